#include "zonmediatypes/PixelFormatSelection.h"

#include "tests/PixelFormatTable.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <random>
#include <span>

namespace zonmediatypes
{
namespace
{

using P = PixelFormatProperties;
constexpr int kImpossible = 10'000;
static_assert(kPixelConversionCost_Impossible == kImpossible);
static_assert(kRenderQuality_Draft == 1 && kRenderQuality_Low == 2 && kRenderQuality_Medium == 3
	&& kRenderQuality_High == 4 && kRenderQuality_Max == 5);

PixelFormat Custom(char inPrefix, P inProperties)
{
	return {MakePixelFormatName(inPrefix, 'r', 'a', 'w'), inProperties};
}

int Cost(PixelFormat inFrom, PixelFormat inTo, RenderQuality inQuality = kRenderQuality_High)
{
	return PixelConversionCost(inFrom.mProperties, inTo.mProperties, inQuality);
}

// ---- Cost ------------------------------------------------------------------------------------------------------------

TEST(PixelConversionCost, IsTheSumOfWhatDiffers)
{
	const PixelFormat bgra = kPixelFormat_BGRA_4444_8u;
	const PixelFormat vuya = kPixelFormat_VUYA_4444_8u;
	const PixelFormat uyvy = kPixelFormat_UYVY_422_8u;
	const PixelFormat dv = kPixelFormat_NTSCDV25;
	const PixelFormat dv100 = kPixelFormat_NTSC_DV100_1080i;
	const PixelFormat mpeg = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;
	const struct
	{
		PixelFormat mFrom, mTo;
		int mLow, mHigh;
	} cases[] = {
		{bgra, bgra, 0, 0},
		{dv, dv, 0, 0},
		// Model and range
		{bgra, vuya, 103, 103},
		{vuya, bgra, 103, 201},
		{bgra, With(bgra, &P::SetIsYUV, 1), 3, 3},
		{bgra, With(bgra, &P::SetIsVideoRange, 1), 101, 101},
		{bgra, kPixelFormat_VUYA_4444_32f, 108, 108},
		{kPixelFormat_BGRA_4444_15u, vuya, 105, 221},
		// Matrix, between two of YUV
		{uyvy, kPixelFormat_UYVY_422_8u_709, 2, 11},
		{vuya, kPixelFormat_VUYA_4444_32f_709, 8, 8},
		{bgra, With(bgra, &P::SetIs709, 1), 1, 1},
		{kPixelFormat_VUYA_4444_8u_709, bgra, 103, 201},
		// Depth
		{bgra, kPixelFormat_BGRA_4444_15u, 3, 3},
		{kPixelFormat_BGRA_4444_15u, bgra, 3, 21},
		{bgra, kPixelFormat_BGRA_4444_32f, 7, 7},
		{kPixelFormat_BGRA_4444_32f, bgra, 7, 52},
		// Alpha
		{bgra, kPixelFormat_BGRX_4444_8u, 26, 26},
		{kPixelFormat_BGRX_4444_8u, bgra, 6, 6},
		{bgra, kPixelFormat_BGRP_4444_8u, 2, 2},
		{kPixelFormat_BGRX_4444_8u, With(bgra, &P::SetAlpha, 0), 2, 2},
		{bgra, With(bgra, &P::SetAlpha, 4), 26, 26},   // an unassigned code is no alpha
		// Order, light and type
		{bgra, kPixelFormat_ARGB_4444_8u, 2, 2},
		{bgra, With(bgra, &P::SetIsLinear, 1), 2, 2},
		{bgra, With(bgra, &P::SetIsFloat, 1), 2, 2},
		{bgra, With(kPixelFormat_ARGB_4444_32f_Linear, &P::SetBitDepth, 0), 4, 4},
		// Chroma, and what DV decompresses to
		{uyvy, With(vuya, &P::SetAlpha, 0), 1, 1},
		{With(vuya, &P::SetAlpha, 0), uyvy, 51, 51},
		{dv, uyvy, 2, 2},
		{dv, kPixelFormat_YUYV_422_8u, 53, 53},
		{dv, vuya, 12, 12},
		{dv100, kPixelFormat_YUYV_422_8u_709, 3, 3},
		{dv100, kPixelFormat_UYVY_422_8u_709, 52, 52},
		{kPixelFormat_PALDV50, kPixelFormat_YUYV_422_8u, 3, 3},
		{mpeg, uyvy, 52, 52},
		{mpeg, vuya, 7, 7},
		// What cannot be
		{uyvy, dv, kImpossible, kImpossible},
		{kPixelFormat_Any, kPixelFormat_Any, kImpossible, kImpossible},
		{kPixelFormat_Invalid, uyvy, kImpossible, kImpossible},
		{uyvy, kPixelFormat_Any, kImpossible, kImpossible},
		{With(bgra, &P::SetCompression, 15), bgra, kImpossible, kImpossible},
		{With(bgra, &P::SetKind, 3), bgra, kImpossible, kImpossible},
		{bgra, With(bgra, &P::SetKind, 3), kImpossible, kImpossible},
	};
	for (const auto& [from, to, low, high] : cases)
	{
		SCOPED_TRACE(testing::Message() << from << " to " << to);
		for (const int quality : {-1, 0, 1, 2})
			EXPECT_EQ(Cost(from, to, static_cast<RenderQuality>(quality)), low);
		for (const int quality : {3, 4, 5, 6})
			EXPECT_EQ(Cost(from, to, static_cast<RenderQuality>(quality)), high);
	}
}

// ---- Selection -------------------------------------------------------------------------------------------------------

PixelFormat Select(const PixelFormats& inSources, PixelFormat inRequest, const PixelFormats& inDestinations,
	bool inPreferRequested = false)
{
	return SelectNearestPixelFormat(inSources, inRequest, inDestinations, kRenderQuality_High, inPreferRequested);
}

TEST(SelectNearestPixelFormat, Examples)
{
	const PixelFormat uyvy = kPixelFormat_UYVY_422_8u;
	const PixelFormat bgra = kPixelFormat_BGRA_4444_8u;
	const PixelFormat argb = kPixelFormat_ARGB_4444_8u;
	const PixelFormat any = kPixelFormat_Any;
	const PixelFormat mpeg = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;
	const PixelFormat custom = Custom('_', kPixelFormatProperties_Invalid);

	EXPECT_EQ(Select({uyvy}, argb, {bgra, argb}, true), argb) << "accepted, though nobody makes it";
	EXPECT_EQ(Select({uyvy}, argb, {bgra, any}, true), argb);
	EXPECT_EQ(Select({uyvy}, kPixelFormat_Invalid, {any}, true), uyvy);
	EXPECT_EQ(Select({uyvy}, argb, {bgra}, true), bgra);
	EXPECT_EQ(Select({uyvy, bgra, argb}, uyvy, {argb, bgra}), argb) << "the consumer's order";
	EXPECT_EQ(Select({custom}, uyvy, {bgra, custom}), custom) << "a custom format that both know";
	EXPECT_EQ(Select({any}, uyvy, {any}), kPixelFormat_Invalid) << "a wildcard is no common format";
	EXPECT_EQ(Select({uyvy, argb, bgra}, uyvy, {any}), argb) << "the first with a fourth component";
	EXPECT_EQ(Select({Custom('@', uyvy.mProperties), uyvy}, uyvy, {any}), uyvy);
	EXPECT_EQ(Select({argb}, uyvy, {}), argb);
	EXPECT_EQ(Select({}, uyvy, {uyvy, bgra}), bgra);
	EXPECT_EQ(Select({}, uyvy, {}), kPixelFormat_Invalid);
	EXPECT_EQ(Select({uyvy}, uyvy, {mpeg}), mpeg) << "cannot be made, and is all that is accepted";
	EXPECT_EQ(Select({mpeg}, mpeg, {uyvy, kPixelFormat_VUYX_4444_8u}), kPixelFormat_VUYX_4444_8u);
	// Deliberate: with a wildcard the cheapest pair gives its source, and a tie that is nearer to the request its
	// destination.
	EXPECT_EQ(Select({bgra}, kPixelFormat_BGRP_4444_8u, {any, kPixelFormat_BGRP_4444_8u}), bgra);
	EXPECT_EQ(Select({bgra}, argb, {any, kPixelFormat_BGRP_4444_8u, argb}), argb);
}

// Of the cheapest conversions the one whose result is nearest to the request, the first one of several.
TEST(SelectNearestPixelFormat, IsTheBestOfAllPairs)
{
	std::mt19937 random(8);
	const PixelFormats formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	const auto any = [&] { return formats[random() % formats.size()]; };
	for (int round = 0; round < 5'000; ++round)
	{
		const PixelFormats sources{any(), any(), any()};
		const PixelFormats destinations{any(), any(), any(), any(), any(), any()};
		const PixelFormat request = any();
		const bool haveCommon = std::ranges::find_first_of(destinations, sources) != destinations.end();
		PixelFormat best = kPixelFormat_Invalid;
		std::pair<int, int> bestCosts{kImpossible, 0};
		for (const PixelFormat source : sources)
		{
			for (const PixelFormat destination : destinations)
			{
				const std::pair costs{Cost(source, destination), Cost(request, destination)};
				best = costs < bestCosts ? destination : best;
				bestCosts = std::min(costs, bestCosts);
			}
		}
		if (!haveCommon && best != kPixelFormat_Invalid)
		{
			ASSERT_EQ(Select(sources, request, destinations), best) << round;
		}
	}
}

TEST(SelectNearestSourcePixelFormat, PrefersCheapThenShallowThenFirst)
{
	const auto select = [](const PixelFormats& inSources, PixelFormat inTarget)
	{ return SelectNearestSourcePixelFormat(inSources, inTarget.mProperties, kRenderQuality_High); };
	const PixelFormat bgra = kPixelFormat_BGRA_4444_8u;
	const PixelFormat argb = kPixelFormat_ARGB_4444_8u;
	// To 16-bit BGRA the 15-bit one costs 1 + 1 and the 8-bit one 1 + 3.
	EXPECT_EQ(select({bgra, kPixelFormat_BGRA_4444_15u}, With(bgra, &P::SetBitDepth, kPixelFormatBitDepth_16)),
		kPixelFormat_BGRA_4444_15u);
	// Both cost 2, by order or by depth: the shallower one wins wherever it stands.
	const PixelFormat target = With(bgra, &P::SetBitDepth, kPixelFormatBitDepth_10);
	const PixelFormat deeper = With(argb, &P::SetBitDepth, kPixelFormatBitDepth_10);
	EXPECT_EQ(select({deeper, bgra}, target), bgra);
	EXPECT_EQ(select({bgra, deeper}, target), bgra);
	EXPECT_EQ(select({kPixelFormat_BGRP_4444_8u, argb}, bgra), kPixelFormat_BGRP_4444_8u);

	const PixelFormat custom = Custom('@', bgra.mProperties);
	EXPECT_EQ(select({kPixelFormat_Invalid, custom, bgra}, kPixelFormat_Any), bgra);
	EXPECT_EQ(select({custom, bgra}, bgra), custom) << "custom formats take part by their properties";
	EXPECT_EQ(select({custom}, kPixelFormat_Any), kPixelFormat_Invalid);
	EXPECT_EQ(select({bgra}, kPixelFormat_Invalid), kPixelFormat_Invalid);
	EXPECT_EQ(select({bgra}, kPixelFormat_NTSCDV25), kPixelFormat_Invalid) << "nothing becomes DV";
	EXPECT_EQ(select({}, bgra), kPixelFormat_Invalid);
}

// A list is a vector, as hosts have it, or anything else that formats lie in.
TEST(PixelFormatLists, MayBeKeptAnywhere)
{
	constexpr PixelFormat kNone{};
	const PixelFormat uyvy = kPixelFormat_UYVY_422_8u, vuyx = kPixelFormat_VUYX_4444_8u;
	const PixelFormat array[] = {uyvy, vuyx};
	const PixelFormats vector(std::begin(array), std::end(array));
	const std::span<const PixelFormat> span(array);
	const auto quality = kRenderQuality_High;
	const auto expect = [&](const auto& inList)
	{
		EXPECT_EQ(SelectNearestSourcePixelFormat(inList, vuyx.mProperties, quality), vuyx);
		EXPECT_EQ(SelectNearestPixelFormat(inList, uyvy, array, quality, false), uyvy);
		EXPECT_EQ(SelectNearestPixelFormat(vector, uyvy, inList, quality, false), uyvy);
		EXPECT_EQ(SelectNearestPixelFormat({vuyx}, uyvy, inList, quality, false), vuyx);
		EXPECT_EQ(SelectNearestPixelFormat(inList, uyvy, {}, quality, false), vuyx);
	};
	expect(vector);
	expect(array);
	expect(std::to_array(array));
	expect(span);
	EXPECT_EQ(SelectNearestPixelFormat({uyvy}, uyvy, {uyvy, vuyx}, quality, false), uyvy);
	EXPECT_EQ(SelectNearestPixelFormat({}, uyvy, {}, quality, false), kNone);
	EXPECT_EQ(SelectNearestSourcePixelFormat({uyvy, vuyx}, vuyx.mProperties, quality), vuyx);
	EXPECT_EQ(SelectNearestSourcePixelFormat({}, vuyx.mProperties, quality), kNone);
}

// ---- Working formats -------------------------------------------------------------------------------------------------

TEST(Select4444PixelFormat, GivesAWorkingFormat)
{
	const struct
	{
		PixelFormat mFormat, mLow, mHigh;
	} cases[] = {
		{kPixelFormat_YUYV_422_8u_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_8u_709},
		{kPixelFormat_PALDV25, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
		{kPixelFormat_V210_422_10u, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_32f},
		{kPixelFormat_UYVY_422_32f_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_32f_709},
		{With(kPixelFormat_UYVY_422_8u, &P::SetIsFloat, 1), kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_32f},
		{With(kPixelFormat_UYVY_422_8u, &P::SetAlpha, 2), kPixelFormat_VUYP_4444_8u, kPixelFormat_VUYP_4444_8u},
		{kPixelFormat_RGB_444_10u, kPixelFormat_BGRX_4444_8u, kPixelFormat_BGRX_4444_32f},
		{kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange, kPixelFormat_BGRX_4444_8u,
			kPixelFormat_BGRX_4444_8u},
		{kPixelFormat_ARGB_4444_15u, kPixelFormat_ARGB_4444_15u, kPixelFormat_ARGB_4444_15u},
		{kPixelFormat_Any, kPixelFormat_Any, kPixelFormat_Any},
		{kPixelFormat_Invalid, kPixelFormat_Invalid, kPixelFormat_Invalid},
		{{kPixelFormatFourCC_Invalid, kPixelFormat_BGRA_4444_8u.mProperties}, kPixelFormat_Invalid,
			kPixelFormat_Invalid},
		{{kPixelFormatFourCC_Invalid, kPixelFormat_UYVY_422_8u.mProperties}, kPixelFormat_VUYX_4444_8u,
			kPixelFormat_VUYX_4444_8u},
	};
	for (const auto& [format, low, high] : cases)
	{
		EXPECT_EQ(Select4444PixelFormat(format, kRenderQuality_Low), low) << format;
		EXPECT_EQ(Select4444PixelFormat(format, kRenderQuality_Medium), high) << format;
	}
	for (const PixelFormat format : EveryPixelFormat())
		EXPECT_EQ(
			Select4444PixelFormat(format, kRenderQuality_Max).mProperties.Is4444(), format.mProperties.IsConcrete())
			<< format;
}

TEST(SelectDVDecompressionFormat, GoesByTheCompressionAlone)
{
	const PixelFormat dv25 = kPixelFormat_UYVY_422_8u;
	const PixelFormat dv50 = kPixelFormat_YUYV_422_8u;
	const PixelFormat dv100 = kPixelFormat_YUYV_422_8u_709;
	const PixelFormat expected[] = {{}, dv25, dv25, dv100, dv100, dv100, dv100, dv50, dv50};
	for (unsigned compression = 0; compression < 16; ++compression)
	{
		const PixelFormat format = With(Custom('_', P(0xFFFC3FFF)), &P::SetCompression, compression);
		const bool isDV = compression >= 1 && compression <= 8;
		EXPECT_EQ(SelectDVDecompressionFormat(format), isDV ? expected[compression] : format) << compression;
	}
}

}   // namespace
}   // namespace zonmediatypes
