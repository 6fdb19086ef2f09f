#pragma once

/// \file
/// What a media file says about itself, as a plain value.

#include "zonmedia/Fraction.h"
#include "zonmedia/StreamLength.h"
#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormat.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace zonmedia
{

struct VideoStream
{
	std::string mCodec;
	std::string mStoredFormat;   ///< the pixel format by the name that the reading library has for it
	Fraction mRate;              ///< frames a second; 0 when the file does not say
	VideoLength mLength;
	int mWidth = 0;
	int mHeight = 0;
	zonmediatypes::PixelFormat mPixelFormat;   ///< kPixelFormat_Invalid where the library has no counterpart
	zonmediatypes::PixelAspectRatio mPixelShape = zonmediatypes::kPixelAspectRatio_Unknown;
	zonmediatypes::FieldType mFieldType = zonmediatypes::kFieldType_Invalid;
};

struct AudioStream
{
	std::string mCodec;
	std::int64_t mSampleRate = 0;
	zonmediatypes::AudioChannelLayout mLayout;   ///< each channel by its role in the file
	SoundLength mLength;
};

struct MediaFile
{
	std::string mFormat;
	bool mIsStill = false;               ///< a picture, or several, without time
	std::optional<VideoStream> mVideo;   ///< the first video stream, or the picture; a cover picture is none
	std::vector<AudioStream> mAudio;
	std::string mStartTimecode;                 ///< the tag's text; empty without a tag
	std::optional<std::int64_t> mStartSample;   ///< the time reference of a broadcast wave
};

/// Reads the headers and the first frame of the file at inPath, or of standard input for "-", and as many packets as the
/// length of its streams takes; all of them for a scan. Throws InputProblem when the file is missing, cannot be read, or is no
/// media.
MediaFile ReadMediaFile(const std::string& inPath, const Scan& inScan = {});

}   // namespace zonmedia
