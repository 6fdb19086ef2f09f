#pragma once

#include <cstdint>

namespace zonmediatypes
{

/// Drop-frame numbering skips the first labels of every minute that is not a multiple of ten, so that labels at a whole
/// nominal rate keep up with a clock at 1000/1001 of it (SMPTE ST 12-1).
struct DropFrameCount
{
	std::uint64_t mNominal;   ///< frame labels per second
	std::uint64_t mDropped;   ///< labels skipped at the start of a short minute

	constexpr std::uint64_t PerFullMinute() const noexcept { return 60 * mNominal; }
	constexpr std::uint64_t PerShortMinute() const noexcept { return PerFullMinute() - mDropped; }
	constexpr std::uint64_t PerTenMinutes() const noexcept { return PerFullMinute() + 9 * PerShortMinute(); }
	constexpr std::uint64_t PerHour() const noexcept { return 6 * PerTenMinutes(); }
};

inline constexpr DropFrameCount kDropFrame_2997{30, 2};
inline constexpr DropFrameCount kDropFrame_5994{60, 4};
static_assert(kDropFrame_2997.PerFullMinute() == 1'800 && kDropFrame_2997.PerShortMinute() == 1'798);
static_assert(kDropFrame_2997.PerTenMinutes() == 17'982 && kDropFrame_2997.PerHour() == 107'892);
static_assert(kDropFrame_5994.PerTenMinutes() == 35'964 && kDropFrame_5994.PerHour() == 215'784);

}   // namespace zonmediatypes
