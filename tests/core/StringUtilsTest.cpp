#include "zoncore/StringUtils.h"

#include "tests/Walks.h"
#include "zoncore/UTF16Stream.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

namespace
{

using namespace zoncore;
using namespace zoncore::utility;

UTF16String Units(std::initializer_list<unsigned> inUnits)
{
	UTF16String text;
	for (const unsigned unit : inUnits)
		text.push_back(static_cast<UTF16Char>(unit));
	return text;
}

// One code point in the bit patterns of table 3-6 of the Unicode Standard, whether it is legal or not.
std::string Encode(unsigned inCodePoint, int inBytes)
{
	if (inBytes == 1)
		return {static_cast<char>(inCodePoint)};
	std::string text;
	for (int i = 1; i < inBytes; ++i, inCodePoint >>= 6)
		text.insert(text.begin(), static_cast<char>(0x80 + inCodePoint % 0x40));
	const unsigned lead = 0x100u - (0x100u >> inBytes);
	return static_cast<char>(lead + inCodePoint) + text;
}

int BytesOf(unsigned inCodePoint)
{
	return inCodePoint < 0x80 ? 1 : inCodePoint < 0x800 ? 2 : inCodePoint < 0x10000 ? 3 : 4;
}

TEST(UTF8, EveryCodePointGoesBothWays)
{
	const unsigned step = zontest::WalkLength(1u, 61u);
	for (unsigned point = 0; point <= 0x10FFFF; ++point)
	{
		const bool isSkipped = (point + 1) % 0x400 > 0x81 && point % step != 0;
		if (isSkipped || (point >= 0xD800 && point <= 0xDFFF))
			continue;
		const std::string text = std::string(1, 'a').append(Encode(point, BytesOf(point)));
		const UTF16String wide = UTF8to16(text);
		ASSERT_EQ(
			wide, point < 0x10000 ? Units({'a', point}) : Units({'a', 0xD7C0 + (point >> 10), 0xDC00 + point % 0x400}));
		ASSERT_EQ(UTF16to8(wide), text) << point;
	}
}

TEST(UTF8, FormsThatAreNotTheShortestSurrogatesAndWhatIsAboveTheLastAreIllFormed)
{
	const auto expectPieces = [](const std::string& inText)
	{ EXPECT_EQ(UTF8to16(inText + "z"), UTF16String(inText.size(), 0xFFFD) + Units({'z'})); };
	for (int bytes = 2; bytes <= 4; ++bytes)
		for (unsigned point = 0; BytesOf(point) < bytes; point += 1 + point / 5)
			expectPieces(Encode(point, bytes));
	for (unsigned point = 0xD800; point <= 0xDFFF; ++point)
		expectPieces(Encode(point, 3));
	for (unsigned point = 0x110000; point <= 0x1FFFFF; point += 0x3FFF)
		expectPieces(Encode(point, 4));
}

TEST(UTF8, IllFormedPiecesAreMaximalSubparts)
{
	for (const auto& [text, expected] : std::initializer_list<std::pair<const char*, const char*>>{
			 // Tables 3-8 to 3-11 of the Unicode Standard, "Conformance", U+FFFD substitution, which is "_" here.
			 {"\xC0\xAF\xE0\x80\xBF\xF0\x81\x82\x41", "________A"},
			 {"\xED\xA0\x80\xED\xBF\xBF\xED\xAF\x41", "________A"},
			 {"\xF4\x91\x92\x93\xFF\x41\x80\xBF\x42", "_____A__B"},
			 {"\xE1\x80\xE2\xF0\x91\x92\xF1\xBF\x41", "____A"},
			 // The example of its chapter 5.22.
			 {"\x61\xF1\x80\x80\xE1\x80\xC2\x62\x80\x63\x80\xBF\x64", "a___b_c__d"},
			 // Cut off.
			 {"\xFF\xFF\xC3", "___"},
			 {"\xE2\x82", "_"},
			 {"\xF0\x9F\x8E", "_"},
		 })
	{
		UTF16String wide = AsciiToUTF16(expected);
		std::ranges::replace(wide, '_', 0xFFFD);
		const std::string more = std::string(text) + "\xBF";   // what lies behind a view is not read
		EXPECT_EQ(UTF8to16(std::string_view(more).substr(0, more.size() - 1)), wide) << testing::PrintToString(text);
	}
}

TEST(UTF16, LoneSurrogatesAreReplacedOneByOne)
{
	EXPECT_EQ(UTF16to8(Units({0xDFAC, 0xD83C})), "\uFFFD\uFFFD");
	EXPECT_EQ(UTF16to8(Units({0xD83C, 0xD83C, 0xDFAC, 0xDFAC})), "\uFFFD\U0001F3AC\uFFFD");
	EXPECT_EQ(UTF16to8(Units({'x', 0xD800, 0xE000})), "x\uFFFD\uE000");
	EXPECT_EQ(UTF16to8(UTF16StringView(Units({0xD83C, 0xDFAC})).substr(0, 1)), "\uFFFD");
}

TEST(Ascii, BytesAbove7FAreReplaced)
{
	for (unsigned byte = 0; byte <= 0xFF; ++byte)
		EXPECT_EQ(AsciiToUTF16(std::string{static_cast<char>(byte), 'a'}), Units({byte < 0x80 ? byte : 0xFFFD, 'a'}));
}

TEST(Coercion, WritesAsAStreamDoes)
{
	EXPECT_EQ(UTF16to8(Coercion(-12'345'678) + Coercion(" text ") + Coercion(1234567.0)), "-12345678 text 1.23457e+06");
}

TEST(ReplaceInString, ReplacesAllAndSearchesNothingTwice)
{
	struct Case
	{
		const char *mText, *mWhat, *mWith, *mExpected;
	};
	for (const auto& [text, what, with, expected] :
		std::initializer_list<Case>{{"@0 of @1, @0", "@0", "two", "two of @1, two"}, {"aaaaa", "aa", "a", "aaa"},
			{"aaa", "a", "aa", "aaaaaa"}, {"abc", "abc", "", ""}, {"abcabd", "abd", "-", "abc-"},
			{"abc", "a", "y", "ybc"}, {"abc", "abcd", "y", "abc"}, {"abc", "", "y", "abc"}, {"", "a", "y", ""}})
	{
		UTF16String replaced = AsciiToUTF16(text);
		ReplaceInString(replaced, AsciiToUTF16(what), AsciiToUTF16(with));
		EXPECT_EQ(UTF16to8(replaced), expected);
	}
	UTF16String same = AsciiToUTF16("text");   // one object for several arguments
	ReplaceInString(same, AsciiToUTF16("e"), same);
	EXPECT_EQ(UTF16to8(same), "ttextxt");
	ReplaceInString(same, same, AsciiToUTF16("new"));
	EXPECT_EQ(UTF16to8(same), "new");
}

}   // namespace
