#include "zoncore/StringUtils.h"
#include "zonmedia/Commands.h"
#include "zonmedia/MediaFile.h"
#include "zonmedia/TimeNames.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/interop/TimeBase.h"

#include <utility>
#include <vector>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;

namespace
{

constexpr const char* kExamples = R"(  zonmedia sheet clip.mov
  zonmedia sheet *.mov sound.wav --json)";

struct SheetArguments : CommonArguments
{
	std::vector<std::string> mFiles;
};

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

const Value kUnknown{"unknown", nullptr};

// ---- Times -----------------------------------------------------------------------------------------------------------

void AddRate(Record& ioRecord, const Rate& inRate)
{
	const bool isRounded = inRate.mIsRounded;
	ioRecord.mItems.emplace_back(Field{"Rate", {Text(inRate), Text(inRate.mStated)}});
	const std::int64_t ticks = inRate.mRate.GetTicksPerFrame();
	const std::string rounding = isRounded ? ", rounded: at this rate it is no whole number of ticks" : "";
	ioRecord.mItems.emplace_back(Field{"Frame duration", {std::to_string(ticks) + " ticks" + rounding, ticks}});
	ioRecord.mItems.emplace_back(Field{"Rate is rounded", {"", isRounded}});
}

void AddEnds(Record& ioRecord, const Span& inSpan, TickTime inDuration)
{
	const FrameRate rate = inSpan.mRate.mRate;
	const TickTime end = inSpan.mStart + inDuration;
	TickTime last = end;
	last.AddFrames(-1, rate);
	const std::string lastText = TimeText(end, rate, inSpan.mForm, kTimecodeFlag_LastFrame);
	const Value endValue = TimeValue(end, rate, inSpan.mForm);
	ioRecord.mItems.emplace_back(
		Field{"End", {endValue.mText + " (last " + inSpan.mUnit + " " + lastText + ")", endValue.mJson}});
	ioRecord.mItems.emplace_back(
		Field{std::string("Last ") + inSpan.mUnit, {"", Json{{"text", lastText}, {"ticks", last.GetTicks()}}}});
	ioRecord.mItems.emplace_back(Field{"Duration", TimeValue(inDuration, rate, inSpan.mForm)});
	ioRecord.mItems.emplace_back(Field{inSpan.mUnits, *inSpan.mCount});
}

void AddTimes(Record& ioRecord, const Span& inSpan)
{
	AddRate(ioRecord, inSpan.mRate);
	ioRecord.mItems.emplace_back(Field{"Display", {DescriptionOf(inSpan.mForm), NameOf(inSpan.mForm)}});
	ioRecord.mItems.emplace_back(Field{"Start", TimeValue(inSpan.mStart, inSpan.mRate.mRate, inSpan.mForm)});
	if (const auto duration = inSpan.Duration())
		AddEnds(ioRecord, inSpan, *duration);
	else
		ioRecord.mItems.emplace_back(Field{"Duration", kUnknown});
}

// ---- Picture ---------------------------------------------------------------------------------------------------------

// Where the picture starts: at the file's timecode, or at zero when it has none that can be read.
TickTime Start(const MediaFile& inFile, const Rate& inRate, TimeForm inForm)
{
	try
	{
		return ReadTime(inFile.mStartTimecode, inRate.mRate, inForm);
	}
	catch (const InputProblem&)
	{
		return kTime_Zero;
	}
}

// Timecode of a tag counts as its separators say; a picture without a tag counts as the library does by itself.
bool IsDropFrame(const std::string& inTimecode)
{
	return inTimecode.empty() || inTimecode.find(';') != std::string::npos;
}

Span PictureSpan(const MediaFile& inFile, const VideoStream& inVideo, const Rate& inRate)
{
	const TimeForm form{GetTimeDisplayForFrameRate(
		inRate.mRate, IsDropFrame(inFile.mStartTimecode), false, kTimeDisplay_Frames, false)};
	return {"frame", "Frames", inRate, form, Start(inFile, inRate, form), inVideo.mFrameCount};
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

void AddFrame(Record& ioRecord, const VideoStream& inVideo)
{
	const int width = inVideo.mWidth;
	const int height = inVideo.mHeight;
	const std::string size = UTF16to8(VideoFrameSizeDescription({0, 0, width, height}, inVideo.mPixelShape));
	ioRecord.mItems.emplace_back(
		Field{"Frame size", {size, Json{{"text", size}, {"width", width}, {"height", height}}}});
	ioRecord.mItems.emplace_back(Field{"Pixel shape", PixelShapeValue(inVideo.mPixelShape)});
	ioRecord.mItems.emplace_back(Field{"Fields", UTF16to8(FieldTypeDescription(inVideo.mFieldType))});
	ioRecord.mItems.emplace_back(Field{"Stored as", inVideo.mStoredFormat});
	ioRecord.mItems.emplace_back(Field{"Pixel format", PixelFormatValue(inVideo)});
}

void AddPicture(Record& ioRecord, const MediaFile& inFile, const VideoStream& inVideo)
{
	const std::optional<Rate> rate = MakeRate(inVideo.mRate);
	if (rate)
		AddTimes(ioRecord, PictureSpan(inFile, inVideo, *rate));
	else
		ioRecord.mItems.emplace_back(Field{"Rate", kUnknown});
	ioRecord.mItems.emplace_back(Field{"Video codec", inVideo.mCodec});
	AddFrame(ioRecord, inVideo);
}

// ---- Sound -----------------------------------------------------------------------------------------------------------

std::optional<Rate> SampleRate(const MediaFile& inFile)
{
	return inFile.mAudio.empty() ? std::nullopt : MakeRate({inFile.mAudio.front().mSampleRate, 1});
}

// Sound without a picture: its own rate, samples and milliseconds.
void AddSound(Record& ioRecord, const MediaFile& inFile, const Rate& inRate)
{
	TickTime start;
	start.AddFrames(inFile.mStartSample.value_or(0), inRate.mRate);
	const Span span{
		"sample", "Samples", inRate, {kTimeDisplay_AudioSamples}, start, inFile.mAudio.front().mSampleCount};
	AddTimes(ioRecord, span);
	if (const auto duration = span.Duration())
		ioRecord.mItems.emplace_back(
			Field{"Milliseconds", TimeText(*duration, inRate.mRate, {kTimeDisplay_Milliseconds})});
}

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
		const int number = static_cast<int>(table.mRows.size()) + 1;
		table.mRows.push_back({number, stream.mCodec, {std::to_string(stream.mSampleRate) + "Hz", stream.mSampleRate},

			static_cast<std::int64_t>(stream.mLayout.size()), UTF16to8(AudioChannelLayoutDescription(stream.mLayout))});
	}
	return table;
}

// ---- The sheet -------------------------------------------------------------------------------------------------------

Record MakeSheet(const std::string& inPath, const MediaFile& inFile)
{
	Record sheet{{"File", inPath}, {}};
	sheet.mItems.emplace_back(Field{"Format", inFile.mFormat});
	sheet.mItems.emplace_back(Field{
		"Timecode tag", {inFile.mStartTimecode, inFile.mStartTimecode.empty() ? Json() : Json(inFile.mStartTimecode)}});
	const std::optional<Rate> sampleRate = SampleRate(inFile);
	if (inFile.mVideo)
		AddPicture(sheet, inFile, *inFile.mVideo);
	else if (sampleRate)
		AddSound(sheet, inFile, *sampleRate);
	sheet.mItems.emplace_back(Field{"Audio", AudioDescription(inFile)});
	const std::optional<Rate> rate = inFile.mVideo ? MakeRate(inFile.mVideo->mRate) : std::nullopt;
	if (rate)
	{
		const Span span = PictureSpan(inFile, *inFile.mVideo, *rate);
		if (const auto duration = span.Duration())
			sheet.mItems.emplace_back(TimeTable("Duration in other displays", *duration, rate->mRate,
				sampleRate ? std::optional(sampleRate->mRate) : std::nullopt, span.mForm));
	}
	if (!inFile.mAudio.empty())
		sheet.mItems.emplace_back(AudioTable(inFile));
	return sheet;
}

Status RunSheet(const SheetArguments& inArguments)
{
	RecordList sheets("files", inArguments.GetStyle());
	for (const std::string& path : inArguments.mFiles)
	{
		try
		{
			sheets.Add(MakeSheet(path, ReadMediaFile(path)));
		}
		catch (const InputProblem& problem)
		{
			sheets.AddProblem(path, problem.what());
		}
	}
	return sheets.Finish();
}

}   // namespace

void AddSheetCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<SheetArguments>();
	CLI::App& command = AddCommand(ioApplication, outRun, "sheet",
		"Show the times, picture and sound of media files, one sheet a file", kExamples, arguments, RunSheet);
	command.add_option("FILE", arguments->mFiles, "Media files")->required();
}

}   // namespace zonmedia
