#include "tests/Platform.h"
#include "zoncore/Flags.h"
#include "zoncore/Geometry.h"
#include "zoncore/RecursiveMutex.h"
#include "zoncore/WrappingArithmetic.h"

#include <gtest/gtest.h>

#include <csignal>
#include <cstdint>
#include <limits>
#include <thread>

namespace
{

using namespace zoncore;

// ---- Flags and geometry ----------------------------------------------------------------------------------------------

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

// ---- Arithmetic that wraps -------------------------------------------------------------------------------------------

template <class Integer>
constexpr bool WrapsAtItsExtremes()
{
	using namespace utility;
	constexpr Integer most = std::numeric_limits<Integer>::max();
	constexpr Integer least = std::numeric_limits<Integer>::min();
	return WrappingAdd(most, 1) == least && WrappingAdd(-2, 3) == 1 && WrappingSubtract(least, 1) == most
		&& WrappingMultiply(most, 2) == -2 && WrappingMultiply(least, -1) == least && WrappingMultiply(-3, 5) == -15
		&& WrappingNegate(least) == least && WrappingNegate(most) == least + 1 && WrappingDivide(least, -1) == least
		&& WrappingDivide(-7, 2) == -3 && WrappingRemainder(least, -1) == 0 && WrappingRemainder(-7, 2) == -1
		&& Magnitude(least) == std::make_unsigned_t<Integer>{1} << (sizeof(Integer) * 8 - 1) && Magnitude(-5) == 5u;
}
static_assert(WrapsAtItsExtremes<std::int32_t>() && WrapsAtItsExtremes<std::int64_t>());

// A handler of the fault's signal that returns does not bring the division back. Sanitizers have a handler of their own.
TEST(WrappingArithmeticDeathTest, DividesByZeroWithAFault)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
	const auto zero = [](void (*inHandler)(int)) { return std::signal(SIGFPE, inHandler) == SIG_ERR ? 1 : 0; };
	EXPECT_EXIT(utility::WrappingDivide(1, zero(SIG_DFL)), zontest::EndedBy(SIGFPE), "");
	EXPECT_EXIT(utility::WrappingRemainder(1, zero(SIG_DFL)), zontest::EndedBy(SIGFPE), "");
	EXPECT_EXIT(utility::WrappingDivide(1, zero([](int) {})), zontest::EndedBy(SIGABRT), "");
}

// ---- Locks -----------------------------------------------------------------------------------------------------------

TEST(RecursiveMutex, IsReentrantForItsThreadAndKeepsOthersOut)
{
	const threads::RecursiveMutex mutex;
	int count = 0;
	const auto work = [&]
	{
		for (int i = 0; i < 20'000; ++i)
		{
			mutex.Lock("outer");
			mutex.Lock(nullptr);
			++count;
			mutex.Unlock();
			++count;
			mutex.Unlock();
		}
	};
	std::thread other(work);
	work();
	other.join();
	EXPECT_EQ(count, 80'000);
}

}   // namespace
