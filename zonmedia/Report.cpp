#include "zonmedia/Report.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <iostream>
#include <numeric>
#include <span>
#include <unistd.h>
#include <utility>

namespace zonmedia
{

namespace
{

template <class Number>
std::string NumberText(Number inNumber)
{
	std::array<char, 32> text{};
	const auto end = std::to_chars(text.data(), text.data() + text.size(), inNumber).ptr;
	return {text.data(), end};
}

// ---- Text for people -------------------------------------------------------------------------------------------------

constexpr std::string_view kBold = "\033[1m";
constexpr std::string_view kDim = "\033[2m";
constexpr std::string_view kPlain = "\033[0m";

std::string Coloured(std::string_view inText, std::string_view inColour, Style inStyle)
{
	return inStyle.mHasColours ? std::string(inColour) + std::string(inText) + std::string(kPlain)
							   : std::string(inText);
}

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

// The columns that UTF-8 text takes on a terminal.
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

std::string Padded(std::string_view inText, std::size_t inWidth, bool inToTheRight = false)
{
	const std::string blanks(inWidth - std::min(inWidth, Width(inText)), ' ');
	return inToTheRight ? blanks + std::string(inText) : std::string(inText) + blanks;
}

constexpr std::string_view kIndent = "  ";
constexpr std::string_view kGap = "  ";

bool IsColumnOfNumbers(const Table& inTable, std::size_t inColumn)
{
	return std::ranges::all_of(inTable.mRows, [inColumn](const auto& inRow) { return inRow[inColumn].IsNumber(); });
}

std::size_t ColumnWidth(const Table& inTable, std::size_t inColumn)
{
	const auto widest = [inColumn](std::size_t inWidest, const auto& inRow)
	{ return std::max(inWidest, Width(Printable(inRow[inColumn].mText))); };
	return std::accumulate(inTable.mRows.begin(), inTable.mRows.end(), Width(inTable.mColumns[inColumn]), widest);
}

std::string WithoutBlanksAtTheEnd(std::string_view inLine)
{
	return std::string(inLine.substr(0, inLine.find_last_not_of(' ') + 1));
}

void WriteTable(const Table& inTable, Style inStyle)
{
	if (inTable.mRows.empty())
		return;
	std::string head;
	std::vector<std::string> lines(inTable.mRows.size());
	for (std::size_t column = 0; column < inTable.mColumns.size(); ++column)
	{
		const bool toTheRight = IsColumnOfNumbers(inTable, column);
		const std::size_t width = ColumnWidth(inTable, column);
		const std::string_view gap = column == 0 ? kIndent : kGap;
		head.append(gap).append(Padded(inTable.mColumns[column], width, toTheRight));
		for (std::size_t row = 0; row < lines.size(); ++row)
			lines[row].append(gap).append(Padded(Printable(inTable.mRows[row][column].mText), width, toTheRight));
	}
	if (!inTable.mName.empty())
		std::cout << '\n' << kIndent << Coloured(inTable.mName, kBold, inStyle) << '\n';
	if (head.find_first_not_of(' ') != std::string::npos)
		std::cout << Coloured(WithoutBlanksAtTheEnd(head), kDim, inStyle) << '\n';
	for (const std::string& line : lines)
		std::cout << WithoutBlanksAtTheEnd(line) << '\n';
}

// Writes the items of a record for people, one overload a kind.
struct ItemWriter
{
	Style mStyle;
	std::size_t mNameWidth;

	void operator()(const Field& inField) const
	{
		const std::string text = Printable(inField.mValue.mText);
		if (!text.empty())
			std::cout << kIndent << Coloured(Padded(inField.mName, mNameWidth), kDim, mStyle) << kGap << text << '\n';
	}
	void operator()(const Table& inTable) const { WriteTable(inTable, mStyle); }
	void operator()(const Grid& inGrid) const { WriteTable(inGrid.mTable, mStyle); }
	void operator()(const Note& inNote) const { std::cout << '\n' << kIndent << Printable(inNote.mText) << '\n'; }
};

// The widest name of those that people see.
std::size_t FieldNameWidth(const Record& inRecord)
{
	std::size_t width = 0;
	for (const auto& item : inRecord.mItems)
	{
		const auto* field = std::get_if<Field>(&item);
		if (field != nullptr && !field->mValue.mText.empty())
			width = std::max(width, Width(field->mName));
	}
	return width;
}

void Write(const Record& inRecord, Style inStyle)
{
	if (!inRecord.mSubject.mValue.mText.empty())
		std::cout << Coloured(Printable(inRecord.mSubject.mValue.mText), kBold, inStyle) << '\n';
	const ItemWriter writer{inStyle, FieldNameWidth(inRecord)};
	for (const auto& item : inRecord.mItems)
		std::visit(writer, item);
}

// ---- JSON for programs -----------------------------------------------------------------------------------------------

Json RowObject(const std::vector<std::string>& inColumns, const std::vector<Value>& inRow)
{
	Json object = Json::object();
	for (std::size_t column = 0; column < inColumns.size(); ++column)
		object[JsonName(inColumns[column])] = inRow[column].mJson;
	return object;
}

// Puts the items of a record into its object, one overload a kind.
struct ItemCollector
{
	Json& mObject;

	void operator()(const Field& inField) const { mObject[JsonName(inField.mName)] = inField.mValue.mJson; }
	void operator()(const Table& inTable) const
	{
		Json rows = Json::array();
		for (const auto& row : inTable.mRows)
			rows.push_back(RowObject(inTable.mColumns, row));
		mObject[JsonName(inTable.mName)] = std::move(rows);
	}
	void operator()(const Grid& inGrid) const { mObject[JsonName(inGrid.mTable.mName)] = inGrid.mJson; }
	void operator()(const Note&) const {}
};

Json Object(const Record& inRecord)
{
	Json object = Json::object();
	const ItemCollector collector{object};
	collector(inRecord.mSubject);
	for (const auto& item : inRecord.mItems)
		std::visit(collector, item);
	return object;
}

void WriteJson(const Json& inDocument)
{
	// Names of files need not be UTF-8; what is not becomes U+FFFD.
	std::cout << inDocument.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}   // namespace

Value::Value(std::string inText) : mText(std::move(inText)), mJson(mText)
{
}
Value::Value(const char* inText) : Value(std::string(inText))
{
}
Value::Value(bool inAnswer) : mText(inAnswer ? "yes" : "no"), mJson(inAnswer)
{
}
Value::Value(int inNumber) : Value(std::int64_t{inNumber})
{
}
Value::Value(std::int64_t inNumber) : mText(NumberText(inNumber)), mJson(inNumber)
{
}
Value::Value(std::uint64_t inNumber) : mText(NumberText(inNumber)), mJson(inNumber)
{
}
Value::Value(double inNumber) : mText(NumberText(inNumber)), mJson(inNumber)
{
}
Value::Value(std::string inText, Json inJson) : mText(std::move(inText)), mJson(std::move(inJson))
{
}

Style StyleOfOutput(bool inIsJson)
{
	const char* terminal = std::getenv("TERM");
	const bool showsColours
		= terminal != nullptr && std::string_view(terminal) != "dumb" && std::getenv("NO_COLOR") == nullptr;
	return {inIsJson, showsColours && isatty(STDOUT_FILENO) == 1};
}

std::string JsonName(std::string_view inName)
{
	const auto isLetterOrDigit = [](char inChar) {
		return (inChar >= 'a' && inChar <= 'z') || (inChar >= 'A' && inChar <= 'Z') || (inChar >= '0' && inChar <= '9');
	};
	const auto inCase = [](char inChar, bool inIsUpper)
	{
		const char lower = inChar >= 'A' && inChar <= 'Z' ? static_cast<char>(inChar - 'A' + 'a') : inChar;
		return inIsUpper && lower >= 'a' && lower <= 'z' ? static_cast<char>(lower - 'a' + 'A') : lower;
	};
	std::string name;
	bool startsWord = false;
	for (const char character : inName)
	{
		if (isLetterOrDigit(character))
			name.push_back(inCase(character, startsWord && !name.empty()));
		startsWord = !isLetterOrDigit(character);
	}
	return name;
}

std::string Printable(std::string_view inText)
{
	std::string text(inText);
	std::ranges::replace_if(
		text, [](char inChar) { return static_cast<unsigned char>(inChar) < 0x20 || inChar == 0x7F; }, '?');
	return text;
}

void Complain(std::string_view inWhat, std::string_view inWhy)
{
	std::cout.flush();   // a terminal shows both streams: what was said before stays before
	std::cerr << "zonmedia: " << Printable(inWhat) << (inWhat.empty() ? "" : ": ") << Printable(inWhy) << '\n';
}

void Print(const Record& inRecord, Style inStyle)
{
	if (inStyle.mIsJson)
		WriteJson(Object(inRecord));
	else
		Write(inRecord, inStyle);
}

void RecordList::Add(const Record& inRecord)
{
	if (mStyle.mIsJson)
	{
		mRecords.push_back(Object(inRecord));
		return;
	}
	if (!std::exchange(mIsFirst, false))
		std::cout << '\n';
	Write(inRecord, mStyle);
}

void RecordList::AddLine(const Record& inRecord, std::string_view inLine)
{
	if (mStyle.mIsJson)
		mRecords.push_back(Object(inRecord));
	else
		std::cout << Printable(inLine) << '\n';
}

void RecordList::AddProblem(std::string_view inInput, std::string_view inWhy)
{
	Complain(inInput, inWhy);
	mProblems.push_back(Json{{"input", inInput}, {"problem", inWhy}});
}

Status RecordList::Finish()
{
	const Status status = mProblems.empty() ? Status::Fine : Status::BadInput;
	if (mStyle.mIsJson)
		WriteJson(Json{{JsonName(mName), std::move(mRecords)}, {"problems", std::move(mProblems)}});
	return status;
}

}   // namespace zonmedia
