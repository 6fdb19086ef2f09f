#include "zonmediatypes/AudioChannelLayout.h"

#include "zonmediatypes/src/audio/AudioChannelLabels.h"
#include "zonmediatypes/src/audio/AudioChannelLayouts.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <numeric>
#include <span>
#include <string_view>

namespace zonmediatypes
{
namespace
{

// The engineer's shorthand for the labels.
// clang-format off
constexpr auto D    = kAudioChannelLabel_Discrete;
constexpr auto L    = kAudioChannelLabel_FrontLeft;
constexpr auto R    = kAudioChannelLabel_FrontRight;
constexpr auto C    = kAudioChannelLabel_FrontCenter;
constexpr auto LFE  = kAudioChannelLabel_LowFrequency;
constexpr auto Ls   = kAudioChannelLabel_BackLeft;
constexpr auto Rs   = kAudioChannelLabel_BackRight;
constexpr auto Cs   = kAudioChannelLabel_BackCenter;
constexpr auto Lc   = kAudioChannelLabel_FrontLeftOfCenter;
constexpr auto Rc   = kAudioChannelLabel_FrontRightOfCenter;
constexpr auto Lsd  = kAudioChannelLabel_SideLeft;
constexpr auto Rsd  = kAudioChannelLabel_SideRight;
constexpr auto Ts   = kAudioChannelLabel_TopCenter;
constexpr auto Vhl  = kAudioChannelLabel_TopFrontLeft;
constexpr auto Vhr  = kAudioChannelLabel_TopFrontRight;
constexpr auto Vhc  = kAudioChannelLabel_TopFrontCenter;
constexpr auto Tbl  = kAudioChannelLabel_TopBackLeft;
constexpr auto Tbr  = kAudioChannelLabel_TopBackRight;
constexpr auto Tbc  = kAudioChannelLabel_TopBackCenter;
constexpr auto Lw   = kAudioChannelLabel_FrontLeftWide;
constexpr auto Rw   = kAudioChannelLabel_FrontRightWide;
constexpr auto Tsl  = kAudioChannelLabel_LeftHeight;
constexpr auto Tsr  = kAudioChannelLabel_RightHeight;
constexpr auto Rls  = kAudioChannelLabel_RearSurroundLeft;
constexpr auto Rrs  = kAudioChannelLabel_RearSurroundRight;
constexpr auto LFE2 = kAudioChannelLabel_LFE2;
constexpr auto Lt   = kAudioChannelLabel_LeftTotal;
constexpr auto Rt   = kAudioChannelLabel_RightTotal;
constexpr auto W    = kAudioChannelLabel_AmbisonicsW;
constexpr auto X    = kAudioChannelLabel_AmbisonicsX;
constexpr auto Y    = kAudioChannelLabel_AmbisonicsY;
constexpr auto Z    = kAudioChannelLabel_AmbisonicsZ;
constexpr auto Bfl  = kAudioChannelLabel_BottomFrontLeft;
constexpr auto Bfc  = kAudioChannelLabel_BottomFrontCenter;
constexpr auto Bfr  = kAudioChannelLabel_BottomFrontRight;
constexpr auto Pl   = kAudioChannelLabel_ProximityLeft;
constexpr auto Pr   = kAudioChannelLabel_ProximityRight;
// clang-format on

constexpr auto sAudioChannelLabels = []
{
	std::array<AudioChannelLabel, kAudioChannelLabels.size()> labels;
	std::ranges::transform(kAudioChannelLabels, labels.begin(), &AudioChannelLabelRow::mLabel);
	return labels;
}();

}   // namespace

std::span<const AudioChannelLabel> AllAudioChannelLabels() noexcept
{
	return sAudioChannelLabels;
}

// ---- Pairs of labels -------------------------------------------------------------------------------------------------

namespace
{

struct LabelPair
{
	AudioChannelLabel mLabel;
	AudioChannelLabel mPartner;
};

// inPairs read both ways; inOneWay entries are written last and win.
template <AudioChannelLabel inLastLabel>
consteval auto MakePairTable(std::initializer_list<LabelPair> inPairs, std::initializer_list<LabelPair> inOneWay = {})
{
	std::array<AudioChannelLabel, LabelIndex(inLastLabel) + 1> table{};   // all Discrete: no partner
	for (const auto [label, partner] : inPairs)
	{
		table.at(LabelIndex(label)) = partner;
		table.at(LabelIndex(partner)) = label;
	}
	for (const auto [label, partner] : inOneWay)
		table.at(LabelIndex(label)) = partner;
	return table;
}

constexpr AudioChannelLabel Partner(std::span<const AudioChannelLabel> inTable, AudioChannelLabel inLabel)
{
	const std::size_t index = LabelIndex(inLabel);
	return index < inTable.size() ? inTable[index] : kAudioChannelLabel_Discrete;
}

// clang-format off
constexpr auto sLeftRightPairs = MakePairTable<Pr>(
	{{L, R}, {LFE, LFE2}, {Ls, Rs}, {Lc, Rc}, {Lsd, Rsd}, {Vhl, Vhr}, {Tbl, Tbr}, {Lw, Rw}, {Tsl, Tsr}, {Rls, Rrs},
	 {Lt, Rt}, {Bfl, Bfr}, {Pl, Pr}});

constexpr auto sFrontBackPairs = MakePairTable<Rrs>(
	{{L, Ls}, {R, Rs}, {C, Cs}, {Lc, Rls}, {Rc, Rrs}, {Vhl, Tbl}, {Vhr, Tbr}, {Vhc, Tbc}});

constexpr auto sTopMiddlePairs = MakePairTable<Tbc>(
	{{L, Vhl}, {C, Vhc}, {Ls, Tbl}, {Rs, Tbr}, {Cs, Tbc}},
	{{R, R}, {Vhr, R}});   // deliberate: R partners itself, Vhr finds R

constexpr auto sTopBottomPairs = MakePairTable<Bfr>(
	{{Vhl, Bfl}, {Vhc, Bfc}},
	{{Vhr, Bfr}, {Bfr, R}});   // deliberate: Bfr finds R, not Vhr

constexpr auto sBottomMiddlePairs = MakePairTable<Bfr>({{Bfl, L}, {Bfc, C}, {Bfr, R}});
// clang-format on

}   // namespace

AudioChannelLabel LeftRightPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sLeftRightPairs, inLabel);
}

AudioChannelLabel FrontBackPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sFrontBackPairs, inLabel);
}

AudioChannelLabel TopMiddlePair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sTopMiddlePairs, inLabel);
}

AudioChannelLabel TopBottomPair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sTopBottomPairs, inLabel);
}

AudioChannelLabel BottomMiddlePair(AudioChannelLabel inLabel) noexcept
{
	return Partner(sBottomMiddlePairs, inLabel);
}

bool IsStereoPair(AudioChannelLabel inFirst, AudioChannelLabel inSecond) noexcept
{
	return inFirst != D && inSecond != D && LeftRightPair(inFirst) == inSecond;
}

// ---- Queries ---------------------------------------------------------------------------------------------------------

bool HasChannelLabeling(const AudioChannelLayout& inLayout) noexcept
{
	return std::ranges::any_of(inLayout, [](AudioChannelDescription inChannel) { return inChannel != D; });
}

bool HasChannelLabel(const AudioChannelLayout& inLayout, AudioChannelLabel inLabel) noexcept
{
	return std::ranges::find(inLayout, inLabel, &AudioChannelDescription::mLabel) != inLayout.end();
}

bool HasLFEChannel(const AudioChannelLayout& inLayout) noexcept
{
	return HasChannelLabel(inLayout, LFE);
}

bool ContainsSameChannelsIgnoreOrder(const AudioChannelLayout& inFirst, const AudioChannelLayout& inSecond)
{
	if (inFirst.size() != inSecond.size())
		return false;
	AudioChannelLayout first = inFirst;
	AudioChannelLayout second = inSecond;
	std::ranges::sort(first);
	std::ranges::sort(second);
	return first == second;
}

unsigned long GetChannelCount(const AudioChannelLayouts& inLayouts) noexcept
{
	return std::accumulate(inLayouts.begin(), inLayouts.end(), 0ul,
		[](unsigned long inSum, const AudioChannelLayout& inLayout) { return inSum + inLayout.size(); });
}

// ---- Catalogue of layouts --------------------------------------------------------------------------------------------

// Every fixed layout: its factory and its labels in order.
// clang-format off
#define ZON_CHANNEL_LAYOUTS(Row)                                                                                                     \
	Row(CreateMonoChannelLayout,                                        D)                                                           \
	Row(CreateStereoChannelLayout,                                      L, R)                                                        \
	Row(Create51ChannelLayout,                                          L, R, C, LFE, Ls, Rs)                                        \
	Row(CreateBroadcast51ChannelLayout,                                 L, R, C, LFE, Ls, Rs)                                        \
	Row(CreateLegacy51ChannelLayout,                                    L, R, Ls, Rs, C, LFE)                                        \
	Row(CreateQuadraphonicChannelLayout,                                L, R, Ls, Rs)                                                \
	Row(Create7_1ItuChannelLayout,                                      L, R, C, LFE, Ls, Rs, Rls, Rrs)                              \
	Row(CreateMatrixStereoChannelLayout,                                Lt, Rt)                                                      \
	Row(Create_Ls_Rs_ChannelLayout,                                     Ls, Rs)                                                      \
	Row(Create_Lc_Rc_ChannelLayout,                                     Lc, Rc)                                                      \
	Row(Create_Lsd_Rsd_ChannelLayout,                                   Lsd, Rsd)                                                    \
	Row(Create_C_LFE_ChannelLayout,                                     C, LFE)                                                      \
	Row(Create_Vhl_Vhr_ChannelLayout,                                   Vhl, Vhr)                                                    \
	Row(Create_Tsl_Tsr_ChannelLayout,                                   Tsl, Tsr)                                                    \
	Row(Create_Tbl_Tbr_ChannelLayout,                                   Tbl, Tbr)                                                    \
	Row(Create_Bfl_Bfr_ChannelLayout,                                   Bfl, Bfr)                                                    \
	Row(Create_L_R_C_ChannelLayout,                                     L, R, C)                                                     \
	Row(Create_C_L_R_ChannelLayout,                                     C, L, R)                                                     \
	Row(Create_L_C_R_ChannelLayout,                                     L, C, R)                                                     \
	Row(Create_L_R_Cs_ChannelLayout,                                    L, R, Cs)                                                    \
	Row(Create_L_R_LFE_ChannelLayout,                                   L, R, LFE)                                                   \
	Row(Create_L_R_C_Cs_ChannelLayout,                                  L, R, C, Cs)                                                 \
	Row(Create_C_L_R_Cs_ChannelLayout,                                  C, L, R, Cs)                                                 \
	Row(Create_L_C_R_Cs_ChannelLayout,                                  L, C, R, Cs)                                                 \
	Row(Create_L_R_LFE_Cs_ChannelLayout,                                L, R, LFE, Cs)                                               \
	Row(Create_L_R_Cs_LFE_ChannelLayout,                                L, R, Cs, LFE)                                               \
	Row(Create_L_R_C_LFE_ChannelLayout,                                 L, R, C, LFE)                                                \
	Row(Create_L_C_R_LFE_ChannelLayout,                                 L, C, R, LFE)                                                \
	Row(CreateAmbisonicsBFormatChannelLayout,                           W, X, Y, Z)                                                  \
	Row(CreatePentagonalChannelLayout,                                  L, R, Ls, Rs, C)                                             \
	Row(Create_L_R_C_Ls_Rs_ChannelLayout,                               L, R, C, Ls, Rs)                                             \
	Row(Create_L_R_Ls_Rs_C_ChannelLayout,                               L, R, Ls, Rs, C)                                             \
	Row(Create_L_C_R_Ls_Rs_ChannelLayout,                               L, C, R, Ls, Rs)                                             \
	Row(Create_C_L_R_Ls_Rs_ChannelLayout,                               C, L, R, Ls, Rs)                                             \
	Row(Create_L_R_LFE_Ls_Rs_ChannelLayout,                             L, R, LFE, Ls, Rs)                                           \
	Row(Create_L_R_C_LFE_Cs_ChannelLayout,                              L, R, C, LFE, Cs)                                            \
	Row(Create_L_C_R_Cs_LFE_ChannelLayout,                              L, C, R, Cs, LFE)                                            \
	Row(Create_L_R_Ls_Rs_LFE_ChannelLayout,                             L, R, Ls, Rs, LFE)                                           \
	Row(Create_L_C_R_Ls_Rs_LFE_ChannelLayout,                           L, C, R, Ls, Rs, LFE)                                        \
	Row(Create_C_L_R_Ls_Rs_LFE_ChannelLayout,                           C, L, R, Ls, Rs, LFE)                                        \
	Row(Create_C_L_R_Ls_Rs_Cs_ChannelLayout,                            C, L, R, Ls, Rs, Cs)                                         \
	Row(CreateHexagonalChannelLayout,                                   L, R, Ls, Rs, C, Cs)                                         \
	Row(Create_L_R_C_Ls_Rs_Cs_ChannelLayout,                            L, R, C, Ls, Rs, Cs)                                         \
	Row(Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout,                         L, R, Ls, Rs, Lsd, Rsd)                                      \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout,                        L, R, C, LFE, Ls, Rs, Cs)                                    \
	Row(Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,                     L, R, LFE, Ls, Rs, Lsd, Rsd)                                 \
	Row(Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout,                       L, R, Ls, Rs, C, Rls, Rrs)                                   \
	Row(Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout,                         L, R, Ls, Rs, C, Lc, Rc)                                     \
	Row(Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout,                         L, R, C, Ls, Rs, Lc, Rc)                                     \
	Row(Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout,                        C, L, R, Ls, Rs, Cs, LFE)                                    \
	Row(Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout,                       C, L, R, Ls, Rs, Rls, Rrs)                                   \
	Row(Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout,                       L, R, C, Ls, Rs, Lsd, Rsd)                                   \
	Row(Create7_1ChannelLayout,                                         L, R, C, LFE, Ls, Rs, Lc, Rc)                                \
	Row(Create7_1MpegChannelLayout,                                     C, Lc, Rc, L, R, Ls, Rs, LFE)                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,                   L, R, C, LFE, Ls, Rs, Lsd, Rsd)                              \
	Row(Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout,                     L, R, C, LFE, Ls, Rs, Pl, Pr)                                \
	Row(Create7_1EMagicChannelLayout,                                   L, R, Ls, Rs, C, LFE, Lc, Rc)                                \
	Row(CreateSmpteDtvChannelLayout,                                    L, R, C, LFE, Ls, Rs, Lt, Rt)                                \
	Row(CreateOctagonalChannelLayout,                                   L, R, Ls, Rs, C, Cs, Lsd, Rsd)                               \
	Row(Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout,                    C, L, R, Ls, Rs, Rls, Rrs, Cs)                               \
	Row(Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout,                      L, R, C, Ls, Rs, Lc, Rc, Cs)                                 \
	Row(Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout,                    L, R, C, Ls, Rs, Cs, Lsd, Rsd)                               \
	Row(CreateCubeChannelLayout,                                        L, R, Ls, Rs, Vhl, Vhr, Tbl, Tbr)                            \
	Row(Create_VST_7_1_Cine_Top_Center_Layout,                          L, R, C, LFE, Ls, Rs, Cs, Ts)                                \
	Row(Create_VST_7_1_Cine_Center_High_Layout,                         L, R, C, LFE, Ls, Rs, Cs, Vhc)                               \
	Row(Create_VST_7_1_Cine_Front_High_Layout,                          L, R, C, LFE, Ls, Rs, Vhl, Vhr)                              \
	Row(Create_VST_7_1_Cine_Side_High_Layout,                           L, R, C, LFE, Ls, Rs, Tsl, Tsr)                              \
	Row(Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout,                  L, R, C, LFE, Ls, Rs, Lc, Rc, Cs)                            \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout,                L, R, C, LFE, Ls, Rs, Cs, Lsd, Rsd)                          \
	Row(Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout,             L, R, LFE, Ls, Rs, Vhl, Vhc, Vhr, Bfc)                       \
	Row(Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout,               L, R, C, Ls, Rs, Vhl, Vhr, Tbl, Tbr)                         \
	Row(Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout,           L, R, C, LFE, Ls, Rs, Vhl, Vhr, Tbl, Tbr)                    \
	Row(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout,           L, R, C, LFE, Ls, Rs, Lsd, Rsd, Tsl, Tsr)                    \
	Row(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout,            L, R, C, Ls, Rs, Ts, Vhl, Vhr, Tbl, Tbr)                     \
	Row(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout,        L, R, C, LFE, Ls, Rs, Ts, Vhl, Vhr, Tbl, Tbr)                \
	Row(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,        L, R, C, Ls, Rs, Ts, Vhl, Vhc, Vhr, Tbl, Tbr)                \
	Row(CreateVST10_2ChannelLayout,                                     L, R, C, LFE, Ls, Rs, Vhl, Vhc, Vhr, Tbl, Tbr, LFE2)         \
	Row(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,    L, R, C, LFE, Ls, Rs, Ts, Vhl, Vhc, Vhr, Tbl, Tbr)           \
	Row(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,     L, R, C, Ls, Rs, Cs, Ts, Vhl, Vhc, Vhr, Tbl, Tbc, Tbr)       \
	Row(CreateVST10_2_PlusChannelLayout,                                L, R, C, LFE, Ls, Rs, Lc, Rc, Vhl, Vhc, Vhr, Tbl, Tbr, LFE2) \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, L, R, C, LFE, Ls, Rs, Cs, Ts, Vhl, Vhc, Vhr, Tbl, Tbc, Tbr)  \
	Row(CreateSMPTEDigitalCinema1Channel,                               D, D, C, D, D, D, D, D, D, D, D, D, D, D, D, D)              \
	Row(CreateSMPTEDigitalCinema2Channel,                               Lt, Rt, D, D, D, D, D, D, D, D, D, D, D, D, D, D)            \
	Row(CreateSMPTEDigitalCinema4Channel,                               L, R, C, D, Cs, D, D, D, D, D, D, D, D, D, D, D)             \
	Row(CreateSMPTEDigitalCinema6Channel,                               L, R, C, LFE, Ls, Rs, D, D, D, D, D, D, D, D, D, D)          \
	Row(CreateSMPTEDigitalCinema7Channel,                               L, R, C, LFE, Ls, Rs, D, D, Cs, D, D, D, D, D, D, D)         \
	Row(CreateSMPTEDigitalCinema8Channel,                               L, R, C, LFE, Ls, Rs, Lc, Rc, D, D, D, D, D, D, D, D)        \
	Row(CreateSMPTEDigitalCinema9Channel,                               L, R, C, LFE, Ls, Rs, Lc, Rc, Cs, D, D, D, D, D, D, D)       \
	Row(CreateVST22_2ChannelLayout,                                     L, R, C, LFE, Ls, Rs, Lc, Rc, Cs, Lsd, Rsd, Ts,              \
	                                                                    Vhl, Vhc, Vhr, Tbl, Tbc, Tbr, LFE2, Tsl, Tsr, Bfl, Bfc, Bfr)
// clang-format on

namespace
{

template <AudioChannelLabel... inLabels>
constexpr std::array<AudioChannelLabel, sizeof...(inLabels)> sLabels{inLabels...};

AudioChannelLayout MakeLayout(std::span<const AudioChannelLabel> inLabels)
{
	return AudioChannelLayout(inLabels.begin(), inLabels.end());
}

// The name of a factory's layout.
consteval std::string_view LayoutName(std::string_view inFactory)
{
	constexpr std::string_view kPrefix = "Create";
	constexpr std::string_view kSuffix = "ChannelLayout";
	if (!inFactory.starts_with(kPrefix))
		throw "a factory's name begins with Create";
	inFactory.remove_prefix(kPrefix.size());
	if (inFactory.ends_with(kSuffix))
		inFactory.remove_suffix(kSuffix.size());
	return inFactory;
}

#define ZON_NAMED_LAYOUT(inFactory, ...) {LayoutName(#inFactory), sLabels<__VA_ARGS__>},
constexpr auto sChannelLayouts = std::to_array<NamedChannelLayout>({ZON_CHANNEL_LAYOUTS(ZON_NAMED_LAYOUT)});
#undef ZON_NAMED_LAYOUT

consteval std::span<const AudioChannelLabel> LabelsOf(std::string_view inName)
{
	return std::ranges::find(sChannelLayouts, inName, &NamedChannelLayout::mName)->mLabels;
}

}   // namespace

#define ZON_FACTORY(inFactory, ...)                                                                                    \
	AudioChannelLayout inFactory()                                                                                     \
	{                                                                                                                  \
		return MakeLayout(sLabels<__VA_ARGS__>);                                                                       \
	}
ZON_CHANNEL_LAYOUTS(ZON_FACTORY)
#undef ZON_FACTORY
#undef ZON_CHANNEL_LAYOUTS

constinit const std::span<const AudioChannelLabel> kStereoLabels = LabelsOf("Stereo");
constinit const std::span<const AudioChannelLabel> kBroadcast51Labels = LabelsOf("Broadcast51");
constinit const std::span<const AudioChannelLabel> kSmpteDtvLabels = LabelsOf("SmpteDtv");

std::span<const NamedChannelLayout> AllChannelLayouts() noexcept
{
	return sChannelLayouts;
}

AudioChannelLayout CreateMultichannelLayout(int inCount)
{
	return AudioChannelLayout(static_cast<std::size_t>(std::max(inCount, 0)));
}

AudioChannelLayout CreateMultichannelLayoutWithDefaultLabels(unsigned long inCount)
{
	switch (inCount)
	{
	case 2:
		return CreateStereoChannelLayout();
	case 4:
		return CreateQuadraphonicChannelLayout();
	case 6:
		return CreateBroadcast51ChannelLayout();
	case 8:
		return Create7_1ItuChannelLayout();
	default:
		return CreateMultichannelLayout(static_cast<std::int32_t>(inCount));   // its low 32 bits
	}
}

}   // namespace zonmediatypes
