#pragma once

#include "zoncore/Debug.h"
#include "zonmediatypes/src/TextWriter.h"

#include <atomic>
#include <cmath>
#include <cstddef>
#include <cstdint>

namespace zonmediatypes::utility
{

/// Holds the longest text of a sample position: four numbers of 20 characters and their separators.
using PositionText = TextWriter<4 * (kLongestInteger + 1)>;

/// Digits of the largest number below inCount, as far as positions are padded: 1 to 4.
constexpr std::size_t PaddedDigits(std::int32_t inCount) noexcept
{
	if (inCount <= 10)
		return 1;
	if (inCount <= 100)
		return 2;
	if (inCount <= 1'000)
		return 3;
	return 4;
}

/// Replaces outText by what inPut writes of inArguments.
template <class Put, class... Arguments>
void SetText(zoncore::UTF16String& outText, Put inPut, const Arguments&... inArguments)
{
	PositionText text;
	inPut(text, inArguments...);
	outText.assign(text.GetText());
}

/// The part of inValue behind the point, with its sign; exact.
inline double Fraction(double inValue) noexcept
{
	return inValue - std::trunc(inValue);
}

/// Tells the host's assert dialog of misuse, unless the user has switched the calling place off, and stops in an
/// attached debugger when the dialog asks for that. Hosts know these places by the file of the conversions' entry
/// points.
inline void ReportMisuse(std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage,
	const char* inFunction, int inLine = __builtin_LINE())
{
	const bool wantsBreak = zoncore::debug::BreakAfterAssertDialog(
		ioDisabled, inCondition, inMessage, "zonmediatypes/src/TimeConversionUtils.cpp", inLine, inFunction, true);
	if (wantsBreak && zoncore::debug::IsDebuggerAttached())
		zoncore::debug::Break();
}

}   // namespace zonmediatypes::utility
