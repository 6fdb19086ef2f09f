#pragma once

#include <string_view>

namespace zoncore::config
{

/// A key up to its first "="; all of it when it has none.
constexpr std::string_view KeyPath(std::string_view inKey)
{
	return inKey.substr(0, inKey.find('='));
}

/// The text that a key carries after its first "="; empty when it has none.
constexpr std::string_view EnglishText(std::string_view inKey)
{
	const auto mark = inKey.find('=');
	return mark == std::string_view::npos ? std::string_view() : inKey.substr(mark + 1);
}

}   // namespace zoncore::config
