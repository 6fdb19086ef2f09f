#include "zoncore/Reciprocal.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <random>

namespace zoncore::utility
{
namespace
{

// Around every power of two and every multiple of the divisor that a rounded factor could miss.
TEST(Reciprocal, DividesAsTheProcessorDoes)
{
	constexpr std::uint64_t kMost = Reciprocal::kMostDividend;
	std::mt19937_64 random(1);
	for (int shift = 0; shift < 64; ++shift)
		for (int i = 0; i < 200; ++i)
		{
			const std::uint64_t power = std::uint64_t{1} << shift;
			const std::uint64_t nearby = power + static_cast<std::uint64_t>(i) - 100;
			const std::uint64_t divisor = i < 150 ? nearby : random() >> shift;
			if (divisor == 0 || divisor > kMost)
				continue;
			const Reciprocal reciprocal(divisor);
			const std::uint64_t multiple = (random() >> 1) / divisor * divisor;
			for (const std::uint64_t dividend :
				{std::uint64_t{0}, std::uint64_t{1}, divisor - 1, divisor, multiple - 1, multiple, multiple + 1,
					kMost / divisor * divisor - 1, kMost / divisor * divisor, kMost - 1, kMost})
			{
				if (dividend <= kMost)
				{
					ASSERT_EQ(reciprocal.Divide(dividend), dividend / divisor) << dividend << " / " << divisor;
				}
			}
		}
}

}   // namespace
}   // namespace zoncore::utility
