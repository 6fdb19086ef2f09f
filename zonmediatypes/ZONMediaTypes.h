#pragma once

/// \file
/// The whole library in one header, and the entry points that a client calls around its use of it.
///
/// zoncore and zonmediatypes both have a namespace `utility`: with `using namespace` for both, write zoncore::utility and
/// zonmediatypes::utility in full.

#include "zoncore/SmallBlockAllocator.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FieldType.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"
#include "zonmediatypes/PixelFormat.h"
#include "zonmediatypes/PixelFormatProperties.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatSize.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/PulldownCadenceUtils.h"
#include "zonmediatypes/RatioTime.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeBase.h"
#include "zonmediatypes/TimeConversionUtils.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/Timecode.h"
#include "zonmediatypes/Version.h"

namespace zonmediatypes
{

/// Counts one more client. The count is kept for hosts that pair the calls; every function of the library works without
/// it. Safe on any thread.
ZONMEDIATYPES_API void Initialize();

/// Counts one client less. A call without its Initialize() is not detected: the count goes below zero.
ZONMEDIATYPES_API void Terminate();

}   // namespace zonmediatypes
