#include "zoncore/Debug.h"

#include "zoncore/src/Hook.h"
#include "zoncore/src/System.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <utility>

namespace zoncore::debug
{
namespace
{

constinit Hook<bool(const char*, const char*, const char*, int)> sContractDialog;
constinit Hook<bool(std::atomic<bool>&, const char*, const char*, const char*, int, const char*)> sAssertDialog;

// Writes one line at once, so that lines of several threads do not mix. Line breaks inside become blanks, those at the
// end go, and what is too long for anybody to read is cut off.
template <class... Arguments>
void PrintLine(const char* inFormat, Arguments... inArguments)
{
	constexpr int kLongestLine = 1'000;
	std::array<char, kLongestLine + 2> line{};   // and a line break and the end
	const int length = std::snprintf(line.data(), kLongestLine + 1, inFormat, inArguments...);
	if (length < 0)
		return;
	char* end = line.data() + std::min(length, kLongestLine);
	while (end != line.data() && end[-1] == '\n')
		--end;
	std::replace(line.data(), end, '\n', ' ');
	end[0] = '\n';
	end[1] = '\0';
	std::fputs(line.data(), stderr);
}

const char* OrUnknown(const char* inText)
{
	return inText != nullptr ? inText : "?";
}

bool PrintContract(const char* inCondition, const char* inSourcePath, const char* inSignature, int inLine)
{
	PrintLine("%s:%d: contract violated: %s in %s", OrUnknown(inSourcePath), inLine, OrUnknown(inCondition),
		OrUnknown(inSignature));
	return false;
}

bool PrintAssert(const char* inCondition, const char* inMessage, const char* inFile, int inLine, const char* inFunction)
{
	PrintLine("%s:%d: assertion failed: %s in %s: %s", OrUnknown(inFile), inLine, OrUnknown(inCondition),
		OrUnknown(inFunction), OrUnknown(inMessage));
	return false;
}

}   // namespace

ContractDialog SetContractDialog(ContractDialog inDialog)
{
	return sContractDialog.Exchange(std::move(inDialog));
}

AssertDialog SetAssertDialog(AssertDialog inDialog)
{
	return sAssertDialog.Exchange(std::move(inDialog));
}

bool BreakAfterContractDialog(const char* inCondition, const char* inSourcePath, const char* inSignature, int inLine)
{
	const auto dialog = sContractDialog.Get();
	return dialog ? (*dialog)(inCondition, inSourcePath, inSignature, inLine)
				  : PrintContract(inCondition, inSourcePath, inSignature, inLine);
}

bool BreakAfterAssertDialog(std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage,
	const char* inFile, int inLine, const char* inFunction, bool inMayDisable)
{
	if (ioDisabled.load(std::memory_order_relaxed))
		return false;
	std::atomic<bool> ignored = false;
	const auto dialog = sAssertDialog.Get();
	return dialog ? (*dialog)(inMayDisable ? ioDisabled : ignored, inCondition, inMessage, inFile, inLine, inFunction)
				  : PrintAssert(inCondition, inMessage, inFile, inLine, inFunction);
}

bool IsDebuggerAttached() noexcept
{
	return system::IsDebuggerAttached();
}

void Break() noexcept
{
	system::StopInDebugger();
}

}   // namespace zoncore::debug
