#include "zonmediatypes/TimeConversionUtils.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/TextScanner.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/src/sampleclock/SampleClock.h"
#include "zonmediatypes/src/time/DropFrame.h"

#include <algorithm>
#include <array>
#include <limits>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zoncore::utility::IsDigit;
using zoncore::utility::Magnitude;
using zoncore::utility::TruncateTo;
using zoncore::utility::WrappingAdd;
using zoncore::utility::WrappingDivide;
using zoncore::utility::WrappingMultiply;
using zoncore::utility::WrappingSubtract;

// The numerator and the denominator of NTSC rates: 30 frames become 30,000 in 1,001 seconds.
constexpr std::int32_t kNTSCNumerator = 1'000;
constexpr std::int32_t kNTSCDenominator = 1'001;

constexpr std::int64_t kNoPosition = -1;   // what empty text is

// Drop-frame numbering is that of 30 frames per second and of its whole multiples.
constexpr std::int32_t kLowestDropFrameRate = 30;

// How a position is written as timecode; see the flags of the public function.
struct TimecodeStyle
{
	bool mDropFrame = false;
	bool mNTSC = false;
	bool mFrameCountOnly = false;
	bool mOmitFrames = false;
	bool mSuppressLeadingZeros = false;
	bool mShowSubframes = false;
	bool mTotalMinutes = false;
};

// What a text is made of.
enum class TextKind : std::uint8_t
{
	Decimal,
	Samples,
	Timecode,
	Beats,
	BarsAndBeats,
	Milliseconds,
	None
};

struct FormatRow
{
	TimecodeFormat mFormat;
	TextKind mKind;
	TimecodeStyle mStyle = {};   // how timecode is written; drop-frame text is read at the scaled rate, too
};

// clang-format off
constexpr auto sFormats = std::to_array<FormatRow>({
	{kTimecodeFormat_Decimal,              TextKind::Decimal},
	{kTimecodeFormat_Samples,              TextKind::Samples},
	{kTimecodeFormat_Timecode,             TextKind::Timecode},
	{kTimecodeFormat_TimecodeNTSC,         TextKind::Timecode, {.mNTSC = true}},
	{kTimecodeFormat_TimecodeDropFrame,    TextKind::Timecode, {.mDropFrame = true}},
	{kTimecodeFormat_Beats,                TextKind::Beats},
	{kTimecodeFormat_BarsAndBeats,         TextKind::BarsAndBeats},
	{kTimecodeFormat_None,                 TextKind::None},
	{kTimecodeFormat_Frames,               TextKind::Timecode, {.mFrameCountOnly = true}},
	{kTimecodeFormat_FramesDropFrame,      TextKind::Timecode, {.mDropFrame = true, .mFrameCountOnly = true}},
	{kTimecodeFormat_TimecodeSubframes,    TextKind::Timecode, {.mSuppressLeadingZeros = true, .mShowSubframes = true}},
	{kTimecodeFormat_Milliseconds,         TextKind::Milliseconds},
	{kTimecodeFormat_TimecodeNTSCAlt,      TextKind::Timecode, {.mNTSC = true}},
	{kTimecodeFormat_TimecodeDropFrameAlt, TextKind::Timecode, {.mDropFrame = true}},
	{kTimecodeFormat_TimecodeNTSCAlt2,     TextKind::Timecode, {.mNTSC = true}},
});
// clang-format on
static_assert(std::ranges::all_of(sFormats, [](const FormatRow& inRow) { return &inRow == &sFormats[inRow.mFormat]; }));

// The row of a format; that of None for a number that is no format.
constexpr const FormatRow& FindFormat(TimecodeFormat inFormat)
{
	return sFormats[inFormat < sFormats.size() ? inFormat : kTimecodeFormat_None];
}

// ---- Text to samples -------------------------------------------------------------------------------------------------

// The numbers that text carries; mSubframes / mSubframeDivisor is a fraction of one frame.
struct TypedFields
{
	std::int32_t mHours;
	std::int32_t mMinutes;
	std::int32_t mSeconds;
	std::int32_t mFrames;
	std::int32_t mSubframes;
	std::int32_t mSubframeDivisor;
};

using Scanner = zoncore::utility::TextScanner<UTF16Char>;

// The digits that come next as a number; 0 for one that does not fit.
std::int32_t TakeField(Scanner& ioText)
{
	const auto run = ioText.TakeDigits(std::numeric_limits<std::int32_t>::max());
	return run.mIsTooLarge ? 0 : static_cast<std::int32_t>(run.mValue);
}

// Skips the separators that come next; whether one of them was ".".
bool TakeSeparators(Scanner& ioText)
{
	bool hasPoint = false;
	while (!ioText.IsAtEnd() && !IsDigit(ioText.Peek()))
		hasPoint = ioText.Next() == '.' || hasPoint;
	return hasPoint;
}

// 10^inExponent, and the most negative value where that does not fit.
constexpr std::int32_t PowerOfTen(std::size_t inExponent)
{
	constexpr auto kPowers = std::to_array<std::int32_t>(
		{1, 10, 100, 1'000, 10'000, 100'000, 1'000'000, 10'000'000, 100'000'000, 1'000'000'000});
	return inExponent < kPowers.size() ? kPowers[inExponent] : std::numeric_limits<std::int32_t>::min();
}

TypedFields ParseTimeCodeString(UTF16StringView inText)
{
	constexpr std::size_t kLabels = 4;
	constexpr std::size_t kMostFields = 5;
	Scanner text(inText);
	// Fields follow zeros: the four values before any end are right-aligned labels.
	std::array<std::int32_t, kLabels + kMostFields> values{};
	std::size_t end = kLabels;
	std::size_t lastFieldLength = 0;   // with all that follows in the text
	bool hasPoint = false;
	for (bool isComplete = false; !isComplete && end < values.size(); isComplete = hasPoint)
	{
		hasPoint = TakeSeparators(text) || hasPoint;
		if (text.IsAtEnd())
			break;
		lastFieldLength = text.GetRemaining();
		values[end++] = TakeField(text);
	}
	const bool hasFraction = hasPoint && end > kLabels;
	const std::size_t labels = hasFraction ? end - 1 : end;
	return {values[labels - 4], values[labels - 3], values[labels - 2], values[labels - 1],
		hasFraction ? values[labels] : 0, hasFraction ? PowerOfTen(lastFieldLength) : 1};
}

// The frame that labels stand for when none is dropped. 32-bit, wrapping.
std::int32_t CountFrames(
	std::int32_t inMinutes, std::int32_t inSeconds, std::int32_t inFrames, std::int32_t inFrameRate)
{
	const std::int32_t seconds = WrappingAdd(WrappingMultiply(inMinutes, 60), inSeconds);
	return WrappingAdd(WrappingMultiply(seconds, inFrameRate), inFrames);
}

std::int32_t CountFrames(const TypedFields& inFields, std::int32_t inFrameRate)
{
	const std::int32_t minutes = WrappingAdd(WrappingMultiply(inFields.mHours, 60), inFields.mMinutes);
	return CountFrames(minutes, inFields.mSeconds, inFields.mFrames, inFrameRate);
}

// The frame that drop-frame labels stand for; labels that are dropped stand for the first one that is not. The
// quotients are exact at 30 and 60 only and serve every rate as they are. 32-bit, wrapping.
std::int32_t CountDropFrames(const TypedFields& inFields, std::int32_t inFrameRate)
{
	const std::int32_t droppedPerMinute = inFrameRate / 15;
	const std::int32_t droppedPerHour = WrappingMultiply(inFrameRate, 108) / 30;
	const std::int32_t framesPerHour = WrappingSubtract(WrappingMultiply(inFrameRate, 3'600), droppedPerHour);
	const std::int32_t framesPerTenMinutes = framesPerHour / 6;
	const std::int32_t tens = inFields.mMinutes / 10;
	const std::int32_t minutes = inFields.mMinutes % 10;

	const bool isDropped = minutes != 0 && inFields.mSeconds == 0 && inFields.mFrames < droppedPerMinute;
	const std::int32_t rest
		= CountFrames(minutes, inFields.mSeconds, isDropped ? droppedPerMinute : inFields.mFrames, inFrameRate);
	const std::int32_t blocks
		= WrappingAdd(WrappingMultiply(inFields.mHours, framesPerHour), WrappingMultiply(tens, framesPerTenMinutes));
	return WrappingAdd(blocks, WrappingSubtract(rest, WrappingMultiply(droppedPerMinute, minutes)));
}

// The first sample at or after a frame and a fraction of it. Wraps, but beyond the range of the integer formula the
// result is that of doubles.
std::int64_t FramesToSamples(std::int32_t inFrames, const TypedFields& inFields, std::int32_t inSampleRate,
	std::int32_t inFrameRate, bool inNTSC)
{
	constexpr double kLargestExact = 0x7p60;
	const std::int32_t rate = inNTSC ? WrappingMultiply(inFrameRate, kNTSCNumerator) : inFrameRate;
	const std::int64_t factor = inNTSC ? kNTSCDenominator : 1;
	const std::int64_t subframes = inFields.mSubframes;
	const std::int64_t divisor = inFields.mSubframeDivisor;
	const std::int64_t denominator
		= rate * divisor;   // cannot overflow, nor can the products with one 32-bit term below
	if (denominator == 0)
		return 0;

	const double estimate = static_cast<double>(denominator - 1)
		+ inSampleRate
			* (static_cast<double>(factor)
				* (static_cast<double>(subframes) + static_cast<double>(inFrames) * static_cast<double>(divisor)));
	if (estimate > kLargestExact)
		return TruncateTo<std::int64_t>(estimate / static_cast<double>(denominator));
	const std::int64_t scaled = WrappingMultiply(factor * inSampleRate, subframes + divisor * inFrames);
	return WrappingDivide(WrappingAdd(scaled, denominator - 1), denominator);
}

// Decimal text in units of its smallest field: timecode fields one place to the left, hours lost.
double ReadDecimal(UTF16StringView inText)
{
	const TypedFields fields = ParseTimeCodeString(inText);
	const double units = fields.mFrames + static_cast<double>(fields.mSubframes) / fields.mSubframeDivisor;
	return fields.mMinutes * 3'600.0 + (fields.mSeconds * 60.0 + (0.0 + units));
}

std::int64_t ReadSampleCount(UTF16StringView inText)
{
	long long count = 0;
	zoncore::utility::StringToNumber(inText, count, 6);
	return count;
}

// ---- Samples to text -------------------------------------------------------------------------------------------------

// The magnitude of a position, in inParts parts of a frame.
std::uint64_t SamplesToFrames(std::int64_t inSamples, std::int32_t inSampleRate, std::int32_t inFrameRate,
	const TimecodeStyle& inStyle, std::uint64_t inParts = 1)
{
	const bool isScaled = inStyle.mDropFrame || inStyle.mNTSC;
	const auto frameRate = static_cast<std::uint64_t>(inFrameRate) * (isScaled ? kNTSCNumerator : 1);
	const auto sampleRate = static_cast<std::uint64_t>(inSampleRate) * (isScaled ? kNTSCDenominator : 1);
	return Magnitude(inSamples) * frameRate * inParts / sampleRate;
}

// Rates that positions can be divided by: frames per hour, and with them those per minute, are 32-bit, wrapping, and not 0.
bool CanDivideBy(std::int32_t inSampleRate, std::int32_t inFrameRate, const TimecodeStyle& inStyle)
{
	const std::int32_t lowestRate = inStyle.mDropFrame ? kLowestDropFrameRate : 1;
	return inSampleRate > 0 && inFrameRate >= lowestRate && static_cast<std::uint32_t>(inFrameRate) * 3'600 != 0;
}

// The frame count at 1000/1001 of a nominal rate, from the left to the right in doubles: one short on some frames.
std::int32_t EstimateDropFrameCount(std::int64_t inSamples, std::int32_t inSampleRate, std::int32_t inFrameRate)
{
	const double multiple = inFrameRate / 30.0;
	const double perTenMinutes = inFrameRate * 600.0 / 1.001;
	const double frames = perTenMinutes / (17'982.0 * multiple) * static_cast<double>(Magnitude(inSamples))
		/ inSampleRate * 29.97 * multiple;
	return TruncateTo<std::int32_t>(frames);
}

void PutDropFrame(PositionText& ioText, std::uint64_t inFrames, std::int32_t inFrameRate)
{
	std::uint32_t hours = 0;
	std::uint32_t minutes = 0;
	std::uint32_t seconds = 0;
	std::uint32_t frames = 0;
	DropFrameToHMSF(static_cast<std::int64_t>(inFrames), inFrameRate, hours, minutes, seconds, frames);
	for (const std::uint32_t label : {hours, minutes, seconds})
	{
		ioText.PutNumber(label, 2);
		ioText.Put(';');
	}
	ioText.PutNumber(frames, 2);
}

// A field and ":". While ioSuppresses is set a 0 is left out; the first field that is written clears it.
void PutField(PositionText& ioText, std::uint64_t inValue, bool& ioSuppresses, std::size_t inLeadingWidth = 1)
{
	if (ioSuppresses && inValue == 0)
		return;
	ioText.PutNumber(inValue, ioSuppresses ? inLeadingWidth : 2);
	ioText.Put(':');
	ioSuppresses = false;
}

void PutNonDrop(PositionText& ioText, std::uint64_t inFrames, std::int32_t inFrameRate, const TimecodeStyle& inStyle)
{
	const auto perSecond = static_cast<std::uint32_t>(inFrameRate);
	const std::uint32_t perMinute = perSecond * 60;
	const std::uint32_t perHour = perSecond * 3'600;
	const std::uint64_t hours = inFrames / perHour;
	const std::uint64_t minutes = inFrames % perHour / perMinute;
	const std::uint64_t rest = inFrames % perHour % perMinute;

	bool suppresses = inStyle.mSuppressLeadingZeros;
	if (!inStyle.mTotalMinutes)
		PutField(ioText, hours, suppresses, 2);
	PutField(ioText, inStyle.mTotalMinutes ? minutes + hours * 60 : minutes, suppresses);
	if (inStyle.mOmitFrames)
		return ioText.PutNumber(rest / perSecond, 2);
	PutField(ioText, rest / perSecond, suppresses);
	ioText.PutNumber(rest % perSecond, suppresses ? 1 : PaddedDigits(inFrameRate));
}

void PutTimecode(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate, std::int32_t inFrameRate,
	const TimecodeStyle& inStyle)
{
	if (!CanDivideBy(inSampleRate, inFrameRate, inStyle))
		return ioText.Put('0');
	if (inStyle.mDropFrame && inStyle.mFrameCountOnly)
		return ioText.PutNumber(EstimateDropFrameCount(inSamples, inSampleRate, inFrameRate));
	const std::uint64_t frames = SamplesToFrames(inSamples, inSampleRate, inFrameRate, inStyle);
	if (inStyle.mFrameCountOnly)
		return ioText.PutNumber(static_cast<std::int32_t>(frames));
	if (inSamples < 0)
		ioText.Put('-');
	if (inStyle.mDropFrame)
		return PutDropFrame(ioText, frames, inFrameRate);
	PutNonDrop(ioText, frames, inFrameRate, inStyle);
	if (!inStyle.mShowSubframes || inStyle.mOmitFrames)
		return;
	ioText.Put('.');
	ioText.PutNumber(SamplesToFrames(inSamples, inSampleRate, inFrameRate, inStyle, 100) % 100, 2);
}

void PutDecimalFraction(PositionText& ioText, std::uint64_t inSeconds, std::uint64_t inRest, std::int32_t inSampleRate)
{
	constexpr std::uint64_t kTenHours = 36'000;
	ioText.Put('.');
	if (inSeconds >= kTenHours)
		return ioText.PutNumber(inRest * 100 / static_cast<std::uint32_t>(inSampleRate), 2);
	const double milliseconds = (static_cast<double>(inRest) + 0.5) * 1'000.0 / inSampleRate;
	ioText.PutNumber(TruncateTo<std::int64_t>(milliseconds), 3);
}

void PutDecimal(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate, bool inOmitFraction)
{
	if (inSampleRate <= 0)
		return ioText.Put('0');
	const auto rate = static_cast<std::uint32_t>(inSampleRate);
	const std::uint64_t samples = Magnitude(inSamples);
	const std::uint64_t seconds = samples / rate;
	const std::uint64_t minutes = seconds / 60;
	if (seconds < 3'600)
	{
		ioText.Put(inSamples < 0 ? "  -" : "   ");
		ioText.PutNumber(minutes);
	}
	else
	{
		ioText.Put(inSamples < 0 ? "-" : "");
		ioText.PutNumber(seconds / 3'600);
		ioText.Put(':');
		ioText.PutNumber(minutes % 60, 2);
	}
	ioText.Put(':');
	ioText.PutNumber(seconds % 60, 2);
	if (!inOmitFraction)
		PutDecimalFraction(ioText, seconds, samples % rate, inSampleRate);
}

void PutMilliseconds(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate)
{
	if (inSampleRate == 0)
		return ioText.Put('0');
	const double tenths = static_cast<double>(inSamples) * 10'000.0 / inSampleRate + 0.5;
	ioText.PutNumber((tenths - Fraction(tenths)) / 10.0);
}

// A position in any format; false, after telling the host, for misuse.
bool PutPosition(PositionText& ioText, std::int64_t inSamples, std::int32_t inSampleRate, const FormatRow& inFormat,
	std::int32_t inFrameRate, const BeatInfo* inBeatInfo, bool inIsDuration)
{
	switch (inFormat.mKind)
	{
	case TextKind::Decimal:
		PutDecimal(ioText, inSamples, inSampleRate, false);
		break;
	case TextKind::Milliseconds:
		PutMilliseconds(ioText, inSamples, inSampleRate);
		break;
	case TextKind::Samples:
		ioText.PutNumber(inSamples);
		break;
	case TextKind::Timecode:
		PutTimecode(ioText, inSamples, inSampleRate, inFrameRate, inFormat.mStyle);
		break;
	case TextKind::Beats:
		if (!inBeatInfo)
			return ReportMisuse(Misuse::WriteBeats);
		PutBeats(ioText, inSamples, inSampleRate, inBeatInfo->dTempo);
		break;
	case TextKind::BarsAndBeats:
		if (!inBeatInfo)
			return ReportMisuse(Misuse::WriteBarsAndBeats);
		return PutBarsAndBeats(ioText, static_cast<double>(inSamples), inSampleRate, *inBeatInfo, inIsDuration, 2);
	case TextKind::None:
		break;
	}
	return true;
}

}   // namespace

bool ConvertTimecodeToSamples(std::int64_t& outSamples, UTF16StringView inTimecode, std::int32_t inSampleRate,
	std::int32_t inFrameRate, bool inNTSC, bool inDropFrame) noexcept
{
	if (inTimecode.empty())
	{
		outSamples = kNoPosition;
		return true;
	}
	const TypedFields fields = ParseTimeCodeString(inTimecode);
	const std::int32_t frames = inDropFrame ? CountDropFrames(fields, inFrameRate) : CountFrames(fields, inFrameRate);
	outSamples = FramesToSamples(frames, fields, inSampleRate, inFrameRate, inNTSC);
	return true;
}

bool ConvertTimecodeToSamples(std::int64_t& outSamples, UTF16StringView inText, TimecodeFormat inFormat,
	std::int32_t inSampleRate, std::int32_t inFrameRate, BeatInfo* inBeatInfo, bool inIsDuration)
{
	if (inText.empty())
	{
		outSamples = kNoPosition;
		return true;
	}
	const FormatRow& format = FindFormat(inFormat);
	switch (format.mKind)
	{
	case TextKind::Decimal:
		outSamples = TruncateTo<std::int64_t>(inSampleRate * ReadDecimal(inText) + 0.5);
		return true;
	case TextKind::Milliseconds:
		outSamples = TruncateTo<std::int64_t>(inSampleRate * ReadDecimal(inText) / 1'000.0 + 0.5);
		return true;
	case TextKind::Samples:
		outSamples = ReadSampleCount(inText);
		return true;
	case TextKind::Timecode:
		return ConvertTimecodeToSamples(outSamples, inText, inSampleRate, inFrameRate,
			format.mStyle.mNTSC || format.mStyle.mDropFrame, format.mStyle.mDropFrame);
	case TextKind::Beats:
		if (!inBeatInfo)
			return ReportMisuse(Misuse::ReadBeats);
		outSamples = TruncateTo<std::int64_t>(ReadDecimal(inText) * (inSampleRate * 60.0 / inBeatInfo->dTempo) + 0.5);
		return true;
	case TextKind::BarsAndBeats:
		if (!inBeatInfo)
			return ReportMisuse(Misuse::ReadBarsAndBeats);
		outSamples = ConvertBarsAndBeatsToSamples(inText, inSampleRate, *inBeatInfo, inIsDuration);
		return true;
	case TextKind::None:
		break;
	}
	outSamples = 0;   // deliberate for unknown formats, too
	return true;
}

bool ConvertSamplesToTimecode(UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate,
	TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo, bool inIsDuration)
{
	const FormatRow& format = FindFormat(inFormat);
	if (format.mKind == TextKind::None)
		return true;
	return SetText(outText, PutPosition, inSamples, inSampleRate, format, inFrameRate, inBeatInfo, inIsDuration);
}

std::size_t ConvertSamplesToTimecode(std::span<UTF16Char> outText, std::int64_t inSamples, std::int32_t inSampleRate,
	TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo, bool inIsDuration)
{
	return WriteText(
		outText, PutPosition, inSamples, inSampleRate, FindFormat(inFormat), inFrameRate, inBeatInfo, inIsDuration);
}

std::size_t ConvertSamplesToTimecode(std::span<char> outText, std::int64_t inSamples, std::int32_t inSampleRate,
	TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo, bool inIsDuration)
{
	return WriteText(
		outText, PutPosition, inSamples, inSampleRate, FindFormat(inFormat), inFrameRate, inBeatInfo, inIsDuration);
}

bool ConvertSamplesToTimecode(UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate,
	std::int32_t inFrameRate, bool inDropFrame, bool inNTSC, bool inFrameCountOnly, bool inOmitFrames,
	bool inSuppressLeadingZeros, bool inShowSubframes, bool inTotalMinutes)
{
	if (inDropFrame && inNTSC)
		return ReportMisuse(Misuse::DropFrameNTSC);
	const TimecodeStyle style{
		inDropFrame, inNTSC, inFrameCountOnly, inOmitFrames, inSuppressLeadingZeros, inShowSubframes, inTotalMinutes};
	return SetText(outText, PutTimecode, inSamples, inSampleRate, inFrameRate, style);
}

void ConvertSamplesToDecimalTimecode(
	UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate, bool inOmitFraction)
{
	SetText(outText, PutDecimal, inSamples, inSampleRate, inOmitFraction);
}

std::int64_t DropFrameToHMSF(std::int64_t inFrame, std::int32_t inFrameRate, std::uint32_t& outHours,
	std::uint32_t& outMinutes, std::uint32_t& outSeconds, std::uint32_t& outFrames) noexcept
{
	if (inFrameRate < kLowestDropFrameRate)
		return 0;
	const auto multiple = static_cast<std::uint64_t>(inFrameRate / kLowestDropFrameRate);
	const DropFrameCount count = DropFrameCount::Dropping(multiple * kLowestDropFrameRate);
	const std::uint64_t labels = count.LabelOf(Magnitude(inFrame));
	const std::uint64_t allSeconds = labels / count.mNominal;
	const std::uint64_t hours = allSeconds / 3'600;
	const auto minutes = static_cast<std::uint32_t>(allSeconds / 60 % 60);
	const std::uint64_t seconds = allSeconds % 60;
	if (hours != 0)
		outHours = static_cast<std::uint32_t>(hours);
	if (minutes >= 10)
		outMinutes = minutes / 10 * 10;
	outMinutes += minutes % 10;
	if (seconds != 0)
		outSeconds = static_cast<std::uint32_t>(seconds);
	outFrames = static_cast<std::uint32_t>(labels - allSeconds * count.mNominal);
	return static_cast<std::int64_t>(seconds);
}

}   // namespace zonmediatypes::utility
