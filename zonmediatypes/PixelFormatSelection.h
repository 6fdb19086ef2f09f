#pragma once

/// \file
/// Which pixel format frames travel in: what a conversion costs, and the choices made by it.
///
/// A producer offers formats, a consumer accepts formats. A conversion has a cost: 0 for none, a few points for what is
/// cheap and loses nothing, 100 and more for what shows, 10000 for what cannot be done.
///
///     PixelConversionCost(kPixelFormat_BGRA_4444_8u.mProperties, kPixelFormat_BGRX_4444_8u.mProperties,
///         kRenderQuality_High);                                                 // 26: alpha is lost
///     Select4444PixelFormat(kPixelFormat_UYVY_422_8u, kRenderQuality_High);     // kPixelFormat_VUYX_4444_8u
///
/// Lists may be empty, may repeat formats, and may hold invalid, custom and wildcard ones; the registry of custom formats
/// is not asked.

#include "zoncore/SmallBlocks.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelFormat.h"

#include <concepts>
#include <cstdint>
#include <initializer_list>
#include <span>

namespace zonmediatypes
{

/// The quality at which the host renders. Rules compare it as a number: Medium and more is high, less is low.
enum RenderQuality : std::int32_t
{
	kRenderQuality_Draft = 1,
	kRenderQuality_Low = 2,
	kRenderQuality_Medium = 3,
	kRenderQuality_High = 4,
	kRenderQuality_Max = 5,
};

/// A list of formats; in the order of preference where formats tie.
using PixelFormats = zoncore::utility::SmallBlockAllocator::vector<PixelFormat>;

/// A list of formats that a function looks at, wherever it is kept: a vector, an array, a span, or braces in the call.
class PixelFormatView
{
public:
	template <std::convertible_to<std::span<const PixelFormat>> List>
	constexpr PixelFormatView(const List& inFormats) noexcept   // NOLINT(google-explicit-constructor)
		: mFormats(inFormats)
	{
	}
	constexpr PixelFormatView(std::initializer_list<PixelFormat> inFormats) noexcept
		: mFormats(inFormats.begin(), inFormats.size())
	{
	}

	constexpr const PixelFormat* begin() const noexcept { return mFormats.data(); }
	constexpr const PixelFormat* end() const noexcept { return mFormats.data() + mFormats.size(); }
	constexpr bool empty() const noexcept { return mFormats.empty(); }

private:
	std::span<const PixelFormat> mFormats;
};

/// The cost of a conversion that cannot be done, and the highest of all.
inline constexpr int kPixelConversionCost_Impossible = 10'000;

/// What it costs to convert frames: kPixelConversionCost_Impossible from and to what is not concrete or of unknown
/// compression, even if it is equal; 0 for other equal properties; impossible into a compressed format; else the points of
/// every change added up, as the \ref video_guide "guide" lists them. Losses cost more at high quality.
ZONMEDIATYPES_API int PixelConversionCost(
	const PixelFormatProperties& inFrom, const PixelFormatProperties& inTo, RenderQuality inQuality) noexcept;

/// The format for frames between a producer of inSourceFormats and a consumer of inDestinationFormats; the first of:
///  1. the request, when it is preferred and accepted, if only by kPixelFormat_Any;
///  2. a format that both know, in the consumer's order;
///  3. what the cheapest conversion leads to, of several the one nearest to the request; where kPixelFormat_Any is accepted,
///     what the first cheapest one starts from (but what an equally cheap one nearer to the request leads to: deliberate);
///  4. a format that can be worked in, with a fourth component before others;
///  5. kPixelFormat_Invalid.
///
/// It can be a format that the producer does not make, or a request that neither list names: ask for the cost of getting there.
ZONMEDIATYPES_API PixelFormat SelectNearestPixelFormat(const PixelFormats& inSourceFormats,
	PixelFormat inRequestedFormat, const PixelFormats& inDestinationFormats, RenderQuality inQuality,
	bool inPreferRequested) noexcept;
/// The same of lists that are no PixelFormats.
ZONMEDIATYPES_API PixelFormat SelectNearestPixelFormat(PixelFormatView inSourceFormats, PixelFormat inRequestedFormat,
	PixelFormatView inDestinationFormats, RenderQuality inQuality, bool inPreferRequested) noexcept;
inline PixelFormat SelectNearestPixelFormat(std::initializer_list<PixelFormat> inSourceFormats,
	PixelFormat inRequestedFormat, std::initializer_list<PixelFormat> inDestinationFormats, RenderQuality inQuality,
	bool inPreferRequested) noexcept;

/// The source format that converts most cheaply to inTarget, of several the shallowest, of those the first; for the
/// wildcard the first concrete one that is not custom. kPixelFormat_Invalid when there is none.
ZONMEDIATYPES_API PixelFormat SelectNearestSourcePixelFormat(
	const PixelFormats& inSourceFormats, PixelFormatProperties inTarget, RenderQuality inQuality) noexcept;
/// The same of a list that is no PixelFormats.
ZONMEDIATYPES_API PixelFormat SelectNearestSourcePixelFormat(
	PixelFormatView inSourceFormats, PixelFormatProperties inTarget, RenderQuality inQuality) noexcept;
inline PixelFormat SelectNearestSourcePixelFormat(std::initializer_list<PixelFormat> inSourceFormats,
	PixelFormatProperties inTarget, RenderQuality inQuality) noexcept;

/// The built-in format with full chroma and a fourth component in which frames of inFormat are processed: inFormat itself
/// when it is one; else 8-bit for 8-bit, and for deeper ones 32-bit float at high quality and 8-bit at low. YUV of full
/// range is processed as RGB. kPixelFormat_Any for the wildcard, kPixelFormat_Invalid when no format has these properties.
ZONMEDIATYPES_API PixelFormat Select4444PixelFormat(PixelFormat inFormat, RenderQuality inQuality) noexcept;

/// The uncompressed format that a DV format decompresses into; every other format as it is.
ZONMEDIATYPES_API PixelFormat SelectDVDecompressionFormat(PixelFormat inFormat) noexcept;

// ---- Inline implementation -------------------------------------------------------------------------------------------

// Braces in a call mean these two: to the functions of vectors and of views they would be equally near.

inline PixelFormat SelectNearestPixelFormat(std::initializer_list<PixelFormat> inSourceFormats,
	PixelFormat inRequestedFormat, std::initializer_list<PixelFormat> inDestinationFormats, RenderQuality inQuality,
	bool inPreferRequested) noexcept
{
	return SelectNearestPixelFormat(PixelFormatView(inSourceFormats), inRequestedFormat,
		PixelFormatView(inDestinationFormats), inQuality, inPreferRequested);
}

inline PixelFormat SelectNearestSourcePixelFormat(std::initializer_list<PixelFormat> inSourceFormats,
	PixelFormatProperties inTarget, RenderQuality inQuality) noexcept
{
	return SelectNearestSourcePixelFormat(PixelFormatView(inSourceFormats), inTarget, inQuality);
}

}   // namespace zonmediatypes
