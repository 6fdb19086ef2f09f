// Timecode text and ticks: any text at any rate and display, and times that must survive being written and read.

#include "FuzzInput.h"
#include "zonmediatypes/Timecode.h"

#include <algorithm>
#include <string>

namespace
{

using namespace zonmediatypes;
using zoncore::UTF16Char;
using zoncore::UTF16String;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

constexpr std::int64_t kDay = 86'400 * kTicksPerSecond;

bool IsFeet(TimeDisplay inDisplay)
{
	return inDisplay == kTimeDisplay_16mmFeetFrames || inDisplay == kTimeDisplay_35mmFeetFrames;
}

FrameRate TakeRate(FuzzInput& ioInput)
{
	return ioInput.Flag() ? FrameRate(ioInput.Edge<std::int64_t>()) : ioInput.OneOf(AllFrameRates());
}

TimeDisplay TakeDisplay(FuzzInput& ioInput)
{
	return ioInput.Below(8) == 7 ? static_cast<TimeDisplay>(ioInput.Edge<std::int32_t>())
								 : ioInput.OneOf(AllTimeDisplays());
}

// Whether a text consists of what timecode is made of: one sign at most, then digits and separators.
bool IsTimecodeText(const UTF16String& inText)
{
	const bool hasSign = !inText.empty() && (inText.front() == '+' || inText.front() == '-');
	const auto isKnown = [](UTF16Char inChar)
	{ return (inChar >= '0' && inChar <= '9') || inChar == ':' || inChar == ';' || inChar == '.'; };
	return std::all_of(inText.begin() + (hasSign ? 1 : 0), inText.end(), isKnown);
}

void CheckReading(const UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay)
{
	const TickTime time = TimecodeToTime(inText, inRate, inDisplay);
	Require(
		TimecodeToTime(inText, inRate, inDisplay, 0xFFFF'FFF7) == time, "only the last-frame flag changes a time read");
	Require(!inText.empty() || time == kTime_Zero, "empty text is zero");
	Require(IsTimecodeText(inText) || IsFeet(inDisplay) || time == kTime_Invalid, "other characters are refused");
	const TickTime end = TimecodeToTime(inText, inRate, inDisplay, kTimecodeFlag_LastFrame);
	TickTime later = time, earlier = time;
	later.AddFrames(1, inRate);
	earlier.AddFrames(-1, inRate);
	Require(end == time ? time == kTime_Invalid || inText.empty() || later == time : end == later || end == earlier,
		"the end of a range is one frame away");
}

void CheckWriting(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, unsigned inFlags)
{
	const UTF16String text = TimeToTimecode(inTime, inRate, inDisplay, inFlags);
	Require(text == TimeToTimecode(inTime, inRate, inDisplay, inFlags | 0xFFFF'FFF0), "only the four flags count");
	Require(
		text.find_first_not_of(UTF16String{'0', '1', '2', '3', '4', '5', '6', '7', '8', '9', ':', ';', '.', '+', '-'})
			== UTF16String::npos,
		"text has only digits, separators and signs");
	Require(!text.empty(), "there is always a text");
}

// A time within a day at a rate that its display counts in.
void CheckRoundTrip(FuzzInput& ioInput)
{
	const TimeDisplay display = ioInput.OneOf(AllTimeDisplays());
	const FrameRate rate = display == kTimeDisplay_Frames || IsFeet(display) || display == kTimeDisplay_AudioSamples
		? ioInput.OneOf(AllFrameRates())
		: GetFrameRateForTimeDisplay(display, {});
	const bool isWholeRate = rate.IsUsable() && kTicksPerSecond % rate.GetTicksPerFrame() == 0;
	if (!rate.IsUsable() || (display == kTimeDisplay_AudioSamples && !isWholeRate))
		return;
	TickTime time(ioInput.Any<std::int64_t>() % kDay);
	const bool isCount = display == kTimeDisplay_Frames || IsFeet(display);
	if (isCount && time.ToFrame64(rate) != time.ToFrame32(rate))
		return;   // counts that are read end at 32 bits
	const TimecodeFlags trim = ioInput.Flag() ? TimecodeFlags(kTimecodeFlag_TrimLeadingZeros) : TimecodeFlags();
	const UTF16String text = TimeToTimecode(time, rate, display, trim | kTimecodeFlag_ShowSign);
	time.AlignToFrame(rate);
	Require(TimecodeToTime(text, rate, display) == time, "a time that is written reads back as its frame");
}

void CheckFields(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay)
{
	unsigned hours = 99, minutes = 99, seconds = 99;
	unsigned long long frames = 99;
	bool isNegative = false;
	TimeToHMSF(hours, minutes, seconds, frames, isNegative, inTime, inRate, inDisplay);
	Require(hours < 24 && minutes < 60 && seconds < 60, "fields are in their range");
	static_cast<void>(HMSFToTime(hours, minutes, seconds, frames, isNegative, inRate, inDisplay));
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	if (input.Flag())
	{
		CheckRoundTrip(input);
		return 0;
	}
	const FrameRate rate = TakeRate(input);
	const TimeDisplay display = TakeDisplay(input);
	if (input.Flag())
	{
		const TickTime time(input.Edge<std::int64_t>());
		CheckWriting(time, rate, display, input.Any<std::uint8_t>());
		CheckFields(time, rate, display);
		static_cast<void>(HMSFToTime(input.Edge<unsigned>(), input.Edge<unsigned>(), input.Edge<unsigned>(),
			input.Edge<unsigned long long>(), input.Flag(), rate, display));
		return 0;
	}
	CheckReading(input.Text(), rate, display);
	return 0;
}
