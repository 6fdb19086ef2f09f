#pragma once

/// \file
/// The commands of the companion. Each is added to the application by a function of its own; parsing the command line
/// leaves the chosen one, with its arguments, in a Run.

#include "zonmedia/Problem.h"
#include "zonmedia/Report.h"

#include <CLI/CLI.hpp>
#include <functional>
#include <memory>
#include <string>

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
