#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <string>
#include <vector>

namespace zonmediatypes
{
namespace
{

struct RequiredLayout
{
	std::string mFactory;
	AudioChannelLayout (*mCreate)();
	std::string mLabels;
};

// clang-format off
#define LAYOUT(inFactory, inLabels) {#inFactory, inFactory, inLabels}
const std::vector<RequiredLayout> sRequiredLayouts = {
	LAYOUT(CreateMonoChannelLayout, "*"),
	LAYOUT(CreateStereoChannelLayout, "L R"),
	LAYOUT(Create51ChannelLayout, "L R C LFE Ls Rs"),
	LAYOUT(CreateBroadcast51ChannelLayout, "L R C LFE Ls Rs"),
	LAYOUT(CreateLegacy51ChannelLayout, "L R Ls Rs C LFE"),
	LAYOUT(CreateQuadraphonicChannelLayout, "L R Ls Rs"),
	LAYOUT(Create7_1ItuChannelLayout, "L R C LFE Ls Rs Rls Rrs"),
	LAYOUT(CreateMatrixStereoChannelLayout, "Lt Rt"),
	LAYOUT(Create_Ls_Rs_ChannelLayout, "Ls Rs"),
	LAYOUT(Create_Lc_Rc_ChannelLayout, "Lc Rc"),
	LAYOUT(Create_Lsd_Rsd_ChannelLayout, "Lsd Rsd"),
	LAYOUT(Create_C_LFE_ChannelLayout, "C LFE"),
	LAYOUT(Create_Vhl_Vhr_ChannelLayout, "Vhl Vhr"),
	LAYOUT(Create_Tsl_Tsr_ChannelLayout, "Tsl Tsr"),
	LAYOUT(Create_Tbl_Tbr_ChannelLayout, "Tbl Tbr"),
	LAYOUT(Create_Bfl_Bfr_ChannelLayout, "Bfl Bfr"),
	LAYOUT(Create_L_R_C_ChannelLayout, "L R C"),
	LAYOUT(Create_C_L_R_ChannelLayout, "C L R"),
	LAYOUT(Create_L_C_R_ChannelLayout, "L C R"),
	LAYOUT(Create_L_R_Cs_ChannelLayout, "L R Cs"),
	LAYOUT(Create_L_R_LFE_ChannelLayout, "L R LFE"),
	LAYOUT(Create_L_R_C_Cs_ChannelLayout, "L R C Cs"),
	LAYOUT(Create_C_L_R_Cs_ChannelLayout, "C L R Cs"),
	LAYOUT(Create_L_C_R_Cs_ChannelLayout, "L C R Cs"),
	LAYOUT(Create_L_R_LFE_Cs_ChannelLayout, "L R LFE Cs"),
	LAYOUT(Create_L_R_Cs_LFE_ChannelLayout, "L R Cs LFE"),
	LAYOUT(Create_L_R_C_LFE_ChannelLayout, "L R C LFE"),
	LAYOUT(Create_L_C_R_LFE_ChannelLayout, "L C R LFE"),
	LAYOUT(CreateAmbisonicsBFormatChannelLayout, "W X Y Z"),
	LAYOUT(CreatePentagonalChannelLayout, "L R Ls Rs C"),
	LAYOUT(Create_L_R_C_Ls_Rs_ChannelLayout, "L R C Ls Rs"),
	LAYOUT(Create_L_R_Ls_Rs_C_ChannelLayout, "L R Ls Rs C"),
	LAYOUT(Create_L_C_R_Ls_Rs_ChannelLayout, "L C R Ls Rs"),
	LAYOUT(Create_C_L_R_Ls_Rs_ChannelLayout, "C L R Ls Rs"),
	LAYOUT(Create_L_R_LFE_Ls_Rs_ChannelLayout, "L R LFE Ls Rs"),
	LAYOUT(Create_L_R_C_LFE_Cs_ChannelLayout, "L R C LFE Cs"),
	LAYOUT(Create_L_C_R_Cs_LFE_ChannelLayout, "L C R Cs LFE"),
	LAYOUT(Create_L_R_Ls_Rs_LFE_ChannelLayout, "L R Ls Rs LFE"),
	LAYOUT(Create_L_C_R_Ls_Rs_LFE_ChannelLayout, "L C R Ls Rs LFE"),
	LAYOUT(Create_C_L_R_Ls_Rs_LFE_ChannelLayout, "C L R Ls Rs LFE"),
	LAYOUT(Create_C_L_R_Ls_Rs_Cs_ChannelLayout, "C L R Ls Rs Cs"),
	LAYOUT(CreateHexagonalChannelLayout, "L R Ls Rs C Cs"),
	LAYOUT(Create_L_R_C_Ls_Rs_Cs_ChannelLayout, "L R C Ls Rs Cs"),
	LAYOUT(Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout, "L R Ls Rs Lsd Rsd"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout, "L R C LFE Ls Rs Cs"),
	LAYOUT(Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout, "L R LFE Ls Rs Lsd Rsd"),
	LAYOUT(Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout, "L R Ls Rs C Rls Rrs"),
	LAYOUT(Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout, "L R Ls Rs C Lc Rc"),
	LAYOUT(Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout, "L R C Ls Rs Lc Rc"),
	LAYOUT(Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout, "C L R Ls Rs Cs LFE"),
	LAYOUT(Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout, "C L R Ls Rs Rls Rrs"),
	LAYOUT(Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout, "L R C Ls Rs Lsd Rsd"),
	LAYOUT(Create7_1ChannelLayout, "L R C LFE Ls Rs Lc Rc"),
	LAYOUT(Create7_1MpegChannelLayout, "C Lc Rc L R Ls Rs LFE"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout, "L R C LFE Ls Rs Lsd Rsd"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout, "L R C LFE Ls Rs Pl Pr"),
	LAYOUT(Create7_1EMagicChannelLayout, "L R Ls Rs C LFE Lc Rc"),
	LAYOUT(CreateSmpteDtvChannelLayout, "L R C LFE Ls Rs Lt Rt"),
	LAYOUT(CreateOctagonalChannelLayout, "L R Ls Rs C Cs Lsd Rsd"),
	LAYOUT(Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout, "C L R Ls Rs Rls Rrs Cs"),
	LAYOUT(Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout, "L R C Ls Rs Lc Rc Cs"),
	LAYOUT(Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout, "L R C Ls Rs Cs Lsd Rsd"),
	LAYOUT(CreateCubeChannelLayout, "L R Ls Rs Vhl Vhr Tbl Tbr"),
	LAYOUT(Create_VST_7_1_Cine_Top_Center_Layout, "L R C LFE Ls Rs Cs Ts"),
	LAYOUT(Create_VST_7_1_Cine_Center_High_Layout, "L R C LFE Ls Rs Cs Vhc"),
	LAYOUT(Create_VST_7_1_Cine_Front_High_Layout, "L R C LFE Ls Rs Vhl Vhr"),
	LAYOUT(Create_VST_7_1_Cine_Side_High_Layout, "L R C LFE Ls Rs Tsl Tsr"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout, "L R C LFE Ls Rs Lc Rc Cs"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout, "L R C LFE Ls Rs Cs Lsd Rsd"),
	LAYOUT(Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout, "L R LFE Ls Rs Vhl Vhc Vhr Bfc"),
	LAYOUT(Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Vhl Vhr Tbl Tbr"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Vhl Vhr Tbl Tbr"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout, "L R C LFE Ls Rs Lsd Rsd Tsl Tsr"),
	LAYOUT(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Ts Vhl Vhr Tbl Tbr"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Ts Vhl Vhr Tbl Tbr"),
	LAYOUT(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Ts Vhl Vhc Vhr Tbl Tbr"),
	LAYOUT(CreateVST10_2ChannelLayout, "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Ts Vhl Vhc Vhr Tbl Tbr"),
	LAYOUT(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	LAYOUT(CreateVST10_2_PlusChannelLayout, "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2"),
	LAYOUT(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	LAYOUT(CreateSMPTEDigitalCinema1Channel, "* * C * * * * * * * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema2Channel, "Lt Rt * * * * * * * * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema4Channel, "L R C * Cs * * * * * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema6Channel, "L R C LFE Ls Rs * * * * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema7Channel, "L R C LFE Ls Rs * * Cs * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema8Channel, "L R C LFE Ls Rs Lc Rc * * * * * * * *"),
	LAYOUT(CreateSMPTEDigitalCinema9Channel, "L R C LFE Ls Rs Lc Rc Cs * * * * * * *"),
	LAYOUT(CreateVST22_2ChannelLayout, "L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr"),
};
#undef LAYOUT

struct RequiredPartners
{
	std::string_view mLabel, mLeftRight, mFrontBack, mTopMiddle, mTopBottom, mBottomMiddle;
};

const std::vector<RequiredPartners> sRequiredPartners = {
	{"L", "R", "Ls", "Vhl", "*", "Bfl"},
	{"R", "L", "Rs", "R", "*", "Bfr"},
	{"C", "*", "Cs", "Vhc", "*", "Bfc"},
	{"LFE", "LFE2", "*", "*", "*", "*"},
	{"Ls", "Rs", "L", "Tbl", "*", "*"},
	{"Rs", "Ls", "R", "Tbr", "*", "*"},
	{"Cs", "*", "C", "Tbc", "*", "*"},
	{"Lc", "Rc", "Rls", "*", "*", "*"},
	{"Rc", "Lc", "Rrs", "*", "*", "*"},
	{"Lsd", "Rsd", "*", "*", "*", "*"},
	{"Rsd", "Lsd", "*", "*", "*", "*"},
	{"Ts", "*", "*", "*", "*", "*"},
	{"Vhl", "Vhr", "Tbl", "L", "Bfl", "*"},
	{"Vhr", "Vhl", "Tbr", "R", "Bfr", "*"},
	{"Vhc", "*", "Tbc", "C", "Bfc", "*"},
	{"Tbl", "Tbr", "Vhl", "Ls", "*", "*"},
	{"Tbr", "Tbl", "Vhr", "Rs", "*", "*"},
	{"Tbc", "*", "Vhc", "Cs", "*", "*"},
	{"Lw", "Rw", "*", "*", "*", "*"},
	{"Rw", "Lw", "*", "*", "*", "*"},
	{"Tsl", "Tsr", "*", "*", "*", "*"},
	{"Tsr", "Tsl", "*", "*", "*", "*"},
	{"Rls", "Rrs", "Lc", "*", "*", "*"},
	{"Rrs", "Rls", "Rc", "*", "*", "*"},
	{"LFE2", "LFE", "*", "*", "*", "*"},
	{"Lt", "Rt", "*", "*", "*", "*"},
	{"Rt", "Lt", "*", "*", "*", "*"},
	{"Bfl", "Bfr", "*", "*", "Vhl", "L"},
	{"Bfc", "*", "*", "*", "Vhc", "C"},
	{"Bfr", "Bfl", "*", "*", "R", "R"},
	{"Pl", "Pr", "*", "*", "*", "*"},
	{"Pr", "Pl", "*", "*", "*", "*"},
};
// clang-format on

// Numbers around every limit of the tables, and wild ones.
std::vector<AudioChannelLabel> AllInterestingLabels()
{
	std::vector<AudioChannelLabel> labels;
	for (int value = -300; value <= 300; ++value)
		labels.push_back(static_cast<AudioChannelLabel>(value));
	for (const int value : {std::numeric_limits<int>::min(), std::numeric_limits<int>::max(), 100 - 65'536, 356})
		labels.push_back(static_cast<AudioChannelLabel>(value));
	return labels;
}

TEST(AudioChannelLabel, HasTheRequiredNumbers)
{
	const auto labels = AllAudioChannelLabels();
	ASSERT_EQ(labels.size(), kRequiredLabels.size());
	for (std::size_t i = 0; i < labels.size(); ++i)
	{
		EXPECT_EQ(kRequiredLabels[i].mLabel, kRequiredLabels[i].mValue) << kRequiredLabels[i].mName;
		EXPECT_EQ(labels[i], kRequiredLabels[i].mValue);
	}
}

TEST(AudioChannelDescription, ComparesBySignedNumber)
{
	EXPECT_EQ(AudioChannelDescription(), kAudioChannelLabel_Discrete);
	EXPECT_LT(static_cast<AudioChannelLabel>(-1), AudioChannelDescription());
	EXPECT_LT(AudioChannelDescription(static_cast<AudioChannelLabel>(-1)), AudioChannelDescription());
	EXPECT_LT(AudioChannelDescription(), AudioChannelDescription(kAudioChannelLabel_FrontLeft));
}

TEST(ChannelLayouts, AreTheRequiredOnes)
{
	const auto catalogue = AllChannelLayouts();
	ASSERT_EQ(catalogue.size(), sRequiredLayouts.size());
	for (std::size_t i = 0; i < catalogue.size(); ++i)
	{
		const RequiredLayout& required = sRequiredLayouts[i];
		const AudioChannelLayout layout = ReadLayout(required.mLabels);
		EXPECT_EQ(required.mCreate(), layout) << required.mFactory;
		EXPECT_TRUE(std::ranges::equal(catalogue[i].mLabels, layout)) << required.mFactory;
		const std::string name = "Create" + std::string(catalogue[i].mName);
		EXPECT_TRUE(required.mFactory == name || required.mFactory == name + "ChannelLayout") << name;
		EXPECT_EQ(catalogue[i].mName.find("ChannelLayout"), std::string_view::npos);
	}
}

TEST(ChannelLayouts, OfAnyCount)
{
	EXPECT_EQ(CreateMultichannelLayout(-3), AudioChannelLayout());
	EXPECT_EQ(CreateMultichannelLayout(std::numeric_limits<int>::min()), AudioChannelLayout());
	EXPECT_EQ(CreateMultichannelLayout(0), AudioChannelLayout());
	EXPECT_EQ(CreateMultichannelLayout(3), ReadLayout("* * *"));
	EXPECT_EQ(CreateMultichannelLayout(100'000), AudioChannelLayout(100'000));
}

TEST(ChannelLayouts, WithDefaultLabels)
{
	const std::vector<std::string> labels = {"", "*", "L R", "* * *", "L R Ls Rs", "* * * * *", "L R C LFE Ls Rs",
		"* * * * * * *", "L R C LFE Ls Rs Rls Rrs", "* * * * * * * * *"};
	for (unsigned long count = 0; count < labels.size(); ++count)
		EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(count), ReadLayout(labels[count])) << count;
	EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(100'000).size(), 100'000u);
	EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(0xFFFF'FFFF), AudioChannelLayout());
	EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(0x8000'0000), AudioChannelLayout());
	EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(0x1'0000'0002), ReadLayout("* *"));
}

TEST(LabelPairs, AreTheRequiredOnes)
{
	for (const AudioChannelLabel label : AllInterestingLabels())
	{
		const auto row = std::ranges::find_if(sRequiredPartners,
			[&](const RequiredPartners& inRow) { return LabelByAbbreviation(inRow.mLabel) == label; });
		const RequiredPartners required
			= row != sRequiredPartners.end() ? *row : RequiredPartners{"", "*", "*", "*", "*", "*"};
		EXPECT_EQ(LeftRightPair(label), LabelByAbbreviation(required.mLeftRight)) << label;
		EXPECT_EQ(FrontBackPair(label), LabelByAbbreviation(required.mFrontBack)) << label;
		EXPECT_EQ(TopMiddlePair(label), LabelByAbbreviation(required.mTopMiddle)) << label;
		EXPECT_EQ(TopBottomPair(label), LabelByAbbreviation(required.mTopBottom)) << label;
		EXPECT_EQ(BottomMiddlePair(label), LabelByAbbreviation(required.mBottomMiddle)) << label;
	}
}

TEST(LabelPairs, StereoPairsAreTheLeftRightOnes)
{
	int pairs = 0;
	for (const AudioChannelLabel first : AllInterestingLabels())
	{
		for (const AudioChannelLabel second : AllInterestingLabels())
		{
			const bool isPair = LeftRightPair(first) == second && second != kAudioChannelLabel_Discrete;
			EXPECT_EQ(IsStereoPair(first, second), isPair) << first << ' ' << second;
			pairs += isPair;
		}
	}
	EXPECT_EQ(pairs, 26);
	EXPECT_TRUE(IsStereoPair(kAudioChannelLabel_LowFrequency, kAudioChannelLabel_LFE2));
	EXPECT_FALSE(IsStereoPair(kAudioChannelLabel_Discrete, kAudioChannelLabel_Discrete));
}

TEST(LayoutQueries, FindLabels)
{
	EXPECT_FALSE(HasChannelLabeling({}));
	EXPECT_FALSE(HasChannelLabeling(CreateMultichannelLayout(8)));
	EXPECT_TRUE(HasChannelLabeling(ReadLayout("* * -1")));
	EXPECT_TRUE(HasChannelLabeling(CreateSMPTEDigitalCinema1Channel()));
	EXPECT_FALSE(HasChannelLabel({}, kAudioChannelLabel_Discrete));
	EXPECT_TRUE(HasChannelLabel(ReadLayout("L *"), kAudioChannelLabel_Discrete));
	EXPECT_TRUE(HasChannelLabel(ReadLayout("L 5"), static_cast<AudioChannelLabel>(5)));
	EXPECT_TRUE(HasLFEChannel(ReadLayout("LFE2 LFE")));
	EXPECT_FALSE(HasLFEChannel(ReadLayout("L R LFE2")));
}

TEST(LayoutQueries, CompareChannelsInAnyOrder)
{
	EXPECT_TRUE(ContainsSameChannelsIgnoreOrder({}, {}));
	EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(CreateBroadcast51ChannelLayout(), CreateLegacy51ChannelLayout()));
	EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(ReadLayout("* L * -1"), ReadLayout("-1 * * L")));
	EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(ReadLayout("L R"), ReadLayout("L R R")));
	EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(ReadLayout("L L R"), ReadLayout("L R R")));
}

TEST(LayoutQueries, CountTheChannelsOfAllStreams)
{
	EXPECT_EQ(GetChannelCount({}), 0u);
	EXPECT_EQ(GetChannelCount({ReadLayout("L R"), ReadLayout("L R C LFE Ls Rs"), ReadLayout("*")}), 9u);
}

}   // namespace
}   // namespace zonmediatypes
