#pragma once

/// \file
/// The template for translators: every text that the library looks up, in gettext's format.

#include <algorithm>
#include <ostream>
#include <string_view>

namespace zonmedia
{

/// A key: a path and, after its first "=", the English text.
struct TextKey
{
	std::string_view mPath;
	std::string_view mText;

	explicit TextKey(std::string_view inKey)
		: mPath(inKey.substr(0, inKey.find('='))), mText(inKey.substr(std::min(mPath.size() + 1, inKey.size())))
	{
	}
};

/// Writes the template, a message with a note for each of the library's keys and the companion's, in their order. The same library gives the
/// same bytes.
void WriteTranslationTemplate(std::ostream& ioStream);

}   // namespace zonmedia
