#include "tests/Allocations.h"
#include "zoncore/CheckRegistry.h"
#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/Timecode.h"

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <functional>
#include <span>
#include <string>
#include <vector>

// Every function that allocates either does all of its work or throws, leaves everything as before and leaks nothing: each of
// its allocations is made to fail. Blocks of a pool do not fail, so that texts and layouts are large where they can be;
// the build without the pool sees every one.

namespace
{

using namespace zonmediatypes;

using zoncore::UTF16String;
using zoncore::ZString;
using zoncore::config::Localizer;
using zontest::FailEachAllocation;
namespace debug = zoncore::debug;
namespace utility = zoncore::utility;

constexpr int kMany = 300;

// L, many unlabelled channels, and R.
AudioChannelLayout LargeLayout()
{
	AudioChannelLayout layout = CreateMultichannelLayout(kMany);
	layout.front() = kAudioChannelLabel_FrontLeft;
	layout.back() = kAudioChannelLabel_FrontRight;
	return layout;
}

// ---- Functions that return what they make ----------------------------------------------------------------------------

// inFunction throws for each allocation that fails, and gives in the end what it gives when none does. The first call is
// among those: what is made once in a process can fail, too.
template <class Function>
void ExpectAllOrThrow(Function inFunction)
{
	auto result = decltype(inFunction())();
	FailEachAllocation([&] { result = inFunction(); }, [] {});
	EXPECT_TRUE(result == inFunction());
}

TEST(WhenMemoryRunsOut, TextsAreWholeOrThrown)
{
	const std::string narrow(kMany, 'x');
	const UTF16String wide = utility::AsciiToUTF16(narrow), pattern = utility::AsciiToUTF16("@0 and @0");
	const AudioChannelLayout layout = CreateVST22_2ChannelLayout(), large = LargeLayout();
	const AudioChannelLayouts twoStreams = {layout, large};
	const zoncore::RectT<int> frame{0, 0, 1'920, 1'080};
	const PixelFormat custom{MakePixelFormatName('_', 'r', 'a', 'w'), {}};
	const std::function<UTF16String()> texts[] = {
		[&] { return utility::AsciiToUTF16(narrow); },
		[&] { return utility::UTF8to16(narrow + "\u00E9"); },
		[&] { return utility::Coercion(wide); },
		[&] { return utility::AsciiToUTF16(utility::UTF16to8(wide)); },
		[] { return utility::NumberToString(1e300, 1, 9, 0, 400); },
		[&] { return Localizer::Get().Lookup("=" + narrow); },
		[&] { return UTF16String(ZString("=@0 and @0", {wide})); },
		[&] { return zoncore::FillPlaceholders(pattern, std::span(&wide, 1)); },
		[] { return TimeToTimecode(kTime_Max, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode); },
		[] { return RatioTimeToTimecode(RatioTime(1, 3), kFrameRate_VideoPAL, kTimeDisplay_25Timecode); },
		[] { return FrameRateDescription(kFrameRate_23976); },
		[] { return TimeDisplayDescription(kTimeDisplay_2997DropTimecode); },
		[] { return AudioChannelLabelDescription(kAudioChannelLabel_BackLeft, true); },
		[] { return AudioChannelLabelAbbreviations(kAudioChannelLabel_BackLeft); },
		[] { return AudioChannelLabelAbbreviationsUnlocalized(kAudioChannelLabel_BackLeft); },
		[&] { return AudioChannelLayoutDescription(layout); },
		[&] { return AudioChannelLayoutDescriptionUnlocalized(large); },
		[&] { return AudioChannelConfigurationDescription(AudioChannelLayouts(3, layout)); },
		[&] { return AudioChannelConfigurationDescription(twoStreams); },
		[] { return RenderQualityDescription(kRenderQuality_Medium); },
		[] { return FieldTypeDescription(kFieldType_UpperFirst); },
		[] { return PixelFormatDescription(kPixelFormat_VUYA_4444_32f_709); },
		[] { return PixelFormatDescription(kPixelFormat_BGRX_4444_32f_Linear); },
		[&] { return PixelFormatDescription(custom); },
		[] { return PixelAspectRatioDescription(kPixelAspectRatio_DVNTSC); },
		[&] { return VideoFrameSizeDescription(frame, kPixelAspectRatio_DVPAL); },
		[] { return kPixelAspectRatio_DVPAL.GetDisplayString(); },
	};
	for (const auto& text : texts)
		ExpectAllOrThrow(text);
	ExpectAllOrThrow([buffer = std::array<char, 20>()]() mutable
		{ return FrameRateDescription(std::span(buffer), kFrameRate_23976); });
}

TEST(WhenMemoryRunsOut, LayoutsAndMapsAreWholeOrThrown)
{
	const AudioChannelLayout large = LargeLayout();
	ExpectAllOrThrow([&] { return ContainsSameChannelsIgnoreOrder(large, {large.rbegin(), large.rend()}); });
	ExpectAllOrThrow([] { return CreateMultichannelLayoutWithDefaultLabels(kMany); });
	ExpectAllOrThrow([] { return CreateVST22_2ChannelLayout(); });
	ExpectAllOrThrow([&] { return ChannelMap(large); });
	ExpectAllOrThrow([] { return ChannelMap::CreateDefaultChannelMap(kMany); });
	ExpectAllOrThrow([&] { return ChannelMap(large).GetChannelLayout(0); });
	ExpectAllOrThrow([] { return AudioFormat::CreateDefaultAudioFormat(kMany, 48'000); });
}

// ---- Functions that change something ---------------------------------------------------------------------------------

// ioValue is as before whenever an allocation of inFunction fails, and another in the end.
template <class Value, class Function>
void ExpectAllOrNothing(Value& ioValue, Function inFunction)
{
	const Value before = ioValue;
	EXPECT_GT(FailEachAllocation(inFunction, [&] { EXPECT_EQ(ioValue, before); }), 0);
	EXPECT_NE(ioValue, before);
}

TEST(WhenMemoryRunsOut, OutputsAreAsBefore)
{
	const AudioChannelLayout many = LargeLayout(), reversed(many.rbegin(), many.rend());
	const AudioChannelLayout unlabelled = CreateMultichannelLayout(kMany);
	ChannelConversionMatrix matrix;
	ExpectAllOrNothing(matrix, [&] { CreateIdentityChannelConversionMatrix(kMany, 2, matrix); });
	ExpectAllOrNothing(matrix, [&] { ComputeChannelConversionMatrix(many, reversed, matrix); });
	ExpectAllOrNothing(matrix, [&] { ComputeChannelConversionMatrix(unlabelled, many, matrix); });
	ChannelOrdering ordering = {42};
	ExpectAllOrNothing(ordering, [&] { RemapChannelOrdering(many, reversed, ordering); });
	AudioChannelLayout layout = many;
	ExpectAllOrNothing(layout,
		[&] { ReplaceDiscreteLabelsWithDestinationLayoutLabels(layout, CreateVST22_2ChannelLayout(), layout); });
	UTF16String text(kMany, 'x');
	ExpectAllOrNothing(text, [&, x = UTF16String(1, 'x'), y = UTF16String(3, 'y')] { ReplaceInString(text, x, y); });
}

TEST(WhenMemoryRunsOut, MapsAndFormatsAreAsBefore)
{
	const AudioChannelLayout many = LargeLayout(), reversed(many.rbegin(), many.rend());
	constexpr auto kLeft = kAudioChannelLabel_FrontLeft;
	ChannelMap map;
	ExpectAllOrNothing(map, [&] { map.AddChannel(many, 0); });
	ExpectAllOrNothing(map, [&] { map.AddChannel(many, 1); });
	ExpectAllOrNothing(map, [&] { map.SetChannelLayout(0, reversed); });
	for (const int channel : {1, 2, -1})
		ExpectAllOrNothing(map, [&] { map.SetDeviceChannelIndexForChannelLabel(kLeft, channel); });
	ExpectAllOrNothing(map, [&, other = ChannelMap(many)] { map = other; });

	AudioFormat format;
	ExpectAllOrNothing(format, [&, other = AudioFormat::CreateDefaultAudioFormat(kMany, 48'000)] { format = other; });
	ExpectAllOrNothing(format, [&] { format.SetChannelLayout(many); });
	ExpectAllOrNothing(format, [&] { NormalizeChannelOrder(format); });
	AudioChannelLayout layout;
	ExpectAllOrNothing(layout, [&] { format.GetChannelLayout(layout); });
}

TEST(WhenMemoryRunsOut, HooksStay)
{
	int reports = 0;
	const auto count = [&reports, large = std::string(kMany, 'x')](auto&&...) { return ++reports, large.empty(); };
	const auto expectStays = [&](auto inSet, auto inReport)
	{
		inSet(count);
		const int before = reports;
		const long failures = FailEachAllocation([&] { inSet([](auto&&...) { return false; }); }, inReport);
		EXPECT_GT(failures, 0);
		inReport();
		EXPECT_EQ(reports - before, failures);
		inSet(nullptr);
	};
	std::atomic<bool> isDisabled = false;
	expectStays([](auto inHook) { Localizer::Get().SetTranslator(inHook); }, [] { Localizer::Get().Lookup(""); });
	expectStays(
		[](auto inHook) { zoncore::config::SetErrorReporter(inHook); }, [] { zoncore::config::ThrowError(0, "="); });
	expectStays(
		[](auto inHook) { debug::SetContractDialog(inHook); }, [] { debug::BreakAfterContractDialog("", "", "", 0); });
	expectStays([](auto inHook) { debug::SetAssertDialog(inHook); },
		[&] { debug::BreakAfterAssertDialog(isDisabled, "", "", "", 0, "", true); });
}

TEST(WhenMemoryRunsOut, RegistriesAreAsBefore)
{
	zoncore::CheckRegistry registry;
	const std::string name(kMany, 'n');
	const auto pass = [](std::string&) { return true; };
	EXPECT_GT(FailEachAllocation(
				  [&] { registry.Register(name, name, pass); }, [&] { EXPECT_TRUE(registry.GetSuites().empty()); }),
		0);
	ExpectAllOrThrow([&] { return registry.GetSuites(); });
	ExpectAllOrThrow([&] { return registry.Run(name, {}); });

	constexpr PixelFormatName kName = MakePixelFormatName('_', 'm', 'e', 'm');
	FailEachAllocation([] { RegisterCustomPixelFormatProperties(kName, kPixelFormatProperties_Any); },
		[] { EXPECT_EQ(LookupPropertiesForName(kName), kPixelFormatProperties_Invalid); });
	EXPECT_EQ(LookupPropertiesForName(kName), kPixelFormatProperties_Any);
}

// ---- Functions that allocate nothing, or once ------------------------------------------------------------------------

TEST(Allocations, AreNotNeededToReadToAskAndToChoose)
{
	const UTF16String timecode = utility::AsciiToUTF16("01:02:03:04"), feet = utility::AsciiToUTF16("12+08");
	const UTF16String number = utility::AsciiToUTF16(std::string(10'000, '1') + ".5e-10000");
	const PixelFormats formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	const AudioChannelLayout many = LargeLayout();
	const ChannelMap map = ChannelMap::CreateDefaultChannelMap(kMany);
	double value = 0;
	const auto use = [&]
	{
		EXPECT_TRUE(utility::StringToNumber(number, value, 0));
		EXPECT_NE(TimecodeToTime(timecode, kFrameRate_VideoPAL, kTimeDisplay_25Timecode), kTime_Zero);
		EXPECT_NE(TimecodeToTime(feet, kFrameRate_Film24, kTimeDisplay_35mmFeetFrames), kTime_Zero);
		SelectNearestPixelFormat(formats, kPixelFormat_V210_422_10u, formats, kRenderQuality_High, false);
		EXPECT_NE(GuessNameForProperties(kPixelFormat_BGRA_4444_8u.mProperties), kPixelFormat_Invalid.mName);
		EXPECT_TRUE(HasChannelLabeling(many) && !HasLFEChannel(many));
		EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(35), 35);
		EXPECT_EQ(map.GetNumberOfAssignments(), unsigned{kMany});
	};
	EXPECT_EQ(zontest::CountAllocations(use), 0u);
	const UTF16String japanese(kMany, 0x3042);
	EXPECT_EQ(zontest::CountAllocations([&] { static_cast<void>(utility::UTF16to8(japanese)); }), 1u);
	ChannelConversionMatrix matrix;
	EXPECT_EQ(zontest::CountAllocations([&] { ComputeChannelConversionMatrix(many, many, matrix); }), 1u + kMany);
}

}   // namespace
