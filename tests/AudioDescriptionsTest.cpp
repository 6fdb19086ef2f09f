#include "zonmediatypes/Descriptions.h"

#include "tests/AudioTables.h"
#include "tests/KeyRecorder.h"
#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

using testing::ElementsAre;
using testing::IsEmpty;
using zoncore::UTF16String;
using zoncore::config::Localizer;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

using Keys = std::vector<std::string>;

const std::string kPrefix = "$$$/zonmediatypes/";
const std::string kLayout = kPrefix + "AudioChannelLayout/";
const std::string kConfiguration = kPrefix + "AudioChannelConfiguration/";

// The key of an abbreviation.
std::string Short(const std::string& inAbbreviation)
{
	return kPrefix + "AudioChannelLabelAbbreviations/" + inAbbreviation + "=" + inAbbreviation;
}

// Installs a translator for the length of a block.
class Translation
{
public:
	explicit Translation(zoncore::config::Translator inTranslator)
	{
		Localizer::Get().SetTranslator(std::move(inTranslator));
	}
	Translation(const Translation&) = delete;
	Translation& operator=(const Translation&) = delete;
	~Translation() { Localizer::Get().SetTranslator({}); }
};

// The keys that inDescribe looks up, in order.
template <class Describe>
Keys KeysOfCall(Describe inDescribe)
{
	zontest::KeyRecorder recorder;
	inDescribe();
	return recorder.TakeKeys();
}

AudioChannelLayouts ReadStreams(const std::string& inText)
{
	AudioChannelLayouts streams;
	std::istringstream layouts(inText);
	for (std::string layout; std::getline(layouts, layout, '|');)
		streams.push_back(ReadLayout(layout));
	return streams;
}

std::string Describe(const std::string& inLayout)
{
	return UTF16to8(AudioChannelLayoutDescription(ReadLayout(inLayout)));
}

std::string DescribeStreams(const std::string& inStreams)
{
	return UTF16to8(AudioChannelConfigurationDescription(ReadStreams(inStreams)));
}

// ---- Labels ----------------------------------------------------------------------------------------------------------

TEST(AudioChannelLabelDescription, HasTheRequiredTextsAndKeys)
{
	for (const RequiredLabel& label : kRequiredLabels)
	{
		const std::string name(label.mName);
		EXPECT_EQ(UTF16to8(AudioChannelLabelDescription(label.mLabel, false)), label.mEnglish);
		EXPECT_EQ(UTF16to8(AudioChannelLabelDescription(label.mLabel, true)), label.mMnemonic);
		EXPECT_EQ(UTF16to8(AudioChannelLabelAbbreviations(label.mLabel)), label.mAbbreviation);
		EXPECT_EQ(UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(label.mLabel)), label.mAbbreviation);
		EXPECT_THAT(KeysOfCall([&] { AudioChannelLabelDescription(label.mLabel, false); }),
			ElementsAre(kPrefix + "AudioChannelLabel/" + name + "=" + std::string(label.mEnglish)));
		EXPECT_THAT(KeysOfCall([&] { AudioChannelLabelDescription(label.mLabel, true); }),
			ElementsAre(kPrefix + "AudioChannelLabelMnemonic/" + name + "=" + std::string(label.mMnemonic)));
		EXPECT_THAT(KeysOfCall([&] { AudioChannelLabelAbbreviationsUnlocalized(label.mLabel); }), IsEmpty());
		if (label.mLabel != kAudioChannelLabel_Discrete)
		{
			EXPECT_THAT(KeysOfCall([&] { AudioChannelLabelAbbreviations(label.mLabel); }),
				ElementsAre(Short(std::string(label.mAbbreviation))));
		}
	}
	EXPECT_THAT(KeysOfCall([] { AudioChannelLabelAbbreviations(kAudioChannelLabel_Discrete); }), IsEmpty());
}

TEST(AudioChannelLabelDescription, IsEmptyForNumbersThatNameNoLabel)
{
	for (const int value : {-2'147'483'647 - 1, -1, 1, 5, 99, 120, 126, 143, 356, 2'147'483'647})
	{
		const auto label = static_cast<AudioChannelLabel>(value);
		const auto describe = [&]
		{
			EXPECT_TRUE(AudioChannelLabelDescription(label, false).empty());
			EXPECT_TRUE(AudioChannelLabelDescription(label, true).empty());
			EXPECT_TRUE(AudioChannelLabelAbbreviations(label).empty());
			EXPECT_TRUE(AudioChannelLabelAbbreviationsUnlocalized(label).empty());
		};
		EXPECT_THAT(KeysOfCall(describe), IsEmpty()) << value;
	}
}

// ---- Layouts ---------------------------------------------------------------------------------------------------------

struct LayoutCase
{
	const char* mLayout;
	const char* mText;
	std::string mKey;
};

const std::vector<LayoutCase> sLayoutCases = {
	{"", "0 Channels", kLayout + "NChannels=@0 Channels"},
	{"*", "Mono", kLayout + "Mono=Mono"},
	{"* *", "2 Channels", kLayout + "NChannels=@0 Channels"},
	{"C", "1 Channel (C)", kLayout + "kChannelConfigurationNameTemplate_1=1 Channel (@0)"},
	{"5", "1 Channel ()", kLayout + "kChannelConfigurationNameTemplate_1=1 Channel (@0)"},
	{"L R", "Stereo", kLayout + "Stereo=Stereo"},
	{"R L", "2 Channels (R L)", kLayout + "kChannelConfigurationNameTemplate_2=2 Channels (@0 @1)"},
	{"* L", "2 Channels (* L)", kLayout + "kChannelConfigurationNameTemplate_2=2 Channels (@0 @1)"},
	{"L R C", "3 Channels (L R C)", kLayout + "kChannelConfigurationNameTemplate_3=3 Channels (@0 @1 @2)"},
	{"L R Ls Rs", "4 Channels (L R Ls Rs)", kLayout + "kChannelConfigurationNameTemplate_4=4 Channels (@0 @1 @2 @3)"},
	{"L R Ls Rs C", "5 Channels (L R Ls Rs C)",
		kLayout + "kChannelConfigurationNameTemplate_5=5 Channels (@0 @1 @2 @3 @4)"},
	{"L R C LFE Ls Rs", "5.1 (L, R, C, LFE, Ls, Rs)",
		kPrefix + "kChannelConfigurationNameTemplate_51=5.1 (@0, @1, @2, @3, @4, @5)"},
	{"Rs LFE C Ls R L", "5.1 (Rs, LFE, C, Ls, R, L)",
		kPrefix + "kChannelConfigurationNameTemplate_51=5.1 (@0, @1, @2, @3, @4, @5)"},
	{"L R C LFE Ls Ls", "6 Channels (L R C LFE Ls Ls)",
		kLayout + "kChannelConfigurationNameTemplate_6=6 Channels (@0 @1 @2 @3 @4 @5)"},
	{"L R C Ls Rs Lc Rc", "7 Channels (L R C Ls Rs Lc Rc)",
		kLayout + "kChannelConfigurationNameTemplate_7=7 Channels (@0 @1 @2 @3 @4 @5 @6)"},
	{"L R C LFE Ls Rs Lt Rt", "SMPTE DTV (L R C LFE Ls Rs Lt Rt)",
		kPrefix + "SmpteDtv=SMPTE DTV (@0 @1 @2 @3 @4 @5 @6 @7)"},
	{"Lt Rt L R C LFE Ls Rs", "8 Channels (Lt Rt L R C LFE Ls Rs)",
		kLayout + "kChannelConfigurationNameTemplate_8=8 Channels (@0 @1 @2 @3 @4 @5 @6 @7)"},
	{"L R C LFE Ls Rs Lc Rc Cs", "9 Channels (L R C LFE Ls Rs Lc...)",
		kLayout + "kChannelConfigurationNameTemplate_N=@0 Channels (@1 @2 @3 @4 @5 @6 @7...)"},
	{"L R C LFE Ls Rs * * * * * * * * * *", "16 Channels (L R C LFE Ls Rs *...)",
		kLayout + "kChannelConfigurationNameTemplate_N=@0 Channels (@1 @2 @3 @4 @5 @6 @7...)"},
};

TEST(AudioChannelLayoutDescription, HasTheRequiredTexts)
{
	for (const LayoutCase& test : sLayoutCases)
		EXPECT_EQ(Describe(test.mLayout), test.mText);
	EXPECT_EQ(
		UTF16to8(AudioChannelLayoutDescription(CreateVST22_2ChannelLayout())), "24 Channels (L R C LFE Ls Rs Lc...)");
	AudioChannelLayout many = CreateMultichannelLayout(100'000);
	EXPECT_EQ(UTF16to8(AudioChannelLayoutDescription(many)), "100000 Channels");
	many.back() = kAudioChannelLabel_FrontLeft;
	EXPECT_EQ(UTF16to8(AudioChannelLayoutDescription(many)), "100000 Channels (* * * * * * *...)");
}

// The keys of a layout's name: the template's, and those of the abbreviations that it shows.
TEST(AudioChannelLayoutDescription, LooksUpTheStatedKeysOnly)
{
	for (const LayoutCase& test : sLayoutCases)
	{
		Keys required = {test.mKey};
		const AudioChannelLayout layout = ReadLayout(test.mLayout);
		const std::size_t shown = test.mKey.find('@') == std::string::npos ? 0 : layout.size() > 8 ? 7 : layout.size();
		for (std::size_t i = 0; i < shown; ++i)
		{
			const UTF16String abbreviation = AudioChannelLabelAbbreviationsUnlocalized(layout[i].mLabel);
			if (!abbreviation.empty() && layout[i] != kAudioChannelLabel_Discrete)
				required.push_back(Short(UTF16to8(abbreviation)));
		}
		EXPECT_THAT(
			KeysOfCall([&] { AudioChannelLayoutDescription(layout); }), testing::UnorderedElementsAreArray(required))
			<< test.mLayout;
	}
}

TEST(AudioChannelLayoutDescription, FillsTranslationsOnce)
{
	const Translation translation(
		[](std::string_view inKey, UTF16String& outText)
		{
			if (inKey.ends_with("=2 Channels (@0 @1)"))
				outText = UTF8to16("@1 und @0, @2 Kanäle");
			else if (inKey.ends_with("=Ls"))
				outText = UTF8to16("@1@0");
			else
				return false;
			return true;
		});
	EXPECT_EQ(Describe("Ls C"), "C und @1@0, @2 Kanäle");
}

TEST(AudioChannelLayoutDescriptionUnlocalized, ListsAllChannelsAndEndsWithAComma)
{
	const auto list
		= [](const char* inLayout) { return UTF16to8(AudioChannelLayoutDescriptionUnlocalized(ReadLayout(inLayout))); };
	EXPECT_EQ(list(""), "");
	EXPECT_EQ(list("*"), "*,");
	EXPECT_EQ(list("L R"), "L,R,");
	EXPECT_EQ(list("L R C LFE Ls Rs"), "L,R,C,LFE,Ls,Rs,");
	EXPECT_EQ(list("5 Vhc *"), ",Vhc,*,");
	EXPECT_THAT(KeysOfCall([&] { list("L R C LFE"); }), IsEmpty());
	EXPECT_EQ(AudioChannelLayoutDescriptionUnlocalized(CreateMultichannelLayout(100'000)).size(), 200'000u);
}

// ---- Streams ---------------------------------------------------------------------------------------------------------

TEST(AudioChannelConfigurationDescription, SumsUpTheStreams)
{
	EXPECT_EQ(DescribeStreams(""), "(No Audio Streams)");
	EXPECT_EQ(DescribeStreams("L R"), "Stereo");
	EXPECT_EQ(DescribeStreams(" "), "0 Channels");   // one stream without channels
	EXPECT_EQ(DescribeStreams(" | "), "2 x 0 Channels");
	EXPECT_EQ(DescribeStreams("L R|L R"), "2 x Stereo");
	EXPECT_EQ(DescribeStreams("L R C LFE Ls Rs|L R C LFE Ls Rs|L R C LFE Ls Rs"), "3 x 5.1 (L, R, C, LFE, Ls, Rs)");
	EXPECT_EQ(DescribeStreams("L R|*"), "Stereo + Mono");
	EXPECT_EQ(
		DescribeStreams("L R C LFE Ls Rs|L R Ls Rs C LFE"), "5.1 (L, R, C, LFE, Ls, Rs) + 5.1 (L, R, Ls, Rs, C, LFE)");
	EXPECT_EQ(DescribeStreams("*|*|L R"), "3 Audio Streams");
	EXPECT_EQ(DescribeStreams("L R|*|L R"), "3 Audio Streams");
}

TEST(AudioChannelConfigurationDescription, LooksUpTheStatedKeysOnly)
{
	const auto keys = [](const char* inStreams) { return KeysOfCall([&] { DescribeStreams(inStreams); }); };
	using testing::UnorderedElementsAre;
	EXPECT_THAT(keys(""), ElementsAre(kConfiguration + "Empty=(No Audio Streams)"));
	EXPECT_THAT(keys("L R"), ElementsAre(kLayout + "Stereo=Stereo"));
	EXPECT_THAT(keys("L R|L R|L R"),
		UnorderedElementsAre(kConfiguration + "NMatchingStreams=@0 x @1", kLayout + "Stereo=Stereo"));
	EXPECT_THAT(keys("L R|*"),
		UnorderedElementsAre(kConfiguration + "TwoStreams=@0 + @1", kLayout + "Stereo=Stereo", kLayout + "Mono=Mono"));
	EXPECT_THAT(keys("L R|*|*"), ElementsAre(kConfiguration + "NAudioStreams=@0 Audio Streams"));
}

TEST(AudioTextKeys, AreAllListedOnce)
{
	const auto all = AllTextKeys();
	std::vector<std::string_view> audio;
	std::ranges::copy_if(all, std::back_inserter(audio),
		[](std::string_view inKey)
		{
			return inKey.starts_with("$$$/zonmediatypes/AudioChannel")
				|| inKey.starts_with("$$$/zonmediatypes/kChannel") || inKey.starts_with("$$$/zonmediatypes/SmpteDtv");
		});
	EXPECT_EQ(audio.size(), 37u + 37 + 36 + 14 + 4);
	for (const LayoutCase& test : sLayoutCases)
		EXPECT_EQ(std::ranges::count(audio, test.mKey), 1) << test.mKey;
	std::ranges::sort(audio);
	EXPECT_EQ(std::ranges::adjacent_find(audio), audio.end());
}

}   // namespace
}   // namespace zonmediatypes
