#include "zonmediatypes/AudioChannelConversion.h"

#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

using MatrixRow = ChannelConversionMatrix::value_type;

// ---- Distances between speakers --------------------------------------------------------------------------------------

// Places in the table of distances: one for each number from the first speaker to the last, one that all other numbers
// share, and one for Discrete.
constexpr std::size_t kPlaceOfOthers = kLabelRows.size();
constexpr std::size_t kPlaceOfDiscrete = kPlaceOfOthers + 1;
constexpr std::size_t kPlaces = kPlaceOfDiscrete + 1;

constexpr std::size_t PlaceOf(AudioChannelLabel inLabel)
{
	return inLabel == kAudioChannelLabel_Discrete ? kPlaceOfDiscrete : std::min(LabelIndex(inLabel), kPlaceOfOthers);
}

// The squared distance to a channel that has no speaker.
constexpr std::uint8_t kNoSpeaker = 0xFF;

constexpr bool HasSpeaker(AudioChannelLabel inLabel)
{
	return inLabel != kAudioChannelLabel_Discrete && inLabel != kAudioChannelLabel_LowFrequency
		&& inLabel != kAudioChannelLabel_LFE2;
}

// The origin for a number that names no label. No pointer to a row: g++ with sanitizers does not compare one in a constant.
constexpr SpeakerPosition PositionOf(AudioChannelLabel inLabel)
{
	return kAudioChannelLabels[FindLabelIndex(inLabel)].mPosition;
}

constexpr std::uint8_t SquaredDistance(AudioChannelLabel inFirst, AudioChannelLabel inSecond)
{
	if (!HasSpeaker(inFirst) || !HasSpeaker(inSecond))
		return kNoSpeaker;
	const auto [x1, y1, z1] = PositionOf(inFirst);
	const auto [x2, y2, z2] = PositionOf(inSecond);
	return static_cast<std::uint8_t>((x1 - x2) * (x1 - x2) + (y1 - y2) * (y1 - y2) + (z1 - z2) * (z1 - z2));
}

// Distances count as equal when they differ by less than 100 times the epsilon of a double, 2.2e-14. The squares are
// integers up to 3 * 4^2 = 48, and the roots of different ones differ by at least sqrt(48) - sqrt(47), about 0.07: the
// squares are equal exactly when the distances are, and no root is needed.
constexpr auto sSquaredDistances = []
{
	// The number whose place is inPlace; any number without a name stands for the place that those share.
	const auto labelAt = [](std::size_t inPlace)
	{
		constexpr auto kFirst = static_cast<std::size_t>(kAudioChannelLabel_FrontLeft);
		return inPlace == kPlaceOfDiscrete ? kAudioChannelLabel_Discrete
										   : static_cast<AudioChannelLabel>(kFirst + inPlace);
	};
	std::array<std::array<std::uint8_t, kPlaces>, kPlaces> distances{};
	for (std::size_t first = 0; first < kPlaces; ++first)
	{
		for (std::size_t second = 0; second < kPlaces; ++second)
			distances[first][second] = SquaredDistance(labelAt(first), labelAt(second));
	}
	return distances;
}();

// ---- Routing ---------------------------------------------------------------------------------------------------------

// Hands out the indices of a layout's Discrete channels in order: the k-th call matches the k-th numbered channel of the
// other side.
class NumberedChannels
{
public:
	explicit NumberedChannels(const AudioChannelLayout& inLayout) : mLayout(inLayout), mNext(inLayout.begin()) {}

	// The channel count when there are no more.
	std::size_t Next()
	{
		const auto found = std::find(mNext, mLayout.end(), AudioChannelDescription());
		mNext = found == mLayout.end() ? found : found + 1;
		return static_cast<std::size_t>(found - mLayout.begin());
	}

private:
	const AudioChannelLayout& mLayout;
	AudioChannelLayout::const_iterator mNext;
};

// The first channel with inLabel; the channel count when there is none.
std::size_t FindChannel(const AudioChannelLayout& inLayout, AudioChannelDescription inLabel)
{
	return static_cast<std::size_t>(std::ranges::find(inLayout, inLabel) - inLayout.begin());
}

// Finds the first channel with a label again and again. Few channels are searched from the start; many are sorted once, so
// that no search takes longer than a few steps.
class FirstChannels
{
public:
	explicit FirstChannels(const AudioChannelLayout& inLayout) : mLayout(inLayout)
	{
		constexpr std::size_t kFew = 32;
		if (inLayout.size() <= kFew)
			return;
		mSorted.reserve(inLayout.size());
		for (std::size_t i = 0; i < inLayout.size(); ++i)
			mSorted.emplace_back(inLayout[i], i);
		std::ranges::sort(mSorted);
	}

	// The channel count when there is none.
	std::size_t Find(AudioChannelDescription inLabel) const
	{
		if (mSorted.empty())
			return FindChannel(mLayout, inLabel);
		const auto found = std::ranges::lower_bound(mSorted, inLabel, {}, &LabelledChannel::first);
		return found != mSorted.end() && found->first == inLabel ? found->second : mLayout.size();
	}

private:
	using LabelledChannel = std::pair<AudioChannelDescription, std::size_t>;

	const AudioChannelLayout& mLayout;
	std::vector<LabelledChannel> mSorted;
};

ChannelConversionMatrix SilentMatrix(std::size_t inSourceCount, std::size_t inDestinationCount)
{
	ChannelConversionMatrix matrix;
	matrix.reserve(inDestinationCount);
	for (std::size_t i = 0; i < inDestinationCount; ++i)
		matrix.emplace_back(inSourceCount);
	return matrix;
}

void RouteEqually(MatrixRow& outRow)
{
	if (!outRow.empty())
		std::ranges::fill(outRow, 1.0 / static_cast<double>(outRow.size()));
}

// Equal shares of all source channels whose speakers are nearest to inLabel; silence when none has a speaker.
void RouteNearest(const AudioChannelLayout& inSource, AudioChannelLabel inLabel, MatrixRow& outRow)
{
	const auto& distances = sSquaredDistances[PlaceOf(inLabel)];
	std::uint8_t nearest = kNoSpeaker;
	std::size_t count = 0;
	for (const auto [label] : inSource)
	{
		const std::uint8_t distance = distances[PlaceOf(label)];
		count = distance < nearest ? 1 : count + (distance == nearest ? 1 : 0);
		nearest = std::min(nearest, distance);
	}
	if (nearest == kNoSpeaker)
		return;
	const double share = 1.0 / static_cast<double>(count);
	std::ranges::transform(inSource, outRow.begin(),
		[&](AudioChannelDescription inChannel)
		{ return distances[PlaceOf(inChannel.mLabel)] == nearest ? share : 0.0; });
}

// The row of a destination channel that has a label.
void RouteLabel(const AudioChannelLayout& inSource, AudioChannelLabel inLabel, MatrixRow& outRow)
{
	if (const std::size_t same = FindChannel(inSource, inLabel); same < inSource.size())
		outRow[same] = 1.0;
	else
		RouteNearest(inSource, inLabel, outRow);
}

bool HasLabelsToGoBy(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination)
{
	return inSource.size() == 1 || inDestination.size() == 1
		|| (HasChannelLabeling(inSource) && HasChannelLabeling(inDestination));
}

}   // namespace

void CreateIdentityChannelConversionMatrix(
	std::size_t inSourceChannelCount, std::size_t inDestinationChannelCount, ChannelConversionMatrix& outMatrix)
{
	ChannelConversionMatrix matrix = SilentMatrix(inSourceChannelCount, inDestinationChannelCount);
	for (std::size_t i = 0; i < std::min(inSourceChannelCount, inDestinationChannelCount); ++i)
		matrix[i][i] = 1.0;
	outMatrix.swap(matrix);
}

void ComputeChannelConversionMatrix(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelConversionMatrix& outMatrix)
{
	if (!HasLabelsToGoBy(inSource, inDestination))
		return CreateIdentityChannelConversionMatrix(inSource.size(), inDestination.size(), outMatrix);

	ChannelConversionMatrix matrix = SilentMatrix(inSource.size(), inDestination.size());
	const bool isUnlabelledMono = inSource.size() == 1 && !HasChannelLabeling(inSource);
	NumberedChannels numbered(inSource);
	for (std::size_t i = 0; i < inDestination.size(); ++i)
	{
		const AudioChannelLabel label = inDestination[i].mLabel;
		if (isUnlabelledMono)
			RouteEqually(matrix[i]);
		else if (label != kAudioChannelLabel_Discrete)
			RouteLabel(inSource, label, matrix[i]);
		else if (const std::size_t channel = numbered.Next(); channel < inSource.size())
			matrix[i][channel] = 1.0;
		else if (inDestination.size() == 1)
			RouteEqually(matrix[i]);
	}
	outMatrix.swap(matrix);
}

bool RemapChannelOrdering(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelOrdering& outOrdering)
{
	if (!inDestination.empty() && inSource.size() != inDestination.size())
		return false;

	ChannelOrdering ordering;
	ordering.reserve(inDestination.size());
	const FirstChannels labelled(inSource);
	NumberedChannels numbered(inSource);
	for (const AudioChannelDescription channel : inDestination)
	{
		const std::size_t found = channel == kAudioChannelLabel_Discrete ? numbered.Next() : labelled.Find(channel);
		if (found == inSource.size())
			return false;
		ordering.push_back(found);
	}
	outOrdering.swap(ordering);
	return true;
}

bool ReplaceDiscreteLabelsWithDestinationLayoutLabels(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, AudioChannelLayout& outLayout)
{
	AudioChannelLayout layout = inSource;
	bool hasChanged = false;
	auto unlabelled = std::ranges::find(layout, AudioChannelDescription());
	const FirstChannels carried(inSource);
	const FirstChannels offered(inDestination);
	for (std::size_t i = 0; i < inDestination.size() && unlabelled != layout.end(); ++i)
	{
		// Every label that was offered before is carried by now, and so is Discrete: an unlabelled channel is left.
		if (carried.Find(inDestination[i]) < inSource.size() || offered.Find(inDestination[i]) < i)
			continue;
		*unlabelled = inDestination[i];
		hasChanged = true;
		unlabelled = std::find(unlabelled + 1, layout.end(), AudioChannelDescription());
	}
	if (hasChanged)
		outLayout.swap(layout);
	return hasChanged;
}

}   // namespace zonmediatypes
