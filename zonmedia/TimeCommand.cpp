#include "zonmedia/Commands.h"
#include "zonmedia/Input.h"
#include "zonmedia/Texts.h"
#include "zonmedia/TimeNames.h"

#include <iostream>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language

namespace
{

constexpr const char* kExamples = R"(  zonmedia time "01:00:00;00" --rate 29.97
  zonmedia time "01:00:00;00" --rate 29.97 --display 29.97df --to frames
  zonmedia time 62+08 --rate 24 --display 35mm --to 24
  zonmedia time -1001001 --rate 48000Hz --display frames --to samples
  seq 0 1800 | zonmedia time - --rate 29.97 --display frames --to 29.97df)";

struct TimeArguments : CommonArguments
{
	std::string mValue;
	std::string mRate;
	std::string mDisplay = "auto";
	std::string mTo;
	std::string mToRate;
};

// How values are read and shown.
struct Conversion
{
	Rate mRate;
	TimeForm mFrom;
	std::optional<TimeForm> mTo;   // every display without one
	Rate mToRate;
};

// The rate that was given, or the one that the display has of its own.
Rate RateFor(const std::string& inText, TimeForm inForm)
{
	if (!inText.empty())
		return ReadRate(inText);
	const FrameRate own
		= inForm.mDisplay ? GetFrameRateForTimeDisplay(*inForm.mDisplay, kFrameRate_Zero) : kFrameRate_Zero;
	const auto rate = own.IsUsable() ? MakeRate({kTicksPerSecond, own.GetTicksPerFrame()}) : std::nullopt;
	if (!rate && inForm.mDisplay == kTimeDisplay_Auto)
		throw UsageProblem("--rate is required, or a --display with a rate of its own, such as 25 or 29.97df");
	if (!rate)
		throw UsageProblem("the display " + NameOf(inForm) + " has no rate of its own: --rate is required");
	return *rate;
}

Conversion ReadConversion(const TimeArguments& inArguments)
{
	const TimeForm from = ReadTimeForm(inArguments.mDisplay);
	const Rate rate = RateFor(inArguments.mRate, from);
	const Rate toRate = inArguments.mToRate.empty() ? rate : ReadRate(inArguments.mToRate);
	const auto to = inArguments.mTo.empty() ? std::nullopt
											: std::optional(ChosenForm(ReadTimeForm(inArguments.mTo), toRate.mRate));
	return {rate, ChosenForm(from, rate.mRate), to, toRate};
}

Record MakeRecord(const std::string& inText, TickTime inTime, const Conversion& inConversion)
{
	const Rate& rate = inConversion.mRate;
	Record record{{"Value", inText}, {}};
	record.mItems = {
		Field{"Rate", {Text(rate), Text(rate.mStated)}},
		Field{"Rate is rounded", {rate.mIsRounded ? Say(kText_RoundedRate) : "", rate.mIsRounded}},
		Field{"Display", NameOf(inConversion.mFrom)},
		Field{"Ticks", inTime.GetTicks()},
	};
	const FrameRate toRate = inConversion.mToRate.mRate;
	if (inConversion.mTo)
		record.mItems.emplace_back(Field{"To", NameOf(*inConversion.mTo)});
	if (inConversion.mTo)
		record.mItems.emplace_back(Field{"Result", TimeText(inTime, toRate, *inConversion.mTo)});
	const auto sampleRate = inConversion.mToRate.IsAudio() ? std::optional(toRate) : std::nullopt;
	if (!inConversion.mTo)
		record.mItems.emplace_back(TimeTable("Displays", inTime, rate.mRate, sampleRate, inConversion.mFrom));
	return record;
}

Status RunTime(const TimeArguments& inArguments)
{
	const Conversion conversion = ReadConversion(inArguments);
	RecordList records("times", inArguments.GetStyle());
	const auto convert = [&](const std::string& inText)
	{
		const TickTime time = ReadTime(inText, conversion.mRate.mRate, conversion.mFrom);
		const Record record = MakeRecord(inText, time, conversion);
		if (conversion.mTo)
			records.AddLine(record, TimeText(time, conversion.mToRate.mRate, *conversion.mTo));
		else
			records.Add(record);
	};
	ForEachValue(inArguments.mValue, records, convert);
	return records.Finish();
}

}   // namespace

void AddTimeCommand(CLI::App& ioApplication, Run& outRun)
{
	const auto arguments = std::make_shared<TimeArguments>();
	CLI::App& command = AddCommand(ioApplication, outRun, "time",
		"Convert a time between timecode, frames, film feet, samples, milliseconds and ticks", kExamples, arguments,
		RunTime);
	command.add_option("VALUE", arguments->mValue, kValueHelp)->required();
	const std::string displays = NamesOf<TimeForm>(TimeForms());
	command.add_option(
		"--rate", arguments->mRate, "Rate of the media: 29.97, 30000/1001, 48000Hz; default: the display's own");
	command.add_option("--display", arguments->mDisplay,
		"How the time is written, one of: " + displays + "; default: auto, as fits the rate");
	command.add_option(
		"--to", arguments->mTo, "How it is to be written, one of: " + displays + "; default: in every one");
	command.add_option(
		"--to-rate", arguments->mToRate, "Rate at which frames, feet and samples of the result count; default: --rate");
}

}   // namespace zonmedia
