#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/SmallBlockAllocator.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/ZONMediaTypes.h"
#include "zonmediatypes/src/InitializationCount.h"

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

// Everything that keeps state, used by many threads at once; ThreadSanitizer watches, and the counts are checked at the end.

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16String;
using Pool = zoncore::utility::SmallBlockAllocator;

constexpr int kRounds = 2'000;

// Blocks on their way from the thread that allocated them to the one that disposes of them.
class BlockExchange
{
public:
	void Work(int inRound)
	{
		const std::size_t size = static_cast<std::size_t>(inRound) % 300;
		UTF16String text(size, static_cast<zoncore::UTF16Char>(inRound));
		{
			const std::lock_guard lock(mMutex);
			mTexts[static_cast<std::size_t>(inRound) % mTexts.size()].swap(text);
		}
		ASSERT_TRUE(text.empty() || text.find_first_not_of(text.front()) == UTF16String::npos);
		++mExchanged;
	}

	int GetExchanged() const { return mExchanged; }

private:
	std::mutex mMutex;
	std::vector<UTF16String> mTexts{64};
	std::atomic<int> mExchanged = 0;
};

TEST(Threads, UseAllSharedStateAtOnce)
{
	std::atomic<int> reports = 0, contracts = 0, assertions = 0, translations = 0;
	BlockExchange blocks;
	const auto reporter = [&](auto, auto, auto&) { ++reports; };
	const auto contractDialog = [&](auto...) { return ++contracts, false; };
	const auto assertDialog = [&](auto&, auto...) { return ++assertions, false; };
	zoncore::config::SetErrorReporter(reporter);
	zoncore::debug::SetContractDialog(contractDialog);
	zoncore::debug::SetAssertDialog(assertDialog);
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
			EXPECT_TRUE(
				text == zoncore::utility::AsciiToUTF16("Draft") || text == zoncore::utility::AsciiToUTF16("Entwurf"));
		},
		[&](int inRound)
		{
			zoncore::config::Localizer::Get().SetTranslator(inRound % 2 == 0 ? zoncore::config::Translator()
				: [&](std::string_view, UTF16String& outText)
				{
					outText = zoncore::utility::AsciiToUTF16("Entwurf");
					++translations;
					return true;
				});
		},
		[&](int) { EXPECT_TRUE(zoncore::config::SetErrorReporter(reporter)); },
		[&](int) { EXPECT_TRUE(zoncore::debug::SetContractDialog(contractDialog)); },
		[&](int) { EXPECT_TRUE(zoncore::debug::SetAssertDialog(assertDialog)); },
		[&](int) { EXPECT_EQ(TickTime(7) / 0.0, TickTime(INT64_MIN)); },   // one contract, reported twice
		[&](int) { zoncore::debug::BreakAfterAssertDialog(isDisabled, "", "", "", 0, "", true); },
		[&](int inRound) { blocks.Work(inRound); },
		[&](int inRound) { blocks.Work(inRound * 7); },
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
	zoncore::config::Localizer::Get().SetTranslator({});
	zoncore::config::SetErrorReporter({});
	zoncore::debug::SetContractDialog({});
	zoncore::debug::SetAssertDialog({});

	EXPECT_EQ(InitializationCount(), initializations);
	EXPECT_EQ(reports, 2 * kRounds);
	EXPECT_EQ(contracts, 2 * kRounds);
	EXPECT_EQ(assertions, kRounds);
	EXPECT_LE(translations, kRounds);
	EXPECT_EQ(blocks.GetExchanged(), 2 * kRounds);
}

}   // namespace
}   // namespace zonmediatypes
