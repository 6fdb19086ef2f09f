#include "zonmedia/Commands.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/Version.h"

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

// A key is a path and, behind its first "=", the English text.
struct Key
{
	std::string_view mPath;
	std::string_view mText;

	explicit Key(std::string_view inKey)
		: mPath(inKey.substr(0, inKey.find('='))), mText(inKey.substr(std::min(mPath.size() + 1, inKey.size())))
	{
	}
};

// inText as a string of a .po file.
std::string PoString(std::string_view inText)
{
	std::string text = "\"";
	for (const char character : inText)
	{
		if (character == '"' || character == '\\')
			text.push_back('\\');
		text.push_back(character);
	}
	return text + '"';
}

void WriteTemplate()
{
	std::cout
		<< "# Display text of zonmediatypes. The context of a message is the path of its key.\n"
		   "# \"@0\", \"@1\" ... stand for values that are filled in; \"&\" precedes the accelerator of a menu item.\n"
		   "msgid \"\"\nmsgstr \"\"\n"
		   "\"Project-Id-Version: zonmediatypes "
		<< zonmediatypes::Version()
		<< "\\n\"\n\"MIME-Version: 1.0\\n\"\n\"Content-Type: text/plain; charset=UTF-8\\n\"\n"
		   "\"Content-Transfer-Encoding: 8bit\\n\"\n";
	for (const std::string_view text : zonmediatypes::AllTextKeys())
	{
		const Key key(text);
		std::cout << "\nmsgctxt " << PoString(key.mPath) << "\nmsgid " << PoString(key.mText) << "\nmsgstr \"\"\n";
	}
}

Status RunKeys(const KeysArguments& inArguments)
{
	if (inArguments.mIsTemplate)
	{
		WriteTemplate();
		return Status::Fine;
	}
	Table table{"Keys", {"Path", "Text"}, {}};
	for (const std::string_view text : zonmediatypes::AllTextKeys())
	{
		const Key key(text);
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
