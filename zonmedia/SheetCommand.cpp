#include "zonmedia/Commands.h"
#include "zonmedia/MediaFile.h"
#include "zonmedia/Sheet.h"

#include <algorithm>
#include <iostream>
#include <string>
#include <unistd.h>
#include <utility>
#include <vector>

namespace zonmedia
{

namespace
{

constexpr const char* kExamples = R"(  zonmedia sheet clip.mov
  zonmedia sheet *.mov sound.wav --json
  zonmedia sheet --scan download.mkv
  curl https://example.org/clip.ts | zonmedia sheet -)";

struct SheetArguments : CommonArguments
{
	std::vector<std::string> mFiles;
	bool mIsScan = false;
};

// How far a scan of inPath has come, on standard error when that is a terminal; the line is wiped when the scan ends.
class ScanProgress
{
public:
	explicit ScanProgress(const std::string& inPath) : mPath(Printable(inPath)) {}
	ScanProgress(const ScanProgress&) = delete;
	ScanProgress& operator=(const ScanProgress&) = delete;
	~ScanProgress()
	{
		if (mShown >= 0)
			std::cerr << "\r\033[K" << std::flush;
	}

	void Show(double inPart)
	{
		const int percent = static_cast<int>(inPart * 100.0);
		if (mIsTerminal && percent > std::exchange(mShown, std::max(mShown, percent)))
			std::cerr << '\r' << mPath << ": " << percent << " %" << std::flush;
	}

private:
	std::string mPath;
	bool mIsTerminal = isatty(STDERR_FILENO) == 1;
	int mShown = -1;
};

Record ReadSheet(const std::string& inPath, bool inIsScan)
{
	ScanProgress progress(inPath);
	const auto show = [&](double inPart) { progress.Show(inPart); };
	return MakeSheet(inPath, ReadMediaFile(inPath, inIsScan ? Scan{true, show} : Scan()));
}

Status RunSheet(const SheetArguments& inArguments)
{
	RecordList sheets("files", inArguments.GetStyle());
	for (const std::string& path : inArguments.mFiles)
	{
		try
		{
			sheets.Add(ReadSheet(path, inArguments.mIsScan));
		}
		catch (const InputProblem& problem)
		{
			sheets.AddProblem(path.empty() ? Quoted(path) : path, problem.what());
		}
	}
	return sheets.Finish();
}

}   // namespace

void AddSheetCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<SheetArguments>();
	CLI::App& command = AddCommand(ioApplication, outRun, "sheet",
		"Show the times, picture and sound of media files, one sheet a file", kExamples, arguments, RunSheet);
	command.add_option("FILE", arguments->mFiles, "Media files; - is standard input")->required();
	command.add_flag("--scan", arguments->mIsScan,
		"Read every packet: the true count of frames, the range of their rates, and what is missing");
}

}   // namespace zonmedia
