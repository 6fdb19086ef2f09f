// Layouts of any labels: conversion, ordering, maps, formats and descriptions.

#include "fuzz/Checks.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <span>

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
	const AudioChannelLabel mirrored = LeftRightPair(label);
	const bool hasMirror = mirrored != kAudioChannelLabel_Discrete;
	Require(!hasMirror || (mirrored != label && LeftRightPair(mirrored) == label), "left and right are mutual");
	Require(IsStereoPair(label, mirrored) == hasMirror, "left and right are a stereo pair");
	Require(IsStereoPair(label, other) == IsStereoPair(other, label), "stereo pairs have no order");
}

// The source channel for a destination channel: the first of its label, the k-th Discrete for the k-th Discrete; the
// channel count when there is none.
std::size_t FindSource(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, std::size_t inIndex)
{
	const AudioChannelDescription label = inDestination[inIndex];
	const auto before = std::span(inDestination).first(label == AudioChannelDescription() ? inIndex : 0);
	auto rest = std::count(before.begin(), before.end(), label);
	for (std::size_t i = 0; i < inSource.size(); ++i)
	{
		if (inSource[i] == label && rest-- == 0)
			return i;
	}
	return inSource.size();
}

bool HasSpeaker(AudioChannelDescription inChannel)
{
	return inChannel != kAudioChannelLabel_Discrete && inChannel != kAudioChannelLabel_LowFrequency
		&& inChannel != kAudioChannelLabel_LFE2;
}

bool IsUnlabelled(const AudioChannelLayout& inLayout)
{
	return std::ranges::count(inLayout, AudioChannelDescription()) == std::ssize(inLayout);
}

void CheckConversion(FuzzInput& ioInput)
{
	const AudioChannelLayout source = TakeLayout(ioInput), destination = TakeLayout(ioInput);
	ChannelConversionMatrix matrix{{77}}, identity{{77}};
	ComputeChannelConversionMatrix(source, destination, matrix);
	CreateIdentityChannelConversionMatrix(source.size(), destination.size(), identity);
	Require(matrix.size() == destination.size() && identity.size() == destination.size(), "destinations have rows");
	const bool isLabelled
		= source.size() == 1 || destination.size() == 1 || (!IsUnlabelled(source) && !IsUnlabelled(destination));
	Require(isLabelled || matrix == identity, "without labels channels keep their numbers");
	const bool hasSpeaker = std::ranges::any_of(source, HasSpeaker);
	for (std::size_t i = 0; i < destination.size(); ++i)
	{
		const auto& row = matrix[i];
		Require(row.size() == source.size() && identity[i].size() == source.size(), "a gain for each source channel");
		for (std::size_t k = 0; k < source.size(); ++k)
			Require(identity[i][k] == (i == k ? 1 : 0), "the identity connects equal numbers");
		if (!isLabelled)
			continue;
		const auto fed = std::ssize(row) - std::ranges::count(row, 0.0);
		const double share = fed == 0 ? 0 : 1.0 / static_cast<double>(fed);
		Require(std::ranges::count(row, share) >= fed, "a channel is fed in equal shares");
		const bool isNumbered = destination[i] == AudioChannelDescription();
		const std::size_t found = FindSource(source, destination, i);
		if (source.size() == 1 && IsUnlabelled(source))
			Require(row[0] == 1, "one channel without a label feeds all");
		else if (found < source.size())
			Require(row[found] == 1, "equal labels and numbers are connected");
		else if (isNumbered)
			Require(
				fed == (destination.size() == 1 ? std::ssize(source) : 0), "numbers are mixed into one channel only");
		else
			Require((fed > 0) == (hasSpeaker && HasSpeaker(destination[i])), "speakers are fed by speakers");
	}
}

void CheckOrdering(FuzzInput& ioInput)
{
	const AudioChannelLayout source = TakeLayout(ioInput), destination = TakeLayout(ioInput);
	for (const AudioChannelDescription channel : destination)
		Require(HasChannelLabel(source, channel.mLabel) == (std::count(source.begin(), source.end(), channel) > 0),
			"labels are found");
	ChannelOrdering expected, ordering{77};
	for (std::size_t i = 0; i < destination.size(); ++i)
		expected.push_back(FindSource(source, destination, i));
	const bool isPossible = destination.empty()
		|| (source.size() == destination.size() && std::ranges::count(expected, source.size()) == 0);
	Require(RemapChannelOrdering(source, destination, ordering) == isPossible, "what has its labels is an ordering");
	Require(ordering == (isPossible ? expected : ChannelOrdering{77}), "labels have their places, or all is left");

	AudioChannelLayout labelled{kAudioChannelLabel_LFE2}, itself = source;
	const bool isChanged = ReplaceDiscreteLabelsWithDestinationLayoutLabels(source, destination, labelled);
	const bool isItselfChanged = ReplaceDiscreteLabelsWithDestinationLayoutLabels(itself, destination, itself);
	Require(isChanged == isItselfChanged && itself == (isChanged ? labelled : source), "the output may be the input");
	AudioChannelLayout rest;   // the labels that are given, each once and in order
	for (const AudioChannelDescription channel : destination)
	{
		if (channel != AudioChannelDescription() && !HasChannelLabel(source, channel.mLabel)
			&& !HasChannelLabel(rest, channel.mLabel))
			rest.push_back(channel);
	}
	AudioChannelLayout stepwise = source;
	for (std::size_t i = 0, given = 0; i < source.size() && given < rest.size(); ++i)
		stepwise[i] = source[i] == AudioChannelDescription() ? rest[given++] : source[i];
	Require(isChanged == (stepwise != source), "a layout changes where a channel has no label and a label is left");
	Require(labelled == (isChanged ? stepwise : AudioChannelLayout{kAudioChannelLabel_LFE2}),
		"channels receive the missing labels in order");
	Require(ContainsSameChannelsIgnoreOrder(source, destination) == std::ranges::is_permutation(source, destination),
		"sets have no order");
	AudioChannelLayout turned = source;
	std::ranges::reverse(turned);
	Require(ContainsSameChannelsIgnoreOrder(source, turned) && RemapChannelOrdering(source, turned, ordering),
		"a layout has the same channels the other way round");
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

// What the map says of labels and channels, entry by entry.
void CheckRouting(const ChannelMap& inMap, AudioChannelLabel inLabel)
{
	const auto count = static_cast<std::int32_t>(inMap.GetNumberOfChannels());
	std::size_t assignments = 0;
	std::int32_t source = -1;
	for (std::int32_t i = count - 1; i >= 0; --i)
	{
		if (inMap[i] >= 0 && inMap[i] < count)
			assignments += inMap.GetChannelLayout(inMap[i]).size();
		if (HasChannelLabel(inMap.GetChannelLayout(i), inLabel))
			source = inMap[i];
	}
	Require(inMap.GetNumberOfAssignments() == assignments, "assignments are the labels of the channels assigned to");
	Require(inMap.GetSourceChannelIndexForChannelLabel(inLabel) == source, "the first entry with a label counts");
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
		CheckRouting(map, label);
	}
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
	const AudioChannelDescription channel = TakeLabel(ioInput);
	for (const AudioChannelDescription label : {channel, before.empty() ? channel : before.back()})
		Require(format.GetChannelIndex(label)
				== static_cast<std::size_t>(std::ranges::find(before, label) - before.begin()),
			"the first channel of a label is found");
	for (std::size_t i = 0; i <= count; ++i)
		Require(format.GetChannelDescription(i) == (i < count ? before[i] : AudioChannelDescription()),
			"channels have their labels");
	NormalizeChannelOrder(format);
	const AudioChannelLayout& layout = format.GetChannelLayout();
	Require(std::ranges::is_permutation(before, layout), "no channel is lost");
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
