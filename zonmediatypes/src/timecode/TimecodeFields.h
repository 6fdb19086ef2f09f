#pragma once

#include "zoncore/NumberConversion.h"
#include "zoncore/Reciprocal.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/Timecode.h"
#include "zonmediatypes/src/time/DropFrame.h"
#include "zonmediatypes/src/timecode/TimeDisplayTable.h"

#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <utility>

// Times as hours, minutes, seconds and frames, and back: what timecode in numbers and in text is made of.

namespace zonmediatypes
{

/// The characters of "HH:MM:SS:FF". Nearly all text has this form: it is written where it stays, and read without a loop.
inline constexpr std::size_t kFullFormLength = 11;

// kTimeDisplay_Auto is for media: pulled-down rates are numbered with drop frames.
inline TimeDisplay ChooseDisplay(TimeDisplay inDisplay, FrameRate inRate) noexcept
{
	return inDisplay == kTimeDisplay_Auto
		? GetTimeDisplayForFrameRate(inRate, true, true, kTimeDisplay_2997DropTimecode, false)
		: inDisplay;
}

inline TickTime MovedByFrames(TickTime inTime, long long inFrames, FrameRate inRate) noexcept
{
	inTime.AddFrames(inFrames, inRate);
	return inTime;
}

// ---- Time to fields --------------------------------------------------------------------------------------------------

/// Splits a count of labels, of which inNominal last a second, where the whole seconds are known; up to 2^32 of them. Hours
/// wrap at 24.
constexpr TimecodeFields SplitSeconds(std::uint64_t inLabels, std::uint64_t inSeconds, std::uint64_t inNominal) noexcept
{
	// Remainders are made from their quotients: compilers divide again for `%`.
	const auto seconds = static_cast<std::uint32_t>(inSeconds);
	const std::uint32_t minutes = seconds / 60;
	const std::uint32_t hours = minutes / 60;
	return {hours < 24 ? hours : hours % 24, minutes - 60 * hours, seconds - 60 * minutes, false,
		inLabels - inNominal * seconds};
}

/// Splits times at the display of a row with a rate of its own, one of the table so that every division is by a constant.
template <std::size_t inRow>
struct OwnRateSplitter
{
	TimecodeFields operator()(TickTime inTime) const noexcept
	{
		constexpr const TimeDisplayRow& kRow = kTimeDisplayTable[inRow];
		const std::uint64_t frames = zoncore::utility::Magnitude(inTime.GetTicks())
			/ static_cast<std::uint64_t>(kRow.mRate.GetTicksPerFrame());
		const std::uint64_t labels = kRow.mCount.mDropped != 0 ? kRow.mCount.LabelOf(frames) : frames;
		return SplitSeconds(labels, labels / kRow.mCount.mNominal, kRow.mCount.mNominal);
	}
};

/// How a single time is divided by a number that is known at run time only; zoncore's Reciprocal serves many times.
class Divisor
{
public:
	explicit Divisor(std::uint64_t inDivisor) noexcept : mDivisor(inDivisor) {}

	std::uint64_t Divide(std::uint64_t inDividend) const noexcept { return inDividend / mDivisor; }

private:
	std::uint64_t mDivisor;
};

/// Splits times at the caller's rate, which has at least one whole frame in a second.
template <class AnyDivisor>
class CallersRateSplitter
{
public:
	explicit CallersRateSplitter(std::int64_t inTicksPerFrame) noexcept
		: mTicksPerFrame(static_cast<std::uint64_t>(inTicksPerFrame)),
		  mNominal(static_cast<std::uint64_t>(kTicksPerSecond / inTicksPerFrame)),
		  mFramesPerSecond(mNominal)
	{
	}

	TimecodeFields operator()(TickTime inTime) const noexcept
	{
		const std::uint64_t frames = mTicksPerFrame.Divide(zoncore::utility::Magnitude(inTime.GetTicks()));
		return SplitSeconds(frames, mFramesPerSecond.Divide(frames), mNominal);
	}

private:
	AnyDivisor mTicksPerFrame;
	std::uint64_t mNominal;
	AnyDivisor mFramesPerSecond;
};

/// The signed count of frames alone, at any rate that is usable.
template <class AnyDivisor>
class FrameCounter
{
public:
	explicit FrameCounter(std::int64_t inTicksPerFrame) noexcept
		: mTicksPerFrame(zoncore::utility::Magnitude(inTicksPerFrame)), mIsBackwards(inTicksPerFrame < 0)
	{
	}

	TimecodeFields operator()(TickTime inTime) const noexcept
	{
		const std::uint64_t frames = mTicksPerFrame.Divide(zoncore::utility::Magnitude(inTime.GetTicks()));
		return {0, 0, 0, false, (inTime < kTime_Zero) != mIsBackwards ? 0 - frames : frames};
	}

private:
	AnyDivisor mTicksPerFrame;
	bool mIsBackwards;
};

struct NoFields
{
	TimecodeFields operator()(TickTime) const noexcept { return {}; }
};

/// What inUse gives of what splits times at the display that has its row at inPlace of the table.
template <std::size_t inPlace, class AnyDivisor, class Use>
auto WithSplitterOf(FrameRate inRate, Use inUse)
{
	constexpr const TimeDisplayRow& kRow = kTimeDisplayTable[inPlace];
	const std::int64_t duration = inRate.GetTicksPerFrame();
	if constexpr (kRow.HasOwnRate())
		return inUse(OwnRateSplitter<inPlace>());
	else if constexpr (kRow.mKind == DisplayKind::Frames)
		return inRate.IsUsable() ? inUse(FrameCounter<AnyDivisor>(duration)) : inUse(NoFields());
	else if constexpr (kRow.CountsAtCallersRate())
		return duration >= 1 && duration <= kTicksPerSecond ? inUse(CallersRateSplitter<AnyDivisor>(duration))
															: inUse(NoFields());
	else
		return inUse(NoFields());
}

template <class AnyDivisor, class Use, std::size_t... inPlaces>
constexpr auto MakeSplitterTable(std::index_sequence<inPlaces...>)
{
	return std::array{&WithSplitterOf<inPlaces, AnyDivisor, Use>...};
}

/// The same for a place that is known at run time only.
template <class AnyDivisor, class Use>
auto WithSplitter(FrameRate inRate, std::size_t inPlace, Use inUse)
{
	static constexpr auto kSplitters
		= MakeSplitterTable<AnyDivisor, Use>(std::make_index_sequence<kTimeDisplayTable.size()>());
	return kSplitters[inPlace](inRate, inUse);
}

inline TimecodeFields FieldsOf(TickTime inTime, FrameRate inRate, std::size_t inPlace) noexcept
{
	return WithSplitter<Divisor>(inRate, inPlace, [=](auto inSplit) { return inSplit(inTime); });
}

/// The time that is negative and nearest to zero, in ticks. Where the fields are those of a frame number it is the number's
/// sign that counts: a time within the first frame before zero is frame 0, which is not negative.
inline std::int64_t LastNegativeTick(FrameRate inRate, const TimeDisplayRow& inRow) noexcept
{
	const std::int64_t duration = (inRow.CountsAtCallersRate() ? inRate : inRow.mRate).GetTicksPerFrame();
	const bool takesSignOfFrame = inRow.mNumbering != FrameNumbering::Drop && inRow.mKind != DisplayKind::Frames
		&& duration >= 1 && duration <= kTicksPerSecond;
	return takesSignOfFrame ? -duration : -1;
}

// ---- Fields to time --------------------------------------------------------------------------------------------------

inline double FramesPerSecondOf(FrameRate inRate) noexcept
{
	return inRate.IsUsable() ? static_cast<double>(kTicksPerSecond) / static_cast<double>(inRate.GetTicksPerFrame())
							 : 0.0;
}

/// Whether inFrames frames last longer than a second: double(inFrames) > FramesPerSecondOf(inRate) without a division. Both
/// are the same, because a quotient up to kTicksPerSecond that is not whole is further from a whole number than a double's
/// rounding error.
inline bool ExceedsSecond(std::uint64_t inFrames, FrameRate inRate) noexcept
{
	constexpr std::uint64_t kMostExact = std::numeric_limits<std::int64_t>::max() / kTicksPerSecond;
	const std::int64_t duration = inRate.GetTicksPerFrame();
	if (duration < 1 || duration > kTicksPerSecond)
		return false;   // less than one frame in a second, or no rate
	if (inFrames > kMostExact)
		return static_cast<double>(inFrames) > FramesPerSecondOf(inRate);
	return static_cast<std::int64_t>(inFrames) * duration > kTicksPerSecond;
}

/// Takes whole seconds out of the frames. The count of frames in a second is that of the rate itself or of the next faster
/// one with a whole number of frames in a second, formed through double as hosts form it.
inline TimecodeFields CarryFrames(TimecodeFields inFields, FrameRate inRate) noexcept
{
	using zoncore::utility::TruncateTo;
	const double perSecond = std::ceil(FramesPerSecondOf(inRate));
	const auto duration = TruncateTo<std::int64_t>(static_cast<double>(kTicksPerSecond) / perSecond);
	const double nominal = static_cast<double>(kTicksPerSecond) / static_cast<double>(duration);
	const auto carry
		= static_cast<std::uint64_t>(TruncateTo<std::int64_t>(static_cast<double>(inFields.mFrames) / nominal));
	return {inFields.mHours, inFields.mMinutes, inFields.mSeconds + static_cast<std::uint32_t>(carry),
		inFields.mNegative, inFields.mFrames - carry * static_cast<std::uint64_t>(TruncateTo<std::int64_t>(nominal))};
}

/// Brings minutes and seconds below 60 and hours below 24, where they mostly are.
inline TimecodeFields CarrySeconds(TimecodeFields inFields) noexcept
{
	if (inFields.mSeconds < 60 && inFields.mMinutes < 60 && inFields.mHours < 24)
		return inFields;
	const std::uint32_t minutes = inFields.mMinutes + inFields.mSeconds / 60;
	const std::uint32_t hours = inFields.mHours + minutes / 60;
	return {hours % 24, minutes % 60, inFields.mSeconds % 60, inFields.mNegative, inFields.mFrames};
}

/// The number of the frame that has these labels; without dropped labels they count up without a gap. The first label of a
/// short minute is dropped with the next one; it alone counts as the frame that the minute begins with.
inline std::uint64_t FrameNumber(TimecodeFields inFields, DropFrameCount inCount) noexcept
{
	const std::uint64_t minutes = inFields.mHours * std::uint64_t{60} + inFields.mMinutes;   // [0, 1439]
	const std::uint64_t shortMinutes = minutes - minutes / 10;
	const bool isDroppedFirstLabel = minutes % 10 != 0 && inFields.mSeconds == 0 && inFields.mFrames == 0;
	const std::uint64_t dropped = inCount.mDropped * (shortMinutes - (isDroppedFirstLabel ? 1 : 0));
	return inCount.mNominal * (minutes * 60 + inFields.mSeconds) + inFields.mFrames - dropped;
}

inline std::uint64_t CallersRateFrameNumber(TimecodeFields inFields, FrameRate inRate, bool inRoundsSum) noexcept
{
	using zoncore::utility::TruncateTo;
	const std::uint32_t seconds = (inFields.mHours * 60 + inFields.mMinutes) * 60 + inFields.mSeconds;
	const double frames = seconds * FramesPerSecondOf(inRate);
	if (inRoundsSum)
		return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames + static_cast<double>(inFields.mFrames)));
	return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames)) + inFields.mFrames;
}

inline TickTime FieldsToTime(TimecodeFields inFields, FrameRate inRate, const TimeDisplayRow& inRow) noexcept
{
	const TimecodeFields fields
		= CarrySeconds(ExceedsSecond(inFields.mFrames, inRate) ? CarryFrames(inFields, inRate) : inFields);
	const FrameRate rate = inRow.CountsAtCallersRate() ? inRate : inRow.mRate;
	const std::uint64_t number = inRow.HasOwnRate()
		? FrameNumber(fields, inRow.mCount)
		: CallersRateFrameNumber(fields, rate, inRow.mKind == DisplayKind::Frames);
	const TickTime time(zoncore::utility::WrappingMultiply(static_cast<std::int64_t>(number), rate.GetTicksPerFrame()));
	return inFields.mNegative ? -time : time;
}

}   // namespace zonmediatypes
