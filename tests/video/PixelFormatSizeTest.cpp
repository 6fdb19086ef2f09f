#include "zonmediatypes/PixelFormatSize.h"

#include "tests/video/PixelFormatTable.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <string_view>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr int kMost = std::numeric_limits<int>::max();

// ---- Rows and frames -------------------------------------------------------------------------------------------------

constexpr std::int64_t Pad(std::int64_t inValue, std::int64_t inMultiple)
{
	return (inValue + inMultiple - 1) / inMultiple * inMultiple;
}

// What the name of a format says about its rows.
struct RowRule
{
	std::string_view mPartOfName;
	int mPixels, mBytes;   // of the smallest group
	int mPadding;
};

constexpr RowRule kRowRules[] = {
	{"_4444_8u", 1, 4, 64}, {"_4444_15u", 1, 8, 64}, {"_4444_32f", 1, 16, 64}, {"RGB_444_10u", 1, 4, 64},
	{"UYVY_422_8u", 1, 2, 16}, {"YUYV_422_8u", 1, 2, 16}, {"UYVY_422_32f", 1, 8, 16}, {"YUYV_422_32f", 1, 8, 16},
	{"V210_422_10u", 48, 128, 1},   // as its publisher defines it
	{"", 1, 0, 1},                  // no uncompressed format
};

TEST(PixelFormatSize, IsWhatTheNamesOfTheFormatsSay)
{
	for (const PixelFormat format : EveryPixelFormat())
	{
		const std::string_view name = PixelFormatCatalogueName(format);
		const RowRule rule = *std::ranges::find_if(kRowRules,
			[name](const RowRule& inRule) { return name.find(inRule.mPartOfName) != std::string_view::npos; });
		int fixedWidth = 12;
		int fixedHeight = -3;
		FixedSizedFormatDimensions(format, fixedWidth, fixedHeight);
		EXPECT_EQ(fixedWidth == 12 && fixedHeight == -3, !format.mProperties.IsDV()) << name;
		EXPECT_NE(IsRectValidForFormat(format, -1, 0, {0, 0}), format.mProperties.IsDV()) << name;
		for (int width = 0; width <= 2'100; ++width)
		{
			const int height = width % 7 * 155;
			const std::int64_t row = Pad(Pad(width, rule.mPixels) / rule.mPixels * rule.mBytes, rule.mPadding);
			const std::int64_t planes = (Pad(width, 128) + Pad(width / 2, 128)) * Pad(height, 32);
			const std::int64_t size = PixelFormatSize(format, width, height);
			ASSERT_EQ(UncompressedPixelFormatRowBytes(format, width), row) << name << " " << width;
			ASSERT_TRUE(format.mProperties.IsDV() || size == (format.mProperties.IsMPEG() ? planes : height * row))
				<< name << " " << width << " x " << height << ": " << size;
		}
	}
}

using P = PixelFormatProperties;
const PixelFormat& sBGRA = kPixelFormat_BGRA_4444_8u;
const PixelFormat& sUYVY = kPixelFormat_UYVY_422_8u;
const PixelFormat& sV210 = kPixelFormat_V210_422_10u;
const PixelFormat& sMPEG = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;

struct SizeCase
{
	PixelFormat mFormat;
	int mWidth, mHeight;
	std::int64_t mRowBytes, mSize;
};

void ExpectSizes(std::initializer_list<SizeCase> inCases)
{
	for (const auto& [format, width, height, row, size] : inCases)
	{
		SCOPED_TRACE(testing::Message() << std::hex << format.mProperties.GetValue() << std::dec << ", " << width);
		EXPECT_EQ(UncompressedPixelFormatRowBytes(format, width), row);
		EXPECT_EQ(PixelFormatSize(format, width, height), size);
	}
}

TEST(PixelFormatSize, FollowsFieldsThatNoFormatCombines)
{
	const auto bgraOf = [](PixelFormatBitDepth inDepth) { return With(sBGRA, &P::SetBitDepth, inDepth); };
	ExpectSizes({{bgraOf(kPixelFormatBitDepth_16), 16, 2, 128, 256}, {bgraOf(kPixelFormatBitDepth_24), 16, 2, 192, 384},
		{bgraOf(kPixelFormatBitDepth_10), 64, 2, 320, 640}, {With(sBGRA, &P::SetBitDepth, 6), 16, 2, 0, 0},
		{With(sBGRA, &P::SetBitDepth, 7), 16, 2, 0, 0},
		{With(sBGRA, &P::SetAlpha, kPixelFormatAlpha_None), 64, 2, 192, 384},
		{With(sBGRA, &P::SetSubsampling, kPixelFormatSubsampling_420), 16, 2, 0, 0},
		{With(kPixelFormat_RGB_444_10u, &P::SetSubsampling, kPixelFormatSubsampling_420), 16, 2, 64, 128},
		{With(sV210, &P::SetIsFloat, 1), 48, 2, 0, 0}, {With(sV210, &P::SetIsYUV, 0), 48, 2, 0, 0},
		{With(sUYVY, &P::SetIsYUV, 0), 16, 2, 32, 64}, {With(sUYVY, &P::SetCompression, 13), 16, 2, 32, 0},
		{With(sMPEG, &P::SetIsYUV, 0), 128, 32, 0, 0},
		{With(sMPEG, &P::SetSubsampling, kPixelFormatSubsampling_444), 128, 32, 0, 0},
		{With(sMPEG, &P::SetKind, kPixelFormatKind_Any), 128, 32, 0, 8'192},
		{With(kPixelFormat_NTSCDV25, &P::SetKind, kPixelFormatKind_Invalid), 1, 1, 0, 120'000}});
}

TEST(PixelFormatSize, RejectsNoWidthAndWraps)
{
	ExpectSizes({{sBGRA, 16, -2, 64, -128}, {sBGRA, -1, 2, 0, 0}, {sBGRA, kMost, 2, 0, 0}, {sUYVY, -kMost, 1, 16, 16},
		{sV210, -7, 1, 0, 0}, {sV210, -17, 1, 0, 0}, {sV210, kMost, 1, 128, 128}, {sMPEG, kMost, kMost, 0, 1ll << 61}});
}

// ---- DV --------------------------------------------------------------------------------------------------------------

TEST(DVFrames, HaveTheirSizesAndShapes)
{
	using Ratios = std::vector<PixelAspectRatio>;
	const Ratios ntsc = {kPixelAspectRatio_DVNTSC, kPixelAspectRatio_DVNTSCWide};
	const Ratios pal = {kPixelAspectRatio_DVPAL, kPixelAspectRatio_DVPALWide};
	const struct
	{
		PixelFormat mFormat;
		int mBytes, mWidth, mHeight;
		Ratios mShapes;
	} variants[] = {
		{kPixelFormat_NTSCDV25, 120'000, 720, 480, ntsc},
		{kPixelFormat_NTSCDV50, 240'000, 720, 480, ntsc},
		{kPixelFormat_PALDV25, 144'000, 720, 576, pal},
		{kPixelFormat_PALDV50, 288'000, 720, 576, pal},
		{kPixelFormat_NTSC_DV100_720p, 240'000, 960, 720, {kPixelAspectRatio_Square}},
		{kPixelFormat_PAL_DV100_720p, 288'000, 960, 720, {kPixelAspectRatio_Square}},
		{kPixelFormat_NTSC_DV100_1080i, 480'000, 1280, 1080, {kPixelAspectRatio_DVCProHD}},
		{kPixelFormat_PAL_DV100_1080i, 576'000, 1440, 1080, {kPixelAspectRatio_HDAnamorphic1080}},
	};
	for (const auto& [format, bytes, w, h, shapes] : variants)
	{
		SCOPED_TRACE(format);
		EXPECT_EQ(PixelFormatSize(format, 1, 1), bytes);
		int width = 0;
		int height = 0;
		FixedSizedFormatDimensions(format, width, height);
		EXPECT_EQ(std::pair(width, height), std::pair(w, h));
		for (const PixelAspectRatio ratio : AllPixelAspectRatios())
		{
			EXPECT_EQ(IsRectValidForFormat(format, w, h, ratio), std::ranges::count(shapes, ratio) != 0) << ratio;
			EXPECT_FALSE(IsRectValidForFormat(format, w, h + 6, ratio));
			EXPECT_FALSE(IsRectValidForFormat(format, w - 1, h, ratio));
		}
	}
}

}   // namespace
}   // namespace zonmediatypes
