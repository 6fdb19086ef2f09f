// Times from and to std::chrono and an MPEG clock, layouts as keys, and values in a log.

#include "zonmediatypes/TimeBase.h"
#include "zonmediatypes/interop/Chrono.h"
#include "zonmediatypes/interop/Hash.h"
#include "zonmediatypes/interop/Streams.h"
#include "zonmediatypes/interop/Strings.h"

#include "zonmediatypes/Timecode.h"

#include <iostream>
#include <string>
#include <unordered_map>

using namespace zonmediatypes;

int main()
{
	using namespace std::chrono_literals;
	const TickTime pause = ToTickTime(1'500ms).value();   // exact: milliseconds are whole numbers of ticks
	constexpr TimeBase kMpegClock = TimeBase::FromRatio(1, 90'000).value();
	std::cout << pause << " s are " << pause.ToFrame64(kFrameRate_VideoPAL) << " frames, "
			  << kMpegClock.FromTicks(pause, Rounding::Nearest).value() << " ticks of an MPEG clock, "
			  << ToDuration<std::chrono::microseconds>(pause, Rounding::Nearest)->count() << " microseconds\n";

	const std::string shown = ToUTF8(TimeToTimecode(pause, kFrameRate_VideoPAL, kTimeDisplay_25Timecode));
	std::cout << shown << " is "
			  << (TimecodeToTime(FromUTF8(shown), kFrameRate_VideoPAL, kTimeDisplay_25Timecode) == pause
						 ? "the same time\n"
						 : "the frame that the time lies in\n");

	std::unordered_map<AudioChannelLayout, int> streams;
	for (const AudioChannelLayout& layout :
		{CreateStereoChannelLayout(), CreateMonoChannelLayout(), CreateStereoChannelLayout()})
		++streams[layout];
	std::cout << streams[CreateStereoChannelLayout()] << " streams of " << CreateStereoChannelLayout() << '\n';
}
