#pragma once

/// \file
/// std::hash for the value types whose equality is exact, so that they can be keys of unordered containers:
///
///     std::unordered_map<AudioChannelLayout, Mixer> mixers;
///
/// Pixel aspect ratios have none: their equality is tolerant and not transitive.
///
/// Every bit of a value reaches every bit of its hash, so tables of a power of two are served well, too. Hashes are those of
/// one run of a program: they are not meant to be stored.

#include "zoncore/Flags.h"
#include "zoncore/Geometry.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/PixelFormat.h"
#include "zonmediatypes/PixelFormatProperties.h"
#include "zonmediatypes/TickTime.h"

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>

namespace zonmediatypes::detail
{

// The finalizer of MurmurHash3, a bijection that spreads every bit over all 64.
constexpr std::uint64_t Spread(std::uint64_t inBits) noexcept
{
	std::uint64_t bits = inBits;
	bits = (bits ^ bits >> 33) * 0xFF51AFD7ED558CCD;
	bits = (bits ^ bits >> 33) * 0xC4CEB9FE1A85EC53;
	return bits ^ bits >> 33;
}

constexpr std::uint64_t AddToHash(std::uint64_t inHash, std::uint64_t inBits) noexcept
{
	return Spread(inHash + 0x9E3779B97F4A7C15 + inBits);   // the golden ratio: zeros in a row must not stay zero
}

/// The hash of integers and enumerations in their order.
template <class... Values>
constexpr std::size_t HashOf(Values... inValues) noexcept
{
	std::uint64_t hash = 0;
	((hash = AddToHash(hash, static_cast<std::uint64_t>(inValues))), ...);
	return static_cast<std::size_t>(hash);
}

}   // namespace zonmediatypes::detail

template <>
struct std::hash<zonmediatypes::TickTime>
{
	std::size_t operator()(zonmediatypes::TickTime inTime) const noexcept
	{
		return zonmediatypes::detail::HashOf(inTime.GetTicks());
	}
};

template <>
struct std::hash<zonmediatypes::FrameRate>
{
	std::size_t operator()(zonmediatypes::FrameRate inRate) const noexcept
	{
		return zonmediatypes::detail::HashOf(inRate.GetTicksPerFrame());
	}
};

template <>
struct std::hash<zonmediatypes::AudioChannelDescription>
{
	std::size_t operator()(zonmediatypes::AudioChannelDescription inChannel) const noexcept
	{
		return zonmediatypes::detail::HashOf(inChannel.mLabel);
	}
};

template <>
struct std::hash<zonmediatypes::AudioChannelLayout>
{
	std::size_t operator()(const zonmediatypes::AudioChannelLayout& inLayout) const noexcept
	{
		std::uint64_t sum = inLayout.size();
		for (const zonmediatypes::AudioChannelDescription channel : inLayout)
			sum = zonmediatypes::detail::AddToHash(sum, static_cast<std::uint64_t>(channel.mLabel));
		return static_cast<std::size_t>(sum);
	}
};

template <>
struct std::hash<zonmediatypes::PixelFormatProperties>
{
	std::size_t operator()(zonmediatypes::PixelFormatProperties inProperties) const noexcept
	{
		return zonmediatypes::detail::HashOf(inProperties.GetValue());
	}
};

template <>
struct std::hash<zonmediatypes::PixelFormat>
{
	std::size_t operator()(zonmediatypes::PixelFormat inFormat) const noexcept
	{
		return zonmediatypes::detail::HashOf(inFormat.mName, inFormat.mProperties.GetValue());
	}
};

template <std::unsigned_integral T>
struct std::hash<zoncore::Flags<T>>
{
	std::size_t operator()(zoncore::Flags<T> inFlags) const noexcept
	{
		return zonmediatypes::detail::HashOf(inFlags.GetBits());
	}
};

template <std::integral T>
struct std::hash<zoncore::PointT<T>>
{
	std::size_t operator()(const zoncore::PointT<T>& inPoint) const noexcept
	{
		return zonmediatypes::detail::HashOf(inPoint.x, inPoint.y);
	}
};

template <std::integral T>
struct std::hash<zoncore::RectT<T>>
{
	std::size_t operator()(const zoncore::RectT<T>& inRect) const noexcept
	{
		return zonmediatypes::detail::HashOf(inRect.left, inRect.top, inRect.right, inRect.bottom);
	}
};

/// As the standard library hashes the bytes of a text.
template <>
struct std::hash<zoncore::UTF16String>
{
	std::size_t operator()(const zoncore::UTF16String& inText) const noexcept
	{
		// NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): every object may be read as bytes
		const auto* const bytes = reinterpret_cast<const char*>(inText.data());
		return std::hash<std::string_view>()({bytes, inText.size() * sizeof(zoncore::UTF16Char)});
	}
};
