#include "zonmediatypes/PixelFormatSize.h"

#include "tests/PixelFormatTable.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <limits>
#include <random>
#include <vector>

namespace zonmediatypes
{
namespace
{

// ---- The rules, step by step, on bare bits ---------------------------------------------------------------------------

using Bits = std::uint32_t;

// 32-bit arithmetic that wraps, written in 64 bits.
std::int64_t Wrap(std::int64_t inValue)
{
	return static_cast<std::int32_t>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(inValue)));
}

std::int64_t Align(std::int64_t inValue, std::int64_t inMultiple)
{
	const std::int64_t padded = Wrap(inValue + inMultiple - 1);
	return padded - (padded % inMultiple + inMultiple) % inMultiple;
}

std::int64_t RowBytes(Bits inFormat, std::int64_t inWidth)
{
	const bool isConcrete = (inFormat & 0xC0000) == 0x40000;
	const bool isCompressed = (inFormat & 0x3C000) != 0;
	const Bits chroma = inFormat >> 10 & 3;
	const Bits depth = inFormat >> 1 & 7;
	const std::int64_t bits = depth == 0 ? 8
		: depth == 1                     ? 10
		: depth <= 3                     ? 16
		: depth == 4                     ? 24
		: depth == 5                     ? 32
										 : 0;
	if (isConcrete && !isCompressed && (inFormat & 1) != 0 && chroma == 1 && depth == 1 && (inFormat & 0x10) == 0)
		return Align(Wrap(Wrap(inWidth + 5) / 6 * 96) / 6, 128);
	if (isConcrete && chroma == 1)
		return Align(Wrap((bits == 10 ? 0 : bits * 2 / 8) * inWidth), 16);
	if (!isConcrete || isCompressed)
		return 0;
	const bool hasSlot = (inFormat & 0x380) != 0;
	const std::int64_t perPixel = chroma == 0 && hasSlot ? 4 * bits : bits == 10 ? 32 : chroma == 0 ? 3 * bits : 0;
	return Align(Wrap(perPixel / 8 * inWidth), 64);
}

std::int64_t FrameBytes(Bits inFormat, std::int64_t inWidth, std::int64_t inHeight)
{
	constexpr std::int64_t kDVBytes[] = {0, 120'000, 144'000, 240'000, 288'000, 480'000, 576'000, 240'000, 288'000};
	const Bits compression = inFormat >> 14 & 15;
	if (compression >= 1 && compression <= 8)
		return kDVBytes[compression];
	if (compression >= 9 && compression <= 12 && (inFormat & 1) != 0 && (inFormat & 0xC00) == 0xC00)
		return Wrap(Align(inWidth, 128) + Align(inWidth / 2, 128)) * Align(inHeight, 32);
	return compression == 0 && (inFormat & 0xC0000) == 0x40000 ? inHeight * RowBytes(inFormat, inWidth) : 0;
}

// ---- Against them ----------------------------------------------------------------------------------------------------

void ExpectRules(PixelFormat inFormat, int inWidth, int inHeight)
{
	const Bits bits = inFormat.mProperties.GetValue();
	ASSERT_EQ(UncompressedPixelFormatRowBytes(inFormat, inWidth), RowBytes(bits, inWidth)) << bits << " " << inWidth;
	ASSERT_EQ(PixelFormatSize(inFormat, inWidth, inHeight), FrameBytes(bits, inWidth, inHeight))
		<< bits << " " << inWidth << " x " << inHeight;
}

TEST(PixelFormatSize, FollowsItsRulesForAllFormats)
{
	for (const PixelFormat format : EveryPixelFormat())
		for (int width = -300; width <= 2'100; ++width)
			ExpectRules(format, width, width % 7 * 155);
}

TEST(PixelFormatSize, FollowsItsRulesForAnythingAtAll)
{
	constexpr int kLeast = std::numeric_limits<int>::min();
	constexpr int kMost = std::numeric_limits<int>::max();
	const int extremes[] = {kLeast, kLeast + 1, kLeast + 127, -1, 0, 1, kMost - 127, kMost - 4, kMost};
	std::mt19937 random(9);
	for (int round = 0; round < 30'000; ++round)
	{
		const Bits bits = static_cast<Bits>(random());
		const PixelFormat format{
			kPixelFormatFourCC_Any, PixelFormatProperties(round % 2 != 0 ? bits : (bits & ~0xFC000u) | 0x40000)};
		ExpectRules(format, extremes[random() % std::size(extremes)], extremes[random() % std::size(extremes)]);
		ExpectRules(format, static_cast<int>(random()), static_cast<int>(random()));
	}
}

TEST(PixelFormatSize, Examples)
{
	EXPECT_EQ(PixelFormatSize(kPixelFormat_BGRA_4444_8u, 1920, 1080), 8'294'400);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_BGRA_4444_8u, 1921), 7'744);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_BGRA_4444_32f, 10), 192);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_V210_422_10u, 1920), 5'120);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_V210_422_10u_709, 1280), 3'456);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_UYVY_422_8u, 721), 1'456);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_YUYV_422_32f, 2), 16);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_RGB_444_10u, 100), 448);
	EXPECT_EQ(UncompressedPixelFormatRowBytes(kPixelFormat_NTSCDV25, 720), 0);
	EXPECT_EQ(PixelFormatSize(kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 720, 480), 552'960);
	EXPECT_EQ(PixelFormatSize(kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 720, 481), 589'824);
	EXPECT_EQ(PixelFormatSize(kPixelFormat_NTSCDV25, 1, 1), 120'000);
	EXPECT_EQ(PixelFormatSize(kPixelFormat_Any, 1920, 1080), 0);
	EXPECT_EQ(PixelFormatSize(kPixelFormat_BGRA_4444_8u, 16, -2), -128) << "nothing is rejected";
}

// ---- DV --------------------------------------------------------------------------------------------------------------

TEST(DVFrames, HaveTheirSizesAndShapes)
{
	struct Variant
	{
		PixelFormat mFormat;
		int mWidth, mHeight;
		std::vector<PixelAspectRatio> mShapes;
	};
	const std::vector<PixelAspectRatio> ntsc = {kPixelAspectRatio_DVNTSC, kPixelAspectRatio_DVNTSCWide};
	const std::vector<PixelAspectRatio> pal = {kPixelAspectRatio_DVPAL, kPixelAspectRatio_DVPALWide};
	const Variant variants[] = {
		{kPixelFormat_NTSCDV25, 720, 480, ntsc},
		{kPixelFormat_NTSCDV50, 720, 480, ntsc},
		{kPixelFormat_PALDV25, 720, 576, pal},
		{kPixelFormat_PALDV50, 720, 576, pal},
		{kPixelFormat_NTSC_DV100_720p, 960, 720, {kPixelAspectRatio_Square}},
		{kPixelFormat_PAL_DV100_720p, 960, 720, {kPixelAspectRatio_Square}},
		{kPixelFormat_NTSC_DV100_1080i, 1280, 1080, {kPixelAspectRatio_DVCProHD}},
		{kPixelFormat_PAL_DV100_1080i, 1440, 1080, {kPixelAspectRatio_HDAnamorphic1080}},
	};
	for (const Variant& variant : variants)
	{
		const int w = variant.mWidth;
		const int h = variant.mHeight;
		int width = 0;
		int height = 0;
		FixedSizedFormatDimensions(variant.mFormat, width, height);
		EXPECT_EQ(width, w) << variant.mFormat;
		EXPECT_EQ(height, h) << variant.mFormat;
		for (const PixelAspectRatio ratio : AllPixelAspectRatios())
		{
			const bool isShape = std::ranges::count(variant.mShapes, ratio) != 0;
			EXPECT_EQ(IsRectValidForFormat(variant.mFormat, w, h, ratio), isShape) << variant.mFormat << " " << ratio;
			EXPECT_FALSE(IsRectValidForFormat(variant.mFormat, w, h + 6, ratio));
			EXPECT_FALSE(IsRectValidForFormat(variant.mFormat, w - 1, h, ratio));
		}
	}
	// The comparison is tolerant: 0.9091 is 10/11, 0.9 is not.
	EXPECT_TRUE(IsRectValidForFormat(kPixelFormat_NTSCDV25, 720, 480, {9'091, 10'000}));
	EXPECT_TRUE(IsRectValidForFormat(kPixelFormat_PAL_DV100_1080i, 1440, 1080, {4, 3}));
}

TEST(OtherFrames, AreValidAndOfNoFixedSize)
{
	for (const PixelFormat format : EveryPixelFormat())
	{
		if (format.mProperties.IsDV())
			continue;
		int width = 12;
		int height = -3;
		FixedSizedFormatDimensions(format, width, height);
		EXPECT_EQ(width, 12);
		EXPECT_EQ(height, -3);
		EXPECT_TRUE(IsRectValidForFormat(format, -1, 0, {0, 0})) << format;
	}
}

}   // namespace
}   // namespace zonmediatypes
