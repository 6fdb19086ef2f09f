// The command-line companion of the library: shows what the library makes of media files, times, channels and formats.

#include "zonmedia/Commands.h"
#include "zonmedia/Language.h"
#include "zonmedia/Names.h"
#include "zonmediatypes/Version.h"

#include <algorithm>
#include <exception>
#include <iostream>
#include <string>
#include <string_view>
#include <vector>

namespace
{

using namespace zonmedia;   // NOLINT(google-build-using-namespace): this is its program

constexpr const char* kFooter = R"(Exit status:
  0  everything asked for was done
  1  a file or a value could not be read, or a check failed; everything else was still done,
     in English when it is the language that is missing or damaged
  2  the arguments make no command)";

// A value such as "-:30" begins as an option does; behind "--" everything is a value.
std::vector<std::string> ValuesLast(std::vector<std::string> inArguments)
{
	const auto isOption = [](std::string_view inArgument)
	{
		constexpr std::string_view kSeparators = ".:;";
		return inArgument.size() < 2 || inArgument[0] != '-'
			|| kSeparators.find(inArgument[1]) == std::string_view::npos;
	};
	const auto values = std::stable_partition(inArguments.begin(), inArguments.end(), isOption);
	if (values != inArguments.end())
		inArguments.insert(values, "--");
	return inArguments;
}

// The command line in the words of whoever typed it: a command that does not exist, or what the parser says.
std::string Explanation(const CLI::App& inApplication, const CLI::ParseError& inError)
{
	const std::vector<std::string> extras = inApplication.remaining(true);
	const CLI::App* level = &inApplication;
	while (!level->get_subcommands().empty())
		level = level->get_subcommands().front();
	std::vector<std::string_view> commands;
	for (const CLI::App* command : level->get_subcommands({}))
		commands.emplace_back(command->get_name());
	if (extras.empty() || extras.front().starts_with('-') || commands.empty())
		return std::string(inError.what()) + " (see --help)";
	return UnknownName("command", extras.front(), commands) + " (see --help)";
}

// Fine, or a complaint: the command runs all the same, in English.
Status ChooseLanguage(const std::string& inLanguage)
{
	try
	{
		if (!inLanguage.empty())
			UseLanguage(inLanguage);
		return Status::Fine;
	}
	catch (const InputProblem& problem)
	{
		Complain("", problem.what());
		return Status::BadInput;
	}
}

Status RunCommandLine(std::vector<std::string> inArguments)
{
	Run run;
	std::string language;
	CLI::App application("Media times, timecode, audio channels and video formats", "zonmedia");
	application.footer(kFooter);
	application.set_version_flag("--version", zonmediatypes::Version());
	application.add_option("--language", language,
		"Describe values in a language, such as de or pt_BR, or from a message catalogue, such as ./de.mo");
	application.fallthrough();   // --language may stand behind the command, too
	application.require_subcommand(1);
	AddSheetCommand(application, run);
	AddTimeCommand(application, run);
	AddSamplesCommand(application, run);
	AddPulldownCommand(application, run);
	AddAudioCommands(application, run);
	AddVideoCommands(application, run);
	AddCheckCommand(application, run);
	AddKeysCommand(application, run);
	try
	{
		std::ranges::reverse(inArguments);   // as the parser wants them
		application.parse(inArguments);
	}
	catch (const CLI::Success& wish)   // --help and --version
	{
		application.exit(wish);
		return Status::Fine;
	}
	catch (const CLI::ParseError& error)
	{
		throw UsageProblem(Explanation(application, error));
	}
	const Status status = ChooseLanguage(language);
	return std::max(status, run());
}

Status RunAndComplain(std::vector<std::string> inArguments)
{
	try
	{
		return RunCommandLine(std::move(inArguments));
	}
	catch (const UsageProblem& problem)
	{
		Complain("", problem.what());
		return Status::BadUsage;
	}
	catch (const std::exception& problem)
	{
		Complain("", problem.what());
		return Status::BadInput;
	}
}

}   // namespace

int main(int inCount, char** inArguments)
{
	std::ios::sync_with_stdio(false);
	const Status status = RunAndComplain(ValuesLast({inArguments + 1, inArguments + inCount}));
	std::cout.flush();
	if (!std::cout)
	{
		Complain("", "standard output cannot be written");
		return static_cast<int>(Status::BadInput);
	}
	return static_cast<int>(status);
}
