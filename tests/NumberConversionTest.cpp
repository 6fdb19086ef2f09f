#include "zoncore/NumberConversion.h"

#include "tests/Allocations.h"
#include "tests/HostileLocale.h"
#include "zoncore/StringUtils.h"

#include <boost/multiprecision/cpp_int.hpp>
#include <gtest/gtest.h>

#include <bit>
#include <climits>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <locale.h>
#include <random>
#include <string>

namespace zoncore::utility
{
namespace
{

constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

static_assert(TruncateTo<std::int32_t>(2147483647.9) == INT_MAX && TruncateTo<std::int32_t>(2147483648.0) == INT_MIN);
static_assert(TruncateTo<std::int32_t>(-2147483648.9) == INT_MIN && TruncateTo<std::int32_t>(-2147483649.0) == INT_MIN);
static_assert(TruncateTo<std::int32_t>(-2147483647.9) == -INT_MAX && TruncateTo<std::int32_t>(-0.9) == 0);
static_assert(TruncateTo<std::int64_t>(0x1p63) == LLONG_MIN && TruncateTo<std::int64_t>(-0x1p63) == LLONG_MIN);
static_assert(
	TruncateTo<std::int64_t>(0x1.fffffffffffffp62) == LLONG_MAX - 1023 && TruncateTo<std::int64_t>(1e300) == LLONG_MIN);
static_assert(
	TruncateTo<std::int64_t>(-0x1.fffffffffffffp62) == -LLONG_MAX + 1023 && TruncateTo<std::int64_t>(2.9) == 2);
static_assert(TruncateTo<std::int64_t>(kNaN) == LLONG_MIN && TruncateTo<std::int32_t>(kInfinity) == INT_MIN);

// Doubles of every magnitude: half of them any bit pattern, half of them near to what people write.
class RandomDoubles
{
public:
	double Next()
	{
		const std::uint64_t bits = mBits();
		if (bits % 2 == 0)
			return std::bit_cast<double>(mBits());
		return static_cast<double>(static_cast<std::int64_t>(mBits()) >> (bits / 2 % 60)) / 10'000;
	}

private:
	std::mt19937_64 mBits{20'260'101};
};

// The C library's own conversions, which serve as judges, follow the process's locale; not while one of these lives.
class ClassicCLocale
{
public:
	ClassicCLocale() : mClassic(::newlocale(LC_ALL_MASK, "C", nullptr)), mBefore(::uselocale(mClassic)) {}
	ClassicCLocale(const ClassicCLocale&) = delete;
	ClassicCLocale& operator=(const ClassicCLocale&) = delete;
	~ClassicCLocale()
	{
		::uselocale(mBefore);
		::freelocale(mClassic);
	}

private:
	::locale_t mClassic;
	::locale_t mBefore;
};

template <class... Arguments>
std::string Print(const char* inFormat, Arguments... inArguments)
{
	const ClassicCLocale locale;
	std::string text(2'500, '\0');
	text.resize(static_cast<std::size_t>(std::snprintf(text.data(), text.size(), inFormat, inArguments...)));
	return text;
}

std::string Format(
	double inValue, unsigned long inDigits, unsigned long inDecimals, unsigned short inFlags, int inLength)
{
	return UTF16to8(NumberToString(inValue, inDigits, inDecimals, inFlags, inLength));
}

TEST(IntegerToString, WritesEveryDigit)
{
	EXPECT_EQ(UTF16to8(IntegerToString(0)), "0");
	EXPECT_EQ(UTF16to8(IntegerToString(-42)), "-42");
	EXPECT_EQ(UTF16to8(IntegerToString(std::numeric_limits<std::int64_t>::min())), "-9223372036854775808");
	EXPECT_EQ(UTF16to8(IntegerToString(std::numeric_limits<std::uint64_t>::max())), "18446744073709551615");
}

TEST(NumberToString, WritesFixedNotation)
{
	struct Case
	{
		const char* mExpected;
		double mValue;
		unsigned long mDigits, mDecimals;
		unsigned short mFlags;
	};
	constexpr unsigned short kDrop = kNumberFlag_DropTrailingZeros;
	for (const Case& each : std::initializer_list<Case>{{"25", 25, 1, 2, kDrop}, {"12.5", 12.5, 1, 2, kDrop},
			 {"29.97", 30'000 / 1'001.0, 1, 2, kDrop}, {"100", 100, 1, 0, kDrop}, {"100", 100, 1, 3, kDrop},
			 {"0", 0, 1, 3, kDrop}, {"-0.5", -0.5, 1, 3, kDrop}, {"1.0", 1, 1, 1, 0}, {"0.9091", 10 / 11.0, 1, 4, 0},
			 {"1.0000", 0.99999, 1, 4, 0}, {"0.12", 0.125, 1, 2, 0}, {"0.38", 0.375, 1, 2, 0}, {"2", 2.5, 1, 0, 0},
			 {"4", 3.5, 1, 0, 0}, {"0", 0.5, 0, 0, 0}, {"1", 0.5000001, 1, 0, 0}, {"007.50", 7.5, 3, 2, 0},
			 {"-007.5", -7.5, 3, 2, kDrop}, {"123", 123, 2, 0, 0}, {"0.00", -0.001, 1, 2, 0}, {"0", -0.0, 1, 2, kDrop},
			 {"-0.01", -0.005000001, 1, 2, 0}, {"000", -0.4, 3, 0, 0}, {"1.0", 1, 1, 1, 0xFFFB}, {"1", 1, 1, 1, 0xFFFF},
			 {"inf", kInfinity, 5, 2, 0}, {"-inf", -kInfinity, 5, 2, kDrop}, {"nan", kNaN, 5, 2, 0},
			 {"nan", -kNaN, 1, 1, 0}})
		EXPECT_EQ(Format(each.mValue, each.mDigits, each.mDecimals, each.mFlags, 31), each.mExpected);
}

TEST(NumberToString, WritesTextThatIsTooLongInGeneralNotation)
{
	EXPECT_EQ(Format(std::numeric_limits<double>::max(), 1, 2, 4, 31), "1.79769e+308");
	EXPECT_EQ(Format(-12'345.5, 1, 1, 0, 8), "-12345.5");
	EXPECT_EQ(Format(-12'345.5, 1, 1, 0, 7), "-12345.5");   // six significant digits: as long as before, and rounded
	EXPECT_EQ(Format(0.125, 1, 3, 0, 5), "0.125");
	EXPECT_EQ(Format(0.0000125, 1, 9, 0, 10), "1.25e-05");
	EXPECT_EQ(Format(7, 5, 0, 0, 4), "7");
	EXPECT_EQ(Format(7, 5, 0, 0, 5), "00007");
	for (const int length : {0, -1, INT_MIN})
		EXPECT_EQ(Format(0.5, 1, 0, 0, length), "0.5");
}

TEST(NumberToString, TakesCountsOfAnySize)
{
	EXPECT_EQ(Format(0.1, 1, 2'000, 0, 2'002), Print("%.2000f", 0.1));
	EXPECT_EQ(Format(0x1p-1074, 1, ULONG_MAX, 4, INT_MAX), Print("%.1074f", 0x1p-1074));
	EXPECT_EQ(Format(1.5, 300, ULONG_MAX, 4, 400), std::string(299, '0') + "1.5");
	for (const unsigned long digits : {1ul, ULONG_MAX - 2, ULONG_MAX})
		for (const unsigned long decimals : {ULONG_MAX - 1, ULONG_MAX, 0x80000000ul})
			EXPECT_EQ(Format(1.5, digits, decimals, 0, 31), "1.5");
	EXPECT_EQ(Format(1.5, ULONG_MAX, 0, 0, INT_MAX), "1.5");
}

TEST(NumberToString, RoundsAsTheCLibraryDoes)
{
	RandomDoubles doubles;
	for (int i = 0; i < 200'000; ++i)
	{
		const double value = doubles.Next();
		if (!std::isfinite(value))
			continue;
		const int decimals = i % 12;
		std::string fixed = Print("%.*f", decimals, std::abs(value));
		if (value < 0 && fixed.find_first_not_of("0.") != std::string::npos)
			fixed.insert(0, "-");
		ASSERT_EQ(Format(value, 1, static_cast<unsigned long>(decimals), 0, 400), fixed);
		ASSERT_EQ(Format(value, 1, 0, 0, 0), Print("%g", value));
	}
}

template <class Number>
std::string Read(const std::string& inText)
{
	Number value = 99;
	const bool isRead = StringToNumber(AsciiToUTF16(inText), value, 0);
	return std::to_string(value) + (isRead ? "" : " rejected");
}

TEST(StringToNumber, ReadsIntegers)
{
	for (const char* const text : {"12", "+12", " \t\n\v\f\r12", "12x", "0012", "12.9", "12 3", "12e3", "12-"})
		EXPECT_EQ(Read<int>(text) + "," + Read<long long>(text), "12,12") << text;
	for (const char* const text : {"", " ", "x12", "-", "+", "+-12", "--12", "- 12", ".5",
			 "\xA0"
			 "12",
			 "e1"})
		EXPECT_EQ(Read<int>(text) + "," + Read<long long>(text), "0 rejected,0 rejected") << text;
	EXPECT_EQ(Read<int>("2147483647"), "2147483647");
	EXPECT_EQ(Read<int>("-2147483648"), "-2147483648");
	EXPECT_EQ(Read<int>("2147483648"), "0 rejected");
	EXPECT_EQ(Read<int>("-2147483649"), "0 rejected");
	EXPECT_EQ(Read<long long>("9223372036854775807"), "9223372036854775807");
	EXPECT_EQ(Read<long long>("-9223372036854775808"), "-9223372036854775808");
	EXPECT_EQ(Read<long long>("9223372036854775808"), "0 rejected");
	EXPECT_EQ(Read<long long>("-9223372036854775809"), "0 rejected");
	EXPECT_EQ(Read<long long>("18446744073709551617"), "0 rejected");
	EXPECT_EQ(Read<int>("-0"), "0");
	EXPECT_EQ(Read<int>(std::string(1'000, '0') + "7"), "7");
	EXPECT_EQ(Read<int>(std::string(1'000, '9')), "0 rejected");
	int value = 1;
	EXPECT_FALSE(StringToNumber(UTF16String{0xFF11}, value, 0xFFFFFFFF));   // a full-width digit is no digit
	EXPECT_TRUE(StringToNumber(UTF16String{'7', 0xD800, 0}, value, 0xFFFFFFFF) && value == 7);
}

// What the C library reads from the first inLength characters must be what is read from the whole text.
void ExpectDouble(const std::string& inText, std::size_t inLength = std::string::npos)
{
	const ClassicCLocale locale;
	double value = 99;
	ASSERT_TRUE(StringToNumber(AsciiToUTF16(inText), value, 0)) << inText;
	ASSERT_EQ(std::bit_cast<std::uint64_t>(value),
		std::bit_cast<std::uint64_t>(std::strtod(inText.substr(0, inLength).c_str(), nullptr)))
		<< inText.substr(0, 100) << " is not " << value;
}

TEST(StringToNumber, ReadsDoubles)
{
	for (const char* const text : {"1", "-1.5", "+.5", "5.", "-0", "0.0", "1e3", "1E+3", "1.25e-3", "  7", "00012.500",
			 "1e999", "-1e999", "1e-999", "-1e-999", "0e999", "1e99999999999999999999", "1e-99999999999999999999",
			 "0e99999999999999999999", "4.9406564584124654e-324", "2.4703282292062327208e-324",
			 "2.4703282292062328e-324", "2.2250738585072011e-308", "1.7976931348623157e308", "1.7976931348623159e308",
			 "9007199254740993", "9007199254740993.0000001", "1e00000000000005"})
		ExpectDouble(text);
	struct Prefix
	{
		const char* mText;
		std::size_t mLength;
	};
	for (const auto& [text, length] :
		std::initializer_list<Prefix>{{"1.5.2", 3}, {"1,5", 1}, {"1e", 1}, {"1e+", 1}, {"1e-x", 1}, {"1.e5", 4},
			{"0x10", 1}, {"1d5", 1}, {"7 8", 1}, {"1.5f", 3}, {"2e1.5", 3}, {"1-2", 1}, {"3_000", 1}})
		ExpectDouble(text, length);
	for (const char* const text : {"", ".", "-.", "e5", ".e5", "-e5", "inf", "nan", "- 1", "--1", "x"})
	{
		double value = 99;
		EXPECT_FALSE(StringToNumber(AsciiToUTF16(text), value, 0)) << text;
		EXPECT_EQ(value, 0) << text;
	}
}

TEST(StringToNumber, RoundsTextOfAnyLengthCorrectly)
{
	RandomDoubles doubles;
	for (int i = 0; i < 20'000; ++i)
	{
		const double value = std::abs(doubles.Next());
		if (!(value < kInfinity))
			continue;
		ExpectDouble(Print("%.17g", value));
		// Exactly between two doubles, and a little above: a digit far behind decides.
		const boost::multiprecision::cpp_int mantissa(
			static_cast<std::uint64_t>(std::ldexp(0.5 + value / (1 + value) / 2, 53)) * 2 + 1);
		const std::string middle = boost::multiprecision::cpp_int(mantissa << (i % 300)).str();
		ExpectDouble(middle);
		ExpectDouble(middle + "." + std::string(static_cast<std::size_t>(i % 2'000), '0') + "1");
	}
	const std::string half = Print("%.1075f", 0x1p-1074).substr(0, 1'074);
	ExpectDouble(half);
	// The longest middle of all, between the two largest subnormal numbers, and beside it.
	std::string longest = Print("%.767e", 0x1.ffffffffffffep-1023);
	ExpectDouble(longest);
	longest.insert(longest.find('e'), "000000001");
	ExpectDouble(longest);
	// Lengths beyond what exponents are made for.
	constexpr std::size_t kLength = 1'000'000;
	ExpectDouble("0." + std::string(kLength, '0') + "15e1000001");
	ExpectDouble("15" + std::string(kLength, '0') + "e-1000001");
	ExpectDouble(std::string(kLength, '0') + "." + std::string(kLength, '0') + "1");
	ExpectDouble(std::string(kLength, '9'));
	ExpectDouble("1e" + std::string(kLength, '0') + "7");
	ExpectDouble("1e" + std::string(kLength, '9'));
}

TEST(StringToNumber, AsksForNoMemory)
{
	const UTF16String text = AsciiToUTF16(std::string(10'000, '1') + "." + std::string(10'000, '2') + "e-10000");
	double number = 0;
	int integer = 0;
	EXPECT_EQ(zontest::CountAllocations(
				  [&]
				  {
					  StringToNumber(text, number, 0);
					  StringToNumber(text, integer, 0);
				  }),
		0u);
	EXPECT_EQ(number, 1 / 9.0);
}

TEST(Numbers, DoNotDependOnTheGlobalLocale)
{
	const zontest::HostileLocale locale;
	EXPECT_EQ(Format(1'234'567.25, 1, 2, 0, 31) + Format(1e300, 1, 2, 0, 31), "1234567.251e+300");
	double value = 0;
	EXPECT_TRUE(StringToNumber(AsciiToUTF16("1234.5,5"), value, 0));
	EXPECT_EQ(value, 1234.5);
}

std::string Approximate(double inValue)
{
	const boost::rational<int> fraction = RationalApproximation(inValue);
	return std::to_string(fraction.numerator()) + "/" + std::to_string(fraction.denominator());
}

TEST(RationalApproximation, GivesTheClosestFraction)
{
	struct Case
	{
		double mValue;
		const char* mExpected;
	};
	for (const Case& each : std::initializer_list<Case>{{0, "0/1"}, {-0.0, "0/1"}, {1, "1/1"}, {-2.5, "-5/2"},
			 {29.97, "2997/100"}, {1 / 3.0, "1/3"}, {kNaN, "0/1"}, {kInfinity, "2147483646/1"},
			 {-kInfinity, "-2147483646/1"}, {1e300, "2147483646/1"}, {2147483646.0, "2147483646/1"},
			 {-2147483648.0, "-2147483646/1"}, {2147483645.75, "2147483646/1"}, {1 / 2147483646.0, "1/2147483646"},
			 {2.34e-10, "1/2147483646"}, {2.32e-10, "0/1"}, {-1e-300, "0/1"}, {0x1p-1074, "0/1"}, {0x1p-33, "0/1"},
			 {1 - 0x1p-53, "1/1"}, {0x1p30 + 0.25, "1073741824/1"},
			 // Ties: the smaller denominator, then the one nearer to zero.
			 {800'000'000.25, "800000000/1"}, {800'000'000.75, "800000001/1"}, {-800'000'000.25, "-800000000/1"},
			 {1'073'741'823.5, "1073741823/1"}, {-1'073'741'823.5, "-1073741823/1"}, {2147483645.5, "2147483645/1"}})
		EXPECT_EQ(Approximate(each.mValue), each.mExpected) << each.mValue;
}

// The closest fraction found step by step: mediants between 0/1 and 1/0 close in on the value until a term is too large.
// Empty when that takes very long.
std::string ApproximateStepwise(double inValue)
{
	using boost::multiprecision::cpp_rational;
	constexpr std::int64_t kLargest = 2'147'483'646;
	const long double value = inValue;   // 64 bits of mantissa hold a 53-bit one times 11 more, not times a denominator
	const cpp_rational exact(inValue);
	std::int64_t lowTop = 0, lowBottom = 1, highTop = 1, highBottom = 0;
	for (int steps = 0; lowTop + highTop <= kLargest && lowBottom + highBottom <= kLargest; ++steps)
	{
		if (steps == 100'000)
			return "";
		const std::int64_t top = lowTop + highTop;
		const std::int64_t bottom = lowBottom + highBottom;
		const long double difference = value * static_cast<long double>(bottom) - static_cast<long double>(top);
		const bool isNear = std::abs(difference) < 1e-6L * static_cast<long double>(top);
		const int side = isNear ? cpp_rational(exact * bottom).compare(cpp_rational(top)) : difference < 0 ? -1 : 1;
		if (side == 0)
			return std::to_string(top) + "/" + std::to_string(bottom);
		(side < 0 ? highTop : lowTop) = top;
		(side < 0 ? highBottom : lowBottom) = bottom;
	}
	const bool takesLow
		= highBottom == 0 || exact - cpp_rational(lowTop, lowBottom) <= cpp_rational(highTop, highBottom) - exact;
	return takesLow ? std::to_string(lowTop) + "/" + std::to_string(lowBottom)
					: std::to_string(highTop) + "/" + std::to_string(highBottom);
}

TEST(RationalApproximation, AgreesWithASearchStepByStep)
{
	std::mt19937_64 random(1);
	int compared = 0;
	for (int i = 0; i < 5'000; ++i)
	{
		const double mantissa = std::ldexp(static_cast<double>(random() >> 11), -53) + 0.5;
		const double value = std::ldexp(mantissa, static_cast<int>(random() % 20) - 10);
		const std::string expected = ApproximateStepwise(value);
		if (expected.empty())
			continue;
		++compared;
		ASSERT_EQ(Approximate(value), expected) << value;
		const boost::rational<int> negative = RationalApproximation(-value);
		ASSERT_TRUE(negative == -RationalApproximation(value));
	}
	EXPECT_GT(compared, 4'500);
}

}   // namespace
}   // namespace zoncore::utility
