#include "zonmediatypes/PixelFormatSize.h"

#include "zoncore/WrappingArithmetic.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>

namespace zonmediatypes
{
namespace
{

using zoncore::utility::WrappingAdd;
using zoncore::utility::WrappingMultiply;

// ---- DV --------------------------------------------------------------------------------------------------------------

struct DVFrame
{
	std::int32_t mCompression;
	std::int32_t mWidth;
	std::int32_t mHeight;
	std::int32_t mBytes;
	PixelAspectRatio mShape;
	PixelAspectRatio mOtherShape;   // the same one where there is one only
};

// clang-format off
constexpr auto sDVFrames = std::to_array<DVFrame>({
	{kPixelFormatCompression_NTSCDV25,         720,  480, 120'000, kPixelAspectRatio_DVNTSC,           kPixelAspectRatio_DVNTSCWide},
	{kPixelFormatCompression_PALDV25,          720,  576, 144'000, kPixelAspectRatio_DVPAL,            kPixelAspectRatio_DVPALWide},
	{kPixelFormatCompression_NTSCDV50,         720,  480, 240'000, kPixelAspectRatio_DVNTSC,           kPixelAspectRatio_DVNTSCWide},
	{kPixelFormatCompression_PALDV50,          720,  576, 288'000, kPixelAspectRatio_DVPAL,            kPixelAspectRatio_DVPALWide},
	{kPixelFormatCompression_NTSCDV100_720p,   960,  720, 240'000, kPixelAspectRatio_Square,           kPixelAspectRatio_Square},
	{kPixelFormatCompression_PALDV100_720p,    960,  720, 288'000, kPixelAspectRatio_Square,           kPixelAspectRatio_Square},
	{kPixelFormatCompression_NTSCDV100_1080i, 1280, 1080, 480'000, kPixelAspectRatio_DVCProHD,         kPixelAspectRatio_DVCProHD},
	{kPixelFormatCompression_PALDV100_1080i,  1440, 1080, 576'000, kPixelAspectRatio_HDAnamorphic1080, kPixelAspectRatio_HDAnamorphic1080},
});
// clang-format on

// Rows by compression code, one for each that the field has room for; empty where a code is not DV.
constexpr auto sDVFramesByCompression = []
{
	std::array<DVFrame, 16> frames{};
	for (const DVFrame& frame : sDVFrames)
		frames.at(static_cast<std::size_t>(frame.mCompression)) = frame;
	return frames;
}();

constexpr const DVFrame& DVFrameOf(PixelFormatProperties inProperties)
{
	return sDVFramesByCompression[inProperties.Compression()];
}

// ---- Rows ------------------------------------------------------------------------------------------------------------

// Rounded up to a multiple of inMultiple, a power of two; wraps.
template <std::int32_t inMultiple>
constexpr std::int32_t AlignUp(std::int32_t inValue)
{
	static_assert(std::has_single_bit(static_cast<std::uint32_t>(inMultiple)));
	return WrappingAdd(inValue, inMultiple - 1) & -inMultiple;
}

// Bits stored for a component, by depth code; 15-bit components are stored in 16.
constexpr auto sBitsPerComponent = std::to_array<std::int32_t>({8, 10, 16, 16, 24, 32, 0, 0});

constexpr std::int32_t BitsPerComponent(PixelFormatProperties inProperties)
{
	return sBitsPerComponent[inProperties.BitDepth()];
}

constexpr bool IsPacked422(PixelFormatProperties inProperties)
{
	return inProperties.IsConcrete() && inProperties.Subsampling() == kPixelFormatSubsampling_422;
}

constexpr bool IsV210(PixelFormatProperties inProperties)
{
	return IsPacked422(inProperties) && !inProperties.IsCompressed() && inProperties.IsYUV()
		&& inProperties.BitDepth() == kPixelFormatBitDepth_10 && !inProperties.IsFloat();
}

// Six pixels stand in 16 bytes.
constexpr std::int32_t V210RowBytes(std::int32_t inWidth)
{
	const std::int32_t groups = WrappingAdd(inWidth, 5) / 6;
	return AlignUp<128>(WrappingMultiply(groups, 96) / 6);
}

constexpr std::int32_t Packed422BytesPerPixel(PixelFormatProperties inProperties)
{
	const std::int32_t bits = BitsPerComponent(inProperties);
	return bits == 10 ? 0 : bits * 2 / 8;   // 10 bits are packed as v210 or not at all
}

constexpr std::int32_t BytesPerPixel(PixelFormatProperties inProperties)
{
	const std::int32_t bits = BitsPerComponent(inProperties);
	const bool is444 = inProperties.Subsampling() == kPixelFormatSubsampling_444;
	if (is444 && inProperties.Alpha() != kPixelFormatAlpha_None)
		return 4 * bits / 8;
	if (bits == 10)
		return 4;   // three components in 32 bits
	return is444 ? 3 * bits / 8 : 0;
}

constexpr std::int32_t RowBytes(PixelFormatProperties inProperties, std::int32_t inWidth)
{
	if (IsV210(inProperties))
		return V210RowBytes(inWidth);
	if (IsPacked422(inProperties))
		return AlignUp<16>(WrappingMultiply(Packed422BytesPerPixel(inProperties), inWidth));
	if (inProperties.IsConcrete() && !inProperties.IsCompressed())
		return AlignUp<64>(WrappingMultiply(BytesPerPixel(inProperties), inWidth));
	return 0;
}

// ---- Frames ----------------------------------------------------------------------------------------------------------

constexpr std::int64_t Planar420Bytes(std::int32_t inWidth, std::int32_t inHeight)
{
	// Two chroma planes of half the height are as large as one of the whole height.
	const std::int32_t pitches = WrappingAdd(AlignUp<128>(inWidth), AlignUp<128>(inWidth / 2));
	return std::int64_t{pitches} * AlignUp<32>(inHeight);
}

}   // namespace

std::int64_t PixelFormatSize(PixelFormat inFormat, int inWidth, int inHeight) noexcept
{
	const PixelFormatProperties properties = inFormat.mProperties;
	if (properties.IsDV())
		return DVFrameOf(properties).mBytes;
	if (properties.IsMPEG() && properties.IsYUV() && properties.Subsampling() == kPixelFormatSubsampling_420)
		return Planar420Bytes(inWidth, inHeight);
	if (properties.IsConcrete() && !properties.IsCompressed())
		return std::int64_t{inHeight} * RowBytes(properties, inWidth);
	return 0;
}

std::int64_t UncompressedPixelFormatRowBytes(PixelFormat inFormat, int inWidth) noexcept
{
	return RowBytes(inFormat.mProperties, inWidth);
}

void FixedSizedFormatDimensions(PixelFormat inFormat, int& outWidth, int& outHeight) noexcept
{
	if (!inFormat.mProperties.IsDV())
		return;
	outWidth = DVFrameOf(inFormat.mProperties).mWidth;
	outHeight = DVFrameOf(inFormat.mProperties).mHeight;
}

bool IsRectValidForFormat(PixelFormat inFormat, int inWidth, int inHeight, PixelAspectRatio inRatio) noexcept
{
	if (!inFormat.mProperties.IsDV())
		return true;
	const DVFrame& frame = DVFrameOf(inFormat.mProperties);
	return inWidth == frame.mWidth && inHeight == frame.mHeight
		&& (inRatio == frame.mShape || inRatio == frame.mOtherShape);
}

}   // namespace zonmediatypes
