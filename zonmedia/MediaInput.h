#pragma once

/// \file
/// Opening media files with FFmpeg's libraries, and saying what is wrong with those that cannot be opened.

#include <memory>
#include <span>
#include <string>

extern "C"
{
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
}

namespace zonmedia
{

/// Gives an object of FFmpeg's back by the function that takes the address of its pointer.
template <auto inFree>
struct FreeBy
{
	template <class T>
	void operator()(T* inObject) const
	{
		inFree(&inObject);
	}
};

using Format = std::unique_ptr<AVFormatContext, FreeBy<avformat_close_input>>;
using Packet = std::unique_ptr<AVPacket, FreeBy<av_packet_free>>;
using Frame = std::unique_ptr<AVFrame, FreeBy<av_frame_free>>;
using Decoder = std::unique_ptr<AVCodecContext, FreeBy<avcodec_free_context>>;

/// The name by which standard input is asked for.
inline constexpr const char* kStandardInput = "-";

/// Opens the file at inPath, or standard input for kStandardInput, and has its streams probed. Throws InputProblem when it is
/// missing, no regular file, or no media, and says what of it is missing where that is known.
Format OpenMedia(const std::string& inPath);

inline std::span<AVStream* const> Streams(const AVFormatContext& inFile)
{
	return {inFile.streams, inFile.nb_streams};
}

/// The name of the file's format, for people: "QuickTime / MOV", "PNG".
std::string FormatName(const AVFormatContext& inFile);

/// Whether the file is one picture, such as a PNG or a JPEG, or several, without any time.
bool IsStill(const AVFormatContext& inFile);

}   // namespace zonmedia
