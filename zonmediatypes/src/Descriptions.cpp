#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/src/AudioChannelLabels.h"
#include "zonmediatypes/src/AudioChannelLayouts.h"
#include "zonmediatypes/src/AudioTextKeys.h"
#include "zonmediatypes/src/TextKeys.h"
#include "zonmediatypes/src/TimeTextKeys.h"

#include <algorithm>
#include <array>
#include <boost/lexical_cast.hpp>
#include <functional>
#include <string>

namespace zonmediatypes
{

using zoncore::UTF16String;
using zoncore::ZString;
using zoncore::config::Localizer;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::IntegerToString;

// ---- Time ------------------------------------------------------------------------------------------------------------

UTF16String FrameRateDescription(FrameRate inRate)
{
	const bool isAudio = inRate.GetTicksPerFrame() <= kFrameRate_Audio8000.GetTicksPerFrame();
	const UTF16String format = Localizer::Get().Lookup(isAudio ? kAudioRateKey : kVideoRateKey);
	const UTF16String number = zoncore::utility::UTF8to16(boost::lexical_cast<std::string>(inRate));
	return zoncore::FillPlaceholders(format, {&number, 1});
}

UTF16String TimeDisplayDescription(TimeDisplay inDisplay)
{
	return Describe<TimeDisplay>(kTimeDisplayKeys, inDisplay);
}

// ---- Audio -----------------------------------------------------------------------------------------------------------

namespace
{

// The localised text of a key of inLabel's row; empty, and no key looked up, for a number that names no label.
UTF16String LabelText(std::span<const std::string_view> inKeys, AudioChannelLabel inLabel)
{
	const AudioChannelLabelRow* const row = FindLabelRow(inLabel);
	return row != nullptr ? Localizer::Get().Lookup(inKeys[IndexOf(*row)]) : UTF16String();
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
	std::array<UTF16String, kChannelsKeys.size()> texts;
	auto end = texts.begin();
	if (inLayout.size() > texts.size())
		*end++ = IntegerToString(inLayout.size());
	for (auto channel = inLayout.begin(); channel != inLayout.end() && end != texts.end(); ++channel)
		*end++ = AudioChannelLabelAbbreviations(channel->mLabel);
	return ZString(LayoutKey(inLayout), std::span(texts.begin(), end));
}

}   // namespace

UTF16String AudioChannelLabelDescription(AudioChannelLabel inLabel, bool inWithMnemonic)
{
	return LabelText(inWithMnemonic ? kLabelMnemonicKeys : kLabelDescriptionKeys, inLabel);
}

UTF16String AudioChannelLabelAbbreviations(AudioChannelLabel inLabel)
{
	return inLabel == kAudioChannelLabel_Discrete ? AudioChannelLabelAbbreviationsUnlocalized(inLabel)
												  : LabelText(kLabelAbbreviationKeys, inLabel);
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

// ---- Video -----------------------------------------------------------------------------------------------------------

// ---- Keys ------------------------------------------------------------------------------------------------------------

namespace
{

constexpr auto sAllTextKeys = JoinKeys(kTimeTextKeys, kAudioTextKeys);

}   // namespace

std::span<const std::string_view> AllTextKeys() noexcept
{
	return sAllTextKeys;
}

}   // namespace zonmediatypes
