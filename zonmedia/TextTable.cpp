#include "zonmedia/TextTable.h"

#include "zonmedia/TextLines.h"
#include "zonmedia/Texts.h"

#include <algorithm>
#include <iostream>
#include <numeric>
#include <span>
#include <utility>

namespace zonmedia
{

namespace
{

using Widths = std::vector<std::size_t>;

// What stands in a table, as text.
struct Cells
{
	std::vector<std::string> mHead;
	std::vector<std::vector<std::string>> mRows;
	std::vector<bool> mIsNumeric;   // for each column
};

Cells CellsOf(const Table& inTable)
{
	Cells cells{{}, {}, std::vector<bool>(inTable.mColumns.size(), true)};
	for (const std::string& column : inTable.mColumns)
		cells.mHead.push_back(NameInLanguage(column));
	for (const std::vector<Value>& row : inTable.mRows)
	{
		std::vector<std::string>& texts = cells.mRows.emplace_back();
		for (std::size_t column = 0; column < row.size(); ++column)
		{
			texts.push_back(Printable(row[column].mText));
			cells.mIsNumeric[column] = cells.mIsNumeric[column] && row[column].IsNumber();
		}
	}
	return cells;
}

std::size_t WidestWord(std::string_view inText)
{
	const std::vector<std::string> words = Wrapped(inText, 1);
	return Width(*std::ranges::max_element(words, {}, [](const std::string& inWord) { return Width(inWord); }));
}

// The widest of a column, by inMeasure.
template <class Measure>
std::size_t Widest(const Cells& inCells, std::size_t inColumn, Measure inMeasure)
{
	std::size_t widest = inMeasure(inCells.mHead[inColumn]);
	for (const std::vector<std::string>& row : inCells.mRows)
		widest = std::max(widest, inMeasure(row[inColumn]));
	return widest;
}

using Columns = std::vector<std::size_t>;

std::size_t LineOf(const Widths& inWidths, const Columns& inColumns)
{
	const auto add = [&](std::size_t inSum, std::size_t inColumn) { return inSum + kGap.size() + inWidths[inColumn]; };
	return std::accumulate(inColumns.begin(), inColumns.end(), std::size_t{0}, add);
}

// inWidths with those of inColumns that are wide as much less as makes them fit a line, where inLeast allows that.
Widths Shrunk(Widths inWidths, const Widths& inLeast, const Columns& inColumns, std::size_t inLine)
{
	while (LineOf(inWidths, inColumns) > inLine)
	{
		const auto shrinkable
			= [&](std::size_t inColumn) { return inWidths[inColumn] > inLeast[inColumn] ? inWidths[inColumn] : 0; };
		const std::size_t widest = *std::ranges::max_element(inColumns, {}, shrinkable);
		if (shrinkable(widest) == 0)
			break;
		--inWidths[widest];
	}
	return inWidths;
}

// The columns of each part of a table: all in one when that can be, and else the first in each and as many others as fit.
std::vector<Columns> PartsFor(const Widths& inWidths, const Widths& inLeast, std::size_t inLine)
{
	Columns all(inWidths.size());
	std::iota(all.begin(), all.end(), std::size_t{0});
	if (LineOf(inLeast, all) <= inLine)
		return {all};
	std::vector<Columns> parts{{0}};
	for (const std::size_t column : std::span(all).subspan(1))
	{
		Columns wider = parts.back();
		wider.push_back(column);
		if (wider.size() == 2 || LineOf(inWidths, wider) <= inLine)
			parts.back() = std::move(wider);
		else
			parts.push_back({0, column});
	}
	return parts;
}

void WriteRow(const std::vector<std::string>& inRow, const Cells& inCells, const Columns& inColumns,
	const Widths& inWidths, std::string_view inColour, Style inStyle)
{
	std::vector<std::vector<std::string>> cells;
	std::size_t height = 0;
	for (const std::size_t column : inColumns)
		height = std::max(height, cells.emplace_back(Wrapped(inRow[column], inWidths[column])).size());
	for (std::size_t number = 0; number < height; ++number)
	{
		std::string line;
		for (std::size_t i = 0; i < inColumns.size(); ++i)
		{
			const std::string_view text = number < cells[i].size() ? std::string_view(cells[i][number]) : "";
			line.append(i == 0 ? kIndent : kGap);
			line.append(Padded(text, inWidths[inColumns[i]], inCells.mIsNumeric[inColumns[i]]));
		}
		line = WithoutBlanksAtTheEnd(line);
		if (!line.empty())
			std::cout << (inColour.empty() ? line : Coloured(line, inColour, inStyle)) << '\n';
	}
}

}   // namespace

std::string Coloured(std::string_view inText, std::string_view inColour, Style inStyle)
{
	constexpr std::string_view kPlain = "\033[0m";
	return inStyle.mHasColours ? std::string(inColour).append(inText).append(kPlain) : std::string(inText);
}

void WriteTable(const Table& inTable, Style inStyle)
{
	if (inTable.mRows.empty())
		return;
	const Cells cells = CellsOf(inTable);
	Widths widest;
	Widths least;
	for (std::size_t column = 0; column < cells.mHead.size(); ++column)
	{
		widest.push_back(Widest(cells, column, Width));
		least.push_back(Widest(cells, column, WidestWord));
	}
	if (!inTable.mName.empty())
		std::cout << '\n' << kIndent << Coloured(NameInLanguage(inTable.mName), kBold, inStyle) << '\n';
	std::string_view between;
	for (const Columns& part : PartsFor(widest, least, inStyle.mLineWidth))
	{
		const Widths widths = Shrunk(widest, least, part, inStyle.mLineWidth);
		std::cout << std::exchange(between, "\n");
		WriteRow(cells.mHead, cells, part, widths, kDim, inStyle);
		for (const std::vector<std::string>& row : cells.mRows)
			WriteRow(row, cells, part, widths, "", inStyle);
	}
}

}   // namespace zonmedia
