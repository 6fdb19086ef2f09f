// Layouts of any labels: conversion, ordering, maps, formats and descriptions.

#include "FuzzInput.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
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
	AudioChannelLayout layout(ioInput.Below(12));
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
	ChannelConversionMatrix matrix;
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

void CheckMap(FuzzInput& ioInput)
{
	ChannelMap map = ioInput.Flag() ? ChannelMap(TakeLayout(ioInput))
									: ChannelMap::CreateDefaultChannelMap(ioInput.Any<std::int8_t>());
	while (!ioInput.IsEmpty())
	{
		const std::int32_t index = ioInput.Any<std::int8_t>();
		const auto channel = static_cast<std::int32_t>(ioInput.Below(8)) - 2;
		const AudioChannelLabel label = TakeLabel(ioInput);
		switch (ioInput.Below(4))
		{
		case 0:
			map.SetChannel(index, channel);
			break;
		case 1:
			map.SetChannelLayout(index, {label});
			break;
		case 2:
			map.AddChannel({label}, channel);
			break;
		case 3:
			map.SetDeviceChannelIndexForChannelLabel(label, channel);
			static_cast<void>(map.GetSourceChannelIndexForChannelLabelIndex(index));
			break;
		}
		const std::int32_t found = map.Find(channel);
		Require(found == -1 || map[found] == channel, "what is found is there");
		Require(map[static_cast<std::int32_t>(map.GetNumberOfChannels())] == -1, "outside there is nothing");
		static_cast<void>(map.GetNumberOfAssignments());
		Require(ChannelMap(map) == map, "copies are equal");
	}
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
	Require((format == other) == (!exact(format, other) && !exact(other, format)), "only equal formats are equivalent");
	static_cast<void>(format.GetSampleAlignment());
	NormalizeChannelOrder(format);
	const AudioChannelLayout& layout = format.GetChannelLayout();
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
	FuzzInput input(inData, inSize);
	switch (input.Below(6))
	{
	case 0:
		CheckPairs(input);
		break;
	case 1:
		CheckConversion(input);
		break;
	case 2:
		CheckOrdering(input);
		break;
	case 3:
		CheckMap(input);
		break;
	case 4:
		CheckFormat(input);
		break;
	case 5:
		CheckDescriptions(input);
		break;
	}
	return 0;
}
