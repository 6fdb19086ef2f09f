// Numbers as text and as fractions, against the C library and exact arithmetic.

#include "FuzzInput.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"

#include <boost/multiprecision/cpp_int.hpp>

#include <algorithm>
#include <cerrno>
#include <climits>
#include <cmath>
#include <string>

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

void CheckReading(const UTF16String& inText)
{
	const std::string narrow = ForTheCLibrary(inText);
	CheckInteger<int>(inText, narrow);
	CheckInteger<long long>(inText, narrow);
	char* end = nullptr;
	const double expected = std::strtod(narrow.c_str(), &end);
	double value = 99;
	Require(StringToNumber(inText, value, 0) == (end != narrow.c_str()), "doubles are taken and refused as by strtod");
	Require(IsSame(value, end != narrow.c_str() ? expected : 0), "doubles have the value that strtod reads");
}

void CheckWriting(double inValue, FuzzInput& ioInput)
{
	UTF16String text = NumberToString(inValue, 1, 1'074, kNumberFlag_DropTrailingZeros, INT_MAX);
	double value = 99;
	const bool isRead = StringToNumber(text, value, 0);
	Require(isRead == std::isfinite(inValue), "finite doubles can be read back");
	Require(!isRead || value == inValue, "doubles with all their decimals survive");

	const auto digits = ioInput.Edge<unsigned long>();
	const auto decimals = ioInput.Edge<unsigned long>();
	const auto flags = ioInput.Any<unsigned short>();
	const int length = ioInput.Any<std::int8_t>();
	text = NumberToString(inValue, digits, decimals, flags, length);
	if (!std::isfinite(inValue) || (length >= 0 && text.size() <= static_cast<std::size_t>(length) && decimals > 1'100))
		return;
	char general[32], fixed[1'500];
	std::snprintf(general, sizeof general, "%g", inValue);
	std::snprintf(fixed, sizeof fixed, "%.*f", static_cast<int>(std::min(decimals, 1'100ul)), inValue);
	const std::string narrow = UTF16to8(text);
	const bool isPlain = digits <= 1 && flags == 0 && std::strtod(fixed, nullptr) != 0;
	Require(!isPlain || narrow == fixed || narrow == general, "fixed and general text are those of printf");
	Require(
		narrow == general || static_cast<int>(narrow.size()) <= length, "only general text is longer than asked for");
}

using Exact = boost::multiprecision::cpp_int;

// |inValue - p/q| x 2^100 x q.
Exact Distance(double inValue, std::int64_t inNumerator, std::int64_t inDenominator)
{
	int exponent = 0;
	const Exact mantissa(static_cast<std::int64_t>(std::ldexp(std::frexp(inValue, &exponent), 53)));
	return abs((mantissa << (47 + exponent)) * inDenominator - (Exact(inNumerator) << 100));
}

void CheckFraction(double inValue, FuzzInput& ioInput)
{
	constexpr std::int64_t kLargest = 2'147'483'646;
	const boost::rational<int> fraction = RationalApproximation(inValue);
	Require(std::abs(static_cast<std::int64_t>(fraction.numerator())) <= kLargest && fraction.denominator() > 0
			&& fraction.denominator() <= kLargest,
		"terms are in their range");
	if (!(std::abs(inValue) > 0x1p-40 && std::abs(inValue) < 0x1p40))
		return;
	const std::int64_t denominator = 1 + ioInput.Any<std::uint32_t>() % kLargest;
	const std::int64_t numerator
		= std::clamp<std::int64_t>(std::llround(inValue * static_cast<double>(denominator)), -kLargest, kLargest);
	const Exact distance = Distance(inValue, fraction.numerator(), fraction.denominator());
	Require(distance * denominator <= Distance(inValue, numerator, denominator) * fraction.denominator(),
		"no fraction is closer");
}

void CheckTruncation(double inValue)
{
	const bool fits64 = inValue >= -0x1p63 && inValue < 0x1p63;
	Require(TruncateTo<std::int64_t>(inValue) == (fits64 ? static_cast<std::int64_t>(inValue) : INT64_MIN), "64 bits");
	const bool fits32 = std::trunc(inValue) >= -0x1p31 && std::trunc(inValue) < 0x1p31;
	Require(TruncateTo<std::int32_t>(inValue) == (fits32 ? static_cast<std::int32_t>(inValue) : INT32_MIN), "32 bits");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	if (input.Flag())
	{
		CheckReading(input.Text());
		return 0;
	}
	const double value = input.Flag() ? input.Any<double>() : static_cast<double>(input.Edge<std::int64_t>()) / 1'001;
	CheckTruncation(value);
	CheckFraction(value, input);
	CheckWriting(value, input);
	return 0;
}
