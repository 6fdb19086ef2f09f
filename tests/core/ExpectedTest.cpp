#include "zoncore/Expected.h"

#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <type_traits>
#include <vector>

using zoncore::BadExpectedAccess;
using zoncore::Expected;
using zoncore::unexpect;
using zoncore::Unexpected;

namespace
{

enum class Reason
{
	Empty,
	TooLarge
};
using Number = Expected<int, Reason>;

constexpr Number ReadDigit(char inChar)
{
	if (inChar == 0)
		return Unexpected(Reason::Empty);
	return inChar - '0';
}

// What readers hand out is as cheap as the number inside, and usable in constant expressions.
static_assert(std::is_trivially_copyable_v<Number> && std::is_trivially_destructible_v<Number>);
static_assert(ReadDigit('7') == 7 && ReadDigit(0) == Unexpected(Reason::Empty) && ReadDigit('7') != ReadDigit('8'));
static_assert(*Number().transform([](int inValue) { return inValue + 1; }) == 1);
static_assert(!std::is_convertible_v<Reason, Number> && !std::is_constructible_v<Number, std::string>);

// A reason of the same type as the value is no value.
static_assert(!Expected<int, int>(unexpect, 3).has_value() && Expected<int, int>(3) != Expected<int, int>(unexpect, 3));

}   // namespace

TEST(Expected, GoesOnWithValueOrReason)
{
	const auto doubled
		= [](int inValue) -> Number { return inValue > 4 ? Number(unexpect, Reason::TooLarge) : Number(2 * inValue); };
	EXPECT_EQ(ReadDigit('4').and_then(doubled), 8);
	EXPECT_EQ(ReadDigit('5').and_then(doubled), Unexpected(Reason::TooLarge));
	EXPECT_EQ(ReadDigit(0).and_then(doubled), Unexpected(Reason::Empty));
	EXPECT_EQ(ReadDigit(0).or_else([](Reason) { return Number(9); }), 9);
	EXPECT_EQ(ReadDigit('4').or_else([](Reason) { return Number(9); }), 4);
	EXPECT_EQ(ReadDigit(0).transform_error([](Reason inReason) { return static_cast<int>(inReason); }).error(), 0);
	EXPECT_EQ(ReadDigit(0).value_or(3), 3);
	EXPECT_EQ(ReadDigit('4').value_or(3), 4);
	EXPECT_EQ(ReadDigit('4').error_or(Reason::TooLarge), Reason::TooLarge);
	EXPECT_EQ((Expected<std::string, int>("text").transform(&std::string::size)), 4u);
}

TEST(Expected, ThrowsTheReasonWhereTheValueIsDemanded)
{
	EXPECT_EQ(ReadDigit('4').value(), 4);
	try
	{
		ReadDigit(0).value();
		ADD_FAILURE() << "nothing was thrown";
	}
	catch (const BadExpectedAccess<Reason>& error)
	{
		EXPECT_EQ(error.error(), Reason::Empty);
	}
	EXPECT_THROW(ReadDigit(0).value(), BadExpectedAccess<void>);
}

TEST(Expected, OwnsWhatItHolds)
{
	Expected<std::vector<int>, std::string> list(std::in_place, {1, 2, 3});
	auto moved = std::move(list);
	EXPECT_EQ(moved->size(), 3u);
	moved = Unexpected("no list");
	EXPECT_EQ(moved.error(), "no list");
	EXPECT_EQ(moved.emplace(2u, 5).size(), 2u);

	Expected<std::unique_ptr<int>, std::string> pointer(std::make_unique<int>(5));
	EXPECT_EQ(*std::move(pointer).value(), 5);
	std::swap(list, moved);
	EXPECT_EQ(list->front(), 5);
}

TEST(Expected, TellsSuccessWithoutValue)
{
	using Done = Expected<void, Reason>;
	EXPECT_TRUE(Done());
	EXPECT_EQ(Done(unexpect, Reason::Empty).error(), Reason::Empty);
	EXPECT_EQ(Done().transform([] { return 3; }), 3);
	EXPECT_NO_THROW(Done().value());
	EXPECT_THROW(Done(unexpect, Reason::Empty).value(), BadExpectedAccess<Reason>);
	EXPECT_NE(Done(), Done(unexpect, Reason::Empty));
}
