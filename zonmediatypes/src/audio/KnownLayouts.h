#pragma once

#include "zonmediatypes/AudioChannelLabel.h"

#include <cstddef>
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

/// The labels that a number of channels stands for, of a layout of the catalogue; empty where it stands for none.
std::span<const AudioChannelLabel> DefaultLabels(std::size_t inChannelCount, DefaultFor inWhat) noexcept;

}   // namespace zonmediatypes
