#pragma once

/// \file
/// The library's 16-bit text as std::string and std::u16string, and back.
///
///     const std::string shown = ToUTF8(TimeToTimecode(mark, rate, display));
///     const TickTime typed = TimecodeToTime(FromUTF8(line), rate, display);
///
/// Malformed UTF-8 and lone surrogates become U+FFFD on the way from or to UTF-8 (zoncore/StringUtils.h); between the two
/// kinds of 16-bit text code units are copied as they are. Each function costs one pass and its result.

#include "zoncore/StringUtils.h"
#include "zoncore/UTF16String.h"

#include <string>
#include <string_view>

namespace zonmediatypes
{

inline std::string ToUTF8(zoncore::UTF16StringView inText)
{
	return zoncore::utility::UTF16to8(inText);
}

inline zoncore::UTF16String FromUTF8(std::string_view inText)
{
	return zoncore::utility::UTF8to16(inText);
}

inline std::u16string ToU16String(zoncore::UTF16StringView inText)
{
	return {inText.begin(), inText.end()};
}

inline zoncore::UTF16String FromU16String(std::u16string_view inText)
{
	return {inText.begin(), inText.end()};
}

}   // namespace zonmediatypes
