#include "zoncore/Flags.h"
#include "zoncore/Geometry.h"
#include "zoncore/RecursiveMutex.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

namespace zoncore
{
namespace
{

enum Option : unsigned
{
	kOption_A = 1,
	kOption_B = 2
};

constexpr bool HasB(Flags<unsigned> inFlags)
{
	return inFlags.Test(kOption_B);
}

static_assert(HasB(kOption_B) && HasB(kOption_A | kOption_B) && !HasB(kOption_A) && !HasB({}));
static_assert((Flags<unsigned>(5) | kOption_B).GetBits() == 7 && (Flags<unsigned>(5) & 3u) == kOption_A);
static_assert(!Flags<unsigned>(1).Test(3) && Flags<unsigned>(7).Test(3) && Flags<unsigned>().Test({}));
static_assert((Flags<unsigned short>(0x8000) | 1) == 0x8001 && Flags<unsigned short>(4) != 5);

static_assert(RectT<int>{1, 2, 3, 4}.bottom == 4 && RectT<int>{} == RectT<int>{0, 0, 0, 0});
static_assert(PointT<int>{1, 2} != PointT<int>{2, 1} && PointT<double>{.x = 1}.y == 0);

TEST(RecursiveMutex, IsReentrantForItsThreadAndKeepsOthersOut)
{
	const threads::RecursiveMutex mutex;
	int count = 0;
	const auto work = [&]
	{
		for (int i = 0; i < 5'000; ++i)
		{
			mutex.Lock("outer");
			mutex.Lock(nullptr);
			++count;
			mutex.Unlock();
			++count;
			mutex.Unlock();
		}
	};
	std::vector<std::thread> threads;
	for (int i = 0; i < 4; ++i)
		threads.emplace_back(work);
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(count, 40'000);
}

}   // namespace
}   // namespace zoncore
