// Layouts of any labels: conversion, ordering, maps, formats and descriptions.

#include "Checks.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <numeric>

namespace
{

using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

AudioChannelLabel TakeLabel(FuzzInput& ioInput)
{
	const auto byte = ioInput.Any<std::uint8_t>();
	return static_cast<AudioChannelLabel>(byte < 200 ? byte
			: byte < 240                             ? kAudioChannelLabel_Discrete
													 : ioInput.Edge<std::int32_t>());
}

AudioChannelLayout TakeLayout(FuzzInput& ioInput)
{
	AudioChannelLayout layout(ioInput.Below(9));
	for (AudioChannelDescription& channel : layout)
		channel = TakeLabel(ioInput);
	return layout;
}

void CheckPairs(FuzzInput& ioInput)
{
	const AudioChannelLabel label = TakeLabel(ioInput), other = TakeLabel(ioInput);
	const auto labels = AllAudioChannelLabels();
	const bool isKnown = std::find(labels.begin(), labels.end(), label) != labels.end();
	for (const auto pair : {LeftRightPair, FrontBackPair, TopMiddlePair, TopBottomPair, BottomMiddlePair})
	{
		const AudioChannelLabel partner = pair(label);
		Require(isKnown || partner == kAudioChannelLabel_Discrete, "only labels have partners");
		Require(std::find(labels.begin(), labels.end(), partner) != labels.end(), "partners are labels");
	}
	Require(IsStereoPair(label, other) == IsStereoPair(other, label), "stereo pairs have no order");
}

void CheckConversion(FuzzInput& ioInput)
{
	const AudioChannelLayout source = TakeLayout(ioInput), destination = TakeLayout(ioInput);
	ChannelConversionMatrix matrix{{77}};
	ComputeChannelConversionMatrix(source, destination, matrix);
	Require(matrix.size() == destination.size(), "a row for each destination channel");
	for (const auto& row : matrix)
	{
		Require(row.size() == source.size(), "a gain for each source channel");
		const double sum = std::accumulate(row.begin(), row.end(), 0.0);
		Require(sum == 0 || std::abs(sum - 1) < 1e-12, "a channel is fed once or not at all");
		Require(row.empty() || *std::min_element(row.begin(), row.end()) >= 0, "gains are shares");
	}
	for (std::size_t i = 0; i < destination.size(); ++i)
	{
		const auto found = std::find(source.begin(), source.end(), destination[i]);
		const bool isFed = destination[i] != AudioChannelDescription() && found != source.end();
		if (isFed)
			Require(matrix[i][static_cast<std::size_t>(found - source.begin())] == 1, "equal labels are connected");
	}
}

void CheckOrdering(FuzzInput& ioInput)
{
	const AudioChannelLayout source = TakeLayout(ioInput), destination = TakeLayout(ioInput);
	for (const AudioChannelDescription channel : destination)
		Require(HasChannelLabel(source, channel.mLabel) == (std::count(source.begin(), source.end(), channel) > 0),
			"labels are found");
	ChannelOrdering ordering{77};
	if (RemapChannelOrdering(source, destination, ordering))
	{
		Require(ordering.size() == destination.size(), "an index for each destination channel");
		for (std::size_t i = 0; i < ordering.size(); ++i)
			Require(source.at(ordering[i]) == destination[i], "the same label");
	}
	else
	{
		Require(ordering == ChannelOrdering{77}, "a refusal changes nothing");
	}

	AudioChannelLayout labelled{kAudioChannelLabel_LFE2}, itself = source;
	const bool isChanged = ReplaceDiscreteLabelsWithDestinationLayoutLabels(source, destination, labelled);
	const bool isItselfChanged = ReplaceDiscreteLabelsWithDestinationLayoutLabels(itself, destination, itself);
	Require(isChanged == isItselfChanged && itself == (isChanged ? labelled : source), "the output may be the input");
	Require(isChanged || labelled == AudioChannelLayout{kAudioChannelLabel_LFE2}, "a refusal changes nothing");
	Require(
		ContainsSameChannelsIgnoreOrder(source, destination) == ContainsSameChannelsIgnoreOrder(destination, source),
		"sets have no order");
	Require(RemapChannelOrdering(source, source, ordering), "every layout is an ordering of itself");
}

std::size_t CountLabels(const ChannelMap& inMap)
{
	std::size_t count = 0;
	for (std::size_t i = 0; i < inMap.GetNumberOfChannels(); ++i)
		count += inMap.GetChannelLayout(static_cast<std::int32_t>(i)).size();
	return count;
}

void CheckMove(ChannelMap& ioMap, AudioChannelLabel inLabel, std::int32_t inChannel)
{
	const std::size_t before = CountLabels(ioMap);
	bool isCarried = false;
	for (std::size_t i = 0; i < ioMap.GetNumberOfChannels(); ++i)
		isCarried = isCarried || HasChannelLabel(ioMap.GetChannelLayout(static_cast<std::int32_t>(i)), inLabel);
	ioMap.SetDeviceChannelIndexForChannelLabel(inLabel, inChannel);
	const std::size_t taken = before - (isCarried ? 1 : 0), after = CountLabels(ioMap);
	if (inChannel < 0)
		return Require(after == taken, "a label is taken away once");
	Require(after == taken || after == taken + 1, "a label is put in once");
	Require(HasChannelLabel(ioMap.GetChannelLayout(ioMap.Find(inChannel)), inLabel), "the channel has the label");
}

// Changes one entry of a map, and requires that the others stay.
void CheckChange(ChannelMap& ioMap, std::int32_t inIndex, AudioChannelLabel inLabel, std::int32_t inChannel)
{
	const ChannelMap before = ioMap;
	const auto count = static_cast<std::int32_t>(ioMap.GetNumberOfChannels());
	const bool isInside = inIndex >= 0 && inIndex < count;
	ioMap.SetChannel(inIndex, inChannel);
	ioMap.SetChannelLayout(inIndex, {inLabel});
	Require(ioMap[inIndex] == (isInside ? inChannel : -1), "an entry has the channel it was assigned to");
	Require(ioMap.GetChannelLayout(inIndex) == (isInside ? AudioChannelLayout{inLabel} : AudioChannelLayout()),
		"an entry has the labels it was given");
	ChannelMap restored = ioMap;
	restored.SetChannel(inIndex, before[inIndex]);
	restored.SetChannelLayout(inIndex, before.GetChannelLayout(inIndex));
	Require(restored == before && (isInside || ioMap == before), "the other entries stay");
}

const ChannelMap sCanonicalOrder(36);

void CheckMap(FuzzInput& ioInput)
{
	constexpr std::array<std::int32_t, 8> kCounts{-1, 0, 1, 2, 3, 6, 8, 40};
	ChannelMap map = ioInput.Flag() ? ChannelMap(TakeLayout(ioInput))
									: ChannelMap::CreateDefaultChannelMap(ioInput.OneOf(kCounts));
	for (int steps = 0; steps < 4 && !ioInput.IsEmpty(); ++steps)
	{
		const std::int32_t index = ioInput.Any<std::int8_t>() % 48;
		const auto channel = static_cast<std::int32_t>(ioInput.Below(8)) - 2;
		const AudioChannelLabel label = TakeLabel(ioInput);
		const std::size_t count = map.GetNumberOfChannels();
		switch (ioInput.Below(4))
		{
		case 0:
			CheckChange(map, index, label, channel);
			break;
		case 1:
			map.SetChannelLayout(index, TakeLayout(ioInput));
			Require(map.GetNumberOfChannels() == count, "labels make no entries");
			break;
		case 2:
			map.AddChannel({label}, channel);
			Require(map[static_cast<std::int32_t>(count)] == channel, "an entry is added at the end");
			break;
		case 3:
			CheckMove(map, label, channel);
			break;
		}
		const std::int32_t found = map.Find(channel);
		Require(found == -1 || map[found] == channel, "what is found is there");
		Require(map[static_cast<std::int32_t>(map.GetNumberOfChannels())] == -1, "outside there is nothing");
		const AudioChannelLayout atPlace = sCanonicalOrder.GetChannelLayout(index);
		Require(map.GetSourceChannelIndexForChannelLabelIndex(index)
				== (atPlace.empty() ? -2 : map.GetSourceChannelIndexForChannelLabel(atPlace.front().mLabel)),
			"a place is as good as its label");
	}
	Require(map.GetNumberOfAssignments() <= map.GetNumberOfChannels() * CountLabels(map), "channels have their labels");
	Require(ChannelMap(map) == map, "copies are equal");
}

AudioFormat TakeFormat(FuzzInput& ioInput)
{
	AudioFormat format = AudioFormat::CreateAudioFormat(TakeLayout(ioInput), ioInput.Edge<std::uint32_t>());
	format.SetSampleType(static_cast<AudioSampleType>(ioInput.Any<std::int8_t>()));
	return format;
}

void CheckFormat(FuzzInput& ioInput)
{
	AudioFormat format = TakeFormat(ioInput);
	const AudioFormat other = TakeFormat(ioInput);
	const AudioFormatExactCompare exact;
	const AudioFormatSimpleCompare simple;
	Require(!exact(format, format) && !simple(format, format), "nothing is before itself");
	Require(!(exact(format, other) && exact(other, format)), "the exact order has one direction");
	Require(!(simple(format, other) && simple(other, format)), "the simple order has one direction");
	const AudioFormat third = TakeFormat(ioInput);
	Require(!exact(format, other) || !exact(other, third) || exact(format, third), "the exact order has no circles");
	Require(!simple(format, other) || !simple(other, third) || simple(format, third), "nor has the simple one");
	Require((format == other) == (!exact(format, other) && !exact(other, format)), "only equal formats are equivalent");
	const std::size_t count = format.GetChannelCount();
	Require(count == 0 ? format.GetSampleAlignment() == 0 : format.GetSampleAlignment() % count == 0,
		"every channel takes as many bytes");
	const AudioChannelLayout before = format.GetChannelLayout();
	NormalizeChannelOrder(format);
	const AudioChannelLayout& layout = format.GetChannelLayout();
	Require(ContainsSameChannelsIgnoreOrder(before, layout), "no channel is lost");
	Require(std::is_sorted(layout.begin(), layout.end()), "channels are in order");
}

void CheckDescriptions(FuzzInput& ioInput)
{
	const AudioChannelLayout layout = TakeLayout(ioInput);
	Require(!AudioChannelLayoutDescription(layout).empty(), "every layout has a description");
	const auto names = AudioChannelLayoutDescriptionUnlocalized(layout);
	Require(
		static_cast<std::size_t>(std::count(names.begin(), names.end(), ',')) == layout.size(), "a comma a channel");
	const AudioChannelLayouts streams(ioInput.Below(4), layout);
	Require(!AudioChannelConfigurationDescription(streams).empty(), "every configuration has a description");
	Require(AudioChannelLabelDescription(TakeLabel(ioInput), ioInput.Flag()).size() < 100, "labels are short");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf(
		{CheckPairs, CheckConversion, CheckOrdering, CheckMap, CheckFormat, CheckDescriptions}, inData, inSize);
}
