#pragma once

#include "zoncore/UTF16String.h"
#include "zonmediatypes/FrameRate.h"

namespace zonmediatypes
{

/// The number of a rate as its stream operators write it.
zoncore::UTF16String RateText(FrameRate inRate);

}   // namespace zonmediatypes
