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
/// display, or the media's at the displays without one.

#include "zoncore/Flags.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/RatioTime.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

namespace zonmediatypes
{

enum TimecodeFlag : unsigned int
{
	/// Writes no hours, also where they are not 0 or carry what tells a negative time apart.
	kTimecodeFlag_OmitHours = 1,
	/// Leaves out leading fields that are zero, and the first field's leading zero.
	kTimecodeFlag_TrimLeadingZeros = 2,
	/// Writes "+" or "-" before a time that is not zero.
	kTimecodeFlag_ShowSign = 4,
	/// Shows the last frame of a range whose end is the time, and reads it as the end. The end of an empty range at zero
	/// shows as the frame before zero, "-00:00:00:01" with a sign.
	kTimecodeFlag_LastFrame = 8
};

/// Timecode flags joined with `|`; bits that are no flag have no effect.
using TimecodeFlags = zoncore::Flags<unsigned int>;

// ---- Numbers ---------------------------------------------------------------------------------------------------------

/// Splits the magnitude of a time into fields; outNegative is its sign. Hours wrap at 24, so times of a day and more lose
/// whole days. Frames are truncated toward zero.
///
/// At kTimeDisplay_Frames outFrames is the signed frame count at any usable rate, and the other fields are 0. At every other
/// display whose rate is not usable, negative or slower than one frame a second, all fields are 0. outNegative is the sign
/// of the time at kTimeDisplay_Frames, for drop-frame numbering and where there is no such rate; everywhere else it is the
/// sign of the frame number, so that a time within the frame before zero is not negative.
ZONMEDIATYPES_API void TimeToHMSF(unsigned int& outHours, unsigned int& outMinutes, unsigned int& outSeconds,
	unsigned long long& outFrames, bool& outNegative, TickTime inTime, FrameRate inRate,
	TimeDisplay inDisplay) noexcept;

/// The time of some fields. More frames than the caller's rate has in a second carry into seconds, seconds into minutes,
/// minutes into hours; hours wrap at 24. No field is rejected, and what is too large wraps. At frames, feet and samples
/// hours, minutes and seconds become frames of the caller's rate, truncated.
///
/// Labels that drop-frame numbering skips have times, too: at 29.97 fps label 00 of a short minute is its first frame and
/// label 01 the frame before (59.94: 01 to 03 the frames before). Deliberate: typed times are never refused.
///
/// At a display without a usable rate the frames are still multiplied by the stored duration: check the display first. At
/// milliseconds pass kFrameRate_Video1000: with the media's rate the 500 of half a second carry as frames of it (20 s at
/// 25 fps).
ZONMEDIATYPES_API TickTime HMSFToTime(unsigned int inHours, unsigned int inMinutes, unsigned int inSeconds,
	unsigned long long inFrames, bool inNegative, FrameRate inRate, TimeDisplay inDisplay) noexcept;

// ---- Text ------------------------------------------------------------------------------------------------------------

/// The text of a time:
///
/// | display           | text                                                                      |
/// |-------------------|---------------------------------------------------------------------------|
/// | timecode          | "01:02:03:04", drop-frame "01:02:03;04"                                   |
/// | milliseconds      | "01:02:03.456"                                                            |
/// | samples           | "01:02:03:00456", zeros in front as below                                 |
/// | frames            | "1000"; a negative count has its "-" with any flags                        |
/// | feet and frames   | "62+08"; a negative time has its "-" with any flags                        |
/// | kTimeDisplay_Auto | as the display that fits the rate, else 29.97 fps drop-frame              |
///
/// Samples are padded to 5 digits at rates of 11,000 to 109,999 Hz, to 4, 3 and 2 at each tenth of that, and not at all at
/// faster ones and below 11 Hz. Trimming leaves at least the seconds: "0:00". A number that is no display is written
/// "00:00:00:0".
///
/// A negative time without kTimecodeFlag_ShowSign shows 23 minus its hours and all other fields as they are, as if only
/// the hour ran backwards: one frame before zero at 25 fps is "23:00:00:01". Deliberate; such text reads back as a positive
/// time. kTime_Invalid gives an ordinary-looking text ("08:06:40:00" at 25 fps): compare with it first.
ZONMEDIATYPES_API zoncore::UTF16String TimeToTimecode(
	TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

/// No text of any time is longer, at any rate and display, with any flags.
inline constexpr std::size_t kLongestTimecode = 30;

/// The same text, ASCII in any case, into a caller's buffer, without a terminator. Returns its length; a buffer that is too
/// short for it is left alone. kLongestTimecode characters are always enough.
ZONMEDIATYPES_API std::size_t TimeToTimecode(std::span<zoncore::UTF16Char> outText, TickTime inTime, FrameRate inRate,
	TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept;
ZONMEDIATYPES_API std::size_t TimeToTimecode(std::span<char> outText, TickTime inTime, FrameRate inRate,
	TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept;

/// The time of a text: kTime_Zero for an empty one, kTime_Invalid for one that is rejected.
///
/// Text is a sign, which may be missing, and one to four groups of the digits "0" to "9" with ".", ":" or ";" between them:
/// frames, seconds, minutes and hours from the right, which HMSFToTime turns into a time. No number is out of range; one
/// above 4,294,967,295 counts as that. One group alone is a run "HHMMSSFF"; at kTimeDisplay_Frames, and after a separator
/// at any display, a count of frames at inRate. Any other character is rejected. Film text is a sign and two numbers with a
/// separator or "+" between them; blanks before a number and other text after it are skipped, and what is none is 0.
///
/// | display, rate        | text                               | time                                                  |
/// |----------------------|------------------------------------|-------------------------------------------------------|
/// | timecode, 25 fps     | "00:00:03:15", "+3:15", "3.15"     | frame 90                                              |
/// |                      | "-3:15"                            | frame -90                                             |
/// |                      | "3:"                               | 3 s: after a last separator the group is 0            |
/// |                      | "1:0:0:0", "25:0:0:0"              | 1 h: hours wrap at 24                                 |
/// |                      | "0:26", "99:00:00"                 | 1 s 1 frame, 1 h 39 min: what is too large carries    |
/// |                      | "500", "1020304"                   | 5 s, 1 h 2 min 3 s 4 frames                           |
/// |                      | ".1000", "-:1000"                  | frame 1,000, frame -1,000                             |
/// |                      | "-", "1::2", "1:2:3:4:5", " 1"     | rejected                                              |
/// | 29.97 fps drop-frame | "00:01:00;02", "00:01:00;00"       | frame 1,800: the minute's first                       |
/// |                      | "00:01:00;01"                      | frame 1,799: the one before; see HMSFToTime           |
/// | milliseconds         | "1.5", "1.500"                     | 1 s 5 ms, 1 s 500 ms: the last group is a count       |
/// |                      | "1500"                             | 1 s 500 ms                                            |
/// |                      | ".500" with a rate of 48 kHz       | 500 samples: a count                                  |
/// | samples, 48 kHz      | "1:2:3:5", "204000"                | 1 h 2 min 3 s and 5 samples, 2 s and 4,000 samples    |
/// | 25 fps, rate 48 kHz  | "500"                              | 20 s: a run has 5 digits for frames of that rate      |
/// | frames, 25 fps       | "-1000"                            | frame -1,000                                          |
/// |                      | "1:2"                              | rejected                                              |
/// | 35 mm, 25 fps        | "12+08", "12:8", "1208"            | frame 200: without a separator two digits are frames  |
/// |                      | "8"                                | frame 8                                               |
/// |                      | "-12+08"                           | frame -200                                            |
/// |                      | "+-1208"                           | frame -184: a second sign is the number's own         |
/// |                      | " 12; 08x", "x+y"                  | frame 200, frame 0                                    |
/// |                      | "1+2+3"                            | rejected                                              |
///
/// A run has 2 digits for the frames of rates up to 100 fps, 3 up to 1,000, 4 up to 10,000 and 5 above: of inRate, at
/// kTimeDisplay_Milliseconds of its own. Feet wrap at 32 bits, and the time of more frames than ticks can count wraps.
///
/// Only kTimecodeFlag_LastFrame has an effect: the time is one frame at inRate further from zero, on the side of the text's
/// sign ("0" is frame 1, "-0" frame -1, film "0+00" frame -1), but that of an empty text. It does not undo the flag of
/// TimeToTimecode for negative times. A number that is no display is read as timecode and gives meaningless times.
ZONMEDIATYPES_API TickTime TimecodeToTime(
	zoncore::UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept;

inline TickTime TimecodeToTime(
	const zoncore::UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept
{
	return TimecodeToTime(zoncore::UTF16StringView(inText), inRate, inDisplay, inFlags);
}

/// TimecodeToTime as a fraction of seconds; rejected text is kTime_Invalid, -400000/1. Exact times are defined in
/// TimeUtils.h.
ZONMEDIATYPES_API RatioTime TimecodeToRatioTime(
	zoncore::UTF16StringView inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});
ZONMEDIATYPES_API RatioTime TimecodeToRatioTime(
	const zoncore::UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

/// TimeToTimecode of the nearest tick.
ZONMEDIATYPES_API zoncore::UTF16String RatioTimeToTimecode(
	RatioTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {});

// ---- Columns ---------------------------------------------------------------------------------------------------------
//
// A list of times that share rate, display and flags: the rows of an edit list, the labels of a ruler. Each row is what the
// function for one time gives. The shorter span counts; the number of rows that were filled is returned. Where times become
// fields or text, what depends on rate and display is done once and divisions by the caller's rate become multiplications.

/// What TimeToHMSF gives of one time.
struct TimecodeFields
{
	unsigned int mHours;
	unsigned int mMinutes;
	unsigned int mSeconds;
	bool mNegative;
	unsigned long long mFrames;

	friend constexpr bool operator==(const TimecodeFields&, const TimecodeFields&) noexcept = default;
};

/// TimeToHMSF of each time.
ZONMEDIATYPES_API std::size_t TimesToHMSF(std::span<TimecodeFields> outFields, std::span<const TickTime> inTimes,
	FrameRate inRate, TimeDisplay inDisplay) noexcept;

/// A text of TimeToTimecode within the value itself, 64 bytes.
struct TimecodeText
{
	std::array<zoncore::UTF16Char, kLongestTimecode + 1> mCharacters;
	std::uint16_t mLength;

	zoncore::UTF16StringView GetText() const noexcept { return {mCharacters.data(), mLength}; }
};

/// TimeToTimecode of each time.
ZONMEDIATYPES_API std::size_t TimesToTimecode(std::span<TimecodeText> outTexts, std::span<const TickTime> inTimes,
	FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags = {}) noexcept;

/// TimecodeToTime of each text: kTime_Invalid where it is rejected.
ZONMEDIATYPES_API std::size_t TimecodesToTimes(std::span<TickTime> outTimes,
	std::span<const zoncore::UTF16StringView> inTexts, FrameRate inRate, TimeDisplay inDisplay,
	TimecodeFlags inFlags = {}) noexcept;

}   // namespace zonmediatypes
