#pragma once

/// \file
/// The commands of the companion. Each is added to the application by a function of its own; parsing the command line
/// leaves the chosen one, with its arguments, in a Run.

#include "zonmedia/Problem.h"
#include "zonmedia/Report.h"

#include <CLI/CLI.hpp>
#include <charconv>
#include <functional>
#include <memory>
#include <string>
#include <system_error>

namespace zonmedia
{

/// The command that was chosen, ready to run. May throw InputProblem and UsageProblem.
using Run = std::function<Status()>;

/// What every command takes.
struct CommonArguments
{
	bool mIsJson = false;

	Style GetStyle() const { return StyleOfOutput(mIsJson); }
};

/// Takes decimal numbers for which inIsFine holds; refuses everything else as no inWhat and says what was expected.
template <class Number>
CLI::Validator NumberWhere(bool (*inIsFine)(Number), const std::string& inWhat, const std::string& inExpected)
{
	const auto problem = [=](const std::string& inText)
	{
		Number number{};
		const char* const end = inText.data() + inText.size();
		const auto [rest, error] = std::from_chars(inText.data(), end, number);
		const bool isFine = error == std::errc() && rest == end && inIsFine(number);
		return isFine ? std::string() : Quoted(inText) + " is no " + inWhat + "; expected " + inExpected;
	};
	return {problem, inExpected};
}

/// Adds a command: inExamples are whole command lines, one each. Arguments derives from CommonArguments.
template <class Arguments>
CLI::App& AddCommand(CLI::App& ioParent, Run& outRun, const char* inName, const char* inDescription,
	const char* inExamples, const std::shared_ptr<Arguments>& inArguments, Status (*inRun)(const Arguments&))
{
	CLI::App* command = ioParent.add_subcommand(inName, inDescription);
	command->footer("Examples:\n" + std::string(inExamples));
	command->add_flag("--json", inArguments->mIsJson, "Write one JSON document");
	command->callback([inArguments, inRun, &outRun] { outRun = [=] { return inRun(*inArguments); }; });
	return *command;
}

/// Adds a command that only holds others.
inline CLI::App& AddGroup(CLI::App& ioParent, const char* inName, const char* inDescription, const char* inExamples)
{
	CLI::App* group = ioParent.add_subcommand(inName, inDescription);
	group->footer("Examples:\n" + std::string(inExamples));
	group->require_subcommand(1);
	return *group;
}

void AddSheetCommand(CLI::App& ioApplication, Run& outRun);
void AddTimeCommand(CLI::App& ioApplication, Run& outRun);
void AddAudioCommands(CLI::App& ioApplication, Run& outRun);
void AddVideoCommands(CLI::App& ioApplication, Run& outRun);
void AddSamplesCommand(CLI::App& ioApplication, Run& outRun);
void AddPulldownCommand(CLI::App& ioApplication, Run& outRun);
void AddCheckCommand(CLI::App& ioApplication, Run& outRun);
void AddKeysCommand(CLI::App& ioApplication, Run& outRun);

}   // namespace zonmedia
