#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/ZONMediaTypes.h"
#include "zonmediatypes/src/InitializationCount.h"

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <string>
#include <thread>
#include <vector>

// Everything that keeps state, used by many threads at once; ThreadSanitizer watches, and the counts are checked at the end.

namespace
{

using namespace zonmediatypes;
namespace debug = zoncore::debug;
using zoncore::UTF16String;
using zoncore::config::Localizer;
using zoncore::config::SetErrorReporter;
using zoncore::utility::AsciiToUTF16;

constexpr int kRounds = 2'000;

TEST(Threads, UseAllSharedStateAtOnce)
{
	std::atomic<int> reports = 0, contracts = 0, assertions = 0;
	const auto reporter = [&](auto, auto, auto&) { ++reports; };
	const auto contractDialog = [&](auto...) { return ++contracts, false; };
	const auto assertDialog = [&](auto&, auto...) { return ++assertions, false; };
	const auto german = [](auto, UTF16String& outText) { return outText = AsciiToUTF16("Entwurf"), true; };
	SetErrorReporter(reporter);
	debug::SetContractDialog(contractDialog);
	debug::SetAssertDialog(assertDialog);
	std::atomic<bool> isDisabled = false;
	const auto initializations = InitializationCount();

	const std::vector<std::function<void(int)>> jobs{
		[](int) { Initialize(); },
		[](int) { Terminate(); },
		[](int inRound)
		{
			const auto name = MakePixelFormatName('_', 't', static_cast<char>('a' + inRound % 26), 'x');
			const auto value = static_cast<std::uint32_t>(inRound);
			RegisterCustomPixelFormatProperties(name, PixelFormatProperties(value));
			EXPECT_NE(LookupPropertiesForName(name), kPixelFormatProperties_Invalid);
		},
		[&](int)
		{
			const UTF16String text = RenderQualityDescription(kRenderQuality_Draft);
			EXPECT_TRUE(text == AsciiToUTF16("Draft") || text == AsciiToUTF16("Entwurf"));
		},
		[&](int) { Localizer::Get().SetTranslator(german); },
		[](int) { Localizer::Get().SetTranslator({}); },
		[&](int) { EXPECT_TRUE(SetErrorReporter(reporter)); },
		[&](int) { EXPECT_TRUE(debug::SetContractDialog(contractDialog)); },
		[&](int) { EXPECT_TRUE(debug::SetAssertDialog(assertDialog)); },
		[&](int) { EXPECT_EQ(TickTime(7) / 0.0, TickTime(INT64_MIN)); },   // one contract, reported twice
		[&](int) { debug::BreakAfterAssertDialog(isDisabled, "", "", "", 0, "", true); },
	};

	std::vector<std::thread> threads;
	for (const auto& job : jobs)
		threads.emplace_back(
			[&]
			{
				for (int round = 0; round < kRounds; ++round)
					job(round);
			});
	for (std::thread& thread : threads)
		thread.join();
	Localizer::Get().SetTranslator({});
	SetErrorReporter({});
	debug::SetContractDialog({});
	debug::SetAssertDialog({});

	EXPECT_EQ(InitializationCount(), initializations);
	Terminate();
	EXPECT_EQ(InitializationCount(), initializations - 1);   // may fall below 0
	Initialize();
	EXPECT_EQ(reports, 2 * kRounds);
	EXPECT_EQ(contracts, 2 * kRounds);
	EXPECT_EQ(assertions, kRounds);
}

}   // namespace
