#pragma once

/// \file
/// Display text by key. A key is a path, "=" and the English text, as in
/// "$$$/zonmediatypes/RenderQuality/Draft=Draft"; the host may install a translator that knows texts for keys, or a catalogue
/// that it has read (MessageCatalogue.h).
///
///     Localizer::Get().SetTranslator(
///         [](std::string_view inKey, UTF16String& outText)
///         {
///             if (!inKey.starts_with("$$$/zonmediatypes/RenderQuality/Draft="))
///                 return false;   // the English text after "="
///             outText = utility::UTF8to16("Entwurf");
///             return true;
///         });

#include "zoncore/Export.h"
#include "zoncore/UTF16String.h"

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <memory>
#include <span>
#include <string_view>
#include <utility>

namespace zoncore::config
{

class MessageCatalogue;

/// Receives the whole key, "=" and English text included. True: outText, empty at first, is the translation. False, or an
/// exception: the key has none, and what was written to outText is discarded. It is called with no lock held, from any
/// thread and by several at once.
using Translator = std::function<bool(std::string_view inKey, UTF16String& outText)>;

/// The process-wide source of display text.
class ZONCORE_API Localizer
{
public:
	static Localizer& Get() noexcept;

	/// The translation of inKey by the translator, else by the catalogue, else the English text after its first "="
	/// (UTF-8); a key without "=" has an empty one. Costs two atomic loads and the text when neither is installed. Safe on
	/// any thread.
	UTF16String Lookup(std::string_view inKey) const;

	/// The same with inEnglish, the text after the first "=", at hand: saves the search for it.
	UTF16String Lookup(std::string_view inKey, std::string_view inEnglish) const;

	/// The same with its placeholders filled, see FillPlaceholders; cheaper than filling the text that Lookup gives.
	UTF16String Lookup(std::string_view inKey, std::span<const UTF16String> inReplacements) const;

	/// Installs inTranslator; an empty one removes it. Safe while other threads look up: a look-up that has begun ends
	/// with the translator it began with.
	void SetTranslator(Translator inTranslator);

	/// Installs a catalogue for the keys that the translator does not know; null removes it. As safe as SetTranslator.
	void SetCatalogue(const std::shared_ptr<const MessageCatalogue>& inCatalogue);

private:
	Localizer() = default;
};

}   // namespace zoncore::config

namespace zoncore
{

/// Fills "@0" ... "@9" of inTemplate with inReplacements, in one pass: text that was filled in is not searched again. A
/// placeholder without replacement stays as it is, and so does "@" without a digit; "@10" is "@1" and a zero. Costs at most
/// one allocation, and time linear in the template and the text that comes out.
ZONCORE_API UTF16String FillPlaceholders(UTF16StringView inTemplate, std::span<const UTF16String> inReplacements);

/// The same into a caller's buffer, without a terminator. Returns the length of the text; a buffer that is too short for it
/// is left alone. The buffer overlaps neither the template nor a replacement.
ZONCORE_API std::size_t FillPlaceholders(
	std::span<UTF16Char> outText, UTF16StringView inTemplate, std::span<const UTF16String> inReplacements) noexcept;

/// The localised text of a key with its placeholders filled; see FillPlaceholders.
class ZString
{
public:
	explicit ZString(std::string_view inKey) : mText(config::Localizer::Get().Lookup(inKey)) {}
	ZString(std::string_view inKey, std::initializer_list<UTF16String> inReplacements)
		: ZString(inKey, std::span(inReplacements.begin(), inReplacements.size()))
	{
	}
	ZString(std::string_view inKey, std::span<const UTF16String> inReplacements)
		: mText(config::Localizer::Get().Lookup(inKey, inReplacements))
	{
	}

	operator UTF16String() const& { return mText; }          // NOLINT(google-explicit-constructor): it is that text
	operator UTF16String() && { return std::move(mText); }   // NOLINT(google-explicit-constructor)

private:
	UTF16String mText;
};

}   // namespace zoncore
