#pragma once

/// \file
/// Display text for every value of the library.
///
/// Words come from the localiser (zoncore/Localizer.h) by key; numbers and abbreviations are filled in. A value that a
/// function does not know gives an empty text, and no key is looked up for it.

#include "zoncore/Geometry.h"
#include "zoncore/UTF16String.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Export.h"
#include "zonmediatypes/FieldType.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormat.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/TimeDisplayUtils.h"

#include <cstddef>
#include <span>
#include <string_view>

namespace zonmediatypes
{

// ---- Time ------------------------------------------------------------------------------------------------------------

/// The rate with its unit: "48000Hz" for a rate of 8,000 Hz and above, "29.97fps" for every slower one, "0fps" for
/// kFrameRate_Zero. A duration of 0 and below counts as an audio rate: "infHz", "-29.97Hz".
ZONMEDIATYPES_API zoncore::UTF16String FrameRateDescription(FrameRate inRate);

/// The same text into a caller's buffer, UTF-16 or UTF-8, without a terminator. Returns its length; a buffer that is too
/// short for it is left alone. No length is always enough, since the unit may be translated: compare the two.
ZONMEDIATYPES_API std::size_t FrameRateDescription(std::span<zoncore::UTF16Char> outText, FrameRate inRate);
ZONMEDIATYPES_API std::size_t FrameRateDescription(std::span<char> outText, FrameRate inRate);

/// The name of a display: "29.97 fps Drop-Frame Timecode"; empty for kTimeDisplay_Auto.
ZONMEDIATYPES_API zoncore::UTF16String TimeDisplayDescription(TimeDisplay inDisplay);

// ---- Audio -----------------------------------------------------------------------------------------------------------

/// The full name of a label ("Left Surround"), or the form with "&" before the accelerator of a menu ("L&eft Surround").
/// `Discrete` is "Mono".
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelLabelDescription(AudioChannelLabel inLabel, bool inWithMnemonic);

/// The short form of a label ("Ls"). `Discrete` is "*" in every language.
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelLabelAbbreviations(AudioChannelLabel inLabel);

/// The short form of a label in English, never translated.
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelLabelAbbreviationsUnlocalized(AudioChannelLabel inLabel);

/// One line for a layout:
///
/// | layout                                        | text                                  |
/// |-----------------------------------------------|---------------------------------------|
/// | empty, one channel, more, all `Discrete`      | "0 Channels", "Mono", "6 Channels"    |
/// | L R                                           | "Stereo"                              |
/// | the channels of 5.1 in any order              | "5.1 (L, R, Ls, Rs, C, LFE)"          |
/// | L R C LFE Ls Rs Lt Rt                         | "SMPTE DTV (L R C LFE Ls Rs Lt Rt)"   |
/// | up to eight others                            | "4 Channels (L R Ls Rs)"              |
/// | more than eight: the first seven              | "24 Channels (L R C LFE Ls Rs Lc...)" |
/// | a number that names no label shows as nothing | "1 Channel ()"                        |
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelLayoutDescription(const AudioChannelLayout& inLayout);

/// The untranslated abbreviations of all channels, each with a comma after it, also the last: "L,R,". For machines.
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelLayoutDescriptionUnlocalized(const AudioChannelLayout& inLayout);

/// One line for all streams of a clip: "(No Audio Streams)", for one its layout's description, "3 x Stereo" for equal ones,
/// "Stereo + Mono" for two that differ, "3 Audio Streams" for more. Channels in another order make another layout.
ZONMEDIATYPES_API zoncore::UTF16String AudioChannelConfigurationDescription(const AudioChannelLayouts& inStreams);

// ---- Video -----------------------------------------------------------------------------------------------------------

/// "Draft", "Low", "Medium", "High", "Max".
ZONMEDIATYPES_API zoncore::UTF16String RenderQualityDescription(RenderQuality inQuality);

/// "Upper Field First", "No Fields (Progressive Scan)".
ZONMEDIATYPES_API zoncore::UTF16String FieldTypeDescription(FieldType inType);

/// What the properties say; the name counts in custom formats and unknown compression only:
///
/// | format                                   | text                                                         |
/// |------------------------------------------|--------------------------------------------------------------|
/// | uncompressed                             | "BGRA 4444 8u", "VUYA 4444 32f 709", "ARGB 4444 32f Linear"  |
/// | UYVY, YUYV, r210                         | "VUY 422 8u", "YUV 422 8u", "BGR 4444 10u"                   |
/// | DV, in every language                    | "NTSC DV 50", "PAL DV 100 (1080i)"                           |
/// | MPEG                                     | "YUV 420 MPEG2 Frame 8u", "... 709", "... 709 Full Range"    |
/// | the wildcard; what is invalid            | "Any Pixel Format"; "Unknown Pixel Format"                   |
/// | custom "_abc", last character first      | "Custom Pixel Format (cba_)" (deliberate)                    |
/// | of unknown compression                   | "Unknown Compressed Pixel Format (avdx)"                     |
/// | with a compression that is not assigned  | ""                                                           |
ZONMEDIATYPES_API zoncore::UTF16String PixelFormatDescription(PixelFormat inFormat);

/// The name of the first well-known shape that is equal under the tolerant comparison, with the ratio as a number:
/// "D1/DV NTSC (0.9091)"; "Other Aspect Ratio (0.9000)" for every other one.
ZONMEDIATYPES_API zoncore::UTF16String PixelAspectRatioDescription(PixelAspectRatio inRatio);

/// "720w 480h (0.9091)", without the ratio when its numerator is 0. The width is `right` and the height `bottom`.
ZONMEDIATYPES_API zoncore::UTF16String VideoFrameSizeDescription(zoncore::RectT<int> inFrame, PixelAspectRatio inRatio);

// ---- Keys ------------------------------------------------------------------------------------------------------------

/// Every key that the library looks up, with its English text; for tools that make message catalogues.
ZONMEDIATYPES_API std::span<const std::string_view> AllTextKeys() noexcept;

}   // namespace zonmediatypes
