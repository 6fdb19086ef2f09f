#pragma once

/// \file
/// The traits of 16-bit characters for standard libraries that have none; UTF16Char.h chooses.

#include "zoncore/Requirements.h"

#include <algorithm>
#include <compare>
#include <cstddef>
#include <cwchar>
#include <iosfwd>

namespace zoncore
{

/// What std::char_traits demands, as it is for the standard's own 16-bit characters.
struct OwnUTF16CharTraits
{
	using char_type = unsigned short;
	using int_type = unsigned int;
	using off_type = std::streamoff;
	using pos_type = std::streampos;
	using state_type = std::mbstate_t;
	using comparison_category = std::strong_ordering;

	static constexpr void assign(char_type& outChar, const char_type& inChar) noexcept { outChar = inChar; }
	static constexpr bool eq(char_type inLHS, char_type inRHS) noexcept { return inLHS == inRHS; }
	static constexpr bool lt(char_type inLHS, char_type inRHS) noexcept { return inLHS < inRHS; }

	static constexpr int compare(const char_type* inLHS, const char_type* inRHS, std::size_t inCount) noexcept
	{
		for (; inCount != 0; --inCount, ++inLHS, ++inRHS)
			if (*inLHS != *inRHS)
				return *inLHS < *inRHS ? -1 : 1;
		return 0;
	}
	static constexpr std::size_t length(const char_type* inText) noexcept
	{
		std::size_t length = 0;
		while (inText[length] != 0)
			++length;
		return length;
	}
	static constexpr const char_type* find(
		const char_type* inText, std::size_t inCount, const char_type& inChar) noexcept
	{
		const char_type* const found = std::find(inText, inText + inCount, inChar);
		return found == inText + inCount ? nullptr : found;
	}
	static constexpr char_type* move(char_type* outText, const char_type* inText, std::size_t inCount) noexcept
	{
		if (outText <= inText)
			std::copy_n(inText, inCount, outText);
		else
			std::copy_backward(inText, inText + inCount, outText + inCount);
		return outText;
	}
	static constexpr char_type* copy(char_type* outText, const char_type* inText, std::size_t inCount) noexcept
	{
		std::copy_n(inText, inCount, outText);
		return outText;
	}
	static constexpr char_type* assign(char_type* outText, std::size_t inCount, char_type inChar) noexcept
	{
		std::fill_n(outText, inCount, inChar);
		return outText;
	}

	// The end is no character: integers are wider.
	static constexpr int_type eof() noexcept { return ~int_type{0}; }
	static constexpr int_type not_eof(int_type inValue) noexcept { return inValue == eof() ? 0 : inValue; }
	static constexpr char_type to_char_type(int_type inValue) noexcept { return static_cast<char_type>(inValue); }
	static constexpr int_type to_int_type(char_type inChar) noexcept { return inChar; }
	static constexpr bool eq_int_type(int_type inLHS, int_type inRHS) noexcept { return inLHS == inRHS; }
};

}   // namespace zoncore
