#pragma once

/// \file
/// Exact conversion between ticks and counts of any other unit of time: 1/90000 s, microseconds, samples, the time base of
/// a stream.
///
///     constexpr auto kMpegClock = TimeBase::FromRatio(1, 90'000);               // a unit lasts 1/90000 s
///     kMpegClock->FromTicks(TickTime(254'016'000'000), Rounding::Nearest);      // 90000
///
/// A conversion multiplies and divides in 128 bits where it must, so it is off by nothing but its rounding. Each is
/// constexpr, allocates nothing and divides by multiplying, also where the time base is known at run time only: making one
/// costs two divisions of 128 bits, so keep it. A product beyond 64 bits costs a division of 128 bits in each conversion.
///
/// kTime_Invalid is a time like any other here, 400,000 s before zero: compare with it first.

#include "zoncore/Reciprocal.h"
#include "zoncore/WideInteger.h"
#include "zoncore/WrappingArithmetic.h"
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
	/// Units of inNumerator / inDenominator seconds each; empty unless both are positive and the ticks of a unit, as a
	/// fraction in lowest terms, have a numerator that fits 64 bits.
	static constexpr std::optional<TimeBase> FromRatio(std::int64_t inNumerator, std::int64_t inDenominator) noexcept;

	/// Units of one frame or one sample of inRate each; empty for a rate that is not usable or negative.
	static constexpr std::optional<TimeBase> FromRate(FrameRate inRate) noexcept;

	/// inTime in units; empty when that does not fit 64 bits.
	constexpr std::optional<std::int64_t> FromTicks(TickTime inTime, Rounding inRounding) const noexcept;

	/// inUnits units as a time; empty when that does not fit 64 bits. Rounds nothing when IsExact().
	constexpr std::optional<TickTime> ToTicks(std::int64_t inUnits, Rounding inRounding) const noexcept;

	/// A number of seconds in lowest terms.
	struct Ratio
	{
		std::int64_t mNumerator = 0;
		std::int64_t mDenominator = 1;

		friend constexpr bool operator==(const Ratio&, const Ratio&) noexcept = default;
	};

	/// The seconds that a unit lasts; empty when the denominator does not fit 64 bits.
	constexpr std::optional<Ratio> ToRatio() const noexcept;

	/// Whether every unit is a whole number of ticks.
	constexpr bool IsExact() const noexcept { return mUnits.mNumber == 1; }

	friend constexpr bool operator==(const TimeBase&, const TimeBase&) noexcept = default;

private:
	/// A positive number that is multiplied and divided by.
	struct Term
	{
		explicit constexpr Term(std::int64_t inNumber) noexcept
			: mNumber(inNumber), mReciprocal(static_cast<std::uint64_t>(inNumber))
		{
		}

		friend constexpr bool operator==(const Term&, const Term&) noexcept = default;

		std::int64_t mNumber;
		zoncore::utility::Reciprocal mReciprocal;
	};

	constexpr TimeBase(std::int64_t inTicks, std::int64_t inUnits) noexcept : mTicks(inTicks), mUnits(inUnits) {}

	static constexpr std::optional<std::int64_t> Rescale(
		std::int64_t inValue, const Term& inFactor, const Term& inDivisor, Rounding inRounding) noexcept;

	// mTicks ticks last as long as mUnits units; both have no common divisor.
	Term mTicks;
	Term mUnits;
};

// ---- Inline implementation -------------------------------------------------------------------------------------------

namespace detail
{

/// What the magnitude of a dividend grows by, so that its truncated quotient is the rounded one.
constexpr std::uint64_t RoundingBias(std::uint64_t inDivisor, bool inIsNegative, Rounding inRounding) noexcept
{
	switch (inRounding)
	{
	case Rounding::TowardZero:
		break;
	case Rounding::Down:
		return inIsNegative ? inDivisor - 1 : 0;
	case Rounding::Up:
		return inIsNegative ? 0 : inDivisor - 1;
	case Rounding::Nearest:
		return inDivisor / 2;
	}
	return 0;
}

}   // namespace detail

// inValue x inFactor / inDivisor, rounded; empty when it does not fit.
constexpr std::optional<std::int64_t> TimeBase::Rescale(
	std::int64_t inValue, const Term& inFactor, const Term& inDivisor, Rounding inRounding) noexcept
{
	using zoncore::utility::Magnitude;
	const auto divisor = static_cast<std::uint64_t>(inDivisor.mNumber);
	const std::uint64_t bias = detail::RoundingBias(divisor, inValue < 0, inRounding);
	if (const auto product = zoncore::utility::CheckedMultiply(inValue, inFactor.mNumber))
	{
		const std::uint64_t dividend = Magnitude(*product) + bias;
		if (dividend < zoncore::utility::Reciprocal::kMostDividend)
		{
			const auto quotient = static_cast<std::int64_t>(inDivisor.mReciprocal.Divide(dividend));
			return inValue < 0 ? -quotient : quotient;
		}
	}
	using zoncore::utility::UInt128;
	const UInt128 dividend = UInt128{Magnitude(inValue)} * static_cast<std::uint64_t>(inFactor.mNumber) + bias;
	const UInt128 quotient = dividend / divisor;
	const std::uint64_t most = Magnitude(std::numeric_limits<std::int64_t>::max()) + (inValue < 0 ? 1 : 0);
	if (quotient > most)
		return std::nullopt;
	const auto magnitude = static_cast<std::uint64_t>(quotient);
	return static_cast<std::int64_t>(inValue < 0 ? 0 - magnitude : magnitude);
}

constexpr std::optional<TimeBase> TimeBase::FromRatio(std::int64_t inNumerator, std::int64_t inDenominator) noexcept
{
	if (inNumerator <= 0 || inDenominator <= 0)
		return std::nullopt;
	const std::int64_t common = std::gcd(kTicksPerSecond, inDenominator);
	const std::int64_t denominator = inDenominator / common;
	const std::int64_t reduced = std::gcd(inNumerator, denominator);
	const auto ticks = zoncore::utility::CheckedMultiply(kTicksPerSecond / common, inNumerator / reduced);
	return ticks ? std::optional(TimeBase(*ticks, denominator / reduced)) : std::nullopt;
}

constexpr std::optional<TimeBase> TimeBase::FromRate(FrameRate inRate) noexcept
{
	if (!inRate.IsUsable() || inRate.GetTicksPerFrame() < 0)
		return std::nullopt;
	return TimeBase(inRate.GetTicksPerFrame(), 1);
}

constexpr std::optional<TimeBase::Ratio> TimeBase::ToRatio() const noexcept
{
	const std::int64_t common = std::gcd(mTicks.mNumber, kTicksPerSecond);
	const auto denominator = zoncore::utility::CheckedMultiply(kTicksPerSecond / common, mUnits.mNumber);
	return denominator ? std::optional(Ratio{mTicks.mNumber / common, *denominator}) : std::nullopt;
}

constexpr std::optional<std::int64_t> TimeBase::FromTicks(TickTime inTime, Rounding inRounding) const noexcept
{
	return Rescale(inTime.GetTicks(), mUnits, mTicks, inRounding);
}

constexpr std::optional<TickTime> TimeBase::ToTicks(std::int64_t inUnits, Rounding inRounding) const noexcept
{
	const std::optional<std::int64_t> ticks = Rescale(inUnits, mTicks, mUnits, inRounding);
	return ticks ? std::optional(TickTime(*ticks)) : std::nullopt;
}

}   // namespace zonmediatypes
