// Film frames of a 23.976 fps clip, and where each lies in 29.97 fps video with 2:3 pulldown.

#include "zoncore/StringUtils.h"
#include "zonmediatypes/PulldownCadenceUtils.h"
#include "zonmediatypes/Timecode.h"

#include <iostream>

using namespace zonmediatypes;
using zoncore::utility::UTF16to8;

int main()
{
	constexpr FrameRate kFilm = kFrameRate_23976;
	constexpr FrameRate kVideo = kFrameRate_VideoNTSC;
	for (int frame = 0; frame < 8; ++frame)
	{
		TickTime film;
		film.AddFrames(frame, kFilm);
		bool isSplit = false;
		const TickTime video = MapPulldownFrameTo2997Frame(film, kVideo, kPulldownCadence_WWSSW, isSplit);
		std::cout << "film " << UTF16to8(TimeToTimecode(film, kFilm, kTimeDisplay_23976Timecode)) << "  video "
				  << UTF16to8(TimeToTimecode(video, kVideo, kTimeDisplay_2997DropTimecode))
				  << (isSplit ? "  one field" : "") << '\n';
	}
}
