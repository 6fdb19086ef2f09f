#include "zonmediatypes/PixelAspectRatio.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"

#include <boost/rational.hpp>
#include <gtest/gtest.h>

#include <boost/lexical_cast.hpp>
#include <iomanip>
#include <limits>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

using Ratio = PixelAspectRatio;
using zoncore::PointT;
using zoncore::RectT;
using zoncore::utility::UTF16to8;

constexpr unsigned kMost = std::numeric_limits<unsigned>::max();
constexpr int kLeast = std::numeric_limits<int>::min();

std::pair<unsigned, unsigned> Terms(Ratio inRatio)
{
	unsigned numerator = 0;
	unsigned denominator = 0;
	inRatio.GetValue(numerator, denominator);
	return {numerator, denominator};
}

TEST(PixelAspectRatio, ConstantsAreKeptAsListed)
{
	const std::vector<std::pair<unsigned, unsigned>> terms = {{1, 1}, {3, 2}, {2, 1}, {0, 2}, {0, 1}, {10, 11},
		{40, 33}, {768, 702}, {1024, 702}, {1920, 1440}, {648, 720}, {864, 720}, {768, 720}, {59, 54}, {1024, 720}};
	const auto all = AllPixelAspectRatios();
	ASSERT_EQ(all.size(), terms.size());
	for (std::size_t i = 0; i < terms.size(); ++i)
		EXPECT_EQ(Terms(all[i]), terms[i]) << i;
	Ratio ratio;
	EXPECT_EQ(Terms(ratio), terms.front());
	ratio.SetValue(6, 4);
	EXPECT_EQ(Terms(ratio), std::make_pair(6u, 4u)) << "not reduced";
	EXPECT_EQ(ratio.ToDouble(), 1.5);
	EXPECT_EQ(Ratio(0, 0).ToDouble(), std::numeric_limits<double>::max());
}

// ---- Comparison ------------------------------------------------------------------------------------------------------

TEST(PixelAspectRatio, ComparesWithToleranceAndZeros)
{
	// Equal ones have the same rank.
	const std::pair<Ratio, int> ranked[] = {{kPixelAspectRatio_Unknown, 0}, {kPixelAspectRatio_Any, 0}, {{0, 5}, 0},
		{{1, kMost}, 1}, {{9, 10}, 2}, {{648, 720}, 2}, {kPixelAspectRatio_DVNTSC, 3}, {{998, 1'000}, 4},
		{{999, 1'000}, 5}, {{1, 1}, 6}, {{1'001, 1'000}, 6}, {{kMost, kMost - 1}, 6}, {{4, 3}, 7},
		{kPixelAspectRatio_HDAnamorphic1080, 7}, {{kMost, 1}, 8}, {{1, 0}, 9}, {{2, 0}, 9}};
	for (const auto& [l, left] : ranked)
	{
		for (const auto& [r, right] : ranked)
		{
			EXPECT_TRUE((l == r) == (left == right) && (l != r) == (left != right)) << l << ", " << r;
			EXPECT_TRUE((l < r) == (left < right) && (l > r) == (left > right)) << l << ", " << r;
			EXPECT_TRUE((l <= r) == (left <= right) && (l >= r) == (left >= right)) << l << ", " << r;
		}
	}
	EXPECT_EQ(Ratio(1'000, 1'001), Ratio(1, 1)) << "and 999/1000, which 1/1 is not";
	EXPECT_EQ(Ratio(1'000, 1'001), Ratio(999, 1'000));
	EXPECT_EQ(Ratio(0, 0), kPixelAspectRatio_Any);
	EXPECT_GT(Ratio(0, 0), Ratio(1'000, 1));
	EXPECT_FALSE(Ratio(0, 0) < Ratio(1, 0)) << "other ratios, and equal as numbers";
}

// ---- Text ------------------------------------------------------------------------------------------------------------

TEST(PixelAspectRatio, WritesOneDecimalOrFour)
{
	const std::pair<Ratio, const char*> cases[] = {{{1, 1}, "1.0"}, {{1'000, 1'001}, "1.0"}, {{999, 1'000}, "0.9990"},
		{{3, 2}, "1.5"}, {{4, 2}, "2.0"}, {{10, 11}, "0.9091"}, {{768, 702}, "1.0940"}, {{0, 1}, "0.0000"},
		{{0, 0}, "1.79769e+308"}, {{kMost, 1}, "4294967295.0000"}};
	for (const auto& [ratio, text] : cases)
	{
		EXPECT_EQ(UTF16to8(ratio.GetDisplayString()), text);
		EXPECT_EQ(UTF16to8(zoncore::utility::Coercion(ratio)), text);
		EXPECT_EQ(boost::lexical_cast<std::string>(ratio), text);
	}
	std::ostringstream narrow;
	narrow << std::setw(8) << std::setfill('*') << std::left << Ratio(10, 11) << '|' << Ratio();
	EXPECT_EQ(narrow.str(), "0.9091**|1.0");
	zoncore::oUTF16StringStream wide;
	wide << std::setw(5) << Ratio();
	EXPECT_EQ(UTF16to8(wide.str()), "  1.0");
}

// ---- Rectangles and sizes --------------------------------------------------------------------------------------------

TEST(PixelAspectRatioUtils, ConvertWidthsOnly)
{
	const struct
	{
		int mWidth;
		Ratio mRatio;
		int mToSquare, mFromSquare;
	} cases[] = {
		{720, kPixelAspectRatio_DVNTSC, 655, 792},
		{1'440, {4, 3}, 1'920, 1'080},
		{3, {1, 2}, 2, 6},      // 1.5 + 0.5
		{-3, {1, 2}, -1, -5},   // -1.5 + 0.5; -6 + 0.5 truncated
		{-1, {1, 1}, 0, 0},     // -0.5 truncated
		{720, {0, 1}, 720, 720},
		{720, {1, 0}, 720, 720},
		{2'147'483'647, {4'294'967'295, 1}, kLeast, 0},
		{-2'147'483'647, {1, 4'294'967'295}, 0, kLeast},
	};
	for (const auto& [width, ratio, toSquare, fromSquare] : cases)
	{
		const RectT<int> rect{1, 2, width, 4};
		EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(rect, ratio), (RectT<int>{1, 2, toSquare, 4}));
		EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(rect, ratio), (RectT<int>{1, 2, fromSquare, 4}));
		EXPECT_EQ(AdjustPixelAspectDimensionToSquarePixelDimension({width, 5}, ratio), (PointT<int>{toSquare, 5}));
		EXPECT_EQ(AdjustSquarePixelDimensionToPixelAspectDimension({width, 5}, ratio), (PointT<int>{fromSquare, 5}));
	}
}

// ---- Downsampling ----------------------------------------------------------------------------------------------------

std::pair<unsigned, unsigned> Downsample(Ratio inRatio, PointT<int> inFrom, PointT<int> inTo)
{
	return Terms(
		AdjustPixelAspectRatioForNonUniformDownsample(inRatio, {7, 8, inFrom.x, inFrom.y}, {9, 10, inTo.x, inTo.y}));
}

TEST(PixelAspectRatioUtils, KeepThePictureWhenItIsDownsampled)
{
	const auto closest = zoncore::utility::RationalApproximation(8'000'000'014.0 / 4'000'000'009.0);
	const struct
	{
		Ratio mRatio;
		PointT<int> mFrom, mTo;
		std::pair<unsigned, unsigned> mTerms;
	} cases[] = {
		{{1, 1}, {1920, 1080}, {960, 1080}, {2, 1}},   // half the width
		// The same shape, and within 1 %: as it was; beyond it both ways
		{{768, 702}, {720, 576}, {360, 288}, {768, 702}}, {{6, 4}, {1920, 1080}, {1902, 1080}, {6, 4}},
		{{6, 4}, {1920, 1080}, {1900, 1080}, {144, 95}}, {{6, 4}, {1920, 1080}, {1941, 1080}, {960, 647}},
		// A denominator of 0
		{{1, 1}, {1920, 1080}, {0, 1080}, {1, 1}}, {{3, 0}, {1920, 1080}, {960, 1080}, {1, 1}},
		{{1, 1}, {5, 0}, {5, 0}, {1, 1}},              // no shapes to compare
		{{0, 7}, {1920, 1080}, {960, 1080}, {0, 1}},   // nothing stays nothing
		// Modulo 2^32, and the sign goes to the numerator
		{{1, 1}, {-1920, 1080}, {960, 1080}, {0u - 2, 1}}, {{1, 1}, {1920, 1080}, {-960, 1080}, {0u - 2, 1}},
		// The largest term, and the nearest one that fits
		{{1, 1}, {2'147'483'646, 1}, {1, 1}, {2'147'483'646, 1}},
		{{1, 1}, {2'147'483'647, 1}, {1, 1}, {2'147'483'646, 1}},
		{{4'000'000'007, 4'000'000'009}, {2, 1}, {1, 1}, {closest.numerator(), closest.denominator()}},   // too large
		{{2, 1}, {kLeast, 1}, {1, kLeast}, {0u - 2'147'483'646, 1}},   // 2^31 x 2^31 x 2 wraps to -2^63
	};
	for (const auto& [ratio, from, to, terms] : cases)
		EXPECT_EQ(Downsample(ratio, from, to), terms) << ratio << ", " << from.x << " to " << to.x;
}

// ---- Legacy ratios ---------------------------------------------------------------------------------------------------

TEST(PixelAspectRatioUtils, MendLegacyRatios)
{
	const std::pair<Ratio, Ratio> corrections[] = {{{648, 720}, {10, 11}}, {{9, 10}, {10, 11}}, {{864, 720}, {40, 33}},
		{{768, 720}, {768, 702}}, {{59, 54}, {768, 702}}, {{1024, 720}, {1024, 702}}, {{64, 45}, {1024, 702}}};
	for (const auto& [legacy, correct] : corrections)
	{
		EXPECT_EQ(Terms(CorrectLegacyPixelAspectRatio(legacy)), Terms(correct));
		EXPECT_TRUE(IsLegacyPixelAspectRatio(legacy));
		EXPECT_FALSE(IsLegacyPixelAspectRatio(correct));
	}
	for (const Ratio other : {Ratio(10, 11), Ratio(8, 9), Ratio(2, 2), Ratio(0, 3), Ratio(3, 0), Ratio(0, 0)})
	{
		EXPECT_EQ(Terms(CorrectLegacyPixelAspectRatio(other)), Terms(other));
		EXPECT_FALSE(IsLegacyPixelAspectRatio(other));
	}
}

}   // namespace
}   // namespace zonmediatypes
