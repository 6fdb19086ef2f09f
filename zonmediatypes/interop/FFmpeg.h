#pragma once

/// \file
/// Values of FFmpeg's libraries and ours. For programs that use FFmpeg: they bring its headers and link libavutil.
///
///     const auto start = ToTickTime(stream->start_time, stream->time_base, Rounding::Nearest);
///     const auto rate = ToFrameRate(stream->avg_frame_rate);                           // 30000/1001: kFrameRate_VideoNTSC
///
///     AudioChannelLayout layout = ToAudioChannelLayout(stream->codecpar->ch_layout);   // 5.1(side): L R C LFE Ls Rs
///
///     AVChannelLayout wanted = ToAVChannelLayout(CreateLegacy51ChannelLayout());
///     av_channel_layout_copy(&codec->ch_layout, &wanted);
///     av_channel_layout_uninit(&wanted);
///
///     PixelFormat format = ToPixelFormat(*stream->codecpar, stream->avg_frame_rate);   // or kPixelFormat_Invalid
///     PixelAspectRatio ratio = ToPixelAspectRatio(av_guess_sample_aspect_ratio(file, stream, nullptr));
///     FieldType fields = ToFieldType(stream->codecpar->field_order, file->iformat->name);

#include "zonmediatypes/AudioChannelLayout.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/PixelAspectRatio.h"
#include "zonmediatypes/PixelFormatSize.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeBase.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <iterator>
#include <limits>
#include <new>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

extern "C"
{
#include <libavcodec/codec_id.h>
#include <libavcodec/codec_par.h>
#include <libavutil/avutil.h>
#include <libavutil/channel_layout.h>
#include <libavutil/mem.h>
#include <libavutil/pixfmt.h>
#include <libavutil/rational.h>
}

namespace zonmediatypes
{

// ---- Time ------------------------------------------------------------------------------------------------------------

/// The time base of a stream; empty unless both terms are positive.
constexpr std::optional<TimeBase> ToTimeBase(AVRational inSecondsPerUnit) noexcept;

/// The reduced ratio of a time base; empty when a term does not fit 32 bits.
constexpr std::optional<AVRational> ToAVRational(TimeBase inTimeBase) noexcept;

/// The time of a timestamp; empty for AV_NOPTS_VALUE, an unusable time base, and what does not fit.
constexpr std::optional<TickTime> ToTickTime(
	std::int64_t inTimestamp, AVRational inTimeBase, Rounding inRounding) noexcept;

/// The timestamp of a time; AV_NOPTS_VALUE for kTime_Invalid, an unusable time base, and what does not fit.
constexpr std::int64_t ToTimestamp(TickTime inTime, AVRational inTimeBase, Rounding inRounding) noexcept;

/// The rate of that many frames a second. A numerator of 0, by which FFmpeg says that a rate is not known, is
/// kFrameRate_Zero; empty for a negative rate, a denominator of 0, and a frame that is no whole number of ticks.
constexpr std::optional<FrameRate> ToFrameRate(AVRational inFramesPerSecond) noexcept;

/// The frames a second in lowest terms, 0/1 for kFrameRate_Zero; empty for a duration of 0 or below and when a term does
/// not fit 32 bits.
constexpr std::optional<AVRational> ToAVRational(FrameRate inRate) noexcept;

// ---- Audio -----------------------------------------------------------------------------------------------------------

/// A speaker of FFmpeg's and the label of the same role.
struct AVChannelRole
{
	AVChannel mChannel;
	AudioChannelLabel mLabel;
};

/// All roles. The surrounds stand here as they are where a layout has both pairs; where it has one pair only, at the side
/// or at the back, that is Ls Rs.
// clang-format off
inline constexpr auto kAVChannelRoles = std::to_array<AVChannelRole>({
	{AV_CHAN_FRONT_LEFT,            kAudioChannelLabel_FrontLeft},
	{AV_CHAN_FRONT_RIGHT,           kAudioChannelLabel_FrontRight},
	{AV_CHAN_FRONT_CENTER,          kAudioChannelLabel_FrontCenter},
	{AV_CHAN_LOW_FREQUENCY,         kAudioChannelLabel_LowFrequency},
	{AV_CHAN_SIDE_LEFT,             kAudioChannelLabel_BackLeft},
	{AV_CHAN_SIDE_RIGHT,            kAudioChannelLabel_BackRight},
	{AV_CHAN_BACK_LEFT,             kAudioChannelLabel_RearSurroundLeft},
	{AV_CHAN_BACK_RIGHT,            kAudioChannelLabel_RearSurroundRight},
	{AV_CHAN_FRONT_LEFT_OF_CENTER,  kAudioChannelLabel_FrontLeftOfCenter},
	{AV_CHAN_FRONT_RIGHT_OF_CENTER, kAudioChannelLabel_FrontRightOfCenter},
	{AV_CHAN_BACK_CENTER,           kAudioChannelLabel_BackCenter},
	{AV_CHAN_TOP_CENTER,            kAudioChannelLabel_TopCenter},
	{AV_CHAN_TOP_FRONT_LEFT,        kAudioChannelLabel_TopFrontLeft},
	{AV_CHAN_TOP_FRONT_CENTER,      kAudioChannelLabel_TopFrontCenter},
	{AV_CHAN_TOP_FRONT_RIGHT,       kAudioChannelLabel_TopFrontRight},
	{AV_CHAN_TOP_BACK_LEFT,         kAudioChannelLabel_TopBackLeft},
	{AV_CHAN_TOP_BACK_CENTER,       kAudioChannelLabel_TopBackCenter},
	{AV_CHAN_TOP_BACK_RIGHT,        kAudioChannelLabel_TopBackRight},
	{AV_CHAN_LOW_FREQUENCY_2,       kAudioChannelLabel_LFE2},
	{AV_CHAN_TOP_SIDE_LEFT,         kAudioChannelLabel_LeftHeight},
	{AV_CHAN_TOP_SIDE_RIGHT,        kAudioChannelLabel_RightHeight},
	{AV_CHAN_BOTTOM_FRONT_LEFT,     kAudioChannelLabel_BottomFrontLeft},
	{AV_CHAN_BOTTOM_FRONT_CENTER,   kAudioChannelLabel_BottomFrontCenter},
	{AV_CHAN_BOTTOM_FRONT_RIGHT,    kAudioChannelLabel_BottomFrontRight},
	{AV_CHAN_WIDE_LEFT,             kAudioChannelLabel_FrontLeftWide},
	{AV_CHAN_WIDE_RIGHT,            kAudioChannelLabel_FrontRightWide},
	{AV_CHAN_STEREO_LEFT,           kAudioChannelLabel_LeftTotal},
	{AV_CHAN_STEREO_RIGHT,          kAudioChannelLabel_RightTotal},
	{AV_CHAN_SURROUND_DIRECT_LEFT,  kAudioChannelLabel_SideLeft},
	{AV_CHAN_SURROUND_DIRECT_RIGHT, kAudioChannelLabel_SideRight},
});
// clang-format on

/// The layout of a stream. Channels keep their order and are known by their speakers: what is no speaker of the table is
/// `Discrete`, and so are all channels of a layout of which only their number is known. A lone centre is mono: `Discrete`.
/// 7.1 has the rear pair before the side pair, other than Create7_1ItuChannelLayout(): RemapChannelOrdering() tells how.
/// An invalid layout gives an empty one.
AudioChannelLayout ToAudioChannelLayout(const AVChannelLayout& inLayout);

/// FFmpeg's layout for inLayout, to be given to av_channel_layout_uninit(): in the native order where the channels stand in
/// it, else with a map of its own. Channels that are all `Discrete` are mono or a mere number of channels; next to others
/// they are unknown ones. A single surround pair is the one at the back, as in FFmpeg's default layouts.
///
/// A layout without channels is the result when there is nothing to convert, and when a label has no counterpart (the
/// Ambisonics components, Pl, Pr and numbers that name no label). Throws std::bad_alloc when memory runs out.
AVChannelLayout ToAVChannelLayout(const AudioChannelLayout& inLayout);

// ---- Video -----------------------------------------------------------------------------------------------------------

/// The format of the frames of a video stream; kPixelFormat_Invalid where ours has no counterpart. Those that have one:
/// - uyvy422 and yuyv422, and v210, by their matrix; bgra, argb, bgr0, 0rgb and r210;
/// - DV by its frame size, its chroma and, where NTSC and PAL are of one size (960x720), by inFrameRate;
/// - yuv420p of MPEG-2 and of MPEG-4 part 2 by field order, matrix and range. Streams in fields are field pictures; those
///   that do not say are frame pictures.
///
/// A matrix that is not stated is Rec. 709 for frames of more than 576 lines and else Rec. 601, a range that is not stated
/// is video range for YUV and full range for RGB. Other matrices have no counterpart.
PixelFormat ToPixelFormat(const AVCodecParameters& inParameters, AVRational inFrameRate);

/// The field that is shown first in a stream of a file; kFieldType_Invalid when that is not known. inFormat is the name of
/// the format that the order was read from, `file->iformat->name`, because AV_FIELD_TB and AV_FIELD_BT mean two things: in
/// QuickTime and Matroska the lines of both fields lie interleaved, and the top (TB) or the bottom field (BT) is the earlier
/// one; everywhere else the one field is stored first and the other one shown first.
///
/// What a file says may be wrong. A decoded frame of a codec that knows (`interlaced_frame`, `top_field_first`) is surer.
FieldType ToFieldType(AVFieldOrder inOrder, std::string_view inFormat);

/// As above for AV_FIELD_TT, AV_FIELD_BB and AV_FIELD_PROGRESSIVE, which mean one thing everywhere; AV_FIELD_TB and
/// AV_FIELD_BT are kFieldType_Invalid.
[[deprecated("say where the order comes from: ToFieldType(order, file->iformat->name)")]] FieldType ToFieldType(
	AVFieldOrder inOrder);

/// A stream's sample aspect ratio as it is; kPixelAspectRatio_Unknown when it is not known, or not positive.
PixelAspectRatio ToPixelAspectRatio(AVRational inRatio);

/// The ratio for a stream, or the closest one whose terms fit; 0/1, FFmpeg's "unknown", where a term is 0.
AVRational ToSampleAspectRatio(PixelAspectRatio inRatio);

// ======================================================================================================================
// Inline implementation

namespace detail
{

constexpr std::optional<AVRational> NarrowRatio(std::int64_t inNumerator, std::int64_t inDenominator) noexcept
{
	if (!std::in_range<int>(inNumerator) || !std::in_range<int>(inDenominator))
		return std::nullopt;
	return AVRational{static_cast<int>(inNumerator), static_cast<int>(inDenominator)};
}

constexpr AudioChannelLabel LabelOfRole(AVChannel inChannel)
{
	const auto role = std::ranges::find(kAVChannelRoles, inChannel, &AVChannelRole::mChannel);
	return role != kAVChannelRoles.end() ? role->mLabel : kAudioChannelLabel_Discrete;
}

constexpr AVChannel ChannelOfRole(AudioChannelLabel inLabel)
{
	const auto role = std::ranges::find(kAVChannelRoles, inLabel, &AVChannelRole::mLabel);
	return role != kAVChannelRoles.end() ? role->mChannel : AV_CHAN_NONE;
}

// The surround that stands in for a rear one where there is one pair only.
constexpr AudioChannelLabel SurroundOf(AudioChannelLabel inLabel)
{
	if (inLabel == kAudioChannelLabel_RearSurroundLeft)
		return kAudioChannelLabel_BackLeft;
	if (inLabel == kAudioChannelLabel_RearSurroundRight)
		return kAudioChannelLabel_BackRight;
	return inLabel;
}

constexpr AudioChannelLabel RearSurroundOf(AudioChannelLabel inLabel)
{
	if (inLabel == kAudioChannelLabel_BackLeft)
		return kAudioChannelLabel_RearSurroundLeft;
	if (inLabel == kAudioChannelLabel_BackRight)
		return kAudioChannelLabel_RearSurroundRight;
	return inLabel;
}

inline bool HasBothSurroundPairs(const AVChannelLayout& inLayout)
{
	const auto has
		= [&](AVChannel inChannel) { return av_channel_layout_index_from_channel(&inLayout, inChannel) >= 0; };
	return (has(AV_CHAN_SIDE_LEFT) || has(AV_CHAN_SIDE_RIGHT)) && (has(AV_CHAN_BACK_LEFT) || has(AV_CHAN_BACK_RIGHT));
}

inline bool HasRearSurrounds(const AudioChannelLayout& inLayout)
{
	return HasChannelLabel(inLayout, kAudioChannelLabel_RearSurroundLeft)
		|| HasChannelLabel(inLayout, kAudioChannelLabel_RearSurroundRight);
}

// The speakers of a layout that has labels; AV_CHAN_NONE where a label has no counterpart.
inline std::vector<AVChannel> Speakers(const AudioChannelLayout& inLayout)
{
	const bool hasRearSurrounds = HasRearSurrounds(inLayout);
	std::vector<AVChannel> speakers(inLayout.size(), AV_CHAN_UNKNOWN);
	for (std::size_t i = 0; i < speakers.size(); ++i)
	{
		const AudioChannelLabel label = inLayout[i].mLabel;
		if (label != kAudioChannelLabel_Discrete)
			speakers[i] = ChannelOfRole(hasRearSurrounds ? label : RearSurroundOf(label));
	}
	return speakers;
}

// Whether the speakers, all of them known, stand in FFmpeg's native order, each once.
inline bool IsNativeOrder(const std::vector<AVChannel>& inSpeakers)
{
	return inSpeakers.back() < std::numeric_limits<std::uint64_t>::digits
		&& std::ranges::adjacent_find(inSpeakers, std::ranges::greater_equal()) == inSpeakers.end();
}

inline AVChannelLayout CountedLayout(std::size_t inCount)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_UNSPEC;
	layout.nb_channels = static_cast<int>(inCount);
	return layout;
}

inline AVChannelLayout NativeLayout(const std::vector<AVChannel>& inSpeakers)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_NATIVE;
	layout.nb_channels = static_cast<int>(inSpeakers.size());
	for (const AVChannel speaker : inSpeakers)
		layout.u.mask |= std::uint64_t{1} << speaker;
	return layout;
}

inline AVChannelLayout MappedLayout(const std::vector<AVChannel>& inSpeakers)
{
	AVChannelLayout layout{};
	layout.order = AV_CHANNEL_ORDER_CUSTOM;
	layout.nb_channels = static_cast<int>(inSpeakers.size());
	layout.u.map = static_cast<AVChannelCustom*>(av_calloc(inSpeakers.size(), sizeof(AVChannelCustom)));
	if (layout.u.map == nullptr)
		throw std::bad_alloc();
	for (std::size_t i = 0; i < inSpeakers.size(); ++i)
		layout.u.map[i].id = inSpeakers[i];
	return layout;
}

}   // namespace detail

constexpr std::optional<TimeBase> ToTimeBase(AVRational inSecondsPerUnit) noexcept
{
	return TimeBase::FromRatio(inSecondsPerUnit.num, inSecondsPerUnit.den);
}

constexpr std::optional<AVRational> ToAVRational(TimeBase inTimeBase) noexcept
{
	const auto ratio = inTimeBase.ToRatio();
	return ratio ? detail::NarrowRatio(ratio->mNumerator, ratio->mDenominator) : std::nullopt;
}

constexpr std::optional<TickTime> ToTickTime(
	std::int64_t inTimestamp, AVRational inTimeBase, Rounding inRounding) noexcept
{
	const auto base = ToTimeBase(inTimeBase);
	return base && inTimestamp != AV_NOPTS_VALUE ? base->ToTicks(inTimestamp, inRounding) : std::nullopt;
}

constexpr std::int64_t ToTimestamp(TickTime inTime, AVRational inTimeBase, Rounding inRounding) noexcept
{
	const auto base = ToTimeBase(inTimeBase);
	return base && inTime != kTime_Invalid ? base->FromTicks(inTime, inRounding).value_or(AV_NOPTS_VALUE)
										   : AV_NOPTS_VALUE;
}

constexpr std::optional<FrameRate> ToFrameRate(AVRational inFramesPerSecond) noexcept
{
	if (inFramesPerSecond.num == 0 && inFramesPerSecond.den != 0)
		return kFrameRate_Zero;
	const auto base = TimeBase::FromRatio(inFramesPerSecond.den, inFramesPerSecond.num);
	const auto ticks = base && base->IsExact() ? base->ToTicks(1, Rounding::TowardZero) : std::nullopt;
	return ticks ? std::optional(FrameRate(ticks->GetTicks())) : std::nullopt;
}

constexpr std::optional<AVRational> ToAVRational(FrameRate inRate) noexcept
{
	if (inRate == kFrameRate_Zero)
		return AVRational{0, 1};
	const auto base = TimeBase::FromRate(inRate);
	const auto ratio = base ? base->ToRatio() : std::nullopt;
	return ratio ? detail::NarrowRatio(ratio->mDenominator, ratio->mNumerator) : std::nullopt;
}

inline AudioChannelLayout ToAudioChannelLayout(const AVChannelLayout& inLayout)
{
	AudioChannelLayout layout(static_cast<std::size_t>(std::max(inLayout.nb_channels, 0)));
	const bool hasBothPairs = detail::HasBothSurroundPairs(inLayout);
	for (std::size_t i = 0; i < layout.size(); ++i)
	{
		const AVChannel speaker = av_channel_layout_channel_from_index(&inLayout, static_cast<unsigned>(i));
		const AudioChannelLabel label = detail::LabelOfRole(speaker);
		layout[i] = hasBothPairs ? label : detail::SurroundOf(label);
	}
	if (layout.size() == 1 && layout.front() == kAudioChannelLabel_FrontCenter)
		layout.front() = kAudioChannelLabel_Discrete;
	return layout;
}

inline AVChannelLayout ToAVChannelLayout(const AudioChannelLayout& inLayout)
{
	if (inLayout.empty() || inLayout.size() > std::size_t{std::numeric_limits<int>::max()})
		return {};
	if (!HasChannelLabeling(inLayout))
		return inLayout.size() == 1 ? detail::NativeLayout({AV_CHAN_FRONT_CENTER})
									: detail::CountedLayout(inLayout.size());
	const std::vector<AVChannel> speakers = detail::Speakers(inLayout);
	if (std::ranges::find(speakers, AV_CHAN_NONE) != speakers.end())
		return {};
	return detail::IsNativeOrder(speakers) ? detail::NativeLayout(speakers) : detail::MappedLayout(speakers);
}

namespace detail
{

// The built-in format with these properties; kPixelFormat_Invalid when there is none.
inline PixelFormat FormatWith(PixelFormatProperties inProperties)
{
	const PixelFormatName name = GuessNameForProperties(inProperties);
	return name != kPixelFormatFourCC_Invalid ? PixelFormat{name, inProperties} : kPixelFormat_Invalid;
}

// The sibling of a YUV format that has the stream's matrix and range.
inline PixelFormat WithColour(PixelFormatProperties inProperties, const AVCodecParameters& inParameters)
{
	constexpr int kMostLinesOfSD = 576;
	inProperties.SetIsVideoRange(inParameters.color_range != AVCOL_RANGE_JPEG);
	switch (inParameters.color_space)
	{
	case AVCOL_SPC_BT709:
		inProperties.SetIs709(true);
		break;
	case AVCOL_SPC_BT470BG:
	case AVCOL_SPC_SMPTE170M:
		inProperties.SetIs709(false);
		break;
	case AVCOL_SPC_UNSPECIFIED:
		inProperties.SetIs709(inParameters.height > kMostLinesOfSD);
		break;
	default:   // there are more in every version of FFmpeg
		return kPixelFormat_Invalid;
	}
	return FormatWith(inProperties);
}

inline PixelFormat InFullRange(PixelFormat inFormat, const AVCodecParameters& inParameters)
{
	return inParameters.color_range != AVCOL_RANGE_MPEG ? inFormat : kPixelFormat_Invalid;
}

// In fields, when it says so.
inline PixelFormat MPEGFormat(const AVCodecParameters& inParameters, unsigned inFrameCode, unsigned inFieldCode)
{
	if (inParameters.format != AV_PIX_FMT_YUV420P)
		return kPixelFormat_Invalid;
	const bool isFrame
		= inParameters.field_order == AV_FIELD_PROGRESSIVE || inParameters.field_order == AV_FIELD_UNKNOWN;
	PixelFormatProperties properties = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601.mProperties;
	properties.SetCompression(isFrame ? inFrameCode : inFieldCode);
	return WithColour(properties, inParameters);
}

inline bool IsPALRate(AVRational inFrameRate)
{
	return av_cmp_q(inFrameRate, {25, 1}) == 0 || av_cmp_q(inFrameRate, {50, 1}) == 0;
}

inline bool HasSizeOf(PixelFormat inFormat, const AVCodecParameters& inParameters)
{
	int width = 0;
	int height = 0;
	FixedSizedFormatDimensions(inFormat, width, height);
	return inParameters.width == width && inParameters.height == height;
}

inline PixelFormat DVFormat(const AVCodecParameters& inParameters, AVRational inFrameRate)
{
	struct Variant
	{
		AVPixelFormat mChroma;
		PixelFormat mFormat;
	};
	const Variant variants[] = {
		{AV_PIX_FMT_YUV411P, kPixelFormat_NTSCDV25},
		{AV_PIX_FMT_YUV420P, kPixelFormat_PALDV25},
		{AV_PIX_FMT_YUV411P, kPixelFormat_PALDV25},   // as DVCPRO has it
		{AV_PIX_FMT_YUV422P, kPixelFormat_NTSCDV50},
		{AV_PIX_FMT_YUV422P, kPixelFormat_PALDV50},
		{AV_PIX_FMT_YUV422P, kPixelFormat_NTSC_DV100_1080i},
		{AV_PIX_FMT_YUV422P, kPixelFormat_PAL_DV100_1080i},
		{AV_PIX_FMT_YUV422P, IsPALRate(inFrameRate) ? kPixelFormat_PAL_DV100_720p : kPixelFormat_NTSC_DV100_720p},
	};
	const auto variant = std::ranges::find_if(variants,
		[&](const Variant& inVariant)
		{ return inParameters.format == inVariant.mChroma && HasSizeOf(inVariant.mFormat, inParameters); });
	return variant != std::end(variants) ? variant->mFormat : kPixelFormat_Invalid;
}

// Of codecs that deliver the packed formats as they are.
inline PixelFormat PackedFormat(const AVCodecParameters& inParameters)
{
	switch (inParameters.format)
	{
	case AV_PIX_FMT_UYVY422:
		return WithColour(kPixelFormat_UYVY_422_8u.mProperties, inParameters);
	case AV_PIX_FMT_YUYV422:
		return WithColour(kPixelFormat_YUYV_422_8u.mProperties, inParameters);
	case AV_PIX_FMT_BGRA:
		return InFullRange(kPixelFormat_BGRA_4444_8u, inParameters);
	case AV_PIX_FMT_ARGB:
		return InFullRange(kPixelFormat_ARGB_4444_8u, inParameters);
	case AV_PIX_FMT_BGR0:
		return InFullRange(kPixelFormat_BGRX_4444_8u, inParameters);
	case AV_PIX_FMT_0RGB:
		return InFullRange(kPixelFormat_XRGB_4444_8u, inParameters);
	}
	return kPixelFormat_Invalid;
}

}   // namespace detail

inline PixelFormat ToPixelFormat(const AVCodecParameters& inParameters, AVRational inFrameRate)
{
	switch (inParameters.codec_id)
	{
	case AV_CODEC_ID_DVVIDEO:
		return detail::DVFormat(inParameters, inFrameRate);
	case AV_CODEC_ID_MPEG2VIDEO:
		return detail::MPEGFormat(inParameters, kPixelFormatCompression_MPEG2Frame, kPixelFormatCompression_MPEG2Field);
	case AV_CODEC_ID_MPEG4:
		return detail::MPEGFormat(inParameters, kPixelFormatCompression_MPEG4Frame, kPixelFormatCompression_MPEG4Field);
	case AV_CODEC_ID_V210:
		return detail::WithColour(kPixelFormat_V210_422_10u.mProperties, inParameters);
	case AV_CODEC_ID_R210:
		return detail::InFullRange(kPixelFormat_RGB_444_10u, inParameters);
	default:   // hundreds
		return detail::PackedFormat(inParameters);
	}
}

namespace detail
{

// FFmpeg's names of a format have commas between them: "mov,mp4,m4a,3gp,3g2,mj2", "matroska,webm".
constexpr bool HasInterleavedOrders(std::string_view inFormat)
{
	constexpr std::string_view kFormats[] = {"mov", "mp4", "matroska", "webm"};
	return std::ranges::find(kFormats, inFormat.substr(0, inFormat.find(','))) != std::end(kFormats);
}

}   // namespace detail

inline FieldType ToFieldType(AVFieldOrder inOrder, std::string_view inFormat)
{
	const bool isTopEarlier = inOrder == AV_FIELD_TB;
	switch (inOrder)
	{
	case AV_FIELD_UNKNOWN:
		return kFieldType_Invalid;
	case AV_FIELD_PROGRESSIVE:
		return kFieldType_NoFields;
	case AV_FIELD_TT:
		return kFieldType_UpperFirst;
	case AV_FIELD_BB:
		return kFieldType_LowerFirst;
	case AV_FIELD_TB:
	case AV_FIELD_BT:
		return isTopEarlier == detail::HasInterleavedOrders(inFormat) ? kFieldType_UpperFirst : kFieldType_LowerFirst;
	}
	return kFieldType_Invalid;
}

inline FieldType ToFieldType(AVFieldOrder inOrder)
{
	const bool dependsOnFormat = inOrder == AV_FIELD_TB || inOrder == AV_FIELD_BT;
	return dependsOnFormat ? kFieldType_Invalid : ToFieldType(inOrder, {});
}

inline PixelAspectRatio ToPixelAspectRatio(AVRational inRatio)
{
	if (inRatio.num <= 0 || inRatio.den <= 0)
		return kPixelAspectRatio_Unknown;
	return {static_cast<unsigned>(inRatio.num), static_cast<unsigned>(inRatio.den)};
}

inline AVRational ToSampleAspectRatio(PixelAspectRatio inRatio)
{
	if (inRatio.GetNumerator() == 0 || inRatio.GetDenominator() == 0)
		return {0, 1};
	AVRational ratio;
	av_reduce(
		&ratio.num, &ratio.den, inRatio.GetNumerator(), inRatio.GetDenominator(), std::numeric_limits<int>::max());
	return ratio;
}

}   // namespace zonmediatypes
