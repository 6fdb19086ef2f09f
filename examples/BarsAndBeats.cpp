// One position, as each tool of an audio editor shows it; and typed positions and lengths in bars and beats.

#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <iostream>

using namespace zonmediatypes::utility;

int main()
{
	constexpr std::int32_t kSampleRate = 48'000;
	constexpr std::int32_t kFrameRate = 30;
	// 120 quarter notes a minute in 4/4; the first bar begins half a second into the file.
	BeatInfo tempo{.iTicksPerBeat = 960, .dTempo = 120, .iBeatsPerBar = 4, .iBeatValue = 4, .dOffsetMilliseconds = 500};

	zoncore::UTF16String text;
	for (const TimecodeFormat format : {kTimecodeFormat_Samples, kTimecodeFormat_Decimal, kTimecodeFormat_Milliseconds,
			 kTimecodeFormat_TimecodeDropFrame, kTimecodeFormat_TimecodeSubframes, kTimecodeFormat_BarsAndBeats})
	{
		ConvertSamplesToTimecode(text, 2'982'000, kSampleRate, format, kFrameRate, &tempo, false);
		std::cout << "format " << format << ": " << zoncore::utility::UTF16to8(text) << '\n';
	}

	for (const char* typed : {"1:1", "2:3", "2:3.480", "3"})
	{
		std::int64_t position = 0;
		std::int64_t length = 0;
		const auto text16 = zoncore::utility::UTF8to16(typed);
		ConvertTimecodeToSamples(
			position, text16, kTimecodeFormat_BarsAndBeats, kSampleRate, kFrameRate, &tempo, false);
		ConvertTimecodeToSamples(length, text16, kTimecodeFormat_BarsAndBeats, kSampleRate, kFrameRate, &tempo, true);
		std::cout << typed << " is sample " << position << ", or a length of " << length << '\n';
	}
}
