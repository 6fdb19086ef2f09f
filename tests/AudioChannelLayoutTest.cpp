#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <limits>
#include <sstream>
#include <string>
#include <vector>

namespace
{

using namespace zonmediatypes;

// ---- Labels and their partners ---------------------------------------------------------------------------------------

TEST(AudioChannelLabel, HasTheRequiredNumbersAndIsOrderedByThem)
{
	EXPECT_TRUE(std::ranges::equal(AllAudioChannelLabels(), kRequiredLabels, {}, {}, &RequiredLabel::mLabel));
	for (const RequiredLabel& label : kRequiredLabels)
		EXPECT_EQ(label.mLabel, label.mValue) << label.mName;
	EXPECT_EQ(AudioChannelDescription(), kAudioChannelLabel_Discrete);
	EXPECT_LT(AudioChannelDescription(static_cast<AudioChannelLabel>(-1)), AudioChannelDescription());
	EXPECT_LT(AudioChannelDescription(), AudioChannelDescription(kAudioChannelLabel_FrontLeft));
}

TEST(LabelPairs, AreTheRequiredOnes)
{
	std::vector<int> values = {std::numeric_limits<int>::min(), std::numeric_limits<int>::max(), 100 - 65'536, 356};
	for (int value = -300; value <= 300; ++value)
		values.push_back(value);
	for (const int value : values)
	{
		const auto row = std::ranges::find(kRequiredLabels, value, &RequiredLabel::mValue);
		const AudioChannelLayout partners = ReadLayout(row != kRequiredLabels.end() ? row->mPartners : "* * * * *");
		const auto label = static_cast<AudioChannelLabel>(value);
		EXPECT_EQ((AudioChannelLayout{LeftRightPair(label), FrontBackPair(label), TopMiddlePair(label),
					  TopBottomPair(label), BottomMiddlePair(label)}),
			partners)
			<< value;
		for (const RequiredLabel& other : kRequiredLabels)
			EXPECT_EQ(IsStereoPair(label, other.mLabel),
				other.mLabel != kAudioChannelLabel_Discrete && other.mLabel == partners[0].mLabel)
				<< value << ' ' << other.mName;
	}
}

// ---- Catalogue of layouts --------------------------------------------------------------------------------------------

struct RequiredLayout
{
	std::string mFactory;
	AudioChannelLayout (*mCreate)();
	std::string mLabels;
};

// The layouts that are called after what they are for; the names of the others are their labels: "_L_R_C_".
// clang-format off
#define ROW(inFactory, inLabels) {#inFactory, inFactory, inLabels}
const std::vector<RequiredLayout> sRequiredLayouts = {
	ROW(CreateMonoChannelLayout, "*"),
	ROW(CreateStereoChannelLayout, "L R"),
	ROW(Create51ChannelLayout, "L R C LFE Ls Rs"),
	ROW(CreateBroadcast51ChannelLayout, "L R C LFE Ls Rs"),
	ROW(CreateLegacy51ChannelLayout, "L R Ls Rs C LFE"),
	ROW(CreateQuadraphonicChannelLayout, "L R Ls Rs"),
	ROW(Create7_1ItuChannelLayout, "L R C LFE Ls Rs Rls Rrs"),
	ROW(CreateMatrixStereoChannelLayout, "Lt Rt"),
	ROW(CreateAmbisonicsBFormatChannelLayout, "W X Y Z"),
	ROW(CreatePentagonalChannelLayout, "L R Ls Rs C"),
	ROW(CreateHexagonalChannelLayout, "L R Ls Rs C Cs"),
	ROW(Create7_1ChannelLayout, "L R C LFE Ls Rs Lc Rc"),
	ROW(Create7_1MpegChannelLayout, "C Lc Rc L R Ls Rs LFE"),
	ROW(Create7_1EMagicChannelLayout, "L R Ls Rs C LFE Lc Rc"),
	ROW(CreateSmpteDtvChannelLayout, "L R C LFE Ls Rs Lt Rt"),
	ROW(CreateOctagonalChannelLayout, "L R Ls Rs C Cs Lsd Rsd"),
	ROW(CreateCubeChannelLayout, "L R Ls Rs Vhl Vhr Tbl Tbr"),
	ROW(CreateVST10_2ChannelLayout, "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2"),
	ROW(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	ROW(CreateVST10_2_PlusChannelLayout, "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2"),
	ROW(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	ROW(CreateVST22_2ChannelLayout, "L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr"),
	ROW(Create_VST_7_1_Cine_Top_Center_Layout, "L R C LFE Ls Rs Cs Ts"),
	ROW(Create_VST_7_1_Cine_Center_High_Layout, "L R C LFE Ls Rs Cs Vhc"),
	ROW(Create_VST_7_1_Cine_Front_High_Layout, "L R C LFE Ls Rs Vhl Vhr"),
	ROW(Create_VST_7_1_Cine_Side_High_Layout, "L R C LFE Ls Rs Tsl Tsr"),
	ROW(CreateSMPTEDigitalCinema1Channel, "* * C * * * * * * * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema2Channel, "Lt Rt * * * * * * * * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema4Channel, "L R C * Cs * * * * * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema6Channel, "L R C LFE Ls Rs * * * * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema7Channel, "L R C LFE Ls Rs * * Cs * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema8Channel, "L R C LFE Ls Rs Lc Rc * * * * * * * *"),
	ROW(CreateSMPTEDigitalCinema9Channel, "L R C LFE Ls Rs Lc Rc Cs * * * * * * *"),
};
#undef ROW
// clang-format on

TEST(ChannelLayouts, AreTheRequiredOnes)
{
	EXPECT_EQ(AllChannelLayouts().size(), 89u);
	for (const auto& [name, labels] : AllChannelLayouts())
	{
		const auto required = std::ranges::find_if(sRequiredLayouts,
			[factory = "Create" + std::string(name)](const RequiredLayout& inLayout)
			{ return inLayout.mFactory == factory || inLayout.mFactory == factory + "ChannelLayout"; });
		std::string words(name);
		std::ranges::replace(words, '_', ' ');
		const AudioChannelLayout layout = ReadLayout(required != sRequiredLayouts.end() ? required->mLabels : words);
		EXPECT_TRUE(std::ranges::equal(labels, layout)) << name;
	}
	EXPECT_EQ(Create_L_R_C_LFE_ChannelLayout(), ReadLayout("L R C LFE"));
	std::ostringstream header;
	header << std::ifstream(ZON_TEST_DATA "/../../zonmediatypes/AudioChannelLayoutCatalogue.h").rdbuf();
	for (const auto& [factory, create, labels] : sRequiredLayouts)
	{
		EXPECT_EQ(create(), ReadLayout(labels)) << factory;
		// The declaration with the line before it, and its comment in one of them.
		const std::size_t place = header.str().find("_API AudioChannelLayout " + factory + "();");
		const std::size_t begin = header.str().rfind('\n', header.str().rfind('\n', place) - 1);
		const std::string lines = header.str().substr(begin, header.str().find('\n', place) - begin);
		EXPECT_TRUE(lines.ends_with("///< " + labels) || lines.starts_with("\n/// " + labels + "\n")) << lines;
	}
}

TEST(ChannelLayouts, OfAnyCount)
{
	const char* const defaults[] = {"", "*", "L R", "* * *", "L R Ls Rs", "* * * * *", "L R C LFE Ls Rs",
		"* * * * * * *", "L R C LFE Ls Rs Rls Rrs", "* * * * * * * * *"};
	for (std::size_t count = 0; count < std::size(defaults); ++count)
		EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(count), ReadLayout(defaults[count])) << count;
	if constexpr (sizeof(std::size_t) > 4)
	{
		EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(0x1'0000'0002), ReadLayout("* *"));
	}
	for (const std::size_t count : {0xFFFF'FFFFu, 0x8000'0000u})
		EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(count), AudioChannelLayout());
	for (const int count : {std::numeric_limits<int>::min(), -1, 0, 1, 3, 100'000})
		EXPECT_EQ(CreateMultichannelLayout(count), AudioChannelLayout(static_cast<std::size_t>(std::max(count, 0))));
}

// ---- Queries ---------------------------------------------------------------------------------------------------------

TEST(LayoutQueries, FindLabels)
{
	for (const char* const unlabelled : {"", "*", "* * *"})
		EXPECT_FALSE(HasChannelLabeling(ReadLayout(unlabelled)));
	EXPECT_TRUE(HasChannelLabeling(ReadLayout("* * -1")));
	EXPECT_FALSE(HasChannelLabel({}, kAudioChannelLabel_Discrete));
	EXPECT_TRUE(HasChannelLabel(ReadLayout("L *"), kAudioChannelLabel_Discrete));
	EXPECT_TRUE(HasChannelLabel(ReadLayout("L 5"), static_cast<AudioChannelLabel>(5)));
	EXPECT_TRUE(HasLFEChannel(ReadLayout("LFE2 LFE")));
	EXPECT_FALSE(HasLFEChannel(ReadLayout("L R LFE2")));
	EXPECT_EQ(GetChannelCount({}), 0u);
	EXPECT_EQ(GetChannelCount({ReadLayout("L R"), ReadLayout("L R C LFE Ls Rs"), ReadLayout("*")}), 9u);
}

TEST(LayoutQueries, CompareChannelsInAnyOrder)
{
	const auto areSame = [](const char* inFirst, const char* inSecond)
	{ return ContainsSameChannelsIgnoreOrder(ReadLayout(inFirst), ReadLayout(inSecond)); };
	EXPECT_TRUE(areSame("", ""));
	EXPECT_TRUE(areSame("* L * -1", "L * -1 *"));
	EXPECT_FALSE(areSame("L R", "L R R"));
	EXPECT_FALSE(areSame("L L R", "L R R"));
}

}   // namespace
