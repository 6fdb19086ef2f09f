#include "zoncore/CheckRegistry.h"

#include "tests/Allocations.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace zoncore
{
namespace
{

CheckRegistry::Check Passing()
{
	return [](std::string&) { return true; };
}

CheckRegistry::Check Failing(std::string inMessage)
{
	return [inMessage](std::string& outMessage)
	{
		outMessage = inMessage;
		return false;
	};
}

std::string ReportOf(const CheckRegistry& inRegistry, std::string_view inSuite)
{
	std::string report;
	const bool passed = inRegistry.Run(inSuite,
		[&](std::string_view inCheck, bool inPassed, std::string_view inMessage)
		{ report.append(inCheck).append(inPassed ? "+" : "-").append(inMessage).append(" "); });
	return report + (passed ? "passed" : "failed");
}

TEST(CheckRegistry, RunsASuiteInOrderAndReportsEachCheck)
{
	CheckRegistry registry;
	registry.Register("Z", "other", Passing());
	registry.Register("A", "second", Passing());
	registry.Register("A", "first", Failing("wrong"));
	registry.Register("A", "third", Passing());
	EXPECT_EQ(registry.GetSuites(), (std::vector<std::string>{"A", "Z"}));
	EXPECT_EQ(ReportOf(registry, "A"), "second+ first-wrong third+ failed");
	EXPECT_EQ(ReportOf(registry, "Z"), "other+ passed");
	EXPECT_EQ(ReportOf(registry, "unknown"), "failed");
	registry.Register("A", "first", Passing());
	EXPECT_EQ(ReportOf(registry, "A"), "second+ first+ third+ passed");
	EXPECT_TRUE(registry.Run("A", {}));
}

TEST(CheckRegistry, TakesWhatThrowsForFailed)
{
	CheckRegistry registry;
	registry.Register("A", "a", [](std::string&) -> bool { throw std::runtime_error("thrown"); });
	registry.Register("A", "b", [](std::string&) -> bool { throw 1; });
	registry.Register("A", "c", {});
	EXPECT_EQ(ReportOf(registry, "A"), "a-thrown b-an exception of an unknown type c-bad_function_call failed");
	EXPECT_THROW(registry.Run("A", [](auto, bool, auto) { throw std::logic_error("stop"); }), std::logic_error);
}

TEST(CheckRegistry, MayBeUsedByItsChecks)
{
	CheckRegistry registry;
	registry.Register("A", "a",
		[&](std::string&)
		{
			registry.Register("A", "b", Passing());
			return registry.GetSuites().size() == 1;
		});
	EXPECT_EQ(ReportOf(registry, "A"), "a+ passed");
	EXPECT_EQ(ReportOf(registry, "A"), "a+ b+ passed");
}

TEST(CheckRegistry, IsAsBeforeWhenMemoryRunsOut)
{
	CheckRegistry registry;
	const std::string name(50, 'n');
	const auto expectEmpty = [&] { EXPECT_TRUE(registry.GetSuites().empty()); };
	EXPECT_GT(zontest::FailEachAllocation([&] { registry.Register(name, name, Passing()); }, expectEmpty), 0);
	EXPECT_EQ(registry.GetSuites(), std::vector{name});
}

TEST(CheckRegistry, IsOnePerProcess)
{
	EXPECT_EQ(&CheckRegistry::Get(), &CheckRegistry::Get());
}

}   // namespace
}   // namespace zoncore
