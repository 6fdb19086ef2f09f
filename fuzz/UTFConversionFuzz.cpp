// Text between its encoding forms, against what a code unit and its neighbours say.

#include "FuzzInput.h"
#include "zoncore/StringUtils.h"

#include <string>

namespace
{

using namespace zoncore;
using namespace zoncore::utility;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

bool IsHigh(unsigned inUnit)
{
	return inUnit >= 0xD800 && inUnit < 0xDC00;
}

bool IsLow(unsigned inUnit)
{
	return inUnit >= 0xDC00 && inUnit < 0xE000;
}

// The text with every lone surrogate replaced.
UTF16String WellFormed(UTF16String inText)
{
	for (std::size_t i = 0; i < inText.size(); ++i)
	{
		if (IsHigh(inText[i]) && i + 1 < inText.size() && IsLow(inText[i + 1]))
			++i;
		else if (IsHigh(inText[i]) || IsLow(inText[i]))
			inText[i] = 0xFFFD;
	}
	return inText;
}

void CheckBytes(std::string_view inBytes)
{
	const UTF16String wide = UTF8to16(inBytes);
	const std::string narrow = UTF16to8(wide);
	Require(wide == WellFormed(wide), "what comes out is well-formed");
	Require(UTF8to16(narrow) == wide, "what comes out survives");
	const bool isReplaced = wide.find(0xFFFD) != UTF16String::npos;
	Require(isReplaced || narrow == inBytes, "what is well-formed survives");
	Require(wide.size() <= inBytes.size() && (!wide.empty() || inBytes.empty()), "nothing grows, nothing vanishes");

	// A byte that is no continuation begins something new: text may be cut before it.
	const std::size_t middle = inBytes.size() / 2;
	if (middle < inBytes.size() && (static_cast<unsigned char>(inBytes[middle]) & 0xC0) != 0x80)
		Require(
			UTF8to16(inBytes.substr(0, middle)) + UTF8to16(inBytes.substr(middle)) == wide, "halves make the whole");

	const UTF16String ascii = AsciiToUTF16(inBytes);
	Require(ascii.size() == inBytes.size(), "ASCII has as many characters as bytes");
	Require(ascii.find(0xFFFD) != UTF16String::npos || ascii == wide, "ASCII is UTF-8");
}

void CheckUnits(const UTF16String& inText)
{
	const std::string narrow = UTF16to8(inText);
	Require(UTF8to16(narrow) == WellFormed(inText), "what is well-formed survives, lone surrogates are replaced");
	Require(narrow == UTF16to8(UTF16StringView(inText)), "a view is as good");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	if (input.Flag())
		CheckBytes(input.Rest());
	else
		CheckUnits(input.Text());
	return 0;
}
