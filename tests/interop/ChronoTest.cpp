#include "zonmediatypes/interop/Chrono.h"

#include <boost/multiprecision/cpp_int.hpp>
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

namespace zonmediatypes
{
namespace
{

using namespace std::chrono_literals;
using Wide = boost::multiprecision::int256_t;

constexpr std::int64_t kMin = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();

static_assert(ToTickTime(40ms) == TickTime(kFrameRate_VideoPAL.GetTicksPerFrame()));
static_assert(ToTickTime(1us) == TickTime(254'016) && ToTickTime(100h) == kTime_Max);
static_assert(ToTickTime(std::chrono::duration<int, std::ratio<1, 90'000>>(-3)) == TickTime(-8'467'200));
static_assert(
	ToTickTime(1ns, Rounding::Nearest) == TickTime(254) && ToTickTime(-1ns, Rounding::Down) == TickTime(-255));
static_assert(!ToTickTime(std::chrono::hours(20'000)) && !ToTickTime(std::chrono::duration<std::uint64_t>(~0ull)));
static_assert(ToDuration(kTime_Max) == 100h);
static_assert(ToDuration<std::chrono::milliseconds>(TickTime(-1), Rounding::Up) == 0ms);
static_assert(ToDuration<std::chrono::milliseconds>(TickTime(-1), Rounding::Down) == -1ms);
static_assert(ToDuration<TickDuration>(TickTime(kMin), Rounding::Down) == TickDuration::min());   // nothing is negated
static_assert(!ToDuration<std::chrono::duration<std::int8_t>>(kTime_Max, Rounding::Nearest));

// The definition of each rounding, in numbers that cannot overflow; empty when the result does not fit.
std::optional<std::int64_t> RoundedQuotient(const Wide& inDividend, const Wide& inDivisor, Rounding inRounding)
{
	const Wide below = abs(inDividend) / inDivisor;
	const Wide rest = abs(inDividend) % inDivisor;
	const bool goesUp = inRounding == Rounding::Nearest
		? 2 * rest >= inDivisor
		: inRounding == (inDividend < 0 ? Rounding::Down : Rounding::Up) && rest != 0;
	const Wide magnitude = below + (goesUp ? 1 : 0);
	const Wide result = inDividend < 0 ? Wide(-magnitude) : magnitude;
	return result >= kMin && result <= kMax ? std::optional(static_cast<std::int64_t>(result)) : std::nullopt;
}

TEST(TimeBase, RoundsExactlyOverTheWholeRange)
{
	std::mt19937_64 random(1);
	const std::int64_t edges[] = {0, 1, -1, kMin, kMax, kMin + 1, kMin / 2, -(kMin / 2),
		-3'074'457'345'618'258'603};   // a third of one below the least
	const std::pair<std::int64_t, std::int64_t> ratios[]
		= {{1, 90'000}, {1'001, 30'000}, {1, 48'000}, {7, 3}, {1, kTicksPerSecond}, {1, 2 * kTicksPerSecond},
			{1, 3 * kTicksPerSecond}, {1, kMax}, {36'000'000, 1}, {9'999'937, 1'000'003}};
	for (const auto& [numerator, denominator] : ratios)
	{
		const auto base = TimeBase::FromRatio(numerator, denominator);
		ASSERT_TRUE(base) << numerator << '/' << denominator;
		for (int i = 0; i < 8'000; ++i)
		{
			const auto rounding = static_cast<Rounding>(i % 4);
			const auto value = i < 36 ? edges[i / 4] : static_cast<std::int64_t>(random()) >> random() % 64;
			const Wide ticks = Wide(value) * kTicksPerSecond * numerator;
			const auto time = base->ToTicks(value, rounding);
			EXPECT_EQ(
				time ? std::optional(time->GetTicks()) : std::nullopt, RoundedQuotient(ticks, denominator, rounding));
			EXPECT_EQ(base->FromTicks(TickTime(value), rounding),
				RoundedQuotient(Wide(value) * denominator, Wide(kTicksPerSecond) * numerator, rounding));
		}
	}
}

TEST(TimeBase, IsARatioOrEmpty)
{
	const auto ntsc = TimeBase::FromRatio(2'002, 60'000).value();
	EXPECT_EQ(ntsc, TimeBase::FromRate(kFrameRate_VideoNTSC));
	EXPECT_EQ(ntsc.ToRatio(), (TimeBase::Ratio{1'001, 30'000}));
	EXPECT_TRUE(ntsc.IsExact());
	EXPECT_FALSE(TimeBase::FromRatio(7, 11).value().IsExact());
	EXPECT_EQ(TimeBase::FromRatio(7, 11).value().ToRatio(), (TimeBase::Ratio{7, 11}));
	EXPECT_EQ(TimeBase::FromRatio(14, 22), TimeBase::FromRatio(7, 11));
	EXPECT_FALSE(TimeBase::FromRatio(0, 1) || TimeBase::FromRatio(1, 0) || TimeBase::FromRatio(-1, -1));
	EXPECT_FALSE(TimeBase::FromRatio(kMax, 1));
	for (const std::int64_t duration : {std::int64_t{0}, std::int64_t{-5}, kMax})
		EXPECT_FALSE(TimeBase::FromRate(FrameRate(duration)));
}

TEST(Chrono, TakesAndGivesFloatingPointDurations)
{
	using Seconds = std::chrono::duration<double>;
	EXPECT_EQ(ToDuration<Seconds>(kTime_Max).count(), 360'000.0);
	EXPECT_EQ(ToTickTime(Seconds(0.5)), TickTime(kTicksPerSecond / 2));
	EXPECT_EQ(ToTickTime(Seconds(-1.0 / 508'032'000'000)), TickTime(-1));
	EXPECT_EQ(ToTickTime(std::chrono::duration<double, TickDuration::period>(-0x1p63)), TickTime(kMin));
	for (const double none : {std::nan(""), HUGE_VAL, -HUGE_VAL, 4e7})
		EXPECT_FALSE(ToTickTime(Seconds(none)));
}

}   // namespace
}   // namespace zonmediatypes
