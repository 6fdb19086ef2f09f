#include "zonmedia/Sheet.h"

#include "zoncore/StringUtils.h"
#include "zonmedia/Texts.h"
#include "zonmedia/TimeNames.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/TimeBase.h"

#include <array>
#include <charconv>
#include <cmath>
#include <optional>
#include <string_view>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;

namespace
{

Value Unknown()
{
	return {Say(kText_Unknown), nullptr};
}

// ---- Times -----------------------------------------------------------------------------------------------------------

// The frames of a file's picture, or the samples of its sound, as a span of time.
struct Span
{
	const char* mLastName;   // of the row of the last of them
	const char* mUnits;      // of the row that counts them
	const OwnText* mEndText;
	Rate mRate;
	TimeForm mForm;
	TickTime mStart;
	std::optional<std::int64_t> mCount;
	std::optional<TickTime> mDuration;   // nothing when it is unknown or outlasts what ticks can count
	bool mIsSteady = true;               // what is counted is all of one length
	bool mIsCounted = true;              // else it is worked out
};

// inCount frames or samples at a steady rate.
std::optional<TickTime> SteadyDuration(std::optional<std::int64_t> inCount, FrameRate inRate)
{
	const auto unit = TimeBase::FromRate(inRate);
	return unit && inCount ? unit->ToTicks(*inCount, Rounding::Nearest) : std::nullopt;
}

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
	const std::optional<Rate> rate = inFile.mVideo && !inFile.mIsStill ? MakeRate(inFile.mVideo->mRate) : std::nullopt;
	if (!rate)
		return std::nullopt;
	const std::string& tag = inFile.mStartTimecode;
	const bool isDropFrame = tag.empty() || tag.find(';') != std::string::npos;
	const TimeForm form{GetTimeDisplayForFrameRate(rate->mRate, isDropFrame, false, kTimeDisplay_Frames, false)};
	const TickTime start = TaggedStart(tag, rate->mRate, form).value_or(kTime_Zero);
	const VideoLength& length = inFile.mVideo->mLength;
	const auto duration = length.mVariation ? length.mDuration : SteadyDuration(length.mFrameCount, rate->mRate);
	return Span{"Last frame", "Frames", &kText_LastFrame, *rate, form, start, length.mFrameCount, duration,
		!length.mVariation, !length.mIsByDuration};
}

std::optional<Span> SoundSpan(const MediaFile& inFile)
{
	const std::optional<Rate> rate
		= inFile.mAudio.empty() ? std::nullopt : MakeRate({inFile.mAudio.front().mSampleRate, 1});
	if (!rate)
		return std::nullopt;
	TickTime start;
	start.AddFrames(inFile.mStartSample.value_or(0), rate->mRate);
	const std::optional<std::int64_t> count = inFile.mAudio.front().mLength.mSampleCount;
	return Span{"Last sample", "Samples", &kText_LastSample, *rate, {kTimeDisplay_AudioSamples}, start, count,
		SteadyDuration(count, rate->mRate)};
}

void AddRate(Record& ioSheet, const Rate& inRate)
{
	const std::int64_t ticks = inRate.mRate.GetTicksPerFrame();
	const OwnText& text = inRate.mIsRounded ? kText_RoundedTickCount : kText_TickCount;
	ioSheet.Add("Rate", {Text(inRate), Text(inRate.mStated)});
	ioSheet.Add("Frame duration", {Say(text, {std::to_string(ticks)}), ticks});
	ioSheet.Add("Rate is rounded", {"", inRate.mIsRounded});
}

// Where the frames differ in length, the one that is last does not begin a frame before the end; where there are none, none
// is the last.
void AddEnd(Record& ioSheet, const Span& inSpan, std::optional<TickTime> inEnd)
{
	const FrameRate rate = inSpan.mRate.mRate;
	const Value end = inEnd ? TimeValue(*inEnd, rate, inSpan.mForm) : Unknown();
	if (!inEnd || !inSpan.mIsSteady || inEnd == inSpan.mStart)
	{
		ioSheet.Add("End", end);
		ioSheet.Add(inSpan.mLastName, {"", nullptr});
		return;
	}
	const std::string last = TimeText(*inEnd, rate, inSpan.mForm, kTimecodeFlag_LastFrame);
	TickTime lastTime = *inEnd;
	lastTime.AddFrames(-1, rate);
	ioSheet.Add("End", {Say(*inSpan.mEndText, {end.mText, last}), end.mJson});
	ioSheet.Add(inSpan.mLastName, {"", Json{{"text", last}, {"ticks", lastTime.GetTicks()}}});
}

void AddTimes(Record& ioSheet, const Span& inSpan)
{
	const FrameRate rate = inSpan.mRate.mRate;
	const std::optional<TickTime> duration = inSpan.mDuration;
	ioSheet.Add("Display", {DescriptionOf(inSpan.mForm), NameOf(inSpan.mForm)});
	ioSheet.Add("Start", TimeValue(inSpan.mStart, rate, inSpan.mForm));
	AddEnd(ioSheet, inSpan, duration ? std::optional(inSpan.mStart + *duration) : std::nullopt);
	ioSheet.Add("Duration", duration ? TimeValue(*duration, rate, inSpan.mForm) : Unknown());
	const bool isCounted = inSpan.mCount && (duration || !inSpan.mIsSteady);
	const Value count = isCounted ? Value(*inSpan.mCount) : Unknown();
	ioSheet.Add(inSpan.mUnits, inSpan.mIsCounted ? count : Value(Say(kText_NotCounted, {count.mText}), count.mJson));
}

// ---- What a scan finds -----------------------------------------------------------------------------------------------

// A frame rate to two decimals, without zeros at the end.
std::string RateText(double inRate)
{
	std::array<char, 32> text{};
	const auto hundredths = std::round(inRate * 100.0) / 100.0;
	const char* const end = std::to_chars(text.data(), text.data() + text.size(), hundredths).ptr;
	return Say(kText_FrameRate, {WithDecimalSign({text.data(), end})});
}

Value VariationValue(const std::optional<RateVariation>& inVariation)
{
	if (!inVariation)
		return {"", nullptr};
	const auto& [average, lowest, highest] = *inVariation;
	const auto json = [](std::optional<double> inRate) { return inRate ? Json(*inRate) : Json(nullptr); };
	const bool hasRange = lowest && highest;
	const std::string text = hasRange
		? Say(kText_AverageAndRange, {RateText(average), RateText(*lowest), RateText(*highest)})
		: Say(kText_Average, {RateText(average)});
	return {text, Json{{"average", average}, {"lowest", json(lowest)}, {"highest", json(highest)}}};
}

// inText is what says it of frames or samples.
Value MissingValue(const OwnText& inText, std::optional<std::int64_t> inPresent, std::optional<std::int64_t> inStated)
{
	if (!inPresent || !inStated)
		return {"", nullptr};
	const std::string text = Say(inText, {std::to_string(*inPresent), std::to_string(*inStated)});
	return {text, Json{{"present", *inPresent}, {"stated", *inStated}}};
}

// ---- Picture ---------------------------------------------------------------------------------------------------------

Value TimecodeTagValue(const std::string& inTag, const std::optional<Span>& inSpan)
{
	if (inTag.empty())
		return {"", nullptr};
	const bool isRead = inSpan && TaggedStart(inTag, inSpan->mRate.mRate, inSpan->mForm);
	return {isRead ? inTag : Say(kText_NoTimecode, {inTag}), inTag};
}

Value PixelShapeValue(PixelAspectRatio inShape)
{
	if (inShape == kPixelAspectRatio_Unknown)
		return Unknown();
	const std::string text = WithDecimalSign(UTF16to8(PixelAspectRatioDescription(inShape)));
	return {
		text, Json{{"text", text}, {"numerator", inShape.GetNumerator()}, {"denominator", inShape.GetDenominator()}}};
}

Value PixelFormatValue(const VideoStream& inVideo)
{
	if (inVideo.mPixelFormat == kPixelFormat_Invalid)
		return {Say(kText_NoCounterpart, {inVideo.mCodec, inVideo.mStoredFormat}), nullptr};
	const std::string name(PixelFormatCatalogueName(inVideo.mPixelFormat));
	const std::string text = UTF16to8(PixelFormatDescription(inVideo.mPixelFormat));
	return {text + " (" + name + ")", Json{{"text", text}, {"name", name}}};
}

void AddPicture(Record& ioSheet, const VideoStream& inVideo, bool inIsStill)
{
	const int width = inVideo.mWidth;
	const int height = inVideo.mHeight;
	const std::string size
		= WithDecimalSign(UTF16to8(VideoFrameSizeDescription({0, 0, width, height}, inVideo.mPixelShape)));
	ioSheet.Add(inIsStill ? "Image codec" : "Video codec", inVideo.mCodec);
	ioSheet.Add(
		inIsStill ? "Image size" : "Frame size", {size, Json{{"text", size}, {"width", width}, {"height", height}}});
	ioSheet.Add("Pixel shape", PixelShapeValue(inVideo.mPixelShape));
	if (!inIsStill)
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
		const Value rate{Say(kText_SampleRate, {std::to_string(stream.mSampleRate)}), stream.mSampleRate};
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

// ---- Sheets ----------------------------------------------------------------------------------------------------------

void AddVideo(Record& ioSheet, const MediaFile& inFile)
{
	const std::optional<Span> picture = PictureSpan(inFile);
	const VideoLength& length = inFile.mVideo->mLength;
	ioSheet.Add("Timecode tag", TimecodeTagValue(inFile.mStartTimecode, picture));
	if (!picture)
		ioSheet.Add("Rate", Unknown());
	if (picture)
		AddRate(ioSheet, picture->mRate);
	ioSheet.Add("Variable frame rate", VariationValue(length.mVariation));
	if (picture)
		AddTimes(ioSheet, *picture);
	ioSheet.Add("Missing", MissingValue(kText_Truncated, length.mFrameCount, length.mStatedCount));
	AddPicture(ioSheet, *inFile.mVideo, false);
	ioSheet.Add("Audio", AudioDescription(inFile));
	if (picture && picture->mDuration)
		ioSheet.mItems.emplace_back(DurationTable(*picture, *picture->mDuration, SoundSpan(inFile)));
	ioSheet.mItems.emplace_back(AudioTable(inFile));
}

void AddSound(Record& ioSheet, const MediaFile& inFile)
{
	const std::optional<Span> sound = SoundSpan(inFile);
	ioSheet.Add("Timecode tag", TimecodeTagValue(inFile.mStartTimecode, std::nullopt));
	if (!sound)
		ioSheet.Add("Rate", Unknown());
	if (sound)
	{
		AddRate(ioSheet, sound->mRate);
		AddTimes(ioSheet, *sound);
	}
	if (sound && sound->mDuration)
		ioSheet.Add("Milliseconds", TimeText(*sound->mDuration, sound->mRate.mRate, {kTimeDisplay_Milliseconds}));
	const SoundLength length = inFile.mAudio.front().mLength;
	ioSheet.Add("Missing", MissingValue(kText_TruncatedSound, length.mSampleCount, length.mStatedCount));
	ioSheet.Add("Audio", AudioDescription(inFile));
	ioSheet.mItems.emplace_back(AudioTable(inFile));
}

}   // namespace

Record MakeSheet(const std::string& inPath, const MediaFile& inFile)
{
	Record sheet{{"File", inPath}, {}};
	sheet.Add("Format", inFile.mFormat);
	if (inFile.mIsStill && inFile.mVideo)
		AddPicture(sheet, *inFile.mVideo, true);
	else if (inFile.mVideo)
		AddVideo(sheet, inFile);
	else
		AddSound(sheet, inFile);
	return sheet;
}

}   // namespace zonmedia
