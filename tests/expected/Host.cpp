// A host that is built as C++23 takes what a library of C++20 hands out, and hands it back.
#include "Library.h"

#include <expected>

static_assert(__cplusplus > 202002L);

int main()
{
	using Standard = std::expected<std::string, int>;
	const Standard name = NameOf(1);
	const Standard none = NameOf(7);
	const bool isEqual = name.has_value() && name->size() == static_cast<std::size_t>(LengthOf(NameOf(1)))
		&& !none.has_value() && none.error() == 7;
	const bool returns = LengthOf(name) == LengthOf(NameOf(1)) && LengthOf(none) == 7
		&& LengthOf(NameOf(2).or_else([](int inNumber) { return NameOf(inNumber - 1); })) == LengthOf(NameOf(1));
	return isEqual && returns ? 0 : 1;
}
