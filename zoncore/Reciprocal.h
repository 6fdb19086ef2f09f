#pragma once

/// \file
/// Exact division by a number that is known at run time only and serves many times.
///
///     const Reciprocal perRow(inWidth);
///     for (const std::uint64_t offset : offsets)
///         rows.push_back(perRow.Divide(offset));       // offset / inWidth
///
/// Compilers replace a division by a constant by a multiplication; this does the same for a divisor of the program's own,
/// after T. Granlund and P. Montgomery, "Division by invariant integers using multiplication" (1994).

#include "zoncore/WideInteger.h"
#include "zoncore/WrappingArithmetic.h"

#include <bit>
#include <cstdint>

namespace zoncore::utility
{

class Reciprocal
{
public:
	/// What Divide takes; the magnitude of every signed number is within.
	static constexpr std::uint64_t kMostDividend = std::uint64_t{1} << 63;

	/// inDivisor is from 1 to 2^63; 0 is a divide fault, in a constant expression an error. Costs one division of 128 bits.
	explicit constexpr Reciprocal(std::uint64_t inDivisor) noexcept
		: mFactor(RoundedUpFactor(inDivisor)), mShift(LogarithmRoundedUp(inDivisor) - 1)
	{
	}

	/// inDividend divided by the divisor, truncated. A dividend above kMostDividend gives a meaningless number.
	constexpr std::uint64_t Divide(std::uint64_t inDividend) const noexcept
	{
		if (mFactor == 0)
			return inDividend;
		return static_cast<std::uint64_t>((UInt128{inDividend} * mFactor) >> 64) >> mShift;
	}

	friend constexpr bool operator==(const Reciprocal&, const Reciprocal&) noexcept = default;

private:
	static constexpr std::uint32_t LogarithmRoundedUp(std::uint64_t inDivisor) noexcept
	{
		return static_cast<std::uint32_t>(std::bit_width(inDivisor - 1));
	}

	// 2^(63 + logarithm) / inDivisor, rounded up: too large by less than 2^logarithm / inDivisor, which a dividend of up to
	// 2^63 never carries to the next whole quotient. It is below 2^64, because the divisor is above 2^(logarithm - 1). A
	// divisor of 1 has the factor 0 and divides nothing.
	static constexpr std::uint64_t RoundedUpFactor(std::uint64_t inDivisor) noexcept
	{
		if (inDivisor == 0)
			RaiseDivideFault();
		if (inDivisor == 1)
			return 0;
		const UInt128 power = UInt128{1u} << (63 + LogarithmRoundedUp(inDivisor));
		return static_cast<std::uint64_t>((power + (inDivisor - 1)) / inDivisor);
	}

	std::uint64_t mFactor;
	std::uint32_t mShift;
};

}   // namespace zoncore::utility
