#pragma once

#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

#if defined(__wasi__)   // its C++ library has no files
	#include <dirent.h>
#else
	#include <filesystem>
#endif

#if defined(_WIN32)
	#include <csignal>
	#include <process.h>
#elif !defined(__wasi__)
	#include <csignal>
	#include <locale.h>   // NOLINT(modernize-deprecated-headers): POSIX' own locales are in no other
	#include <sys/wait.h>
	#include <unistd.h>
	#if defined(__APPLE__)
		#include <xlocale.h>
	#endif
#endif

// What tests ask the system for, and each system has in its own way.

namespace zontest
{

/// Whether an exception that is thrown can be caught.
#if defined(__wasi__)
inline constexpr bool kHasExceptions = false;
#else
inline constexpr bool kHasExceptions = true;
#endif

/// A number that no other process has now.
inline std::string ProcessId()
{
#if defined(_WIN32)
	return std::to_string(::_getpid());
#elif defined(__wasi__)
	return "0";
#else
	return std::to_string(::getpid());
#endif
}

/// The bytes of a file, by the C library, since not every C++ library has files; empty when it cannot be read.
inline std::string ReadFile(const std::string& inPath)
{
	std::string bytes;
	std::FILE* const file = std::fopen(inPath.c_str(), "rb");
	if (file == nullptr)
		return bytes;
	for (int byte = std::fgetc(file); byte != EOF; byte = std::fgetc(file))
		bytes.push_back(static_cast<char>(byte));
	std::fclose(file);
	return bytes;
}

/// The names of the files of a folder, in any order.
inline std::vector<std::string> FilesOf(const std::string& inFolder)
{
	std::vector<std::string> names;
#if defined(__wasi__)
	::DIR* const folder = ::opendir(inFolder.c_str());
	if (folder == nullptr)
		return names;
	while (const ::dirent* const entry = ::readdir(folder))
		if (entry->d_name[0] != '.')
			names.emplace_back(entry->d_name);
	::closedir(folder);
#else
	for (const auto& entry : std::filesystem::directory_iterator(inFolder))
		names.push_back(entry.path().filename().string());
#endif
	return names;
}

/// What the C library reads and writes has a decimal point for as long as this lives, whatever locale the run is under.
class ClassicNumbers
{
public:
#if defined(_WIN32) || defined(__wasi__)
	ClassicNumbers()
	{
	}   // there only the program itself changes the C library's locale, and tests do not
	ClassicNumbers(const ClassicNumbers&) = delete;
	ClassicNumbers& operator=(const ClassicNumbers&) = delete;
	~ClassicNumbers()
	{
	}
#else
	ClassicNumbers() : mBefore(::uselocale(Classic()))
	{
	}
	ClassicNumbers(const ClassicNumbers&) = delete;
	ClassicNumbers& operator=(const ClassicNumbers&) = delete;
	~ClassicNumbers()
	{
		::uselocale(mBefore);
	}

private:
	static ::locale_t Classic()
	{
		static const ::locale_t sClassic = ::newlocale(LC_ALL_MASK, "C", nullptr);
		return sClassic;
	}

	::locale_t mBefore;
#endif
};

#if !defined(__wasi__)

/// A predicate of EXPECT_EXIT: the process ended as this signal ends one that does not handle it. Windows has exit codes
/// for that.
class EndedBy
{
public:
	explicit EndedBy(int inSignal) : mSignal(inSignal) {}

	bool operator()(int inStatus) const
	{
	#if defined(_WIN32)
		constexpr int kAbort = 3;
		return inStatus == kAbort && (mSignal == SIGFPE || mSignal == SIGABRT);
	#else
		return WIFSIGNALED(inStatus) && WTERMSIG(inStatus) == mSignal;
	#endif
	}

private:
	int mSignal;
};

#endif

}   // namespace zontest
