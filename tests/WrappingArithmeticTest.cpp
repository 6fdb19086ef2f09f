#include "zoncore/WrappingArithmetic.h"

#include <gtest/gtest.h>

#include <csignal>
#include <cstdint>
#include <limits>

namespace zoncore::utility
{
namespace
{

template <class Integer>
constexpr bool WrapsAtItsExtremes()
{
	constexpr Integer most = std::numeric_limits<Integer>::max();
	constexpr Integer least = std::numeric_limits<Integer>::min();
	return WrappingAdd(most, 1) == least && WrappingAdd(-2, 3) == 1 && WrappingSubtract(least, 1) == most
		&& WrappingMultiply(most, 2) == -2 && WrappingMultiply(least, -1) == least && WrappingMultiply(-3, 5) == -15
		&& WrappingNegate(least) == least && WrappingNegate(most) == least + 1 && WrappingDivide(least, -1) == least
		&& WrappingDivide(-7, 2) == -3 && WrappingRemainder(least, -1) == 0 && WrappingRemainder(-7, 2) == -1
		&& Magnitude(least) == std::make_unsigned_t<Integer>{1} << (sizeof(Integer) * 8 - 1) && Magnitude(-5) == 5u;
}
static_assert(WrapsAtItsExtremes<std::int32_t>() && WrapsAtItsExtremes<std::int64_t>());

TEST(WrappingArithmeticDeathTest, DividesByZeroWithAFault)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
	const auto prepare = []
	{
		std::signal(SIGFPE, SIG_DFL);   // sanitizers have a handler of their own
		return 0;
	};
	EXPECT_EXIT(WrappingDivide(1, prepare()), testing::KilledBySignal(SIGFPE), "");
	EXPECT_EXIT(WrappingRemainder(1, prepare()), testing::KilledBySignal(SIGFPE), "");

	// A handler that returns does not bring the division back.
	const auto resume = []
	{
		std::signal(SIGFPE, [](int) {});
		return 0;
	};
	EXPECT_EXIT(WrappingDivide(1, resume()), testing::KilledBySignal(SIGABRT), "");
}

}   // namespace
}   // namespace zoncore::utility
