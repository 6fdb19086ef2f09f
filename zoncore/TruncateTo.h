#pragma once

/// \file
/// The one way in which a double becomes an integer.

#include "zoncore/Requirements.h"

#include <concepts>
#include <cstdint>
#include <limits>

namespace zoncore::utility
{

/// inValue truncated toward zero; the most negative value of Integer for NaN and for everything that does not fit, the
/// infinities included.
template <class Integer>
	requires std::same_as<Integer, std::int64_t> || std::same_as<Integer, std::int32_t>
constexpr Integer TruncateTo(double inValue) noexcept
{
	constexpr double kTooLarge = -static_cast<double>(std::numeric_limits<Integer>::min());   // 2^63 or 2^31
	constexpr double kTooSmall = sizeof(Integer) == 8 ? -kTooLarge * (1 + 0x1p-52) : -kTooLarge - 1;
	return inValue > kTooSmall && inValue < kTooLarge ? static_cast<Integer>(inValue)
													  : std::numeric_limits<Integer>::min();
}

}   // namespace zoncore::utility
