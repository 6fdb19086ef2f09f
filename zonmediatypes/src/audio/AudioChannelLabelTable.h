#pragma once

#include "zonmediatypes/AudioChannelLabel.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>

namespace zonmediatypes
{

/// Where a speaker stands around the listener, on a coarse grid of -2 ... 2 on each axis.
struct SpeakerPosition
{
	int mX;   ///< left to right
	int mY;   ///< below to above ear level
	int mZ;   ///< behind to in front
};

/// All that is known of a label, but for its partners.
struct AudioChannelLabelRow
{
	AudioChannelLabel mLabel;
	std::string_view mName;   ///< as in its constant and in the keys of its texts
	std::string_view mAbbreviation;
	std::string_view mEnglish;
	std::string_view mMnemonic;   ///< the English text with "&" before the accelerator of a menu
	SpeakerPosition mPosition;
};

// Positions are shared on purpose: wide fronts stand with the fronts, rear surrounds with the surrounds, the matrix-encoded
// pair at the sides, and the components of Ambisonics are placed as if they were speakers.
//
// clang-format off
inline constexpr auto kAudioChannelLabels = std::to_array<AudioChannelLabelRow>({
	{kAudioChannelLabel_Discrete,           "Discrete",           "*",    "Mono",                    "&Mono",                    { 0,  0,  0}},
	{kAudioChannelLabel_FrontLeft,          "FrontLeft",          "L",    "Left",                    "&Left",                    {-2,  0,  2}},
	{kAudioChannelLabel_FrontRight,         "FrontRight",         "R",    "Right",                   "&Right",                   { 2,  0,  2}},
	{kAudioChannelLabel_FrontCenter,        "FrontCenter",        "C",    "Center",                  "&Center",                  { 0,  0,  2}},
	{kAudioChannelLabel_LowFrequency,       "LowFrequency",       "LFE",  "Low Frequency Effects",   "Low Fre&quency Effects",   { 0,  0,  0}},
	{kAudioChannelLabel_BackLeft,           "BackLeft",           "Ls",   "Left Surround",           "L&eft Surround",           {-2,  0, -2}},
	{kAudioChannelLabel_BackRight,          "BackRight",          "Rs",   "Right Surround",          "Ri&ght Surround",          { 2,  0, -2}},
	{kAudioChannelLabel_BackCenter,         "BackCenter",         "Cs",   "Center Surround",         "Ce&nter Surround",         { 0,  0, -2}},
	{kAudioChannelLabel_FrontLeftOfCenter,  "FrontLeftOfCenter",  "Lc",   "Left Center",             "&Left Center",             {-1,  0,  2}},
	{kAudioChannelLabel_FrontRightOfCenter, "FrontRightOfCenter", "Rc",   "Right Center",            "&Right Center",            { 1,  0,  2}},
	{kAudioChannelLabel_SideLeft,           "SideLeft",           "Lsd",  "Left Surround Direct",    "Left Surround &Direct",    {-2,  0,  0}},
	{kAudioChannelLabel_SideRight,          "SideRight",          "Rsd",  "Right Surround Direct",   "Right Surround &Direct",   { 2,  0,  0}},
	{kAudioChannelLabel_TopCenter,          "TopCenter",          "Ts",   "Top Center Surround",     "Top Center S&urround",     { 0,  2,  0}},
	{kAudioChannelLabel_TopFrontLeft,       "TopFrontLeft",       "Vhl",  "Vertical Height Left",    "Vertical Height &Left",    {-2,  2,  2}},
	{kAudioChannelLabel_TopFrontRight,      "TopFrontRight",      "Vhr",  "Vertical Height Right",   "Vertical Height &Right",   { 2,  2,  2}},
	{kAudioChannelLabel_TopFrontCenter,     "TopFrontCenter",     "Vhc",  "Vertical Height Center",  "Vertical Height &Center",  { 0,  2,  2}},
	{kAudioChannelLabel_TopBackLeft,        "TopBackLeft",        "Tbl",  "Top Back Left",           "Top Back L&eft",           {-2,  2, -2}},
	{kAudioChannelLabel_TopBackRight,       "TopBackRight",       "Tbr",  "Top Back Right",          "Top Back Ri&ght",          { 2,  2, -2}},
	{kAudioChannelLabel_TopBackCenter,      "TopBackCenter",      "Tbc",  "Top Back Center",         "Top Back &Center",         { 0,  2, -2}},
	{kAudioChannelLabel_FrontLeftWide,      "FrontLeftWide",      "Lw",   "Left Wide",               "Left W&ide",               {-2,  0,  2}},
	{kAudioChannelLabel_FrontRightWide,     "FrontRightWide",     "Rw",   "Right Wide",              "Right Wi&de",              { 2,  0,  2}},
	{kAudioChannelLabel_LeftHeight,         "LeftHeight",         "Tsl",  "Top Side Left",           "Top Side Le&ft",           {-2,  2,  0}},
	{kAudioChannelLabel_RightHeight,        "RightHeight",        "Tsr",  "Top Side Right",          "Top Side Rig&ht",          { 2,  2,  0}},
	{kAudioChannelLabel_RearSurroundLeft,   "RearSurroundLeft",   "Rls",  "Rear Surround Left",      "Rear Surround &Left",      {-2,  0, -2}},
	{kAudioChannelLabel_RearSurroundRight,  "RearSurroundRight",  "Rrs",  "Rear Surround Right",     "Rear Surround &Right",     { 2,  0, -2}},
	{kAudioChannelLabel_LFE2,               "LFE2",               "LFE2", "Low Frequency Effects 2", "Low Frequency Effects &2", { 0,  0,  0}},
	{kAudioChannelLabel_LeftTotal,          "LeftTotal",          "Lt",   "Left Total",              "Left &Total",              {-2,  0,  0}},
	{kAudioChannelLabel_RightTotal,         "RightTotal",         "Rt",   "Right Total",             "Right T&otal",             { 2,  0,  0}},
	{kAudioChannelLabel_AmbisonicsW,        "AmbisonicsW",        "W",    "Ambisonics W",            "Ambisonics &W",            { 0,  0,  0}},
	{kAudioChannelLabel_AmbisonicsX,        "AmbisonicsX",        "X",    "Ambisonics X",            "Ambisonics &X",            {-2,  0,  0}},
	{kAudioChannelLabel_AmbisonicsY,        "AmbisonicsY",        "Y",    "Ambisonics Y",            "Ambisonics &Y",            { 0,  2,  0}},
	{kAudioChannelLabel_AmbisonicsZ,        "AmbisonicsZ",        "Z",    "Ambisonics Z",            "Ambisonics &Z",            { 0,  0,  2}},
	{kAudioChannelLabel_BottomFrontLeft,    "BottomFrontLeft",    "Bfl",  "Bottom Front Left",       "&Bottom Front Left",       {-2, -2,  2}},
	{kAudioChannelLabel_BottomFrontCenter,  "BottomFrontCenter",  "Bfc",  "Bottom Front Center",     "B&ottom Front Center",     { 0, -2,  2}},
	{kAudioChannelLabel_BottomFrontRight,   "BottomFrontRight",   "Bfr",  "Bottom Front Right",      "Bo&ttom Front Right",      { 2, -2,  2}},
	{kAudioChannelLabel_ProximityLeft,      "ProximityLeft",      "Pl",   "Proximity Left",          "&Proximity Left",          {-1,  0,  0}},
	{kAudioChannelLabel_ProximityRight,     "ProximityRight",     "Pr",   "Proximity Right",         "Pro&ximity Right",         { 1,  0,  0}},
});
// clang-format on
static_assert(
	std::ranges::adjacent_find(kAudioChannelLabels, std::ranges::greater_equal(), &AudioChannelLabelRow::mLabel)
		== kAudioChannelLabels.end(),
	"labels stand in numeric order, each once");

/// A label's place in a table that begins with the first speaker; any number below it wraps past the end of every table.
constexpr std::size_t LabelIndex(AudioChannelLabel inLabel) noexcept
{
	return static_cast<std::uint32_t>(inLabel) - static_cast<std::uint32_t>(kAudioChannelLabel_FrontLeft);
}

/// The row of every label from the first speaker to the last; 0, the row of Discrete, for numbers between them that name
/// none.
inline constexpr auto kLabelRows = []
{
	std::array<std::uint8_t, LabelIndex(kAudioChannelLabels.back().mLabel) + 1> rows{};
	for (std::size_t row = 1; row < kAudioChannelLabels.size(); ++row)
		rows.at(LabelIndex(kAudioChannelLabels[row].mLabel)) = static_cast<std::uint8_t>(row);
	return rows;
}();

/// The index of a label's row; 0, the row of Discrete, for a number that names none.
constexpr std::size_t FindLabelIndex(AudioChannelLabel inLabel) noexcept
{
	const std::size_t index = LabelIndex(inLabel);
	return index < kLabelRows.size() ? kLabelRows[index] : 0;
}

/// The row of a label; null for a number that names none.
constexpr const AudioChannelLabelRow* FindLabelRow(AudioChannelLabel inLabel) noexcept
{
	const std::size_t row = FindLabelIndex(inLabel);
	return row != 0 || inLabel == kAudioChannelLabel_Discrete ? &kAudioChannelLabels[row] : nullptr;
}

/// The label of an abbreviation; where there is none, what asks does not compile.
constexpr AudioChannelLabel LabelByAbbreviation(std::string_view inAbbreviation)
{
	for (const AudioChannelLabelRow& row : kAudioChannelLabels)
		if (row.mAbbreviation == inAbbreviation)
			return row.mLabel;
	throw "no label has this abbreviation";
}

/// Calls inTake with each word of a text, in which blanks or underscores stand between words.
template <class Take>
constexpr void ForEachWord(std::string_view inText, Take inTake)
{
	for (std::size_t begin = 0; begin < inText.size();)
	{
		const std::size_t end = std::min(inText.find_first_of(" _", begin), inText.size());
		if (begin < end)
			inTake(inText.substr(begin, end - begin));
		begin = end + 1;
	}
}

constexpr std::size_t CountWords(std::string_view inText)
{
	std::size_t words = 0;
	ForEachWord(inText, [&](std::string_view) { ++words; });
	return words;
}

/// Writes the labels of a text of abbreviations; returns the end of what it has written.
template <class Iterator>
constexpr Iterator ReadLabels(std::string_view inText, Iterator inOut)
{
	ForEachWord(inText, [&](std::string_view inWord) { *inOut++ = LabelByAbbreviation(inWord); });
	return inOut;
}

/// The index of a row of the table.
constexpr std::size_t IndexOf(const AudioChannelLabelRow& inRow) noexcept
{
	return static_cast<std::size_t>(&inRow - kAudioChannelLabels.data());
}

}   // namespace zonmediatypes
