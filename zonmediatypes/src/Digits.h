#pragma once

#include "zoncore/UTF16String.h"

namespace zonmediatypes
{

// ASCII digits only: those of other scripts are no part of timecode.
constexpr bool IsDigit(zoncore::UTF16Char inChar) noexcept
{
	return inChar >= '0' && inChar <= '9';
}

}   // namespace zonmediatypes
