#include "zonmediatypes/FrameRate.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/src/time/RateText.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16String;

using detail::kNamedRates;
using detail::NamedRate;

constexpr auto sFrameRates = []
{
	std::array<FrameRate, kNamedRates.size() + 1> rates{};   // kFrameRate_Zero is the last one
	std::ranges::transform(kNamedRates, rates.begin(),
		[](const NamedRate& inRow) { return FrameRate(kTicksPerSecond * inRow.mSeconds / inRow.mFrames); });
	return rates;
}();

unsigned long Decimals(FrameRate inRate)
{
	constexpr unsigned kUsual = NamedRate{}.mDecimals;
	const auto row = static_cast<std::size_t>(std::ranges::find(sFrameRates, inRate) - sFrameRates.begin());
	return row < kNamedRates.size() ? kNamedRates[row].mDecimals : kUsual;
}

// A duration of 0 is written as the rate "inf".
double WrittenFramesPerSecond(FrameRate inRate)
{
	if (inRate == kFrameRate_Zero)
		return 0.0;
	return static_cast<double>(kTicksPerSecond) / static_cast<double>(inRate.GetTicksPerFrame());
}

}   // namespace

UTF16String RateText(FrameRate inRate)
{
	constexpr std::size_t kMinIntegerDigits = 1;
	constexpr int kMaxLength = 31;
	return zoncore::utility::NumberToString(WrittenFramesPerSecond(inRate), kMinIntegerDigits, Decimals(inRate),
		zoncore::utility::kNumberFlag_DropTrailingZeros, kMaxLength);
}

std::span<const FrameRate> AllFrameRates() noexcept
{
	return sFrameRates;
}

std::basic_ostream<char>& operator<<(std::basic_ostream<char>& inStream, FrameRate inRate)
{
	return inStream << zoncore::utility::UTF16to8(RateText(inRate));
}

zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& inStream, FrameRate inRate)
{
	return inStream << RateText(inRate);
}

#if ZONCORE_HAS_BYTE_STREAMS
std::basic_ostream<unsigned char>& operator<<(std::basic_ostream<unsigned char>& inStream, FrameRate inRate)
{
	const std::string text = zoncore::utility::UTF16to8(RateText(inRate));
	return inStream << std::basic_string<unsigned char>(text.begin(), text.end());
}
#endif

}   // namespace zonmediatypes
