// Sample-clock timecode and frame counts: any text, position and rate.

#include "FuzzInput.h"
#include "zoncore/Debug.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <array>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

constexpr std::array kFormats{kTimecodeFormat_Timecode, kTimecodeFormat_TimecodeNTSC, kTimecodeFormat_TimecodeDropFrame,
	kTimecodeFormat_Frames, kTimecodeFormat_FramesDropFrame, kTimecodeFormat_TimecodeSubframes,
	kTimecodeFormat_TimecodeNTSCAlt, kTimecodeFormat_TimecodeDropFrameAlt, kTimecodeFormat_TimecodeNTSCAlt2,
	kTimecodeFormat_Samples, kTimecodeFormat_None};

void CheckReading(FuzzInput& ioInput)
{
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const auto frameRate = ioInput.Edge<std::int32_t>();
	const bool isNTSC = ioInput.Flag(), isDropFrame = ioInput.Flag();
	const UTF16String text = ioInput.Text();
	std::int64_t samples = 1, again = 2, plain = 3;
	Require(
		ConvertTimecodeToSamples(samples, text, format, sampleRate, frameRate, nullptr, false), "no beats are needed");
	Require(ConvertTimecodeToSamples(again, UTF16StringView(text), format, sampleRate, frameRate, nullptr, true),
		"a view is as good");
	Require(samples == again, "a view gives the same, and durations are positions");
	Require(!text.empty() || samples == -1, "empty text is no value");
	Require(format != kTimecodeFormat_None || text.empty() || samples == 0, "no format is zero");
	Require(ConvertTimecodeToSamples(plain, text, sampleRate, frameRate, isNTSC, isDropFrame), "text is never refused");
}

void CheckWriting(FuzzInput& ioInput)
{
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const auto frameRate = ioInput.Edge<std::int32_t>();
	const auto flags = ioInput.Any<std::uint8_t>();
	const UTF16String before = zoncore::utility::AsciiToUTF16("before");
	UTF16String text = before;
	const bool isDropFrame = (flags & 1) != 0, isNTSC = (flags & 2) != 0;
	const bool isWritten = ConvertSamplesToTimecode(text, samples, sampleRate, frameRate, isDropFrame, isNTSC,
		(flags & 4) != 0, (flags & 8) != 0, (flags & 16) != 0, (flags & 32) != 0, (flags & 64) != 0);
	Require(isWritten ? text != before && !text.empty() : text == before, "text is written whole or not at all");
	Require(isWritten || (isDropFrame && isNTSC), "only drop-frame with NTSC is misuse");

	text = before;
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	Require(
		ConvertSamplesToTimecode(text, samples, sampleRate, format, frameRate, nullptr, false), "no beats are needed");
	Require((text == before) == (format == kTimecodeFormat_None), "every format but None is written");
}

// Text that is written for a position reads as a position at which the same text is written.
void CheckRoundTrip(FuzzInput& ioInput)
{
	constexpr std::array kStable{
		kTimecodeFormat_Timecode, kTimecodeFormat_TimecodeNTSC, kTimecodeFormat_TimecodeDropFrame};
	constexpr std::array<std::int32_t, 4> kSampleRates{44'100, 48'000, 96'000, 192'000};
	constexpr std::array<std::int32_t, 5> kFrameRates{24, 25, 30, 50, 60};
	const TimecodeFormat format = ioInput.OneOf(kStable);
	const std::int32_t sampleRate = ioInput.OneOf(kSampleRates);
	const std::int32_t frameRate
		= format == kTimecodeFormat_TimecodeDropFrame ? 30 * (1 + ioInput.Flag()) : ioInput.OneOf(kFrameRates);
	const auto samples = static_cast<std::int64_t>(
		ioInput.Any<std::uint64_t>() % (86'400ull * static_cast<std::uint32_t>(sampleRate)));
	UTF16String text, again;
	ConvertSamplesToTimecode(text, samples, sampleRate, format, frameRate, nullptr, false);
	std::int64_t frameStart = -2;
	ConvertTimecodeToSamples(frameStart, text, format, sampleRate, frameRate, nullptr, false);
	Require(frameStart <= samples, "a frame begins no later than its samples");
	Require(
		samples - frameStart <= sampleRate / frameRate + sampleRate / frameRate / 500 + 1, "a frame is one frame long");
	ConvertSamplesToTimecode(again, frameStart, sampleRate, format, frameRate, nullptr, false);
	Require(again == text, "the first sample of a frame has the frame's text");
}

void CheckSplitting(FuzzInput& ioInput)
{
	const auto frame = ioInput.Edge<std::int64_t>();
	const auto frameRate = ioInput.Edge<std::int32_t>();
	std::uint32_t hours = 0, minutes = 0, seconds = 0, frames = 0;
	const std::int64_t result = DropFrameToHMSF(frame, frameRate, hours, minutes, seconds, frames);
	Require(
		frameRate >= 30 || (hours + minutes + seconds + frames == 0 && result == 0), "slow rates leave all as it is");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	zoncore::debug::SetAssertDialog([](auto&&...) { return false; });
	FuzzInput input(inData, inSize);
	switch (input.Below(4))
	{
	case 0:
		CheckReading(input);
		break;
	case 1:
		CheckWriting(input);
		break;
	case 2:
		CheckRoundTrip(input);
		break;
	case 3:
		CheckSplitting(input);
		break;
	}
	return 0;
}
