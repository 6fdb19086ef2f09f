#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/StringUtils.h"

#include "tests/Allocations.h"

#include <gtest/gtest.h>

#include <atomic>
#include <csignal>
#include <string>
#include <sys/ptrace.h>
#include <sys/wait.h>
#include <thread>
#include <type_traits>
#include <unistd.h>
#include <vector>

namespace zoncore
{
namespace
{

constexpr const char* kKey = "$$$/zoncore/Error/Broken=Something is broken: @0";

std::string CaptureLine(bool (*inFunction)())
{
	testing::internal::CaptureStderr();
	const bool result = inFunction();
	return testing::internal::GetCapturedStderr() + (result ? "true" : "false");
}

TEST(ErrorReporter, ThrowsAnErrorByDefault)
{
	try
	{
		config::ThrowError(3, kKey, {utility::AsciiToUTF16("it")});
		FAIL() << "returned";
	}
	catch (const config::Error& error)
	{
		const std::runtime_error& base = error;
		EXPECT_EQ(error.GetLevel(), 3);
		EXPECT_STREQ(error.GetKey(), kKey);
		EXPECT_STREQ(base.what(), "Something is broken: @0");
	}
	EXPECT_THROW(config::ThrowError(0, nullptr), config::Error);
	EXPECT_STREQ(config::Error(0, "no text").what(), "");
	static_assert(std::is_nothrow_copy_constructible_v<config::Error>);
}

TEST(ErrorReporter, IsTheHostsAndReturnsWhenItDoes)
{
	std::string report;
	const auto before = config::SetErrorReporter(
		[&](int inLevel, const char* inKey, const std::vector<config::ReplacementValue>& inValues) {
			report
				= std::to_string(inLevel) + inKey + utility::UTF16to8(inValues.at(0)) + std::to_string(inValues.size());
		});
	EXPECT_FALSE(before);
	config::ThrowError(-1, "key=", {utility::AsciiToUTF16("a"), utility::AsciiToUTF16("b")});
	EXPECT_EQ(report, "-1key=a2");
	EXPECT_THROW(config::ThrowError(1, "key="), std::out_of_range);   // what the reporter throws gets through

	const auto mine = config::SetErrorReporter({});
	ASSERT_TRUE(mine);
	EXPECT_THROW(config::ThrowError(1, kKey), config::Error);
	mine(5, "direct=", {{}});
	EXPECT_EQ(report, "5direct=1");
	EXPECT_FALSE(config::SetErrorReporter(mine));
	config::ThrowError(6, "again=", {{}});
	EXPECT_EQ(report, "6again=1");
	EXPECT_TRUE(config::SetErrorReporter({}));
}

TEST(ErrorReporter, StaysWhenMemoryRunsOut)
{
	int reports = 0;
	const auto count
		= [&reports, large = std::string(100, 'x')](auto, auto, auto&) { reports += large.empty() ? 0 : 1; };
	config::SetErrorReporter(count);
	const auto expectCount = [&]
	{
		const int before = reports;
		config::ThrowError(0, "=");
		EXPECT_EQ(reports, before + 1);
	};
	EXPECT_GT(zontest::FailEachAllocation([&] { config::SetErrorReporter([](auto, auto, auto&) {}); }, expectCount), 0);
	config::SetErrorReporter({});
}

TEST(ContractDialog, WritesOneLineByDefaultAndGoesOn)
{
	EXPECT_EQ(CaptureLine([] { return debug::BreakAfterContractDialog("in != 0", "a/b.cpp", "void F()", 12); }),
		"a/b.cpp:12: contract violated: in != 0 in void F()\nfalse");
	EXPECT_EQ(CaptureLine([] { return debug::BreakAfterContractDialog(nullptr, nullptr, nullptr, -1); }),
		"?:-1: contract violated: ? in ?\nfalse");
	const std::string line
		= CaptureLine([] { return debug::BreakAfterContractDialog(std::string(5'000, 'x').c_str(), "%s", "%n\n", 1); });
	EXPECT_EQ(line.substr(0, 25), "%s:1: contract violated: ");
	EXPECT_EQ(line.substr(line.size() - 8), "xx\nfalse");
}

TEST(ContractDialog, IsTheHosts)
{
	std::string seen;
	EXPECT_FALSE(debug::SetContractDialog(
		[&](const char* inCondition, const char* inPath, const char* inSignature, int inLine)
		{
			seen = std::string(inCondition) + inPath + inSignature + std::to_string(inLine);
			return inLine == 1;
		}));
	EXPECT_TRUE(debug::BreakAfterContractDialog("a", "b", "c", 1));
	EXPECT_FALSE(debug::BreakAfterContractDialog("a", "b", "c", 2));
	EXPECT_EQ(seen, "abc2");
	EXPECT_TRUE(debug::SetContractDialog({}));
	EXPECT_FALSE(debug::SetContractDialog({}));
}

bool Assert(std::atomic<bool>& ioDisabled, bool inMayDisable)
{
	return debug::BreakAfterAssertDialog(ioDisabled, "ok", "programmer error!\n", "f.cpp", 7, "F", inMayDisable);
}

TEST(AssertDialog, WritesOneLineByDefaultAndGoesOn)
{
	constexpr auto assertAgain = []
	{
		static std::atomic<bool> sDisabled = false;
		return Assert(sDisabled, true);
	};
	for (int i = 0; i < 2; ++i)
		EXPECT_EQ(CaptureLine(assertAgain), "f.cpp:7: assertion failed: ok in F: programmer error!\nfalse");
	constexpr auto assertTwoLines = []
	{
		std::atomic<bool> isDisabled = false;
		return debug::BreakAfterAssertDialog(isDisabled, "ok", "two\nlines\n\n", "f.cpp", 7, nullptr, true);
	};
	EXPECT_EQ(CaptureLine(assertTwoLines), "f.cpp:7: assertion failed: ok in ?: two lines\nfalse");
}

TEST(AssertDialog, IsSwitchedOffPerPlaceAndOnlyWhereAllowed)
{
	int shown = 0;
	EXPECT_FALSE(debug::SetAssertDialog(
		[&](std::atomic<bool>& ioDisabled, const char*, const char* inMessage, const char*, int, const char*)
		{
			EXPECT_STREQ(inMessage, "programmer error!\n");
			++shown;
			ioDisabled = shown >= 2;
			return true;
		}));
	std::atomic<bool> place = false, other = false;
	EXPECT_TRUE(Assert(place, true));
	EXPECT_TRUE(Assert(place, true));
	EXPECT_FALSE(Assert(place, true));   // off, without a dialog
	EXPECT_EQ(shown, 2);
	EXPECT_TRUE(Assert(other, false));
	EXPECT_TRUE(Assert(other, false));
	EXPECT_EQ(shown, 4);
	EXPECT_FALSE(other);
	EXPECT_TRUE(debug::SetAssertDialog({}));
}

TEST(Hooks, AreReplacedWhileOthersReport)
{
	std::atomic<int> reports = 0, dialogs = 0;
	const auto reporter = [&reports](auto, auto, auto&) { ++reports; };
	const auto dialog = [&dialogs, text = std::string(50, 'x')](auto...) { return ++dialogs, text.size() == 50; };
	config::SetErrorReporter(reporter);
	debug::SetContractDialog(dialog);
	std::vector<std::thread> threads;
	constexpr int kCalls = 2'000, kThreads = 3;
	for (int i = 0; i < kThreads; ++i)
		threads.emplace_back(
			[]
			{
				for (int call = 0; call < kCalls; ++call)
				{
					config::ThrowError(0, "=");
					EXPECT_TRUE(debug::BreakAfterContractDialog("", "", "", 0));
				}
			});
	for (int i = 0; i < kCalls; ++i)
	{
		EXPECT_TRUE(config::SetErrorReporter(reporter));
		EXPECT_TRUE(debug::SetContractDialog(dialog));
	}
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(reports, kCalls * kThreads);
	EXPECT_EQ(dialogs, kCalls * kThreads);
	config::SetErrorReporter({});
	debug::SetContractDialog({});
}

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
	if (WIFEXITED(status) && (WEXITSTATUS(status) == 77 || debug::IsDebuggerAttached()))
		GTEST_SKIP() << "no tracing here, or traced as a whole";
	EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
	EXPECT_FALSE(debug::IsDebuggerAttached());
}

TEST(Debugger, IsToldToStop)
{
	EXPECT_EXIT(debug::Break(), testing::KilledBySignal(SIGTRAP), "");
}

}   // namespace
}   // namespace zoncore
