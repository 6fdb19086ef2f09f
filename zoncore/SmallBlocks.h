#pragma once

/// \file
/// Memory for the many small, short-lived blocks of texts and tables: pooled, so that a block is served and taken back
/// in a few nanoseconds. 16-bit texts, channel layouts and lists of formats take theirs here. This is the allocator without
/// its map; SmallBlockAllocator.h has all of it.

#include "zoncore/Export.h"

#include <cstddef>
#include <limits>
#include <new>
#include <vector>

namespace zoncore::utility
{

namespace detail
{

/// Names the map over small blocks; SmallBlockAllocator.h defines it.
template <class Key, class Value>
struct SmallBlockMap;

}   // namespace detail

/// Serves blocks of up to 256 bytes from pools and larger ones from `operator new`. Any thread may allocate and dispose;
/// a block may be disposed of on another thread than it was allocated on, after that thread has ended, and during static
/// destruction. Pools only grow: what is disposed of is kept for the next block of its size.
class ZONCORE_API SmallBlockAllocator
{
public:
	/// A block of at least inSize bytes, aligned for any scalar type. inSize 0 gives a block that must be disposed of,
	/// too. Throws std::bad_alloc when memory runs out.
	[[nodiscard]] static void* Allocate(std::size_t inSize);

	/// Takes back a block that Allocate(inSize) gave; a null pointer is ignored.
	static void Dispose(void* inBlock, std::size_t inSize) noexcept;

	/// The standard allocator over Allocate and Dispose. All instances are equal.
	template <class T>
	class Allocator
	{
	public:
		using value_type = T;

		constexpr Allocator() noexcept = default;
		template <class Other>
		constexpr Allocator(const Allocator<Other>&) noexcept   // NOLINT(google-explicit-constructor): rebinding
		{
		}

		[[nodiscard]] T* allocate(std::size_t inCount)
		{
			static_assert(alignof(T) <= alignof(std::max_align_t), "over-aligned types need an allocator of their own");
			if (inCount > std::numeric_limits<std::size_t>::max() / sizeof(T))
				throw std::bad_array_new_length();
			return static_cast<T*>(Allocate(inCount * sizeof(T)));
		}
		void deallocate(T* inBlock, std::size_t inCount) noexcept { Dispose(inBlock, inCount * sizeof(T)); }

		template <class Other>
		friend constexpr bool operator==(const Allocator&, const Allocator<Other>&) noexcept
		{
			return true;
		}
	};

	template <class T>
	using vector = std::vector<T, Allocator<T>>;
	template <class Key, class Value>
	using map = typename detail::SmallBlockMap<Key, Value>::Type;
};

}   // namespace zoncore::utility
