#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/src/text/TextKeys.h"
#include "zonmediatypes/src/text/VideoTextKeys.h"

#include <algorithm>
#include <array>
#include <boost/lexical_cast.hpp>
#include <string>

namespace zonmediatypes
{

using zoncore::UTF16String;
using zoncore::ZString;
using zoncore::config::Localizer;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::IntegerToString;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

namespace
{

void Append(UTF16String& ioText, std::string_view inASCII)
{
	ioText.append(inASCII.begin(), inASCII.end());
}

// The name's characters from the last to the first, up to a zero byte.
UTF16String ReversedNameText(PixelFormatName inName)
{
	std::array<char, 4> text{};
	for (unsigned i = 0; i < text.size(); ++i)
		text[i] = static_cast<char>(std::uint32_t{inName} >> (24 - 8 * i));
	return AsciiToUTF16({text.begin(), std::ranges::find(text, '\0')});
}

std::string_view DVText(unsigned inCompression)
{
	constexpr auto kTexts = std::to_array<std::string_view>({"", "NTSC DV", "PAL DV", "NTSC DV 100 (720p)",
		"PAL DV 100 (720p)", "NTSC DV 100 (1080i)", "PAL DV 100 (1080i)", "NTSC DV 50", "PAL DV 50"});
	static_assert(kTexts.size() == kPixelFormatCompression_PALDV50 + 1);
	return kTexts[inCompression];
}

UTF16String MPEGText(PixelFormatProperties inProperties)
{
	const auto compression = static_cast<PixelFormatCompression>(inProperties.Compression());
	UTF16String text = Describe<PixelFormatCompression>(kMPEGKeys, compression);
	Append(text, inProperties.Is709() ? " 709" : "");
	Append(text, inProperties.IsVideoRange() ? "" : " Full Range");
	return text;
}

void AppendComponents(UTF16String& ioText, PixelFormatProperties inProperties)
{
	constexpr auto kAlphaTexts = std::to_array<std::string_view>({"", "A", "P", "X", "", "", "", ""});
	const std::string_view alpha = kAlphaTexts[inProperties.Alpha()];
	if (inProperties.ReversedOrder())
	{
		Append(ioText, alpha);
		Append(ioText, inProperties.IsYUV() ? "YUV" : "RGB");
		return;
	}
	Append(ioText, inProperties.IsYUV() ? "VUY" : "BGR");
	Append(ioText, alpha);
}

UTF16String UncompressedText(PixelFormatProperties inProperties)
{
	constexpr auto kChromaTexts = std::to_array<std::string_view>({" 4444 ", " 422 ", "  ", "  "});
	constexpr auto kDepthTexts = std::to_array<std::string_view>({"8", "10", "15", "16", "24", "32", "", ""});
	UTF16String text;
	AppendComponents(text, inProperties);
	Append(text, kChromaTexts[inProperties.Subsampling()]);
	Append(text, kDepthTexts[inProperties.BitDepth()]);
	Append(text, inProperties.IsFloat() ? "f" : "u");
	if (inProperties.IsLinear())
	{
		Append(text, " ");
		text += Localizer::Get().Lookup(kLinearKey);
	}
	Append(text, inProperties.Is709() ? " 709" : "");
	return text;
}

UTF16String RatioText(PixelAspectRatio inRatio)
{
	return UTF8to16(boost::lexical_cast<std::string>(inRatio));
}

}   // namespace

UTF16String RenderQualityDescription(RenderQuality inQuality)
{
	return Describe<RenderQuality>(kRenderQualityKeys, inQuality);
}

UTF16String FieldTypeDescription(FieldType inType)
{
	return Describe<FieldType>(kFieldTypeKeys, inType);
}

UTF16String PixelFormatDescription(PixelFormat inFormat)
{
	const PixelFormatProperties properties = inFormat.mProperties;
	if (properties.Kind() == kPixelFormatKind_Any)
		return ZString(kAnyPixelFormatKey);
	if (IsCustomPixelFormatName(inFormat.mName))
		return ZString(kCustomPixelFormatKey, {ReversedNameText(inFormat.mName)});
	if (properties.Kind() == kPixelFormatKind_Invalid)
		return ZString(kUnknownPixelFormatKey);
	if (!properties.IsCompressed())
		return UncompressedText(properties);
	if (properties.IsDV())
		return AsciiToUTF16(DVText(properties.Compression()));
	if (properties.IsMPEG())
		return MPEGText(properties);
	if (properties.HasUnknownCompression())
		return ZString(kUnknownCompressedKey, {ReversedNameText(inFormat.mName)});
	return {};
}

// PixelFormat.h declares these two, and yet they stand here: what they write is a description, and video knows no text.

std::ostream& operator<<(std::ostream& ioStream, const PixelFormat& inFormat)
{
	return ioStream << UTF16to8(PixelFormatDescription(inFormat)).c_str();   // up to the first zero byte
}

zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& ioStream, const PixelFormat& inFormat)
{
	return ioStream << PixelFormatDescription(inFormat);
}

UTF16String PixelAspectRatioDescription(PixelAspectRatio inRatio)
{
	const auto row = std::ranges::find(kPixelAspectRatioKeys, inRatio, &KeyFor<PixelAspectRatio>::mValue);
	return ZString(row != kPixelAspectRatioKeys.end() ? row->mKey : kOtherRatioKey, {RatioText(inRatio)});
}

UTF16String VideoFrameSizeDescription(zoncore::RectT<int> inFrame, PixelAspectRatio inRatio)
{
	const UTF16String width = IntegerToString(inFrame.right);
	const UTF16String height = IntegerToString(inFrame.bottom);
	if (inRatio == kPixelAspectRatio_Unknown)
		return ZString(kFrameSizeKey, {width, height});
	return ZString(kFrameSizeWithRatioKey, {width, height, RatioText(inRatio)});
}

}   // namespace zonmediatypes
