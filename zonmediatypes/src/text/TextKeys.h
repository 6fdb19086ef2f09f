#pragma once

#include "zoncore/Localizer.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <ranges>
#include <span>
#include <string_view>
#include <type_traits>

namespace zonmediatypes
{

/// One row of a table of display texts: a value and the key of its text.
template <class Value>
struct KeyFor
{
	Value mValue;
	std::string_view mKey;
};

/// The localised text of inValue; empty, and no key looked up, for a value without a row.
template <class Value>
zoncore::UTF16String Describe(std::span<const KeyFor<Value>> inTable, std::type_identity_t<Value> inValue)
{
	const auto row = std::ranges::find(inTable, inValue, &KeyFor<Value>::mValue);
	return row == inTable.end() ? zoncore::UTF16String() : zoncore::config::Localizer::Get().Lookup(row->mKey);
}

/// The keys of a table of display texts, in its order.
template <class Value, std::size_t inCount>
consteval std::array<std::string_view, inCount> KeysOf(const std::array<KeyFor<Value>, inCount>& inTable)
{
	std::array<std::string_view, inCount> keys{};
	std::ranges::transform(inTable, keys.begin(), &KeyFor<Value>::mKey);
	return keys;
}

/// Lists of keys, one after the other.
template <std::size_t... inCounts>
consteval std::array<std::string_view, (inCounts + ... + 0)> JoinKeys(
	const std::array<std::string_view, inCounts>&... inKeys)
{
	std::array<std::string_view, (inCounts + ... + 0)> joined{};
	[[maybe_unused]] auto end = joined.begin();
	((end = std::ranges::copy(inKeys, end).out), ...);
	return joined;
}

}   // namespace zonmediatypes
