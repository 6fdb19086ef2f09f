#pragma once

/// \file
/// Conversion between times and what a user sees of them: timecode, frame counts, film feet, samples, milliseconds.
///
///     TimeToTimecode(TickTime(914'457'600'000), kFrameRate_VideoPAL, kTimeDisplay_25Timecode);    // "00:00:03:15"
///     TimecodeToTime(text, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode);
///
/// Every function takes a display and the caller's rate, that of the media. The display's own rate counts where it has
/// one; the caller's rate counts for frames, feet and samples, decides when frames carry into seconds and how a run of
/// digits is read, and is the rate of the frame that kTimecodeFlag_LastFrame moves by. Pass the rate that belongs to the
/// display, or the media's at the displays without one: the run "500" at 25 fps timecode is 5 s with a 25 fps rate and
/// 20 s with a 48 kHz rate.
///
/// Any argument is accepted. All functions are pure and may be called from any thread; reading allocates nothing, writing
/// only the text that is returned.

#include "zoncore/Flags.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"

namespace zonmediatypes
{

enum TimecodeFlag : unsigned int
{
	kTimecodeFlag_OmitHours = 1,   ///< writes no hours
	kTimecodeFlag_TrimLeadingZeros
	= 2,                          ///< leaves out leading fields that are zero, and the first field's leading zero
	kTimecodeFlag_ShowSign = 4,   ///< writes "+" or "-" before a time that is not zero
	kTimecodeFlag_LastFrame = 8   ///< shows the last frame of a range whose end is the time, and reads it as the end
};

/// Timecode flags joined with `|`; bits that are no flag have no effect.
using TimecodeFlags = zoncore::Flags<unsigned int>;

// ---- Numbers ---------------------------------------------------------------------------------------------------------

/// Splits the magnitude of a time into fields; outNegative is its sign. Hours wrap at 24, so times of a day and more lose
/// whole days. Frames are truncated toward zero.
///
/// At kTimeDisplay_Frames outFrames is the signed frame count and the other fields are 0. At a display whose rate is not
/// usable, negative or slower than one frame a second, all fields are 0. outNegative is the sign of the time for these and
/// for drop-frame numbering, the sign of the frame number for all others.
ZONMEDIATYPES_API void TimeToHMSF(unsigned int& outHours, unsigned int& outMinutes, unsigned int& outSeconds,
	unsigned long long& outFrames, bool& outNegative, TickTime inTime, FrameRate inRate,
	TimeDisplay inDisplay) noexcept;

/// The time of some fields. More frames than the caller's rate has in a second carry into seconds, seconds into minutes,
/// minutes into hours; hours wrap at 24. No field is rejected, and what is too large wraps.
///
/// Labels that drop-frame numbering skips have times, too: at 29.97 fps label 00 of a short minute is its first frame and
/// label 01 the frame before (59.94: 01 to 03 the frames before). Deliberate: typed times are never refused.
///
/// At a display without a usable rate the frames are still multiplied by the stored duration: check the display first.
ZONMEDIATYPES_API TickTime HMSFToTime(unsigned int inHours, unsigned int inMinutes, unsigned int inSeconds,
	unsigned long long inFrames, bool inNegative, FrameRate inRate, TimeDisplay inDisplay) noexcept;

// ---- Text ------------------------------------------------------------------------------------------------------------

/// The text of a time:
///
/// | display           | text                                                                      |
/// |-------------------|---------------------------------------------------------------------------|
/// | timecode          | "01:02:03:04", drop-frame "01:02:03;04"                                   |
/// | milliseconds      | "01:02:03.456"                                                            |
/// | samples           | "01:02:03:00456"; as wide as the rate needs up to 99,999 Hz, else unpadded |
/// | frames            | "-1000", always signed                                                    |
/// | feet and frames   | "62+08"; a negative time is always signed                                 |
/// | kTimeDisplay_Auto | as the display that fits the rate, else 29.97 fps drop-frame              |
///
/// A negative time without kTimecodeFlag_ShowSign shows 23 minus its hours and all other fields as they are, as if only
/// the hour ran backwards: one frame before zero at 25 fps is "23:00:00:01". Deliberate; such text reads back as a positive
/// time. kTime_Invalid gives an ordinary-looking text ("08:06:40:00" at 25 fps): compare with it first.
ZONMEDIATYPES_API zoncore::UTF16String TimeToTimecode(
	TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

/// The time of a text; kTime_Invalid for text that is rejected, kTime_Zero for an empty one. Only
/// kTimecodeFlag_LastFrame has an effect: the time is one frame at inRate further from zero, for an empty text not. It does
/// not undo the flag of TimeToTimecode for negative times.
///
/// Timecode, samples and milliseconds are a sign, which may be missing, and up to four groups of digits with ".", ":" or
/// ";" between them, read from the right as frames, seconds, minutes and hours; after a last separator the group is 0.
/// Nothing is range-checked: 99 minutes are 1 h 39 min.
///
/// One group alone is a run "HHMMSSFF" read from the right, with 2 digits for the frames of rates up to 100 fps, 3 up to
/// 1,000, 4 up to 10,000 and 5 above. After a leading separator it is a count of frames at inRate, as it is at
/// kTimeDisplay_Frames. Groups above 4,294,967,295 count as that number.
///
/// At kTimeDisplay_Milliseconds the last group is a count of milliseconds, not a decimal fraction: "1.5" is 1 s 5 ms. A run
/// of digits has 3 for them; but ".500" is 500 frames of inRate.
///
/// Feet and frames are a sign and two numbers with ";", ":", "." or "+" between them. Without a separator the last two
/// characters are the frames ("1208" is 12 feet 8 frames), two characters or less are frames only. What is no number counts
/// as 0; the frames wrap at 32 bits.
///
/// A number that is no display is read as timecode and gives meaningless times.
ZONMEDIATYPES_API TickTime TimecodeToTime(
	zoncore::UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept;

inline TickTime TimecodeToTime(
	const zoncore::UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept
{
	return TimecodeToTime(zoncore::UTF16StringView(inText), inRate, inDisplay, inFlags);
}

/// TimecodeToTime as a fraction of seconds; rejected text is kTime_Invalid, -400000/1.
ZONMEDIATYPES_API RatioTime TimecodeToRatioTime(
	zoncore::UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

inline RatioTime TimecodeToRatioTime(
	const zoncore::UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {})
{
	return TimecodeToRatioTime(zoncore::UTF16StringView(inText), inRate, inDisplay, inFlags);
}

/// TimeToTimecode of the nearest tick.
ZONMEDIATYPES_API zoncore::UTF16String RatioTimeToTimecode(
	RatioTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

}   // namespace zonmediatypes
