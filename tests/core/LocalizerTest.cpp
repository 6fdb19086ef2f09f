#include "zoncore/Localizer.h"

#include "tests/WithTranslator.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <span>
#include <stdexcept>
#include <string>
#include <vector>

namespace
{

using namespace zoncore;
using config::Localizer;
using utility::AsciiToUTF16;
using utility::UTF16to8;
using zontest::WithTranslator;

std::string Look(std::string_view inKey)
{
	return UTF16to8(Localizer::Get().Lookup(inKey));
}

TEST(Localizer, GivesTheTextAfterTheFirstEqualsSign)
{
	EXPECT_EQ(Look("$$$/area/Name=English text"), "English text");
	EXPECT_EQ(Look("$$$/area/Name=a=b"), "a=b");
	EXPECT_EQ(Look("=\u00E9 @0"), "\u00E9 @0");
	for (const char* const key : {"", "$$$/area/Name", "$$$/area/Name="})
		EXPECT_EQ(Look(key), "");
}

TEST(Localizer, AsksTheTranslatorWithTheWholeKey)
{
	const WithTranslator translator(
		[](std::string_view inKey, UTF16String& outText)
		{
			outText = AsciiToUTF16(outText.empty() ? "asked for " : "not empty") + AsciiToUTF16(inKey);
			if (inKey == "Thrown=English")
				throw std::runtime_error("no more text");
			return inKey != "Unknown=English";
		});
	EXPECT_EQ(Look("$$$/Known=English"), "asked for $$$/Known=English");
	EXPECT_EQ(Look("Unknown=English"), "English");   // what was written before giving up is gone
	EXPECT_EQ(Look("Thrown=English"), "English");
	EXPECT_EQ(UTF16to8(ZString("Known=English")), "asked for Known=English");
}

TEST(Localizer, LetsATranslatorReplaceItself)
{
	const WithTranslator translator(
		[copy = std::string("held as long as it runs")](std::string_view, UTF16String& outText)
		{
			Localizer::Get().SetTranslator({});
			return outText = AsciiToUTF16(copy), true;
		});
	EXPECT_EQ(Look("=Draft"), "held as long as it runs");
	EXPECT_EQ(Look("=Draft"), "Draft");
}

TEST(ZString, FillsPlaceholdersInOnePass)
{
	const UTF16String one = AsciiToUTF16("one");
	const UTF16String mark = AsciiToUTF16("@1");
	const UTF16String at = AsciiToUTF16("@");
	struct Case
	{
		const char* mTemplate;
		std::vector<UTF16String> mTexts;
		const char* mExpected;
	};
	for (const auto& [pattern, texts, expected] :
		std::initializer_list<Case>{{"@0 x @1, @0", {one, mark}, "one x @1, one"}, {"@0@1", {mark, one}, "@1one"},
			{"@01", {at, one}, "@1"}, {"@@0@", {one}, "@one@"}, {"@10@2@9@x @", {at, one}, "one0@2@9@x @"},
			{"\u00E9@0 \u2026@1", {one, one}, "\u00E9one \u2026one"}, {"@0", {{}}, ""}, {"@0", {}, "@0"},
			{"none", {one}, "none"}, {"", {one}, ""}, {"@9@8@:", std::vector(11, one), "oneone@:"}})
	{
		EXPECT_EQ(UTF16to8(ZString(std::string("$$$/Key=") + pattern, texts)), expected);
		const WithTranslator translator([&translation = pattern](std::string_view, UTF16String& outText)
			{ return outText = utility::UTF8to16(translation), true; });
		EXPECT_EQ(UTF16to8(ZString("=English @0", texts)), expected);

		const UTF16String wide = utility::UTF8to16(pattern);
		const UTF16String filled = FillPlaceholders(wide, texts);
		UTF16String buffer(filled.size(), '-');
		EXPECT_EQ(FillPlaceholders(std::span(buffer).first(buffer.size() / 2), wide, texts), filled.size());
		EXPECT_EQ(buffer, UTF16String(filled.size(), '-'));   // there was no room
		EXPECT_EQ(FillPlaceholders(std::span(buffer), wide, texts), filled.size());
		EXPECT_EQ(buffer, filled);
	}
	EXPECT_EQ(UTF16to8(ZString("=@0 @1", {one, at})), "one @");
}

}   // namespace
