#include "tests/Platform.h"
#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <atomic>
#include <csignal>
#include <functional>
#include <string>
#include <type_traits>
#include <vector>

#if defined(__linux__)
	#include <sys/ptrace.h>
#endif

namespace
{

using namespace zoncore;
using debug::BreakAfterContractDialog;

static_assert(std::is_nothrow_copy_constructible_v<config::Error>);

TEST(ErrorReporter, ThrowsByDefaultAndIsElseTheHosts)
{
	const char* const key = "$$$/zoncore/Error/Broken=Something is broken: @0";
	try
	{
		config::ThrowError(3, key, {utility::AsciiToUTF16("it")});
		FAIL() << "returned";
	}
	catch (const config::Error& error)
	{
		EXPECT_EQ(error.GetLevel(), 3);
		EXPECT_STREQ(error.GetKey(), key);
		EXPECT_STREQ(error.what(), "Something is broken: @0");
	}
	EXPECT_THROW(config::ThrowError(0, nullptr), config::Error);

	std::string report;
	const auto reporter = [&](int inLevel, const char* inKey, const std::vector<config::ReplacementValue>& inValues)
	{ report = std::to_string(inLevel) + inKey + utility::UTF16to8(inValues.at(0) + inValues.at(1)); };
	EXPECT_FALSE(config::SetErrorReporter(reporter));
	config::ThrowError(-1, "key=", {utility::AsciiToUTF16("a"), utility::AsciiToUTF16("b")});
	EXPECT_EQ(report, "-1key=ab");
	EXPECT_THROW(config::ThrowError(1, "key="), std::out_of_range);   // what the reporter throws gets through
	EXPECT_TRUE(config::SetErrorReporter({}));
	EXPECT_THROW(config::ThrowError(1, "key="), config::Error);
	EXPECT_FALSE(config::SetErrorReporter({}));
}

bool Assert(std::atomic<bool>& ioDisabled, bool inMayDisable, const char* inMessage = "programmer error!\n")
{
	return debug::BreakAfterAssertDialog(ioDisabled, "ok", inMessage, "f.cpp", 7, "F", inMayDisable);
}

TEST(Dialogs, WriteOneLineByDefaultAndGoOn)
{
	std::atomic<bool> isDisabled = false;
	const std::string condition(990, 'x');
	const std::pair<std::function<bool()>, std::string> cases[] = {
		{[] { return BreakAfterContractDialog("in != 0", "a/b.cpp", "void F()", 12); },
			"a/b.cpp:12: contract violated: in != 0 in void F()\n"},
		{[] { return BreakAfterContractDialog(nullptr, nullptr, nullptr, -1); }, "?:-1: contract violated: ? in ?\n"},
		{[&] { return BreakAfterContractDialog(condition.c_str(), "%s", "%n\n", 1); },
			"%s:1: contract violated: " + condition.substr(0, 975) + "\n"},
		{[&] { return Assert(isDisabled, true); }, "f.cpp:7: assertion failed: ok in F: programmer error!\n"},
		{[&] { return Assert(isDisabled, true, "two\nlines\n\n"); }, "f.cpp:7: assertion failed: ok in F: two lines\n"},
		{[&] { return Assert(isDisabled, true, nullptr); }, "f.cpp:7: assertion failed: ok in F: ?\n"},
	};
	for (const auto& [show, line] : cases)
	{
		testing::internal::CaptureStderr();
		EXPECT_FALSE(show());
		EXPECT_EQ(testing::internal::GetCapturedStderr(), line);
	}
}

TEST(Dialogs, AreTheHosts)
{
	std::string seen;
	EXPECT_FALSE(debug::SetContractDialog(
		[&](const char* inCondition, const char* inPath, const char* inSignature, int inLine)
		{
			seen = std::string(inCondition) + inPath + inSignature + std::to_string(inLine);
			return inLine == 1;
		}));
	EXPECT_TRUE(BreakAfterContractDialog("a", "b", "c", 1));
	EXPECT_FALSE(BreakAfterContractDialog("a", "b", "c", 2));
	EXPECT_EQ(seen, "abc2");
	EXPECT_TRUE(debug::SetContractDialog({}));

	// Assertions are switched off per place, and only where that is allowed.
	int shown = 0;
	EXPECT_FALSE(debug::SetAssertDialog(
		[&](std::atomic<bool>& ioDisabled, auto...) { return ioDisabled = ++shown >= 2, true; }));
	std::atomic<bool> place = false;
	std::atomic<bool> other = false;
	EXPECT_TRUE(Assert(place, true));
	EXPECT_TRUE(Assert(place, true));
	EXPECT_FALSE(Assert(place, true));   // off, without a dialog
	EXPECT_TRUE(Assert(other, false) && Assert(other, false));
	EXPECT_EQ(shown, 4);
	EXPECT_TRUE(debug::SetAssertDialog({}));
}

#if defined(__linux__)

TEST(Debugger, IsFoundWhenOneTraces)
{
	const pid_t child = ::fork();
	if (child == 0)
	{
		const bool before = debug::IsDebuggerAttached();
		if (::ptrace(PTRACE_TRACEME, 0, nullptr, nullptr) != 0)
			::_exit(77);
		::_exit(debug::IsDebuggerAttached() && !before ? 0 : 1);
	}
	int status = 0;
	ASSERT_EQ(::waitpid(child, &status, 0), child);
	if (WIFEXITED(status) && WEXITSTATUS(status) == 77)
		GTEST_SKIP() << "no tracing here, or traced already";
	EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
}

#endif

TEST(Debugger, IsToldToStop)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
#if defined(SIGTRAP)
	EXPECT_EXIT(debug::Break(), zontest::EndedBy(SIGTRAP), "");
#else
	EXPECT_DEATH(debug::Break(), "");
#endif
}

}   // namespace
