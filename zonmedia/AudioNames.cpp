#include "zonmedia/AudioNames.h"

#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

#include <optional>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language

namespace
{

std::vector<Named<AudioChannelLayout>> MakeLayoutNames()
{
	std::vector<Named<AudioChannelLayout>> names;
	for (const NamedChannelLayout& layout : AllChannelLayouts())
	{
		// Names made of abbreviations have underscores around them.
		const std::size_t first = std::min(layout.mName.find_first_not_of('_'), layout.mName.size());
		const std::string_view name = layout.mName.substr(first, layout.mName.find_last_not_of('_') + 1 - first);
		names.push_back({std::string(name), AudioChannelLayout(layout.mLabels.begin(), layout.mLabels.end())});
	}
	return names;
}

std::vector<Named<AudioChannelLabel>> MakeLabelNames()
{
	std::vector<Named<AudioChannelLabel>> names;
	for (const AudioChannelLabel label : AllAudioChannelLabels())
		names.push_back({Abbreviation(label), label});
	return names;
}

std::span<const Named<AudioChannelLabel>> LabelNames()
{
	static const std::vector<Named<AudioChannelLabel>> sNames = MakeLabelNames();
	return sNames;
}

AudioChannelLayout ReadAbbreviations(std::span<const std::string_view> inItems)
{
	AudioChannelLayout layout;
	for (const std::string_view item : inItems)
		layout.emplace_back(ValueNamed<AudioChannelLabel>(
			LabelNames(), "channel", item, "; \"zonmedia audio layouts\" lists the channels of each layout"));
	return layout;
}

std::vector<std::string_view> WordsOf(std::string_view inText)
{
	std::vector<std::string_view> words;
	for (std::size_t begin = inText.find_first_not_of(' '); begin != std::string_view::npos;)
	{
		const std::size_t end = std::min(inText.find(' ', begin), inText.size());
		words.push_back(inText.substr(begin, end - begin));
		begin = inText.find_first_not_of(' ', end);
	}
	return words;
}

bool IsAbbreviation(std::string_view inText)
{
	return std::ranges::any_of(
		LabelNames(), [inText](const auto& inNamed) { return IsSameName(inNamed.mName, inText); });
}

// Whether inShown is the description of a layout or what stands in it before the channels: "5.1 (L, R, C, LFE, Ls, Rs)".
// Descriptions of many channels leave some out.
bool IsDescription(std::string_view inText, std::string_view inShown)
{
	return (IsSameName(inText, inShown) && inShown.find("...") == std::string_view::npos)
		|| IsSameName(inText, inShown.substr(0, inShown.find(" (")));
}

// The first layout that is described by inText, when all others that are have the same channels.
std::optional<AudioChannelLayout> DescribedLayout(std::string_view inText)
{
	std::optional<AudioChannelLayout> described;
	for (const auto& [name, layout] : LayoutNames())
	{
		if (!IsDescription(inText, zoncore::utility::UTF16to8(AudioChannelLayoutDescription(layout))))
			continue;
		if (described && !ContainsSameChannelsIgnoreOrder(*described, layout))
			return std::nullopt;
		described = described.value_or(layout);
	}
	return described;
}

// The layout whose description inText is by naming each channel: "8 Channels (L R C LFE Rls Rrs Ls Rs)". The catalogue need
// not have it.
std::optional<AudioChannelLayout> SpelledLayout(std::string_view inText)
{
	const std::size_t first = inText.rfind('(');
	if (first == std::string_view::npos || !inText.ends_with(')'))
		return std::nullopt;
	const std::vector<std::string_view> words = WordsOf(inText.substr(first + 1, inText.size() - first - 2));
	if (!std::ranges::all_of(words, IsAbbreviation))
		return std::nullopt;
	AudioChannelLayout layout = ReadAbbreviations(words);
	const bool isIts = IsSameName(inText, zoncore::utility::UTF16to8(AudioChannelLayoutDescription(layout)));
	return isIts ? std::optional(std::move(layout)) : std::nullopt;
}

}   // namespace

std::span<const Named<AudioChannelLayout>> LayoutNames()
{
	static const std::vector<Named<AudioChannelLayout>> sNames = MakeLayoutNames();
	return sNames;
}

AudioChannelLayout ReadLayout(std::string_view inText)
{
	if (const auto described = DescribedLayout(inText))
		return *described;
	if (const auto spelled = SpelledLayout(inText))
		return *spelled;
	if (inText.find(',') != std::string_view::npos)
		return ReadAbbreviations(ItemsOf(inText, ','));
	// Marks within words belong to names of layouts: "L_ R_C" is L R C, not L Rc.
	const std::vector<std::string_view> words = WordsOf(inText);
	if (inText.find_first_of("_-") == std::string_view::npos && !words.empty()
		&& std::ranges::all_of(words, IsAbbreviation))
		return ReadAbbreviations(words);
	return ValueNamed<AudioChannelLayout>(LayoutNames(), "layout", inText,
		"; abbreviations (L,R,LFE) also serve, and \"zonmedia audio layouts\" lists the channels of each");
}

std::string Abbreviation(AudioChannelLabel inLabel)
{
	return zoncore::utility::UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(inLabel));
}

}   // namespace zonmedia
