#include "zonmediatypes/PixelAspectRatioUtils.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/Rational.h"
#include "zoncore/WrappingArithmetic.h"

#include <array>
#include <cstdint>
#include <numeric>

namespace zonmediatypes
{
namespace
{

using zoncore::PointT;
using zoncore::RectT;
using zoncore::utility::Magnitude;
using zoncore::utility::WrappingMultiply;

// ---- Widths ----------------------------------------------------------------------------------------------------------

int RoundWidth(double inWidth)
{
	return zoncore::utility::TruncateTo<std::int32_t>(inWidth + 0.5);
}

int ToSquarePixels(int inWidth, PixelAspectRatio inRatio)
{
	return RoundWidth(inWidth * inRatio.ToDouble());
}

int FromSquarePixels(int inWidth, PixelAspectRatio inRatio)
{
	return RoundWidth(inWidth / inRatio.ToDouble());
}

constexpr bool HasShape(PixelAspectRatio inRatio)
{
	return inRatio.GetNumerator() != 0 && inRatio.GetDenominator() != 0;
}

using ConvertWidth = int(int inWidth, PixelAspectRatio inRatio);

RectT<int> Adjust(const RectT<int>& inRect, PixelAspectRatio inRatio, ConvertWidth inConvert)
{
	if (!HasShape(inRatio))
		return inRect;
	return {inRect.left, inRect.top, inConvert(inRect.right, inRatio), inRect.bottom};
}

PointT<int> Adjust(const PointT<int>& inSize, PixelAspectRatio inRatio, ConvertWidth inConvert)
{
	if (!HasShape(inRatio))
		return inSize;
	return {inConvert(inSize.x, inRatio), inSize.y};
}

// ---- Exact ratios ----------------------------------------------------------------------------------------------------

struct Fraction
{
	std::int64_t mNumerator, mDenominator;
};

std::int64_t WrappingProduct(unsigned inTerm, int inA, int inB)
{
	return WrappingMultiply(WrappingMultiply(std::int64_t{inTerm}, inA), inB);
}

// In lowest terms, with the sign at the numerator; a term of 2^63 wraps to -2^63.
Fraction Reduce(Fraction inFraction)
{
	const std::uint64_t numerator = Magnitude(inFraction.mNumerator);
	const std::uint64_t denominator = Magnitude(inFraction.mDenominator);
	const std::uint64_t divisor = std::gcd(numerator, denominator);
	const bool isNegative = (inFraction.mNumerator < 0) != (inFraction.mDenominator < 0);
	return {static_cast<std::int64_t>(isNegative ? 0 - numerator / divisor : numerator / divisor),
		static_cast<std::int64_t>(denominator / divisor)};
}

constexpr bool FitsRational(std::int64_t inTerm)
{
	constexpr std::int64_t kLargestTerm = 2'147'483'646;
	return -kLargestTerm <= inTerm && inTerm <= kLargestTerm;
}

PixelAspectRatio MakeRatio(std::int64_t inNumerator, std::int64_t inDenominator)
{
	return {static_cast<unsigned int>(inNumerator), static_cast<unsigned int>(inDenominator)};
}

bool HaveSameShape(const RectT<int>& inA, const RectT<int>& inB)
{
	const double a = static_cast<double>(inA.right) / inA.bottom;
	const double b = static_cast<double>(inB.right) / inB.bottom;
	const double difference = a / b - 1;
	return -0.01 < difference && difference < 0.01;   // false for what is no number
}

// ---- Legacy ratios ---------------------------------------------------------------------------------------------------

struct Correction
{
	PixelAspectRatio mLegacy, mCorrect;
};

constexpr auto sCorrections = std::to_array<Correction>({
	{kPixelAspectRatio_DVNTSC_Incorrect, kPixelAspectRatio_DVNTSC},
	{kPixelAspectRatio_DVNTSCWide_Incorrect, kPixelAspectRatio_DVNTSCWide},
	{kPixelAspectRatio_DVPAL_Incorrect, kPixelAspectRatio_DVPAL},
	{kPixelAspectRatio_DVPAL_TooPrecise, kPixelAspectRatio_DVPAL},
	{kPixelAspectRatio_DVPALWide_Incorrect, kPixelAspectRatio_DVPALWide},
});

}   // namespace

RectT<int> AdjustPixelAspectRectToSquarePixelRect(const RectT<int>& inRect, const PixelAspectRatio& inRatio) noexcept
{
	return Adjust(inRect, inRatio, ToSquarePixels);
}

RectT<int> AdjustSquarePixelRectToPixelAspectRect(const RectT<int>& inRect, const PixelAspectRatio& inRatio) noexcept
{
	return Adjust(inRect, inRatio, FromSquarePixels);
}

PointT<int> AdjustPixelAspectDimensionToSquarePixelDimension(
	const PointT<int>& inSize, const PixelAspectRatio& inRatio) noexcept
{
	return Adjust(inSize, inRatio, ToSquarePixels);
}

PointT<int> AdjustSquarePixelDimensionToPixelAspectDimension(
	const PointT<int>& inSize, const PixelAspectRatio& inRatio) noexcept
{
	return Adjust(inSize, inRatio, FromSquarePixels);
}

PixelAspectRatio AdjustPixelAspectRatioForNonUniformDownsample(
	const PixelAspectRatio& inRatio, const RectT<int>& inOriginal, const RectT<int>& inDownsampled)
{
	if (HaveSameShape(inOriginal, inDownsampled))
		return inRatio;
	const std::int64_t denominator = WrappingProduct(inRatio.GetDenominator(), inOriginal.bottom, inDownsampled.right);
	if (denominator == 0)
		return kPixelAspectRatio_Square;
	const std::int64_t numerator = WrappingProduct(inRatio.GetNumerator(), inDownsampled.bottom, inOriginal.right);
	const Fraction exact = Reduce({numerator, denominator});
	if (FitsRational(exact.mNumerator) && FitsRational(exact.mDenominator))
		return MakeRatio(exact.mNumerator, exact.mDenominator);
	const auto closest = zoncore::utility::RationalApproximation(
		static_cast<double>(exact.mNumerator) / static_cast<double>(exact.mDenominator));
	return MakeRatio(closest.numerator(), closest.denominator());
}

PixelAspectRatio CorrectLegacyPixelAspectRatio(PixelAspectRatio inRatio) noexcept
{
	for (const Correction& correction : sCorrections)
		if (inRatio == correction.mLegacy)
			return correction.mCorrect;
	return inRatio;
}

bool IsLegacyPixelAspectRatio(PixelAspectRatio inRatio) noexcept
{
	return CorrectLegacyPixelAspectRatio(inRatio) != inRatio;
}

}   // namespace zonmediatypes
