// Which labels drop-frame numbering skips: the frames around a minute, cell by cell, and the minutes of ten.

#include "Pictures.h"
#include "Svg.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Timecode.h"

#include <string>

namespace pictures
{
namespace
{

using namespace zonmediatypes;

constexpr int kMargin = 20;
constexpr int kCellWidth = 92;
constexpr int kCellHeight = 34;
constexpr int kCells = 9;

struct DropFrameRate
{
	FrameRate mRate;
	TimeDisplay mDisplay;
	int mNominal;   // labels a second
};
constexpr DropFrameRate s2997{kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode, 30};
constexpr DropFrameRate s5994{kFrameRate_VideoNTSC_HD, kTimeDisplay_5994DropTimecode, 60};

// The time at which a minute begins, which is its first label that is not skipped.
int FirstFrameOfMinute(const DropFrameRate& inRate, unsigned inMinute)
{
	return HMSFToTime(0, inMinute, 0, 0, false, inRate.mRate, inRate.mDisplay).ToFrame32(inRate.mRate);
}

std::string Label(const DropFrameRate& inRate, int inFrame)
{
	TickTime time;
	time.AddFrames(inFrame, inRate.mRate);
	return zoncore::utility::UTF16to8(TimeToTimecode(time, inRate.mRate, inRate.mDisplay));
}

// How many labels of its second a frame's label leaves unused before it, when the frame before it ended the last second.
int SkippedBefore(const DropFrameRate& inRate, int inFrame)
{
	const std::string label = Label(inRate, inFrame);
	const std::string before = Label(inRate, inFrame - 1);
	const bool beginsSecond = label.substr(0, 8) != before.substr(0, 8);
	return beginsSecond ? std::stoi(label.substr(9)) : 0;
}

void DrawCell(const Picture& inPicture, int inCell, int inTop, bool inIsFrame, const std::string& inLabel)
{
	const int left = kMargin + inCell * kCellWidth;
	inPicture.Box(inIsFrame ? "frame" : "ghost", left + 2, inTop, kCellWidth - 4, kCellHeight);
	inPicture.Text(inIsFrame ? "mono label" : "mono dropped", left + kCellWidth / 2, inTop + 22, inLabel);
}

// The cells around a minute's start: frames with their number above, skipped labels without.
void DrawMinuteStart(
	const Picture& inPicture, int inTop, std::string_view inTitle, const DropFrameRate& inRate, unsigned inMinute)
{
	const int first = FirstFrameOfMinute(inRate, inMinute);
	const int skipped = SkippedBefore(inRate, first);
	const int before = (kCells - skipped) / 2;
	inPicture.Text("title", kMargin + 2, inTop, inTitle);
	const int top = inTop + 34;
	for (int cell = 0; cell < kCells; ++cell)
	{
		const int frame = first - before + cell - (cell < before + skipped ? 0 : skipped);
		if (cell >= before && cell < before + skipped)
		{
			DrawCell(
				inPicture, cell, top, false, Label(inRate, first).substr(0, 9) + "0" + std::to_string(cell - before));
			continue;
		}
		inPicture.Text("note", kMargin + cell * kCellWidth + kCellWidth / 2, top - 8, std::to_string(frame));
		DrawCell(inPicture, cell, top, true, Label(inRate, frame));
	}
}

// Ten minutes and how many frames each has.
void DrawTenMinutes(const Picture& inPicture, int inTop, const DropFrameRate& inRate)
{
	constexpr int kWidth = kCells * kCellWidth / 10;
	inPicture.Text("title", kMargin + 2, inTop, "Frames of each minute of ten at 29.97 fps");
	for (unsigned minute = 0; minute < 10; ++minute)
	{
		const int frames = FirstFrameOfMinute(inRate, minute + 1) - FirstFrameOfMinute(inRate, minute);
		const int left = kMargin + static_cast<int>(minute) * kWidth;
		const bool isFull = frames == 60 * inRate.mNominal;
		inPicture.Text("note", left + kWidth / 2, inTop + 26, "minute " + std::to_string(minute));
		inPicture.Box(isFull ? "kept" : "frame", left + 2, inTop + 34, kWidth - 4, kCellHeight);
		inPicture.Text("", left + kWidth / 2, inTop + 56, std::to_string(frames));
	}
	inPicture.Text("note left", kMargin + 2, inTop + 88,
		"Together " + std::to_string(FirstFrameOfMinute(inRate, 10)) + " frames where 30 labels a second would be "
			+ std::to_string(600 * inRate.mNominal) + ". Struck-out labels belong to no frame; no frame is missing.");
}

}   // namespace

void DrawDropFrame()
{
	const Picture picture(
		2 * kMargin + kCells * kCellWidth, 456, "Drop-frame numbering: labels skipped at the start of a minute");
	DrawMinuteStart(picture, 30, "29.97 fps: every minute begins with label 02 ...", s2997, 1);
	DrawMinuteStart(picture, 132, "... but every tenth minute begins with label 00", s2997, 10);
	DrawMinuteStart(picture, 234, "59.94 fps: every minute begins with label 04", s5994, 1);
	DrawTenMinutes(picture, 342, s2997);
}

}   // namespace pictures
