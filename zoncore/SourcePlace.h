#pragma once

/// \file
/// Where a call stands in the source, as default arguments of the function that is called. Stands for std::source_location,
/// which not every supported compiler has.

namespace zoncore::debug
{

/// The line of the code that makes the call.
constexpr int SourceLine(int inLine = __builtin_LINE())
{
	return inLine;
}

/// The path of its file.
constexpr const char* SourceFile(const char* inFile = __builtin_FILE())
{
	return inFile;
}

}   // namespace zoncore::debug
