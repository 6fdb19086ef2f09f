#include "tests/HostileLocale.h"
#include "tests/KeyRecorder.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/FrameRate.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <iterator>
#include <limits>
#include <string>
#include <tuple>
#include <vector>

namespace zonmediatypes
{
namespace
{

using zoncore::utility::UTF16to8;
using zontest::KeyRecorder;

std::string Describe(std::int64_t inTicksPerFrame)
{
	return UTF16to8(FrameRateDescription(FrameRate(inTicksPerFrame)));
}

TEST(FrameRateDescription, HasNumberAndUnit)
{
	const zontest::HostileLocale locale;
	const char* const named[] = {"10fps", "12fps", "12.5fps", "15fps", "23.976fps", "24fps", "25fps", "29.97fps",
		"30fps", "48fps", "50fps", "59.94fps", "60fps", "100fps", "1000fps", "8000Hz", "11025Hz", "22050Hz", "32000Hz",
		"44100Hz", "48000Hz", "88200Hz", "96000Hz", "192000Hz", "0fps"};
	ASSERT_EQ(std::size(named), AllFrameRates().size());
	for (std::size_t i = 0; i < std::size(named); ++i)
		EXPECT_EQ(UTF16to8(FrameRateDescription(AllFrameRates()[i])), named[i]);
	EXPECT_EQ(Describe(31'752'001), "8000fps");
	EXPECT_EQ(Describe(0), "infHz");
	EXPECT_EQ(Describe(-8'475'667'200), "-29.97Hz");
	EXPECT_EQ(Describe(1), "254016000000Hz");
	EXPECT_EQ(Describe(std::numeric_limits<std::int64_t>::min()), "0Hz");
}

TEST(FrameRateDescription, IsFilledIntoItsTranslation)
{
	KeyRecorder recorder("@0 @1 @0/s");
	EXPECT_EQ(Describe(10'160'640'000), "25 @1 25/s");
	EXPECT_EQ(Describe(5'292'000), "48000 @1 48000/s");
	EXPECT_EQ(recorder.TakeKeys(),
		(std::vector<std::string>{
			"$$$/zonmediatypes/FrameRateFormat/Video=@0fps", "$$$/zonmediatypes/FrameRateFormat/Audio=@0Hz"}));
}

TEST(TimeDisplayDescription, HasAKeyForEachDisplay)
{
	KeyRecorder recorder;
	std::vector<std::string> keys;
	const auto describe
		= [](int inDisplay) { return UTF16to8(TimeDisplayDescription(static_cast<TimeDisplay>(inDisplay))); };
	for (const auto& [display, name, text] : std::initializer_list<std::tuple<int, std::string, std::string>>{
			 {100, "24", "24 fps Timecode"},
			 {101, "25", "25 fps Timecode"},
			 {102, "2997DF", "29.97 fps Drop-Frame Timecode"},
			 {103, "2997NDF", "29.97 fps Non-Drop-Frame Timecode"},
			 {104, "30", "30 fps Timecode"},
			 {105, "50", "50 fps Timecode"},
			 {106, "5994DF", "59.94 fps Drop-Frame Timecode"},
			 {107, "5994NDF", "59.94 fps Non-Drop-Frame Timecode"},
			 {108, "60", "60 fps Timecode"},
			 {109, "Frames", "Frames"},
			 {110, "23976", "23.976 fps Timecode"},
			 {111, "16mmFeetFrames", "Feet + Frames 16 mm"},
			 {112, "35mmFeetFrames", "Feet + Frames 35 mm"},
			 {113, "48", "48 fps Timecode"},
			 {200, "AudioSamples", "Audio Samples"},
			 {201, "Milliseconds", "Milliseconds"},
		 })
	{
		EXPECT_EQ(describe(display), text);
		keys.push_back("$$$/zonmediatypes/TimeDisplay/" + name + "=" + text);
	}
	EXPECT_EQ(recorder.TakeKeys(), keys);
	for (const int display : {0, 99, 114, 199, 202, 999, -1})
		EXPECT_EQ(describe(display), "");
	EXPECT_TRUE(recorder.TakeKeys().empty()) << "a value without a text looked a key up";
	for (const std::string& key : keys)
		EXPECT_EQ(std::ranges::count(AllTextKeys(), key), 1) << key;
}

}   // namespace
}   // namespace zonmediatypes
