#include "zonmediatypes/AudioFormat.h"

#include "zonmediatypes/src/audio/KnownLayouts.h"

#include <algorithm>
#include <tuple>

namespace zonmediatypes
{
namespace
{

std::uint32_t BytesPerSample(AudioSampleType inType)
{
	switch (inType)
	{
	case kAudioSampleType_Invalid:
		return 0;
	case kAudioSampleType_8Bit:
		return 1;
	case kAudioSampleType_16Bit:
		return 2;
	case kAudioSampleType_24Bit:
		return 3;
	case kAudioSampleType_32Bit:
		return 4;
	}
	return 0;
}

}   // namespace

AudioFormat& AudioFormat::operator=(const AudioFormat& inOther)
{
	return *this = AudioFormat(inOther);
}

AudioFormat::~AudioFormat() = default;

AudioFormat AudioFormat::CreateDefaultAudioFormat(std::uint32_t inChannelCount, std::uint32_t inSampleRate)
{
	const auto labels = DefaultLabels(inChannelCount, DefaultFor::MapsAndFormats);
	return CreateAudioFormat(
		labels.empty() ? AudioChannelLayout(inChannelCount) : AudioChannelLayout(labels.begin(), labels.end()),
		inSampleRate);
}

AudioFormat AudioFormat::CreateAudioFormat(const AudioChannelLayout& inLayout, std::uint32_t inSampleRate)
{
	AudioFormat format;
	format.mSampleRate = static_cast<std::int32_t>(inSampleRate);
	format.mSampleType = kAudioSampleType_32Bit;
	format.mChannelLayout = inLayout;
	return format;
}

bool AudioFormat::operator==(const AudioFormat& inOther) const noexcept
{
	return mSampleRate == inOther.mSampleRate && mSampleType == inOther.mSampleType
		&& mChannelLayout == inOther.mChannelLayout;
}

std::uint32_t AudioFormat::GetSampleAlignment() const noexcept
{
	return static_cast<std::uint32_t>(mChannelLayout.size()) * BytesPerSample(mSampleType);
}

void AudioFormat::GetChannelLayout(AudioChannelLayout& outLayout) const
{
	if (&outLayout == &mChannelLayout)
		return;
	AudioChannelLayout layout = mChannelLayout;
	outLayout.swap(layout);
}

void AudioFormat::SetChannelLayout(const AudioChannelLayout& inLayout)
{
	if (&inLayout == &mChannelLayout)
		return;
	AudioChannelLayout layout = inLayout;
	mChannelLayout.swap(layout);
}

std::size_t AudioFormat::GetChannelIndex(const AudioChannelDescription& inChannel) const noexcept
{
	return static_cast<std::size_t>(std::ranges::find(mChannelLayout, inChannel) - mChannelLayout.begin());
}

AudioChannelDescription AudioFormat::GetChannelDescription(std::size_t inIndex) const noexcept
{
	return inIndex < mChannelLayout.size() ? mChannelLayout[inIndex] : AudioChannelDescription();
}

void NormalizeChannelOrder(AudioFormat& ioFormat)
{
	AudioChannelLayout layout = ioFormat.GetChannelLayout();
	std::ranges::sort(layout);   // equal labels cannot be told apart: no need of a stable sort
	ioFormat.SetChannelLayout(layout);
}

bool AudioFormatExactCompare::operator()(const AudioFormat& inLHS, const AudioFormat& inRHS) const noexcept
{
	if (inLHS.GetSampleRate() != inRHS.GetSampleRate())
		return inLHS.GetSampleRate() < inRHS.GetSampleRate();
	if (inLHS.GetChannelLayout() != inRHS.GetChannelLayout())
		return inLHS.GetChannelLayout() < inRHS.GetChannelLayout();
	return inLHS.GetSampleType() < inRHS.GetSampleType();
}

bool AudioFormatSimpleCompare::operator()(const AudioFormat& inLHS, const AudioFormat& inRHS) const noexcept
{
	const auto key = [](const AudioFormat& inFormat)
	{ return std::tuple(inFormat.GetSampleRate(), inFormat.GetChannelCount(), inFormat.GetSampleType()); };
	return key(inLHS) < key(inRHS);
}

}   // namespace zonmediatypes
