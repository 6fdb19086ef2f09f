#pragma once

#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/src/text/TextKeys.h"

#include <array>
#include <string_view>

namespace zonmediatypes
{

inline constexpr std::string_view kAudioRateKey = "$$$/zonmediatypes/FrameRateFormat/Audio=@0Hz";
inline constexpr std::string_view kVideoRateKey = "$$$/zonmediatypes/FrameRateFormat/Video=@0fps";

// clang-format off
inline constexpr auto kTimeDisplayKeys = std::to_array<KeyFor<TimeDisplay>>({
	{kTimeDisplay_24Timecode,          "$$$/zonmediatypes/TimeDisplay/24=24 fps Timecode"},
	{kTimeDisplay_25Timecode,          "$$$/zonmediatypes/TimeDisplay/25=25 fps Timecode"},
	{kTimeDisplay_2997DropTimecode,    "$$$/zonmediatypes/TimeDisplay/2997DF=29.97 fps Drop-Frame Timecode"},
	{kTimeDisplay_2997NonDropTimecode, "$$$/zonmediatypes/TimeDisplay/2997NDF=29.97 fps Non-Drop-Frame Timecode"},
	{kTimeDisplay_30Timecode,          "$$$/zonmediatypes/TimeDisplay/30=30 fps Timecode"},
	{kTimeDisplay_50Timecode,          "$$$/zonmediatypes/TimeDisplay/50=50 fps Timecode"},
	{kTimeDisplay_5994DropTimecode,    "$$$/zonmediatypes/TimeDisplay/5994DF=59.94 fps Drop-Frame Timecode"},
	{kTimeDisplay_5994NonDropTimecode, "$$$/zonmediatypes/TimeDisplay/5994NDF=59.94 fps Non-Drop-Frame Timecode"},
	{kTimeDisplay_60Timecode,          "$$$/zonmediatypes/TimeDisplay/60=60 fps Timecode"},
	{kTimeDisplay_Frames,              "$$$/zonmediatypes/TimeDisplay/Frames=Frames"},
	{kTimeDisplay_23976Timecode,       "$$$/zonmediatypes/TimeDisplay/23976=23.976 fps Timecode"},
	{kTimeDisplay_16mmFeetFrames,      "$$$/zonmediatypes/TimeDisplay/16mmFeetFrames=Feet + Frames 16 mm"},
	{kTimeDisplay_35mmFeetFrames,      "$$$/zonmediatypes/TimeDisplay/35mmFeetFrames=Feet + Frames 35 mm"},
	{kTimeDisplay_48Timecode,          "$$$/zonmediatypes/TimeDisplay/48=48 fps Timecode"},
	{kTimeDisplay_AudioSamples,        "$$$/zonmediatypes/TimeDisplay/AudioSamples=Audio Samples"},
	{kTimeDisplay_Milliseconds,        "$$$/zonmediatypes/TimeDisplay/Milliseconds=Milliseconds"},
});
// clang-format on

inline constexpr auto kTimeTextKeys = JoinKeys(std::array{kAudioRateKey, kVideoRateKey}, KeysOf(kTimeDisplayKeys));

}   // namespace zonmediatypes
