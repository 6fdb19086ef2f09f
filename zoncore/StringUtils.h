#pragma once

/// \file
/// Conversions between 8-bit and 16-bit text, and replacement in 16-bit text.
///
/// Nothing here throws but what memory running out throws. Malformed input gives U+FFFD for each maximal ill-formed
/// piece, as the Unicode Standard recommends (a maximal subpart: FF FF gives two, E2 82 one).

#include "zoncore/Export.h"
#include "zoncore/UTF16String.h"

#include <string>
#include <string_view>

namespace zoncore::utility
{

/// ASCII text as UTF-16; each byte above 7F gives U+FFFD.
ZONCORE_API UTF16String AsciiToUTF16(std::string_view inText);

/// UTF-8 text as UTF-16.
ZONCORE_API UTF16String UTF8to16(std::string_view inText);

/// UTF-16 text as UTF-8; each lone surrogate gives U+FFFD.
ZONCORE_API std::string UTF16to8(UTF16StringView inText);
inline std::string UTF16to8(const UTF16String& inText)
{
	return UTF16to8(UTF16StringView(inText));
}

/// Replaces every occurrence of inWhat in ioText by inWith, from the first to the last; what was put in is never searched
/// again. An empty inWhat changes nothing. The arguments may be the same object. When memory runs out ioText is as before.
ZONCORE_API void ReplaceInString(UTF16String& ioText, const UTF16String& inWhat, const UTF16String& inWith);

/// The value as a fresh 16-bit stream writes it.
template <class T>
UTF16String Coercion(const T& inValue)
{
	oUTF16StringStream stream;
	stream << inValue;
	return stream.str();
}

}   // namespace zoncore::utility
