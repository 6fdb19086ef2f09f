#pragma once

/// \file
/// The sheet of a media file: what the library makes of its times, its picture and its sound.

#include "zonmedia/MediaFile.h"
#include "zonmedia/Report.h"

#include <string>

namespace zonmedia
{

/// The same fields for every file with video, for every file with sound alone, and for every still picture; what is not known is null in JSON.
Record MakeSheet(const std::string& inPath, const MediaFile& inFile);

}   // namespace zonmedia
