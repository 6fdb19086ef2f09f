#pragma once

// What is required of the labels, and layouts written as text; for the tests of every audio area.

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
	std::string_view mName;
	int mValue;
	std::string_view mAbbreviation;
	std::array<int, 3> mPosition;   // to the right, up, to the front
	std::string_view mPartners;     // left-right, front-back, top-middle, top-bottom, bottom-middle
};

// The order of the numbers; what belongs together shares a line where that is possible.
// clang-format off
#define LABEL(inName, ...) RequiredLabel{kAudioChannelLabel_##inName, #inName, __VA_ARGS__}
inline constexpr auto kRequiredLabels = std::to_array<RequiredLabel>({
	LABEL(Discrete, 0, "*", {0, 0, 0}, "* * * * *"),
	LABEL(FrontLeft, 100, "L", {-2, 0, 2}, "R Ls Vhl * Bfl"),         LABEL(FrontRight, 101, "R", {2, 0, 2}, "L Rs R * Bfr"),
	LABEL(FrontCenter, 102, "C", {0, 0, 2}, "* Cs Vhc * Bfc"),        LABEL(LowFrequency, 103, "LFE", {0, 0, 0}, "LFE2 * * * *"),
	LABEL(BackLeft, 104, "Ls", {-2, 0, -2}, "Rs L Tbl * *"),          LABEL(BackRight, 105, "Rs", {2, 0, -2}, "Ls R Tbr * *"),
	LABEL(BackCenter, 106, "Cs", {0, 0, -2}, "* C Tbc * *"),
	LABEL(FrontLeftOfCenter, 107, "Lc", {-1, 0, 2}, "Rc Rls * * *"),  LABEL(FrontRightOfCenter, 108, "Rc", {1, 0, 2}, "Lc Rrs * * *"),
	LABEL(SideLeft, 109, "Lsd", {-2, 0, 0}, "Rsd * * * *"),           LABEL(SideRight, 110, "Rsd", {2, 0, 0}, "Lsd * * * *"),
	LABEL(TopCenter, 111, "Ts", {0, 2, 0}, "* * * * *"),
	LABEL(TopFrontLeft, 112, "Vhl", {-2, 2, 2}, "Vhr Tbl L Bfl *"),   LABEL(TopFrontRight, 113, "Vhr", {2, 2, 2}, "Vhl Tbr R Bfr *"),
	LABEL(TopFrontCenter, 114, "Vhc", {0, 2, 2}, "* Tbc C Bfc *"),
	LABEL(TopBackLeft, 115, "Tbl", {-2, 2, -2}, "Tbr Vhl Ls * *"),    LABEL(TopBackRight, 116, "Tbr", {2, 2, -2}, "Tbl Vhr Rs * *"),
	LABEL(TopBackCenter, 117, "Tbc", {0, 2, -2}, "* Vhc Cs * *"),
	LABEL(FrontLeftWide, 118, "Lw", {-2, 0, 2}, "Rw * * * *"),        LABEL(FrontRightWide, 119, "Rw", {2, 0, 2}, "Lw * * * *"),
	LABEL(LeftHeight, 127, "Tsl", {-2, 2, 0}, "Tsr * * * *"),         LABEL(RightHeight, 128, "Tsr", {2, 2, 0}, "Tsl * * * *"),
	LABEL(RearSurroundLeft, 129, "Rls", {-2, 0, -2}, "Rrs Lc * * *"), LABEL(RearSurroundRight, 130, "Rrs", {2, 0, -2}, "Rls Rc * * *"),
	LABEL(LFE2, 131, "LFE2", {0, 0, 0}, "LFE * * * *"),
	LABEL(LeftTotal, 132, "Lt", {-2, 0, 0}, "Rt * * * *"),            LABEL(RightTotal, 133, "Rt", {2, 0, 0}, "Lt * * * *"),
	LABEL(AmbisonicsW, 134, "W", {0, 0, 0}, "* * * * *"),             LABEL(AmbisonicsX, 135, "X", {-2, 0, 0}, "* * * * *"),
	LABEL(AmbisonicsY, 136, "Y", {0, 2, 0}, "* * * * *"),             LABEL(AmbisonicsZ, 137, "Z", {0, 0, 2}, "* * * * *"),
	LABEL(BottomFrontLeft, 138, "Bfl", {-2, -2, 2}, "Bfr * * Vhl L"),
	LABEL(BottomFrontCenter, 139, "Bfc", {0, -2, 2}, "* * * Vhc C"),
	LABEL(BottomFrontRight, 140, "Bfr", {2, -2, 2}, "Bfl * * R R"),
	LABEL(ProximityLeft, 141, "Pl", {-1, 0, 0}, "Pr * * * *"),        LABEL(ProximityRight, 142, "Pr", {1, 0, 0}, "Pl * * * *"),
});
#undef LABEL
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
