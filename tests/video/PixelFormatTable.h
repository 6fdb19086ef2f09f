#pragma once

#include "zonmediatypes/PixelFormatUtils.h"

#include <vector>

namespace zonmediatypes
{

/// The built-in formats with the invalid one and the wildcard.
inline std::vector<PixelFormat> EveryPixelFormat()
{
	std::vector<PixelFormat> formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	formats.push_back(kPixelFormat_Invalid);
	formats.push_back(kPixelFormat_Any);
	return formats;
}

/// inFormat with another code in one of its fields.
template <class Code>
PixelFormat With(PixelFormat inFormat, void (PixelFormatProperties::*inSet)(Code), unsigned inCode)
{
	(inFormat.mProperties.*inSet)(static_cast<Code>(inCode));
	return inFormat;
}

}   // namespace zonmediatypes
