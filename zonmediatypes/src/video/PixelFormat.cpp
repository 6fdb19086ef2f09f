#include "zonmediatypes/PixelFormat.h"

#include "zoncore/SmallBlockAllocator.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/src/video/PerfectIndex.h"
#include "zonmediatypes/src/video/PixelFormatFacts.h"
#include "zonmediatypes/src/video/RegistryMutex.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <mutex>
#include <string_view>

// The facts' own short words, in this file only.
using namespace zonmediatypes;
using namespace zonmediatypes::catalogue;

// ---- The catalogue ---------------------------------------------------------------------------------------------------

// clang-format off
#define ZON_PIXEL_FORMATS(Row)                                                                                                 \
	Row(VUYA_4444_8u,                                        YUV, D8u,  Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_8u_709,                                    YUV, D8u,  Rec709, Video, Straight,      C4444)                   \
	Row(VUYA_4444_15u,                                       YUV, D15u, Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_32f,                                       YUV, D32f, Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_32f_709,                                   YUV, D32f, Rec709, Video, Straight,      C4444)                   \
	Row(VUYX_4444_8u,                                        YUV, D8u,  Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_8u_709,                                    YUV, D8u,  Rec709, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_15u,                                       YUV, D15u, Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_32f,                                       YUV, D32f, Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_32f_709,                                   YUV, D32f, Rec709, Video, Ignored,       C4444)                   \
	Row(VUYP_4444_8u,                                        YUV, D8u,  Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_8u_709,                                    YUV, D8u,  Rec709, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_15u,                                       YUV, D15u, Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_32f,                                       YUV, D32f, Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_32f_709,                                   YUV, D32f, Rec709, Video, Premultiplied, C4444)                   \
	Row(BGRA_4444_8u,                                        RGB, D8u,  Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_15u,                                       RGB, D15u, Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_32f,                                       RGB, D32f, Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Straight,      C4444, Usual,    Linear) \
	Row(BGRX_4444_8u,                                        RGB, D8u,  Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_15u,                                       RGB, D15u, Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_32f,                                       RGB, D32f, Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Ignored,       C4444, Usual,    Linear) \
	Row(BGRP_4444_8u,                                        RGB, D8u,  Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_15u,                                       RGB, D15u, Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_32f,                                       RGB, D32f, Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Premultiplied, C4444, Usual,    Linear) \
	Row(ARGB_4444_8u,                                        RGB, D8u,  Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_15u,                                       RGB, D15u, Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_32f,                                       RGB, D32f, Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Straight,      C4444, Reversed, Linear) \
	Row(XRGB_4444_8u,                                        RGB, D8u,  Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_15u,                                       RGB, D15u, Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_32f,                                       RGB, D32f, Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Ignored,       C4444, Reversed, Linear) \
	Row(PRGB_4444_8u,                                        RGB, D8u,  Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_15u,                                       RGB, D15u, Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_32f,                                       RGB, D32f, Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_32f_Linear,                                RGB, D32f, Rec601, Full,  Premultiplied, C4444, Reversed, Linear) \
	Row(RGB_444_10u,                                         RGB, D10u, Rec601, Full,  None,          C444)                    \
	Row(UYVY_422_8u,                                         YUV, D8u,  Rec601, Video, None,          C422)                    \
	Row(UYVY_422_8u_709,                                     YUV, D8u,  Rec709, Video, None,          C422)                    \
	Row(UYVY_422_32f,                                        YUV, D32f, Rec601, Video, None,          C422)                    \
	Row(UYVY_422_32f_709,                                    YUV, D32f, Rec709, Video, None,          C422)                    \
	Row(YUYV_422_8u,                                         YUV, D8u,  Rec601, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_8u_709,                                     YUV, D8u,  Rec709, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_32f,                                        YUV, D32f, Rec601, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_32f_709,                                    YUV, D32f, Rec709, Video, None,          C422,  Reversed)         \
	Row(V210_422_10u,                                        YUV, D10u, Rec601, Video, None,          C422)                    \
	Row(V210_422_10u_709,                                    YUV, D10u, Rec709, Video, None,          C422)                    \
	Row(NTSCDV25,                                            YUV, D8u,  Rec601, Video, None,          DV,    NTSCDV25)         \
	Row(PALDV25,                                             YUV, D8u,  Rec601, Video, None,          DV,    PALDV25)          \
	Row(NTSCDV50,                                            YUV, D8u,  Rec601, Video, None,          DV,    NTSCDV50)         \
	Row(PALDV50,                                             YUV, D8u,  Rec601, Video, None,          DV,    PALDV50)          \
	Row(NTSC_DV100_720p,                                     YUV, D8u,  Rec709, Video, None,          DV,    NTSCDV100_720p)   \
	Row(PAL_DV100_720p,                                      YUV, D8u,  Rec709, Video, None,          DV,    PALDV100_720p)    \
	Row(NTSC_DV100_1080i,                                    YUV, D8u,  Rec709, Video, None,          DV,    NTSCDV100_1080i)  \
	Row(PAL_DV100_1080i,                                     YUV, D8u,  Rec709, Video, None,          DV,    PALDV100_1080i)   \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601,           YUV, D8u,  Rec601, Video, None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601,           YUV, D8u,  Rec601, Video, None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange, YUV, D8u,  Rec601, Full,  None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange, YUV, D8u,  Rec601, Full,  None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709,           YUV, D8u,  Rec709, Video, None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709,           YUV, D8u,  Rec709, Video, None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange, YUV, D8u,  Rec709, Full,  None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange, YUV, D8u,  Rec709, Full,  None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601,           YUV, D8u,  Rec601, Video, None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601,           YUV, D8u,  Rec601, Video, None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange, YUV, D8u,  Rec601, Full,  None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange, YUV, D8u,  Rec601, Full,  None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709,           YUV, D8u,  Rec709, Video, None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709,           YUV, D8u,  Rec709, Video, None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange, YUV, D8u,  Rec709, Full,  None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange, YUV, D8u,  Rec709, Full,  None,          C420,  MPEG4Frame)
// clang-format on

// Qualified, so that a row without its declaration in the header does not compile.
#define ZON_DEFINE(inName, ...)                                                                                        \
	constexpr PixelFormat zonmediatypes::kPixelFormat_##inName                                                         \
		= Format(Row(#inName, kPixelFormatFourCC_##inName, __VA_ARGS__));
ZON_PIXEL_FORMATS(ZON_DEFINE)
#undef ZON_DEFINE

constexpr PixelFormat zonmediatypes::kPixelFormat_Invalid;
constexpr PixelFormat zonmediatypes::kPixelFormat_Any{kPixelFormatFourCC_Any, kPixelFormatProperties_Any};

namespace zonmediatypes
{
namespace
{

#define ZON_FORMAT(inName, ...) kPixelFormat_##inName,
#define ZON_NAME(inName, ...) #inName,
constexpr auto sAllPixelFormats = std::to_array<PixelFormat>({ZON_PIXEL_FORMATS(ZON_FORMAT)});
constexpr auto sCatalogueNames = std::to_array<std::string_view>({ZON_PIXEL_FORMATS(ZON_NAME)});
#undef ZON_FORMAT
#undef ZON_NAME

// A name in two rows, or in that of the wildcard, does not compile; one without a row is told by -Wswitch.
#define ZON_CASE(inName, ...) case kPixelFormatFourCC_##inName:
[[maybe_unused]] constexpr bool IsBuiltIn(PixelFormatName inName)
{
	switch (inName)
	{
		ZON_PIXEL_FORMATS(ZON_CASE)
		return true;
	case kPixelFormatFourCC_Any:
	case kPixelFormatFourCC_Invalid:
		break;
	}
	return false;
}
#undef ZON_CASE
#undef ZON_PIXEL_FORMATS

// ---- Indices ---------------------------------------------------------------------------------------------------------

constexpr std::uint32_t NameOf(PixelFormat inFormat)
{
	return inFormat.mName;
}

constexpr std::uint32_t PropertiesOf(PixelFormat inFormat)
{
	return inFormat.mProperties.GetValue();
}

template <class KeyOf>
consteval auto Keys(KeyOf inKeyOf)
{
	std::array<std::uint32_t, sAllPixelFormats.size()> keys{};
	std::ranges::transform(sAllPixelFormats, keys.begin(), inKeyOf);
	return keys;
}

// Building an index shows that its keys are distinct: the first match is the only one.
constexpr PerfectIndex<512> sIndexByName(Keys(NameOf));
constexpr PerfectIndex<512> sIndexByProperties(Keys(PropertiesOf));

static_assert(sAllPixelFormats.size() == 74);
static_assert(std::ranges::none_of(sAllPixelFormats, IsCustomPixelFormatName, &PixelFormat::mName));

// ---- Custom formats --------------------------------------------------------------------------------------------------

class CustomPixelFormats
{
public:
	static CustomPixelFormats& Get()
	{
		static CustomPixelFormats sFormats;
		return sFormats;
	}

	void Register(unsigned int inName, PixelFormatProperties inProperties)
	{
		// Memory is taken and given back without the lock, since that may take a lock of its own.
		Registry added;
		added.emplace(inName, inProperties);
		const std::lock_guard lock(mMutex);
		mRegistry.merge(added);
		if (!added.empty())
			mRegistry.find(inName)->second = inProperties;
	}

	PixelFormatProperties Lookup(unsigned int inName) const
	{
		const std::lock_guard lock(mMutex);
		const auto found = mRegistry.find(inName);
		return found == mRegistry.end() ? kPixelFormatProperties_Invalid : found->second;
	}

private:
	using Registry = zoncore::utility::SmallBlockAllocator::map<unsigned int, PixelFormatProperties>;

	mutable RegistryMutex mMutex;
	Registry mRegistry;
};

// Made at load, or earlier for the static initialiser of a host that the library is linked into.
[[maybe_unused]] CustomPixelFormats& sCustomPixelFormats = CustomPixelFormats::Get();

}   // namespace

const PixelFormat* AllPixelFormatsBegin() noexcept
{
	return sAllPixelFormats.data();
}

const PixelFormat* AllPixelFormatsEnd() noexcept
{
	return sAllPixelFormats.data() + sAllPixelFormats.size();
}

std::string_view PixelFormatCatalogueName(PixelFormat inFormat) noexcept
{
	const std::size_t place = sIndexByName.Find(inFormat.mName);
	return sAllPixelFormats[place] == inFormat ? sCatalogueNames[place] : std::string_view();
}

void RegisterCustomPixelFormatProperties(unsigned int inName, PixelFormatProperties inProperties)
{
	CustomPixelFormats::Get().Register(inName, inProperties);
}

PixelFormatProperties LookupPropertiesForName(PixelFormatName inName)
{
	if (inName == kPixelFormatFourCC_Any)
		return kPixelFormatProperties_Any;
	if (IsCustomPixelFormatName(inName))
		return CustomPixelFormats::Get().Lookup(inName);
	const PixelFormat candidate = sAllPixelFormats[sIndexByName.Find(inName)];
	return candidate.mName == inName ? candidate.mProperties : kPixelFormatProperties_Invalid;
}

PixelFormatName GuessNameForProperties(PixelFormatProperties inProperties) noexcept
{
	if (inProperties.Kind() == kPixelFormatKind_Any)
		return kPixelFormatFourCC_Any;
	// Invalid properties and unknown compression stand in no row.
	const PixelFormat candidate = sAllPixelFormats[sIndexByProperties.Find(inProperties.GetValue())];
	return candidate.mProperties == inProperties ? candidate.mName : kPixelFormatFourCC_Invalid;
}

}   // namespace zonmediatypes
