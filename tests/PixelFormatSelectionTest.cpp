#include "zonmediatypes/PixelFormatSelection.h"

#include "tests/PixelFormatTable.h"
#include "zonmediatypes/PixelFormatUtils.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <random>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr RenderQuality kQualities[]
	= {static_cast<RenderQuality>(0), kRenderQuality_Draft, kRenderQuality_Low, kRenderQuality_Medium,
		kRenderQuality_High, kRenderQuality_Max, static_cast<RenderQuality>(6), static_cast<RenderQuality>(-1)};

// ---- The rules, step by step, on bare bits ---------------------------------------------------------------------------

using Bits = std::uint32_t;

Bits DecompressedDV(Bits inFormat)
{
	switch (inFormat >> 14 & 15)
	{
	case 1:
	case 2:
		return 0x40441;
	case 3:
	case 4:
	case 5:
	case 6:
		return 0x41461;
	case 7:
	case 8:
		return 0x41441;
	default:
		return inFormat;
	}
}

int Cost(Bits inFrom, Bits inTo, int inQuality)
{
	const bool high = inQuality >= 3;
	const auto differs = [=](Bits inMask) { return ((inFrom ^ inTo) & inMask) != 0; };
	if ((inFrom & 0xC0000) != 0x40000 || (inTo & 0x3C000) == 0x3C000)
		return 10000;
	if ((inFrom & 0x3C000) == 0x3C000 || (inTo & 0xC0000) != 0x40000)
		return 10000;
	if (inFrom == inTo)
		return 0;
	int cost = (inFrom & 0x3C000) == 0 ? 1 : 2;
	if ((inTo & 0x3C000) != 0)
		cost += 10000;
	const int fromDepth = static_cast<int>(inFrom >> 1 & 7);
	const int toDepth = static_cast<int>(inTo >> 1 & 7);
	const bool toYUV = (inTo & 1) != 0;
	if (differs(1))
	{
		if (toDepth == 5)
			cost += 1;
		else if (high)
			cost += toYUV && toDepth >= fromDepth ? 2 : 100;
		else
			cost += 2;
	}
	if ((inFrom & inTo & 1) != 0 && differs(0x20))
		cost += !high || toDepth == 5 ? 1 : 10;
	if (differs(0x40))
		cost += 100;
	if (toDepth > fromDepth)
		cost += toDepth - fromDepth;
	else
		cost += (fromDepth - toDepth) * (high ? 10 : 1);
	const Bits fromAlpha = inFrom >> 7 & 7;
	const Bits toAlpha = inTo >> 7 & 7;
	const bool fromHas = fromAlpha == 1 || fromAlpha == 2;
	const bool toHas = toAlpha == 1 || toAlpha == 2;
	if (fromAlpha != toAlpha)
		cost += fromHas && toHas ? 1 : !fromHas && !toHas ? 1 : toHas ? 5 : 25;
	cost += differs(0x1000) + differs(0x2000) + differs(0x10);
	if (differs(0xC00))
	{
		const Bits compression = inFrom >> 14 & 15;
		const bool subsampled = (inTo & 0xC00) != 0;
		if (compression >= 1 && compression <= 8)
			cost += inTo == DecompressedDV(inFrom) ? 0 : subsampled ? 50 : 5;
		else
			cost += subsampled ? 50 : 0;
	}
	return std::min(cost, 10000);
}

int Cost(PixelFormat inFrom, PixelFormat inTo, RenderQuality inQuality)
{
	return Cost(inFrom.mProperties.GetValue(), inTo.mProperties.GetValue(), inQuality);
}

bool IsCustom(PixelFormat inFormat)
{
	return (inFormat.mName & 0xFF) == '_' || (inFormat.mName & 0xFF) == '@';
}

bool IsConcrete(PixelFormat inFormat)
{
	return (inFormat.mProperties.GetValue() & 0xC0000) == 0x40000;
}

bool Contains(const PixelFormats& inFormats, PixelFormat inFormat)
{
	return std::find(inFormats.begin(), inFormats.end(), inFormat) != inFormats.end();
}

void Fallback(const PixelFormats& inFormats, PixelFormat& ioBest)
{
	for (const PixelFormat format : inFormats)
		if (ioBest == kPixelFormat_Invalid && IsConcrete(format) && (format.mProperties.GetValue() & 0xC00) == 0
			&& (format.mProperties.GetValue() & 0x380) != 0)
			ioBest = format;
	for (const PixelFormat format : inFormats)
		if (ioBest == kPixelFormat_Invalid && !IsCustom(format) && IsConcrete(format))
			ioBest = format;
}

PixelFormat Nearest(const PixelFormats& inA, PixelFormat inR, const PixelFormats& inB, RenderQuality inQ, bool inPrefer)
{
	const bool any = Contains(inB, kPixelFormat_Any);
	if (inPrefer && (Contains(inB, inR) || (any && inR != kPixelFormat_Invalid)))
		return inR;
	for (const PixelFormat b : inB)
		if (Contains(inA, b) && (IsCustom(b) || IsConcrete(b)))
			return b;
	PixelFormat best = kPixelFormat_Invalid;
	int bestCost = 10000;
	int bestSecond = 10000;
	for (const PixelFormat a : inA)
	{
		for (const PixelFormat b : inB)
		{
			const int cost = Cost(a, b, inQ);
			if (cost < bestCost)
			{
				bestCost = cost;
				best = any ? a : b;
				bestSecond = Cost(inR, best, inQ);
			}
			else if (cost == bestCost && cost < 10000)
			{
				const int second = Cost(inR, b, inQ);
				if (second < bestSecond)
					best = b;
				bestSecond = std::min(second, bestSecond);
			}
		}
	}
	if (any || inB.empty())
		Fallback(inA, best);
	Fallback(inB, best);
	return best;
}

// ---- Against them ----------------------------------------------------------------------------------------------------

TEST(PixelConversionCost, IsTheSumOfItsRulesForAllPairs)
{
	for (const RenderQuality quality : kQualities)
		for (const PixelFormat from : EveryPixelFormat())
			for (const PixelFormat to : EveryPixelFormat())
				ASSERT_EQ(PixelConversionCost(from.mProperties, to.mProperties, quality), Cost(from, to, quality))
					<< from << " to " << to << " at " << quality;
}

// Values that no format has: anything at all, and near misses of formats.
TEST(PixelConversionCost, IsTheSumOfItsRulesForArbitraryProperties)
{
	std::mt19937 random(7);
	const std::vector<PixelFormat> formats = EveryPixelFormat();
	const auto near = [&] { return formats[random() % formats.size()].mProperties.GetValue() ^ 1u << random() % 32; };
	const auto concrete = [&] { return static_cast<Bits>((random() & ~0xC0000u) | 0x40000u); };
	for (int round = 0; round < 100'000; ++round)
	{
		const Bits from = round % 3 == 0 ? static_cast<Bits>(random()) : round % 3 == 1 ? near() : concrete();
		const Bits to = round % 5 == 0 ? near() : round % 5 == 1 ? from ^ 1u << random() % 32 : concrete();
		const RenderQuality quality = kQualities[random() % std::size(kQualities)];
		ASSERT_EQ(PixelConversionCost(PixelFormatProperties(from), PixelFormatProperties(to), quality),
			Cost(from, to, quality))
			<< std::hex << from << " to " << to;
	}
}

TEST(PixelConversionCost, Examples)
{
	const struct
	{
		PixelFormat mFrom, mTo;
		int mLow, mHigh;
	} cases[] = {
		{kPixelFormat_BGRA_4444_8u, kPixelFormat_VUYA_4444_8u, 103, 103},
		{kPixelFormat_VUYA_4444_8u, kPixelFormat_BGRA_4444_8u, 103, 201},
		{kPixelFormat_BGRA_4444_32f, kPixelFormat_BGRA_4444_8u, 7, 52},
		{kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRA_4444_32f, 7, 7},
		{kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRX_4444_8u, 26, 26},
		{kPixelFormat_BGRX_4444_8u, kPixelFormat_BGRA_4444_8u, 6, 6},
		{kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRP_4444_8u, 2, 2},
		{kPixelFormat_NTSCDV25, kPixelFormat_UYVY_422_8u, 2, 2},
		{kPixelFormat_NTSCDV25, kPixelFormat_VUYA_4444_8u, 12, 12},
		{kPixelFormat_UYVY_422_8u, kPixelFormat_UYVY_422_8u_709, 2, 11},
		{kPixelFormat_UYVY_422_8u, kPixelFormat_NTSCDV25, 10000, 10000},
		{kPixelFormat_NTSCDV25, kPixelFormat_NTSCDV25, 0, 0},
		{kPixelFormat_Any, kPixelFormat_Any, 10000, 10000},
		{kPixelFormat_Invalid, kPixelFormat_UYVY_422_8u, 10000, 10000},
	};
	for (const auto& test : cases)
	{
		EXPECT_EQ(PixelConversionCost(test.mFrom.mProperties, test.mTo.mProperties, kRenderQuality_Low), test.mLow);
		EXPECT_EQ(PixelConversionCost(test.mFrom.mProperties, test.mTo.mProperties, kRenderQuality_Medium), test.mHigh);
	}
}

// ---- Selection -------------------------------------------------------------------------------------------------------

TEST(SelectNearestPixelFormat, FollowsItsRulesForListsOfEveryKind)
{
	std::mt19937 random(8);
	std::vector<PixelFormat> formats = EveryPixelFormat();
	formats.push_back({MakePixelFormatName('_', 'a', 'b', 'c'), kPixelFormat_BGRA_4444_8u.mProperties});
	formats.push_back({MakePixelFormatName('@', 'a', 'b', 'c'), kPixelFormatProperties_Invalid});
	formats.push_back({MakePixelFormatName('@', 'x', 'y', 'z'), kPixelFormat_V210_422_10u.mProperties});
	formats.push_back({kPixelFormatFourCC_Invalid, kPixelFormat_BGRA_4444_8u.mProperties});
	formats.push_back({kPixelFormat_BGRA_4444_8u.mName, kPixelFormatProperties_Any});
	const auto list = [&](std::size_t inLongest)
	{
		PixelFormats chosen(random() % (inLongest + 1));
		for (PixelFormat& format : chosen)
			format = formats[random() % formats.size()];
		if (random() % 5 == 0)
			chosen.push_back(kPixelFormat_Any);
		return chosen;
	};
	int ties = 0;
	for (int round = 0; round < 60'000; ++round)
	{
		const PixelFormats sources = list(6);
		const PixelFormats destinations = list(round % 2 == 0 ? 2 : 12);
		const PixelFormat request = formats[random() % formats.size()];
		const RenderQuality quality = kQualities[random() % std::size(kQualities)];
		const bool prefer = random() % 4 == 0;
		const PixelFormat nearest = Nearest(sources, request, destinations, quality, prefer);
		ASSERT_EQ(SelectNearestPixelFormat(sources, request, destinations, quality, prefer), nearest) << round;
		ties += nearest != Nearest(sources, kPixelFormat_Invalid, destinations, quality, prefer);
	}
	EXPECT_GT(ties, 1'000) << "the request must have decided often enough";
}

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
	const PixelFormat custom{MakePixelFormatName('_', 'r', 'a', 'w'), kPixelFormatProperties_Invalid};

	EXPECT_EQ(Select({uyvy}, argb, {bgra, argb}, true), argb) << "accepted, though nobody makes it";
	EXPECT_EQ(Select({uyvy}, argb, {any}, true), argb);
	EXPECT_EQ(Select({uyvy}, kPixelFormat_Invalid, {any}, true), uyvy);
	EXPECT_EQ(Select({uyvy, bgra, argb}, uyvy, {argb, bgra}), argb) << "the consumer's order";
	EXPECT_EQ(Select({custom}, uyvy, {bgra, custom}), custom) << "a custom format that both know";
	EXPECT_EQ(Select({any}, uyvy, {any}), kPixelFormat_Invalid) << "a wildcard is no common format";
	EXPECT_EQ(Select({uyvy, argb, bgra}, uyvy, {any}), argb) << "the first with a fourth component";
	EXPECT_EQ(Select({uyvy}, uyvy, {any}), uyvy);
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

TEST(SelectNearestSourcePixelFormat, PrefersCheapThenShallowThenFirst)
{
	const auto select = [](const PixelFormats& inSources, PixelFormat inTarget)
	{ return SelectNearestSourcePixelFormat(inSources, inTarget.mProperties, kRenderQuality_High); };
	const PixelFormat bgra = kPixelFormat_BGRA_4444_8u;
	// To 16-bit BGRA the 15-bit one costs 1 + 1 and the 8-bit one 1 + 3.
	PixelFormat deep = bgra;
	deep.mProperties.SetBitDepth(kPixelFormatBitDepth_16);
	EXPECT_EQ(select({bgra, kPixelFormat_BGRA_4444_15u}, deep), kPixelFormat_BGRA_4444_15u);
	// Both cost 2, by order or by depth: the shallower one wins wherever it stands.
	PixelFormat target = kPixelFormat_BGRA_4444_15u;
	target.mProperties.SetBitDepth(kPixelFormatBitDepth_10);
	PixelFormat deeper = kPixelFormat_ARGB_4444_8u;
	deeper.mProperties.SetBitDepth(kPixelFormatBitDepth_10);
	EXPECT_EQ(select({deeper, bgra}, target), bgra);
	EXPECT_EQ(select({bgra, deeper}, target), bgra);
	EXPECT_EQ(select({kPixelFormat_BGRP_4444_8u, kPixelFormat_ARGB_4444_8u}, bgra), kPixelFormat_BGRP_4444_8u);

	const PixelFormat custom{MakePixelFormatName('@', 'r', 'a', 'w'), bgra.mProperties};
	EXPECT_EQ(select({kPixelFormat_Invalid, custom, bgra}, kPixelFormat_Any), bgra);
	EXPECT_EQ(select({custom, bgra}, bgra), custom) << "custom formats take part by their properties";
	EXPECT_EQ(select({custom}, kPixelFormat_Any), kPixelFormat_Invalid);
	EXPECT_EQ(select({bgra}, kPixelFormat_Invalid), kPixelFormat_Invalid);
	EXPECT_EQ(select({bgra}, kPixelFormat_NTSCDV25), kPixelFormat_Invalid) << "nothing becomes DV";
	EXPECT_EQ(select({}, bgra), kPixelFormat_Invalid);
}

TEST(Select4444PixelFormat, GivesAWorkingFormat)
{
	const struct
	{
		PixelFormat mFormat, mLow, mHigh;
	} cases[] = {
		{kPixelFormat_UYVY_422_8u, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
		{kPixelFormat_YUYV_422_8u_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_8u_709},
		{kPixelFormat_PALDV25, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
		{kPixelFormat_NTSC_DV100_720p, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_8u_709},
		{kPixelFormat_V210_422_10u, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_32f},
		{kPixelFormat_UYVY_422_32f_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_32f_709},
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
	for (const auto& test : cases)
	{
		EXPECT_EQ(Select4444PixelFormat(test.mFormat, kRenderQuality_Low), test.mLow) << test.mFormat;
		EXPECT_EQ(Select4444PixelFormat(test.mFormat, kRenderQuality_Medium), test.mHigh) << test.mFormat;
	}
	for (const PixelFormat format : EveryPixelFormat())
		EXPECT_EQ(Select4444PixelFormat(format, kRenderQuality_Max).mProperties.Is4444(), IsConcrete(format)) << format;
}

TEST(SelectDVDecompressionFormat, GoesByTheCompressionAlone)
{
	for (unsigned compression = 0; compression < 16; ++compression)
	{
		PixelFormat format{MakePixelFormatName('_', 'd', 'v', '?'), PixelFormatProperties(0xFFFC3FFF)};
		format.mProperties.SetCompression(compression);
		const Bits value = format.mProperties.GetValue();
		const PixelFormat decompressed = SelectDVDecompressionFormat(format);
		EXPECT_EQ(decompressed.mProperties.GetValue(), DecompressedDV(value));
		EXPECT_EQ(decompressed.mName == format.mName, DecompressedDV(value) == value);
	}
}

}   // namespace
}   // namespace zonmediatypes
