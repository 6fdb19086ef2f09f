// Sample positions to text and back, beside libavutil's timecode functions on the same frames.

#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

extern "C"
{
#include <libavutil/timecode.h>
}

#include <array>
#include <benchmark/benchmark.h>
#include <string>
#include <vector>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16String;

constexpr std::int32_t kSampleRate = 48'000;
constexpr std::int32_t kFrameRate = 30;
constexpr std::int32_t kFramesPerDay = 24 * 107'892;
constexpr std::size_t kPositions = 1'024;   // a power of two

// Frames all over a day, in an order that no branch predictor knows.
std::array<std::int32_t, kPositions> Frames()
{
	std::array<std::int32_t, kPositions> frames{};
	std::uint32_t frame = 1;
	for (std::int32_t& value : frames)
	{
		frame = frame * 1'664'525 + 1'013'904'223;
		value = static_cast<std::int32_t>(frame % kFramesPerDay);
	}
	return frames;
}

std::int64_t FirstSample(std::int32_t inFrame)
{
	return (std::int64_t{inFrame} * kSampleRate * 1'001 + kFrameRate * 1'000 - 1) / (kFrameRate * 1'000);
}

AVTimecode PeerTimecode(int inFlags)
{
	AVTimecode timecode;
	av_timecode_init(&timecode, {30'000, 1'001}, inFlags, 0, nullptr);
	return timecode;
}

void SamplesToText(benchmark::State& ioState, TimecodeFormat inFormat)
{
	const auto frames = Frames();
	std::vector<std::int64_t> samples;
	for (const std::int32_t frame : frames)
		samples.push_back(FirstSample(frame));
	const BeatInfo beats;
	UTF16String text;
	std::size_t i = 0;
	for (auto _ : ioState)
	{
		ConvertSamplesToTimecode(text, samples[i++ % kPositions], kSampleRate, inFormat, kFrameRate, &beats, false);
		benchmark::DoNotOptimize(text.data());
	}
}
BENCHMARK_CAPTURE(SamplesToText, DropFrame, kTimecodeFormat_TimecodeDropFrame);
BENCHMARK_CAPTURE(SamplesToText, NonDrop, kTimecodeFormat_TimecodeNTSC);
BENCHMARK_CAPTURE(SamplesToText, BarsAndBeats, kTimecodeFormat_BarsAndBeats);

void FramesToTextByFFmpeg(benchmark::State& ioState, int inFlags)
{
	const auto frames = Frames();
	const AVTimecode timecode = PeerTimecode(inFlags);
	char text[AV_TIMECODE_STR_SIZE];
	std::size_t i = 0;
	for (auto _ : ioState)
		benchmark::DoNotOptimize(av_timecode_make_string(&timecode, text, frames[i++ % kPositions]));
}
BENCHMARK_CAPTURE(FramesToTextByFFmpeg, DropFrame, AV_TIMECODE_FLAG_DROPFRAME);
BENCHMARK_CAPTURE(FramesToTextByFFmpeg, NonDrop, 0);

void TextToSamples(benchmark::State& ioState, TimecodeFormat inFormat)
{
	BeatInfo beats;
	std::vector<UTF16String> texts(kPositions);
	const auto frames = Frames();
	for (std::size_t i = 0; i < kPositions; ++i)
		ConvertSamplesToTimecode(texts[i], FirstSample(frames[i]), kSampleRate, inFormat, kFrameRate, &beats, false);
	std::size_t i = 0;
	for (auto _ : ioState)
	{
		std::int64_t samples = 0;
		ConvertTimecodeToSamples(samples, texts[i++ % kPositions], inFormat, kSampleRate, kFrameRate, &beats, false);
		benchmark::DoNotOptimize(samples);
	}
}
BENCHMARK_CAPTURE(TextToSamples, DropFrame, kTimecodeFormat_TimecodeDropFrame);
BENCHMARK_CAPTURE(TextToSamples, NonDrop, kTimecodeFormat_TimecodeNTSC);
BENCHMARK_CAPTURE(TextToSamples, BarsAndBeats, kTimecodeFormat_BarsAndBeats);

void TextToFramesByFFmpeg(benchmark::State& ioState, int inFlags)
{
	const AVTimecode writer = PeerTimecode(inFlags);
	std::vector<std::string> texts;
	for (const std::int32_t frame : Frames())
	{
		char text[AV_TIMECODE_STR_SIZE];
		texts.emplace_back(av_timecode_make_string(&writer, text, frame));
	}
	std::size_t i = 0;
	for (auto _ : ioState)
	{
		AVTimecode timecode;
		av_timecode_init_from_string(&timecode, {30'000, 1'001}, texts[i++ % kPositions].c_str(), nullptr);
		benchmark::DoNotOptimize(timecode.start);
	}
}
BENCHMARK_CAPTURE(TextToFramesByFFmpeg, DropFrame, AV_TIMECODE_FLAG_DROPFRAME);
BENCHMARK_CAPTURE(TextToFramesByFFmpeg, NonDrop, 0);

}   // namespace
