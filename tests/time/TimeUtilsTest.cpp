#include "zonmediatypes/TimeUtils.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <limits>

namespace zonmediatypes
{
namespace
{

constexpr long long kMost = std::numeric_limits<long long>::max();
constexpr long long kLeast = std::numeric_limits<long long>::min();
constexpr int kMostInt = std::numeric_limits<int>::max();

TEST(RatioTime, IsExactSeconds)
{
	EXPECT_EQ(TimeToRatioTime(TickTime(8'475'667'200)), RatioTime(1'001, 30'000));
	EXPECT_EQ(TimeToRatioTime(TickTime(-kTicksPerSecond)), RatioTime(-1, 1));
	EXPECT_EQ(TimeToRatioTime(kTime_Zero), RatioTime(0, 1));
	EXPECT_EQ(TimeToRatioTime(TickTime(kMost)), RatioTime(kMost / 7 / 7, kTicksPerSecond / 49));
	EXPECT_EQ(TimeToRatioTime(TickTime(kLeast)), RatioTime(kLeast / 4'096, kTicksPerSecond / 4'096));
}

TEST(RatioTime, RoundsToTheNearestTick)
{
	struct RoundCase
	{
		long long mHalfTicks, mTicks;
	};
	for (const auto& [halfTicks, ticks] :
		std::to_array<RoundCase>({{1, 1}, {-1, 0}, {5, 3}, {-5, -2}, {4, 2}, {-4, -2}, {0, 0}, {-3, -1}, {3, 2}}))
		EXPECT_EQ(RatioTimeToTime({halfTicks, 2 * kTicksPerSecond}).GetTicks(), ticks) << halfTicks;
	EXPECT_EQ(RatioTimeToTime({-27, 10 * kTicksPerSecond}).GetTicks(), -3);
	EXPECT_EQ(RatioTimeToTime({27, 10 * kTicksPerSecond}).GetTicks(), 3);
	EXPECT_EQ(RatioTimeToTime({1'001, 30'000}).GetTicks(), 8'475'667'200);
	EXPECT_EQ(RatioTimeToTime(RatioTime(kMost)).GetTicks(), kLeast);
	EXPECT_EQ(RatioTimeToTime(RatioTime(kLeast)).GetTicks(), kLeast);
	EXPECT_EQ(RatioTimeToTime({1, kMost}).GetTicks(), 0);
	const TickTime sample(72'081'624'662'019'000);   // at 192 kHz, of more ticks than a double holds
	EXPECT_EQ(RatioTimeToTime(TimeToRatioTime(sample)) - sample, TickTime(8));
}

// Frames and samples of a day, there and back; through 32-bit terms as long as the fraction fits into them.
TEST(RatioTime, KeepsFramesOfEveryNamedRate)
{
	constexpr std::int64_t kTolerance = 132'300;   // a tenth of a sample at 192 kHz
	for (const FrameRate rate : AllFrameRates().first(AllFrameRates().size() - 1))
	{
		const std::int64_t day = TickTime(86'400 * kTicksPerSecond).ToFrame64(rate);
		for (std::int64_t frame = -day; frame <= day; frame += day / 997)
		{
			TickTime time;
			time.AddFrames(frame, rate);
			const RatioTime ratio = TimeToRatioTime(time);
			ASSERT_EQ(RatioTimeToTime(ratio), time) << frame << " at " << rate;
			const RatioTime legacy = LegacyRatioTimeToRatioTime(RatioTimeToLegacyRatioTime(ratio));
			const bool fits = ratio.numerator() < kMostInt && ratio.numerator() > -kMostInt;
			ASSERT_TRUE(!fits || (RatioTimeToTime(legacy) - time).Abs().GetTicks() <= kTolerance)
				<< frame << " at " << rate;
		}
	}
}

TEST(LegacyRatioTime, IsExactUpToOneShortOfTheExtremes)
{
	EXPECT_EQ(RatioTimeToLegacyRatioTime({kMostInt - 1, 7}), LegacyRatioTime(kMostInt - 1, 7));
	EXPECT_EQ(RatioTimeToLegacyRatioTime({-kMostInt + 1, 7}), LegacyRatioTime(-kMostInt + 1, 7));
	EXPECT_EQ(RatioTimeToLegacyRatioTime({kMostInt - 1, kMostInt - 2}), LegacyRatioTime(kMostInt - 1, kMostInt - 2));
	EXPECT_EQ(RatioTimeToLegacyRatioTime({-kMostInt + 1, kMostInt - 2}), LegacyRatioTime(-kMostInt + 1, kMostInt - 2));
	EXPECT_EQ(RatioTimeToLegacyRatioTime(RatioTime(kMostInt)), LegacyRatioTime(kMostInt - 1));
	EXPECT_EQ(RatioTimeToLegacyRatioTime({1, kMostInt}), LegacyRatioTime(1, kMostInt - 1));
	EXPECT_EQ(RatioTimeToLegacyRatioTime({3'000'000'000, 9'000'000'001}), LegacyRatioTime(1, 3));
	const int least = std::numeric_limits<int>::min();
	EXPECT_EQ(LegacyRatioTimeToRatioTime(LegacyRatioTime(least)), RatioTime(least));
}

TEST(LegacyTimeScale, IsAMultipleOf2997)
{
	for (const long long scale : {0, 2'997, -2'997, 5'994})
		EXPECT_TRUE(IsLegacyTimeScale(scale)) << scale;
	for (const long long scale : {kMost, kLeast, 30'000ll, 60'000ll, 1ll})
		EXPECT_FALSE(IsLegacyTimeScale(scale)) << scale;
}

TEST(LegacyTimeScale, IsCorrected)
{
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(1'000'000), 2'997), RatioTime(999'999));
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(1'000'000), 30'000), RatioTime(1'000'000));
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(-1, 3), 0), RatioTime(-333'333, 1'000'000));
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(0), 0), RatioTime(0));
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(-1, 3), 0), LegacyRatioTime(-333'333, 1'000'000));
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(-1, 3), 1), LegacyRatioTime(-1, 3));
	// Exact products that 32 bits do not hold become the closest fraction.
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(1, 1'000'003), 0),
		RatioTimeToLegacyRatioTime({999'999, 1'000'003'000'000}));
	// 64-bit terms are exact or refused; this product fits because 999,999 is a multiple of 7.
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(1, kMost / 1'000'000 * 7), 0),
		RatioTime(142'857, kMost / 1'000'000 * 1'000'000));
	constexpr long long kMostFactor = kMost / 999'999;   // so does the largest product
	EXPECT_EQ(
		CorrectLegacyRatioTimeAtTimeScale(RatioTime(kMostFactor * 64), 0), RatioTime(kMostFactor * 999'999, 15'625));
	EXPECT_THROW(CorrectLegacyRatioTimeAtTimeScale(RatioTime(kMost), 0), boost::bad_rational);
	EXPECT_THROW(CorrectLegacyRatioTimeAtTimeScale(RatioTime(kLeast), 0), boost::bad_rational);
	EXPECT_THROW(CorrectLegacyRatioTimeAtTimeScale(RatioTime(1, kMost), 0), boost::bad_rational);
	EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(kLeast), 1), RatioTime(kLeast));
}

TEST(FrameRateToRatio, IsFramesPerSecond)
{
	EXPECT_EQ(FrameRateToRatio(kFrameRate_VideoNTSC), RatioTime(30'000, 1'001));
	EXPECT_EQ(FrameRateToRatio(kFrameRate_23976), RatioTime(24'000, 1'001));
	EXPECT_EQ(FrameRateToRatio(kFrameRate_Video12_5), RatioTime(25, 2));
	EXPECT_EQ(FrameRateToRatio(FrameRate(-kTicksPerSecond)), RatioTime(-1));
	EXPECT_EQ(FrameRateToRatio(FrameRate(kLeast)), RatioTime(-kTicksPerSecond / 4'096, 1ll << 51));
	EXPECT_EQ(FrameRateToRatio(kFrameRate_Zero), RatioTime(kTicksPerSecond / 49, kMost / 49));
	EXPECT_THROW(FrameRateToRatio(FrameRate(0)), boost::bad_rational);
}

}   // namespace
}   // namespace zonmediatypes
