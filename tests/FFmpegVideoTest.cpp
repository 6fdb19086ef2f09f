#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

#include <gtest/gtest.h>

#if ZON_HAS_LIBAVFORMAT
	#include "zonmediatypes/interop/FFmpeg.h"

	#include <cstdlib>
	#include <filesystem>
	#include <memory>
	#include <string>
	#include <vector>

extern "C"
{
	#include <libavcodec/avcodec.h>
	#include <libavformat/avformat.h>
	#include <libavutil/imgutils.h>
}

namespace zonmediatypes
{
namespace
{

// ---- Streams by their parameters -------------------------------------------------------------------------------------

struct Stream
{
	AVCodecID mCodec = AV_CODEC_ID_RAWVIDEO;
	AVPixelFormat mFormat = AV_PIX_FMT_NONE;
	int mWidth = 720, mHeight = 576;
	AVFieldOrder mOrder = AV_FIELD_UNKNOWN;
	AVColorSpace mSpace = AVCOL_SPC_UNSPECIFIED;
	AVColorRange mRange = AVCOL_RANGE_UNSPECIFIED;
	AVRational mRate = {25, 1};
};

std::string FormatOf(const Stream& inStream)
{
	AVCodecParameters* parameters = avcodec_parameters_alloc();
	parameters->codec_id = inStream.mCodec;
	parameters->format = inStream.mFormat;
	parameters->width = inStream.mWidth;
	parameters->height = inStream.mHeight;
	parameters->field_order = inStream.mOrder;
	parameters->color_space = inStream.mSpace;
	parameters->color_range = inStream.mRange;
	const PixelFormat format = ToPixelFormat(*parameters, inStream.mRate);
	avcodec_parameters_free(&parameters);
	return std::string(PixelFormatCatalogueName(format));
}

TEST(FFmpegPixelFormat, PackedFormatsGoByMatrixAndRange)
{
	const auto packed = [](AVPixelFormat inFormat, AVColorSpace inSpace, AVColorRange inRange, int inHeight = 576)
	{ return FormatOf({.mFormat = inFormat, .mHeight = inHeight, .mSpace = inSpace, .mRange = inRange}); };
	constexpr auto kNoRange = AVCOL_RANGE_UNSPECIFIED;
	EXPECT_EQ(packed(AV_PIX_FMT_UYVY422, AVCOL_SPC_SMPTE170M, AVCOL_RANGE_MPEG), "UYVY_422_8u");
	EXPECT_EQ(packed(AV_PIX_FMT_UYVY422, AVCOL_SPC_BT709, kNoRange), "UYVY_422_8u_709");
	EXPECT_EQ(packed(AV_PIX_FMT_UYVY422, AVCOL_SPC_BT709, AVCOL_RANGE_JPEG), "");
	EXPECT_EQ(packed(AV_PIX_FMT_UYVY422, AVCOL_SPC_BT2020_NCL, kNoRange), "");
	EXPECT_EQ(packed(AV_PIX_FMT_YUYV422, AVCOL_SPC_BT470BG, kNoRange, 1080), "YUYV_422_8u");
	EXPECT_EQ(packed(AV_PIX_FMT_YUYV422, AVCOL_SPC_UNSPECIFIED, kNoRange, 576), "YUYV_422_8u");
	EXPECT_EQ(packed(AV_PIX_FMT_YUYV422, AVCOL_SPC_UNSPECIFIED, kNoRange, 577), "YUYV_422_8u_709");
	EXPECT_EQ(packed(AV_PIX_FMT_BGRA, AVCOL_SPC_BT709, kNoRange), "BGRA_4444_8u") << "RGB has no matrix";
	EXPECT_EQ(packed(AV_PIX_FMT_BGRA, AVCOL_SPC_RGB, AVCOL_RANGE_MPEG), "");
	EXPECT_EQ(packed(AV_PIX_FMT_RGBA, AVCOL_SPC_RGB, kNoRange), "");
	EXPECT_EQ(packed(AV_PIX_FMT_YUV420P, AVCOL_SPC_BT709, kNoRange), "") << "planar, and not of MPEG";
	EXPECT_EQ(FormatOf({.mCodec = AV_CODEC_ID_V210, .mFormat = AV_PIX_FMT_YUV422P10, .mSpace = AVCOL_SPC_BT709}),
		"V210_422_10u_709");
}

TEST(FFmpegPixelFormat, MPEGGoesByFieldsMatrixAndRange)
{
	const auto mpeg = [](AVCodecID inCodec, AVFieldOrder inOrder, AVColorSpace inSpace, AVColorRange inRange) {
		return FormatOf({inCodec, AV_PIX_FMT_YUV420P, 720, 480, inOrder, inSpace, inRange});
	};
	const std::string kMPEG2 = "YUV_420_MPEG2_";
	const std::string kMPEG4 = "YUV_420_MPEG4_";
	for (const AVFieldOrder order : {AV_FIELD_TT, AV_FIELD_BB, AV_FIELD_TB, AV_FIELD_BT})
	{
		EXPECT_EQ(mpeg(AV_CODEC_ID_MPEG2VIDEO, order, AVCOL_SPC_BT709, AVCOL_RANGE_MPEG),
			kMPEG2 + "FIELD_PICTURE_PLANAR_8u_709");
		EXPECT_EQ(mpeg(AV_CODEC_ID_MPEG4, order, AVCOL_SPC_SMPTE170M, AVCOL_RANGE_JPEG),
			kMPEG4 + "FIELD_PICTURE_PLANAR_8u_601_FullRange");
	}
	for (const AVFieldOrder order : {AV_FIELD_PROGRESSIVE, AV_FIELD_UNKNOWN})
	{
		EXPECT_EQ(mpeg(AV_CODEC_ID_MPEG2VIDEO, order, AVCOL_SPC_BT709, AVCOL_RANGE_JPEG),
			kMPEG2 + "FRAME_PICTURE_PLANAR_8u_709_FullRange");
		EXPECT_EQ(mpeg(AV_CODEC_ID_MPEG4, order, AVCOL_SPC_UNSPECIFIED, AVCOL_RANGE_UNSPECIFIED),
			kMPEG4 + "FRAME_PICTURE_PLANAR_8u_601");
	}
	EXPECT_EQ(mpeg(AV_CODEC_ID_H264, AV_FIELD_PROGRESSIVE, AVCOL_SPC_BT709, AVCOL_RANGE_MPEG), "");
	EXPECT_EQ(FormatOf({.mCodec = AV_CODEC_ID_MPEG2VIDEO, .mFormat = AV_PIX_FMT_YUV422P}), "");
	EXPECT_EQ(FormatOf({.mCodec = AV_CODEC_ID_DVVIDEO, .mFormat = AV_PIX_FMT_YUV420P, .mHeight = 480}), "");
}

TEST(FFmpegVideo, FieldsAndShapesGoBothWays)
{
	EXPECT_EQ(ToFieldType(AV_FIELD_UNKNOWN), kFieldType_Invalid);
	EXPECT_EQ(ToFieldType(AV_FIELD_PROGRESSIVE), kFieldType_NoFields);
	EXPECT_EQ(ToFieldType(AV_FIELD_TT), kFieldType_UpperFirst);
	EXPECT_EQ(ToFieldType(AV_FIELD_BT), kFieldType_UpperFirst);
	EXPECT_EQ(ToFieldType(AV_FIELD_BB), kFieldType_LowerFirst);
	EXPECT_EQ(ToFieldType(AV_FIELD_TB), kFieldType_LowerFirst);

	for (const PixelAspectRatio ratio : AllPixelAspectRatios())
		EXPECT_EQ(ToPixelAspectRatio(ToSampleAspectRatio(ratio)), ratio) << ratio;
	for (const AVRational unknown : {AVRational{0, 1}, AVRational{1, 0}, AVRational{-4, 3}, AVRational{4, -3}})
		EXPECT_EQ(ToPixelAspectRatio(unknown), kPixelAspectRatio_Unknown);
	const AVRational large = ToSampleAspectRatio({4'000'000'000, 3'000'000'000});
	EXPECT_EQ(av_cmp_q(large, {4, 3}), 0);
}

// ---- Rows ------------------------------------------------------------------------------------------------------------

TEST(FFmpegRows, AreAsLongAsOursUpToThePadding)
{
	const struct
	{
		AVPixelFormat mPeer;
		PixelFormat mOurs;
		int mPadding;
	} formats[] = {
		{AV_PIX_FMT_UYVY422, kPixelFormat_UYVY_422_8u, 16},
		{AV_PIX_FMT_YUYV422, kPixelFormat_YUYV_422_8u, 16},
		{AV_PIX_FMT_BGRA, kPixelFormat_BGRA_4444_8u, 64},
		{AV_PIX_FMT_ARGB, kPixelFormat_ARGB_4444_8u, 64},
	};
	for (const auto& format : formats)
		for (int width = 1; width <= 8'200; ++width)
			ASSERT_EQ(UncompressedPixelFormatRowBytes(format.mOurs, width),
				FFALIGN(av_image_get_linesize(format.mPeer, width, 0), format.mPadding))
				<< format.mOurs << " " << width;
}

// The bytes of a frame that the v210 encoder writes.
int EncodedV210Bytes(int inWidth, int inHeight)
{
	const auto free = [](AVCodecContext* inContext) { avcodec_free_context(&inContext); };
	const std::unique_ptr<AVCodecContext, decltype(free)> context(
		avcodec_alloc_context3(avcodec_find_encoder(AV_CODEC_ID_V210)), free);
	context->width = inWidth;
	context->height = inHeight;
	context->pix_fmt = AV_PIX_FMT_YUV422P10;
	context->time_base = {1, 25};
	AVFrame* frame = av_frame_alloc();
	frame->width = inWidth;
	frame->height = inHeight;
	frame->format = AV_PIX_FMT_YUV422P10;
	AVPacket* packet = av_packet_alloc();
	const bool isEncoded = avcodec_open2(context.get(), nullptr, nullptr) >= 0 && av_frame_get_buffer(frame, 0) >= 0
		&& avcodec_send_frame(context.get(), frame) >= 0 && avcodec_receive_packet(context.get(), packet) >= 0;
	const int size = isEncoded ? packet->size : -1;
	av_packet_free(&packet);
	av_frame_free(&frame);
	return size;
}

TEST(FFmpegRows, OfV210AreTheEncoders)
{
	if (avcodec_find_encoder(AV_CODEC_ID_V210) == nullptr)
		GTEST_SKIP() << "libavcodec was built without the v210 encoder";
	for (const int width :
		{2, 6, 46, 48, 50, 94, 96, 98, 640, 720, 960, 1'280, 1'440, 1'920, 2'048, 3'840, 4'096, 7'680})
		EXPECT_EQ(EncodedV210Bytes(width, 4), PixelFormatSize(kPixelFormat_V210_422_10u, width, 4)) << width;
}

// ---- Files -----------------------------------------------------------------------------------------------------------

// The first video stream of a file.
class VideoFile
{
public:
	explicit VideoFile(const std::string& inPath)
	{
		if (avformat_open_input(&mFile, inPath.c_str(), nullptr, nullptr) < 0
			|| avformat_find_stream_info(mFile, nullptr) < 0)
			throw std::runtime_error("cannot open " + inPath);
		mIndex = av_find_best_stream(mFile, AVMEDIA_TYPE_VIDEO, -1, -1, nullptr, 0);
	}
	VideoFile(const VideoFile&) = delete;
	VideoFile& operator=(const VideoFile&) = delete;
	~VideoFile() { avformat_close_input(&mFile); }

	AVStream& Stream() const { return *mFile->streams[mIndex]; }

	// The shape that the container states, or else the codec.
	PixelAspectRatio Shape() const
	{
		return ToPixelAspectRatio(av_guess_sample_aspect_ratio(mFile, &Stream(), nullptr));
	}

	std::int64_t FirstFrameBytes()
	{
		AVPacket* packet = av_packet_alloc();
		while (av_read_frame(mFile, packet) >= 0 && packet->stream_index != mIndex)
			av_packet_unref(packet);
		const std::int64_t size = packet->size;
		av_packet_free(&packet);
		return size;
	}

private:
	AVFormatContext* mFile = nullptr;
	int mIndex = -1;
};

struct FileCase
{
	const char* mName;
	const char* mFormat;      // as the catalogue names it
	bool mIsFrameOfOurSize;   // its first packet is as long as our frame
	const char* mShape;       // the description of its pixels
};

const FileCase kFiles[] = {
	{"dv25-ntsc.dv", "NTSCDV25", true, "Other Aspect Ratio (0.8889)"},
	{"dv25-ntsc-wide.dv", "NTSCDV25", true, "Other Aspect Ratio (1.1852)"},
	{"dv25-pal.dv", "PALDV25", true, "Other Aspect Ratio (1.0667)"},
	{"dv25-pal-dvcpro.mov", "PALDV25", true, "Square Pixels (1.0)"},
	{"dv50-ntsc.dv", "NTSCDV50", true, "Other Aspect Ratio (0.8889)"},
	{"dv50-pal.dv", "PALDV50", true, "Other Aspect Ratio (1.0667)"},
	{"dv100-720p60.mov", "NTSC_DV100_720p", true, "Square Pixels (1.0)"},
	{"dv100-720p50.mov", "PAL_DV100_720p", true, "Square Pixels (1.0)"},
	{"dv100-1080i60.mov", "NTSC_DV100_1080i", true, "Square Pixels (1.0)"},
	{"dv100-1080i50.mov", "PAL_DV100_1080i", true, "Square Pixels (1.0)"},
	{"mpeg2-upper-601.m2v", "YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601", false, "Other Aspect Ratio (0.8889)"},
	{"mpeg2-lower.m2v", "YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601", false, "Other Aspect Ratio (1.0667)"},
	{"mpeg2-upper-709.m2v", "YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709", false, "HD Anamorphic 1080 (1.3333)"},
	{"mpeg2-progressive.m2v", "YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709", false, "Square Pixels (1.0)"},
	{"mpeg4-12-11.mp4", "YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601", false, "Other Aspect Ratio (1.0909)"},
	{"mpeg4-10-11.mp4", "YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601", false, "D1/DV NTSC (0.9091)"},
	{"mpeg4-40-33.mp4", "YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601", false, "D1/DV NTSC Widescreen 16:9 (1.2121)"},
	{"uyvy.mov", "UYVY_422_8u", true, "Square Pixels (1.0)"},
	{"yuyv.mov", "YUYV_422_8u", true, "Square Pixels (1.0)"},
	{"bgra.avi", "BGRA_4444_8u", true, "Square Pixels (1.0)"},
	{"bgr0.nut", "BGRX_4444_8u", true, "Square Pixels (1.0)"},
	{"argb.mov", "ARGB_4444_8u", true, "Square Pixels (1.0)"},
	{"0rgb.nut", "XRGB_4444_8u", true, "Square Pixels (1.0)"},
	{"v210.mov", "V210_422_10u", true, "Square Pixels (1.0)"},
	{"r210.mov", "RGB_444_10u", false, "Square Pixels (1.0)"},   // its encoder pads rows to 256 bytes, we to 64
	{"rgb24.mov", "", false, "Square Pixels (1.0)"},
};

TEST(FFmpegFiles, AreWhatTheCatalogueSays)
{
	if (std::system("ffmpeg -version >/dev/null 2>&1") != 0)
		GTEST_SKIP() << "ffmpeg makes the files of this test, and it is not installed";
	const std::filesystem::path folder = std::filesystem::path(testing::TempDir()) / "zonmediatypes-video-files";
	ASSERT_EQ(std::system(("sh '" ZON_TEST_DATA "/make-video.sh' '" + folder.string() + "'").c_str()), 0);
	for (const FileCase& test : kFiles)
	{
		SCOPED_TRACE(test.mName);
		VideoFile file((folder / test.mName).string());
		const AVCodecParameters& parameters = *file.Stream().codecpar;
		const PixelFormat format = ToPixelFormat(parameters, file.Stream().avg_frame_rate);
		EXPECT_EQ(PixelFormatCatalogueName(format), test.mFormat);
		EXPECT_EQ(zoncore::utility::UTF16to8(PixelAspectRatioDescription(file.Shape())), test.mShape);
		if (test.mIsFrameOfOurSize)
		{
			EXPECT_EQ(PixelFormatSize(format, parameters.width, parameters.height), file.FirstFrameBytes());
		}
		int width = parameters.width;
		int height = parameters.height;
		FixedSizedFormatDimensions(format, width, height);
		EXPECT_EQ(width, parameters.width);
		EXPECT_EQ(height, parameters.height);
	}
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
