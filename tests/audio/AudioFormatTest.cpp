#include "zonmediatypes/AudioFormat.h"

#include "tests/audio/AudioTables.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <type_traits>
#include <vector>

namespace
{

using namespace zonmediatypes;

static_assert(std::has_virtual_destructor_v<AudioFormat> && std::is_nothrow_move_constructible_v<AudioFormat>);
static_assert(kAudioSampleRate_Invalid == -1);

AudioFormat Format(const char* inLayout, std::uint32_t inRate = 48'000, int inType = kAudioSampleType_32Bit)
{
	AudioFormat format = AudioFormat::CreateAudioFormat(ReadLayout(inLayout), inRate);
	format.SetSampleType(static_cast<AudioSampleType>(inType));
	return format;
}

TEST(AudioFormat, StartsEmptyOrWithDefaults)
{
	EXPECT_EQ(AudioFormat(), Format("", 0, 0));
	for (const std::uint32_t count : {0u, 1u, 2u, 3u, 4u, 6u, 8u, 100'000u})
	{
		const AudioFormat format = AudioFormat::CreateDefaultAudioFormat(count, 0x8000'0000 + count);
		EXPECT_EQ(format.GetChannelLayout(),
			count == 2       ? ReadLayout("L R")
				: count == 6 ? ReadLayout("L R C LFE Ls Rs")
							 : AudioChannelLayout(count));
		EXPECT_EQ(format.GetChannelCount(), count);
		EXPECT_EQ(format.GetSampleRate(), static_cast<std::int32_t>(0x8000'0000 + count));
		EXPECT_EQ(format.GetSampleType(), kAudioSampleType_32Bit);
	}
	EXPECT_EQ(AudioFormat::CreateAudioFormat(ReadLayout("C"), 1), Format("C", 1));
}

TEST(AudioFormat, AlignsToTheBytesOfAllChannels)
{
	for (int type = -1; type <= 60; ++type)
	{
		const bool isKnown = type == 10 || type == 20 || type == 30 || type == 40;
		EXPECT_EQ(Format("L R C", 1, type).GetSampleAlignment(), isKnown ? 3u * static_cast<unsigned>(type) / 10 : 0);
	}
}

TEST(AudioFormat, FindsChannels)
{
	const AudioFormat format = Format("L C 5 C");
	EXPECT_EQ(format.GetChannelIndex(kAudioChannelLabel_FrontCenter), 1u);
	EXPECT_EQ(format.GetChannelIndex(kAudioChannelLabel_FrontRight), 4u);
	EXPECT_EQ(format.GetChannelDescription(2), static_cast<AudioChannelLabel>(5));
	EXPECT_EQ(format.GetChannelDescription(4), kAudioChannelLabel_Discrete);
}

TEST(AudioFormat, CopiesItsLayoutInAndOut)
{
	AudioFormat format = Format("L R");
	const AudioFormat copy = format;
	AudioChannelLayout layout = ReadLayout("C");
	format.GetChannelLayout(layout);
	EXPECT_EQ(layout, ReadLayout("L R"));
	format.SetChannelLayout(format.GetChannelLayout());
	EXPECT_EQ(format, copy);
	format.SetChannelLayout(ReadLayout("101 100 0 100 -1"));
	EXPECT_EQ(copy, Format("L R"));
	NormalizeChannelOrder(format);
	EXPECT_EQ(format, Format("-1 0 100 100 101"));
	format = copy;
	EXPECT_EQ(format, copy);
}

// Compares all pairs of formats that stand in ascending order.
template <class Compare>
void ExpectOrder(const std::vector<AudioFormat>& inFormats)
{
	for (std::size_t i = 0; i < inFormats.size(); ++i)
	{
		for (std::size_t j = 0; j < inFormats.size(); ++j)
		{
			EXPECT_EQ(Compare()(inFormats[i], inFormats[j]), i < j) << i << ' ' << j;
			EXPECT_EQ(inFormats[i] == inFormats[j], i == j) << i << ' ' << j;
		}
	}
}

TEST(AudioFormat, IsOrderedByRateThenChannelsThenType)
{
	ExpectOrder<AudioFormatExactCompare>({Format("Rs", 0xFFFF'FFFF, 40), Format("", 1, 40), Format("", 2, 10),
		Format("", 2, 20), Format("-1", 2, 40), Format("*", 2, 40), Format("* *", 2, 10), Format("L", 2, 40),
		Format("L R", 2, 40), Format("L R *", 2, 10), Format("L C", 2, 10), Format("L C", 2, 20), Format("", 3, 10)});
	ExpectOrder<AudioFormatSimpleCompare>({Format("L", 0xFFFF'FFFF, 40), Format("L R", 1, 40), Format("L", 2, 10),
		Format("L", 2, 20), Format("* *", 2, 10)});
	EXPECT_FALSE(AudioFormatSimpleCompare()(Format("L R"), Format("* *")));
	EXPECT_FALSE(AudioFormatSimpleCompare()(Format("* *"), Format("L R")));
}

}   // namespace
