#pragma once

#include "zoncore/UTF16String.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string_view>
#include <type_traits>

namespace zonfuzz
{

/// Reads arguments off a fuzzer's bytes: numbers from the front, text from what is left. Behind the end all bytes are 0.
class FuzzInput
{
public:
	FuzzInput(const std::uint8_t* inData, std::size_t inSize) : mBytes(reinterpret_cast<const char*>(inData), inSize) {}

	bool IsEmpty() const { return mBytes.empty(); }

	/// Any value of a number type.
	template <class Number>
	Number Any()
	{
		std::array<char, sizeof(Number)> bytes{};
		const std::size_t count = std::min(bytes.size(), mBytes.size());
		std::copy_n(mBytes.begin(), count, bytes.begin());
		mBytes.remove_prefix(count);
		if constexpr (std::endian::native == std::endian::big)   // an input means the same everywhere
			std::ranges::reverse(bytes);
		return std::bit_cast<Number>(bytes);
	}

	/// 0 ... inCount - 1.
	std::size_t Below(std::size_t inCount) { return Any<std::uint8_t>() % inCount; }
	bool Flag() { return Any<std::uint8_t>() % 2 != 0; }

	/// An integer that is small, any, or near to where arithmetic wraps.
	template <class Integer>
	Integer Edge()
	{
		using Unsigned = std::make_unsigned_t<Integer>;
		const auto kind = Any<std::uint8_t>();
		if (kind < 0x80)
			return static_cast<Integer>(Any<std::int8_t>());
		if (kind < 0xC0)
			return Any<Integer>();
		const auto bit = static_cast<Unsigned>(Unsigned{1} << kind % std::numeric_limits<Unsigned>::digits);
		return static_cast<Integer>(bit + static_cast<Unsigned>(Any<std::int8_t>()));
	}

	template <class Values>
	auto OneOf(const Values& inValues)
	{
		return inValues[Below(inValues.size())];
	}

	/// What is left.
	std::string_view Rest()
	{
		const std::string_view rest = mBytes;
		mBytes = {};
		return rest;
	}

	/// What is left as 16-bit text: bytes up to EF are characters, the others begin a pair of bytes that is one code unit.
	zoncore::UTF16String Text()
	{
		zoncore::UTF16String text;
		text.reserve(mBytes.size());
		while (!mBytes.empty())
		{
			const auto byte = Any<std::uint8_t>();
			text.push_back(byte < 0xF0 ? byte : Any<std::uint16_t>());
		}
		return text;
	}

private:
	std::string_view mBytes;
};

}   // namespace zonfuzz
