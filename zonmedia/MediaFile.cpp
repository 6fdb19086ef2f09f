#include "zonmedia/MediaFile.h"

#include "zonmedia/FieldOrder.h"
#include "zonmedia/MediaInput.h"
#include "zonmedia/PacketReader.h"
#include "zonmedia/Problem.h"
#include "zonmediatypes/interop/FFmpeg.h"

#include <algorithm>
#include <charconv>
#include <cmath>

extern "C"
{
#include <libavutil/dict.h>
#include <libavutil/log.h>
#include <libavutil/pixdesc.h>
}

namespace zonmedia
{

namespace
{

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

// ---- Streams ---------------------------------------------------------------------------------------------------------

std::string OrEmpty(const char* inText)
{
	return inText == nullptr ? std::string() : std::string(inText);
}

// The rate of a picture. Readers round what they find to a usual rate; a file whose clock ticks once a frame says it
// exactly, 2997/100 for instance.
AVRational FrameRateOf(AVFormatContext& ioFile, AVStream& inStream)
{
	constexpr double kRounding = 0.005;
	const AVRational rate = av_guess_frame_rate(&ioFile, &inStream, nullptr);
	const AVRational clock = av_inv_q(inStream.time_base);
	return std::abs(av_q2d(clock) / av_q2d(rate) - 1.0) < kRounding ? clock : rate;
}

VideoStream ReadPicture(AVFormatContext& ioFile, AVStream& ioStream, AVRational inRate)
{
	const AVCodecParameters& parameters = *ioStream.codecpar;
	VideoStream video;
	video.mCodec = avcodec_get_name(parameters.codec_id);
	video.mStoredFormat = OrEmpty(av_get_pix_fmt_name(static_cast<AVPixelFormat>(parameters.format)));
	video.mWidth = parameters.width;
	video.mHeight = parameters.height;
	video.mPixelFormat = zonmediatypes::ToPixelFormat(parameters, inRate);
	video.mPixelShape = zonmediatypes::ToPixelAspectRatio(av_guess_sample_aspect_ratio(&ioFile, &ioStream, nullptr));
	return video;
}

// What goes by the field order is to go by the one that was found.
AVFieldOrder OrderOf(zonmediatypes::FieldType inFields)
{
	if (inFields == zonmediatypes::kFieldType_NoFields)
		return AV_FIELD_PROGRESSIVE;
	if (inFields == zonmediatypes::kFieldType_UpperFirst)
		return AV_FIELD_TT;
	return inFields == zonmediatypes::kFieldType_LowerFirst ? AV_FIELD_BB : AV_FIELD_UNKNOWN;
}

VideoStream ReadVideo(AVFormatContext& ioFile, AVStream& ioStream, PacketReader& ioPackets, const Scan& inScan)
{
	const AVRational rate = FrameRateOf(ioFile, ioStream);
	const zonmediatypes::FieldType fields = ReadFieldType(ioFile, ioStream, ioPackets);
	ioStream.codecpar->field_order = OrderOf(fields);
	VideoStream video = ReadPicture(ioFile, ioStream, rate);
	video.mFieldType = fields;
	video.mRate = rate.num > 0 && rate.den > 0 ? Reduced({rate.num, rate.den}) : Fraction{};
	video.mLength = ReadVideoLength(ioFile, ioStream, rate, ioPackets, inScan);
	return video;
}

// Two channels whose speakers the file does not state are stereo, as every format takes them; more could be anything.
zonmediatypes::AudioChannelLayout LayoutOf(const AVChannelLayout& inLayout)
{
	const bool isStereo = inLayout.order == AV_CHANNEL_ORDER_UNSPEC && inLayout.nb_channels == 2;
	return isStereo ? zonmediatypes::CreateStereoChannelLayout() : zonmediatypes::ToAudioChannelLayout(inLayout);
}

AudioStream ReadAudio(AVFormatContext& ioFile, const AVStream& inStream, PacketReader& ioPackets)
{
	const AVCodecParameters& parameters = *inStream.codecpar;
	AudioStream audio;
	audio.mCodec = avcodec_get_name(parameters.codec_id);
	audio.mSampleRate = parameters.sample_rate;
	audio.mLayout = LayoutOf(parameters.ch_layout);
	audio.mLength = ReadSoundLength(ioFile, inStream, ioPackets);
	return audio;
}

// A stream of which nothing was found to be seen or heard, as in a file that has only just begun, is none.
bool IsVideo(const AVStream& inStream)
{
	const bool isCover = (inStream.disposition & AV_DISPOSITION_ATTACHED_PIC) != 0;
	const AVCodecParameters& parameters = *inStream.codecpar;
	return parameters.codec_type == AVMEDIA_TYPE_VIDEO && !isCover && parameters.width > 0 && parameters.height > 0;
}

bool IsAudio(const AVStream& inStream)
{
	const AVCodecParameters& parameters = *inStream.codecpar;
	return parameters.codec_type == AVMEDIA_TYPE_AUDIO && parameters.sample_rate > 0;
}

void ReadStreams(AVFormatContext& ioFile, const Scan& inScan, MediaFile& ioMedia)
{
	PacketReader packets(ioFile);
	const auto streams = Streams(ioFile);
	const auto video = std::ranges::find_if(streams, [](const AVStream* inStream) { return IsVideo(*inStream); });
	// The picture first, whose first frame is found from the beginning of the file.
	if (video != streams.end())
		ioMedia.mVideo
			= ioMedia.mIsStill ? ReadPicture(ioFile, **video, {}) : ReadVideo(ioFile, **video, packets, inScan);
	else if (inScan.mIsWanted)
		packets.ReadAll(inScan.mProgress);
	for (const AVStream* stream : Streams(ioFile))
	{
		if (IsAudio(*stream))
			ioMedia.mAudio.push_back(ReadAudio(ioFile, *stream, packets));
	}
}

}   // namespace

MediaFile ReadMediaFile(const std::string& inPath, const Scan& inScan)
{
	av_log_set_level(AV_LOG_QUIET);   // what went wrong is said in one line, by the caller
	const Format format = OpenMedia(inPath);
	MediaFile media;
	media.mFormat = FormatName(*format);
	media.mStartTimecode = StartTimecode(*format);
	media.mStartSample = StartSample(*format);
	media.mIsStill = IsStill(*format);
	ReadStreams(*format, inScan, media);
	if (!media.mVideo && media.mIsStill)
		throw InputProblem(media.mFormat + " image that is damaged, or whose end is missing");
	if (!media.mVideo && media.mAudio.empty())
		throw InputProblem("no video and no audio in this file");
	return media;
}

}   // namespace zonmedia
