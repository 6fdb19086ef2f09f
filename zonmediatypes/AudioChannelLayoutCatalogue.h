#pragma once

/// \file
/// The catalogue of layouts: 89 fixed ones by name, and layouts of any number of channels.
///
///     const AudioChannelLayout surround = CreateBroadcast51ChannelLayout();   // L R C LFE Ls Rs
///     HasLFEChannel(surround);                                                // true
///     CreateMultichannelLayout(3);                                            // Discrete Discrete Discrete

#include "zonmediatypes/AudioChannelLabel.h"
#include "zonmediatypes/Export.h"

#include <cstddef>
#include <span>
#include <string_view>

namespace zonmediatypes
{

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
ZONMEDIATYPES_API AudioChannelLayout CreateMultichannelLayoutWithDefaultLabels(std::size_t inCount);

// The fixed layouts by channel count. Where a factory's name does not list its labels in order, a comment does, * for
// Discrete. Two of them hold a channel more than their names list (Tbc), and the SMPTE digital cinema layouts fill up to 16
// channels: both deliberately.

// One channel

ZONMEDIATYPES_API AudioChannelLayout CreateMonoChannelLayout();   ///< *

// Two channels

ZONMEDIATYPES_API AudioChannelLayout CreateStereoChannelLayout();         ///< L R
ZONMEDIATYPES_API AudioChannelLayout CreateMatrixStereoChannelLayout();   ///< Lt Rt
ZONMEDIATYPES_API AudioChannelLayout Create_Ls_Rs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Lc_Rc_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Lsd_Rsd_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Vhl_Vhr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Tsl_Tsr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Tbl_Tbr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_Bfl_Bfr_ChannelLayout();

// Three channels

ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_ChannelLayout();

// Four channels

ZONMEDIATYPES_API AudioChannelLayout CreateQuadraphonicChannelLayout();   ///< L R Ls Rs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout CreateAmbisonicsBFormatChannelLayout();   ///< W X Y Z

// Five channels

ZONMEDIATYPES_API AudioChannelLayout CreatePentagonalChannelLayout();   ///< L R Ls Rs C
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_LFE_ChannelLayout();

// Six channels

ZONMEDIATYPES_API AudioChannelLayout Create51ChannelLayout();            ///< L R C LFE Ls Rs
ZONMEDIATYPES_API AudioChannelLayout CreateBroadcast51ChannelLayout();   ///< L R C LFE Ls Rs
ZONMEDIATYPES_API AudioChannelLayout CreateLegacy51ChannelLayout();      ///< L R Ls Rs C LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout CreateHexagonalChannelLayout();   ///< L R Ls Rs C Cs
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout();

// Seven channels

ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout();

// Eight channels

ZONMEDIATYPES_API AudioChannelLayout Create7_1ItuChannelLayout();    ///< L R C LFE Ls Rs Rls Rrs
ZONMEDIATYPES_API AudioChannelLayout Create7_1ChannelLayout();       ///< L R C LFE Ls Rs Lc Rc
ZONMEDIATYPES_API AudioChannelLayout Create7_1MpegChannelLayout();   ///< C Lc Rc L R Ls Rs LFE
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create7_1EMagicChannelLayout();   ///< L R Ls Rs C LFE Lc Rc
ZONMEDIATYPES_API AudioChannelLayout CreateSmpteDtvChannelLayout();    ///< L R C LFE Ls Rs Lt Rt
ZONMEDIATYPES_API AudioChannelLayout CreateOctagonalChannelLayout();   ///< L R Ls Rs C Cs Lsd Rsd
ZONMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout CreateCubeChannelLayout();                  ///< L R Ls Rs Vhl Vhr Tbl Tbr
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Top_Center_Layout();    ///< L R C LFE Ls Rs Cs Ts
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Center_High_Layout();   ///< L R C LFE Ls Rs Cs Vhc
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Front_High_Layout();    ///< L R C LFE Ls Rs Vhl Vhr
ZONMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Side_High_Layout();     ///< L R C LFE Ls Rs Tsl Tsr

// Nine channels

ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();

// Ten channels

ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();

// Eleven channels

ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZONMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();

// Twelve channels

ZONMEDIATYPES_API AudioChannelLayout CreateVST10_2ChannelLayout();   ///< L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2
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

ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema1Channel();   ///< * * C * * * * * * * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema2Channel();   ///< Lt Rt * * * * * * * * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema4Channel();   ///< L R C * Cs * * * * * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema6Channel();   ///< L R C LFE Ls Rs * * * * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema7Channel();   ///< L R C LFE Ls Rs * * Cs * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema8Channel();   ///< L R C LFE Ls Rs Lc Rc * * * * * * * *
ZONMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema9Channel();   ///< L R C LFE Ls Rs Lc Rc Cs * * * * * * *

// Twenty-four channels

/// L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr
ZONMEDIATYPES_API AudioChannelLayout CreateVST22_2ChannelLayout();

}   // namespace zonmediatypes
