// Channel conversion and layout descriptions beside what libswresample and libavutil do for the same layouts.

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Descriptions.h"

#include <benchmark/benchmark.h>

extern "C"
{
#include <libavutil/channel_layout.h>
#include <libavutil/log.h>
#include <libswresample/swresample.h>
}

#include <array>

namespace zonmediatypes
{
namespace
{

void Matrix(benchmark::State& ioState, AudioChannelLayout (*inSource)(), AudioChannelLayout (*inDestination)())
{
	const AudioChannelLayout source = inSource();
	const AudioChannelLayout destination = inDestination();
	ChannelConversionMatrix matrix;
	for (auto _ : ioState)
	{
		ComputeChannelConversionMatrix(source, destination, matrix);
		benchmark::DoNotOptimize(matrix.data());
	}
}

void SwresampleMatrix(benchmark::State& ioState, AVChannelLayout inSource, AVChannelLayout inDestination)
{
	av_log_set_level(AV_LOG_QUIET);   // a warning on every call is not what is measured
	std::array<double, 64 * 64> matrix{};
	for (auto _ : ioState)
	{
		constexpr double kMinus3dB = 0.70710678118654752;
		swr_build_matrix2(&inSource, &inDestination, kMinus3dB, kMinus3dB, 0.0, 1.0, 1.0, matrix.data(), 64,
			AV_MATRIX_ENCODING_NONE, nullptr);
		benchmark::DoNotOptimize(matrix.data());
	}
}

BENCHMARK_CAPTURE(Matrix, 5.1_to_stereo, CreateBroadcast51ChannelLayout, CreateStereoChannelLayout);
BENCHMARK_CAPTURE(SwresampleMatrix, 5.1_to_stereo, AV_CHANNEL_LAYOUT_5POINT1_BACK, AV_CHANNEL_LAYOUT_STEREO);
BENCHMARK_CAPTURE(Matrix, 7.1_to_5.1, Create7_1ItuChannelLayout, CreateBroadcast51ChannelLayout);
BENCHMARK_CAPTURE(SwresampleMatrix, 7.1_to_5.1, AV_CHANNEL_LAYOUT_7POINT1, AV_CHANNEL_LAYOUT_5POINT1);
BENCHMARK_CAPTURE(Matrix, 22.2_to_7.1, CreateVST22_2ChannelLayout, Create7_1ItuChannelLayout);
BENCHMARK_CAPTURE(SwresampleMatrix, 22.2_to_7.1, AV_CHANNEL_LAYOUT_22POINT2, AV_CHANNEL_LAYOUT_7POINT1);

// The peer has nothing to do this with.
void IdentityMatrix(benchmark::State& ioState)
{
	ChannelConversionMatrix matrix;
	for (auto _ : ioState)
	{
		CreateIdentityChannelConversionMatrix(8, 8, matrix);
		benchmark::DoNotOptimize(matrix.data());
	}
}
BENCHMARK(IdentityMatrix)->Name("IdentityMatrix/7.1");

void Remap(benchmark::State& ioState)
{
	const AudioChannelLayout source = CreateBroadcast51ChannelLayout();
	const AudioChannelLayout destination = CreateLegacy51ChannelLayout();
	ChannelOrdering ordering;
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(RemapChannelOrdering(source, destination, ordering));
		benchmark::DoNotOptimize(ordering.data());
	}
}
BENCHMARK(Remap)->Name("Remap/5.1");

// ---- Descriptions ----------------------------------------------------------------------------------------------------

void Description(benchmark::State& ioState, AudioChannelLayout (*inLayout)())
{
	const AudioChannelLayout layout = inLayout();
	for (auto _ : ioState)
		benchmark::DoNotOptimize(AudioChannelLayoutDescription(layout));
}

void AvutilDescription(benchmark::State& ioState, AVChannelLayout inLayout)
{
	std::array<char, 256> text{};
	for (auto _ : ioState)
	{
		av_channel_layout_describe(&inLayout, text.data(), text.size());
		benchmark::DoNotOptimize(text.data());
	}
}

// An order of the peer's own making, for which it has no name.
template <AVChannel... inChannels>
void AvutilDescriptionOf(benchmark::State& ioState)
{
	std::array<AVChannelCustom, sizeof...(inChannels)> channels{AVChannelCustom{inChannels, {}, nullptr}...};
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_CUSTOM;
	layout.nb_channels = sizeof...(inChannels);
	layout.u.map = channels.data();
	AvutilDescription(ioState, layout);
}

BENCHMARK_CAPTURE(Description, stereo, CreateStereoChannelLayout);
BENCHMARK_CAPTURE(AvutilDescription, stereo, AV_CHANNEL_LAYOUT_STEREO);
BENCHMARK_CAPTURE(Description, 5.1, CreateBroadcast51ChannelLayout);
BENCHMARK_CAPTURE(AvutilDescription, 5.1, AV_CHANNEL_LAYOUT_5POINT1_BACK);
BENCHMARK_CAPTURE(Description, 7.1, Create7_1ItuChannelLayout);
BENCHMARK_CAPTURE(AvutilDescription, 7.1, AV_CHANNEL_LAYOUT_7POINT1);
BENCHMARK_CAPTURE(Description, 22.2, CreateVST22_2ChannelLayout);
BENCHMARK_CAPTURE(AvutilDescription, 22.2, AV_CHANNEL_LAYOUT_22POINT2);

BENCHMARK_CAPTURE(Description, L_R_Ls_Rs_C_LFE, CreateLegacy51ChannelLayout);
BENCHMARK(AvutilDescriptionOf<AV_CHAN_FRONT_LEFT, AV_CHAN_FRONT_RIGHT, AV_CHAN_BACK_LEFT, AV_CHAN_BACK_RIGHT,
			  AV_CHAN_FRONT_CENTER, AV_CHAN_LOW_FREQUENCY>)
	->Name("AvutilDescription/L_R_Ls_Rs_C_LFE");
BENCHMARK_CAPTURE(Description, C_L_R, Create_C_L_R_ChannelLayout);
BENCHMARK(AvutilDescriptionOf<AV_CHAN_FRONT_CENTER, AV_CHAN_FRONT_LEFT, AV_CHAN_FRONT_RIGHT>)
	->Name("AvutilDescription/C_L_R");

}   // namespace
}   // namespace zonmediatypes
