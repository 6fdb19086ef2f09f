#pragma once

/// \file
/// Pixel formats: a four-character code and the properties that it stands for.
///
/// The code's characters are read from the least significant byte up: "vuya" is 0x61797576. A code whose first character
/// is "_" or "@" names a custom format, whose properties the host registers (PixelFormatUtils.h).
///
///     const PixelFormat format = kPixelFormat_BGRA_4444_8u;
///     format.mName == MakePixelFormatName('b', 'g', 'r', 'a');   // true
///     format.mProperties.HasAlpha();                             // true
///
/// Formats are plain values of eight bytes, passed by value. Constants are initialised before any code runs and may be
/// used in every static initialiser.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelFormatProperties.h"

#include <cstdint>
#include <ostream>

namespace zonmediatypes
{

// ---- Names -----------------------------------------------------------------------------------------------------------

/// A four-character code; every 32-bit value is one.
enum PixelFormatName : std::uint32_t
{
	kPixelFormatFourCC_Any = 0,                ///< the wildcard
	kPixelFormatFourCC_Invalid = 0x66646162,   ///< "badf": no valid format
};

/// The code that reads as these four characters.
constexpr PixelFormatName MakePixelFormatName(char inFirst, char inSecond, char inThird, char inFourth) noexcept;

/// Whether the first character is "_" or "@": the name of a custom format.
constexpr bool IsCustomPixelFormatName(PixelFormatName inName) noexcept;

// ---- Formats ---------------------------------------------------------------------------------------------------------

/// A name with its properties. Equal when both are, in all bits.
struct PixelFormat
{
	PixelFormatName mName = kPixelFormatFourCC_Invalid;
	PixelFormatProperties mProperties;

	friend constexpr bool operator==(PixelFormat, PixelFormat) noexcept = default;
};

/// Writes PixelFormatDescription (Descriptions.h) as the stream's own text inserter does, width and fill included; the
/// `char` stream receives UTF-8 up to the first zero.
ZONMEDIATYPES_API std::ostream& operator<<(std::ostream& ioStream, const PixelFormat& inFormat);
ZONMEDIATYPES_API std::basic_ostream<zoncore::UTF16Char>& operator<<(
	std::basic_ostream<zoncore::UTF16Char>& ioStream, const PixelFormat& inFormat);

// ---- Constants -------------------------------------------------------------------------------------------------------
//
// kPixelFormat_ + components from the first byte on + chroma + depth; A is straight alpha, P premultiplied, X ignored.
// YUV is video range and Rec. 601 unless the name says otherwise; DV 100 is Rec. 709.

ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_Invalid;   ///< "badf"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_Any;       ///< four zero bytes

ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_8u;                                ///< "vuya"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_8u_709;                            ///< "vuyA"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_15u;                               ///< "Vuya"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_32f;                               ///< "VUya"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_32f_709;                           ///< "VUyA"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_8u;                                ///< "vuyx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_8u_709;                            ///< "vuyX"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_15u;                               ///< "Vuyx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_32f;                               ///< "VUyx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_32f_709;                           ///< "VUyX"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_8u;                                ///< "vuyp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_8u_709;                            ///< "vuyP"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_15u;                               ///< "Vuyp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_32f;                               ///< "VUyp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_32f_709;                           ///< "VUyP"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_8u;                                ///< "bgra"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_15u;                               ///< "Bgra"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_32f;                               ///< "BGra"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_32f_Linear;                        ///< "BGLa"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_8u;                                ///< "bgrx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_15u;                               ///< "Bgrx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_32f;                               ///< "BGrx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_32f_Linear;                        ///< "BGLx"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_8u;                                ///< "bgrp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_15u;                               ///< "Bgrp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_32f;                               ///< "BGrp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_32f_Linear;                        ///< "BGLp"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_8u;                                ///< "argb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_15u;                               ///< "Argb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_32f;                               ///< "ARgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_32f_Linear;                        ///< "ARLb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_8u;                                ///< "xrgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_15u;                               ///< "Xrgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_32f;                               ///< "XRgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_32f_Linear;                        ///< "XRLb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_8u;                                ///< "prgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_15u;                               ///< "Prgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_32f;                               ///< "PRgb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_32f_Linear;                        ///< "PRLb"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_RGB_444_10u;                                 ///< "r210"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_8u;                                 ///< "uyvy"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_8u_709;                             ///< "uyv7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_32f;                                ///< "UYvy"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_32f_709;                            ///< "UYv7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_8u;                                 ///< "yuy2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_8u_709;                             ///< "yuy3"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_32f;                                ///< "YUy2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_32f_709;                            ///< "YUy3"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_V210_422_10u;                                ///< "v210"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_V210_422_10u_709;                            ///< "v211"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSCDV25;                                    ///< "dvn2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PALDV25;                                     ///< "dvp2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSCDV50;                                    ///< "dvn5"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PALDV50;                                     ///< "dvp5"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSC_DV100_720p;                             ///< "dvn7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PAL_DV100_720p;                              ///< "dvp7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSC_DV100_1080i;                            ///< "dvn1"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PAL_DV100_1080i;                             ///< "dvp1"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601;   ///< "yvi2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;   ///< "yv12"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange;   ///< "yvif"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange;                                ///< "yv1f"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709;   ///< "yvi7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709;   ///< "yv17"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange;   ///< "yviF"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange;                                ///< "yv1F"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601;   ///< "Yvi2"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601;   ///< "Yv12"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange;   ///< "Yvif"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange;                                ///< "Yv1f"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709;   ///< "Yvi7"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709;   ///< "Yv17"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange;   ///< "YviF"
ZONMEDIATYPES_API extern const PixelFormat
	kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange;   ///< "Yv1F"

// ======================================================================================================================
// Inline implementation
// ======================================================================================================================

constexpr PixelFormatName MakePixelFormatName(char inFirst, char inSecond, char inThird, char inFourth) noexcept
{
	const auto at = [](char inCharacter, unsigned inPosition)
	{ return std::uint32_t{static_cast<unsigned char>(inCharacter)} << 8 * inPosition; };
	return static_cast<PixelFormatName>(at(inFirst, 0) | at(inSecond, 1) | at(inThird, 2) | at(inFourth, 3));
}

constexpr bool IsCustomPixelFormatName(PixelFormatName inName) noexcept
{
	const std::uint32_t first = std::uint32_t{inName} & 0xFF;
	return first == '_' || first == '@';
}

static_assert(MakePixelFormatName('b', 'a', 'd', 'f') == kPixelFormatFourCC_Invalid);

}   // namespace zonmediatypes
