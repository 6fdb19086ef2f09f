#pragma once

/// \file
/// The format of an audio stream: sample rate, sample type and the channels in order.

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Export.h"

#include <cstddef>
#include <cstdint>

namespace zonmediatypes
{

/// How many bytes a sample takes, times ten. It does not tell integers from floating point, nor the order of bytes.
enum AudioSampleType : std::int32_t
{
	kAudioSampleType_Invalid = 0,
	kAudioSampleType_8Bit = 10,
	kAudioSampleType_16Bit = 20,
	kAudioSampleType_24Bit = 30,
	kAudioSampleType_32Bit = 40,
};

/// The sample rate that says that none is known.
inline constexpr std::int32_t kAudioSampleRate_Invalid = -1;

/// A format; meant to be derived from by what adds fields of its own.
///
///     AudioFormat format = AudioFormat::CreateDefaultAudioFormat(6, 48000);   // L R C LFE Ls Rs, 32 bits
///     format.SetSampleType(kAudioSampleType_24Bit);
///     format.GetSampleAlignment();                                           // 18
class ZONMEDIATYPES_API AudioFormat
{
public:
	/// Rate 0, type kAudioSampleType_Invalid, no channels.
	AudioFormat() = default;
	AudioFormat(const AudioFormat& inOther) = default;
	AudioFormat(AudioFormat&& ioOther) noexcept = default;
	AudioFormat& operator=(const AudioFormat& inOther);
	AudioFormat& operator=(AudioFormat&& ioOther) noexcept = default;
	virtual ~AudioFormat();

	/// A format of 32-bit samples. 2 and 6 channels are labelled L R and L R C LFE Ls Rs, any other number of channels is
	/// `Discrete`, deliberately also 4 and 8, which CreateMultichannelLayoutWithDefaultLabels labels. Rates above 2147483647
	/// are stored modulo 2^32.
	static AudioFormat CreateDefaultAudioFormat(std::uint32_t inChannelCount, std::uint32_t inSampleRate);
	/// The same with the channels of inLayout.
	static AudioFormat CreateAudioFormat(const AudioChannelLayout& inLayout, std::uint32_t inSampleRate);

	/// Whether rate, type and the labels in order are the same.
	bool operator==(const AudioFormat& inOther) const noexcept;

	/// Samples per second; any number is stored as it is.
	std::int32_t GetSampleRate() const noexcept { return mSampleRate; }
	void SetSampleRate(std::int32_t inSampleRate) noexcept { mSampleRate = inSampleRate; }

	AudioSampleType GetSampleType() const noexcept { return mSampleType; }
	void SetSampleType(AudioSampleType inSampleType) noexcept { mSampleType = inSampleType; }

	std::size_t GetChannelCount() const noexcept { return mChannelLayout.size(); }

	/// The bytes of one sample of all channels; 0 for a sample type that is none of the above. Wraps at 32 bits.
	std::uint32_t GetSampleAlignment() const noexcept;

	const AudioChannelLayout& GetChannelLayout() const noexcept { return mChannelLayout; }
	/// Copies the layout; outLayout may be the format's own.
	void GetChannelLayout(AudioChannelLayout& outLayout) const;
	/// Replaces the layout; inLayout may be the format's own.
	void SetChannelLayout(const AudioChannelLayout& inLayout);

	/// The first channel with that label; the channel count when there is none.
	std::size_t GetChannelIndex(const AudioChannelDescription& inChannel) const noexcept;
	/// The channel at inIndex; `Discrete` beyond the channel count.
	AudioChannelDescription GetChannelDescription(std::size_t inIndex) const noexcept;

private:
	std::int32_t mSampleRate = 0;
	AudioSampleType mSampleType = kAudioSampleType_Invalid;
	AudioChannelLayout mChannelLayout;
};

/// Sorts the channels by ascending label number. It moves labels, not audio.
ZONMEDIATYPES_API void NormalizeChannelOrder(AudioFormat& ioFormat);

/// A strict weak order over every field: by rate, then by layout as a word of label numbers, then by type. Type counts
/// between equal layouts only.
struct ZONMEDIATYPES_API AudioFormatExactCompare
{
	bool operator()(const AudioFormat& inLHS, const AudioFormat& inRHS) const noexcept;
};

/// A strict weak order by rate, channel count and type: formats that differ in channel labels only are equivalent.
struct ZONMEDIATYPES_API AudioFormatSimpleCompare
{
	bool operator()(const AudioFormat& inLHS, const AudioFormat& inRHS) const noexcept;
};

}   // namespace zonmediatypes
