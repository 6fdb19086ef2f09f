#include "zoncore/SmallBlockAllocator.h"

#include "tests/Allocations.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <random>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace zoncore::utility
{
namespace
{

using Pool = SmallBlockAllocator;

// A block that is full of its own mark: whoever else writes into it is found out.
class MarkedBlock
{
public:
	MarkedBlock(std::size_t inSize, unsigned char inMark)
		: mBlock(static_cast<unsigned char*>(Pool::Allocate(inSize))), mSize(inSize), mMark(inMark)
	{
		std::fill_n(mBlock, mSize, mMark);
	}
	MarkedBlock(MarkedBlock&& ioOther) noexcept
		: mBlock(std::exchange(ioOther.mBlock, nullptr)), mSize(ioOther.mSize), mMark(ioOther.mMark)
	{
	}
	MarkedBlock& operator=(MarkedBlock&& ioOther) noexcept
	{
		std::swap(mBlock, ioOther.mBlock);
		std::swap(mSize, ioOther.mSize);
		std::swap(mMark, ioOther.mMark);
		return *this;
	}
	~MarkedBlock() { Pool::Dispose(mBlock, mSize); }

	bool IsIntact() const
	{
		return std::all_of(mBlock, mBlock + mSize, [&](unsigned char inByte) { return inByte == mMark; });
	}
	bool IsAligned() const { return reinterpret_cast<std::uintptr_t>(mBlock) % alignof(std::max_align_t) == 0; }

private:
	unsigned char* mBlock;
	std::size_t mSize;
	unsigned char mMark;
};

bool IsPooled()
{
	Pool::Dispose(Pool::Allocate(8), 8);
	return zontest::CountAllocations([] { Pool::Dispose(Pool::Allocate(8), 8); }) == 0;
}

TEST(SmallBlockAllocator, GivesBlocksOfEverySizeThatDoNotOverlap)
{
	std::vector<MarkedBlock> blocks;
	std::mt19937 random(1);
	for (int i = 0; i < 50'000; ++i)
	{
		MarkedBlock block(random() % 600, static_cast<unsigned char>(random()));
		ASSERT_TRUE(block.IsAligned());
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
	Pool::Dispose(nullptr, 8);
	Pool::Dispose(nullptr, 8'000);
}

TEST(SmallBlockAllocator, ServesContainers)
{
	Pool::vector<int> numbers;
	for (int i = 0; i < 10'000; ++i)
		numbers.push_back(i);
	Pool::map<std::string, int> names{{"b", 2}, {"a", 1}};
	EXPECT_EQ(numbers[9'999] + names.begin()->second, 10'000);
	static_assert(Pool::Allocator<int>() == Pool::Allocator<std::string>());
	static_assert(std::allocator_traits<Pool::Allocator<int>>::is_always_equal::value);
	Pool::Allocator<std::uint64_t> allocator;
	EXPECT_THROW(
		static_cast<void>(allocator.allocate(std::numeric_limits<std::size_t>::max() / 4)), std::bad_array_new_length);
}

TEST(SmallBlockAllocator, ThrowsWhenMemoryRunsOutAndGoesOn)
{
	std::vector<MarkedBlock> blocks;
	blocks.reserve(20'000);
	long failures = 0;
	for (std::size_t i = 0; i < 10'000; ++i)
		failures
			+= zontest::FailEachAllocation([&] { blocks.emplace_back(i % 300, static_cast<unsigned char>(i)); }, [] {});
	EXPECT_GT(failures, 0);
	EXPECT_TRUE(std::ranges::all_of(blocks, &MarkedBlock::IsIntact));
}

TEST(SmallBlockAllocator, TakesBlocksBackOnOtherThreads)
{
	constexpr std::size_t kThreads = 4;
	std::vector<std::vector<MarkedBlock>> lists(kThreads);
	for (int round = 0; round < 20; ++round)
	{
		std::vector<std::thread> threads;
		for (std::size_t i = 0; i < kThreads; ++i)
			threads.emplace_back(
				[&, i]
				{
					EXPECT_TRUE(std::ranges::all_of(lists[i], &MarkedBlock::IsIntact));
					lists[i].clear();
					for (std::size_t size = 0; size < 1'000; ++size)
						lists[i].emplace_back(size % 300, static_cast<unsigned char>(size + i));
				});
		for (std::thread& thread : threads)
			thread.join();
		std::rotate(lists.begin(), lists.begin() + 1, lists.end());   // the next thread takes what this one left behind
	}
}

TEST(SmallBlockAllocator, KeepsWhatThreadsLeaveForTheNext)
{
	if (!IsPooled())
		GTEST_SKIP() << "built without the pool";
	std::vector<void*> blocks(1'000);
	const auto allocate = [&] { std::ranges::generate(blocks, [] { return Pool::Allocate(200); }); };
	const auto dispose = [&] { std::ranges::for_each(blocks, [](void* inBlock) { Pool::Dispose(inBlock, 200); }); };
	const std::size_t before = zontest::gAllocatedBytes;
	for (int round = 0; round < 300; ++round)
	{
		std::thread(allocate).join();
		std::thread(dispose).join();
		allocate();
		std::thread(dispose).join();
	}
	// A thousand blocks of 208 bytes, some for each thread's list, and what the threads themselves need: far below the
	// hundred megabytes of blocks that nobody gets twice.
	EXPECT_LT(zontest::gAllocatedBytes - before, 1'000'000u);
}

// Whoever ends after the allocator's own farewell to its thread still allocates and disposes.
struct Latecomer
{
	~Latecomer()
	{
		for (std::size_t size = 0; size < 300; ++size)
			mBlocks.emplace_back(size, static_cast<unsigned char>(size));
		if (!std::ranges::all_of(mBlocks, &MarkedBlock::IsIntact))
			std::abort();
	}

	std::vector<MarkedBlock> mBlocks;
};

TEST(SmallBlockAllocator, ServesThreadsThatAreEnding)
{
	for (int round = 0; round < 3; ++round)
		std::thread(
			[]
			{
				static thread_local Latecomer sLatecomer;   // made first, so it ends last
				for (std::size_t size = 0; size < 600; ++size)
					sLatecomer.mBlocks.emplace_back(size % 300, static_cast<unsigned char>(7 * size));
			})
			.join();
}

// The same for static objects of the program; each test of this file ends with it.
Latecomer sStaticLatecomer;

TEST(SmallBlockAllocator, ServesStaticObjectsToTheEnd)
{
	EXPECT_EXIT(
		{
			for (std::size_t size = 0; size < 600; ++size)
				sStaticLatecomer.mBlocks.emplace_back(size % 300, static_cast<unsigned char>(3 * size));
			std::exit(0);
		},
		testing::ExitedWithCode(0), "");
}

}   // namespace
}   // namespace zoncore::utility
