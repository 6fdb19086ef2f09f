#pragma once

/// \file
/// Exact conversion between ticks and counts of any other unit of time: 1/90000 s, microseconds, samples, the time base of
/// a stream.
///
///     constexpr auto kMpegClock = TimeBase::FromRatio(1, 90'000);               // a unit lasts 1/90000 s
///     kMpegClock->FromTicks(TickTime(254'016'000'000), Rounding::Nearest);      // 90000
///
/// A conversion multiplies and divides in 128 bits where it must, so it is off by nothing but its rounding. Each is
/// constexpr, allocates nothing and costs one division by a run-time number, or a multiplication where the time base is a
/// constant.

#include "zonmediatypes/TickTime.h"

#include <cstdint>
#include <limits>
#include <numeric>
#include <optional>

namespace zonmediatypes
{

/// What becomes of a fraction of a unit.
enum class Rounding
{
	TowardZero,
	Down,     ///< to the unit at or before
	Up,       ///< to the unit at or after
	Nearest   ///< to the nearest unit, halves away from zero
};

class TimeBase
{
public:
	/// Units of inNumerator / inDenominator seconds each; empty unless both are positive and the reduced number of ticks to
	/// a unit, or of units to a tick, fits 64 bits.
	static constexpr std::optional<TimeBase> FromRatio(std::int64_t inNumerator, std::int64_t inDenominator) noexcept;

	/// The units that one frame or sample lasts; empty for a rate that is not usable or negative.
	static constexpr std::optional<TimeBase> FromRate(FrameRate inRate) noexcept;

	/// Empty when the result does not fit 64 bits.
	constexpr std::optional<std::int64_t> FromTicks(TickTime inTime, Rounding inRounding) const noexcept;
	constexpr std::optional<TickTime> ToTicks(std::int64_t inUnits, Rounding inRounding) const noexcept;

	/// The seconds that a unit lasts, in lowest terms; empty when the denominator does not fit 64 bits.
	struct Ratio
	{
		std::int64_t mNumerator, mDenominator;

		friend constexpr bool operator==(const Ratio&, const Ratio&) noexcept = default;
	};
	constexpr std::optional<Ratio> ToRatio() const noexcept;

	/// Whether every unit is a whole number of ticks: ToTicks then rounds nothing.
	constexpr bool IsExact() const noexcept { return mUnits == 1; }

	friend constexpr bool operator==(const TimeBase&, const TimeBase&) noexcept = default;

private:
	constexpr TimeBase(std::int64_t inTicks, std::int64_t inUnits) noexcept : mTicks(inTicks), mUnits(inUnits) {}

	// mTicks ticks last as long as mUnits units; both are positive and have no common divisor.
	std::int64_t mTicks;
	std::int64_t mUnits;
};

// ---- Inline implementation -------------------------------------------------------------------------------------------

namespace detail
{

__extension__ using Int128 = __int128;

/// inDividend / inDivisor, rounded; inDivisor is positive.
template <class Integer>
constexpr Integer DivideRounded(Integer inDividend, std::int64_t inDivisor, Rounding inRounding) noexcept
{
	const Integer quotient = inDividend / inDivisor;
	const auto rest = static_cast<std::int64_t>(inDividend % inDivisor);
	if (rest == 0 || inRounding == Rounding::TowardZero)
		return quotient;
	const bool isNegative = rest < 0;
	const std::int64_t distance = isNegative ? -rest : rest;
	const bool goesAway = inRounding == Rounding::Nearest ? distance >= inDivisor - distance
														  : isNegative == (inRounding == Rounding::Down);
	return quotient + (!goesAway ? 0 : isNegative ? -1 : 1);
}

/// inValue x inFactor / inDivisor, rounded; empty when it does not fit. The terms are positive.
constexpr std::optional<std::int64_t> Rescale(
	std::int64_t inValue, std::int64_t inFactor, std::int64_t inDivisor, Rounding inRounding) noexcept
{
	std::int64_t product = 0;
	if (!__builtin_mul_overflow(inValue, inFactor, &product))
		return DivideRounded(product, inDivisor, inRounding);
	const Int128 result = DivideRounded(Int128{inValue} * inFactor, inDivisor, inRounding);
	if (result < std::numeric_limits<std::int64_t>::min() || result > std::numeric_limits<std::int64_t>::max())
		return std::nullopt;
	return static_cast<std::int64_t>(result);
}

}   // namespace detail

constexpr std::optional<TimeBase> TimeBase::FromRatio(std::int64_t inNumerator, std::int64_t inDenominator) noexcept
{
	if (inNumerator <= 0 || inDenominator <= 0)
		return std::nullopt;
	const std::int64_t common = std::gcd(kTicksPerSecond, inDenominator);
	const std::int64_t denominator = inDenominator / common;
	const std::int64_t reduced = std::gcd(inNumerator, denominator);
	std::int64_t ticks = 0;
	if (__builtin_mul_overflow(kTicksPerSecond / common, inNumerator / reduced, &ticks))
		return std::nullopt;
	return TimeBase(ticks, denominator / reduced);
}

constexpr std::optional<TimeBase> TimeBase::FromRate(FrameRate inRate) noexcept
{
	if (!inRate.IsUsable() || inRate.GetTicksPerFrame() < 0)
		return std::nullopt;
	return TimeBase(inRate.GetTicksPerFrame(), 1);
}

constexpr std::optional<TimeBase::Ratio> TimeBase::ToRatio() const noexcept
{
	const std::int64_t common = std::gcd(mTicks, kTicksPerSecond);
	std::int64_t denominator = 0;
	if (__builtin_mul_overflow(kTicksPerSecond / common, mUnits, &denominator))
		return std::nullopt;
	return Ratio{mTicks / common, denominator};
}

constexpr std::optional<std::int64_t> TimeBase::FromTicks(TickTime inTime, Rounding inRounding) const noexcept
{
	return detail::Rescale(inTime.GetTicks(), mUnits, mTicks, inRounding);
}

constexpr std::optional<TickTime> TimeBase::ToTicks(std::int64_t inUnits, Rounding inRounding) const noexcept
{
	const std::optional<std::int64_t> ticks = detail::Rescale(inUnits, mTicks, mUnits, inRounding);
	return ticks ? std::optional(TickTime(*ticks)) : std::nullopt;
}

}   // namespace zonmediatypes
