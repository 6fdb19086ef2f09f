#include "zonmediatypes/TimeDisplayUtils.h"

#include <gtest/gtest.h>

#include <array>
#include <cstddef>
#include <limits>

namespace zonmediatypes
{
namespace
{

constexpr FrameRate kCallers(123);

struct DisplayCase
{
	int mDisplay;
	FrameRate mRate;
	bool mIsAudio, mIsDrop, mIsDropApplicable, mIsHMSF, mIsHMSFWithFrames;
};

constexpr auto sDisplays = std::to_array<DisplayCase>({
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
	{0, kFrameRate_Zero, false, false, false, true, true},
	{99, kFrameRate_Zero, false, false, false, true, true},
	{114, kFrameRate_Zero, false, false, false, true, true},
	{202, kFrameRate_Zero, false, false, false, true, true},
	{std::numeric_limits<int>::max(), kFrameRate_Zero, false, false, false, true, true},
	{std::numeric_limits<int>::min(), kFrameRate_Zero, false, false, false, true, true},
});

TEST(TimeDisplay, IsClassified)
{
	for (const DisplayCase& row : sDisplays)
	{
		SCOPED_TRACE(row.mDisplay);
		const auto display = static_cast<TimeDisplay>(row.mDisplay);
		EXPECT_EQ(GetFrameRateForTimeDisplay(display, kCallers), row.mRate);
		EXPECT_EQ(IsTimeDisplayFormatAudio(display), row.mIsAudio);
		EXPECT_EQ(IsTimeDisplayDropFrame(display), row.mIsDrop);
		EXPECT_EQ(IsDropFrameApplicableForTimeDisplay(display), row.mIsDropApplicable);
		EXPECT_EQ(IsHMSFTimeDisplay(display, false), row.mIsHMSF);
		EXPECT_EQ(IsHMSFTimeDisplay(display, true), row.mIsHMSFWithFrames);
	}
}

TEST(TimeDisplay, IsListedInOrder)
{
	constexpr std::size_t kEnumerators = 17;
	ASSERT_EQ(AllTimeDisplays().size(), kEnumerators);
	for (std::size_t i = 0; i < kEnumerators; ++i)
		EXPECT_EQ(AllTimeDisplays()[i], sDisplays[i].mDisplay);
}

struct ChoiceCase
{
	FrameRate mRate;
	int mDropFrame, mNonDrop, mMilliseconds;
};

TEST(TimeDisplay, IsChosenForARate)
{
	constexpr int kDefault = 55;
	constexpr auto kChoices = std::to_array<ChoiceCase>({
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
		{kFrameRate_Audio22050, 200, 200, 200},
		{kFrameRate_Audio32000, 200, 200, 200},
		{kFrameRate_Audio44100, 200, 200, 200},
		{kFrameRate_Audio48000, 200, 200, 200},
		{kFrameRate_Audio88200, 200, 200, 200},
		{kFrameRate_Audio96000, 200, 200, 200},
		{kFrameRate_Audio192000, 200, 200, 200},
	});
	const auto choose = [](FrameRate inRate, bool inDropFrame, bool inAllowMilliseconds)
	{
		const auto chosen = GetTimeDisplayForFrameRate(
			inRate, inDropFrame, false, static_cast<TimeDisplay>(kDefault), inAllowMilliseconds);
		EXPECT_EQ(chosen,
			GetTimeDisplayForFrameRate(
				inRate, inDropFrame, true, static_cast<TimeDisplay>(kDefault), inAllowMilliseconds));
		return static_cast<int>(chosen);
	};
	for (const auto& [rate, dropFrame, nonDrop, milliseconds] : kChoices)
	{
		SCOPED_TRACE(rate);
		EXPECT_EQ(choose(rate, true, false), dropFrame);
		EXPECT_EQ(choose(rate, false, false), nonDrop);
		EXPECT_EQ(choose(rate, false, true), milliseconds);
	}
	for (const FrameRate rate : {kFrameRate_Audio8000, kFrameRate_Audio11025, kFrameRate_Video10, kFrameRate_Video12,
			 kFrameRate_Video12_5, kFrameRate_Video15, kFrameRate_Video100, kFrameRate_Zero, FrameRate(0),
			 FrameRate(-1), kFrameRate_Film24 / 1.001})
		EXPECT_EQ(choose(rate, true, true), kDefault) << rate;
}

}   // namespace
}   // namespace zonmediatypes
