// Channel conversion and layout descriptions beside what libswresample, libavutil and GStreamer do for the
// same layouts.

#include "Comparison.h"

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Descriptions.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <gst/audio/audio.h>
#include <vector>

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

template <class Call>
Work PerChannel(std::size_t inChannels, Call inCall)
{
	return [inChannels, inCall](benchmark::State& ioState)
	{
		const AudioChannelLayout layout = LayoutOf(inChannels);
		Call call = inCall;
		for (auto _ : ioState)
			benchmark::DoNotOptimize(call(layout));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inChannels));
	};
}

constexpr auto sChannelCounts = std::to_array<std::size_t>({1, 10, 100, 1'000, 10'000, 100'000});

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
		Reordering(CreateBroadcast51ChannelLayout, CreateLegacy51ChannelLayout),
		{{"GStreamer", PeerReordering(kPeerBroadcast51, kPeerLegacy51)}});
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

	Grow("matrix of so many channels to stereo", sChannelCounts,
		[](std::size_t inChannels)
		{
			return PerChannel(inChannels,
				[destination = CreateStereoChannelLayout(), matrix = ChannelConversionMatrix()](
					const AudioChannelLayout& inLayout) mutable
				{
					ComputeChannelConversionMatrix(inLayout, destination, matrix);
					return matrix.data();
				});
		});
	Grow("ordering of so many channels reversed", sChannelCounts,
		[](std::size_t inChannels)
		{
			return PerChannel(inChannels,
				[ordering = ChannelOrdering()](const AudioChannelLayout& inLayout) mutable
				{
					RemapChannelOrdering(inLayout, AudioChannelLayout(inLayout.rbegin(), inLayout.rend()), ordering);
					return ordering.data();
				});
		});
	Grow("description of so many channels without a translation", sChannelCounts,
		[](std::size_t inChannels)
		{
			return PerChannel(inChannels,
				[](const AudioChannelLayout& inLayout) { return AudioChannelLayoutDescriptionUnlocalized(inLayout); });
		});
	return true;
}();

}   // namespace
}   // namespace benchmarks
