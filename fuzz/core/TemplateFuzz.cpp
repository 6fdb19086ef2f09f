// Templates and keys whose placeholders are filled, and text that is replaced, against a walk character by character.

#include "fuzz/BufferChecks.h"
#include "fuzz/core/SmallCatalogue.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"

#include <algorithm>
#include <memory>
#include <mutex>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace
{

using namespace zoncore;
using zonfuzz::FuzzInput;
using zonfuzz::Require;
using zonfuzz::RequireInBuffer;

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

// A text cut into pieces at lengths that the input begins with; the last piece is what is left.
std::vector<UTF16String> TakePieces(FuzzInput& ioInput)
{
	std::vector<std::size_t> lengths(ioInput.Below(12));
	for (std::size_t& length : lengths)
		length = ioInput.Below(8);
	const UTF16String text = ioInput.Text();
	std::vector<UTF16String> pieces;
	std::size_t begin = 0;
	for (const std::size_t length : lengths)
	{
		pieces.push_back(text.substr(begin, length));
		begin += pieces.back().size();
	}
	pieces.push_back(text.substr(begin));
	return pieces;
}

void CheckFilling(FuzzInput& ioInput)
{
	std::vector<UTF16String> texts = TakePieces(ioInput);
	const UTF16String pattern = texts.back();
	texts.pop_back();
	const UTF16String filled = FillPlaceholders(pattern, texts);
	Require(filled == FillStepwise(pattern, texts), "templates are filled in one pass");
	RequireInBuffer(filled, [&](std::span<UTF16Char> outText) { return FillPlaceholders(outText, pattern, texts); });
}

void CheckReplacing(FuzzInput& ioInput)
{
	std::vector<UTF16String> texts = TakePieces(ioInput);
	texts.insert(texts.begin(), 3 - std::min<std::size_t>(texts.size(), 3), UTF16String());
	const UTF16String &text = texts.back(), &what = texts[0], &with = texts[1];
	UTF16String replaced = text;
	utility::ReplaceInString(replaced, what, with);
	Require(replaced == ReplaceStepwise(text, what, with), "every occurrence is replaced once");
	UTF16String itself = text;
	utility::ReplaceInString(itself, itself, with);
	Require(itself == (text.empty() ? text : with), "text is its own only occurrence");
	itself = text;
	utility::ReplaceInString(itself, what, itself);
	Require(itself == ReplaceStepwise(text, what, text), "text is put into itself as it was");
}

// What the translator knows for every key below "$$$/known/".
UTF16String sTranslation;

void InstallTranslator()
{
	config::Localizer::Get().SetTranslator(
		[](std::string_view inKey, UTF16String& outText)
		{
			outText = sTranslation;
			return inKey.starts_with("$$$/known/");
		});
}

// Installs the small catalogue, or takes it away.
void InstallCatalogue(bool inIsWanted)
{
	static const auto sCatalogue = []
	{
		auto catalogue = std::make_shared<config::MessageCatalogue>();
		std::string error;
		Require(catalogue->Parse(zonfuzz::SmallCatalogue(), error), "a sound catalogue is read");
		return catalogue;
	}();
	config::Localizer::Get().SetCatalogue(inIsWanted ? sCatalogue : nullptr);
}

void CheckKeys(FuzzInput& ioInput)
{
	static std::once_flag sIsInstalled;
	std::call_once(sIsInstalled, InstallTranslator);
	std::vector<UTF16String> texts = TakePieces(ioInput);
	const bool hasCatalogue = texts.size() % 2 == 0;
	InstallCatalogue(hasCatalogue);
	sTranslation = texts.back();
	texts.pop_back();
	const config::Localizer& localizer = config::Localizer::Get();
	const std::string english = utility::UTF16to8(sTranslation);
	const std::string known = "$$$/known/key=English", unknown = "$$$/unknown/key=" + english;
	Require(localizer.Lookup(known) == sTranslation, "the translation is that of the translator");
	Require(localizer.Lookup(unknown) == utility::UTF8to16(english), "without one the text is the English one");
	Require(localizer.Lookup(unknown, english) == utility::UTF8to16(english), "also when it is at hand");
	for (const std::string& key : {known, unknown})
		Require(localizer.Lookup(key, texts) == FillStepwise(localizer.Lookup(key), texts), "templates are filled");
	Require(localizer.Lookup("$$$/a=b") == UTF16String{static_cast<UTF16Char>(hasCatalogue ? 'c' : 'b')},
		"the catalogue knows what the translator does not");
	const std::string anything = utility::UTF16to8(texts.empty() ? sTranslation : texts.front());
	const std::size_t equals = anything.find('=');
	Require(anything.starts_with("$$$/known/") || anything == "$$$/a=b"
			|| localizer.Lookup(anything)
				== utility::UTF8to16(equals == std::string::npos ? "" : anything.substr(equals + 1)),
		"the English text stands after the first mark");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckFilling, CheckReplacing, CheckKeys}, inData, inSize);
}
