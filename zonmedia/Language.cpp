#include "zonmedia/Language.h"

#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zonmedia/Names.h"

#include <algorithm>
#include <filesystem>
#include <memory>
#include <optional>
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

// The language of a locale without its country: "pt" of "pt_PT".
std::string_view WithoutCountry(std::string_view inLanguage)
{
	return inLanguage.substr(0, inLanguage.find('_'));
}

// The one of inPresent that is closest to a locale: "de-AT.UTF-8" is "de_AT", else "de", else German of any country.
std::optional<std::string> ClosestLanguage(std::string_view inLocale, const std::vector<std::string>& inPresent)
{
	std::string wanted(inLocale.substr(0, inLocale.find_first_of(".@")));
	std::ranges::replace(wanted, '-', '_');
	const std::string_view any = WithoutCountry(wanted);
	const auto find = [&](auto inIsMeant) { return std::ranges::find_if(inPresent, inIsMeant); };
	auto found = find([&](const std::string& inName) { return IsSameName(inName, wanted); });
	if (found == inPresent.end())
		found = find([&](const std::string& inName) { return IsSameName(inName, any); });
	if (found == inPresent.end())
		found = find([&](const std::string& inName) { return IsSameName(WithoutCountry(inName), any); });
	return found == inPresent.end() ? std::nullopt : std::optional(*found);
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
	if (const auto found = ClosestLanguage(inLanguage, present))
		return *found == kEnglish ? fs::path() : CatalogueOf(folder, *found);
	throw InputProblem(
		UnknownName("language", inLanguage, {present.begin(), present.end()}) + " (in " + folder.string() + ")");
}

}   // namespace

std::string LanguageNames()
{
	const std::vector<std::string> names = LanguagesIn(CatalogueFolder());
	return Joined(std::vector<std::string_view>(names.begin(), names.end()));
}

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
