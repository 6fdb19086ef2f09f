#pragma once

/// \file
/// Fractions as files and people state rates.

#include "zonmediatypes/TimeBase.h"

#include <cstdint>
#include <numeric>
#include <string>

namespace zonmedia
{

using Fraction = zonmediatypes::TimeBase::Ratio;

/// The same value in lowest terms; both terms are to be above 0.
constexpr Fraction Reduced(Fraction inFraction)
{
	const std::int64_t divisor = std::gcd(inFraction.mNumerator, inFraction.mDenominator);
	return {inFraction.mNumerator / divisor, inFraction.mDenominator / divisor};
}

/// "30000/1001", or "25" for a whole number.
inline std::string Text(Fraction inFraction)
{
	const std::string numerator = std::to_string(inFraction.mNumerator);
	return inFraction.mDenominator == 1 ? numerator : numerator + "/" + std::to_string(inFraction.mDenominator);
}

}   // namespace zonmedia
