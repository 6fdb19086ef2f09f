#include "zonmedia/Commands.h"
#include "zonmedia/MediaFile.h"
#include "zonmedia/Sheet.h"

#include <vector>

namespace zonmedia
{

namespace
{

constexpr const char* kExamples = R"(  zonmedia sheet clip.mov
  zonmedia sheet *.mov sound.wav --json)";

struct SheetArguments : CommonArguments
{
	std::vector<std::string> mFiles;
};

Status RunSheet(const SheetArguments& inArguments)
{
	RecordList sheets("files", inArguments.GetStyle());
	for (const std::string& path : inArguments.mFiles)
	{
		try
		{
			sheets.Add(MakeSheet(path, ReadMediaFile(path)));
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
	command.add_option("FILE", arguments->mFiles, "Media files")->required();
}

}   // namespace zonmedia
