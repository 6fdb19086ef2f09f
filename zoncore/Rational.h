#pragma once

/// \file
/// Boost's fractions, whose exception can be caught across the boundary of a shared library.
///
/// Compare a boost::rational with a boost::rational only: with a bare integer the comparison never returns in C++20 with
/// the supported compilers and Boost.

#include "zoncore/Requirements.h"

// Boost leaves the exception to the compiler's options, which may hide its type. libc++ takes types that are hidden in two
// places for two types. The first declaration decides.
#if defined(_LIBCPP_VERSION) && !defined(_WIN32)
namespace boost
{
class __attribute__((visibility("default"))) bad_rational;
}
#endif

#include <boost/rational.hpp>
