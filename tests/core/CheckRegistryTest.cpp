#include "zoncore/CheckRegistry.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace
{

using namespace zoncore;

bool Passes(std::string&)
{
	return true;
}

bool Fails(std::string& outMessage)
{
	outMessage = "wrong";
	return false;
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
	registry.Register("Z", "other", Passes);
	registry.Register("A", "second", Passes);
	registry.Register("A", "first", Fails);
	registry.Register("A", "third", Passes);
	EXPECT_EQ(registry.GetSuites(), (std::vector<std::string>{"A", "Z"}));
	EXPECT_EQ(ReportOf(registry, "A"), "second+ first-wrong third+ failed");
	EXPECT_EQ(ReportOf(registry, "Z"), "other+ passed");
	EXPECT_EQ(ReportOf(registry, "unknown"), "failed");
	registry.Register("A", "first", Passes);
	EXPECT_EQ(ReportOf(registry, "A"), "second+ first+ third+ passed");
	EXPECT_TRUE(registry.Run("A", {}));
	EXPECT_EQ(&CheckRegistry::Get(), &CheckRegistry::Get());
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
	registry.Register("A", "a", [&](std::string&) { return registry.Register("A", "b", Passes), true; });
	EXPECT_EQ(ReportOf(registry, "A"), "a+ passed");
	EXPECT_EQ(ReportOf(registry, "A"), "a+ b+ passed");
}

}   // namespace
