// What conversions cost among some formats that differ in one point each, at high quality.

#include "Pictures.h"
#include "Svg.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatUtils.h"

#include <string>

namespace pictures
{
namespace
{

using namespace zonmediatypes;

constexpr int kNameWidth = 160;
constexpr int kCellWidth = 84;
constexpr int kCellHeight = 34;
constexpr int kTop = 96;

// By how much a viewer notices.
std::string_view Look(int inCost)
{
	if (inCost == kPixelConversionCost_Impossible)
		return "none";
	return inCost < 10 ? "kept" : inCost < 100 ? "marked" : "ghost";
}

std::string Name(PixelFormat inFormat)
{
	return std::string(PixelFormatCatalogueName(inFormat));
}

void DrawRow(const Picture& inPicture, int inTop, PixelFormat inFrom, const PixelFormats& inTo)
{
	inPicture.Text("label right", kNameWidth - 10, inTop + 22, Name(inFrom));
	int left = kNameWidth;
	for (const PixelFormat to : inTo)
	{
		const int cost = PixelConversionCost(inFrom.mProperties, to.mProperties, kRenderQuality_High);
		inPicture.Box(Look(cost), left + 1, inTop + 1, kCellWidth - 2, kCellHeight - 2);
		inPicture.Text("", left + kCellWidth / 2, inTop + 22,
			cost == kPixelConversionCost_Impossible ? "-" : std::to_string(cost));
		left += kCellWidth;
	}
}

// Names of columns stand on two lines, broken before the chroma.
void DrawColumnName(const Picture& inPicture, int inMiddle, PixelFormat inFormat)
{
	const std::string name = Name(inFormat);
	const std::size_t chroma = name.find('_');
	inPicture.Text("label", inMiddle, kTop - 26, name.substr(0, chroma));
	if (chroma != std::string::npos)
		inPicture.Text("label", inMiddle, kTop - 10, name.substr(chroma + 1));
}

}   // namespace

void DrawConversionCosts()
{
	const PixelFormats formats{kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRX_4444_8u, kPixelFormat_BGRA_4444_32f,
		kPixelFormat_VUYA_4444_8u, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_UYVY_422_8u, kPixelFormat_V210_422_10u,
		kPixelFormat_NTSCDV25};
	const int count = static_cast<int>(formats.size());
	const Picture picture(kNameWidth + count * kCellWidth + 20, kTop + count * kCellHeight + 44,
		"The cost of conversions between pixel formats");
	picture.Text("title", 20, 30, "Cost of a conversion at high quality, from the row's format to the column's");
	int left = kNameWidth + kCellWidth / 2;
	int top = kTop;
	for (const PixelFormat format : formats)
	{
		DrawColumnName(picture, left, format);
		DrawRow(picture, top, format, formats);
		left += kCellWidth;
		top += kCellHeight;
	}
	picture.Text("note left", kNameWidth + 2, top + 26,
		"green: below 10; yellow: below 100; red: 100 and more, which shows; grey: cannot be done");
}

}   // namespace pictures
