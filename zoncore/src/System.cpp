#include "zoncore/src/System.h"

#include "zoncore/Mutex.h"

#include <cstddef>
#include <cstdlib>
#include <cstring>

#if !defined(__wasi__)
	#include <csignal>
#endif
#if defined(_WIN32)
	#if !defined(NOMINMAX)
		#define NOMINMAX
	#endif
	#define WIN32_LEAN_AND_MEAN
	#include "zoncore/StringUtils.h"

	#include <cerrno>
	#include <clocale>
	#include <windows.h>
#elif defined(__APPLE__)
	#include <sys/sysctl.h>
	#include <unistd.h>
	#include <xlocale.h>
#elif defined(__linux__)
	#include <fcntl.h>
	#include <locale.h>   // NOLINT(modernize-deprecated-headers): POSIX' own locales are in no other
	#include <string_view>
	#include <unistd.h>
#endif

namespace zoncore
{

// ---- Debuggers -------------------------------------------------------------------------------------------------------

#if defined(_WIN32)

bool system::IsDebuggerAttached() noexcept
{
	return ::IsDebuggerPresent() != FALSE;
}

void system::StopInDebugger() noexcept
{
	::DebugBreak();
}

#elif defined(__APPLE__)

bool system::IsDebuggerAttached() noexcept
{
	int name[] = {CTL_KERN, KERN_PROC, KERN_PROC_PID, ::getpid()};
	kinfo_proc process{};
	std::size_t size = sizeof process;
	return ::sysctl(name, 4, &process, &size, nullptr, 0) == 0 && (process.kp_proc.p_flag & P_TRACED) != 0;
}

#elif defined(__linux__)

bool system::IsDebuggerAttached() noexcept
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
	constexpr std::string_view kTracer = "\nTracerPid:\t";
	const auto found = status.find(kTracer);
	return found != std::string_view::npos && found + kTracer.size() < status.size()
		&& status[found + kTracer.size()] != '0';
}

#else

bool system::IsDebuggerAttached() noexcept
{
	return false;
}

#endif

#if defined(SIGTRAP)

void system::StopInDebugger() noexcept
{
	std::raise(SIGTRAP);
}

#elif !defined(_WIN32)

void system::StopInDebugger() noexcept
{
	std::abort();
}

#endif

void system::RaiseDivideFault() noexcept
{
#if defined(SIGFPE)
	std::raise(SIGFPE);
#endif
	std::abort();   // a handler of the host's that returns must not resume a division that has no result
}

// ---- Mutexes ---------------------------------------------------------------------------------------------------------

#if defined(_WIN32)

static_assert(sizeof(::SRWLOCK) == sizeof(void*));

void threads::Mutex::lock() noexcept
{
	::AcquireSRWLockExclusive(reinterpret_cast<::SRWLOCK*>(&mState));
}

void threads::Mutex::unlock() noexcept
{
	::ReleaseSRWLockExclusive(reinterpret_cast<::SRWLOCK*>(&mState));
}

#endif

// ---- Files and errors ------------------------------------------------------------------------------------------------

std::FILE* system::OpenToRead(const std::string& inPath) noexcept
{
#if defined(_WIN32)
	try
	{
		const UTF16String path = utility::UTF8to16(inPath);
		return ::_wfopen(std::wstring(path.begin(), path.end()).c_str(), L"rb");
	}
	catch (...)
	{
		errno = ENOMEM;
		return nullptr;
	}
#else
	return std::fopen(inPath.c_str(), "rb");
#endif
}

std::string system::ErrorText(int inError)
{
#if defined(__GLIBC__)
	const char* const text = ::strerrordesc_np(inError);
#elif defined(__APPLE__)
	const char* const text = inError >= 0 && inError < ::sys_nerr ? ::sys_errlist[inError] : nullptr;
#else
	const char* const text = std::strerror(inError);   // has no other language there
#endif
	return text != nullptr ? text : "unknown error";
}

#if !defined(__cpp_lib_to_chars)

// ---- Numbers ---------------------------------------------------------------------------------------------------------

double system::ReadDouble(const char* inText) noexcept
{
	#if defined(_WIN32)
	static const ::_locale_t sClassic = ::_create_locale(LC_ALL, "C");
	return ::_strtod_l(inText, nullptr, sClassic);
	#elif defined(__GLIBC__) || defined(__APPLE__)
	static const ::locale_t sClassic = ::newlocale(LC_ALL_MASK, "C", nullptr);
	return ::strtod_l(inText, nullptr, sClassic);
	#else
	return std::strtod(inText, nullptr);   // knows no other decimal point
	#endif
}

#endif   // __cpp_lib_to_chars

}   // namespace zoncore
