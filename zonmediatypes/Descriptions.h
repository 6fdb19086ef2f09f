#pragma once

/// \file
/// Display text for every value of the library.
///
/// Words come from the localiser (zoncore/Localizer.h) by key; numbers and abbreviations are filled in. A value that a
/// function does not know gives an empty text, and no key is looked up for it. Each function returns a new text, takes no
/// lock of this library and may be called from any thread.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"

#include <span>
#include <string_view>

namespace zonmediatypes
{

// ---- Time ------------------------------------------------------------------------------------------------------------

// ---- Audio -----------------------------------------------------------------------------------------------------------

// ---- Video -----------------------------------------------------------------------------------------------------------

// ---- Keys ------------------------------------------------------------------------------------------------------------

/// Every key that the library looks up, with its English text; for tools that make message catalogues.
ZONMEDIATYPES_API std::span<const std::string_view> AllTextKeys() noexcept;

}   // namespace zonmediatypes
