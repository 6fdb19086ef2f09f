#include "zonmediatypes/Timecode.h"

#include "tests/Walks.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <cstdio>
#include <limits>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#if ZON_HAS_LIBAVUTIL
extern "C"
{
	#include <libavutil/timecode.h>
}
#endif

namespace zonmediatypes
{
namespace
{

constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();

constexpr FrameRate kPAL = kFrameRate_VideoPAL;
constexpr FrameRate kNTSC = kFrameRate_VideoNTSC;
constexpr FrameRate kNTSC_HD = kFrameRate_VideoNTSC_HD;
constexpr FrameRate kMs = kFrameRate_Video1000;
constexpr FrameRate k48k = kFrameRate_Audio48000;

constexpr unsigned kOmit = kTimecodeFlag_OmitHours;
constexpr unsigned kTrim = kTimecodeFlag_TrimLeadingZeros;
constexpr unsigned kSign = kTimecodeFlag_ShowSign;
constexpr unsigned kLast = kTimecodeFlag_LastFrame;

TimeDisplay Display(int inDisplay)
{
	return static_cast<TimeDisplay>(inDisplay);
}

TickTime Frames(std::int64_t inFrames, FrameRate inRate)
{
	TickTime time;
	time.AddFrames(inFrames, inRate);
	return time;
}

std::string Out(TickTime inTime, FrameRate inRate, int inDisplay, unsigned inFlags = 0)
{
	return zoncore::utility::UTF16to8(TimeToTimecode(inTime, inRate, Display(inDisplay), inFlags));
}

TickTime In(std::string_view inText, FrameRate inRate, int inDisplay, unsigned inFlags = 0)
{
	return TimecodeToTime(zoncore::utility::AsciiToUTF16(inText), inRate, Display(inDisplay), inFlags);
}

// ---- Text ------------------------------------------------------------------------------------------------------------

// Texts and the frames that they stand for, at one rate and display.
struct TextCases
{
	FrameRate mRate;
	int mDisplay;
	unsigned mFlags;
	std::vector<std::pair<std::int64_t, const char*>> mCases;
};

TEST(TimeToTimecode, WritesWhatTheDisplayShows)
{
	const FrameRate noRate(0);
	const auto frequency = [](std::int64_t inFrames) { return FrameRate(kTicksPerSecond / inFrames); };
	const TextCases groups[] = {
		// Whole days are lost, and without a sign the hours of negative times run backwards
		{kPAL, 101, 0, {{90, "00:00:03:15"}, {24 * 90'000 + 5, "00:00:00:05"}, {-1, "23:00:00:01"}}},
		{kFrameRate_Video10, 101, 0, {{-400'000, "12:06:40:00"}}},
		{kPAL, 101, kSign, {{-1, "-00:00:00:01"}, {1, "+00:00:00:01"}, {0, "00:00:00:00"}}},
		// Leading fields
		{kPAL, 101, kTrim, {{0, "0:00"}, {137, "5:12"}, {90'000, "1:00:00:00"}}},
		{kPAL, 101, kSign | kTrim, {{125, "+5:00"}}},
		{kPAL, 101, kOmit | kTrim, {{90'025, "1:00"}}},
		{k48k, 200, kOmit | kTrim, {{3'900, "0:03900"}}},
		// The last frame of a range, and bits that are no flags
		{kPAL, 101, kLast, {{25, "00:00:00:24"}, {0, "23:00:00:01"}}},
		{kPAL, 109, kLast, {{0, "-1"}}},
		{kPAL, 101, 0xFFFF'FFF0, {{1, "00:00:00:01"}}},
		// Samples have as many digits as the rate needs, up to five, and with some room above each power of ten
		{k48k, 200, 0, {{100'000, "00:00:02:04000"}}},
		{kFrameRate_Audio192000, 200, 0, {{192'001, "00:00:01:1"}}},
		{frequency(10), 200, 0, {{7, "00:00:00:7"}}},
		{frequency(11), 200, 0, {{7, "00:00:00:07"}}},
		{frequency(109), 200, 0, {{7, "00:00:00:07"}}},
		{frequency(110), 200, 0, {{7, "00:00:00:007"}}},
		{frequency(1'099), 200, 0, {{1'007, "00:00:00:1007"}}},
		{frequency(1'100), 200, 0, {{7, "00:00:00:0007"}}},
		{frequency(11'000), 200, 0, {{7, "00:00:00:00007"}}},
		{frequency(110'000), 200, 0, {{7, "00:00:00:7"}}},
		{kMs, 201, 0, {{1'500, "00:00:01.500"}}},
		// Counts, feet and frames
		{kPAL, 109, kTrim, {{1'000, "1000"}, {-1'000, "-1000"}}},
		{kPAL, 109, kSign, {{1'000, "+1000"}}},
		{kPAL, 112, 0, {{1'000, "62+08"}, {-1'000, "-62+08"}}},
		{kPAL, 111, 0, {{1'039, "25+39"}}},
		// The display that fits the rate, no rate and no display
		{kNTSC, 999, 0, {{1'800, "00:01:00;02"}}},
		{kMs, 999, 0, {{3'000, "00:00:02;29"}}},
		{noRate, 200, 0, {{5, "00:00:00:0"}}},
		{noRate, 109, 0, {{5, "0"}}},
		{FrameRate(-10), 200, 0, {{-5, "00:00:00:0"}}},
		{kPAL, 7, 0, {{5, "00:00:00:0"}, {-5, "23:00:00:0"}}},
	};
	for (const auto& [rate, display, flags, cases] : groups)
		for (const auto& [frames, text] : cases)
			EXPECT_EQ(Out(Frames(frames, rate), rate, display, flags), text) << frames << " at " << rate;
}

TEST(TimeToTimecode, WritesTimesThatNoFrameStartsAt)
{
	EXPECT_EQ(Out(TickTime(-1), kPAL, 101), "23:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 101, kSign), "-00:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 112), "-0+00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 109), "0");
	EXPECT_EQ(Out(kTime_Invalid, kPAL, 101), "08:06:40:00");
	EXPECT_EQ(Out(TickTime(kLeast), FrameRate(1), 111), "-230584300921369395+08");
	EXPECT_EQ(Out(TickTime(kTicksPerSecond - 1), FrameRate(1), 200, kSign), "+00:00:00:254015999999");
	EXPECT_EQ(Out(Frames(5, kPAL), FrameRate(-kPAL.GetTicksPerFrame()), 109, kSign), "+-5");
}

TEST(TimecodeToTime, ReadsWhatUsersType)
{
	const TextCases groups[] = {
		{kPAL, 101, 0,
			{{0, ""}, {90, "+00.00;03:15"}, {75, "3:"}, {90'000, "1:0:0:0"}, {90'000, "1:0:0:"}, {90'000, "25:0:0:0"},
				{26, "0:26"}, {-90, "-00:00:03:15"}}},
		{kNTSC, 103, 0, {{30, "0:30"}}},
		// Dropped labels
		{kNTSC, 102, 0,
			{{1'800, "00:01:00;00"}, {1'799, "00:01:00;01"}, {1'800, "00:00:59;30"}, {24 * 107'892 - 1, "23:59:59;29"},
				{0, "24:00:00;00"}}},
		{kNTSC_HD, 106, 0, {{3'600, "00:01:00;00"}, {3'597, "00:01:00;01"}}},
		// Runs of digits, split by the rate; 4294967295 at most
		{kPAL, 101, 0,
			{{125, "500"}, {1'500, "10000"}, {23 * 90'000, "23000000"}, {((60 + 2) * 60 + 3) * 25 + 4, "1020304"},
				{((4 * 60 + 40) * 60 + 1) * 25 + 9, "99995959"},
				{((23 * 60 + 37) * 60 + 15) * 25 + 20, "99999999999999999999"}}},
		{k48k, 101, 0, {{500 * 1'920, "500"}}},
		{kFrameRate_Video100, 101, 0, {{6'016, "10004"}}},
		{k48k, 200, 0, {{100'000, "204000"}, {3'723 * 48'000 + 5, "1:2:3:5"}}},
		{kFrameRate_Audio8000, 200, 0, {{84'000, "104000"}}},
		{kMs, 201, 0, {{1'005, "1.5"}, {1'500, "1500"}, {1'001, "0.1001"}}},
		// Counts
		{kPAL, 109, 0, {{1'000, ".1000"}, {-1'000, "-1000"}, {4'294'967'295, "5000000000"}}},
		{kPAL, 101, 0, {{1'000, ".1000"}, {-1'000, "-:1000"}, {27, ":1:2"}, {-4'294'967'295, "-;5000000000"}}},
		{k48k, 201, 0, {{500, ".500"}}},
		// The last frame of a range, and flags without effect
		{kPAL, 101, kLast, {{0, ""}, {1, "0"}, {-1, "-0"}}},
		{kPAL, 112, kLast, {{17, "1+00"}, {-1, "0+00"}, {-17, "-1+00"}}},
		{kPAL, 101, kOmit | kTrim | kSign, {{90, "3:15"}}},
		// Feet and frames: a second sign is the number's own, feet wrap at 32 bits
		{kPAL, 112, 0,
			{{200, "12+08"}, {200, "1208"}, {-200, "-1208"}, {200, " 12; 08x"}, {200, "\t\r12+08"}, {8, "+8"}, {0, "-"},
				{0, "x+y"}, {192, "12+"}, {-184, "+-1208"}, {184, "--12+8"}, {5 - 0x8000'0000ll, "134217728+5"},
				{5, "268435456+5"}, {675'282'944, "9000000000000000000+0"}, {-16, "99999999999999999999+0"},
				{16, "-99999999999999999999+0"}, {1, "+-99999999999999999999+1"}, {15, "1+99999999999999999999"}}},
		{kPAL, 111, 0, {{488, "12:8"}}},
		{kNTSC, 999, 0, {{1'800, "00:01:00;02"}}},
	};
	for (const auto& [rate, display, flags, cases] : groups)
		for (const auto& [frames, text] : cases)
			EXPECT_EQ(In(text, rate, display, flags), Frames(frames, rate)) << text << " in " << display;
}

TEST(TimecodeToTime, RejectsOtherText)
{
	for (const char* text : {"-", "+", ":", "-.", "::", "1::2", ":1::2", "1:2:3:4:5", ":1:2:3:4:5", "1:2:3:4:", " 1",
			 "1 ", "--1", "+-1", "1-2", "1:2a", "x", "1:2:3:x", ":;1"})
		for (const int display : {100, 101, 102, 106, 200, 201, 999, 5})
			EXPECT_EQ(In(text, kPAL, display, kLast), kTime_Invalid) << text;
	for (const char* text : {"1:2", "5:", "1.5", "-1:", "1 ", "", "12x"})
		EXPECT_EQ(In(text, kPAL, 109), *text == '\0' ? kTime_Zero : kTime_Invalid) << text;
	for (const char* text : {"1+2+3", "1:2+3", "1::2", "++1+2"})
		EXPECT_EQ(In(text, kPAL, 112), kTime_Invalid) << text;
	zoncore::UTF16String wide = zoncore::utility::AsciiToUTF16("00:00:01:00");
	wide[6] = 0x0661;   // an Arabic digit
	EXPECT_EQ(TimecodeToTime(wide, kPAL, kTimeDisplay_25Timecode), kTime_Invalid);
}

TEST(Timecode, ConvertsRatioTime)
{
	const auto text = zoncore::utility::AsciiToUTF16("00:00:03:15");
	EXPECT_EQ(TimecodeToRatioTime(text, kPAL, kTimeDisplay_25Timecode), RatioTime(18, 5));
	EXPECT_EQ(TimecodeToRatioTime(text.substr(1, 1), kPAL, Display(5)), TimeToRatioTime(In("0", kPAL, 5)));
	EXPECT_EQ(RatioTimeToTimecode({18, 5}, kPAL, kTimeDisplay_25Timecode), text);
}

// ---- Fields ----------------------------------------------------------------------------------------------------------

using Fields = TimecodeFields;

TEST(TimeToHMSF, GivesTheFieldsOfTheDisplay)
{
	constexpr FrameRate kBackwards(-kPAL.GetTicksPerFrame());
	constexpr FrameRate kSecond(kTicksPerSecond);
	const struct
	{
		TickTime mTime;
		FrameRate mRate;
		int mDisplay;
		Fields mFields;
	} cases[] = {
		{Frames(90'026, kPAL), kPAL, 101, {1, 0, 1, false, 1}},
		{Frames(25 * 90'000, kPAL), kPAL, 101, {1, 0, 0, false, 0}},
		{TickTime(1 - kPAL.GetTicksPerFrame()), kPAL, 101, {0, 0, 0, false, 0}},   // frame 0 is not negative
		{Frames(-1, kPAL), kPAL, 101, {0, 0, 0, true, 1}},
		{TickTime(-1), kNTSC, 102, {0, 0, 0, true, 0}},   // with dropped frames the time's sign counts
		{Frames(24 * 107'892 + 1, kNTSC), kNTSC, 102, {0, 0, 0, false, 1}},
		{Frames(24 * 215'784 + 3, kNTSC_HD), kNTSC_HD, 106,
			{0, 0, 0, false, 3}},   // labels begin anew 86 ms before a day
		{Frames(-1'800, kNTSC), kPAL, 102, {0, 1, 0, true, 2}},
		{Frames(100, kPAL), kPAL, 112, {0, 0, 4, false, 0}},
		{Frames(-100, kPAL), kPAL, 109, {0, 0, 0, true, 0 - 100ull}},
		{TickTime(-1), kPAL, 109, {0, 0, 0, true, 0}},
		{Frames(100, kPAL), kBackwards, 109, {0, 0, 0, false, 0 - 100ull}},
		{TickTime(kLeast), FrameRate(-1), 109, {0, 0, 0, true, 1ull << 63}},
		{Frames(61, kSecond), kSecond, 200, {0, 1, 1, false, 0}},
		{TickTime(-1), kSecond, 200, {0, 0, 0, false, 0}},
		{TickTime(kLeast), FrameRate(1), 200, {6, 10, 1, true, 0x8000'0000'0000'0000 % kTicksPerSecond}},
		// Without a rate only the sign
		{TickTime(-5), kBackwards, 200, {0, 0, 0, true, 0}},
		{TickTime(-5), FrameRate(kTicksPerSecond + 1), 200, {0, 0, 0, true, 0}},
		{TickTime(-5), FrameRate(0), 109, {0, 0, 0, true, 0}},
		{TickTime(-5), kPAL, 999, {0, 0, 0, true, 0}},
		{TickTime(5), kPAL, 7, {0, 0, 0, false, 0}},
	};
	for (const auto& [time, rate, display, expected] : cases)
	{
		Fields fields{1, 2, 3, true, 4};
		TimeToHMSF(fields.mHours, fields.mMinutes, fields.mSeconds, fields.mFrames, fields.mNegative, time, rate,
			Display(display));
		EXPECT_EQ(fields, expected) << time.GetTicks() << " at " << rate << " in " << display;
	}
}

TEST(HMSFToTime, CarriesWhatIsTooLarge)
{
	constexpr unsigned kMostSeconds = std::numeric_limits<unsigned>::max();
	const struct
	{
		Fields mFields;
		FrameRate mRate;
		int mDisplay;
		std::int64_t mFrames;   // at the rate of the display
	} cases[] = {
		{{1, 2, 3, false, 4}, kPAL, 101, 93'079},
		{{1, 2, 3, true, 4}, kPAL, 101, -93'079},
		{{25, 61, 61, false, 26}, kPAL, 101, (2 * 3'600 + 2 * 60 + 2) * 25 + 1},
		{{24, 0, 0, false, 0}, kPAL, 101, 0},
		{{23, 60, 0, false, 0}, kPAL, 101, 0},
		{{0, 0, 60, false, 0}, kNTSC, 102, 1'800},
		{{0, 0, kMostSeconds, false, 25}, kPAL, 101, 23'295 * 25 + 25},
		{{0, 0, 0, false, 30}, kNTSC, 102, 30},
		{{0, 1, 0, false, 0}, kNTSC_HD, 106, 3'600},
		{{0, 10, 0, false, 0}, kNTSC_HD, 106, 35'964},
		// Seconds of a rate that is not whole are truncated, and rounded with the frames where frames are counted
		{{0, 0, 1, false, 29}, kNTSC, 200, 58},
		{{0, 0, 10, false, 0}, kNTSC, 109, 299},
		{{0, 0, 0, false, 31}, FrameRate(kTicksPerSecond / 30 + 1), 200, 30},
		{{0, 0, 0, false, 48'003}, FrameRate(kTicksPerSecond / 48'001), 200, 48'002},
		{{0, 0, 0, false, 40'000'000}, kPAL, 101, 40'000'000 % (86'400 * 25)},
		{{0, 0, 0, false, kTicksPerSecond + 1}, FrameRate(1), 101, 26},
		{{0, 0, 0, false, 0 - 5ull}, kPAL, 101, 1'353'211},
		{{0, 0, 1, false, 7}, FrameRate(kTicksPerSecond + 1), 200, 7},
		{{0, 0, 1, false, 3}, FrameRate(kTicksPerSecond), 200, 4},
		{{0, 0, 1, false, 7}, kFrameRate_Zero, 200, 7},
		{{0, 0, 1, false, 7}, FrameRate(-kPAL.GetTicksPerFrame()), 200, 0 - 25 + 7},
		{{0, 0, 1, false, 31}, FrameRate(-kNTSC.GetTicksPerFrame()), 200, 2},
		{{0, 0, 1, false, 31}, FrameRate(-kNTSC.GetTicksPerFrame()), 109, 1},
		{{0, 0, 1, false, 7}, kPAL, 5, 7},
	};
	for (const auto& [fields, rate, display, frames] : cases)
	{
		const auto& [hours, minutes, seconds, isNegative, count] = fields;
		const TickTime time = HMSFToTime(hours, minutes, seconds, count, isNegative, rate, Display(display));
		const FrameRate shown = GetFrameRateForTimeDisplay(Display(display), rate);
		EXPECT_EQ(time, Frames(frames, shown)) << hours << ':' << minutes << ':' << seconds << ':' << count << " at "
											   << rate << ": " << time.ToFrame64(shown);
	}
}

// ---- A day of frames -------------------------------------------------------------------------------------------------

// The labels are counted as a clock counts them, and as libavutil does.
TEST(FramesOfADay, HaveTheNextLabelAndAreReadBack)
{
	const struct
	{
		int mDisplay;
		int mLabels, mDropped;
	} days[] = {{100, 24, 0}, {101, 25, 0}, {102, 30, 2}, {103, 30, 0}, {104, 30, 0}, {105, 50, 0}, {106, 60, 4},
		{107, 60, 0}, {108, 60, 0}, {110, 24, 0}, {113, 48, 0}};
	for (const auto& [display, labels, dropped] : days)
	{
		const FrameRate rate = GetFrameRateForTimeDisplay(Display(display), {});
#if ZON_HAS_LIBAVUTIL
		const auto ratio = FrameRateToRatio(rate);
		AVTimecode peer;
		const unsigned flags = dropped != 0 ? AV_TIMECODE_FLAG_DROPFRAME : 0;
		ASSERT_EQ(0,
			av_timecode_init(&peer, {static_cast<int>(ratio.numerator()), static_cast<int>(ratio.denominator())},
				static_cast<int>(flags), 0, nullptr));
#endif
		const int perMinute = 60 * labels;
		const int step = dropped != 0 ? 1 : zontest::WalkLength(97, 6'101);
		const int end = zontest::WalkLength(24, dropped != 0 ? 2 : 24) * 60 * perMinute;
		int frame = 0;
		for (int label = 0; label < end; label += step, frame += step)
		{
			if (label % perMinute == 0 && label / perMinute % 10 != 0)
				label += dropped;
			char text[48];
			const int seconds = label / labels;
			std::snprintf(text, sizeof text, "%02d:%02d:%02d%c%02d", seconds / 3'600, seconds / 60 % 60, seconds % 60,
				dropped != 0 ? ';' : ':', label % labels);
			ASSERT_EQ(Out(Frames(frame, rate), rate, display), text) << frame << " in " << display;
			ASSERT_EQ(In(text, rate, display), Frames(frame, rate)) << text << " in " << display;
#if ZON_HAS_LIBAVUTIL
			char expected[AV_TIMECODE_STR_SIZE];
			ASSERT_STREQ(av_timecode_make_string(&peer, expected, frame), text) << frame << " in " << display;
#endif
		}
	}
}

}   // namespace
}   // namespace zonmediatypes
