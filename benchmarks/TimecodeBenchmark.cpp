// Timecode of 100,000 frames spread over a day, beside libavutil's.

#include "zonmediatypes/Timecode.h"

#include "zoncore/StringUtils.h"

#include <array>
#include <benchmark/benchmark.h>
#include <cstdint>
#include <string>
#include <vector>

extern "C"
{
#include <libavutil/timecode.h>
}

namespace zonmediatypes
{
namespace
{

constexpr int kFrames = 100'000;

struct Case
{
	const char* mName;
	TimeDisplay mDisplay;
	FrameRate mRate;
	AVRational mAVRate;
	unsigned mAVFlags;
};

constexpr auto sCases = std::to_array<Case>({
	{"25", kTimeDisplay_25Timecode, kFrameRate_VideoPAL, {25, 1}, 0},
	{"29.97df", kTimeDisplay_2997DropTimecode, kFrameRate_VideoNTSC, {30'000, 1'001}, AV_TIMECODE_FLAG_DROPFRAME},
	{"59.94df", kTimeDisplay_5994DropTimecode, kFrameRate_VideoNTSC_HD, {60'000, 1'001}, AV_TIMECODE_FLAG_DROPFRAME},
});

// The frame numbers, in an order that keeps the processor from learning the digits that follow.
std::vector<int> SpreadFrames(const Case& inCase)
{
	const auto day = TickTime(86'400 * kTicksPerSecond).ToFrame64(inCase.mRate);
	std::vector<int> frames;
	for (std::int64_t i = 0; i < kFrames; ++i)
		frames.push_back(static_cast<int>(i * 61'803 % kFrames * day / kFrames));
	return frames;
}

TickTime FrameTime(const Case& inCase, std::int64_t inFrame)
{
	return TickTime(inFrame * inCase.mRate.GetTicksPerFrame());
}

std::vector<TickTime> SpreadTimes(const Case& inCase)
{
	std::vector<TickTime> times;
	for (const int frame : SpreadFrames(inCase))
		times.push_back(FrameTime(inCase, frame));
	return times;
}

std::vector<zoncore::UTF16String> SpreadTexts(const Case& inCase)
{
	std::vector<zoncore::UTF16String> texts;
	for (const TickTime time : SpreadTimes(inCase))
		texts.push_back(TimeToTimecode(time, inCase.mRate, inCase.mDisplay));
	return texts;
}

// One iteration is one conversion of one of the inputs.
template <class Inputs, class Convert>
void Measure(benchmark::State& ioState, const Inputs& inInputs, Convert inConvert)
{
	auto input = inInputs.begin();
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(inConvert(*input));
		if (++input == inInputs.end())
			input = inInputs.begin();
	}
}

// ---- Text ------------------------------------------------------------------------------------------------------------

void TextOut(benchmark::State& ioState, const Case& inCase)
{
	Measure(ioState, SpreadTimes(inCase),
		[&](TickTime inTime) { return TimeToTimecode(inTime, inCase.mRate, inCase.mDisplay); });
}

void TextOutLibavutil(benchmark::State& ioState, const Case& inCase)
{
	AVTimecode timecode;
	av_timecode_init(&timecode, inCase.mAVRate, static_cast<int>(inCase.mAVFlags), 0, nullptr);
	std::array<char, AV_TIMECODE_STR_SIZE> text;
	Measure(ioState, SpreadFrames(inCase),
		[&](int inFrame) { return *av_timecode_make_string(&timecode, text.data(), inFrame); });
}

void TextIn(benchmark::State& ioState, const Case& inCase)
{
	Measure(ioState, SpreadTexts(inCase),
		[&](const zoncore::UTF16String& inText) { return TimecodeToTime(inText, inCase.mRate, inCase.mDisplay); });
}

void TextInLibavutil(benchmark::State& ioState, const Case& inCase)
{
	std::vector<std::string> texts;
	for (const zoncore::UTF16String& text : SpreadTexts(inCase))
		texts.push_back(zoncore::utility::UTF16to8(text));
	AVTimecode timecode;
	Measure(ioState, texts,
		[&](const std::string& inText)
		{
			av_timecode_init_from_string(&timecode, inCase.mAVRate, inText.c_str(), nullptr);
			return timecode.start;
		});
}

// ---- Numbers ---------------------------------------------------------------------------------------------------------

struct Fields
{
	unsigned int mHours, mMinutes, mSeconds;
	unsigned long long mFrames;
	bool mNegative;
};

Fields Split(const Case& inCase, TickTime inTime)
{
	Fields fields;
	TimeToHMSF(fields.mHours, fields.mMinutes, fields.mSeconds, fields.mFrames, fields.mNegative, inTime, inCase.mRate,
		inCase.mDisplay);
	return fields;
}

void FieldsOut(benchmark::State& ioState, const Case& inCase)
{
	Measure(ioState, SpreadTimes(inCase), [&](TickTime inTime) { return Split(inCase, inTime); });
}

void FieldsIn(benchmark::State& ioState, const Case& inCase)
{
	std::vector<Fields> fields;
	for (const TickTime time : SpreadTimes(inCase))
		fields.push_back(Split(inCase, time));
	Measure(ioState, fields,
		[&](const Fields& inFields)
		{
			return HMSFToTime(inFields.mHours, inFields.mMinutes, inFields.mSeconds, inFields.mFrames,
				inFields.mNegative, inCase.mRate, inCase.mDisplay);
		});
}

void RatioOut(benchmark::State& ioState, const Case& inCase)
{
	Measure(ioState, SpreadTimes(inCase), [](TickTime inTime) { return TimeToRatioTime(inTime); });
}

void RatioIn(benchmark::State& ioState, const Case& inCase)
{
	std::vector<RatioTime> times;
	for (const TickTime time : SpreadTimes(inCase))
		times.push_back(TimeToRatioTime(time));
	Measure(ioState, times, [](RatioTime inTime) { return RatioTimeToTime(inTime); });
}

void Register(const char* inName, void (*inFunction)(benchmark::State&, const Case&))
{
	for (const Case& row : sCases)
		benchmark::RegisterBenchmark((std::string(inName) + "/" + row.mName).c_str(),
			[inFunction, &row](benchmark::State& ioState) { inFunction(ioState, row); });
}

[[maybe_unused]] const bool sRegistered = []
{
	Register("TimeToTimecode", TextOut);
	Register("av_timecode_make_string", TextOutLibavutil);
	Register("TimecodeToTime", TextIn);
	Register("av_timecode_init_from_string", TextInLibavutil);
	Register("TimeToHMSF", FieldsOut);
	Register("HMSFToTime", FieldsIn);
	Register("TimeToRatioTime", RatioOut);
	Register("RatioTimeToTime", RatioIn);
	return true;
}();

}   // namespace
}   // namespace zonmediatypes
