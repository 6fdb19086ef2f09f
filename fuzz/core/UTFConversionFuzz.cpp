// Text between its encoding forms, against a decoder of its own.

#include "fuzz/Checks.h"
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

// The bytes behind a first byte, and what the first of them may be.
struct Continuation
{
	std::size_t mCount;
	unsigned mLowest, mHighest;
};

// Unicode Standard, table 3-7: well-formed UTF-8; no byte behind what begins nothing.
Continuation ContinuationOf(unsigned inFirst)
{
	if (inFirst >= 0xC2 && inFirst < 0xE0)
		return {1, 0x80, 0xBF};
	if (inFirst >= 0xE0 && inFirst < 0xF0)
		return {2, inFirst == 0xE0 ? 0xA0u : 0x80u, inFirst == 0xED ? 0x9Fu : 0xBFu};
	if (inFirst >= 0xF0 && inFirst < 0xF5)
		return {3, inFirst == 0xF0 ? 0x90u : 0x80u, inFirst == 0xF4 ? 0x8Fu : 0xBFu};
	return {0, 0, 0};
}

UTF16String DecodeStepwise(std::string_view inBytes)
{
	UTF16String text;
	for (std::size_t i = 0; i < inBytes.size();)
	{
		const auto first = static_cast<unsigned char>(inBytes[i++]);
		auto [count, lowest, highest] = ContinuationOf(first);
		char32_t code = first < 0x80 ? first : first & (0x3Fu >> count);
		bool isComplete = first < 0x80 || count > 0;
		for (; count > 0 && isComplete; --count, lowest = 0x80, highest = 0xBF)
		{
			const unsigned next = i < inBytes.size() ? static_cast<unsigned char>(inBytes[i]) : 0;
			isComplete = next >= lowest && next <= highest;
			code = code << 6 | (next & 0x3F);
			i += isComplete ? 1 : 0;
		}
		if (!isComplete)
			text.push_back(0xFFFD);
		else if (code < 0x10000)
			text.push_back(static_cast<UTF16Char>(code));
		else
			text.append({static_cast<UTF16Char>(0xD7C0 + (code >> 10)), static_cast<UTF16Char>(0xDC00 + code % 0x400)});
	}
	return text;
}

void CheckBytes(FuzzInput& ioInput)
{
	const std::string_view bytes = ioInput.Rest();
	const UTF16String wide = UTF8to16(bytes);
	const std::string narrow = UTF16to8(wide);
	Require(wide == DecodeStepwise(bytes), "every maximal ill-formed piece is replaced");
	Require(wide == WellFormed(wide), "what comes out is well-formed");
	Require(UTF8to16(narrow) == wide, "what comes out survives");
	const bool isReplaced = wide.find(0xFFFD) != UTF16String::npos;
	Require(isReplaced || narrow == bytes, "what is well-formed survives");
	Require(wide.size() <= bytes.size() && (!wide.empty() || bytes.empty()), "nothing grows, nothing vanishes");

	// A byte that is no continuation begins something new: text may be cut before it.
	const std::size_t middle = bytes.size() / 2;
	if (middle < bytes.size() && (static_cast<unsigned char>(bytes[middle]) & 0xC0) != 0x80)
		Require(UTF8to16(bytes.substr(0, middle)) + UTF8to16(bytes.substr(middle)) == wide, "halves make the whole");

	const UTF16String ascii = AsciiToUTF16(bytes);
	Require(ascii.size() == bytes.size(), "ASCII has as many characters as bytes");
	for (std::size_t i = 0; i < bytes.size(); ++i)
	{
		const auto byte = static_cast<unsigned char>(bytes[i]);
		Require(ascii[i] == (byte < 0x80 ? byte : 0xFFFD), "ASCII is kept, and nothing else is");
	}
}

void CheckUnits(FuzzInput& ioInput)
{
	const UTF16String text = ioInput.Text();
	const std::string narrow = UTF16to8(text);
	Require(DecodeStepwise(narrow) == WellFormed(text), "what is well-formed survives, lone surrogates are replaced");
	Require(narrow == UTF16to8(UTF16StringView(text)), "a view is as good");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckUnits, CheckBytes}, inData, inSize);
}
