#include "zonmedia/Commands.h"
#include "zonmedia/TimeNames.h"
#include "zonmediatypes/PulldownCadenceUtils.h"

#include <array>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language

namespace
{

constexpr const char* kExamples = R"(  zonmedia pulldown --cadence WWSSW
  zonmedia pulldown --cadence WWWSW --rate 59.94)";

struct PulldownArguments : CommonArguments
{
	std::string mCadence;
	std::string mRate = "29.97";
	int mGroups = 3;
};

constexpr int kFilmFramesInGroup = 4;
constexpr int kVideoFramesInGroup = 5;

// The name of a cadence says which frames of a video group are whole (W) and which are split between two film frames (S).
const std::array<Named<PulldownCadence>, 10> sCadences{{
	{"WSSWW", kPulldownCadence_WSSWW},
	{"SSWWW", kPulldownCadence_SSWWW},
	{"SWWWS", kPulldownCadence_SWWWS},
	{"WWWSS", kPulldownCadence_WWWSS},
	{"WWSSW", kPulldownCadence_WWSSW},
	{"WWWSW", kPulldownCadence_Advanced_WWWSW},
	{"WWSWW", kPulldownCadence_Advanced_WWSWW},
	{"WSWWW", kPulldownCadence_Advanced_WSWWW},
	{"SWWWW", kPulldownCadence_Advanced_SWWWW},
	{"WWWWS", kPulldownCadence_Advanced_WWWWS},
}};

Status RunPulldown(const PulldownArguments& inArguments)
{
	const PulldownCadence cadence = ValueNamed<PulldownCadence>(sCadences, "cadence", inArguments.mCadence);
	const std::string letters = NameOf<PulldownCadence>(sCadences, cadence);
	const Rate video = ReadRate(inArguments.mRate);
	const FrameRate film = video.mRate / kVideoFramesInGroup * kFilmFramesInGroup;
	const TimeForm form{GetTimeDisplayForFrameRate(video.mRate, true, false, kTimeDisplay_Frames, false)};
	Table table{"Frames", {"Film frame", "Video frame", "Letter", "Marked", "Video time"}, {}};
	for (int frame = 0; frame < inArguments.mGroups * kFilmFramesInGroup; ++frame)
	{
		TickTime filmTime;
		filmTime.AddFrames(frame, film);
		bool isMarked = false;
		const TickTime videoTime = MapPulldownFrameTo2997Frame(filmTime, video.mRate, cadence, isMarked);
		const std::int64_t videoFrame = videoTime.ToFrame64(video.mRate);
		const char letter = letters[static_cast<std::size_t>(videoFrame % kVideoFramesInGroup)];
		table.mRows.push_back(
			{frame, videoFrame, std::string(1, letter), isMarked, TimeText(videoTime, video.mRate, form)});
	}
	Record record{{"Cadence", letters}, {}};
	record.mItems = {Field{"Rate", {Text(video), Text(video.mStated)}}, std::move(table)};
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

}   // namespace

void AddPulldownCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<PulldownArguments>();
	CLI::App& command = AddCommand(ioApplication, outRun, "pulldown",
		"Show which video frames carry the film frames of a pulldown", kExamples, arguments, RunPulldown);
	command
		.add_option("--cadence", arguments->mCadence,
			"Whole (W) and split (S) frames of a group, one of: " + NamesOf<PulldownCadence>(sCadences))
		->required();
	command.add_option("--rate", arguments->mRate, "Rate of the video")->capture_default_str();
	command.add_option("--groups", arguments->mGroups, "Groups of four film frames to show")
		->check(NumberWhere<int>([](int inGroups) { return inGroups >= 1 && inGroups <= 1000; }, "count of groups",
			"a whole number from 1 to 1000"))
		->capture_default_str();
}

}   // namespace zonmedia
