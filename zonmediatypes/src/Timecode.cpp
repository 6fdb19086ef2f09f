#include "zonmediatypes/Timecode.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/src/DropFrame.h"
#include "zonmediatypes/src/TextWriter.h"
#include "zonmediatypes/src/TimeDisplayTable.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zoncore::utility::Magnitude;
using zoncore::utility::TruncateTo;
using zoncore::utility::WrappingAdd;
using zoncore::utility::WrappingMultiply;

// kTimeDisplay_Auto is for media: pulled-down rates are numbered with drop frames.
TimeDisplay ChooseDisplay(TimeDisplay inDisplay, FrameRate inRate)
{
	return inDisplay == kTimeDisplay_Auto
		? GetTimeDisplayForFrameRate(inRate, true, true, kTimeDisplay_2997DropTimecode, false)
		: inDisplay;
}

TickTime MovedByFrames(TickTime inTime, long long inFrames, FrameRate inRate)
{
	inTime.AddFrames(inFrames, inRate);
	return inTime;
}

// ---- Time to fields --------------------------------------------------------------------------------------------------

// At a display with a rate of its own. The display is a template argument so that every division is by a constant.
template <TimeDisplay inDisplay>
HMSF FixedRateFields(TickTime inTime)
{
	constexpr const TimeDisplayRow& kRow = FindTimeDisplay(inDisplay);
	const std::uint64_t frames
		= Magnitude(inTime.GetTicks()) / static_cast<std::uint64_t>(kRow.mRate.GetTicksPerFrame());
	if constexpr (kRow.mNumbering == FrameNumbering::Drop)
		return SplitDropFrames(frames, kRow.mCount);
	else
		return SplitFrames(frames, kRow.mCount.mNominal);
}

// At the caller's rate; a rate that has no whole frame in a second has no fields.
HMSF CallersRateFields(TickTime inTime, FrameRate inRate)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	if (duration < 1 || duration > kTicksPerSecond)
		return {};
	return SplitFrames(Magnitude(inTime.GetTicks() / duration), static_cast<std::uint64_t>(kTicksPerSecond / duration));
}

// clang-format off
HMSF FieldsOf(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay)
{
	switch (inDisplay)
	{
	case kTimeDisplay_24Timecode:          return FixedRateFields<kTimeDisplay_24Timecode>(inTime);
	case kTimeDisplay_25Timecode:          return FixedRateFields<kTimeDisplay_25Timecode>(inTime);
	case kTimeDisplay_2997DropTimecode:    return FixedRateFields<kTimeDisplay_2997DropTimecode>(inTime);
	case kTimeDisplay_2997NonDropTimecode: return FixedRateFields<kTimeDisplay_2997NonDropTimecode>(inTime);
	case kTimeDisplay_30Timecode:          return FixedRateFields<kTimeDisplay_30Timecode>(inTime);
	case kTimeDisplay_50Timecode:          return FixedRateFields<kTimeDisplay_50Timecode>(inTime);
	case kTimeDisplay_5994DropTimecode:    return FixedRateFields<kTimeDisplay_5994DropTimecode>(inTime);
	case kTimeDisplay_5994NonDropTimecode: return FixedRateFields<kTimeDisplay_5994NonDropTimecode>(inTime);
	case kTimeDisplay_60Timecode:          return FixedRateFields<kTimeDisplay_60Timecode>(inTime);
	case kTimeDisplay_23976Timecode:       return FixedRateFields<kTimeDisplay_23976Timecode>(inTime);
	case kTimeDisplay_48Timecode:          return FixedRateFields<kTimeDisplay_48Timecode>(inTime);
	case kTimeDisplay_Milliseconds:        return FixedRateFields<kTimeDisplay_Milliseconds>(inTime);
	case kTimeDisplay_16mmFeetFrames:
	case kTimeDisplay_35mmFeetFrames:
	case kTimeDisplay_AudioSamples:        return CallersRateFields(inTime, inRate);
	case kTimeDisplay_Frames:              return {0, 0, 0, static_cast<std::uint64_t>(inTime.ToFrame64(inRate))};
	case kTimeDisplay_Auto:                break;
	}
	return {};
}
// clang-format on

// Whether the fields are those of a frame number, whose sign counts then: a time within the first frame before zero is
// frame 0, which is not negative.
bool TakesSignOfFrame(const TimeDisplayRow& inRow, FrameRate inRate)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	return inRow.mNumbering != FrameNumbering::Drop && inRow.mKind != DisplayKind::Frames && duration >= 1
		&& duration <= kTicksPerSecond;
}

// ---- Fields to time --------------------------------------------------------------------------------------------------

double FramesPerSecondOf(FrameRate inRate)
{
	return inRate.IsUsable() ? static_cast<double>(kTicksPerSecond) / static_cast<double>(inRate.GetTicksPerFrame())
							 : 0.0;
}

// Whether inFrames frames last longer than a second: double(inFrames) > FramesPerSecondOf(inRate) without a division. Both
// are the same, because a quotient up to kTicksPerSecond that is not whole is further from a whole number than a double's
// rounding error.
bool ExceedsSecond(std::uint64_t inFrames, FrameRate inRate)
{
	constexpr std::uint64_t kMostExact = std::numeric_limits<std::int64_t>::max() / kTicksPerSecond;
	const std::int64_t duration = inRate.GetTicksPerFrame();
	if (duration < 1 || duration > kTicksPerSecond)
		return false;   // less than one frame in a second, or no rate
	if (inFrames > kMostExact)
		return static_cast<double>(inFrames) > FramesPerSecondOf(inRate);
	return static_cast<std::int64_t>(inFrames) * duration > kTicksPerSecond;
}

// Takes whole seconds out of the frames. The count of frames in a second is that of the next slower rate whose second is a
// whole number of frames, formed through double as hosts form it.
HMSF CarryFrames(HMSF inFields, FrameRate inRate)
{
	const double perSecond = std::ceil(FramesPerSecondOf(inRate));
	const auto duration = TruncateTo<std::int64_t>(static_cast<double>(kTicksPerSecond) / perSecond);
	const double nominal = static_cast<double>(kTicksPerSecond) / static_cast<double>(duration);
	const auto carry
		= static_cast<std::uint64_t>(TruncateTo<std::int64_t>(static_cast<double>(inFields.mFrames) / nominal));
	return {inFields.mHours, inFields.mMinutes, inFields.mSeconds + static_cast<std::uint32_t>(carry),
		inFields.mFrames - carry * static_cast<std::uint64_t>(TruncateTo<std::int64_t>(nominal))};
}

// Brings minutes and seconds below 60 and hours below 24, where they mostly are.
HMSF CarrySeconds(HMSF inFields)
{
	if (inFields.mSeconds < 60 && inFields.mMinutes < 60 && inFields.mHours < 24)
		return inFields;
	const std::uint32_t minutes = inFields.mMinutes + inFields.mSeconds / 60;
	const std::uint32_t hours = inFields.mHours + minutes / 60;
	return {hours % 24, minutes % 60, inFields.mSeconds % 60, inFields.mFrames};
}

// The number of the frame that has these labels; without dropped labels they count up without a gap. The first label of a
// short minute is dropped with the next one; it alone counts as the frame that the minute begins with.
std::uint64_t FrameNumber(HMSF inFields, DropFrameCount inCount)
{
	const std::uint64_t minutes = inFields.mHours * std::uint64_t{60} + inFields.mMinutes;   // [0, 1439]
	const std::uint64_t shortMinutes = minutes - minutes / 10;
	const bool isDroppedFirstLabel = minutes % 10 != 0 && inFields.mSeconds == 0 && inFields.mFrames == 0;
	const std::uint64_t dropped = inCount.mDropped * (shortMinutes - (isDroppedFirstLabel ? 1 : 0));
	return inCount.mNominal * (minutes * 60 + inFields.mSeconds) + inFields.mFrames - dropped;
}

std::uint64_t CallersRateFrameNumber(HMSF inFields, FrameRate inRate, bool inRoundsSum)
{
	const std::uint32_t seconds = (inFields.mHours * 60 + inFields.mMinutes) * 60 + inFields.mSeconds;
	const double frames = seconds * FramesPerSecondOf(inRate);
	if (inRoundsSum)
		return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames + static_cast<double>(inFields.mFrames)));
	return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames)) + inFields.mFrames;
}

TickTime FieldsToTime(HMSF inFields, bool inNegative, FrameRate inRate, const TimeDisplayRow& inRow)
{
	const HMSF fields
		= CarrySeconds(ExceedsSecond(inFields.mFrames, inRate) ? CarryFrames(inFields, inRate) : inFields);
	const bool hasOwnRate = inRow.mCount.mNominal != 0;
	const FrameRate rate = inRow.CountsAtCallersRate() ? inRate : inRow.mRate;
	const std::uint64_t number = hasOwnRate ? FrameNumber(fields, inRow.mCount)
											: CallersRateFrameNumber(fields, rate, inRow.mKind == DisplayKind::Frames);
	const TickTime time(WrappingMultiply(static_cast<std::int64_t>(number), rate.GetTicksPerFrame()));
	return inNegative ? -time : time;
}

// ---- Time to text ----------------------------------------------------------------------------------------------------

// A sign, three fields with their separators and a 64-bit count.
using TimecodeText = TextWriter<1 + 3 * 3 + kLongestInteger>;

// The fields as they are shown: of a negative time without a sign the hours run backwards.
HMSF ShownFields(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	HMSF fields = FieldsOf(inTime, inRate, inDisplay);
	if (inTime < kTime_Zero && !inFlags.Test(kTimecodeFlag_ShowSign))
		fields.mHours = 23 - fields.mHours;
	return fields;
}

constexpr char FrameSeparator(const TimeDisplayRow& inRow)
{
	if (inRow.mNumbering == FrameNumbering::Drop)
		return ';';
	return inRow.mKind == DisplayKind::Milliseconds ? '.' : ':';
}

// ---- Time to text: the usual form --------------------------------------------------------------------------------------

// Four fields of two digits: nearly all text has this form. Its length is known before it is written, so that it is written
// where it stays.
constexpr std::size_t kUsualLength = 11;

bool HasUsualText(const TimeDisplayRow& inRow, TimecodeFlags inFlags)
{
	constexpr TimecodeFlags kOtherForms
		= kTimecodeFlag_OmitHours | kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_ShowSign;
	return inRow.mKind == DisplayKind::Timecode && (inFlags & kOtherForms) == TimecodeFlags();
}

void WriteUsualText(HMSF inFields, char inFrameSeparator, UTF16Char* outText)
{
	WriteTwoDigits(inFields.mHours, outText);
	outText[2] = ':';
	WriteTwoDigits(inFields.mMinutes, outText + 3);
	outText[5] = ':';
	WriteTwoDigits(inFields.mSeconds, outText + 6);
	outText[8] = static_cast<unsigned char>(inFrameSeparator);
	WriteTwoDigits(inFields.mFrames, outText + 9);
}

// ---- Time to text: all forms ---------------------------------------------------------------------------------------------

// How many digits the frames field has at least: those of the largest frame number, up to five and with some room for
// rates that are just above a power of ten.
std::size_t FrameDigits(const TimeDisplayRow& inRow, FrameRate inRate)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	if (inRow.mKind == DisplayKind::Timecode)
		return 2;
	const std::int64_t nominal = duration < 1 ? 0 : kTicksPerSecond / duration;
	if (nominal < 11 || nominal > 109'999)
		return 1;
	return nominal <= 109 ? 2 : nominal <= 1'099 ? 3 : nominal <= 10'999 ? 4 : 5;
}

void PutFields(
	TimecodeText& ioText, HMSF inFields, const TimeDisplayRow& inRow, std::size_t inFrameDigits, TimecodeFlags inFlags)
{
	bool isLeading = inFlags.Test(kTimecodeFlag_TrimLeadingZeros);
	const auto put = [&](std::uint32_t inField)
	{
		if (!isLeading)
			return ioText.PutTwoDigits(inField);
		ioText.PutNumber(inField, 1);
		isLeading = false;
	};
	const auto putBeforeColon = [&](std::uint32_t inField)
	{
		if (isLeading && inField == 0)
			return;
		put(inField);
		ioText.Put(':');
	};
	if (!inFlags.Test(kTimecodeFlag_OmitHours))
		putBeforeColon(inFields.mHours);
	putBeforeColon(inFields.mMinutes);
	put(inFields.mSeconds);
	ioText.Put(FrameSeparator(inRow));
	ioText.PutNumber(inFields.mFrames, inFrameDigits);
}

void PutFeet(TimecodeText& ioText, TickTime inTime, FrameRate inRate, int inFramesPerFoot)
{
	const std::int64_t frames = inTime.ToFrame64(inRate);
	if (inTime < kTime_Zero)
		ioText.Put('-');
	ioText.PutNumber(Magnitude(frames / inFramesPerFoot), 1);
	ioText.Put('+');
	ioText.PutTwoDigits(Magnitude(frames % inFramesPerFoot));
}

void PutFrameCount(TimecodeText& ioText, std::int64_t inFrames)
{
	if (inFrames < 0)
		ioText.Put('-');
	ioText.PutNumber(Magnitude(inFrames), 1);
}

void PutTimecode(TimecodeText& ioText, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	const TimeDisplayRow& row = FindTimeDisplay(inDisplay);
	const bool showsSign = inFlags.Test(kTimecodeFlag_ShowSign);
	if (showsSign && inTime > kTime_Zero)
		ioText.Put('+');
	if (row.mKind == DisplayKind::Frames)
		return PutFrameCount(ioText, inTime.ToFrame64(inRate));
	if (row.mKind == DisplayKind::Film)
		return PutFeet(ioText, inTime, inRate, row.mFramesPerFoot);
	if (showsSign && inTime < kTime_Zero)
		ioText.Put('-');
	const std::size_t frameDigits = FrameDigits(row, row.CountsAtCallersRate() ? inRate : row.mRate);
	PutFields(ioText, ShownFields(inTime, inRate, inDisplay, inFlags), row, frameDigits, inFlags);
}

// ---- Text to time ----------------------------------------------------------------------------------------------------

constexpr bool IsDigit(UTF16Char inChar)
{
	return inChar >= '0' && inChar <= '9';
}

constexpr bool IsWhiteSpace(UTF16Char inChar)
{
	return inChar == ' ' || (inChar >= '\t' && inChar <= '\r');
}

constexpr bool IsSign(UTF16Char inChar)
{
	return inChar == '+' || inChar == '-';
}

constexpr bool IsSeparator(UTF16Char inChar)
{
	return inChar == '.' || inChar == ':' || inChar == ';';
}

// Between feet and frames.
constexpr bool IsFilmSeparator(UTF16Char inChar)
{
	return IsSeparator(inChar) || inChar == '+';
}

// The groups of digits of a text, from the right; those that are missing are 0.
struct TextFields
{
	HMSF mFields{};
	int mGroups = 1;
};

// Text in its usual form, read without a branch for every character. False for all other text.
bool ReadUsualFields(UTF16StringView inText, TextFields& outFields)
{
	if (inText.size() != kUsualLength || !IsSeparator(inText[2]) || !IsSeparator(inText[5]) || !IsSeparator(inText[8]))
		return false;
	bool isNumber = true;
	const auto read = [&](std::size_t inAt)
	{
		const std::uint32_t tens = inText[inAt] - std::uint32_t{'0'};
		const std::uint32_t ones = inText[inAt + 1] - std::uint32_t{'0'};
		isNumber &= tens < 10;
		isNumber &= ones < 10;
		return tens * 10 + ones;
	};
	const TextFields fields{{read(0), read(3), read(6), read(9)}, 4};
	if (isNumber)
		outFields = fields;
	return isNumber;
}

// False for a text that is not one to four groups of digits, with single separators between them.
bool ReadFields(UTF16StringView inText, TextFields& outFields)
{
	constexpr std::uint64_t kMostFrames = std::numeric_limits<std::uint32_t>::max();
	constexpr int kMostGroups = 4;
	TextFields read;
	HMSF& fields = read.mFields;
	bool isAfterSeparator = true;
	for (const UTF16Char character : inText)
	{
		if (IsDigit(character))
		{
			fields.mFrames = std::min<std::uint64_t>(fields.mFrames * 10 + (character - UTF16Char{'0'}), kMostFrames);
			isAfterSeparator = false;
			continue;
		}
		if (!IsSeparator(character) || isAfterSeparator || ++read.mGroups > kMostGroups)
			return false;
		fields = {fields.mMinutes, fields.mSeconds, static_cast<std::uint32_t>(fields.mFrames), 0};
		isAfterSeparator = true;
	}
	outFields = read;
	return true;
}

// A run of digits, "HHMMSSFF"; how many of them are frames depends on the rate.
HMSF SplitDigits(std::uint64_t inRun, FrameRate inRate)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	const std::uint32_t frames = duration >= kFrameRate_Video100.GetTicksPerFrame() ? 100
		: duration >= kFrameRate_Video1000.GetTicksPerFrame()                       ? 1'000
		: duration >= kFrameRate_Video1000.GetTicksPerFrame() / 10                  ? 10'000
																					: 100'000;
	const auto run = static_cast<std::uint32_t>(inRun);
	const std::uint32_t rest = run / frames;
	return {rest / 10'000, rest / 100 % 100, rest % 100, run % frames};
}

TickTime ReadTimecode(UTF16StringView inText, FrameRate inRate, const TimeDisplayRow& inRow, TimecodeFlags inFlags)
{
	const bool isNegative = inText.front() == '-';
	const UTF16StringView magnitude = inText.substr(IsSign(inText.front()) ? 1 : 0);
	const bool hasLeadingSeparator = !magnitude.empty() && IsSeparator(magnitude.front());
	const UTF16StringView groups = magnitude.substr(hasLeadingSeparator ? 1 : 0);
	TextFields read;
	if (groups.empty() || (!ReadUsualFields(groups, read) && !ReadFields(groups, read)))
		return kTime_Invalid;
	const bool isCount = inRow.mKind == DisplayKind::Frames;
	if (isCount && read.mGroups != 1)
		return kTime_Invalid;

	const FrameRate fieldRate = inRow.mKind == DisplayKind::Milliseconds ? inRow.mRate : inRate;
	const HMSF fields = read.mGroups == 1 ? SplitDigits(read.mFields.mFrames, fieldRate) : read.mFields;
	const auto count = static_cast<std::int64_t>(read.mFields.mFrames);
	const TickTime time = read.mGroups == 1 && (isCount || hasLeadingSeparator)
		? MovedByFrames(kTime_Zero, isNegative ? -count : count, inRate)
		: FieldsToTime(fields, isNegative, fieldRate, inRow);
	return inFlags.Test(kTimecodeFlag_LastFrame) ? MovedByFrames(time, isNegative ? -1 : 1, inRate) : time;
}

// The number that inText begins with after white space; 0 when there is none. What 64 bits do not hold is the nearest
// number that they do.
std::int64_t ReadFilmNumber(UTF16StringView inText)
{
	const auto begin = std::ranges::find_if_not(inText, IsWhiteSpace);
	const bool isNegative = begin != inText.end() && *begin == '-';
	const std::uint64_t most = std::numeric_limits<std::int64_t>::max() + std::uint64_t{isNegative};
	std::uint64_t number = 0;
	for (auto character = begin + isNegative; character != inText.end() && IsDigit(*character); ++character)
	{
		const std::uint64_t digit = *character - UTF16Char{'0'};
		number = number > (most - digit) / 10 ? most : number * 10 + digit;
	}
	return static_cast<std::int64_t>(isNegative ? 0 - number : number);
}

TickTime ReadFeet(UTF16StringView inText, FrameRate inRate, int inFramesPerFoot, TimecodeFlags inFlags)
{
	const UTF16StringView text = inText.substr(IsSign(inText.front()) ? 1 : 0);
	const auto separators = std::ranges::count_if(text, IsFilmSeparator);
	if (separators > 1)
		return kTime_Invalid;
	// Without a separator the frames are two characters.
	const auto found = static_cast<std::size_t>(std::ranges::find_if(text, IsFilmSeparator) - text.begin());
	const std::size_t feetEnd = separators == 1 ? found : text.size() - std::min<std::size_t>(text.size(), 2);
	const std::int64_t feet = ReadFilmNumber(text.substr(0, feetEnd));
	const std::int64_t frames = ReadFilmNumber(text.substr(feetEnd + static_cast<std::size_t>(separators)));
	const TickTime count(WrappingAdd(WrappingMultiply(feet, inFramesPerFoot), frames));
	const auto signedCount = static_cast<std::int32_t>((inText.front() == '-' ? -count : count).GetTicks());
	const TickTime time = MovedByFrames(kTime_Zero, signedCount, inRate);
	if (!inFlags.Test(kTimecodeFlag_LastFrame))
		return time;
	return MovedByFrames(time, time > kTime_Zero ? 1 : -1, inRate);
}

}   // namespace

void TimeToHMSF(unsigned int& outHours, unsigned int& outMinutes, unsigned int& outSeconds,
	unsigned long long& outFrames, bool& outNegative, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	const TimeDisplayRow& row = FindTimeDisplay(inDisplay);
	const FrameRate rate = row.CountsAtCallersRate() ? inRate : row.mRate;
	const HMSF fields = FieldsOf(inTime, inRate, inDisplay);
	outHours = fields.mHours;
	outMinutes = fields.mMinutes;
	outSeconds = fields.mSeconds;
	outFrames = fields.mFrames;
	outNegative = TakesSignOfFrame(row, rate) ? inTime.GetTicks() <= -rate.GetTicksPerFrame() : inTime < kTime_Zero;
}

TickTime HMSFToTime(unsigned int inHours, unsigned int inMinutes, unsigned int inSeconds, unsigned long long inFrames,
	bool inNegative, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	return FieldsToTime({inHours, inMinutes, inSeconds, inFrames}, inNegative, inRate, FindTimeDisplay(inDisplay));
}

UTF16String TimeToTimecode(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	const TickTime time = inFlags.Test(kTimecodeFlag_LastFrame) ? MovedByFrames(inTime, -1, inRate) : inTime;
	const TimeDisplay display = ChooseDisplay(inDisplay, inRate);
	const TimeDisplayRow& row = FindTimeDisplay(display);
	if (HasUsualText(row, inFlags))
	{
		UTF16String text(kUsualLength, UTF16Char{});
		WriteUsualText(ShownFields(time, inRate, display, inFlags), FrameSeparator(row), text.data());
		return text;
	}
	TimecodeText text;
	PutTimecode(text, time, inRate, display, inFlags);
	return UTF16String(text.GetText());
}

TickTime TimecodeToTime(UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags) noexcept
{
	if (inText.empty())
		return kTime_Zero;
	const TimeDisplayRow& row = FindTimeDisplay(ChooseDisplay(inDisplay, inRate));
	return row.mKind == DisplayKind::Film ? ReadFeet(inText, inRate, row.mFramesPerFoot, inFlags)
										  : ReadTimecode(inText, inRate, row, inFlags);
}

RatioTime TimecodeToRatioTime(UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	return TimeToRatioTime(TimecodeToTime(inText, inRate, inDisplay, inFlags));
}

UTF16String RatioTimeToTimecode(RatioTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	return TimeToTimecode(RatioTimeToTime(inTime), inRate, inDisplay, inFlags);
}

}   // namespace zonmediatypes
