// Which video frame carries which film frame, for each cadence.

#include "Pictures.h"
#include "Svg.h"
#include "zonmediatypes/PulldownCadenceUtils.h"

#include <array>
#include <stdexcept>
#include <string>

namespace pictures
{
namespace
{

using namespace zonmediatypes;

constexpr int kFilmGroup = 4;    // film frames
constexpr int kVideoGroup = 5;   // the video frames that carry them
constexpr int kGroups = 2;
constexpr int kCell = 34;
constexpr int kNameWidth = 74;
constexpr int kRowHeight = 66;
constexpr int kColumnWidth = kNameWidth + kGroups * kVideoGroup * kCell + 34;

struct NamedCadence
{
	PulldownCadence mCadence;
	std::string_view mLetters;   // whole (W) and split (S) video frames of a group
};
constexpr auto sCadences = std::to_array<NamedCadence>({
	{kPulldownCadence_WSSWW, "WSSWW"},
	{kPulldownCadence_SSWWW, "SSWWW"},
	{kPulldownCadence_SWWWS, "SWWWS"},
	{kPulldownCadence_WWWSS, "WWWSS"},
	{kPulldownCadence_WWSSW, "WWSSW"},
});
constexpr auto sAdvancedCadences = std::to_array<NamedCadence>({
	{kPulldownCadence_Advanced_WWWSW, "WWWSW"},
	{kPulldownCadence_Advanced_WWSWW, "WWSWW"},
	{kPulldownCadence_Advanced_WSWWW, "WSWWW"},
	{kPulldownCadence_Advanced_SWWWW, "SWWWW"},
	{kPulldownCadence_Advanced_WWWWS, "WWWWS"},
});

struct VideoFrame
{
	std::string mFilmFrame;   // A to D; empty for the one that no film frame maps to
	bool mIsMarked = false;
};
using VideoFrames = std::array<VideoFrame, kGroups * kVideoGroup>;

VideoFrames MapFilmFrames(PulldownCadence inCadence)
{
	VideoFrames frames;
	for (int film = 0; film < kGroups * kFilmGroup; ++film)
	{
		TickTime time;
		time.AddFrames(film, kFrameRate_23976);
		bool isMarked = false;
		const TickTime video = MapPulldownFrameTo2997Frame(time, kFrameRate_VideoNTSC, inCadence, isMarked);
		frames.at(static_cast<std::size_t>(video.ToFrame64(kFrameRate_VideoNTSC)))
			= {std::string(1, static_cast<char>('A' + film % kFilmGroup)), isMarked};
	}
	return frames;
}

void DrawCadence(const Picture& inPicture, int inLeft, int inTop, const NamedCadence& inCadence)
{
	inPicture.Text("mono left", inLeft, inTop + 38, inCadence.mLetters);
	const VideoFrames frames = MapFilmFrames(inCadence.mCadence);
	for (std::size_t index = 0; index < frames.size(); ++index)
	{
		const VideoFrame& frame = frames[index];
		const char letter = inCadence.mLetters[index % kVideoGroup];
		if (frame.mFilmFrame.empty() && letter != 'S')
			throw std::logic_error("a whole video frame carries no film frame");
		const int gap = static_cast<int>(index) / kVideoGroup * 10;
		const int left = inLeft + kNameWidth + gap + static_cast<int>(index) * kCell;
		inPicture.Text("note", left + kCell / 2, inTop + 12, std::string(1, letter));
		const std::string_view look = frame.mFilmFrame.empty() ? "ghost" : frame.mIsMarked ? "marked" : "frame";
		inPicture.Box(look, left + 1, inTop + 18, kCell - 2, 30);
		inPicture.Text("", left + kCell / 2, inTop + 38, frame.mFilmFrame);
	}
}

template <class Cadences>
void DrawColumn(const Picture& inPicture, int inLeft, std::string_view inTitle, const Cadences& inCadences)
{
	inPicture.Text("title", inLeft, 30, inTitle);
	int top = 48;
	for (const NamedCadence& cadence : inCadences)
	{
		DrawCadence(inPicture, inLeft, top, cadence);
		top += kRowHeight;
	}
}

void DrawLegend(const Picture& inPicture, int inTop)
{
	struct Entry
	{
		int mLeft;
		std::string_view mLook, mText;
	};
	for (const auto& [left, look, text] : {Entry{20, "frame", "carries film frame A, B, C or D"},
			 Entry{290, "marked", "carries it as the second of two split frames"},
			 Entry{650, "ghost", "no film frame maps to it"}})
	{
		inPicture.Box(look, left, inTop, 26, 20);
		inPicture.Text("note left", left + 34, inTop + 15, text);
	}
}

}   // namespace

void DrawCadences()
{
	constexpr int kBottom = 48 + kRowHeight * static_cast<int>(sCadences.size());
	const Picture picture(
		20 + 2 * kColumnWidth, kBottom + 44, "The video frames that carry each film frame, for every cadence");
	DrawColumn(picture, 20, "2:3 pulldown: two of five frames are split", sCadences);
	DrawColumn(picture, 20 + kColumnWidth, "2:3:3:2 pulldown: one of five is split", sAdvancedCadences);
	DrawLegend(picture, kBottom + 8);
}

}   // namespace pictures
