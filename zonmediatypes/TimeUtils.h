#pragma once

/// \file
/// Time as an exact fraction of seconds, and the repair of times that were stored at a legacy time scale.
///
///     TimeToRatioTime(TickTime(kFrameRate_VideoNTSC.GetTicksPerFrame()));    // 1001/30000
///     RatioTimeToTime({1'001, 30'000});                                      // 8,475,667,200 ticks
///     FrameRateToRatio(kFrameRate_VideoNTSC);                                // 30000/1001
///
/// Compare a boost::rational with a boost::rational only, never with a bare integer: with C++20, g++ 12 and Boost 1.74
/// that comparison never returns.

#include "zoncore/Rational.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/RatioTime.h"
#include "zonmediatypes/TickTime.h"

namespace zonmediatypes
{

/// Exact.
ZONMEDIATYPES_API RatioTime TimeToRatioTime(TickTime inTime);

/// The nearest tick, exact halves rounded up (2.5 ticks give 3, -2.5 give -2). The conversion goes through double: it is
/// exact for frames and samples of the named rates up to kTime_Max, but at 192 kHz for 78 hours only. Other fractions can
/// miss the nearest tick, by one from the first minutes on, by a dozen at 100 hours; TimeBase.h does not. What no
/// tick count holds gives the most negative one.
ZONMEDIATYPES_API TickTime RatioTimeToTime(RatioTime inTime) noexcept;

/// Exact.
ZONMEDIATYPES_API RatioTime LegacyRatioTimeToRatioTime(LegacyRatioTime inTime);

/// Exact when both terms lie in -2147483646..2147483646; else the closest fraction with such terms
/// (zoncore::utility::RationalApproximation).
ZONMEDIATYPES_API LegacyRatioTime RatioTimeToLegacyRatioTime(RatioTime inTime);

/// Whether inTimeScale, in units per second, is a multiple of 2997: times stored at such a scale run 1,000,000/999,999
/// too long. True for 0.
constexpr bool IsLegacyTimeScale(long long inTimeScale) noexcept
{
	return inTimeScale % 2'997 == 0;
}

/// inTime x 999,999/1,000,000 when it was stored at a legacy time scale; else inTime. Throws boost::bad_rational when a
/// term of the exact product does not fit in 64 bits.
ZONMEDIATYPES_API RatioTime CorrectLegacyRatioTimeAtTimeScale(RatioTime inTime, long long inTimeScale);

/// The same for 32-bit terms, never throwing: where the exact product does not fit, the closest fraction.
ZONMEDIATYPES_API LegacyRatioTime CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime inTime, long long inTimeScale);

/// Frames per second as an exact fraction; for kFrameRate_Zero the quotient of the durations, not 0. Throws
/// boost::bad_rational for a duration of 0.
ZONMEDIATYPES_API boost::rational<long long> FrameRateToRatio(const FrameRate& inRate);

}   // namespace zonmediatypes
