#include "zonmediatypes/Timecode.h"

#include "zoncore/TextScanner.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/src/timecode/TimecodeFields.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <limits>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16StringView;
using zoncore::utility::DigitRun;
using zoncore::utility::IsSign;
using zoncore::utility::TextScanner;
using zoncore::utility::WrappingAdd;
using zoncore::utility::WrappingMultiply;
using zoncore::utility::WrappingNegate;

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
constexpr int kMostGroups = 4;

struct TextFields
{
	TimecodeFields mFields{};
	int mGroups = 1;
};

// Four groups of two digits, read without a branch for every character. False for all other text.
bool ReadFullForm(UTF16StringView inText, TextFields& outFields)
{
	if (inText.size() != kFullFormLength || !IsSeparator(inText[2]) || !IsSeparator(inText[5])
		|| !IsSeparator(inText[8]))
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
	const TextFields fields{{read(0), read(3), read(6), false, read(9)}, kMostGroups};
	if (isNumber)
		outFields = fields;
	return isNumber;
}

// False for a text that is not one to four groups of digits, with single separators between them; the last may be empty.
bool ReadFields(UTF16StringView inText, TextFields& outFields)
{
	constexpr std::uint64_t kMostFrames = std::numeric_limits<std::uint32_t>::max();
	TimecodeFields fields{};
	TextScanner scanner(inText);
	for (int group = 1; group <= kMostGroups; ++group)
	{
		const DigitRun run = scanner.TakeDigits(kMostFrames);
		fields = {fields.mMinutes, fields.mSeconds, static_cast<std::uint32_t>(fields.mFrames), false, run.mValue};
		if (scanner.IsAtEnd())
		{
			outFields = {fields, group};
			return true;
		}
		if (run.mCount == 0 || !IsSeparator(scanner.Next()))
			return false;
	}
	return false;
}

// A run of digits, "HHMMSSFF"; how many of them are frames depends on the rate.
TimecodeFields SplitDigits(std::uint64_t inRun, FrameRate inRate)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	const std::uint32_t frames = duration >= kFrameRate_Video100.GetTicksPerFrame() ? 100
		: duration >= kFrameRate_Video1000.GetTicksPerFrame()                       ? 1'000
		: duration >= kFrameRate_Video1000.GetTicksPerFrame() / 10                  ? 10'000
																					: 100'000;
	const auto run = static_cast<std::uint32_t>(inRun);
	const std::uint32_t rest = run / frames;
	return {rest / 10'000, rest / 100 % 100, rest % 100, false, run % frames};
}

TickTime ReadTimecode(UTF16StringView inText, FrameRate inRate, const TimeDisplayRow& inRow, TimecodeFlags inFlags)
{
	const bool isNegative = inText.front() == '-';
	const UTF16StringView magnitude = inText.substr(IsSign(inText.front()) ? 1 : 0);
	const bool hasLeadingSeparator = !magnitude.empty() && IsSeparator(magnitude.front());
	const UTF16StringView groups = magnitude.substr(hasLeadingSeparator ? 1 : 0);
	TextFields read;
	if (groups.empty() || (!ReadFullForm(groups, read) && !ReadFields(groups, read)))
		return kTime_Invalid;
	const bool isCount = inRow.mKind == DisplayKind::Frames;
	if (isCount && read.mGroups != 1)
		return kTime_Invalid;

	const FrameRate fieldRate = inRow.mKind == DisplayKind::Milliseconds ? inRow.mRate : inRate;
	TimecodeFields fields = read.mGroups == 1 ? SplitDigits(read.mFields.mFrames, fieldRate) : read.mFields;
	fields.mNegative = isNegative;
	const auto count = static_cast<std::int64_t>(read.mFields.mFrames);
	const TickTime time = read.mGroups == 1 && (isCount || hasLeadingSeparator)
		? MovedByFrames(kTime_Zero, isNegative ? -count : count, inRate)
		: FieldsToTime(fields, fieldRate, inRow);
	return inFlags.Test(kTimecodeFlag_LastFrame) ? MovedByFrames(time, isNegative ? -1 : 1, inRate) : time;
}

// The number that inText begins with after white space; 0 when there is none. What 64 bits do not hold is the nearest
// number that they do.
std::int64_t ReadFilmNumber(UTF16StringView inText)
{
	TextScanner scanner(inText);
	scanner.SkipWhiteSpace();
	const bool isNegative = scanner.Take('-');
	const std::uint64_t most = std::numeric_limits<std::int64_t>::max() + std::uint64_t{isNegative};
	const std::uint64_t number = scanner.TakeDigits(most).mValue;
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
	const std::int64_t count = WrappingAdd(WrappingMultiply(feet, inFramesPerFoot), frames);
	const auto signedCount = static_cast<std::int32_t>(inText.front() == '-' ? WrappingNegate(count) : count);
	const TickTime time = MovedByFrames(kTime_Zero, signedCount, inRate);
	if (!inFlags.Test(kTimecodeFlag_LastFrame))
		return time;
	return MovedByFrames(time, time > kTime_Zero ? 1 : -1, inRate);
}

TickTime ReadText(UTF16StringView inText, FrameRate inRate, const TimeDisplayRow& inRow, TimecodeFlags inFlags)
{
	if (inText.empty())
		return kTime_Zero;
	return inRow.mKind == DisplayKind::Film ? ReadFeet(inText, inRate, inRow.mFramesPerFoot, inFlags)
											: ReadTimecode(inText, inRate, inRow, inFlags);
}

}   // namespace

TickTime TimecodeToTime(UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags) noexcept
{
	return ReadText(inText, inRate, FindTimeDisplay(ChooseDisplay(inDisplay, inRate)), inFlags);
}

std::size_t TimecodesToTimes(std::span<TickTime> outTimes, std::span<const UTF16StringView> inTexts, FrameRate inRate,
	TimeDisplay inDisplay, TimecodeFlags inFlags) noexcept
{
	const std::size_t count = std::min(outTimes.size(), inTexts.size());
	const TimeDisplayRow& row = FindTimeDisplay(ChooseDisplay(inDisplay, inRate));
	for (std::size_t i = 0; i < count; ++i)
		outTimes[i] = ReadText(inTexts[i], inRate, row, inFlags);
	return count;
}

RatioTime TimecodeToRatioTime(UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	return TimeToRatioTime(TimecodeToTime(inText, inRate, inDisplay, inFlags));
}

RatioTime TimecodeToRatioTime(
	const zoncore::UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	return TimecodeToRatioTime(UTF16StringView(inText), inRate, inDisplay, inFlags);
}

}   // namespace zonmediatypes
