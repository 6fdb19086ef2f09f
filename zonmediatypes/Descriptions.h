#pragma once

/// \file
/// Display text for every value of the library.
///
/// Words come from the localiser (zoncore/Localizer.h) by key; numbers and abbreviations are filled in. A value that a
/// function does not know gives an empty text, and no key is looked up for it. Each function returns a new text, takes no
/// lock of this library and may be called from any thread.

#include "zoncore/UTF16String.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TimeDisplayUtils.h"

#include <span>
#include <string_view>

namespace zonmediatypes
{

// ---- Time ------------------------------------------------------------------------------------------------------------

/// The rate with its unit: "48000Hz" for a rate of 8,000 Hz and above, "29.97fps" for every slower one, "0fps" for
/// kFrameRate_Zero. A duration of 0 and below counts as an audio rate: "infHz", "-29.97Hz".
ZONMEDIATYPES_API zoncore::UTF16String FrameRateDescription(FrameRate inRate);

/// The name of a display: "29.97 fps Drop-Frame Timecode"; empty for kTimeDisplay_Auto.
ZONMEDIATYPES_API zoncore::UTF16String TimeDisplayDescription(TimeDisplay inDisplay);

// ---- Audio -----------------------------------------------------------------------------------------------------------

// ---- Video -----------------------------------------------------------------------------------------------------------

// ---- Keys ------------------------------------------------------------------------------------------------------------

/// Every key that the library looks up, with its English text; for tools that make message catalogues.
ZONMEDIATYPES_API std::span<const std::string_view> AllTextKeys() noexcept;

}   // namespace zonmediatypes
