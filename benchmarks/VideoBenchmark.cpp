// Look-up, conversion cost, selection and sizes of pixel formats beside libavutil's and GStreamer's counterparts, each over
// the same number of formats: all of ours, and as many of their software formats.

#include "Comparison.h"

#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatSize.h"
#include "zonmediatypes/PixelFormatUtils.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <ctime>
#include <functional>
#include <gst/video/video.h>
#include <map>
#include <string>
#include <vector>

extern "C"
{
#include <libavutil/imgutils.h>
#include <libavutil/pixdesc.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace)

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

// By number: the list of them would want the whole of GStreamer set up.
std::vector<GstVideoFormat> StreamerFormats()
{
	std::vector<GstVideoFormat> formats;
	for (std::size_t i = 0; i < OurFormats().size(); ++i)
		formats.push_back(static_cast<GstVideoFormat>(GST_VIDEO_FORMAT_I420 + i));
	return formats;
}

// The codes of the few formats that have one there, over and over.
std::vector<std::uint32_t> StreamerCodes()
{
	std::vector<std::uint32_t> codes;
	for (const GstVideoFormat format : StreamerFormats())
		if (const std::uint32_t code = gst_video_format_to_fourcc(format); code != 0)
			codes.push_back(code);
	for (std::size_t i = 0; codes.size() < OurFormats().size(); ++i)
		codes.push_back(codes[i]);
	return codes;
}

// All pairs of a catalogue.
template <class Formats>
auto Pairs(const Formats& inFormats)
{
	std::vector<std::array<typename Formats::value_type, 2>> pairs;
	for (const auto from : inFormats)
		for (const auto to : inFormats)
			pairs.push_back({from, to});
	return pairs;
}

// inCount formats from the whole of a catalogue, at equal distances.
template <class Formats>
Formats Spread(const Formats& inAll, std::size_t inCount, std::size_t inFirst = 0)
{
	Formats formats;
	for (std::size_t i = 0; i < inCount; ++i)
		formats.push_back(inAll[(inFirst + i * inAll.size() / inCount) % inAll.size()]);
	return formats;
}

Work Cost(RenderQuality inQuality)
{
	return ForEach([] { return Pairs(OurFormats()); },
		[inQuality](const auto& inPair)
		{ return PixelConversionCost(inPair[0].mProperties, inPair[1].mProperties, inQuality); });
}

Work PeerLoss()
{
	return ForEach([] { return Pairs(PeerFormats()); },
		[](const auto& inPair) { return av_get_pix_fmt_loss(inPair[1], inPair[0], 1); });
}

// ---- Nearest of a list -----------------------------------------------------------------------------------------------

Work Nearest(std::size_t inChoices)
{
	return ForEach(OurFormats,
		[sources = Spread(OurFormats(), inChoices)](PixelFormat inTarget)
		{ return SelectNearestSourcePixelFormat(sources, inTarget.mProperties, kRenderQuality_High); });
}

AVPixelFormat PeerBest(const std::vector<AVPixelFormat>& inChoices, AVPixelFormat inSource)
{
	AVPixelFormat best = AV_PIX_FMT_NONE;
	int loss = 0;
	for (const AVPixelFormat choice : inChoices)
		best = av_find_best_pix_fmt_of_2(best, choice, inSource, 1, &loss);
	return best;
}

Work PeerNearest(std::size_t inChoices)
{
	return ForEach(PeerFormats,
		[choices = Spread(PeerFormats(), inChoices)](AVPixelFormat inSource) { return PeerBest(choices, inSource); });
}

// Two lists without a common format: all pairs are compared. An item is a pair.
Work NearestBetweenLists(std::size_t inCount)
{
	return [inCount](benchmark::State& ioState)
	{
		const PixelFormats sources = Spread(OurFormats(), inCount);
		PixelFormats destinations = Spread(OurFormats(), inCount, 4);
		for (PixelFormat& format : destinations)
			format.mName = kPixelFormatFourCC_Any;
		for (auto _ : ioState)
			benchmark::DoNotOptimize(
				SelectNearestPixelFormat(sources, kPixelFormat_BGRA_4444_8u, destinations, kRenderQuality_High, false));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inCount * inCount));
	};
}

// The peer takes one list for each format of the other.
Work PeerBetweenLists(std::size_t inCount)
{
	return [inCount](benchmark::State& ioState)
	{
		const std::vector<AVPixelFormat> sources = Spread(PeerFormats(), inCount);
		const std::vector<AVPixelFormat> choices = Spread(PeerFormats(), inCount, 4);
		for (auto _ : ioState)
			for (const AVPixelFormat source : sources)
				benchmark::DoNotOptimize(PeerBest(choices, source));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inCount * inCount));
	};
}

// ---- Growth ----------------------------------------------------------------------------------------------------------

PixelFormatName CustomName(std::size_t inIndex)
{
	const auto letter = [&](std::size_t inPlace) { return static_cast<char>('a' + inIndex / inPlace % 26); };
	return MakePixelFormatName('@', letter(26 * 26), letter(26), letter(1));
}

constexpr auto sRegistrySizes = std::to_array<std::size_t>({1, 10, 100, 1'000, 10'000});

// Nanoseconds of one call among so many registered formats.
struct RegistryTimes
{
	double mLookup = 0;
	double mRegistration = 0;
};

void Register(PixelFormatName inName)
{
	RegisterCustomPixelFormatProperties(inName, kPixelFormat_BGRA_4444_8u.mProperties);
}

template <class Call>
double Nanoseconds(const std::vector<PixelFormatName>& inNames, Call inCall)
{
	constexpr int kRounds = 200;
	const std::clock_t start = std::clock();
	for (int round = 0; round < kRounds; ++round)
		for (const PixelFormatName name : inNames)
			inCall(name);
	const auto calls = static_cast<double>(kRounds * inNames.size());
	return 1e9 * static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC / calls;
}

// There is no removal, and repetitions come in any order: so the registry is measured once, while it grows.
std::map<std::size_t, RegistryTimes> MeasureRegistry()
{
	std::map<std::size_t, RegistryTimes> times;
	std::size_t registered = 0;
	for (const std::size_t size : sRegistrySizes)
	{
		do
			Register(CustomName(registered));
		while (++registered < size);
		std::vector<PixelFormatName> names;
		for (std::size_t i = 0; i < 1'024; ++i)
			names.push_back(CustomName(i * 61'803 % registered));
		times[size].mLookup = Nanoseconds(
			names, [](PixelFormatName inName) { benchmark::DoNotOptimize(LookupPropertiesForName(inName)); });
		times[size].mRegistration = Nanoseconds(names, Register);
	}
	return times;
}

std::function<Work(std::size_t)> Registry(double RegistryTimes::*inTime)
{
	return [inTime](std::size_t inSize)
	{
		return [inTime, inSize](benchmark::State& ioState)
		{
			static const std::map<std::size_t, RegistryTimes> sTimes = MeasureRegistry();
			for (auto _ : ioState)
				benchmark::ClobberMemory();
			ioState.counters["items_per_second"] = 1e9 / (sTimes.at(inSize).*inTime);
		};
	};
}

// One list without the target itself, which would end the search. An item is a format of the list.
Work NearestOfList(std::size_t inCount)
{
	return [inCount](benchmark::State& ioState)
	{
		PixelFormats sources = Spread(OurFormats(), inCount);
		const PixelFormat target = kPixelFormat_UYVY_422_8u;
		std::ranges::replace(sources, target, kPixelFormat_V210_422_10u);
		for (auto _ : ioState)
			benchmark::DoNotOptimize(SelectNearestSourcePixelFormat(sources, target.mProperties, kRenderQuality_High));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inCount));
	};
}

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Video";
	Compare(kArea, "look-up by code (by number at libavutil)",
		ForEach(OurFormats, [](PixelFormat inFormat) { return LookupPropertiesForName(inFormat.mName); }),
		{{"libavutil", ForEach(PeerFormats, [](AVPixelFormat inFormat) { return av_pix_fmt_desc_get(inFormat); })},
			{"GStreamer",
				ForEach(StreamerCodes,
					[](std::uint32_t inCode)
					{ return gst_video_format_get_info(gst_video_format_from_fourcc(inCode)); })}});
	Compare(kArea, "cost of a conversion, high quality", Cost(kRenderQuality_High), {{"libavutil", PeerLoss()}});
	Compare(kArea, "cost of a conversion, low quality", Cost(kRenderQuality_Low), {{"libavutil", PeerLoss()}});
	for (const std::size_t count : {8U, 74U})
	{
		const std::string number = std::to_string(count);
		Compare(kArea, "nearest of " + number, Nearest(count), {{"libavutil", PeerNearest(count)}});
		Compare(kArea, "nearest between two lists of " + number + ", a pair", NearestBetweenLists(count),
			{{"libavutil", PeerBetweenLists(count)}});
	}
	Compare(kArea, "row size",
		ForEach(OurFormats, [](PixelFormat inFormat) { return UncompressedPixelFormatRowBytes(inFormat, kWidth); }),
		{{"libavutil",
			ForEach(PeerFormats, [](AVPixelFormat inFormat) { return av_image_get_linesize(inFormat, kWidth, 0); })}});
	Compare(kArea, "frame size (with strides and offsets at GStreamer)",
		ForEach(OurFormats, [](PixelFormat inFormat) { return PixelFormatSize(inFormat, kWidth, kHeight); }),
		{{"libavutil",
			 ForEach(PeerFormats,
				 [](AVPixelFormat inFormat) { return av_image_get_buffer_size(inFormat, kWidth, kHeight, 64); })},
			{"GStreamer",
				ForEach(StreamerFormats,
					[info = GstVideoInfo()](GstVideoFormat inFormat) mutable
					{
						gst_video_info_set_format(&info, inFormat, kWidth, kHeight);
						return info.size;
					})}});

	Compare(kArea, "description", ForEach(OurFormats, PixelFormatDescription));

	constexpr auto kListSizes = std::to_array<std::size_t>({1, 10, 100, 1'000});
	Grow("nearest between two lists of so many formats, a pair", kListSizes, NearestBetweenLists);
	constexpr auto kLongListSizes = std::to_array<std::size_t>({1, 10, 100, 1'000, 10'000, 100'000});
	Grow("nearest source of so many formats, a format", kLongListSizes, NearestOfList);
	Grow("look-up of a custom format among so many (a look-up)", sRegistrySizes, Registry(&RegistryTimes::mLookup));
	Grow("registration of a custom format again among so many (a registration)", sRegistrySizes,
		Registry(&RegistryTimes::mRegistration));
	return true;
}();

}   // namespace
}   // namespace benchmarks
