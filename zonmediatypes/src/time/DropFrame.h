#pragma once

#include <algorithm>
#include <cstdint>

namespace zonmediatypes
{

/// How many frame labels a second has, and how many of them drop-frame numbering skips at the start of every minute that is
/// not a multiple of ten, a short minute.
struct DropFrameCount
{
	std::uint64_t mNominal;   ///< frame labels per second
	std::uint64_t mDropped;   ///< labels that a short minute skips; 0 without drop-frame numbering

	/// Drop-frame numbering makes up for a second that is 1001/1000 as long with two labels for every thirty.
	static constexpr DropFrameCount Dropping(std::uint64_t inNominal) noexcept
	{
		return {inNominal, inNominal / 30 * 2};
	}

	constexpr std::uint64_t PerFullMinute() const noexcept { return 60 * mNominal; }
	constexpr std::uint64_t PerShortMinute() const noexcept { return PerFullMinute() - mDropped; }
	constexpr std::uint64_t PerTenMinutes() const noexcept { return PerFullMinute() + 9 * PerShortMinute(); }

	/// The label of a frame, counted from zero with the skipped ones: it splits into hours, minutes, seconds and frames as if
	/// none were skipped.
	constexpr std::uint64_t LabelOf(std::uint64_t inFrame) const noexcept
	{
		const std::uint64_t tens = inFrame / PerTenMinutes();
		const std::uint64_t rest = inFrame - PerTenMinutes() * tens;
		// The first minute is longer by what each other one skips: without its first frames all ten are equally long.
		const std::uint64_t shortMinutes = (std::max(rest, mDropped) - mDropped) / PerShortMinute();   // [0, 9]
		return inFrame + mDropped * (9 * tens + shortMinutes);
	}
};
static_assert(DropFrameCount::Dropping(30).PerTenMinutes() == 17'982);
static_assert(DropFrameCount::Dropping(60).PerTenMinutes() == 35'964);
static_assert(DropFrameCount::Dropping(30).LabelOf(1'799) == 1'799);
static_assert(DropFrameCount::Dropping(30).LabelOf(1'800) == 1'802);
static_assert(DropFrameCount::Dropping(30).LabelOf(17'982) == 18'000);

}   // namespace zonmediatypes
