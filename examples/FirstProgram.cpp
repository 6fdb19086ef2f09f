#include "zoncore/StringUtils.h"
#include "zonmediatypes/Timecode.h"
#include <iostream>

int main()
{
	using namespace zonmediatypes;
	TickTime cut = kTime_Zero;
	cut.AddFrames(1'800, kFrameRate_VideoNTSC);   // exact: a frame is 8,475,667,200 ticks
	const auto text = TimeToTimecode(cut, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode);
	std::cout << zoncore::utility::UTF16to8(text) << '\n';   // 00:01:00;02
}
