#include "zonmediatypes/PixelFormatSelection.h"

#include "tests/video/PixelFormatTable.h"

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

const PixelFormat& sBGRA = kPixelFormat_BGRA_4444_8u;
const PixelFormat& sARGB = kPixelFormat_ARGB_4444_8u;
const PixelFormat& sVUYA = kPixelFormat_VUYA_4444_8u;
const PixelFormat& sUYVY = kPixelFormat_UYVY_422_8u;
const PixelFormat& sDV = kPixelFormat_NTSCDV25;
const PixelFormat& sDV100 = kPixelFormat_NTSC_DV100_1080i;
const PixelFormat& sMPEG = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;

struct CostCase
{
	PixelFormat mFrom, mTo;
	int mLow, mHigh;   // quality
};

void ExpectCosts(std::initializer_list<CostCase> inCases)
{
	for (const auto& [from, to, low, high] : inCases)
		for (const int quality : {-1, 0, 1, 2, 3, 4, 5, 6})
			EXPECT_EQ(Cost(from, to, static_cast<RenderQuality>(quality)), quality < 3 ? low : high)
				<< from << " to " << to << " at " << quality;
}

TEST(PixelConversionCost, OfModelMatrixAndDepthGoesByQuality)
{
	ExpectCosts({{sBGRA, sBGRA, 0, 0}, {sDV, sDV, 0, 0}, {sBGRA, sVUYA, 103, 103}, {sVUYA, sBGRA, 103, 201},
		{sBGRA, With(sBGRA, &P::SetIsYUV, 1), 3, 3}, {sBGRA, With(sBGRA, &P::SetIsVideoRange, 1), 101, 101},
		{sBGRA, kPixelFormat_VUYA_4444_32f, 108, 108}, {kPixelFormat_BGRA_4444_15u, sVUYA, 105, 221}});
	// The matrix counts between two of YUV.
	ExpectCosts({{sUYVY, kPixelFormat_UYVY_422_8u_709, 2, 11}, {sVUYA, kPixelFormat_VUYA_4444_32f_709, 8, 8},
		{sBGRA, With(sBGRA, &P::SetIs709, 1), 1, 1}, {kPixelFormat_VUYA_4444_8u_709, sBGRA, 103, 201}});
	ExpectCosts({{sBGRA, kPixelFormat_BGRA_4444_15u, 3, 3}, {kPixelFormat_BGRA_4444_15u, sBGRA, 3, 21},
		{sBGRA, kPixelFormat_BGRA_4444_32f, 7, 7}, {kPixelFormat_BGRA_4444_32f, sBGRA, 7, 52}});
}

TEST(PixelConversionCost, OfAlphaOrderLightAndChromaDoesNot)
{
	ExpectCosts({{sBGRA, kPixelFormat_BGRX_4444_8u, 26, 26}, {kPixelFormat_BGRX_4444_8u, sBGRA, 6, 6},
		{sBGRA, kPixelFormat_BGRP_4444_8u, 2, 2}, {kPixelFormat_BGRX_4444_8u, With(sBGRA, &P::SetAlpha, 0), 2, 2},
		{sBGRA, With(sBGRA, &P::SetAlpha, 4), 26, 26}});   // an unassigned code is no alpha
	ExpectCosts({{sBGRA, sARGB, 2, 2}, {sBGRA, With(sBGRA, &P::SetIsLinear, 1), 2, 2},
		{sBGRA, With(sBGRA, &P::SetIsFloat, 1), 2, 2},
		{sBGRA, With(kPixelFormat_ARGB_4444_32f_Linear, &P::SetBitDepth, 0), 4, 4}});
	// Nothing is added for the chroma that DV decompresses to.
	const PixelFormat vuy = With(sVUYA, &P::SetAlpha, 0);
	ExpectCosts({{sUYVY, vuy, 1, 1}, {vuy, sUYVY, 51, 51}, {sDV, sUYVY, 2, 2}, {sDV, kPixelFormat_YUYV_422_8u, 53, 53},
		{sDV, sVUYA, 12, 12}, {sDV100, kPixelFormat_YUYV_422_8u_709, 3, 3},
		{sDV100, kPixelFormat_UYVY_422_8u_709, 52, 52}, {kPixelFormat_PALDV50, kPixelFormat_YUYV_422_8u, 3, 3},
		{sMPEG, sUYVY, 52, 52}, {sMPEG, sVUYA, 7, 7}});
}

TEST(PixelConversionCost, IsImpossibleWithoutConcreteFormatsAndIntoCompressedOnes)
{
	const PixelFormat unknown = With(sBGRA, &P::SetCompression, kPixelFormatCompression_Unknown);
	const PixelFormat unassigned = With(sBGRA, &P::SetKind, 3);
	for (const auto& [from, to] :
		{std::pair(sUYVY, sDV), {kPixelFormat_Any, kPixelFormat_Any}, {kPixelFormat_Invalid, sUYVY},
			{sUYVY, kPixelFormat_Any}, {unknown, sBGRA}, {unassigned, sBGRA}, {sBGRA, unassigned}})
		ExpectCosts({{from, to, kImpossible, kImpossible}});
}

// ---- Selection -------------------------------------------------------------------------------------------------------

PixelFormat Select(const PixelFormats& inSources, PixelFormat inRequest, const PixelFormats& inDestinations,
	bool inPreferRequested = false)
{
	return SelectNearestPixelFormat(inSources, inRequest, inDestinations, kRenderQuality_High, inPreferRequested);
}

TEST(SelectNearestPixelFormat, Examples)
{
	const PixelFormat any = kPixelFormat_Any;
	const PixelFormat custom = Custom('_', kPixelFormatProperties_Invalid);

	EXPECT_EQ(Select({sUYVY}, sARGB, {sBGRA, sARGB}, true), sARGB) << "accepted, though nobody makes it";
	EXPECT_EQ(Select({sUYVY}, sARGB, {sBGRA, any}, true), sARGB);
	EXPECT_EQ(Select({sUYVY}, kPixelFormat_Invalid, {any}, true), sUYVY);
	EXPECT_EQ(Select({sUYVY}, sARGB, {sBGRA}, true), sBGRA);
	EXPECT_EQ(Select({sUYVY, sBGRA, sARGB}, sUYVY, {sARGB, sBGRA}), sARGB) << "the consumer's order";
	EXPECT_EQ(Select({custom}, sUYVY, {sBGRA, custom}), custom) << "a custom format that both know";
	EXPECT_EQ(Select({any}, sUYVY, {any}), kPixelFormat_Invalid) << "a wildcard is no common format";
	EXPECT_EQ(Select({sUYVY, sARGB, sBGRA}, sUYVY, {any}), sARGB) << "the first with a fourth component";
	EXPECT_EQ(Select({Custom('@', sUYVY.mProperties), sUYVY}, sUYVY, {any}), sUYVY);
	EXPECT_EQ(Select({sARGB}, sUYVY, {}), sARGB);
	EXPECT_EQ(Select({}, sUYVY, {sUYVY, sBGRA}), sBGRA);
	EXPECT_EQ(Select({}, sUYVY, {}), kPixelFormat_Invalid);
	EXPECT_EQ(Select({sUYVY}, sUYVY, {sMPEG}), sMPEG) << "cannot be made, and is all that is accepted";
	EXPECT_EQ(Select({sMPEG}, sMPEG, {sUYVY, kPixelFormat_VUYX_4444_8u}), kPixelFormat_VUYX_4444_8u);
	// Deliberate: with a wildcard the cheapest pair gives its source, and a tie that is nearer to the request its
	// destination.
	EXPECT_EQ(Select({sBGRA}, kPixelFormat_BGRP_4444_8u, {any, kPixelFormat_BGRP_4444_8u}), sBGRA);
	EXPECT_EQ(Select({sBGRA}, sARGB, {any, kPixelFormat_BGRP_4444_8u, sARGB}), sARGB);
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
	// To 16-bit BGRA the 15-bit one costs 1 + 1 and the 8-bit one 1 + 3.
	EXPECT_EQ(select({sBGRA, kPixelFormat_BGRA_4444_15u}, With(sBGRA, &P::SetBitDepth, kPixelFormatBitDepth_16)),
		kPixelFormat_BGRA_4444_15u);
	// Both cost 2, by order or by depth: the shallower one wins wherever it stands.
	const PixelFormat target = With(sBGRA, &P::SetBitDepth, kPixelFormatBitDepth_10);
	const PixelFormat deeper = With(sARGB, &P::SetBitDepth, kPixelFormatBitDepth_10);
	EXPECT_EQ(select({deeper, sBGRA}, target), sBGRA);
	EXPECT_EQ(select({sBGRA, deeper}, target), sBGRA);
	EXPECT_EQ(select({kPixelFormat_BGRP_4444_8u, sARGB}, sBGRA), kPixelFormat_BGRP_4444_8u);

	const PixelFormat custom = Custom('@', sBGRA.mProperties);
	EXPECT_EQ(select({kPixelFormat_Invalid, custom, sBGRA}, kPixelFormat_Any), sBGRA);
	EXPECT_EQ(select({custom, sBGRA}, sBGRA), custom) << "custom formats take part by their properties";
	EXPECT_EQ(select({custom}, kPixelFormat_Any), kPixelFormat_Invalid);
	EXPECT_EQ(select({sBGRA}, kPixelFormat_Invalid), kPixelFormat_Invalid);
	EXPECT_EQ(select({sBGRA}, kPixelFormat_NTSCDV25), kPixelFormat_Invalid) << "nothing becomes DV";
	EXPECT_EQ(select({}, sBGRA), kPixelFormat_Invalid);
}

// A list is a vector, as hosts have it, or anything else that formats lie in.
TEST(PixelFormatLists, MayBeKeptAnywhere)
{
	const PixelFormat array[] = {sUYVY, sVUYA};
	const auto expectSelections = [&](const auto& inList)
	{
		EXPECT_EQ(SelectNearestSourcePixelFormat(inList, sVUYA.mProperties, kRenderQuality_Low), sVUYA);
		EXPECT_EQ(SelectNearestPixelFormat(inList, sUYVY, array, kRenderQuality_Low, false), sUYVY);
		EXPECT_EQ(SelectNearestPixelFormat({sVUYA}, sUYVY, inList, kRenderQuality_Low, false), sVUYA);
		EXPECT_EQ(SelectNearestPixelFormat(inList, sUYVY, {}, kRenderQuality_Low, false), sVUYA);
	};
	expectSelections(array);
	expectSelections(std::to_array(array));
	expectSelections(std::span<const PixelFormat>(array));
	expectSelections(PixelFormats(std::begin(array), std::end(array)));
	EXPECT_EQ(SelectNearestPixelFormat({sUYVY}, sUYVY, {sUYVY, sVUYA}, kRenderQuality_Low, false), sUYVY);
	EXPECT_EQ(SelectNearestPixelFormat({}, sUYVY, {}, kRenderQuality_Low, false), kPixelFormat_Invalid);
	EXPECT_EQ(SelectNearestSourcePixelFormat({sUYVY, sVUYA}, sVUYA.mProperties, kRenderQuality_Low), sVUYA);
	EXPECT_EQ(SelectNearestSourcePixelFormat({}, sVUYA.mProperties, kRenderQuality_Low), kPixelFormat_Invalid);
}

// ---- Working formats -------------------------------------------------------------------------------------------------

TEST(Select4444PixelFormat, GivesAWorkingFormat)
{
	const PixelFormat vuyx = kPixelFormat_VUYX_4444_8u, vuyx709 = kPixelFormat_VUYX_4444_8u_709;
	const PixelFormat bgrx = kPixelFormat_BGRX_4444_8u, argb15 = kPixelFormat_ARGB_4444_15u;
	const PixelFormat any = kPixelFormat_Any, invalid = kPixelFormat_Invalid;
	const struct
	{
		PixelFormat mFormat, mLow, mHigh;
	} cases[] = {{kPixelFormat_YUYV_422_8u_709, vuyx709, vuyx709}, {kPixelFormat_PALDV25, vuyx, vuyx},
		{kPixelFormat_V210_422_10u, vuyx, kPixelFormat_VUYX_4444_32f},
		{kPixelFormat_UYVY_422_32f_709, vuyx709, kPixelFormat_VUYX_4444_32f_709},
		{With(sUYVY, &P::SetIsFloat, 1), vuyx, kPixelFormat_VUYX_4444_32f},
		{With(sUYVY, &P::SetAlpha, 2), kPixelFormat_VUYP_4444_8u, kPixelFormat_VUYP_4444_8u},
		{kPixelFormat_RGB_444_10u, bgrx, kPixelFormat_BGRX_4444_32f},
		{kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange, bgrx, bgrx}, {argb15, argb15, argb15},
		{any, any, any}, {invalid, invalid, invalid}, {{invalid.mName, sBGRA.mProperties}, invalid, invalid},
		{{invalid.mName, sUYVY.mProperties}, vuyx, vuyx}};
	for (const auto& [format, low, high] : cases)
	{
		EXPECT_EQ(Select4444PixelFormat(format, kRenderQuality_Low), low) << format;
		EXPECT_EQ(Select4444PixelFormat(format, kRenderQuality_Medium), high) << format;
	}
	for (const PixelFormat format : EveryPixelFormat())
		EXPECT_EQ(
			Select4444PixelFormat(format, kRenderQuality_Max).mProperties.Is4444(), format.mProperties.IsConcrete());
}

TEST(SelectDVDecompressionFormat, GoesByTheCompressionAlone)
{
	const PixelFormat& dv50 = kPixelFormat_YUYV_422_8u;
	const PixelFormat& dv100 = kPixelFormat_YUYV_422_8u_709;
	const PixelFormat custom = Custom('_', P(0xFFFC3FFF));
	const PixelFormat dv[] = {custom, sUYVY, sUYVY, dv100, dv100, dv100, dv100, dv50, dv50};
	for (unsigned compression = 0; compression < 16; ++compression)
	{
		const PixelFormat format = With(custom, &P::SetCompression, compression);
		EXPECT_EQ(SelectDVDecompressionFormat(format), format.mProperties.IsDV() ? dv[compression] : format)
			<< compression;
	}
}

}   // namespace
}   // namespace zonmediatypes
