#pragma once

/// \file
/// Bytes of frames and rows, and the frames that DV allows.
///
///     PixelFormatSize(kPixelFormat_BGRA_4444_8u, 1920, 1080);                    // 8,294,400
///     UncompressedPixelFormatRowBytes(kPixelFormat_V210_422_10u, 1280);          // 3,456: rows padded to 128 bytes
///     PixelFormatSize(kPixelFormat_NTSCDV25, 1, 1);                              // 120,000: DV frames are all alike
///
/// Widths and heights are not checked: negative ones give negative byte counts, and 32-bit row arithmetic wraps for very
/// large ones. Check both before allocating.

#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormat.h"

#include <cstdint>

namespace zonmediatypes
{

/// Bytes of one frame. DV: the variant's, whatever the size (SMPTE ST 314, ST 370). Planar 4:2:0 of MPEG: a luma plane
/// and two chroma planes of half the width, truncated, and half the height, with rows padded to 128 bytes and the height
/// to 32 lines. Uncompressed: the rows' bytes. 0 for everything else.
ZONMEDIATYPES_API std::int64_t PixelFormatSize(PixelFormat inFormat, int inWidth, int inHeight) noexcept;

/// Bytes of one row of an uncompressed frame, padding included: to 128 bytes for v210, to 16 for other packed 4:2:2, to
/// 64 for the rest. 0 for a format that has no such rows. Packed 4:2:2 counts as uncompressed whatever its compression.
ZONMEDIATYPES_API std::int64_t UncompressedPixelFormatRowBytes(PixelFormat inFormat, int inWidth) noexcept;

/// The frame size of a DV format; outputs are left alone for every other format.
ZONMEDIATYPES_API void FixedSizedFormatDimensions(PixelFormat inFormat, int& outWidth, int& outHeight) noexcept;

/// Whether a DV format may store frames of this size and pixel shape: its own size, and one of its shapes under the
/// tolerant comparison of ratios. True for every other format.
ZONMEDIATYPES_API bool IsRectValidForFormat(
	PixelFormat inFormat, int inWidth, int inHeight, PixelAspectRatio inRatio) noexcept;

}   // namespace zonmediatypes
