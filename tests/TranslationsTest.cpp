// The translations: each is whole, keeps what the texts are filled with, and reaches users.

#include "tests/ProgramRunner.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"
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

std::set<std::string> Languages()
{
	std::set<std::string> languages;
	for (const fs::directory_entry& entry : fs::directory_iterator(ZON_TRANSLATIONS))
	{
		if (entry.path().extension() == ".po")
			languages.insert(entry.path().stem());
	}
	return languages;
}

std::string CataloguePath(const std::string& inLanguage)
{
	return ZON_CATALOGUES "/" + inLanguage + "/LC_MESSAGES/zonmediatypes.mo";
}

std::string PathOf(std::string_view inKey)
{
	return std::string(inKey.substr(0, inKey.find('=')));
}

std::string EnglishOf(std::string_view inKey)
{
	return std::string(inKey.substr(inKey.find('=') + 1));
}

// "@" and digit of each placeholder.
std::multiset<char> Placeholders(std::string_view inText)
{
	std::multiset<char> digits;
	for (std::size_t i = 1; i < inText.size(); ++i)
	{
		if (inText[i - 1] == '@' && std::isdigit(static_cast<unsigned char>(inText[i])) != 0)
			digits.insert(inText[i]);
	}
	return digits;
}

// The digits of a text, which no language changes: rates, sizes, standards.
std::multiset<char> Digits(std::string_view inText)
{
	std::multiset<char> digits;
	std::ranges::copy_if(
		inText, std::inserter(digits, digits.end()), [](unsigned char inByte) { return std::isdigit(inByte); });
	return digits;
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
	}
	void TearDown() override { Localizer::Get().SetCatalogue(nullptr); }

	const std::shared_ptr<MessageCatalogue> mCatalogue = std::make_shared<MessageCatalogue>();
};

// ---- Each language ---------------------------------------------------------------------------------------------------

TEST_P(Translation, HasEachKeyAndNoOther)
{
	for (const std::string_view key : AllTextKeys())
		EXPECT_NE(mCatalogue->Find(key), "") << key;
	EXPECT_EQ(mCatalogue->GetSize(), AllTextKeys().size());
}

TEST_P(Translation, KeepsPlaceholdersAndNumbers)
{
	for (const std::string_view key : AllTextKeys())
	{
		const std::string text(mCatalogue->Find(key));
		EXPECT_EQ(Placeholders(text), Placeholders(EnglishOf(key))) << key << ": " << text;
		EXPECT_EQ(Digits(WithoutAccelerator(text)), Digits(EnglishOf(key))) << key << ": " << text;
	}
}

TEST_P(Translation, HasOneAcceleratorInMenuItemsOfTheSameNames)
{
	constexpr std::string_view kMnemonic = "Mnemonic/";
	std::size_t items = 0;
	for (const std::string_view key : AllTextKeys())
	{
		const std::string text(mCatalogue->Find(key));
		const std::size_t mnemonic = key.find(kMnemonic);
		const bool isItem = mnemonic != std::string_view::npos;
		EXPECT_EQ(std::ranges::count(text, '&'), isItem ? 1 : 0) << key << ": " << text;
		if (!isItem)
			continue;
		++items;
		const std::size_t accelerator = text.find('&') + 1;
		ASSERT_LT(accelerator, text.size()) << key;
		EXPECT_TRUE(std::isalnum(static_cast<unsigned char>(text[accelerator]))) << key << ": " << text;
		const std::string path = PathOf(key).replace(mnemonic, kMnemonic.size(), "/");
		const auto isName = [&path](std::string_view inKey) { return PathOf(inKey) == path; };
		EXPECT_EQ(WithoutAccelerator(text), mCatalogue->Find(*std::ranges::find_if(AllTextKeys(), isName))) << key;
	}
	EXPECT_EQ(items, 37u);
}

// A menu of the channels of one layout, up to eight, has each accelerator once.
TEST_P(Translation, HasDistinctAcceleratorsInOneLayout)
{
	Localizer::Get().SetCatalogue(mCatalogue);
	const auto accelerator = [](AudioChannelLabel inLabel)
	{
		const std::string text = UTF16to8(AudioChannelLabelDescription(inLabel, true));
		return std::tolower(static_cast<unsigned char>(text.at(text.find('&') + 1)));
	};
	for (const auto& [name, labels] : AllChannelLayouts())
	{
		std::set<int> letters;
		for (const AudioChannelLabel label : labels.first(labels.size() <= 8 ? labels.size() : 0))
		{
			EXPECT_TRUE(label == kAudioChannelLabel_Discrete || letters.insert(accelerator(label)).second)
				<< name << ": " << label;
		}
	}
}

INSTANTIATE_TEST_SUITE_P(
	Languages, Translation, testing::ValuesIn(Languages()), [](const auto& inInfo) { return inInfo.param; });

// ---- What users see --------------------------------------------------------------------------------------------------

struct Texts
{
	const char* mLanguage;
	std::vector<std::string> mTexts;
};

std::vector<std::string> SomeTexts()
{
	const AudioChannelLayout surround = Create51ChannelLayout();
	const std::vector<zoncore::UTF16String> texts = {FrameRateDescription(kFrameRate_VideoNTSC),
		TimeDisplayDescription(kTimeDisplay_2997DropTimecode), AudioChannelLabelDescription(surround[4].mLabel, false),
		AudioChannelLayoutDescription({surround.begin(), surround.begin() + 4}),
		AudioChannelConfigurationDescription({surround, surround}), FieldTypeDescription(kFieldType_UpperFirst),
		PixelFormatDescription(kPixelFormat_Any), PixelAspectRatioDescription(kPixelAspectRatio_Square)};
	std::vector<std::string> inUTF8;
	std::ranges::transform(texts, std::back_inserter(inUTF8), [](const auto& inText) { return UTF16to8(inText); });
	return inUTF8;
}

TEST(Translations, ReachTheDescriptions)
{
	const std::string matching = "2 × 5.1 (L, R, C, LFE, Ls, Rs)";
	const std::vector<Texts> cases = {
		{"de",
			{"29.97 fps", "29,97-fps-Drop-Frame-Timecode", "Surround links", "4 Kanäle (L R C LFE)", matching,
				"Oberes Halbbild zuerst", "Beliebiges Pixelformat", "Quadratische Pixel (1.0)"}},
		{"fr",
			{"29.97 i/s", "Timecode drop-frame 29,97 i/s", "Surround gauche", "4 canaux (L R C LFE)", matching,
				"Trame supérieure en premier", "Format de pixels indifférent", "Pixels carrés (1.0)"}},
		{"es",
			{"29.97 fps", "Código de tiempo drop-frame de 29,97 fps", "Envolvente izquierdo", "4 canales (L R C LFE)",
				matching, "Campo superior primero", "Cualquier formato de píxeles", "Píxeles cuadrados (1.0)"}},
		{"ja",
			{"29.97 fps", "29.97 fps ドロップフレームタイムコード", "左サラウンド", "4 チャンネル (L R C LFE)",
				matching, "上位フィールド優先", "任意のピクセルフォーマット", "正方形ピクセル (1.0)"}},
		{"zh_CN",
			{"29.97 fps", "29.97 fps 丢帧时间码", "左环绕", "4 声道 (L R C LFE)", matching, "高场优先", "任意像素格式",
				"方形像素 (1.0)"}},
		{"pt_BR",
			{"29.97 fps", "Timecode drop-frame de 29,97 fps", "Surround esquerdo", "4 canais (L R C LFE)", matching,
				"Campo superior primeiro", "Qualquer formato de pixel", "Pixels quadrados (1.0)"}},
	};
	for (const auto& [language, texts] : cases)
	{
		const auto catalogue = std::make_shared<MessageCatalogue>();
		std::string error;
		ASSERT_TRUE(catalogue->Load(CataloguePath(language), error)) << error;
		Localizer::Get().SetCatalogue(catalogue);
		EXPECT_EQ(SomeTexts(), texts) << language;
		Localizer::Get().SetCatalogue(nullptr);
	}
}

TEST(Translations, HaveACurrentTemplate)
{
	const Outcome outcome = RunProgram(ZON_PROGRAM, {"keys", "--pot"});
	EXPECT_EQ(outcome.mStatus, 0) << outcome.mErrors;
	EXPECT_EQ(outcome.mOutput, FileText(ZON_TRANSLATIONS "/zonmediatypes.pot"))
		<< "write it again: zonmedia keys --pot > translations/zonmediatypes.pot";
}

// Every message of the template and of each translation says what it is.
TEST(Translations, AreExplained)
{
	for (const fs::directory_entry& entry : fs::directory_iterator(ZON_TRANSLATIONS))
	{
		if (entry.path().extension() == ".txt")
			continue;
		const std::string text = FileText(entry.path());
		std::size_t messages = 0;
		for (std::size_t at = text.find("\nmsgctxt"); at != std::string::npos; at = text.find("\nmsgctxt", at + 1))
		{
			const std::size_t line = text.rfind('\n', at - 1) + 1;
			EXPECT_EQ(text.compare(line, 3, "#. "), 0) << entry.path() << text.substr(at, 80);
			++messages;
		}
		EXPECT_EQ(messages, AllTextKeys().size()) << entry.path();
	}
}

// ---- The companion ---------------------------------------------------------------------------------------------------

const std::vector<std::string> kDisplays = {"time", "1", "--rate", "25", "--display", "frames"};

Outcome DisplaysIn(const std::string& inLanguage)
{
	std::vector<std::string> arguments{"--language", inLanguage};
	arguments.insert(arguments.end(), kDisplays.begin(), kDisplays.end());
	return RunProgram(ZON_PROGRAM, arguments);
}

TEST(Translations, ReachTheCompanion)
{
	const std::string file = CataloguePath("ja");
	const std::vector<std::pair<std::string, std::string>> cases = {{"de", "24-fps-Timecode"},
		{"de_AT.UTF-8", "24-fps-Timecode"}, {"pt-BR", "Timecode de 24 fps"}, {"zh_CN", "24 fps 时间码"},
		{file, "24 fps タイムコード"}, {"en", "24 fps Timecode"}, {"en_GB", "24 fps Timecode"}};
	for (const auto& [language, text] : cases)
	{
		const Outcome outcome = DisplaysIn(language);
		EXPECT_THAT(outcome.mOutput, HasSubstr(text)) << language;
		EXPECT_EQ(outcome.mErrors, "");
		EXPECT_EQ(outcome.mStatus, 0) << language;
	}
	std::vector<std::string> behind = kDisplays;
	behind.insert(behind.end(), {"--language", "de"});
	EXPECT_EQ(RunProgram(ZON_PROGRAM, behind).mOutput, DisplaysIn("de").mOutput);
}

TEST(Translations, LeaveEnglishWhenTheyCannotBeRead)
{
	const std::string whole = FileText(CataloguePath("de"));
	const std::string cut = Scratch() / "cut.mo";
	const std::string other = Scratch() / "other.mo";
	std::ofstream(cut, std::ios::binary) << whole.substr(0, whole.size() / 2);
	std::ofstream(other, std::ios::binary) << "no catalogue of messages at all";
	const std::vector<std::pair<std::string, std::string>> cases = {{cut, cut + ": is a damaged message catalogue"},
		{other, other + ": is not a message catalogue"},
		{Scratch() / "missing.mo", "missing.mo: cannot be opened: No such file"}, {"./", "./: cannot be read"},
		{"tlh", "no language is named \"tlh\"; the closest are"}, {"pt_PT", "the closest are pt_BR"}, {"..", "\"..\""}};
	const std::string english = RunProgram(ZON_PROGRAM, kDisplays).mOutput;
	ASSERT_THAT(english, HasSubstr("24 fps Timecode"));
	for (const auto& [language, complaint] : cases)
	{
		const Outcome outcome = DisplaysIn(language);
		EXPECT_EQ(outcome.mOutput, english) << language;
		EXPECT_THAT(outcome.mErrors, testing::StartsWith("zonmedia: "));
		EXPECT_THAT(outcome.mErrors, HasSubstr(complaint));
		EXPECT_EQ(std::ranges::count(outcome.mErrors, '\n'), 1) << outcome.mErrors;
		EXPECT_EQ(outcome.mStatus, 1) << language;
	}
}

}   // namespace
