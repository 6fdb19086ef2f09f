#include "zonmedia/PacketReader.h"

#include <algorithm>
#include <limits>
#include <new>

extern "C"
{
#include <libavutil/avutil.h>
#include <libavutil/common.h>
#include <libavutil/mathematics.h>
}

namespace zonmedia
{

void PacketTotals::Add(const AVPacket& inPacket, bool inIsPicture)
{
	const std::int64_t duration
		= std::clamp<std::int64_t>(inPacket.duration, 0, std::numeric_limits<std::int32_t>::max());
	const std::int64_t time = inPacket.pts != AV_NOPTS_VALUE ? inPacket.pts : inPacket.dts;
	constexpr std::int64_t kMostTime = std::numeric_limits<std::int64_t>::max() / 4;   // differences of these fit
	const bool isHidden = (inPacket.flags & AV_PKT_FLAG_DISCARD) != 0;
	++mCount;
	mHidden += isHidden ? 1 : 0;
	mUntimed += inPacket.pts == AV_NOPTS_VALUE ? 1 : 0;
	mDuration += duration;
	if (isHidden || time < -kMostTime || time > kMostTime)   // or AV_NOPTS_VALUE
		return;
	mEnd = std::max(time + duration, mStart ? mEnd : time + duration);
	mStart = std::min(time, mStart.value_or(time));
	if (inIsPicture)
		mTimes.push_back(time);
}

PacketReader::PacketReader(AVFormatContext& ioFile)
	: mFile(ioFile), mPacket(av_packet_alloc()), mTotals(ioFile.nb_streams)
{
	if (mPacket == nullptr)
		throw std::bad_alloc();
}

const AVPacket* PacketReader::Next()
{
	av_packet_unref(mPacket.get());
	mIsAtEnd = mIsAtEnd || av_read_frame(&mFile, mPacket.get()) < 0;
	if (mIsAtEnd)
		return nullptr;
	// Streams may begin in the middle of a file.
	const auto index = static_cast<std::size_t>(mPacket->stream_index);
	mTotals.resize(std::max(mTotals.size(), index + 1));
	const bool isPicture = mFile.streams[index]->codecpar->codec_type == AVMEDIA_TYPE_VIDEO;
	mTotals[index].Add(*mPacket, isPicture);
	return mPacket.get();
}

const PacketTotals& PacketReader::TotalsOf(const AVStream& inStream) const
{
	static const PacketTotals sNone;
	const auto index = static_cast<std::size_t>(inStream.index);
	return index < mTotals.size() ? mTotals[index] : sNone;
}

void PacketReader::ReadAll(const Progress& inProgress)
{
	const std::int64_t size = mFile.pb != nullptr ? avio_size(mFile.pb) : 0;
	while (Next() != nullptr)
	{
		const double read = size > 0 ? static_cast<double>(avio_tell(mFile.pb)) / static_cast<double>(size) : 0.0;
		if (inProgress)
			inProgress(std::clamp(read, 0.0, 1.0));
	}
}

bool PacketReader::GoTo(const AVStream& inStream, std::int64_t inTime)
{
	if (mFile.pb == nullptr || (mFile.pb->seekable & AVIO_SEEKABLE_NORMAL) == 0
		|| av_seek_frame(&mFile, inStream.index, inTime, AVSEEK_FLAG_BACKWARD) < 0)
		return false;
	std::ranges::fill(mTotals, PacketTotals());
	mIsAtEnd = false;
	return true;
}

bool PacketReader::GoToEnd(const AVStream& inStream)
{
	if (mFile.duration == AV_NOPTS_VALUE || mFile.start_time == AV_NOPTS_VALUE)
		return false;
	const std::int64_t last = av_sat_add64(mFile.start_time, mFile.duration);
	const std::int64_t end = av_rescale_q(last, av_get_time_base_q(), inStream.time_base);
	const bool isThere = GoTo(inStream, end);
	mHasMoved = mHasMoved || isThere;
	return isThere;
}

bool PacketReader::GoToBeginning(const AVStream& inStream)
{
	const std::int64_t start = inStream.start_time;
	const bool isThere = GoTo(inStream, start == AV_NOPTS_VALUE ? 0 : start);
	mHasMoved = mHasMoved && !isThere;
	return isThere;
}

}   // namespace zonmedia
