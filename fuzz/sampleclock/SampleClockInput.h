#pragma once

#include "fuzz/BufferChecks.h"
#include "fuzz/FuzzInput.h"
#include "zoncore/Debug.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

namespace zonfuzz
{

/// Misuse of the sample clock's functions is part of what the targets try: nobody is told of it.
inline const auto sQuietDialog = zoncore::debug::SetAssertDialog([](auto&&...) { return false; });

/// What an output holds before a call that may leave it untouched.
inline const zoncore::UTF16String sBefore = zoncore::utility::AsciiToUTF16("before");

/// Any tempo and meter.
inline zonmediatypes::utility::BeatInfo TakeBeats(FuzzInput& ioInput)
{
	zonmediatypes::utility::BeatInfo beats;
	beats.iTicksPerBeat = ioInput.Edge<std::int32_t>();
	beats.dTempo = ioInput.Flag() ? 120 : ioInput.Any<double>();
	beats.iBeatsPerBar = ioInput.Edge<std::int32_t>();
	beats.iBeatValue = ioInput.Edge<std::int32_t>();
	beats.dOffsetMilliseconds = ioInput.Flag() ? 0 : ioInput.Any<double>();
	return beats;
}

/// Requires that a position is written into buffers as it is into inText; inText is as before where nothing is written.
inline void RequirePositionInBuffers(const zoncore::UTF16String& inText, std::int64_t inSamples,
	std::int32_t inSampleRate, zonmediatypes::utility::TimecodeFormat inFormat, std::int32_t inFrameRate,
	const zonmediatypes::utility::BeatInfo* inBeatInfo, bool inIsDuration)
{
	Require(inText.size() <= zonmediatypes::utility::kLongestPosition, "no text is longer");
	RequireInBuffers(inText == sBefore ? zoncore::UTF16String() : inText,
		[&](auto outText)
		{
			return zonmediatypes::utility::ConvertSamplesToTimecode(
				outText, inSamples, inSampleRate, inFormat, inFrameRate, inBeatInfo, inIsDuration);
		});
}

}   // namespace zonfuzz
