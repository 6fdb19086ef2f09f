// Bars and beats of any meter and tempo.

#include "fuzz/Checks.h"
#include "fuzz/sampleclock/SampleClockInput.h"

#include <cmath>
#include <string>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16String;
using zonfuzz::FuzzInput;
using zonfuzz::Require;
using zonfuzz::RequirePositionInBuffers;
using zonfuzz::sBefore;
using zonfuzz::TakeBeats;

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
	UTF16String text = sBefore;
	const bool isWritten = ConvertSamplesToBarsAndBeats(text, samples, sampleRate, beats, isDuration, style);
	Require(isWritten == (beats.iBeatsPerBar != 0), "only a bar without beats is misuse");
	Require(isWritten == (text != sBefore), "text is written whole or not at all");
}

// Requires that the text of some numbers, counted from 0, is written half a tick behind their position and read as it.
void RequireNumbers(FuzzInput& ioInput, const BeatInfo& inBeats, double inSampleRate, bool inIsDuration)
{
	const std::int64_t bar = ioInput.Any<std::int16_t>();
	const auto beat = static_cast<std::int32_t>(ioInput.Below(static_cast<std::size_t>(inBeats.iBeatsPerBar)));
	const std::int32_t tick = ioInput.Any<std::uint16_t>() % inBeats.iTicksPerBeat, base = inIsDuration ? 0 : 1;
	const std::string digits = std::to_string(tick);
	const std::size_t mostDigits = std::to_string(inBeats.iTicksPerBeat - 1).size();
	const UTF16String numbers = zoncore::utility::AsciiToUTF16(std::to_string(bar + base) + ":"
		+ std::to_string(beat + base) + "." + std::string(mostDigits - digits.size(), '0') + digits);

	const long double perTick = 240.0L * inSampleRate / inBeats.dTempo / inBeats.iBeatValue / inBeats.iTicksPerBeat;
	const std::int64_t ticks = (bar * inBeats.iBeatsPerBar + beat) * inBeats.iTicksPerBeat + tick;
	const long double offset = inIsDuration ? 0 : inBeats.dOffsetMilliseconds * inSampleRate / 1'000;
	const long double position = offset + static_cast<long double>(ticks) * perTick;
	UTF16String text;
	ConvertSamplesToBarsAndBeats(
		text, static_cast<double>(position + perTick / 2), inSampleRate, inBeats, inIsDuration, 2);
	Require(text == numbers, "a position is written in its numbers");
	const auto read = ConvertBarsAndBeatsToSamples(numbers, inSampleRate, inBeats, inIsDuration);
	const long double distance = std::abs(static_cast<long double>(read) - position);
	Require(distance < (ticks < 0 ? 1.50001L : 0.50001L), "numbers are read as their sample");
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
	const double distance = ioInput.Any<std::uint32_t>();
	const double samples = std::ceil(offset) + (ioInput.Flag() ? -distance : distance);
	UTF16String text;
	ConvertSamplesToBarsAndBeats(text, samples, kSampleRate, beats, isDuration, 2);
	const std::int64_t again = ConvertBarsAndBeatsToSamples(text, kSampleRate, beats, isDuration);
	const double samplesPerTick = kSampleRate * 60 / beats.dTempo * 4 / beats.iBeatValue / beats.iTicksPerBeat;
	Require(
		std::abs(static_cast<double>(again) - samples) <= samplesPerTick + 1, "bars and beats are exact to the tick");
	RequireNumbers(ioInput, beats, kSampleRate, isDuration);
}

// Both writers and both styles of a position agree.
void CheckEntries(FuzzInput& ioInput)
{
	const BeatInfo beats = TakeBeats(ioInput);
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const bool isDuration = ioInput.Flag();
	UTF16String direct = sBefore, text = sBefore;
	const bool isWritten
		= ConvertSamplesToBarsAndBeats(direct, static_cast<double>(samples), sampleRate, beats, isDuration, 2);
	Require(isWritten
			== ConvertSamplesToTimecode(
				text, samples, sampleRate, kTimecodeFormat_BarsAndBeats, 30, &beats, isDuration),
		"both writers take the same");
	Require(text == direct, "both writers give the same");
	RequirePositionInBuffers(text, samples, sampleRate, kTimecodeFormat_BarsAndBeats, 30, &beats, isDuration);
	Require(!ConvertSamplesToTimecode(text, samples, sampleRate, kTimecodeFormat_BarsAndBeats, 30, nullptr, isDuration)
			&& text == direct,
		"without beats nothing is written");
	if (beats.iTicksPerBeat == -1 || !isWritten)
		return;
	for (const std::int32_t style : {1, 0})
	{
		UTF16String shorter;
		ConvertSamplesToBarsAndBeats(shorter, static_cast<double>(samples), sampleRate, beats, isDuration, style);
		Require(text.starts_with(shorter) && shorter.size() < text.size(), "a shorter style is the beginning");
		text = shorter;
	}
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckReading, CheckWriting, CheckRoundTrip, CheckEntries}, inData, inSize);
}
