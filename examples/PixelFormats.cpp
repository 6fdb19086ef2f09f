// The format in which frames travel from a decoder to a display, and why.

#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatSize.h"

#include <iostream>

using namespace zonmediatypes;

int main()
{
	const PixelFormats decoder{kPixelFormat_NTSCDV25, kPixelFormat_YUYV_422_8u};
	const PixelFormats display{kPixelFormat_BGRX_4444_8u, kPixelFormat_UYVY_422_8u, kPixelFormat_VUYX_4444_8u};
	for (const PixelFormat from : decoder)
	{
		for (const PixelFormat to : display)
			std::cout << from << " to " << to << " costs "
					  << PixelConversionCost(from.mProperties, to.mProperties, kRenderQuality_High) << '\n';
	}
	const PixelFormat nearest
		= SelectNearestPixelFormat(decoder, kPixelFormat_Any, display, kRenderQuality_High, false);
	std::cout << "frames travel as " << nearest << ", " << PixelFormatSize(nearest, 720, 480) << " bytes each\n";
	std::cout << "effects work in " << Select4444PixelFormat(nearest, kRenderQuality_High) << '\n';
}
