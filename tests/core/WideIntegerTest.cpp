#include "zoncore/WideInteger.h"

#include <boost/multiprecision/cpp_int.hpp>
#include <gtest/gtest.h>

#include <bit>
#include <cstdint>
#include <limits>
#include <optional>
#include <random>

namespace zoncore::utility
{
namespace
{

namespace mp = boost::multiprecision;
using Judge = mp::number<mp::cpp_int_backend<128, 128, mp::unsigned_magnitude, mp::unchecked, void>>;

std::mt19937_64 sRandom(128);

// Words of every width, all ones and single bits among them: where a carry or a quotient's digit goes wrong.
std::uint64_t RandomWord()
{
	const std::uint64_t word = sRandom() >> sRandom() % 64;
	switch (sRandom() % 4)
	{
	case 0:
		return std::bit_floor(word);
	case 1:
		return 0 - std::bit_floor(word);
	case 2:
		return std::bit_floor(word) - 1;
	default:
		return word;
	}
}

Judge Joined(std::uint64_t inHigh, std::uint64_t inLow)
{
	return Judge(inHigh) << 64 | inLow;
}

template <class Wide>
Judge Value(Wide inValue)
{
	return Joined(static_cast<std::uint64_t>(inValue >> 64u), static_cast<std::uint64_t>(inValue));
}

template <class Wide>
class WideInteger : public testing::Test
{
};
using Kinds = testing::Types<UInt128, PortableUInt128>;
TYPED_TEST_SUITE(WideInteger, Kinds);

TYPED_TEST(WideInteger, CalculatesExactly)
{
	for (int i = 0; i < 20'000; ++i)
	{
		const std::uint64_t words[]
			= {sRandom() % 2 * RandomWord(), RandomWord(), sRandom() % 2 * RandomWord(), RandomWord()};
		const TypeParam a = TypeParam{words[0]} << 64u | TypeParam{words[1]};
		const TypeParam b = TypeParam{words[2]} << 64u | TypeParam{words[3]};
		const Judge expectedA = Joined(words[0], words[1]);
		const Judge expectedB = Joined(words[2], words[3]);
		const auto shift = static_cast<unsigned>(i % 128);
		ASSERT_EQ(Value(a), expectedA);
		ASSERT_EQ(Value(a + b), Judge(expectedA + expectedB));
		ASSERT_EQ(Value(a - b), Judge(expectedA - expectedB));
		ASSERT_EQ(Value(a * b), Judge(expectedA * expectedB));
		ASSERT_EQ(Value(a << shift), Judge(expectedA << shift));
		ASSERT_EQ(Value(a >> shift), Judge(expectedA >> shift));
		ASSERT_EQ(a < b, expectedA < expectedB);
		ASSERT_EQ(a == b, expectedA == expectedB);
		if (expectedB == 0)
			continue;
		ASSERT_EQ(Value(a / b), Judge(expectedA / expectedB)) << expectedA << " / " << expectedB;
		ASSERT_EQ(Value(a % b), Judge(expectedA % expectedB)) << expectedA << " % " << expectedB;
	}
	static_assert(TypeParam{7u} * 6u / 5u % 4u == 0u && static_cast<std::uint8_t>(TypeParam{0x1FFu}) == 0xFF);
}

template <class Integer>
void MultipliesOrSaysThatItDoesNotFit()
{
	using Limits = std::numeric_limits<Integer>;
	for (int i = 0; i < 20'000; ++i)
	{
		const auto a = static_cast<Integer>(RandomWord());
		const auto b = static_cast<Integer>(RandomWord());
		const mp::cpp_int product = mp::cpp_int(a) * b;
		const std::optional<Integer> expected = product < Limits::min() || product > Limits::max()
			? std::nullopt
			: std::optional(static_cast<Integer>(product));
		ASSERT_EQ(CheckedMultiply(a, b), expected) << a << " x " << b;
		ASSERT_EQ(PortableCheckedMultiply(a, b), expected) << a << " x " << b;
	}
	static_assert(
		PortableCheckedMultiply(Limits::max(), 1) == Limits::max() && !PortableCheckedMultiply(Limits::max(), 2));
	static_assert(PortableCheckedMultiply(Limits::min(), 1) == Limits::min());
}

TEST(CheckedMultiply, IsExactOrEmpty)
{
	MultipliesOrSaysThatItDoesNotFit<std::int64_t>();
	MultipliesOrSaysThatItDoesNotFit<std::uint64_t>();
}

}   // namespace
}   // namespace zoncore::utility
