#pragma once

/// \file
/// The names of exact times in seconds. Using such a time takes TimeUtils.h, which defines it.

#include "zoncore/Requirements.h"

namespace boost
{

template <typename IntType>
class rational;

}   // namespace boost

namespace zonmediatypes
{

/// Seconds as a fraction in lowest terms with a positive denominator.
using RatioTime = boost::rational<long long>;

/// The same in 32-bit terms, as older hosts store it.
using LegacyRatioTime = boost::rational<int>;

}   // namespace zonmediatypes
