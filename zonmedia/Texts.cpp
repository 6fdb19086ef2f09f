#include "zonmedia/Texts.h"

#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"
#include "zonmedia/Report.h"

#include <algorithm>
#include <array>

namespace zonmedia
{

namespace
{

constexpr auto sTexts = std::to_array<const OwnText*>({
	&kText_DecimalSign,
	&kText_Yes,
	&kText_No,
	&kText_NoBecause,
	&kText_Unknown,
	&kText_None,
	&kText_Ticks,
	&kText_TickCount,
	&kText_RoundedTickCount,
	&kText_RoundedRate,
	&kText_LastFrame,
	&kText_LastSample,
	&kText_NotCounted,
	&kText_NoTimecode,
	&kText_NoCounterpart,
	&kText_Average,
	&kText_AverageAndRange,
	&kText_Truncated,
	&kText_TruncatedSound,
	&kText_FromTo,
	&kText_Untaken,
	&kText_ChannelCounts,
	&kText_MissingChannel,
	&kText_FewerUnlabelled,
	&kText_Straight,
	&kText_Premultiplied,
	&kText_Ignored,
	&kText_FullRange,
	&kText_Impossible,
	&kText_NothingUsable,
	&kText_Requested,
	&kText_BothKnow,
	&kText_NothingConverts,
	&kText_Cheapest,
	&kText_LegacyRatio,
});

// Rows, columns and tables that people see, by the name from which JSON's is made.
constexpr auto sNames = std::to_array<std::string_view>({
	"Alpha",
	"Audio",
	"Audio streams",
	"Channel",
	"Channels",
	"Check",
	"Checks",
	"Chroma",
	"Code",
	"Codec",
	"Colour",
	"Compressed",
	"Cost",
	"Count",
	"Depth",
	"Description",
	"Destination",
	"Display",
	"Displays",
	"Duration",
	"Duration in other displays",
	"End",
	"Fields",
	"Film frame",
	"Fixed size",
	"Format",
	"Formats",
	"Frame",
	"Frame bytes",
	"Frame duration",
	"Frame size",
	"Frames",
	"Frames per second",
	"From square pixels",
	"Front back",
	"Has LFE",
	"Has labels",
	"Image codec",
	"Image size",
	"In square pixels",
	"Is possible",
	"Is reordering",
	"Keys",
	"Label",
	"Labels",
	"Layout",
	"Layouts",
	"Left right",
	"Legacy",
	"Letter",
	"Linear",
	"Marked",
	"Matrix",
	"Message",
	"Milliseconds",
	"Missing",
	"Name",
	"Number",
	"Ordering",
	"Passed",
	"Path",
	"Pixel format",
	"Pixel shape",
	"Properties",
	"Quality",
	"Rate",
	"Rate is rounded",
	"Result",
	"Reversed",
	"Row bytes",
	"Sample rate",
	"Samples",
	"Size",
	"Source",
	"Start",
	"Stored as",
	"Stream",
	"Suite",
	"Text",
	"Ticks",
	"Timecode tag",
	"To",
	"Variable frame rate",
	"Video codec",
	"Video frame",
	"Video time",
	"Why",
});
static_assert(std::ranges::is_sorted(sNames));

std::string KeyOfName(std::string_view inEnglish)
{
	return "$$$/zonmedia/Name/" + JsonName(inEnglish) + "=" + std::string(inEnglish);
}

std::string Lookup(std::string_view inKey)
{
	return zoncore::utility::UTF16to8(zoncore::config::Localizer::Get().Lookup(inKey));
}

bool IsDigit(char inChar)
{
	return inChar >= '0' && inChar <= '9';
}

}   // namespace

std::vector<std::pair<std::string, std::string_view>> AllOwnTexts()
{
	std::vector<std::pair<std::string, std::string_view>> texts;
	for (const std::string_view name : sNames)
		texts.emplace_back(KeyOfName(name), "The name of a row, a column or a table.");
	for (const OwnText* text : sTexts)
		texts.emplace_back(text->mKey, text->mNote);
	return texts;
}

std::string Say(const OwnText& inText, std::initializer_list<std::string> inReplacements)
{
	std::vector<zoncore::UTF16String> replacements;
	for (const std::string& replacement : inReplacements)
		replacements.push_back(zoncore::utility::UTF8to16(replacement));
	return zoncore::utility::UTF16to8(zoncore::config::Localizer::Get().Lookup(inText.mKey, replacements));
}

std::string NameInLanguage(std::string_view inEnglish)
{
	return std::ranges::binary_search(sNames, inEnglish) ? Lookup(KeyOfName(inEnglish)) : std::string(inEnglish);
}

std::string WithDecimalSign(std::string_view inText)
{
	const std::string sign = Say(kText_DecimalSign);
	std::string text;
	for (std::size_t i = 0; i < inText.size(); ++i)
	{
		const bool isSign
			= inText[i] == '.' && i > 0 && i + 1 < inText.size() && IsDigit(inText[i - 1]) && IsDigit(inText[i + 1]);
		text.append(isSign ? std::string_view(sign) : inText.substr(i, 1));
	}
	return text;
}

}   // namespace zonmedia
