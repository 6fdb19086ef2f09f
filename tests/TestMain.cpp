#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <locale>

// The main of every test program. ZON_TEST_LOCALE puts the whole run under a locale of that name, for C++ and for the C
// library: no result may depend on it.
int main(int inCount, char** inArguments)
{
	if (const char* const name = std::getenv("ZON_TEST_LOCALE"))
	{
		try
		{
			std::locale::global(std::locale(name));
		}
		catch (const std::exception& error)
		{
			std::fprintf(stderr, "ZON_TEST_LOCALE=%s: no such locale: %s\n", name, error.what());
			return 1;
		}
	}
	testing::InitGoogleMock(&inCount, inArguments);
	return RUN_ALL_TESTS();
}
