// Pixel formats of any properties, rectangles and ratios of any integers.

#include "fuzz/Checks.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatSize.h"
#include "zonmediatypes/PixelFormatUtils.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <iterator>
#include <utility>

namespace
{

using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

PixelFormat TakeFormat(FuzzInput& ioInput)
{
	const std::size_t index = ioInput.Below(128);
	const auto count = static_cast<std::size_t>(AllPixelFormatsEnd() - AllPixelFormatsBegin());
	if (index < count)
		return AllPixelFormatsBegin()[index];
	return {static_cast<PixelFormatName>(ioInput.Any<std::uint32_t>()),
		PixelFormatProperties(ioInput.Any<std::uint32_t>())};
}

PixelFormats TakeFormats(FuzzInput& ioInput)
{
	PixelFormats formats(ioInput.Below(5));
	for (PixelFormat& format : formats)
		format = TakeFormat(ioInput);
	return formats;
}

RenderQuality TakeQuality(FuzzInput& ioInput)
{
	return static_cast<RenderQuality>(ioInput.Any<std::int8_t>() % 8);
}

void CheckProperties(FuzzInput& ioInput)
{
	PixelFormatProperties properties(ioInput.Any<std::uint32_t>());
	const PixelFormatProperties before = properties;
	const auto code = ioInput.Any<std::uint32_t>();
	properties.SetBitDepth(code);
	properties.SetAlpha(code);
	properties.SetSubsampling(code);
	properties.SetCompression(code);
	properties.SetKind(code);
	Require(properties.BitDepth() == code % 8 && properties.Alpha() == code % 8 && properties.Subsampling() == code % 4
			&& properties.Compression() == code % 16 && properties.Kind() == code % 4,
		"a field keeps what it has room for");
	properties.SetBitDepth(before.BitDepth());
	properties.SetAlpha(before.Alpha());
	properties.SetSubsampling(before.Subsampling());
	properties.SetCompression(before.Compression());
	properties.SetKind(before.Kind());
	Require(properties == before, "fields do not touch each other");

	const PixelFormatName name = GuessNameForProperties(before);
	const bool isNamed = name != kPixelFormatFourCC_Any && name != kPixelFormatFourCC_Invalid;
	Require(!isNamed || LookupPropertiesForName(name) == before, "a name that is guessed stands for the properties");
	const PixelFormat format = TakeFormat(ioInput);
	static_cast<void>(LookupPropertiesForName(format.mName));
	static_cast<void>(PixelFormatDescription(format));
	Require(PixelFormatCatalogueName(format).size() < 100, "catalogue names are short");
}

void CheckSelection(FuzzInput& ioInput)
{
	const RenderQuality quality = TakeQuality(ioInput);
	const PixelFormats sources = TakeFormats(ioInput), destinations = TakeFormats(ioInput);
	const PixelFormat request = TakeFormat(ioInput);
	const PixelFormatProperties from = request.mProperties, other = TakeFormat(ioInput).mProperties;
	for (const PixelFormatProperties to : {other, from})
	{
		const int cost = PixelConversionCost(from, to, quality);
		const bool isKnown = from.IsConcrete() && !from.HasUnknownCompression();
		if (isKnown && from == to)
			Require(cost == 0, "no conversion costs nothing");
		else if (isKnown && to.IsConcrete() && !to.IsCompressed())
			Require(cost > 0 && cost < kPixelConversionCost_Impossible, "a conversion costs something");
		else
			Require(cost == kPixelConversionCost_Impossible, "what is not known or is compressed is out of reach");
	}

	const PixelFormat nearest = SelectNearestSourcePixelFormat(sources, request.mProperties, quality);
	Require(
		nearest == kPixelFormat_Invalid || std::count(sources.begin(), sources.end(), nearest) > 0, "a source format");
	if (request.mProperties.Kind() != kPixelFormatKind_Any)
	{
		const auto rank = [&](const PixelFormat& inSource)
		{
			return std::pair(PixelConversionCost(inSource.mProperties, request.mProperties, quality),
				inSource.mProperties.BitDepth());
		};
		const auto best = std::ranges::min_element(sources, {}, rank);
		const bool isPossible = best != sources.end() && rank(*best).first < kPixelConversionCost_Impossible;
		Require(nearest == (isPossible ? *best : kPixelFormat_Invalid),
			"the first of the shallowest of the cheapest is the nearest");
	}
	const bool prefersRequest = ioInput.Flag();
	const PixelFormat selected = SelectNearestPixelFormat(sources, request, destinations, quality, prefersRequest);
	const bool isAccepted = std::count(destinations.begin(), destinations.end(), request) > 0;
	Require(!prefersRequest || !isAccepted || selected == request, "what is preferred and accepted is taken");
	Require(selected == kPixelFormat_Invalid || selected == request
			|| std::count(sources.begin(), sources.end(), selected) > 0
			|| std::count(destinations.begin(), destinations.end(), selected) > 0,
		"a format of somebody's");
	const PixelFormat working = Select4444PixelFormat(request, quality);
	Require(!working.mProperties.IsConcrete() || Select4444PixelFormat(working, quality) == working,
		"a working format is its own");
	const PixelFormat decompressed = SelectDVDecompressionFormat(request);
	Require(decompressed == request || (request.mProperties.IsDV() && !decompressed.mProperties.IsCompressed()),
		"only DV is decompressed");
}

// The bits of a pixel of an uncompressed format with rows; 0 for other formats.
std::int64_t BitsPerPixel(PixelFormatProperties inProperties)
{
	constexpr std::array<std::int64_t, 8> kBits{8, 10, 15, 16, 24, 32, 0, 0};
	const std::int64_t bits = kBits[inProperties.BitDepth()];
	if (inProperties.IsConcrete() && inProperties.Subsampling() == kPixelFormatSubsampling_422)
		return 2 * bits;
	const bool is444 = inProperties.IsConcrete() && inProperties.Subsampling() == kPixelFormatSubsampling_444;
	return is444 && !inProperties.IsCompressed() ? (inProperties.Is4444() ? 4 : 3) * bits : 0;
}

void CheckSizes(FuzzInput& ioInput)
{
	const PixelFormat format = TakeFormat(ioInput);
	const auto width = ioInput.Edge<std::int32_t>(), height = ioInput.Edge<std::int32_t>();
	const bool isOrdinary = width > 0 && width < 16'384 && height > 0 && height < 16'384;
	const std::int64_t size = PixelFormatSize(format, width, height);
	const std::int64_t row = UncompressedPixelFormatRowBytes(format, width);
	Require(!isOrdinary || (size >= 0 && row >= 0), "ordinary frames have a size");
	const PixelFormatProperties properties = format.mProperties;
	if (properties.IsConcrete() && !properties.IsCompressed())
		Require(size == row * height && row % 16 == 0, "a frame is its rows, which are padded");
	if (const std::int64_t bits = width * BitsPerPixel(properties); isOrdinary && bits > 0 && row > 0)
	{
		// Of 16 bits 15 are used at least; v210 stores groups of six pixels and pads by up to 127 bytes.
		Require(
			row * 8 >= bits && (row - 16 - 127) * 8 * 15 <= bits * 16, "a row has room for its pixels, and no more");
		Require(row <= UncompressedPixelFormatRowBytes(format, width + 1), "wider rows are no shorter");
	}
	int fixedWidth = -1, fixedHeight = -2;
	FixedSizedFormatDimensions(format, fixedWidth, fixedHeight);
	Require(format.mProperties.IsDV() ? fixedWidth > 0 && fixedHeight > 0 : fixedWidth == -1 && fixedHeight == -2,
		"only DV has a size of its own");
	const PixelAspectRatio ratio(ioInput.Edge<unsigned>(), ioInput.Edge<unsigned>());
	const bool isValid = IsRectValidForFormat(format, width, height, ratio);
	Require(properties.IsDV() ? !isValid || (width == fixedWidth && height == fixedHeight) : isValid,
		"only DV demands a size");
}

// Requires that a width is inWidth * inNumerator / inDenominator rounded, where that fits.
void RequireScaled(std::int64_t inResult, std::int64_t inWidth, std::int64_t inNumerator, std::int64_t inDenominator)
{
	if (inNumerator == 0 || inDenominator == 0)
		return Require(inResult == inWidth, "a ratio with a term of 0 changes nothing");
	if (inWidth <= 0 || inWidth * inNumerator / inDenominator >= INT32_MAX)
		return;
	const std::int64_t distance = std::abs(inResult * inDenominator - inWidth * inNumerator);
	Require(distance * 2 <= inDenominator + inDenominator / 1'024, "a width is scaled and rounded");
}

void CheckRatios(FuzzInput& ioInput)
{
	const PixelAspectRatio a(ioInput.Edge<unsigned>(), ioInput.Edge<unsigned>());
	const PixelAspectRatio b = ioInput.Flag() ? ioInput.OneOf(AllPixelAspectRatios())
											  : PixelAspectRatio(ioInput.Edge<unsigned>(), ioInput.Edge<unsigned>());
	Require(a == a && !(a < a), "a ratio equals itself");
	Require((a == b) == (b == a) && (a < b) == (b > a) && !(a < b && a >= b), "comparisons have two sides");
	const PixelAspectRatio corrected = CorrectLegacyPixelAspectRatio(a);
	Require(IsLegacyPixelAspectRatio(a) == (corrected != a), "only legacy ratios are corrected");
	Require(!PixelAspectRatioDescription(a).empty() && !a.GetDisplayString().empty(), "every ratio has a description");

	const zoncore::RectT<int> first{0, 0, ioInput.Edge<int>(), ioInput.Edge<int>()};
	const zoncore::RectT<int> second{ioInput.Edge<int>(), 0, ioInput.Edge<int>(), ioInput.Edge<int>()};
	static_cast<void>(AdjustPixelAspectRatioForNonUniformDownsample(a, first, second));
	if (second.right > 0 && second.bottom > 0)
	{
		const PixelAspectRatio kept = AdjustPixelAspectRatioForNonUniformDownsample(a, second, second);
		Require(kept.GetNumerator() == a.GetNumerator() && kept.GetDenominator() == a.GetDenominator(),
			"the same shape keeps the ratio");
	}
	const auto square = AdjustPixelAspectRectToSquarePixelRect(second, a);
	Require(
		square.left == second.left && square.top == second.top && square.bottom == second.bottom, "only widths change");
	const auto size = AdjustPixelAspectDimensionToSquarePixelDimension({second.right, second.bottom}, a);
	Require(size.x == square.right && size.y == square.bottom, "sizes change as rectangles do");
	const auto other = AdjustSquarePixelRectToPixelAspectRect(second, a);
	const auto otherSize = AdjustSquarePixelDimensionToPixelAspectDimension({second.right, second.bottom}, a);
	Require(otherSize.x == other.right && otherSize.y == second.bottom, "and back");
	RequireScaled(square.right, second.right, a.GetNumerator(), a.GetDenominator());
	RequireScaled(other.right, second.right, a.GetDenominator(), a.GetNumerator());
	Require(!VideoFrameSizeDescription(second, a).empty(), "every frame size has a description");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckProperties, CheckSelection, CheckSizes, CheckRatios}, inData, inSize);
}
