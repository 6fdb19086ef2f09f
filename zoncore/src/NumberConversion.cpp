#include "zoncore/NumberConversion.h"

#include "zoncore/Rational.h"
#include "zoncore/StringUtils.h"
#include "zoncore/TextScanner.h"
#include "zoncore/WideInteger.h"
#include "zoncore/WrappingArithmetic.h"
#include "zoncore/src/System.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <span>
#include <string_view>
#include <system_error>
#include <utility>

namespace zoncore::utility
{
namespace
{

// ---- Numbers to text -------------------------------------------------------------------------------------------------

constexpr std::size_t kMostIntegerDigits = 309;   // of a finite double
constexpr std::size_t kMostDecimals = 1'074;      // beyond these every double has zeros only
constexpr std::size_t kLongestFixedText = kMostIntegerDigits + 1 + kMostDecimals;

// The digits of inMagnitude, rounded; no more decimals than a double can have.
std::string_view FixedText(double inMagnitude, std::size_t inDecimals, std::span<char, kLongestFixedText> outBuffer)
{
	char* const begin = outBuffer.data();
	const auto decimals = static_cast<int>(std::min<std::size_t>(inDecimals, kMostDecimals));
	const auto result = std::to_chars(begin, begin + outBuffer.size(), inMagnitude, std::chars_format::fixed, decimals);
	return {begin, result.ptr};
}

std::string_view WithoutTrailingZeros(std::string_view inText)
{
	if (inText.find('.') == std::string_view::npos)
		return inText;
	const std::size_t last = inText.find_last_not_of('0');
	return inText.substr(0, inText[last] == '.' ? last : last + 1);
}

// ---- Text to numbers -------------------------------------------------------------------------------------------------

template <class Integer>
bool ReadInteger(UTF16StringView inText, Integer& outValue)
{
	TextScanner scanner(inText);
	scanner.SkipWhiteSpace();
	const bool isNegative = scanner.TakeSign() == Sign::Minus;
	const DigitRun digits = scanner.TakeDigits(Magnitude(std::numeric_limits<Integer>::max()) + (isNegative ? 1 : 0));
	const bool isNumber = digits.mCount != 0 && !digits.mIsTooLarge;
	const std::uint64_t magnitude = isNumber ? digits.mValue : 0;
	outValue = static_cast<Integer>(isNegative ? 0 - magnitude : magnitude);
	return isNumber;
}

std::size_t CountDigits(UTF16StringView inText)
{
	return static_cast<std::size_t>(std::ranges::find_if_not(inText, IsDigit) - inText.begin());
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
	TextScanner exponent(inText.substr(length + 1));
	exponent.TakeSign();
	return exponent.TakeDigits(0).mCount == 0 ? length : length + 1 + exponent.GetPosition();
}

// The number after an exponent's mark; one that is far beyond every text's length and every double is cut short.
std::int64_t ReadExponent(UTF16StringView inText)
{
	constexpr std::uint64_t kMost = 4'000'000'000'000'000'000;
	TextScanner scanner(inText);
	const bool isNegative = scanner.TakeSign() == Sign::Minus;
	const auto magnitude = static_cast<std::int64_t>(scanner.TakeDigits(kMost).mValue);
	return isNegative ? -magnitude : magnitude;
}

// A number as "." with digits, the first of them not 0, for the library to read: no text makes it longer.
class SignificantDigits
{
public:
	explicit SignificantDigits(UTF16StringView inDigits)
	{
		*mEnd++ = '.';
		for (const UTF16Char digit : inDigits)
			if (IsDigit(digit))
				Append(static_cast<char>(digit));
	}

	// This, times ten to the power of inExponent; infinite or zero when out of range.
	double Scaled(std::int64_t inExponent)
	{
		constexpr std::int64_t kHuge = 400;   // beyond every double by far
		if (inExponent > kHuge)
			return std::numeric_limits<double>::infinity();
		if (inExponent < -kHuge)
			return 0;
		*mEnd = 'e';
		const auto exponent = std::to_chars(mEnd + 1, mBuffer.data() + mBuffer.size(), inExponent);
#if defined(__cpp_lib_to_chars)
		double value = 0;
		const auto result = std::from_chars(mBuffer.data(), exponent.ptr, value);
		if (result.ec == std::errc::result_out_of_range)
			return inExponent > 0 ? std::numeric_limits<double>::infinity() : 0;
		return value;
#else
		*exponent.ptr = '\0';
		return system::ReadDouble(mBuffer.data());
#endif
	}

private:
	// A double, and the middle between two of them, has at most 768 digits: of those that follow it only matters whether
	// one is not 0, which a single last digit says.
	static constexpr std::ptrdiff_t kMostDigits = 770;

	void Append(char inDigit)
	{
		if (mEnd - mBuffer.data() <= kMostDigits)
			*mEnd++ = inDigit;
		else if (inDigit != '0')
			mEnd[-1] = '1';
	}

	std::array<char, kMostDigits + 8> mBuffer;   // ".", "e-400" and an end included
	char* mEnd = mBuffer.data();
};

// The value of a decimal number as DecimalLength finds it.
double ReadDecimal(UTF16StringView inText)
{
	const auto isMark = [](UTF16Char inChar) { return (inChar | 0x20) == 'e'; };
	const auto isSignificant = [](UTF16Char inChar) { return inChar >= '1' && inChar <= '9'; };
	const UTF16Char* const begin = inText.data();
	const UTF16Char* const end = begin + inText.size();
	const UTF16Char* const mark = std::find_if(begin, end, isMark);
	const UTF16Char* const point = std::find(begin, mark, UTF16Char{'.'});
	const UTF16Char* const first = std::find_if(begin, mark, isSignificant);
	if (first == mark)
		return 0;
	const std::int64_t place = first < point ? point - first : point - first + 1;
	const std::int64_t exponent = mark == end ? 0 : ReadExponent({mark + 1, end});
	return SignificantDigits({first, mark}).Scaled(place + exponent);
}

// ---- Fractions -------------------------------------------------------------------------------------------------------

constexpr std::int64_t kLargestTerm = 2'147'483'646;

// The value to come near to, exactly.
struct Target
{
	UInt128 mNumerator;
	UInt128 mDenominator;
};

struct Fraction
{
	std::int64_t mNumerator;     // [0, kLargestTerm]
	std::int64_t mDenominator;   // [0, kLargestTerm]
};

// For magnitudes in [2^-33, 2^31): the numerator is below 2^53, the denominator at most 2^86.
Target ExactTarget(double inMagnitude)
{
	constexpr int kMantissaBits = 53;
	int exponent = 0;
	const double mantissa = std::frexp(inMagnitude, &exponent);
	return {static_cast<std::uint64_t>(std::ldexp(mantissa, kMantissaBits)),
		UInt128{1u} << static_cast<unsigned>(kMantissaBits - exponent)};
}

// The closer of two neighbours on both sides of inTarget, then that with the smaller denominator, then that nearer to
// zero. inTarget is compared with the middle between them; no product exceeds 2^117, the middle being at most twice it.
Fraction Closer(const Target& inTarget, const Fraction& inA, const Fraction& inB)
{
	const std::int64_t a = inA.mNumerator * inB.mDenominator;
	const std::int64_t b = inB.mNumerator * inA.mDenominator;
	const UInt128 target = inTarget.mNumerator * static_cast<std::uint64_t>(2 * inA.mDenominator * inB.mDenominator);
	const UInt128 middle = inTarget.mDenominator * static_cast<std::uint64_t>(a + b);
	if (target != middle)
		return (target < middle) == (a < b) ? inA : inB;
	if (inA.mDenominator != inB.mDenominator)
		return inA.mDenominator < inB.mDenominator ? inA : inB;
	return inA.mNumerator < inB.mNumerator ? inA : inB;
}

// How often inLast can be added to inBefore, term by term, before a term is too large.
std::int64_t MostSteps(const Fraction& inBefore, const Fraction& inLast)
{
	const auto steps = [](std::int64_t inStart, std::int64_t inStep)
	{ return inStep == 0 ? kLargestTerm : (kLargestTerm - inStart) / inStep; };
	return std::min(steps(inBefore.mNumerator, inLast.mNumerator), steps(inBefore.mDenominator, inLast.mDenominator));
}

// The closest fraction with terms up to kLargestTerm. Convergents approach the target from both sides in turn; the best
// fraction is the last convergent that fits or the last semiconvergent that fits on the way to the next one.
Fraction ClosestFraction(const Target& inTarget)
{
	Fraction before{0, 1};
	Fraction last{1, 0};
	Target rest = inTarget;
	while (rest.mDenominator != 0u)
	{
		const UInt128 quotient = rest.mNumerator / rest.mDenominator;
		const std::int64_t steps = MostSteps(before, last);
		const bool fits = quotient <= static_cast<std::uint64_t>(steps);
		const std::int64_t count = fits ? static_cast<std::int64_t>(static_cast<std::uint64_t>(quotient)) : steps;
		const Fraction next{
			before.mNumerator + count * last.mNumerator, before.mDenominator + count * last.mDenominator};
		if (!fits)
			return Closer(inTarget, last, next);
		before = std::exchange(last, next);
		rest = {rest.mDenominator, rest.mNumerator % rest.mDenominator};
	}
	return last;
}

}   // namespace

std::string_view WriteGeneral(double inValue, GeneralText& outText) noexcept
{
	constexpr int kSignificantDigits = 6;
	const auto result = std::to_chars(
		outText.data(), outText.data() + outText.size(), inValue, std::chars_format::general, kSignificantDigits);
	return {outText.data(), result.ptr};
}

UTF16String NumberToString(double inValue, std::size_t inMinIntegerDigits, std::size_t inDecimals,
	Flags<unsigned short> inFlags, int inMaxLength)
{
	if (std::isnan(inValue))
		return AsciiToUTF16("nan");
	if (std::isinf(inValue))
		return AsciiToUTF16(inValue < 0 ? "-inf" : "inf");

	std::array<char, kLongestFixedText> buffer;
	const std::string_view fixed = FixedText(std::abs(inValue), inDecimals, buffer);
	const bool keepsZeros = !inFlags.Test(kNumberFlag_DropTrailingZeros);
	const std::string_view digits = keepsZeros ? fixed : WithoutTrailingZeros(fixed);
	const bool isNegative = inValue < 0 && digits.find_first_not_of("0.") != std::string_view::npos;
	const std::size_t integerDigits = std::min(digits.find('.'), digits.size());
	const std::size_t moreDigits = inMinIntegerDigits > integerDigits ? inMinIntegerDigits - integerDigits : 0;
	const std::size_t moreDecimals = keepsZeros && inDecimals > kMostDecimals ? inDecimals - kMostDecimals : 0;

	// Compared piece by piece: the counts come from the caller and their sum could wrap.
	const std::size_t maxLength = inMaxLength < 0 ? 0 : static_cast<std::size_t>(inMaxLength);
	const std::size_t length = digits.size() + (isNegative ? 1 : 0);
	if (length > maxLength || moreDecimals > maxLength - length || moreDigits > maxLength - length - moreDecimals)
	{
		GeneralText text;
		return AsciiToUTF16(WriteGeneral(inValue, text));
	}

	UTF16String text(length + moreDecimals + moreDigits, '0');
	if (isNegative)
		text.front() = '-';
	std::ranges::copy(digits, text.begin() + static_cast<std::ptrdiff_t>((isNegative ? 1 : 0) + moreDigits));
	return text;
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
	TextScanner scanner(inText);
	scanner.SkipWhiteSpace();
	const bool isNegative = scanner.TakeSign() == Sign::Minus;
	const UTF16StringView number = inText.substr(scanner.GetPosition());
	const std::size_t length = DecimalLength(number);
	if (length == 0)
		return false;
	const double magnitude = ReadDecimal(number.substr(0, length));
	outValue = isNegative ? -magnitude : magnitude;
	return true;
}

boost::rational<int> RationalApproximation(double inValue)
{
	constexpr double kNothing = 0x1p-33;   // nearer to 0 than to the smallest fraction other than 0
	const double magnitude = std::abs(inValue);
	const int sign = inValue < 0 ? -1 : 1;
	if (std::isnan(inValue) || magnitude < kNothing)
		return {0, 1};
	if (magnitude >= static_cast<double>(kLargestTerm))
		return {sign * static_cast<int>(kLargestTerm), 1};
	const Fraction closest = ClosestFraction(ExactTarget(magnitude));
	return {sign * static_cast<int>(closest.mNumerator), static_cast<int>(closest.mDenominator)};
}

}   // namespace zoncore::utility
