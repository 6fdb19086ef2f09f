#include "zonmediatypes/PixelAspectRatio.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"

#include <array>
#include <cstddef>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16String;

constexpr auto sPixelAspectRatios = std::to_array<PixelAspectRatio>({
	kPixelAspectRatio_Square,
	kPixelAspectRatio_DVCProHD,
	kPixelAspectRatio_Anamorphic,
	kPixelAspectRatio_Unknown,
	kPixelAspectRatio_Any,
	kPixelAspectRatio_DVNTSC,
	kPixelAspectRatio_DVNTSCWide,
	kPixelAspectRatio_DVPAL,
	kPixelAspectRatio_DVPALWide,
	kPixelAspectRatio_HDAnamorphic1080,
	kPixelAspectRatio_DVNTSC_Incorrect,
	kPixelAspectRatio_DVNTSCWide_Incorrect,
	kPixelAspectRatio_DVPAL_Incorrect,
	kPixelAspectRatio_DVPAL_TooPrecise,
	kPixelAspectRatio_DVPALWide_Incorrect,
});
static_assert(sPixelAspectRatios.size() == 15);

// Shapes that one decimal says in full.
constexpr bool IsHalfOrWhole(PixelAspectRatio inRatio)
{
	return inRatio == kPixelAspectRatio_Square || inRatio == kPixelAspectRatio_DVCProHD
		|| inRatio == kPixelAspectRatio_Anamorphic;
}

UTF16String RatioText(PixelAspectRatio inRatio)
{
	constexpr std::size_t kMinIntegerDigits = 1;
	constexpr unsigned short kNoFlags = 0;
	constexpr int kMaxLength = 31;
	return zoncore::utility::NumberToString(
		inRatio.ToDouble(), kMinIntegerDigits, IsHalfOrWhole(inRatio) ? 1 : 4, kNoFlags, kMaxLength);
}

}   // namespace

std::span<const PixelAspectRatio> AllPixelAspectRatios() noexcept
{
	return sPixelAspectRatios;
}

UTF16String PixelAspectRatio::GetDisplayString() const
{
	return RatioText(*this);
}

std::ostream& operator<<(std::ostream& ioStream, const PixelAspectRatio& inRatio)
{
	return ioStream << zoncore::utility::UTF16to8(RatioText(inRatio));
}

zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& ioStream, const PixelAspectRatio& inRatio)
{
	return ioStream << RatioText(inRatio);
}

}   // namespace zonmediatypes
