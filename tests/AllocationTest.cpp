#include "tests/Allocations.h"
#include "tests/CatalogueFile.h"
#include "tests/Platform.h"
#include "tests/WithTranslator.h"
#include "zoncore/CheckRegistry.h"
#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/AudioChannelMap.h"
#include "zonmediatypes/AudioFormat.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/Timecode.h"
#include "zonmediatypes/interop/Streams.h"
#include "zonmediatypes/interop/Strings.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iomanip>
#include <memory>
#include <new>
#include <span>
#include <sstream>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
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
using zoncore::config::MessageCatalogue;
using zontest::FailEachAllocation;
using zontest::Failure;
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

// A row in which nothing fails would prove nothing.
void ExpectFailures(long inFailures)
{
	EXPECT_TRUE(inFailures > 0 || !zontest::kSeesEveryBlock);
}

// ---- Functions that return what they make ----------------------------------------------------------------------------

// inFunction throws for each allocation that fails, and gives in the end what it gives when none does. The first call is
// among those: what is made once in a process can fail, too.
template <class Function>
void ExpectAllOrThrow(Function inFunction, Failure inFailure = Failure::Reaches)
{
	auto result = decltype(inFunction())();
	ExpectFailures(FailEachAllocation([&] { result = inFunction(); }, [] {}, inFailure));
	EXPECT_TRUE(result == inFunction());
}

// Long texts for all keys of the library, and one more.
std::shared_ptr<const MessageCatalogue> LongCatalogue(const std::string& inKey)
{
	std::vector<std::string> keys(AllTextKeys().begin(), AllTextKeys().end());
	keys.push_back(inKey);
	zontest::Messages messages = {{"", "charset=UTF-8\n"}};
	for (std::string& key : keys)
	{
		key[key.find('=')] = '\4';
		messages.emplace_back(key, std::string(kMany, 'y') + "@0 \u00E9");
	}
	std::ranges::sort(messages);
	MessageCatalogue catalogue;
	std::string error;
	EXPECT_TRUE(catalogue.Parse(zontest::MakeCatalogue(messages), error)) << error;
	return std::make_shared<const MessageCatalogue>(std::move(catalogue));
}

TEST(WhenMemoryRunsOut, TextsAreWholeOrThrown)
{
	const std::string narrow(kMany, 'x');
	const std::string utf8 = narrow + "\u00E9";
	const std::string key = "$$$/a=@0" + narrow;
	const UTF16String wide = utility::AsciiToUTF16(narrow);
	const UTF16String pattern = utility::AsciiToUTF16("@0 and @0");
	const AudioChannelLayout layout = CreateVST22_2ChannelLayout();
	const AudioChannelLayout large = LargeLayout();
	const AudioChannelLayouts twoStreams = {layout, large};
	const AudioChannelLayouts equalStreams(3, layout);
	const zoncore::RectT<int> frame{0, 0, 1'920, 1'080};
	const PixelFormat custom{MakePixelFormatName('_', 'r', 'a', 'w'), {}};
	const Localizer& localizer = Localizer::Get();
	using Text = std::function<UTF16String()>;
	const std::vector<Text> texts = {
		[&] { return utility::AsciiToUTF16(narrow); },
		[&] { return utility::UTF8to16(utf8); },
		[&] { return utility::Coercion(wide); },
		[&] { return utility::AsciiToUTF16(utility::UTF16to8(wide)); },
		[] { return utility::NumberToString(1e300, 1, 9, 0, 400); },
		[&] { return localizer.Lookup(key); },
		[&] { return localizer.Lookup(key, narrow); },
		[&] { return localizer.Lookup(key, std::span(&wide, 1)); },
		[&] { return UTF16String(ZString(key, {wide})); },
		[&] { return zoncore::FillPlaceholders(pattern, std::span(&wide, 1)); },
		[] { return TimeToTimecode(kTime_Max, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode); },
		[] { return RatioTimeToTimecode(RatioTime(1, 3), kFrameRate_VideoPAL, kTimeDisplay_25Timecode); },
		[] { return FrameRateDescription(kFrameRate_23976); },
		[] { return FrameRateDescription(FrameRate(-1)); },
		[] { return TimeDisplayDescription(kTimeDisplay_2997DropTimecode); },
		[] { return AudioChannelLabelDescription(kAudioChannelLabel_BackLeft, true); },
		[&] { return AudioChannelLayoutDescription(layout); },
		[&] { return AudioChannelLayoutDescriptionUnlocalized(large); },
		[&] { return AudioChannelConfigurationDescription(equalStreams); },
		[&] { return AudioChannelConfigurationDescription(twoStreams); },
		[] { return FieldTypeDescription(kFieldType_UpperFirst); },
		[] { return PixelFormatDescription(kPixelFormat_VUYA_4444_32f_709); },
		[] { return PixelFormatDescription(kPixelFormat_BGRX_4444_32f_Linear); },
		[&] { return PixelFormatDescription(custom); },
		[] { return PixelAspectRatioDescription(kPixelAspectRatio_DVNTSC); },
		[] { return PixelAspectRatioDescription(PixelAspectRatio(9, 10)); },
		[&] { return VideoFrameSizeDescription(frame, kPixelAspectRatio_DVPAL); },
		[] { return PixelAspectRatio(1'234'567, 1).GetDisplayString(); },
	};
	const std::vector<Text> shortInEnglish = {
		[] { return FrameRateDescription(kFrameRate_Zero); },
		[] { return AudioChannelLabelAbbreviations(kAudioChannelLabel_BackLeft); },
		[] { return RenderQualityDescription(kRenderQuality_Medium); },
	};
	const auto expect = [](const std::vector<Text>& inTexts, Failure inFailure)
	{
		for (const Text& text : inTexts)
		{
			SCOPED_TRACE(utility::UTF16to8(text()));
			ExpectAllOrThrow(text, inFailure);
		}
	};
	expect(texts, Failure::Reaches);
	Localizer::Get().SetCatalogue(LongCatalogue(key));
	expect(texts, Failure::Reaches);
	expect(shortInEnglish, Failure::Reaches);
	ExpectAllOrThrow([buffer = std::array<char, 2 * kMany>()]() mutable
		{ return FrameRateDescription(std::span(buffer), kFrameRate_23976); });
	ExpectAllOrThrow([buffer = std::array<zoncore::UTF16Char, 2 * kMany>()]() mutable
		{ return FrameRateDescription(std::span(buffer), kFrameRate_23976); });
	const zontest::WithTranslator translator([&](auto, UTF16String& outText) { return outText = wide, true; });
	expect(texts, Failure::MayStay);   // the next best text will do
	expect(shortInEnglish, Failure::MayStay);
	Localizer::Get().SetCatalogue({});
}

TEST(WhenMemoryRunsOut, StreamsTellOrThrow)
{
	const PixelFormat format = kPixelFormat_VUYA_4444_32f_709;
	const AudioFormat audio = AudioFormat::CreateDefaultAudioFormat(kMany, 48'000);
	const ChannelMap map = ChannelMap::CreateDefaultChannelMap(6);
	const std::function<void(std::ostream&)> writes[] = {
		[](std::ostream& outText) { outText << std::setw(kMany) << TickTime(1); },
		[](std::ostream& outText) { outText << std::setw(kMany) << FrameRate(-1); },
		[](std::ostream& outText) { outText << std::setw(kMany) << kPixelAspectRatio_DVPAL; },
		[&](std::ostream& outText) { outText << format; },
		[&](std::ostream& outText) { outText << audio; },
		[&](std::ostream& outText) { outText << map; },
		[](std::ostream& outText) {
			outText << zoncore::RectT<int>{0, 0, 1'920, 1'080};
		},
		[](std::ostream& outText) {
			outText << zoncore::PointT<int>{1'234'567, 1'234'567};
		},
		[](std::ostream& outText) { outText << zonmediatypes::utility::BeatInfo(); },
		[](std::ostream& outText) { outText << *TimeBase::FromRatio(1'001, 1'000'000'007); },
		[&](std::ostream& outText)
		{
			zoncore::oUTF16StringStream stream;
			stream.exceptions(std::ios::badbit);
			stream << format << kPixelAspectRatio_DVPAL << kFrameRate_VideoNTSC << TickTime(1);
			outText << utility::UTF16to8(stream.str());
		},
	};
	for (const auto& write : writes)
	{
		std::ostringstream first;
		write(first);   // what the first text makes for all others stays, and is no leak
		for (const auto thrown : {std::ios::goodbit, std::ios::badbit})
			ExpectAllOrThrow(
				[&]
				{
					std::ostringstream stream;
					stream.exceptions(thrown);
					write(stream);
					if (stream.bad())
						throw std::bad_alloc();
					return stream.str();
				});
	}
}

TEST(WhenMemoryRunsOut, LayoutsAndMapsAreWholeOrThrown)
{
	const AudioChannelLayout large = LargeLayout();
	const ChannelMap map(large);
	ExpectAllOrThrow([&] { return ContainsSameChannelsIgnoreOrder(large, {large.rbegin(), large.rend()}); });
	ExpectAllOrThrow([] { return CreateMultichannelLayout(kMany); });
	ExpectAllOrThrow([] { return CreateMultichannelLayoutWithDefaultLabels(kMany); });
	ExpectAllOrThrow([] { return CreateVST22_2ChannelLayout(); });   // of all fixed layouts: they are made alike
	ExpectAllOrThrow([&] { return ChannelMap(large); });
	ExpectAllOrThrow([] { return ChannelMap(kMany); });
	ExpectAllOrThrow([&] { return ChannelMap(map); });
	ExpectAllOrThrow([] { return ChannelMap::CreateDefaultChannelMap(kMany); });
	ExpectAllOrThrow([&] { return ChannelMap(large).GetChannelLayout(0); });
	ExpectAllOrThrow([] { return AudioFormat::CreateDefaultAudioFormat(kMany, 48'000); });
	ExpectAllOrThrow([&] { return AudioFormat::CreateAudioFormat(large, 48'000); });
}

TEST(WhenMemoryRunsOut, ErrorsAndCataloguesAreWholeOrThrown)
{
	const std::string key = "$$$/a=" + std::string(kMany, 'x');
	const UTF16String wide(kMany, 'x');
	ExpectAllOrThrow([&] { return std::string_view(zoncore::config::Error(3, key.c_str()).GetKey()) == key; });
	ExpectAllOrThrow(
		[&]
		{
			try
			{
				return zoncore::config::ThrowError(3, key.c_str(), {wide}), false;
			}
			catch (const zoncore::config::Error& error)
			{
				return std::string_view(error.what()).size() == kMany;
			}
		});
	ExpectAllOrThrow([&] { return ToU16String(wide); });

	const auto path = std::filesystem::temp_directory_path() / ("AllocationTest" + zontest::ProcessId() + ".mo");
	const zontest::Messages messages = {{"", "charset=UTF-8\n"}, {"a", std::string(20'000, 'y')}};
	std::ofstream(path, std::ios::binary) << zontest::MakeCatalogue(messages);
	for (const char* const suffix : {"", "-that-is-not-there"})
	{
		const std::string file = path.string() + suffix;
		ExpectAllOrThrow(
			[&]
			{
				MessageCatalogue catalogue;
				std::string error;
				const bool loaded = catalogue.Load(file, error);
				return std::pair(loaded, error);
			});
	}
	std::filesystem::remove(path);
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
	const AudioChannelLayout many = LargeLayout();
	const AudioChannelLayout reversed(many.rbegin(), many.rend());
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
	const AudioChannelLayout many = LargeLayout();
	const AudioChannelLayout reversed(many.rbegin(), many.rend());
	constexpr auto kLeft = kAudioChannelLabel_FrontLeft;
	ChannelMap map(1);   // not empty: the room that a failed call leaves in it takes the place of other room
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
		for (const bool isRemoved : {false, true})
		{
			inSet(count);
			const int before = reports;
			const auto change = [&] { isRemoved ? inSet(nullptr) : inSet([](auto&&...) { return false; }); };
			const long failures = FailEachAllocation(change, inReport);
			constexpr bool kCopies = !std::is_void_v<decltype(inSet(nullptr))>;   // the one before
			EXPECT_EQ(failures > 0, kCopies || !isRemoved);
			if (!isRemoved)
				inReport();
			EXPECT_EQ(reports - before, failures);
		}
		inSet(nullptr);
	};
	std::atomic<bool> isDisabled = false;
	expectStays([](auto inHook) { Localizer::Get().SetTranslator(inHook); }, [] { Localizer::Get().Lookup(""); });
	expectStays([](auto inHook) { return zoncore::config::SetErrorReporter(inHook); },
		[] { zoncore::config::ThrowError(0, "="); });
	expectStays([](auto inHook) { return debug::SetContractDialog(inHook); },
		[] { debug::BreakAfterContractDialog("", "", "", 0); });
	expectStays([](auto inHook) { return debug::SetAssertDialog(inHook); },
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

	const auto fail = [name](std::string&) { return false; };
	EXPECT_GT(
		FailEachAllocation([&] { registry.Register(name, name, fail); }, [&] { EXPECT_TRUE(registry.Run(name, {})); }),
		0);
	EXPECT_FALSE(registry.Run(name, {}));

	constexpr PixelFormatName kName = MakePixelFormatName('_', 'm', 'e', 'm');
	for (const PixelFormatProperties properties : {kPixelFormatProperties_Any, PixelFormatProperties(42)})
	{
		const PixelFormatProperties before = LookupPropertiesForName(kName);
		ExpectFailures(FailEachAllocation([&] { RegisterCustomPixelFormatProperties(kName, properties); },
			[&] { EXPECT_EQ(LookupPropertiesForName(kName), before); }));
		EXPECT_EQ(LookupPropertiesForName(kName), properties);
		EXPECT_NE(properties, before);
	}
}

// ---- Functions that allocate nothing, or once ------------------------------------------------------------------------

TEST(Allocations, AreNotNeededToReadToAskAndToChoose)
{
	const UTF16String timecode = utility::AsciiToUTF16("01:02:03:04");
	const UTF16String feet = utility::AsciiToUTF16("12+08");
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
