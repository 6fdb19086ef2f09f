#include "zonmediatypes/TimeDisplayUtils.h"

#include "zonmediatypes/src/timecode/TimeDisplayTable.h"

#include <algorithm>

namespace zonmediatypes
{
namespace
{

constexpr auto sAllTimeDisplays = []
{
	std::array<TimeDisplay, kTimeDisplays> displays{};
	std::ranges::transform(
		kTimeDisplayTable.begin(), kTimeDisplayTable.end() - 1, displays.begin(), &TimeDisplayRow::mDisplay);
	return displays;
}();

// A named rate of 22,050 Hz or more: a host that shows slower ones picks the display itself.
bool IsShownInSamples(FrameRate inRate)
{
	return inRate.GetTicksPerFrame() <= kFrameRate_Audio22050.GetTicksPerFrame()
		&& std::ranges::find(AllFrameRates(), inRate) != AllFrameRates().end();
}

}   // namespace

std::span<const TimeDisplay> AllTimeDisplays() noexcept
{
	return sAllTimeDisplays;
}

TimeDisplay GetTimeDisplayForFrameRate(
	FrameRate inRate, bool inDropFrame, bool /*inUnused*/, TimeDisplay inDefault, bool inAllowMilliseconds) noexcept
{
	const FrameNumbering other = inDropFrame ? FrameNumbering::NonDrop : FrameNumbering::Drop;
	const auto fits = [&](const TimeDisplayRow& inRow)
	{
		return inRow.mRate == inRate && inRow.mNumbering != other
			&& (inRow.mKind == DisplayKind::Timecode
				|| (inRow.mKind == DisplayKind::Milliseconds && inAllowMilliseconds));
	};
	if (const auto row = std::ranges::find_if(kTimeDisplayTable, fits); row != kTimeDisplayTable.end())
		return row->mDisplay;
	return IsShownInSamples(inRate) ? kTimeDisplay_AudioSamples : inDefault;
}

FrameRate GetFrameRateForTimeDisplay(TimeDisplay inDisplay, FrameRate inRate) noexcept
{
	const TimeDisplayRow& row = FindTimeDisplay(inDisplay);
	return row.CountsAtCallersRate() ? inRate : row.mRate;
}

bool IsTimeDisplayFormatAudio(TimeDisplay inDisplay) noexcept
{
	const DisplayKind kind = FindTimeDisplay(inDisplay).mKind;
	return kind == DisplayKind::Samples || kind == DisplayKind::Milliseconds;
}

bool IsTimeDisplayDropFrame(TimeDisplay inDisplay) noexcept
{
	return FindTimeDisplay(inDisplay).mNumbering == FrameNumbering::Drop;
}

bool IsDropFrameApplicableForTimeDisplay(TimeDisplay inDisplay) noexcept
{
	return FindTimeDisplay(inDisplay).mNumbering != FrameNumbering::Straight;
}

bool IsHMSFTimeDisplay(TimeDisplay inDisplay, bool inFramesAsHMSF) noexcept
{
	const DisplayKind kind = FindTimeDisplay(inDisplay).mKind;
	if (kind == DisplayKind::Frames)
		return inFramesAsHMSF;
	return kind != DisplayKind::Film && kind != DisplayKind::Auto;
}

}   // namespace zonmediatypes
