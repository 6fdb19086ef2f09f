#pragma once

#include "zonmediatypes/Export.h"

#include <cstdint>

namespace zonmediatypes
{

/// Initialize() calls minus Terminate() calls; for checks only.
ZONMEDIATYPES_API std::int32_t InitializationCount();

}   // namespace zonmediatypes
