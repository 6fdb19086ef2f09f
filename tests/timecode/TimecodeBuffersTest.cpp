// The forms that write into a caller's buffer or fill a column give what the form for one time gives.

#include "tests/Allocations.h"
#include "zonmediatypes/Timecode.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <span>
#include <vector>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;

std::vector<TickTime> Times()
{
	constexpr std::int64_t kMost = std::numeric_limits<std::int64_t>::max();
	std::vector<TickTime> times;
	for (const std::int64_t ticks : {std::int64_t{0}, std::int64_t{1}, std::int64_t{8'475'667'200},
			 59 * kTicksPerSecond, 60 * kTicksPerSecond, 599 * kTicksPerSecond + 1, 3'600 * kTicksPerSecond,
			 86'399 * kTicksPerSecond, 360'000 * kTicksPerSecond, kMost - 1, kMost})
		for (const std::int64_t sign : {1, -1})
			times.emplace_back(sign * ticks);
	times.emplace_back(-kMost - 1);
	return times;
}

std::vector<FrameRate> Rates()
{
	std::vector<FrameRate> rates(AllFrameRates().begin(), AllFrameRates().end());
	for (const std::int64_t duration : std::initializer_list<std::int64_t>{0, 1, 7, -1, -8'475'667'200})
		rates.emplace_back(duration);
	rates.emplace_back(std::numeric_limits<std::int64_t>::min());
	rates.emplace_back(kTicksPerSecond + 1);
	return rates;
}

template <class Char>
void ExpectInBuffer(
	const UTF16String& inText, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, unsigned inFlags)
{
	constexpr Char kUntouched = '#';
	std::array<Char, kLongestTimecode + 1> buffer;
	buffer.fill(kUntouched);
	const std::span<Char> tooShort = std::span(buffer).first(inText.size() - 1);
	ASSERT_EQ(TimeToTimecode(tooShort, inTime, inRate, inDisplay, inFlags), inText.size());
	ASSERT_EQ(std::ranges::count(buffer, kUntouched), std::ssize(buffer));
	ASSERT_EQ(
		TimeToTimecode(std::span(buffer).first(inText.size()), inTime, inRate, inDisplay, inFlags), inText.size());
	ASSERT_TRUE(std::equal(inText.begin(), inText.end(), buffer.begin()));
	ASSERT_EQ(std::ranges::count(buffer, kUntouched), std::ssize(buffer) - std::ssize(inText));
}

void ExpectTextsOfOneTime(FrameRate inRate, TimeDisplay inDisplay, unsigned inFlags)
{
	const std::vector<TickTime> times = Times();
	std::vector<TimecodeText> texts(times.size());
	std::vector<UTF16StringView> views;
	std::vector<TickTime> read(times.size());
	ASSERT_EQ(TimesToTimecode(texts, times, inRate, inDisplay, inFlags), times.size());
	for (std::size_t i = 0; i < times.size(); ++i)
	{
		const UTF16String text = TimeToTimecode(times[i], inRate, inDisplay, inFlags);
		ExpectInBuffer<UTF16Char>(text, times[i], inRate, inDisplay, inFlags);
		ExpectInBuffer<char>(text, times[i], inRate, inDisplay, inFlags);
		views.push_back(texts[i].GetText());
		ASSERT_EQ(views[i], text) << times[i].GetTicks() << " at " << inRate.GetTicksPerFrame();
	}
	ASSERT_EQ(TimecodesToTimes(read, views, inRate, inDisplay, inFlags), times.size());
	for (std::size_t i = 0; i < times.size(); ++i)
		ASSERT_EQ(read[i], TimecodeToTime(views[i], inRate, inDisplay, inFlags));
}

void ExpectFieldsOfOneTime(FrameRate inRate, TimeDisplay inDisplay)
{
	const std::vector<TickTime> times = Times();
	std::vector<TimecodeFields> column(times.size(), {1, 2, 3, true, 4});
	ASSERT_EQ(TimesToHMSF(column, times, inRate, inDisplay), times.size());
	for (std::size_t i = 0; i < times.size(); ++i)
	{
		TimecodeFields one;
		TimeToHMSF(one.mHours, one.mMinutes, one.mSeconds, one.mFrames, one.mNegative, times[i], inRate, inDisplay);
		ASSERT_EQ(column[i], one) << times[i].GetTicks() << " at " << inRate.GetTicksPerFrame();
	}
}

TEST(TimecodeBuffersAndColumns, HoldWhatOneTimeGives)
{
	std::vector<TimeDisplay> displays(AllTimeDisplays().begin(), AllTimeDisplays().end());
	displays.push_back(static_cast<TimeDisplay>(0));
	for (const TimeDisplay display : displays)
		for (const FrameRate rate : Rates())
		{
			SCOPED_TRACE(display);
			ExpectFieldsOfOneTime(rate, display);
			for (unsigned flags = 0; flags < 16; ++flags)
				ExpectTextsOfOneTime(rate, display, flags);
		}
}

TEST(TimecodeColumns, EndWithTheShorterSpanAndAllocateNothing)
{
	const std::array<TickTime, 2> times{};
	std::array<TimecodeText, 3> texts{};
	std::array<TimecodeFields, 1> fields{};
	std::array<TickTime, 3> read{kTime_Max, kTime_Max, kTime_Max};
	const std::array<UTF16StringView, 1> empty{};
	EXPECT_EQ(zontest::CountAllocations(
				  [&]
				  {
					  EXPECT_EQ(TimesToTimecode(texts, times, kFrameRate_VideoPAL, kTimeDisplay_Auto), 2u);
					  EXPECT_EQ(TimesToHMSF(fields, times, kFrameRate_VideoPAL, kTimeDisplay_AudioSamples), 1u);
					  EXPECT_EQ(TimecodesToTimes(read, empty, kFrameRate_VideoPAL, kTimeDisplay_Auto), 1u);
				  }),
		0u);
	EXPECT_EQ(texts[2].mLength, 0);
	EXPECT_EQ(read, (std::array{kTime_Zero, kTime_Max, kTime_Max}));
}

}   // namespace
}   // namespace zonmediatypes
