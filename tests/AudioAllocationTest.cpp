#include "tests/Allocations.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"

#include <gtest/gtest.h>

// Layouts are so large here that no block of theirs comes from a pool: every allocation can be made to fail in every build.

namespace zonmediatypes
{
namespace
{

using zontest::FailEachAllocation;

constexpr int kMany = 150;

// L, many unlabelled channels, and R.
AudioChannelLayout LargeLayout()
{
	AudioChannelLayout layout = CreateMultichannelLayout(kMany);
	layout.front() = kAudioChannelLabel_FrontLeft;
	layout.back() = kAudioChannelLabel_FrontRight;
	return layout;
}

AudioChannelLayout Reversed(const AudioChannelLayout& inLayout)
{
	return AudioChannelLayout(inLayout.rbegin(), inLayout.rend());
}

// Makes each allocation of inFunction fail in turn: ioValue must then be as before. In the end it must have changed.
template <class Value, class Function>
void ExpectAllOrNothing(Value& ioValue, Function inFunction)
{
	const Value before = ioValue;
	const long failures = FailEachAllocation(inFunction, [&] { EXPECT_EQ(ioValue, before); });
	EXPECT_GT(failures, 0);
	EXPECT_NE(ioValue, before);
}

TEST(WhenMemoryRunsOut, MatricesAreAsBefore)
{
	const AudioChannelLayout many = LargeLayout();
	const AudioChannelLayout unlabelled = CreateMultichannelLayout(kMany);
	const ChannelConversionMatrix before = {{7.0}};

	ChannelConversionMatrix matrix = before;
	ExpectAllOrNothing(matrix, [&] { CreateIdentityChannelConversionMatrix(kMany, 2, matrix); });
	matrix = before;
	ExpectAllOrNothing(matrix, [&] { ComputeChannelConversionMatrix(many, Reversed(many), matrix); });
	matrix = before;
	ExpectAllOrNothing(matrix, [&] { ComputeChannelConversionMatrix(unlabelled, many, matrix); });
}

TEST(WhenMemoryRunsOut, OrderingsAreAsBefore)
{
	const AudioChannelLayout source = LargeLayout();
	const AudioChannelLayout destination = Reversed(source);
	ChannelOrdering ordering = {42};
	ExpectAllOrNothing(ordering, [&] { EXPECT_TRUE(RemapChannelOrdering(source, destination, ordering)); });
}

TEST(WhenMemoryRunsOut, RelabelledLayoutsAreAsBefore)
{
	const AudioChannelLayout destination = CreateVST22_2ChannelLayout();
	AudioChannelLayout layout = LargeLayout();
	ExpectAllOrNothing(
		layout, [&] { EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(layout, destination, layout)); });
}

TEST(WhenMemoryRunsOut, ChannelMapsAreAsBefore)
{
	const AudioChannelLayout many = LargeLayout();
	ChannelMap map;
	ExpectAllOrNothing(map, [&] { map.AddChannel(many, 0); });
	ExpectAllOrNothing(map, [&] { map.AddChannel(many, 1); });
	ExpectAllOrNothing(map, [&] { map.SetChannelLayout(0, Reversed(many)); });
	constexpr auto kLeft = kAudioChannelLabel_FrontLeft;
	ExpectAllOrNothing(map, [&] { map.SetDeviceChannelIndexForChannelLabel(kLeft, 1); });
	ExpectAllOrNothing(map, [&] { map.SetDeviceChannelIndexForChannelLabel(kLeft, 2); });
	ExpectAllOrNothing(map, [&] { map.SetDeviceChannelIndexForChannelLabel(kLeft, -1); });
	const ChannelMap other(many);
	ExpectAllOrNothing(map, [&] { map = other; });
}

TEST(WhenMemoryRunsOut, AudioFormatsAreAsBefore)
{
	const AudioChannelLayout many = LargeLayout();
	const AudioFormat other = AudioFormat::CreateDefaultAudioFormat(kMany, 48'000);
	AudioFormat format;
	ExpectAllOrNothing(format, [&] { format = other; });
	ExpectAllOrNothing(format, [&] { format.SetChannelLayout(many); });
	ExpectAllOrNothing(format, [&] { NormalizeChannelOrder(format); });
	AudioChannelLayout layout;
	ExpectAllOrNothing(layout, [&] { format.GetChannelLayout(layout); });
}

TEST(WhenMemoryRunsOut, CopiesAndTextsAreNotMade)
{
	const AudioChannelLayout many = LargeLayout();
	const auto nothing = [] {};
	EXPECT_GT(
		FailEachAllocation([&] { EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(many, Reversed(many))); }, nothing), 0);
	EXPECT_GT(
		FailEachAllocation([&] { EXPECT_EQ(AudioChannelLayoutDescriptionUnlocalized(many).size(), 300u); }, nothing),
		0);
	EXPECT_GT(FailEachAllocation([&] { EXPECT_EQ(ChannelMap(many).GetNumberOfChannels(), 150u); }, nothing), 0);
}

TEST(AudioAllocations, EachRowOfAMatrixIsAllocatedOnce)
{
	const AudioChannelLayout many = LargeLayout();
	ChannelConversionMatrix matrix;
	EXPECT_EQ(zontest::CountAllocations([&] { ComputeChannelConversionMatrix(many, many, matrix); }), 1u + kMany);
}

TEST(AudioAllocations, QueriesNeedNoMemory)
{
	const AudioChannelLayout many = LargeLayout();
	const ChannelMap map = ChannelMap::CreateDefaultChannelMap(kMany);
	const auto query = [&]
	{
		EXPECT_TRUE(HasChannelLabeling(many));
		EXPECT_FALSE(HasLFEChannel(many));
		EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(35), 35);
		EXPECT_EQ(map.GetNumberOfAssignments(), static_cast<unsigned>(kMany));
	};
	EXPECT_EQ(zontest::CountAllocations(query), 0u);
}

}   // namespace
}   // namespace zonmediatypes
