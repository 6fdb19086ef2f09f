#pragma once

/// \file
/// Text under construction in a fixed buffer: what a stream would write, without a stream and without memory.

#include "zoncore/NumberConversion.h"
#include "zoncore/UTF16String.h"

#include <array>
#include <charconv>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace zoncore::utility
{

inline constexpr std::size_t kLongestInteger = 20;   // characters of a 64-bit integer, its sign included

/// Writes two digits of a number below 100; the end of what was written.
template <class Char>
Char* WriteTwoDigits(std::uint64_t inNumber, Char* outText) noexcept
{
	static constexpr auto kPairs = []
	{
		std::array<std::array<Char, 2>, 100> pairs{};
		for (std::size_t number = 0; number < pairs.size(); ++number)
			pairs[number] = {static_cast<Char>('0' + number / 10), static_cast<Char>('0' + number % 10)};
		return pairs;
	}();
	outText[0] = kPairs[static_cast<std::size_t>(inNumber)][0];
	outText[1] = kPairs[static_cast<std::size_t>(inNumber)][1];
	return outText + 2;
}

/// Copies an ASCII text into a caller's buffer if it fits, and leaves the buffer alone if not; the length of the text.
template <class Char>
std::size_t CopyText(UTF16StringView inAscii, std::span<Char> outText) noexcept
{
	if (inAscii.size() <= outText.size())
		for (std::size_t i = 0; i < inAscii.size(); ++i)
			outText[i] = static_cast<Char>(inAscii[i]);
	return inAscii.size();
}

/// A short text under construction: the characters that a 16-bit stream would write, without the stream and without
/// memory of its own. Nothing checks the capacity; who uses it chooses one that the longest text fits into.
template <std::size_t inCapacity>
class TextWriter
{
public:
	TextWriter() noexcept = default;
	TextWriter(const TextWriter&) = delete;   // mEnd points into the object itself
	TextWriter& operator=(const TextWriter&) = delete;

	void Put(char inChar) noexcept { *mEnd++ = static_cast<unsigned char>(inChar); }
	void Put(std::string_view inAscii) noexcept
	{
		for (const char character : inAscii)
			Put(character);
	}

	/// inNumber is below 100.
	void PutTwoDigits(std::uint64_t inNumber) noexcept { mEnd = WriteTwoDigits(inNumber, mEnd); }

	/// inNumber in decimal, padded with zeros to inWidth characters as a stream pads: in front of a minus sign, too.
	template <std::integral Integer>
	void PutNumber(Integer inNumber, std::size_t inWidth = 1) noexcept
	{
		if (inNumber >= 0 && inNumber < 100 && inWidth == 2)
			return PutTwoDigits(static_cast<std::size_t>(inNumber));
		char digits[kLongestInteger]{};   // a compiler that does not see what to_chars writes warns otherwise
		const char* const end = std::to_chars(digits, digits + kLongestInteger, inNumber).ptr;
		const auto length = static_cast<std::size_t>(end - digits);
		for (std::size_t i = length; i < inWidth; ++i)
			Put('0');
		Put(std::string_view(digits, length));
	}

	/// inNumber as a stream writes it by default; see WriteGeneral.
	void PutNumber(double inNumber) noexcept
	{
		GeneralText text;
		Put(WriteGeneral(inNumber, text));
	}

	std::span<UTF16Char> GetChars() noexcept { return {mChars.data(), mEnd}; }
	UTF16StringView GetText() const noexcept { return {mChars.data(), mEnd}; }

private:
	std::array<UTF16Char, inCapacity> mChars;
	UTF16Char* mEnd = mChars.data();
};

}   // namespace zoncore::utility
