// Templates that are filled, and text that is replaced, against a walk character by character.

#include "FuzzInput.h"
#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"

#include <vector>

namespace
{

using namespace zoncore;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

UTF16String FillStepwise(const UTF16String& inTemplate, const std::vector<UTF16String>& inTexts)
{
	UTF16String text;
	for (std::size_t i = 0; i < inTemplate.size(); ++i)
	{
		const std::size_t digit = i + 1 < inTemplate.size() ? inTemplate[i + 1] - std::size_t{'0'} : 10;
		if (inTemplate[i] == '@' && digit < 10 && digit < inTexts.size())
			text += inTexts[digit], ++i;
		else
			text += inTemplate[i];
	}
	return text;
}

UTF16String ReplaceStepwise(const UTF16String& inText, const UTF16String& inWhat, const UTF16String& inWith)
{
	UTF16String text;
	for (std::size_t i = 0; i < inText.size();)
	{
		const bool isFound = !inWhat.empty() && UTF16StringView(inText).substr(i).starts_with(inWhat);
		text += isFound ? inWith : inText.substr(i, 1);
		i += isFound ? inWhat.size() : 1;
	}
	return text;
}

// inCount characters off the front of ioText.
UTF16String Take(UTF16String& ioText, std::size_t inCount)
{
	const UTF16String taken = ioText.substr(0, inCount);
	ioText.erase(0, taken.size());
	return taken;
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	std::vector<std::size_t> lengths(input.Below(12));
	for (std::size_t& length : lengths)
		length = input.Below(8);
	const std::size_t whatLength = input.Below(4);
	UTF16String pattern = input.Text();
	std::vector<UTF16String> texts;
	for (const std::size_t length : lengths)
		texts.push_back(Take(pattern, length));

	const UTF16String filled = FillPlaceholders(pattern, texts);
	Require(filled == FillStepwise(pattern, texts), "templates are filled in one pass");

	const UTF16String what = pattern.substr(0, whatLength);
	const UTF16String with = texts.empty() ? UTF16String() : texts.front();
	UTF16String replaced = filled;
	utility::ReplaceInString(replaced, what, with);
	Require(replaced == ReplaceStepwise(filled, what, with), "every occurrence is replaced once");
	UTF16String itself = filled;
	utility::ReplaceInString(itself, itself, itself);
	Require(itself == filled, "text replaced by itself stays");
	return 0;
}
