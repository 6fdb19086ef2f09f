#pragma once

/// \file
/// A plain fraction, as files and people state rates.

#include <compare>
#include <cstdint>
#include <numeric>
#include <string>

namespace zonmedia
{

struct Fraction
{
	std::int64_t mNumerator = 0;
	std::int64_t mDenominator = 1;

	friend constexpr bool operator==(Fraction, Fraction) = default;
};

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
