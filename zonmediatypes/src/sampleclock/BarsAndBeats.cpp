#include "zoncore/NumberConversion.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/TimeConversionUtils.h"
#include "zonmediatypes/src/sampleclock/SampleClock.h"

#include <algorithm>
#include <cmath>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zoncore::utility::StringToNumber;
using zoncore::utility::TruncateTo;
using zoncore::utility::WrappingAdd;
using zoncore::utility::WrappingDivide;
using zoncore::utility::WrappingMultiply;
using zoncore::utility::WrappingSubtract;

constexpr std::int32_t kDecimalBeats = -1;   // in place of the ticks of a beat

// A beat is one 1/iBeatValue note and the tempo counts quarter notes.
double BeatsPerMinute(const BeatInfo& inBeatInfo)
{
	return inBeatInfo.iBeatValue * inBeatInfo.dTempo * 0.25;
}

// ---- Text to samples -------------------------------------------------------------------------------------------------

int ReadInteger(UTF16StringView inText)
{
	int value = 0;
	StringToNumber(inText, value, 1);
	return value;
}

// What follows the first "." of inText, in beats.
double ReadSubBeat(UTF16StringView inText, std::int32_t inTicksPerBeat)
{
	const std::size_t point = inText.find('.');
	const UTF16StringView fraction = point == UTF16StringView::npos ? UTF16StringView() : inText.substr(point);
	if (inTicksPerBeat != kDecimalBeats)
		return (fraction.empty() ? 0 : ReadInteger(fraction.substr(1))) / static_cast<double>(inTicksPerBeat);
	double value = 0;
	StringToNumber(fraction, value, 1);
	return value;
}

// The beats before the one that inText names; what follows "." left out.
std::int32_t ReadWholeBeats(UTF16StringView inText, std::int32_t inBeatsPerBar, bool inIsDuration)
{
	const std::int32_t base = inIsDuration ? 0 : 1;
	const std::size_t colon = inText.find(':');
	const bool hasBeats = colon != UTF16StringView::npos;
	const std::int32_t bars = WrappingSubtract(ReadInteger(inText.substr(0, colon)), base);
	const std::int32_t beats = hasBeats ? WrappingSubtract(ReadInteger(inText.substr(colon + 1)), base) : 0;
	return WrappingAdd(WrappingMultiply(bars, inBeatsPerBar), beats);
}

// ---- Samples to text -------------------------------------------------------------------------------------------------

struct Ticks
{
	std::int64_t mTicks = 0;
	std::int64_t mMilliTicks = 0;
};

// A position in the numbers that its text shows.
struct MusicalPosition
{
	std::int64_t mBar;
	std::int64_t mBeat;
	double mFraction;   // of the beat
	Ticks mTicks;       // the same in ticks
};

// The part below the beat. A fraction of a whole number of ticks rounds to less than that number, so that no whole beat is
// left to carry.
Ticks SplitTicks(double inFraction, std::int32_t inTicksPerBeat)
{
	if (inTicksPerBeat < 1)
		return {};
	const double ticks = inFraction * inTicksPerBeat;
	const auto wholeTicks = TruncateTo<std::int64_t>(ticks);
	return {wholeTicks, WrappingSubtract(TruncateTo<std::int64_t>(ticks * 1'000), WrappingMultiply(wholeTicks, 1'000))};
}

MusicalPosition SplitBeats(double inBeats, const BeatInfo& inBeatInfo, std::int64_t inBase)
{
	const std::int64_t beatsPerBar = inBeatInfo.iBeatsPerBar;
	// Positions before the first bar are moved after it by whole bars, which are taken off the bar number again.
	const std::int64_t movedBars
		= inBeats < 0 ? WrappingAdd(TruncateTo<std::int64_t>(-inBeats / inBeatInfo.iBeatsPerBar), 1) : 0;
	const double beats = inBeats + static_cast<double>(WrappingMultiply(movedBars, beatsPerBar));
	const double fraction = Fraction(beats);
	const auto wholeBeats = TruncateTo<std::int64_t>(beats);
	const std::int64_t bar = WrappingDivide(wholeBeats, beatsPerBar);
	const std::int64_t beat = WrappingSubtract(wholeBeats, WrappingMultiply(bar, beatsPerBar));
	return {WrappingSubtract(WrappingAdd(bar, inBase), movedBars), WrappingAdd(beat, inBase), fraction,
		SplitTicks(fraction, inBeatInfo.iTicksPerBeat)};
}

// The bar and, without a separator, the beat with decimals; every character after the first "." becomes a "0".
void PutDecimalBeats(PositionText& ioText, const MusicalPosition& inPosition)
{
	const auto thousandths = TruncateTo<std::int64_t>(inPosition.mFraction * 1'000);
	ioText.PutNumber(inPosition.mBar);
	ioText.PutNumber(static_cast<double>(inPosition.mBeat) + static_cast<double>(thousandths) / 1'000.0);
	const auto chars = ioText.GetChars();
	const auto point = std::ranges::find(chars, zoncore::UTF16Char{'.'});
	if (point != chars.end())
		std::fill(point + 1, chars.end(), zoncore::UTF16Char{'0'});
}

void PutTicks(
	PositionText& ioText, const MusicalPosition& inPosition, std::int32_t inTicksPerBeat, std::int32_t inStyle)
{
	if (inStyle < 0)
		return;
	ioText.PutNumber(inPosition.mBar);
	if (inStyle < 1)
		return;
	ioText.Put(':');
	ioText.PutNumber(inPosition.mBeat);
	if (inStyle < 2)
		return;
	ioText.Put('.');
	ioText.PutNumber(inPosition.mTicks.mTicks, PaddedDigits(inTicksPerBeat));
}

void PutPosition(
	PositionText& ioText, const MusicalPosition& inPosition, std::int32_t inTicksPerBeat, std::int32_t inStyle)
{
	if (inTicksPerBeat == kDecimalBeats)
		PutDecimalBeats(ioText, inPosition);
	else
		PutTicks(ioText, inPosition, inTicksPerBeat, inStyle);
	if (inStyle < 3)
		return;
	ioText.Put('.');
	ioText.PutNumber(inPosition.mTicks.mMilliTicks, 3);
}

}   // namespace

std::int64_t ConvertBarsAndBeatsToSamples(
	UTF16StringView inText, double inSampleRate, const BeatInfo& inBeatInfo, bool inIsDuration) noexcept
{
	const double beats
		= ReadWholeBeats(inText, inBeatInfo.iBeatsPerBar, inIsDuration) + ReadSubBeat(inText, inBeatInfo.iTicksPerBeat);
	const double seconds = beats / BeatsPerMinute(inBeatInfo) * 60.0;
	const auto samples = TruncateTo<std::int64_t>(seconds * inSampleRate + 0.5);
	if (inIsDuration)
		return samples;
	return WrappingAdd(
		samples, TruncateTo<std::int64_t>(inSampleRate * inBeatInfo.dOffsetMilliseconds / 1'000.0 + 0.5));
}

bool PutBarsAndBeats(PositionText& ioText, double inSamples, double inSampleRate, const BeatInfo& inBeatInfo,
	bool inIsDuration, std::int32_t inStyle)
{
	if (inBeatInfo.iBeatsPerBar == 0)
		return ReportMisuse(Misuse::NoBeatsPerBar);

	const double offset = std::floor(inBeatInfo.dOffsetMilliseconds * inSampleRate / 1'000.0 + 0.5);
	const double samples = inIsDuration ? inSamples : inSamples - offset;
	const double nudge = 0.5 / inBeatInfo.iTicksPerBeat / 1'000.0;   // half a thousandth of a tick, against truncation
	const double beats = BeatsPerMinute(inBeatInfo) * samples / 60.0 / inSampleRate + nudge;
	const MusicalPosition position = SplitBeats(beats, inBeatInfo, inIsDuration ? 0 : 1);
	PutPosition(ioText, position, inBeatInfo.iTicksPerBeat, inStyle);
	return true;
}

bool ConvertSamplesToBarsAndBeats(UTF16String& outText, double inSamples, double inSampleRate,
	const BeatInfo& inBeatInfo, bool inIsDuration, std::int32_t inStyle)
{
	return SetText(outText, PutBarsAndBeats, inSamples, inSampleRate, inBeatInfo, inIsDuration, inStyle);
}

void PutBeats(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate, double inTempo) noexcept
{
	if (inSampleRate == 0)
		return ioText.Put('0');
	const double beats = static_cast<double>(inSamples) / (inSampleRate * 60.0 / inTempo) + 0.0005;
	ioText.PutNumber(TruncateTo<std::int32_t>(beats));
	ioText.Put('.');
	ioText.PutNumber(TruncateTo<std::int32_t>(Fraction(beats) * 1'000), 3);
}

void ConvertSamplesToBeats(UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate, double inTempo)
{
	SetText(outText, PutBeats, inSamples, inSampleRate, inTempo);
}

}   // namespace zonmediatypes::utility
