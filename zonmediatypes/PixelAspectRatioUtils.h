#pragma once

/// \file
/// Rectangles and sizes between square and other pixels, and ratios that need mending.
///
///     const zoncore::RectT<int> stored{0, 0, 720, 480};
///     AdjustPixelAspectRectToSquarePixelRect(stored, kPixelAspectRatio_DVNTSC);   // {0, 0, 655, 480}

#include "zoncore/Geometry.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelAspectRatio.h"

namespace zonmediatypes
{

// ---- Rectangles and sizes --------------------------------------------------------------------------------------------
//
// Only the width changes, to its value in the other pixels plus 0.5, truncated toward zero: half up above zero, and
// deliberately something else below. There and back is not exact. A ratio with a term of 0 changes nothing; a width that
// does not fit an int becomes the most negative one.

/// `right` is the width; the other edges stay.
ZONMEDIATYPES_API zoncore::RectT<int> AdjustPixelAspectRectToSquarePixelRect(
	const zoncore::RectT<int>& inRect, const PixelAspectRatio& inRatio) noexcept;
ZONMEDIATYPES_API zoncore::RectT<int> AdjustSquarePixelRectToPixelAspectRect(
	const zoncore::RectT<int>& inRect, const PixelAspectRatio& inRatio) noexcept;

/// `x` is the width; `y` stays.
ZONMEDIATYPES_API zoncore::PointT<int> AdjustPixelAspectDimensionToSquarePixelDimension(
	const zoncore::PointT<int>& inSize, const PixelAspectRatio& inRatio) noexcept;
ZONMEDIATYPES_API zoncore::PointT<int> AdjustSquarePixelDimensionToPixelAspectDimension(
	const zoncore::PointT<int>& inSize, const PixelAspectRatio& inRatio) noexcept;

// ---- Ratios ----------------------------------------------------------------------------------------------------------

/// The ratio that keeps the picture's shape when a frame of inOriginal (`right` by `bottom`) is stored as inDownsampled:
/// inRatio itself when both have the same shape within 1 %; 1/1 when the new denominator is 0; otherwise the exact
/// fraction in lowest terms, or the closest fraction with 32-bit terms when it does not fit. Products are 64-bit and
/// wrap. A negative numerator is stored modulo 2^32.
ZONMEDIATYPES_API PixelAspectRatio AdjustPixelAspectRatioForNonUniformDownsample(
	const PixelAspectRatio& inRatio, const zoncore::RectT<int>& inOriginal, const zoncore::RectT<int>& inDownsampled);

/// The right ratio in place of a wrong one that older projects stored, other ratios as they are. The comparison is
/// tolerant: legitimate ratios near 9/10, 6/5, 16/15, 59/54 and 64/45 are replaced, too.
ZONMEDIATYPES_API PixelAspectRatio CorrectLegacyPixelAspectRatio(PixelAspectRatio inRatio) noexcept;

/// Whether CorrectLegacyPixelAspectRatio changes it to a ratio that is not equal.
ZONMEDIATYPES_API bool IsLegacyPixelAspectRatio(PixelAspectRatio inRatio) noexcept;

}   // namespace zonmediatypes
