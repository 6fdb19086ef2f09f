#pragma once

/// \file
/// The order of the fields of interlaced video.

#include "zoncore/Requirements.h"

#include <cstdint>

namespace zonmediatypes
{

/// Which lines of a frame come first in time; the upper field has the topmost one.
enum FieldType : std::int32_t
{
	kFieldType_Invalid = -1,   ///< not known whether there are fields
	kFieldType_NoFields = 0,   ///< progressive: both fields are of one time
	kFieldType_UpperFirst = 1,
	kFieldType_LowerFirst = 2,
	kFieldType_UnknownDominance = 3,   ///< there are fields, and their order is not known
	kFieldType_Any = 4,                ///< the wildcard
};

}   // namespace zonmediatypes
