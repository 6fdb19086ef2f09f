#include "zonmediatypes/AudioFormat.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <set>
#include <type_traits>
#include <vector>

namespace zonmediatypes
{
namespace
{

static_assert(std::has_virtual_destructor_v<AudioFormat> && std::is_nothrow_move_constructible_v<AudioFormat>);
static_assert(kAudioSampleRate_Invalid == -1);

AudioFormat Format(const char* inLayout, std::uint32_t inRate = 48'000, int inType = 40)
{
	AudioFormat format = AudioFormat::CreateAudioFormat(ReadLayout(inLayout), inRate);
	format.SetSampleType(static_cast<AudioSampleType>(inType));
	return format;
}

TEST(AudioFormat, StartsEmpty)
{
	const AudioFormat format;
	EXPECT_EQ(format.GetSampleRate(), 0);
	EXPECT_EQ(format.GetSampleType(), 0);
	EXPECT_EQ(format.GetChannelCount(), 0u);
	EXPECT_EQ(format.GetSampleAlignment(), 0u);
}

TEST(AudioFormat, DefaultsLabelTwoAndSixChannelsOnly)
{
	for (const std::uint32_t count : {0u, 1u, 2u, 3u, 4u, 6u, 8u, 100'000u})
	{
		const AudioFormat format = AudioFormat::CreateDefaultAudioFormat(count, 48'000);
		const AudioChannelLayout layout = count == 2 ? ReadLayout("100 101")
			: count == 6                             ? ReadLayout("100 101 102 103 104 105")
													 : AudioChannelLayout(count);
		EXPECT_EQ(format.GetChannelLayout(), layout);
		EXPECT_EQ(format.GetSampleRate(), 48'000);
		EXPECT_EQ(format.GetSampleType(), kAudioSampleType_32Bit);
	}
	EXPECT_EQ(AudioFormat::CreateDefaultAudioFormat(1, 0xFFFF'FFFF).GetSampleRate(), -1);
	const AudioFormat created = AudioFormat::CreateAudioFormat(ReadLayout("C"), 0x8000'0000);
	EXPECT_EQ(created.GetSampleRate(), -2'147'483'648);
	EXPECT_EQ(created.GetSampleType(), 40);
	EXPECT_EQ(created.GetChannelLayout(), ReadLayout("C"));
}

TEST(AudioFormat, AlignsToTheBytesOfAllChannels)
{
	for (int type = -1; type <= 60; ++type)
	{
		const bool isKnown = type == 10 || type == 20 || type == 30 || type == 40;
		EXPECT_EQ(Format("L R C LFE Ls Rs", 1, type).GetSampleAlignment(),
			isKnown ? 6u * static_cast<unsigned>(type) / 10 : 0)
			<< type;
	}
}

TEST(AudioFormat, FindsChannels)
{
	const AudioFormat format = Format("L C 5 C");
	EXPECT_EQ(format.GetChannelIndex(kAudioChannelLabel_FrontCenter), 1u);
	EXPECT_EQ(format.GetChannelIndex(static_cast<AudioChannelLabel>(5)), 2u);
	EXPECT_EQ(format.GetChannelIndex(kAudioChannelLabel_FrontRight), 4u);
	EXPECT_EQ(format.GetChannelDescription(2), static_cast<AudioChannelLabel>(5));
	EXPECT_EQ(format.GetChannelDescription(4), kAudioChannelLabel_Discrete);
	EXPECT_EQ(format.GetChannelDescription(~std::size_t{0}), kAudioChannelLabel_Discrete);
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
	format.SetChannelLayout(ReadLayout("C LFE"));
	EXPECT_EQ(format.GetChannelLayout(), ReadLayout("C LFE"));
	EXPECT_NE(format, copy);
	format = copy;
	EXPECT_EQ(format, copy);
	EXPECT_NE(format, Format("L R", 44'100));
	EXPECT_NE(format, Format("L R", 48'000, 20));
	EXPECT_NE(format, Format("L R C"));
}

TEST(AudioFormat, NormalizesByLabelNumber)
{
	AudioFormat format = Format("101 100 0 100 -1", 44'100, 20);
	NormalizeChannelOrder(format);
	EXPECT_EQ(format, Format("-1 0 100 100 101", 44'100, 20));
}

// Formats in ascending order of the exact comparison.
const std::vector<AudioFormat> sExactlyOrdered = {Format("Rs", 0xFFFF'FFFF, 40), Format("", 1, 40), Format("", 2, 10),
	Format("", 2, 20), Format("-1", 2, 40), Format("*", 2, 40), Format("* *", 2, 10), Format("L", 2, 40),
	Format("L R", 2, 40), Format("L R *", 2, 10), Format("L C", 2, 10), Format("L C", 2, 20), Format("", 3, 10)};

TEST(AudioFormatExactCompare, OrdersByRateThenLayoutThenType)
{
	for (std::size_t i = 0; i < sExactlyOrdered.size(); ++i)
	{
		for (std::size_t j = 0; j < sExactlyOrdered.size(); ++j)
			EXPECT_EQ(AudioFormatExactCompare()(sExactlyOrdered[i], sExactlyOrdered[j]), i < j) << i << ' ' << j;
	}
	const std::set<AudioFormat, AudioFormatExactCompare> formats(sExactlyOrdered.begin(), sExactlyOrdered.end());
	EXPECT_EQ(formats.size(), sExactlyOrdered.size());
}

TEST(AudioFormatSimpleCompare, OrdersByRateThenCountThenType)
{
	const std::vector<AudioFormat> ordered = {Format("L", 0xFFFF'FFFF, 40), Format("L R", 1, 40), Format("L", 2, 10),
		Format("L", 2, 20), Format("* *", 2, 10)};
	for (std::size_t i = 0; i < ordered.size(); ++i)
	{
		for (std::size_t j = 0; j < ordered.size(); ++j)
			EXPECT_EQ(AudioFormatSimpleCompare()(ordered[i], ordered[j]), i < j) << i << ' ' << j;
	}
	EXPECT_FALSE(AudioFormatSimpleCompare()(Format("L R"), Format("* *")));
	EXPECT_FALSE(AudioFormatSimpleCompare()(Format("* *"), Format("L R")));
}

}   // namespace
}   // namespace zonmediatypes
