#pragma once

/// \file
/// Time as a count of ticks.
///
/// One second is kTicksPerSecond (254,016,000,000) ticks, so one frame of every named video rate and one sample of every
/// named audio rate is a whole number of ticks: frame arithmetic is exact. Negative times lie before zero.
///
///     TickTime cut = kTime_Zero;
///     cut.AddFrames(90, kFrameRate_VideoPAL);    // 914,457,600,000 ticks
///     cut.ToFrame64(kFrameRate_VideoPAL);        // 90
///
/// Arithmetic wraps on overflow and reports nothing; only division by zero is reported.

#include "zoncore/SourcePlace.h"
#include "zoncore/TruncateTo.h"
#include "zoncore/UTF16Char.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"

#include <compare>
#include <concepts>
#include <cstdint>
#include <iosfwd>
#include <limits>
#include <optional>

namespace zonmediatypes
{

/// The integers that do not fit the operators of 32 bits: long, long long, std::size_t and their like.
template <class T>
concept WideInteger = std::integral<T> && sizeof(T) > sizeof(std::int32_t);

class TickTime
{
public:
	/// kTime_Zero.
	constexpr TickTime() noexcept = default;

	explicit constexpr TickTime(std::int64_t inTicks) noexcept : mTicks(inTicks) {}

	/// The time at which frame inFrames begins, exactly; empty when it does not fit, or when the rate is not usable.
	static constexpr std::optional<TickTime> FromFrames(std::int64_t inFrames, FrameRate inRate) noexcept;

	constexpr std::int64_t GetTicks() const noexcept { return mTicks; }

	// ---- Frames ----
	// At a rate that is not usable (FrameRate::IsUsable) counts are 0 and alignments leave the time as it is; AddFrames
	// multiplies whatever the duration is.

	/// Moves the time by inFrames frames, wrapping.
	constexpr void AddFrames(long long inFrames, const FrameRate& inRate) noexcept;

	/// The frame that the time lies in, truncated toward zero: one tick before zero is frame 0, too.
	constexpr std::int64_t ToFrame64(const FrameRate& inRate) const noexcept;

	/// The low 32 bits of ToFrame64.
	constexpr std::int32_t ToFrame32(const FrameRate& inRate) const noexcept;

	/// outRate becomes the rate at which inFrameCount frames fill this time: the duration of one frame truncated toward
	/// zero, negative for a negative time; kFrameRate_Zero for a count of 0 or of more frames than ticks.
	constexpr void CalculateFrameRate(unsigned long long inFrameCount, FrameRate& outRate) const noexcept;

	/// To the frame boundary at or next toward zero. For negative times that is a later one: deliberate.
	constexpr void AlignToFrame(const FrameRate& inRate) noexcept;

	/// To the frame start at or after the time. Negative times follow the same truncating formula, so that at ten ticks a
	/// frame -10 gives 0 and -19 gives -10: deliberate, not a mathematical ceiling.
	constexpr void AlignToFrameCeil(const FrameRate& inRate) noexcept;

	/// To the nearest frame boundary, ties away from zero, then into kTime_Min..kTime_Max. The half of an odd duration is
	/// truncated: at three ticks a frame 1 gives 0 and 2 gives 3.
	constexpr void AlignToNearestFrame(const FrameRate& inRate) noexcept;

	// ---- Scaling ----

	/// By an integer: wrapping. By a double: through double, truncated toward zero; the most negative tick count for what
	/// is NaN or out of range.
	constexpr TickTime& operator*=(double inValue) noexcept;
	constexpr TickTime& operator*=(std::int32_t inValue) noexcept;
	constexpr TickTime& operator*=(std::uint32_t inValue) noexcept;
	constexpr TickTime& operator*=(WideInteger auto inValue) noexcept;
	constexpr TickTime operator*(double inValue) const noexcept { return TickTime(*this) *= inValue; }
	constexpr TickTime operator*(std::int32_t inValue) const noexcept { return TickTime(*this) *= inValue; }
	constexpr TickTime operator*(std::uint32_t inValue) const noexcept { return TickTime(*this) *= inValue; }
	constexpr TickTime operator*(WideInteger auto inValue) const noexcept { return TickTime(*this) *= inValue; }

	/// Truncated toward zero. A divisor of zero violates the contract: it is reported to the contract dialog and then to
	/// the error reporter, which throws zoncore::config::Error unless the host has installed another. When the reporter
	/// returns, a division by 0.0 gives the most negative tick count and an integer division is a divide fault (SIGFPE).
	/// Of these six the operators that leave their operand alone report twice, for themselves and for the one that they apply.
	constexpr TickTime& operator/=(double inValue);
	constexpr TickTime& operator/=(std::int32_t inValue);
	constexpr TickTime& operator/=(std::uint32_t inValue);
	constexpr TickTime operator/(double inValue) const;
	constexpr TickTime operator/(std::int32_t inValue) const;
	constexpr TickTime operator/(std::uint32_t inValue) const;
	constexpr TickTime& operator/=(WideInteger auto inValue);
	constexpr TickTime operator/(WideInteger auto inValue) const { return TickTime(*this) /= inValue; }

	/// The ratio of two times. A zero divisor is reported as above; when the reporter returns, the ratio is infinite or NaN.
	constexpr double operator/(const TickTime& inRHS) const;

	/// What truncated division leaves over, with the sign of this time: t - n * (t / n). By a time, how far this one lies past
	/// the last multiple of it. A zero divisor is reported as above, once; when the reporter returns, it is a divide fault.
	constexpr TickTime& operator%=(std::integral auto inValue);
	constexpr TickTime& operator%=(const TickTime& inRHS);
	constexpr TickTime operator%(std::integral auto inValue) const { return TickTime(*this) %= inValue; }
	constexpr TickTime operator%(const TickTime& inRHS) const { return TickTime(*this) %= inRHS; }

	// ---- Sums ----

	/// All wrap; the negative of the most negative tick count is itself.
	constexpr TickTime operator-() const noexcept { return TickTime(zoncore::utility::WrappingNegate(mTicks)); }
	constexpr TickTime& operator+=(const TickTime& inRHS) noexcept;
	constexpr TickTime& operator-=(const TickTime& inRHS) noexcept;
	constexpr TickTime operator+(const TickTime& inRHS) const noexcept { return TickTime(*this) += inRHS; }
	constexpr TickTime operator-(const TickTime& inRHS) const noexcept { return TickTime(*this) -= inRHS; }

	/// Takes the sign off, in place; the most negative tick count keeps it.
	constexpr TickTime& Abs() noexcept;

	friend constexpr auto operator<=>(const TickTime& inLHS, const TickTime& inRHS) noexcept = default;

private:
	/// Reports the violated contract of the operator inSignature; returns when the error reporter does.
	ZONMEDIATYPES_API static void ReportZeroDivisor(
		const char* inCondition, const char* inSignature, int inLine = zoncore::debug::SourceLine());

	/// Truncated; a divisor of 0 is a divide fault.
	constexpr std::int64_t Quotient(std::integral auto inDivisor) const noexcept;

	std::int64_t mTicks = 0;
};

/// A factor may stand on either side.
constexpr TickTime operator*(double inValue, const TickTime& inTime) noexcept
{
	return inTime * inValue;
}
constexpr TickTime operator*(std::integral auto inValue, const TickTime& inTime) noexcept
{
	return inTime * inValue;
}

inline constexpr TickTime kTime_Zero;
inline constexpr TickTime kTime_Max(360'000 * kTicksPerSecond);   ///< 100 hours: the latest time that clamping gives
inline constexpr TickTime kTime_Min(-kTime_Max);                  ///< the earliest such time
inline constexpr TickTime kTime_Invalid(-400'000 * kTicksPerSecond);   ///< no time; below what clamping gives

/// Writes the time in seconds. On a `char` stream it is inserted as any double is. On a 16-bit stream it has six
/// significant digits ("1.5", "0.333333", "360000") whatever the settings of the stream are, and is padded as any text.
ZONMEDIATYPES_API std::basic_ostream<char>& operator<<(std::basic_ostream<char>& inStream, const TickTime& inTime);
ZONMEDIATYPES_API zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& inStream, const TickTime& inTime);

// ---- Inline implementation: frames -----------------------------------------------------------------------------------

constexpr std::optional<TickTime> TickTime::FromFrames(std::int64_t inFrames, FrameRate inRate) noexcept
{
	if (!inRate.IsUsable())
		return std::nullopt;
	const std::int64_t duration = inRate.GetTicksPerFrame();
	const bool isNegative = (inFrames < 0) != (duration < 0);
	const std::uint64_t mostTicks = zoncore::utility::Magnitude(
		isNegative ? std::numeric_limits<std::int64_t>::min() : std::numeric_limits<std::int64_t>::max());
	if (zoncore::utility::Magnitude(inFrames) > mostTicks / zoncore::utility::Magnitude(duration))
		return std::nullopt;
	return TickTime(zoncore::utility::WrappingMultiply(inFrames, duration));
}

constexpr void TickTime::AddFrames(long long inFrames, const FrameRate& inRate) noexcept
{
	mTicks = zoncore::utility::WrappingAdd(
		mTicks, zoncore::utility::WrappingMultiply<std::int64_t>(inFrames, inRate.GetTicksPerFrame()));
}

constexpr std::int64_t TickTime::ToFrame64(const FrameRate& inRate) const noexcept
{
	return inRate.IsUsable() ? zoncore::utility::WrappingDivide(mTicks, inRate.GetTicksPerFrame()) : 0;
}

constexpr std::int32_t TickTime::ToFrame32(const FrameRate& inRate) const noexcept
{
	return static_cast<std::int32_t>(ToFrame64(inRate));
}

constexpr void TickTime::CalculateFrameRate(unsigned long long inFrameCount, FrameRate& outRate) const noexcept
{
	const auto count = static_cast<std::int64_t>(inFrameCount);
	const std::int64_t duration = count == 0 ? 0 : zoncore::utility::WrappingDivide(mTicks, count);
	outRate = duration == 0 ? kFrameRate_Zero : FrameRate(duration);
}

constexpr void TickTime::AlignToFrame(const FrameRate& inRate) noexcept
{
	if (inRate.IsUsable())
		mTicks -= zoncore::utility::WrappingRemainder(mTicks, inRate.GetTicksPerFrame());
}

constexpr void TickTime::AlignToFrameCeil(const FrameRate& inRate) noexcept
{
	if (!inRate.IsUsable())
		return;
	mTicks = zoncore::utility::WrappingAdd(mTicks, zoncore::utility::WrappingSubtract(inRate.GetTicksPerFrame(), 1));
	AlignToFrame(inRate);
}

constexpr void TickTime::AlignToNearestFrame(const FrameRate& inRate) noexcept
{
	if (!inRate.IsUsable())
		return;
	const TickTime half(inRate.GetTicksPerFrame() / 2);
	*this = mTicks >= 0 ? *this + half : *this - half;
	AlignToFrame(inRate);
	*this = *this < kTime_Min ? kTime_Min : *this > kTime_Max ? kTime_Max : *this;
}

// ---- Inline implementation: scaling ----------------------------------------------------------------------------------

constexpr TickTime& TickTime::operator*=(double inValue) noexcept
{
	mTicks = zoncore::utility::TruncateTo<std::int64_t>(static_cast<double>(mTicks) * inValue);
	return *this;
}

constexpr TickTime& TickTime::operator*=(std::int32_t inValue) noexcept
{
	mTicks = zoncore::utility::WrappingMultiply(mTicks, inValue);
	return *this;
}

constexpr TickTime& TickTime::operator*=(std::uint32_t inValue) noexcept
{
	mTicks = zoncore::utility::WrappingMultiply(mTicks, inValue);
	return *this;
}

constexpr TickTime& TickTime::operator*=(WideInteger auto inValue) noexcept
{
	mTicks = zoncore::utility::WrappingMultiply(mTicks, static_cast<std::int64_t>(inValue));
	return *this;
}

constexpr TickTime& TickTime::operator/=(double inValue)
{
	if (inValue == 0.0)
		ReportZeroDivisor("inValue != 0", "zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(double)");
	mTicks = zoncore::utility::TruncateTo<std::int64_t>(static_cast<double>(mTicks) / inValue);
	return *this;
}

constexpr TickTime& TickTime::operator/=(std::int32_t inValue)
{
	if (inValue == 0)
		ReportZeroDivisor("inValue != 0", "zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(std::int32_t)");
	mTicks = zoncore::utility::WrappingDivide(mTicks, inValue);
	return *this;
}

constexpr TickTime& TickTime::operator/=(std::uint32_t inValue)
{
	if (inValue == 0)
		ReportZeroDivisor(
			"inValue != 0", "zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(std::uint32_t)");
	mTicks = zoncore::utility::WrappingDivide(mTicks, inValue);
	return *this;
}

constexpr TickTime TickTime::operator/(double inValue) const
{
	if (inValue == 0.0)
		ReportZeroDivisor("inValue != 0", "zonmediatypes::TickTime zonmediatypes::TickTime::operator/(double) const");
	return TickTime(*this) /= inValue;
}

constexpr TickTime TickTime::operator/(std::int32_t inValue) const
{
	if (inValue == 0)
		ReportZeroDivisor(
			"inValue != 0", "zonmediatypes::TickTime zonmediatypes::TickTime::operator/(std::int32_t) const");
	return TickTime(*this) /= inValue;
}

constexpr TickTime TickTime::operator/(std::uint32_t inValue) const
{
	if (inValue == 0)
		ReportZeroDivisor(
			"inValue != 0", "zonmediatypes::TickTime zonmediatypes::TickTime::operator/(std::uint32_t) const");
	return TickTime(*this) /= inValue;
}

constexpr TickTime& TickTime::operator/=(WideInteger auto inValue)
{
	if (inValue == 0)
		ReportZeroDivisor("inValue != 0", "zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(WideInteger)");
	mTicks = Quotient(inValue);
	return *this;
}

constexpr double TickTime::operator/(const TickTime& inRHS) const
{
	if (inRHS.mTicks == 0)
		ReportZeroDivisor(
			"inRHS.mTicks != 0", "double zonmediatypes::TickTime::operator/(const zonmediatypes::TickTime &) const");
	return static_cast<double>(mTicks) / static_cast<double>(inRHS.mTicks);
}

constexpr TickTime& TickTime::operator%=(std::integral auto inValue)
{
	if (inValue == 0)
		ReportZeroDivisor(
			"inValue != 0", "zonmediatypes::TickTime &zonmediatypes::TickTime::operator%=(std::integral)");
	const std::int64_t quotient = Quotient(inValue);
	mTicks = zoncore::utility::WrappingSubtract(
		mTicks, zoncore::utility::WrappingMultiply(quotient, static_cast<std::int64_t>(inValue)));
	return *this;
}

constexpr TickTime& TickTime::operator%=(const TickTime& inRHS)
{
	if (inRHS.mTicks == 0)
		ReportZeroDivisor("inRHS.mTicks != 0",
			"zonmediatypes::TickTime &zonmediatypes::TickTime::operator%=(const zonmediatypes::TickTime &)");
	mTicks = zoncore::utility::WrappingRemainder(mTicks, inRHS.mTicks);
	return *this;
}

constexpr std::int64_t TickTime::Quotient(std::integral auto inDivisor) const noexcept
{
	const auto divisor = static_cast<std::int64_t>(inDivisor);
	if (std::signed_integral<decltype(inDivisor)> || divisor >= 0)
		return zoncore::utility::WrappingDivide(mTicks, divisor);
	// The divisor is 2^63 or more: only the most negative tick count holds it, and only once.
	constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();
	return mTicks == kLeast && divisor == kLeast ? -1 : 0;
}

// ---- Inline implementation: sums -------------------------------------------------------------------------------------

constexpr TickTime& TickTime::operator+=(const TickTime& inRHS) noexcept
{
	mTicks = zoncore::utility::WrappingAdd(mTicks, inRHS.mTicks);
	return *this;
}

constexpr TickTime& TickTime::operator-=(const TickTime& inRHS) noexcept
{
	mTicks = zoncore::utility::WrappingSubtract(mTicks, inRHS.mTicks);
	return *this;
}

constexpr TickTime& TickTime::Abs() noexcept
{
	return mTicks < 0 ? *this = -*this : *this;
}

}   // namespace zonmediatypes
