#include "zonmediatypes/TimeDisplayUtils.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <limits>

namespace zonmediatypes
{
namespace
{

TEST(TimeDisplay, IsListedAndClassified)
{
	constexpr FrameRate kCallers(123);
	const struct
	{
		int mDisplay;
		FrameRate mRate;
		bool mIsAudio, mIsDrop, mIsDropApplicable, mIsHMSF, mIsHMSFWithFrames;
	} displays[] = {
		{100, kFrameRate_Film24, false, false, false, true, true},
		{101, kFrameRate_VideoPAL, false, false, false, true, true},
		{102, kFrameRate_VideoNTSC, false, true, true, true, true},
		{103, kFrameRate_VideoNTSC, false, false, true, true, true},
		{104, kFrameRate_Video30, false, false, false, true, true},
		{105, kFrameRate_VideoPAL_HD, false, false, false, true, true},
		{106, kFrameRate_VideoNTSC_HD, false, true, true, true, true},
		{107, kFrameRate_VideoNTSC_HD, false, false, true, true, true},
		{108, kFrameRate_Video60, false, false, false, true, true},
		{109, kCallers, false, false, false, false, true},
		{110, kFrameRate_23976, false, false, false, true, true},
		{111, kCallers, false, false, false, false, false},
		{112, kCallers, false, false, false, false, false},
		{113, kFrameRate_Film48, false, false, false, true, true},
		{200, kCallers, true, false, false, true, true},
		{201, kFrameRate_Video1000, true, false, false, true, true},
		{999, kFrameRate_Zero, false, false, false, false, false},
		{202, kFrameRate_Zero, false, false, false, true, true},
		{std::numeric_limits<int>::max(), kFrameRate_Zero, false, false, false, true, true},
		{std::numeric_limits<int>::min(), kFrameRate_Zero, false, false, false, true, true},
	};
	const auto all = AllTimeDisplays();
	ASSERT_EQ(all.size(), 17u);
	std::size_t place = 0;
	for (const auto& [number, rate, isAudio, isDrop, isDropApplicable, isHMSF, isHMSFWithFrames] : displays)
	{
		SCOPED_TRACE(number);
		const auto display = static_cast<TimeDisplay>(number);
		EXPECT_TRUE(place >= all.size() || all[place] == display);
		++place;
		EXPECT_EQ(GetFrameRateForTimeDisplay(display, kCallers), rate);
		EXPECT_EQ(IsTimeDisplayFormatAudio(display), isAudio);
		EXPECT_EQ(IsTimeDisplayDropFrame(display), isDrop);
		EXPECT_EQ(IsDropFrameApplicableForTimeDisplay(display), isDropApplicable);
		EXPECT_EQ(IsHMSFTimeDisplay(display, false), isHMSF);
		EXPECT_EQ(IsHMSFTimeDisplay(display, true), isHMSFWithFrames);
	}
}

TEST(TimeDisplay, IsChosenForARate)
{
	constexpr int kDefault = 55;
	const struct
	{
		FrameRate mRate;
		int mDropFrame, mNonDrop, mMilliseconds;
	} choices[] = {
		{kFrameRate_23976, 110, 110, 110},
		{kFrameRate_Film24, 100, 100, 100},
		{kFrameRate_VideoPAL, 101, 101, 101},
		{kFrameRate_VideoNTSC, 102, 103, 103},
		{kFrameRate_Video30, 104, 104, 104},
		{kFrameRate_Film48, 113, 113, 113},
		{kFrameRate_VideoPAL_HD, 105, 105, 105},
		{kFrameRate_VideoNTSC_HD, 106, 107, 107},
		{kFrameRate_Video60, 108, 108, 108},
		{kFrameRate_Video1000, kDefault, kDefault, 201},
	};
	const auto choose = [](FrameRate inRate, bool inDropFrame, bool inAllowMilliseconds)
	{
		const auto get = [=](bool inUnused)
		{
			return GetTimeDisplayForFrameRate(
				inRate, inDropFrame, inUnused, static_cast<TimeDisplay>(kDefault), inAllowMilliseconds);
		};
		EXPECT_EQ(get(false), get(true));
		return static_cast<int>(get(false));
	};
	for (const auto& [rate, dropFrame, nonDrop, milliseconds] : choices)
	{
		SCOPED_TRACE(rate);
		EXPECT_EQ(choose(rate, true, false), dropFrame);
		EXPECT_EQ(choose(rate, false, false), nonDrop);
		EXPECT_EQ(choose(rate, false, true), milliseconds);
	}
	for (const FrameRate rate : {kFrameRate_Audio22050, kFrameRate_Audio32000, kFrameRate_Audio44100,
			 kFrameRate_Audio48000, kFrameRate_Audio88200, kFrameRate_Audio96000, kFrameRate_Audio192000})
		EXPECT_EQ(choose(rate, true, true), kTimeDisplay_AudioSamples) << rate;
	for (const FrameRate rate : {kFrameRate_Audio8000, kFrameRate_Audio11025, kFrameRate_Video10, kFrameRate_Video12,
			 kFrameRate_Video12_5, kFrameRate_Video15, kFrameRate_Video100, kFrameRate_Zero, FrameRate(0),
			 FrameRate(-1), kFrameRate_Film24 / 1.001})
		EXPECT_EQ(choose(rate, true, true), kDefault) << rate;
}

}   // namespace
}   // namespace zonmediatypes
