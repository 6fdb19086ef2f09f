#include "zonmedia/MediaFile.h"

#include "zonmedia/Problem.h"
#include "zonmediatypes/interop/FFmpeg.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <limits>
#include <memory>
#include <span>
#include <string_view>

extern "C"
{
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/dict.h>
#include <libavutil/error.h>
#include <libavutil/log.h>
#include <libavutil/pixdesc.h>
}

namespace zonmedia
{

namespace
{

struct CloseFormat
{
	void operator()(AVFormatContext* inContext) const { avformat_close_input(&inContext); }
};
using Format = std::unique_ptr<AVFormatContext, CloseFormat>;

struct FreePacket
{
	void operator()(AVPacket* inPacket) const { av_packet_free(&inPacket); }
};

std::span<AVStream* const> Streams(const AVFormatContext& inContext)
{
	return {inContext.streams, inContext.nb_streams};
}

std::string Reason(int inError)
{
	if (inError == AVERROR_INVALIDDATA || inError == AVERROR_EOF)
		return "not a media file";
	std::array<char, AV_ERROR_MAX_STRING_SIZE> text{};
	av_strerror(inError, text.data(), text.size());
	return text.data();
}

Format Open(const std::string& inPath)
{
	// Names on the command line are files, whatever they look like; and a file may refer to other files only.
	AVDictionary* options = nullptr;
	av_dict_set(&options, "protocol_whitelist", "file", 0);
	AVFormatContext* context = nullptr;
	const int opened = avformat_open_input(&context, ("file:" + inPath).c_str(), nullptr, &options);
	av_dict_free(&options);
	if (opened < 0)
		throw InputProblem(Reason(opened));
	Format format(context);
	// Plain text passes for the drawings of text terminals, which are no media.
	if (std::string_view(format->iformat->name) == "tty")
		throw InputProblem(Reason(AVERROR_INVALIDDATA));
	const int read = avformat_find_stream_info(format.get(), nullptr);
	if (read < 0)
		throw InputProblem(Reason(read));
	return format;
}

// ---- Tags ------------------------------------------------------------------------------------------------------------

std::string Tag(const AVDictionary* inTags, const char* inName)
{
	const AVDictionaryEntry* entry = av_dict_get(inTags, inName, nullptr, 0);
	return entry == nullptr ? std::string() : std::string(entry->value);
}

// The start timecode, which formats keep with the picture, on a track of its own or for the whole file.
std::string StartTimecode(const AVFormatContext& inContext)
{
	const char* const name = "timecode";
	for (const AVMediaType type : {AVMEDIA_TYPE_VIDEO, AVMEDIA_TYPE_DATA, AVMEDIA_TYPE_AUDIO})
	{
		for (const AVStream* stream : Streams(inContext))
		{
			std::string tag = stream->codecpar->codec_type == type ? Tag(stream->metadata, name) : std::string();
			if (!tag.empty())
				return tag;
		}
	}
	return Tag(inContext.metadata, name);
}

std::optional<std::int64_t> StartSample(const AVFormatContext& inContext)
{
	const std::string tag = Tag(inContext.metadata, "time_reference");
	std::int64_t sample = 0;
	const bool isNumber = std::from_chars(tag.data(), tag.data() + tag.size(), sample).ec == std::errc();
	return isNumber ? std::optional(sample) : std::nullopt;
}

// ---- Durations -------------------------------------------------------------------------------------------------------

// inDuration in units of 1/inRate seconds, to the nearest; nothing when it is unknown or beyond counting.
std::optional<std::int64_t> Rescaled(std::int64_t inDuration, AVRational inTimeBase, AVRational inRate)
{
	if (inDuration == AV_NOPTS_VALUE || inDuration <= 0 || inRate.num <= 0 || inRate.den <= 0)
		return std::nullopt;
	const std::int64_t count = av_rescale_q_rnd(inDuration, inTimeBase, av_inv_q(inRate), AV_ROUND_NEAR_INF);
	return count > 0 ? std::optional(count) : std::nullopt;
}

// The number of units of 1/inRate seconds by reading the whole stream: a packet of video is a frame, one of audio says how
// long it is.
std::optional<std::int64_t> Counted(AVFormatContext& ioContext, const AVStream& inStream, AVRational inRate)
{
	const std::unique_ptr<AVPacket, FreePacket> packet(av_packet_alloc());
	if (packet == nullptr || av_seek_frame(&ioContext, inStream.index, 0, AVSEEK_FLAG_BACKWARD) < 0)
		return std::nullopt;
	std::int64_t packets = 0;
	std::int64_t duration = 0;
	for (; av_read_frame(&ioContext, packet.get()) >= 0; av_packet_unref(packet.get()))
	{
		if (packet->stream_index != inStream.index)
			continue;
		++packets;
		duration += std::clamp<std::int64_t>(packet->duration, 0, std::numeric_limits<std::int32_t>::max());
	}
	const bool isVideo = inStream.codecpar->codec_type == AVMEDIA_TYPE_VIDEO;
	return isVideo ? std::optional(packets) : Rescaled(duration, inStream.time_base, inRate);
}

// The length of a stream in units of 1/inRate seconds.
std::optional<std::int64_t> Length(AVFormatContext& ioContext, const AVStream& inStream, AVRational inRate)
{
	// A length that was worked out from the file's size and bit rate is no count.
	const bool isGuess = ioContext.duration_estimation_method == AVFMT_DURATION_FROM_BITRATE;
	if (!isGuess && inStream.duration != AV_NOPTS_VALUE)
		return Rescaled(inStream.duration, inStream.time_base, inRate);
	if (inStream.codecpar->codec_type == AVMEDIA_TYPE_VIDEO && inStream.nb_frames > 0)
		return inStream.nb_frames;
	if (!isGuess && ioContext.duration != AV_NOPTS_VALUE)
		return Rescaled(ioContext.duration, av_get_time_base_q(), inRate);
	return Counted(ioContext, inStream, inRate);
}

// ---- Streams ---------------------------------------------------------------------------------------------------------

std::string OrEmpty(const char* inText)
{
	return inText == nullptr ? std::string() : std::string(inText);
}

// The rate of a picture. Readers round what they find to a usual rate; a file whose clock ticks once a frame says it
// exactly, 2997/100 for instance.
AVRational FrameRateOf(AVFormatContext& ioContext, AVStream& inStream)
{
	constexpr double kRounding = 0.005;
	const AVRational rate = av_guess_frame_rate(&ioContext, &inStream, nullptr);
	const AVRational clock = av_inv_q(inStream.time_base);
	return std::abs(av_q2d(clock) / av_q2d(rate) - 1.0) < kRounding ? clock : rate;
}

VideoStream ReadVideo(AVFormatContext& ioContext, AVStream& inStream)
{
	const AVCodecParameters& parameters = *inStream.codecpar;
	const AVRational rate = FrameRateOf(ioContext, inStream);
	VideoStream video;
	video.mCodec = avcodec_get_name(parameters.codec_id);
	video.mStoredFormat = OrEmpty(av_get_pix_fmt_name(static_cast<AVPixelFormat>(parameters.format)));
	video.mRate = rate.num > 0 && rate.den > 0 ? Reduced({rate.num, rate.den}) : Fraction{};
	video.mFrameCount = Length(ioContext, inStream, rate);
	video.mWidth = parameters.width;
	video.mHeight = parameters.height;
	video.mPixelFormat = zonmediatypes::ToPixelFormat(parameters, rate);
	video.mPixelShape = zonmediatypes::ToPixelAspectRatio(av_guess_sample_aspect_ratio(&ioContext, &inStream, nullptr));
	video.mFieldType = zonmediatypes::ToFieldType(parameters.field_order);
	return video;
}

// Two channels whose speakers the file does not state are stereo, as every format takes them; more could be anything.
zonmediatypes::AudioChannelLayout LayoutOf(const AVChannelLayout& inLayout)
{
	const bool isStereo = inLayout.order == AV_CHANNEL_ORDER_UNSPEC && inLayout.nb_channels == 2;
	return isStereo ? zonmediatypes::CreateStereoChannelLayout() : zonmediatypes::ToAudioChannelLayout(inLayout);
}

AudioStream ReadAudio(AVFormatContext& ioContext, const AVStream& inStream)
{
	const AVCodecParameters& parameters = *inStream.codecpar;
	AudioStream audio;
	audio.mCodec = avcodec_get_name(parameters.codec_id);
	audio.mSampleRate = parameters.sample_rate;
	audio.mLayout = LayoutOf(parameters.ch_layout);
	audio.mSampleCount = Length(ioContext, inStream, {parameters.sample_rate, 1});
	return audio;
}

}   // namespace

MediaFile ReadMediaFile(const std::string& inPath)
{
	av_log_set_level(AV_LOG_QUIET);   // what went wrong is said in one line, by the caller
	const Format format = Open(inPath);
	MediaFile file;
	file.mFormat = format->iformat->long_name;
	file.mStartTimecode = StartTimecode(*format);
	file.mStartSample = StartSample(*format);
	for (AVStream* stream : Streams(*format))
	{
		const AVMediaType type = stream->codecpar->codec_type;
		const bool isPicture = (stream->disposition & AV_DISPOSITION_ATTACHED_PIC) != 0;
		if (type == AVMEDIA_TYPE_VIDEO && !isPicture && !file.mVideo)
			file.mVideo = ReadVideo(*format, *stream);
		else if (type == AVMEDIA_TYPE_AUDIO)
			file.mAudio.push_back(ReadAudio(*format, *stream));
	}
	if (!file.mVideo && file.mAudio.empty())
		throw InputProblem("no video and no audio in this file");
	return file;
}

}   // namespace zonmedia
