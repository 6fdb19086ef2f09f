#pragma once

#include "zonmediatypes/FieldType.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormatProperties.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/src/text/TextKeys.h"

#include <array>
#include <string_view>

namespace zonmediatypes
{

inline constexpr auto kRenderQualityKeys = std::to_array<KeyFor<RenderQuality>>({
	{kRenderQuality_Draft, "$$$/zonmediatypes/RenderQuality/Draft=Draft"},
	{kRenderQuality_Low, "$$$/zonmediatypes/RenderQuality/Low=Low"},
	{kRenderQuality_Medium, "$$$/zonmediatypes/RenderQuality/Medium=Medium"},
	{kRenderQuality_High, "$$$/zonmediatypes/RenderQuality/High=High"},
	{kRenderQuality_Max, "$$$/zonmediatypes/RenderQuality/Max=Max"},
});

// "Invald" is deliberate: translations are found by it.
inline constexpr auto kFieldTypeKeys = std::to_array<KeyFor<FieldType>>({
	{kFieldType_Invalid, "$$$/zonmediatypes/FieldType/Invald=Field Presence Unknown"},
	{kFieldType_NoFields, "$$$/zonmediatypes/FieldType/NoFields=No Fields (Progressive Scan)"},
	{kFieldType_UpperFirst, "$$$/zonmediatypes/FieldType/UpperFirst=Upper Field First"},
	{kFieldType_LowerFirst, "$$$/zonmediatypes/FieldType/LowerFirst=Lower Field First"},
	{kFieldType_UnknownDominance, "$$$/zonmediatypes/FieldType/UnknownDominance=Fields (Unknown Dominance)"},
	{kFieldType_Any, "$$$/zonmediatypes/FieldType/Any=Any Field Order"},
});

inline constexpr std::string_view kAnyPixelFormatKey = "$$$/zonmediatypes/PixelFormat/Any=Any Pixel Format";
inline constexpr std::string_view kCustomPixelFormatKey
	= "$$$/zonmediatypes/PixelFormat/Custom=Custom Pixel Format (@0)";
inline constexpr std::string_view kUnknownPixelFormatKey = "$$$/zonmediatypes/PixelFormat/Unknown=Unknown Pixel Format";
inline constexpr std::string_view kUnknownCompressedKey
	= "$$$/zonmediatypes/PixelFormat/UnknownCompressed=Unknown Compressed Pixel Format (@0)";
inline constexpr std::string_view kLinearKey = "$$$/zonmediatypes/PixelFormat/Linear=Linear";

inline constexpr auto kMPEGKeys = std::to_array<KeyFor<PixelFormatCompression>>({
	{kPixelFormatCompression_MPEG2Field, "$$$/zonmediatypes/PixelFormat/MPEG2Field=YUV 420 MPEG2 Field 8u"},
	{kPixelFormatCompression_MPEG2Frame, "$$$/zonmediatypes/PixelFormat/MPEG2Frame=YUV 420 MPEG2 Frame 8u"},
	{kPixelFormatCompression_MPEG4Field, "$$$/zonmediatypes/PixelFormat/MPEG4Field=YUV 420 MPEG4 Field 8u"},
	{kPixelFormatCompression_MPEG4Frame, "$$$/zonmediatypes/PixelFormat/MPEG4Frame=YUV 420 MPEG4 Frame 8u"},
});

// In the order of comparison, which is tolerant: the first match counts.
inline constexpr auto kPixelAspectRatioKeys = std::to_array<KeyFor<PixelAspectRatio>>({
	{kPixelAspectRatio_Square, "$$$/zonmediatypes/PixelAspectRatioFormat/Square=Square Pixels (@0)"},
	{kPixelAspectRatio_DVNTSC, "$$$/zonmediatypes/PixelAspectRatioFormat/D1NTSC=D1/DV NTSC (@0)"},
	{kPixelAspectRatio_DVNTSCWide,
		"$$$/zonmediatypes/PixelAspectRatioFormat/D1NTSCWideScreen=D1/DV NTSC Widescreen 16:9 (@0)"},
	{kPixelAspectRatio_DVPAL, "$$$/zonmediatypes/PixelAspectRatioFormat/D1PAL=D1/DV PAL (@0)"},
	{kPixelAspectRatio_DVPALWide, "$$$/zonmediatypes/PixelAspectRatioFormat/D1PALWide=D1/DV PAL Widescreen 16:9 (@0)"},
	{kPixelAspectRatio_Anamorphic, "$$$/zonmediatypes/PixelAspectRatioFormat/Anamorphic=Anamorphic 2:1 (@0)"},
	{kPixelAspectRatio_HDAnamorphic1080,
		"$$$/zonmediatypes/PixelAspectRatioFormat/HDAnamorphic1080=HD Anamorphic 1080 (@0)"},
	{kPixelAspectRatio_DVCProHD, "$$$/zonmediatypes/PixelAspectRatioFormat/DVCProHD=DVCPRO HD (@0)"},
});
inline constexpr std::string_view kOtherRatioKey
	= "$$$/zonmediatypes/PixelAspectRatioFormat/Other=Other Aspect Ratio (@0)";

inline constexpr std::string_view kFrameSizeKey = "$$$/zonmediatypes/VideoFrameSizeFormat=@0w @1h";
inline constexpr std::string_view kFrameSizeWithRatioKey = "$$$/zonmediatypes/VideoFrameSizeFormatPAR=@0w @1h (@2)";

inline constexpr auto kVideoTextKeys = JoinKeys(KeysOf(kRenderQualityKeys), KeysOf(kFieldTypeKeys),
	std::to_array(
		{kAnyPixelFormatKey, kCustomPixelFormatKey, kUnknownPixelFormatKey, kUnknownCompressedKey, kLinearKey}),
	KeysOf(kMPEGKeys), KeysOf(kPixelAspectRatioKeys),
	std::to_array({kOtherRatioKey, kFrameSizeKey, kFrameSizeWithRatioKey}));

}   // namespace zonmediatypes
