#pragma once

// The labels as they are required, and layouts written as text; for the tests of every audio area.

#include "zonmediatypes/AudioChannelLayout.h"

#include <array>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>

namespace zonmediatypes
{

struct RequiredLabel
{
	AudioChannelLabel mLabel;
	int mValue;
	std::string_view mName;
	std::string_view mAbbreviation;
	std::string_view mEnglish;
	std::string_view mMnemonic;
};

// clang-format off
inline constexpr auto kRequiredLabels = std::to_array<RequiredLabel>({
	{kAudioChannelLabel_Discrete, 0, "Discrete", "*", "Mono", "&Mono"},
	{kAudioChannelLabel_FrontLeft, 100, "FrontLeft", "L", "Left", "&Left"},
	{kAudioChannelLabel_FrontRight, 101, "FrontRight", "R", "Right", "&Right"},
	{kAudioChannelLabel_FrontCenter, 102, "FrontCenter", "C", "Center", "&Center"},
	{kAudioChannelLabel_LowFrequency, 103, "LowFrequency", "LFE", "Low Frequency Effects", "Low Fre&quency Effects"},
	{kAudioChannelLabel_BackLeft, 104, "BackLeft", "Ls", "Left Surround", "L&eft Surround"},
	{kAudioChannelLabel_BackRight, 105, "BackRight", "Rs", "Right Surround", "Ri&ght Surround"},
	{kAudioChannelLabel_BackCenter, 106, "BackCenter", "Cs", "Center Surround", "Ce&nter Surround"},
	{kAudioChannelLabel_FrontLeftOfCenter, 107, "FrontLeftOfCenter", "Lc", "Left Center", "&Left Center"},
	{kAudioChannelLabel_FrontRightOfCenter, 108, "FrontRightOfCenter", "Rc", "Right Center", "&Right Center"},
	{kAudioChannelLabel_SideLeft, 109, "SideLeft", "Lsd", "Left Surround Direct", "Left Surround &Direct"},
	{kAudioChannelLabel_SideRight, 110, "SideRight", "Rsd", "Right Surround Direct", "Right Surround &Direct"},
	{kAudioChannelLabel_TopCenter, 111, "TopCenter", "Ts", "Top Center Surround", "Top Center S&urround"},
	{kAudioChannelLabel_TopFrontLeft, 112, "TopFrontLeft", "Vhl", "Vertical Height Left", "Vertical Height &Left"},
	{kAudioChannelLabel_TopFrontRight, 113, "TopFrontRight", "Vhr", "Vertical Height Right", "Vertical Height &Right"},
	{kAudioChannelLabel_TopFrontCenter, 114, "TopFrontCenter", "Vhc", "Vertical Height Center", "Vertical Height &Center"},
	{kAudioChannelLabel_TopBackLeft, 115, "TopBackLeft", "Tbl", "Top Back Left", "Top Back L&eft"},
	{kAudioChannelLabel_TopBackRight, 116, "TopBackRight", "Tbr", "Top Back Right", "Top Back Ri&ght"},
	{kAudioChannelLabel_TopBackCenter, 117, "TopBackCenter", "Tbc", "Top Back Center", "Top Back &Center"},
	{kAudioChannelLabel_FrontLeftWide, 118, "FrontLeftWide", "Lw", "Left Wide", "Left W&ide"},
	{kAudioChannelLabel_FrontRightWide, 119, "FrontRightWide", "Rw", "Right Wide", "Right Wi&de"},
	{kAudioChannelLabel_LeftHeight, 127, "LeftHeight", "Tsl", "Top Side Left", "Top Side Le&ft"},
	{kAudioChannelLabel_RightHeight, 128, "RightHeight", "Tsr", "Top Side Right", "Top Side Rig&ht"},
	{kAudioChannelLabel_RearSurroundLeft, 129, "RearSurroundLeft", "Rls", "Rear Surround Left", "Rear Surround &Left"},
	{kAudioChannelLabel_RearSurroundRight, 130, "RearSurroundRight", "Rrs", "Rear Surround Right", "Rear Surround &Right"},
	{kAudioChannelLabel_LFE2, 131, "LFE2", "LFE2", "Low Frequency Effects 2", "Low Frequency Effects &2"},
	{kAudioChannelLabel_LeftTotal, 132, "LeftTotal", "Lt", "Left Total", "Left &Total"},
	{kAudioChannelLabel_RightTotal, 133, "RightTotal", "Rt", "Right Total", "Right T&otal"},
	{kAudioChannelLabel_AmbisonicsW, 134, "AmbisonicsW", "W", "Ambisonics W", "Ambisonics &W"},
	{kAudioChannelLabel_AmbisonicsX, 135, "AmbisonicsX", "X", "Ambisonics X", "Ambisonics &X"},
	{kAudioChannelLabel_AmbisonicsY, 136, "AmbisonicsY", "Y", "Ambisonics Y", "Ambisonics &Y"},
	{kAudioChannelLabel_AmbisonicsZ, 137, "AmbisonicsZ", "Z", "Ambisonics Z", "Ambisonics &Z"},
	{kAudioChannelLabel_BottomFrontLeft, 138, "BottomFrontLeft", "Bfl", "Bottom Front Left", "&Bottom Front Left"},
	{kAudioChannelLabel_BottomFrontCenter, 139, "BottomFrontCenter", "Bfc", "Bottom Front Center", "B&ottom Front Center"},
	{kAudioChannelLabel_BottomFrontRight, 140, "BottomFrontRight", "Bfr", "Bottom Front Right", "Bo&ttom Front Right"},
	{kAudioChannelLabel_ProximityLeft, 141, "ProximityLeft", "Pl", "Proximity Left", "&Proximity Left"},
	{kAudioChannelLabel_ProximityRight, 142, "ProximityRight", "Pr", "Proximity Right", "Pro&ximity Right"},
});
// clang-format on

inline AudioChannelLabel LabelByAbbreviation(std::string_view inAbbreviation)
{
	for (const RequiredLabel& label : kRequiredLabels)
	{
		if (label.mAbbreviation == inAbbreviation)
			return static_cast<AudioChannelLabel>(label.mValue);
	}
	throw std::invalid_argument(std::string(inAbbreviation));
}

// "L R *" is a layout of FrontLeft, FrontRight, Discrete; a number stands for itself.
inline AudioChannelLayout ReadLayout(std::string_view inText)
{
	AudioChannelLayout layout;
	std::istringstream words{std::string(inText)};
	for (std::string word; words >> word;)
	{
		const bool isNumber = word.find_first_not_of("-0123456789") == std::string::npos;
		layout.push_back(isNumber ? static_cast<AudioChannelLabel>(std::stoi(word)) : LabelByAbbreviation(word));
	}
	return layout;
}

}   // namespace zonmediatypes
