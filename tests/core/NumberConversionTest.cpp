#include "zoncore/NumberConversion.h"

#include "tests/HostileLocale.h"
#include "tests/Platform.h"
#include "tests/Walks.h"
#include "zoncore/StringUtils.h"

#include <boost/integer/mod_inverse.hpp>
#include <boost/multiprecision/cpp_int.hpp>
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <bit>
#include <cerrno>
#include <climits>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <iomanip>
#include <limits>
#include <optional>
#include <random>
#include <regex>
#include <sstream>
#include <string>
#include <utility>

namespace
{

using namespace zoncore;
using namespace zoncore::utility;

// No case depends on the global locale.
const zontest::HostileLocale sHostileLocale;

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

std::mt19937_64 sRandom(20'260'101);

// Doubles of every magnitude: half of them any bit pattern, half of them near to what people write.
double RandomDouble()
{
	const std::uint64_t bits = sRandom();
	if (bits % 2 == 0)
		return std::bit_cast<double>(sRandom());
	return static_cast<double>(static_cast<std::int64_t>(sRandom()) >> (bits / 2 % 60)) / 10'000;
}

// What printf writes, which a classic stream calls.
std::string Print(double inValue, std::ios_base::fmtflags inNotation, long inPrecision)
{
	std::ostringstream text;
	text.imbue(std::locale::classic());
	text.setf(inNotation, std::ios_base::floatfield);
	text << std::setprecision(static_cast<int>(inPrecision)) << inValue;
	return text.str();
}

double ReadAsStrtod(const std::string& inText)
{
	const zontest::ClassicNumbers classic;
	return std::strtod(inText.c_str(), nullptr);
}

// ---- Numbers to text -------------------------------------------------------------------------------------------------

std::string Format(
	double inValue, std::size_t inDigits, std::size_t inDecimals, unsigned short inFlags = 0, int inLength = 31)
{
	return UTF16to8(NumberToString(inValue, inDigits, inDecimals, inFlags, inLength));
}

TEST(IntegerToString, WritesEveryDigit)
{
	EXPECT_EQ(UTF16to8(IntegerToString(LLONG_MIN)), "-9223372036854775808");
	EXPECT_EQ(UTF16to8(IntegerToString(ULLONG_MAX)), "18446744073709551615");
}

TEST(NumberToString, RoundsAsTheCLibraryDoes)
{
	for (int i = 0; i < zontest::WalkLength(200'000, 20'000); ++i)
	{
		const double value = RandomDouble();
		if (!std::isfinite(value))
			continue;
		std::string fixed = Print(std::abs(value), std::ios_base::fixed, i % 12);
		if (value < 0 && fixed.find_first_not_of("0.") != std::string::npos)
			fixed.insert(0, "-");
		ASSERT_EQ(Format(value, 1, static_cast<std::size_t>(i % 12), 0, 400), fixed);
		ASSERT_EQ(Format(value, 1, 0, 0, 0), Print(value, {}, 6));
	}
	EXPECT_EQ(Format(-0x1p1023, 1, 2'000, 0, 2'310), Print(-0x1p1023, std::ios_base::fixed, 2'000));
	EXPECT_EQ(Format(0x1p-1074, 1, SIZE_MAX, 4, INT_MAX), Print(0x1p-1074, std::ios_base::fixed, 1'074));
}

TEST(NumberToString, DropsZerosPadsAndChangesTheNotationOfLongText)
{
	for (const auto& [value, text] : std::initializer_list<std::pair<double, const char*>>{{25, "25"}, {12.5, "12.5"},
			 {100, "100"}, {0, "0"}, {-0.001, "0"}, {-0.0, "0"}, {-0.5, "-0.5"}, {kInfinity, "inf"},
			 {-kInfinity, "-inf"}, {kNaN, "nan"}, {-kNaN, "nan"}, {1e300, "1e+300"}})
		EXPECT_EQ(Format(value, 1, 2, kNumberFlag_DropTrailingZeros), text);
	EXPECT_EQ(Format(100, 1, 0, 0xFFFF), "100");
	EXPECT_EQ(Format(1, 1, 1, 0xFFFB), "1.0");
	for (const auto& [value, text] : std::initializer_list<std::pair<double, const char*>>{
			 {7.5, "007.50"}, {-7.5, "-007.50"}, {1234, "1234.00"}, {-0.001, "000.00"}})
		EXPECT_EQ(Format(value, 3, 2), text);
	EXPECT_EQ(Format(0.5, 0, 0), "0");
	// Just short enough, and too long
	EXPECT_EQ(Format(-1'234'567.5, 1, 1, 0, 10), "-1234567.5");
	EXPECT_EQ(Format(-1'234'567.5, 1, 1, 0, 9), "-1.23457e+06");
	EXPECT_EQ(Format(7, 5, 0, 0, 5) + " " + Format(7, 5, 0, 0, 4), "00007 7");
	EXPECT_EQ(Format(1, 3, 1'075, 0, 1'078) + " " + Format(1, 1, 1'075, 0, 1'076), "1 1");   // one character less each
	EXPECT_EQ(Format(0.5, 1, 0, 0, INT_MIN), "0.5");
	// Counts that no memory holds, and sums of counts that wrap
	for (const std::size_t digits : {std::size_t{1}, SIZE_MAX - 2, SIZE_MAX})
		for (const std::size_t decimals : {SIZE_MAX - 1, SIZE_MAX, std::size_t{0x80000000}})
			EXPECT_EQ(Format(1.5, digits, decimals), "1.5");
	EXPECT_EQ(Format(1.5, SIZE_MAX, 0, 0, INT_MAX), "1.5");
	EXPECT_EQ(Format(1.5, 5, SIZE_MAX, kNumberFlag_DropTrailingZeros), "00001.5");
}

// ---- Text to numbers -------------------------------------------------------------------------------------------------

template <class Number>
std::optional<Number> Read(const std::string& inText)
{
	Number value = 99;
	const bool isRead = StringToNumber(AsciiToUTF16(inText), value, 0);
	EXPECT_TRUE(isRead || value == 0);
	return isRead ? std::optional(value) : std::nullopt;
}

// The number that inText begins with, as the C library reads it.
template <class Number>
std::optional<Number> ReadAsRequired(const std::string& inText)
{
	static const std::regex sNumber(std::is_integral_v<Number>
			? "[ \t\n\v\f\r]*[-+]?[0-9]+"
			: "[ \t\n\v\f\r]*[-+]?([0-9]+\\.?[0-9]*|\\.[0-9]+)([eE][-+]?[0-9]+)?");
	std::smatch match;
	if (!std::regex_search(inText, match, sNumber, std::regex_constants::match_continuous))
		return std::nullopt;
	const std::string number = match.str();
	if constexpr (std::is_integral_v<Number>)
	{
		errno = 0;
		const long long value = std::strtoll(number.c_str(), nullptr, 10);
		return errno == 0 && std::in_range<Number>(value) ? std::optional(static_cast<Number>(value)) : std::nullopt;
	}
	else
		return ReadAsStrtod(number);
}

TEST(StringToNumber, ReadsTheLongestNumber)
{
	std::vector<std::string> texts = {"2147483647", "-2147483648", "2147483648", "-2147483649", "9223372036854775807",
		"-9223372036854775808", "9223372036854775808", "-9223372036854775809", "18446744073709551617", "inf", "nan",
		"0x10", "-0", "1e999", "-1e999", "1e-999", "0e99999999999999999999", "1e99999999999999999999",
		"1e-99999999999999999999", "4.9406564584124654e-324", "2.4703282292062327208e-324", "2.4703282292062328e-324",
		"2.2250738585072011e-308", "1.7976931348623157e308", "1.7976931348623159e308", "9007199254740993.0000001"};
	const std::string alphabet = " \t\v\r\x08\x0E+-..0123456789eE/:x";
	for (int i = 0; i < zontest::WalkLength(20'000, 2'000); ++i)
	{
		std::string& text = texts.emplace_back();
		for (auto length = sRandom() % 10; length > 0; --length)
			text.push_back(alphabet[sRandom() % (text.empty() ? 10 : alphabet.size())]);
	}
	for (const std::string& text : texts)
	{
		ASSERT_EQ(Read<int>(text), ReadAsRequired<int>(text)) << text;
		ASSERT_EQ(Read<long long>(text), ReadAsRequired<long long>(text)) << text;
		ASSERT_EQ(Read<double>(text), ReadAsRequired<double>(text)) << text;
	}
	EXPECT_TRUE(std::signbit(Read<double>("-0").value()));
	int value = 1;
	EXPECT_FALSE(StringToNumber(UTF16String{0xFF11}, value, 0xFFFFFFFF));   // a full-width digit is no digit
	EXPECT_TRUE(StringToNumber(UTF16String{'7', 0xD800, 0}, value, 0xFFFFFFFF) && value == 7);
}

void ExpectDouble(const std::string& inText)
{
	ASSERT_EQ(Read<double>(inText), ReadAsStrtod(inText)) << inText.substr(0, 100);
}

TEST(StringToNumber, RoundsTextOfAnyLengthCorrectly)
{
	for (int i = 0; i < zontest::WalkLength(20'000, 2'000); ++i)
	{
		const double value = std::abs(RandomDouble());
		if (!(value < kInfinity))
			continue;
		ExpectDouble(Print(value, {}, 17));
		// Exactly between two doubles, and a little above: a digit far behind decides.
		const boost::multiprecision::cpp_int mantissa(
			static_cast<std::uint64_t>(std::ldexp(0.5 + value / (1 + value) / 2, 53)) * 2 + 1);
		const std::string middle = boost::multiprecision::cpp_int(mantissa << (i % 300)).str();
		ExpectDouble(middle);
		ExpectDouble(middle + "." + std::string(static_cast<std::size_t>(i % 2'000), '0') + "1");
	}
	ExpectDouble(Print(0x1p-1074, std::ios_base::fixed, 1'075).substr(0, 1'074));
	// The longest middle of all, between the two largest subnormal numbers, and beside it.
	std::string longest = Print(0x1.ffffffffffffep-1023, std::ios_base::scientific, 767);
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

// ---- Fractions -------------------------------------------------------------------------------------------------------

TEST(RationalApproximation, GivesTheClosestFraction)
{
	struct Case
	{
		double mValue;
		int mNumerator, mDenominator;
	};
	constexpr int kMost = 2'147'483'646;
	for (const auto& [value, numerator, denominator] :
		std::initializer_list<Case>{{0, 0, 1}, {-0.0, 0, 1}, {1, 1, 1}, {-2.5, -5, 2}, {29.97, 2'997, 100},
			{1 / 3.0, 1, 3}, {kNaN, 0, 1}, {kInfinity, kMost, 1}, {-kInfinity, -kMost, 1}, {2147483646.0, kMost, 1},
			{-2147483648.0, -kMost, 1}, {2147483645.75, kMost, 1}, {1.0 / kMost, 1, kMost}, {2.34e-10, 1, kMost},
			{2.32e-10, 0, 1}, {-1e-300, 0, 1}, {0x1p-33, 0, 1}, {1 - 0x1p-53, 1, 1}, {0x1p30 + 0.25, 1 << 30, 1},
			// Ties: the smaller denominator, then the one nearer to zero.
			{800'000'000.25, 800'000'000, 1}, {800'000'000.75, 800'000'001, 1}, {-800'000'000.25, -800'000'000, 1},
			{1'073'741'823.5, 1'073'741'823, 1}, {2147483645.5, kMost - 1, 1}})
		EXPECT_TRUE(RationalApproximation(value) == boost::rational<int>(numerator, denominator)) << value;
}

// Nothing is closer to a value than p/q when its neighbours are not: of all fractions with terms that small, the next
// one below is a/b with p*b - a*q = 1 and the largest terms, and the next one above likewise with a*q - p*b = 1.
TEST(RationalApproximation, IsCloserThanItsNeighbours)
{
	using boost::multiprecision::cpp_rational;
	constexpr std::int64_t kMost = 2'147'483'646;
	std::mt19937_64 random(1);
	for (int i = 0; i < zontest::WalkLength(10'000, 1'000); ++i)
	{
		const auto mantissa = static_cast<double>(random() >> 12 | std::uint64_t{1} << 52);
		const double value = std::ldexp(mantissa, static_cast<int>(random() % 61) - 83);   // [2^-31, 2^30)
		const boost::rational<int> closest = RationalApproximation(value);
		ASSERT_TRUE(RationalApproximation(-value) == -closest);
		const std::int64_t p = closest.numerator(), q = closest.denominator();
		const std::int64_t below = q == 1 ? 1 : boost::integer::mod_inverse(p % q, q);
		for (const auto& [a, b] : {std::pair((p * below - 1) / q, below), {p - (p * below - 1) / q, q - below}})
		{
			const std::int64_t steps = std::min((kMost - a) / p, (kMost - b) / q);
			if (b + steps * q == 0)
				continue;   // 1/0 is above everything
			const cpp_rational neighbour(a + steps * p, b + steps * q);
			ASSERT_LE(abs(cpp_rational(value) - cpp_rational(p, q)), abs(cpp_rational(value) - neighbour)) << value;
		}
	}
}

// The run of all tests under a locale that writes numbers otherwise would prove nothing without it.
TEST(TestLocale, IsInForceWhereItIsAskedFor)
{
	const bool isAskedFor = std::getenv("ZON_TEST_LOCALE") != nullptr;
	std::array<char, 8> text{};
	std::snprintf(text.data(), text.size(), "%.1f", 1.5);
	EXPECT_STREQ(text.data(), isAskedFor ? "1,5" : "1.5");
}

}   // namespace
