// Sample-clock timecode and frame counts: any text, position and rate.

#include "fuzz/Checks.h"
#include "fuzz/Numbers.h"
#include "fuzz/sampleclock/SampleClockInput.h"
#include "zoncore/NumberConversion.h"

#include <algorithm>
#include <array>
#include <cstdlib>

namespace
{

using namespace zonmediatypes::utility;
using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zonfuzz::FuzzInput;
using zonfuzz::Numbers;
using zonfuzz::ReadNumbers;
using zonfuzz::Require;
using zonfuzz::RequirePositionInBuffers;
using zonfuzz::sBefore;

constexpr std::array kFormats{kTimecodeFormat_Timecode, kTimecodeFormat_TimecodeNTSC, kTimecodeFormat_TimecodeDropFrame,
	kTimecodeFormat_Frames, kTimecodeFormat_FramesDropFrame, kTimecodeFormat_TimecodeSubframes,
	kTimecodeFormat_TimecodeNTSCAlt, kTimecodeFormat_TimecodeDropFrameAlt, kTimecodeFormat_TimecodeNTSCAlt2,
	kTimecodeFormat_Samples, kTimecodeFormat_None, TimecodeFormat(15), TimecodeFormat(0xFFFFFFFF)};

// None and numbers that name no format have no text.
constexpr bool HasText(TimecodeFormat inFormat)
{
	return inFormat != kTimecodeFormat_None && inFormat < 15;
}

// The formats of timecode and frame counts by what they stand for.
struct FormatMeaning
{
	TimecodeFormat mFormat;
	bool mIsDropFrame = false, mIsNTSC = false, mIsCount = false, mHasSubframes = false;
};

constexpr std::array kMeanings{FormatMeaning{.mFormat = kTimecodeFormat_Timecode},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeNTSC, .mIsNTSC = true},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeNTSCAlt, .mIsNTSC = true},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeNTSCAlt2, .mIsNTSC = true},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeDropFrame, .mIsDropFrame = true},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeDropFrameAlt, .mIsDropFrame = true},
	FormatMeaning{.mFormat = kTimecodeFormat_Frames, .mIsCount = true},
	FormatMeaning{.mFormat = kTimecodeFormat_FramesDropFrame, .mIsDropFrame = true, .mIsCount = true},
	FormatMeaning{.mFormat = kTimecodeFormat_TimecodeSubframes, .mHasSubframes = true}};

struct Labels
{
	std::int64_t mHours, mMinutes, mSeconds, mFrames;

	std::int64_t Minutes() const { return mHours * 60 + mMinutes; }
};

// The frame that labels stand for at a nominal rate; drop-frame numbering has two labels at 30 frames a second less in
// every minute but the tenth.
std::int64_t CountFrames(const Labels& inLabels, std::int64_t inFrameRate, bool inIsDropFrame)
{
	const std::int64_t minutes = inLabels.Minutes();
	const std::int64_t frames = (minutes * 60 + inLabels.mSeconds) * inFrameRate + inLabels.mFrames;
	return inIsDropFrame ? frames - inFrameRate / 15 * (minutes - minutes / 10) : frames;
}

bool IsDropped(const Labels& inLabels, std::int64_t inFrameRate)
{
	return inLabels.mMinutes % 10 != 0 && inLabels.mSeconds == 0 && inLabels.mFrames < inFrameRate / 15;
}

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
	const UTF16String longer = text + UTF16String{'7', ':', '7'};
	Require(ConvertTimecodeToSamples(
				again, UTF16StringView(longer).substr(0, text.size()), format, sampleRate, frameRate, nullptr, true),
		"a view is as good");
	Require(samples == again, "a view gives the same, and durations are positions");
	Require(!text.empty() || samples == -1, "empty text is no value");
	Require(HasText(format) || text.empty() || samples == 0, "no format is zero");
	Require(ConvertTimecodeToSamples(plain, text, sampleRate, frameRate, isNTSC, isDropFrame), "text is never refused");
}

void CheckWriting(FuzzInput& ioInput)
{
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const auto frameRate = ioInput.Edge<std::int32_t>();
	const auto flags = ioInput.Any<std::uint8_t>();
	UTF16String text = sBefore;
	const bool isDropFrame = (flags & 1) != 0, isNTSC = (flags & 2) != 0;
	const bool isWritten = ConvertSamplesToTimecode(text, samples, sampleRate, frameRate, isDropFrame, isNTSC,
		(flags & 4) != 0, (flags & 8) != 0, (flags & 16) != 0, (flags & 32) != 0, (flags & 64) != 0);
	Require(isWritten ? text != sBefore && !text.empty() : text == sBefore, "text is written whole or not at all");
	Require(isWritten || (isDropFrame && isNTSC), "only drop-frame with NTSC is misuse");

	text = sBefore;
	const TimecodeFormat format = ioInput.OneOf(kFormats);
	Require(
		ConvertSamplesToTimecode(text, samples, sampleRate, format, frameRate, nullptr, false), "no beats are needed");
	Require((text == sBefore) != HasText(format), "every format that has a text is written");
	RequirePositionInBuffers(text, samples, sampleRate, format, frameRate, nullptr, false);
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
	if (frameRate < 30)
		return Require(hours + minutes + seconds + frames == 0 && result == 0, "slow rates leave all as it is");
	Require(minutes < 60 && seconds < 60 && frames < static_cast<std::uint32_t>(frameRate), "labels are in range");
	Require(result == seconds, "the seconds are returned");
	const auto isBelow = [](std::int64_t inValue, std::int64_t inEnd) { return inValue > -inEnd && inValue < inEnd; };
	if (isBelow(frame, 1ll << 61) && isBelow(frame / frameRate, 1ll << 40))   // hours do not wrap
		Require(CountFrames({hours, minutes, seconds, frames}, frameRate / 30 * 30, true) == std::abs(frame),
			"labels stand for the frame");
}

// Every format does as the flags that it stands for.
void CheckEntries(FuzzInput& ioInput)
{
	const FormatMeaning meaning = ioInput.OneOf(kMeanings);
	const auto samples = ioInput.Edge<std::int64_t>();
	const auto sampleRate = ioInput.Edge<std::int32_t>();
	const auto frameRate = ioInput.Edge<std::int32_t>();
	UTF16String text, direct;
	ConvertSamplesToTimecode(text, samples, sampleRate, meaning.mFormat, frameRate, nullptr, false);
	ConvertSamplesToTimecode(direct, samples, sampleRate, frameRate, meaning.mIsDropFrame, meaning.mIsNTSC,
		meaning.mIsCount, false, meaning.mHasSubframes, meaning.mHasSubframes, false);
	Require(text == direct, "both writers give the same");

	const UTF16String typed = ioInput.Flag() ? text : ioInput.Text();
	std::int64_t position = 1, directPosition = 2;
	ConvertTimecodeToSamples(position, typed, meaning.mFormat, sampleRate, frameRate, nullptr, false);
	ConvertTimecodeToSamples(
		directPosition, typed, sampleRate, frameRate, meaning.mIsNTSC || meaning.mIsDropFrame, meaning.mIsDropFrame);
	Require(position == directPosition, "both readers give the same");
}

// The labels of a text stand for the frame in which the position lies.
void CheckLabels(FuzzInput& ioInput)
{
	const FormatMeaning meaning = ioInput.OneOf(kMeanings);
	const std::int64_t sampleRate = 1 + ioInput.Any<std::uint32_t>() % 768'000;
	const std::int64_t frameRate = meaning.mIsDropFrame ? 30 * (1 + static_cast<std::int64_t>(ioInput.Below(4)))
														: 1 + ioInput.Any<std::uint8_t>();
	const auto samples = static_cast<std::int64_t>(ioInput.Any<std::uint64_t>() % (1ull << 40));
	UTF16String text;
	ConvertSamplesToTimecode(text, samples, static_cast<std::int32_t>(sampleRate), meaning.mFormat,
		static_cast<std::int32_t>(frameRate), nullptr, false);
	UTF16String negative;
	ConvertSamplesToTimecode(negative, -samples, static_cast<std::int32_t>(sampleRate), meaning.mFormat,
		static_cast<std::int32_t>(frameRate), nullptr, false);
	const bool hasSign = samples > 0 && !meaning.mIsCount;
	Require(negative == (hasSign ? UTF16Char{'-'} + text : text), "a negative position is one with a sign in front");
	const bool isScaled = meaning.mIsDropFrame || meaning.mIsNTSC;
	const std::int64_t numerator = frameRate * (isScaled ? 1'000 : 1),
					   denominator = sampleRate * (isScaled ? 1'001 : 1);
	const std::int64_t frame = samples * numerator / denominator;

	if (meaning.mIsCount)
	{
		long long count = -1;
		zoncore::utility::StringToNumber(text, count, 0);
		if (!meaning.mIsDropFrame)
			Require(count == static_cast<std::int32_t>(frame), "a count is the low 32 bits");
		else if (frame < INT32_MAX)
			Require(count == frame || count == frame - 1, "a drop-frame count is one short at most");
		return;
	}
	Numbers numbers = ReadNumbers(text);
	if (meaning.mHasSubframes)
	{
		Require(!numbers.empty() && numbers.back() == samples * numerator * 100 / denominator % 100, "hundredths");
		numbers.pop_back();
		Require(numbers.size() == 1 || numbers.front() > 0, "no zero leads");
		numbers.insert(numbers.begin(), 4 - std::min<std::size_t>(numbers.size(), 4), 0);
	}
	Require(numbers.size() == 4 && numbers[1] < 60 && numbers[2] < 60 && numbers[3] < frameRate, "labels are in range");
	const Labels labels{numbers[0], numbers[1], numbers[2], numbers[3]};
	Require(CountFrames(labels, frameRate, meaning.mIsDropFrame) == frame, "labels stand for the frame");
	Require(!meaning.mIsDropFrame || !IsDropped(labels, frameRate), "no label is written that is dropped");
}

// Labels of any separators are read as the first sample at or behind the frame that they stand for.
void CheckFields(FuzzInput& ioInput)
{
	constexpr std::array<UTF16Char, 6> kSeparators{':', ';', '-', ' ', '/', 0x3A3};
	const bool isDropFrame = ioInput.Flag(), isNTSC = ioInput.Flag();
	const std::int64_t sampleRate = 1 + ioInput.Any<std::uint32_t>() % 768'000;
	const std::int64_t frameRate
		= isDropFrame ? 30 * (1 + static_cast<std::int64_t>(ioInput.Below(4))) : 1 + ioInput.Any<std::uint8_t>();
	Labels labels{ioInput.Any<std::uint8_t>(), ioInput.Any<std::uint8_t>(), ioInput.Any<std::uint8_t>(),
		ioInput.Any<std::uint8_t>()};
	UTF16String text;
	for (const std::int64_t label : {labels.mHours, labels.mMinutes, labels.mSeconds, labels.mFrames})
	{
		if (!text.empty())
			text.append(1 + ioInput.Below(3), ioInput.OneOf(kSeparators));
		text += zoncore::utility::IntegerToString(label);
	}
	std::int64_t samples = -2;
	ConvertTimecodeToSamples(samples, text, static_cast<std::int32_t>(sampleRate), static_cast<std::int32_t>(frameRate),
		isNTSC, isDropFrame);
	if (isDropFrame && IsDropped(labels, frameRate))
		labels.mFrames = frameRate / 15;
	const std::int64_t numerator = frameRate * (isNTSC ? 1'000 : 1);
	const std::int64_t scaled = CountFrames(labels, frameRate, isDropFrame) * sampleRate * (isNTSC ? 1'001 : 1);
	Require(samples == (scaled + numerator - 1) / numerator, "labels are read as their first sample");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf(
		{CheckReading, CheckWriting, CheckRoundTrip, CheckSplitting, CheckEntries, CheckLabels, CheckFields}, inData,
		inSize);
}
