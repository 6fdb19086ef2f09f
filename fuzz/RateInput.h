#pragma once

#include "fuzz/FuzzInput.h"
#include "zonmediatypes/FrameRate.h"

#include <cstdint>

namespace zonfuzz
{

/// A named rate or any number of ticks.
inline zonmediatypes::FrameRate TakeRate(FuzzInput& ioInput)
{
	using namespace zonmediatypes;
	return ioInput.Flag() ? FrameRate(ioInput.Edge<std::int64_t>()) : ioInput.OneOf(AllFrameRates());
}

}   // namespace zonfuzz
