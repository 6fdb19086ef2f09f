#pragma once

/// \file
/// Frame rates and sample rates, as the duration of one frame or sample in ticks.
///
/// One second is 254,016,000,000 ticks, so one frame of every rate named here is a whole number of ticks. A larger
/// duration is a slower rate. Multiplying and dividing scale the rate, and so act inversely on the duration:
///
///     kFrameRate_VideoNTSC * 2;      // kFrameRate_VideoNTSC_HD
///     kFrameRate_VideoPAL_HD / 2;    // kFrameRate_VideoPAL

#include "zoncore/TruncateTo.h"
#include "zoncore/UTF16Char.h"
#include "zoncore/WrappingArithmetic.h"
#include "zonmediatypes/Export.h"

#include <array>
#include <cstdint>
#include <iosfwd>
#include <limits>
#include <span>

namespace zonmediatypes
{

/// The unit of all media time: ticks in one second, 2^12 · 3^4 · 5^6 · 7^2.
inline constexpr std::int64_t kTicksPerSecond = 254'016'000'000;

class FrameRate
{
public:
	/// kFrameRate_Zero: no rate at all.
	constexpr FrameRate() noexcept = default;

	/// The rate whose frames last inTicksPerFrame ticks each. Any number is accepted; see IsUsable().
	explicit constexpr FrameRate(std::int64_t inTicksPerFrame) noexcept : mTicksPerFrame(inTicksPerFrame) {}

	constexpr std::int64_t GetTicksPerFrame() const noexcept { return mTicksPerFrame; }

	/// False for a duration of 0 and for that of kFrameRate_Zero, which give neutral results wherever frames are counted.
	/// Negative durations count as usable: the formulas are carried out as they stand.
	constexpr bool IsUsable() const noexcept { return mTicksPerFrame != 0 && mTicksPerFrame != kNoRate; }

	/// The rate becomes inValue times faster: the duration is divided by inValue. An integer division truncates toward zero
	/// and has no check: 0 is a divide fault. A division by a double truncates toward zero, too; it gives the most negative
	/// duration for a quotient that is infinite, NaN or out of range.
	constexpr FrameRate& operator*=(int inValue) noexcept;
	constexpr FrameRate& operator*=(double inValue) noexcept;
	constexpr FrameRate operator*(int inValue) const noexcept { return FrameRate(*this) *= inValue; }
	constexpr FrameRate operator*(double inValue) const noexcept { return FrameRate(*this) *= inValue; }

	/// The rate becomes inValue times slower: the duration is multiplied by inValue, wrapping for an integer; for a double
	/// truncated toward zero, and the most negative duration for a product that is NaN or out of range. 24, 30 and 60 fps
	/// divided by 1.001 are one tick short of kFrameRate_23976, kFrameRate_VideoNTSC and kFrameRate_VideoNTSC_HD, because
	/// the product of doubles is just below a whole number: use the constants where a rate must be exact.
	constexpr FrameRate& operator/=(int inValue) noexcept;
	constexpr FrameRate& operator/=(double inValue) noexcept;
	constexpr FrameRate operator/(int inValue) const noexcept { return FrameRate(*this) /= inValue; }
	constexpr FrameRate operator/(double inValue) const noexcept { return FrameRate(*this) /= inValue; }

	friend constexpr bool operator==(FrameRate inLHS, FrameRate inRHS) noexcept = default;

private:
	static constexpr std::int64_t kNoRate = std::numeric_limits<std::int64_t>::max();

	std::int64_t mTicksPerFrame = kNoRate;
};

/// The rate of inFrames frames every inSeconds seconds. Does not compile when one frame is not a whole number of ticks.
///
/// A rate whose terms a file states is FrameRate(kTicksPerSecond * seconds / frames), exact where that division leaves no
/// remainder; TimeBase::FromRatio(seconds, frames) of TimeBase.h checks and rounds for any two terms. A rate that
/// is stated as a decimal number, such as 29.97, stands for the nearest of AllFrameRates().
consteval FrameRate FramesPerSecond(std::int64_t inFrames, std::int64_t inSeconds = 1)
{
	if (kTicksPerSecond * inSeconds % inFrames != 0)
		throw "this rate has no exact duration in ticks";
	return FrameRate(kTicksPerSecond * inSeconds / inFrames);
}

// ---- Named rates -----------------------------------------------------------------------------------------------------

namespace detail
{

struct NamedRate
{
	std::int64_t mFrames;
	std::int64_t mSeconds = 1;
	unsigned mDecimals = 2;   ///< in its text, at most
};

// clang-format off
/// The list of them, from which AllFrameRates() comes, too.
inline constexpr auto kNamedRates = std::to_array<NamedRate>({
	{10}, {12}, {25, 2}, {15}, {24'000, 1'001, 3}, {24}, {25}, {30'000, 1'001}, {30}, {48}, {50}, {60'000, 1'001}, {60},
	{100}, {1'000},
	{8'000}, {11'025}, {22'050}, {32'000}, {44'100}, {48'000}, {88'200}, {96'000}, {192'000},
});
// clang-format on

/// A rate of the list. Does not compile for another, so that the list has every rate that is named here.
consteval FrameRate Named(std::int64_t inFrames, std::int64_t inSeconds = 1)
{
	for (const NamedRate& row : kNamedRates)
	{
		if (row.mFrames == inFrames && row.mSeconds == inSeconds)
			return FramesPerSecond(inFrames, inSeconds);
	}
	throw "this rate is not in the list of named rates";
}

}   // namespace detail

// clang-format off
inline constexpr FrameRate kFrameRate_Video10      = detail::Named(10);
inline constexpr FrameRate kFrameRate_Video12      = detail::Named(12);
inline constexpr FrameRate kFrameRate_Video12_5    = detail::Named(25, 2);
inline constexpr FrameRate kFrameRate_Video15      = detail::Named(15);
inline constexpr FrameRate kFrameRate_23976        = detail::Named(24'000, 1'001);
inline constexpr FrameRate kFrameRate_Film24       = detail::Named(24);
inline constexpr FrameRate kFrameRate_VideoPAL     = detail::Named(25);
inline constexpr FrameRate kFrameRate_VideoNTSC    = detail::Named(30'000, 1'001);
inline constexpr FrameRate kFrameRate_Video30      = detail::Named(30);
inline constexpr FrameRate kFrameRate_Film48       = detail::Named(48);
inline constexpr FrameRate kFrameRate_VideoPAL_HD  = detail::Named(50);
inline constexpr FrameRate kFrameRate_VideoNTSC_HD = detail::Named(60'000, 1'001);
inline constexpr FrameRate kFrameRate_Video60      = detail::Named(60);
inline constexpr FrameRate kFrameRate_Video100     = detail::Named(100);
inline constexpr FrameRate kFrameRate_Video1000    = detail::Named(1'000);      ///< one frame is one millisecond
inline constexpr FrameRate kFrameRate_Audio8000    = detail::Named(8'000);      ///< the slowest audio rate: slower ones are video
inline constexpr FrameRate kFrameRate_Audio11025   = detail::Named(11'025);
inline constexpr FrameRate kFrameRate_Audio22050   = detail::Named(22'050);
inline constexpr FrameRate kFrameRate_Audio32000   = detail::Named(32'000);
inline constexpr FrameRate kFrameRate_Audio44100   = detail::Named(44'100);
inline constexpr FrameRate kFrameRate_Audio48000   = detail::Named(48'000);
inline constexpr FrameRate kFrameRate_Audio88200   = detail::Named(88'200);
inline constexpr FrameRate kFrameRate_Audio96000   = detail::Named(96'000);
inline constexpr FrameRate kFrameRate_Audio192000  = detail::Named(192'000);
inline constexpr FrameRate kFrameRate_Zero;                                     ///< no rate: one frame lasts for ever
// clang-format on

/// All named rates in the order above, kFrameRate_Zero last.
ZONMEDIATYPES_API std::span<const FrameRate> AllFrameRates() noexcept;

// ---- Functions -------------------------------------------------------------------------------------------------------

/// How many times faster inA is than inB. 0.0 when inA's duration is 0; a very large number, not 0, when inB is
/// kFrameRate_Zero.
constexpr double GetFrameRateRatio(const FrameRate& inA, const FrameRate& inB) noexcept;

/// Orders rates by frames a second, slower ones first, exactly; for sorting, maps and look-up. kFrameRate_Zero stands between
/// negative and positive rates, and a duration of 0, which is infinitely fast, last.
struct FewerFramesPerSecond
{
	constexpr bool operator()(FrameRate inLHS, FrameRate inRHS) const noexcept;
};

/// Writes the rate in frames or samples per second with at most two decimals, kFrameRate_23976 with three: "25", "12.5",
/// "29.97", "23.976"; kFrameRate_Zero is "0", a duration of 0 "inf". The text is padded as any text; the other settings of
/// the stream have no effect.
ZONMEDIATYPES_API std::basic_ostream<char>& operator<<(std::basic_ostream<char>& inStream, FrameRate inRate);
ZONMEDIATYPES_API zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& inStream, FrameRate inRate);
#if ZONCORE_HAS_BYTE_STREAMS
ZONMEDIATYPES_API std::basic_ostream<unsigned char>& operator<<(
	std::basic_ostream<unsigned char>& inStream, FrameRate inRate);
#endif

// ---- Inline implementation -------------------------------------------------------------------------------------------

constexpr FrameRate& FrameRate::operator*=(int inValue) noexcept
{
	mTicksPerFrame = zoncore::utility::WrappingDivide(mTicksPerFrame, inValue);
	return *this;
}

constexpr FrameRate& FrameRate::operator*=(double inValue) noexcept
{
	mTicksPerFrame = zoncore::utility::TruncateTo<std::int64_t>(static_cast<double>(mTicksPerFrame) / inValue);
	return *this;
}

constexpr FrameRate& FrameRate::operator/=(int inValue) noexcept
{
	mTicksPerFrame = zoncore::utility::WrappingMultiply(mTicksPerFrame, inValue);
	return *this;
}

constexpr FrameRate& FrameRate::operator/=(double inValue) noexcept
{
	mTicksPerFrame = zoncore::utility::TruncateTo<std::int64_t>(static_cast<double>(mTicksPerFrame) * inValue);
	return *this;
}

constexpr double GetFrameRateRatio(const FrameRate& inA, const FrameRate& inB) noexcept
{
	if (inA.GetTicksPerFrame() == 0)
		return 0.0;
	return static_cast<double>(inB.GetTicksPerFrame()) / static_cast<double>(inA.GetTicksPerFrame());
}

constexpr bool FewerFramesPerSecond::operator()(FrameRate inLHS, FrameRate inRHS) const noexcept
{
	// Longer durations are slower. As unsigned numbers the negative ones come before all others, -1 first, and 0 last.
	return static_cast<std::uint64_t>(inLHS.GetTicksPerFrame()) > static_cast<std::uint64_t>(inRHS.GetTicksPerFrame());
}

}   // namespace zonmediatypes
