#include "tests/video/PixelFormatTable.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iomanip>
#include <string>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr PixelFormatProperties kSomeProperties(0x12345678);
constexpr PixelFormatName kEarly = MakePixelFormatName('_', 'e', 'l', 'y');

// A static initialiser of a host sees the constants and the catalogue, and may register.
// NOLINTNEXTLINE(cppcoreguidelines-interfaces-global-init): that it may is what is tested
const PixelFormatProperties sSeenEarly = []
{
	RegisterCustomPixelFormatProperties(kEarly, kPixelFormat_UYVY_422_8u.mProperties);
	return LookupPropertiesForName(kPixelFormat_YUYV_422_8u.mName);
}();

static_assert(kPixelFormatProperties_Invalid.GetValue() == 0x3C000 && kPixelFormatProperties_Any.GetValue() == 0xBC000);
static_assert(MakePixelFormatName("vuya") == 0x61797576 && kPixelFormatFourCC_VUYA_4444_8u == 0x61797576);
static_assert(MakePixelFormatName('\xFF', '\x80', '\0', '\xFE') == 0xFE0080FF);

// ---- The catalogue ---------------------------------------------------------------------------------------------------

TEST(PixelFormatCatalogue, IsThePublishedTable)
{
	std::ifstream file(ZON_TEST_DATA "/pixel-formats.tsv");
	std::string rest, constant, code;
	std::ptrdiff_t index = 0;
	std::uint32_t name = 0, properties = 0;
	std::getline(file, rest);   // headings
	for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
	{
		file >> std::dec >> index >> constant >> code >> std::setbase(0) >> name >> properties;
		std::getline(file, rest);   // the description
		EXPECT_EQ(format - AllPixelFormatsBegin(), index);
		EXPECT_EQ(format->mName, name) << constant;
		EXPECT_EQ(format->mName, MakePixelFormatName(code[0], code[1], code[2], code[3]));
		EXPECT_EQ(format->mProperties.GetValue(), properties) << constant;
		EXPECT_EQ("kPixelFormat_" + std::string(PixelFormatCatalogueName(*format)), constant);
		EXPECT_EQ(LookupPropertiesForName(format->mName), format->mProperties) << constant;
		EXPECT_EQ(GuessNameForProperties(format->mProperties), format->mName) << constant;
	}
	EXPECT_EQ(index, 73);
	EXPECT_EQ(file.peek(), std::char_traits<char>::eof());
}

TEST(PixelFormatCatalogue, IsSeenByStaticInitialisersAndHasItsConstants)
{
	EXPECT_EQ(sSeenEarly, kPixelFormat_YUYV_422_8u.mProperties);
	EXPECT_EQ(LookupPropertiesForName(kEarly), kPixelFormat_UYVY_422_8u.mProperties);
	EXPECT_EQ(AllPixelFormatsBegin()[55], kPixelFormat_PAL_DV100_720p);
	EXPECT_EQ(AllPixelFormatsBegin()[73], kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange);
	EXPECT_EQ(kPixelFormat_Invalid, (PixelFormat{MakePixelFormatName("badf"), {}}));
	EXPECT_EQ(kPixelFormat_Any, (PixelFormat{kPixelFormatFourCC_Any, kPixelFormatProperties_Any}));
}

TEST(PixelFormatCatalogue, KnowsNoOtherNames)
{
	const std::vector<PixelFormat> known = EveryPixelFormat();
	for (const PixelFormat format : known)
	{
		for (unsigned bit = 0; bit < 32; ++bit)
		{
			const auto name = static_cast<PixelFormatName>(format.mName ^ 1u << bit);
			const auto found = std::ranges::find(known, name, &PixelFormat::mName);
			EXPECT_EQ(LookupPropertiesForName(name),
				found != known.end() ? found->mProperties : kPixelFormatProperties_Invalid);
		}
	}
	EXPECT_EQ(PixelFormatCatalogueName(kPixelFormat_Any), "");
	EXPECT_EQ(PixelFormatCatalogueName({kPixelFormatFourCC_BGRA_4444_8u, kSomeProperties}), "");
}

TEST(PixelFormatGuess, WantsAllBits)
{
	const std::pair<std::uint32_t, PixelFormatName> cases[] = {
		{0x400C1, kPixelFormat_VUYA_4444_8u.mName}, {0x100400C1, kPixelFormatFourCC_Invalid},
		{0xBC000, kPixelFormatFourCC_Any}, {0x800C1, kPixelFormatFourCC_Any},   // the kind decides
		{0x000C1, kPixelFormatFourCC_Invalid}, {0xC00C1, kPixelFormatFourCC_Invalid},
		{0x7C0C1, kPixelFormatFourCC_Invalid},   // unknown compression
	};
	for (const auto& [properties, name] : cases)
		EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(properties)), name) << std::hex << properties;
}

// ---- Properties ------------------------------------------------------------------------------------------------------

// Where the fields stand is shown by the catalogue, whose rows are made by the setters.
TEST(PixelFormatProperties, KeepWhatFitsTheirFields)
{
	PixelFormatProperties properties(0xFFFFFFFF);
	properties.SetBitDepth(0x1A);
	properties.SetAlpha(0xF5);
	properties.SetSubsampling(0xF9);
	properties.SetCompression(0x123);
	properties.SetKind(0x72);
	EXPECT_EQ(properties.GetValue(), 0xFFF8'F6F5u);
	EXPECT_TRUE(properties.BitDepth() == 2 && properties.Alpha() == 5 && properties.Subsampling() == 1);
	EXPECT_TRUE(properties.Compression() == 3 && properties.Kind() == kPixelFormatKind_Any);
	EXPECT_NE(PixelFormatProperties(0x400C1), PixelFormatProperties(0x800400C1)) << "unused bits count";
}

// ---- Custom formats --------------------------------------------------------------------------------------------------

TEST(CustomPixelFormats, AreFoundAfterRegistrationUnderTheirPrefixOnly)
{
	const PixelFormatName at = MakePixelFormatName('@', '\0', '\0', '\0');
	EXPECT_EQ(LookupPropertiesForName(at), kPixelFormatProperties_Invalid);
	for (const PixelFormatProperties properties : {kSomeProperties, kPixelFormatProperties_Any})
	{
		RegisterCustomPixelFormatProperties(at, properties);
		EXPECT_EQ(LookupPropertiesForName(at), properties) << "the latest one counts";
	}
	EXPECT_EQ(GuessNameForProperties(kSomeProperties), kPixelFormatFourCC_Invalid);

	// Deliberate: without the prefix a name is recorded and never found, and a built-in one stays what it is.
	for (const PixelFormatName name : {MakePixelFormatName('a', '_', '@', 'b'), kPixelFormatFourCC_Any,
			 kPixelFormatFourCC_Invalid, kPixelFormat_BGRA_4444_8u.mName})
	{
		const PixelFormatProperties before = LookupPropertiesForName(name);
		RegisterCustomPixelFormatProperties(name, kSomeProperties);
		EXPECT_EQ(LookupPropertiesForName(name), before);
	}
}

TEST(CustomPixelFormats, AreKeptApartHoweverMany)
{
	const auto name = [](std::uint32_t inNumber) { return static_cast<PixelFormatName>('_' | inNumber << 8); };
	constexpr std::uint32_t kNames = 10'000;
	for (std::uint32_t number = 0; number < kNames; ++number)
		RegisterCustomPixelFormatProperties(name(number), PixelFormatProperties(number));
	for (std::uint32_t number = 0; number < kNames; ++number)
		ASSERT_EQ(LookupPropertiesForName(name(number)), PixelFormatProperties(number));
	EXPECT_EQ(LookupPropertiesForName(name(kNames)), kPixelFormatProperties_Invalid);
}

}   // namespace
}   // namespace zonmediatypes
