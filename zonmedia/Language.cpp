#include "zonmedia/Language.h"

#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zonmedia/Names.h"

#include <algorithm>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace zonmedia
{

namespace
{

namespace fs = std::filesystem;

constexpr std::string_view kEnglish = "en";

// Found from where the program lies, so that an installation can be moved.
fs::path CatalogueFolder()
{
	std::error_code error;
	const fs::path program = fs::read_symlink("/proc/self/exe", error);
	return error ? fs::path() : (program.parent_path() / ZON_LOCALES_FROM_PROGRAM).lexically_normal();
}

fs::path CatalogueOf(const fs::path& inFolder, const std::string& inLanguage)
{
	return inFolder / inLanguage / "LC_MESSAGES" / "zonmediatypes.mo";
}

std::vector<std::string> LanguagesIn(const fs::path& inFolder)
{
	std::vector<std::string> languages{std::string(kEnglish)};
	std::error_code error;
	for (const fs::directory_entry& entry : fs::directory_iterator(inFolder, error))
	{
		const std::string language = entry.path().filename().string();
		if (fs::exists(CatalogueOf(inFolder, language), error))
			languages.push_back(language);
	}
	std::ranges::sort(languages);
	return languages;
}

// The languages that a locale's name stands for, the closest first: "de-AT.UTF-8" is "de_AT", else "de".
std::vector<std::string> LanguagesOf(std::string_view inLocale)
{
	std::string language(inLocale.substr(0, inLocale.find_first_of(".@")));
	std::ranges::replace(language, '-', '_');
	return {language, language.substr(0, language.find('_'))};
}

bool IsFile(std::string_view inLanguage)
{
	return inLanguage.find('/') != std::string_view::npos || inLanguage.ends_with(".mo");
}

// Empty for English.
fs::path FindCatalogue(std::string_view inLanguage)
{
	if (IsFile(inLanguage))
		return inLanguage;
	const fs::path folder = CatalogueFolder();
	const std::vector<std::string> present = LanguagesIn(folder);
	for (const std::string& language : LanguagesOf(inLanguage))
	{
		const auto isMeant = [&](const std::string& inName) { return IsSameName(inName, language); };
		if (const auto found = std::ranges::find_if(present, isMeant); found != present.end())
			return *found == kEnglish ? fs::path() : CatalogueOf(folder, *found);
	}
	throw InputProblem(
		UnknownName("language", inLanguage, {present.begin(), present.end()}) + " (in " + folder.string() + ")");
}

}   // namespace

void UseLanguage(std::string_view inLanguage)
{
	const fs::path path = FindCatalogue(inLanguage);
	if (path.empty())
		return;
	const auto catalogue = std::make_shared<zoncore::config::MessageCatalogue>();
	std::string error;
	if (!catalogue->Load(path.string(), error))
		throw InputProblem(error);
	zoncore::config::Localizer::Get().SetCatalogue(catalogue);
}

}   // namespace zonmedia
