#pragma once

/// \file
/// A set of bit flags over an unsigned integer.

#include "zoncore/Requirements.h"

#include <concepts>

namespace zoncore
{

/// A set of bits of T. Converts implicitly from T, so that single flags and flags joined with `|` are sets as they stand.
template <std::unsigned_integral T>
class Flags
{
public:
	constexpr Flags() noexcept = default;
	constexpr Flags(T inBits) noexcept : mBits(inBits) {}   // NOLINT(google-explicit-constructor): flags are sets

	/// Whether every bit of inFlags is set; true for no bits at all.
	constexpr bool Test(Flags inFlags) const noexcept { return (mBits & inFlags.mBits) == inFlags.mBits; }
	constexpr T GetBits() const noexcept { return mBits; }

	friend constexpr Flags operator|(Flags inLHS, Flags inRHS) noexcept
	{
		return static_cast<T>(inLHS.mBits | inRHS.mBits);
	}
	friend constexpr Flags operator&(Flags inLHS, Flags inRHS) noexcept
	{
		return static_cast<T>(inLHS.mBits & inRHS.mBits);
	}
	friend constexpr bool operator==(Flags inLHS, Flags inRHS) noexcept = default;

private:
	T mBits = 0;
};

}   // namespace zoncore
