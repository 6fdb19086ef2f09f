#pragma once

/// \file
/// Channel layouts as they are written on a command line.

#include "zonmedia/Names.h"
#include "zonmediatypes/AudioChannelLayout.h"

#include <span>
#include <string>
#include <string_view>

namespace zonmedia
{

/// The library's catalogue of layouts.
std::span<const Named<zonmediatypes::AudioChannelLayout>> LayoutNames();

/// Reads the name of a layout ("Broadcast51"), its description as it is shown ("5.1 (L, R, C, LFE, Ls, Rs)" or "5.1" for
/// short), or a list of abbreviations ("L,R,C,LFE,Ls,Rs", "L R"; "*" for a channel
/// without a label). Throws UsageProblem with the closest names.
zonmediatypes::AudioChannelLayout ReadLayout(std::string_view inText);

/// "Ls", "LFE"; "*" for a channel without a label.
std::string Abbreviation(zonmediatypes::AudioChannelLabel inLabel);

}   // namespace zonmedia
