#pragma once

/// \file
/// What a command has to say, and the two forms in which it is said: text for people and JSON for programs. Both come from
/// the same records, so that neither can show what the other lacks.

#include "zonmedia/Problem.h"
#include "zonmedia/TextLines.h"

#include <cstddef>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace zonmedia
{

using Json = nlohmann::ordered_json;

/// One thing said: as text, and as a JSON value.
struct Value
{
	Value(std::string inText);       // NOLINT(google-explicit-constructor): text, numbers and answers are values
	Value(const char* inText);       // NOLINT(google-explicit-constructor)
	Value(bool inAnswer);            // NOLINT(google-explicit-constructor): "yes" or "no"
	Value(int inNumber);             // NOLINT(google-explicit-constructor)
	Value(std::int64_t inNumber);    // NOLINT(google-explicit-constructor)
	Value(std::uint64_t inNumber);   // NOLINT(google-explicit-constructor)
	Value(double inNumber);          // NOLINT(google-explicit-constructor)
	/// A value that programs get in another form than people.
	Value(std::string inText, Json inJson);

	bool IsNumber() const { return mJson.is_number(); }

	std::string mText;
	Json mJson;
};

/// A value with its name. The name is written as people read it in English ("Frame size"): JSON's is made from it
/// ("frameSize"), and people see it in the language of the run (see Texts.h).
struct Field
{
	std::string mName;
	Value mValue;
};

/// Rows of values under column names; in JSON an array with one object a row.
struct Table
{
	std::string mName;
	std::vector<std::string> mColumns;
	std::vector<std::vector<Value>> mRows;
};

/// A table whose rows and columns are numbered rather than named in JSON, such as a matrix: JSON gets mJson.
struct Grid
{
	Table mTable;
	Json mJson;
};

/// A sentence about the whole record, for people; programs find what it says in a field of its own.
struct Note
{
	std::string mText;
};

/// The sheet of one thing: a file, a value, a layout.
struct Record
{
	/// What the sheet is about: its headline, and its first field in JSON. No headline when its text is empty.
	Field mSubject;
	std::vector<std::variant<Field, Table, Grid, Note>> mItems;

	void Add(std::string inName, Value inValue) { mItems.emplace_back(Field{std::move(inName), std::move(inValue)}); }
};

/// How a run writes.
struct Style
{
	bool mIsJson = false;
	bool mHasColours = false;   ///< standard output is a terminal that shows them
	std::size_t mLineWidth = kAnyWidth;
};

/// The style for standard output as it is.
Style StyleOfOutput(bool inIsJson);

/// The name of a field in JSON: "Frame size" is "frameSize".
std::string JsonName(std::string_view inName);

/// Text of others, safe on a terminal: control characters become "?".
std::string Printable(std::string_view inText);

/// One line about what went wrong, on standard error. inWhat names the input that it happened to; it may be empty.
void Complain(std::string_view inWhat, std::string_view inWhy);

/// Writes the only record of a command.
void Print(const Record& inRecord, Style inStyle);

/// The records of a command that takes any number of inputs. People get each record at once, programs one document with
/// all of them, and what went wrong, at the end.
class RecordList
{
public:
	/// inName is the list's name in JSON.
	RecordList(std::string_view inName, Style inStyle) : mName(inName), mStyle(inStyle) {}

	void Add(const Record& inRecord);
	/// Adds a record of which people get only this line.
	void AddLine(const Record& inRecord, std::string_view inLine);
	/// Complains about an input and goes on.
	void AddProblem(std::string_view inInput, std::string_view inWhy);
	/// Ends the document; Fine when there was no problem.
	Status Finish();

private:
	void Keep(const Record& inRecord);

	std::string mName;
	Style mStyle;
	bool mIsFirst = true;
	Json mRecords = Json::array();
	Json mProblems = Json::array();
};

}   // namespace zonmedia
