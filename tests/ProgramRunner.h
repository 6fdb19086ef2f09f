#pragma once

/// \file
/// Runs a program as a user does, from a shell, and keeps what it said.

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

struct Outcome
{
	int mStatus = -1;   ///< the exit status; -1 when the program did not end by itself
	std::string mOutput;
	std::string mErrors;
};

/// A folder of this process alone, removed when it ends.
class ScratchFolder
{
public:
	ScratchFolder() : mPath(std::filesystem::temp_directory_path() / ("zonmedia-test-" + std::to_string(getpid())))
	{
		std::filesystem::create_directories(mPath);
	}
	ScratchFolder(const ScratchFolder&) = delete;
	ScratchFolder& operator=(const ScratchFolder&) = delete;
	~ScratchFolder()
	{
		std::error_code ignored;
		std::filesystem::remove_all(mPath, ignored);
	}

	std::string operator/(std::string_view inName) const { return (mPath / inName).string(); }

private:
	std::filesystem::path mPath;
};

inline const ScratchFolder& Scratch()
{
	static const ScratchFolder sFolder;
	return sFolder;
}

inline std::string FileText(const std::string& inPath)
{
	std::ifstream file(inPath, std::ios::binary);
	return {std::istreambuf_iterator<char>(file), {}};
}

inline std::string ShellQuoted(std::string_view inText)
{
	std::string quoted = "'";
	for (const char character : inText)
		quoted.append(character == '\'' ? "'\\''" : std::string(1, character));
	return quoted + "'";
}

/// Runs inProgram with inInput as its standard input.
inline Outcome RunProgram(
	const std::string& inProgram, const std::vector<std::string>& inArguments, const std::string& inInput = "")
{
	const std::string input = Scratch() / "input";
	const std::string output = Scratch() / "output";
	const std::string errors = Scratch() / "errors";
	std::ofstream(input, std::ios::binary) << inInput;
	std::string command = ShellQuoted(inProgram);
	for (const std::string& argument : inArguments)
		command += " " + ShellQuoted(argument);
	command += " <" + ShellQuoted(input) + " >" + ShellQuoted(output) + " 2>" + ShellQuoted(errors);
	const int status = std::system(command.c_str());
	return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, FileText(output), FileText(errors)};
}
