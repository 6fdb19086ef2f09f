#include "zoncore/CheckRegistry.h"
#include "zonmediatypes/Version.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <string>
#include <string_view>
#include <vector>

// This program calls none of the entry points: that the library is linked, statically or not, is enough.

namespace
{

TEST(SelfCheck, IsRegisteredAtLoadAndPasses)
{
	ASSERT_STRNE(zonmediatypes::Version(), "");
	const auto suites = zoncore::CheckRegistry::Get().GetSuites();
	ASSERT_EQ(std::ranges::count(suites, "ZON.MediaTypes"), 1);
	std::vector<std::string> checks;
	const bool passed = zoncore::CheckRegistry::Get().Run("ZON.MediaTypes",
		[&](std::string_view inCheck, bool inPassed, std::string_view inMessage)
		{
			checks.emplace_back(inCheck);
			EXPECT_TRUE(inPassed) << inCheck << ": " << inMessage;
			EXPECT_EQ(inMessage, "");
		});
	EXPECT_TRUE(passed);
	EXPECT_EQ(checks, (std::vector<std::string>{"Frame rates", "Tick time round trips", "Timecode round trips"}));
}

}   // namespace
