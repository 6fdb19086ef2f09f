#pragma once

/// \file
/// Conversions between 8-bit and 16-bit text, and replacement in 16-bit text.
///
///     UTF16String title = UTF8to16("Take @0");
///     ReplaceInString(title, AsciiToUTF16("@0"), Coercion(12));
///     UTF16to8(title);   // "Take 12"
///
/// Any input is legal: malformed text gives U+FFFD for each maximal ill-formed piece, as the Unicode Standard recommends
/// (FF FF gives two, E2 82 one, two lone surrogates two). Nothing here throws but what memory running out throws, and
/// nothing depends on a locale. A conversion between encodings is linear in the text, with one allocation where the result
/// does not fit into the string object itself. Safe on any thread.

#include "zoncore/Export.h"
#include "zoncore/UTF16String.h"

#include <string>
#include <string_view>

namespace zoncore::utility
{

/// ASCII text as UTF-16; each byte above 7F gives U+FFFD. Zero bytes are characters like others.
ZONCORE_API UTF16String AsciiToUTF16(std::string_view inText);

/// UTF-8 text as UTF-16. Overlong forms, surrogates and code points above 10FFFF are ill-formed. A byte order mark is kept.
ZONCORE_API UTF16String UTF8to16(std::string_view inText);

/// UTF-16 text as UTF-8; each lone surrogate gives U+FFFD.
ZONCORE_API std::string UTF16to8(UTF16StringView inText);
inline std::string UTF16to8(const UTF16String& inText)
{
	return UTF16to8(UTF16StringView(inText));
}
inline std::string UTF16to8(const UTF16Char* inText)
{
	return UTF16to8(UTF16StringView(inText));
}

/// Replaces every occurrence of inWhat in ioText by inWith, from the first to the last; what was put in is never searched
/// again, so "aaa" with "aa" for "a" is "aaaaaa". An empty inWhat changes nothing. The arguments may be the same object.
/// When memory runs out ioText is as before.
ZONCORE_API void ReplaceInString(UTF16String& ioText, const UTF16String& inWhat, const UTF16String& inWith);

/// The value as a fresh 16-bit stream writes it: numbers as with std::ostream and the classic locale (doubles with six
/// significant digits), a UTF16Char as its number. Costs a stream; where speed matters, write digits directly. Using it takes
/// UTF16Stream.h.
template <class T, class Stream = oUTF16StringStream>
UTF16String Coercion(const T& inValue)
{
	Stream stream;
	stream.exceptions(Stream::badbit);   // memory that runs out is reported, not a text cut short
	stream << inValue;
	return stream.str();
}

}   // namespace zoncore::utility
