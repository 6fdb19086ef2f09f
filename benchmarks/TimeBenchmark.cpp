// Ticks as units of other time bases, exactly rounded, beside GStreamer's scaling of 64-bit numbers and libavutil's.

#include "Comparison.h"

#include "zonmediatypes/TimeBase.h"
#include "zonmediatypes/TimeUtils.h"

#include <array>
#include <cstdint>
#include <numeric>
#include <string>
#include <vector>

#if ZON_HAS_GSTREAMER
	#include <gst/gst.h>
#endif

extern "C"
{
#include <libavutil/mathematics.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace)

constexpr double kWanted = 4;

// Times all over a day.
std::vector<TickTime> Times()
{
	std::vector<TickTime> times;
	std::uint64_t state = 1;
	for (int i = 0; i < 1'024; ++i)
	{
		state = state * 6'364'136'223'846'793'005 + 1'442'695'040'888'963'407;
		times.emplace_back(static_cast<std::int64_t>((state >> 8) % (86'400 * std::uint64_t{kTicksPerSecond})));
	}
	return times;
}

template <std::int64_t inUnitsPerSecond>
Work KnownBase()
{
	return ForEach(Times,
		[](TickTime inTime)
		{
			constexpr TimeBase kBase = *TimeBase::FromRatio(1, inUnitsPerSecond);
			return *kBase.FromTicks(inTime, Rounding::Nearest);
		});
}

Work RunTimeBase(std::int64_t inUnitsPerSecond)
{
	return ForEach(Times,
		[base = *TimeBase::FromRatio(1, inUnitsPerSecond)](TickTime inTime)
		{ return *base.FromTicks(inTime, Rounding::Nearest); });
}

Work RunTimeBaseToTicks(std::int64_t inUnitsPerSecond)
{
	return ForEach(Times,
		[base = *TimeBase::FromRatio(1, inUnitsPerSecond)](TickTime inTime)
		{ return *base.ToTicks(inTime.GetTicks() >> 20, Rounding::Nearest); });
}

// The peers get their fraction in lowest terms, as ours is.
#if ZON_HAS_GSTREAMER

Work Scale(std::int64_t inUnitsPerSecond)
{
	const std::int64_t common = std::gcd(inUnitsPerSecond, kTicksPerSecond);
	return ForEach(Times,
		[units = static_cast<guint64>(inUnitsPerSecond / common),
			ticks = static_cast<guint64>(kTicksPerSecond / common)](TickTime inTime)
		{ return gst_util_uint64_scale_round(static_cast<guint64>(inTime.GetTicks()), units, ticks); });
}

#else

Work Scale(std::int64_t)
{
	return {};
}

#endif

Work Rescale(std::int64_t inUnitsPerSecond)
{
	const std::int64_t common = std::gcd(inUnitsPerSecond, kTicksPerSecond);
	return ForEach(Times,
		[units = inUnitsPerSecond / common, ticks = kTicksPerSecond / common](TickTime inTime)
		{ return av_rescale_rnd(inTime.GetTicks(), units, ticks, AV_ROUND_NEAR_INF); });
}

template <std::int64_t inUnitsPerSecond>
void AddBase(const std::string& inName)
{
	constexpr const char* kArea = "Time";
	const std::vector<Peer> peers{
		{"GStreamer", Scale(inUnitsPerSecond), kWanted}, {"libavutil", Rescale(inUnitsPerSecond)}};
	Compare(kArea, "ticks to " + inName + ", known base", KnownBase<inUnitsPerSecond>(), peers);
	Compare(kArea, "ticks to " + inName + ", base of run time", RunTimeBase(inUnitsPerSecond), peers);
	Compare(kArea, inName + " to ticks, base of run time", RunTimeBaseToTicks(inUnitsPerSecond));
}

[[maybe_unused]] const bool sAdded = []
{
	AddBase<90'000>("90 kHz");
	AddBase<1'000'000>("microseconds");
	AddBase<48'000>("samples at 48 kHz");
	AddBase<44'100>("samples at 44.1 kHz");
	Compare("Time", "ticks to a fraction of seconds",
		ForEach(Times, [](TickTime inTime) { return TimeToRatioTime(inTime); }));
	Compare("Time", "a fraction of seconds to ticks",
		ForEach(
			[]
			{
				std::vector<RatioTime> ratios;
				for (const TickTime time : Times())
					ratios.push_back(TimeToRatioTime(time));
				return ratios;
			},
			[](RatioTime inTime) { return RatioTimeToTime(inTime); }));
	return true;
}();

}   // namespace
}   // namespace benchmarks
