#include "tests/CatalogueFile.h"
#include "zoncore/CheckRegistry.h"
#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/ZONMediaTypes.h"
#include "zonmediatypes/src/InitializationCount.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <cstdint>
#include <functional>
#include <latch>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

// Everything that keeps state, used by many threads at once; ThreadSanitizer watches, and the counts are checked at the end.

namespace
{

using namespace zonmediatypes;
namespace debug = zoncore::debug;
using zoncore::CheckRegistry;
using zoncore::UTF16String;
using zoncore::config::Localizer;
using zoncore::config::MessageCatalogue;
using zoncore::config::SetErrorReporter;
using zoncore::utility::AsciiToUTF16;

constexpr int kRounds = 2'000;
constexpr int kLetters = 26;
constexpr int kThreadsAJob = 2;
constexpr int kCalls = kThreadsAJob * kRounds;

char Letter(int inRound)
{
	return static_cast<char>('a' + inRound % kLetters);
}

PixelFormatName NameOf(int inRound)
{
	return MakePixelFormatName('_', 't', Letter(inRound), 'x');
}

// Properties that tell the round that they come from, and are never invalid.
PixelFormatProperties PropertiesOf(int inRound)
{
	return PixelFormatProperties(0x40000000u + static_cast<std::uint32_t>(inRound));
}

int RoundOf(PixelFormatProperties inProperties)
{
	return static_cast<int>(inProperties.GetValue() - 0x40000000u);
}

std::shared_ptr<const MessageCatalogue> CatalogueWith(const std::string& inDraft)
{
	MessageCatalogue catalogue;
	std::string error;
	const zontest::Messages messages
		= {{"", "charset=UTF-8\n"}, {"$$$/zonmediatypes/RenderQuality/Draft\4Draft", inDraft}};
	EXPECT_TRUE(catalogue.Parse(zontest::MakeCatalogue(messages), error)) << error;
	return std::make_shared<const MessageCatalogue>(std::move(catalogue));
}

// Runs each job on two threads, all at once.
void RunTogether(const std::vector<std::function<void(int)>>& inJobs)
{
	std::vector<std::thread> threads;
	std::latch start(kThreadsAJob * std::ssize(inJobs));
	for (int i = 0; i < kThreadsAJob; ++i)
		for (const auto& job : inJobs)
			threads.emplace_back(
				[&]
				{
					start.arrive_and_wait();
					for (int round = 0; round < kRounds; ++round)
						job(round);
				});
	for (std::thread& thread : threads)
		thread.join();
}

TEST(Threads, UseAllSharedStateAtOnce)
{
	std::atomic<int> reports = 0;
	std::atomic<int> contracts = 0;
	std::atomic<int> assertions = 0;
	std::atomic<int> translations = 0;
	std::atomic<int> translated = 0;
	const auto hooks = std::make_shared<int>();   // each hook that is alive holds one
	const auto reporter = [&, hooks](auto, auto, auto&) { ++reports; };
	const auto contractDialog = [&, hooks](auto...) { return ++contracts, false; };
	const auto assertDialog = [&, hooks](auto&, auto...) { return ++assertions, false; };
	const auto german
		= [&, hooks](auto, UTF16String& outText) { return ++translations, outText = AsciiToUTF16("Entwurf"), true; };
	const long kept = hooks.use_count();
	SetErrorReporter(reporter);
	debug::SetContractDialog(contractDialog);
	debug::SetAssertDialog(assertDialog);
	const auto french = CatalogueWith("Brouillon");
	const auto danish = CatalogueWith("Kladde");
	CheckRegistry& checks = CheckRegistry::Get();
	std::atomic<bool> isDisabled = false;
	std::mutex mutex;
	std::vector<UTF16String> handed;
	int taken = 0;
	const auto initializations = InitializationCount();

	RunTogether({
		[](int) { Initialize(); },
		[](int) { Terminate(); },

		[](int inRound)
		{
			RegisterCustomPixelFormatProperties(NameOf(inRound), PropertiesOf(inRound));
			EXPECT_EQ(RoundOf(LookupPropertiesForName(NameOf(inRound))) % kLetters, inRound % kLetters);
		},
		[](int inRound)
		{
			const PixelFormatProperties found = LookupPropertiesForName(NameOf(inRound));
			EXPECT_TRUE(found == kPixelFormatProperties_Invalid || RoundOf(found) % kLetters == inRound % kLetters);
		},

		[&](int inRound)
		{
			checks.Register("threads", std::string(1, Letter(inRound)),
				[=](std::string& outMessage) { return outMessage = std::to_string(inRound), true; });
		},
		[&](int inRound)
		{
			if (inRound % 100 == 0)   // all checks each time
				checks.Run("threads",
					[](auto inName, bool inPassed, auto inMessage)
					{ EXPECT_TRUE(inPassed && inName[0] == Letter(std::stoi(std::string(inMessage)))); });
			EXPECT_FALSE(checks.GetSuites().empty());
		},

		[&](int)
		{
			const std::string text = zoncore::utility::UTF16to8(RenderQualityDescription(kRenderQuality_Draft));
			translated += text == "Entwurf";
			EXPECT_TRUE(text == "Entwurf" || text == "Draft" || text == "Brouillon" || text == "Kladde") << text;
		},
		[&](int) { Localizer::Get().SetTranslator(german); },
		[](int) { Localizer::Get().SetTranslator({}); },
		[&](int inRound) { Localizer::Get().SetCatalogue(inRound % 2 == 0 ? french : danish); },
		[](int) { Localizer::Get().SetCatalogue({}); },

		[&](int) { EXPECT_TRUE(SetErrorReporter(reporter)); },
		[&](int) { EXPECT_TRUE(debug::SetContractDialog(contractDialog)); },
		[&](int) { EXPECT_TRUE(debug::SetAssertDialog(assertDialog)); },
		[&](int) { EXPECT_EQ(TickTime(7) / 0.0, TickTime(INT64_MIN)); },   // one contract, reported twice
		[&](int) { debug::BreakAfterAssertDialog(isDisabled, "", "", "", 0, "", true); },

		[&](int inRound)   // small blocks that another thread frees
		{
			UTF16String text(8 + static_cast<std::size_t>(inRound % 120), static_cast<zoncore::UTF16Char>(inRound));
			const std::lock_guard lock(mutex);
			handed.push_back(std::move(text));
		},
		[&](int)
		{
			std::vector<UTF16String> texts;
			{
				const std::lock_guard lock(mutex);
				texts.swap(handed);
				taken += static_cast<int>(texts.size());
			}
			for (const UTF16String& text : texts)
				EXPECT_EQ(std::ranges::count(text, text.front()), std::ssize(text));
		},
	});
	Localizer::Get().SetTranslator({});
	Localizer::Get().SetCatalogue({});
	SetErrorReporter({});
	debug::SetContractDialog({});
	debug::SetAssertDialog({});

	EXPECT_EQ(InitializationCount(), initializations);
	Terminate();
	EXPECT_EQ(InitializationCount(), initializations - 1);   // may fall below 0
	Initialize();
	EXPECT_EQ(reports, 2 * kCalls);
	EXPECT_EQ(contracts, 2 * kCalls);
	EXPECT_EQ(assertions, kCalls);
	EXPECT_EQ(translations, translated);
	EXPECT_EQ(hooks.use_count(), kept);
	EXPECT_EQ(french.use_count(), 1);
	EXPECT_EQ(danish.use_count(), 1);
	EXPECT_EQ(taken + std::ssize(handed), kCalls);

	// Whoever came last to a name came with the last round of its letter.
	std::map<std::string, std::string, std::less<>> last;
	for (int round = kRounds - kLetters; round < kRounds; ++round)
	{
		EXPECT_EQ(LookupPropertiesForName(NameOf(round)), PropertiesOf(round)) << round;
		last.emplace(std::string(1, Letter(round)), std::to_string(round));
	}
	std::map<std::string, std::string, std::less<>> found;
	checks.Run(
		"threads", [&](auto inName, bool, auto inMessage) { EXPECT_TRUE(found.emplace(inName, inMessage).second); });
	EXPECT_EQ(found, last);
}

}   // namespace
