#pragma once

/// \file
/// Translations of one language, read from a message catalogue in gettext's binary format (.mo).
///
/// A key of the localiser finds its translation with its path as context and its English text as message id: in a .po
/// file, the key "$$$/zonmediatypes/RenderQuality/Draft=Draft" is
///
///     msgctxt "$$$/zonmediatypes/RenderQuality/Draft"
///     msgid "Draft"
///     msgstr "Entwurf"
///
/// so that a changed English text marks its entry for the translator.

#include "zoncore/Export.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace zoncore::config
{

/// A catalogue that is checked whole when it is read and does not change afterwards; any number of threads may look up in
/// it. Catalogues of either byte order are read; their text must be UTF-8. Plural forms are not used.
class ZONCORE_API MessageCatalogue
{
public:
	MessageCatalogue() = default;
	MessageCatalogue(const MessageCatalogue&) = delete;   // messages refer into the catalogue's own bytes
	MessageCatalogue& operator=(const MessageCatalogue&) = delete;
	MessageCatalogue(MessageCatalogue&&) = default;
	MessageCatalogue& operator=(MessageCatalogue&&) = default;
	~MessageCatalogue() = default;

	/// Reads the file at inPath. False, outError saying in one line what was wrong, and the catalogue as before when the
	/// file cannot be read or is not a sound catalogue. Files above 64 MB are refused.
	bool Load(const std::string& inPath, std::string& outError);

	/// Reads a catalogue from memory, as Load does; inBytes may be anything.
	bool Parse(std::string_view inBytes, std::string& outError);

	/// The translation of inKey in UTF-8, valid as long as this catalogue is neither changed nor destroyed; empty when
	/// there is none. Costs a binary search over the messages.
	std::string_view Find(std::string_view inKey) const noexcept;

	/// The number of translated messages, the header not counted.
	std::size_t GetSize() const noexcept { return mMessages.size(); }

private:
	struct Message
	{
		std::string_view mId;   // context, EOT and message id, as the file has them
		std::string_view mText;
	};

	std::vector<char> mBytes;         // what the messages refer to; a vector keeps its bytes in place when moved
	std::vector<Message> mMessages;   // sorted by mId
};

}   // namespace zoncore::config
