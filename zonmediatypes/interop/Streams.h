#pragma once

/// \file
/// Text of every value for logs, on `char` streams: what the other headers leave out.
///
///     std::clog << layout << " at " << rect << '\n';    // "L R C LFE Ls Rs at (0, 0, 1920, 1080)"
///
/// This text is English, is not translated, and may change: it is for people who look into a program, not for its users
/// (Descriptions.h) and not for files. Each operator writes one padded text, so that width and fill apply to the whole.
///
/// Labels and other unscoped enumerations are numbers to a stream unless this header is included; then labels are their
/// abbreviations.

#include "zoncore/Flags.h"
#include "zoncore/Geometry.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormat.h"
#include "zonmediatypes/PixelFormatProperties.h"
#include "zonmediatypes/TimeBase.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <concepts>
#include <cstdint>
#include <locale>
#include <ostream>
#include <sstream>
#include <string>

namespace zoncore::utility
{

/// The text as UTF-8.
inline std::ostream& operator<<(std::ostream& inStream, const UTF16String& inText)
{
	return inStream << UTF16to8(inText);
}

}   // namespace zoncore::utility

namespace zoncore::detail
{

/// A number as "0x1b".
inline std::string HexText(std::uint64_t inNumber)
{
	std::array<char, 16> digits{};
	char* const end = std::to_chars(digits.data(), digits.data() + digits.size(), inNumber, 16).ptr;
	return "0x" + std::string(digits.data(), end);
}

/// What inWrite writes to a stream with default settings; half a text is none, so that it throws when memory runs out.
template <class Write>
std::string TextOf(const Write& inWrite)
{
	std::ostringstream stream;
	stream.exceptions(std::ios_base::badbit);
	stream.imbue(std::locale::classic());
	inWrite(stream);
	return stream.str();
}

}   // namespace zoncore::detail

namespace zoncore
{

/// "(1920, 1080)"
template <class T>
std::ostream& operator<<(std::ostream& inStream, const PointT<T>& inPoint)
{
	return inStream << detail::TextOf(
			   [&](std::ostream& outText) { outText << '(' << inPoint.x << ", " << inPoint.y << ')'; });
}

/// Left, top, right, bottom: "(0, 0, 1920, 1080)"
template <class T>
std::ostream& operator<<(std::ostream& inStream, const RectT<T>& inRect)
{
	return inStream << detail::TextOf(
			   [&](std::ostream& outText) {
				   outText << '(' << inRect.left << ", " << inRect.top << ", " << inRect.right << ", " << inRect.bottom
						   << ')';
			   });
}

/// "0x5"
template <std::unsigned_integral T>
std::ostream& operator<<(std::ostream& inStream, Flags<T> inFlags)
{
	return inStream << detail::TextOf(
			   [&](std::ostream& outText) { outText << "0x" << std::hex << +inFlags.GetBits(); });
}

}   // namespace zoncore

namespace zonmediatypes
{

namespace detail
{

inline std::string LabelText(AudioChannelLabel inLabel)
{
	const std::string text = zoncore::utility::UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(inLabel));
	return text.empty() ? "label " + std::to_string(std::int32_t{inLabel}) : text;
}

inline std::string LayoutText(const AudioChannelLayout& inLayout)
{
	std::string text;
	for (const AudioChannelDescription channel : inLayout)
		text.append(text.empty() ? "" : " ").append(LabelText(channel.mLabel));   // g++ 12 warns of "+" here
	return text.empty() ? "no channels" : text;
}

inline std::string ChannelMapText(const ChannelMap& inMap)
{
	std::string text;
	for (std::int32_t entry = 0; entry < static_cast<std::int32_t>(inMap.GetNumberOfChannels()); ++entry)
	{
		const std::string channel = inMap[entry] < 0 ? "none" : std::to_string(inMap[entry]);
		text += (text.empty() ? "" : ", ") + LayoutText(inMap.GetChannelLayout(entry)) + " -> " + channel;
	}
	return text.empty() ? "no entries" : text;
}

inline std::string NameText(PixelFormatName inName)
{
	std::string text;
	for (std::uint32_t rest = inName; rest != 0; rest >>= 8)
		text += static_cast<char>(rest & 0xFF);
	const bool isText
		= text.size() == 4 && std::ranges::all_of(text, [](char inChar) { return inChar >= ' ' && inChar <= '~'; });
	return isText ? text : inName == kPixelFormatFourCC_Any ? "any" : zoncore::detail::HexText(inName);
}

}   // namespace detail

/// The seconds of a unit: "1001/30000 s"; "time base" when they do not fit.
inline std::ostream& operator<<(std::ostream& inStream, TimeBase inTimeBase)
{
	const auto ratio = inTimeBase.ToRatio();
	return inStream << (ratio ? std::to_string(ratio->mNumerator) + '/' + std::to_string(ratio->mDenominator) + " s"
							  : "time base");
}

/// The abbreviation, as in "Ls"; "label 120" for a number that names none.
inline std::ostream& operator<<(std::ostream& inStream, AudioChannelLabel inLabel)
{
	return inStream << detail::LabelText(inLabel);
}
inline std::ostream& operator<<(std::ostream& inStream, AudioChannelDescription inChannel)
{
	return inStream << detail::LabelText(inChannel.mLabel);
}

/// "L R C LFE Ls Rs"; "no channels" for an empty layout.
inline std::ostream& operator<<(std::ostream& inStream, const AudioChannelLayout& inLayout)
{
	return inStream << detail::LayoutText(inLayout);
}

/// The labels of each entry and its channel: "L -> 0, R -> none"; "no entries" for an empty map.
inline std::ostream& operator<<(std::ostream& inStream, const ChannelMap& inMap)
{
	return inStream << detail::ChannelMapText(inMap);
}

/// "48000 Hz, 24 bits, L R"; 0 bits for an invalid sample type.
inline std::ostream& operator<<(std::ostream& inStream, const AudioFormat& inFormat)
{
	// The numbers of the sample types are their bytes times ten.
	return inStream << std::to_string(inFormat.GetSampleRate()) + " Hz, "
		+ std::to_string(std::int64_t{inFormat.GetSampleType()} * 8 / 10) + " bits, "
		+ detail::LayoutText(inFormat.GetChannelLayout());
}

/// The four characters: "bgra"; "any" for the wildcard and a number for what is no text: "0x1".
inline std::ostream& operator<<(std::ostream& inStream, PixelFormatName inName)
{
	return inStream << detail::NameText(inName);
}

/// The value: "0x400c0".
inline std::ostream& operator<<(std::ostream& inStream, PixelFormatProperties inProperties)
{
	return inStream << zoncore::detail::HexText(inProperties.GetValue());
}

namespace utility
{

/// "120 in 4/4, 960 ticks a beat, from 500 ms"
inline std::ostream& operator<<(std::ostream& inStream, const BeatInfo& inInfo)
{
	return inStream << zoncore::detail::TextOf(
			   [&](std::ostream& outText)
			   {
				   outText << inInfo.dTempo << " in " << inInfo.iBeatsPerBar << '/' << inInfo.iBeatValue << ", "
						   << inInfo.iTicksPerBeat << " ticks a beat, from " << inInfo.dOffsetMilliseconds << " ms";
			   });
}

}   // namespace utility

}   // namespace zonmediatypes
