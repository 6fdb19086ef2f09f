#pragma once

/// \file
/// Conversions between numbers, and between numbers and text. None depends on a locale; all are safe on any thread.

#include "zoncore/Export.h"
#include "zoncore/Flags.h"
#include "zoncore/TruncateTo.h"
#include "zoncore/UTF16String.h"

#include <array>
#include <charconv>
#include <concepts>
#include <cstddef>
#include <limits>
#include <string_view>

namespace boost
{

template <typename IntType>
class rational;

}   // namespace boost

namespace zoncore::utility
{

/// Drops the trailing zeros of a fraction, and then a bare point.
inline constexpr unsigned short kNumberFlag_DropTrailingZeros = 4;

/// inValue in fixed notation, correctly rounded to inDecimals places (exact halves to even): "1.0", "29.97", "0.9091".
/// The integer part is padded with zeros to inMinIntegerDigits (0 acts as 1). A negative value that rounds to zero has no
/// sign. Text of more than inMaxLength characters, sign included, is written as printf's "%g" writes it instead
/// ("1.79769e+308"). Infinities are "inf" and "-inf", NaN is "nan".
///
/// Counts of any size are legal: text that no memory holds is longer than inMaxLength. The result is what is allocated.
ZONCORE_API UTF16String NumberToString(double inValue, std::size_t inMinIntegerDigits, std::size_t inDecimals,
	Flags<unsigned short> inFlags, int inMaxLength);

/// Room for what WriteGeneral writes.
using GeneralText = std::array<char, 16>;

/// inValue as printf's "%g" and a stream write it by default: six significant digits without trailing zeros, with an exponent
/// where that is shorter ("1.5", "0.333333", "1.79769e+308", "inf"). The text lies in outText.
ZONCORE_API std::string_view WriteGeneral(double inValue, GeneralText& outText) noexcept;

/// inValue in decimal digits, with "-" before a negative one.
template <std::integral Integer>
UTF16String IntegerToString(Integer inValue)
{
	std::array<char, std::numeric_limits<Integer>::digits10 + 2> text;   // with the last digit and a sign
	return UTF16String(text.data(), std::to_chars(text.data(), text.data() + text.size(), inValue).ptr);
}

/// Reads the longest number at the start of inText: ASCII white space, an optional sign, decimal digits; for a double
/// also "." with more digits and an exponent that has digits. What follows is ignored. False, and 0, when there are no
/// digits or when an integer is out of range; a double out of range is the infinity of its sign, or zero, with true.
/// inOptions is accepted and changes nothing.
///
/// Doubles are correctly rounded (exact halves to even) whatever the number of digits. No memory is allocated, and the
/// time is linear in the length of the number.
ZONCORE_API bool StringToNumber(UTF16StringView inText, int& outValue, unsigned inOptions);
ZONCORE_API bool StringToNumber(UTF16StringView inText, long long& outValue, unsigned inOptions);
ZONCORE_API bool StringToNumber(UTF16StringView inText, double& outValue, unsigned inOptions);

template <class Number>
bool StringToNumber(const UTF16String& inText, Number& outValue, unsigned inOptions)
{
	return StringToNumber(UTF16StringView(inText), outValue, inOptions);
}

/// The fraction closest to inValue with both terms in -2147483646..2147483646; of two equally close ones that with the
/// smaller denominator, then the one nearer to zero. NaN gives 0/1; a larger magnitude gives plus or minus 2147483646/1.
/// The closest fraction to a rounded quotient need not be the quotient's own. Costs some dozens of divisions at most. Using
/// it takes zoncore/Rational.h.
///
/// Compare a boost::rational with a boost::rational only: with a bare integer the comparison never returns in C++20 with
/// the supported compilers and Boost.
ZONCORE_API boost::rational<int> RationalApproximation(double inValue);

}   // namespace zoncore::utility
