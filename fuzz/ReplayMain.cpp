// Runs a fuzz target over the files of the folders that are named on the command line: a regression test of every input
// that once mattered.

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
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

}   // namespace

int main(int inCount, char** inArguments)
{
	int files = 0;
	for (int i = 1; i < inCount; ++i)
	{
		for (const auto& entry : std::filesystem::directory_iterator(inArguments[i]))
		{
			Replay(entry.path());
			++files;
		}
	}
	LLVMFuzzerTestOneInput(nullptr, 0);
	std::printf("%d inputs\n", files);
	return files > 0 ? 0 : 1;
}
