#include "zonmedia/VideoNames.h"

#include "zonmediatypes/PixelFormatUtils.h"

#include <array>
#include <charconv>
#include <optional>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language

namespace
{

constexpr std::string_view kAny = "any";

const std::array<Named<RenderQuality>, 5> sQualities{{
	{"draft", kRenderQuality_Draft},
	{"low", kRenderQuality_Low},
	{"medium", kRenderQuality_Medium},
	{"high", kRenderQuality_High},
	{"max", kRenderQuality_Max},
}};

std::vector<Named<PixelFormat>> MakePixelFormatNames()
{
	std::vector<Named<PixelFormat>> names;
	for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
		names.push_back({std::string(PixelFormatCatalogueName(*format)), *format});
	return names;
}

// Two numbers with inMark between them.
template <class Number>
std::optional<std::pair<Number, Number>> ReadPair(std::string_view inText, char inMark)
{
	std::pair<Number, Number> numbers{};
	const char* const end = inText.data() + inText.size();
	const auto [mark, error] = std::from_chars(inText.data(), end, numbers.first);
	if (error != std::errc() || mark == end || *mark != inMark)
		return std::nullopt;
	const auto second = std::from_chars(mark + 1, end, numbers.second);
	return second.ec == std::errc() && second.ptr == end ? std::optional(numbers) : std::nullopt;
}

}   // namespace

std::span<const Named<PixelFormat>> PixelFormatNames()
{
	static const std::vector<Named<PixelFormat>> sNames = MakePixelFormatNames();
	return sNames;
}

PixelFormat ReadPixelFormat(std::string_view inText)
{
	if (IsSameName(inText, kAny))
		return kPixelFormat_Any;
	const auto hasCode = [inText](const Named<PixelFormat>& inNamed) { return CodeOf(inNamed.mValue) == inText; };
	const auto named = std::ranges::find_if(PixelFormatNames(), hasCode);
	return named != PixelFormatNames().end() ? named->mValue
											 : ValueNamed<PixelFormat>(PixelFormatNames(), "pixel format", inText,
												 "; \"zonmedia video formats\" lists them");
}

PixelFormats ReadPixelFormats(std::string_view inText)
{
	PixelFormats formats;
	for (const std::string_view name : ItemsOf(inText, ','))
		formats.push_back(ReadPixelFormat(name));
	return formats;
}

std::string NameOf(PixelFormat inFormat)
{
	if (inFormat == kPixelFormat_Any)
		return std::string(kAny);
	return inFormat == kPixelFormat_Invalid ? "none" : std::string(PixelFormatCatalogueName(inFormat));
}

std::string CodeOf(PixelFormat inFormat)
{
	std::string code;
	for (std::uint32_t rest = inFormat.mName; rest != 0; rest >>= 8)
		code.push_back(static_cast<char>(rest & 0xFF));
	return code;
}

RenderQuality ReadQuality(std::string_view inText)
{
	return ValueNamed<RenderQuality>(sQualities, "quality", inText);
}

zoncore::PointT<int> ReadSize(std::string_view inText)
{
	constexpr int kMost = 100'000'000;   // at up to 16 bytes a pixel the bytes of a row are counted in 32 bits
	const auto isIn = [](int inPixels) { return inPixels >= 1 && inPixels <= kMost; };
	const auto size = ReadPair<int>(inText, 'x');
	if (!size || !isIn(size->first) || !isIn(size->second))
		throw UsageProblem(Quoted(inText) + " is no frame size; expected width and height in pixels, 1 to "
			+ std::to_string(kMost) + " each, such as 1920x1080");
	return {size->first, size->second};
}

PixelAspectRatio ReadPixelAspectRatio(std::string_view inText)
{
	const auto ratio = ReadPair<unsigned>(inText, '/');
	if (!ratio || ratio->second == 0)
		throw UsageProblem(
			Quoted(inText) + " is no pixel aspect ratio; expected a fraction such as 10/11 with a denominator above 0");
	return {ratio->first, ratio->second};
}

}   // namespace zonmedia
