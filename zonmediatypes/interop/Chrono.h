#pragma once

/// \file
/// TickTime and the durations of std::chrono.
///
///     ToTickTime(std::chrono::milliseconds(40)).value();                          // one frame at 25 fps, exact
///     ToTickTime(std::chrono::nanoseconds(1), Rounding::Nearest).value();         // 254 ticks of 254.016
///     ToDuration<std::chrono::milliseconds>(kTime_Max, Rounding::Down).value();   // 360000000 ms
///
/// Milliseconds, microseconds, hours and 1/90000 s are whole numbers of ticks and convert exactly; other periods, and every
/// conversion away from ticks, name their rounding. Results are optional: one that does not fit is empty. kTime_Invalid is
/// a time like any other, 400,000 s before zero: compare with it first.

#include "zonmediatypes/TimeBase.h"

#include <chrono>
#include <cmath>
#include <concepts>
#include <cstdint>
#include <limits>
#include <optional>
#include <ratio>
#include <utility>

namespace zonmediatypes
{

/// A duration that counts ticks.
using TickDuration = std::chrono::duration<std::int64_t, std::ratio<1, kTicksPerSecond>>;

/// The time base of a std::chrono duration. Does not compile for a period that is out of range.
template <class Period>
inline constexpr TimeBase kTimeBaseOf = TimeBase::FromRatio(Period::num, Period::den).value();

/// The time as a duration of the same ticks.
constexpr TickDuration ToDuration(TickTime inTime) noexcept
{
	return TickDuration(inTime.GetTicks());
}

/// The time in another duration that counts whole units; empty when it does not fit.
template <class Duration>
	requires std::integral<typename Duration::rep>
constexpr std::optional<Duration> ToDuration(TickTime inTime, Rounding inRounding) noexcept
{
	using Rep = typename Duration::rep;
	const auto count = kTimeBaseOf<typename Duration::period>.FromTicks(inTime, inRounding);
	if (!count || !std::in_range<Rep>(*count))
		return std::nullopt;
	return Duration(static_cast<Rep>(*count));
}

/// The time in a duration that counts in floating point, such as std::chrono::duration<double>: as near as it can hold.
template <class Duration>
	requires std::floating_point<typename Duration::rep>
constexpr Duration ToDuration(TickTime inTime) noexcept
{
	return std::chrono::duration_cast<Duration>(std::chrono::duration<typename Duration::rep, TickDuration::period>(
		static_cast<typename Duration::rep>(inTime.GetTicks())));
}

/// The time of a duration that counts whole units; empty when it does not fit 64 bits of ticks.
template <std::integral Rep, class Period>
constexpr std::optional<TickTime> ToTickTime(
	std::chrono::duration<Rep, Period> inDuration, Rounding inRounding) noexcept
{
	if (!std::in_range<std::int64_t>(inDuration.count()))
		return std::nullopt;
	return kTimeBaseOf<Period>.ToTicks(static_cast<std::int64_t>(inDuration.count()), inRounding);
}

/// The same without a rounding, for periods that are a whole number of ticks; others do not compile.
template <std::integral Rep, class Period>
	requires(kTimeBaseOf<Period>.IsExact())
constexpr std::optional<TickTime> ToTickTime(std::chrono::duration<Rep, Period> inDuration) noexcept
{
	return ToTickTime(inDuration, Rounding::TowardZero);
}

/// The tick nearest to a duration that counts in floating point; empty for NaN, infinities and what does not fit.
template <std::floating_point Rep, class Period>
std::optional<TickTime> ToTickTime(std::chrono::duration<Rep, Period> inDuration) noexcept
{
	constexpr double kTooLarge = -static_cast<double>(std::numeric_limits<std::int64_t>::min());
	const double ticks = std::round(std::chrono::duration<double, TickDuration::period>(inDuration).count());
	if (!(ticks >= -kTooLarge && ticks < kTooLarge))
		return std::nullopt;
	return TickTime(static_cast<std::int64_t>(ticks));
}

}   // namespace zonmediatypes
