#pragma once

#include "zoncore/SourcePlace.h"
#include "zoncore/TextWriter.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <span>
#include <type_traits>

namespace zonmediatypes::utility
{

using PositionText = zoncore::utility::TextWriter<kLongestPosition>;
static_assert(kLongestPosition
	>= 4 * zoncore::utility::kLongestInteger + 3);   // bar, beat, ticks and thousandths, with what separates them

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

/// Puts beats as ConvertSamplesToBeats describes them.
void PutBeats(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate, double inTempo) noexcept;

/// Puts bars and beats as ConvertSamplesToBarsAndBeats describes them; false, after telling the host, for misuse.
bool PutBarsAndBeats(PositionText& ioText, double inSamples, double inSampleRate, const BeatInfo& inBeatInfo,
	bool inIsDuration, std::int32_t inStyle);

/// Calls inPut with a text and inArguments; false where inPut says so.
template <class Put, class... Arguments>
bool PutText(PositionText& ioText, Put inPut, const Arguments&... inArguments)
{
	if constexpr (std::is_void_v<decltype(inPut(ioText, inArguments...))>)
		return inPut(ioText, inArguments...), true;
	else
		return inPut(ioText, inArguments...);
}

/// Replaces outText by what inPut writes of inArguments; false, and outText untouched, where inPut fails.
template <class Put, class... Arguments>
bool SetText(zoncore::UTF16String& outText, Put inPut, const Arguments&... inArguments)
{
	PositionText text;
	if (!PutText(text, inPut, inArguments...))
		return false;
	outText.assign(text.GetText());
	return true;
}

/// The same into a caller's buffer, which is left alone where the text does not fit; the length of the text, 0 where inPut
/// fails.
template <class Char, class Put, class... Arguments>
std::size_t WriteText(std::span<Char> outText, Put inPut, const Arguments&... inArguments)
{
	PositionText text;
	return PutText(text, inPut, inArguments...) ? zoncore::utility::CopyText(text.GetText(), outText) : 0;
}

/// The part of inValue after the point, with its sign; exact.
inline double Fraction(double inValue) noexcept
{
	return inValue - std::trunc(inValue);
}

/// What callers can do wrong. Each is a place of its own, which the user can switch off in the assert dialog.
enum class Misuse : std::uint8_t
{
	ReadBeats,   ///< without a BeatInfo, as the next three
	ReadBarsAndBeats,
	WriteBeats,
	WriteBarsAndBeats,
	DropFrameNTSC,   ///< both at once
	NoBeatsPerBar
};

/// Tells the host's assert dialog of misuse, unless the user has switched the place off, and stops in an attached debugger
/// when the dialog asks for that. False, for callers to pass on.
bool ReportMisuse(Misuse inMisuse, int inLine = zoncore::debug::SourceLine());

}   // namespace zonmediatypes::utility
