#pragma once

#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace zonmediatypes
{

/// The canonical order of labels, by which channels are labelled that are known by position only. It is not numeric: Lc
/// and Rc come before Cs, and each centre above ear level stands between its left and its right.
inline constexpr auto sOrderedChannelLabels = []
{
	constexpr std::string_view kOrder
		= "L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr Lw Rw Tsl Tsr Rls Rrs LFE2 "
		  "Lt Rt W X Y Z Bfl Bfc Bfr Pl Pr";
	std::array<AudioChannelLabel, CountWords(kOrder)> labels{};
	ReadLabels(kOrder, labels.begin());
	return labels;
}();
static_assert(std::ranges::is_permutation(sOrderedChannelLabels, std::span(kAudioChannelLabels).subspan(1), {}, {},
				  &AudioChannelLabelRow::mLabel),
	"every label but Discrete stands in the order, once");

}   // namespace zonmediatypes
