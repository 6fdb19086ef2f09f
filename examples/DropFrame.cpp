// Labels around the first and the tenth minute at 29.97 fps, and what becomes of a label that no frame has.

#include "zoncore/StringUtils.h"
#include "zonmediatypes/Timecode.h"

#include <iostream>

using namespace zonmediatypes;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

int main()
{
	std::cout << " frame  non-drop     drop-frame\n";
	for (const int frame : {1'799, 1'800, 17'981, 17'982, 107'892})
	{
		TickTime time;
		time.AddFrames(frame, kFrameRate_VideoNTSC);
		std::cout.width(6);
		std::cout << frame << "  "
				  << UTF16to8(TimeToTimecode(time, kFrameRate_VideoNTSC, kTimeDisplay_2997NonDropTimecode)) << "  "
				  << UTF16to8(TimeToTimecode(time, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode)) << '\n';
	}
	std::cout << '\n';
	for (const char* typed : {"00:00:59;29", "00:01:00;00", "00:01:00;01", "00:01:00;02", "10000", "a minute"})
	{
		const TickTime time = TimecodeToTime(UTF8to16(typed), kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode);
		std::cout << typed << ": ";
		if (time == kTime_Invalid)
			std::cout << "no timecode\n";
		else
			std::cout << "frame " << time.ToFrame64(kFrameRate_VideoNTSC) << '\n';
	}
}
