#pragma once

#include <gtest/gtest.h>

#include <atomic>
#include <cstddef>
#include <cstdlib>
#include <new>

// Include this in one source file of a program: it counts what the program asks `operator new` for, and can let it fail.

namespace zontest
{

// NOLINTBEGIN(readability-identifier-naming): g says that they are there for the whole program
inline std::atomic<std::size_t> gAllocations = 0;
inline std::atomic<std::size_t> gAllocatedBytes = 0;
inline std::atomic<long> gBlocks = 0;                 // that are not given back yet
inline std::atomic<long> gAllocationsToFailure = 0;   // the one that makes this 0 fails; not above 0: none does
// NOLINTEND(readability-identifier-naming)

/// Whether this build shows every block: a pool gives out its own, which do not fail, and keeps those that come back.
inline constexpr bool kSeesEveryBlock = !ZONCORE_SMALL_BLOCK_POOL;

/// Whether what the library asks for is seen, too: a DLL keeps to the `operator new` that it was linked with.
#if defined(_WIN32) && !defined(ZONCORE_STATIC)
inline constexpr bool kSeesTheLibrary = false;
#else
inline constexpr bool kSeesTheLibrary = true;
#endif

/// How many blocks of memory inFunction asks for.
template <class Function>
std::size_t CountAllocations(Function&& inFunction)
{
	const std::size_t before = gAllocations;
	inFunction();
	return gAllocations - before;
}

/// What becomes of a failure: it must reach the caller, or may stay inside, where a function has another way.
enum class Failure
{
	Reaches,
	MayStay
};

/// Calls inFunction with its first allocation failing, then its second, until none is left to fail; after each of these
/// calls inCheck looks whether everything is as before, and no block may be left over. Returns how many calls those were.
template <class Function, class Check>
long FailEachAllocation(Function&& inFunction, Check&& inCheck, Failure inFailure = Failure::Reaches)
{
	if (!kSeesTheLibrary)
		return inFunction(), 1;
	for (long failures = 0;; ++failures)
	{
		bool reached = false;
		const long blocks = gBlocks;
		gAllocationsToFailure = failures + 1;
		try
		{
			inFunction();
		}
		catch (const std::bad_alloc&)
		{
			reached = true;
		}
		const bool failed = gAllocationsToFailure.exchange(0) == 0;
		if (!failed)
		{
			EXPECT_FALSE(reached) << "memory has really run out";
			return failures;
		}
		EXPECT_TRUE(reached || inFailure == Failure::MayStay) << "nobody was told of failure " << failures + 1;
		EXPECT_TRUE(!reached || !kSeesEveryBlock || gBlocks == blocks)
			<< gBlocks - blocks << " blocks leaked in failure " << failures + 1;
		inCheck();
	}
}

}   // namespace zontest

// Not inlined: where g++ sees both sides it takes free() for the wrong partner of `new`.
// NOLINTBEGIN(misc-definitions-in-headers, cppcoreguidelines-no-malloc): one source includes this, and these are `new`
[[gnu::noinline]] void* operator new(std::size_t inSize)
{
	++zontest::gAllocations;
	zontest::gAllocatedBytes += inSize;
	const bool fails = zontest::gAllocationsToFailure > 0 && --zontest::gAllocationsToFailure == 0;
	void* const block = fails ? nullptr : std::malloc(inSize == 0 ? 1 : inSize);
	if (block == nullptr)
		throw std::bad_alloc();
	++zontest::gBlocks;
	return block;
}

[[gnu::noinline]] void operator delete(void* inBlock) noexcept
{
	if (inBlock != nullptr)
		--zontest::gBlocks;
	std::free(inBlock);
}

[[gnu::noinline]] void operator delete(void* inBlock, std::size_t) noexcept
{
	operator delete(inBlock);
}
// NOLINTEND(misc-definitions-in-headers, cppcoreguidelines-no-malloc)
