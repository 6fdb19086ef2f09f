#include "zoncore/Localizer.h"

#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"
#include "zoncore/src/Hook.h"
#include "zoncore/src/TextKey.h"

#include <algorithm>
#include <cstddef>
#include <utility>

namespace zoncore
{
namespace
{

constinit Hook<bool(std::string_view, UTF16String&)> sTranslator;
constinit Replaceable<config::MessageCatalogue> sCatalogue;

// Whether the host's translator gave a text for inKey.
bool Translate(std::string_view inKey, UTF16String& outText)
{
	const auto translator = sTranslator.Get();
	if (!translator)
		return false;
	try
	{
		return (*translator)(inKey, outText);
	}
	catch (...)
	{
		return false;   // display text is no reason for an operation to fail
	}
}

// The text of a key in UTF-8 when the host has none: that of the catalogue, if there is one, or the English text.
std::string_view TextOf(const config::MessageCatalogue* inCatalogue, std::string_view inKey, std::string_view inEnglish)
{
	const std::string_view translation = inCatalogue != nullptr ? inCatalogue->Find(inKey) : std::string_view();
	return translation.empty() ? inEnglish : translation;
}

// Takes a template of UTF-16 or of ASCII apart: calls inChar for each character that stays, inText for each replacement.
template <class View, class OnChar, class OnText>
void TakeApart(View inTemplate, std::span<const UTF16String> inReplacements, OnChar inChar, OnText inText)
{
	for (const auto *next = inTemplate.data(), *const end = next + inTemplate.size(); next != end; ++next)
	{
		const std::size_t index = *next == '@' && next + 1 != end ? static_cast<std::size_t>(next[1]) - '0' : 10;
		if (index >= 10 || index >= inReplacements.size())
		{
			inChar(static_cast<UTF16Char>(*next));
			continue;
		}
		inText(inReplacements[index]);
		++next;
	}
}

template <class View>
std::size_t FilledLength(View inTemplate, std::span<const UTF16String> inReplacements)
{
	std::size_t length = 0;
	TakeApart(
		inTemplate, inReplacements, [&](UTF16Char) { ++length; },
		[&](const UTF16String& inText) { length += inText.size(); });
	return length;
}

template <class View>
void Fill(View inTemplate, std::span<const UTF16String> inReplacements, UTF16Char* outText)
{
	TakeApart(
		inTemplate, inReplacements, [&](UTF16Char inChar) { *outText++ = inChar; },
		[&](const UTF16String& inText)
		{
			for (const UTF16Char unit : inText)   // most are too short for memcpy to pay
				*outText++ = unit;
		});
}

template <class View>
UTF16String Filled(View inTemplate, std::span<const UTF16String> inReplacements)
{
	UTF16String filled(FilledLength(inTemplate, inReplacements), 0);
	Fill(inTemplate, inReplacements, filled.data());
	return filled;
}

}   // namespace

config::Localizer& config::Localizer::Get() noexcept
{
	static constinit Localizer sLocalizer;
	return sLocalizer;
}

UTF16String config::Localizer::Lookup(std::string_view inKey) const
{
	return Lookup(inKey, EnglishText(inKey));
}

UTF16String config::Localizer::Lookup(std::string_view inKey, std::string_view inEnglish) const
{
	UTF16String text;
	if (Translate(inKey, text))
		return text;
	const auto catalogue = sCatalogue.Get();
	return utility::UTF8to16(TextOf(catalogue.get(), inKey, inEnglish));
}

UTF16String config::Localizer::Lookup(std::string_view inKey, std::span<const UTF16String> inReplacements) const
{
	UTF16String text;
	if (Translate(inKey, text))
		return FillPlaceholders(text, inReplacements);
	const auto catalogue = sCatalogue.Get();
	const std::string_view pattern = TextOf(catalogue.get(), inKey, EnglishText(inKey));
	const bool isAscii = std::ranges::all_of(pattern, [](unsigned char inByte) { return inByte < 0x80; });
	return isAscii ? Filled(pattern, inReplacements) : FillPlaceholders(utility::UTF8to16(pattern), inReplacements);
}

void config::Localizer::SetTranslator(Translator inTranslator)
{
	sTranslator.Set(std::move(inTranslator));
}

void config::Localizer::SetCatalogue(const std::shared_ptr<const MessageCatalogue>& inCatalogue)
{
	sCatalogue.Set(inCatalogue);
}

UTF16String FillPlaceholders(UTF16StringView inTemplate, std::span<const UTF16String> inReplacements)
{
	return Filled(inTemplate, inReplacements);
}

std::size_t FillPlaceholders(
	std::span<UTF16Char> outText, UTF16StringView inTemplate, std::span<const UTF16String> inReplacements) noexcept
{
	const std::size_t length = FilledLength(inTemplate, inReplacements);
	if (length <= outText.size())
		Fill(inTemplate, inReplacements, outText.data());
	return length;
}

}   // namespace zoncore
