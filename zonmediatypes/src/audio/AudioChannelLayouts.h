#pragma once

#include "zonmediatypes/AudioChannelLayout.h"

#include <span>

namespace zonmediatypes
{

/// Layouts of the catalogue that have a name of their own in display text.
extern const std::span<const AudioChannelLabel> kStereoLabels;
extern const std::span<const AudioChannelLabel> kBroadcast51Labels;
extern const std::span<const AudioChannelLabel> kSmpteDtvLabels;

}   // namespace zonmediatypes
