#pragma once

/// \file
/// ZONMEDIATYPES_API marks what zonmediatypes exports: everything else stays hidden in the shared library.

#if defined(ZONMEDIATYPES_STATIC)
	#define ZONMEDIATYPES_API
#elif defined(_WIN32) && defined(ZONMEDIATYPES_BUILDING)
	#define ZONMEDIATYPES_API __declspec(dllexport)
#elif defined(_WIN32)
	#define ZONMEDIATYPES_API __declspec(dllimport)
#else
	#define ZONMEDIATYPES_API __attribute__((visibility("default")))
#endif
