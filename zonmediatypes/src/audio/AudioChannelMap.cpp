#include "zonmediatypes/AudioChannelMap.h"

#include "zonmediatypes/src/audio/KnownLayouts.h"
#include "zonmediatypes/src/audio/OrderedChannelLabels.h"

#include <algorithm>
#include <cstddef>
#include <numeric>
#include <utility>

namespace zonmediatypes
{
namespace
{

constexpr std::int32_t kUnassigned = -1;
constexpr std::int32_t kNoSuchLabelIndex = -2;
constexpr auto kNoLabel = static_cast<AudioChannelLabel>(-1);

// The layout of the first inCount labels of the canonical order.
AudioChannelLayout OrderedLayout(std::int32_t inCount)
{
	AudioChannelLayout layout(static_cast<std::size_t>(std::max(inCount, 0)), kNoLabel);
	std::copy_n(sOrderedChannelLabels.begin(), std::min(layout.size(), sOrderedChannelLabels.size()), layout.begin());
	return layout;
}

}   // namespace

ChannelMap::ChannelMap(std::int32_t inChannelCount) : ChannelMap(OrderedLayout(inChannelCount))
{
}

ChannelMap::ChannelMap(const AudioChannelLayout& inLayout) : mAssignments(inLayout.size(), kUnassigned)
{
	mLayouts.reserve(inLayout.size());
	for (const AudioChannelDescription channel : inLayout)
		mLayouts.emplace_back(1, channel);
}

ChannelMap& ChannelMap::operator=(const ChannelMap& inOther)
{
	return *this = ChannelMap(inOther);
}

ChannelMap::~ChannelMap() = default;

ChannelMap ChannelMap::CreateDefaultChannelMap(std::int32_t inChannelCount)
{
	const auto labels = DefaultLabels(static_cast<std::size_t>(inChannelCount), DefaultFor::MapsAndFormats);
	ChannelMap map = labels.empty() ? ChannelMap(inChannelCount) : ChannelMap();
	map.mLayouts.reserve(labels.size());
	for (const AudioChannelLabel label : labels)
		map.mLayouts.emplace_back(1, label);
	map.mAssignments.resize(map.mLayouts.size());
	std::iota(map.mAssignments.begin(), map.mAssignments.end(), 0);
	return map;
}

AudioChannelLayout ChannelMap::GetChannelLayout(std::int32_t inIndex) const
{
	return Contains(inIndex) ? mLayouts[static_cast<std::size_t>(inIndex)] : AudioChannelLayout();
}

void ChannelMap::SetChannelLayout(std::int32_t inIndex, const AudioChannelLayout& inLayout)
{
	if (Contains(inIndex))
		mLayouts[static_cast<std::size_t>(inIndex)] = AudioChannelLayout(inLayout);
}

void ChannelMap::SetChannel(std::int32_t inIndex, std::int32_t inAssignment) noexcept
{
	if (Contains(inIndex))
		mAssignments[static_cast<std::size_t>(inIndex)] = inAssignment;
}

std::int32_t ChannelMap::operator[](std::int32_t inIndex) const noexcept
{
	return Contains(inIndex) ? mAssignments[static_cast<std::size_t>(inIndex)] : kUnassigned;
}

std::size_t ChannelMap::GetNumberOfChannels() const noexcept
{
	return mAssignments.size();
}

std::uint32_t ChannelMap::GetNumberOfAssignments() const noexcept
{
	std::uint32_t labels = 0;
	for (const std::int32_t channel : mAssignments)
	{
		if (Contains(channel))
			labels += static_cast<std::uint32_t>(mLayouts[static_cast<std::size_t>(channel)].size());
	}
	return labels;
}

std::int32_t ChannelMap::GetSourceChannelIndexForChannelLabel(AudioChannelLabel inLabel) const noexcept
{
	const auto carrier = std::ranges::find_if(
		mLayouts, [&](const AudioChannelLayout& inLayout) { return HasChannelLabel(inLayout, inLabel); });
	return carrier != mLayouts.end() ? mAssignments[static_cast<std::size_t>(carrier - mLayouts.begin())] : kUnassigned;
}

std::int32_t ChannelMap::GetSourceChannelIndexForChannelLabelIndex(std::int32_t inLabelIndex) const noexcept
{
	const auto index = static_cast<std::size_t>(inLabelIndex);   // a negative one lies beyond every table
	return index < sOrderedChannelLabels.size() ? GetSourceChannelIndexForChannelLabel(sOrderedChannelLabels[index])
												: kNoSuchLabelIndex;
}

void ChannelMap::SetDeviceChannelIndexForChannelLabel(AudioChannelLabel inLabel, std::int32_t inChannel)
{
	ChannelMap map = *this;
	map.RemoveLabel(inLabel);
	if (inChannel >= 0)
		map.PlaceLabel(inLabel, inChannel);
	*this = std::move(map);
}

// Takes inLabel from the first entry that carries it.
void ChannelMap::RemoveLabel(AudioChannelLabel inLabel) noexcept
{
	const auto carrier = std::ranges::find_if(
		mLayouts, [&](const AudioChannelLayout& inLayout) { return HasChannelLabel(inLayout, inLabel); });
	if (carrier == mLayouts.end())
		return;
	carrier->erase(std::ranges::find(*carrier, AudioChannelDescription(inLabel)));
	if (!carrier->empty())
		return;
	// Two erasures on their own: an entry that was empty before goes first, and so does an earlier equal assignment.
	const std::int32_t channel = mAssignments[static_cast<std::size_t>(carrier - mLayouts.begin())];
	mLayouts.erase(std::ranges::find_if(mLayouts, &AudioChannelLayout::empty));
	mAssignments.erase(std::ranges::find(mAssignments, channel));
}

// Puts inLabel last in the first entry that is assigned to inChannel, or in a new one.
void ChannelMap::PlaceLabel(AudioChannelLabel inLabel, std::int32_t inChannel)
{
	const std::int32_t index = Find(inChannel);
	if (index < 0)
		return AddChannel({inLabel}, inChannel);
	AudioChannelLayout& labels = mLayouts[static_cast<std::size_t>(index)];
	if (!HasChannelLabel(labels, inLabel))
		labels.push_back(inLabel);
}

std::int32_t ChannelMap::Find(std::int32_t inAssignment) const noexcept
{
	const auto found = std::ranges::find(mAssignments, inAssignment);
	return found != mAssignments.end() ? static_cast<std::int32_t>(found - mAssignments.begin()) : -1;
}

void ChannelMap::AddChannel(const AudioChannelLayout& inLayout, std::int32_t inAssignment)
{
	AudioChannelLayout layout = inLayout;
	mAssignments.push_back(inAssignment);
	try
	{
		mLayouts.push_back(std::move(layout));
	}
	catch (...)
	{
		mAssignments.pop_back();
		throw;
	}
}

bool ChannelMap::operator==(const ChannelMap& inOther) const noexcept
{
	return mAssignments == inOther.mAssignments && mLayouts == inOther.mLayouts;
}

bool ChannelMap::Contains(std::int32_t inIndex) const noexcept
{
	return inIndex >= 0 && static_cast<std::size_t>(inIndex) < mAssignments.size();
}

}   // namespace zonmediatypes
