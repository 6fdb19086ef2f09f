#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <span>

namespace zonmediatypes
{

/// Where each of a fixed set of distinct keys stands, found with one multiplication and one read. Multiplicative hashing
/// without a collision: the multiplier is searched for while compiling.
template <std::size_t inSlots>
class PerfectIndex
{
	static_assert(std::has_single_bit(inSlots));

public:
	/// Does not compile when two keys are equal.
	explicit consteval PerfectIndex(std::span<const std::uint32_t> inKeys)
	{
		for (std::size_t i = 0; i < inKeys.size(); ++i)
			for (std::size_t j = 0; j < i; ++j)
				if (inKeys[i] == inKeys[j])
					throw "a key stands in two places";
		while (!Fill(inKeys))
			mMultiplier
				= (mMultiplier * 1'664'525 + 1'013'904'223) | 1;   // the next number of a sequence without pattern
	}

	/// The place of inKey if it is one of the keys, else that of some key: compare before use.
	constexpr std::size_t Find(std::uint32_t inKey) const noexcept { return mPlaces[Slot(inKey)]; }

private:
	using Place = std::uint8_t;

	constexpr std::size_t Slot(std::uint32_t inKey) const noexcept
	{
		return static_cast<std::uint32_t>(inKey * mMultiplier) >> (32 - std::countr_zero(inSlots));
	}

	consteval bool Fill(std::span<const std::uint32_t> inKeys)
	{
		if (inKeys.size() - 1 > std::numeric_limits<Place>::max())
			throw "too many keys for the type of a place";
		std::array<bool, inSlots> taken{};
		for (std::size_t place = 0; place < inKeys.size(); ++place)
		{
			const std::size_t slot = Slot(inKeys[place]);
			if (taken[slot])
				return false;
			taken[slot] = true;
			mPlaces[slot] = static_cast<Place>(place);
		}
		return true;
	}

	std::uint32_t mMultiplier = 0x9E3779B1;   // 2^32 divided by the golden ratio, the customary first try
	std::array<Place, inSlots> mPlaces{};
};

}   // namespace zonmediatypes
