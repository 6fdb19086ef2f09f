#include "zonmedia/AudioNames.h"

#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

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

AudioChannelLayout ReadAbbreviations(std::string_view inText)
{
	AudioChannelLayout layout;
	for (std::size_t begin = 0; begin < inText.size();)   // a comma may end the list, as in the library's own
	{
		const std::size_t end = std::min(inText.find(',', begin), inText.size());
		layout.emplace_back(ValueNamed<AudioChannelLabel>(LabelNames(), "channel", inText.substr(begin, end - begin)));
		begin = end + 1;
	}
	return layout;
}

}   // namespace

std::span<const Named<AudioChannelLayout>> LayoutNames()
{
	static const std::vector<Named<AudioChannelLayout>> sNames = MakeLayoutNames();
	return sNames;
}

AudioChannelLayout ReadLayout(std::string_view inText)
{
	const auto isMeant
		= [inText](const Named<AudioChannelLabel>& inNamed) { return IsSameName(inNamed.mName, inText); };
	if (std::ranges::any_of(LabelNames(), isMeant) || inText.find(',') != std::string_view::npos)
		return ReadAbbreviations(inText);
	return ValueNamed<AudioChannelLayout>(LayoutNames(), "layout", inText,
		"; abbreviations (L,R,LFE) also serve, and \"zonmedia audio layouts\" lists the channels of each");
}

std::string Abbreviation(AudioChannelLabel inLabel)
{
	return zoncore::utility::UTF16to8(AudioChannelLabelAbbreviationsUnlocalized(inLabel));
}

}   // namespace zonmedia
