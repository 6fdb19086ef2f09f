#include "TestLocale.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

// The main of every test program.
int main(int inCount, char** inArguments)
{
	if (!zontest::SetTestLocale())
		return 1;
	testing::InitGoogleMock(&inCount, inArguments);
	return RUN_ALL_TESTS();
}
