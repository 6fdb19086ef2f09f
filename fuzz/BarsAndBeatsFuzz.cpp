// Bars and beats of any meter and tempo.

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

BeatInfo TakeBeats(FuzzInput& ioInput)
{
	return {ioInput.Edge<std::int32_t>(), ioInput.Flag() ? 120 : ioInput.Any<double>(), ioInput.Edge<std::int32_t>(),
		ioInput.Edge<std::int32_t>(), ioInput.Flag() ? 0 : ioInput.Any<double>()};
}

void CheckReading(FuzzInput& ioInput)
{
	BeatInfo beats = TakeBeats(ioInput);
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const bool isDuration = ioInput.Flag();
	const UTF16String text = ioInput.Text();
	const std::int64_t direct = ConvertBarsAndBeatsToSamples(text, sampleRate, beats, isDuration);
	std::int64_t samples = 0x123456789;
	Require(ConvertTimecodeToSamples(samples, text, kTimecodeFormat_BarsAndBeats, sampleRate, 30, &beats, isDuration),
		"text is never refused");
	Require(samples == (text.empty() ? -1 : direct), "both readers give the same");
	samples = 0x123456789;
	const bool isRead
		= ConvertTimecodeToSamples(samples, text, kTimecodeFormat_BarsAndBeats, sampleRate, 30, nullptr, isDuration);
	Require(isRead ? text.empty() && samples == -1 : samples == 0x123456789, "without beats nothing is read");
}

void CheckWriting(FuzzInput& ioInput)
{
	const BeatInfo beats = TakeBeats(ioInput);
	const double samples = ioInput.Flag() ? ioInput.Any<double>() : static_cast<double>(ioInput.Edge<std::int64_t>());
	const double sampleRate = ioInput.Flag() ? ioInput.Any<double>() : 48'000;
	const bool isDuration = ioInput.Flag();
	const std::int32_t style = ioInput.Any<std::int8_t>();
	const UTF16String before = zoncore::utility::AsciiToUTF16("before");
	UTF16String text = before;
	const bool isWritten = ConvertSamplesToBarsAndBeats(text, samples, sampleRate, beats, isDuration, style);
	Require(isWritten == (beats.iBeatsPerBar != 0), "only a bar without beats is misuse");
	Require(isWritten == (text != before), "text is written whole or not at all");
}

// What a usual meter writes reads back within the tick that was cut off and the sample that is rounded to.
void CheckRoundTrip(FuzzInput& ioInput)
{
	constexpr double kSampleRate = 48'000;
	BeatInfo beats;
	beats.dTempo = 30 + ioInput.Any<std::uint8_t>();
	beats.iBeatsPerBar = 1 + static_cast<std::int32_t>(ioInput.Below(16));
	beats.iBeatValue = 1 << ioInput.Below(5);
	beats.iTicksPerBeat = 1 + ioInput.Any<std::uint16_t>() % 1'920;
	beats.dOffsetMilliseconds = ioInput.Any<std::uint8_t>();
	const bool isDuration = ioInput.Flag();
	const double offset = isDuration ? 0 : beats.dOffsetMilliseconds * kSampleRate / 1'000;
	const double samples = std::ceil(offset) + ioInput.Any<std::uint32_t>();
	UTF16String text;
	ConvertSamplesToBarsAndBeats(text, samples, kSampleRate, beats, isDuration, 2);
	const std::int64_t again = ConvertBarsAndBeatsToSamples(text, kSampleRate, beats, isDuration);
	const double samplesPerTick = kSampleRate * 60 / beats.dTempo * 4 / beats.iBeatValue / beats.iTicksPerBeat;
	Require(
		std::abs(static_cast<double>(again) - samples) <= samplesPerTick + 1, "bars and beats are exact to the tick");
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
