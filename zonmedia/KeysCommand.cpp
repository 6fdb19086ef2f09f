#include "zonmedia/Commands.h"
#include "zonmedia/Texts.h"
#include "zonmedia/TranslationTemplate.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <iostream>
#include <string_view>

namespace zonmedia
{

namespace
{

struct KeysArguments : CommonArguments
{
	bool mIsTemplate = false;
};

Status RunKeys(const KeysArguments& inArguments)
{
	if (inArguments.mIsTemplate)
	{
		WriteTranslationTemplate(std::cout);
		return Status::Fine;
	}
	Table table{"Keys", {"Path", "Text"}, {}};
	const auto add = [&](std::string_view inText)
	{
		const TextKey key(inText);
		table.mRows.push_back({std::string(key.mPath), std::string(key.mText)});
	};
	std::ranges::for_each(zonmediatypes::AllTextKeys(), add);
	for (const auto& [text, note] : AllOwnTexts())
		add(text);
	Print({{"Count", {"", static_cast<std::int64_t>(table.mRows.size())}}, {std::move(table)}}, inArguments.GetStyle());
	return Status::Fine;
}

}   // namespace

void AddKeysCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<KeysArguments>();
	AddCommand(ioApplication, outRun, "keys", "List the keys and English texts of the library and the companion",
		"  zonmedia keys\n  zonmedia keys --pot > zonmediatypes.pot", arguments, RunKeys)
		.add_flag("--pot", arguments->mIsTemplate, "Write a gettext template for translators")
		->excludes("--json");
}

}   // namespace zonmedia
