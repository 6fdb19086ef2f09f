#include "zonmedia/Report.h"

#include "zonmedia/TextTable.h"
#include "zonmedia/Texts.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <iostream>
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

constexpr std::size_t kLeastText = 20;   // columns that a text gets, however narrow the terminal is

// ---- Text for people -------------------------------------------------------------------------------------------------

// A text that begins after inIndent columns, in lines that do not reach beyond the terminal.
void WriteText(std::string_view inText, std::size_t inIndent, Style inStyle)
{
	const std::size_t room
		= inStyle.mLineWidth == kAnyWidth ? kAnyWidth : std::max(inStyle.mLineWidth, inIndent + kLeastText) - inIndent;
	std::string_view indent;
	const std::string blanks(inIndent, ' ');
	for (const std::string& line : Wrapped(inText, room))
	{
		std::cout << indent << line << '\n';
		indent = blanks;
	}
}

// Writes the items of a record for people, one overload a kind.
struct ItemWriter
{
	Style mStyle;
	std::size_t mNameWidth;

	void operator()(const Field& inField) const
	{
		const std::string text = Printable(inField.mValue.mText);
		if (text.empty())
			return;
		std::cout << kIndent << Coloured(Padded(NameInLanguage(inField.mName), mNameWidth), kDim, mStyle) << kGap;
		WriteText(text, kIndent.size() + mNameWidth + kGap.size(), mStyle);
	}
	void operator()(const Table& inTable) const { WriteTable(inTable, mStyle); }
	void operator()(const Grid& inGrid) const { WriteTable(inGrid.mTable, mStyle); }
	void operator()(const Note& inNote) const
	{
		std::cout << '\n' << kIndent;
		WriteText(Printable(inNote.mText), kIndent.size(), mStyle);
	}
};

// The widest name of those that people see.
std::size_t FieldNameWidth(const Record& inRecord)
{
	std::size_t width = 0;
	for (const auto& item : inRecord.mItems)
	{
		const auto* field = std::get_if<Field>(&item);
		if (field != nullptr && !field->mValue.mText.empty())
			width = std::max(width, Width(NameInLanguage(field->mName)));
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
Value::Value(bool inAnswer) : mText(Say(inAnswer ? kText_Yes : kText_No)), mJson(inAnswer)
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
Value::Value(double inNumber) : mText(WithDecimalSign(NumberText(inNumber))), mJson(inNumber)
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
	return {inIsJson, showsColours && isatty(STDOUT_FILENO) == 1, LineWidth()};
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
