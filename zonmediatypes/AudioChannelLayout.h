#pragma once

/// \file
/// Audio channels: what each channel of a stream carries, and how channels of one layout feed those of another.
///
/// A label names the speaker of a channel; a layout lists the labels of a stream's channels in their storage order. Every
/// number is a legal label: only 0 is `Discrete`, a numbered channel without a speaker, and a number that names no label
/// is a label of its own which has no partner and no text. Layouts may be empty and may repeat labels.
///
///     const AudioChannelLayout surround = CreateBroadcast51ChannelLayout();   // L R C LFE Ls Rs
///     HasLFEChannel(surround);                                                // true
///     LeftRightPair(kAudioChannelLabel_BackLeft);                             // kAudioChannelLabel_BackRight
///
///     ChannelConversionMatrix matrix;
///     ComputeChannelConversionMatrix(surround, CreateStereoChannelLayout(), matrix);
///     // L takes L and R takes R; centre, LFE and surrounds are routed nowhere
///
/// Everything here is a pure function of its arguments and may be called from any thread. Functions that build, copy or
/// grow a container throw what it throws when memory runs out, and leave their output arguments as they were; functions
/// that are `noexcept` throw nothing.

#include "zoncore/SmallBlockAllocator.h"
#include "zonmediatypes/Export.h"

#include <compare>
#include <cstdint>
#include <span>
#include <string_view>

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
ZONMEDIATYPES_API unsigned long GetChannelCount(const AudioChannelLayouts& inLayouts) noexcept;

// ---- Conversion ------------------------------------------------------------------------------------------------------

/// Linear gains (1.0 is unity): a row for each destination channel, in it a gain for each source channel.
using ChannelConversionMatrix
	= zoncore::utility::SmallBlockAllocator::vector<zoncore::utility::SmallBlockAllocator::vector<double>>;

/// For each destination channel the index of the source channel that feeds it.
using ChannelOrdering = zoncore::utility::SmallBlockAllocator::vector<unsigned long>;

/// Feeds each destination channel from the source channel of the same index; what is left over on either side is silent.
/// Without destination channels the matrix is empty.
ZONMEDIATYPES_API void CreateIdentityChannelConversionMatrix(
	unsigned long inSourceChannelCount, unsigned long inDestinationChannelCount, ChannelConversionMatrix& outMatrix);

/// The matrix that routes inSource into inDestination by label.
///
/// Without labels to go by, when either layout is empty or all `Discrete` and neither has exactly one channel, the matrix
/// is the identity. Otherwise each destination channel takes, at the first of these rules that fits:
///  - having a label, the first source channel of the same label;
///  - a source's only channel, when that is `Discrete`: it feeds every channel at full gain, LFE included;
///  - being the k-th `Discrete` one, the k-th `Discrete` source channel;
///  - having a speaker position, all source channels whose speakers are nearest to it, in equal shares (1, 1/2, 1/3, ...).
///    LFE, LFE2 and `Discrete` have no position, on either side;
///  - being the only destination channel and `Discrete`, all source channels in equal shares, LFE included;
///  - nothing: the channel is silent.
///
/// Speakers stand on a grid of -2 ... 2 from left to right, from below to above ear level and from behind to in front: L at
/// (-2, 0, 2), Lc (-1, 0, 2), Lsd (-2, 0, 0), Pl (-1, 0, 0), Ls (-2, 0, -2); Vhl, Tsl and Tbl 2 above L, Lsd and Ls, and Bfl 2
/// below L. The right mirrors the left, centres stand between them. Lw shares the place of L, Rls that of Ls, Lt that of Lsd;
/// X, Y and Z have those of Lsd, Ts and C. W and numbers that name no label are at (0, 0, 0). Distances are Euclidean.
///
/// The matrix routes, it does not fold down: 5.1 to stereo drops centre, LFE and surrounds. Nothing reports source channels
/// that no destination takes. Two unlabelled channels into one labelled one, or the reverse, are silent.
///
/// Takes time and memory in proportion to the product of the two channel counts.
ZONMEDIATYPES_API void ComputeChannelConversionMatrix(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelConversionMatrix& outMatrix);

/// Finds for each destination channel the first source channel of the same label; the k-th `Discrete` one takes the k-th
/// `Discrete` source channel. False, and outOrdering untouched, when the layouts differ in size or a channel finds none;
/// but an empty destination succeeds with an empty ordering whatever the source holds.
///
/// A destination that repeats a label takes the same source channel each time: the ordering need not be a permutation.
/// Takes time and memory as sorting the channels does.
ZONMEDIATYPES_API bool RemapChannelOrdering(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelOrdering& outOrdering);

/// Gives the `Discrete` channels of inSource, in order, those labels of inDestination that it does not carry yet, each
/// once; its other channels stay as they are. False, and outLayout untouched, when no channel received a label. outLayout
/// may be one of the inputs. Takes time and memory as sorting the channels of both layouts does.
ZONMEDIATYPES_API bool ReplaceDiscreteLabelsWithDestinationLayoutLabels(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, AudioChannelLayout& outLayout);

// ---- Catalogue of layouts --------------------------------------------------------------------------------------------

/// A named layout of the catalogue.
struct NamedChannelLayout
{
	std::string_view mName;   ///< its factory's name without "Create" and "ChannelLayout"
	std::span<const AudioChannelLabel> mLabels;
};

/// All fixed layouts, smaller ones mostly first; for menus and tools.
ZONMEDIATYPES_API std::span<const NamedChannelLayout> AllChannelLayouts() noexcept;

/// inCount `Discrete` channels; none for a negative count.
ZONMEDIATYPES_API AudioChannelLayout CreateMultichannelLayout(int inCount);

/// The usual layout of 1, 2, 4, 6 or 8 channels: mono, stereo, quadraphonic, broadcast 5.1, 7.1 ITU. Any other count gives
/// `Discrete` channels, as many as its low 32 bits say as a signed number: none when those are negative.
ZONMEDIATYPES_API AudioChannelLayout CreateMultichannelLayoutWithDefaultLabels(unsigned long inCount);

// The fixed layouts by channel count, each with its labels in order. Two of them hold a channel more than their names
// list (Tbc), and the SMPTE digital cinema layouts fill up to 16 channels: both deliberately.

// One channel

/// Discrete
ZONMEDIATYPES_API AudioChannelLayout CreateMonoChannelLayout();

// Two channels

/// L R
ZONMEDIATYPES_API AudioChannelLayout CreateStereoChannelLayout();
/// Lt Rt
ZONMEDIATYPES_API AudioChannelLayout CreateMatrixStereoChannelLayout();
/// Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_Ls_Rs_ChannelLayout();
/// Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create_Lc_Rc_ChannelLayout();
/// Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_Lsd_Rsd_ChannelLayout();
/// C LFE
ZONMEDIATYPES_API AudioChannelLayout Create_C_LFE_ChannelLayout();
/// Vhl Vhr
ZONMEDIATYPES_API AudioChannelLayout Create_Vhl_Vhr_ChannelLayout();
/// Tsl Tsr
ZONMEDIATYPES_API AudioChannelLayout Create_Tsl_Tsr_ChannelLayout();
/// Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_Tbl_Tbr_ChannelLayout();
/// Bfl Bfr
ZONMEDIATYPES_API AudioChannelLayout Create_Bfl_Bfr_ChannelLayout();

// Three channels

/// L R C
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_ChannelLayout();
/// C L R
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_ChannelLayout();
/// L C R
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_ChannelLayout();
/// L R Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_ChannelLayout();
/// L R LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_ChannelLayout();

// Four channels

/// L R Ls Rs
ZONMEDIATYPES_API AudioChannelLayout CreateQuadraphonicChannelLayout();
/// L R C Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Cs_ChannelLayout();
/// C L R Cs
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Cs_ChannelLayout();
/// L C R Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_ChannelLayout();
/// L R LFE Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Cs_ChannelLayout();
/// L R Cs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_LFE_ChannelLayout();
/// L R C LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_ChannelLayout();
/// L C R LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_LFE_ChannelLayout();
/// W X Y Z
ZONMEDIATYPES_API AudioChannelLayout CreateAmbisonicsBFormatChannelLayout();

// Five channels

/// L R Ls Rs C
ZONMEDIATYPES_API AudioChannelLayout CreatePentagonalChannelLayout();
/// L R C Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_ChannelLayout();
/// L R Ls Rs C
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_ChannelLayout();
/// L C R Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_ChannelLayout();
/// C L R Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_ChannelLayout();
/// L R LFE Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_ChannelLayout();
/// L R C LFE Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Cs_ChannelLayout();
/// L C R Cs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_LFE_ChannelLayout();
/// L R Ls Rs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_LFE_ChannelLayout();

// Six channels

/// L R C LFE Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create51ChannelLayout();
/// L R C LFE Ls Rs
ZONMEDIATYPES_API AudioChannelLayout CreateBroadcast51ChannelLayout();
/// L R Ls Rs C LFE
ZONMEDIATYPES_API AudioChannelLayout CreateLegacy51ChannelLayout();
/// L C R Ls Rs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_LFE_ChannelLayout();
/// C L R Ls Rs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_LFE_ChannelLayout();
/// C L R Ls Rs Cs
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_ChannelLayout();
/// L R Ls Rs C Cs
ZONMEDIATYPES_API AudioChannelLayout CreateHexagonalChannelLayout();
/// L R C Ls Rs Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_ChannelLayout();
/// L R Ls Rs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout();

// Seven channels

/// L R C LFE Ls Rs Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout();
/// L R LFE Ls Rs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
/// L R Ls Rs C Rls Rrs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout();
/// L R Ls Rs C Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout();
/// L R C Ls Rs Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout();
/// C L R Ls Rs Cs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout();
/// C L R Ls Rs Rls Rrs
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout();
/// L R C Ls Rs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout();

// Eight channels

/// L R C LFE Ls Rs Rls Rrs
ZONMEDIATYPES_API AudioChannelLayout Create7_1ItuChannelLayout();
/// L R C LFE Ls Rs Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create7_1ChannelLayout();
/// C Lc Rc L R Ls Rs LFE
ZONMEDIATYPES_API AudioChannelLayout Create7_1MpegChannelLayout();
/// L R C LFE Ls Rs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
/// L R C LFE Ls Rs Pl Pr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout();
/// L R Ls Rs C LFE Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create7_1EMagicChannelLayout();
/// L R C LFE Ls Rs Lt Rt
ZONMEDIATYPES_API AudioChannelLayout CreateSmpteDtvChannelLayout();
/// L R Ls Rs C Cs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout CreateOctagonalChannelLayout();
/// C L R Ls Rs Rls Rrs Cs
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout();
/// L R C Ls Rs Lc Rc Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
/// L R C Ls Rs Cs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
/// L R Ls Rs Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout CreateCubeChannelLayout();
/// L R C LFE Ls Rs Cs Ts
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Top_Center_Layout();
/// L R C LFE Ls Rs Cs Vhc
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Center_High_Layout();
/// L R C LFE Ls Rs Vhl Vhr
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Front_High_Layout();
/// L R C LFE Ls Rs Tsl Tsr
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Side_High_Layout();

// Nine channels

/// L R C LFE Ls Rs Lc Rc Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
/// L R C LFE Ls Rs Cs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
/// L R LFE Ls Rs Vhl Vhc Vhr Bfc
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout();
/// L R C Ls Rs Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();

// Ten channels

/// L R C LFE Ls Rs Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
/// L R C LFE Ls Rs Lsd Rsd Tsl Tsr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout();
/// L R C Ls Rs Ts Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();

// Eleven channels

/// L R C LFE Ls Rs Ts Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
/// L R C Ls Rs Ts Vhl Vhc Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();

// Twelve channels

/// L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2
ZONMEDIATYPES_API AudioChannelLayout CreateVST10_2ChannelLayout();
/// L R C LFE Ls Rs Ts Vhl Vhc Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();

// Thirteen channels

/// L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();

// Fourteen channels

/// L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2
ZONMEDIATYPES_API AudioChannelLayout CreateVST10_2_PlusChannelLayout();
/// L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();

// Sixteen channels

/// Discrete ×2 C Discrete ×13
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema1Channel();
/// Lt Rt Discrete ×14
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema2Channel();
/// L R C Discrete Cs Discrete ×11
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema4Channel();
/// L R C LFE Ls Rs Discrete ×10
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema6Channel();
/// L R C LFE Ls Rs Discrete ×2 Cs Discrete ×7
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema7Channel();
/// L R C LFE Ls Rs Lc Rc Discrete ×8
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema8Channel();
/// L R C LFE Ls Rs Lc Rc Cs Discrete ×7
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema9Channel();

// Twenty-four channels

/// L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr
ZONMEDIATYPES_API AudioChannelLayout CreateVST22_2ChannelLayout();

}   // namespace zonmediatypes
