#include "Library.h"

static_assert(__cplusplus == 202002L);

zoncore::Expected<std::string, int> NameOf(int inNumber)
{
	if (inNumber != 1)
		return zoncore::Unexpected(inNumber);
	return "the one that has a name of its own";
}

int LengthOf(const zoncore::Expected<std::string, int>& inName)
{
	return inName ? static_cast<int>(inName->size()) : inName.error();
}
