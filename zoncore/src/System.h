#pragma once

#include <cstdio>
#include <string>
#include <version>

/// What every operating system has and each in its own way. System.cpp is the only source that asks which one it is.
namespace zoncore::system
{

/// Whether a debugger is attached to this process; false where the system cannot tell.
bool IsDebuggerAttached() noexcept;

/// Stops in the attached debugger; without one the process ends.
void StopInDebugger() noexcept;

/// Ends the process as a processor does that finds it cannot divide by zero: some give 0 and go on.
[[noreturn]] void RaiseDivideFault() noexcept;

/// Opens a file, whose path is UTF-8, to read its bytes; null, and errno says why, when that fails.
std::FILE* OpenToRead(const std::string& inPath) noexcept;

/// What an errno means, in English whatever the process's locale is.
std::string ErrorText(int inError);

#if !defined(__cpp_lib_to_chars)
/// For standard libraries whose std::from_chars reads no doubles: the number that inText is, with "." as decimal point whatever the process's locale is; correctly rounded (exact halves
/// to even), infinite or zero when out of range.
double ReadDouble(const char* inText) noexcept;
#endif

}   // namespace zoncore::system
