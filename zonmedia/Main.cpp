// The command-line companion of the library: shows what the library makes of media files, times, channels and formats.

#include "zoncore/Localizer.h"
#include "zonmedia/Commands.h"
#include "zonmedia/Language.h"
#include "zonmedia/Names.h"
#include "zonmedia/TextLines.h"
#include "zonmediatypes/Version.h"

#include <algorithm>
#include <exception>
#include <iostream>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

namespace
{

using namespace zonmedia;   // NOLINT(google-build-using-namespace): this is its program

constexpr const char* kFooter = R"(Exit status:
  0  everything asked for was done
  1  a file or a value could not be read, or a check failed; everything else
     was still done, in English when it is the language that is missing
  2  the arguments make no command)";

const std::string kValuesAfter = "--";

// A value such as "-:30" begins as an option does; after "--" everything is a value.
std::vector<std::string> ValuesLast(std::vector<std::string> inArguments)
{
	if (std::ranges::find(inArguments, kValuesAfter) != inArguments.end())
		return inArguments;
	const auto isOption = [](std::string_view inArgument)
	{
		constexpr std::string_view kSeparators = ".:;";
		return inArgument.size() < 2 || inArgument[0] != '-'
			|| kSeparators.find(inArgument[1]) == std::string_view::npos;
	};
	const auto values = std::stable_partition(inArguments.begin(), inArguments.end(), isOption);
	if (values != inArguments.end())
		inArguments.insert(values, kValuesAfter);
	return inArguments;
}

std::vector<std::string> CommandsOf(const CLI::App& inLevel)
{
	std::vector<std::string> names;
	for (const CLI::App* command : inLevel.get_subcommands({}))
		names.push_back(command->get_name());
	return names;
}

// The options that may stand after a command: its own, and those of the whole program.
std::vector<std::string> OptionsOf(const CLI::App& inLevel)
{
	std::vector<std::string> names;
	for (const CLI::App* level = &inLevel; level != nullptr; level = level->get_parent())
	{
		for (const CLI::Option* option : level->get_options())
		{
			for (const std::string& name : option->get_lnames())
			{
				if (std::ranges::find(names, "--" + name) == names.end())
					names.push_back("--" + name);
			}
		}
	}
	return names;
}

// What is wrong with the first of the arguments that the parser had no use for.
std::string Unexpected(const std::string& inExtra, const CLI::App& inLevel, bool inIsAfterMark)
{
	const std::vector<std::string> commands = CommandsOf(inLevel);
	if (!inExtra.starts_with('-'))
		return commands.empty() ? Quoted(inExtra) + " is one argument too many"
								: UnknownName("command", inExtra, {commands.begin(), commands.end()});
	const std::vector<std::string> options = OptionsOf(inLevel);
	const std::string name = inExtra.substr(0, inExtra.find('='));
	if (std::ranges::find(options, name) == options.end())
		return UnknownName("option", name, {options.begin(), options.end()});
	return name + (inIsAfterMark ? " stands after \"--\", where everything is a value" : " stands after the command");
}

std::vector<std::string> Unused(const CLI::App& inApplication)
{
	std::vector<std::string> extras = inApplication.remaining(true);
	std::erase(extras, kValuesAfter);
	return extras;
}

const CLI::App& Innermost(const CLI::App& inApplication)
{
	const CLI::App* level = &inApplication;
	while (!level->get_subcommands().empty())
		level = level->get_subcommands().front();
	return *level;
}

// The command line in the words of whoever typed it: what makes no command, or what the parser says.
std::string Explanation(
	const CLI::App& inApplication, const CLI::ParseError& inError, const std::vector<std::string>& inArguments)
{
	const CLI::App& level = Innermost(inApplication);
	if (const std::vector<std::string> extras = Unused(inApplication); !extras.empty())
	{
		const auto mark = std::ranges::find(inArguments, kValuesAfter);
		const bool isAfterMark = std::find(mark, inArguments.end(), extras.front()) != inArguments.end();
		return Unexpected(extras.front(), level, isAfterMark);
	}
	if (const std::vector<std::string> commands = CommandsOf(level); !commands.empty())
		return "a command is required: " + Joined(std::vector<std::string_view>(commands.begin(), commands.end()));
	const std::string said = inError.what();
	const std::size_t colon = std::min(said.find(": "), said.size());   // after the option that is wrong
	if (dynamic_cast<const CLI::ArgumentMismatch*>(&inError) != nullptr)
		return said.substr(0, colon) + (said.ends_with("missing") ? " needs a value" : " is given more than once");
	return dynamic_cast<const CLI::ValidationError*>(&inError) != nullptr ? std::string(said).erase(colon, 1) : said;
}

// Shows the help or the version that was asked for; there is none of a command that does not exist.
void Grant(const CLI::App& inApplication, const CLI::Success& inWish)
{
	const std::vector<std::string> extras = Unused(inApplication);
	const auto word
		= std::ranges::find_if(extras, [](const std::string& inExtra) { return !inExtra.starts_with('-'); });
	if (word != extras.end())
		throw UsageProblem(Unexpected(*word, Innermost(inApplication), false) + " (see --help)");
	std::ostringstream text;
	inApplication.exit(inWish, text, text);
	constexpr std::size_t kUsualWidth = 80;
	const std::size_t width = LineWidth();
	std::cout << WrappedHelp(text.str(), width == kAnyWidth ? kUsualWidth : width);
}

// Programs get the same of every language.
bool IsForPrograms(const CLI::App& inApplication)
{
	const CLI::Option* option = Innermost(inApplication).get_option_no_throw("--json");
	return option != nullptr && option->count() > 0;
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

Status RunCommandLine(const std::vector<std::string>& inArguments)
{
	Run run;
	std::string language;
	CLI::App application("Media times, timecode, audio channels and video formats", "zonmedia");
	application.footer(kFooter);
	application.set_version_flag("--version", zonmediatypes::Version());
	application.add_option("--language", language,
		"Language of the texts, one of: " + LanguageNames() + "; or a message catalogue, such as ./de.mo");
	application.ignore_case();
	application.fallthrough();   // --language may stand after the command, too
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
		application.parse(
			std::vector<std::string>(inArguments.rbegin(), inArguments.rend()));   // as the parser wants them
	}
	catch (const CLI::Success& wish)   // --help and --version
	{
		Grant(application, wish);
		return Status::Fine;
	}
	catch (const CLI::ParseError& error)
	{
		throw UsageProblem(Explanation(application, error, inArguments) + " (see --help)");
	}
	const Status status = ChooseLanguage(language);
	if (IsForPrograms(application))
		zoncore::config::Localizer::Get().SetCatalogue(nullptr);
	return std::max(status, run());
}

Status RunAndComplain(const std::vector<std::string>& inArguments)
{
	try
	{
		return RunCommandLine(inArguments);
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
