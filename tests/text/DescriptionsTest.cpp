#include "zonmediatypes/Descriptions.h"

#include "tests/HostileLocale.h"
#include "tests/WithTranslator.h"
#include "tests/audio/AudioTables.h"
#include "tests/video/PixelFormatTable.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iomanip>
#include <limits>
#include <set>
#include <span>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace
{

using namespace zonmediatypes;
using zoncore::UTF16String;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;
using Texts = std::vector<std::string>;

// Every case runs under a locale that groups digits and writes a decimal comma.
const zontest::HostileLocale sHostileLocale;

const std::string kPrefix = "$$$/zonmediatypes/";

// The text of inDescribe. Every key that it looks up must be listed, so that the English text here and the path that
// translations/zonmediatypes.pot has for it belong together, and an empty text must need none.
template <class Describe>
std::string Text(Describe inDescribe)
{
	std::size_t keys = 0;
	const zontest::WithTranslator recorder(
		[&](std::string_view inKey, UTF16String&)
		{
			EXPECT_EQ(std::ranges::count(AllTextKeys(), inKey), 1) << inKey;
			++keys;
			return false;
		});
	std::string text = UTF16to8(inDescribe());
	EXPECT_TRUE(!text.empty() || keys == 0);
	return text;
}

template <class Value>
using Rows = std::initializer_list<std::pair<Value, const char*>>;

// Every row's text in the order of the numbers, and none for any other number.
template <class Value>
void ExpectTexts(UTF16String (*inDescribe)(Value), std::vector<std::pair<Value, const char*>> inRows)
{
	auto row = inRows.begin();
	for (int value = -10; value <= 1'000; ++value)
	{
		const bool isRow = row != inRows.end() && value == row->first;
		EXPECT_EQ(Text([=] { return inDescribe(static_cast<Value>(value)); }), isRow ? row->second : "") << value;
		row += isRow;
	}
	EXPECT_EQ(row, inRows.end());
}

TEST(Descriptions, OfEnumerations)
{
	ExpectTexts(TimeDisplayDescription,
		{{kTimeDisplay_24Timecode, "24 fps Timecode"}, {kTimeDisplay_25Timecode, "25 fps Timecode"},
			{kTimeDisplay_2997DropTimecode, "29.97 fps Drop-Frame Timecode"},
			{kTimeDisplay_2997NonDropTimecode, "29.97 fps Non-Drop-Frame Timecode"},
			{kTimeDisplay_30Timecode, "30 fps Timecode"}, {kTimeDisplay_50Timecode, "50 fps Timecode"},
			{kTimeDisplay_5994DropTimecode, "59.94 fps Drop-Frame Timecode"},
			{kTimeDisplay_5994NonDropTimecode, "59.94 fps Non-Drop-Frame Timecode"},
			{kTimeDisplay_60Timecode, "60 fps Timecode"}, {kTimeDisplay_Frames, "Frames"},
			{kTimeDisplay_23976Timecode, "23.976 fps Timecode"}, {kTimeDisplay_16mmFeetFrames, "Feet + Frames 16 mm"},
			{kTimeDisplay_35mmFeetFrames, "Feet + Frames 35 mm"}, {kTimeDisplay_48Timecode, "48 fps Timecode"},
			{kTimeDisplay_AudioSamples, "Audio Samples"}, {kTimeDisplay_Milliseconds, "Milliseconds"}});
	ExpectTexts(RenderQualityDescription,
		{{kRenderQuality_Draft, "Draft"}, {kRenderQuality_Low, "Low"}, {kRenderQuality_Medium, "Medium"},
			{kRenderQuality_High, "High"}, {kRenderQuality_Max, "Max"}});
	static_assert(kFieldType_Invalid == -1 && kFieldType_NoFields == 0 && kFieldType_UpperFirst == 1
		&& kFieldType_LowerFirst == 2 && kFieldType_UnknownDominance == 3 && kFieldType_Any == 4);
	ExpectTexts(FieldTypeDescription,
		{{kFieldType_Invalid, "Field Presence Unknown"}, {kFieldType_NoFields, "No Fields (Progressive Scan)"},
			{kFieldType_UpperFirst, "Upper Field First"}, {kFieldType_LowerFirst, "Lower Field First"},
			{kFieldType_UnknownDominance, "Fields (Unknown Dominance)"}, {kFieldType_Any, "Any Field Order"}});
}

// A caller's buffer gets the same text when it is long enough, and stays as it is when it is not.
template <class Char>
void ExpectRateInBuffer(FrameRate inRate)
{
	const std::string text = UTF16to8(FrameRateDescription(inRate));
	std::vector<Char> buffer(text.size());
	EXPECT_EQ(FrameRateDescription(std::span(buffer).first(text.size() - 1), inRate), text.size());
	EXPECT_EQ(buffer, std::vector<Char>(text.size()));
	EXPECT_EQ(FrameRateDescription(std::span(buffer), inRate), text.size());
	EXPECT_EQ(std::string(buffer.begin(), buffer.end()), text);
}

TEST(Descriptions, OfRates)
{
	Texts texts;
	for (const FrameRate rate : AllFrameRates())
	{
		texts.push_back(Text([=] { return FrameRateDescription(rate); }));
		ExpectRateInBuffer<char>(rate);
		ExpectRateInBuffer<zoncore::UTF16Char>(rate);
	}
	for (const std::int64_t ticks : {31'752'001LL, 31'752'000LL, 1LL, 0LL, -8'475'667'200LL})
		texts.push_back(Text([=] { return FrameRateDescription(FrameRate(ticks)); }));
	EXPECT_EQ(texts,
		(Texts{"10fps", "12fps", "12.5fps", "15fps", "23.976fps", "24fps", "25fps", "29.97fps", "30fps", "48fps",
			"50fps", "59.94fps", "60fps", "100fps", "1000fps", "8000Hz", "11025Hz", "22050Hz", "32000Hz", "44100Hz",
			"48000Hz", "88200Hz", "96000Hz", "192000Hz", "0fps", "8000fps", "8000Hz", "254016000000Hz", "infHz",
			"-29.97Hz"}));
}

// ---- Audio -----------------------------------------------------------------------------------------------------------

TEST(Descriptions, OfLabels)
{
	// The English text of the key with a path.
	const auto english = [](const std::string& inPath)
	{
		for (const std::string_view key : AllTextKeys())
			if (key.starts_with(kPrefix + inPath + "="))
				return std::string(key.substr(key.find('=') + 1));
		return std::string();
	};
	for (int value = -300; value <= 300; ++value)
	{
		const auto row = std::ranges::find(kRequiredLabels, value, &RequiredLabel::mValue);
		const RequiredLabel required = row != kRequiredLabels.end() ? *row : RequiredLabel{};
		const std::string name(required.mName), abbreviation(required.mAbbreviation);
		const auto label = static_cast<AudioChannelLabel>(value);
		EXPECT_EQ(
			Text([=] { return AudioChannelLabelDescription(label, false); }), english("AudioChannelLabel/" + name));
		EXPECT_EQ(Text([=] { return AudioChannelLabelDescription(label, true); }),
			english("AudioChannelLabelMnemonic/" + name));
		EXPECT_EQ(Text([=] { return AudioChannelLabelAbbreviations(label); }), abbreviation);
		const zontest::WithTranslator translator(
			[](std::string_view inKey, UTF16String& outText) { return outText = UTF8to16(inKey), true; });
		EXPECT_EQ(UTF16to8(AudioChannelLabelAbbreviations(label)),
			value == 0 || abbreviation.empty()
				? abbreviation
				: kPrefix + "AudioChannelLabelAbbreviations/" + abbreviation + "=" + abbreviation);
		EXPECT_EQ(UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(label)), abbreviation);
	}
}

TEST(Descriptions, OfLayouts)
{
	const auto describe = [](const AudioChannelLayout& inLayout)
	{ return Text([&] { return AudioChannelLayoutDescription(inLayout); }); };
	for (const auto& [layout, text] :
		Rows<const char*>{{"", "0 Channels"}, {"*", "Mono"}, {"* *", "2 Channels"}, {"L R", "Stereo"},
			{"C", "1 Channel (C)"}, {"5", "1 Channel ()"}, {"R L", "2 Channels (R L)"}, {"L R C", "3 Channels (L R C)"},
			{"L * Ls Rs", "4 Channels (L * Ls Rs)"}, {"L R Ls Rs C", "5 Channels (L R Ls Rs C)"},
			{"Rs LFE C Ls R L", "5.1 (Rs, LFE, C, Ls, R, L)"}, {"L R C LFE Ls Ls", "6 Channels (L R C LFE Ls Ls)"},
			{"L R C Ls Rs Lc Rc", "7 Channels (L R C Ls Rs Lc Rc)"},
			{"L R C LFE Ls Rs Lt Rt", "SMPTE DTV (L R C LFE Ls Rs Lt Rt)"},
			{"Lt Rt L R C LFE Ls Rs", "8 Channels (Lt Rt L R C LFE Ls Rs)"},
			{"L R C LFE Ls Rs * * *", "9 Channels (L R C LFE Ls Rs *...)"}})
		EXPECT_EQ(describe(ReadLayout(layout)), text);
	EXPECT_EQ(describe(CreateMultichannelLayout(100'000)), "100000 Channels");
	for (const auto& [layout, text] : Rows<const char*>{{"", ""}, {"*", "*,"}, {"L 5 LFE", "L,,LFE,"}})
		EXPECT_EQ(UTF16to8(AudioChannelLayoutDescriptionUnlocalized(ReadLayout(layout))), text);
}

TEST(Descriptions, OfStreams)
{
	const AudioChannelLayout mono = ReadLayout("*"), stereo = ReadLayout("L R"), reversed = ReadLayout("R L");
	for (const auto& [streams, text] :
		Rows<AudioChannelLayouts>{{{}, "(No Audio Streams)"}, {{stereo}, "Stereo"}, {{{}, {}}, "2 x 0 Channels"},
			{{mono, mono, mono}, "3 x Mono"}, {{stereo, reversed}, "Stereo + 2 Channels (R L)"},
			{{mono, mono, stereo}, "3 Audio Streams"}, {{stereo, mono, stereo}, "3 Audio Streams"}})
		EXPECT_EQ(Text([&, &layouts = streams] { return AudioChannelConfigurationDescription(layouts); }), text);
}

// ---- Video -----------------------------------------------------------------------------------------------------------

TEST(Descriptions, OfTheCatalogueOfFormats)
{
	std::ifstream file(ZON_TEST_DATA "/pixel-formats.tsv");
	std::string row;
	std::getline(file, row);   // headings
	for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
	{
		std::getline(file, row);
		EXPECT_EQ(Text([&] { return PixelFormatDescription(*format); }), row.substr(row.rfind('\t') + 1));
	}
}

PixelFormat Format(const char (&inCode)[5], std::uint32_t inProperties)
{
	return {MakePixelFormatName(inCode), PixelFormatProperties(inProperties)};
}

TEST(Descriptions, OfFormatsByWildcardNameKindAndCompression)
{
	for (const auto& [format, text] : Rows<PixelFormat>{{kPixelFormat_Any, "Any Pixel Format"},
			 {Format("_abc", 0xBC000), "Any Pixel Format"}, {Format("_abc", 0x3C000), "Custom Pixel Format (cba_)"},
			 {Format("@abc", 0x40080), "Custom Pixel Format (cba@)"},
			 {Format("_\0bc", 0x40080), "Custom Pixel Format (cb)"},
			 {Format("_ab\0", 0x40080), "Custom Pixel Format ()"},
			 {Format("_a\xE9z", 0x40080), "Custom Pixel Format (z\uFFFDa_)"},
			 {Format("bgra", 0x00080), "Unknown Pixel Format"},
			 {Format("xdva", 0x7C000), "Unknown Compressed Pixel Format (avdx)"}, {Format("bgra", 0x74000), ""},
			 {Format("bgra", 0x78000), ""}, {Format("bgra", 0xC0080), "BGRA 4444 8u"},   // kind 3 reads as kind 1
			 {Format("bgra", 0x43080), "ARGB 4444 8u Linear"},
			 {Format("????", 0x4022C), "BGR 4444 u 709"},   // depth code 6 and alpha code 4 have no text
			 {Format("????", 0x4187F), "YUV  f 709"}, {Format("????", 0x40C06), "BGR  16u"},
			 {Format("yv12", 0x64021), "YUV 420 MPEG2 Field 8u 709 Full Range"}, {Format("dvn2", 0xC4000), "NTSC DV"}})
		EXPECT_EQ(Text([&, &value = format] { return PixelFormatDescription(value); }), text);
}

TEST(Descriptions, OfFormatsAreStreamed)
{
	std::ostringstream narrow;
	narrow << std::setw(16) << std::setfill('.') << kPixelFormat_BGRA_4444_8u << '|' << kPixelFormat_NTSCDV25 << '|';
	zoncore::oUTF16StringStream wide;
	wide << std::left << std::setw(8) << kPixelFormat_NTSCDV25 << kPixelFormat_PALDV25;
	EXPECT_EQ(UTF16to8(wide.str()), "NTSC DV PAL DV");
	// A translation with a zero in it: the narrow stream ends there.
	const zontest::WithTranslator translator(
		[](std::string_view, UTF16String& outText) {
			return outText = {'a', 0, 'b'}, true;
		});
	narrow << kPixelFormat_Any << '|';
	EXPECT_EQ(narrow.str(), "....BGRA 4444 8u|NTSC DV|a|");
	EXPECT_EQ(zoncore::utility::Coercion(kPixelFormat_Any).size(), 3u);
}

TEST(Descriptions, OfShapesAndSizes)
{
	for (const auto& [ratio, text] : Rows<PixelAspectRatio>{{{1, 1}, "Square Pixels (1.0)"},
			 {{10, 11}, "D1/DV NTSC (0.9091)"}, {{40, 33}, "D1/DV NTSC Widescreen 16:9 (1.2121)"},
			 {{768, 702}, "D1/DV PAL (1.0940)"}, {{1024, 702}, "D1/DV PAL Widescreen 16:9 (1.4587)"},
			 {{2, 1}, "Anamorphic 2:1 (2.0)"}, {{4, 3}, "HD Anamorphic 1080 (1.3333)"}, {{3, 2}, "DVCPRO HD (1.5)"},
			 {{9, 10}, "Other Aspect Ratio (0.9000)"}, {{12345, 1}, "Other Aspect Ratio (12345.0000)"},
			 {{1, 0}, "Other Aspect Ratio (1.79769e+308)"}})
		EXPECT_EQ(Text([&, &value = ratio] { return PixelAspectRatioDescription(value); }), text);
	const auto describe = [](int inWidth, int inHeight, PixelAspectRatio inRatio) {
		return Text([&] { return VideoFrameSizeDescription({11, 12, inWidth, inHeight}, inRatio); });
	};
	EXPECT_EQ(describe(1920, 1080, kPixelAspectRatio_Any), "1920w 1080h");
	EXPECT_EQ(describe(std::numeric_limits<int>::min(), -1, {0, 0}), "-2147483648w -1h");
	EXPECT_EQ(describe(720, 480, kPixelAspectRatio_DVNTSC), "720w 480h (0.9091)");
}

// ---- Keys and translations -------------------------------------------------------------------------------------------

// What is filled in stays as it is, also where it looks like a placeholder.
TEST(Descriptions, FillTranslationsOnce)
{
	const auto translated = [](const char* inTranslation, auto inDescribe)
	{
		const zontest::WithTranslator translator(
			[&](std::string_view, UTF16String& outText) { return outText = UTF8to16(inTranslation), true; });
		return UTF16to8(inDescribe());
	};
	const auto describeRate = []
	{
		ExpectRateInBuffer<char>(kFrameRate_VideoPAL);
		ExpectRateInBuffer<zoncore::UTF16Char>(kFrameRate_VideoPAL);
		return FrameRateDescription(kFrameRate_VideoPAL);
	};
	EXPECT_EQ(translated("@0 @1 @0/s", describeRate), "25 @1 25/s");
	EXPECT_EQ(translated("@1@0", [] { return AudioChannelLayoutDescription(ReadLayout("Ls *")); }), "*@1@0");
	EXPECT_EQ(translated("@1@0", [] { return AudioChannelConfigurationDescription({{}, {}}); }), "@102");
	EXPECT_EQ(translated("@0-@1", [] { return PixelFormatDescription(Format("_0@c", 0)); }), "c@0_-@1");
	EXPECT_EQ(translated("@0", [] { return PixelFormatDescription(Format("yv12", 0x64021)); }), "@0 709 Full Range");
	EXPECT_EQ(translated("@0", [] { return PixelFormatDescription(kPixelFormat_NTSCDV25); }), "NTSC DV");
	EXPECT_EQ(translated("@2@1@0", [] { return VideoFrameSizeDescription({0, 0, 720, 480}, {1, 1}); }), "1.0480720");
}

TEST(TextKeys, AreAllThereOnce)
{
	EXPECT_EQ(AllTextKeys().size(), 2u + 16 + 37 + 37 + 36 + 14 + 4 + 5 + 6 + 9 + 9 + 2);
	EXPECT_EQ(std::set(AllTextKeys().begin(), AllTextKeys().end()).size(), AllTextKeys().size());
	EXPECT_EQ(
		std::ranges::count(AllTextKeys(), kPrefix + "FieldType/Invald=Field Presence Unknown"), 1);   // deliberate
}

}   // namespace
