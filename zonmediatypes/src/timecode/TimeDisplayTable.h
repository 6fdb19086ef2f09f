#pragma once

#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/src/time/DropFrame.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace zonmediatypes
{

enum class DisplayKind : std::uint8_t
{
	Timecode,
	Frames,
	Film,
	Samples,
	Milliseconds,
	Auto,
	None   ///< no display at all
};

/// How the frames of a rate that has no whole number of them in a second are numbered.
enum class FrameNumbering : std::uint8_t
{
	Straight,   ///< in one way only
	NonDrop,
	Drop
};

struct TimeDisplayRow
{
	TimeDisplay mDisplay;
	DisplayKind mKind;
	FrameRate mRate = kFrameRate_Zero;   ///< its own rate; kinds Frames, Film and Samples count at the caller's
	DropFrameCount mCount{};             ///< labels of a display with a rate of its own
	FrameNumbering mNumbering = FrameNumbering::Straight;
	int mFramesPerFoot = 0;

	constexpr bool CountsAtCallersRate() const noexcept
	{
		return mKind == DisplayKind::Frames || mKind == DisplayKind::Film || mKind == DisplayKind::Samples;
	}
};

/// A display that counts at a rate of its own. A second that is not a whole number of frames long is numbered as if the
/// frame that it ends in were whole; drop-frame numbering makes up for that with two labels a short
/// minute for every thirty in a second.
consteval TimeDisplayRow FixedRateDisplay(TimeDisplay inDisplay, FrameRate inRate,
	FrameNumbering inNumbering = FrameNumbering::Straight, DisplayKind inKind = DisplayKind::Timecode)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	const auto nominal = static_cast<std::uint64_t>((kTicksPerSecond + duration - 1) / duration);
	return {inDisplay, inKind, inRate, {nominal, inNumbering == FrameNumbering::Drop ? nominal / 15 : 0}, inNumbering};
}

consteval TimeDisplayRow FilmDisplay(TimeDisplay inDisplay, int inFramesPerFoot)
{
	return {inDisplay, DisplayKind::Film, kFrameRate_Zero, {}, FrameNumbering::Straight, inFramesPerFoot};
}

// clang-format off
inline constexpr auto kTimeDisplayTable = std::to_array<TimeDisplayRow>({
	FixedRateDisplay(kTimeDisplay_24Timecode,          kFrameRate_Film24),
	FixedRateDisplay(kTimeDisplay_25Timecode,          kFrameRate_VideoPAL),
	FixedRateDisplay(kTimeDisplay_2997DropTimecode,    kFrameRate_VideoNTSC, FrameNumbering::Drop),
	FixedRateDisplay(kTimeDisplay_2997NonDropTimecode, kFrameRate_VideoNTSC, FrameNumbering::NonDrop),
	FixedRateDisplay(kTimeDisplay_30Timecode,          kFrameRate_Video30),
	FixedRateDisplay(kTimeDisplay_50Timecode,          kFrameRate_VideoPAL_HD),
	FixedRateDisplay(kTimeDisplay_5994DropTimecode,    kFrameRate_VideoNTSC_HD, FrameNumbering::Drop),
	FixedRateDisplay(kTimeDisplay_5994NonDropTimecode, kFrameRate_VideoNTSC_HD, FrameNumbering::NonDrop),
	FixedRateDisplay(kTimeDisplay_60Timecode,          kFrameRate_Video60),
	{kTimeDisplay_Frames, DisplayKind::Frames},
	FixedRateDisplay(kTimeDisplay_23976Timecode,       kFrameRate_23976),
	FilmDisplay(kTimeDisplay_16mmFeetFrames, 40),
	FilmDisplay(kTimeDisplay_35mmFeetFrames, 16),
	FixedRateDisplay(kTimeDisplay_48Timecode,          kFrameRate_Film48),
	{kTimeDisplay_AudioSamples, DisplayKind::Samples},
	FixedRateDisplay(kTimeDisplay_Milliseconds, kFrameRate_Video1000, FrameNumbering::Straight, DisplayKind::Milliseconds),
	{kTimeDisplay_Auto, DisplayKind::Auto},
});
// clang-format on

inline constexpr TimeDisplayRow kNoTimeDisplay{TimeDisplay{}, DisplayKind::None};

/// The row of inDisplay without a search: the displays are numbered in three runs. kNoTimeDisplay for other numbers.
constexpr const TimeDisplayRow& FindTimeDisplay(TimeDisplay inDisplay) noexcept
{
	constexpr std::size_t kVideoDisplays = kTimeDisplay_48Timecode - kTimeDisplay_24Timecode + 1;
	if (inDisplay >= kTimeDisplay_24Timecode && inDisplay <= kTimeDisplay_48Timecode)
		return kTimeDisplayTable[static_cast<std::size_t>(inDisplay - kTimeDisplay_24Timecode)];
	if (inDisplay == kTimeDisplay_AudioSamples)
		return kTimeDisplayTable[kVideoDisplays];
	if (inDisplay == kTimeDisplay_Milliseconds)
		return kTimeDisplayTable[kVideoDisplays + 1];
	return inDisplay == kTimeDisplay_Auto ? kTimeDisplayTable[kVideoDisplays + 2] : kNoTimeDisplay;
}

static_assert(
	[]
	{
		for (const TimeDisplayRow& row : kTimeDisplayTable)
			if (&FindTimeDisplay(row.mDisplay) != &row)
				return false;
		return true;
	}(),
	"the table is in the order in which the displays are numbered");

}   // namespace zonmediatypes
