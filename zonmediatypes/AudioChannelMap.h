#pragma once

/// \file
/// How the channels of a stream are routed to the channels of a device.

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Export.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace zonmediatypes
{

/// An ordered list of entries, each of which carries labels and is assigned to a channel, or to none.
///
///     ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);                     // L to channel 0, R to channel 1
///     map.SetDeviceChannelIndexForChannelLabel(kAudioChannelLabel_FrontLeft, 1);   // R and L to channel 1
///     map.GetSourceChannelIndexForChannelLabel(kAudioChannelLabel_FrontLeft);      // 1
///
/// An entry's number outside the map is harmless: there is nothing to get there, and nothing to set.
class ZONMEDIATYPES_API ChannelMap
{
public:
	/// No entries.
	ChannelMap() = default;

	/// inChannelCount entries, each with one label in the canonical order (L R C LFE Ls Rs Lc Rc Cs ...) and label -1
	/// beyond its 36 labels; none is assigned. A count below 1 gives no entries.
	explicit ChannelMap(std::int32_t inChannelCount);

	/// One entry for each channel of inLayout, with its label; none is assigned.
	explicit ChannelMap(const AudioChannelLayout& inLayout);

	ChannelMap(const ChannelMap& inOther) = default;
	ChannelMap(ChannelMap&& ioOther) noexcept = default;
	ChannelMap& operator=(const ChannelMap& inOther);
	ChannelMap& operator=(ChannelMap&& ioOther) noexcept = default;
	virtual ~ChannelMap();

	/// The usual labels of 1 (mono), 2 (stereo) or 6 (broadcast 5.1) channels, or those of the canonical order for any other
	/// count; entry k is assigned to channel k.
	static ChannelMap CreateDefaultChannelMap(std::int32_t inChannelCount);

	/// The labels that entry inIndex carries; empty outside the map.
	AudioChannelLayout GetChannelLayout(std::int32_t inIndex) const;
	/// Replaces the labels of entry inIndex.
	void SetChannelLayout(std::int32_t inIndex, const AudioChannelLayout& inLayout);

	/// Assigns entry inIndex to a channel; a negative one is none.
	void SetChannel(std::int32_t inIndex, std::int32_t inAssignment) noexcept;
	/// The channel of entry inIndex; -1 outside the map.
	std::int32_t operator[](std::int32_t inIndex) const noexcept;

	/// The number of entries.
	std::size_t GetNumberOfChannels() const noexcept;
	/// The labels routed to channels of this map: for each entry that is assigned to a channel number below the number of
	/// entries, the labels of the entry *of that number*, added up.
	std::uint32_t GetNumberOfAssignments() const noexcept;

	/// The channel of the first entry that carries inLabel; -1 when none does.
	std::int32_t GetSourceChannelIndexForChannelLabel(AudioChannelLabel inLabel) const noexcept;
	/// The same for the label at a place of the canonical order, 0 ... 35; -2 for any other place.
	std::int32_t GetSourceChannelIndexForChannelLabelIndex(std::int32_t inLabelIndex) const noexcept;

	/// Moves a label to a channel: takes it from the first entry that carries it, and puts it last in the first entry that is
	/// assigned to inChannel, or in a new entry at the end. A negative channel only takes the label away. When the label is
	/// on the channel already, it becomes the last of its entry.
	///
	/// An entry that is left without labels goes. Deliberately the labels that go are the first empty ones, and the
	/// assignment that goes is the first one to that channel: where entries were empty before, or channels were assigned
	/// more than once, that can re-route other labels. Takes time in proportion to the whole map.
	void SetDeviceChannelIndexForChannelLabel(AudioChannelLabel inLabel, std::int32_t inChannel);

	/// The first entry that is assigned to inAssignment; -1 when none is.
	std::int32_t Find(std::int32_t inAssignment) const noexcept;

	/// Appends an entry.
	void AddChannel(const AudioChannelLayout& inLayout, std::int32_t inAssignment);

	/// Whether the same labels, in order, are assigned to the same channels.
	bool operator==(const ChannelMap& inOther) const noexcept;

private:
	ZONMEDIATYPES_INTERNAL bool Contains(std::int32_t inIndex) const noexcept;
	ZONMEDIATYPES_INTERNAL void RemoveLabel(AudioChannelLabel inLabel) noexcept;
	ZONMEDIATYPES_INTERNAL void PlaceLabel(AudioChannelLabel inLabel, std::int32_t inChannel);

	std::vector<AudioChannelLayout> mLayouts;
	std::vector<std::int32_t> mAssignments;   // as many as layouts
};

}   // namespace zonmediatypes
