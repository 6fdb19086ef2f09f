#include "zonmediatypes/PixelFormat.h"

#include "zoncore/SmallBlockAllocator.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/src/video/PerfectIndex.h"
#include "zonmediatypes/src/video/PixelFormatFacts.h"

#include <algorithm>
#include <array>
#include <boost/thread/lock_guard.hpp>
#include <boost/thread/mutex.hpp>
#include <cstddef>
#include <cstdint>
#include <string_view>

// The facts' own short words, in this file only.
using namespace zonmediatypes;
using namespace zonmediatypes::catalogue;

// ---- The catalogue ---------------------------------------------------------------------------------------------------

// clang-format off
#define ZON_PIXEL_FORMATS(Row)                                                                                                         \
	Row(VUYA_4444_8u,                                        "vuya", YUV, D8u,  Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_8u_709,                                    "vuyA", YUV, D8u,  Rec709, Video, Straight,      C4444)                   \
	Row(VUYA_4444_15u,                                       "Vuya", YUV, D15u, Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_32f,                                       "VUya", YUV, D32f, Rec601, Video, Straight,      C4444)                   \
	Row(VUYA_4444_32f_709,                                   "VUyA", YUV, D32f, Rec709, Video, Straight,      C4444)                   \
	Row(VUYX_4444_8u,                                        "vuyx", YUV, D8u,  Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_8u_709,                                    "vuyX", YUV, D8u,  Rec709, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_15u,                                       "Vuyx", YUV, D15u, Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_32f,                                       "VUyx", YUV, D32f, Rec601, Video, Ignored,       C4444)                   \
	Row(VUYX_4444_32f_709,                                   "VUyX", YUV, D32f, Rec709, Video, Ignored,       C4444)                   \
	Row(VUYP_4444_8u,                                        "vuyp", YUV, D8u,  Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_8u_709,                                    "vuyP", YUV, D8u,  Rec709, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_15u,                                       "Vuyp", YUV, D15u, Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_32f,                                       "VUyp", YUV, D32f, Rec601, Video, Premultiplied, C4444)                   \
	Row(VUYP_4444_32f_709,                                   "VUyP", YUV, D32f, Rec709, Video, Premultiplied, C4444)                   \
	Row(BGRA_4444_8u,                                        "bgra", RGB, D8u,  Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_15u,                                       "Bgra", RGB, D15u, Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_32f,                                       "BGra", RGB, D32f, Rec601, Full,  Straight,      C4444)                   \
	Row(BGRA_4444_32f_Linear,                                "BGLa", RGB, D32f, Rec601, Full,  Straight,      C4444, Usual,    Linear) \
	Row(BGRX_4444_8u,                                        "bgrx", RGB, D8u,  Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_15u,                                       "Bgrx", RGB, D15u, Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_32f,                                       "BGrx", RGB, D32f, Rec601, Full,  Ignored,       C4444)                   \
	Row(BGRX_4444_32f_Linear,                                "BGLx", RGB, D32f, Rec601, Full,  Ignored,       C4444, Usual,    Linear) \
	Row(BGRP_4444_8u,                                        "bgrp", RGB, D8u,  Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_15u,                                       "Bgrp", RGB, D15u, Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_32f,                                       "BGrp", RGB, D32f, Rec601, Full,  Premultiplied, C4444)                   \
	Row(BGRP_4444_32f_Linear,                                "BGLp", RGB, D32f, Rec601, Full,  Premultiplied, C4444, Usual,    Linear) \
	Row(ARGB_4444_8u,                                        "argb", RGB, D8u,  Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_15u,                                       "Argb", RGB, D15u, Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_32f,                                       "ARgb", RGB, D32f, Rec601, Full,  Straight,      C4444, Reversed)         \
	Row(ARGB_4444_32f_Linear,                                "ARLb", RGB, D32f, Rec601, Full,  Straight,      C4444, Reversed, Linear) \
	Row(XRGB_4444_8u,                                        "xrgb", RGB, D8u,  Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_15u,                                       "Xrgb", RGB, D15u, Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_32f,                                       "XRgb", RGB, D32f, Rec601, Full,  Ignored,       C4444, Reversed)         \
	Row(XRGB_4444_32f_Linear,                                "XRLb", RGB, D32f, Rec601, Full,  Ignored,       C4444, Reversed, Linear) \
	Row(PRGB_4444_8u,                                        "prgb", RGB, D8u,  Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_15u,                                       "Prgb", RGB, D15u, Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_32f,                                       "PRgb", RGB, D32f, Rec601, Full,  Premultiplied, C4444, Reversed)         \
	Row(PRGB_4444_32f_Linear,                                "PRLb", RGB, D32f, Rec601, Full,  Premultiplied, C4444, Reversed, Linear) \
	Row(RGB_444_10u,                                         "r210", RGB, D10u, Rec601, Full,  None,          C444)                    \
	Row(UYVY_422_8u,                                         "uyvy", YUV, D8u,  Rec601, Video, None,          C422)                    \
	Row(UYVY_422_8u_709,                                     "uyv7", YUV, D8u,  Rec709, Video, None,          C422)                    \
	Row(UYVY_422_32f,                                        "UYvy", YUV, D32f, Rec601, Video, None,          C422)                    \
	Row(UYVY_422_32f_709,                                    "UYv7", YUV, D32f, Rec709, Video, None,          C422)                    \
	Row(YUYV_422_8u,                                         "yuy2", YUV, D8u,  Rec601, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_8u_709,                                     "yuy3", YUV, D8u,  Rec709, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_32f,                                        "YUy2", YUV, D32f, Rec601, Video, None,          C422,  Reversed)         \
	Row(YUYV_422_32f_709,                                    "YUy3", YUV, D32f, Rec709, Video, None,          C422,  Reversed)         \
	Row(V210_422_10u,                                        "v210", YUV, D10u, Rec601, Video, None,          C422)                    \
	Row(V210_422_10u_709,                                    "v211", YUV, D10u, Rec709, Video, None,          C422)                    \
	Row(NTSCDV25,                                            "dvn2", YUV, D8u,  Rec601, Video, None,          DV,    NTSCDV25)         \
	Row(PALDV25,                                             "dvp2", YUV, D8u,  Rec601, Video, None,          DV,    PALDV25)          \
	Row(NTSCDV50,                                            "dvn5", YUV, D8u,  Rec601, Video, None,          DV,    NTSCDV50)         \
	Row(PALDV50,                                             "dvp5", YUV, D8u,  Rec601, Video, None,          DV,    PALDV50)          \
	Row(NTSC_DV100_720p,                                     "dvn7", YUV, D8u,  Rec709, Video, None,          DV,    NTSCDV100_720p)   \
	Row(PAL_DV100_720p,                                      "dvp7", YUV, D8u,  Rec709, Video, None,          DV,    PALDV100_720p)    \
	Row(NTSC_DV100_1080i,                                    "dvn1", YUV, D8u,  Rec709, Video, None,          DV,    NTSCDV100_1080i)  \
	Row(PAL_DV100_1080i,                                     "dvp1", YUV, D8u,  Rec709, Video, None,          DV,    PALDV100_1080i)   \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601,           "yvi2", YUV, D8u,  Rec601, Video, None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601,           "yv12", YUV, D8u,  Rec601, Video, None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange, "yvif", YUV, D8u,  Rec601, Full,  None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange, "yv1f", YUV, D8u,  Rec601, Full,  None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709,           "yvi7", YUV, D8u,  Rec709, Video, None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709,           "yv17", YUV, D8u,  Rec709, Video, None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange, "yviF", YUV, D8u,  Rec709, Full,  None,          C420,  MPEG2Field)       \
	Row(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange, "yv1F", YUV, D8u,  Rec709, Full,  None,          C420,  MPEG2Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601,           "Yvi2", YUV, D8u,  Rec601, Video, None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601,           "Yv12", YUV, D8u,  Rec601, Video, None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange, "Yvif", YUV, D8u,  Rec601, Full,  None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange, "Yv1f", YUV, D8u,  Rec601, Full,  None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709,           "Yvi7", YUV, D8u,  Rec709, Video, None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709,           "Yv17", YUV, D8u,  Rec709, Video, None,          C420,  MPEG4Frame)       \
	Row(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange, "YviF", YUV, D8u,  Rec709, Full,  None,          C420,  MPEG4Field)       \
	Row(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange, "Yv1F", YUV, D8u,  Rec709, Full,  None,          C420,  MPEG4Frame)
// clang-format on

// Qualified, so that a row without its declaration in the header does not compile.
#define ZON_DEFINE(inName, ...)                                                                                        \
	constexpr PixelFormat zonmediatypes::kPixelFormat_##inName = Format(Row(#inName, __VA_ARGS__));
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
static_assert(
	std::ranges::find(sAllPixelFormats, kPixelFormatFourCC_Any, &PixelFormat::mName) == sAllPixelFormats.end());
static_assert(
	std::ranges::find(sAllPixelFormats, kPixelFormatFourCC_Invalid, &PixelFormat::mName) == sAllPixelFormats.end());

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
		const boost::lock_guard<boost::mutex> lock(mMutex);
		mRegistry.merge(added);
		if (!added.empty())
			mRegistry.find(inName)->second = inProperties;
	}

	PixelFormatProperties Lookup(unsigned int inName) const
	{
		const boost::lock_guard<boost::mutex> lock(mMutex);
		const auto found = mRegistry.find(inName);
		return found == mRegistry.end() ? kPixelFormatProperties_Invalid : found->second;
	}

private:
	using Registry = zoncore::utility::SmallBlockAllocator::map<unsigned int, PixelFormatProperties>;

	mutable boost::mutex mMutex;
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
