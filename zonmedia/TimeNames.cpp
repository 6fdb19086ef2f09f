#include "zonmedia/TimeNames.h"

#include "zoncore/StringUtils.h"
#include "zonmedia/Input.h"
#include "zonmedia/Texts.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/TimeBase.h"

#include <array>
#include <charconv>
#include <limits>
#include <sstream>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

namespace
{

// The whole of inText as a decimal number.
std::optional<std::int64_t> WholeNumber(std::string_view inText)
{
	std::int64_t number = 0;
	const auto [end, error] = std::from_chars(inText.data(), inText.data() + inText.size(), number);
	return error == std::errc() && end == inText.data() + inText.size() ? std::optional(number) : std::nullopt;
}

// The rate in frames or samples a second, as the library writes it: "29.97".
std::string Text(FrameRate inRate)
{
	std::ostringstream stream;
	stream << inRate;
	return stream.str();
}

// What one frame of inRate takes, turned round: a rate of the library's as a fraction.
Fraction FramesPerSecondOf(FrameRate inRate)
{
	return Reduced({kTicksPerSecond, inRate.GetTicksPerFrame()});
}

std::vector<Named<FrameRate>> MakeRateNames()
{
	std::vector<Named<FrameRate>> names;
	for (const FrameRate rate : AllFrameRates())
	{
		if (rate.IsUsable())
			names.push_back({Text(rate), rate});
	}
	return names;
}

std::optional<Fraction> ReadSampleRate(std::string_view inText)
{
	const std::string_view unit = inText.substr(inText.size() - std::min<std::size_t>(inText.size(), 2));
	const bool isSampleRate = unit == "Hz" || unit == "hz" || unit == "HZ";
	const auto samples = isSampleRate ? WholeNumber(inText.substr(0, inText.size() - unit.size())) : std::nullopt;
	return samples ? std::optional(Fraction{*samples, 1}) : std::nullopt;
}

std::optional<Fraction> ReadFraction(std::string_view inText)
{
	const std::size_t slash = inText.find('/');
	if (slash == std::string_view::npos)
		return std::nullopt;
	const auto numerator = WholeNumber(inText.substr(0, slash));
	const auto denominator = WholeNumber(inText.substr(slash + 1));
	return numerator && denominator ? std::optional(Fraction{*numerator, *denominator}) : std::nullopt;
}

// Displays that count at the caller's rate have names of their own; every other is named by its rate.
constexpr auto sNamesWithoutRate = std::to_array<std::pair<TimeDisplay, std::string_view>>({
	{kTimeDisplay_Frames, "frames"},
	{kTimeDisplay_16mmFeetFrames, "16mm"},
	{kTimeDisplay_35mmFeetFrames, "35mm"},
	{kTimeDisplay_AudioSamples, "samples"},
	{kTimeDisplay_Milliseconds, "ms"},
	{kTimeDisplay_Auto, "auto"},
});

std::string DisplayName(TimeDisplay inDisplay)
{
	const auto row = std::ranges::find(sNamesWithoutRate, inDisplay, &std::pair<TimeDisplay, std::string_view>::first);
	if (row != sNamesWithoutRate.end())
		return std::string(row->second);
	std::string rate = Text(GetFrameRateForTimeDisplay(inDisplay, kFrameRate_Zero));
	if (!IsDropFrameApplicableForTimeDisplay(inDisplay))
		return rate;
	return rate + (IsTimeDisplayDropFrame(inDisplay) ? "df" : "ndf");
}

std::vector<Named<TimeForm>> MakeTimeForms()
{
	std::vector<Named<TimeForm>> forms;
	for (const TimeDisplay display : AllTimeDisplays())
		forms.push_back({DisplayName(display), {display}});
	forms.push_back({"ticks", {}});
	return forms;
}

// An example shows something in every field.
constexpr int kExampleSeconds = 1 * 3600 + 2 * 60 + 3;

std::string Expectation(FrameRate inRate, TimeForm inForm)
{
	if (!inForm.mDisplay)
		return "not a time; expected a whole number of ticks such as " + std::to_string(kTicksPerSecond);
	const std::string description = DescriptionOf(inForm);
	TickTime example = TickTime(kTicksPerSecond) * kExampleSeconds;
	example.AddFrames(4, inRate);
	return "not a time; expected something such as " + TimeText(example, inRate, inForm)
		+ (description.empty() ? "" : " (" + description + ")");
}

// What the library reads as one foot; 0 where it does not show feet and frames and so rejects the "+" between them.
std::uint64_t FramesPerFoot(TimeForm inForm)
{
	constexpr FrameRate kFrameIsTick(1);
	const TickTime foot
		= inForm.mDisplay ? TimecodeToTime(UTF8to16("1+0"), kFrameIsTick, *inForm.mDisplay) : kTime_Invalid;
	return foot == kTime_Invalid ? 0 : static_cast<std::uint64_t>(foot.GetTicks());
}

// A sign, which may be missing, and one number or two with a separator between them: the library reads the rest as 0.
bool IsFeetAndFrames(std::string_view inText)
{
	const auto isNumber = [](std::string_view inNumber)
	{ return !inNumber.empty() && inNumber.find_first_not_of("0123456789") == std::string_view::npos; };
	inText.remove_prefix(inText.starts_with('+') || inText.starts_with('-') ? 1 : 0);
	const std::size_t separator = inText.find_first_of("+.:;");
	return isNumber(inText.substr(0, separator))
		&& (separator == std::string_view::npos || isNumber(inText.substr(separator + 1)));
}

// The library reads a larger number as 32 bits hold; the time of more frames than ticks can count wraps, and so do the
// frames of feet beyond 32 bits.
std::uint64_t MostReadable(FrameRate inRate, TimeForm inForm)
{
	constexpr std::uint64_t kMostOfGroup = std::numeric_limits<std::uint32_t>::max();
	constexpr std::uint64_t kMostFilmFrames = std::numeric_limits<std::int32_t>::max();
	constexpr std::int64_t kMostTicks = std::numeric_limits<std::int64_t>::max();
	const auto mostFrames = static_cast<std::uint64_t>(kMostTicks / inRate.GetTicksPerFrame());
	if (const std::uint64_t framesPerFoot = FramesPerFoot(inForm); framesPerFoot != 0)
		return std::min(kMostFilmFrames, mostFrames) / framesPerFoot;
	return inForm.mDisplay == kTimeDisplay_Frames ? std::min(kMostOfGroup, mostFrames) : kMostOfGroup;
}

}   // namespace

std::optional<Rate> MakeRate(Fraction inFramesPerSecond)
{
	if (inFramesPerSecond.mNumerator <= 0 || inFramesPerSecond.mDenominator <= 0)
		return std::nullopt;
	const Fraction stated = Reduced(inFramesPerSecond);
	const auto frame = TimeBase::FromRatio(stated.mDenominator, stated.mNumerator);
	const auto ticks = frame ? frame->ToTicks(1, Rounding::Nearest) : std::nullopt;
	const FrameRate rate = ticks ? FrameRate(ticks->GetTicks()) : kFrameRate_Zero;
	return rate.IsUsable() ? std::optional(Rate{stated, rate, !frame->IsExact()}) : std::nullopt;
}

Rate ReadRate(std::string_view inText)
{
	static const std::vector<Named<FrameRate>> sNames = MakeRateNames();
	const std::optional<Fraction> fraction
		= inText.find('/') != std::string_view::npos ? ReadFraction(inText) : ReadSampleRate(inText);
	if (fraction)
	{
		if (const std::optional<Rate> rate = MakeRate(*fraction))
			return *rate;
		throw UsageProblem("the rate " + Quoted(inText) + " cannot be used; expected above 0 and up to "
			+ std::to_string(kTicksPerSecond) + " frames a second, and at most "
			+ std::to_string(std::numeric_limits<std::int64_t>::max() / kTicksPerSecond) + " seconds a frame");
	}
	const auto exact = std::ranges::find(sNames, inText, &Named<FrameRate>::mName);
	if (exact != sNames.end())
		return {FramesPerSecondOf(exact->mValue), exact->mValue, false};
	std::vector<std::string_view> names;
	for (const auto& named : sNames)
		names.emplace_back(named.mName);
	throw UsageProblem(
		UnknownName("rate", inText, names) + "; a fraction (30000/1001) or a sample rate (48000Hz) also serve");
}

std::string Text(const Rate& inRate)
{
	return Text(inRate.mStated) + " (" + WithDecimalSign(UTF16to8(FrameRateDescription(inRate.mRate))) + ")";
}

std::span<const Named<TimeForm>> TimeForms()
{
	static const std::vector<Named<TimeForm>> sForms = MakeTimeForms();
	return sForms;
}

TimeForm ReadTimeForm(std::string_view inName)
{
	return ValueNamed<TimeForm>(TimeForms(), "display", inName);
}

std::string NameOf(TimeForm inForm)
{
	return NameOf<TimeForm>(TimeForms(), inForm);
}

TimeForm ChosenForm(TimeForm inForm, FrameRate inRate)
{
	return inForm.mDisplay == kTimeDisplay_Auto
		? TimeForm{GetTimeDisplayForFrameRate(inRate, true, false, kTimeDisplay_Frames, false)}
		: inForm;
}

std::string DescriptionOf(TimeForm inForm)
{
	return inForm.mDisplay ? UTF16to8(TimeDisplayDescription(*inForm.mDisplay)) : Say(kText_Ticks);
}

std::string TimeText(TickTime inTime, FrameRate inRate, TimeForm inForm, TimecodeFlags inFlags)
{
	if (!inForm.mDisplay)
		return std::to_string(inTime.GetTicks());
	const TimecodeFlags sign = inTime < kTime_Zero ? kTimecodeFlag_ShowSign : TimecodeFlags();
	const std::string text = UTF16to8(TimeToTimecode(inTime, inRate, *inForm.mDisplay, inFlags | sign));
	return inForm.mDisplay == kTimeDisplay_Milliseconds ? WithDecimalSign(text) : text;
}

TickTime ReadTime(std::string_view inText, FrameRate inRate, TimeForm inForm)
{
	if (const std::uint64_t most = MostReadable(inRate, inForm); inForm.mDisplay && HasNumberAbove(inText, most))
		throw InputProblem("too large a number in it; expected " + std::to_string(most) + " at most");
	if (inForm.mDisplay && !inText.empty() && (FramesPerFoot(inForm) == 0 || IsFeetAndFrames(inText)))
	{
		std::string text(inText);
		if (inForm.mDisplay == kTimeDisplay_Milliseconds)
			std::ranges::replace(text, ',', '.');   // as other languages write decimals
		const TickTime time = TimecodeToTime(UTF8to16(text), inRate, *inForm.mDisplay);
		if (time != kTime_Invalid)
			return time;
	}
	const auto ticks = inForm.mDisplay ? std::nullopt : WholeNumber(inText.substr(inText.starts_with('+') ? 1 : 0));
	if (ticks)
		return TickTime(*ticks);
	throw InputProblem(Expectation(inRate, inForm));
}

Value TimeValue(TickTime inTime, FrameRate inRate, TimeForm inForm, TimecodeFlags inFlags)
{
	const std::string text = TimeText(inTime, inRate, inForm, inFlags);
	return {text, Json{{"text", text}, {"ticks", inTime.GetTicks()}}};
}

Table TimeTable(std::string_view inName, TickTime inTime, FrameRate inRate, std::optional<FrameRate> inSampleRate,
	TimeForm inExcept)
{
	Table table{std::string(inName), {"Display", "Description", "Text"}, {}};
	for (const auto& [name, form] : TimeForms())
	{
		const bool countsSamples = form.mDisplay == kTimeDisplay_AudioSamples;
		if (form == inExcept || form.mDisplay == kTimeDisplay_Auto || (countsSamples && !inSampleRate))
			continue;
		const FrameRate rate = countsSamples ? *inSampleRate : inRate;
		table.mRows.push_back({name, DescriptionOf(form), TimeText(inTime, rate, form)});
	}
	return table;
}

}   // namespace zonmedia
