#pragma once

/// \file
/// Products of 64-bit integers without loss: a number of 128 bits, and a product that says when it does not fit.
///
///     const UInt128 product = UInt128{inTicks} * inUnits;
///     const auto whole = static_cast<std::uint64_t>(product / inDivisor);
///     const std::optional<std::int64_t> scaled = CheckedMultiply(inCount, inFactor);
///
/// This is the one place that asks what the compiler has: its own wide integers where there are any, which cost least, and
/// the same in portable C++ elsewhere.

#include "zoncore/WrappingArithmetic.h"

#include <bit>
#include <compare>
#include <concepts>
#include <cstdint>
#include <limits>
#include <optional>
#include <type_traits>

namespace zoncore::utility
{

/// An unsigned number of 128 bits as two of 64. Sums, differences and products wrap around; a divisor of 0 is a divide
/// fault, in a constant expression an error. Converts implicitly from unsigned integers and explicitly to them, which
/// keeps the low bits, as the compilers' own do.
class PortableUInt128
{
public:
	constexpr PortableUInt128() noexcept = default;
	template <std::unsigned_integral Integer>
	constexpr PortableUInt128(Integer inValue) noexcept : mLow(inValue)   // NOLINT(google-explicit-constructor): widens
	{
	}
	constexpr PortableUInt128(std::uint64_t inHigh, std::uint64_t inLow) noexcept : mHigh(inHigh), mLow(inLow) {}

	template <std::unsigned_integral Integer>
	explicit constexpr operator Integer() const noexcept
	{
		return static_cast<Integer>(mLow);
	}

	// The arguments of shifts are below 128.
	friend constexpr PortableUInt128 operator<<(PortableUInt128 inValue, unsigned inBits) noexcept
	{
		if (inBits >= 64)
			return {inValue.mLow << (inBits - 64), 0};
		return inBits == 0
			? inValue
			: PortableUInt128(inValue.mHigh << inBits | inValue.mLow >> (64 - inBits), inValue.mLow << inBits);
	}
	friend constexpr PortableUInt128 operator>>(PortableUInt128 inValue, unsigned inBits) noexcept
	{
		if (inBits >= 64)
			return {0, inValue.mHigh >> (inBits - 64)};
		return inBits == 0
			? inValue
			: PortableUInt128(inValue.mHigh >> inBits, inValue.mHigh << (64 - inBits) | inValue.mLow >> inBits);
	}

	friend constexpr PortableUInt128 operator|(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
	{
		return {inLHS.mHigh | inRHS.mHigh, inLHS.mLow | inRHS.mLow};
	}
	friend constexpr PortableUInt128 operator+(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
	{
		const std::uint64_t low = inLHS.mLow + inRHS.mLow;
		return {inLHS.mHigh + inRHS.mHigh + (low < inLHS.mLow ? 1 : 0), low};
	}
	friend constexpr PortableUInt128 operator-(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
	{
		return {inLHS.mHigh - inRHS.mHigh - (inLHS.mLow < inRHS.mLow ? 1 : 0), inLHS.mLow - inRHS.mLow};
	}
	friend constexpr PortableUInt128 operator*(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
	{
		const PortableUInt128 low = Multiply(inLHS.mLow, inRHS.mLow);
		return {low.mHigh + inLHS.mHigh * inRHS.mLow + inLHS.mLow * inRHS.mHigh, low.mLow};
	}
	friend constexpr PortableUInt128 operator/(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept;
	friend constexpr PortableUInt128 operator%(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept;

	// Member by member, the high half first.
	friend constexpr std::strong_ordering operator<=>(PortableUInt128, PortableUInt128) noexcept = default;

private:
	struct Division;

	static constexpr PortableUInt128 Multiply(std::uint64_t inLHS, std::uint64_t inRHS) noexcept;
	static constexpr Division Divide(PortableUInt128 inDividend, PortableUInt128 inDivisor) noexcept;

	constexpr unsigned Width() const noexcept
	{
		return static_cast<unsigned>(mHigh != 0 ? 64 + std::bit_width(mHigh) : std::bit_width(mLow));
	}

	std::uint64_t mHigh = 0;
	std::uint64_t mLow = 0;
};

/// CheckedMultiply in portable C++.
template <std::integral Integer>
	requires(sizeof(Integer) == 8)
constexpr std::optional<Integer> PortableCheckedMultiply(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept;

// libgcc and compiler-rt, which divide these, do not come with Microsoft's tools.
#if defined(__SIZEOF_INT128__) && !defined(_MSC_VER)
__extension__ using UInt128 = unsigned __int128;
#else
using UInt128 = PortableUInt128;
#endif

/// The product; empty when it does not fit.
template <std::integral Integer>
	requires(sizeof(Integer) == 8)
constexpr std::optional<Integer> CheckedMultiply(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
#if defined(__SIZEOF_INT128__) && !defined(_MSC_VER)
	Integer product = 0;
	return __builtin_mul_overflow(inLHS, inRHS, &product) ? std::nullopt : std::optional(product);
#else
	return PortableCheckedMultiply(inLHS, inRHS);
#endif
}

// ---- Inline implementation -------------------------------------------------------------------------------------------

struct PortableUInt128::Division
{
	PortableUInt128 mQuotient;
	PortableUInt128 mRemainder;
};

// Four products of halves. No sum wraps: (2^32 - 1)^2 + 2 x (2^32 - 1) is 2^64 - 1.
constexpr PortableUInt128 PortableUInt128::Multiply(std::uint64_t inLHS, std::uint64_t inRHS) noexcept
{
	constexpr std::uint64_t kHalf = 0xFFFF'FFFF;
	const std::uint64_t lows = (inLHS & kHalf) * (inRHS & kHalf);
	const std::uint64_t crossed = (inLHS >> 32) * (inRHS & kHalf) + (lows >> 32);
	const std::uint64_t middle = (inLHS & kHalf) * (inRHS >> 32) + (crossed & kHalf);
	return {(inLHS >> 32) * (inRHS >> 32) + (crossed >> 32) + (middle >> 32), middle << 32 | (lows & kHalf)};
}

// Bit by bit from the highest that the quotient can have, as by hand.
constexpr PortableUInt128::Division PortableUInt128::Divide(
	PortableUInt128 inDividend, PortableUInt128 inDivisor) noexcept
{
	if (inDivisor == PortableUInt128())
		RaiseDivideFault();
	if (inDividend.mHigh == 0 && inDivisor.mHigh == 0)
		return {inDividend.mLow / inDivisor.mLow, inDividend.mLow % inDivisor.mLow};
	if (inDividend < inDivisor)
		return {PortableUInt128(), inDividend};
	Division division{PortableUInt128(), inDividend};
	for (unsigned bit = inDividend.Width() - inDivisor.Width() + 1; bit-- != 0;)
	{
		const PortableUInt128 part = inDivisor << bit;
		if (division.mRemainder < part)
			continue;
		division.mRemainder = division.mRemainder - part;
		division.mQuotient = division.mQuotient + (PortableUInt128(1u) << bit);
	}
	return division;
}

constexpr PortableUInt128 operator/(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
{
	return PortableUInt128::Divide(inLHS, inRHS).mQuotient;
}

constexpr PortableUInt128 operator%(PortableUInt128 inLHS, PortableUInt128 inRHS) noexcept
{
	return PortableUInt128::Divide(inLHS, inRHS).mRemainder;
}

template <std::integral Integer>
	requires(sizeof(Integer) == 8)
constexpr std::optional<Integer> PortableCheckedMultiply(Integer inLHS, std::type_identity_t<Integer> inRHS) noexcept
{
	const auto magnitude = [](Integer inValue)
	{ return inValue < 0 ? 0 - static_cast<std::uint64_t>(inValue) : static_cast<std::uint64_t>(inValue); };
	const bool isNegative = (inLHS < 0) != (inRHS < 0);
	const PortableUInt128 product = PortableUInt128(magnitude(inLHS)) * magnitude(inRHS);
	const std::uint64_t most = static_cast<std::uint64_t>(std::numeric_limits<Integer>::max()) + (isNegative ? 1 : 0);
	if (product > most)
		return std::nullopt;
	const auto result = static_cast<std::uint64_t>(product);
	return static_cast<Integer>(isNegative ? 0 - result : result);
}

}   // namespace zoncore::utility
