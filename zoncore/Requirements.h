#pragma once

/// \file
/// What the compiler and its standard library must be able to do; included before everything else, so that what is missing is
/// one message.

#if defined(_MSVC_LANG) ? _MSVC_LANG < 202002L : __cplusplus < 202002L
	#error "zonmediatypes needs C++20: compile with -std=c++20 or later (Microsoft's compiler: /std:c++20)"
	#include "C++20 or later"   // does not exist, which stops a compiler that goes on after #error
#endif

#include <version>

#if defined(_LIBCPP_VERSION) && _LIBCPP_VERSION < 16'00'00
	#error "zonmediatypes needs libc++ 16 or later: earlier ones lack parts of C++20"
	#include "libc++ 16 or later"
#endif
