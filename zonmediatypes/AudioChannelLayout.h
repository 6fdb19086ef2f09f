#pragma once

/// \file
/// All of audio channels: labels and layouts, the catalogue of layouts, and conversion between layouts.

#include "zonmediatypes/AudioChannelConversion.h"
#include "zonmediatypes/AudioChannelLabel.h"
#include "zonmediatypes/AudioChannelLayoutCatalogue.h"
