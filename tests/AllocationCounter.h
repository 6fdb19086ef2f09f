#pragma once

#include <atomic>
#include <cstddef>
#include <cstdlib>
#include <new>

// Include this in one source file of a program: it counts what the program asks `operator new` for.

namespace zontest
{

inline std::atomic<std::size_t> gAllocations = 0;

/// How many blocks of memory inFunction asks for.
template <class Function>
std::size_t CountAllocations(Function&& inFunction)
{
	const std::size_t before = gAllocations;
	inFunction();
	return gAllocations - before;
}

}   // namespace zontest

[[gnu::noinline]] void* operator new(std::size_t inSize)
{
	++zontest::gAllocations;
	if (void* const block = std::malloc(inSize == 0 ? 1 : inSize))
		return block;
	throw std::bad_alloc();
}

[[gnu::noinline]] void operator delete(void* inBlock) noexcept
{
	std::free(inBlock);
}

[[gnu::noinline]] void operator delete(void* inBlock, std::size_t) noexcept
{
	std::free(inBlock);
}
