#include "zonmedia/StreamLength.h"

#include "zonmedia/PacketReader.h"
#include "zonmediatypes/interop/FFmpeg.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

extern "C"
{
#include <libavutil/common.h>
#include <libavutil/dict.h>
#include <libavutil/mathematics.h>
#include <libavutil/parseutils.h>
}

namespace zonmedia
{

namespace
{

// Timestamps of a stream in order, in its own units.
using Times = std::vector<std::int64_t>;

// ---- What the file states --------------------------------------------------------------------------------------------

std::string_view Tag(const AVStream& inStream, const char* inName)
{
	// Matroska's tags of a stream may end with its language: "DURATION-eng".
	const AVDictionaryEntry* entry = av_dict_get(inStream.metadata, inName, nullptr, 0);
	if (entry == nullptr)
		entry = av_dict_get(inStream.metadata, (std::string(inName) + "-").c_str(), nullptr, AV_DICT_IGNORE_SUFFIX);
	return entry == nullptr ? std::string_view() : entry->value;
}

bool IsMatroska(const AVFormatContext& inFile)
{
	return std::string_view(inFile.iformat->name).starts_with("matroska");
}

// A length that was worked out from the file's size and bit rate is none.
bool IsGuessed(const AVFormatContext& inFile)
{
	return inFile.duration_estimation_method == AVFMT_DURATION_FROM_BITRATE;
}

std::optional<std::int64_t> StatedCount(const AVStream& inStream)
{
	const std::string_view tag = Tag(inStream, "NUMBER_OF_FRAMES");
	std::int64_t count = inStream.nb_frames;
	if (count <= 0)
		std::from_chars(tag.data(), tag.data() + tag.size(), count);
	return count > 0 ? std::optional(count) : std::nullopt;
}

// inDuration in units of 1/inRate seconds, to the nearest; nothing when it is unknown or beyond counting.
std::optional<std::int64_t> Rescaled(std::int64_t inDuration, AVRational inTimeBase, AVRational inRate)
{
	if (inDuration == AV_NOPTS_VALUE || inDuration <= 0 || inRate.num <= 0 || inRate.den <= 0)
		return std::nullopt;
	const std::int64_t count = av_rescale_q_rnd(inDuration, inTimeBase, av_inv_q(inRate), AV_ROUND_NEAR_INF);
	return count > 0 ? std::optional(count) : std::nullopt;
}

// The stream's own length, or that of the file when it has no other stream; in units of 1/inRate seconds. Matroska keeps it
// as a tag, and its reader gives a stream without packets, as in a file that is cut off early, the length of the file.
std::optional<std::int64_t> StatedDuration(const AVFormatContext& inFile, const AVStream& inStream, AVRational inRate)
{
	if (IsGuessed(inFile))
		return std::nullopt;
	std::int64_t microseconds = 0;
	const std::string tag(Tag(inStream, "DURATION"));
	const bool hasOther = inStream.duration != AV_NOPTS_VALUE && !IsMatroska(inFile);
	if (!tag.empty() && !hasOther && av_parse_time(&microseconds, tag.c_str(), 1) >= 0)
		return Rescaled(microseconds, av_get_time_base_q(), inRate);
	if (inStream.duration != AV_NOPTS_VALUE)
		return Rescaled(inStream.duration, inStream.time_base, inRate);
	return inFile.nb_streams == 1 ? Rescaled(inFile.duration, av_get_time_base_q(), inRate) : std::nullopt;
}

// Matroska's tag may count from the beginning of the file rather than of the stream.
bool HasClearDuration(const AVFormatContext& inFile, const AVStream& inStream)
{
	const bool startsLate = inStream.start_time != AV_NOPTS_VALUE && inStream.start_time > 0;
	return !startsLate || !IsMatroska(inFile);
}

// ---- What the packets show -------------------------------------------------------------------------------------------

// The frames that are shown, from an index that has all of them: QuickTime's.
std::optional<std::int64_t> IndexedCount(const AVFormatContext& inFile, AVStream& inStream)
{
	const int count = avformat_index_get_entries_count(&inStream);
	const bool hasAll = inStream.nb_frames > 0 && count >= inStream.nb_frames;
	if (!std::string_view(inFile.iformat->name).starts_with("mov") || !hasAll)
		return std::nullopt;
	std::int64_t shown = 0;
	for (int i = 0; i < count; ++i)
		shown += (avformat_index_get_entry(&inStream, i)->flags & AVINDEX_DISCARD_FRAME) == 0 ? 1 : 0;
	return shown;
}

// The shortest and the longest time between frames, of inTimes in order; 0 and 0 for fewer than two.
std::pair<std::int64_t, std::int64_t> FrameLengths(const Times& inTimes)
{
	std::int64_t shortest = std::numeric_limits<std::int64_t>::max();
	std::int64_t longest = 0;
	for (std::size_t i = 1; i < inTimes.size(); ++i)
	{
		const std::int64_t length = inTimes[i] - inTimes[i - 1];
		shortest = length > 0 ? std::min(shortest, length) : shortest;
		longest = std::max(longest, length);
	}
	return {std::min(shortest, longest), longest};
}

double RateOf(std::int64_t inFrames, std::int64_t inDuration, AVRational inTimeBase)
{
	return static_cast<double>(inFrames) * inTimeBase.den / (static_cast<double>(inDuration) * inTimeBase.num);
}

// How the frames of a stream that lasts inDuration vary in length; nothing when that is no more than timestamps are rounded.
std::optional<RateVariation> VariationOf(Times inTimes, std::int64_t inDuration, AVRational inTimeBase)
{
	constexpr std::int64_t kRounding = 2;
	constexpr double kUnevenness = 1.02;
	std::ranges::sort(inTimes);
	const auto [shortest, longest] = FrameLengths(inTimes);
	if (longest <= shortest + kRounding || static_cast<double>(longest) < static_cast<double>(shortest) * kUnevenness)
		return std::nullopt;
	const auto frames = static_cast<std::int64_t>(inTimes.size());
	return RateVariation{
		RateOf(frames, inDuration, inTimeBase), RateOf(1, longest, inTimeBase), RateOf(1, shortest, inTimeBase)};
}

// Whether the average that the file states is not its rate.
bool IsAverageAnother(AVRational inAverage, AVRational inRate)
{
	constexpr double kUnevenness = 0.01;
	return inAverage.num > 0 && inAverage.den > 0 && std::abs(av_q2d(inAverage) / av_q2d(inRate) - 1.0) > kUnevenness;
}

std::optional<zonmediatypes::TickTime> Ticks(std::int64_t inUnits, AVRational inTimeBase)
{
	const auto time = zonmediatypes::ToTickTime(inUnits, inTimeBase, zonmediatypes::Rounding::Nearest);
	return inUnits > 0 ? time : std::nullopt;
}

// The frames of a steady rate up to the end of the last packet. Some formats state their length from the beginning of the
// file rather than of the stream.
std::int64_t ReachOf(const AVStream& inStream, AVRational inRate, const PacketTotals& inTotals)
{
	const std::int64_t start = std::min<std::int64_t>(inTotals.mStart.value_or(0), 0);
	return Rescaled(inTotals.mEnd - start, inStream.time_base, inRate).value_or(inTotals.mCount);
}

VideoLength CountedLength(
	const AVFormatContext& inFile, const AVStream& inStream, AVRational inRate, const PacketTotals& inTotals)
{
	const std::int64_t duration = inTotals.mEnd - inTotals.mStart.value_or(0);
	VideoLength length;
	length.mFrameCount = inTotals.mCount - inTotals.mHidden;
	length.mDuration = Ticks(duration, inStream.time_base);
	if (inTotals.HasTimes() && duration > 0)
		length.mVariation = VariationOf(inTotals.mTimes, duration, inStream.time_base);
	const std::int64_t stated = StatedCount(inStream).value_or(0);
	const std::int64_t lasting = StatedDuration(inFile, inStream, inRate).value_or(0);
	const std::int64_t expected = length.mVariation ? stated : std::max(stated, lasting);
	const std::int64_t expectedReach = length.mVariation ? lasting : expected;
	// Formats may leave out frames that repeat others: then fewer packets reach as far.
	if (inTotals.mCount < expected && ReachOf(inStream, inRate, inTotals) + 1 < expectedReach)
		length.mStatedCount = expected;
	return length;
}

// Whether all packets of a sound end before inStated samples, by more than what the last ones may leave open.
bool EndsBefore(std::int64_t inStated, const AVStream& inStream, AVRational inRate, const PacketTotals& inTotals)
{
	constexpr std::int64_t kOpen = 2;   // packets
	if (inTotals.mCount == 0 || !inTotals.mStart)
		return false;
	const std::int64_t reach = ReachOf(inStream, inRate, inTotals);
	return inStated - reach > reach / inTotals.mCount * kOpen;
}

// The length of a stream by its last packets, in its own units; nothing where they cannot be reached without all others.
std::optional<std::int64_t> LengthToLastPacket(
	const AVFormatContext& inFile, const AVStream& inStream, PacketReader& ioPackets)
{
	if (IsGuessed(inFile) || inStream.start_time == AV_NOPTS_VALUE || !ioPackets.GoToEnd(inStream))
		return std::nullopt;
	ioPackets.ReadAll({});
	const PacketTotals& totals = ioPackets.TotalsOf(inStream);
	return totals.mStart && totals.HasTimes() ? std::optional(av_sat_sub64(totals.mEnd, inStream.start_time))
											  : std::nullopt;
}

bool IsSmall(const AVFormatContext& inFile)
{
	constexpr std::int64_t kMost = std::int64_t{16} << 20;   // bytes that are read in no time
	const std::int64_t size = inFile.pb != nullptr ? avio_size(inFile.pb) : -1;
	return size >= 0 && size <= kMost;
}

// The length of a picture that is not read to its end, by the frames or the duration that are stated for it.
VideoLength StatedLength(
	const AVFormatContext& inFile, AVStream& ioStream, AVRational inRate, std::optional<std::int64_t> inFrames)
{
	const auto indexed = IndexedCount(inFile, ioStream);
	const auto count = indexed ? indexed : StatedCount(ioStream);
	const bool isSteady = !IsAverageAnother(ioStream.avg_frame_rate, inRate);
	VideoLength length;
	length.mFrameCount = count || !isSteady ? count : inFrames;
	length.mIsByDuration = !count;
	length.mDuration = inFrames ? Ticks(*inFrames, av_inv_q(inRate)) : std::nullopt;
	if (!isSteady)
		length.mVariation = RateVariation{av_q2d(ioStream.avg_frame_rate), std::nullopt, std::nullopt};
	return length;
}

// What is stated of a rate that varies is an average of the first frames, and a duration by the order of decoding.
void MeasureDuration(
	const AVFormatContext& inFile, const AVStream& inStream, PacketReader& ioPackets, VideoLength& ioLength)
{
	const auto units = LengthToLastPacket(inFile, inStream, ioPackets);
	const auto duration = units ? Ticks(*units, inStream.time_base) : std::nullopt;
	if (!duration || *units <= 0)
		return;
	ioLength.mDuration = duration;
	if (ioLength.mFrameCount)
		ioLength.mVariation->mAverage = RateOf(*ioLength.mFrameCount, *units, inStream.time_base);
}

// Reads all packets, again where some were left out. None can be read where that is impossible.
const PacketTotals& ReadFromBeginning(const AVStream& inStream, PacketReader& ioPackets)
{
	if (!ioPackets.HasMoved() || ioPackets.GoToBeginning(inStream))
		ioPackets.ReadAll({});
	return ioPackets.TotalsOf(inStream);
}

}   // namespace

VideoLength ReadVideoLength(
	AVFormatContext& ioFile, AVStream& ioStream, AVRational inRate, PacketReader& ioPackets, const Scan& inScan)
{
	if (inScan.mIsWanted || IsSmall(ioFile))
	{
		ioPackets.ReadAll(inScan.mProgress);
		return CountedLength(ioFile, ioStream, inRate, ioPackets.TotalsOf(ioStream));
	}
	// A duration that was taken from the last timestamps may lack a frame.
	const bool endsAtLastTime = ioFile.duration_estimation_method == AVFMT_DURATION_FROM_PTS;
	const bool isClear = !endsAtLastTime && HasClearDuration(ioFile, ioStream);
	auto frames = isClear ? StatedDuration(ioFile, ioStream, inRate) : std::nullopt;
	if (!frames)
	{
		if (const auto length = LengthToLastPacket(ioFile, ioStream, ioPackets))
			frames = Rescaled(*length, ioStream.time_base, inRate);
	}
	if (frames || StatedCount(ioStream))
	{
		VideoLength length = StatedLength(ioFile, ioStream, inRate, frames);
		if (length.mVariation)
			MeasureDuration(ioFile, ioStream, ioPackets, length);
		return length;
	}
	return CountedLength(ioFile, ioStream, inRate, ReadFromBeginning(ioStream, ioPackets));
}

SoundLength ReadSoundLength(AVFormatContext& ioFile, const AVStream& inStream, PacketReader& ioPackets)
{
	const AVRational rate{inStream.codecpar->sample_rate, 1};
	if (const auto stated = StatedDuration(ioFile, inStream, rate))
	{
		const bool isCut = ioPackets.IsAllRead() && EndsBefore(*stated, inStream, rate, ioPackets.TotalsOf(inStream));
		return isCut ? SoundLength{ReachOf(inStream, rate, ioPackets.TotalsOf(inStream)), stated}
					 : SoundLength{stated, std::nullopt};
	}
	if (!ioPackets.IsAllRead())
	{
		if (const auto length = LengthToLastPacket(ioFile, inStream, ioPackets))
			return {Rescaled(*length, inStream.time_base, rate), std::nullopt};
		ReadFromBeginning(inStream, ioPackets);
	}
	return {Rescaled(ioPackets.TotalsOf(inStream).mDuration, inStream.time_base, rate), std::nullopt};
}

}   // namespace zonmedia
