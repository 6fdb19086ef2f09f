// Ratios and the sizes that they change, beside the exact fractions of libavutil and GStreamer.

#include "Comparison.h"

#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"

#include <array>
#include <vector>

#if ZON_HAS_GSTREAMER
	#include <gst/video/video.h>
#endif

extern "C"
{
#include <libavutil/mathematics.h>
#include <libavutil/rational.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace)

constexpr int kWidth = 720;
constexpr zoncore::RectT<int> kOriginal{0, 0, 1'440, 1'080};
constexpr zoncore::RectT<int> kDownsampled{0, 0, 960, 540};

// Those that are a shape: GStreamer refuses the others.
std::vector<PixelAspectRatio> Ratios()
{
	std::vector<PixelAspectRatio> ratios(AllPixelAspectRatios().begin(), AllPixelAspectRatios().end());
	std::erase_if(ratios, [](PixelAspectRatio inRatio) { return inRatio == kPixelAspectRatio_Any; });
	return ratios;
}

AVRational PeerRatio(PixelAspectRatio inRatio)
{
	return {static_cast<int>(inRatio.GetNumerator()), static_cast<int>(inRatio.GetDenominator())};
}

std::vector<AVRational> PeerRatios()
{
	std::vector<AVRational> ratios;
	for (const PixelAspectRatio ratio : Ratios())
		ratios.push_back(PeerRatio(ratio));
	return ratios;
}

template <class Ratio>
std::vector<std::array<Ratio, 2>> Pairs(const std::vector<Ratio>& inRatios)
{
	std::vector<std::array<Ratio, 2>> pairs;
	for (const Ratio first : inRatios)
		for (const Ratio second : inRatios)
			pairs.push_back({first, second});
	return pairs;
}

// The ratio that keeps the shape of the picture in fewer pixels.
AVRational SmallerFrame(AVRational inRatio)
{
	return av_mul_q(av_mul_q(inRatio, {kOriginal.right, kOriginal.bottom}), {kDownsampled.bottom, kDownsampled.right});
}

#if ZON_HAS_GSTREAMER

guint StreamerSmallerFrame(AVRational inRatio)
{
	guint numerator = 0;
	guint denominator = 0;
	gst_video_calculate_display_ratio(&numerator, &denominator, kOriginal.right, kOriginal.bottom,
		static_cast<guint>(inRatio.num), static_cast<guint>(inRatio.den), kDownsampled.right, kDownsampled.bottom);
	return numerator;
}

Work StreamerSmallerFrames()
{
	return ForEach(PeerRatios, StreamerSmallerFrame);
}

#else

Work StreamerSmallerFrames()
{
	return {};
}

#endif

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Video shapes";
	Compare(kArea, "whether two are equal (exactly there)",
		ForEach([] { return Pairs(Ratios()); }, [](const auto& inPair) { return inPair[0] == inPair[1]; }),
		{{"libavutil",
			ForEach([] { return Pairs(PeerRatios()); },
				[](const auto& inPair) { return av_cmp_q(inPair[0], inPair[1]) == 0; })}});
	Compare(kArea, "width in square pixels",
		ForEach(Ratios,
			[](PixelAspectRatio inRatio) {
				return AdjustPixelAspectDimensionToSquarePixelDimension({kWidth, 480}, inRatio);
			}),
		{{"libavutil",
			ForEach(PeerRatios, [](AVRational inRatio) { return av_rescale(kWidth, inRatio.num, inRatio.den); })}});
	Compare(kArea, "rectangle in square pixels",
		ForEach(Ratios,
			[](PixelAspectRatio inRatio) { return AdjustPixelAspectRectToSquarePixelRect(kOriginal, inRatio); }));
	Compare(kArea, "ratio of a smaller frame",
		ForEach(Ratios,
			[](PixelAspectRatio inRatio)
			{ return AdjustPixelAspectRatioForNonUniformDownsample(inRatio, kOriginal, kDownsampled); }),
		{{"libavutil", ForEach(PeerRatios, SmallerFrame)}, {"GStreamer", StreamerSmallerFrames()}});
	Compare(kArea, "ratio of an older project mended", ForEach(Ratios, CorrectLegacyPixelAspectRatio));
	Compare(kArea, "description", ForEach(Ratios, PixelAspectRatioDescription));
	Compare(kArea, "description of a frame's size",
		ForEach(Ratios, [](PixelAspectRatio inRatio) { return VideoFrameSizeDescription(kOriginal, inRatio); }));
	return true;
}();

}   // namespace
}   // namespace benchmarks
