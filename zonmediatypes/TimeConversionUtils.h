#pragma once

/// \file
/// Sample positions as text and back, for audio tools: timecode, frame counts, decimal time, milliseconds, and musical
/// time in beats or in bars and beats.
///
/// Positions are sample counts at a whole sample rate; frame rates are nominal whole rates. 29.97 frames per second is
/// a nominal rate of 30 with an NTSC or drop-frame format, which scale it by 1000/1001. TickTime and FrameRate play no
/// part here, and the texts differ from those of Timecode.h: drop-frame text has ";" between all its fields.
///
///     UTF16String text;
///     ConvertSamplesToTimecode(text, 2'882'880, 48'000, kTimecodeFormat_TimecodeDropFrame, 30, nullptr, false);
///                                                                       // "00;01;00;02"
///     std::int64_t samples = 0;
///     ConvertTimecodeToSamples(samples, text, kTimecodeFormat_TimecodeDropFrame, 48'000, 30, nullptr, false);
///                                                                       // 2,882,880
///
/// Integers wrap, and a floating-point value that does not fit its integer becomes the most negative one. Reading text
/// costs time linear in its length and copies none of it.
///
/// Misuse (no BeatInfo for a musical format, no beats per bar, drop-frame together with NTSC) is reported to the assert
/// dialog of zoncore/Debug.h; the result is then false, of the forms for buffers 0, and the output is as before the call.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace zonmediatypes::utility
{

/// How a position is written. Alternatives behave as what they are alternatives of, in both directions.
enum TimecodeFormat : std::uint32_t
{
	kTimecodeFormat_Decimal = 0,                 ///< "   1:23.456", "1:02:03.500": hours, minutes and decimal seconds
	kTimecodeFormat_Samples = 1,                 ///< "4005888": the sample count
	kTimecodeFormat_Timecode = 2,                ///< "01:02:03:04" at the nominal rate
	kTimecodeFormat_TimecodeNTSC = 3,            ///< "01:02:03:04" at 1000/1001 of the nominal rate, non-drop
	kTimecodeFormat_TimecodeDropFrame = 4,       ///< "01;02;03;04" at 1000/1001 of the nominal rate
	kTimecodeFormat_Beats = 5,                   ///< "4.000": quarter notes; needs a BeatInfo
	kTimecodeFormat_BarsAndBeats = 6,            ///< "2:2.480": bar, beat, ticks; needs a BeatInfo
	kTimecodeFormat_None = 7,                    ///< no text at all; read as 0
	kTimecodeFormat_Frames = 8,                  ///< "1800": the frame count at the nominal rate; read as Timecode
	kTimecodeFormat_FramesDropFrame = 9,         ///< the frame count at 1000/1001; read as TimecodeDropFrame
	kTimecodeFormat_TimecodeSubframes = 10,      ///< "1:05:00.50": hundredths of a frame, leading zeros left out
	kTimecodeFormat_Milliseconds = 11,           ///< "1234.5"
	kTimecodeFormat_TimecodeNTSCAlt = 12,        ///< as TimecodeNTSC
	kTimecodeFormat_TimecodeDropFrameAlt = 13,   ///< as TimecodeDropFrame
	kTimecodeFormat_TimecodeNTSCAlt2 = 14,       ///< as TimecodeNTSC
};

/// Tempo and meter. A beat is one 1/iBeatValue note; the tempo counts quarter notes, whatever a beat is.
struct BeatInfo
{
	std::int32_t iTicksPerBeat = 960;   ///< ticks of one beat; -1: the part below the beat is a decimal fraction
	double dTempo = 120;                ///< quarter notes per minute
	std::int32_t iBeatsPerBar = 4;      ///< numerator of the time signature; not 0
	std::int32_t iBeatValue = 4;        ///< denominator of the time signature: 4 for quarter notes, 8 for eighths
	double dOffsetMilliseconds = 0;     ///< where the first bar begins; applies to positions, not to durations
};

// ---- Text to samples -------------------------------------------------------------------------------------------------
//
// Fields are runs of the digits "0" to "9"; every other character separates, the minus sign included: negative text
// reads back as a positive position. A field above 2,147,483,647 counts as 0. Only sample counts and the numbers of
// bars-and-beats text are read with a sign, as zoncore::utility::StringToNumber reads them.

/// Timecode text as a position, rounded up to the next sample; always true.
///
/// Fields are hours, minutes, seconds and frames from the right; of five the first is dropped, and no sixth is read. A field
/// after a "." is a fraction of a frame, whose digits deliberately are all characters up to the end of the text; ten or more
/// turn the value around. inNTSC scales the rate by 1000/1001; inDropFrame reads drop-frame labels, of which one that is
/// skipped stands for the first of its minute, and does not itself imply inNTSC. At 48 kHz and 30 frames per second:
///
/// | text                           | samples                                                  |
/// |--------------------------------|----------------------------------------------------------|
/// | "00:00:01:00"                  | 48,000, with inNTSC 48,048                               |
/// | "3:04", "-3:04"                | 150,400: 3 s 4 frames                                    |
/// | "10"                           | 16,000: 10 frames                                        |
/// | "10.50", "10.5 "               | 16,800: 10.5 frames, 16,080: 10.05 frames                |
/// | "12.", ".5"                    | 20: 0.012 frames, 800: half a frame                      |
/// | "1:2:3:4:5:6"                  | 354,440,000: 2 h 3 min 4 s 5 frames                      |
/// | "00:01:00;00", "00:01:00;02"   | with inDropFrame 2,880,000, with both flags 2,882,880    |
/// | "", "abc"                      | -1: no value, 0; at a frame rate of 0 all text is 0      |
ZONMEDIATYPES_API bool ConvertTimecodeToSamples(std::int64_t& outSamples, zoncore::UTF16StringView inTimecode,
	std::int32_t inSampleRate, std::int32_t inFrameRate, bool inNTSC, bool inDropFrame) noexcept;

inline bool ConvertTimecodeToSamples(std::int64_t& outSamples, const zoncore::UTF16String& inTimecode,
	std::int32_t inSampleRate, std::int32_t inFrameRate, bool inNTSC, bool inDropFrame) noexcept
{
	return ConvertTimecodeToSamples(
		outSamples, zoncore::UTF16StringView(inTimecode), inSampleRate, inFrameRate, inNTSC, inDropFrame);
}

/// Text of any format as a position. inBeatInfo matters for Beats and BarsAndBeats, inIsDuration for BarsAndBeats only.
/// False, and outSamples untouched, when a BeatInfo is needed and missing.
///
/// Decimal, Beats and Milliseconds are fields as in timecode, of which the last is in units of the format and may have a
/// fraction; the one before counts 60 of them, the next 3,600. Positions are rounded to the nearest sample. At 48 kHz and 120
/// quarter notes a minute:
///
/// | format                  | text            | samples                                                  |
/// |-------------------------|-----------------|----------------------------------------------------------|
/// | Decimal                 | "1:30"          | 4,320,000: 90 s                                          |
/// |                         | "1:2:03.25"     | 178,716,000: 1 h 2 min 3.25 s                            |
/// |                         | "1:00:00:00"    | 0: four fields lose the first one; deliberate            |
/// | Milliseconds            | "1000.5"        | 48,024                                                   |
/// | Beats                   | "4.25"          | 102,000                                                  |
/// | Samples                 | " -12 frames"   | -12                                                      |
/// | any                     | ""              | -1: no value                                             |
/// | None, and unknown ones  | "1:00"          | 0                                                        |
ZONMEDIATYPES_API bool ConvertTimecodeToSamples(std::int64_t& outSamples, zoncore::UTF16StringView inText,
	TimecodeFormat inFormat, std::int32_t inSampleRate, std::int32_t inFrameRate, BeatInfo* inBeatInfo,
	bool inIsDuration);

inline bool ConvertTimecodeToSamples(std::int64_t& outSamples, const zoncore::UTF16String& inText,
	TimecodeFormat inFormat, std::int32_t inSampleRate, std::int32_t inFrameRate, BeatInfo* inBeatInfo,
	bool inIsDuration)
{
	return ConvertTimecodeToSamples(
		outSamples, zoncore::UTF16StringView(inText), inFormat, inSampleRate, inFrameRate, inBeatInfo, inIsDuration);
}

/// Bars-and-beats text as a position: bar, ":", beat, "." and ticks, of which all but the bar may be missing. The first ":"
/// and the first "." count, wherever they stand. A position counts bars and beats from 1, and the first bar begins at
/// dOffsetMilliseconds; a duration counts from 0. With iTicksPerBeat -1 what follows "." is a decimal fraction of a beat.
/// A half is added to the samples and the sum truncated: to the nearest sample after the first bar, before it deliberately
/// one later. A tempo, beat value or tick count of 0 has no meaningful result. At 48 kHz, 120 quarter notes a minute, 4/4
/// and 960 ticks a beat:
///
/// | text       | as         | samples                                               |
/// |------------|------------|-------------------------------------------------------|
/// | "2:2.480"  | a position | 132,000: 1 bar, 1 beat and a half                     |
/// | "1:1.480"  | a duration | 132,000                                               |
/// | "3"        | a position | 192,000: a bar alone                                  |
/// | "2:2.5"    | a duration | 240,125: five ticks; with iTicksPerBeat -1 252,000    |
/// | "0:4"      | a position | -23,999: one later than a beat before the first bar   |
ZONMEDIATYPES_API std::int64_t ConvertBarsAndBeatsToSamples(
	zoncore::UTF16StringView inText, double inSampleRate, const BeatInfo& inBeatInfo, bool inIsDuration) noexcept;

inline std::int64_t ConvertBarsAndBeatsToSamples(
	const zoncore::UTF16String& inText, double inSampleRate, const BeatInfo& inBeatInfo, bool inIsDuration) noexcept
{
	return ConvertBarsAndBeatsToSamples(zoncore::UTF16StringView(inText), inSampleRate, inBeatInfo, inIsDuration);
}

// ---- Samples to text -------------------------------------------------------------------------------------------------
//
// The text replaces the one in outText; with enough capacity in it nothing is allocated.

/// A position in any format. None and unknown formats leave outText as it is. inFrameRate matters for timecode and
/// frame counts, inBeatInfo for Beats and BarsAndBeats, inIsDuration for BarsAndBeats only. False, and outText
/// untouched, when a BeatInfo is needed and missing, or has no beats per bar.
///
/// Milliseconds have one decimal and deliberately no more than six significant digits: 123,456.7 ms is "123457", and
/// 1,234,567 ms "1.23457e+06". At a sample rate of 0 they are "0".
ZONMEDIATYPES_API bool ConvertSamplesToTimecode(zoncore::UTF16String& outText, std::int64_t inSamples,
	std::int32_t inSampleRate, TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo,
	bool inIsDuration);

/// No text of any position is longer, in any format.
inline constexpr std::size_t kLongestPosition = 84;

/// The same text, ASCII in any case, into a caller's buffer, without a terminator. Returns its length; a buffer that is too
/// short for it is left alone. kLongestPosition characters are always enough. 0, and the buffer untouched, where the form
/// above leaves its text as it is or is false.
ZONMEDIATYPES_API std::size_t ConvertSamplesToTimecode(std::span<zoncore::UTF16Char> outText, std::int64_t inSamples,
	std::int32_t inSampleRate, TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo,
	bool inIsDuration);
ZONMEDIATYPES_API std::size_t ConvertSamplesToTimecode(std::span<char> outText, std::int64_t inSamples,
	std::int32_t inSampleRate, TimecodeFormat inFormat, std::int32_t inFrameRate, const BeatInfo* inBeatInfo,
	bool inIsDuration);

/// A position as timecode; frames are truncated, negative positions have "-" before them, hours do not wrap at 24. Frames
/// have as many digits as the largest frame number of the rate, up to four, and two in drop-frame text. The text is "0" for a
/// sample rate of 0 or below, and for a frame rate below 1 (drop-frame: below 30) or whose frames per minute or hour are 0
/// in 32 bits. At 48 kHz and 30 frames per second:
///
/// | flag                  | text                          | meaning                                                     |
/// |-----------------------|-------------------------------|-------------------------------------------------------------|
/// | none                  | "01:02:05:00"                 | non-drop labels at the nominal rate                         |
/// | inDropFrame           | "00;01;00;02"                 | labels at 1000/1001 of it; the flags from inOmitFrames on   |
/// |                       |                               | have no effect                                              |
/// | inNTSC                | "00:00:01:00"                 | non-drop labels at 1000/1001; with inDropFrame misuse       |
/// | inFrameCountOnly      | "1800"                        | 32-bit, without sign; drop-frame counts are formed through  |
/// |                       |                               | double and one short on about every twentieth frame         |
/// | inOmitFrames          | "01:02:05"                    | no leading zeros of the seconds are left out then           |
/// | inSuppressLeadingZeros| "59:03", "1:00:00", "0"       | no leading fields of 0; frames are always written           |
/// | inShowSubframes       | "00:00:05:00.50"              | hundredths of a frame                                       |
/// | inTotalMinutes        | "62:05:00"                    | no hours: minutes count on                                  |
ZONMEDIATYPES_API bool ConvertSamplesToTimecode(zoncore::UTF16String& outText, std::int64_t inSamples,
	std::int32_t inSampleRate, std::int32_t inFrameRate, bool inDropFrame, bool inNTSC, bool inFrameCountOnly,
	bool inOmitFrames, bool inSuppressLeadingZeros, bool inShowSubframes, bool inTotalMinutes);

/// A position as minutes and seconds with milliseconds, "   1:23.456", from one hour on with hours, "1:02:03.500", and
/// from ten hours on with hundredths, "10:00:00.50". Below one hour the sign stands right-aligned in three columns of
/// its own, blank for positive positions; deliberate. "0" for a sample rate of 0 or below. At sample rates of 500 and
/// below position 0 shows a fraction: milliseconds are those of the middle of the sample.
ZONMEDIATYPES_API void ConvertSamplesToDecimalTimecode(
	zoncore::UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate, bool inOmitFraction);

/// A position as bars and beats. inStyle 0 is the bar alone, 1 "bar:beat", 2 "bar:beat.ticks", 3 and above have
/// thousandths of a tick after another "."; negative styles give an empty text. Ticks have as many digits as the
/// largest one. Positions count from "1:1.000" at dOffsetMilliseconds, durations from "0:0.000"; before the first bar
/// bars count down through 0 while beats stay 1 to iBeatsPerBar.
///
/// With iTicksPerBeat -1 the text is, for every style, the bar and right after it the beat with decimals whose digits
/// are all "0" (from style 3 on ".000" follows): deliberate, and no reader takes it. At a sample rate, tempo, beat value
/// or iTicksPerBeat of 0 the text means nothing. False, and outText untouched, when iBeatsPerBar is 0.
ZONMEDIATYPES_API bool ConvertSamplesToBarsAndBeats(zoncore::UTF16String& outText, double inSamples,
	double inSampleRate, const BeatInfo& inBeatInfo, bool inIsDuration, std::int32_t inStyle);

/// A position in quarter notes with three decimals, "4.000", as 32-bit numbers. Before zero the decimals have a sign of
/// their own: "-1.-499" is one beat and a half, rounded toward zero by half a thousandth; deliberate. "0" for a sample
/// rate of 0.
ZONMEDIATYPES_API void ConvertSamplesToBeats(
	zoncore::UTF16String& outText, std::int64_t inSamples, std::int32_t inSampleRate, double inTempo);

/// Splits the magnitude of a frame count into drop-frame labels at nominal rate inFrameRate. Hours do not wrap at 24.
///
/// An output is written only in the step that computes it: hours from one hour on, minutes from ten minutes on (below,
/// the minutes are added to the caller's), seconds from one second on, frames always. Pass zeros; deliberate. Returns
/// the seconds field where it is computed, else 0. A frame rate below 30 leaves the outputs alone and returns 0.
ZONMEDIATYPES_API std::int64_t DropFrameToHMSF(std::int64_t inFrame, std::int32_t inFrameRate, std::uint32_t& outHours,
	std::uint32_t& outMinutes, std::uint32_t& outSeconds, std::uint32_t& outFrames) noexcept;

}   // namespace zonmediatypes::utility
