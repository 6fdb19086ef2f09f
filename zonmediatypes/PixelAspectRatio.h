#pragma once

/// \file
/// The shape of a pixel: its width to its height, as a ratio of two integers.
///
/// A ratio is kept as it was given, neither reduced nor validated. A numerator of 0 stands for an unknown shape or for
/// any shape, a denominator of 0 for an unusable one.
///
///     const PixelAspectRatio wide(40, 33);
///     wide.ToDouble();                        // 1.2121...
///     wide == kPixelAspectRatio_DVNTSCWide;   // true
///     wide == PixelAspectRatio(1212, 1000);   // true: equality is tolerant
///
/// Comparisons call ratios within 0.001 of each other equal, neither less nor greater. So equality is not transitive, and
/// a ratio serves neither as a key of a map nor for sorting.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"

#include <iosfwd>
#include <limits>
#include <span>

namespace zonmediatypes
{

/// A ratio of two unsigned 32-bit integers.
class PixelAspectRatio
{
public:
	/// Square pixels, 1/1.
	constexpr PixelAspectRatio() noexcept = default;
	/// Both terms as they are.
	constexpr PixelAspectRatio(unsigned int inNumerator, unsigned int inDenominator) noexcept
		: mNumerator(inNumerator), mDenominator(inDenominator)
	{
	}

	constexpr void SetValue(unsigned int inNumerator, unsigned int inDenominator) noexcept;
	constexpr void GetValue(unsigned int& outNumerator, unsigned int& outDenominator) const noexcept;
	constexpr unsigned int GetNumerator() const noexcept { return mNumerator; }
	constexpr unsigned int GetDenominator() const noexcept { return mDenominator; }

	/// Numerator by denominator; the largest finite double when the denominator is 0, whatever the numerator.
	constexpr double ToDouble() const noexcept;

	/// What the 16-bit output operator writes.
	ZONMEDIATYPES_API zoncore::UTF16String GetDisplayString() const;

private:
	unsigned int mNumerator = 1;
	unsigned int mDenominator = 1;
};

// ---- Comparison ------------------------------------------------------------------------------------------------------

/// Within 0.001 of each other. Numerators of 0 equal each other and nothing else, whatever the denominators; so do
/// denominators of 0 under other numerators. `!=` is the opposite.
constexpr bool operator==(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept;

/// The order of ToDouble(); false for two ratios within 0.001 of each other, with numerators of 0, or with denominators
/// of 0.
constexpr bool operator<(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept;
constexpr bool operator>(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept;

/// Less or equal, greater or equal.
constexpr bool operator<=(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept;
constexpr bool operator>=(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept;

// ---- Text ------------------------------------------------------------------------------------------------------------

/// The ratio as a number with four decimals ("0.9091"), with one for ratios within 0.001 of 1, 1.5 and 2 ("1.0");
/// "1.79769e+308" for a denominator of 0. Written as the stream's own text inserter does, width and fill included.
ZONMEDIATYPES_API std::ostream& operator<<(std::ostream& ioStream, const PixelAspectRatio& inRatio);
ZONMEDIATYPES_API zoncore::UTF16OutputStream& operator<<(
	zoncore::UTF16OutputStream& ioStream, const PixelAspectRatio& inRatio);

// ---- Constants -------------------------------------------------------------------------------------------------------

// clang-format off
inline constexpr PixelAspectRatio kPixelAspectRatio_Square(1, 1);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVCProHD(3, 2);
inline constexpr PixelAspectRatio kPixelAspectRatio_Anamorphic(2, 1);
inline constexpr PixelAspectRatio kPixelAspectRatio_Unknown(0, 2);            ///< equals Any
inline constexpr PixelAspectRatio kPixelAspectRatio_Any(0, 1);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSC(10, 11);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSCWide(40, 33);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL(768, 702);          ///< 702 of 720 samples make a 4:3 picture
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPALWide(1024, 702);     ///< and a 16:9 one
inline constexpr PixelAspectRatio kPixelAspectRatio_HDAnamorphic1080(1920, 1440);
// What older projects stored; CorrectLegacyPixelAspectRatio (PixelAspectRatioUtils.h) mends them.
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSC_Incorrect(648, 720);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSCWide_Incorrect(864, 720);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL_Incorrect(768, 720);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL_TooPrecise(59, 54);
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPALWide_Incorrect(1024, 720);
// clang-format on

/// The 15 constants in the order above; for menus and tools.
ZONMEDIATYPES_API std::span<const PixelAspectRatio> AllPixelAspectRatios() noexcept;

// ---- Inline implementation -------------------------------------------------------------------------------------------

constexpr void PixelAspectRatio::SetValue(unsigned int inNumerator, unsigned int inDenominator) noexcept
{
	*this = PixelAspectRatio(inNumerator, inDenominator);
}

constexpr void PixelAspectRatio::GetValue(unsigned int& outNumerator, unsigned int& outDenominator) const noexcept
{
	outNumerator = mNumerator;
	outDenominator = mDenominator;
}

constexpr double PixelAspectRatio::ToDouble() const noexcept
{
	if (mDenominator == 0)
		return std::numeric_limits<double>::max();
	return static_cast<double>(mNumerator) / static_cast<double>(mDenominator);
}

constexpr bool operator==(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept
{
	if (inLHS.GetNumerator() == 0 || inRHS.GetNumerator() == 0)
		return inLHS.GetNumerator() == inRHS.GetNumerator();
	if (inLHS.GetDenominator() == 0 || inRHS.GetDenominator() == 0)
		return inLHS.GetDenominator() == inRHS.GetDenominator();
	constexpr double kTolerance = 0.001;
	const double difference = inLHS.ToDouble() - inRHS.ToDouble();
	return -kTolerance < difference && difference < kTolerance;
}

constexpr bool operator<(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept
{
	return inLHS != inRHS && inLHS.ToDouble() < inRHS.ToDouble();
}

constexpr bool operator>(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept
{
	return inRHS < inLHS;
}

constexpr bool operator<=(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept
{
	return inLHS == inRHS || inLHS < inRHS;
}

constexpr bool operator>=(PixelAspectRatio inLHS, PixelAspectRatio inRHS) noexcept
{
	return inRHS <= inLHS;
}

}   // namespace zonmediatypes
