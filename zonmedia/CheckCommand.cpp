#include "zoncore/CheckRegistry.h"
#include "zonmedia/Commands.h"

#include <utility>

namespace zonmedia
{

namespace
{

Status RunCheck(const CommonArguments& inArguments)
{
	Table checks{"Checks", {"Suite", "Check", "Passed", "Message"}, {}};
	zoncore::CheckRegistry& registry = zoncore::CheckRegistry::Get();
	const std::vector<std::string> suites = registry.GetSuites();
	bool havePassed = !suites.empty();   // without the library's suite nothing was checked
	for (const std::string& suite : suites)
	{
		const auto report = [&](std::string_view inCheck, bool inPassed, std::string_view inMessage) {
			checks.mRows.push_back({suite, std::string(inCheck), inPassed, std::string(inMessage)});
		};
		havePassed = registry.Run(suite, report) && havePassed;
	}
	Print({{"Have passed", {"", havePassed}}, {std::move(checks)}}, inArguments.GetStyle());
	return havePassed ? Status::Fine : Status::BadInput;
}

}   // namespace

void AddCheckCommand(CLI::App& ioApplication, Run& outRun)
{
	AddCommand(ioApplication, outRun, "check", "Run the library's checks of itself", "  zonmedia check",
		std::make_shared<CommonArguments>(), RunCheck);
}

}   // namespace zonmedia
