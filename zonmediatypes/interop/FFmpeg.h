#pragma once

/// \file
/// Values of FFmpeg's libraries and ours. For programs that use FFmpeg: they bring its headers and link libavutil.
///
///     AudioChannelLayout layout = ToAudioChannelLayout(stream->codecpar->ch_layout);   // 5.1(side): L R C LFE Ls Rs
///
///     AVChannelLayout wanted = ToAVChannelLayout(CreateLegacy51ChannelLayout());
///     av_channel_layout_copy(&codec->ch_layout, &wanted);
///     av_channel_layout_uninit(&wanted);

#include "zonmediatypes/AudioChannelLayout.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <limits>
#include <new>
#include <vector>

extern "C"
{
#include <libavutil/channel_layout.h>
#include <libavutil/mem.h>
}

namespace zonmediatypes
{

// ---- Audio -----------------------------------------------------------------------------------------------------------

/// A speaker of FFmpeg's and the label of the same role.
struct AVChannelRole
{
	AVChannel mChannel;
	AudioChannelLabel mLabel;
};

/// All roles. The surrounds stand here as they are where a layout has both pairs; where it has one pair only, at the side
/// or at the back, that is Ls Rs.
// clang-format off
inline constexpr auto kAVChannelRoles = std::to_array<AVChannelRole>({
	{AV_CHAN_FRONT_LEFT,            kAudioChannelLabel_FrontLeft},
	{AV_CHAN_FRONT_RIGHT,           kAudioChannelLabel_FrontRight},
	{AV_CHAN_FRONT_CENTER,          kAudioChannelLabel_FrontCenter},
	{AV_CHAN_LOW_FREQUENCY,         kAudioChannelLabel_LowFrequency},
	{AV_CHAN_SIDE_LEFT,             kAudioChannelLabel_BackLeft},
	{AV_CHAN_SIDE_RIGHT,            kAudioChannelLabel_BackRight},
	{AV_CHAN_BACK_LEFT,             kAudioChannelLabel_RearSurroundLeft},
	{AV_CHAN_BACK_RIGHT,            kAudioChannelLabel_RearSurroundRight},
	{AV_CHAN_FRONT_LEFT_OF_CENTER,  kAudioChannelLabel_FrontLeftOfCenter},
	{AV_CHAN_FRONT_RIGHT_OF_CENTER, kAudioChannelLabel_FrontRightOfCenter},
	{AV_CHAN_BACK_CENTER,           kAudioChannelLabel_BackCenter},
	{AV_CHAN_TOP_CENTER,            kAudioChannelLabel_TopCenter},
	{AV_CHAN_TOP_FRONT_LEFT,        kAudioChannelLabel_TopFrontLeft},
	{AV_CHAN_TOP_FRONT_CENTER,      kAudioChannelLabel_TopFrontCenter},
	{AV_CHAN_TOP_FRONT_RIGHT,       kAudioChannelLabel_TopFrontRight},
	{AV_CHAN_TOP_BACK_LEFT,         kAudioChannelLabel_TopBackLeft},
	{AV_CHAN_TOP_BACK_CENTER,       kAudioChannelLabel_TopBackCenter},
	{AV_CHAN_TOP_BACK_RIGHT,        kAudioChannelLabel_TopBackRight},
	{AV_CHAN_LOW_FREQUENCY_2,       kAudioChannelLabel_LFE2},
	{AV_CHAN_TOP_SIDE_LEFT,         kAudioChannelLabel_LeftHeight},
	{AV_CHAN_TOP_SIDE_RIGHT,        kAudioChannelLabel_RightHeight},
	{AV_CHAN_BOTTOM_FRONT_LEFT,     kAudioChannelLabel_BottomFrontLeft},
	{AV_CHAN_BOTTOM_FRONT_CENTER,   kAudioChannelLabel_BottomFrontCenter},
	{AV_CHAN_BOTTOM_FRONT_RIGHT,    kAudioChannelLabel_BottomFrontRight},
	{AV_CHAN_WIDE_LEFT,             kAudioChannelLabel_FrontLeftWide},
	{AV_CHAN_WIDE_RIGHT,            kAudioChannelLabel_FrontRightWide},
	{AV_CHAN_STEREO_LEFT,           kAudioChannelLabel_LeftTotal},
	{AV_CHAN_STEREO_RIGHT,          kAudioChannelLabel_RightTotal},
	{AV_CHAN_SURROUND_DIRECT_LEFT,  kAudioChannelLabel_SideLeft},
	{AV_CHAN_SURROUND_DIRECT_RIGHT, kAudioChannelLabel_SideRight},
});
// clang-format on

/// The layout of a stream. Channels keep their order and are known by their speakers: what is no speaker of the table is
/// `Discrete`, and so are all channels of a layout of which only their number is known. A lone centre is mono: `Discrete`.
/// An invalid layout gives an empty one.
AudioChannelLayout ToAudioChannelLayout(const AVChannelLayout& inLayout);

/// FFmpeg's layout for inLayout, to be given to av_channel_layout_uninit(): in the native order where the channels stand in
/// it, else with a map of its own. Channels that are all `Discrete` are mono or a mere number of channels; next to others
/// they are unknown ones. A single surround pair is the one at the back, as in FFmpeg's default layouts.
///
/// A layout without channels is the result when there is nothing to convert, and when a label has no counterpart (the
/// Ambisonics components, Pl, Pr and numbers that name no label). Throws std::bad_alloc when memory runs out.
AVChannelLayout ToAVChannelLayout(const AudioChannelLayout& inLayout);

// ======================================================================================================================
// Inline implementation

namespace detail
{

constexpr AudioChannelLabel LabelOfRole(AVChannel inChannel)
{
	const auto role = std::ranges::find(kAVChannelRoles, inChannel, &AVChannelRole::mChannel);
	return role != kAVChannelRoles.end() ? role->mLabel : kAudioChannelLabel_Discrete;
}

constexpr AVChannel ChannelOfRole(AudioChannelLabel inLabel)
{
	const auto role = std::ranges::find(kAVChannelRoles, inLabel, &AVChannelRole::mLabel);
	return role != kAVChannelRoles.end() ? role->mChannel : AV_CHAN_NONE;
}

// The surround that stands in for a rear one where there is one pair only.
constexpr AudioChannelLabel SurroundOf(AudioChannelLabel inLabel)
{
	if (inLabel == kAudioChannelLabel_RearSurroundLeft)
		return kAudioChannelLabel_BackLeft;
	if (inLabel == kAudioChannelLabel_RearSurroundRight)
		return kAudioChannelLabel_BackRight;
	return inLabel;
}

constexpr AudioChannelLabel RearSurroundOf(AudioChannelLabel inLabel)
{
	if (inLabel == kAudioChannelLabel_BackLeft)
		return kAudioChannelLabel_RearSurroundLeft;
	if (inLabel == kAudioChannelLabel_BackRight)
		return kAudioChannelLabel_RearSurroundRight;
	return inLabel;
}

inline bool HasBothSurroundPairs(const AVChannelLayout& inLayout)
{
	const auto has
		= [&](AVChannel inChannel) { return av_channel_layout_index_from_channel(&inLayout, inChannel) >= 0; };
	return (has(AV_CHAN_SIDE_LEFT) || has(AV_CHAN_SIDE_RIGHT)) && (has(AV_CHAN_BACK_LEFT) || has(AV_CHAN_BACK_RIGHT));
}

inline bool HasRearSurrounds(const AudioChannelLayout& inLayout)
{
	return HasChannelLabel(inLayout, kAudioChannelLabel_RearSurroundLeft)
		|| HasChannelLabel(inLayout, kAudioChannelLabel_RearSurroundRight);
}

// The speakers of a layout that has labels; AV_CHAN_NONE where a label has no counterpart.
inline std::vector<AVChannel> Speakers(const AudioChannelLayout& inLayout)
{
	const bool hasRearSurrounds = HasRearSurrounds(inLayout);
	std::vector<AVChannel> speakers(inLayout.size(), AV_CHAN_UNKNOWN);
	for (std::size_t i = 0; i < speakers.size(); ++i)
	{
		const AudioChannelLabel label = inLayout[i].mLabel;
		if (label != kAudioChannelLabel_Discrete)
			speakers[i] = ChannelOfRole(hasRearSurrounds ? label : RearSurroundOf(label));
	}
	return speakers;
}

// Whether the speakers, all of them known, stand in FFmpeg's native order, each once.
inline bool IsNativeOrder(const std::vector<AVChannel>& inSpeakers)
{
	return inSpeakers.back() < std::numeric_limits<std::uint64_t>::digits
		&& std::ranges::adjacent_find(inSpeakers, std::ranges::greater_equal()) == inSpeakers.end();
}

inline AVChannelLayout CountedLayout(std::size_t inCount)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_UNSPEC;
	layout.nb_channels = static_cast<int>(inCount);
	return layout;
}

inline AVChannelLayout NativeLayout(const std::vector<AVChannel>& inSpeakers)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_NATIVE;
	layout.nb_channels = static_cast<int>(inSpeakers.size());
	for (const AVChannel speaker : inSpeakers)
		layout.u.mask |= std::uint64_t{1} << speaker;
	return layout;
}

inline AVChannelLayout MappedLayout(const std::vector<AVChannel>& inSpeakers)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_CUSTOM;
	layout.nb_channels = static_cast<int>(inSpeakers.size());
	layout.u.map = static_cast<AVChannelCustom*>(av_calloc(inSpeakers.size(), sizeof(AVChannelCustom)));
	if (layout.u.map == nullptr)
		throw std::bad_alloc();
	for (std::size_t i = 0; i < inSpeakers.size(); ++i)
		layout.u.map[i].id = inSpeakers[i];
	return layout;
}

}   // namespace detail

inline AudioChannelLayout ToAudioChannelLayout(const AVChannelLayout& inLayout)
{
	AudioChannelLayout layout(static_cast<std::size_t>(std::max(inLayout.nb_channels, 0)));
	const bool hasBothPairs = detail::HasBothSurroundPairs(inLayout);
	for (std::size_t i = 0; i < layout.size(); ++i)
	{
		const AVChannel speaker = av_channel_layout_channel_from_index(&inLayout, static_cast<unsigned>(i));
		const AudioChannelLabel label = detail::LabelOfRole(speaker);
		layout[i] = hasBothPairs ? label : detail::SurroundOf(label);
	}
	if (layout.size() == 1 && layout.front() == kAudioChannelLabel_FrontCenter)
		layout.front() = kAudioChannelLabel_Discrete;
	return layout;
}

inline AVChannelLayout ToAVChannelLayout(const AudioChannelLayout& inLayout)
{
	if (inLayout.empty() || inLayout.size() > std::size_t{std::numeric_limits<int>::max()})
		return {};
	if (!HasChannelLabeling(inLayout))
		return inLayout.size() == 1 ? detail::NativeLayout({AV_CHAN_FRONT_CENTER})
									: detail::CountedLayout(inLayout.size());
	const std::vector<AVChannel> speakers = detail::Speakers(inLayout);
	if (std::ranges::find(speakers, AV_CHAN_NONE) != speakers.end())
		return {};
	return detail::IsNativeOrder(speakers) ? detail::NativeLayout(speakers) : detail::MappedLayout(speakers);
}

}   // namespace zonmediatypes
