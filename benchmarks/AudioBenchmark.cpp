// Channel conversion and layout descriptions beside what libswresample, libavutil and GStreamer do for the
// same layouts.

#include "Comparison.h"

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <utility>
#include <vector>

#if ZON_HAS_GSTREAMER
	#include <gst/audio/audio.h>
#endif

extern "C"
{
#include <libavutil/channel_layout.h>
#include <libavutil/log.h>
#include <libswresample/swresample.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace)

using MakeLayout = AudioChannelLayout (*)();

AVChannelLayout PeerLayout(std::uint64_t inSpeakers)
{
	AVChannelLayout layout{};
	av_channel_layout_from_mask(&layout, inSpeakers);
	return layout;
}

// ---- Matrices --------------------------------------------------------------------------------------------------------

Work Matrix(MakeLayout inSource, MakeLayout inDestination)
{
	return Repeat(
		[source = inSource(), destination = inDestination(), matrix = ChannelConversionMatrix()]() mutable
		{
			ComputeChannelConversionMatrix(source, destination, matrix);
			return matrix.data();
		});
}

Work PeerMatrix(AVChannelLayout inSource, AVChannelLayout inDestination)
{
	av_log_set_level(AV_LOG_QUIET);   // a warning on every call is not what is measured
	return Repeat(
		[=, matrix = std::array<double, 64 * 64>()]() mutable
		{
			constexpr double kMinus3dB = 0.70710678118654752;
			swr_build_matrix2(&inSource, &inDestination, kMinus3dB, kMinus3dB, 0.0, 1.0, 1.0, matrix.data(), 64,
				AV_MATRIX_ENCODING_NONE, nullptr);
			return matrix[0];
		});
}

// ---- Orders ----------------------------------------------------------------------------------------------------------

Work Reordering(MakeLayout inSource, MakeLayout inDestination)
{
	return Repeat(
		[source = inSource(), destination = inDestination(), ordering = ChannelOrdering()]() mutable
		{
			RemapChannelOrdering(source, destination, ordering);
			return ordering.data();
		});
}

#if ZON_HAS_GSTREAMER

template <std::size_t inChannels>
using PeerPositions = std::array<GstAudioChannelPosition, inChannels>;

template <std::size_t inChannels>
Work PeerReordering(const PeerPositions<inChannels>& inSource, const PeerPositions<inChannels>& inDestination)
{
	return Repeat(
		[=, ordering = std::array<gint, inChannels>()]() mutable
		{
			gst_audio_get_channel_reorder_map(inChannels, inSource.data(), inDestination.data(), ordering.data());
			return ordering[0];
		});
}

constexpr PeerPositions<6> kPeerBroadcast51{GST_AUDIO_CHANNEL_POSITION_FRONT_LEFT,
	GST_AUDIO_CHANNEL_POSITION_FRONT_RIGHT, GST_AUDIO_CHANNEL_POSITION_FRONT_CENTER, GST_AUDIO_CHANNEL_POSITION_LFE1,
	GST_AUDIO_CHANNEL_POSITION_REAR_LEFT, GST_AUDIO_CHANNEL_POSITION_REAR_RIGHT};
constexpr PeerPositions<6> kPeerLegacy51{GST_AUDIO_CHANNEL_POSITION_FRONT_LEFT, GST_AUDIO_CHANNEL_POSITION_FRONT_RIGHT,
	GST_AUDIO_CHANNEL_POSITION_REAR_LEFT, GST_AUDIO_CHANNEL_POSITION_REAR_RIGHT,
	GST_AUDIO_CHANNEL_POSITION_FRONT_CENTER, GST_AUDIO_CHANNEL_POSITION_LFE1};

bool SamePeerChannels(const PeerPositions<6>& inFirst, const PeerPositions<6>& inSecond)
{
	guint64 first = 0;
	guint64 second = 0;
	return gst_audio_channel_positions_to_mask(inFirst.data(), 6, FALSE, &first) != FALSE
		&& gst_audio_channel_positions_to_mask(inSecond.data(), 6, FALSE, &second) != FALSE && first == second;
}

Work PeerReordering51()
{
	return PeerReordering(kPeerBroadcast51, kPeerLegacy51);
}

Work PeerSameChannels51()
{
	return Repeat([first = kPeerBroadcast51, second = kPeerLegacy51] { return SamePeerChannels(first, second); });
}

#else

Work PeerReordering51()
{
	return {};
}

Work PeerSameChannels51()
{
	return {};
}

#endif

// ---- Channel maps ----------------------------------------------------------------------------------------------------

ChannelMap MapOf(const AudioChannelLayout& inLayout)
{
	ChannelMap map(inLayout);
	for (std::int32_t i = 0; i < static_cast<std::int32_t>(inLayout.size()); ++i)
		map.SetChannel(i, i);
	return map;
}

Work ChannelOfLabel()
{
	return ForEach(CreateVST22_2ChannelLayout,
		[map = MapOf(CreateVST22_2ChannelLayout())](AudioChannelDescription inChannel)
		{ return map.GetSourceChannelIndexForChannelLabel(inChannel.mLabel); });
}

Work PeerChannelOfLabel()
{
	const AVChannelLayout layout = PeerLayout(AV_CH_LAYOUT_22POINT2);
	const auto channels = [layout]
	{
		std::vector<AVChannel> result;
		for (unsigned i = 0; i < 24; ++i)
			result.push_back(av_channel_layout_channel_from_index(&layout, i));
		return result;
	};
	return ForEach(
		channels, [layout](AVChannel inChannel) { return av_channel_layout_index_from_channel(&layout, inChannel); });
}

// ---- Formats ---------------------------------------------------------------------------------------------------------

constexpr auto kRates = std::to_array<int>({44'100, 48'000});
constexpr auto kChannelCounts = std::to_array<int>({1, 2, 6, 8});

std::vector<AudioFormat> Formats()
{
	std::vector<AudioFormat> formats;
	for (const int rate : kRates)
		for (const int channels : kChannelCounts)
			formats.push_back(AudioFormat::CreateAudioFormat(
				CreateMultichannelLayoutWithDefaultLabels(static_cast<unsigned>(channels)),
				static_cast<std::uint32_t>(rate)));
	return formats;
}

// All pairs, of a format with itself too.
template <class MakeFormats, class Call>
Work EveryPair(MakeFormats inMakeFormats, Call inCall)
{
	return [inMakeFormats, inCall](benchmark::State& ioState)
	{
		const auto formats = inMakeFormats();
		for (auto _ : ioState)
			for (const auto& first : formats)
				for (const auto& second : formats)
					benchmark::DoNotOptimize(inCall(first, second));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(formats.size() * formats.size()));
	};
}

#if ZON_HAS_GSTREAMER

std::vector<GstAudioInfo> PeerFormats()
{
	std::vector<GstAudioInfo> formats;
	for (const int rate : kRates)
		for (const int channels : kChannelCounts)
		{
			std::array<GstAudioChannelPosition, 8> positions{};
			gst_audio_channel_positions_from_mask(
				channels, gst_audio_channel_get_fallback_mask(channels), positions.data());
			gst_audio_info_set_format(&formats.emplace_back(), GST_AUDIO_FORMAT_F32, rate, channels, positions.data());
		}
	return formats;
}

Work PeerEqualFormats()
{
	return EveryPair(PeerFormats,
		[](const GstAudioInfo& inFirst, const GstAudioInfo& inSecond)
		{ return gst_audio_info_is_equal(&inFirst, &inSecond); });
}

#else

Work PeerEqualFormats()
{
	return {};
}

#endif

// ---- Descriptions ----------------------------------------------------------------------------------------------------

Work Description(MakeLayout inLayout)
{
	return Repeat([layout = inLayout()] { return AudioChannelLayoutDescription(layout); });
}

Work PeerDescription(AVChannelLayout inLayout)
{
	return Repeat(
		[inLayout, text = std::array<char, 256>()]() mutable
		{
			av_channel_layout_describe(&inLayout, text.data(), text.size());
			return text[0];
		});
}

// An order of the peer's own making, for which it has no name.
template <AVChannel... inChannels>
Work PeerDescriptionOf()
{
	static std::array<AVChannelCustom, sizeof...(inChannels)> sChannels{AVChannelCustom{inChannels, {}, nullptr}...};
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_CUSTOM;
	layout.nb_channels = sizeof...(inChannels);
	layout.u.map = sChannels.data();
	return PeerDescription(layout);
}

// ---- Growth ----------------------------------------------------------------------------------------------------------

// Labels in an order that is none of the catalogue's.
AudioChannelLayout LayoutOf(std::size_t inChannels)
{
	const std::span<const AudioChannelLabel> labels = AllAudioChannelLabels();
	AudioChannelLayout layout;
	for (std::size_t i = 0; i < inChannels; ++i)
		layout.emplace_back(labels[i * 7 % labels.size()]);
	return layout;
}

// Every number is a legal label: no search ends before its channel.
AudioChannelLayout DistinctLayoutOf(std::size_t inChannels)
{
	AudioChannelLayout layout;
	for (std::size_t i = 0; i < inChannels; ++i)
		layout.emplace_back(static_cast<AudioChannelLabel>(1'000 + i));
	return layout;
}

// What the calls take and write. It stays on the heap from before the first call: without it, glibc gives large results back
// to the system after each call, and most of the time are page faults in the next one.
struct Grown
{
	explicit Grown(AudioChannelLayout inLayout) : mLayout(std::move(inLayout)) {}

	AudioChannelLayout mLayout;
	AudioChannelLayout mReversed{mLayout.rbegin(), mLayout.rend()};
	AudioChannelLayout mUnlabelled = AudioChannelLayout(mLayout.size());
	AudioChannelLayout mStereo = CreateStereoChannelLayout();
	AudioChannelLabel mLastLabel = mLayout.back().mLabel;
	std::int32_t mLastChannel = static_cast<std::int32_t>(mLayout.size()) - 1;
	ChannelMap mMap = MapOf(mLayout);
	ChannelMap mOtherMap = MapOf(mLayout);

	AudioChannelLayout mResult;
	ChannelConversionMatrix mMatrix;
	ChannelOrdering mOrdering;
};

constexpr auto sChannelCounts = std::to_array<std::size_t>({1, 10, 100, 1'000, 10'000, 100'000});

// An item is a channel.
template <class Call>
void GrowLayout(const char* inWhat, AudioChannelLayout (*inMakeLayout)(std::size_t), Call inCall)
{
	Grow(inWhat, sChannelCounts,
		[inMakeLayout, inCall](std::size_t inChannels) -> Work
		{
			return [=](benchmark::State& ioState)
			{
				Grown grown(inMakeLayout(inChannels));
				for (auto _ : ioState)
					benchmark::DoNotOptimize(inCall(grown));
				ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inChannels));
			};
		});
}

void AddGrowth()
{
	GrowLayout("matrix of so many channels to stereo", LayoutOf,
		[](Grown& ioGrown)
		{
			ComputeChannelConversionMatrix(ioGrown.mLayout, ioGrown.mStereo, ioGrown.mMatrix);
			return ioGrown.mMatrix.data();
		});
	GrowLayout("description of so many channels without a translation", LayoutOf,
		[](Grown& ioGrown) { return AudioChannelLayoutDescriptionUnlocalized(ioGrown.mLayout); });
	GrowLayout("description of so many different channels", DistinctLayoutOf,
		[](Grown& ioGrown) { return AudioChannelLayoutDescription(ioGrown.mLayout); });
	GrowLayout("ordering of so many different channels reversed", DistinctLayoutOf,
		[](Grown& ioGrown) { return RemapChannelOrdering(ioGrown.mLayout, ioGrown.mReversed, ioGrown.mOrdering); });
	GrowLayout("so many different labels for unlabelled channels", DistinctLayoutOf,
		[](Grown& ioGrown) {
			return ReplaceDiscreteLabelsWithDestinationLayoutLabels(
				ioGrown.mUnlabelled, ioGrown.mLayout, ioGrown.mResult);
		});
	GrowLayout("whether so many different channels are the same in any order", DistinctLayoutOf,
		[](Grown& ioGrown) { return ContainsSameChannelsIgnoreOrder(ioGrown.mLayout, ioGrown.mReversed); });
	GrowLayout("channel map of so many different channels", DistinctLayoutOf,
		[](Grown& ioGrown) { return ChannelMap(ioGrown.mLayout); });
	GrowLayout("whether maps of so many different channels are equal", DistinctLayoutOf,
		[](Grown& ioGrown) { return ioGrown.mMap == ioGrown.mOtherMap; });
	GrowLayout("channel of the last label in a map of so many", DistinctLayoutOf,
		[](Grown& ioGrown) { return ioGrown.mMap.GetSourceChannelIndexForChannelLabel(ioGrown.mLastLabel); });
	GrowLayout("last label of a map of so many to the channel before and back", DistinctLayoutOf,
		[](Grown& ioGrown)
		{
			ioGrown.mMap.SetDeviceChannelIndexForChannelLabel(ioGrown.mLastLabel, ioGrown.mLastChannel - 1);
			ioGrown.mMap.SetDeviceChannelIndexForChannelLabel(ioGrown.mLastLabel, ioGrown.mLastChannel);
			return ioGrown.mMap.GetNumberOfChannels();
		});
}

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Audio";
	Compare(kArea, "matrix, 5.1 to stereo", Matrix(CreateBroadcast51ChannelLayout, CreateStereoChannelLayout),
		{{"libswresample", PeerMatrix(PeerLayout(AV_CH_LAYOUT_5POINT1_BACK), PeerLayout(AV_CH_LAYOUT_STEREO))}});
	Compare(kArea, "matrix, 7.1 to 5.1", Matrix(Create7_1ItuChannelLayout, CreateBroadcast51ChannelLayout),
		{{"libswresample", PeerMatrix(PeerLayout(AV_CH_LAYOUT_7POINT1), PeerLayout(AV_CH_LAYOUT_5POINT1))}});
	Compare(kArea, "matrix, 22.2 to 7.1 (9 of 24 channels there)",
		Matrix(CreateVST22_2ChannelLayout, Create7_1ItuChannelLayout),
		{{"libswresample", PeerMatrix(PeerLayout(AV_CH_LAYOUT_22POINT2), PeerLayout(AV_CH_LAYOUT_7POINT1))}});
	Compare(kArea, "identity matrix, 8 by 8",
		Repeat(
			[matrix = ChannelConversionMatrix()]() mutable
			{
				CreateIdentityChannelConversionMatrix(8, 8, matrix);
				return matrix.data();
			}));
	Compare(kArea, "reordering, 5.1 (from source to destination there)",
		Reordering(CreateBroadcast51ChannelLayout, CreateLegacy51ChannelLayout), {{"GStreamer", PeerReordering51()}});
	Compare(kArea, "whether channels are the same in any order, 5.1",
		Repeat([first = CreateBroadcast51ChannelLayout(), second = CreateLegacy51ChannelLayout()]
			{ return ContainsSameChannelsIgnoreOrder(first, second); }),
		{{"GStreamer", PeerSameChannels51()}});
	Compare(kArea, "channel of a label in a map, 22.2 (in a layout there)", ChannelOfLabel(),
		{{"libavutil", PeerChannelOfLabel()}});
	Compare(kArea, "default channel map, 5.1", Repeat([] { return ChannelMap::CreateDefaultChannelMap(6); }));
	Compare(kArea, "label of a map to another channel, 5.1",
		Repeat(
			[map = MapOf(CreateBroadcast51ChannelLayout()), channel = 0]() mutable
			{
				channel = (channel + 1) % 6;
				map.SetDeviceChannelIndexForChannelLabel(kAudioChannelLabel_LowFrequency, channel);
				return map.GetNumberOfChannels();
			}));
	Compare(
		kArea, "whether formats are equal", EveryPair(Formats, std::equal_to<>()), {{"GStreamer", PeerEqualFormats()}});
	Compare(kArea, "order of formats, exact", EveryPair(Formats, AudioFormatExactCompare()));
	Compare(kArea, "order of formats, simple", EveryPair(Formats, AudioFormatSimpleCompare()));
	Compare(kArea, "description, stereo", Description(CreateStereoChannelLayout),
		{{"libavutil", PeerDescription(PeerLayout(AV_CH_LAYOUT_STEREO))}});
	Compare(kArea, "description, 5.1 (a fixed name there)", Description(CreateBroadcast51ChannelLayout),
		{{"libavutil", PeerDescription(PeerLayout(AV_CH_LAYOUT_5POINT1_BACK))}});
	Compare(kArea, "description, 7.1 (a fixed name there)", Description(Create7_1ItuChannelLayout),
		{{"libavutil", PeerDescription(PeerLayout(AV_CH_LAYOUT_7POINT1))}});
	Compare(kArea, "description, 22.2 (a fixed name there)", Description(CreateVST22_2ChannelLayout),
		{{"libavutil", PeerDescription(PeerLayout(AV_CH_LAYOUT_22POINT2))}});
	Compare(kArea, "description, L R Ls Rs C LFE (no name there)", Description(CreateLegacy51ChannelLayout),
		{{"libavutil",
			PeerDescriptionOf<AV_CHAN_FRONT_LEFT, AV_CHAN_FRONT_RIGHT, AV_CHAN_BACK_LEFT, AV_CHAN_BACK_RIGHT,
				AV_CHAN_FRONT_CENTER, AV_CHAN_LOW_FREQUENCY>()}});
	Compare(kArea, "description, C L R (no name there)", Description(Create_C_L_R_ChannelLayout),
		{{"libavutil", PeerDescriptionOf<AV_CHAN_FRONT_CENTER, AV_CHAN_FRONT_LEFT, AV_CHAN_FRONT_RIGHT>()}});

	AddGrowth();
	return true;
}();

}   // namespace
}   // namespace benchmarks
