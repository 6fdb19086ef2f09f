#pragma once

/// \file
/// The character of 16-bit text, and the names of the streams over it: what a header needs that only declares an output
/// operator. Text itself is in UTF16String.h, streams that can be used are in UTF16Stream.h.

#include "zoncore/Requirements.h"

#include <iosfwd>
#include <version>

/// libc++ has traits for the characters that the standard names and no others, so neither 16-bit text nor streams over
/// `unsigned char`: the former have traits of our own there, the latter do not exist.
#if defined(_LIBCPP_VERSION)
	#include "zoncore/UTF16CharTraits.h"
	#define ZONCORE_HAS_BYTE_STREAMS 0
#else
	#define ZONCORE_HAS_BYTE_STREAMS 1
#endif

namespace zoncore
{

/// One UTF-16 code unit; any value is legal, lone surrogates and 0 included.
using UTF16Char = unsigned short;

/// How texts compare and copy code units.
#if defined(_LIBCPP_VERSION)
using UTF16CharTraits = OwnUTF16CharTraits;
#else
using UTF16CharTraits = std::char_traits<UTF16Char>;
#endif

/// What 16-bit text is written to.
using UTF16OutputStream = std::basic_ostream<UTF16Char, UTF16CharTraits>;

}   // namespace zoncore
