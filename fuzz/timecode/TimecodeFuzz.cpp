// Timecode text and ticks: any text at any rate and display, and times that must survive being written and read.

#include "fuzz/BufferChecks.h"
#include "fuzz/Numbers.h"
#include "fuzz/RateInput.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/Timecode.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <span>
#include <vector>

namespace
{

using namespace zonmediatypes;
using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zonfuzz::FuzzInput;
using zonfuzz::Numbers;
using zonfuzz::ReadNumbers;
using zonfuzz::Require;
using zonfuzz::RequireInBuffers;
using zonfuzz::TakeRate;

constexpr std::int64_t kDay = 86'400 * kTicksPerSecond;

bool IsFeet(TimeDisplay inDisplay)
{
	return inDisplay == kTimeDisplay_16mmFeetFrames || inDisplay == kTimeDisplay_35mmFeetFrames;
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

// The time of a text that is not feet and frames, read group by group and put together by HMSFToTime.
TickTime ReadAgain(const UTF16String& inText, FrameRate inRate, TimeDisplay inDisplay)
{
	if (inText.empty())
		return kTime_Zero;
	const bool isNegative = inText.front() == '-';
	std::size_t begin = isNegative || inText.front() == '+' ? 1 : 0;
	const auto isSeparator = [](UTF16Char inChar) { return inChar == ':' || inChar == ';' || inChar == '.'; };
	const bool isCount = begin < inText.size() && isSeparator(inText[begin]);
	begin += isCount ? 1 : 0;
	std::vector<std::uint32_t> groups;   // without the one behind a last separator
	for (bool isInside = false; const UTF16Char character : UTF16StringView(inText).substr(begin))
	{
		const bool isDigit = character >= '0' && character <= '9';
		if (!isDigit && (!isSeparator(character) || !isInside))
			return kTime_Invalid;
		if (isDigit && !isInside)
			groups.push_back(0);
		if (isDigit)
			groups.back() = static_cast<std::uint32_t>(
				std::min<std::uint64_t>(groups.back() * 10ull + (character - 0x30u), 0xFFFF'FFFF));
		isInside = isDigit;
	}
	if (groups.empty())
		return kTime_Invalid;
	if (isSeparator(inText.back()))
		groups.push_back(0);
	if (groups.size() > 4 || (inDisplay == kTimeDisplay_Frames && groups.size() > 1))
		return kTime_Invalid;
	if (groups.size() == 1 && (isCount || inDisplay == kTimeDisplay_Frames))
	{
		TickTime time;
		time.AddFrames(isNegative ? -std::int64_t{groups[0]} : std::int64_t{groups[0]}, inRate);
		return time;
	}
	const FrameRate rate = inDisplay == kTimeDisplay_Milliseconds ? kFrameRate_Video1000 : inRate;
	if (groups.size() == 1)
	{
		std::uint32_t run = groups[0], frames = 100;
		for (const std::int64_t perSecond : {100, 1'000, 10'000})
			frames *= rate.GetTicksPerFrame() < kTicksPerSecond / perSecond ? 10u : 1u;
		groups = {run / frames / 10'000, run / frames / 100 % 100, run / frames % 100, run % frames};
	}
	groups.insert(groups.begin(), 4 - groups.size(), 0);
	const TimeDisplay chosen = inDisplay == kTimeDisplay_Auto
		? GetTimeDisplayForFrameRate(inRate, true, false, kTimeDisplay_2997DropTimecode, false)
		: inDisplay;
	return HMSFToTime(groups[0], groups[1], groups[2], groups[3], isNegative, rate, chosen);
}

void CheckReading(FuzzInput& ioInput)
{
	const FrameRate rate = TakeRate(ioInput);
	const TimeDisplay display = TakeDisplay(ioInput);
	const UTF16String text = ioInput.Text();
	const TickTime time = TimecodeToTime(text, rate, display);
	Require(TimecodeToRatioTime(text, rate, display) == TimeToRatioTime(time), "seconds are those of the ticks");
	Require(TimecodeToTime(text, rate, display, 0xFFFF'FFF7) == time, "only the last-frame flag changes a time read");
	Require(IsFeet(display) || time == ReadAgain(text, rate, display), "fields are read as they stand");
	Require(!text.empty() || time == kTime_Zero, "empty text is zero");
	Require(IsTimecodeText(text) || IsFeet(display) || time == kTime_Invalid, "other characters are refused");
	const TickTime end = TimecodeToTime(text, rate, display, kTimecodeFlag_LastFrame);
	TickTime later = time, earlier = time;
	later.AddFrames(1, rate);
	earlier.AddFrames(-1, rate);
	Require(end == time ? time == kTime_Invalid || text.empty() || later == time : end == later || end == earlier,
		"the end of a range is one frame away");
}

void CheckWriting(FuzzInput& ioInput)
{
	const FrameRate rate = TakeRate(ioInput);
	const TimeDisplay display = TakeDisplay(ioInput);
	const TickTime time(ioInput.Edge<std::int64_t>());
	const unsigned flags = ioInput.Any<std::uint8_t>();
	const UTF16String text = TimeToTimecode(time, rate, display, flags);
	Require(text == TimeToTimecode(time, rate, display, flags | 0xFFFF'FFF0), "only the four flags count");
	Require(
		text.find_first_not_of(UTF16String{'0', '1', '2', '3', '4', '5', '6', '7', '8', '9', ':', ';', '.', '+', '-'})
			== UTF16String::npos,
		"text has only digits, separators and signs");
	Require(!text.empty() && text.size() <= kLongestTimecode, "there is always a text, and none is longer");
	RequireInBuffers(text, [&](auto outText) { return TimeToTimecode(outText, time, rate, display, flags); });
	const bool isTimecode = IsHMSFTimeDisplay(display, false) && display < kTimeDisplay_Auto;
	const bool isWhole
		= (flags & (kTimecodeFlag_OmitHours | kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_LastFrame)) == 0;
	if (const bool hasSign = (flags & kTimecodeFlag_ShowSign) != 0; isTimecode && isWhole)
	{
		unsigned hours = 99, minutes = 99, seconds = 99;
		unsigned long long frames = 99;
		bool isNegative = false;
		TimeToHMSF(hours, minutes, seconds, frames, isNegative, time, rate, display);
		Require(ReadNumbers(text)
				== Numbers{time < kTime_Zero && !hasSign ? 23 - hours : hours, minutes, seconds,
					static_cast<std::int64_t>(frames)},
			"the text shows the fields");
		Require((text.front() == '-') == (hasSign && time < kTime_Zero), "and the sign that is asked for");
		Require(
			(text.find(';') != UTF16String::npos) == IsTimeDisplayDropFrame(display), "drop frames have their mark");
	}
	const RatioTime seconds = TimeToRatioTime(time);
	Require(RatioTimeToTimecode(seconds, rate, display, flags)
			== TimeToTimecode(RatioTimeToTime(seconds), rate, display, flags),
		"seconds are written as their ticks");
}

// A time within a day at a rate that its display counts in; drop-frame labels begin anew 86 ms before a day is over.
void CheckRoundTrip(FuzzInput& ioInput)
{
	const TimeDisplay display = ioInput.OneOf(AllTimeDisplays());
	const FrameRate rate = display == kTimeDisplay_Frames || IsFeet(display) || display == kTimeDisplay_AudioSamples
		? ioInput.OneOf(AllFrameRates())
		: GetFrameRateForTimeDisplay(display, {});
	const bool isWholeRate = rate.IsUsable() && kTicksPerSecond % rate.GetTicksPerFrame() == 0;
	if (!rate.IsUsable() || (display == kTimeDisplay_AudioSamples && !isWholeRate))
		return;
	TickTime time(ioInput.Any<std::int64_t>() % (kDay - kTicksPerSecond));
	const bool isCount = display == kTimeDisplay_Frames || IsFeet(display);
	if (isCount && time.ToFrame64(rate) != time.ToFrame32(rate))
		return;   // counts that are read end at 32 bits
	const TimecodeFlags trim = ioInput.Flag() ? TimecodeFlags(kTimecodeFlag_TrimLeadingZeros) : TimecodeFlags();
	const UTF16String text = TimeToTimecode(time, rate, display, trim | kTimecodeFlag_ShowSign);
	time.AlignToFrame(rate);
	Require(TimecodeToTime(text, rate, display) == time, "a time that is written reads back as its frame");
	if (!IsHMSFTimeDisplay(display, false))
		return;
	unsigned hours = 99, minutes = 99, seconds = 99;
	unsigned long long frames = 99;
	bool isNegative = false;
	TimeToHMSF(hours, minutes, seconds, frames, isNegative, time, rate, display);
	Require(HMSFToTime(hours, minutes, seconds, frames, isNegative, rate, display) == time, "fields survive");
	Require(ReadNumbers(TimeToTimecode(time < kTime_Zero ? -time : time, rate, display))
			== Numbers{hours, minutes, seconds, static_cast<std::int64_t>(frames)},
		"the text shows the fields");
}

// How a display with a rate of its own numbers its frames.
struct Numbering
{
	explicit Numbering(TimeDisplay inDisplay)
		: mDuration(GetFrameRateForTimeDisplay(inDisplay, {}).GetTicksPerFrame()),
		  mNominal((kTicksPerSecond + mDuration - 1) / mDuration),
		  mDropped(IsTimeDisplayDropFrame(inDisplay) ? mNominal / 15 : 0)
	{
	}

	// The first label of a minute that drops it counts as the frame that the minute begins with.
	std::int64_t FrameOf(std::int64_t inSeconds, std::int64_t inFrames) const
	{
		const std::int64_t minutes = inSeconds / 60;
		const bool isFirst = minutes % 10 != 0 && inSeconds % 60 == 0 && inFrames == 0;
		return inSeconds * mNominal + inFrames - mDropped * (minutes - minutes / 10 - (isFirst ? 1 : 0));
	}

	std::int64_t mDuration, mNominal, mDropped;
};

void CheckFields(FuzzInput& ioInput)
{
	const FrameRate rate = TakeRate(ioInput);
	const TimeDisplay display = TakeDisplay(ioInput);
	const TickTime time(ioInput.Edge<std::int64_t>());
	unsigned hours = 99, minutes = 99, seconds = 99;
	unsigned long long frames = 99;
	bool isNegative = false;
	TimeToHMSF(hours, minutes, seconds, frames, isNegative, time, rate, display);
	Require(hours < 24 && minutes < 60 && seconds < 60, "fields are in their range");
	static_cast<void>(HMSFToTime(hours, minutes, seconds, frames, isNegative, rate, display));
	static_cast<void>(HMSFToTime(ioInput.Edge<unsigned>(), ioInput.Edge<unsigned>(), ioInput.Edge<unsigned>(),
		ioInput.Edge<unsigned long long>(), ioInput.Flag(), rate, display));

	const FrameRate own = GetFrameRateForTimeDisplay(display, {});
	if (!own.IsUsable())
		return;
	const Numbering numbering(display);
	const std::int64_t label = static_cast<std::int64_t>(frames), day = numbering.FrameOf(86'400, 0);
	const std::int64_t number = time.ToFrame64(own);
	Require(label < numbering.mNominal, "frames are below the count of a second");
	Require(numbering.FrameOf((hours * 60 + minutes) * 60 + seconds, label) == std::abs(number % day),
		"fields stand for the frame of the day");
	Require(isNegative == (IsTimeDisplayDropFrame(display) ? time < kTime_Zero : number < 0), "fields have a sign");

	// Too large fields carry at the display's own rate.
	const auto manyHours = ioInput.Any<std::uint16_t>(), manyMinutes = ioInput.Any<std::uint16_t>(),
			   manySeconds = ioInput.Any<std::uint16_t>();
	std::int64_t rest = ioInput.Any<std::uint32_t>(), total = (manyHours * 60ll + manyMinutes) * 60 + manySeconds;
	const TickTime carried = HMSFToTime(
		manyHours, manyMinutes, manySeconds, static_cast<unsigned long long>(rest), isNegative, own, display);
	if (rest > kTicksPerSecond / own.GetTicksPerFrame())
	{
		total += rest / numbering.mNominal;
		rest %= numbering.mNominal;
	}
	TickTime expected;
	expected.AddFrames(numbering.FrameOf(total % 86'400, rest), own);
	Require(carried == (isNegative ? -expected : expected), "more frames than a second has carry");
}

// Every row of a column is what the function for one gives; the shorter span counts.
void CheckColumns(FuzzInput& ioInput)
{
	const FrameRate rate = TakeRate(ioInput);
	const TimeDisplay display = TakeDisplay(ioInput);
	const unsigned flags = ioInput.Any<std::uint8_t>();
	std::array<TickTime, 4> times;
	for (TickTime& time : times)
		time = TickTime(ioInput.Flag() ? ioInput.Edge<std::int64_t>() : ioInput.Any<std::int64_t>() % kDay);
	const std::size_t rows = ioInput.Below(times.size() + 1), expected = std::min<std::size_t>(rows, 3);
	const std::span<const TickTime> column = std::span(times).first(rows);

	const TimecodeFields noFields{98, 97, 96, true, 95};
	std::array<TimecodeFields, 3> fields{noFields, noFields, noFields};
	std::array<TimecodeText, 3> texts{};
	Require(TimesToHMSF(fields, column, rate, display) == expected, "the rows are counted");
	Require(TimesToTimecode(texts, column, rate, display, flags) == expected, "the rows are counted");
	for (std::size_t i = 0; i < fields.size(); ++i)
	{
		TimecodeFields single = noFields;
		UTF16String text;
		if (i < expected)
		{
			TimeToHMSF(single.mHours, single.mMinutes, single.mSeconds, single.mFrames, single.mNegative, times[i],
				rate, display);
			text = TimeToTimecode(times[i], rate, display, flags);
		}
		Require(fields[i] == single, "a row has the fields of its time");
		Require(text == texts[i].GetText(), "a row has the text of its time");
	}

	std::array<UTF16String, 3> typed{ioInput.Text()};
	typed[1] = typed[0].substr(typed[0].size() / 2);
	typed[2] = TimeToTimecode(times[0], rate, display, flags);
	const std::array<UTF16StringView, 3> views{typed[0], typed[1], typed[2]};
	constexpr TickTime kBefore(4'711);
	std::array<TickTime, 3> read{kBefore, kBefore, kBefore};
	const std::size_t lines = std::min<std::size_t>(rows, views.size());
	Require(TimecodesToTimes(read, std::span(views).first(lines), rate, display, flags) == lines, "rows are counted");
	for (std::size_t i = 0; i < read.size(); ++i)
		Require(read[i] == (i < lines ? TimecodeToTime(views[i], rate, display, flags) : kBefore),
			"a row has the time of its text");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckReading, CheckRoundTrip, CheckWriting, CheckFields, CheckColumns}, inData, inSize);
}
