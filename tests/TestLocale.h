#pragma once

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <locale>

namespace zontest
{

/// Puts the whole program under the locale that ZON_TEST_LOCALE names, for C++ and for the C library, when it is set: no
/// result may depend on it. False, and a line that says so, when there is no such locale.
inline bool SetTestLocale()
{
	const char* const name = std::getenv("ZON_TEST_LOCALE");
	if (name == nullptr)
		return true;
	try
	{
		std::locale::global(std::locale(name));
		return true;
	}
	catch (const std::exception& error)
	{
		std::fprintf(stderr, "ZON_TEST_LOCALE=%s: no such locale: %s\n", name, error.what());
		return false;
	}
}

}   // namespace zontest
