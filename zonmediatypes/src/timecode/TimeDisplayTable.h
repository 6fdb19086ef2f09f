#pragma once

#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/src/time/DropFrame.h"

#include <algorithm>
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

	constexpr bool HasOwnRate() const noexcept { return mCount.mNominal != 0; }
};

/// A display that counts at a rate of its own. A second that is not a whole number of frames long is numbered as if the
/// frame that it ends in were whole.
consteval TimeDisplayRow FixedRateDisplay(TimeDisplay inDisplay, FrameRate inRate,
	FrameNumbering inNumbering = FrameNumbering::Straight, DisplayKind inKind = DisplayKind::Timecode)
{
	const std::int64_t duration = inRate.GetTicksPerFrame();
	const auto nominal = static_cast<std::uint64_t>((kTicksPerSecond + duration - 1) / duration);
	const bool isDrop = inNumbering == FrameNumbering::Drop;
	return {inDisplay, inKind, inRate, isDrop ? DropFrameCount::Dropping(nominal) : DropFrameCount{nominal, 0},
		inNumbering};
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
	{TimeDisplay{}, DisplayKind::None},
});
// clang-format on
inline constexpr std::size_t kTimeDisplays = kTimeDisplayTable.size() - 1;   // without the last row

/// The place of a display's row without a search: the displays are numbered in three runs. The last row for other numbers.
constexpr std::size_t PlaceOf(TimeDisplay inDisplay) noexcept
{
	constexpr std::size_t kVideoDisplays = kTimeDisplay_48Timecode - kTimeDisplay_24Timecode + 1;
	if (inDisplay >= kTimeDisplay_24Timecode && inDisplay <= kTimeDisplay_48Timecode)
		return static_cast<std::size_t>(inDisplay - kTimeDisplay_24Timecode);
	if (inDisplay == kTimeDisplay_AudioSamples)
		return kVideoDisplays;
	if (inDisplay == kTimeDisplay_Milliseconds)
		return kVideoDisplays + 1;
	return inDisplay == kTimeDisplay_Auto ? kVideoDisplays + 2 : kTimeDisplays;
}
static_assert(std::ranges::all_of(kTimeDisplayTable,
				  [](const TimeDisplayRow& inRow) { return &kTimeDisplayTable[PlaceOf(inRow.mDisplay)] == &inRow; }),
	"the table is in the order in which the displays are numbered");

constexpr const TimeDisplayRow& FindTimeDisplay(TimeDisplay inDisplay) noexcept
{
	return kTimeDisplayTable[PlaceOf(inDisplay)];
}

}   // namespace zonmediatypes
