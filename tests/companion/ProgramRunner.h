#pragma once

/// \file
/// Runs a program as a user does, from a shell, and keeps what it said.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
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
struct ScratchFolder
{
	const std::string mPath = testing::TempDir() + "zonmedia-test-" + std::to_string(::getpid()) + "/";

	ScratchFolder() { std::filesystem::create_directories(mPath); }
	ScratchFolder(const ScratchFolder&) = delete;
	ScratchFolder& operator=(const ScratchFolder&) = delete;
	~ScratchFolder() { std::filesystem::remove_all(mPath); }
};
inline const ScratchFolder sScratchFolder;
inline const std::string& kScratch = sScratchFolder.mPath;

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

/// Runs ZON_PROGRAM with inInput as its standard input.
inline Outcome Zonmedia(const std::vector<std::string>& inArguments, const std::string& inInput = "")
{
	std::ofstream(kScratch + "input", std::ios::binary) << inInput;
	std::string command = ShellQuoted(ZON_PROGRAM);
	for (const std::string& argument : inArguments)
		command.append(" ").append(ShellQuoted(argument));
	const int status
		= std::system(("cd " + ShellQuoted(kScratch) + " && " + command + " <input >output 2>errors").c_str());
	return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, FileText(kScratch + "output"), FileText(kScratch + "errors")};
}

/// One line on standard error that says which program complains and contains inComplaint.
inline void ExpectComplaint(const Outcome& inOutcome, int inStatus, const std::string& inComplaint)
{
	EXPECT_EQ(inOutcome.mStatus, inStatus) << inComplaint;
	EXPECT_THAT(inOutcome.mErrors, testing::StartsWith("zonmedia: "));
	EXPECT_THAT(inOutcome.mErrors, testing::HasSubstr(inComplaint));
	EXPECT_EQ(std::ranges::count(inOutcome.mErrors, '\n'), 1) << inOutcome.mErrors;
}
