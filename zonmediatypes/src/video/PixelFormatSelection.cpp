#include "zonmediatypes/PixelFormatSelection.h"

#include "zonmediatypes/PixelFormatUtils.h"

#include <algorithm>

namespace zonmediatypes
{
namespace
{

constexpr int kImpossible = kPixelConversionCost_Impossible;

constexpr bool IsHighQuality(RenderQuality inQuality)
{
	return inQuality >= kRenderQuality_Medium;
}

// ---- Conversion cost -------------------------------------------------------------------------------------------------
//
// A sum of small answers, one for each way in which formats differ.

constexpr int ModelCost(PixelFormatProperties inFrom, PixelFormatProperties inTo, RenderQuality inQuality)
{
	if (inFrom.IsYUV() == inTo.IsYUV())
		return 0;
	if (inTo.BitDepth() == kPixelFormatBitDepth_32)
		return 1;
	if (!IsHighQuality(inQuality))
		return 2;
	return inTo.IsYUV() && inTo.BitDepth() >= inFrom.BitDepth() ? 2 : 100;
}

constexpr int MatrixCost(PixelFormatProperties inFrom, PixelFormatProperties inTo, RenderQuality inQuality)
{
	if (!inFrom.IsYUV() || !inTo.IsYUV() || inFrom.Is709() == inTo.Is709())
		return 0;
	return IsHighQuality(inQuality) && inTo.BitDepth() != kPixelFormatBitDepth_32 ? 10 : 1;
}

constexpr int RangeCost(PixelFormatProperties inFrom, PixelFormatProperties inTo)
{
	return inFrom.IsVideoRange() == inTo.IsVideoRange() ? 0 : 100;
}

// Depths are compared by their codes, which are no counts of bits.
constexpr int DepthCost(PixelFormatProperties inFrom, PixelFormatProperties inTo, RenderQuality inQuality)
{
	const int gain = static_cast<int>(inTo.BitDepth()) - static_cast<int>(inFrom.BitDepth());   // [-7, 7]
	if (gain >= 0)
		return gain;
	return IsHighQuality(inQuality) ? 10 * -gain : -gain;
}

constexpr int AlphaCost(PixelFormatProperties inFrom, PixelFormatProperties inTo)
{
	if (inFrom.Alpha() == inTo.Alpha())
		return 0;
	if (inFrom.HasAlpha() == inTo.HasAlpha())
		return 1;
	return inTo.HasAlpha() ? 5 : 25;
}

constexpr int LayoutCost(PixelFormatProperties inFrom, PixelFormatProperties inTo)
{
	const int order = inFrom.ReversedOrder() != inTo.ReversedOrder();
	const int light = inFrom.IsLinear() != inTo.IsLinear();
	const int type = inFrom.IsFloat() != inTo.IsFloat();
	return order + light + type;
}

int ChromaCost(PixelFormatProperties inFrom, PixelFormatProperties inTo)
{
	if (inFrom.Subsampling() == inTo.Subsampling())
		return 0;
	if (inFrom.IsDV() && inTo == SelectDVDecompressionFormat({kPixelFormatFourCC_Invalid, inFrom}).mProperties)
		return 0;
	if (inTo.Subsampling() != kPixelFormatSubsampling_444)
		return 50;
	return inFrom.IsDV() ? 5 : 0;
}

int ConversionCost(PixelFormatProperties inFrom, PixelFormatProperties inTo, RenderQuality inQuality)
{
	if (!inFrom.IsConcrete() || inFrom.HasUnknownCompression())
		return kImpossible;
	if (inFrom == inTo)
		return 0;
	if (!inTo.IsConcrete() || inTo.IsCompressed())   // unknown compression included
		return kImpossible;
	const int base = inFrom.IsCompressed() ? 2 : 1;
	return base + ModelCost(inFrom, inTo, inQuality) + MatrixCost(inFrom, inTo, inQuality) + RangeCost(inFrom, inTo)
		+ DepthCost(inFrom, inTo, inQuality) + AlphaCost(inFrom, inTo) + LayoutCost(inFrom, inTo)
		+ ChromaCost(inFrom, inTo);
}

// ---- Lists -----------------------------------------------------------------------------------------------------------

bool Contains(PixelFormatView inFormats, PixelFormat inFormat)
{
	return std::ranges::find(inFormats, inFormat) != inFormats.end();
}

bool IsCustom(PixelFormat inFormat)
{
	return IsCustomPixelFormatName(inFormat.mName);
}

bool Is4444(PixelFormat inFormat)
{
	return inFormat.mProperties.Is4444();
}

bool IsKnownAndConcrete(PixelFormat inFormat)
{
	return !IsCustom(inFormat) && inFormat.mProperties.IsConcrete();
}

template <class Predicate>
PixelFormat FirstThat(PixelFormatView inFormats, Predicate inPredicate)
{
	const auto found = std::ranges::find_if(inFormats, inPredicate);
	return found != inFormats.end() ? *found : kPixelFormat_Invalid;
}

PixelFormat FirstCommon(PixelFormatView inSourceFormats, PixelFormatView inDestinationFormats)
{
	return FirstThat(inDestinationFormats,
		[&](PixelFormat inFormat)
		{ return (IsCustom(inFormat) || inFormat.mProperties.IsConcrete()) && Contains(inSourceFormats, inFormat); });
}

// A format to work in: one with a fourth component, or any that is concrete.
PixelFormat FirstWorkable(PixelFormatView inFormats)
{
	const PixelFormat format = FirstThat(inFormats, Is4444);
	return format != kPixelFormat_Invalid ? format : FirstThat(inFormats, IsKnownAndConcrete);
}

// The cheapest conversion between two lists; of several the one whose format is nearest to the request.
class CheapestConversion
{
public:
	CheapestConversion(PixelFormat inRequestedFormat, RenderQuality inQuality)
		: mRequested(inRequestedFormat.mProperties), mQuality(inQuality)
	{
	}

	void Search(PixelFormatView inSourceFormats, PixelFormatView inDestinationFormats, bool inAcceptsAny)
	{
		for (const PixelFormat source : inSourceFormats)
			for (const PixelFormat destination : inDestinationFormats)
				Try(source, destination, inAcceptsAny);
	}

	/// kPixelFormat_Invalid when no conversion can be done.
	PixelFormat GetFormat() const { return mBest; }

private:
	void Try(PixelFormat inSource, PixelFormat inDestination, bool inAcceptsAny)
	{
		const int cost = ConversionCost(inSource.mProperties, inDestination.mProperties, mQuality);
		if (cost > mCost || cost == kImpossible)
			return;
		if (cost < mCost)
		{
			mBest = inAcceptsAny ? inSource : inDestination;
			mCost = cost;
			mCostFromRequest = CostFromRequest(mBest);
			return;
		}
		// A tie stands for the destination, also where anything is accepted.
		const int costFromRequest = CostFromRequest(inDestination);
		if (costFromRequest < mCostFromRequest)
		{
			mBest = inDestination;
			mCostFromRequest = costFromRequest;
		}
	}

	int CostFromRequest(PixelFormat inFormat) const
	{
		return ConversionCost(mRequested, inFormat.mProperties, mQuality);
	}

	const PixelFormatProperties mRequested;
	const RenderQuality mQuality;
	PixelFormat mBest = kPixelFormat_Invalid;
	int mCost = kImpossible;
	int mCostFromRequest = kImpossible;
};

// ---- Working formats -------------------------------------------------------------------------------------------------

PixelFormatProperties To4444(PixelFormatProperties inProperties, RenderQuality inQuality)
{
	PixelFormatProperties working = inProperties;
	working.SetSubsampling(kPixelFormatSubsampling_444);
	working.SetCompression(kPixelFormatCompression_None);
	if (working.Alpha() == kPixelFormatAlpha_None)
		working.SetAlpha(kPixelFormatAlpha_Ignored);
	const bool isFloat
		= (working.BitDepth() != kPixelFormatBitDepth_8 || working.IsFloat()) && IsHighQuality(inQuality);
	working.SetBitDepth(isFloat ? kPixelFormatBitDepth_32 : kPixelFormatBitDepth_8);
	working.SetIsFloat(isFloat);
	working.SetIsYUV(working.IsYUV() && working.IsVideoRange());
	if (working.IsYUV())
		working.SetReversedOrder(false);
	else
		working.SetIs709(false);
	return working;
}

}   // namespace

int PixelConversionCost(
	const PixelFormatProperties& inFrom, const PixelFormatProperties& inTo, RenderQuality inQuality) noexcept
{
	return ConversionCost(inFrom, inTo, inQuality);
}

PixelFormat SelectNearestPixelFormat(const PixelFormats& inSourceFormats, PixelFormat inRequestedFormat,
	const PixelFormats& inDestinationFormats, RenderQuality inQuality, bool inPreferRequested) noexcept
{
	return SelectNearestPixelFormat(PixelFormatView(inSourceFormats), inRequestedFormat,
		PixelFormatView(inDestinationFormats), inQuality, inPreferRequested);
}

PixelFormat SelectNearestPixelFormat(PixelFormatView inSourceFormats, PixelFormat inRequestedFormat,
	PixelFormatView inDestinationFormats, RenderQuality inQuality, bool inPreferRequested) noexcept
{
	if (inPreferRequested && Contains(inDestinationFormats, inRequestedFormat))
		return inRequestedFormat;
	const bool acceptsAny = Contains(inDestinationFormats, kPixelFormat_Any);
	if (inPreferRequested && acceptsAny && inRequestedFormat != kPixelFormat_Invalid)
		return inRequestedFormat;

	PixelFormat format = FirstCommon(inSourceFormats, inDestinationFormats);
	if (format != kPixelFormat_Invalid)
		return format;
	CheapestConversion conversion(inRequestedFormat, inQuality);
	conversion.Search(inSourceFormats, inDestinationFormats, acceptsAny);
	format = conversion.GetFormat();
	if (format == kPixelFormat_Invalid && (acceptsAny || inDestinationFormats.empty()))
		format = FirstWorkable(inSourceFormats);
	if (format == kPixelFormat_Invalid)
		format = FirstWorkable(inDestinationFormats);
	return format;
}

PixelFormat SelectNearestSourcePixelFormat(
	const PixelFormats& inSourceFormats, PixelFormatProperties inTarget, RenderQuality inQuality) noexcept
{
	return SelectNearestSourcePixelFormat(PixelFormatView(inSourceFormats), inTarget, inQuality);
}

PixelFormat SelectNearestSourcePixelFormat(
	PixelFormatView inSourceFormats, PixelFormatProperties inTarget, RenderQuality inQuality) noexcept
{
	if (inTarget.Kind() == kPixelFormatKind_Any)
		return FirstThat(inSourceFormats, IsKnownAndConcrete);
	PixelFormat best = kPixelFormat_Invalid;
	int bestCost = kImpossible;
	for (const PixelFormat source : inSourceFormats)
	{
		const int cost = ConversionCost(source.mProperties, inTarget, inQuality);
		const bool isShallower = source.mProperties.BitDepth() < best.mProperties.BitDepth();
		if (cost < bestCost || (cost == bestCost && cost < kImpossible && isShallower))
		{
			best = source;
			bestCost = cost;
		}
	}
	return best;
}

PixelFormat Select4444PixelFormat(PixelFormat inFormat, RenderQuality inQuality) noexcept
{
	if (Is4444(inFormat))
		return inFormat.mName == kPixelFormatFourCC_Invalid ? kPixelFormat_Invalid : inFormat;
	const PixelFormatProperties working = To4444(inFormat.mProperties, inQuality);
	const PixelFormatName name = GuessNameForProperties(working);
	if (name == kPixelFormatFourCC_Any)
		return kPixelFormat_Any;
	if (name == kPixelFormatFourCC_Invalid)
		return kPixelFormat_Invalid;
	return {name, working};
}

PixelFormat SelectDVDecompressionFormat(PixelFormat inFormat) noexcept
{
	switch (inFormat.mProperties.Compression())
	{
	case kPixelFormatCompression_NTSCDV25:
	case kPixelFormatCompression_PALDV25:
		return kPixelFormat_UYVY_422_8u;
	case kPixelFormatCompression_NTSCDV100_720p:
	case kPixelFormatCompression_PALDV100_720p:
	case kPixelFormatCompression_NTSCDV100_1080i:
	case kPixelFormatCompression_PALDV100_1080i:
		return kPixelFormat_YUYV_422_8u_709;
	case kPixelFormatCompression_NTSCDV50:
	case kPixelFormatCompression_PALDV50:
		return kPixelFormat_YUYV_422_8u;
	}
	return inFormat;
}

}   // namespace zonmediatypes
