#pragma once

#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TimeDisplayUtils.h"

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

/// How the frames of a second that is not a whole number of frames long are numbered.
enum class FrameNumbering : std::uint8_t
{
	Straight,   ///< seconds are whole numbers of frames, or are counted as if they were
	NonDrop,
	Drop
};

struct TimeDisplayRow
{
	TimeDisplay mDisplay;
	DisplayKind mKind;
	FrameRate mRate = kFrameRate_Zero;   ///< in which the display counts; of kind Frames, Film and Samples the caller's
	FrameNumbering mNumbering = FrameNumbering::Straight;
	int mFramesPerFoot = 0;

	constexpr bool CountsAtCallersRate() const noexcept
	{
		return mKind == DisplayKind::Frames || mKind == DisplayKind::Film || mKind == DisplayKind::Samples;
	}
};

// clang-format off
inline constexpr auto kTimeDisplayTable = std::to_array<TimeDisplayRow>({
	{kTimeDisplay_24Timecode,          DisplayKind::Timecode, kFrameRate_Film24},
	{kTimeDisplay_25Timecode,          DisplayKind::Timecode, kFrameRate_VideoPAL},
	{kTimeDisplay_2997DropTimecode,    DisplayKind::Timecode, kFrameRate_VideoNTSC, FrameNumbering::Drop},
	{kTimeDisplay_2997NonDropTimecode, DisplayKind::Timecode, kFrameRate_VideoNTSC, FrameNumbering::NonDrop},
	{kTimeDisplay_30Timecode,          DisplayKind::Timecode, kFrameRate_Video30},
	{kTimeDisplay_50Timecode,          DisplayKind::Timecode, kFrameRate_VideoPAL_HD},
	{kTimeDisplay_5994DropTimecode,    DisplayKind::Timecode, kFrameRate_VideoNTSC_HD, FrameNumbering::Drop},
	{kTimeDisplay_5994NonDropTimecode, DisplayKind::Timecode, kFrameRate_VideoNTSC_HD, FrameNumbering::NonDrop},
	{kTimeDisplay_60Timecode,          DisplayKind::Timecode, kFrameRate_Video60},
	{kTimeDisplay_Frames,              DisplayKind::Frames},
	{kTimeDisplay_23976Timecode,       DisplayKind::Timecode, kFrameRate_23976},
	{kTimeDisplay_16mmFeetFrames,      DisplayKind::Film, kFrameRate_Zero, FrameNumbering::Straight, 40},
	{kTimeDisplay_35mmFeetFrames,      DisplayKind::Film, kFrameRate_Zero, FrameNumbering::Straight, 16},
	{kTimeDisplay_48Timecode,          DisplayKind::Timecode, kFrameRate_Film48},
	{kTimeDisplay_AudioSamples,        DisplayKind::Samples},
	{kTimeDisplay_Milliseconds,        DisplayKind::Milliseconds, kFrameRate_Video1000},
	{kTimeDisplay_Auto,                DisplayKind::Auto},
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
