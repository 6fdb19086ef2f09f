// Channel conversion and layout descriptions beside what libswresample and libavutil do for the same layouts.

#include "zonmediatypes/AudioChannelLayout.h"

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

}   // namespace
}   // namespace zonmediatypes
