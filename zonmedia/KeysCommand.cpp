#include "zonmedia/Commands.h"
#include "zonmedia/TranslationTemplate.h"
#include "zonmediatypes/Descriptions.h"

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
	for (const std::string_view text : zonmediatypes::AllTextKeys())
	{
		const TextKey key(text);
		table.mRows.push_back({std::string(key.mPath), std::string(key.mText)});
	}
	Print({{"Count", {"", static_cast<std::int64_t>(table.mRows.size())}}, {std::move(table)}}, inArguments.GetStyle());
	return Status::Fine;
}

}   // namespace

void AddKeysCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<KeysArguments>();
	AddCommand(ioApplication, outRun, "keys", "List the keys and English texts that the library looks up",
		"  zonmedia keys\n  zonmedia keys --pot > zonmediatypes.pot", arguments, RunKeys)
		.add_flag("--pot", arguments->mIsTemplate, "Write a gettext template for translators")
		->excludes("--json");
}

}   // namespace zonmedia
