#include "zoncore/SmallBlockAllocator.h"

#include "tests/Allocations.h"
#include "tests/Walks.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <random>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace
{

using namespace zoncore;
using namespace zoncore::utility;

using Pool = SmallBlockAllocator;

// A block that is full of its own mark: whoever else writes into it is found out.
struct MarkedBlock
{
	MarkedBlock(std::size_t inSize, std::size_t inMark)
		: mMark(static_cast<unsigned char>(inMark)), mBytes(inSize, mMark)
	{
	}

	bool IsIntact() const { return std::ranges::count(mBytes, mMark) == std::ssize(mBytes); }

	unsigned char mMark;
	Pool::vector<unsigned char> mBytes;
};

TEST(SmallBlockAllocator, GivesBlocksOfEverySizeThatDoNotOverlap)
{
	std::vector<MarkedBlock> blocks;
	std::mt19937 random(1);
	for (int i = 0; i < zontest::WalkLength(50'000, 10'000); ++i)
	{
		MarkedBlock block(random() % 600, random());
		ASSERT_EQ(reinterpret_cast<std::uintptr_t>(block.mBytes.data()) % alignof(std::max_align_t), 0u);
		if (blocks.size() < 2'000)
		{
			blocks.push_back(std::move(block));
			continue;
		}
		MarkedBlock& other = blocks[random() % blocks.size()];
		ASSERT_TRUE(other.IsIntact());
		other = std::move(block);
	}
	EXPECT_TRUE(std::ranges::all_of(blocks, &MarkedBlock::IsIntact));
	void* const empty = Pool::Allocate(0);
	EXPECT_NE(empty, nullptr);
	Pool::Dispose(empty, 0);
	Pool::Dispose(nullptr, 8);
	Pool::Dispose(nullptr, 8'000);
}

TEST(SmallBlockAllocator, ServesContainers)
{
	const Pool::map<std::string, int> names{{"b", 2}, {"a", 1}};
	EXPECT_EQ(names.begin()->second, 1);
	static_assert(Pool::Allocator<int>() == Pool::Allocator<std::string>());
	static_assert(std::allocator_traits<Pool::Allocator<int>>::is_always_equal::value);
	constexpr std::size_t kMost = std::numeric_limits<std::size_t>::max() / sizeof(std::uint64_t);
	Pool::Allocator<std::uint64_t> allocator;
	EXPECT_THROW(static_cast<void>(allocator.allocate(kMost + 1)), std::bad_array_new_length);
}

TEST(SmallBlockAllocator, ThrowsWhenMemoryRunsOutAndGoesOn)
{
	std::vector<MarkedBlock> blocks;
	blocks.reserve(10'000);
	long failures = 0;
	for (std::size_t i = 0; i < 10'000; ++i)
		failures += zontest::FailEachAllocation([&] { blocks.emplace_back(i % 300, i); }, [] {});
	EXPECT_GT(failures, 0);
	EXPECT_TRUE(std::ranges::all_of(blocks, &MarkedBlock::IsIntact));
}

TEST(SmallBlockAllocator, TakesBlocksBackOnOtherThreads)
{
	std::vector<std::vector<MarkedBlock>> lists(4);
	for (int round = 0; round < 20; ++round)
	{
		std::vector<std::thread> threads;
		for (auto& list : lists)
			threads.emplace_back(
				[&list]
				{
					EXPECT_TRUE(std::ranges::all_of(list, &MarkedBlock::IsIntact));
					list.clear();
					for (std::size_t size = 0; size < 1'000; ++size)
						list.emplace_back(size % 300, size);
				});
		for (std::thread& thread : threads)
			thread.join();
		std::rotate(lists.begin(), lists.begin() + 1, lists.end());   // the next thread takes what this one left behind
	}
}

#if ZONCORE_SMALL_BLOCK_POOL
TEST(SmallBlockAllocator, PoolsBlocksOfUpTo256BytesForAllThreads)
{
	for (const std::size_t size : {8u, 256u, 257u})
	{
		const auto use = [&] { Pool::Dispose(Pool::Allocate(size), size); };
		use();
		EXPECT_EQ(zontest::CountAllocations(use), zontest::kSeesTheLibrary && size > 256 ? 1u : 0u);
	}
	// What threads leave is for the next: a thousand blocks, some for each thread's list, and what the threads need.
	std::vector<void*> blocks(1'000);
	for (const std::size_t size : {8u, 200u})
	{
		const auto allocate = [&] { std::ranges::generate(blocks, [=] { return Pool::Allocate(size); }); };
		const auto dispose
			= [&] { std::ranges::for_each(blocks, [=](void* inBlock) { Pool::Dispose(inBlock, size); }); };
		const std::size_t before = zontest::gAllocatedBytes;
		for (int round = 0; round < 100; ++round)
		{
			std::thread(allocate).join();
			std::thread(dispose).join();
			allocate();
			std::thread(dispose).join();
		}
		EXPECT_LT(zontest::gAllocatedBytes - before, 200'000 + 2'000 * size);
	}
}
#endif

// Whoever ends after the allocator's own farewell to its thread still allocates and disposes.
struct Latecomer
{
	~Latecomer()
	{
		Fill(300);
		if (!std::ranges::all_of(mBlocks, &MarkedBlock::IsIntact))
			std::abort();
	}
	void Fill(std::size_t inBlocks)
	{
		mBlocks.reserve(900);
		for (std::size_t i = 0; i < inBlocks; ++i)
			mBlocks.emplace_back(i % 256, 7 * i);
	}

	std::vector<MarkedBlock> mBlocks;
};

TEST(SmallBlockAllocator, ServesThreadsThatAreEnding)
{
	const auto work = []
	{
		static thread_local Latecomer sLatecomer;   // made first, so it ends last
		sLatecomer.Fill(600);
	};
	[[maybe_unused]] const std::size_t before = zontest::gAllocatedBytes;
	for (int round = 0; round < 100; ++round)
		std::thread(work).join();
#if ZONCORE_SMALL_BLOCK_POOL
	// The list of the blocks, and nearly none of the 120,000 bytes in them: those go back to the pool.
	EXPECT_LT((zontest::gAllocatedBytes - before) / 100, 60'000u);
#endif
}

// The same for static objects of the program; each test of this file ends with it.
Latecomer sStaticLatecomer;

TEST(SmallBlockAllocator, ServesStaticObjectsToTheEnd)
{
	EXPECT_EXIT((sStaticLatecomer.Fill(600), std::exit(0)), testing::ExitedWithCode(0), "");
}

}   // namespace
