#pragma once

/// \file
/// Diagnostics for developers of hosts: dialogs that ask whether to stop in the debugger. The host installs its own; the
/// default ones write one line to standard error and do not stop.

#include "zoncore/Export.h"

#include <atomic>
#include <functional>

namespace zoncore::debug
{

/// Told of a violated contract of a function; true asks to stop in an attached debugger.
using ContractDialog
	= std::function<bool(const char* inCondition, const char* inSourcePath, const char* inSignature, int inLine)>;

/// Told of a failed assertion; true asks to stop in an attached debugger. Setting ioDisabled switches the dialog of that
/// place in the code off for the rest of the run.
using AssertDialog = std::function<bool(std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage,
	const char* inFile, int inLine, const char* inFunction)>;

/// Installs a dialog and returns a copy of the one before it; an empty one stands for the default. Any thread may call
/// them while others report: a report that has begun ends with the dialog it began with. Dialogs are called with no lock
/// held, from any thread and by several at once; what they throw reaches the code that reports.
ZONCORE_API ContractDialog SetContractDialog(ContractDialog inDialog);
ZONCORE_API AssertDialog SetAssertDialog(AssertDialog inDialog);

/// Calls the contract dialog and returns its answer.
ZONCORE_API bool BreakAfterContractDialog(
	const char* inCondition, const char* inSourcePath, const char* inSignature, int inLine);

/// False at once, without a dialog, while ioDisabled is set; else the assert dialog's answer. The dialog can switch
/// itself off by setting the flag only when inMayDisable is true.
ZONCORE_API bool BreakAfterAssertDialog(std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage,
	const char* inFile, int inLine, const char* inFunction, bool inMayDisable);

/// Whether a debugger is attached to this process, as the operating system says now; false where it cannot tell. Costs
/// the reading of a short file.
ZONCORE_API bool IsDebuggerAttached() noexcept;

/// Stops in the attached debugger; without one the process ends.
ZONCORE_API void Break() noexcept;

}   // namespace zoncore::debug
