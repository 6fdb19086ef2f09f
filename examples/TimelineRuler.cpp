// The labels of a timeline ruler, made at once for all its marks, and one label in a buffer that the host owns.

#include "zonmediatypes/Timecode.h"

#include <array>
#include <iostream>
#include <string_view>

using namespace zonmediatypes;

int main()
{
	constexpr FrameRate kRate = kFrameRate_VideoNTSC;
	constexpr TimeDisplay kDisplay = kTimeDisplay_2997DropTimecode;

	// A mark every 300 frames, around the first minute. The rows stay from one repaint to the next.
	std::array<TickTime, 5> marks;
	std::array<TimecodeText, marks.size()> labels;
	TickTime next;
	next.AddFrames(1'200, kRate);
	for (TickTime& mark : marks)
	{
		mark = next;
		next.AddFrames(300, kRate);
	}
	TimesToTimecode(labels, marks, kRate, kDisplay);
	for (const TimecodeText& label : labels)
	{
		for (const zoncore::UTF16Char unit : label.GetText())
			std::cout << static_cast<char>(unit);   // timecode is ASCII
		std::cout << '\n';
	}

	std::array<char, kLongestTimecode> buffer;
	const std::size_t length = TimeToTimecode(std::span(buffer), next, kRate, kDisplay);
	std::cout << "next: " << std::string_view(buffer.data(), length) << '\n';
}
