#include "zoncore/TextScanner.h"

#include <gtest/gtest.h>
#include <string>

using zoncore::utility::Sign;
using zoncore::utility::TextScanner;

TEST(TextScanner, KnowsWhereEachPieceBegins)
{
	TextScanner scanner(std::string_view("\t -12:034x"));
	scanner.SkipWhiteSpace();
	EXPECT_EQ(scanner.TakeSign(), Sign::Minus);
	EXPECT_EQ(scanner.TakeSign(), Sign::None);
	EXPECT_EQ(scanner.GetPosition(), 3u);
	EXPECT_EQ(scanner.TakeDigits(99).mValue, 12u);
	EXPECT_FALSE(scanner.Take(';'));
	EXPECT_TRUE(scanner.Take(':'));
	EXPECT_EQ(scanner.GetPosition(), 6u);
	EXPECT_EQ(scanner.TakeDigits(99).mCount, 3u);
	EXPECT_EQ(scanner.TakeDigits(99).mCount, 0u);
	EXPECT_EQ(scanner.Peek(), 'x');
	scanner.Skip(5);
	EXPECT_TRUE(scanner.IsAtEnd());
	EXPECT_EQ(scanner.Peek(), 0);
}

TEST(TextScanner, HoldsNumbersAtTheirLimit)
{
	constexpr std::uint64_t kMost = std::numeric_limits<std::uint64_t>::max();
	const struct
	{
		const char16_t* mText;
		std::uint64_t mMost, mValue;
		bool mIsTooLarge;
	} cases[] = {
		{u"100", 100, 100, false}, {u"101", 100, 100, true}, {u"0000000000000000000000000000007", 7, 7, false},
		{u"18446744073709551615", kMost, kMost, false}, {u"18446744073709551616", kMost, kMost, true},
		{u"18446744073709551620", kMost, kMost, true},   // the last digit carries
		{u"99999999999999999999999", 5, 5, true}, {u"340282366920938463463374607431768211456", 9, 9, true},   // 2^128
		{u"１", 9, 0, false},   // a digit of no ASCII
	};
	for (const auto& row : cases)
	{
		const auto run = TextScanner(std::u16string_view(row.mText)).TakeDigits(row.mMost);
		EXPECT_EQ(run.mValue, row.mValue) << std::u16string_view(row.mText).size();
		EXPECT_EQ(run.mIsTooLarge, row.mIsTooLarge) << std::u16string_view(row.mText).size();
	}
}
