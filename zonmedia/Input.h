#pragma once

/// \file
/// Values of a command: one from the command line, or one a line from standard input.

#include "zonmedia/Report.h"

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

namespace zonmedia
{

constexpr const char* kValueHelp = "The value; - reads one a line from standard input, skipping empty lines";

/// Calls inUse with inValue, or, when that is "-", with each line of standard input that is not blank, either without the
/// blanks around it. A value for which inUse throws InputProblem becomes a problem of ioRecords, and the others are still used.
/// Shows on standard error how far a long list has come, when that is a terminal and the results go elsewhere.
void ForEachValue(
	const std::string& inValue, RecordList& ioRecords, const std::function<void(const std::string& inValue)>& inUse);

/// Whether a run of digits in inText is a number above inMost.
bool HasNumberAbove(std::string_view inText, std::uint64_t inMost);

}   // namespace zonmedia
