// Sample positions to text and back, beside libavutil's timecode functions on the same frames.

#include "Comparison.h"

#include "zonmediatypes/TimeConversionUtils.h"

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

extern "C"
{
#include <libavutil/timecode.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes::utility;   // NOLINT(google-build-using-namespace)
using zoncore::UTF16Char;
using zoncore::UTF16String;

constexpr std::int32_t kSampleRate = 48'000;
constexpr std::int32_t kFrameRate = 30;
constexpr std::int32_t kFramesPerDay = 24 * 107'892;
constexpr std::size_t kPositions = 1'024;

// Frames all over a day, in an order that no branch predictor knows.
std::vector<std::int32_t> Frames()
{
	std::vector<std::int32_t> frames;
	std::uint32_t frame = 1;
	for (std::size_t i = 0; i < kPositions; ++i)
	{
		frame = frame * 1'664'525 + 1'013'904'223;
		frames.push_back(static_cast<std::int32_t>(frame % kFramesPerDay));
	}
	return frames;
}

std::vector<std::int64_t> Samples()
{
	std::vector<std::int64_t> samples;
	for (const std::int32_t frame : Frames())
		samples.push_back((std::int64_t{frame} * kSampleRate * 1'001 + kFrameRate * 1'000 - 1) / (kFrameRate * 1'000));
	return samples;
}

Work TextOut(TimecodeFormat inFormat)
{
	return ForEach(Samples,
		[inFormat, text = UTF16String()](std::int64_t inSamples) mutable
		{
			const BeatInfo beats;
			ConvertSamplesToTimecode(text, inSamples, kSampleRate, inFormat, kFrameRate, &beats, false);
			return text.data();
		});
}

template <class Char>
Work TextIntoBuffer(TimecodeFormat inFormat)
{
	return ForEach(Samples,
		[inFormat, text = std::array<Char, kLongestPosition>()](std::int64_t inSamples) mutable
		{
			const BeatInfo beats;
			return ConvertSamplesToTimecode(
				std::span(text), inSamples, kSampleRate, inFormat, kFrameRate, &beats, false);
		});
}

Work TextIn(TimecodeFormat inFormat)
{
	return ForEach(
		[inFormat]
		{
			std::vector<UTF16String> texts;
			BeatInfo beats;
			for (const std::int64_t samples : Samples())
				ConvertSamplesToTimecode(
					texts.emplace_back(), samples, kSampleRate, inFormat, kFrameRate, &beats, false);
			return texts;
		},
		[inFormat](const UTF16String& inText)
		{
			BeatInfo beats;
			std::int64_t samples = 0;
			ConvertTimecodeToSamples(samples, inText, inFormat, kSampleRate, kFrameRate, &beats, false);
			return samples;
		});
}

AVTimecode PeerTimecode(int inFlags)
{
	AVTimecode timecode;
	av_timecode_init(&timecode, {30'000, 1'001}, inFlags, 0, nullptr);
	return timecode;
}

Work PeerTextOut(int inFlags)
{
	return ForEach(Frames,
		[timecode = PeerTimecode(inFlags), text = std::array<char, AV_TIMECODE_STR_SIZE>()](int inFrame) mutable
		{ return av_timecode_make_string(&timecode, text.data(), inFrame); });
}

Work PeerTextIn(int inFlags)
{
	return ForEach(
		[inFlags]
		{
			const AVTimecode writer = PeerTimecode(inFlags);
			std::vector<std::string> texts;
			for (const std::int32_t frame : Frames())
			{
				char text[AV_TIMECODE_STR_SIZE];
				texts.emplace_back(av_timecode_make_string(&writer, text, frame));
			}
			return texts;
		},
		[](const std::string& inText)
		{
			AVTimecode timecode;
			av_timecode_init_from_string(&timecode, {30'000, 1'001}, inText.c_str(), nullptr);
			return timecode.start;
		});
}

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Sample clock";
	struct Case
	{
		const char* mName;
		TimecodeFormat mFormat;
		int mPeerFlags;
	};
	constexpr auto kCases = std::to_array<Case>({
		{"drop-frame", kTimecodeFormat_TimecodeDropFrame, AV_TIMECODE_FLAG_DROPFRAME},
		{"non-drop", kTimecodeFormat_TimecodeNTSC, 0},
	});
	for (const Case& row : kCases)
	{
		const std::vector<Peer> out{{"libavutil", PeerTextOut(row.mPeerFlags)}};
		Compare(kArea, std::string(row.mName) + " text into a buffer of char", TextIntoBuffer<char>(row.mFormat), out);
		Compare(kArea, std::string(row.mName) + " text into a buffer of UTF-16", TextIntoBuffer<UTF16Char>(row.mFormat),
			out);
		Compare(kArea, std::string(row.mName) + " text as a string", TextOut(row.mFormat), out);
		Compare(kArea, std::string(row.mName) + " text in", TextIn(row.mFormat),
			{{"libavutil", PeerTextIn(row.mPeerFlags)}});
	}
	for (const auto& [name, format] : std::to_array<std::pair<const char*, TimecodeFormat>>({
			 {"bars and beats", kTimecodeFormat_BarsAndBeats},
			 {"beats", kTimecodeFormat_Beats},
			 {"decimal time", kTimecodeFormat_Decimal},
			 {"milliseconds", kTimecodeFormat_Milliseconds},
			 {"frame count", kTimecodeFormat_Frames},
			 {"timecode with hundredths of a frame", kTimecodeFormat_TimecodeSubframes},
		 }))
	{
		Compare(kArea, name, TextOut(format));
		Compare(kArea, std::string(name) + " into a buffer of char", TextIntoBuffer<char>(format));
		Compare(kArea, std::string(name) + " in", TextIn(format));
	}
	return true;
}();

}   // namespace
}   // namespace benchmarks
