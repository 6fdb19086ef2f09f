#pragma once

/// \file
/// The language of the texts that the library gives, and of the companion's own.

#include <string>
#include <string_view>

namespace zonmedia
{

/// The languages there are catalogues for, and English: "de, en, pt_BR".
std::string LanguageNames();

/// Has the library's texts looked up in a message catalogue: that of a language ("de", "pt_BR"; "de_AT.UTF-8" and "pt" take
/// the nearest one there is), or the file that inLanguage names, which has a "/" in it or ends with ".mo". English needs
/// none. Throws InputProblem, and leaves the language as it was, when the catalogue is missing or damaged.
void UseLanguage(std::string_view inLanguage);

}   // namespace zonmedia
