#pragma once

/// \file
/// ZONMEDIATYPES_API marks what zonmediatypes exports: everything else stays hidden in the shared library. Of a class that
/// is marked whole, ZONMEDIATYPES_INTERNAL hides a member that only the library calls.

#include "zoncore/Requirements.h"

#if defined(ZONMEDIATYPES_STATIC)
	#define ZONMEDIATYPES_API
#elif defined(_WIN32) && defined(ZONMEDIATYPES_BUILDING)
	#define ZONMEDIATYPES_API __declspec(dllexport)
#elif defined(_WIN32)
	#define ZONMEDIATYPES_API __declspec(dllimport)
#else
	#define ZONMEDIATYPES_API __attribute__((visibility("default")))
#endif

#if defined(ZONMEDIATYPES_STATIC) || defined(_WIN32)
	#define ZONMEDIATYPES_INTERNAL
#else
	#define ZONMEDIATYPES_INTERNAL __attribute__((visibility("hidden")))
#endif
