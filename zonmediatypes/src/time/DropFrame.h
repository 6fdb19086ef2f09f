#pragma once

#include <algorithm>
#include <cstdint>

namespace zonmediatypes
{

/// Drop-frame numbering skips the first labels of every minute that is not a multiple of ten.
struct DropFrameCount
{
	std::uint64_t mNominal;   ///< frame labels per second
	std::uint64_t mDropped;   ///< labels skipped at the start of a short minute; 0 without drop-frame numbering

	constexpr std::uint64_t PerFullMinute() const noexcept { return 60 * mNominal; }
	constexpr std::uint64_t PerShortMinute() const noexcept { return PerFullMinute() - mDropped; }
	constexpr std::uint64_t PerTenMinutes() const noexcept { return PerFullMinute() + 9 * PerShortMinute(); }
	constexpr std::uint64_t PerHour() const noexcept { return 6 * PerTenMinutes(); }
};

static_assert(DropFrameCount{30, 2}.PerTenMinutes() == 17'982 && DropFrameCount{30, 2}.PerHour() == 107'892);
static_assert(DropFrameCount{60, 4}.PerTenMinutes() == 35'964 && DropFrameCount{60, 4}.PerHour() == 215'784);

/// Hours, minutes, seconds and frames.
struct HMSF
{
	std::uint32_t mHours;
	std::uint32_t mMinutes;
	std::uint32_t mSeconds;
	std::uint64_t mFrames;

	friend constexpr bool operator==(const HMSF&, const HMSF&) noexcept = default;
};

/// Splits a frame count of which inSeconds whole seconds of inNominal labels are known; up to 2^32 seconds. Hours wrap at 24.
constexpr HMSF SplitSeconds(std::uint64_t inFrames, std::uint64_t inSeconds, std::uint64_t inNominal) noexcept
{
	// Remainders are made from their quotients: compilers divide again for `%`.
	const auto seconds = static_cast<std::uint32_t>(inSeconds);
	const std::uint32_t minutes = seconds / 60;
	const std::uint32_t hours = minutes / 60;
	return {
		hours < 24 ? hours : hours % 24, minutes - 60 * hours, seconds - 60 * minutes, inFrames - inNominal * seconds};
}

/// Splits a frame count when every second has inNominal labels, at least one.
constexpr HMSF SplitFrames(std::uint64_t inFrames, std::uint64_t inNominal) noexcept
{
	return SplitSeconds(inFrames, inFrames / inNominal, inNominal);
}

/// Splits a frame count into drop-frame labels: puts the dropped ones back, then splits as usual. Hours wrap at 24.
constexpr HMSF SplitDropFrames(std::uint64_t inFrames, DropFrameCount inCount) noexcept
{
	const std::uint64_t tens = inFrames / inCount.PerTenMinutes();
	const std::uint64_t rest = inFrames - inCount.PerTenMinutes() * tens;
	// The first minute is longer by the labels that each other drops: without its first frames all ten are equally long.
	const std::uint64_t shortMinutes   // [0, 9]
		= (std::max(rest, inCount.mDropped) - inCount.mDropped) / inCount.PerShortMinute();
	return SplitFrames(inFrames + inCount.mDropped * (9 * tens + shortMinutes), inCount.mNominal);
}
static_assert(SplitDropFrames(1'800, {30, 2}) == HMSF{0, 1, 0, 2});
static_assert(SplitDropFrames(17'982, {30, 2}) == HMSF{0, 10, 0, 0});

}   // namespace zonmediatypes
