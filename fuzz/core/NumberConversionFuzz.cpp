// Numbers as text and as fractions, against the C library and exact arithmetic.

#include "fuzz/Checks.h"
#include "tests/Platform.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"

#include <boost/multiprecision/cpp_int.hpp>

#include <algorithm>
#include <cerrno>
#include <climits>
#include <clocale>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <utility>

namespace
{

using namespace zoncore;
using namespace zoncore::utility;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

bool IsSame(double inA, double inB)
{
	return std::bit_cast<std::uint64_t>(inA) == std::bit_cast<std::uint64_t>(inB);
}

// The text without what only the C library takes for a part of a number.
std::string ForTheCLibrary(const UTF16String& inText)
{
	std::string text;
	for (const UTF16Char unit : inText)
	{
		const bool isKnown = unit < 0x80 && unit != 0 && std::strchr("0123456789.eE+- \t\n\v\f\r", unit) != nullptr;
		text.push_back(isKnown ? static_cast<char>(unit) : '~');
	}
	return text;
}

template <class Integer>
void CheckInteger(const UTF16String& inText, const std::string& inNarrow)
{
	char* end = nullptr;
	errno = 0;
	const long long expected = std::strtoll(inNarrow.c_str(), &end, 10);
	const bool isExpected = end != inNarrow.c_str() && errno == 0 && expected >= std::numeric_limits<Integer>::min()
		&& expected <= std::numeric_limits<Integer>::max();
	Integer value = 99;
	Require(StringToNumber(inText, value, 0) == isExpected, "integers are taken and refused as by strtoll");
	Require(value == (isExpected ? expected : 0), "integers have the value that strtoll reads");
}

void CheckReading(FuzzInput& ioInput)
{
	const UTF16String text = ioInput.Text();
	const std::string narrow = ForTheCLibrary(text);
	CheckInteger<int>(text, narrow);
	CheckInteger<long long>(text, narrow);
	char* end = nullptr;
	const double expected = (zontest::ClassicNumbers(), std::strtod(narrow.c_str(), &end));
	double value = 99;
	Require(StringToNumber(text, value, 0) == (end != narrow.c_str()), "doubles are taken and refused as by strtod");
	Require(IsSame(value, end != narrow.c_str() ? expected : 0), "doubles have the value that strtod reads");
}

// The text of a number made of what printf writes. Beyond 1,100 decimals a double has zeros only; texts of that many
// digits are longer than all that are asked for here.
std::string Expected(double inValue, std::size_t inDigits, std::size_t inDecimals, unsigned inFlags, int inLength)
{
	if (std::isnan(inValue))
		return "nan";
	if (std::isinf(inValue))
		return inValue < 0 ? "-inf" : "inf";
	const zontest::ClassicNumbers classic;
	char buffer[1'500];
	std::snprintf(
		buffer, sizeof buffer, "%.*f", static_cast<int>(std::min(inDecimals, std::size_t{1'100})), std::abs(inValue));
	std::string text = buffer;
	const std::size_t wholeDigits = std::min(text.find('.'), text.size());
	text.insert(0, std::max(std::min(inDigits, std::size_t{400}), wholeDigits) - wholeDigits, '0');
	if ((inFlags & kNumberFlag_DropTrailingZeros) != 0 && text.find('.') != std::string::npos)
	{
		text.erase(text.find_last_not_of('0') + 1);
		text.erase(text.find_last_not_of('.') + 1);
	}
	if (inValue < 0 && text.find_first_of("123456789") != std::string::npos)
		text.insert(0, 1, '-');
	if (static_cast<std::int64_t>(text.size()) > inLength)
		std::snprintf(buffer, sizeof buffer, "%g", inValue);
	return static_cast<std::int64_t>(text.size()) > inLength ? buffer : text;
}

double TakeDouble(FuzzInput& ioInput)
{
	return ioInput.Flag() ? ioInput.Any<double>() : static_cast<double>(ioInput.Edge<std::int64_t>()) / 1'001;
}

void CheckRoundTrip(FuzzInput& ioInput)
{
	const double value = TakeDouble(ioInput);
	const UTF16String text = NumberToString(value, 1, 1'074, kNumberFlag_DropTrailingZeros, INT_MAX);
	double again = 99;
	const bool isRead = StringToNumber(text, again, 0);
	Require(isRead == std::isfinite(value), "finite doubles can be read back");
	Require(!isRead || again == value, "doubles with all their decimals survive");
}

void CheckWriting(FuzzInput& ioInput)
{
	const double value = TakeDouble(ioInput);
	const auto digits = static_cast<std::size_t>(ioInput.Edge<std::uint64_t>());
	const auto decimals = static_cast<std::size_t>(ioInput.Edge<std::uint64_t>());
	const auto flags = ioInput.Any<unsigned short>();
	const int length = ioInput.Any<std::int8_t>();
	Require(UTF16to8(NumberToString(value, digits, decimals, flags, length))
			== Expected(value, digits, decimals, flags, length),
		"numbers are written as by printf");
}

template <class Integer>
void CheckIntegerText(Integer inValue)
{
	const UTF16String text = IntegerToString(inValue);
	Require(UTF16to8(text) == std::to_string(inValue), "integers are written as by the standard library");
	long long value = 99;
	const bool isRead = StringToNumber(text, value, 0);
	Require(isRead == std::in_range<long long>(inValue), "integers are read where they fit");
	Require(!isRead || std::cmp_equal(value, inValue), "integers survive");
}

using Exact = boost::multiprecision::cpp_int;

// |inValue - p/q| x 2^100 x q.
Exact Distance(double inValue, std::int64_t inNumerator, std::int64_t inDenominator)
{
	int exponent = 0;
	const Exact mantissa(static_cast<std::int64_t>(std::ldexp(std::frexp(inValue, &exponent), 53)));
	return abs((mantissa << (47 + exponent)) * inDenominator - (Exact(inNumerator) << 100));
}

void CheckFraction(FuzzInput& ioInput)
{
	const double value = TakeDouble(ioInput);
	constexpr std::int64_t kLargest = 2'147'483'646;
	const boost::rational<int> fraction = RationalApproximation(value);
	Require(std::abs(static_cast<std::int64_t>(fraction.numerator())) <= kLargest && fraction.denominator() > 0
			&& fraction.denominator() <= kLargest,
		"terms are in their range");
	if (!(std::abs(value) > 0x1p-40 && std::abs(value) < 0x1p40))
		return;
	const std::int64_t denominator = 1 + ioInput.Any<std::uint32_t>() % kLargest;
	const std::int64_t numerator
		= std::clamp<std::int64_t>(std::llround(value * static_cast<double>(denominator)), -kLargest, kLargest);
	const Exact distance = Distance(value, fraction.numerator(), fraction.denominator());
	Require(distance * denominator <= Distance(value, numerator, denominator) * fraction.denominator(),
		"no fraction is closer");
}

void CheckTruncation(FuzzInput& ioInput)
{
	const double value = TakeDouble(ioInput);
	const bool fits64 = value >= -0x1p63 && value < 0x1p63;
	Require(TruncateTo<std::int64_t>(value) == (fits64 ? static_cast<std::int64_t>(value) : INT64_MIN), "64 bits");
	const bool fits32 = std::trunc(value) >= -0x1p31 && std::trunc(value) < 0x1p31;
	Require(TruncateTo<std::int32_t>(value) == (fits32 ? static_cast<std::int32_t>(value) : INT32_MIN), "32 bits");
}

void CheckIntegers(FuzzInput& ioInput)
{
	CheckIntegerText(ioInput.Edge<int>());
	CheckIntegerText(ioInput.Edge<unsigned>());
	CheckIntegerText(ioInput.Edge<std::int64_t>());
	CheckIntegerText(ioInput.Edge<std::uint64_t>());
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf(
		{CheckReading, CheckWriting, CheckRoundTrip, CheckFraction, CheckTruncation, CheckIntegers}, inData, inSize);
}
