#include "tests/HostileLocale.h"
#include "tests/KeyRecorder.h"
#include "tests/PixelFormatTable.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <gtest/gtest.h>
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

using zoncore::utility::UTF16to8;
using zontest::KeyRecorder;
using Keys = std::vector<std::string>;

const std::string kPrefix = "$$$/zonmediatypes/";

std::string Describe(PixelFormat inFormat)
{
	return UTF16to8(PixelFormatDescription(inFormat));
}

// ---- Qualities and fields --------------------------------------------------------------------------------------------

TEST(VideoDescriptions, QualitiesAndFieldsHaveAKeyEach)
{
	KeyRecorder recorder;
	Keys keys;
	const auto quality
		= [](int inQuality) { return UTF16to8(RenderQualityDescription(static_cast<RenderQuality>(inQuality))); };
	const auto field = [](int inType) { return UTF16to8(FieldTypeDescription(static_cast<FieldType>(inType))); };

	const std::string qualities[] = {"Draft", "Low", "Medium", "High", "Max"};
	for (int i = 0; i < 5; ++i)
	{
		EXPECT_EQ(quality(i + 1), qualities[i]);
		keys.push_back(kPrefix + "RenderQuality/" + qualities[i] + "=" + qualities[i]);
	}
	const std::pair<std::string, std::string> fields[] = {
		{"Invald", "Field Presence Unknown"},   // deliberate
		{"NoFields", "No Fields (Progressive Scan)"},
		{"UpperFirst", "Upper Field First"},
		{"LowerFirst", "Lower Field First"},
		{"UnknownDominance", "Fields (Unknown Dominance)"},
		{"Any", "Any Field Order"},
	};
	for (int i = 0; i < 6; ++i)
	{
		EXPECT_EQ(field(i - 1), fields[i].second);
		keys.push_back(kPrefix + "FieldType/" + fields[i].first + "=" + fields[i].second);
	}
	EXPECT_EQ(recorder.TakeKeys(), keys);
	for (const int none : {-2, 6, 0x7FFFFFFF})
		EXPECT_EQ(quality(none) + field(none), "");
	EXPECT_EQ(quality(0) + field(5), "");
	EXPECT_TRUE(recorder.TakeKeys().empty()) << "a value without a text looked a key up";
}

// ---- Formats ---------------------------------------------------------------------------------------------------------

// The name of a format's constant says its description, but for packed 4:2:2, 10 bits, DV and MPEG.
std::string ExpectedText(PixelFormat inFormat)
{
	const std::pair<PixelFormat, const char*> others[] = {
		{kPixelFormat_RGB_444_10u, "BGR 4444 10u"},
		{kPixelFormat_UYVY_422_8u, "VUY 422 8u"},
		{kPixelFormat_UYVY_422_8u_709, "VUY 422 8u 709"},
		{kPixelFormat_UYVY_422_32f, "VUY 422 32f"},
		{kPixelFormat_UYVY_422_32f_709, "VUY 422 32f 709"},
		{kPixelFormat_YUYV_422_8u, "YUV 422 8u"},
		{kPixelFormat_YUYV_422_8u_709, "YUV 422 8u 709"},
		{kPixelFormat_YUYV_422_32f, "YUV 422 32f"},
		{kPixelFormat_YUYV_422_32f_709, "YUV 422 32f 709"},
		{kPixelFormat_V210_422_10u, "VUY 422 10u"},
		{kPixelFormat_V210_422_10u_709, "VUY 422 10u 709"},
		{kPixelFormat_NTSCDV25, "NTSC DV"},
		{kPixelFormat_PALDV25, "PAL DV"},
		{kPixelFormat_NTSCDV50, "NTSC DV 50"},
		{kPixelFormat_PALDV50, "PAL DV 50"},
		{kPixelFormat_NTSC_DV100_720p, "NTSC DV 100 (720p)"},
		{kPixelFormat_PAL_DV100_720p, "PAL DV 100 (720p)"},
		{kPixelFormat_NTSC_DV100_1080i, "NTSC DV 100 (1080i)"},
		{kPixelFormat_PAL_DV100_1080i, "PAL DV 100 (1080i)"},
	};
	for (const auto& [format, text] : others)
		if (format == inFormat)
			return text;
	std::string text(PixelFormatCatalogueName(inFormat));
	std::replace(text.begin(), text.end(), '_', ' ');
	// "YUV 420 MPEG2 FIELD PICTURE PLANAR 8u 601 FullRange"
	for (const auto& [from, to] : {std::pair("FIELD PICTURE PLANAR", "Field"), {"FRAME PICTURE PLANAR", "Frame"},
			 {" 601", ""}, {"FullRange", "Full Range"}})
		if (const std::size_t at = text.find(from); at != std::string::npos)
			text.replace(at, std::string_view(from).size(), to);
	return text;
}

TEST(PixelFormatDescription, NamesTheWholeCatalogue)
{
	for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
		EXPECT_EQ(Describe(*format), ExpectedText(*format));
	EXPECT_EQ(Describe(kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange),
		"YUV 420 MPEG2 Field 8u Full Range");
	EXPECT_EQ(Describe(kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange),
		"YUV 420 MPEG4 Frame 8u 709 Full Range");
	EXPECT_EQ(Describe(kPixelFormat_ARGB_4444_32f_Linear), "ARGB 4444 32f Linear");
	EXPECT_EQ(Describe(kPixelFormat_VUYA_4444_8u_709), "VUYA 4444 8u 709");
}

TEST(PixelFormatDescription, DecidesByWildcardNameKindAndCompression)
{
	const auto format = [](const char* inCode, std::uint32_t inProperties)
	{
		return PixelFormat{
			MakePixelFormatName(inCode[0], inCode[1], inCode[2], inCode[3]), PixelFormatProperties(inProperties)};
	};
	const struct
	{
		PixelFormat mFormat;
		std::string mText, mKey;
	} cases[] = {
		{kPixelFormat_Any, "Any Pixel Format", "PixelFormat/Any=Any Pixel Format"},
		{format("_abc", 0xBC000), "Any Pixel Format", "PixelFormat/Any=Any Pixel Format"},
		{format("_abc", 0x3C000), "Custom Pixel Format (cba_)", "PixelFormat/Custom=Custom Pixel Format (@0)"},
		{format("@abc", 0x40080), "Custom Pixel Format (cba@)", "PixelFormat/Custom=Custom Pixel Format (@0)"},
		{{MakePixelFormatName('_', '\0', 'b', 'c'), kPixelFormat_BGRA_4444_8u.mProperties}, "Custom Pixel Format (cb)",
			"PixelFormat/Custom=Custom Pixel Format (@0)"},
		{{MakePixelFormatName('_', 'a', 'b', '\0'), kPixelFormat_BGRA_4444_8u.mProperties}, "Custom Pixel Format ()",
			"PixelFormat/Custom=Custom Pixel Format (@0)"},
		{format("_a\xE9z", 0x40080),
			"Custom Pixel Format (z\uFFFD"
			"a_)",
			"PixelFormat/Custom=Custom Pixel Format (@0)"},
		{kPixelFormat_Invalid, "Unknown Pixel Format", "PixelFormat/Unknown=Unknown Pixel Format"},
		{format("bgra", 0x00080), "Unknown Pixel Format", "PixelFormat/Unknown=Unknown Pixel Format"},
		{format("xdva", 0x7C000), "Unknown Compressed Pixel Format (avdx)",
			"PixelFormat/UnknownCompressed=Unknown Compressed Pixel Format (@0)"},
		{format("bgra", 0x74000), "", ""},
		{format("bgra", 0x78000), "", ""},
		{format("bgra", 0xC0080), "BGRA 4444 8u", ""},   // kind 3 reads as kind 1
		{format("bgra", 0x43080), "ARGB 4444 8u Linear", "PixelFormat/Linear=Linear"},
		{format("????", 0x4022C), "BGR 4444 u 709", ""},   // depth code 6 and alpha code 4 have no text
		{format("????", 0x4187F), "YUV  f 709", ""},
		{format("????", 0x40C06), "BGR  16u", ""},
		{format("yv12", 0x64021), "YUV 420 MPEG2 Field 8u 709 Full Range",
			"PixelFormat/MPEG2Field=YUV 420 MPEG2 Field 8u"},
		{format("dvn2", 0xC4000), "NTSC DV", ""},
	};
	for (const auto& test : cases)
	{
		KeyRecorder recorder;
		EXPECT_EQ(Describe(test.mFormat), test.mText);
		EXPECT_EQ(recorder.TakeKeys(), test.mKey.empty() ? Keys() : Keys{kPrefix + test.mKey});
	}
}

TEST(PixelFormatDescription, GoesThroughTheTranslator)
{
	const KeyRecorder recorder("@0-@1");
	EXPECT_EQ(Describe({MakePixelFormatName('_', '0', '@', 'c'), {}}), "c@0_-@1") << "what is filled in stays";
	EXPECT_EQ(Describe(kPixelFormat_BGRX_4444_32f_Linear), "BGRX 4444 32f @0-@1");
	EXPECT_EQ(Describe(kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709), "@0-@1 709");
	EXPECT_EQ(Describe(kPixelFormat_NTSCDV25), "NTSC DV") << "fixed English";
}

TEST(PixelFormatOutput, IsTheDescription)
{
	std::ostringstream narrow;
	narrow << std::setw(16) << std::setfill('.') << kPixelFormat_BGRA_4444_8u << '|' << kPixelFormat_NTSCDV25;
	EXPECT_EQ(narrow.str(), "....BGRA 4444 8u|NTSC DV");
	zoncore::oUTF16StringStream wide;
	wide << std::left << std::setw(8) << kPixelFormat_NTSCDV25 << kPixelFormat_PALDV25;
	EXPECT_EQ(UTF16to8(wide.str()), "NTSC DV PAL DV");

	// A translation with a zero in it: the narrow stream ends there.
	const KeyRecorder recorder(std::string("a\0b", 3));
	std::ostringstream cut;
	cut << kPixelFormat_Any << '|';
	EXPECT_EQ(cut.str(), "a|");
	EXPECT_EQ(zoncore::utility::Coercion(kPixelFormat_Any).size(), 3u);
}

// ---- Shapes and sizes ------------------------------------------------------------------------------------------------

TEST(PixelAspectRatioDescription, TakesTheFirstThatIsEqual)
{
	const zontest::HostileLocale locale;
	const std::string area = kPrefix + "PixelAspectRatioFormat/";
	const struct
	{
		PixelAspectRatio mRatio;
		std::string mKey, mText, mNumber;
	} cases[] = {
		{{1, 1}, "Square", "Square Pixels", "1.0"},
		{{10, 11}, "D1NTSC", "D1/DV NTSC", "0.9091"},
		{{40, 33}, "D1NTSCWideScreen", "D1/DV NTSC Widescreen 16:9", "1.2121"},
		{{768, 702}, "D1PAL", "D1/DV PAL", "1.0940"},
		{{1024, 702}, "D1PALWide", "D1/DV PAL Widescreen 16:9", "1.4587"},
		{{2, 1}, "Anamorphic", "Anamorphic 2:1", "2.0"},
		{{4, 3}, "HDAnamorphic1080", "HD Anamorphic 1080", "1.3333"},
		{{3, 2}, "DVCProHD", "DVCPRO HD", "1.5"},
		{{9, 10}, "Other", "Other Aspect Ratio", "0.9000"},
		{{0, 1}, "Other", "Other Aspect Ratio", "0.0000"},
		{{12345, 1}, "Other", "Other Aspect Ratio", "12345.0000"},
		{{1, 0}, "Other", "Other Aspect Ratio", "1.79769e+308"},
	};
	for (const auto& test : cases)
	{
		KeyRecorder recorder;
		EXPECT_EQ(UTF16to8(PixelAspectRatioDescription(test.mRatio)), test.mText + " (" + test.mNumber + ")");
		EXPECT_EQ(recorder.TakeKeys(), Keys{area + test.mKey + "=" + test.mText + " (@0)"});
	}
}

TEST(VideoFrameSizeDescription, LeavesOutAShapeThatIsUnknown)
{
	const zontest::HostileLocale locale;
	const auto describe = [](int inWidth, int inHeight, PixelAspectRatio inRatio) {
		return UTF16to8(VideoFrameSizeDescription({11, 12, inWidth, inHeight}, inRatio));
	};
	constexpr int kLeast = std::numeric_limits<int>::min();
	EXPECT_EQ(describe(1920, 1080, kPixelAspectRatio_Any), "1920w 1080h");
	EXPECT_EQ(describe(720, 480, kPixelAspectRatio_DVNTSC), "720w 480h (0.9091)");
	EXPECT_EQ(describe(kLeast, -1, {0, 0}), "-2147483648w -1h");
	EXPECT_EQ(describe(0, 0, {1, 0}), "0w 0h (1.79769e+308)");
	KeyRecorder recorder("@2 @1 @0");
	EXPECT_EQ(describe(720, 480, {1, 1}), "1.0 480 720");
	EXPECT_EQ(describe(720, 480, {0, 1}), "@2 480 720");
	EXPECT_EQ(recorder.TakeKeys(),
		(Keys{kPrefix + "VideoFrameSizeFormatPAR=@0w @1h (@2)", kPrefix + "VideoFrameSizeFormat=@0w @1h"}));
}

TEST(VideoTextKeys, AreAllListedOnce)
{
	const auto all = AllTextKeys();
	const auto count = [&](std::string_view inArea)
	{
		return std::ranges::count_if(
			all, [=](std::string_view inKey) { return inKey.starts_with(kPrefix + std::string(inArea)); });
	};
	EXPECT_EQ(count("RenderQuality/"), 5);
	EXPECT_EQ(count("FieldType/"), 6);
	EXPECT_EQ(count("PixelFormat/"), 9);
	EXPECT_EQ(count("PixelAspectRatioFormat/"), 9);
	EXPECT_EQ(count("VideoFrameSizeFormat"), 2);
	std::vector<std::string_view> sorted(all.begin(), all.end());
	std::ranges::sort(sorted);
	EXPECT_EQ(std::ranges::adjacent_find(sorted), sorted.end());
}

}   // namespace
}   // namespace zonmediatypes
