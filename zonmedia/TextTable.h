#pragma once

/// \file
/// Tables as people see them.

#include "zonmedia/Report.h"

namespace zonmedia
{

inline constexpr std::string_view kIndent = "  ";   ///< before each line of a record but its headline
inline constexpr std::string_view kGap = "  ";      ///< between columns

/// inText in a colour, or as it is where there are none.
std::string Coloured(std::string_view inText, std::string_view inColour, Style inStyle);

inline constexpr std::string_view kBold = "\033[1m";
inline constexpr std::string_view kDim = "\033[2m";

/// Writes a table with its name. Where it is wider than a line its texts are wrapped, the widest first; where that does not do
/// it is written in several parts, each with the first column.
void WriteTable(const Table& inTable, Style inStyle);

}   // namespace zonmedia
