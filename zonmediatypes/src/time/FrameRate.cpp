#include "zonmediatypes/FrameRate.h"

#include "zoncore/StringUtils.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/src/time/RateText.h"

#include <array>
#include <cstddef>
#include <string>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16String;

constexpr auto sFrameRates = std::to_array<FrameRate>({
	kFrameRate_Video10,
	kFrameRate_Video12,
	kFrameRate_Video12_5,
	kFrameRate_Video15,
	kFrameRate_23976,
	kFrameRate_Film24,
	kFrameRate_VideoPAL,
	kFrameRate_VideoNTSC,
	kFrameRate_Video30,
	kFrameRate_Film48,
	kFrameRate_VideoPAL_HD,
	kFrameRate_VideoNTSC_HD,
	kFrameRate_Video60,
	kFrameRate_Video100,
	kFrameRate_Video1000,
	kFrameRate_Audio8000,
	kFrameRate_Audio11025,
	kFrameRate_Audio22050,
	kFrameRate_Audio32000,
	kFrameRate_Audio44100,
	kFrameRate_Audio48000,
	kFrameRate_Audio88200,
	kFrameRate_Audio96000,
	kFrameRate_Audio192000,
	kFrameRate_Zero,
});

// A duration of 0 is written as the rate "inf".
double WrittenFramesPerSecond(FrameRate inRate)
{
	if (inRate == kFrameRate_Zero)
		return 0.0;
	return static_cast<double>(kTicksPerSecond) / static_cast<double>(inRate.GetTicksPerFrame());
}

}   // namespace

// Two decimals tell all named rates apart but 23.976 and 24 fps, which people know by three.
UTF16String RateText(FrameRate inRate)
{
	constexpr std::size_t kMinIntegerDigits = 1;
	constexpr int kMaxLength = 31;
	return zoncore::utility::NumberToString(WrittenFramesPerSecond(inRate), kMinIntegerDigits,
		inRate == kFrameRate_23976 ? 3 : 2, zoncore::utility::kNumberFlag_DropTrailingZeros, kMaxLength);
}

std::span<const FrameRate> AllFrameRates() noexcept
{
	return sFrameRates;
}

std::basic_ostream<char>& operator<<(std::basic_ostream<char>& inStream, FrameRate inRate)
{
	return inStream << zoncore::utility::UTF16to8(RateText(inRate));
}

std::basic_ostream<unsigned short>& operator<<(std::basic_ostream<unsigned short>& inStream, FrameRate inRate)
{
	return inStream << RateText(inRate);
}

std::basic_ostream<unsigned char>& operator<<(std::basic_ostream<unsigned char>& inStream, FrameRate inRate)
{
	const std::string text = zoncore::utility::UTF16to8(RateText(inRate));
	return inStream << std::basic_string<unsigned char>(text.begin(), text.end());
}

}   // namespace zonmediatypes
