#pragma once

/// \file
/// The small-block allocator with all its containers: the vector, which texts and tables use everywhere, and the map.

#include "zoncore/SmallBlocks.h"

#include <map>
#include <utility>

namespace zoncore::utility::detail
{

template <class Key, class Value>
struct SmallBlockMap
{
	using Type = std::map<Key, Value, std::less<Key>, SmallBlockAllocator::Allocator<std::pair<const Key, Value>>>;
};

}   // namespace zoncore::utility::detail
