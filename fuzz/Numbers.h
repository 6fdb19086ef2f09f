#pragma once

#include "zoncore/UTF16String.h"

#include <cstdint>
#include <vector>

namespace zonfuzz
{

/// The numbers that a text shows.
using Numbers = std::vector<std::int64_t>;

inline Numbers ReadNumbers(const zoncore::UTF16String& inText)
{
	Numbers numbers;
	bool isInside = false;
	for (const zoncore::UTF16Char unit : inText)
	{
		const bool isDigit = unit >= '0' && unit <= '9';
		if (isDigit && !isInside)
			numbers.push_back(0);
		if (isDigit)
			numbers.back() = numbers.back() * 10 + (unit - '0');
		isInside = isDigit;
	}
	return numbers;
}

}   // namespace zonfuzz
