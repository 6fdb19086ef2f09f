#include "zonmedia/StandardInput.h"

#include "zonmedia/Problem.h"

#include <array>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <system_error>
#include <unistd.h>

namespace zonmedia
{

namespace
{

namespace fs = std::filesystem;

constexpr const char* kItself = "/dev/stdin";

// An empty file of this run alone.
std::string TemporaryFile()
{
	std::error_code error;
	std::string name = (fs::temp_directory_path(error) / "zonmedia-XXXXXX").string();
	const int file = error ? -1 : mkstemp(name.data());
	if (file < 0)
		throw InputProblem("no temporary file can be made to keep it in");
	close(file);
	return name;
}

bool CopyInput(const std::string& inPath)
{
	std::ofstream copy(inPath, std::ios::binary);
	std::array<char, 1 << 16> block{};
	do
	{
		std::cin.read(block.data(), block.size());
		copy.write(block.data(), std::cin.gcount());
	} while (std::cin && copy);
	copy.close();
	return !copy.fail();
}

}   // namespace

StandardInput::StandardInput() : mPath(kItself)
{
	std::error_code error;
	if (fs::is_regular_file(mPath, error))
		return;
	mPath = TemporaryFile();
	mIsKept = true;
	if (CopyInput(mPath))
		return;
	fs::remove(mPath, error);
	throw InputProblem("the temporary file " + mPath + " cannot hold it");
}

StandardInput::~StandardInput()
{
	std::error_code error;
	if (mIsKept)
		fs::remove(mPath, error);
}

}   // namespace zonmedia
