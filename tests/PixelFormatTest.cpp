#include "tests/Allocations.h"
#include "tests/PixelFormatTable.h"

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <random>
#include <string>
#include <thread>
#include <type_traits>
#include <vector>

namespace zonmediatypes
{
namespace
{

// A static initialiser of a host sees the constants and the catalogue, and may register.
// NOLINTNEXTLINE(cppcoreguidelines-interfaces-global-init): that it may is what is tested
const PixelFormatProperties sSeenEarly = []
{
	RegisterCustomPixelFormatProperties(MakePixelFormatName('_', 'e', 'l', 'y'), kPixelFormat_UYVY_422_8u.mProperties);
	return LookupPropertiesForName(kPixelFormat_YUYV_422_8u.mName);
}();

constexpr PixelFormatProperties kSomeProperties(0x12345678);

static_assert(sizeof(PixelFormat) == 8 && std::is_trivially_copyable_v<PixelFormat>);
static_assert(kPixelFormatProperties_Invalid.GetValue() == 0x3C000 && kPixelFormatProperties_Any.GetValue() == 0xBC000);
static_assert(MakePixelFormatName('v', 'u', 'y', 'a') == 0x61797576);
static_assert(MakePixelFormatName('\xFF', '\x80', '\0', '\xFE') == 0xFE0080FF);

TEST(PixelFormatCatalogue, IsThePublishedTable)
{
	const std::vector<PixelFormatRow> rows = ReadPixelFormatTable();
	ASSERT_EQ(rows.size(), 74u);
	ASSERT_EQ(AllPixelFormatsEnd() - AllPixelFormatsBegin(), 74);
	for (std::size_t i = 0; i < rows.size(); ++i)
	{
		const PixelFormat format = AllPixelFormatsBegin()[i];
		const PixelFormatRow& row = rows[i];
		EXPECT_EQ(format.mName, row.mName) << row.mConstant;
		EXPECT_EQ(format.mName, MakePixelFormatName(row.mCode[0], row.mCode[1], row.mCode[2], row.mCode[3]));
		EXPECT_EQ(format.mProperties.GetValue(), row.mProperties) << row.mConstant;
		EXPECT_EQ("kPixelFormat_" + std::string(PixelFormatCatalogueName(format)), row.mConstant);
		EXPECT_EQ(LookupPropertiesForName(format.mName), format.mProperties) << row.mConstant;
		EXPECT_EQ(GuessNameForProperties(format.mProperties), format.mName) << row.mConstant;
	}
}

// The header's declarations are the table's names: one of every family, with those that differ in one bit.
TEST(PixelFormatCatalogue, HasItsConstantsInTheirPlaces)
{
	EXPECT_EQ(*AllPixelFormatsBegin(), kPixelFormat_VUYA_4444_8u);
	EXPECT_EQ(AllPixelFormatsEnd()[-1], kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange);
	EXPECT_EQ(AllPixelFormatsBegin()[30], kPixelFormat_ARGB_4444_32f_Linear);
	EXPECT_EQ(AllPixelFormatsBegin()[39], kPixelFormat_RGB_444_10u);
	EXPECT_EQ(AllPixelFormatsBegin()[47], kPixelFormat_YUYV_422_32f_709);
	EXPECT_EQ(AllPixelFormatsBegin()[55], kPixelFormat_PAL_DV100_720p);
	EXPECT_EQ(kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601.mProperties.GetValue(), 0x64C41u);
	EXPECT_EQ(kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange.mProperties.GetValue(), 0x64C01u);
	EXPECT_EQ(kPixelFormat_Invalid, PixelFormat());
	EXPECT_EQ(kPixelFormat_Invalid.mName, MakePixelFormatName('b', 'a', 'd', 'f'));
	EXPECT_EQ(kPixelFormat_Any, (PixelFormat{kPixelFormatFourCC_Any, kPixelFormatProperties_Any}));
	EXPECT_EQ(sSeenEarly, kPixelFormat_YUYV_422_8u.mProperties);
}

// The getters read the bits that the layout gives them, and the setters write no others, for arbitrary values.
TEST(PixelFormatProperties, FieldsStandWhereTheyStand)
{
	struct Field
	{
		unsigned mShift, mBits;
		std::function<unsigned(const PixelFormatProperties&)> mGet;
		std::function<void(PixelFormatProperties&, unsigned)> mSet;
	};
	using P = PixelFormatProperties;
	const Field fields[] = {
		{0, 1, &P::IsYUV, &P::SetIsYUV},
		{1, 3, &P::BitDepth, &P::SetBitDepth},
		{4, 1, &P::IsFloat, &P::SetIsFloat},
		{5, 1, &P::Is709, &P::SetIs709},
		{6, 1, &P::IsVideoRange, &P::SetIsVideoRange},
		{7, 3, &P::Alpha, &P::SetAlpha},
		{10, 2, &P::Subsampling, &P::SetSubsampling},
		{12, 1, &P::ReversedOrder, &P::SetReversedOrder},
		{13, 1, &P::IsLinear, &P::SetIsLinear},
		{14, 4, &P::Compression, &P::SetCompression},
		{18, 2, &P::Kind, &P::SetKind},
	};
	std::mt19937 random(5);
	for (int round = 0; round < 2'000; ++round)
	{
		const P value(static_cast<std::uint32_t>(random()));
		const auto code = static_cast<unsigned>(random());
		for (const Field& field : fields)
		{
			const std::uint32_t low = (1u << field.mBits) - 1;
			const unsigned stored = field.mBits == 1 ? unsigned{code != 0} : code & low;   // a bool is any number but 0
			P changed = value;
			field.mSet(changed, code);
			EXPECT_EQ(field.mGet(value), value.GetValue() >> field.mShift & low);
			EXPECT_EQ(changed.GetValue(), (value.GetValue() & ~(low << field.mShift)) | stored << field.mShift);
		}
	}
}

TEST(PixelFormatProperties, PredicatesAreMasksOnTheWholeValue)
{
	std::mt19937 random(6);
	for (int round = 0; round < 20'000; ++round)
	{
		const auto value = static_cast<std::uint32_t>(random());
		const PixelFormatProperties properties(value);
		const unsigned compression = value >> 14 & 15;
		EXPECT_EQ(properties.IsConcrete(), (value & 0xC0000) == 0x40000);
		EXPECT_EQ(properties.IsCompressed(), (value & 0x3C000) != 0);
		EXPECT_EQ(properties.HasUnknownCompression(), (value & 0x3C000) == 0x3C000);
		EXPECT_EQ(properties.IsDV(), compression >= 1 && compression <= 8);
		EXPECT_EQ(properties.IsMPEG(), compression >= 9 && compression <= 12);
		EXPECT_EQ(properties.Is4444(), (value & 0xC0C00) == 0x40000 && (value & 0x380) != 0);
		EXPECT_EQ(properties.HasAlpha(), (value >> 7 & 7) == 1 || (value >> 7 & 7) == 2);
	}
	EXPECT_NE(PixelFormatProperties(0x400C1), PixelFormatProperties(0x800400C1)) << "unused bits count";
}

TEST(PixelFormatLookup, KnowsNoOthers)
{
	EXPECT_EQ(LookupPropertiesForName(kPixelFormatFourCC_Any), kPixelFormatProperties_Any);
	EXPECT_EQ(LookupPropertiesForName(kPixelFormatFourCC_Invalid), kPixelFormatProperties_Invalid);
	EXPECT_EQ(PixelFormatCatalogueName(kPixelFormat_Any), "");
	EXPECT_EQ(PixelFormatCatalogueName({kPixelFormat_BGRA_4444_8u.mName, kSomeProperties}), "");
	// Every code that differs from a built-in one in one bit, unless it is one itself.
	for (const PixelFormatRow& row : ReadPixelFormatTable())
	{
		for (unsigned bit = 0; bit < 32; ++bit)
		{
			const auto name = static_cast<PixelFormatName>(row.mName ^ 1u << bit);
			const auto* const end = AllPixelFormatsEnd();
			const auto* const found = std::find_if(
				AllPixelFormatsBegin(), end, [name](PixelFormat inFormat) { return inFormat.mName == name; });
			EXPECT_EQ(
				LookupPropertiesForName(name), found == end ? kPixelFormatProperties_Invalid : found->mProperties);
		}
	}
}

TEST(PixelFormatGuess, WantsAllBits)
{
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x400C1)), MakePixelFormatName('v', 'u', 'y', 'a'));
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x100400C1)), kPixelFormatFourCC_Invalid);
	EXPECT_EQ(GuessNameForProperties(kPixelFormatProperties_Any), kPixelFormatFourCC_Any);
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x800C1)), kPixelFormatFourCC_Any) << "the kind decides";
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x000C1)), kPixelFormatFourCC_Invalid) << "kind 0";
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0xC00C1)), kPixelFormatFourCC_Invalid) << "kind 3";
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x7C0C1)), kPixelFormatFourCC_Invalid)
		<< "unknown compression";
}

TEST(CustomPixelFormats, AreFoundAfterRegistrationUnderTheirPrefixOnly)
{
	const PixelFormatName at = MakePixelFormatName('@', '\0', '\0', '\0');
	EXPECT_EQ(LookupPropertiesForName(at), kPixelFormatProperties_Invalid);
	RegisterCustomPixelFormatProperties(at, kSomeProperties);
	EXPECT_EQ(LookupPropertiesForName(at), kSomeProperties);
	RegisterCustomPixelFormatProperties(at, kPixelFormatProperties_Any);
	EXPECT_EQ(LookupPropertiesForName(at), kPixelFormatProperties_Any) << "the later one counts";
	EXPECT_EQ(LookupPropertiesForName(MakePixelFormatName('_', 'e', 'l', 'y')), kPixelFormat_UYVY_422_8u.mProperties);

	// Deliberate: without the prefix a name is recorded and never found, and a built-in one stays what it is.
	for (const PixelFormatName name : {MakePixelFormatName('a', '_', '@', 'b'), kPixelFormatFourCC_Any,
			 kPixelFormatFourCC_Invalid, kPixelFormat_BGRA_4444_8u.mName})
	{
		const PixelFormatProperties before = LookupPropertiesForName(name);
		RegisterCustomPixelFormatProperties(name, kSomeProperties);
		EXPECT_EQ(LookupPropertiesForName(name), before);
	}
	RegisterCustomPixelFormatProperties(at, PixelFormatProperties(0x4FFFF));
	EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(0x4FFFF)), kPixelFormatFourCC_Invalid);
}

TEST(CustomPixelFormats, AreAsBeforeWhenMemoryRunsOut)
{
	const PixelFormatName name = MakePixelFormatName('_', 'm', 'e', 'm');
	zontest::FailEachAllocation([=] { RegisterCustomPixelFormatProperties(name, kSomeProperties); },
		[=] { EXPECT_EQ(LookupPropertiesForName(name), kPixelFormatProperties_Invalid); });
	EXPECT_EQ(LookupPropertiesForName(name), kSomeProperties);
}

PixelFormatName NumberedName(std::uint32_t inNumber)
{
	return static_cast<PixelFormatName>('_' | inNumber << 8);
}

TEST(CustomPixelFormats, AMillionOfThem)
{
	constexpr std::uint32_t kMany = 1'000'000;
	for (std::uint32_t i = 0; i < kMany; ++i)
		RegisterCustomPixelFormatProperties(NumberedName(i), PixelFormatProperties(i ^ 0xABCDE));
	std::uint32_t wrong = 0;
	for (std::uint32_t i = 0; i < kMany; ++i)
		wrong += LookupPropertiesForName(NumberedName(i)) != PixelFormatProperties(i ^ 0xABCDE);
	EXPECT_EQ(wrong, 0u);
	EXPECT_EQ(LookupPropertiesForName(NumberedName(kMany)), kPixelFormatProperties_Invalid);
}

// Each writer registers its own names in rising order; a reader that finds a name finds its properties.
TEST(CustomPixelFormats, ServeWritersAndReadersAtOnce)
{
	constexpr std::uint32_t kNames = 3'000;
	const auto name = [](std::uint32_t inWriter, std::uint32_t inIndex)
	{ return NumberedName(0x800000 | inWriter << 16 | inIndex); };
	std::atomic<int> wrong = 0;
	std::vector<std::thread> threads;
	for (const std::uint32_t writer : {1u, 2u})
	{
		threads.emplace_back(
			[=]
			{
				for (std::uint32_t i = 0; i < kNames; ++i)
					RegisterCustomPixelFormatProperties(name(writer, i), PixelFormatProperties(writer << 16 | i));
			});
		threads.emplace_back(
			[=, &wrong]
			{
				for (std::uint32_t i = 0; i < kNames; ++i)
				{
					const PixelFormatProperties found = LookupPropertiesForName(name(writer, i));
					wrong
						+= found != kPixelFormatProperties_Invalid && found != PixelFormatProperties(writer << 16 | i);
					wrong += LookupPropertiesForName(kPixelFormat_NTSCDV25.mName) != kPixelFormat_NTSCDV25.mProperties;
				}
			});
	}
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(wrong, 0);
	for (const std::uint32_t writer : {1u, 2u})
		for (std::uint32_t i = 0; i < kNames; ++i)
			ASSERT_EQ(LookupPropertiesForName(name(writer, i)), PixelFormatProperties(writer << 16 | i));
}

}   // namespace
}   // namespace zonmediatypes
