#include "zonmediatypes/PixelAspectRatio.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"

#include <gtest/gtest.h>

#include <boost/lexical_cast.hpp>
#include <cmath>
#include <iomanip>
#include <limits>
#include <random>
#include <sstream>
#include <string>
#include <type_traits>
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

static_assert(sizeof(Ratio) == 8 && std::is_trivially_copyable_v<Ratio> && std::is_standard_layout_v<Ratio>);

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
	EXPECT_EQ(Terms(kPixelAspectRatio_DVPALWide_Incorrect), terms.back());
	EXPECT_EQ(Terms(Ratio()), terms.front());

	Ratio ratio;
	ratio.SetValue(6, 4);
	EXPECT_EQ(Terms(ratio), std::make_pair(6u, 4u)) << "not reduced";
	EXPECT_EQ(ratio.ToDouble(), 1.5);
	EXPECT_EQ(Ratio(0, 0).ToDouble(), std::numeric_limits<double>::max());
	EXPECT_EQ(Ratio(4'294'967'295, 1).ToDouble(), 4'294'967'295.0);
}

// ---- Comparison ------------------------------------------------------------------------------------------------------

bool Equal(Ratio inL, Ratio inR)
{
	if (inR.GetNumerator() == 0)
		return inL.GetNumerator() == 0;
	if (inL.GetNumerator() == 0)
		return false;
	if (inR.GetDenominator() == 0)
		return inL.GetDenominator() == 0;
	if (inL.GetDenominator() == 0)
		return false;
	return std::fabs(inL.ToDouble() - inR.ToDouble()) < 0.001;
}

bool Less(Ratio inL, Ratio inR)
{
	const auto [ln, ld] = Terms(inL);
	const auto [rn, rd] = Terms(inR);
	if (ln == 0 && rn == 0)
		return false;
	if (ln != 0 && rn != 0)
	{
		if (ld == 0 && rd == 0)
			return false;
		if (ld != 0 && rd != 0 && std::fabs(inL.ToDouble() - inR.ToDouble()) < 0.001)
			return false;
	}
	return inL.ToDouble() < inR.ToDouble();
}

TEST(PixelAspectRatio, ComparesWithToleranceAndZeros)
{
	std::vector<Ratio> ratios = {{1, 0}, {2, 0}, {0, 0}, {0, 5}, {9, 10}, {1'000, 1'001}, {1'001, 1'000}, {999, 1'000},
		{998, 1'000}, {4, 3}, {1'000, 1}, {4'294'967'295, 1}, {1, 4'294'967'295}, {4'294'967'295, 4'294'967'294}};
	ratios.insert(ratios.end(), AllPixelAspectRatios().begin(), AllPixelAspectRatios().end());
	for (const Ratio l : ratios)
	{
		for (const Ratio r : ratios)
		{
			const auto [ln, ld] = Terms(l);
			const auto [rn, rd] = Terms(r);
			SCOPED_TRACE(
				std::to_string(ln) + "/" + std::to_string(ld) + ", " + std::to_string(rn) + "/" + std::to_string(rd));
			EXPECT_EQ(l == r, Equal(l, r));
			EXPECT_EQ(l != r, !Equal(l, r));
			EXPECT_EQ(l < r, Less(l, r));
			EXPECT_EQ(l > r, Less(r, l));
			EXPECT_EQ(l <= r, Equal(l, r) || Less(l, r));
			EXPECT_EQ(l >= r, Equal(l, r) || Less(r, l));
		}
	}
	EXPECT_EQ(kPixelAspectRatio_Unknown, kPixelAspectRatio_Any);
	EXPECT_EQ(Ratio(648, 720), Ratio(9, 10));
	EXPECT_NE(Ratio(9, 10), kPixelAspectRatio_DVNTSC);
	EXPECT_GT(Ratio(1, 0), Ratio(1'000, 1));
}

// ---- Text ------------------------------------------------------------------------------------------------------------

TEST(PixelAspectRatio, WritesOneDecimalOrFour)
{
	const std::pair<Ratio, const char*> cases[] = {
		{{1, 1}, "1.0"},
		{{1'000, 1'001}, "1.0"},
		{{999, 1'000}, "0.9990"},
		{{3, 2}, "1.5"},
		{{4, 2}, "2.0"},
		{{10, 11}, "0.9091"},
		{{768, 702}, "1.0940"},
		{{3, 1}, "3.0000"},
		{{0, 1}, "0.0000"},
		{{0, 0}, "1.79769e+308"},
		{{1, 0}, "1.79769e+308"},
		{{4'294'967'295, 1}, "4294967295.0000"},
	};
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
	constexpr int kLeast = std::numeric_limits<int>::min();
	const struct
	{
		int mWidth;
		Ratio mRatio;
		int mToSquare, mFromSquare;
	} cases[] = {
		{720, kPixelAspectRatio_DVNTSC, 655, 792},
		{655, kPixelAspectRatio_DVNTSC, 595, 721},
		{720, kPixelAspectRatio_DVPALWide, 1'050, 494},
		{1'440, {4, 3}, 1'920, 1'080},
		{3, {1, 2}, 2, 6},      // 1.5 + 0.5
		{-3, {1, 2}, -1, -5},   // -1.5 + 0.5; -6 + 0.5 truncated
		{-1, {1, 1}, 0, 0},     // -0.5 truncated
		{720, {0, 1}, 720, 720},
		{720, {1, 0}, 720, 720},
		{2'147'483'647, {4'294'967'295, 1}, kLeast, 0},
		{-2'147'483'647, {1, 4'294'967'295}, 0, kLeast},
	};
	for (const auto& test : cases)
	{
		const RectT<int> rect{1, 2, test.mWidth, 4};
		const PointT<int> size{test.mWidth, 5};
		EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(rect, test.mRatio), (RectT<int>{1, 2, test.mToSquare, 4}));
		EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(rect, test.mRatio), (RectT<int>{1, 2, test.mFromSquare, 4}));
		EXPECT_EQ(
			AdjustPixelAspectDimensionToSquarePixelDimension(size, test.mRatio), (PointT<int>{test.mToSquare, 5}));
		EXPECT_EQ(
			AdjustSquarePixelDimensionToPixelAspectDimension(size, test.mRatio), (PointT<int>{test.mFromSquare, 5}));
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
	using T = std::pair<unsigned, unsigned>;
	EXPECT_EQ(Downsample({1, 1}, {1920, 1080}, {960, 1080}), T(2, 1));
	EXPECT_EQ(Downsample({1, 1}, {1920, 1080}, {1440, 1080}), T(4, 3));
	EXPECT_EQ(Downsample({768, 702}, {720, 576}, {360, 288}), T(768, 702)) << "the same shape: as it was";
	EXPECT_EQ(Downsample({6, 4}, {1920, 1080}, {1902, 1080}), T(6, 4)) << "within 1 %";
	EXPECT_EQ(Downsample({6, 4}, {1920, 1080}, {1900, 1080}), T(144, 95)) << "beyond";
	EXPECT_EQ(Downsample({1, 1}, {1920, 1080}, {0, 1080}), T(1, 1)) << "a denominator of 0";
	EXPECT_EQ(Downsample({3, 0}, {1920, 1080}, {960, 1080}), T(1, 1));
	EXPECT_EQ(Downsample({0, 7}, {1920, 1080}, {960, 1080}), T(0, 1));
	EXPECT_EQ(Downsample({1, 1}, {-1920, 1080}, {960, 1080}), T(static_cast<unsigned>(-2), 1)) << "modulo 2^32";
	EXPECT_EQ(Downsample({1, 1}, {0, 0}, {960, 1080}), T(1, 1));
	EXPECT_EQ(Downsample({1, 1}, {5, 0}, {5, 0}), T(1, 1));
	EXPECT_EQ(Downsample({1, 1}, {2'147'483'646, 1}, {1, 1}), T(2'147'483'646, 1)) << "the largest term";
	EXPECT_EQ(Downsample({1, 1}, {2'147'483'647, 1}, {1, 1}), T(2'147'483'646, 1)) << "the nearest one that fits";
	const auto closest = zoncore::utility::RationalApproximation(8'000'000'014.0 / 4'000'000'009.0);
	EXPECT_EQ(
		Downsample({4'000'000'007, 4'000'000'009}, {2, 1}, {1, 1}), T(closest.numerator(), closest.denominator()));
	// 2^31 x 2^31 x 2 as a numerator wraps to -2^63.
	constexpr int kLeast = std::numeric_limits<int>::min();
	EXPECT_EQ(Downsample({2, 1}, {kLeast, 1}, {1, kLeast}), T(static_cast<unsigned>(-2'147'483'646), 1));
}

TEST(PixelAspectRatioUtils, TakeAnyRectangle)
{
	std::mt19937 random(10);
	for (int round = 0; round < 20'000; ++round)
	{
		const auto any = [&] { return static_cast<int>(random() >> random() % 32); };
		const Ratio ratio(static_cast<unsigned>(any()), static_cast<unsigned>(any()));
		const PointT<int> from{any(), any()};
		const PointT<int> to{any(), any()};
		const auto [numerator, denominator] = Downsample(ratio, from, to);
		EXPECT_TRUE(denominator != 0 || std::pair(numerator, denominator) == Terms(ratio));
	}
}

// ---- Legacy ratios ---------------------------------------------------------------------------------------------------

TEST(PixelAspectRatioUtils, MendLegacyRatios)
{
	const std::pair<Ratio, Ratio> corrections[] = {
		{{648, 720}, {10, 11}},
		{{9, 10}, {10, 11}},
		{{864, 720}, {40, 33}},
		{{768, 720}, {768, 702}},
		{{59, 54}, {768, 702}},
		{{1024, 720}, {1024, 702}},
		{{64, 45}, {1024, 702}},
	};
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
