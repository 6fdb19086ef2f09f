// Look-up, conversion cost, selection and sizes of pixel formats beside libavutil's counterparts, each over the same number
// of formats: all of ours, and as many of libavutil's software formats.

#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatSize.h"
#include "zonmediatypes/PixelFormatUtils.h"

#include <benchmark/benchmark.h>

extern "C"
{
#include <libavutil/imgutils.h>
#include <libavutil/pixdesc.h>
}

#include <algorithm>
#include <cstddef>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr int kWidth = 1'920;
constexpr int kHeight = 1'080;

PixelFormats OurFormats()
{
	return {AllPixelFormatsBegin(), AllPixelFormatsEnd()};
}

std::vector<AVPixelFormat> PeerFormats()
{
	std::vector<AVPixelFormat> formats;
	for (const AVPixFmtDescriptor* descriptor = av_pix_fmt_desc_next(nullptr);
		 descriptor != nullptr && formats.size() < OurFormats().size(); descriptor = av_pix_fmt_desc_next(descriptor))
		if ((descriptor->flags & AV_PIX_FMT_FLAG_HWACCEL) == 0)
			formats.push_back(av_pix_fmt_desc_get_id(descriptor));
	return formats;
}

// inCount formats from the whole of a catalogue, at equal distances.
template <class Formats>
Formats Spread(const Formats& inAll, std::size_t inCount, std::size_t inFirst)
{
	Formats formats;
	for (std::size_t i = 0; i < inCount; ++i)
		formats.push_back(inAll[(inFirst + i * inAll.size() / inCount) % inAll.size()]);
	return formats;
}

// Shows the time of one item beside that of the loop over all.
void CountItems(benchmark::State& ioState, std::size_t inItems)
{
	ioState.counters["item"] = benchmark::Counter(
		static_cast<double>(inItems), benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

// ---- Look-up by code -------------------------------------------------------------------------------------------------

void Lookup(benchmark::State& ioState)
{
	const PixelFormats formats = OurFormats();
	for (auto _ : ioState)
		for (const PixelFormat format : formats)
			benchmark::DoNotOptimize(LookupPropertiesForName(format.mName));
	CountItems(ioState, formats.size());
}
BENCHMARK(Lookup);

void LibavutilLookup(benchmark::State& ioState)
{
	const std::vector<AVPixelFormat> formats = PeerFormats();
	for (auto _ : ioState)
		for (const AVPixelFormat format : formats)
			benchmark::DoNotOptimize(av_pix_fmt_desc_get(format));
	CountItems(ioState, formats.size());
}
BENCHMARK(LibavutilLookup);

// What an index replaces.
void LookupByScan(benchmark::State& ioState)
{
	const PixelFormats formats = OurFormats();
	for (auto _ : ioState)
		for (const PixelFormat format : formats)
			benchmark::DoNotOptimize(std::find_if(AllPixelFormatsBegin(), AllPixelFormatsEnd(),
				[=](PixelFormat inFormat) {
					return inFormat.mName == format.mName;
				})->mProperties);
	CountItems(ioState, formats.size());
}
BENCHMARK(LookupByScan);

// ---- Conversion cost -------------------------------------------------------------------------------------------------

void Cost(benchmark::State& ioState, RenderQuality inQuality)
{
	const PixelFormats formats = OurFormats();
	for (auto _ : ioState)
		for (const PixelFormat& from : formats)
			for (const PixelFormat& to : formats)
				benchmark::DoNotOptimize(PixelConversionCost(from.mProperties, to.mProperties, inQuality));
	CountItems(ioState, formats.size() * formats.size());
}
BENCHMARK_CAPTURE(Cost, Low, kRenderQuality_Low);
BENCHMARK_CAPTURE(Cost, High, kRenderQuality_High);

void LibavutilLoss(benchmark::State& ioState)
{
	const std::vector<AVPixelFormat> formats = PeerFormats();
	for (auto _ : ioState)
		for (const AVPixelFormat from : formats)
			for (const AVPixelFormat to : formats)
				benchmark::DoNotOptimize(av_get_pix_fmt_loss(to, from, 1));
	CountItems(ioState, formats.size() * formats.size());
}
BENCHMARK(LibavutilLoss);

// ---- Nearest of a list -----------------------------------------------------------------------------------------------

// One format against a list, for each of the catalogue.
void NearestSource(benchmark::State& ioState)
{
	const PixelFormats targets = OurFormats();
	const PixelFormats sources = Spread(targets, static_cast<std::size_t>(ioState.range(0)), 0);
	for (auto _ : ioState)
		for (const PixelFormat target : targets)
			benchmark::DoNotOptimize(SelectNearestSourcePixelFormat(sources, target.mProperties, kRenderQuality_High));
	CountItems(ioState, targets.size());
}
BENCHMARK(NearestSource)->Arg(8)->Arg(74);

AVPixelFormat PeerNearest(const std::vector<AVPixelFormat>& inChoices, AVPixelFormat inSource)
{
	AVPixelFormat best = AV_PIX_FMT_NONE;
	int loss = 0;
	for (const AVPixelFormat choice : inChoices)
		best = av_find_best_pix_fmt_of_2(best, choice, inSource, 1, &loss);
	return best;
}

void LibavutilNearest(benchmark::State& ioState)
{
	const std::vector<AVPixelFormat> sources = PeerFormats();
	const std::vector<AVPixelFormat> choices = Spread(sources, static_cast<std::size_t>(ioState.range(0)), 0);
	for (auto _ : ioState)
		for (const AVPixelFormat source : sources)
			benchmark::DoNotOptimize(PeerNearest(choices, source));
	CountItems(ioState, sources.size());
}
BENCHMARK(LibavutilNearest)->Arg(8)->Arg(74);

// Two lists without a common format: all pairs are compared. The peer takes one list for each format of the other.
void NearestBetweenLists(benchmark::State& ioState)
{
	const auto count = static_cast<std::size_t>(ioState.range(0));
	const PixelFormats sources = Spread(OurFormats(), count, 0);
	PixelFormats destinations = Spread(OurFormats(), count, 4);
	for (PixelFormat& format : destinations)
		format.mName = kPixelFormatFourCC_Any;
	for (auto _ : ioState)
		benchmark::DoNotOptimize(
			SelectNearestPixelFormat(sources, kPixelFormat_BGRA_4444_8u, destinations, kRenderQuality_High, false));
	CountItems(ioState, count * count);
}
BENCHMARK(NearestBetweenLists)->Arg(8)->Arg(74);

void LibavutilBetweenLists(benchmark::State& ioState)
{
	const auto count = static_cast<std::size_t>(ioState.range(0));
	const std::vector<AVPixelFormat> sources = Spread(PeerFormats(), count, 0);
	const std::vector<AVPixelFormat> choices = Spread(PeerFormats(), count, 4);
	for (auto _ : ioState)
		for (const AVPixelFormat source : sources)
			benchmark::DoNotOptimize(PeerNearest(choices, source));
	CountItems(ioState, count * count);
}
BENCHMARK(LibavutilBetweenLists)->Arg(8)->Arg(74);

// ---- Sizes -----------------------------------------------------------------------------------------------------------

void RowSize(benchmark::State& ioState)
{
	const PixelFormats formats = OurFormats();
	for (auto _ : ioState)
		for (const PixelFormat format : formats)
			benchmark::DoNotOptimize(UncompressedPixelFormatRowBytes(format, kWidth));
	CountItems(ioState, formats.size());
}
BENCHMARK(RowSize);

void LibavutilRowSize(benchmark::State& ioState)
{
	const std::vector<AVPixelFormat> formats = PeerFormats();
	for (auto _ : ioState)
		for (const AVPixelFormat format : formats)
			benchmark::DoNotOptimize(av_image_get_linesize(format, kWidth, 0));
	CountItems(ioState, formats.size());
}
BENCHMARK(LibavutilRowSize);

void FrameSize(benchmark::State& ioState)
{
	const PixelFormats formats = OurFormats();
	for (auto _ : ioState)
		for (const PixelFormat format : formats)
			benchmark::DoNotOptimize(PixelFormatSize(format, kWidth, kHeight));
	CountItems(ioState, formats.size());
}
BENCHMARK(FrameSize);

void LibavutilFrameSize(benchmark::State& ioState)
{
	const std::vector<AVPixelFormat> formats = PeerFormats();
	for (auto _ : ioState)
		for (const AVPixelFormat format : formats)
			benchmark::DoNotOptimize(av_image_get_buffer_size(format, kWidth, kHeight, 64));
	CountItems(ioState, formats.size());
}
BENCHMARK(LibavutilFrameSize);

}   // namespace
}   // namespace zonmediatypes
