#pragma once

/// \file
/// How long the streams of a media file are: what the file states, and what its packets show.

#include "zonmedia/MediaInput.h"
#include "zonmediatypes/TickTime.h"

#include <cstdint>
#include <functional>
#include <optional>

namespace zonmedia
{

class PacketReader;

/// The frames a second of a picture whose frames differ in length.
struct RateVariation
{
	double mAverage = 0.0;
	std::optional<double> mLowest;   ///< nothing when only the average is known
	std::optional<double> mHighest;
};

struct VideoLength
{
	std::optional<std::int64_t> mFrameCount;
	bool mIsByDuration = false;   ///< the frames were not counted: they are worked out from the duration, or unknown
	std::optional<std::int64_t> mStatedCount;           ///< what the file says, when its end is missing
	std::optional<RateVariation> mVariation;            ///< nothing at a steady rate
	std::optional<zonmediatypes::TickTime> mDuration;   ///< as the timestamps have it, for rates that vary
};

struct SoundLength
{
	std::optional<std::int64_t> mSampleCount;
	std::optional<std::int64_t> mStatedCount;   ///< what the file says, when its end is missing
};

/// Whether all packets are to be read, and who is told how far that has come.
struct Scan
{
	bool mIsWanted = false;
	std::function<void(double inPart)> mProgress;
};

/// The length of a video stream of inRate frames a second. Packets are read: all of them for a scan, when the file is small
/// enough for that to take no time, and when it states no length; of a file that states no more than its last timestamp those
/// from the last key frame on. ioPackets may have read packets before, from the beginning.
VideoLength ReadVideoLength(
	AVFormatContext& ioFile, AVStream& ioStream, AVRational inRate, PacketReader& ioPackets, const Scan& inScan);

/// The length of a sound stream: what its packets show where the file does not say, or where all of them were read and end
/// before the length that it states.
SoundLength ReadSoundLength(AVFormatContext& ioFile, const AVStream& inStream, PacketReader& ioPackets);

}   // namespace zonmedia
