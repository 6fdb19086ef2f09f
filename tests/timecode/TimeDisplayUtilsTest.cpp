#include "zonmediatypes/TimeDisplayUtils.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <limits>

namespace zonmediatypes
{
namespace
{

constexpr FrameRate kCallers(123);
constexpr auto kDefault = static_cast<TimeDisplay>(55);

// What is true of a display.
enum : unsigned
{
	kAudio = 1,
	kDrop = 2,
	kEither = 4,   // drop-frame numbering is applicable
	kFields = 8,
	kFieldsOfFrames = 16   // where a host shows frames as fields
};

struct DisplayCase
{
	TimeDisplay mDisplay;
	FrameRate mRate;
	unsigned mIs = kFields;
};

constexpr DisplayCase sDisplays[] = {
	{kTimeDisplay_24Timecode, kFrameRate_Film24},
	{kTimeDisplay_25Timecode, kFrameRate_VideoPAL},
	{kTimeDisplay_2997DropTimecode, kFrameRate_VideoNTSC, kDrop | kEither | kFields},
	{kTimeDisplay_2997NonDropTimecode, kFrameRate_VideoNTSC, kEither | kFields},
	{kTimeDisplay_30Timecode, kFrameRate_Video30},
	{kTimeDisplay_50Timecode, kFrameRate_VideoPAL_HD},
	{kTimeDisplay_5994DropTimecode, kFrameRate_VideoNTSC_HD, kDrop | kEither | kFields},
	{kTimeDisplay_5994NonDropTimecode, kFrameRate_VideoNTSC_HD, kEither | kFields},
	{kTimeDisplay_60Timecode, kFrameRate_Video60},
	{kTimeDisplay_Frames, kCallers, kFieldsOfFrames},
	{kTimeDisplay_23976Timecode, kFrameRate_23976},
	{kTimeDisplay_16mmFeetFrames, kCallers, 0},
	{kTimeDisplay_35mmFeetFrames, kCallers, 0},
	{kTimeDisplay_48Timecode, kFrameRate_Film48},
	{kTimeDisplay_AudioSamples, kCallers, kAudio | kFields},
	{kTimeDisplay_Milliseconds, kFrameRate_Video1000, kAudio | kFields},
	{kTimeDisplay_Auto, kFrameRate_Zero, 0},
	// No displays
	{static_cast<TimeDisplay>(202), kFrameRate_Zero},
	{static_cast<TimeDisplay>(std::numeric_limits<int>::max()), kFrameRate_Zero},
	{static_cast<TimeDisplay>(std::numeric_limits<int>::min()), kFrameRate_Zero},
};

// Hosts store them.
static_assert(kTimeDisplay_24Timecode == 100 && kTimeDisplay_48Timecode == 113 && kTimeDisplay_AudioSamples == 200
	&& kTimeDisplay_Milliseconds == 201 && kTimeDisplay_Auto == 999);

TEST(TimeDisplay, IsListedAndClassified)
{
	const auto all = AllTimeDisplays();
	ASSERT_EQ(all.size(), 17u);
	for (std::size_t place = 0; place < std::size(sDisplays); ++place)
	{
		const auto& [display, rate, is] = sDisplays[place];
		SCOPED_TRACE(display);
		EXPECT_TRUE(place >= all.size() || all[place] == display);
		EXPECT_TRUE(place > 13 || display == kTimeDisplay_24Timecode + static_cast<int>(place));
		EXPECT_EQ(GetFrameRateForTimeDisplay(display, kCallers), rate);
		EXPECT_EQ(IsTimeDisplayFormatAudio(display), (is & kAudio) != 0);
		EXPECT_EQ(IsTimeDisplayDropFrame(display), (is & kDrop) != 0);
		EXPECT_EQ(IsDropFrameApplicableForTimeDisplay(display), (is & kEither) != 0);
		EXPECT_EQ(IsHMSFTimeDisplay(display, false), (is & kFields) != 0);
		EXPECT_EQ(IsHMSFTimeDisplay(display, true), (is & (kFields | kFieldsOfFrames)) != 0);
	}
}

TimeDisplay Choose(FrameRate inRate, bool inDropFrame, bool inAllowMilliseconds = false)
{
	const auto get = [=](bool inUnused)
	{ return GetTimeDisplayForFrameRate(inRate, inDropFrame, inUnused, kDefault, inAllowMilliseconds); };
	EXPECT_EQ(get(false), get(true));
	return get(false);
}

TEST(TimeDisplay, IsChosenForARate)
{
	for (const auto& [display, rate, is] : sDisplays)
	{
		const bool isTimecode = (is & (kAudio | kFields)) == kFields && rate != kFrameRate_Zero;
		for (const bool isDrop : {false, true})
			EXPECT_EQ(
				Choose(rate, isDrop) == display, isTimecode && ((is & kEither) == 0 || isDrop == ((is & kDrop) != 0)))
				<< display;
	}
	EXPECT_EQ(Choose(kFrameRate_Video1000, true, true), kTimeDisplay_Milliseconds);
	for (const FrameRate rate : {kFrameRate_Audio22050, kFrameRate_Audio32000, kFrameRate_Audio44100,
			 kFrameRate_Audio48000, kFrameRate_Audio88200, kFrameRate_Audio96000, kFrameRate_Audio192000})
		EXPECT_EQ(Choose(rate, true, true), kTimeDisplay_AudioSamples) << rate;
	for (const FrameRate rate : {kFrameRate_Audio8000, kFrameRate_Audio11025, kFrameRate_Video10, kFrameRate_Video12,
			 kFrameRate_Video12_5, kFrameRate_Video15, kFrameRate_Video100, kFrameRate_Video1000, kFrameRate_Zero,
			 FrameRate(0), FrameRate(-1), FrameRate(5'292'001), kFrameRate_Film24 / 1.001})
		EXPECT_EQ(Choose(rate, true), kDefault) << rate;
}

}   // namespace
}   // namespace zonmediatypes
