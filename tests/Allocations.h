#pragma once

#include <gtest/gtest.h>

#include <atomic>
#include <cstddef>
#include <cstdlib>
#include <new>

// Include this in one source file of a program: it counts what the program asks `operator new` for, and can let it fail.

namespace zontest
{

inline std::atomic<std::size_t> gAllocations = 0;
inline std::atomic<std::size_t> gAllocatedBytes = 0;
inline std::atomic<long> gAllocationsToFailure
	= 0;   // the one that counts this down to 0 fails; not above 0: none does

/// How many blocks of memory inFunction asks for.
template <class Function>
std::size_t CountAllocations(Function&& inFunction)
{
	const std::size_t before = gAllocations;
	inFunction();
	return gAllocations - before;
}

/// Calls inFunction with its first allocation failing, then its second, until one call gets through; after each call
/// that failed, inCheck looks whether everything is as before. Returns how many calls failed. Blocks from a pool do
/// not fail: it takes a build without the pool to see all of them.
template <class Function, class Check>
long FailEachAllocation(Function&& inFunction, Check&& inCheck)
{
	for (long failures = 0;; ++failures)
	{
		gAllocationsToFailure = failures + 1;
		try
		{
			inFunction();
			gAllocationsToFailure = 0;
			return failures;
		}
		catch (const std::bad_alloc&)
		{
			gAllocationsToFailure = 0;
			inCheck();
		}
	}
}

}   // namespace zontest

// Not inlined: where g++ sees both sides it takes free() for the wrong partner of `new`.
[[gnu::noinline]] void* operator new(std::size_t inSize)
{
	++zontest::gAllocations;
	zontest::gAllocatedBytes += inSize;
	const bool fails = zontest::gAllocationsToFailure > 0 && --zontest::gAllocationsToFailure == 0;
	void* const block = fails ? nullptr : std::malloc(inSize == 0 ? 1 : inSize);
	if (block == nullptr)
		throw std::bad_alloc();
	return block;
}

[[gnu::noinline]] void operator delete(void* inBlock) noexcept
{
	std::free(inBlock);
}

[[gnu::noinline]] void operator delete(void* inBlock, std::size_t) noexcept
{
	std::free(inBlock);
}
