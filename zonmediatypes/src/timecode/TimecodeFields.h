#pragma once

#include "zoncore/NumberConversion.h"
#include "zoncore/Reciprocal.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/src/time/DropFrame.h"
#include "zonmediatypes/src/timecode/TimeDisplayTable.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>

// Times as hours, minutes, seconds and frames, and back: what timecode in numbers and in text is made of.

namespace zonmediatypes
{

/// The characters of "HH:MM:SS:FF". Nearly all text has this form: it is written where it stays, and read without a loop.
inline constexpr std::size_t kUsualLength = 11;

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

/// Splits times at a display with a rate of its own. The display is a template argument so that every division is by a
/// constant.
template <TimeDisplay inDisplay>
struct FixedRateSplitter
{
	HMSF operator()(TickTime inTime) const noexcept
	{
		constexpr const TimeDisplayRow& kRow = FindTimeDisplay(inDisplay);
		const std::uint64_t frames = zoncore::utility::Magnitude(inTime.GetTicks())
			/ static_cast<std::uint64_t>(kRow.mRate.GetTicksPerFrame());
		if constexpr (kRow.mNumbering == FrameNumbering::Drop)
			return SplitDropFrames(frames, kRow.mCount);
		else
			return SplitFrames(frames, kRow.mCount.mNominal);
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

	HMSF operator()(TickTime inTime) const noexcept
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

	HMSF operator()(TickTime inTime) const noexcept
	{
		const std::uint64_t frames = mTicksPerFrame.Divide(zoncore::utility::Magnitude(inTime.GetTicks()));
		return {0, 0, 0, (inTime < kTime_Zero) != mIsBackwards ? 0 - frames : frames};
	}

private:
	AnyDivisor mTicksPerFrame;
	bool mIsBackwards;
};

struct NoFields
{
	HMSF operator()(TickTime) const noexcept { return {}; }
};

// clang-format off
/// Calls inUse with what splits times at a display.
template <class AnyDivisor, class Use>
auto WithSplitter(FrameRate inRate, TimeDisplay inDisplay, Use inUse)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	switch (inDisplay)
	{
	case kTimeDisplay_24Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_24Timecode>());
	case kTimeDisplay_25Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_25Timecode>());
	case kTimeDisplay_2997DropTimecode:    return inUse(FixedRateSplitter<kTimeDisplay_2997DropTimecode>());
	case kTimeDisplay_2997NonDropTimecode: return inUse(FixedRateSplitter<kTimeDisplay_2997NonDropTimecode>());
	case kTimeDisplay_30Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_30Timecode>());
	case kTimeDisplay_50Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_50Timecode>());
	case kTimeDisplay_5994DropTimecode:    return inUse(FixedRateSplitter<kTimeDisplay_5994DropTimecode>());
	case kTimeDisplay_5994NonDropTimecode: return inUse(FixedRateSplitter<kTimeDisplay_5994NonDropTimecode>());
	case kTimeDisplay_60Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_60Timecode>());
	case kTimeDisplay_23976Timecode:       return inUse(FixedRateSplitter<kTimeDisplay_23976Timecode>());
	case kTimeDisplay_48Timecode:          return inUse(FixedRateSplitter<kTimeDisplay_48Timecode>());
	case kTimeDisplay_Milliseconds:        return inUse(FixedRateSplitter<kTimeDisplay_Milliseconds>());
	case kTimeDisplay_16mmFeetFrames:
	case kTimeDisplay_35mmFeetFrames:
	case kTimeDisplay_AudioSamples:
		if (duration >= 1 && duration <= kTicksPerSecond)
			return inUse(CallersRateSplitter<AnyDivisor>(duration));
		break;
	case kTimeDisplay_Frames:
		if (inRate.IsUsable())
			return inUse(FrameCounter<AnyDivisor>(duration));
		break;
	case kTimeDisplay_Auto:
		break;
	}
	return inUse(NoFields());
}
// clang-format on

inline HMSF FieldsOf(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	return WithSplitter<Divisor>(inRate, inDisplay, [=](auto inSplit) { return inSplit(inTime); });
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
inline HMSF CarryFrames(HMSF inFields, FrameRate inRate) noexcept
{
	using zoncore::utility::TruncateTo;
	const double perSecond = std::ceil(FramesPerSecondOf(inRate));
	const auto duration = TruncateTo<std::int64_t>(static_cast<double>(kTicksPerSecond) / perSecond);
	const double nominal = static_cast<double>(kTicksPerSecond) / static_cast<double>(duration);
	const auto carry
		= static_cast<std::uint64_t>(TruncateTo<std::int64_t>(static_cast<double>(inFields.mFrames) / nominal));
	return {inFields.mHours, inFields.mMinutes, inFields.mSeconds + static_cast<std::uint32_t>(carry),
		inFields.mFrames - carry * static_cast<std::uint64_t>(TruncateTo<std::int64_t>(nominal))};
}

/// Brings minutes and seconds below 60 and hours below 24, where they mostly are.
inline HMSF CarrySeconds(HMSF inFields) noexcept
{
	if (inFields.mSeconds < 60 && inFields.mMinutes < 60 && inFields.mHours < 24)
		return inFields;
	const std::uint32_t minutes = inFields.mMinutes + inFields.mSeconds / 60;
	const std::uint32_t hours = inFields.mHours + minutes / 60;
	return {hours % 24, minutes % 60, inFields.mSeconds % 60, inFields.mFrames};
}

/// The number of the frame that has these labels; without dropped labels they count up without a gap. The first label of a
/// short minute is dropped with the next one; it alone counts as the frame that the minute begins with.
inline std::uint64_t FrameNumber(HMSF inFields, DropFrameCount inCount) noexcept
{
	const std::uint64_t minutes = inFields.mHours * std::uint64_t{60} + inFields.mMinutes;   // [0, 1439]
	const std::uint64_t shortMinutes = minutes - minutes / 10;
	const bool isDroppedFirstLabel = minutes % 10 != 0 && inFields.mSeconds == 0 && inFields.mFrames == 0;
	const std::uint64_t dropped = inCount.mDropped * (shortMinutes - (isDroppedFirstLabel ? 1 : 0));
	return inCount.mNominal * (minutes * 60 + inFields.mSeconds) + inFields.mFrames - dropped;
}

inline std::uint64_t CallersRateFrameNumber(HMSF inFields, FrameRate inRate, bool inRoundsSum) noexcept
{
	using zoncore::utility::TruncateTo;
	const std::uint32_t seconds = (inFields.mHours * 60 + inFields.mMinutes) * 60 + inFields.mSeconds;
	const double frames = seconds * FramesPerSecondOf(inRate);
	if (inRoundsSum)
		return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames + static_cast<double>(inFields.mFrames)));
	return static_cast<std::uint64_t>(TruncateTo<std::int64_t>(frames)) + inFields.mFrames;
}

inline TickTime FieldsToTime(HMSF inFields, bool inNegative, FrameRate inRate, const TimeDisplayRow& inRow) noexcept
{
	const HMSF fields
		= CarrySeconds(ExceedsSecond(inFields.mFrames, inRate) ? CarryFrames(inFields, inRate) : inFields);
	const bool hasOwnRate = inRow.mCount.mNominal != 0;
	const FrameRate rate = inRow.CountsAtCallersRate() ? inRate : inRow.mRate;
	const std::uint64_t number = hasOwnRate ? FrameNumber(fields, inRow.mCount)
											: CallersRateFrameNumber(fields, rate, inRow.mKind == DisplayKind::Frames);
	const TickTime time(zoncore::utility::WrappingMultiply(static_cast<std::int64_t>(number), rate.GetTicksPerFrame()));
	return inNegative ? -time : time;
}

}   // namespace zonmediatypes
