#pragma once

/// \file
/// Rates, displays and times as they are written on a command line and shown on a sheet.

#include "zonmedia/Fraction.h"
#include "zonmedia/Names.h"
#include "zonmedia/Report.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/Timecode.h"

#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace zonmedia
{

/// A rate as it was stated, and as the library has it.
struct Rate
{
	Fraction mStated;   ///< frames a second, in lowest terms
	zonmediatypes::FrameRate mRate;
	bool mIsRounded = false;   ///< one frame is no whole number of ticks: mRate is the nearest that is

	bool IsAudio() const { return mRate.GetTicksPerFrame() <= zonmediatypes::kFrameRate_Audio8000.GetTicksPerFrame(); }
};

/// The rate of a fraction of frames a second. Nothing for rates that are not above 0, or so fast or slow that one frame is
/// no tick or outlasts all of time.
std::optional<Rate> MakeRate(Fraction inFramesPerSecond);

/// Reads any rate that the library names ("29.97"), a fraction ("30000/1001") or a sample rate ("48000Hz"). Throws
/// UsageProblem.
Rate ReadRate(std::string_view inText);

/// How the rate reads: "30000/1001 (29.97fps)".
std::string Text(const Rate& inRate);

/// How a time is written.
struct TimeForm
{
	std::optional<zonmediatypes::TimeDisplay> mDisplay;   ///< without one, as the bare count of ticks

	friend bool operator==(const TimeForm&, const TimeForm&) = default;
};

/// The names of all forms: "29.97df", "frames", "ms", "auto", "ticks".
std::span<const Named<TimeForm>> TimeForms();

/// The form of that name. Throws UsageProblem.
TimeForm ReadTimeForm(std::string_view inName);
std::string NameOf(TimeForm inForm);
/// The form itself, or the one that "auto" stands for at inRate: frames where the rate has no timecode.
TimeForm ChosenForm(TimeForm inForm, zonmediatypes::FrameRate inRate);
/// The library's description of the form, in the language of the run.
std::string DescriptionOf(TimeForm inForm);

/// A time before zero has its sign.
std::string TimeText(zonmediatypes::TickTime inTime, zonmediatypes::FrameRate inRate, TimeForm inForm,
	zonmediatypes::TimecodeFlags inFlags = {});

/// Reads a time. Throws InputProblem, which says what was expected.
zonmediatypes::TickTime ReadTime(std::string_view inText, zonmediatypes::FrameRate inRate, TimeForm inForm);

/// A time for a record: its text, and for programs the ticks beside it.
Value TimeValue(zonmediatypes::TickTime inTime, zonmediatypes::FrameRate inRate, TimeForm inForm,
	zonmediatypes::TimecodeFlags inFlags = {});

/// A time in every display but inExcept. The display of audio samples counts at inSampleRate, the others at inRate;
/// without a sample rate it is left out.
Table TimeTable(std::string_view inName, zonmediatypes::TickTime inTime, zonmediatypes::FrameRate inRate,
	std::optional<zonmediatypes::FrameRate> inSampleRate, TimeForm inExcept);

}   // namespace zonmedia
