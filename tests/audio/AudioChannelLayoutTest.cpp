#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/audio/AudioTables.h"

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

std::string ReadFile(const std::string& inPath)
{
	std::ostringstream text;
	text << std::ifstream(inPath).rdbuf();
	return text.str();
}

TEST(ChannelLayouts, AreThePublishedTable)
{
	std::istringstream table(ReadFile(ZON_TEST_DATA "/channel-layouts.tsv"));
	const std::string header = ReadFile(ZON_TEST_DATA "/../../zonmediatypes/AudioChannelLayoutCatalogue.h");
	std::string factory, channels, labels;
	std::getline(table, labels);   // headings
	for (const NamedChannelLayout& layout : AllChannelLayouts())
	{
		table >> factory >> channels >> std::ws;
		std::getline(table, labels);
		const std::string name = "Create" + std::string(layout.mName);
		EXPECT_TRUE(factory == name || factory == name + "ChannelLayout") << factory;
		EXPECT_TRUE(std::ranges::equal(layout.mLabels, ReadLayout(labels))) << factory;
		EXPECT_EQ(std::to_string(layout.mLabels.size()), channels) << factory;
		// In the header they stand after the declaration or before it, where the factory's name does not list them.
		std::string words = labels;
		std::ranges::replace(words, ' ', '_');
		const std::string declaration = "ZONMEDIATYPES_API AudioChannelLayout " + factory + "();";
		const std::size_t place = header.find(declaration);
		EXPECT_TRUE(factory == "Create_" + words + "_ChannelLayout"
			|| header.substr(place, header.find('\n', place) - place).ends_with("///< " + labels)
			|| header.substr(0, place).ends_with(labels + "\n"))
			<< factory;
	}
	EXPECT_EQ(table.peek(), std::char_traits<char>::eof());
}

TEST(ChannelLayouts, AreMadeByTheirFactories)
{
	EXPECT_EQ(Create51ChannelLayout(), ReadLayout("L R C LFE Ls Rs"));
	EXPECT_EQ(Create_L_R_C_LFE_ChannelLayout(), ReadLayout("L R C LFE"));
	EXPECT_EQ(Create_VST_7_1_Cine_Top_Center_Layout(), ReadLayout("L R C LFE Ls Rs Cs Ts"));
	EXPECT_EQ(CreateSMPTEDigitalCinema4Channel(), ReadLayout("L R C * Cs * * * * * * * * * * *"));
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
