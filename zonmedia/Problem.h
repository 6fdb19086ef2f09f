#pragma once

/// \file
/// What can go wrong in a run, each in one line for standard error.

#include <cstddef>
#include <stdexcept>
#include <string>
#include <string_view>

namespace zonmedia
{

/// The exit statuses, as `--help` states them.
enum class Status
{
	Fine = 0,
	BadInput = 1,   ///< a file or a value could not be read, or a check failed; everything else was still shown
	BadUsage = 2,   ///< the arguments make no command
};

/// A file or a value that cannot be used; what() says why and what was expected, without naming the input.
class InputProblem : public std::runtime_error
{
	using std::runtime_error::runtime_error;
};

/// Arguments that make no command.
class UsageProblem : public std::runtime_error
{
	using std::runtime_error::runtime_error;
};

/// inText in quotation marks; of a very long one, which is no mistyped name, the beginning and the length. Text of users
/// and files is shown through Printable at the latest when it is written.
inline std::string Quoted(std::string_view inText)
{
	constexpr std::size_t kMostShown = 200;
	if (inText.size() > kMostShown)
		return Quoted(std::string(inText.substr(0, kMostShown / 4)) + "...") + " (" + std::to_string(inText.size())
			+ " characters)";
	// Not by operator+: g++ 12 warns of an overlap that cannot be.
	std::string text(1, '"');
	text.append(inText);
	text.push_back('"');
	return text;
}

}   // namespace zonmedia
