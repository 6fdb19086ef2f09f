#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <string>
#include <utility>
#include <vector>

namespace
{

using namespace zonmediatypes;

// ---- Labels and their partners ---------------------------------------------------------------------------------------

TEST(AudioChannelLabel, HasTheRequiredNumbers)
{
	EXPECT_TRUE(std::ranges::equal(AllAudioChannelLabels(), kRequiredLabels, {}, {}, &RequiredLabel::mLabel));
	for (const RequiredLabel& label : kRequiredLabels)
		EXPECT_EQ(label.mLabel, label.mValue) << label.mName;
}

TEST(AudioChannelDescription, ComparesBySignedNumber)
{
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
	std::string_view mName;
	AudioChannelLayout (*mCreate)();
	std::string mLabels;
};

// The layouts that are called after what they are for; the names of the others are their labels: "_L_R_C_".
// clang-format off
#define NAMED(inName, inLabels) {#inName, Create##inName##ChannelLayout, inLabels}
#define OTHER(inName, inLabels) {#inName, Create##inName, inLabels}
const std::vector<RequiredLayout> sRequiredLayouts = {
	NAMED(Mono, "*"),
	NAMED(Stereo, "L R"),
	NAMED(51, "L R C LFE Ls Rs"),
	NAMED(Broadcast51, "L R C LFE Ls Rs"),
	NAMED(Legacy51, "L R Ls Rs C LFE"),
	NAMED(Quadraphonic, "L R Ls Rs"),
	NAMED(7_1Itu, "L R C LFE Ls Rs Rls Rrs"),
	NAMED(MatrixStereo, "Lt Rt"),
	NAMED(AmbisonicsBFormat, "W X Y Z"),
	NAMED(Pentagonal, "L R Ls Rs C"),
	NAMED(Hexagonal, "L R Ls Rs C Cs"),
	NAMED(7_1, "L R C LFE Ls Rs Lc Rc"),
	NAMED(7_1Mpeg, "C Lc Rc L R Ls Rs LFE"),
	NAMED(7_1EMagic, "L R Ls Rs C LFE Lc Rc"),
	NAMED(SmpteDtv, "L R C LFE Ls Rs Lt Rt"),
	NAMED(Octagonal, "L R Ls Rs C Cs Lsd Rsd"),
	NAMED(Cube, "L R Ls Rs Vhl Vhr Tbl Tbr"),
	NAMED(VST10_2, "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2"),
	NAMED(_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_, "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	NAMED(VST10_2_Plus, "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2"),
	NAMED(_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_, "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
	NAMED(VST22_2, "L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr"),
	OTHER(_VST_7_1_Cine_Top_Center_Layout, "L R C LFE Ls Rs Cs Ts"),
	OTHER(_VST_7_1_Cine_Center_High_Layout, "L R C LFE Ls Rs Cs Vhc"),
	OTHER(_VST_7_1_Cine_Front_High_Layout, "L R C LFE Ls Rs Vhl Vhr"),
	OTHER(_VST_7_1_Cine_Side_High_Layout, "L R C LFE Ls Rs Tsl Tsr"),
	OTHER(SMPTEDigitalCinema1Channel, "* * C * * * * * * * * * * * * *"),
	OTHER(SMPTEDigitalCinema2Channel, "Lt Rt * * * * * * * * * * * * * *"),
	OTHER(SMPTEDigitalCinema4Channel, "L R C * Cs * * * * * * * * * * *"),
	OTHER(SMPTEDigitalCinema6Channel, "L R C LFE Ls Rs * * * * * * * * * *"),
	OTHER(SMPTEDigitalCinema7Channel, "L R C LFE Ls Rs * * Cs * * * * * * *"),
	OTHER(SMPTEDigitalCinema8Channel, "L R C LFE Ls Rs Lc Rc * * * * * * * *"),
	OTHER(SMPTEDigitalCinema9Channel, "L R C LFE Ls Rs Lc Rc Cs * * * * * * *"),
};
#undef NAMED
#undef OTHER
// clang-format on

TEST(ChannelLayouts, AreTheRequiredOnes)
{
	EXPECT_EQ(AllChannelLayouts().size(), 89u);
	for (const auto& [name, labels] : AllChannelLayouts())
	{
		const auto required = std::ranges::find(sRequiredLayouts, name, &RequiredLayout::mName);
		std::string words(name);
		std::ranges::replace(words, '_', ' ');
		const AudioChannelLayout layout = ReadLayout(required != sRequiredLayouts.end() ? required->mLabels : words);
		EXPECT_TRUE(std::ranges::equal(labels, layout)) << name;
	}
	for (const RequiredLayout& required : sRequiredLayouts)
		EXPECT_EQ(required.mCreate(), ReadLayout(required.mLabels)) << required.mName;
	EXPECT_EQ(Create_L_R_C_LFE_ChannelLayout(), ReadLayout("L R C LFE"));
}

TEST(ChannelLayouts, OfAnyCount)
{
	const char* const defaults[] = {"", "*", "L R", "* * *", "L R Ls Rs", "* * * * *", "L R C LFE Ls Rs",
		"* * * * * * *", "L R C LFE Ls Rs Rls Rrs", "* * * * * * * * *"};
	for (unsigned long count = 0; count < std::size(defaults); ++count)
		EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(count), ReadLayout(defaults[count])) << count;
	EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(0x1'0000'0002), ReadLayout("* *"));
	for (const unsigned long count : {0xFFFF'FFFFul, 0x8000'0000ul})
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
	EXPECT_TRUE(areSame("* L * -1", "-1 * * L"));
	EXPECT_FALSE(areSame("L R", "L R R"));
	EXPECT_FALSE(areSame("L L R", "L R R"));
}

}   // namespace
