#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"
#include "zonmediatypes/src/audio/KnownLayouts.h"
#include "zonmediatypes/src/text/AudioTextKeys.h"

#include <algorithm>
#include <array>
#include <functional>

namespace zonmediatypes
{

using zoncore::UTF16String;
using zoncore::ZString;
using zoncore::config::Localizer;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::IntegerToString;

namespace
{

// The localised form of one of a label's English texts, by its key; empty, and no key looked up, for a number that names no
// label.
UTF16String LabelText(AudioChannelLabel inLabel, std::string_view AudioChannelLabelRow::*inEnglish,
	std::span<const std::string_view> inKeys)
{
	const AudioChannelLabelRow* const row = FindLabelRow(inLabel);
	return row != nullptr ? Localizer::Get().Lookup(inKeys[IndexOf(*row)], row->*inEnglish) : UTF16String();
}

bool HasLabels(const AudioChannelLayout& inLayout, std::span<const AudioChannelLabel> inLabels)
{
	return std::ranges::equal(inLayout, inLabels, {}, &AudioChannelDescription::mLabel);
}

bool HasLabelsInAnyOrder(const AudioChannelLayout& inLayout, std::span<const AudioChannelLabel> inLabels)
{
	return inLayout.size() == inLabels.size()
		&& std::ranges::is_permutation(inLayout, inLabels, {}, &AudioChannelDescription::mLabel);
}

std::string_view LayoutKey(const AudioChannelLayout& inLayout)
{
	if (inLayout.size() > kChannelsKeys.size())
		return kManyChannelsKey;
	if (HasLabelsInAnyOrder(inLayout, kBroadcast51Labels))
		return k51Key;
	if (HasLabels(inLayout, kSmpteDtvLabels))
		return kSmpteDtvKey;
	return kChannelsKeys[inLayout.size() - 1];
}

// The name of a layout by the abbreviations of its first channels, with the channel count before them when there are more.
UTF16String ListChannels(const AudioChannelLayout& inLayout)
{
	constexpr std::size_t kTexts = kChannelsKeys.size();
	const std::size_t counts = inLayout.size() > kTexts ? 1 : 0;
	const auto text = [&](std::size_t inIndex)
	{
		if (inIndex < counts)
			return IntegerToString(inLayout.size());
		const std::size_t channel = inIndex - counts;
		return channel < inLayout.size() ? AudioChannelLabelAbbreviations(inLayout[channel].mLabel) : UTF16String();
	};
	const std::array<UTF16String, kTexts> texts{text(0), text(1), text(2), text(3), text(4), text(5), text(6), text(7)};
	return ZString(LayoutKey(inLayout), std::span(texts).first(std::min(inLayout.size() + counts, kTexts)));
}

}   // namespace

UTF16String AudioChannelLabelDescription(AudioChannelLabel inLabel, bool inWithMnemonic)
{
	return inWithMnemonic ? LabelText(inLabel, &AudioChannelLabelRow::mMnemonic, kLabelMnemonicKeys)
						  : LabelText(inLabel, &AudioChannelLabelRow::mEnglish, kLabelDescriptionKeys);
}

UTF16String AudioChannelLabelAbbreviations(AudioChannelLabel inLabel)
{
	return inLabel == kAudioChannelLabel_Discrete
		? AudioChannelLabelAbbreviationsUnlocalized(inLabel)
		: LabelText(inLabel, &AudioChannelLabelRow::mAbbreviation, kLabelAbbreviationKeys);
}

UTF16String AudioChannelLabelAbbreviationsUnlocalized(AudioChannelLabel inLabel)
{
	const AudioChannelLabelRow* const row = FindLabelRow(inLabel);
	return row != nullptr ? AsciiToUTF16(row->mAbbreviation) : UTF16String();
}

UTF16String AudioChannelLayoutDescription(const AudioChannelLayout& inLayout)
{
	if (HasLabels(inLayout, kStereoLabels))
		return ZString(kStereoKey);
	if (HasChannelLabeling(inLayout))
		return ListChannels(inLayout);
	if (inLayout.size() == 1)
		return ZString(kMonoKey);
	return ZString(kUnlabelledChannelsKey, {IntegerToString(inLayout.size())});
}

UTF16String AudioChannelLayoutDescriptionUnlocalized(const AudioChannelLayout& inLayout)
{
	UTF16String text;
	for (const auto [label] : inLayout)
	{
		const AudioChannelLabelRow* const row = FindLabelRow(label);
		if (row != nullptr)
			text.append(row->mAbbreviation.begin(), row->mAbbreviation.end());
		text.push_back(',');
	}
	return text;
}

UTF16String AudioChannelConfigurationDescription(const AudioChannelLayouts& inStreams)
{
	if (inStreams.empty())
		return ZString(kNoStreamsKey);
	if (inStreams.size() == 1)
		return AudioChannelLayoutDescription(inStreams.front());
	if (std::ranges::adjacent_find(inStreams, std::ranges::not_equal_to()) == inStreams.end())
		return ZString(
			kMatchingStreamsKey, {IntegerToString(inStreams.size()), AudioChannelLayoutDescription(inStreams.front())});
	if (inStreams.size() == 2)
		return ZString(kTwoStreamsKey,
			{AudioChannelLayoutDescription(inStreams.front()), AudioChannelLayoutDescription(inStreams.back())});
	return ZString(kStreamsKey, {IntegerToString(inStreams.size())});
}

}   // namespace zonmediatypes
