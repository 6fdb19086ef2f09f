#pragma once

/// \file
/// Labels of audio channels, and layouts made of them: what each channel of a stream carries.
///
/// A label names the speaker of a channel; a layout lists the labels of a stream's channels in their storage order. Every
/// number is a legal label: only 0 is `Discrete`, a numbered channel without a speaker, and a number that names no label
/// is a label of its own which has no partner and no text. Layouts may be empty and may repeat labels.
///
///     const AudioChannelLayout layout = {kAudioChannelLabel_FrontLeft, kAudioChannelLabel_FrontRight};
///     HasChannelLabel(layout, kAudioChannelLabel_FrontCenter);   // false
///     LeftRightPair(kAudioChannelLabel_BackLeft);                // kAudioChannelLabel_BackRight

#include "zoncore/SmallBlocks.h"
#include "zonmediatypes/Export.h"

#include <compare>
#include <cstddef>
#include <cstdint>
#include <span>

namespace zonmediatypes
{

// ---- Labels ----------------------------------------------------------------------------------------------------------

/// What a channel carries: a speaker position, or a kind of signal. Each line has the label's abbreviation and its name.
/// The numbers are fixed; those that are not listed are not assigned.
enum AudioChannelLabel : std::int32_t
{
	kAudioChannelLabel_Discrete = 0,               ///< *: a numbered channel without a speaker position
	kAudioChannelLabel_FrontLeft = 100,            ///< L: Left
	kAudioChannelLabel_FrontRight = 101,           ///< R: Right
	kAudioChannelLabel_FrontCenter = 102,          ///< C: Center
	kAudioChannelLabel_LowFrequency = 103,         ///< LFE: Low Frequency Effects
	kAudioChannelLabel_BackLeft = 104,             ///< Ls: Left Surround
	kAudioChannelLabel_BackRight = 105,            ///< Rs: Right Surround
	kAudioChannelLabel_BackCenter = 106,           ///< Cs: Center Surround
	kAudioChannelLabel_FrontLeftOfCenter = 107,    ///< Lc: Left Center
	kAudioChannelLabel_FrontRightOfCenter = 108,   ///< Rc: Right Center
	kAudioChannelLabel_SideLeft = 109,             ///< Lsd: Left Surround Direct
	kAudioChannelLabel_SideRight = 110,            ///< Rsd: Right Surround Direct
	kAudioChannelLabel_TopCenter = 111,            ///< Ts: Top Center Surround
	kAudioChannelLabel_TopFrontLeft = 112,         ///< Vhl: Vertical Height Left
	kAudioChannelLabel_TopFrontRight = 113,        ///< Vhr: Vertical Height Right
	kAudioChannelLabel_TopFrontCenter = 114,       ///< Vhc: Vertical Height Center
	kAudioChannelLabel_TopBackLeft = 115,          ///< Tbl: Top Back Left
	kAudioChannelLabel_TopBackRight = 116,         ///< Tbr: Top Back Right
	kAudioChannelLabel_TopBackCenter = 117,        ///< Tbc: Top Back Center
	kAudioChannelLabel_FrontLeftWide = 118,        ///< Lw: Left Wide
	kAudioChannelLabel_FrontRightWide = 119,       ///< Rw: Right Wide
	kAudioChannelLabel_LeftHeight = 127,           ///< Tsl: Top Side Left
	kAudioChannelLabel_RightHeight = 128,          ///< Tsr: Top Side Right
	kAudioChannelLabel_RearSurroundLeft = 129,     ///< Rls: Rear Surround Left
	kAudioChannelLabel_RearSurroundRight = 130,    ///< Rrs: Rear Surround Right
	kAudioChannelLabel_LFE2 = 131,                 ///< LFE2: Low Frequency Effects 2
	kAudioChannelLabel_LeftTotal = 132,            ///< Lt: Left Total
	kAudioChannelLabel_RightTotal = 133,           ///< Rt: Right Total
	kAudioChannelLabel_AmbisonicsW = 134,          ///< W: Ambisonics W
	kAudioChannelLabel_AmbisonicsX = 135,          ///< X: Ambisonics X
	kAudioChannelLabel_AmbisonicsY = 136,          ///< Y: Ambisonics Y
	kAudioChannelLabel_AmbisonicsZ = 137,          ///< Z: Ambisonics Z
	kAudioChannelLabel_BottomFrontLeft = 138,      ///< Bfl: Bottom Front Left
	kAudioChannelLabel_BottomFrontCenter = 139,    ///< Bfc: Bottom Front Center
	kAudioChannelLabel_BottomFrontRight = 140,     ///< Bfr: Bottom Front Right
	kAudioChannelLabel_ProximityLeft = 141,        ///< Pl: Proximity Left
	kAudioChannelLabel_ProximityRight = 142,       ///< Pr: Proximity Right
};

/// All labels in numeric order, `Discrete` first; for menus and tools.
ZONMEDIATYPES_API std::span<const AudioChannelLabel> AllAudioChannelLabels() noexcept;

/// One channel of a stream.
struct AudioChannelDescription
{
	AudioChannelLabel mLabel = kAudioChannelLabel_Discrete;

	constexpr AudioChannelDescription() noexcept = default;
	constexpr AudioChannelDescription(AudioChannelLabel inLabel) noexcept   // NOLINT(google-explicit-constructor)
		: mLabel(inLabel)
	{
	}

	/// By label number, so `Discrete` sorts before every speaker.
	friend constexpr bool operator==(AudioChannelDescription, AudioChannelDescription) noexcept = default;
	friend constexpr std::strong_ordering operator<=>(
		AudioChannelDescription inLHS, AudioChannelDescription inRHS) noexcept
	{
		return std::int32_t{inLHS.mLabel} <=> std::int32_t{inRHS.mLabel};
	}
};

/// The channels of one stream in storage order: the index of a description is the number of the channel.
using AudioChannelLayout = zoncore::utility::SmallBlockAllocator::vector<AudioChannelDescription>;

/// The layouts of several streams, such as those of a clip.
using AudioChannelLayouts = zoncore::utility::SmallBlockAllocator::vector<AudioChannelLayout>;

// ---- Pairs of labels -------------------------------------------------------------------------------------------------
//
// The partner of a label in one direction; `Discrete` when there is none, also for every number that names no label.
// Partners are not always mutual, see the two functions that say so.

/// The mirror image across the centre line: L and R, Ls and Rs, ... LFE and LFE2 are partners, too.
ZONMEDIATYPES_API AudioChannelLabel LeftRightPair(AudioChannelLabel inLabel) noexcept;

/// The partner on the other side of the listener: L and Ls, C and Cs, Vhl and Tbl, ... The fronts beside the centre, Lc
/// and Rc, have the rear surrounds Rls and Rrs.
ZONMEDIATYPES_API AudioChannelLabel FrontBackPair(AudioChannelLabel inLabel) noexcept;

/// The partner between the layer at ear level and the one above: L and Vhl, Cs and Tbc, ... Deliberately R is its own
/// partner, although Vhr has R.
ZONMEDIATYPES_API AudioChannelLabel TopMiddlePair(AudioChannelLabel inLabel) noexcept;

/// The partner between the layer above and the one below: Vhl and Bfl, Vhc and Bfc. Vhr has Bfr, but deliberately Bfr
/// has R.
ZONMEDIATYPES_API AudioChannelLabel TopBottomPair(AudioChannelLabel inLabel) noexcept;

/// The partner between the layer below and the one at ear level: Bfl and L, Bfc and C, Bfr and R.
ZONMEDIATYPES_API AudioChannelLabel BottomMiddlePair(AudioChannelLabel inLabel) noexcept;

/// Whether inSecond is the left/right partner of inFirst, in either order: (L, R) and (R, L) are pairs, (L, L) is none.
/// False when either label is `Discrete`.
ZONMEDIATYPES_API bool IsStereoPair(AudioChannelLabel inFirst, AudioChannelLabel inSecond) noexcept;

// ---- Queries ---------------------------------------------------------------------------------------------------------

/// Whether any channel has a label other than `Discrete`; false for an empty layout.
ZONMEDIATYPES_API bool HasChannelLabeling(const AudioChannelLayout& inLayout) noexcept;

/// Whether any channel has exactly inLabel.
ZONMEDIATYPES_API bool HasChannelLabel(const AudioChannelLayout& inLayout, AudioChannelLabel inLabel) noexcept;

/// Whether any channel is LFE (103). LFE2 does not count.
ZONMEDIATYPES_API bool HasLFEChannel(const AudioChannelLayout& inLayout) noexcept;

/// Whether both layouts hold every label equally often. Sorts copies of both.
ZONMEDIATYPES_API bool ContainsSameChannelsIgnoreOrder(
	const AudioChannelLayout& inFirst, const AudioChannelLayout& inSecond);

/// The channels of all layouts together.
ZONMEDIATYPES_API std::size_t GetChannelCount(const AudioChannelLayouts& inLayouts) noexcept;

}   // namespace zonmediatypes
