#include "zonmedia/Input.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <iostream>
#include <string_view>
#include <unistd.h>

namespace zonmedia
{

namespace
{

constexpr std::uint64_t kLinesBetweenReports = 10'000;

std::string WithoutBlanks(std::string_view inLine)
{
	constexpr std::string_view kBlanks = " \t\r\v\f";
	const std::size_t first = inLine.find_first_not_of(kBlanks);
	return first == std::string_view::npos
		? std::string()
		: std::string(inLine.substr(first, inLine.find_last_not_of(kBlanks) - first + 1));
}

// Uses one value; inPlace says where it stood, when that is worth saying.
void Use(const std::string& inValue, const std::string& inPlace, RecordList& ioRecords,
	const std::function<void(const std::string&)>& inUse)
{
	try
	{
		inUse(inValue);
	}
	catch (const InputProblem& problem)
	{
		ioRecords.AddProblem(inPlace + Quoted(inValue), problem.what());
	}
}

}   // namespace

void ForEachValue(
	const std::string& inValue, RecordList& ioRecords, const std::function<void(const std::string& inValue)>& inUse)
{
	if (inValue != "-")
		return Use(WithoutBlanks(inValue), "", ioRecords, inUse);
	// Results on the same terminal show the progress themselves.
	const bool showsProgress = isatty(STDERR_FILENO) == 1 && isatty(STDOUT_FILENO) == 0;
	std::uint64_t number = 0;
	for (std::string line; std::getline(std::cin, line);)
	{
		++number;
		const std::string value = WithoutBlanks(line);
		if (!value.empty())
			Use(value, "line " + std::to_string(number) + ": ", ioRecords, inUse);
		if (showsProgress && number % kLinesBetweenReports == 0)
			std::cerr << '\r' << number << " lines" << std::flush;
	}
	if (showsProgress && number >= kLinesBetweenReports)
		std::cerr << '\r' << number << " lines\n";
}

bool HasNumberAbove(std::string_view inText, std::uint64_t inMost)
{
	constexpr std::string_view kDigits = "0123456789";
	for (std::size_t begin = inText.find_first_of(kDigits); begin != std::string_view::npos;)
	{
		const std::size_t end = std::min(inText.find_first_not_of(kDigits, begin), inText.size());
		std::uint64_t number = 0;
		if (std::from_chars(inText.data() + begin, inText.data() + end, number).ec != std::errc() || number > inMost)
			return true;
		begin = inText.find_first_of(kDigits, end);
	}
	return false;
}

}   // namespace zonmedia
