#pragma once

/// \file
/// Standard input as a file that can be read in any order.

#include <string>

namespace zonmedia
{

/// What comes through a pipe is kept in a temporary file: many formats say at their end what is to be known of their
/// beginning. The constructor throws InputProblem when it cannot be kept.
class StandardInput
{
public:
	StandardInput();
	StandardInput(const StandardInput&) = delete;
	StandardInput& operator=(const StandardInput&) = delete;
	/// Removes the temporary file, which whoever has it open can still read.
	~StandardInput();

	const std::string& Path() const { return mPath; }

private:
	std::string mPath;
	bool mIsKept = false;
};

}   // namespace zonmedia
