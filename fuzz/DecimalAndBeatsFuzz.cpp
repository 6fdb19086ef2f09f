// Decimal time, milliseconds and beats of the sample clock.

#include "FuzzInput.h"
#include "zoncore/Debug.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <array>
#include <cmath>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16String;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

constexpr std::array kFormats{kTimecodeFormat_Decimal, kTimecodeFormat_Milliseconds, kTimecodeFormat_Beats};

BeatInfo TakeBeats(FuzzInput& ioInput)
{
	return {ioInput.Edge<std::int32_t>(), ioInput.Flag() ? 120 : ioInput.Any<double>(), ioInput.Edge<std::int32_t>(),
		ioInput.Edge<std::int32_t>(), ioInput.Flag() ? 0 : ioInput.Any<double>()};
}

void CheckReading(FuzzInput& ioInput)
{
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	BeatInfo beats = TakeBeats(ioInput);
	const bool hasBeats = ioInput.Flag();
	const UTF16String text = ioInput.Text();
	constexpr std::int64_t kBefore = 0x123456789;
	std::int64_t samples = kBefore;
	const bool isRead
		= ConvertTimecodeToSamples(samples, text, format, sampleRate, 30, hasBeats ? &beats : nullptr, ioInput.Flag());
	if (!isRead)
	{
		Require(format == kTimecodeFormat_Beats && !hasBeats && samples == kBefore, "only missing beats are misuse");
		return;
	}
	Require(!text.empty() || samples == -1, "empty text is no value");
}

void CheckWriting(FuzzInput& ioInput)
{
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const double tempo = ioInput.Flag() ? 120 : ioInput.Any<double>();
	const UTF16String before = zoncore::utility::AsciiToUTF16("before");
	UTF16String text = before;
	ConvertSamplesToDecimalTimecode(text, samples, sampleRate, ioInput.Flag());
	Require(text != before && !text.empty(), "decimal time is always written");
	text = before;
	ConvertSamplesToBeats(text, samples, sampleRate, tempo);
	Require(text != before && !text.empty(), "beats are always written");

	const BeatInfo beats = TakeBeats(ioInput);
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	const bool hasBeats = ioInput.Flag();
	text = before;
	const bool isWritten
		= ConvertSamplesToTimecode(text, samples, sampleRate, format, 30, hasBeats ? &beats : nullptr, ioInput.Flag());
	Require(isWritten == (format != kTimecodeFormat_Beats || hasBeats), "only missing beats are misuse");
	Require(isWritten == (text != before), "text is written whole or not at all");
}

// A position below ten hours is written with milliseconds, and read back within one of them.
void CheckRoundTrip(FuzzInput& ioInput)
{
	constexpr std::int32_t kSampleRate = 48'000;
	const std::int64_t samples = ioInput.Any<std::uint32_t>() % (36'000u * kSampleRate);
	UTF16String text;
	ConvertSamplesToTimecode(text, samples, kSampleRate, kTimecodeFormat_Decimal, 30, nullptr, false);
	std::int64_t again = -1;
	ConvertTimecodeToSamples(again, text, kTimecodeFormat_Decimal, kSampleRate, 30, nullptr, false);
	Require(std::abs(again - samples) <= kSampleRate / 1'000, "decimal time is exact to the millisecond");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	zoncore::debug::SetAssertDialog([](auto&&...) { return false; });
	FuzzInput input(inData, inSize);
	switch (input.Below(3))
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
	}
	return 0;
}
