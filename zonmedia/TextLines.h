#pragma once

/// \file
/// Text as lines of a terminal: how wide it is, and where it is broken.

#include <cstddef>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

namespace zonmedia
{

/// The width of lines that are never broken.
inline constexpr std::size_t kAnyWidth = std::numeric_limits<std::size_t>::max();

/// The columns of a line: what COLUMNS says, or else the terminal that standard output is; kAnyWidth for files and pipes, where
/// a line is what programs search and cut.
std::size_t LineWidth();

/// The columns that UTF-8 text takes on a terminal.
std::size_t Width(std::string_view inText);

/// inText with blanks after it, or before it, up to inWidth columns.
std::string Padded(std::string_view inText, std::size_t inWidth, bool inToTheRight = false);

std::string WithoutBlanksAtTheEnd(std::string_view inLine);

/// inText, broken at blanks into lines of at most inWidth columns. Words are never broken, and may be wider. One line at least.
std::vector<std::string> Wrapped(std::string_view inText, std::size_t inWidth);

/// What the parser writes for --help, in lines of at most inWidth columns: descriptions stay in their column, and examples are
/// broken as a shell takes them.
std::string WrappedHelp(std::string_view inHelp, std::size_t inWidth);

}   // namespace zonmedia
