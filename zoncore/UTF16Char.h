#pragma once

/// \file
/// The character of 16-bit text, and the names of the streams over it: what a header needs that only declares an output
/// operator. Text itself is in UTF16String.h, streams that can be used are in UTF16Stream.h.

#include <iosfwd>

namespace zoncore
{

/// One UTF-16 code unit; any value is legal, lone surrogates and 0 included.
using UTF16Char = unsigned short;

/// How texts compare and copy code units.
using UTF16CharTraits = std::char_traits<UTF16Char>;

/// What 16-bit text is written to.
using UTF16OutputStream = std::basic_ostream<UTF16Char, UTF16CharTraits>;

}   // namespace zoncore
