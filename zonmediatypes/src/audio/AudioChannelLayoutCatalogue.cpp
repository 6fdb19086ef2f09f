#include "zonmediatypes/AudioChannelLayoutCatalogue.h"

#include "zonmediatypes/src/audio/AudioChannelLabelTable.h"
#include "zonmediatypes/src/audio/KnownLayouts.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

// ---- The fixed layouts -----------------------------------------------------------------------------------------------

// Each factory with its labels in order, or kByName where its name lists them.
// clang-format off
#define ZON_CHANNEL_LAYOUTS(Row)                                                                                                                        \
	Row(CreateMonoChannelLayout,                                "*")                                                                                    \
	Row(CreateStereoChannelLayout,                              "L R")                                                                                  \
	Row(Create51ChannelLayout,                                  "L R C LFE Ls Rs")                                                                      \
	Row(CreateBroadcast51ChannelLayout,                         "L R C LFE Ls Rs")                                                                      \
	Row(CreateLegacy51ChannelLayout,                            "L R Ls Rs C LFE")                                                                      \
	Row(CreateQuadraphonicChannelLayout,                        "L R Ls Rs")                                                                            \
	Row(Create7_1ItuChannelLayout,                              "L R C LFE Ls Rs Rls Rrs")                                                              \
	Row(CreateMatrixStereoChannelLayout,                        "Lt Rt")                                                                                \
	Row(Create_Ls_Rs_ChannelLayout,                             kByName)                                                                                \
	Row(Create_Lc_Rc_ChannelLayout,                             kByName)                                                                                \
	Row(Create_Lsd_Rsd_ChannelLayout,                           kByName)                                                                                \
	Row(Create_C_LFE_ChannelLayout,                             kByName)                                                                                \
	Row(Create_Vhl_Vhr_ChannelLayout,                           kByName)                                                                                \
	Row(Create_Tsl_Tsr_ChannelLayout,                           kByName)                                                                                \
	Row(Create_Tbl_Tbr_ChannelLayout,                           kByName)                                                                                \
	Row(Create_Bfl_Bfr_ChannelLayout,                           kByName)                                                                                \
	Row(Create_L_R_C_ChannelLayout,                             kByName)                                                                                \
	Row(Create_C_L_R_ChannelLayout,                             kByName)                                                                                \
	Row(Create_L_C_R_ChannelLayout,                             kByName)                                                                                \
	Row(Create_L_R_Cs_ChannelLayout,                            kByName)                                                                                \
	Row(Create_L_R_LFE_ChannelLayout,                           kByName)                                                                                \
	Row(Create_L_R_C_Cs_ChannelLayout,                          kByName)                                                                                \
	Row(Create_C_L_R_Cs_ChannelLayout,                          kByName)                                                                                \
	Row(Create_L_C_R_Cs_ChannelLayout,                          kByName)                                                                                \
	Row(Create_L_R_LFE_Cs_ChannelLayout,                        kByName)                                                                                \
	Row(Create_L_R_Cs_LFE_ChannelLayout,                        kByName)                                                                                \
	Row(Create_L_R_C_LFE_ChannelLayout,                         kByName)                                                                                \
	Row(Create_L_C_R_LFE_ChannelLayout,                         kByName)                                                                                \
	Row(CreateAmbisonicsBFormatChannelLayout,                   "W X Y Z")                                                                              \
	Row(CreatePentagonalChannelLayout,                          "L R Ls Rs C")                                                                          \
	Row(Create_L_R_C_Ls_Rs_ChannelLayout,                       kByName)                                                                                \
	Row(Create_L_R_Ls_Rs_C_ChannelLayout,                       kByName)                                                                                \
	Row(Create_L_C_R_Ls_Rs_ChannelLayout,                       kByName)                                                                                \
	Row(Create_C_L_R_Ls_Rs_ChannelLayout,                       kByName)                                                                                \
	Row(Create_L_R_LFE_Ls_Rs_ChannelLayout,                     kByName)                                                                                \
	Row(Create_L_R_C_LFE_Cs_ChannelLayout,                      kByName)                                                                                \
	Row(Create_L_C_R_Cs_LFE_ChannelLayout,                      kByName)                                                                                \
	Row(Create_L_R_Ls_Rs_LFE_ChannelLayout,                     kByName)                                                                                \
	Row(Create_L_C_R_Ls_Rs_LFE_ChannelLayout,                   kByName)                                                                                \
	Row(Create_C_L_R_Ls_Rs_LFE_ChannelLayout,                   kByName)                                                                                \
	Row(Create_C_L_R_Ls_Rs_Cs_ChannelLayout,                    kByName)                                                                                \
	Row(CreateHexagonalChannelLayout,                           "L R Ls Rs C Cs")                                                                       \
	Row(Create_L_R_C_Ls_Rs_Cs_ChannelLayout,                    kByName)                                                                                \
	Row(Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout,                 kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout,                kByName)                                                                                \
	Row(Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,             kByName)                                                                                \
	Row(Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout,               kByName)                                                                                \
	Row(Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout,                 kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout,                 kByName)                                                                                \
	Row(Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout,                kByName)                                                                                \
	Row(Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout,               kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout,               kByName)                                                                                \
	Row(Create7_1ChannelLayout,                                 "L R C LFE Ls Rs Lc Rc")                                                                \
	Row(Create7_1MpegChannelLayout,                             "C Lc Rc L R Ls Rs LFE")                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,           kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout,             kByName)                                                                                \
	Row(Create7_1EMagicChannelLayout,                           "L R Ls Rs C LFE Lc Rc")                                                                \
	Row(CreateSmpteDtvChannelLayout,                            "L R C LFE Ls Rs Lt Rt")                                                                \
	Row(CreateOctagonalChannelLayout,                           "L R Ls Rs C Cs Lsd Rsd")                                                               \
	Row(Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout,            kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout,              kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout,            kByName)                                                                                \
	Row(CreateCubeChannelLayout,                                "L R Ls Rs Vhl Vhr Tbl Tbr")                                                            \
	Row(Create_VST_7_1_Cine_Top_Center_Layout,                  "L R C LFE Ls Rs Cs Ts")                                                                \
	Row(Create_VST_7_1_Cine_Center_High_Layout,                 "L R C LFE Ls Rs Cs Vhc")                                                               \
	Row(Create_VST_7_1_Cine_Front_High_Layout,                  "L R C LFE Ls Rs Vhl Vhr")                                                              \
	Row(Create_VST_7_1_Cine_Side_High_Layout,                   "L R C LFE Ls Rs Tsl Tsr")                                                              \
	Row(Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout,          kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout,        kByName)                                                                                \
	Row(Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout,     kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout,       kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout,   kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout,   kByName)                                                                                \
	Row(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout,    kByName)                                                                                \
	Row(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout, kByName)                                                                               \
	Row(Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, kByName)                                                                               \
	Row(CreateVST10_2ChannelLayout,                             "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2")                                             \
	Row(Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, kByName)                                                                           \
	Row(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr")                                        \
	Row(CreateVST10_2_PlusChannelLayout,                        "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2")                                       \
	Row(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr")                                \
	Row(CreateSMPTEDigitalCinema1Channel,                       "* * C * * * * * * * * * * * * *")                                                      \
	Row(CreateSMPTEDigitalCinema2Channel,                       "Lt Rt * * * * * * * * * * * * * *")                                                    \
	Row(CreateSMPTEDigitalCinema4Channel,                       "L R C * Cs * * * * * * * * * * *")                                                     \
	Row(CreateSMPTEDigitalCinema6Channel,                       "L R C LFE Ls Rs * * * * * * * * * *")                                                  \
	Row(CreateSMPTEDigitalCinema7Channel,                       "L R C LFE Ls Rs * * Cs * * * * * * *")                                                 \
	Row(CreateSMPTEDigitalCinema8Channel,                       "L R C LFE Ls Rs Lc Rc * * * * * * * *")                                                \
	Row(CreateSMPTEDigitalCinema9Channel,                       "L R C LFE Ls Rs Lc Rc Cs * * * * * * *")                                               \
	Row(CreateVST22_2ChannelLayout,                             "L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfl Bfc Bfr")
// clang-format on

namespace zonmediatypes
{
namespace
{

struct LayoutRow
{
	std::string_view mName;   // of the layout
	std::string_view mLabels;
};

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

constexpr std::string_view kByName;

consteval LayoutRow MakeRow(std::string_view inFactory, std::string_view inLabels)
{
	const std::string_view name = LayoutName(inFactory);
	return {name, inLabels == kByName ? name : inLabels};
}

#define ZON_ROW(inFactory, inLabels) MakeRow(#inFactory, inLabels),
constexpr auto sRows = std::to_array<LayoutRow>({ZON_CHANNEL_LAYOUTS(ZON_ROW)});
#undef ZON_ROW

// The labels of all rows, one row after the other.
constexpr auto sLabels = []
{
	constexpr std::size_t kLabels = []
	{
		std::size_t labels = 0;
		for (const LayoutRow& row : sRows)
			labels += CountWords(row.mLabels);
		return labels;
	}();
	std::array<AudioChannelLabel, kLabels> labels{};
	auto end = labels.begin();
	for (const LayoutRow& row : sRows)
		end = ReadLabels(row.mLabels, end);
	return labels;
}();

constexpr auto sChannelLayouts = []
{
	std::array<NamedChannelLayout, sRows.size()> layouts{};
	std::span<const AudioChannelLabel> rest(sLabels);
	for (std::size_t i = 0; i < layouts.size(); ++i)
	{
		const std::size_t count = CountWords(sRows[i].mLabels);
		layouts[i] = {sRows[i].mName, rest.first(count)};
		rest = rest.subspan(count);
	}
	return layouts;
}();

consteval std::span<const AudioChannelLabel> LabelsOf(std::string_view inName)
{
	for (const auto& [name, labels] : sChannelLayouts)
		if (name == inName)
			return labels;
	throw "no layout has this name";
}

AudioChannelLayout MakeLayout(std::span<const AudioChannelLabel> inLabels)
{
	return AudioChannelLayout(inLabels.begin(), inLabels.end());
}

}   // namespace

constinit const std::span<const AudioChannelLabel> kStereoLabels = LabelsOf("Stereo");
constinit const std::span<const AudioChannelLabel> kBroadcast51Labels = LabelsOf("Broadcast51");
constinit const std::span<const AudioChannelLabel> kSmpteDtvLabels = LabelsOf("SmpteDtv");

std::span<const NamedChannelLayout> AllChannelLayouts() noexcept
{
	return sChannelLayouts;
}

// ---- Layouts of a count ----------------------------------------------------------------------------------------------

namespace
{

struct DefaultLayout
{
	std::span<const AudioChannelLabel> mLabels;
	bool mIsForAll = true;   // for maps and formats, too
};

// By the number of channels; a layout without labels where the number stands for none.
constexpr auto sDefaultsByCount = []
{
	std::array<DefaultLayout, 9> layouts{};
	for (const DefaultLayout layout : {DefaultLayout{LabelsOf("Mono")}, {LabelsOf("Stereo")},
			 {LabelsOf("Quadraphonic"), false}, {LabelsOf("Broadcast51")}, {LabelsOf("7_1Itu"), false}})
		layouts.at(layout.mLabels.size()) = layout;
	return layouts;
}();

}   // namespace

std::span<const AudioChannelLabel> DefaultLabels(std::size_t inChannelCount, DefaultFor inWhat) noexcept
{
	const DefaultLayout layout
		= inChannelCount < sDefaultsByCount.size() ? sDefaultsByCount[inChannelCount] : DefaultLayout();
	return layout.mIsForAll || inWhat == DefaultFor::Layouts ? layout.mLabels : std::span<const AudioChannelLabel>();
}

AudioChannelLayout CreateMultichannelLayout(int inCount)
{
	return AudioChannelLayout(static_cast<std::size_t>(std::max(inCount, 0)));
}

AudioChannelLayout CreateMultichannelLayoutWithDefaultLabels(std::size_t inCount)
{
	const auto labels = DefaultLabels(inCount, DefaultFor::Layouts);
	return labels.empty() ? CreateMultichannelLayout(static_cast<std::int32_t>(inCount)) : MakeLayout(labels);
}

}   // namespace zonmediatypes

// Qualified, so that a row without its declaration in the header does not compile.
#define ZON_FACTORY(inFactory, ...)                                                                                    \
	zonmediatypes::AudioChannelLayout zonmediatypes::inFactory()                                                       \
	{                                                                                                                  \
		return MakeLayout(LabelsOf(LayoutName(#inFactory)));                                                           \
	}
ZON_CHANNEL_LAYOUTS(ZON_FACTORY)
#undef ZON_FACTORY
#undef ZON_CHANNEL_LAYOUTS
