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
/// Any argument is accepted. All functions are pure and may be called from any thread; none allocates anything but the
/// string that it returns, and those that write into a caller's buffer or fill a column allocate nothing.

#include "zoncore/Flags.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>

namespace zonmediatypes
{

enum TimecodeFlag : unsigned int
{
	kTimecodeFlag_OmitHours
	= 1,   ///< writes no hours, also where they are not 0 or carry what tells a negative time apart
	kTimecodeFlag_TrimLeadingZeros
	= 2,                          ///< leaves out leading fields that are zero, and the first field's leading zero
	kTimecodeFlag_ShowSign = 4,   ///< writes "+" or "-" before a time that is not zero
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

/// The time of a text; kTime_Invalid for text that is rejected, kTime_Zero for an empty one. Only
/// kTimecodeFlag_LastFrame has an effect: the time is one frame at inRate further from zero, on the side of the text's sign
/// ("0" is frame 1, "-0" frame -1, feet of 0 are frame -1), for an empty text not. It does not undo the flag of
/// TimeToTimecode for negative times.
///
/// Timecode, samples and milliseconds are a sign, which may be missing, and up to four groups of digits with ".", ":" or
/// ";" between them, read from the right as frames, seconds, minutes and hours; after a last separator the group is 0.
/// Nothing is range-checked: 99 minutes are 1 h 39 min. Digits are "0" to "9". Any other character is rejected, blanks
/// around the text included, and so is an empty group between separators.
///
/// One group alone is a run "HHMMSSFF" read from the right, with 2 digits for the frames of rates up to 100 fps, 3 up to
/// 1,000, 4 up to 10,000 and 5 above. After a leading separator it is a count of frames at inRate, as it is at
/// kTimeDisplay_Frames. Groups above 4,294,967,295 count as that number; the time of so many frames may wrap.
///
/// At kTimeDisplay_Milliseconds the last group is a count of milliseconds, not a decimal fraction: "1.5" is 1 s 5 ms. A run
/// of digits has 3 for them; but ".500" is 500 frames of inRate.
///
/// Feet and frames are a sign and two numbers with ";", ":", "." or "+" between them. Without a separator the last two
/// characters are the frames ("1208" is 12 feet 8 frames), two characters or less are frames only. A second sign belongs to
/// its number ("+-1208" is -12 feet and 8 frames). What is no number counts as 0; the frames wrap at 32 bits.
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

// ---- Columns ---------------------------------------------------------------------------------------------------------
//
// A list of times that share rate, display and flags: the rows of an edit list, the labels of a ruler. Each row is what the
// function for one time gives. The shorter span counts; the number of rows that were filled is returned. Where times become
// fields or text, what depends on rate and display is done once and divisions by the caller's rate become multiplications.
// Nothing is allocated.

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
