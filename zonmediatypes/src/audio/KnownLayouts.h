#pragma once

#include "zonmediatypes/AudioChannelLabel.h"

#include <cstddef>
#include <optional>
#include <span>

namespace zonmediatypes
{

/// Layouts of the catalogue that have a name of their own in display text.
extern const std::span<const AudioChannelLabel> kStereoLabels;
extern const std::span<const AudioChannelLabel> kBroadcast51Labels;
extern const std::span<const AudioChannelLabel> kSmpteDtvLabels;

/// What is made of a mere number of channels.
enum class DefaultFor
{
	Layouts,
	MapsAndFormats
};

/// The layout of the catalogue that a number of channels stands for; empty where it stands for none.
std::optional<AudioChannelLayout> DefaultLayoutOf(std::size_t inChannelCount, DefaultFor inWhat);

}   // namespace zonmediatypes
