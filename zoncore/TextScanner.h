#pragma once

/// \file
/// Reading a text from left to right: characters, signs, runs of digits, and the position where each was found.
///
///     TextScanner scanner(std::string_view("-12:34"));
///     scanner.TakeSign();                    // Sign::Minus
///     scanner.TakeDigits(99).mValue;         // 12
///     scanner.Take(':');                     // true
///     scanner.GetPosition();                 // 4, where "34" begins
///
/// Characters are those of ASCII, in text of any character type; digits of other scripts are no digits. Nothing here
/// allocates, throws or depends on a locale.

#include "zoncore/Requirements.h"

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string_view>

namespace zoncore::utility
{

constexpr bool IsDigit(std::uint32_t inChar) noexcept
{
	return inChar - '0' < 10;
}

/// The six characters that C's classic locale counts as white space.
constexpr bool IsWhiteSpace(std::uint32_t inChar) noexcept
{
	return inChar == ' ' || inChar - '\t' < 5;
}

constexpr bool IsSign(std::uint32_t inChar) noexcept
{
	return inChar == '+' || inChar == '-';
}

/// A sign as it was written.
enum class Sign : std::uint8_t
{
	None,
	Plus,
	Minus
};

/// A run of digits.
struct DigitRun
{
	std::uint64_t mValue;   ///< at most the limit that the reader was given
	std::size_t mCount;     ///< of digits; 0 where none stood
	bool mIsTooLarge;       ///< whether the number itself is above the limit
};

/// A text and how far it has been read. It refers to the text, which must live as long.
template <class Char>
class TextScanner
{
public:
	template <class Traits>
	explicit constexpr TextScanner(std::basic_string_view<Char, Traits> inText) noexcept
		: mBegin(inText.data()), mNext(mBegin), mEnd(mBegin + inText.size())
	{
	}

	constexpr bool IsAtEnd() const noexcept { return mNext == mEnd; }

	/// The next character; 0 at the end, which a text may hold, too.
	constexpr Char Peek() const noexcept { return IsAtEnd() ? Char{} : *mNext; }

	/// Reads one character; not at the end.
	constexpr Char Next() noexcept { return *mNext++; }

	/// How many code units have been read, and how many are left.
	constexpr std::size_t GetPosition() const noexcept { return static_cast<std::size_t>(mNext - mBegin); }
	constexpr std::size_t GetRemaining() const noexcept { return static_cast<std::size_t>(mEnd - mNext); }

	/// Reads inCount code units, at most those that are left.
	constexpr void Skip(std::size_t inCount) noexcept { mNext += inCount < GetRemaining() ? inCount : GetRemaining(); }

	/// Reads one character if it is inChar, and says whether it was.
	constexpr bool Take(char inChar) noexcept;

	/// Reads a "+" or a "-", if one comes next.
	constexpr Sign TakeSign() noexcept;

	constexpr void SkipWhiteSpace() noexcept;

	/// Reads the digits that come next, however many; a number above inMost counts as inMost.
	constexpr DigitRun TakeDigits(std::uint64_t inMost) noexcept;

private:
	/// Whether the number that these digits write does.
	static constexpr bool Fits64Bits(const Char* inBegin, const Char* inEnd) noexcept;

	const Char* mBegin;
	const Char* mNext;
	const Char* mEnd;
};

template <class Char, class Traits>
TextScanner(std::basic_string_view<Char, Traits>) -> TextScanner<Char>;

// ---- Inline implementation -------------------------------------------------------------------------------------------

template <class Char>
constexpr bool TextScanner<Char>::Take(char inChar) noexcept
{
	if (IsAtEnd() || *mNext != static_cast<Char>(inChar))
		return false;
	++mNext;
	return true;
}

template <class Char>
constexpr Sign TextScanner<Char>::TakeSign() noexcept
{
	if (Take('-'))
		return Sign::Minus;
	return Take('+') ? Sign::Plus : Sign::None;
}

template <class Char>
constexpr void TextScanner<Char>::SkipWhiteSpace() noexcept
{
	while (!IsAtEnd() && IsWhiteSpace(static_cast<std::uint32_t>(*mNext)))
		++mNext;
}

template <class Char>
constexpr DigitRun TextScanner<Char>::TakeDigits(std::uint64_t inMost) noexcept
{
	const Char* const begin = mNext;
	std::uint64_t value = 0;
	for (; !IsAtEnd(); ++mNext)
	{
		const std::uint32_t digit = static_cast<std::uint32_t>(*mNext) - '0';
		if (digit > 9)
			break;
		value = value * 10 + digit;
	}
	const bool isTooLarge = value > inMost || !Fits64Bits(begin, mNext);
	return {isTooLarge ? inMost : value, static_cast<std::size_t>(mNext - begin), isTooLarge};
}

template <class Char>
constexpr bool TextScanner<Char>::Fits64Bits(const Char* inBegin, const Char* inEnd) noexcept
{
	constexpr std::uint64_t kMost = std::numeric_limits<std::uint64_t>::max();
	if (inEnd - inBegin <= std::numeric_limits<std::uint64_t>::digits10)
		return true;   // as every number of so few digits
	std::uint64_t value = 0;
	for (; inBegin != inEnd; ++inBegin)
	{
		const auto digit = static_cast<std::uint64_t>(*inBegin - Char{'0'});
		if (value > (kMost - digit) / 10)
			return false;
		value = value * 10 + digit;
	}
	return true;
}

}   // namespace zoncore::utility
