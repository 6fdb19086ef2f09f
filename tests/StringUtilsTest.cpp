#include "zoncore/StringUtils.h"

#include "tests/Allocations.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace zoncore::utility
{
namespace
{

UTF16String Units(std::initializer_list<unsigned> inUnits)
{
	UTF16String text;
	for (const unsigned unit : inUnits)
		text.push_back(static_cast<UTF16Char>(unit));
	return text;
}

// The code points of 16-bit text, by the definition of the encoding form; lone surrogates stand for themselves.
std::vector<unsigned> CodePoints(const UTF16String& inText)
{
	std::vector<unsigned> points;
	for (const UTF16Char unit : inText)
	{
		const bool completes
			= unit >= 0xDC00 && unit <= 0xDFFF && !points.empty() && points.back() >= 0xD800 && points.back() <= 0xDBFF;
		if (completes)
			points.back() = (points.back() - 0xD800) * 0x400 + (unit - 0xDC00) + 0x10000;
		else
			points.push_back(unit);
	}
	return points;
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
	for (unsigned point = 0; point <= 0x10FFFF; ++point)
	{
		if (point == 0xD800)
			point = 0xE000;
		const std::string text = Encode(point, BytesOf(point));
		const UTF16String wide = UTF8to16("a" + text);
		ASSERT_EQ(CodePoints(wide), (std::vector<unsigned>{'a', point}));
		ASSERT_EQ(UTF16to8(wide), "a" + text) << point;
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
	struct Case
	{
		std::string mText;
		UTF16String mExpected;
	};
	const std::vector<Case> cases{
		// Tables 3-8 to 3-11 of the Unicode Standard, "Conformance", U+FFFD substitution.
		{"\xC0\xAF\xE0\x80\xBF\xF0\x81\x82\x41", UTF16String(8, 0xFFFD) + Units({0x41})},
		{"\xED\xA0\x80\xED\xBF\xBF\xED\xAF\x41", UTF16String(8, 0xFFFD) + Units({0x41})},
		{"\xF4\x91\x92\x93\xFF\x41\x80\xBF\x42",
			Units({0xFFFD, 0xFFFD, 0xFFFD, 0xFFFD, 0xFFFD, 0x41, 0xFFFD, 0xFFFD, 0x42})},
		{"\xE1\x80\xE2\xF0\x91\x92\xF1\xBF\x41", Units({0xFFFD, 0xFFFD, 0xFFFD, 0xFFFD, 0x41})},
		// The example of its chapter 5.22.
		{"\x61\xF1\x80\x80\xE1\x80\xC2\x62\x80\x63\x80\xBF\x64",
			Units({0x61, 0xFFFD, 0xFFFD, 0xFFFD, 0x62, 0xFFFD, 0x63, 0xFFFD, 0xFFFD, 0x64})},
		{"\xFF\xFF", Units({0xFFFD, 0xFFFD})},
		{"\xE2\x82", Units({0xFFFD})},
		{"\xF0\x9F\x8E", Units({0xFFFD})},
		{"\xF0\x9F\x8E\xAC\xF0", Units({0xD83C, 0xDFAC, 0xFFFD})},
		{"\xC3", Units({0xFFFD})},
		{"\xEF\xBB\xBF", Units({0xFEFF})},
	};
	for (const Case& each : cases)
		EXPECT_EQ(UTF8to16(each.mText), each.mExpected) << testing::PrintToString(each.mText);
}

TEST(UTF16, LoneSurrogatesAreReplacedOneByOne)
{
	const std::string replacement = "\xEF\xBF\xBD";
	EXPECT_EQ(UTF16to8(Units({0xD83C})), replacement);
	EXPECT_EQ(UTF16to8(Units({0xDFAC, 0xD83C})), replacement + replacement);
	EXPECT_EQ(UTF16to8(Units({0xD83C, 0xD83C, 0xDFAC, 0xDFAC})), replacement + "\xF0\x9F\x8E\xAC" + replacement);
	EXPECT_EQ(UTF16to8(Units({0xD83C, 'x', 0xDBFF, 0xDFFF})), replacement + "x\xF4\x8F\xBF\xBF");
	EXPECT_EQ(UTF16to8(Units({'x', 0xD800, 0xE000})), "x" + replacement + "\xEE\x80\x80");
	EXPECT_EQ(UTF16to8(UTF16StringView()), "");
}

TEST(Ascii, BytesAbove7FAreReplaced)
{
	for (unsigned byte = 0; byte <= 0xFF; ++byte)
		EXPECT_EQ(AsciiToUTF16(std::string(3, static_cast<char>(byte))),
			UTF16String(3, byte < 0x80 ? static_cast<UTF16Char>(byte) : 0xFFFD));
}

TEST(Coercion, WritesAsAStreamDoes)
{
	EXPECT_EQ(UTF16to8(Coercion(-12'345'678)), "-12345678");
	EXPECT_EQ(UTF16to8(Coercion(1234567.0)), "1.23457e+06");
	EXPECT_EQ(UTF16to8(Coercion("text")), "text");
	EXPECT_EQ(UTF16to8(Coercion(UTF16Char{'A'})), "65");
}

std::string Replace(const char* inText, const char* inWhat, const char* inWith)
{
	UTF16String text = AsciiToUTF16(inText);
	ReplaceInString(text, AsciiToUTF16(inWhat), AsciiToUTF16(inWith));
	return UTF16to8(text);
}

TEST(ReplaceInString, ReplacesAllAndSearchesNothingTwice)
{
	EXPECT_EQ(Replace("@0 of @1, @0", "@0", "two"), "two of @1, two");
	EXPECT_EQ(Replace("aaaaa", "aa", "a"), "aaa");
	EXPECT_EQ(Replace("aaa", "a", "aa"), "aaaaaa");
	EXPECT_EQ(Replace("abc", "abc", ""), "");
	EXPECT_EQ(Replace("abcabd", "abd", "-"), "abc-");
	EXPECT_EQ(Replace("abc", "x", "y"), "abc");
	EXPECT_EQ(Replace("abc", "abcd", "y"), "abc");
	EXPECT_EQ(Replace("abc", "", "y"), "abc");
	EXPECT_EQ(Replace("", "a", "y"), "");
}

TEST(ReplaceInString, TakesOneObjectForSeveralArguments)
{
	UTF16String text = AsciiToUTF16("text");
	ReplaceInString(text, text, AsciiToUTF16("new"));
	EXPECT_EQ(UTF16to8(text), "new");
	ReplaceInString(text, AsciiToUTF16("e"), text);
	EXPECT_EQ(UTF16to8(text), "nneww");
	ReplaceInString(text, text, text);
	EXPECT_EQ(UTF16to8(text), "nneww");
}

// Above the largest block of the pool, so that every allocation can fail in every build.
TEST(StringUtils, GiveAllOrNothingWhenMemoryRunsOut)
{
	const std::string narrow(300, 'x');
	const UTF16String wide = AsciiToUTF16(narrow), what = AsciiToUTF16("x"), with = AsciiToUTF16("yyy");
	UTF16String text = wide;
	EXPECT_GT(
		zontest::FailEachAllocation([&] { ReplaceInString(text, what, with); }, [&] { ASSERT_EQ(text, wide); }), 0);
	EXPECT_EQ(text, UTF16String(900, 'y'));

	std::string result;
	const auto expectAll = [&](const auto& inFunction)
	{
		EXPECT_GT(zontest::FailEachAllocation([&] { result = inFunction(); }, [] {}), 0);
		EXPECT_EQ(result, narrow);
	};
	expectAll([&] { return std::string(UTF16to8(wide)); });
	expectAll([&] { return UTF16to8(UTF8to16(narrow)); });
	expectAll([&] { return UTF16to8(AsciiToUTF16(narrow)); });
	expectAll([&] { return UTF16to8(Coercion(wide)); });
}

}   // namespace
}   // namespace zoncore::utility
