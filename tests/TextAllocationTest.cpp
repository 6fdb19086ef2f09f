#include "tests/Allocations.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelFormatSelection.h"
#include "zonmediatypes/PixelFormatUtils.h"
#include "zonmediatypes/Timecode.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

// Every function that returns a text either returns all of it or throws, and leaks nothing; without the block pool every
// allocation is made to fail. What allocates nothing is counted.

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16String;
using zoncore::utility::AsciiToUTF16;

TEST(WhenMemoryRunsOut, TextsAreWholeOrThrown)
{
	const AudioChannelLayout layout = CreateVST22_2ChannelLayout();
	const AudioChannelLayouts streams(3, layout);
	const PixelFormat custom{MakePixelFormatName('_', 'r', 'a', 'w'), {}};
	const std::vector<std::function<UTF16String()>> texts{
		[] { return TimeToTimecode(kTime_Max, kFrameRate_VideoNTSC, kTimeDisplay_2997DropTimecode); },
		[] {
			return RatioTimeToTimecode({1, 3}, kFrameRate_VideoPAL, kTimeDisplay_25Timecode);
		},
		[] { return FrameRateDescription(kFrameRate_23976); },
		[] { return TimeDisplayDescription(kTimeDisplay_2997DropTimecode); },
		[] { return AudioChannelLabelDescription(kAudioChannelLabel_BackLeft, true); },
		[&] { return AudioChannelLayoutDescription(layout); },
		[&] { return AudioChannelLayoutDescriptionUnlocalized(layout); },
		[&] { return AudioChannelConfigurationDescription(streams); },
		[] { return RenderQualityDescription(kRenderQuality_Medium); },
		[] { return FieldTypeDescription(kFieldType_UpperFirst); },
		[] { return PixelFormatDescription(kPixelFormat_VUYA_4444_32f_709); },
		[&] { return PixelFormatDescription(custom); },
		[] { return PixelAspectRatioDescription(kPixelAspectRatio_DVNTSC); },
		[] {
			return VideoFrameSizeDescription({0, 0, 1'920, 1'080}, kPixelAspectRatio_DVPAL);
		},
		[] { return kPixelAspectRatio_DVPAL.GetDisplayString(); },
		[] { return zoncore::utility::NumberToString(1e300, 1, 9, 0, 400); },
		[] { return zoncore::utility::Coercion(-1234567890123ll); },
	};
	for (std::size_t i = 0; i < texts.size(); ++i)
	{
		const UTF16String expected = texts[i]();
		UTF16String text;
		zontest::FailEachAllocation([&] { text = texts[i](); }, [&] { EXPECT_TRUE(text.empty()) << i; });
		EXPECT_EQ(text, expected) << i;
		EXPECT_FALSE(text.empty()) << i;
	}
}

TEST(WhenMemoryRunsOut, TheRegistryIsAsBefore)
{
	constexpr PixelFormatName kName = MakePixelFormatName('_', 'm', 'e', 'm');
	zontest::FailEachAllocation([] { RegisterCustomPixelFormatProperties(kName, kPixelFormatProperties_Any); },
		[] { EXPECT_EQ(LookupPropertiesForName(kName), kPixelFormatProperties_Invalid); });
	EXPECT_EQ(LookupPropertiesForName(kName), kPixelFormatProperties_Any);
}

TEST(Allocations, AreNotNeededToReadTextOrToChooseFormats)
{
	const UTF16String timecode = AsciiToUTF16("01:02:03:04"), feet = AsciiToUTF16("12+08");
	const PixelFormats formats(AllPixelFormatsBegin(), AllPixelFormatsEnd());
	EXPECT_EQ(zontest::CountAllocations(
				  [&]
				  {
					  static_cast<void>(TimecodeToTime(timecode, kFrameRate_VideoPAL, kTimeDisplay_25Timecode));
					  static_cast<void>(TimecodeToTime(feet, kFrameRate_Film24, kTimeDisplay_35mmFeetFrames));
					  static_cast<void>(SelectNearestPixelFormat(
						  formats, kPixelFormat_V210_422_10u, formats, kRenderQuality_High, false));
					  static_cast<void>(GuessNameForProperties(kPixelFormat_BGRA_4444_8u.mProperties));
				  }),
		0u);
}

}   // namespace
}   // namespace zonmediatypes
