// Prints a digest of what each area gives for fixed inputs. Every platform must print the same lines: Digest.expected.
//   Digest LIST      the list names a file a line: message catalogues (.mo), which give the languages, and files with any
//                    text for the readers of text

#include "tests/Platform.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/ZONMediaTypes.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <concepts>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <span>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

namespace
{

using namespace zonmediatypes;
using zoncore::UTF16String;

// FNV-1a over what it is given, whole numbers lowest byte first, doubles as their bits.
class Digest
{
public:
	template <std::integral Integer>
	void Add(Integer inValue)
	{
		const auto value = static_cast<std::uint64_t>(inValue);
		for (unsigned shift = 0; shift < 64; shift += 8)
			mHash = (mHash ^ (value >> shift & 0xFF)) * 0x100'0000'01B3;
	}
	void Add(double inValue) { Add(std::isnan(inValue) ? 0 : std::bit_cast<std::uint64_t>(inValue)); }
	void Add(TickTime inTime) { Add(inTime.GetTicks()); }
	void Add(FrameRate inRate) { Add(inRate.GetTicksPerFrame()); }
	void Add(PixelFormat inFormat)
	{
		Add(std::uint32_t{inFormat.mName});
		Add(inFormat.mProperties.GetValue());
	}
	void Add(PixelAspectRatio inRatio)
	{
		Add(inRatio.GetNumerator());
		Add(inRatio.GetDenominator());
	}
	void Add(const UTF16String& inText)
	{
		Add(inText.size());
		for (const zoncore::UTF16Char unit : inText)
			Add(unit);
	}
	template <class Integer>
	void Add(const boost::rational<Integer>& inValue)
	{
		Add(inValue.numerator());
		Add(inValue.denominator());
	}

	void Print(const std::string& inWhat) const
	{
		std::printf("%-28s %016llx\n", inWhat.c_str(), static_cast<unsigned long long>(mHash));
	}

private:
	std::uint64_t mHash = 0xCBF2'9CE4'8422'2325;
};

// The times of a day that are looked at: a frame before and after each place where something carries, and others between.
std::vector<TickTime> Times()
{
	std::vector<TickTime> times{kTime_Zero, kTime_Max, kTime_Min, kTime_Invalid, TickTime(1), TickTime(-1)};
	for (std::int64_t second = 0; second < 86'400; second += second % 60 == 0 ? 59 : 1)
	{
		const TickTime time(second * kTicksPerSecond + second % 7 * 1'000'003);
		times.push_back(time);
		if (second % 600 < 60)
			times.push_back(-time);
	}
	return times;
}

std::span<const std::int32_t> SampleRates()
{
	static constexpr std::int32_t kRates[] = {-1, 0, 1, 500, 8'000, 44'100, 48'000, 96'000, 2'147'483'647};
	return kRates;
}

constexpr TimecodeFlags kAllFlags[]
	= {0u, kTimecodeFlag_TrimLeadingZeros, kTimecodeFlag_ShowSign, kTimecodeFlag_OmitHours | kTimecodeFlag_LastFrame};

// ---- Time ------------------------------------------------------------------------------------------------------------

void PrintTime(const std::vector<TickTime>& inTimes)
{
	Digest digest;
	for (const FrameRate rate : AllFrameRates())
	{
		digest.Add(rate);
		digest.Add(rate * 1.001);
		digest.Add(rate / 3);
		for (const FrameRate other : AllFrameRates())
			digest.Add(GetFrameRateRatio(rate, other));
		if (rate.IsUsable())
			digest.Add(FrameRateToRatio(rate));
	}
	for (const TickTime time : inTimes)
	{
		digest.Add(time / 3.0);
		digest.Add(time * 0.7);
		digest.Add(TimeToRatioTime(time));
		digest.Add(RatioTimeToTime(TimeToRatioTime(time)));
		digest.Add(RatioTimeToLegacyRatioTime(TimeToRatioTime(time)));
		digest.Add(CorrectLegacyRatioTimeAtTimeScale(RatioTimeToLegacyRatioTime(TimeToRatioTime(time)), 2'997));
		for (int cadence = -1; cadence <= 11; ++cadence)
		{
			bool flag = false;
			digest.Add(
				MapPulldownFrameTo2997Frame(time, kFrameRate_23976, static_cast<PulldownCadence>(cadence), flag));
			digest.Add(flag);
		}
	}
	digest.Print("time");
}

void PrintTimecode(const std::vector<TickTime>& inTimes)
{
	Digest digest;
	for (const TimeDisplay display : AllTimeDisplays())
		for (const FrameRate callers : {kFrameRate_VideoNTSC, kFrameRate_VideoPAL, kFrameRate_Audio48000})
			for (const TickTime time : inTimes)
				for (const TimecodeFlags flags : kAllFlags)
				{
					const UTF16String text = TimeToTimecode(time, callers, display, flags);
					digest.Add(text);
					digest.Add(TimecodeToTime(text, callers, display, flags));
				}
	digest.Print("timecode");
}

void PrintSampleClock(const std::vector<TickTime>& inTimes)
{
	using namespace zonmediatypes::utility;
	const BeatInfo beatInfos[] = {{}, {-1, 63.0, 3, 8, 12.5}, {480, 119.88, 7, 4, -3.25}};
	Digest digest;
	for (std::size_t i = 0; i < inTimes.size(); i += 17)
		for (const std::int32_t sampleRate : SampleRates())
			for (std::uint32_t format = 0; format < 16; ++format)
			{
				const std::int64_t samples = inTimes[i].GetTicks() / 5'292'000 + static_cast<std::int64_t>(i);
				UTF16String text;
				digest.Add(ConvertSamplesToTimecode(text, samples, sampleRate, TimecodeFormat{format},
					i % 2 == 0 ? 30 : 25, &beatInfos[i % 3], i % 5 == 0));
				digest.Add(text);
				BeatInfo beatInfo = beatInfos[i % 3];
				std::int64_t back = 0;
				digest.Add(ConvertTimecodeToSamples(
					back, text, TimecodeFormat{format}, sampleRate, 30, &beatInfo, i % 5 == 0));
				digest.Add(back);
			}
	digest.Print("sample clock");
}

// What the readers of text make of any text.
void PrintReaders(std::span<const UTF16String> inTexts)
{
	using namespace zonmediatypes::utility;
	Digest digest;
	for (const UTF16String& text : inTexts)
	{
		for (const TimeDisplay display : AllTimeDisplays())
			digest.Add(TimecodeToTime(text, kFrameRate_VideoNTSC, display));
		for (std::uint32_t format = 0; format < 16; ++format)
		{
			BeatInfo beatInfo;
			std::int64_t samples = 0;
			digest.Add(ConvertTimecodeToSamples(samples, text, TimecodeFormat{format}, 48'000, 30, &beatInfo, false));
			digest.Add(samples);
		}
		int integer = 0;
		double number = 0;
		digest.Add(zoncore::utility::StringToNumber(text, integer, 0));
		digest.Add(integer);
		digest.Add(zoncore::utility::StringToNumber(text, number, 0));
		digest.Add(number);
		digest.Add(zoncore::utility::NumberToString(number, 1, 4, 0u, 40));
		digest.Add(zoncore::utility::RationalApproximation(number));
	}
	digest.Print("reading text");
}

// ---- Audio and video -------------------------------------------------------------------------------------------------

AudioChannelLayout Layout(const NamedChannelLayout& inLayout)
{
	return {inLayout.mLabels.begin(), inLayout.mLabels.end()};
}

void PrintAudio()
{
	Digest digest;
	for (const NamedChannelLayout& from : AllChannelLayouts())
		for (const NamedChannelLayout& to : AllChannelLayouts())
		{
			ChannelConversionMatrix matrix;
			ComputeChannelConversionMatrix(Layout(from), Layout(to), matrix);
			for (const auto& row : matrix)
				for (const double gain : row)
					digest.Add(gain);
			ChannelOrdering ordering;
			digest.Add(RemapChannelOrdering(Layout(from), Layout(to), ordering));
			for (const std::size_t channel : ordering)
				digest.Add(channel);
		}
	digest.Print("audio");
}

void PrintVideo()
{
	const std::span formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	Digest digest;
	for (const PixelFormat from : formats)
	{
		digest.Add(from);
		for (const PixelFormat to : formats)
			for (const RenderQuality quality : {kRenderQuality_Draft, kRenderQuality_High})
			{
				digest.Add(PixelConversionCost(from.mProperties, to.mProperties, quality));
				digest.Add(SelectNearestPixelFormat({kPixelFormat_Any, from}, to, {from, to}, quality, true));
			}
		for (int width = -3; width < 4'100; width += width < 40 ? 1 : 97)
			for (const int height : {-1, 0, 1, 17, 1'080, 2'147'483'647})
				digest.Add(PixelFormatSize(from, width, height));
	}
	for (const PixelAspectRatio ratio : AllPixelAspectRatios())
		for (int width = -2; width < 2'000; width += 13)
		{
			digest.Add(AdjustPixelAspectDimensionToSquarePixelDimension({width, 576}, ratio).x);
			digest.Add(AdjustSquarePixelDimensionToPixelAspectDimension({width, 576}, ratio).x);
			digest.Add(
				AdjustPixelAspectRatioForNonUniformDownsample(ratio, {0, 0, 720, 576}, {0, 0, 360, 288 + width}));
		}
	digest.Print("video");
}

// ---- Descriptions ----------------------------------------------------------------------------------------------------

// Every description in the language that is installed.
void PrintDescriptions(const std::string& inLanguage)
{
	Digest digest;
	for (const std::string_view key : AllTextKeys())
		digest.Add(zoncore::config::Localizer::Get().Lookup(key));
	for (const FrameRate rate : AllFrameRates())
		digest.Add(FrameRateDescription(rate));
	for (const TimeDisplay display : AllTimeDisplays())
		digest.Add(TimeDisplayDescription(display));
	for (const NamedChannelLayout& layout : AllChannelLayouts())
		digest.Add(AudioChannelLayoutDescription(Layout(layout)));
	for (const AudioChannelLabel label : AllAudioChannelLabels())
		digest.Add(AudioChannelLabelDescription(label, true));
	for (const PixelFormat* format = AllPixelFormatsBegin(); format != AllPixelFormatsEnd(); ++format)
		digest.Add(PixelFormatDescription(*format));
	for (const PixelAspectRatio ratio : AllPixelAspectRatios())
	{
		digest.Add(PixelAspectRatioDescription(ratio));
		digest.Add(VideoFrameSizeDescription({0, 0, 720, 576}, ratio));
	}
	digest.Print("descriptions " + inLanguage);
}

// .../de/LC_MESSAGES/zonmediatypes.mo is German.
std::string LanguageOf(std::string_view inPath)
{
	const auto folder = inPath.rfind("/LC_MESSAGES/");
	return std::string(inPath.substr(0, folder)).substr(inPath.substr(0, folder).rfind('/') + 1);
}

}   // namespace

int main(int inCount, char** inArguments)
{
	std::vector<UTF16String> texts;
	std::vector<std::string> catalogues;
	std::istringstream list(zontest::ReadFile(inCount == 2 ? inArguments[1] : ""));
	for (std::string path; std::getline(list, path);)
	{
		if (path.ends_with(".mo"))
			catalogues.push_back(path);
		else
			texts.push_back(zoncore::utility::UTF8to16(zontest::ReadFile(path)));
	}
	const std::vector<TickTime> times = Times();
	PrintTime(times);
	PrintTimecode(times);
	PrintSampleClock(times);
	PrintReaders(texts);
	PrintAudio();
	PrintVideo();
	PrintDescriptions("en");
	for (const std::string& path : catalogues)
	{
		const auto catalogue = std::make_shared<zoncore::config::MessageCatalogue>();
		std::string error;
		if (!catalogue->Load(path, error))
		{
			std::fprintf(stderr, "%s\n", error.c_str());
			return 1;
		}
		zoncore::config::Localizer::Get().SetCatalogue(catalogue);
		PrintDescriptions(LanguageOf(path));
	}
	zoncore::config::Localizer::Get().SetCatalogue({});
}
