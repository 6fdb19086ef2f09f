#pragma once

#include "zonmediatypes/AudioChannelLayout.h"

#include <array>

namespace zonmediatypes
{

/// The canonical order of labels, by which channels are labelled that are known by position only. It is not numeric: Lc
/// and Rc come before Cs, and each centre above ear level stands between its left and its right.
// clang-format off
inline constexpr auto sOrderedChannelLabels = std::to_array<AudioChannelLabel>({
	kAudioChannelLabel_FrontLeft, kAudioChannelLabel_FrontRight, kAudioChannelLabel_FrontCenter,
	kAudioChannelLabel_LowFrequency,
	kAudioChannelLabel_BackLeft, kAudioChannelLabel_BackRight,
	kAudioChannelLabel_FrontLeftOfCenter, kAudioChannelLabel_FrontRightOfCenter,
	kAudioChannelLabel_BackCenter,
	kAudioChannelLabel_SideLeft, kAudioChannelLabel_SideRight,
	kAudioChannelLabel_TopCenter,
	kAudioChannelLabel_TopFrontLeft, kAudioChannelLabel_TopFrontCenter, kAudioChannelLabel_TopFrontRight,
	kAudioChannelLabel_TopBackLeft, kAudioChannelLabel_TopBackCenter, kAudioChannelLabel_TopBackRight,
	kAudioChannelLabel_FrontLeftWide, kAudioChannelLabel_FrontRightWide,
	kAudioChannelLabel_LeftHeight, kAudioChannelLabel_RightHeight,
	kAudioChannelLabel_RearSurroundLeft, kAudioChannelLabel_RearSurroundRight,
	kAudioChannelLabel_LFE2,
	kAudioChannelLabel_LeftTotal, kAudioChannelLabel_RightTotal,
	kAudioChannelLabel_AmbisonicsW, kAudioChannelLabel_AmbisonicsX, kAudioChannelLabel_AmbisonicsY,
	kAudioChannelLabel_AmbisonicsZ,
	kAudioChannelLabel_BottomFrontLeft, kAudioChannelLabel_BottomFrontCenter, kAudioChannelLabel_BottomFrontRight,
	kAudioChannelLabel_ProximityLeft, kAudioChannelLabel_ProximityRight,
});
// clang-format on

}   // namespace zonmediatypes
