#pragma once

#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"
#include "zonmediatypes/src/text/TextKeys.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string_view>

namespace zonmediatypes
{

// ---- Labels ----------------------------------------------------------------------------------------------------------

/// A key in the pieces of which it is made.
using TextKeyPieces = std::array<std::string_view, 4>;

constexpr TextKeyPieces DescriptionKey(const AudioChannelLabelRow& inLabel)
{
	return {"$$$/zonmediatypes/AudioChannelLabel/", inLabel.mName, "=", inLabel.mEnglish};
}

constexpr TextKeyPieces MnemonicKey(const AudioChannelLabelRow& inLabel)
{
	return {"$$$/zonmediatypes/AudioChannelLabelMnemonic/", inLabel.mName, "=", inLabel.mMnemonic};
}

constexpr TextKeyPieces AbbreviationKey(const AudioChannelLabelRow& inLabel)
{
	return {"$$$/zonmediatypes/AudioChannelLabelAbbreviations/", inLabel.mAbbreviation, "=", inLabel.mAbbreviation};
}

/// One key of each label, in the order of the labels.
template <TextKeyPieces (*inPiecesOf)(const AudioChannelLabelRow&)>
class LabelKeys
{
	static constexpr std::size_t Length(const AudioChannelLabelRow& inLabel)
	{
		std::size_t length = 0;
		for (const std::string_view piece : inPiecesOf(inLabel))
			length += piece.size();
		return length;
	}

	static constexpr std::size_t TotalLength()
	{
		std::size_t length = 0;
		for (const AudioChannelLabelRow& label : kAudioChannelLabels)
			length += Length(label);
		return length;
	}

	// All keys, one after the other.
	static constexpr auto sCharacters = []
	{
		std::array<char, TotalLength()> characters{};
		auto end = characters.begin();
		for (const AudioChannelLabelRow& label : kAudioChannelLabels)
		{
			for (const std::string_view piece : inPiecesOf(label))
				end = std::ranges::copy(piece, end).out;
		}
		return characters;
	}();

public:
	static constexpr auto sKeys = []
	{
		std::array<std::string_view, kAudioChannelLabels.size()> keys;
		const char* begin = sCharacters.data();
		for (std::size_t row = 0; row < keys.size(); ++row)
		{
			keys[row] = std::string_view(begin, Length(kAudioChannelLabels[row]));
			begin += keys[row].size();
		}
		return keys;
	}();
};

inline constexpr const auto& kLabelDescriptionKeys = LabelKeys<DescriptionKey>::sKeys;
inline constexpr const auto& kLabelMnemonicKeys = LabelKeys<MnemonicKey>::sKeys;

/// The first, of Discrete, is never looked up: its abbreviation is the same in every language.
inline constexpr const auto& kLabelAbbreviationKeys = LabelKeys<AbbreviationKey>::sKeys;

// ---- Layouts ---------------------------------------------------------------------------------------------------------

inline constexpr std::string_view kMonoKey = "$$$/zonmediatypes/AudioChannelLayout/Mono=Mono";
inline constexpr std::string_view kUnlabelledChannelsKey = "$$$/zonmediatypes/AudioChannelLayout/NChannels=@0 Channels";
inline constexpr std::string_view kStereoKey = "$$$/zonmediatypes/AudioChannelLayout/Stereo=Stereo";

// These two have no segment of their own in their keys, and 5.1 has commas: deliberately so, translations know them.
inline constexpr std::string_view k51Key
	= "$$$/zonmediatypes/kChannelConfigurationNameTemplate_51=5.1 (@0, @1, @2, @3, @4, @5)";
inline constexpr std::string_view kSmpteDtvKey = "$$$/zonmediatypes/SmpteDtv=SMPTE DTV (@0 @1 @2 @3 @4 @5 @6 @7)";

/// Layouts of 1, 2, ... 8 channels by their abbreviations.
// clang-format off
inline constexpr auto kChannelsKeys = std::to_array<std::string_view>({
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_1=1 Channel (@0)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_2=2 Channels (@0 @1)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_3=3 Channels (@0 @1 @2)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_4=4 Channels (@0 @1 @2 @3)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_5=5 Channels (@0 @1 @2 @3 @4)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_6=6 Channels (@0 @1 @2 @3 @4 @5)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_7=7 Channels (@0 @1 @2 @3 @4 @5 @6)",
	"$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_8=8 Channels (@0 @1 @2 @3 @4 @5 @6 @7)",
});
// clang-format on

/// More channels: their count and the abbreviations of the first seven.
inline constexpr std::string_view kManyChannelsKey
	= "$$$/zonmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_N=@0 Channels (@1 @2 @3 @4 @5 @6 @7...)";

// ---- Streams ---------------------------------------------------------------------------------------------------------

inline constexpr std::string_view kNoStreamsKey
	= "$$$/zonmediatypes/AudioChannelConfiguration/Empty=(No Audio Streams)";
inline constexpr std::string_view kMatchingStreamsKey
	= "$$$/zonmediatypes/AudioChannelConfiguration/NMatchingStreams=@0 x @1";
inline constexpr std::string_view kTwoStreamsKey = "$$$/zonmediatypes/AudioChannelConfiguration/TwoStreams=@0 + @1";
inline constexpr std::string_view kStreamsKey
	= "$$$/zonmediatypes/AudioChannelConfiguration/NAudioStreams=@0 Audio Streams";

// ---- All -------------------------------------------------------------------------------------------------------------

inline constexpr auto kLabelAbbreviationKeysInUse = []
{
	std::array<std::string_view, kLabelAbbreviationKeys.size() - 1> keys;
	std::copy(kLabelAbbreviationKeys.begin() + 1, kLabelAbbreviationKeys.end(), keys.begin());
	return keys;
}();

inline constexpr auto kAudioTextKeys = JoinKeys(kLabelDescriptionKeys, kLabelMnemonicKeys, kLabelAbbreviationKeysInUse,
	std::to_array({kMonoKey, kUnlabelledChannelsKey, kStereoKey}), kChannelsKeys,
	std::to_array({k51Key, kSmpteDtvKey, kManyChannelsKey}),
	std::to_array({kNoStreamsKey, kMatchingStreamsKey, kTwoStreamsKey, kStreamsKey}));

}   // namespace zonmediatypes
