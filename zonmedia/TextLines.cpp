#include "zonmedia/TextLines.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <sys/ioctl.h>
#include <unistd.h>

namespace zonmedia
{

namespace
{

constexpr std::size_t kLeastWidth = 40;   // narrower lines would be all breaks

// The blocks of Unicode whose characters take two columns of a terminal.
struct Range
{
	char32_t mFirst, mLast;
};
constexpr auto sWideBlocks = std::to_array<Range>({{0x1100, 0x115F}, {0x2E80, 0xA4CF}, {0xAC00, 0xD7A3},
	{0xF900, 0xFAFF}, {0xFE30, 0xFE6F}, {0xFF00, 0xFF60}, {0xFFE0, 0xFFE6}, {0x20000, 0x3FFFD}});

constexpr std::size_t Columns(char32_t inChar)
{
	const auto isIn = [inChar](Range inBlock) { return inChar >= inBlock.mFirst && inChar <= inBlock.mLast; };
	return std::ranges::any_of(sWideBlocks, isIn) ? 2 : 1;
}

std::vector<std::string_view> LinesOf(std::string_view inText)
{
	std::vector<std::string_view> lines;
	for (std::size_t begin = 0; begin < inText.size();)
	{
		const std::size_t end = std::min(inText.find('\n', begin), inText.size());
		lines.push_back(inText.substr(begin, end - begin));
		begin = end + 1;
	}
	return lines;
}

// Where what follows a name begins: after the first two blanks in a row after it; the indent when there is no name.
std::size_t HangingIndent(std::string_view inLine)
{
	const std::size_t name = std::min(inLine.find_first_not_of(' '), inLine.size());
	const std::size_t gap = name == 0 ? std::string_view::npos : inLine.find("  ", name);
	return gap == std::string_view::npos ? name : std::min(inLine.find_first_not_of(' ', gap), inLine.size());
}

// The line with its text broken, all lines but the first after inIndent blanks and all but the last before inMark.
std::string Broken(
	std::string_view inLine, std::size_t inStart, std::size_t inIndent, std::string_view inMark, std::size_t inWidth)
{
	const std::size_t room = std::max(inWidth, inIndent + kLeastWidth / 2) - inIndent - inMark.size();
	std::string text(inLine.substr(0, inStart));
	const std::vector<std::string> lines = Wrapped(inLine.substr(inStart), room);
	for (std::size_t i = 0; i < lines.size(); ++i)
	{
		text.append(i == 0 ? "" : std::string(inIndent, ' ')).append(lines[i]);
		text.append(i + 1 == lines.size() ? "" : inMark).append("\n");
	}
	return text;
}

}   // namespace

std::size_t LineWidth()
{
	const char* const stated = std::getenv("COLUMNS");
	const std::string_view text = stated == nullptr ? "" : stated;
	std::size_t width = 0;
	if (std::from_chars(text.data(), text.data() + text.size(), width).ec != std::errc())
	{
		winsize size{};
		width = ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
	}
	return width == 0 ? kAnyWidth : std::max(width, kLeastWidth);
}

std::size_t Width(std::string_view inText)
{
	std::size_t width = 0;
	for (std::size_t begin = 0; begin < inText.size();)
	{
		const auto isTail = [](char inByte) { return (static_cast<unsigned char>(inByte) & 0xC0) == 0x80; };
		const auto next = std::ranges::find_if_not(inText.substr(begin + 1), isTail);
		const std::string_view bytes(inText.begin() + static_cast<std::ptrdiff_t>(begin), next);
		const unsigned lead = static_cast<unsigned char>(bytes.front());
		char32_t code = bytes.size() == 1 ? lead : lead & (0x7Fu >> std::min<std::size_t>(bytes.size(), 7));
		for (const char tail : bytes.substr(1))
			code = code << 6 | (static_cast<unsigned char>(tail) & 0x3Fu);
		width += Columns(code);
		begin += bytes.size();
	}
	return width;
}

std::string Padded(std::string_view inText, std::size_t inWidth, bool inToTheRight)
{
	const std::string blanks(inWidth - std::min(inWidth, Width(inText)), ' ');
	return inToTheRight ? blanks + std::string(inText) : std::string(inText) + blanks;
}

std::string WithoutBlanksAtTheEnd(std::string_view inLine)
{
	return std::string(inLine.substr(0, inLine.find_last_not_of(' ') + 1));
}

std::vector<std::string> Wrapped(std::string_view inText, std::size_t inWidth)
{
	if (inWidth == kAnyWidth || Width(inText) <= inWidth)
		return {std::string(inText)};
	std::vector<std::string> lines{""};
	for (std::size_t begin = 0; begin < inText.size();)
	{
		const std::size_t end = std::min(inText.find(' ', begin), inText.size());
		const std::string_view word = inText.substr(begin, end - begin);
		if (!lines.back().empty() && Width(lines.back()) + 1 + Width(word) > inWidth)
			lines.emplace_back();
		lines.back().append(lines.back().empty() ? "" : " ").append(word);
		begin = end + 1;
	}
	return lines;
}

std::string WrappedHelp(std::string_view inHelp, std::size_t inWidth)
{
	constexpr std::size_t kIndentOfExamples = 2;
	std::string text;
	bool isExample = false;
	for (const std::string_view line : LinesOf(inHelp))
	{
		isExample = line.starts_with("Examples:") || (isExample && line.starts_with(' '));
		if (inWidth == kAnyWidth || Width(line) <= inWidth)
			text.append(line).append("\n");
		else if (isExample)
			text.append(Broken(line, kIndentOfExamples, 2 * kIndentOfExamples, " \\", inWidth));
		else
			text.append(Broken(line, HangingIndent(line), HangingIndent(line), "", inWidth));
	}
	return text;
}

}   // namespace zonmedia
