#pragma once

/// \file
/// 16-bit text: the string of UTF-16 code units that all display text is. Streams over it are declared here; using one takes
/// UTF16Stream.h.

#include "zoncore/Export.h"
#include "zoncore/SmallBlocks.h"
#include "zoncore/UTF16Char.h"

#include <string>
#include <string_view>

namespace zoncore
{

/// Text of UTF-16 code units. Up to seven are held without memory from the allocator.
using UTF16String = std::basic_string<UTF16Char, UTF16CharTraits, utility::SmallBlockAllocator::Allocator<UTF16Char>>;

/// Text that somebody else holds.
using UTF16StringView = std::basic_string_view<UTF16Char, UTF16CharTraits>;

/// A standard string stream with classic facets for 16-bit characters; UTF16Stream.h defines it.
template <class Stream>
class ClassicUTF16Stream;

using oUTF16StringStream
	= ClassicUTF16Stream<std::basic_ostringstream<UTF16Char, UTF16CharTraits, UTF16String::allocator_type>>;
using iUTF16StringStream
	= ClassicUTF16Stream<std::basic_istringstream<UTF16Char, UTF16CharTraits, UTF16String::allocator_type>>;
using UTF16StringStream
	= ClassicUTF16Stream<std::basic_stringstream<UTF16Char, UTF16CharTraits, UTF16String::allocator_type>>;

}   // namespace zoncore
