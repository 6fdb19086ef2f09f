#include "zoncore/NumberConversion.h"

#include "zoncore/StringUtils.h"

#include <algorithm>
#include <boost/multiprecision/cpp_int.hpp>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>

namespace zoncore::utility
{
namespace
{

// ---- Numbers to text -------------------------------------------------------------------------------------------------

constexpr std::size_t kMostIntegerDigits = 309;   // of a finite double
constexpr std::size_t kMostDecimals = 1074;       // beyond these every double has zeros only
constexpr int kGeneralDigits = 6;                 // the precision of "%g"

std::string GeneralText(double inValue)
{
	char buffer[32];
	const auto result = std::to_chars(buffer, std::end(buffer), inValue, std::chars_format::general, kGeneralDigits);
	return {buffer, result.ptr};
}

// The digits of inMagnitude, rounded; no more decimals than a double can have.
std::string FixedText(double inMagnitude, unsigned long inDecimals)
{
	std::string text(kMostIntegerDigits + 1 + kMostDecimals, '\0');
	const auto decimals = static_cast<int>(std::min<unsigned long>(inDecimals, kMostDecimals));
	const auto result
		= std::to_chars(text.data(), text.data() + text.size(), inMagnitude, std::chars_format::fixed, decimals);
	text.resize(static_cast<std::size_t>(result.ptr - text.data()));
	return text;
}

void DropTrailingZeros(std::string& ioText)
{
	if (ioText.find('.') == std::string::npos)
		return;
	ioText.erase(ioText.find_last_not_of('0') + 1);
	if (ioText.back() == '.')
		ioText.pop_back();
}

// ---- Text to numbers -------------------------------------------------------------------------------------------------

constexpr bool IsWhiteSpace(UTF16Char inChar)
{
	return inChar == ' ' || (inChar >= '\t' && inChar <= '\r');
}

constexpr bool IsDigit(UTF16Char inChar)
{
	return inChar >= '0' && inChar <= '9';
}

std::size_t CountDigits(UTF16StringView inText)
{
	return static_cast<std::size_t>(std::ranges::find_if_not(inText, IsDigit) - inText.begin());
}

// Takes a sign off the front of ioText; true for "-".
bool TakeSign(UTF16StringView& ioText)
{
	if (ioText.empty() || (ioText.front() != '-' && ioText.front() != '+'))
		return false;
	const bool isNegative = ioText.front() == '-';
	ioText.remove_prefix(1);
	return isNegative;
}

// The sign and the characters of the number that inText begins with, white space and "+" taken off.
struct NumberText
{
	bool mIsNegative;
	UTF16StringView mText;
};

NumberText SkipToNumber(UTF16StringView inText)
{
	inText.remove_prefix(static_cast<std::size_t>(std::ranges::find_if_not(inText, IsWhiteSpace) - inText.begin()));
	const bool isNegative = TakeSign(inText);
	return {isNegative, inText};
}

template <class Integer>
bool ReadInteger(UTF16StringView inText, Integer& outValue)
{
	outValue = 0;
	const NumberText number = SkipToNumber(inText);
	const std::size_t digits = CountDigits(number.mText);
	using Wide = std::uint64_t;
	const Wide largest = static_cast<Wide>(std::numeric_limits<Integer>::max()) + (number.mIsNegative ? 1 : 0);
	Wide magnitude = 0;
	for (const UTF16Char digit : number.mText.substr(0, digits))
	{
		const Wide value = digit - Wide{'0'};
		if (magnitude > (largest - value) / 10)
			return false;
		magnitude = magnitude * 10 + value;
	}
	outValue = static_cast<Integer>(number.mIsNegative ? 0 - magnitude : magnitude);
	return digits != 0;
}

// How much of inText is a decimal number without sign: digits, a point and an exponent that has digits. 0 for none.
std::size_t DecimalLength(UTF16StringView inText)
{
	const std::size_t whole = CountDigits(inText);
	std::size_t length = whole;
	if (length < inText.size() && inText[length] == '.')
	{
		const std::size_t decimals = CountDigits(inText.substr(length + 1));
		if (whole + decimals == 0)
			return 0;
		length += 1 + decimals;
	}
	if (length == 0 || length == inText.size() || (inText[length] | 0x20) != 'e')
		return length;
	UTF16StringView exponent = inText.substr(length + 1);
	TakeSign(exponent);
	const std::size_t digits = CountDigits(exponent);
	return digits == 0 ? length : inText.size() - exponent.size() + digits;
}

// Whether a decimal number that no double holds is too large, and not too small, for one.
bool IsHuge(std::string_view inText)
{
	// A double holds every power of ten that a number whose exponent is out of range could be off by, so the place of
	// the first digit other than 0 decides: text lengths are far below the exponents that matter, unless both are absurd.
	const std::size_t mark = inText.find_first_of("eE");
	const std::string_view digits = inText.substr(0, mark);
	const std::size_t point = std::min(digits.find('.'), digits.size());
	const std::size_t first = digits.find_first_of("123456789");
	if (first == std::string_view::npos)
		return false;
	const double place = first < point ? static_cast<double>(point - first) : -static_cast<double>(first - point);
	if (mark == std::string_view::npos)
		return place > 0;
	const bool isNegative = inText[mark + 1] == '-';
	const std::size_t begin = inText.find_first_of("123456789", mark);
	double exponent = 0;
	for (const char digit : begin == std::string_view::npos ? std::string_view() : inText.substr(begin))
		exponent = exponent * 10 + (digit - '0');
	return place + (isNegative ? -exponent : exponent) > 0;
}

// ---- Fractions -------------------------------------------------------------------------------------------------------

constexpr int kLargestTerm = 2'147'483'646;

using Wide = boost::multiprecision::number<boost::multiprecision::cpp_int_backend<512, 512,
	boost::multiprecision::signed_magnitude, boost::multiprecision::unchecked, void>>;

struct Fraction
{
	Wide mNumerator;
	Wide mDenominator;
};

// A positive double as an exact fraction, for magnitudes from 2^-33 to 2^31.
Fraction ExactFraction(double inMagnitude)
{
	constexpr int kMantissaBits = 53;
	int exponent = 0;
	const double mantissa = std::frexp(inMagnitude, &exponent);
	Fraction fraction{static_cast<std::int64_t>(std::ldexp(mantissa, kMantissaBits)), 1};
	const int shift = exponent - kMantissaBits;
	if (shift >= 0)
		fraction.mNumerator <<= shift;
	else
		fraction.mDenominator <<= -shift;
	return fraction;
}

// |inTarget - inFraction| x both denominators, so that distances to one target compare after a cross-multiplication.
Wide ScaledDistance(const Fraction& inTarget, const Fraction& inFraction)
{
	return abs(inTarget.mNumerator * inFraction.mDenominator - inFraction.mNumerator * inTarget.mDenominator);
}

// The better of two neighbours: the closer one, then that with the smaller denominator, then that nearer to zero.
const Fraction& Closer(const Fraction& inTarget, const Fraction& inA, const Fraction& inB)
{
	const Wide a = ScaledDistance(inTarget, inA) * inB.mDenominator;
	const Wide b = ScaledDistance(inTarget, inB) * inA.mDenominator;
	if (a != b)
		return a < b ? inA : inB;
	if (inA.mDenominator != inB.mDenominator)
		return inA.mDenominator < inB.mDenominator ? inA : inB;
	return inA.mNumerator < inB.mNumerator ? inA : inB;
}

// The closest fraction with terms up to kLargestTerm. Convergents approach the target from both sides in turn; the best
// fraction is the last convergent that fits or the last semiconvergent that fits on the way to the next one.
Fraction ClosestFraction(const Fraction& inTarget)
{
	Fraction before{0, 1};
	Fraction last{1, 0};
	Fraction rest = inTarget;
	while (rest.mDenominator != 0)
	{
		const Wide quotient = rest.mNumerator / rest.mDenominator;
		Wide fitting = quotient;
		if (last.mNumerator != 0)
			fitting = std::min<Wide>(fitting, (kLargestTerm - before.mNumerator) / last.mNumerator);
		if (last.mDenominator != 0)
			fitting = std::min<Wide>(fitting, (kLargestTerm - before.mDenominator) / last.mDenominator);
		const Fraction next{
			before.mNumerator + fitting * last.mNumerator, before.mDenominator + fitting * last.mDenominator};
		if (fitting < quotient)
			return next.mDenominator == 0 ? last : last.mDenominator == 0 ? next : Closer(inTarget, last, next);
		before = std::exchange(last, next);
		rest = {rest.mDenominator, rest.mNumerator - quotient * rest.mDenominator};
	}
	return last;
}

}   // namespace

UTF16String NumberToString(double inValue, unsigned long inMinIntegerDigits, unsigned long inDecimals,
	Flags<unsigned short> inFlags, int inMaxLength)
{
	if (std::isnan(inValue))
		return AsciiToUTF16("nan");
	if (std::isinf(inValue))
		return AsciiToUTF16(inValue < 0 ? "-inf" : "inf");

	std::string text = FixedText(std::abs(inValue), inDecimals);
	const bool keepsZeros = !inFlags.Test(kNumberFlag_DropTrailingZeros);
	const bool isNegative = inValue < 0 && text.find_first_not_of("0.") != std::string::npos;
	const unsigned long moreDecimals = keepsZeros && inDecimals > kMostDecimals ? inDecimals - kMostDecimals : 0;
	if (!keepsZeros)
		DropTrailingZeros(text);
	const std::size_t integerDigits = std::min(text.find('.'), text.size());
	const unsigned long moreDigits = inMinIntegerDigits > integerDigits ? inMinIntegerDigits - integerDigits : 0;

	// Compared piece by piece: the counts come from the caller and their sum could wrap.
	const std::size_t maxLength = inMaxLength < 0 ? 0 : static_cast<std::size_t>(inMaxLength);
	const std::size_t length = text.size() + (isNegative ? 1 : 0);
	if (length > maxLength || moreDecimals > maxLength - length || moreDigits > maxLength - length - moreDecimals)
		return AsciiToUTF16(GeneralText(inValue));

	text.insert(0, moreDigits, '0');
	text.append(moreDecimals, '0');
	if (isNegative)
		text.insert(0, 1, '-');
	return AsciiToUTF16(text);
}

bool StringToNumber(UTF16StringView inText, int& outValue, unsigned /*inOptions*/)
{
	return ReadInteger(inText, outValue);
}

bool StringToNumber(UTF16StringView inText, long long& outValue, unsigned /*inOptions*/)
{
	return ReadInteger(inText, outValue);
}

bool StringToNumber(UTF16StringView inText, double& outValue, unsigned /*inOptions*/)
{
	outValue = 0;
	const NumberText number = SkipToNumber(inText);
	const std::size_t length = DecimalLength(number.mText);
	if (length == 0)
		return false;
	const std::string text(number.mText.begin(), number.mText.begin() + static_cast<std::ptrdiff_t>(length));
	double magnitude = 0;
	const auto result = std::from_chars(text.data(), text.data() + text.size(), magnitude);
	if (result.ec == std::errc::result_out_of_range)
		magnitude = IsHuge(text) ? std::numeric_limits<double>::infinity() : 0;
	outValue = number.mIsNegative ? -magnitude : magnitude;
	return true;
}

boost::rational<int> RationalApproximation(double inValue)
{
	constexpr double kNothing = 0x1p-33;   // nearer to 0 than to the smallest fraction other than 0
	const double magnitude = std::abs(inValue);
	const int sign = inValue < 0 ? -1 : 1;
	if (std::isnan(inValue) || magnitude < kNothing)
		return {0, 1};
	if (magnitude >= kLargestTerm)
		return {sign * kLargestTerm, 1};
	const Fraction closest = ClosestFraction(ExactFraction(magnitude));
	return {sign * static_cast<int>(closest.mNumerator), static_cast<int>(closest.mDenominator)};
}

}   // namespace zoncore::utility
