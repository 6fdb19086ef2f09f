#pragma once

#include "fuzz/Checks.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16String.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <vector>

namespace zonfuzz
{

/// Requires that inWrite, which writes into a caller's buffer, gives inText: into a buffer of that length and into longer
/// ones, of which the rest stays, but not into one that is a character too short. The text is empty where there is none.
template <class Text, class Write>
void RequireInBuffer(const Text& inText, Write&& inWrite)
{
	using Char = typename Text::value_type;
	constexpr Char kUntouched = 1;
	for (const std::size_t length : {inText.size(), inText.size() + 3, std::max<std::size_t>(inText.size(), 1) - 1})
	{
		std::vector<Char> buffer(length, kUntouched);   // on the heap, where nothing goes unnoticed behind its end
		Require(inWrite(std::span<Char>(buffer)) == inText.size(), "the length of the text is returned");
		const bool isWritten = length >= inText.size();
		const auto end = buffer.begin() + static_cast<std::ptrdiff_t>(isWritten ? inText.size() : 0);
		Require(!isWritten || std::equal(buffer.begin(), end, inText.begin()), "the buffer has the text");
		Require(std::all_of(end, buffer.end(), [](Char inChar) { return inChar == kUntouched; }), "the rest stays");
	}
}

/// The same of a function that takes buffers of 16-bit and of 8-bit characters.
template <class Write>
void RequireInBuffers(const zoncore::UTF16String& inText, Write&& inWrite)
{
	RequireInBuffer(inText, inWrite);
	RequireInBuffer(zoncore::utility::UTF16to8(inText), inWrite);
}

}   // namespace zonfuzz
