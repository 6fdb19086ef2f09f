#include "zoncore/Localizer.h"

#include "zoncore/MessageCatalogue.h"
#include "zoncore/StringUtils.h"
#include "zoncore/src/Hook.h"
#include "zoncore/src/TextKey.h"

#include <cstddef>
#include <memory>
#include <mutex>
#include <utility>

namespace zoncore
{
namespace
{

// Where texts come from besides the keys themselves.
struct Sources
{
	config::Translator mTranslator;
	std::shared_ptr<const config::MessageCatalogue> mCatalogue;
};

constinit Replaceable<Sources> sSources;
constinit std::mutex sChangeMutex;   // one change at a time; look-ups do not take it

// Replaces the sources by a copy that inChange has changed.
template <class Change>
void ChangeSources(Change inChange)
{
	std::shared_ptr<const Sources> before;   // given up after the lock: what it holds is the host's
	const std::lock_guard lock(sChangeMutex);
	before = sSources.Get();
	Sources next = before ? *before : Sources();
	inChange(next);
	const bool isEmpty = !next.mTranslator && !next.mCatalogue;
	sSources.Exchange(isEmpty ? nullptr : std::make_shared<const Sources>(std::move(next)));
}

// Whether the host's translator gave a text for inKey.
bool Translate(const config::Translator& inTranslator, std::string_view inKey, UTF16String& outText)
{
	try
	{
		return inTranslator && inTranslator(inKey, outText);
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
	const auto sources = sSources.Get();
	if (!sources)
		return utility::UTF8to16(EnglishText(inKey));
	if (UTF16String text; Translate(sources->mTranslator, inKey, text))
		return text;
	const std::string_view translation = sources->mCatalogue ? sources->mCatalogue->Find(inKey) : std::string_view();
	return utility::UTF8to16(translation.empty() ? EnglishText(inKey) : translation);
}

void config::Localizer::SetTranslator(Translator inTranslator)
{
	ChangeSources([&](Sources& ioSources) { ioSources.mTranslator = std::move(inTranslator); });
}

void config::Localizer::SetCatalogue(std::shared_ptr<const MessageCatalogue> inCatalogue)
{
	ChangeSources([&](Sources& ioSources) { ioSources.mCatalogue = std::move(inCatalogue); });
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
