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

constexpr UTF16Char kPlaceholderMark = '@';

// Which replacement the mark at the start of inText asks for; past the end of any list when no digit follows it.
std::size_t PlaceholderIndex(UTF16StringView inText)
{
	const bool hasDigit = inText.size() > 1 && inText[1] >= '0' && inText[1] <= '9';
	return hasDigit ? static_cast<std::size_t>(inText[1] - '0') : UTF16StringView::npos;
}

}   // namespace

config::Localizer& config::Localizer::Get() noexcept
{
	static constinit Localizer sLocalizer;
	return sLocalizer;
}

UTF16String config::Localizer::Lookup(std::string_view inKey) const
{
	UTF16String text;
	if (Translate(inKey, text))
		return text;
	const auto catalogue = sCatalogue.Get();
	const std::string_view translation = catalogue ? catalogue->Find(inKey) : std::string_view();
	return utility::UTF8to16(translation.empty() ? EnglishText(inKey) : translation);
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
	UTF16String text;
	text.reserve(inTemplate.size());
	while (!inTemplate.empty())
	{
		const std::size_t plain = std::min(inTemplate.find(kPlaceholderMark), inTemplate.size());
		text.append(inTemplate.substr(0, plain));
		inTemplate.remove_prefix(plain);
		if (inTemplate.empty())
			break;
		const std::size_t index = PlaceholderIndex(inTemplate);
		const bool isFilled = index < inReplacements.size();
		text.append(isFilled ? UTF16StringView(inReplacements[index]) : inTemplate.substr(0, 1));
		inTemplate.remove_prefix(isFilled ? 2 : 1);
	}
	return text;
}

}   // namespace zoncore
