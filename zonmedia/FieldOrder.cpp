#include "zonmedia/FieldOrder.h"

#include "zonmedia/PacketReader.h"
#include "zonmediatypes/interop/FFmpeg.h"

#include <algorithm>
#include <array>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language

namespace
{

// Codecs whose frames are progressive when they do not say that they are in fields; those of all others leave it open.
constexpr auto sCodecsThatTell = std::to_array<AVCodecID>({AV_CODEC_ID_MPEG1VIDEO, AV_CODEC_ID_MPEG2VIDEO,
	AV_CODEC_ID_MPEG4, AV_CODEC_ID_H264, AV_CODEC_ID_VC1, AV_CODEC_ID_PRORES, AV_CODEC_ID_DNXHD, AV_CODEC_ID_FFV1});

bool TellsWhenProgressive(const AVCodecParameters& inParameters)
{
	// The first versions of FFV1, which have nothing ahead of their frames, tell nothing.
	const bool isTold = inParameters.codec_id != AV_CODEC_ID_FFV1 || inParameters.extradata_size > 0;
	return isTold && std::ranges::find(sCodecsThatTell, inParameters.codec_id) != sCodecsThatTell.end();
}

// A decoder that knows nothing of what the container says, which some repeat in their frames as if the frames said it.
Decoder OpenDecoder(const AVStream& inStream)
{
	const AVCodec* codec = avcodec_find_decoder(inStream.codecpar->codec_id);
	Decoder decoder(codec == nullptr ? nullptr : avcodec_alloc_context3(codec));
	if (decoder == nullptr || avcodec_parameters_to_context(decoder.get(), inStream.codecpar) < 0)
		return nullptr;
	decoder->field_order = AV_FIELD_UNKNOWN;
	decoder->thread_count = 1;   // several would want several packets ahead
	return avcodec_open2(decoder.get(), codec, nullptr) < 0 ? nullptr : std::move(decoder);
}

// The first frame that comes out of the stream's first packets; null when none does.
Frame FirstFrame(const AVStream& inStream, PacketReader& ioPackets)
{
	constexpr int kMostPackets = 128;   // more than any codec holds back
	const Decoder decoder = OpenDecoder(inStream);
	Frame frame(av_frame_alloc());
	if (decoder == nullptr || frame == nullptr)
		return nullptr;
	for (int count = 0; count < kMostPackets;)
	{
		const AVPacket* packet = ioPackets.Next();
		if (packet != nullptr && packet->stream_index != inStream.index)
			continue;
		avcodec_send_packet(decoder.get(), packet);   // null, at the end, has it give what it holds back
		if (avcodec_receive_frame(decoder.get(), frame.get()) >= 0)
			return frame;
		if (packet == nullptr)
			return nullptr;
		++count;
	}
	return nullptr;
}

}   // namespace

FieldType ReadFieldType(const AVFormatContext& inFile, const AVStream& inStream, PacketReader& ioPackets)
{
	constexpr int kLinesOfProgressiveDV = 720;
	const AVCodecParameters& parameters = *inStream.codecpar;
	const FieldType said = ToFieldType(parameters.field_order, inFile.iformat->name);
	const Frame frame = FirstFrame(inStream, ioPackets);
	if (frame == nullptr)
		return said;
	// All frames of DV say that they are in fields; those of 720 lines never are, and the container may know of others.
	const bool isDV = parameters.codec_id == AV_CODEC_ID_DVVIDEO;
	if (isDV && (said == kFieldType_NoFields || parameters.height == kLinesOfProgressiveDV))
		return kFieldType_NoFields;
	if (frame->interlaced_frame != 0)
		return frame->top_field_first != 0 ? kFieldType_UpperFirst : kFieldType_LowerFirst;
	return TellsWhenProgressive(parameters) ? kFieldType_NoFields : said;
}

}   // namespace zonmedia
