#include "zoncore/Debug.h"

#include "zoncore/src/Hook.h"

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <string_view>
#include <unistd.h>
#include <utility>

namespace zoncore::debug
{
namespace
{

constinit Hook<bool(const char*, const char*, const char*, int)> sContractDialog;
constinit Hook<bool(std::atomic<bool>&, const char*, const char*, const char*, int, const char*)> sAssertDialog;

bool PrintContract(const char* inCondition, const char* inSourcePath, const char* inSignature, int inLine)
{
	std::fprintf(stderr, "%s:%d: contract violated: %s in %s\n", inSourcePath, inLine, inCondition, inSignature);
	return false;
}

// A message may end in a line break of its own; the report stays one line.
bool PrintAssert(
	const char* inCondition, std::string_view inMessage, const char* inFile, int inLine, const char* inFunction)
{
	while (!inMessage.empty() && inMessage.back() == '\n')
		inMessage.remove_suffix(1);
	std::fprintf(stderr, "%s:%d: assertion failed: %s: %.*s in %s\n", inFile, inLine, inCondition,
		static_cast<int>(inMessage.size()), inMessage.data(), inFunction);
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
	// Linux writes the tracer's process number, 0 for none, into a short text about the process.
	const int file = ::open("/proc/self/status", O_RDONLY | O_CLOEXEC);
	if (file < 0)
		return false;
	char buffer[4096];
	const ::ssize_t size = ::read(file, buffer, sizeof buffer);
	::close(file);
	if (size <= 0)
		return false;
	const std::string_view status(buffer, static_cast<std::size_t>(size));
	constexpr std::string_view kTracer = "TracerPid:\t";
	const auto found = status.find(kTracer);
	return found != std::string_view::npos && found + kTracer.size() < status.size()
		&& status[found + kTracer.size()] != '0';
}

void Break() noexcept
{
	std::raise(SIGTRAP);
}

}   // namespace zoncore::debug
