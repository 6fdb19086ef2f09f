#pragma once

/// \file
/// ZONCORE_API marks what zoncore exports: everything else stays hidden in the shared library.

#include "zoncore/Requirements.h"

#if defined(ZONCORE_STATIC)
	#define ZONCORE_API
#elif defined(_WIN32) && defined(ZONCORE_BUILDING)
	#define ZONCORE_API __declspec(dllexport)
#elif defined(_WIN32)
	#define ZONCORE_API __declspec(dllimport)
#else
	#define ZONCORE_API __attribute__((visibility("default")))
#endif
