#pragma once

/// \file
/// The catalogue of pixel formats: iteration, look-up by name, the way back from properties, and formats of the host's own.
///
///     for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
///         std::cout << PixelFormatCatalogueName(*format) << '\n';   // VUYA_4444_8u, VUYA_4444_8u_709, ...
///
///     RegisterCustomPixelFormatProperties(MakePixelFormatName('_', 'r', 'a', 'w'), properties);
///     LookupPropertiesForName(MakePixelFormatName('_', 'r', 'a', 'w'));   // properties

#include "zonmediatypes/Export.h"
#include "zonmediatypes/PixelFormat.h"

#include <string_view>

namespace zonmediatypes
{

/// The 74 built-in formats in the catalogue's order; never invalid, a wildcard or custom. The order is fixed.
ZONMEDIATYPES_API const PixelFormat* AllPixelFormatsBegin() noexcept;
ZONMEDIATYPES_API const PixelFormat* AllPixelFormatsEnd() noexcept;

/// The name of a built-in format's constant without its prefix, such as "BGRA_4444_8u"; empty for every other format.
ZONMEDIATYPES_API std::string_view PixelFormatCatalogueName(PixelFormat inFormat) noexcept;

/// Records the properties of a custom format, in place of earlier ones under that name. Nothing is validated: a name that
/// does not begin with "_" or "@" is recorded and never found again (deliberate). There is no removal.
ZONMEDIATYPES_API void RegisterCustomPixelFormatProperties(unsigned int inName, PixelFormatProperties inProperties);

/// The properties of a built-in or registered format: kPixelFormatProperties_Any for the wildcard's name,
/// kPixelFormatProperties_Invalid for "badf" and for names that are not known. A built-in name costs one multiplication
/// and two reads; a custom one takes the registry's lock, and time in proportion to the logarithm of the number of registered
/// formats.
ZONMEDIATYPES_API PixelFormatProperties LookupPropertiesForName(PixelFormatName inName);

/// The built-in name with exactly these properties, in all 32 bits: kPixelFormatFourCC_Any for kind "any", "badf" for
/// invalid properties, for unknown compression and for what no built-in format has. Custom names are never given.
ZONMEDIATYPES_API PixelFormatName GuessNameForProperties(PixelFormatProperties inProperties) noexcept;

}   // namespace zonmediatypes
