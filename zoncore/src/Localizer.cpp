#include "zoncore/Localizer.h"

#include "zoncore/StringUtils.h"
#include "zoncore/src/Hook.h"
#include "zoncore/src/TextKey.h"

#include <cstddef>
#include <utility>

namespace zoncore
{
namespace
{

constinit Hook<bool(std::string_view, UTF16String&)> sTranslator;

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

}   // namespace

config::Localizer& config::Localizer::Get() noexcept
{
	static constinit Localizer sLocalizer;
	return sLocalizer;
}

UTF16String config::Localizer::Lookup(std::string_view inKey) const
{
	UTF16String text;
	return Translate(inKey, text) ? text : utility::UTF8to16(EnglishText(inKey));
}

void config::Localizer::SetTranslator(Translator inTranslator)
{
	sTranslator.Exchange(std::move(inTranslator));
}

UTF16String FillPlaceholders(UTF16StringView inTemplate, std::span<const UTF16String> inReplacements)
{
	UTF16String text;
	for (std::size_t i = 0; i < inTemplate.size(); ++i)
	{
		const bool isMark
			= inTemplate[i] == '@' && i + 1 < inTemplate.size() && inTemplate[i + 1] >= '0' && inTemplate[i + 1] <= '9';
		const auto index = isMark ? static_cast<std::size_t>(inTemplate[i + 1] - '0') : inReplacements.size();
		if (index < inReplacements.size())
		{
			text.append(inReplacements[index]);
			++i;
		}
		else
		{
			text.push_back(inTemplate[i]);
		}
	}
	return text;
}

}   // namespace zoncore
