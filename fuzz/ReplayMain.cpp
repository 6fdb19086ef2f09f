// Runs a fuzz target over the files of the folders that are named on the command line: a regression test of every input
// that once mattered. It fails where an invariant does not hold, and where no input reaches one of the target's checks.

#include "fuzz/Checks.h"
#include "tests/TestLocale.h"

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize);

namespace
{

void Replay(const std::filesystem::path& inPath)
{
	std::ifstream file(inPath, std::ios::binary);
	const std::vector<char> bytes{std::istreambuf_iterator<char>(file), {}};
	std::printf("%s\n", inPath.filename().c_str());
	std::fflush(stdout);   // the name of the input that ends the program is the last one
	LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
}

// The numbers of the checks that no input chose, each behind a blank.
std::string UnreachedChecks()
{
	std::string numbers;
	for (std::size_t i = 0; i < zonfuzz::sReachedChecks.size(); ++i)
		numbers.append(zonfuzz::sReachedChecks[i] ? "" : " ")
			.append(zonfuzz::sReachedChecks[i] ? "" : std::to_string(i));
	return numbers;
}

}   // namespace

int main(int inCount, char** inArguments)
{
	if (!zontest::SetTestLocale())
		return 1;
	int files = 0;
	for (int i = 1; i < inCount; ++i)
	{
		for (const auto& entry : std::filesystem::directory_iterator(inArguments[i]))
		{
			Replay(entry.path());
			++files;
		}
	}
	const std::string unreached = UnreachedChecks();
	LLVMFuzzerTestOneInput(nullptr, 0);
	std::printf("%d inputs\n", files);
	if (!unreached.empty())
		std::fprintf(stderr, "no input reaches these of the %zu checks, counted from 0:%s\n",
			zonfuzz::sReachedChecks.size(), unreached.c_str());
	return files > 0 && unreached.empty() ? 0 : 1;
}
