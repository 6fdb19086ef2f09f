#pragma once

/// \file
/// Reading the packets of a media file, and what they say of the length of its streams.

#include "zonmedia/MediaInput.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <vector>

namespace zonmedia
{

/// What the packets of one stream say. Times are in the stream's own units.
struct PacketTotals
{
	std::int64_t mCount = 0;
	std::int64_t mHidden = 0;     ///< of them, that are decoded but not shown
	std::int64_t mDuration = 0;   ///< of all of them together
	std::optional<std::int64_t> mStart;
	std::int64_t mEnd = 0;              ///< where the last one to be shown ends
	std::vector<std::int64_t> mTimes;   ///< of a picture's packets that are shown, in the order of the file

	std::int64_t mUntimed = 0;   ///< packets that have no time to be shown at, other than that they are decoded at

	/// Whether mTimes are of one kind.
	bool HasTimes() const { return mUntimed == 0 || mUntimed == mCount; }
	void Add(const AVPacket& inPacket, bool inIsPicture);
};

/// Reads a file packet by packet, from where it stands to its end.
class PacketReader
{
public:
	/// Is called after each packet with the part of the file that has been read, from 0 to 1; 0 when that is unknown.
	using Progress = std::function<void(double inPart)>;

	explicit PacketReader(AVFormatContext& ioFile);

	/// The next packet, which is valid until the next call; none at the end, or where the file cannot be read any more.
	const AVPacket* Next();
	/// Reads what is left.
	void ReadAll(const Progress& inProgress);
	/// Goes to the last key frame of a stream, and forgets what was read; false when that is impossible.
	bool GoToEnd(const AVStream& inStream);
	/// Goes back to the beginning, and forgets what was read; false when that is impossible.
	bool GoToBeginning(const AVStream& inStream);

	/// What was read of a stream, from the beginning or the place that was gone to.
	const PacketTotals& TotalsOf(const AVStream& inStream) const;
	/// Whether packets were left out by going elsewhere.
	bool HasMoved() const { return mHasMoved; }
	/// Whether all packets were read, from the beginning.
	bool IsAllRead() const { return mIsAtEnd && !mHasMoved; }

private:
	bool GoTo(const AVStream& inStream, std::int64_t inTime);

	AVFormatContext& mFile;
	Packet mPacket;
	std::vector<PacketTotals> mTotals;   // a stream each
	bool mHasMoved = false;
	bool mIsAtEnd = false;
};

}   // namespace zonmedia
