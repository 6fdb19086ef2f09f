// Rates, displays, times and layouts as they are typed on a command line: read whole or refused in one line.

#include "FuzzInput.h"
#include "zonmedia/AudioNames.h"
#include "zonmedia/TimeNames.h"
#include "zonmedia/VideoNames.h"

#include <string>

namespace
{

using namespace zonmedia;
using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

// Calls inFunction, which may refuse the text that it was given.
template <class Problem, class Function>
void MayRefuse(Function&& inFunction)
{
	try
	{
		inFunction();
	}
	catch (const Problem& problem)
	{
		Require(*problem.what() != '\0', "a refusal has a reason");
	}
}

void CheckRate(std::string_view inText)
{
	const Rate rate = ReadRate(inText);
	Require(rate.mRate.GetTicksPerFrame() > 0 && rate.mRate.IsUsable(), "a rate that is read can be used");
	Require(rate.mStated.mNumerator > 0 && rate.mStated.mDenominator > 0, "a rate is above 0");
	Require(Reduced(rate.mStated) == rate.mStated, "a rate is stated in lowest terms");
	const Rate again
		= ReadRate(std::to_string(rate.mStated.mNumerator) + "/" + std::to_string(rate.mStated.mDenominator));
	Require(again.mRate == rate.mRate && again.mIsRounded == rate.mIsRounded, "the fraction stands for the rate");
	Require(!Text(rate).empty(), "a rate has a text");
}

void CheckTime(std::string_view inText, TimeForm inForm, FrameRate inRate)
{
	const TickTime time = ReadTime(inText, inRate, inForm);
	if (!inForm.mDisplay)
		Require(ReadTime(TimeText(time, inRate, inForm), inRate, inForm) == time, "ticks survive");
	Require(!TimeText(time, inRate, inForm).empty(), "a time has a text");
}

void CheckLayout(std::string_view inText)
{
	const AudioChannelLayout layout = ReadLayout(inText);
	std::string abbreviations;
	for (const AudioChannelDescription channel : layout)
		abbreviations += Abbreviation(channel.mLabel) + ",";
	Require(layout.empty() || ReadLayout(abbreviations) == layout, "a layout is the list of its abbreviations");
}

void CheckFormats(std::string_view inText)
{
	const PixelFormats formats = ReadPixelFormats(inText);
	std::string names;
	for (const PixelFormat format : formats)
		names += (names.empty() ? "" : ",") + NameOf(format);
	Require(formats.empty() || ReadPixelFormats(names) == formats, "formats are the list of their names");
}

void CheckSize(std::string_view inText)
{
	const zoncore::PointT<int> size = ReadSize(inText);
	Require(size.x > 0 && size.y > 0, "a size is above 0");
	Require(ReadSize(std::to_string(size.x) + "x" + std::to_string(size.y)) == size, "a size survives");
}

void CheckShape(std::string_view inText)
{
	const PixelAspectRatio ratio = ReadPixelAspectRatio(inText);
	const std::string text = std::to_string(ratio.GetNumerator()) + "/" + std::to_string(ratio.GetDenominator());
	Require(ReadPixelAspectRatio(text) == ratio, "a shape survives");
}

void CheckDistance(std::string_view inText)
{
	const std::string_view left = inText.substr(0, inText.size() / 2), right = inText.substr(inText.size() / 2);
	const std::size_t distance = EditDistance(left, right);
	Require(distance == EditDistance(right, left), "a distance has no direction");
	Require(
		EditDistance(left, left) == 0 && distance <= std::max(left.size(), right.size()), "and is no longer than text");
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	const std::size_t kind = input.Below(9);
	const TimeForm form = TimeForms()[input.Below(TimeForms().size())].mValue;
	const FrameRate rate = input.OneOf(AllFrameRates());
	const std::string_view text = input.Rest();
	switch (kind)
	{
	case 0:
		MayRefuse<UsageProblem>([&] { CheckRate(text); });
		break;
	case 1:
		MayRefuse<InputProblem>([&] { CheckTime(text, form, rate); });
		break;
	case 2:
		MayRefuse<UsageProblem>([&] { CheckLayout(text); });
		break;
	case 3:
		MayRefuse<UsageProblem>([&] { Require(!NameOf(ReadTimeForm(text)).empty(), "a form has a name"); });
		break;
	case 4:
		CheckDistance(text);
		break;
	case 5:
		MayRefuse<UsageProblem>([&] { CheckFormats(text); });
		break;
	case 6:
		MayRefuse<UsageProblem>([&] { CheckSize(text); });
		break;
	case 7:
		MayRefuse<UsageProblem>([&] { CheckShape(text); });
		break;
	case 8:
		MayRefuse<UsageProblem>([&] { Require(ReadQuality(text) > 0, "a quality is known"); });
		break;
	}
	return 0;
}
