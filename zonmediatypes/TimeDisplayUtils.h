#pragma once

/// \file
/// The ways in which a time is shown: timecode at a fixed rate, counts of frames, film feet, samples or milliseconds.
///
/// Any 32-bit number may be passed as a display; one that is no enumerator gives the neutral result that each function
/// states.

#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"

#include <cstdint>
#include <span>

namespace zonmediatypes
{

/// Hosts store these numbers: they never change.
enum TimeDisplay : std::int32_t
{
	kTimeDisplay_24Timecode = 100,
	kTimeDisplay_25Timecode = 101,
	kTimeDisplay_2997DropTimecode = 102,      ///< 29.97 fps, drop-frame numbering
	kTimeDisplay_2997NonDropTimecode = 103,   ///< 29.97 fps, counted as 30 frames a second
	kTimeDisplay_30Timecode = 104,
	kTimeDisplay_50Timecode = 105,
	kTimeDisplay_5994DropTimecode = 106,      ///< 59.94 fps, drop-frame numbering
	kTimeDisplay_5994NonDropTimecode = 107,   ///< 59.94 fps, counted as 60 frames a second
	kTimeDisplay_60Timecode = 108,
	kTimeDisplay_Frames = 109,           ///< a frame count at the caller's rate
	kTimeDisplay_23976Timecode = 110,    ///< 23.976 fps, counted as 24 frames a second
	kTimeDisplay_16mmFeetFrames = 111,   ///< 40 frames a foot at the caller's rate
	kTimeDisplay_35mmFeetFrames = 112,   ///< 16 frames a foot at the caller's rate
	kTimeDisplay_48Timecode = 113,
	kTimeDisplay_AudioSamples = 200,   ///< hours, minutes, seconds and samples at the caller's rate
	kTimeDisplay_Milliseconds = 201,
	kTimeDisplay_Auto = 999   ///< the timecode functions choose a display that fits the rate
};

/// All displays in the order above, kTimeDisplay_Auto last.
ZONMEDIATYPES_API std::span<const TimeDisplay> AllTimeDisplays() noexcept;

/// The timecode display that counts at inRate; at 29.97 and 59.94 fps the drop-frame one when inDropFrame is set.
/// kTimeDisplay_Milliseconds for 1000 fps when inAllowMilliseconds is set, kTimeDisplay_AudioSamples for the audio rates
/// from 22,050 Hz up. inDefault for every other rate; 8,000 and 11,025 Hz are among them: deliberate. The third argument
/// has no effect.
ZONMEDIATYPES_API TimeDisplay GetTimeDisplayForFrameRate(
	FrameRate inRate, bool inDropFrame, bool /*inUnused*/, TimeDisplay inDefault, bool inAllowMilliseconds) noexcept;

/// The rate in which inDisplay counts: inRate for frames, feet and samples; kFrameRate_Zero for kTimeDisplay_Auto and for
/// what is no display.
ZONMEDIATYPES_API FrameRate GetFrameRateForTimeDisplay(TimeDisplay inDisplay, FrameRate inRate) noexcept;

/// True for samples and milliseconds.
ZONMEDIATYPES_API bool IsTimeDisplayFormatAudio(TimeDisplay inDisplay) noexcept;

/// True for the two displays with drop-frame numbering.
ZONMEDIATYPES_API bool IsTimeDisplayDropFrame(TimeDisplay inDisplay) noexcept;

/// True for the four displays at 29.97 and 59.94 fps, whose frames can be numbered either way.
ZONMEDIATYPES_API bool IsDropFrameApplicableForTimeDisplay(TimeDisplay inDisplay) noexcept;

/// Whether the display has fields of hours, minutes, seconds and frames: not for feet and kTimeDisplay_Auto;
/// inFramesAsHMSF for a frame count; true for everything else, numbers that are no display included.
ZONMEDIATYPES_API bool IsHMSFTimeDisplay(TimeDisplay inDisplay, bool inFramesAsHMSF) noexcept;

}   // namespace zonmediatypes
