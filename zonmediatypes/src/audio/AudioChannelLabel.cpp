#include "zonmediatypes/AudioChannelLabel.h"

#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <numeric>
#include <string_view>

namespace zonmediatypes
{
namespace
{

constexpr auto sAudioChannelLabels = []
{
	std::array<AudioChannelLabel, kAudioChannelLabels.size()> labels;
	std::ranges::transform(kAudioChannelLabels, labels.begin(), &AudioChannelLabelRow::mLabel);
	return labels;
}();

}   // namespace

std::span<const AudioChannelLabel> AllAudioChannelLabels() noexcept
{
	return sAudioChannelLabels;
}

// ---- Pairs of labels -------------------------------------------------------------------------------------------------

namespace
{

// The partner of every label from the first speaker to the last; Discrete for none.
using PairTable = std::array<AudioChannelLabel, kLabelRows.size()>;

// Of "L=Ls" both are partners; of "Vhr>R" R is the partner of Vhr only.
consteval PairTable MakePairTable(std::string_view inPairs)
{
	PairTable table{};
	ForEachWord(inPairs,
		[&](std::string_view inPair)
		{
			const std::size_t sign = inPair.find_first_of("=>");
			const AudioChannelLabel label = LabelByAbbreviation(inPair.substr(0, sign));
			const AudioChannelLabel partner = LabelByAbbreviation(inPair.substr(sign + 1));
			table.at(LabelIndex(label)) = partner;
			if (inPair[sign] == '=')
				table.at(LabelIndex(partner)) = label;
		});
	return table;
}

constexpr AudioChannelLabel Partner(const PairTable& inTable, AudioChannelLabel inLabel)
{
	const std::size_t index = LabelIndex(inLabel);
	return index < inTable.size() ? inTable[index] : kAudioChannelLabel_Discrete;
}

constexpr PairTable sLeftRightPairs
	= MakePairTable("L=R LFE=LFE2 Ls=Rs Lc=Rc Lsd=Rsd Vhl=Vhr Tbl=Tbr Lw=Rw Tsl=Tsr Rls=Rrs Lt=Rt Bfl=Bfr Pl=Pr");
constexpr PairTable sFrontBackPairs = MakePairTable("L=Ls R=Rs C=Cs Lc=Rls Rc=Rrs Vhl=Tbl Vhr=Tbr Vhc=Tbc");
// Deliberate: R partners itself, and Vhr finds R.
constexpr PairTable sTopMiddlePairs = MakePairTable("L=Vhl C=Vhc Ls=Tbl Rs=Tbr Cs=Tbc R>R Vhr>R");
// Deliberate: Bfr finds R, not Vhr.
constexpr PairTable sTopBottomPairs = MakePairTable("Vhl=Bfl Vhc=Bfc Vhr>Bfr Bfr>R");
constexpr PairTable sBottomMiddlePairs = MakePairTable("Bfl=L Bfc=C Bfr=R");

}   // namespace

AudioChannelLabel LeftRightPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sLeftRightPairs, inLabel);
}

AudioChannelLabel FrontBackPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sFrontBackPairs, inLabel);
}

AudioChannelLabel TopMiddlePair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sTopMiddlePairs, inLabel);
}

AudioChannelLabel TopBottomPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sTopBottomPairs, inLabel);
}

AudioChannelLabel BottomMiddlePair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sBottomMiddlePairs, inLabel);
}

bool IsStereoPair(AudioChannelLabel inFirst, AudioChannelLabel inSecond) noexcept
{
	return inFirst != kAudioChannelLabel_Discrete && inSecond != kAudioChannelLabel_Discrete
		&& LeftRightPair(inFirst) == inSecond;
}

// ---- Queries ---------------------------------------------------------------------------------------------------------

bool HasChannelLabeling(const AudioChannelLayout& inLayout) noexcept
{
	return std::ranges::any_of(
		inLayout, [](AudioChannelDescription inChannel) { return inChannel != kAudioChannelLabel_Discrete; });
}

bool HasChannelLabel(const AudioChannelLayout& inLayout, AudioChannelLabel inLabel) noexcept
{
	return std::ranges::find(inLayout, inLabel, &AudioChannelDescription::mLabel) != inLayout.end();
}

bool HasLFEChannel(const AudioChannelLayout& inLayout) noexcept
{
	return HasChannelLabel(inLayout, kAudioChannelLabel_LowFrequency);
}

bool ContainsSameChannelsIgnoreOrder(const AudioChannelLayout& inFirst, const AudioChannelLayout& inSecond)
{
	if (inFirst.size() != inSecond.size())
		return false;
	AudioChannelLayout first = inFirst;
	AudioChannelLayout second = inSecond;
	std::ranges::sort(first);
	std::ranges::sort(second);
	return first == second;
}

std::size_t GetChannelCount(const AudioChannelLayouts& inLayouts) noexcept
{
	return std::accumulate(inLayouts.begin(), inLayouts.end(), 0ul,
		[](std::size_t inSum, const AudioChannelLayout& inLayout) { return inSum + inLayout.size(); });
}

}   // namespace zonmediatypes
