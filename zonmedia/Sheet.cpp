#include "zonmedia/Sheet.h"

#include "zoncore/StringUtils.h"
#include "zonmedia/TimeNames.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/interop/TimeBase.h"

#include <optional>
#include <string_view>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;

namespace
{

const Value kUnknown{"unknown", nullptr};

// ---- Times -----------------------------------------------------------------------------------------------------------

// The frames of a file's picture, or the samples of its sound, as a span of time.
struct Span
{
	const char* mUnit;   // what is counted
	const char* mUnits;
	Rate mRate;
	TimeForm mForm;
	TickTime mStart;
	std::optional<std::int64_t> mCount;

	// Nothing when it is unknown or outlasts what ticks can count.
	std::optional<TickTime> Duration() const
	{
		const auto unit = TimeBase::FromRate(mRate.mRate);
		return unit && mCount ? unit->ToTicks(*mCount, Rounding::Nearest) : std::nullopt;
	}
};

// The start that a timecode tag states; nothing for text that is no timecode.
std::optional<TickTime> TaggedStart(const std::string& inTag, FrameRate inRate, TimeForm inForm)
{
	try
	{
		return ReadTime(inTag, inRate, inForm);
	}
	catch (const InputProblem&)
	{
		return std::nullopt;
	}
}

// Frames count as the separators of the tag say; without a tag as they do in the library by itself. Rates that have no
// timecode are counted in bare frames.
std::optional<Span> PictureSpan(const MediaFile& inFile)
{
	const std::optional<Rate> rate = inFile.mVideo ? MakeRate(inFile.mVideo->mRate) : std::nullopt;
	if (!rate)
		return std::nullopt;
	const std::string& tag = inFile.mStartTimecode;
	const bool isDropFrame = tag.empty() || tag.find(';') != std::string::npos;
	const TimeForm form{GetTimeDisplayForFrameRate(rate->mRate, isDropFrame, false, kTimeDisplay_Frames, false)};
	const TickTime start = TaggedStart(tag, rate->mRate, form).value_or(kTime_Zero);
	return Span{"frame", "Frames", *rate, form, start, inFile.mVideo->mFrameCount};
}

std::optional<Span> SoundSpan(const MediaFile& inFile)
{
	const std::optional<Rate> rate
		= inFile.mAudio.empty() ? std::nullopt : MakeRate({inFile.mAudio.front().mSampleRate, 1});
	if (!rate)
		return std::nullopt;
	TickTime start;
	start.AddFrames(inFile.mStartSample.value_or(0), rate->mRate);
	return Span{"sample", "Samples", *rate, {kTimeDisplay_AudioSamples}, start, inFile.mAudio.front().mSampleCount};
}

void AddRate(Record& ioSheet, const Rate& inRate)
{
	const std::int64_t ticks = inRate.mRate.GetTicksPerFrame();
	const std::string rounding = inRate.mIsRounded ? ", rounded: at this rate it is no whole number of ticks" : "";
	ioSheet.Add("Rate", {Text(inRate), Text(inRate.mStated)});
	ioSheet.Add("Frame duration", {std::to_string(ticks) + " ticks" + rounding, ticks});
	ioSheet.Add("Rate is rounded", {"", inRate.mIsRounded});
}

void AddEnd(Record& ioSheet, const Span& inSpan, TickTime inEnd)
{
	const FrameRate rate = inSpan.mRate.mRate;
	const Value end = TimeValue(inEnd, rate, inSpan.mForm);
	const std::string last = TimeText(inEnd, rate, inSpan.mForm, kTimecodeFlag_LastFrame);
	TickTime lastTime = inEnd;
	lastTime.AddFrames(-1, rate);
	ioSheet.Add("End", {end.mText + " (last " + inSpan.mUnit + " " + last + ")", end.mJson});
	ioSheet.Add(std::string("Last ") + inSpan.mUnit, {"", Json{{"text", last}, {"ticks", lastTime.GetTicks()}}});
}

void AddTimes(Record& ioSheet, const Span& inSpan)
{
	const FrameRate rate = inSpan.mRate.mRate;
	const std::optional<TickTime> duration = inSpan.Duration();
	AddRate(ioSheet, inSpan.mRate);
	ioSheet.Add("Display", {DescriptionOf(inSpan.mForm), NameOf(inSpan.mForm)});
	ioSheet.Add("Start", TimeValue(inSpan.mStart, rate, inSpan.mForm));
	if (duration)
	{
		AddEnd(ioSheet, inSpan, inSpan.mStart + *duration);
	}
	else
	{
		ioSheet.Add("End", kUnknown);
		ioSheet.Add(std::string("Last ") + inSpan.mUnit, {"", nullptr});
	}
	ioSheet.Add("Duration", duration ? TimeValue(*duration, rate, inSpan.mForm) : kUnknown);
	ioSheet.Add(inSpan.mUnits, duration ? Value(*inSpan.mCount) : kUnknown);
}

// ---- Picture ---------------------------------------------------------------------------------------------------------

Value TimecodeTagValue(const std::string& inTag, const std::optional<Span>& inSpan)
{
	if (inTag.empty())
		return {"", nullptr};
	const bool isRead = inSpan && TaggedStart(inTag, inSpan->mRate.mRate, inSpan->mForm);
	return {inTag + (isRead ? "" : " (no timecode: the start is taken as 0)"), inTag};
}

Value PixelShapeValue(PixelAspectRatio inShape)
{
	if (inShape == kPixelAspectRatio_Unknown)
		return kUnknown;
	const std::string text = UTF16to8(PixelAspectRatioDescription(inShape));
	return {
		text, Json{{"text", text}, {"numerator", inShape.GetNumerator()}, {"denominator", inShape.GetDenominator()}}};
}

Value PixelFormatValue(const VideoStream& inVideo)
{
	if (inVideo.mPixelFormat == kPixelFormat_Invalid)
		return {"none: the library has no counterpart of " + inVideo.mCodec + " " + inVideo.mStoredFormat, nullptr};
	const std::string name(PixelFormatCatalogueName(inVideo.mPixelFormat));
	const std::string text = UTF16to8(PixelFormatDescription(inVideo.mPixelFormat));
	return {text + " (" + name + ")", Json{{"text", text}, {"name", name}}};
}

void AddPicture(Record& ioSheet, const VideoStream& inVideo)
{
	const int width = inVideo.mWidth;
	const int height = inVideo.mHeight;
	const std::string size = UTF16to8(VideoFrameSizeDescription({0, 0, width, height}, inVideo.mPixelShape));
	ioSheet.Add("Video codec", inVideo.mCodec);
	ioSheet.Add("Frame size", {size, Json{{"text", size}, {"width", width}, {"height", height}}});
	ioSheet.Add("Pixel shape", PixelShapeValue(inVideo.mPixelShape));
	ioSheet.Add("Fields", UTF16to8(FieldTypeDescription(inVideo.mFieldType)));
	ioSheet.Add("Stored as", inVideo.mStoredFormat);
	ioSheet.Add("Pixel format", PixelFormatValue(inVideo));
}

// ---- Sound -----------------------------------------------------------------------------------------------------------

std::string AudioDescription(const MediaFile& inFile)
{
	AudioChannelLayouts layouts;
	for (const AudioStream& stream : inFile.mAudio)
		layouts.push_back(stream.mLayout);
	return UTF16to8(AudioChannelConfigurationDescription(layouts));
}

Table AudioTable(const MediaFile& inFile)
{
	Table table{"Audio streams", {"Stream", "Codec", "Rate", "Channels", "Layout"}, {}};
	for (const AudioStream& stream : inFile.mAudio)
	{
		const auto number = static_cast<std::int64_t>(table.mRows.size()) + 1;
		const auto channels = static_cast<std::int64_t>(stream.mLayout.size());
		const Value rate{std::to_string(stream.mSampleRate) + "Hz", stream.mSampleRate};
		table.mRows.push_back(
			{number, stream.mCodec, rate, channels, UTF16to8(AudioChannelLayoutDescription(stream.mLayout))});
	}
	return table;
}

// The other displays of a duration; samples count at the rate of the sound.
Table DurationTable(const Span& inPicture, TickTime inDuration, const std::optional<Span>& inSound)
{
	const auto sampleRate = inSound ? std::optional(inSound->mRate.mRate) : std::nullopt;
	return TimeTable("Duration in other displays", inDuration, inPicture.mRate.mRate, sampleRate, inPicture.mForm);
}

}   // namespace

Record MakeSheet(const std::string& inPath, const MediaFile& inFile)
{
	const std::optional<Span> picture = PictureSpan(inFile);
	const std::optional<Span> sound = SoundSpan(inFile);
	const std::optional<Span>& span = inFile.mVideo ? picture : sound;
	const std::optional<TickTime> duration = span ? span->Duration() : std::nullopt;
	Record sheet{{"File", inPath}, {}};
	sheet.Add("Format", inFile.mFormat);
	sheet.Add("Timecode tag", TimecodeTagValue(inFile.mStartTimecode, picture));
	if (span)
		AddTimes(sheet, *span);
	else
		sheet.Add("Rate", kUnknown);
	if (inFile.mVideo)
		AddPicture(sheet, *inFile.mVideo);
	else if (duration)
		sheet.Add("Milliseconds", TimeText(*duration, span->mRate.mRate, {kTimeDisplay_Milliseconds}));
	sheet.Add("Audio", AudioDescription(inFile));
	if (picture && duration)
		sheet.mItems.emplace_back(DurationTable(*picture, *duration, sound));
	sheet.mItems.emplace_back(AudioTable(inFile));
	return sheet;
}

}   // namespace zonmedia
