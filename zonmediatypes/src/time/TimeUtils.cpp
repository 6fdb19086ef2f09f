#include "zonmediatypes/TimeUtils.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/WrappingArithmetic.h"

#include <cmath>
#include <cstdint>
#include <limits>
#include <numeric>

namespace zonmediatypes
{
namespace
{

using zoncore::utility::Magnitude;

constexpr std::uint64_t kCorrectionNumerator = 999'999;
constexpr std::uint64_t kCorrectionDenominator = 1'000'000;

// Boost normalises with the negative of each term, which the most negative number does not have. The other term is always
// kTicksPerSecond here, which is even, so both can be halved.
boost::rational<long long> NormalizedRatio(std::int64_t inNumerator, std::int64_t inDenominator)
{
	static_assert(kTicksPerSecond % 2 == 0);
	constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();
	if (inNumerator == kLeast || inDenominator == kLeast)
		return {inNumerator / 2, inDenominator / 2};
	return {inNumerator, inDenominator};
}

// The product, which a term of a fraction must hold.
long long TermProduct(std::uint64_t inLHS, std::uint64_t inRHS)
{
	constexpr std::uint64_t kLargestTerm = std::numeric_limits<long long>::max();
	if (inLHS > kLargestTerm / inRHS)
		throw boost::bad_rational("bad rational: the product does not fit");
	return static_cast<long long>(inLHS * inRHS);
}

// inTime x 999,999/1,000,000. Common factors are taken out crosswise first, so that the products are in lowest terms.
RatioTime CorrectedTime(RatioTime inTime)
{
	const std::uint64_t numerator = Magnitude(inTime.numerator());
	const auto denominator = static_cast<std::uint64_t>(inTime.denominator());
	const std::uint64_t across = std::gcd(numerator, kCorrectionDenominator);
	const std::uint64_t down = std::gcd(denominator, kCorrectionNumerator);
	const long long product = TermProduct(numerator / across, kCorrectionNumerator / down);
	return {
		inTime.numerator() < 0 ? -product : product, TermProduct(denominator / down, kCorrectionDenominator / across)};
}

constexpr bool IsExactLegacyTerm(long long inTerm)
{
	constexpr long long kLargest = std::numeric_limits<int>::max() - 1;
	return inTerm >= -kLargest && inTerm <= kLargest;
}

}   // namespace

RatioTime TimeToRatioTime(TickTime inTime)
{
	return NormalizedRatio(inTime.GetTicks(), kTicksPerSecond);
}

TickTime RatioTimeToTime(RatioTime inTime) noexcept
{
	const double ticks = static_cast<double>(kTicksPerSecond) / static_cast<double>(inTime.denominator())
		* static_cast<double>(inTime.numerator());
	const bool isHalf = std::floor(ticks + 0.5) == ticks + 0.5;
	const double rounded = ticks > 0 ? ticks + 0.5 : isHalf ? ticks : ticks - 0.5;
	return TickTime(zoncore::utility::TruncateTo<std::int64_t>(rounded));
}

RatioTime LegacyRatioTimeToRatioTime(LegacyRatioTime inTime)
{
	return {inTime.numerator(), inTime.denominator()};
}

LegacyRatioTime RatioTimeToLegacyRatioTime(RatioTime inTime)
{
	if (IsExactLegacyTerm(inTime.numerator()) && IsExactLegacyTerm(inTime.denominator()))
		return {static_cast<int>(inTime.numerator()), static_cast<int>(inTime.denominator())};
	return zoncore::utility::RationalApproximation(
		static_cast<double>(inTime.numerator()) / static_cast<double>(inTime.denominator()));
}

RatioTime CorrectLegacyRatioTimeAtTimeScale(RatioTime inTime, long long inTimeScale)
{
	return IsLegacyTimeScale(inTimeScale) ? CorrectedTime(inTime) : inTime;
}

LegacyRatioTime CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime inTime, long long inTimeScale)
{
	if (!IsLegacyTimeScale(inTimeScale))
		return inTime;
	return RatioTimeToLegacyRatioTime(CorrectedTime(LegacyRatioTimeToRatioTime(inTime)));
}

boost::rational<long long> FrameRateToRatio(const FrameRate& inRate)
{
	return NormalizedRatio(kTicksPerSecond, inRate.GetTicksPerFrame());
}

}   // namespace zonmediatypes
