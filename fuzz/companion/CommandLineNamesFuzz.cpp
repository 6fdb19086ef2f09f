// Rates, displays, times and layouts as they are typed on a command line: read whole or refused in one line.

#include "fuzz/Checks.h"
#include "zonmedia/AudioNames.h"
#include "zonmedia/TimeNames.h"
#include "zonmedia/VideoNames.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <cstring>
#include <numeric>
#include <optional>
#include <string>
#include <string_view>
#include <type_traits>

namespace
{

using namespace zonmedia;
using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

// Reads with inRead what may be no name, or else checks what was read.
template <class Problem, class Read, class Check>
void ReadAndCheck(std::string_view inText, Read&& inRead, Check&& inCheck)
{
	std::optional<std::invoke_result_t<Read, std::string_view>> value;
	try
	{
		value = inRead(inText);
	}
	catch (const Problem& problem)
	{
		Require(*problem.what() != '\0', "a refusal has a reason");
		Require(inText.find('\n') != std::string_view::npos || std::strchr(problem.what(), '\n') == nullptr,
			"and its reason is one line");
	}
	if (value)
		inCheck(*value);
}

// A text of some characters: refusing one measures its distance to every name of a list.
std::string_view TakeText(FuzzInput& ioInput)
{
	return ioInput.Rest().substr(0, 16);
}

void CheckRate(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(ioInput.Rest(), ReadRate,
		[](const Rate& inRate)
		{
			Require(inRate.mRate.GetTicksPerFrame() > 0 && inRate.mRate.IsUsable(), "a rate that is read can be used");
			Require(inRate.mStated.mNumerator > 0 && inRate.mStated.mDenominator > 0, "a rate is above 0");
			Require(Reduced(inRate.mStated) == inRate.mStated, "a rate is stated in lowest terms");
			const Rate again = ReadRate(
				std::to_string(inRate.mStated.mNumerator) + "/" + std::to_string(inRate.mStated.mDenominator));
			Require(again.mRate == inRate.mRate && again.mIsRounded == inRate.mIsRounded,
				"the fraction stands for the rate");
			Require(!Text(inRate).empty(), "a rate has a text");
		});
}

void CheckTime(FuzzInput& ioInput)
{
	const TimeForm form = ioInput.OneOf(TimeForms()).mValue;
	const FrameRate rate = ioInput.OneOf(AllFrameRates());
	const auto read = [&](std::string_view inText) { return ReadTime(inText, rate, form); };
	ReadAndCheck<InputProblem>(ioInput.Rest(), read,
		[&](TickTime inTime)
		{
			const std::string text = TimeText(inTime, rate, form);
			Require(!text.empty(), "a time has a text");
			Require(form.mDisplay || ReadTime(text, rate, form) == inTime, "ticks survive");
		});
}

void CheckLayout(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(TakeText(ioInput), ReadLayout,
		[](const AudioChannelLayout& inLayout)
		{
			std::string abbreviations;
			for (const AudioChannelDescription channel : inLayout)
				abbreviations += Abbreviation(channel.mLabel) + ",";
			Require(
				inLayout.empty() || ReadLayout(abbreviations) == inLayout, "a layout is the list of its abbreviations");
		});
}

void CheckForm(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(TakeText(ioInput), ReadTimeForm,
		[](TimeForm inForm) { Require(ReadTimeForm(NameOf(inForm)) == inForm, "a form has a name"); });
}

void CheckDistance(FuzzInput& ioInput)
{
	const std::string_view text = ioInput.Rest();
	const std::string_view left = text.substr(0, text.size() / 2), right = text.substr(text.size() / 2);
	const std::size_t distance = EditDistance(left, right);
	Require(distance == EditDistance(right, left), "a distance has no direction");
	Require(
		EditDistance(left, left) == 0 && distance <= std::max(left.size(), right.size()), "and is no longer than text");
	Require(IsSameName(left, right) == (distance == 0), "names without a distance are one");
}

void CheckFormats(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(TakeText(ioInput), ReadPixelFormats,
		[](const PixelFormats& inFormats)
		{
			std::string names;
			for (const PixelFormat format : inFormats)
				names.append(names.empty() ? "" : ",").append(NameOf(format));
			Require(ReadPixelFormats(names) == inFormats, "formats are the list of their names");
		});
}

void CheckSize(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(ioInput.Rest(), ReadSize,
		[](zoncore::PointT<int> inSize)
		{
			Require(inSize.x > 0 && inSize.y > 0, "a size is above 0");
			Require(ReadSize(std::to_string(inSize.x) + "x" + std::to_string(inSize.y)) == inSize, "a size survives");
		});
}

void CheckShape(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(ioInput.Rest(), ReadPixelAspectRatio,
		[](PixelAspectRatio inRatio)
		{
			const PixelAspectRatio again = ReadPixelAspectRatio(
				std::to_string(inRatio.GetNumerator()) + "/" + std::to_string(inRatio.GetDenominator()));
			Require(
				again.GetNumerator() == inRatio.GetNumerator() && again.GetDenominator() == inRatio.GetDenominator(),
				"a shape survives");
		});
}

void CheckQuality(FuzzInput& ioInput)
{
	ReadAndCheck<UsageProblem>(TakeText(ioInput), ReadQuality,
		[](RenderQuality inQuality)
		{ Require(inQuality >= kRenderQuality_Draft && inQuality <= kRenderQuality_Max, "a quality is known"); });
}

// A name in capitals and small letters, with marks that do not count, as the input has it.
std::string Rewritten(std::string_view inName, FuzzInput& ioInput)
{
	std::string text;
	for (const char character : inName)
	{
		const auto change = ioInput.Any<std::uint8_t>();
		if (change % 8 < 3)
			text.push_back("_- "[change % 8]);
		const bool isSmall = character >= 'a' && character <= 'z';
		text.push_back(isSmall && change >= 128 ? static_cast<char>(character - 'a' + 'A') : character);
	}
	return text;
}

void CheckRewriting(FuzzInput& ioInput)
{
	const Named<AudioChannelLayout>& layout = LayoutNames()[ioInput.Below(LayoutNames().size())];
	Require(ReadLayout(Rewritten(layout.mName, ioInput)) == layout.mValue, "a layout however it is written");
	const Named<TimeForm>& form = TimeForms()[ioInput.Below(TimeForms().size())];
	Require(ReadTimeForm(Rewritten(form.mName, ioInput)) == form.mValue, "a form however it is written");
	const Named<PixelFormat>& format = PixelFormatNames()[ioInput.Below(PixelFormatNames().size())];
	Require(ReadPixelFormat(Rewritten(format.mName, ioInput)) == format.mValue, "a format however it is written");
	Require(ReadPixelFormat(CodeOf(format.mValue)).mName == format.mValue.mName, "a format by its code");
}

void CheckLists(FuzzInput& ioInput)
{
	PixelFormats formats;
	AudioChannelLayout layout;
	std::string formatNames, abbreviations;
	for (std::size_t rest = 1 + ioInput.Below(5); rest > 0; --rest)
	{
		const Named<PixelFormat>& format = PixelFormatNames()[ioInput.Below(PixelFormatNames().size())];
		formats.push_back(format.mValue);
		formatNames += format.mName + (rest > 1 ? "," : "");
		layout.emplace_back(ioInput.OneOf(AllAudioChannelLabels()));
		abbreviations += Abbreviation(layout.back().mLabel) + ",";
	}
	Require(ReadPixelFormats(formatNames) == formats, "a list of names is the formats in order");
	Require(ReadLayout(abbreviations) == layout, "a list of abbreviations is the channels in order");
}

// What is spelled from numbers is read as them.
void CheckSpelled(FuzzInput& ioInput)
{
	const std::int64_t numerator = 1 + ioInput.Any<std::uint16_t>(), denominator = 1 + ioInput.Any<std::uint16_t>();
	const std::string over = std::to_string(numerator) + "/" + std::to_string(denominator);
	const Rate rate = ReadRate(over);
	const std::int64_t common = std::gcd(numerator, denominator), ticks = kTicksPerSecond * denominator;
	Require(rate.mStated == Fraction{numerator / common, denominator / common}, "a rate is stated as it is spelled");
	Require(
		std::abs(rate.mRate.GetTicksPerFrame() * numerator - ticks) * 2 <= numerator, "and has the nearest duration");
	Require(rate.mIsRounded == (ticks % numerator != 0), "which may be exact");
	const PixelAspectRatio shape = ReadPixelAspectRatio(over);
	Require(shape.GetNumerator() == numerator && shape.GetDenominator() == denominator, "a shape is read as spelled");
	const auto size = ReadSize(std::to_string(numerator) + "x" + std::to_string(denominator));
	Require(size.x == numerator && size.y == denominator, "so is a size");
	constexpr std::array<std::string_view, 5> kQualities{"draft", "low", "medium", "high", "max"};
	const std::size_t quality = ioInput.Below(kQualities.size());
	Require(ReadQuality(kQualities[quality]) == static_cast<RenderQuality>(quality + 1), "so is a quality");

	// A frame of a day, at the rate of the form or at any.
	const TimeForm form = ioInput.OneOf(TimeForms()).mValue;
	const FrameRate any = ioInput.OneOf(AllFrameRates());
	const FrameRate counted = form.mDisplay ? GetFrameRateForTimeDisplay(*form.mDisplay, any) : any;
	const bool isWhole = counted.IsUsable() && kTicksPerSecond % counted.GetTicksPerFrame() == 0;
	TickTime time(ioInput.Any<std::int64_t>() % (86'399 * kTicksPerSecond));
	time.AlignToFrame(counted);
	if (counted.IsUsable() && time.ToFrame64(counted) == time.ToFrame32(counted)
		&& (isWhole || form.mDisplay != kTimeDisplay_AudioSamples))
		Require(ReadTime(TimeText(time, counted, form), counted, form) == time, "so is a time");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf({CheckRate, CheckTime, CheckLayout, CheckForm, CheckDistance, CheckFormats, CheckSize,
								 CheckShape, CheckQuality, CheckRewriting, CheckLists, CheckSpelled},
		inData, inSize);
}
