#pragma once

#include <string_view>

namespace zoncore::config
{

/// The text that a key carries behind its first "="; empty when it has none.
constexpr std::string_view EnglishText(std::string_view inKey)
{
	const auto mark = inKey.find('=');
	return mark == std::string_view::npos ? std::string_view() : inKey.substr(mark + 1);
}

}   // namespace zoncore::config
