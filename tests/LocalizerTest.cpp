#include "zoncore/Localizer.h"

#include "tests/Allocations.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <atomic>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace zoncore
{
namespace
{

using config::Localizer;
using utility::AsciiToUTF16;
using utility::UTF16to8;

// The host's translator for as long as it lives.
class WithTranslator
{
public:
	explicit WithTranslator(config::Translator inTranslator)
	{
		Localizer::Get().SetTranslator(std::move(inTranslator));
	}
	WithTranslator(const WithTranslator&) = delete;
	WithTranslator& operator=(const WithTranslator&) = delete;
	~WithTranslator() { Localizer::Get().SetTranslator({}); }
};

std::string Look(std::string_view inKey)
{
	return UTF16to8(Localizer::Get().Lookup(inKey));
}

TEST(Localizer, GivesTheTextBehindTheFirstEqualsSign)
{
	EXPECT_EQ(Look("$$$/area/Name=English text"), "English text");
	EXPECT_EQ(Look("$$$/area/Name=a=b"), "a=b");
	EXPECT_EQ(Look("$$$/area/Name="), "");
	EXPECT_EQ(Look("$$$/area/Name"), "");
	EXPECT_EQ(Look(""), "");
	EXPECT_EQ(Look("=\xC3\xA9 @0"), "\xC3\xA9 @0");
}

TEST(Localizer, AsksTheTranslatorWithTheWholeKey)
{
	std::vector<std::string> keys;
	const WithTranslator translator(
		[&](std::string_view inKey, UTF16String& outText)
		{
			keys.emplace_back(inKey);
			EXPECT_TRUE(outText.empty());
			outText = AsciiToUTF16("Entwurf");
			return inKey != "$$$/Unknown=Unknown";
		});
	EXPECT_EQ(Look("$$$/Draft=Draft"), "Entwurf");
	EXPECT_EQ(Look("$$$/Unknown=Unknown"), "Unknown");   // what it wrote before it gave up is gone
	EXPECT_EQ(UTF16to8(ZString("$$$/Draft=Draft")), "Entwurf");
	EXPECT_EQ(keys, (std::vector<std::string>{"$$$/Draft=Draft", "$$$/Unknown=Unknown", "$$$/Draft=Draft"}));
	Localizer::Get().SetTranslator(nullptr);
	EXPECT_EQ(Look("$$$/Draft=Draft"), "Draft");
}

TEST(Localizer, TakesATranslatorThatThrowsForNone)
{
	const WithTranslator translator(
		[](std::string_view, UTF16String& outText) -> bool
		{
			outText = AsciiToUTF16("half a te");
			throw std::runtime_error("no more text");
		});
	EXPECT_EQ(Look("$$$/Draft=Draft"), "Draft");
}

TEST(Localizer, LetsATranslatorReplaceItself)
{
	const WithTranslator translator(
		[copy = std::string("held as long as it runs")](std::string_view, UTF16String& outText)
		{
			Localizer::Get().SetTranslator({});
			outText = AsciiToUTF16(copy);
			return true;
		});
	EXPECT_EQ(Look("$$$/Draft=Draft"), "held as long as it runs");
	EXPECT_EQ(Look("$$$/Draft=Draft"), "Draft");
}

TEST(Localizer, AnswersWhileTranslatorsChange)
{
	std::atomic<bool> isDone = false;
	std::vector<std::thread> threads;
	for (int i = 0; i < 3; ++i)
		threads.emplace_back(
			[&]
			{
				while (!isDone)
				{
					const std::string text = Look("$$$/Draft=Draft");
					ASSERT_TRUE(text == "Draft" || text == "a text of its own") << text;
				}
			});
	for (int i = 0; i < 2'000; ++i)
	{
		Localizer::Get().SetTranslator(
			[text = AsciiToUTF16("a text of its own")](std::string_view, UTF16String& outText)
			{
				outText = text;
				return true;
			});
		if (i % 3 == 0)
			Localizer::Get().SetTranslator({});
	}
	isDone = true;
	for (std::thread& thread : threads)
		thread.join();
	Localizer::Get().SetTranslator({});
}

TEST(Localizer, IsAsBeforeWhenMemoryRunsOut)
{
	const WithTranslator translator(
		[](std::string_view, UTF16String& outText)
		{
			outText
				= AsciiToUTF16("a translation that is long enough to need memory of its own, however short the pool");
			return true;
		});
	const auto isTranslated = [] { EXPECT_EQ(Look("=English").substr(0, 13), "a translation"); };
	zontest::FailEachAllocation([]
		{ Localizer::Get().SetTranslator([large = std::string(100, 'x')](auto, auto&) { return large.empty(); }); },
		isTranslated);
	EXPECT_EQ(Look("=English"), "English");
}

std::string Fill(const char* inTemplate, std::initializer_list<UTF16String> inTexts)
{
	return UTF16to8(ZString(std::string("$$$/Key=") + inTemplate, inTexts));
}

TEST(ZString, FillsPlaceholdersInOnePass)
{
	const UTF16String one = AsciiToUTF16("one"), mark = AsciiToUTF16("@1"), at = AsciiToUTF16("@");
	EXPECT_EQ(Fill("@0 x @1, @0", {one, AsciiToUTF16("1080")}), "one x 1080, one");
	EXPECT_EQ(Fill("@0@1", {mark, one}), "@1one");
	EXPECT_EQ(Fill("@01", {at, one}), "@1");
	EXPECT_EQ(Fill("@@0@", {one}), "@one@");
	EXPECT_EQ(Fill("@10", {at, one}), "one0");
	EXPECT_EQ(Fill("@0@2@9@x @", {one, one}), "one@2@9@x @");
	EXPECT_EQ(Fill("\u00E9@0 \u2026@1", {one, one}), "\u00E9one \u2026one");
	EXPECT_EQ(Fill("@0", {{}}), "");
	EXPECT_EQ(Fill("@0", {}), "@0");
	EXPECT_EQ(Fill("no placeholders", {one, one}), "no placeholders");
	EXPECT_EQ(Fill("", {one}), "");
	EXPECT_EQ(Fill("@9@8", {{}, {}, {}, {}, {}, {}, {}, {}, at, one, mark}), "one@");
	const UTF16String surrogates{0xD83C, '@', '0', 0xDFAC};
	const UTF16String filled{0xD83C, 'o', 'n', 'e', 0xDFAC};
	EXPECT_EQ(FillPlaceholders(surrogates, std::vector{one}), filled);
}

TEST(ZString, FillsTheTranslationNotTheEnglishText)
{
	const WithTranslator translator(
		[](std::string_view, UTF16String& outText)
		{
			outText = AsciiToUTF16("@1 of @0");
			return true;
		});
	const UTF16String text = ZString("=@0 by @1", {AsciiToUTF16("a"), AsciiToUTF16("b")});
	EXPECT_EQ(UTF16to8(text), "b of a");
}

}   // namespace
}   // namespace zoncore
