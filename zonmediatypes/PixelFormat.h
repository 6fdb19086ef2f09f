#pragma once

/// \file
/// Pixel formats: a four-character code and the properties that it stands for.
///
/// The code's characters are read from the least significant byte up: "vuya" is 0x61797576. A code whose first character
/// is "_" or "@" names a custom format, whose properties the host registers (PixelFormatUtils.h).
///
///     const PixelFormat format = kPixelFormat_BGRA_4444_8u;
///     format.mName == kPixelFormatFourCC_BGRA_4444_8u;   // true
///     format.mName == MakePixelFormatName("bgra");       // true
///     format.mProperties.HasAlpha();                     // true
///
/// Formats are plain values of eight bytes, passed by value. Constants are initialised before any code runs and may be
/// used in every static initialiser.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelFormatProperties.h"

#include <cstdint>
#include <iosfwd>

namespace zonmediatypes
{

// ---- Names -----------------------------------------------------------------------------------------------------------

/// A four-character code; every 32-bit value is one.
enum PixelFormatName : std::uint32_t;

/// The code that reads as these four characters.
constexpr PixelFormatName MakePixelFormatName(char inFirst, char inSecond, char inThird, char inFourth) noexcept
{
	const auto at = [](char inCharacter, unsigned inPosition)
	{ return std::uint32_t{static_cast<unsigned char>(inCharacter)} << 8 * inPosition; };
	return static_cast<PixelFormatName>(at(inFirst, 0) | at(inSecond, 1) | at(inThird, 2) | at(inFourth, 3));
}
constexpr PixelFormatName MakePixelFormatName(const char (&inCode)[5]) noexcept
{
	return MakePixelFormatName(inCode[0], inCode[1], inCode[2], inCode[3]);
}

/// The names of the formats below; each may be a `case` label.
// clang-format off
enum PixelFormatName : std::uint32_t
{
	kPixelFormatFourCC_Any = 0,                                 ///< the wildcard
	kPixelFormatFourCC_Invalid = MakePixelFormatName("badf"),   ///< no valid format

	kPixelFormatFourCC_VUYA_4444_8u                                        = MakePixelFormatName("vuya"),
	kPixelFormatFourCC_VUYA_4444_8u_709                                    = MakePixelFormatName("vuyA"),
	kPixelFormatFourCC_VUYA_4444_15u                                       = MakePixelFormatName("Vuya"),
	kPixelFormatFourCC_VUYA_4444_32f                                       = MakePixelFormatName("VUya"),
	kPixelFormatFourCC_VUYA_4444_32f_709                                   = MakePixelFormatName("VUyA"),
	kPixelFormatFourCC_VUYX_4444_8u                                        = MakePixelFormatName("vuyx"),
	kPixelFormatFourCC_VUYX_4444_8u_709                                    = MakePixelFormatName("vuyX"),
	kPixelFormatFourCC_VUYX_4444_15u                                       = MakePixelFormatName("Vuyx"),
	kPixelFormatFourCC_VUYX_4444_32f                                       = MakePixelFormatName("VUyx"),
	kPixelFormatFourCC_VUYX_4444_32f_709                                   = MakePixelFormatName("VUyX"),
	kPixelFormatFourCC_VUYP_4444_8u                                        = MakePixelFormatName("vuyp"),
	kPixelFormatFourCC_VUYP_4444_8u_709                                    = MakePixelFormatName("vuyP"),
	kPixelFormatFourCC_VUYP_4444_15u                                       = MakePixelFormatName("Vuyp"),
	kPixelFormatFourCC_VUYP_4444_32f                                       = MakePixelFormatName("VUyp"),
	kPixelFormatFourCC_VUYP_4444_32f_709                                   = MakePixelFormatName("VUyP"),
	kPixelFormatFourCC_BGRA_4444_8u                                        = MakePixelFormatName("bgra"),
	kPixelFormatFourCC_BGRA_4444_15u                                       = MakePixelFormatName("Bgra"),
	kPixelFormatFourCC_BGRA_4444_32f                                       = MakePixelFormatName("BGra"),
	kPixelFormatFourCC_BGRA_4444_32f_Linear                                = MakePixelFormatName("BGLa"),
	kPixelFormatFourCC_BGRX_4444_8u                                        = MakePixelFormatName("bgrx"),
	kPixelFormatFourCC_BGRX_4444_15u                                       = MakePixelFormatName("Bgrx"),
	kPixelFormatFourCC_BGRX_4444_32f                                       = MakePixelFormatName("BGrx"),
	kPixelFormatFourCC_BGRX_4444_32f_Linear                                = MakePixelFormatName("BGLx"),
	kPixelFormatFourCC_BGRP_4444_8u                                        = MakePixelFormatName("bgrp"),
	kPixelFormatFourCC_BGRP_4444_15u                                       = MakePixelFormatName("Bgrp"),
	kPixelFormatFourCC_BGRP_4444_32f                                       = MakePixelFormatName("BGrp"),
	kPixelFormatFourCC_BGRP_4444_32f_Linear                                = MakePixelFormatName("BGLp"),
	kPixelFormatFourCC_ARGB_4444_8u                                        = MakePixelFormatName("argb"),
	kPixelFormatFourCC_ARGB_4444_15u                                       = MakePixelFormatName("Argb"),
	kPixelFormatFourCC_ARGB_4444_32f                                       = MakePixelFormatName("ARgb"),
	kPixelFormatFourCC_ARGB_4444_32f_Linear                                = MakePixelFormatName("ARLb"),
	kPixelFormatFourCC_XRGB_4444_8u                                        = MakePixelFormatName("xrgb"),
	kPixelFormatFourCC_XRGB_4444_15u                                       = MakePixelFormatName("Xrgb"),
	kPixelFormatFourCC_XRGB_4444_32f                                       = MakePixelFormatName("XRgb"),
	kPixelFormatFourCC_XRGB_4444_32f_Linear                                = MakePixelFormatName("XRLb"),
	kPixelFormatFourCC_PRGB_4444_8u                                        = MakePixelFormatName("prgb"),
	kPixelFormatFourCC_PRGB_4444_15u                                       = MakePixelFormatName("Prgb"),
	kPixelFormatFourCC_PRGB_4444_32f                                       = MakePixelFormatName("PRgb"),
	kPixelFormatFourCC_PRGB_4444_32f_Linear                                = MakePixelFormatName("PRLb"),
	kPixelFormatFourCC_RGB_444_10u                                         = MakePixelFormatName("r210"),
	kPixelFormatFourCC_UYVY_422_8u                                         = MakePixelFormatName("uyvy"),
	kPixelFormatFourCC_UYVY_422_8u_709                                     = MakePixelFormatName("uyv7"),
	kPixelFormatFourCC_UYVY_422_32f                                        = MakePixelFormatName("UYvy"),
	kPixelFormatFourCC_UYVY_422_32f_709                                    = MakePixelFormatName("UYv7"),
	kPixelFormatFourCC_YUYV_422_8u                                         = MakePixelFormatName("yuy2"),
	kPixelFormatFourCC_YUYV_422_8u_709                                     = MakePixelFormatName("yuy3"),
	kPixelFormatFourCC_YUYV_422_32f                                        = MakePixelFormatName("YUy2"),
	kPixelFormatFourCC_YUYV_422_32f_709                                    = MakePixelFormatName("YUy3"),
	kPixelFormatFourCC_V210_422_10u                                        = MakePixelFormatName("v210"),
	kPixelFormatFourCC_V210_422_10u_709                                    = MakePixelFormatName("v211"),
	kPixelFormatFourCC_NTSCDV25                                            = MakePixelFormatName("dvn2"),
	kPixelFormatFourCC_PALDV25                                             = MakePixelFormatName("dvp2"),
	kPixelFormatFourCC_NTSCDV50                                            = MakePixelFormatName("dvn5"),
	kPixelFormatFourCC_PALDV50                                             = MakePixelFormatName("dvp5"),
	kPixelFormatFourCC_NTSC_DV100_720p                                     = MakePixelFormatName("dvn7"),
	kPixelFormatFourCC_PAL_DV100_720p                                      = MakePixelFormatName("dvp7"),
	kPixelFormatFourCC_NTSC_DV100_1080i                                    = MakePixelFormatName("dvn1"),
	kPixelFormatFourCC_PAL_DV100_1080i                                     = MakePixelFormatName("dvp1"),
	kPixelFormatFourCC_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601           = MakePixelFormatName("yvi2"),
	kPixelFormatFourCC_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601           = MakePixelFormatName("yv12"),
	kPixelFormatFourCC_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange = MakePixelFormatName("yvif"),
	kPixelFormatFourCC_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange = MakePixelFormatName("yv1f"),
	kPixelFormatFourCC_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709           = MakePixelFormatName("yvi7"),
	kPixelFormatFourCC_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709           = MakePixelFormatName("yv17"),
	kPixelFormatFourCC_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange = MakePixelFormatName("yviF"),
	kPixelFormatFourCC_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange = MakePixelFormatName("yv1F"),
	kPixelFormatFourCC_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601           = MakePixelFormatName("Yvi2"),
	kPixelFormatFourCC_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601           = MakePixelFormatName("Yv12"),
	kPixelFormatFourCC_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange = MakePixelFormatName("Yvif"),
	kPixelFormatFourCC_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange = MakePixelFormatName("Yv1f"),
	kPixelFormatFourCC_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709           = MakePixelFormatName("Yvi7"),
	kPixelFormatFourCC_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709           = MakePixelFormatName("Yv17"),
	kPixelFormatFourCC_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange = MakePixelFormatName("YviF"),
	kPixelFormatFourCC_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange = MakePixelFormatName("Yv1F"),
};
// clang-format on

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
ZONMEDIATYPES_API zoncore::UTF16OutputStream& operator<<(
	zoncore::UTF16OutputStream& ioStream, const PixelFormat& inFormat);

// ---- Constants -------------------------------------------------------------------------------------------------------
//
// kPixelFormat_ + components from the first byte on + chroma + depth; A is straight alpha, P premultiplied, X ignored.
// YUV is video range and Rec. 601 unless the name says otherwise; DV 100 is Rec. 709.

ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_Invalid;   ///< "badf"
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_Any;       ///< four zero bytes

ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYA_4444_32f_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYX_4444_32f_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_VUYP_4444_32f_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRA_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRX_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_BGRP_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_ARGB_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_XRGB_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_15u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PRGB_4444_32f_Linear;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_RGB_444_10u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_UYVY_422_32f_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_8u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_32f;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUYV_422_32f_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_V210_422_10u;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_V210_422_10u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSCDV25;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PALDV25;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSCDV50;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PALDV50;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSC_DV100_720p;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PAL_DV100_720p;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_NTSC_DV100_1080i;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_PAL_DV100_1080i;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange;
ZONMEDIATYPES_API extern const PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange;

// ---- Inline implementation -------------------------------------------------------------------------------------------

constexpr bool IsCustomPixelFormatName(PixelFormatName inName) noexcept
{
	const std::uint32_t first = std::uint32_t{inName} & 0xFF;
	return first == '_' || first == '@';
}

}   // namespace zonmediatypes
