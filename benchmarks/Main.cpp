// All benchmarks in one program. Besides Google Benchmark's options it takes
//     --table=FILE    the results as a page of tables
//     --json=FILE     the same as data

#include "Comparison.h"

#include <cstdlib>
#include <fstream>
#include <iostream>
#include <string>
#include <string_view>
#include <vector>

namespace
{

// The value of an option "--name=value"; empty without it.
std::string TakeOption(std::vector<char*>& ioArguments, std::string_view inStart)
{
	std::string value;
	std::erase_if(ioArguments,
		[&](const char* inArgument)
		{
			const std::string_view argument = inArgument;
			if (!argument.starts_with(inStart))
				return false;
			value = argument.substr(inStart.size());
			return true;
		});
	return value;
}

bool WriteFile(const std::string& inPath, void (*inWrite)(std::ostream&, const benchmarks::Collector&),
	const benchmarks::Collector& inCollector)
{
	if (inPath.empty())
		return true;
	std::ofstream file(inPath);
	inWrite(file, inCollector);
	if (!file.flush())
		std::cerr << "Benchmarks: cannot write " << inPath << '\n';
	return file.good();
}

}   // namespace

int main(int inArgumentCount, char** inArguments)
{
	std::vector<char*> arguments(inArguments, inArguments + inArgumentCount);
	const std::string table = TakeOption(arguments, "--table=");
	const std::string json = TakeOption(arguments, "--json=");
	int count = static_cast<int>(arguments.size());
	benchmark::Initialize(&count, arguments.data());
	if (benchmark::ReportUnrecognizedArguments(count, arguments.data()))
		return EXIT_FAILURE;
	benchmarks::Collector collector;
	benchmark::RunSpecifiedBenchmarks(&collector);
	const bool isWritten
		= WriteFile(table, benchmarks::WriteTables, collector) && WriteFile(json, benchmarks::WriteJson, collector);
	return isWritten ? EXIT_SUCCESS : EXIT_FAILURE;
}
