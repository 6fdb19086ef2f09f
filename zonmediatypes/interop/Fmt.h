#pragma once

/// \file
/// Formatters for fmt, where its headers are present: the text is that of the `char` stream operators, with fmt's alignment.
///
///     fmt::print("{:>12} at {}\n", layout, rate);    // "         L R at 25"
///
/// Version 9 of fmt or later; without its headers this header is empty. fmt refuses 16-bit text in 8-bit formats: write
/// ToUTF8(text) (Strings.h).

#if __has_include(<fmt/ostream.h>)

	#include "zonmediatypes/AudioChannelLayout.h"
	#include "zonmediatypes/FrameRate.h"
	#include "zonmediatypes/PixelAspectRatio.h"
	#include "zonmediatypes/PixelFormat.h"
	#include "zonmediatypes/PixelFormatProperties.h"
	#include "zonmediatypes/TickTime.h"
	#include "zonmediatypes/interop/Streams.h"

	#include <fmt/ostream.h>

// clang-format off
// Its number would follow the global locale, which the streams of fmt take over.
template <>
struct fmt::formatter<zonmediatypes::TickTime> : fmt::formatter<std::string>
{
	template <class Context>
	auto format(zonmediatypes::TickTime inTime, Context& ioContext) const
	{
		return fmt::formatter<std::string>::format(
			zoncore::detail::TextOf([&](std::ostream& ioStream) { ioStream << inTime; }), ioContext);
	}
};
template <> struct fmt::formatter<zonmediatypes::FrameRate> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::TimeBase> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::AudioChannelLabel> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::AudioChannelDescription> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::AudioChannelLayout> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::ChannelMap> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::AudioFormat> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::PixelFormatName> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::PixelFormatProperties> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::PixelFormat> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::PixelAspectRatio> : fmt::ostream_formatter {};
template <> struct fmt::formatter<zonmediatypes::utility::BeatInfo> : fmt::ostream_formatter {};
template <class T> struct fmt::formatter<zoncore::PointT<T>> : fmt::ostream_formatter {};
template <class T> struct fmt::formatter<zoncore::RectT<T>> : fmt::ostream_formatter {};
template <class T> struct fmt::formatter<zoncore::Flags<T>> : fmt::ostream_formatter {};
// clang-format on

#endif
