// Decimal time, milliseconds and beats of the sample clock.

#include "fuzz/Checks.h"
#include "fuzz/Numbers.h"
#include "fuzz/sampleclock/SampleClockInput.h"

#include <array>
#include <cmath>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16String;
using zonfuzz::FuzzInput;
using zonfuzz::Numbers;
using zonfuzz::ReadNumbers;
using zonfuzz::Require;
using zonfuzz::RequirePositionInBuffers;
using zonfuzz::sBefore;
using zonfuzz::TakeBeats;

constexpr std::array kFormats{kTimecodeFormat_Decimal, kTimecodeFormat_Milliseconds, kTimecodeFormat_Beats};

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
	UTF16String text = sBefore;
	ConvertSamplesToDecimalTimecode(text, samples, sampleRate, ioInput.Flag());
	Require(text != sBefore && !text.empty(), "decimal time is always written");
	text = sBefore;
	ConvertSamplesToBeats(text, samples, sampleRate, tempo);
	Require(text != sBefore && !text.empty(), "beats are always written");

	const BeatInfo beats = TakeBeats(ioInput);
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	const BeatInfo* const given = ioInput.Flag() ? &beats : nullptr;
	const bool isDuration = ioInput.Flag();
	text = sBefore;
	const bool isWritten = ConvertSamplesToTimecode(text, samples, sampleRate, format, 30, given, isDuration);
	Require(isWritten == (format != kTimecodeFormat_Beats || given != nullptr), "only missing beats are misuse");
	Require(isWritten == (text != sBefore), "text is written whole or not at all");
	RequirePositionInBuffers(text, samples, sampleRate, format, 30, given, isDuration);
}

constexpr std::array<std::int32_t, 6> kSampleRates{48'000, 44'100, 22'050, 8'000, 96'000, 192'000};

// A position below ten hours is written with the milliseconds of the sample's middle, and read back within one of them,
// but for its sign.
void CheckRoundTrip(FuzzInput& ioInput)
{
	const std::int64_t any = ioInput.Any<std::uint32_t>();
	const std::int32_t sampleRate = ioInput.OneOf(kSampleRates);
	const bool isNegative = ioInput.Flag();
	const std::int64_t samples = any % (36'000ll * sampleRate);
	UTF16String text;
	ConvertSamplesToTimecode(
		text, isNegative ? -samples : samples, sampleRate, kTimecodeFormat_Decimal, 30, nullptr, false);
	std::int64_t again = -1;
	ConvertTimecodeToSamples(again, text, kTimecodeFormat_Decimal, sampleRate, 30, nullptr, false);
	Require(std::abs(again - samples) <= sampleRate / 1'000, "decimal time is exact to the millisecond");

	const std::int64_t milliseconds = (2 * samples + 1) * 500 / sampleRate, minutes = milliseconds / 60'000;
	Numbers numbers{minutes, milliseconds / 1'000 % 60, milliseconds % 1'000};
	if (minutes >= 60)
		numbers = {minutes / 60, minutes % 60, numbers[1], numbers[2]};
	Require(ReadNumbers(text) == numbers, "the text shows hours, minutes, seconds and milliseconds");
	Require((text.find('-') != UTF16String::npos) == (isNegative && samples > 0), "and the sign");
}

// Quarter notes are written with three decimals, milliseconds with one or as six digits, and read back as exactly.
void CheckCountsRoundTrip(FuzzInput& ioInput)
{
	BeatInfo beats;
	beats.dTempo = 30 + ioInput.Any<std::uint8_t>();
	const std::int64_t any = ioInput.Any<std::uint32_t>();
	const std::int32_t sampleRate = ioInput.OneOf(kSampleRates);
	const std::int64_t samples = any % (36'000ll * sampleRate);
	UTF16String text;
	std::int64_t again = -1;
	ConvertSamplesToTimecode(text, samples, sampleRate, kTimecodeFormat_Beats, 30, &beats, false);
	ConvertTimecodeToSamples(again, text, kTimecodeFormat_Beats, sampleRate, 30, &beats, false);
	const double perBeat = sampleRate * 60 / beats.dTempo;
	Require(std::abs(static_cast<double>(again - samples)) <= perBeat / 1'000 + 1, "beats are exact to the thousandth");
	const Numbers numbers = ReadNumbers(text);
	Require(numbers.size() == 2
			&& std::abs(static_cast<double>(numbers[0] * 1'000 + numbers[1])
				   - static_cast<double>(samples) * 1'000 / perBeat)
				<= 0.51,
		"the text shows the nearest thousandth");

	const std::int64_t few = samples % (99 * sampleRate);   // with tenths; longer texts have fewer digits
	const bool isNegative = ioInput.Flag();
	ConvertSamplesToTimecode(
		text, isNegative ? -few : few, sampleRate, kTimecodeFormat_Milliseconds, 30, nullptr, false);
	ConvertTimecodeToSamples(again, text, kTimecodeFormat_Milliseconds, sampleRate, 30, nullptr, false);
	const int halves = isNegative ? 3 : 1;   // below zero half a tenth is added, too, before what is left is cut off
	Require((std::abs(again - few) - 1) * 20'000 <= halves * sampleRate, "milliseconds are exact to the tenth");
}

// The functions for one format and the one for all agree, and durations are written as positions are.
void CheckEntries(FuzzInput& ioInput)
{
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const BeatInfo beats = TakeBeats(ioInput);
	const bool isDuration = ioInput.Flag();
	UTF16String text, direct;
	ConvertSamplesToTimecode(text, samples, sampleRate, kTimecodeFormat_Decimal, 30, nullptr, isDuration);
	ConvertSamplesToDecimalTimecode(direct, samples, sampleRate, false);
	Require(text == direct, "both writers give the same decimal time");
	UTF16String whole;
	ConvertSamplesToDecimalTimecode(whole, samples, sampleRate, true);
	Require(direct.starts_with(whole), "without its fraction a time is cut short");
	ConvertSamplesToTimecode(text, samples, sampleRate, kTimecodeFormat_Beats, 30, &beats, isDuration);
	ConvertSamplesToBeats(direct, samples, sampleRate, beats.dTempo);
	Require(text == direct, "both writers give the same beats");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf(
		{CheckReading, CheckWriting, CheckRoundTrip, CheckCountsRoundTrip, CheckEntries}, inData, inSize);
}
