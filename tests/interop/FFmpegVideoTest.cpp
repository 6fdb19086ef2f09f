#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

#include <gtest/gtest.h>

#if ZON_HAS_LIBAVFORMAT
	#include "zonmediatypes/interop/FFmpeg.h"

	#include <cstdlib>
	#include <filesystem>
	#include <fstream>
	#include <stdexcept>
	#include <string>

extern "C"
{
	#include <libavcodec/avcodec.h>
	#include <libavformat/avformat.h>
	#include <libavutil/pixdesc.h>
}

namespace zonmediatypes
{
namespace
{

// ---- Streams by their parameters -------------------------------------------------------------------------------------

struct StreamCase
{
	AVPixelFormat mFormat;
	AVColorSpace mSpace;
	const char* mName;   // as the catalogue has it, empty where nothing corresponds
	AVColorRange mRange = AVCOL_RANGE_UNSPECIFIED;
	AVFieldOrder mOrder = AV_FIELD_UNKNOWN;
	int mHeight = 576;
};

void ExpectFormats(AVCodecID inCodec, std::initializer_list<StreamCase> inCases)
{
	for (const auto& [format, space, name, range, order, height] : inCases)
	{
		AVCodecParameters* parameters = avcodec_parameters_alloc();
		parameters->codec_id = inCodec;
		parameters->format = format;
		parameters->width = 720;
		parameters->height = height;
		parameters->field_order = order;
		parameters->color_space = space;
		parameters->color_range = range;
		const PixelFormat found = ToPixelFormat(*parameters, {25, 1});
		avcodec_parameters_free(&parameters);
		EXPECT_EQ(PixelFormatCatalogueName(found), name) << av_get_pix_fmt_name(format) << ", " << height << " lines";
	}
}

TEST(FFmpegPixelFormat, OfRawVideoGoesByMatrixAndRange)
{
	constexpr auto kUYVY = AV_PIX_FMT_UYVY422, kYUYV = AV_PIX_FMT_YUYV422;
	ExpectFormats(AV_CODEC_ID_RAWVIDEO,
		{{kUYVY, AVCOL_SPC_SMPTE170M, "UYVY_422_8u", AVCOL_RANGE_MPEG}, {kUYVY, AVCOL_SPC_BT709, "UYVY_422_8u_709"},
			{kUYVY, AVCOL_SPC_BT709, "", AVCOL_RANGE_JPEG}, {kUYVY, AVCOL_SPC_BT2020_NCL, ""},
			{kYUYV, AVCOL_SPC_BT470BG, "YUYV_422_8u", {}, {}, 1080},
			{kYUYV, AVCOL_SPC_UNSPECIFIED, "YUYV_422_8u", {}, {}, 576},
			{kYUYV, AVCOL_SPC_UNSPECIFIED, "YUYV_422_8u_709", {}, {}, 577},
			{AV_PIX_FMT_BGRA, AVCOL_SPC_BT709, "BGRA_4444_8u"},   // RGB has no matrix
			{AV_PIX_FMT_BGRA, AVCOL_SPC_RGB, "", AVCOL_RANGE_MPEG}, {AV_PIX_FMT_RGBA, AVCOL_SPC_RGB, ""},
			{AV_PIX_FMT_YUV420P, AVCOL_SPC_BT709, ""}});   // planar, and not of MPEG
}

TEST(FFmpegPixelFormat, OfCodecsGoesByFieldsMatrixAndRange)
{
	constexpr auto k420 = AV_PIX_FMT_YUV420P;
	ExpectFormats(AV_CODEC_ID_V210, {{AV_PIX_FMT_YUV422P10, AVCOL_SPC_BT709, "V210_422_10u_709"}});
	ExpectFormats(AV_CODEC_ID_MPEG2VIDEO,
		{{k420, AVCOL_SPC_BT709, "YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709", AVCOL_RANGE_MPEG, AV_FIELD_TT},
			{k420, AVCOL_SPC_BT709, "YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange", AVCOL_RANGE_JPEG,
				AV_FIELD_PROGRESSIVE},
			{AV_PIX_FMT_YUV422P, AVCOL_SPC_BT709, ""}});
	ExpectFormats(AV_CODEC_ID_MPEG4,
		{{k420, AVCOL_SPC_SMPTE170M, "YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange", AVCOL_RANGE_JPEG,
			 AV_FIELD_BT},
			{k420, AVCOL_SPC_UNSPECIFIED, "YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601"}});
	ExpectFormats(AV_CODEC_ID_H264, {{k420, AVCOL_SPC_BT709, "", AVCOL_RANGE_MPEG, AV_FIELD_PROGRESSIVE}});
	ExpectFormats(AV_CODEC_ID_DVVIDEO, {{k420, AVCOL_SPC_UNSPECIFIED, "", {}, {}, 480}});
}

TEST(FFmpegVideo, FieldsAndShapesGoBothWays)
{
	const struct
	{
		AVFieldOrder mOrder;
		FieldType mInQuickTime, mElsewhere;
	} orders[] = {{AV_FIELD_UNKNOWN, kFieldType_Invalid, kFieldType_Invalid},
		{AV_FIELD_PROGRESSIVE, kFieldType_NoFields, kFieldType_NoFields},
		{AV_FIELD_TT, kFieldType_UpperFirst, kFieldType_UpperFirst},
		{AV_FIELD_BB, kFieldType_LowerFirst, kFieldType_LowerFirst},
		{AV_FIELD_TB, kFieldType_UpperFirst, kFieldType_LowerFirst},
		{AV_FIELD_BT, kFieldType_LowerFirst, kFieldType_UpperFirst}};
	for (const auto& [order, inQuickTime, elsewhere] : orders)
	{
		for (const char* const format : {"mov,mp4,m4a,3gp,3g2,mj2", "mov", "matroska,webm"})
			EXPECT_EQ(ToFieldType(order, format), inQuickTime) << order << " in " << format;
		for (const char* const format : {"mxf", "mpegts", "avi", "movie", ""})
			EXPECT_EQ(ToFieldType(order, format), elsewhere) << order << " in " << format;
	}
	for (const PixelAspectRatio ratio : AllPixelAspectRatios())
		EXPECT_EQ(ToPixelAspectRatio(ToSampleAspectRatio(ratio)), ratio) << ratio;
	for (const AVRational unknown : {AVRational{0, 1}, AVRational{1, 0}, AVRational{-4, 3}, AVRational{4, -3}})
		EXPECT_EQ(ToPixelAspectRatio(unknown), kPixelAspectRatio_Unknown);
	EXPECT_EQ(av_cmp_q(ToSampleAspectRatio({4'000'000'000, 3'000'000'000}), {4, 3}), 0);
}

// ---- Files -----------------------------------------------------------------------------------------------------------

struct VideoFile
{
	PixelFormat mFormat;
	PixelAspectRatio mShape;   // that the container states, or else the codec
	int mWidth, mHeight;
	std::int64_t mFirstFrameBytes;
};

VideoFile Probe(const std::string& inPath)
{
	AVFormatContext* file = nullptr;
	if (avformat_open_input(&file, inPath.c_str(), nullptr, nullptr) < 0
		|| avformat_find_stream_info(file, nullptr) < 0)
		throw std::runtime_error("cannot open " + inPath);
	const int index = av_find_best_stream(file, AVMEDIA_TYPE_VIDEO, -1, -1, nullptr, 0);
	AVStream* const stream = file->streams[index];
	AVPacket* packet = av_packet_alloc();
	while (av_read_frame(file, packet) >= 0 && packet->stream_index != index)
		av_packet_unref(packet);
	const AVCodecParameters& parameters = *stream->codecpar;
	const VideoFile result{ToPixelFormat(parameters, stream->avg_frame_rate),
		ToPixelAspectRatio(av_guess_sample_aspect_ratio(file, stream, nullptr)), parameters.width, parameters.height,
		packet->size};
	av_packet_free(&packet);
	avformat_close_input(&file);
	return result;
}

TEST(FFmpegFiles, AreWhatTheCatalogueSays)
{
	if (std::system("ffmpeg -version >/dev/null 2>&1") != 0)
		GTEST_SKIP() << "ffmpeg makes the files of this test, and it is not installed";
	const std::filesystem::path folder = std::filesystem::path(testing::TempDir()) / "zonmediatypes-video-files";
	ASSERT_EQ(std::system(("sh '" ZON_TEST_DATA "/make-video.sh' '" + folder.string() + "'").c_str()), 0);
	std::ifstream table(ZON_TEST_DATA "/video-files.tsv");
	std::string name, formatName, bytes, shape;
	std::getline(table, shape);   // headings
	while (table >> name >> formatName >> bytes >> std::ws && std::getline(table, shape))
	{
		SCOPED_TRACE(name);
		const VideoFile file = Probe((folder / name).string());
		EXPECT_EQ(PixelFormatCatalogueName(file.mFormat), formatName == "-" ? "" : formatName);
		EXPECT_EQ(zoncore::utility::UTF16to8(PixelAspectRatioDescription(file.mShape)), shape);
		// Compressed by more than DV the first packet is shorter; r210's encoder pads rows to 256 bytes, we to 64.
		EXPECT_EQ(PixelFormatSize(file.mFormat, file.mWidth, file.mHeight) == file.mFirstFrameBytes, bytes == "frame");
		int width = file.mWidth;
		int height = file.mHeight;
		FixedSizedFormatDimensions(file.mFormat, width, height);
		EXPECT_EQ(std::pair(width, height), std::pair(file.mWidth, file.mHeight));
	}
	EXPECT_EQ(name, "rgb24.mov") << "the last row";
	std::filesystem::remove_all(folder);
}

}   // namespace
}   // namespace zonmediatypes

#else

TEST(FFmpegVideo, IsComparedWhereItIsInstalled)
{
	GTEST_SKIP() << "libavformat is not installed";
}

#endif
