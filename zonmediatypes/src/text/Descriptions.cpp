#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"
#include "zonmediatypes/src/audio/KnownLayouts.h"
#include "zonmediatypes/src/text/AudioTextKeys.h"
#include "zonmediatypes/src/text/TextKeys.h"
#include "zonmediatypes/src/text/TimeTextKeys.h"
#include "zonmediatypes/src/text/VideoTextKeys.h"
#include "zonmediatypes/src/time/RateText.h"

#include <algorithm>
#include <array>
#include <boost/lexical_cast.hpp>
#include <functional>
#include <string>

namespace zonmediatypes
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::ZString;
using zoncore::config::Localizer;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::IntegerToString;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

// ---- Time ------------------------------------------------------------------------------------------------------------

namespace
{

UTF16String RateFormat(FrameRate inRate)
{
	const bool isAudio = inRate.GetTicksPerFrame() <= kFrameRate_Audio8000.GetTicksPerFrame();
	return Localizer::Get().Lookup(isAudio ? kAudioRateKey : kVideoRateKey);
}

}   // namespace

UTF16String FrameRateDescription(FrameRate inRate)
{
	const UTF16String format = RateFormat(inRate);
	const UTF16String number = zoncore::utility::UTF8to16(boost::lexical_cast<std::string>(inRate));
	return zoncore::FillPlaceholders(format, {&number, 1});
}

std::size_t FrameRateDescription(std::span<UTF16Char> outText, FrameRate inRate)
{
	const UTF16String number = RateText(inRate);
	return zoncore::FillPlaceholders(outText, RateFormat(inRate), {&number, 1});
}

std::size_t FrameRateDescription(std::span<char> outText, FrameRate inRate)
{
	const UTF16String number = RateText(inRate);
	const std::string text = UTF16to8(zoncore::FillPlaceholders(RateFormat(inRate), {&number, 1}));
	if (text.size() <= outText.size())
		std::ranges::copy(text, outText.begin());
	return text.size();
}

UTF16String TimeDisplayDescription(TimeDisplay inDisplay)
{
	return Describe<TimeDisplay>(kTimeDisplayKeys, inDisplay);
}

// ---- Audio -----------------------------------------------------------------------------------------------------------

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

// ---- Video -----------------------------------------------------------------------------------------------------------

namespace
{

void Append(UTF16String& ioText, std::string_view inASCII)
{
	ioText.append(inASCII.begin(), inASCII.end());
}

// The name's characters from the last to the first, up to a zero byte.
UTF16String ReversedNameText(PixelFormatName inName)
{
	std::array<char, 4> text{};
	for (unsigned i = 0; i < text.size(); ++i)
		text[i] = static_cast<char>(std::uint32_t{inName} >> (24 - 8 * i));
	return AsciiToUTF16({text.begin(), std::ranges::find(text, '\0')});
}

std::string_view DVText(unsigned inCompression)
{
	constexpr auto kTexts = std::to_array<std::string_view>({"", "NTSC DV", "PAL DV", "NTSC DV 100 (720p)",
		"PAL DV 100 (720p)", "NTSC DV 100 (1080i)", "PAL DV 100 (1080i)", "NTSC DV 50", "PAL DV 50"});
	static_assert(kTexts.size() == kPixelFormatCompression_PALDV50 + 1);
	return kTexts[inCompression];
}

UTF16String MPEGText(PixelFormatProperties inProperties)
{
	const auto compression = static_cast<PixelFormatCompression>(inProperties.Compression());
	UTF16String text = Describe<PixelFormatCompression>(kMPEGKeys, compression);
	Append(text, inProperties.Is709() ? " 709" : "");
	Append(text, inProperties.IsVideoRange() ? "" : " Full Range");
	return text;
}

void AppendComponents(UTF16String& ioText, PixelFormatProperties inProperties)
{
	constexpr auto kAlphaTexts = std::to_array<std::string_view>({"", "A", "P", "X", "", "", "", ""});
	const std::string_view alpha = kAlphaTexts[inProperties.Alpha()];
	if (inProperties.ReversedOrder())
	{
		Append(ioText, alpha);
		Append(ioText, inProperties.IsYUV() ? "YUV" : "RGB");
		return;
	}
	Append(ioText, inProperties.IsYUV() ? "VUY" : "BGR");
	Append(ioText, alpha);
}

UTF16String UncompressedText(PixelFormatProperties inProperties)
{
	constexpr auto kChromaTexts = std::to_array<std::string_view>({" 4444 ", " 422 ", "  ", "  "});
	constexpr auto kDepthTexts = std::to_array<std::string_view>({"8", "10", "15", "16", "24", "32", "", ""});
	UTF16String text;
	AppendComponents(text, inProperties);
	Append(text, kChromaTexts[inProperties.Subsampling()]);
	Append(text, kDepthTexts[inProperties.BitDepth()]);
	Append(text, inProperties.IsFloat() ? "f" : "u");
	if (inProperties.IsLinear())
	{
		Append(text, " ");
		text += Localizer::Get().Lookup(kLinearKey);
	}
	Append(text, inProperties.Is709() ? " 709" : "");
	return text;
}

UTF16String RatioText(PixelAspectRatio inRatio)
{
	return UTF8to16(boost::lexical_cast<std::string>(inRatio));
}

}   // namespace

UTF16String RenderQualityDescription(RenderQuality inQuality)
{
	return Describe<RenderQuality>(kRenderQualityKeys, inQuality);
}

UTF16String FieldTypeDescription(FieldType inType)
{
	return Describe<FieldType>(kFieldTypeKeys, inType);
}

UTF16String PixelFormatDescription(PixelFormat inFormat)
{
	const PixelFormatProperties properties = inFormat.mProperties;
	if (properties.Kind() == kPixelFormatKind_Any)
		return ZString(kAnyPixelFormatKey);
	if (IsCustomPixelFormatName(inFormat.mName))
		return ZString(kCustomPixelFormatKey, {ReversedNameText(inFormat.mName)});
	if (properties.Kind() == kPixelFormatKind_Invalid)
		return ZString(kUnknownPixelFormatKey);
	if (!properties.IsCompressed())
		return UncompressedText(properties);
	if (properties.IsDV())
		return AsciiToUTF16(DVText(properties.Compression()));
	if (properties.IsMPEG())
		return MPEGText(properties);
	if (properties.HasUnknownCompression())
		return ZString(kUnknownCompressedKey, {ReversedNameText(inFormat.mName)});
	return {};
}

std::ostream& operator<<(std::ostream& ioStream, const PixelFormat& inFormat)
{
	return ioStream << UTF16to8(PixelFormatDescription(inFormat)).c_str();   // up to the first zero byte
}

std::basic_ostream<UTF16Char>& operator<<(std::basic_ostream<UTF16Char>& ioStream, const PixelFormat& inFormat)
{
	return ioStream << PixelFormatDescription(inFormat);
}

UTF16String PixelAspectRatioDescription(PixelAspectRatio inRatio)
{
	const auto row = std::ranges::find(kPixelAspectRatioKeys, inRatio, &KeyFor<PixelAspectRatio>::mValue);
	return ZString(row != kPixelAspectRatioKeys.end() ? row->mKey : kOtherRatioKey, {RatioText(inRatio)});
}

UTF16String VideoFrameSizeDescription(zoncore::RectT<int> inFrame, PixelAspectRatio inRatio)
{
	const UTF16String width = IntegerToString(inFrame.right);
	const UTF16String height = IntegerToString(inFrame.bottom);
	if (inRatio == kPixelAspectRatio_Unknown)
		return ZString(kFrameSizeKey, {width, height});
	return ZString(kFrameSizeWithRatioKey, {width, height, RatioText(inRatio)});
}

// ---- Keys ------------------------------------------------------------------------------------------------------------

namespace
{

constexpr auto sAllTextKeys = JoinKeys(kTimeTextKeys, kAudioTextKeys, kVideoTextKeys);

}   // namespace

std::span<const std::string_view> AllTextKeys() noexcept
{
	return sAllTextKeys;
}

}   // namespace zonmediatypes
