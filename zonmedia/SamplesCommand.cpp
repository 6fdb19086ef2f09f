#include "zoncore/StringUtils.h"
#include "zonmedia/Commands.h"
#include "zonmedia/Input.h"
#include "zonmedia/Texts.h"
#include "zonmedia/TimeNames.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <limits>
#include <optional>
#include <tuple>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes::
	utility;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

namespace
{

constexpr const char* kExamples = R"(  zonmedia samples 2882880 --rate 48000 --format samples --to dropframe
  zonmedia samples "00;01;00;02" --rate 48000 --format dropframe
  zonmedia samples 2:2.480 --rate 48000 --format bars --tempo 120 --meter 4/4 --ticks 960 --to ms)";

struct SamplesArguments : CommonArguments
{
	std::string mValue;
	std::string mRate;
	std::string mFormat;
	std::string mTo;
	std::int32_t mFramesPerSecond = 30;
	std::string mMeter = "4/4";
	BeatInfo mBeats{960, 120.0, 0, 0, 0.0};
	bool mIsDuration = false;
};

// The formats that differ: those of the library that are other names for one of these have no name of their own.
const std::array<Named<TimecodeFormat>, 11> sFormats{{
	{"decimal", kTimecodeFormat_Decimal},
	{"samples", kTimecodeFormat_Samples},
	{"timecode", kTimecodeFormat_Timecode},
	{"ntsc", kTimecodeFormat_TimecodeNTSC},
	{"dropframe", kTimecodeFormat_TimecodeDropFrame},
	{"beats", kTimecodeFormat_Beats},
	{"bars", kTimecodeFormat_BarsAndBeats},
	{"frames", kTimecodeFormat_Frames},
	{"framesdropframe", kTimecodeFormat_FramesDropFrame},
	{"subframes", kTimecodeFormat_TimecodeSubframes},
	{"ms", kTimecodeFormat_Milliseconds},
}};

// The clock of an audio tool: how its positions are counted.
struct Clock
{
	std::int32_t mSampleRate;
	std::int32_t mFramesPerSecond;
	BeatInfo mBeats;
	bool mIsDuration;
};

bool NeedsDropFrameRate(TimecodeFormat inFormat)
{
	return inFormat == kTimecodeFormat_TimecodeDropFrame || inFormat == kTimecodeFormat_FramesDropFrame;
}

TimecodeFormat ReadFormat(const std::string& inName, const Clock& inClock)
{
	const TimecodeFormat format = ValueNamed<TimecodeFormat>(sFormats, "format", inName);
	if (NeedsDropFrameRate(format) && inClock.mFramesPerSecond < 30)
		throw UsageProblem("drop-frame formats count at 30 frames a second or more, not at --fps "
			+ std::to_string(inClock.mFramesPerSecond));
	return format;
}

std::string SamplesText(std::int64_t inSamples, TimecodeFormat inFormat, const Clock& inClock)
{
	zoncore::UTF16String text;
	ConvertSamplesToTimecode(
		text, inSamples, inClock.mSampleRate, inFormat, inClock.mFramesPerSecond, &inClock.mBeats, inClock.mIsDuration);
	return UTF16to8(text);
}

// The library reads a larger number as 0.
std::uint64_t MostReadable(TimecodeFormat inFormat)
{
	constexpr std::uint64_t kMostSamples = std::numeric_limits<std::int64_t>::max();
	constexpr std::uint64_t kMostOfField = std::numeric_limits<std::int32_t>::max();
	return inFormat == kTimecodeFormat_Samples ? kMostSamples : kMostOfField;
}

// What is in a text that is neither a digit nor a mark between numbers; empty when there is nothing.
std::string_view ForeignCharacter(std::string_view inText)
{
	const std::size_t first = std::min(inText.find_first_not_of("0123456789:;., +-"), inText.size());
	const auto isTail = [](char inByte) { return (static_cast<unsigned char>(inByte) & 0xC0) == 0x80; };   // of UTF-8
	std::size_t end = first + 1;
	while (end < inText.size() && isTail(inText[end]))
		++end;
	return inText.substr(first, end - first);
}

// Why the library would read less, or something else, than what was typed; empty when it would not.
std::string Misreading(std::string_view inText, TimecodeFormat inFormat)
{
	if (inText.find_first_of("0123456789") == std::string_view::npos)
		return "no digits in it";
	if (const std::string_view foreign = ForeignCharacter(inText); !foreign.empty())
		return Quoted(foreign) + " in it is neither a digit nor a separator";
	return HasNumberAbove(inText, MostReadable(inFormat)) ? "too large a number in it" : "";
}

std::int64_t ReadSamples(const std::string& inText, TimecodeFormat inFormat, const Clock& inClock)
{
	if (const std::string why = Misreading(inText, inFormat); !why.empty())
	{
		// A minute, a second and a bit; from 100 s on milliseconds lose digits.
		const std::int64_t example = std::int64_t{inClock.mSampleRate} * 61 + inClock.mSampleRate / 2;
		throw InputProblem(why + "; expected something like " + Quoted(SamplesText(example, inFormat, inClock)));
	}
	std::int64_t samples = 0;
	BeatInfo beats = inClock.mBeats;
	ConvertTimecodeToSamples(samples, UTF8to16(inText), inFormat, inClock.mSampleRate, inClock.mFramesPerSecond, &beats,
		inClock.mIsDuration);   // false only without a BeatInfo
	return samples;
}

std::int32_t ReadSampleRate(const std::string& inText)
{
	std::int32_t rate = 0;
	const char* const end = inText.data() + inText.size();
	const auto [rest, error] = std::from_chars(inText.data(), end, rate);
	const bool endsRate = rest == end || IsSameName({rest, end}, "Hz");
	if (error != std::errc() || !endsRate || rate <= 0)
		throw UsageProblem(Quoted(inText) + " is no sample rate; expected 1 to "
			+ std::to_string(std::numeric_limits<std::int32_t>::max()) + " samples a second, such as 48000");
	return rate;
}

// "3/4": beats a bar, and the note that has the beat.
std::pair<std::int32_t, std::int32_t> ReadMeter(const std::string& inText)
{
	std::int32_t beats = 0;
	std::int32_t value = 0;
	const char* const end = inText.data() + inText.size();
	const auto first = std::from_chars(inText.data(), end, beats);
	const bool hasSlash = first.ec == std::errc() && first.ptr != end && *first.ptr == '/';
	const auto second = hasSlash ? std::from_chars(first.ptr + 1, end, value) : first;
	if (!hasSlash || second.ec != std::errc() || second.ptr != end || beats <= 0 || value <= 0)
		throw UsageProblem(
			Quoted(inText) + " is no meter; expected beats a bar and the note of a beat, such as 4/4 or 6/8");
	return {beats, value};
}

Clock ReadClock(const SamplesArguments& inArguments)
{
	Clock clock{
		ReadSampleRate(inArguments.mRate), inArguments.mFramesPerSecond, inArguments.mBeats, inArguments.mIsDuration};
	std::tie(clock.mBeats.iBeatsPerBar, clock.mBeats.iBeatValue) = ReadMeter(inArguments.mMeter);
	return clock;
}

Record MakeRecord(const std::string& inText, std::int64_t inSamples, TimecodeFormat inFormat,
	const std::optional<TimecodeFormat>& inTo, const Clock& inClock)
{
	Record record{{"Value", inText}, {}};
	record.mItems = {
		Field{"Sample rate",
			{Say(kText_SampleRate, {std::to_string(inClock.mSampleRate)}), std::int64_t{inClock.mSampleRate}}},
		Field{"Frames per second", inClock.mFramesPerSecond},
		Field{"Format", NameOf<TimecodeFormat>(sFormats, inFormat)},
		Field{"Samples", inSamples},
	};
	if (inTo)
	{
		record.mItems.emplace_back(Field{"To", NameOf<TimecodeFormat>(sFormats, *inTo)});
		record.mItems.emplace_back(Field{"Result", SamplesText(inSamples, *inTo, inClock)});
		return record;
	}
	Table table{"Formats", {"Format", "Text"}, {}};
	for (const auto& [name, format] : sFormats)
	{
		if (!NeedsDropFrameRate(format) || inClock.mFramesPerSecond >= 30)
			table.mRows.push_back({name, SamplesText(inSamples, format, inClock)});
	}
	record.mItems.emplace_back(std::move(table));
	return record;
}

Status RunSamples(const SamplesArguments& inArguments)
{
	const Clock clock = ReadClock(inArguments);
	const TimecodeFormat format = ReadFormat(inArguments.mFormat, clock);
	const auto to = inArguments.mTo.empty() ? std::nullopt : std::optional(ReadFormat(inArguments.mTo, clock));
	RecordList records("positions", inArguments.GetStyle());
	const auto convert = [&](const std::string& inText)
	{
		const std::int64_t samples = ReadSamples(inText, format, clock);
		const Record record = MakeRecord(inText, samples, format, to, clock);
		if (to)
			records.AddLine(record, SamplesText(samples, *to, clock));
		else
			records.Add(record);
	};
	ForEachValue(inArguments.mValue, records, convert);
	return records.Finish();
}

}   // namespace

void AddSamplesCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<SamplesArguments>();
	CLI::App& command = AddCommand(ioApplication, outRun, "samples",
		"Convert a position on an audio tool's clock between samples, timecode, milliseconds, beats and bars",
		kExamples, arguments, RunSamples);
	const std::string formats = NamesOf<TimecodeFormat>(sFormats);
	command.add_option("VALUE", arguments->mValue, kValueHelp)->required();
	command.add_option("--rate", arguments->mRate, "Samples a second: 48000")->required();
	command.add_option("--format", arguments->mFormat, "How the value is written, one of: " + formats)->required();
	command.add_option(
		"--to", arguments->mTo, "How it is to be written, one of: " + formats + "; default: in every one");
	command.add_option("--fps", arguments->mFramesPerSecond, "Frames a second, nominal: 30 for 29.97")
		->check(NumberWhere<std::int32_t>([](std::int32_t inRate) { return inRate >= 1 && inRate <= 100'000; },
			"nominal frame rate", "a whole number from 1 to 100000"))
		->capture_default_str();
	command.add_option("--tempo", arguments->mBeats.dTempo, "Quarter notes a minute")
		->check(NumberWhere<double>([](double inTempo) { return inTempo >= 0.001 && inTempo <= 100'000.0; }, "tempo",
			"0.001 to 100000 quarter notes a minute"))
		->capture_default_str();
	command.add_option("--meter", arguments->mMeter, "Beats a bar / note of a beat")->capture_default_str();
	command.add_option("--ticks", arguments->mBeats.iTicksPerBeat, "Ticks a beat; -1 for decimal beats")
		->check(NumberWhere<std::int32_t>([](std::int32_t inTicks) { return inTicks >= 1 || inTicks == -1; },
			"count of ticks", "a whole number from 1, or -1 for decimal beats"))
		->capture_default_str();
	command
		.add_option("--offset", arguments->mBeats.dOffsetMilliseconds, "Where the first bar begins, in milliseconds")
		->check(NumberWhere<double>(
			[](double inOffset) { return std::isfinite(inOffset); }, "offset", "a number of milliseconds, such as 500"))
		->capture_default_str();
	command.add_flag("--duration", arguments->mIsDuration, "The value is a length: bars and beats count from 0");
}

}   // namespace zonmedia
