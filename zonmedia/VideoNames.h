#pragma once

/// \file
/// Pixel formats, sizes and shapes as they are written on a command line.

#include "zoncore/Geometry.h"
#include "zonmedia/Names.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormat.h"
#include "zonmediatypes/PixelFormatSelection.h"

#include <span>
#include <string>
#include <string_view>

namespace zonmedia
{

/// The library's catalogue of formats.
std::span<const Named<zonmediatypes::PixelFormat>> PixelFormatNames();

/// Reads a name of the catalogue ("BGRA_4444_8u"), a code ("bgra") or "any". Throws UsageProblem with the closest names.
zonmediatypes::PixelFormat ReadPixelFormat(std::string_view inText);
/// Reads several, with commas between them.
zonmediatypes::PixelFormats ReadPixelFormats(std::string_view inText);
/// "BGRA_4444_8u", "any", or "none" for the invalid format.
std::string NameOf(zonmediatypes::PixelFormat inFormat);
/// The four characters of its code.
std::string CodeOf(zonmediatypes::PixelFormat inFormat);

/// Reads "draft", "low", "medium", "high" or "max". Throws UsageProblem.
zonmediatypes::RenderQuality ReadQuality(std::string_view inText);

/// Reads "1920x1080". Throws UsageProblem unless both are above 0 and small enough for the bytes of any frame to be counted.
zoncore::PointT<int> ReadSize(std::string_view inText);

/// Reads "10/11". Throws UsageProblem, also for a denominator of 0.
zonmediatypes::PixelAspectRatio ReadPixelAspectRatio(std::string_view inText);

}   // namespace zonmedia
