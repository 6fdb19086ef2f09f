// The translations: each is whole, keeps what the texts are filled with, and reaches users.

#include "tests/companion/ProgramRunner.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <cctype>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <memory>
#include <set>

namespace
{

namespace fs = std::filesystem;
using namespace zonmediatypes;
using testing::HasSubstr;
using zoncore::config::Localizer;
using zoncore::config::MessageCatalogue;
using zoncore::utility::UTF16to8;

const std::string kLanguages[] = {"de", "es", "fr", "ja", "pt_BR", "zh_CN"};

std::string CataloguePath(const std::string& inLanguage)
{
	return ZON_CATALOGUES "/" + inLanguage + "/LC_MESSAGES/zonmediatypes.mo";
}

// The keys of the library and of the companion, as the template has them; no text has a quotation mark.
std::vector<std::string> TemplateKeys()
{
	const std::string text = FileText(ZON_TRANSLATIONS "/zonmediatypes.pot");
	const auto quoted = [&](std::string_view inName, std::size_t inAt)
	{
		const std::size_t begin = text.find(inName, inAt) + inName.size();
		return text.substr(begin, text.find('"', begin) - begin);
	};
	std::vector<std::string> keys;
	for (std::size_t at = text.find("msgctxt"); at != std::string::npos; at = text.find("msgctxt", at + 1))
		keys.push_back(quoted("msgctxt \"", at) + '=' + quoted("msgid \"", at));
	return keys;
}

// What no language changes: the digits of rates, sizes and standards, and the placeholders.
std::multiset<std::string> Kept(std::string_view inText)
{
	std::multiset<std::string> kept;
	for (std::size_t i = 0; i < inText.size(); ++i)
	{
		const std::size_t begin = i > 0 && inText[i - 1] == '@' ? i - 1 : i;
		if (std::isdigit(static_cast<unsigned char>(inText[i])) != 0)
			kept.emplace(inText.substr(begin, i + 1 - begin));
	}
	return kept;
}

// A menu item without its accelerator: "&" goes, and so does "(&L)" at the end.
std::string WithoutAccelerator(std::string inText)
{
	if (const std::size_t appended = inText.find("(&"); appended != std::string::npos)
		return inText.substr(0, appended);
	std::erase(inText, '&');
	return inText;
}

class Translation : public testing::TestWithParam<std::string>
{
protected:
	void SetUp() override
	{
		std::string error;
		ASSERT_TRUE(mCatalogue->Load(CataloguePath(GetParam()), error)) << error;
		Localizer::Get().SetCatalogue(mCatalogue);
	}
	void TearDown() override { Localizer::Get().SetCatalogue(nullptr); }

	const std::shared_ptr<MessageCatalogue> mCatalogue = std::make_shared<MessageCatalogue>();
};
INSTANTIATE_TEST_SUITE_P(
	Languages, Translation, testing::ValuesIn(kLanguages), [](const auto& inInfo) { return inInfo.param; });

TEST_P(Translation, HasEachKeyAndKeepsPlaceholdersAndNumbers)
{
	const std::vector<std::string> keys = TemplateKeys();
	EXPECT_TRUE(std::ranges::equal(AllTextKeys(), std::span(keys).first(AllTextKeys().size())));
	EXPECT_EQ(mCatalogue->GetSize(), keys.size());
	for (const std::string_view key : keys)
	{
		const std::string text(mCatalogue->Find(key));
		EXPECT_NE(text, "") << key;
		EXPECT_EQ(Kept(WithoutAccelerator(text)), Kept(key.substr(key.find('=')))) << key << ": " << text;
		EXPECT_EQ(std::ranges::count(text, '&'), key.find("Mnemonic/") == key.npos ? 0 : 1) << key << ": " << text;
	}
}

// Each accelerator is a letter or digit of the label's name, and stands once in a menu of the channels of one layout.
TEST_P(Translation, HasAcceleratorsThatTellLabelsApart)
{
	const auto accelerator = [](AudioChannelLabel inLabel)
	{
		const std::string text = UTF16to8(AudioChannelLabelDescription(inLabel, true));
		return std::tolower(static_cast<unsigned char>(text.at(text.find('&') + 1)));
	};
	for (const AudioChannelLabel label : AllAudioChannelLabels())
	{
		EXPECT_TRUE(std::isalnum(accelerator(label))) << label;
		EXPECT_EQ(WithoutAccelerator(UTF16to8(AudioChannelLabelDescription(label, true))),
			UTF16to8(AudioChannelLabelDescription(label, false)));
	}
	for (const auto& [name, labels] : AllChannelLayouts())
	{
		std::set<int> letters;
		for (const AudioChannelLabel label : labels.first(labels.size() <= 8 ? labels.size() : 0))
			EXPECT_TRUE(label == kAudioChannelLabel_Discrete || letters.insert(accelerator(label)).second)
				<< name << ": " << label;
	}
}

class German : public Translation
{
};
INSTANTIATE_TEST_SUITE_P(, German, testing::Values("de"));

TEST_P(German, ReachesTheDescriptions)
{
	const AudioChannelLayout surround = Create51ChannelLayout();
	for (const auto& [text, german] : std::initializer_list<std::pair<zoncore::UTF16String, const char*>>{
			 {FrameRateDescription(kFrameRate_VideoNTSC), "29.97 fps"},
			 {TimeDisplayDescription(kTimeDisplay_2997DropTimecode), "29,97-fps-Drop-Frame-Timecode"},
			 {AudioChannelLabelDescription(surround[4].mLabel, false), "Surround links"},
			 {AudioChannelLayoutDescription({surround.begin(), surround.begin() + 4}), "4 Kanäle (L R C LFE)"},
			 {AudioChannelConfigurationDescription({surround, surround}), "2 × 5.1 (L, R, C, LFE, Ls, Rs)"},
			 {FieldTypeDescription(kFieldType_UpperFirst), "Oberes Halbbild zuerst"},
			 {PixelFormatDescription(kPixelFormat_Any), "Beliebiges Pixelformat"},
			 {PixelAspectRatioDescription(kPixelAspectRatio_Square), "Quadratische Pixel (1.0)"},
		 })
		EXPECT_EQ(UTF16to8(text), german);
}

// Every message of the template and of each translation says what it is.
TEST(Translations, AreExplainedAndHaveACurrentTemplate)
{
	EXPECT_EQ(Zonmedia({"keys", "--pot"}).mOutput, FileText(ZON_TRANSLATIONS "/zonmediatypes.pot"))
		<< "write it again: zonmedia keys --pot > translations/zonmediatypes.pot";
	for (const fs::directory_entry& entry : fs::directory_iterator(ZON_TRANSLATIONS))
	{
		if (entry.path().extension() == ".txt")
			continue;
		EXPECT_TRUE(entry.path().extension() == ".pot" || std::ranges::count(kLanguages, entry.path().stem().string()))
			<< entry;
		const std::string text = FileText(entry.path());
		std::size_t messages = 0;
		for (std::size_t at = text.find("\nmsgctxt"); at != std::string::npos; at = text.find("\nmsgctxt", at + 1))
		{
			const std::size_t line = text.rfind('\n', at - 1) + 1;
			EXPECT_EQ(text.compare(line, 3, "#. "), 0) << entry.path() << text.substr(at, 80);
			++messages;
		}
		EXPECT_EQ(messages, TemplateKeys().size()) << entry.path();
	}
}

// ---- The companion ---------------------------------------------------------------------------------------------------

Outcome DisplaysIn(const std::string& inLanguage)
{
	return Zonmedia({"--language", inLanguage, "time", "1", "--rate", "25", "--display", "frames"});
}

TEST(Translations, ReachTheCompanion)
{
	for (const auto& [language, text] :
		std::initializer_list<std::pair<std::string, const char*>>{{"de", "24-fps-Timecode"},
			{"DE_at.UTF-8", "24-fps-Timecode"}, {"pt-BR", "Timecode de 24 fps"}, {"pt", "Timecode de 24 fps"},
			{"pt_PT", "Timecode de 24 fps"}, {"zh", "24 fps 时间码"}, {"zh_CN", "24 fps 时间码"},
			{CataloguePath("ja"), "24 fps タイムコード"}, {"en", "24 fps Timecode"}, {"en_GB", "24 fps Timecode"}})
	{
		const Outcome outcome = DisplaysIn(language);
		EXPECT_THAT(outcome.mOutput, HasSubstr(text)) << language;
		EXPECT_EQ(outcome.mErrors, "");
		EXPECT_EQ(outcome.mStatus, 0) << language;
	}
	EXPECT_EQ(Zonmedia({"time", "1", "--rate", "25", "--display", "frames", "--language", "de"}).mOutput,
		DisplaysIn("de").mOutput);
}

// Rows, columns and texts of the companion are in the language, all numbers have its decimal sign, and what programs read is
// the same in all.
TEST(Translations, AreOfOnePieceOnASheet)
{
	const std::vector<std::vector<std::string>> commands = {{"sheet", ZON_CLIP},
		{"time", "1", "--rate", "2997/100", "--display", "frames"}, {"audio", "matrix", "51", "Stereo"},
		{"audio", "layout", "51"}, {"video", "formats"}, {"video", "ratio", "10/11", "720x480"},
		{"video", "cost", "bgra", "v210"}, {"samples", "1", "--rate", "48000", "--format", "samples"},
		{"pulldown", "--cadence", "WSSWW"}, {"check"}, {"audio", "map", "51", "Stereo"}};
	for (std::vector<std::string> command : commands)
	{
		const std::string english = Zonmedia(command).mOutput;
		command.insert(command.begin(), {"--language", "de"});
		const std::string german = Zonmedia(command).mOutput;
		EXPECT_NE(german, english) << command[2];
		for (const char* const word : {"Description", "Frame duration", "Pixel shape", "Video codec", "unknown", " yes",
				 "last frame", "Depth", "Left right", "Is possible", "Film frame"})
			EXPECT_THAT(german, testing::Not(HasSubstr(word))) << command[2];
		command.emplace_back("--json");
		const std::string inGerman = Zonmedia(command).mOutput;
		command.erase(command.begin(), command.begin() + 2);
		EXPECT_EQ(inGerman, Zonmedia(command).mOutput);
	}
	const Outcome sheet = Zonmedia({"--language", "de", "sheet", ZON_CLIP});
	for (const char* const text :
		{"Framegröße", "(29,97 fps)", "48000 Hz", "(0,9091)", "letzter Frame", "00:00:05,005", "Ticks"})
		EXPECT_THAT(sheet.mOutput, HasSubstr(text));
	EXPECT_THAT(sheet.mOutput, testing::Not(testing::ContainsRegex("[0-9]\\.[0-9]+ fps|0\\.9091|5\\.005")));
	EXPECT_EQ(
		Zonmedia({"time", "00:00:05,005", "--rate", "25", "--display", "ms", "--to", "ms"}).mOutput, "00:00:05.005\n");
}

TEST(Translations, LeaveEnglishWhenTheyCannotBeRead)
{
	const std::string whole = FileText(CataloguePath("de"));
	const std::string cut = kScratch + "cut.mo", other = kScratch + "other.mo";
	std::ofstream(cut, std::ios::binary) << whole.substr(0, whole.size() / 2);
	std::ofstream(other, std::ios::binary) << "no catalogue of messages at all";
	const std::string english = DisplaysIn("en").mOutput;
	for (const auto& [language, complaint] : std::initializer_list<std::pair<std::string, std::string>>{
			 {cut, cut + ": is a damaged message catalogue"}, {other, other + ": is not a message catalogue"},
			 {kScratch + "missing.mo", "missing.mo: cannot be opened: No such file"}, {"./", "./: cannot be read"},
			 {"tlh", "no language is named \"tlh\"; there are"}, {"..", "\"..\""}})
	{
		const Outcome outcome = DisplaysIn(language);
		EXPECT_EQ(outcome.mOutput, english) << language;
		ExpectComplaint(outcome, 1, complaint);
	}
}

}   // namespace
