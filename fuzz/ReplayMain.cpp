// Runs a fuzz target over the files of the folders that are named on the command line: a regression test of every input
// that once mattered. It fails where an invariant does not hold, and where no input reaches one of the target's checks.

#include "fuzz/Checks.h"
#include "tests/Platform.h"
#include "tests/TestLocale.h"

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize);

namespace
{

void Replay(const std::string& inFolder, const std::string& inName)
{
	const std::string bytes = zontest::ReadFile(inFolder + '/' + inName);
	std::printf("%s\n", inName.c_str());
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
		for (const std::string& name : zontest::FilesOf(inArguments[i]))
		{
			Replay(inArguments[i], name);
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
