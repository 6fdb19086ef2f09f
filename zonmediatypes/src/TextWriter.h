#pragma once

#include "zoncore/UTF16String.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <concepts>
#include <cstddef>
#include <iterator>
#include <span>
#include <string_view>

namespace zonmediatypes
{

/// A short text under construction: the characters that a 16-bit stream would write, without the stream and without
/// memory of its own. Nothing checks the capacity; who uses it chooses one that the longest text fits into.
template <std::size_t inCapacity>
class TextWriter
{
public:
	void Append(char inChar) noexcept { mChars[mLength++] = static_cast<unsigned char>(inChar); }

	void Append(std::string_view inAscii) noexcept
	{
		for (const char character : inAscii)
			Append(character);
	}

	/// inValue in decimal. It is padded with zeros to inWidth characters as a stream pads: in front of a minus sign,
	/// too.
	template <std::integral Integer>
	void AppendNumber(Integer inValue, std::size_t inWidth = 1) noexcept
	{
		if (inValue >= 0 && inValue < 100 && inWidth == 2)
			return AppendTwoDigits(static_cast<unsigned>(inValue));
		char digits[kLongestNumber];
		const auto end = std::to_chars(digits, std::end(digits), inValue).ptr;
		const auto length = static_cast<std::size_t>(end - digits);
		for (std::size_t i = length; i < inWidth; ++i)
			Append('0');
		Append(std::string_view(digits, length));
	}

	/// inValue as a stream writes it by default: six significant digits, with an exponent where that is shorter.
	void AppendNumber(double inValue) noexcept
	{
		char digits[kLongestNumber];
		const auto end = std::to_chars(digits, std::end(digits), inValue, std::chars_format::general, 6).ptr;
		Append(std::string_view(digits, static_cast<std::size_t>(end - digits)));
	}

	std::span<zoncore::UTF16Char> GetChars() noexcept { return {mChars.data(), mLength}; }
	zoncore::UTF16StringView GetText() const noexcept { return {mChars.data(), mLength}; }

private:
	static constexpr std::size_t kLongestNumber = 24;   // 20 characters of a 64-bit integer, 13 of a double

	void AppendTwoDigits(unsigned inValue) noexcept
	{
		mChars[mLength] = static_cast<zoncore::UTF16Char>('0' + inValue / 10);
		mChars[mLength + 1] = static_cast<zoncore::UTF16Char>('0' + inValue % 10);
		mLength += 2;
	}

	std::array<zoncore::UTF16Char, inCapacity> mChars;
	std::size_t mLength = 0;
};

}   // namespace zonmediatypes
