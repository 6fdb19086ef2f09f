#include "zonmediatypes/Timecode.h"

#include "tests/Walks.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeUtils.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <cstdio>
#include <initializer_list>
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

constexpr TimeDisplay k25 = kTimeDisplay_25Timecode;
constexpr TimeDisplay kDrop = kTimeDisplay_2997DropTimecode;
constexpr TimeDisplay kDrop_HD = kTimeDisplay_5994DropTimecode;
constexpr TimeDisplay kFrames = kTimeDisplay_Frames;
constexpr TimeDisplay k16mm = kTimeDisplay_16mmFeetFrames;
constexpr TimeDisplay k35mm = kTimeDisplay_35mmFeetFrames;
constexpr TimeDisplay kSamples = kTimeDisplay_AudioSamples;
constexpr TimeDisplay kMilliseconds = kTimeDisplay_Milliseconds;
constexpr auto kNoDisplay = static_cast<TimeDisplay>(7);

constexpr unsigned kOmit = kTimecodeFlag_OmitHours;
constexpr unsigned kTrim = kTimecodeFlag_TrimLeadingZeros;
constexpr unsigned kSign = kTimecodeFlag_ShowSign;
constexpr unsigned kLast = kTimecodeFlag_LastFrame;

TickTime Frames(std::int64_t inFrames, FrameRate inRate)
{
	TickTime time;
	time.AddFrames(inFrames, inRate);
	return time;
}

std::string Out(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, unsigned inFlags = 0)
{
	return zoncore::utility::UTF16to8(TimeToTimecode(inTime, inRate, inDisplay, inFlags));
}

TickTime In(std::string_view inText, FrameRate inRate, TimeDisplay inDisplay, unsigned inFlags = 0)
{
	return TimecodeToTime(zoncore::utility::AsciiToUTF16(inText), inRate, inDisplay, inFlags);
}

// ---- Text ------------------------------------------------------------------------------------------------------------

// Frames and the texts that stand for them, at one rate and display.
struct TextCases
{
	FrameRate mRate;
	TimeDisplay mDisplay;
	unsigned mFlags;
	std::vector<std::pair<std::int64_t, const char*>> mCases;
};

void ExpectWritten(std::initializer_list<TextCases> inGroups)
{
	for (const auto& [rate, display, flags, cases] : inGroups)
		for (const auto& [frames, text] : cases)
			EXPECT_EQ(Out(Frames(frames, rate), rate, display, flags), text) << frames << " at " << rate;
}

void ExpectRead(std::initializer_list<TextCases> inGroups)
{
	for (const auto& [rate, display, flags, cases] : inGroups)
		for (const auto& [frames, text] : cases)
			EXPECT_EQ(In(text, rate, display, flags), Frames(frames, rate)) << text << " in " << display;
}

TEST(TimeToTimecode, WritesFields)
{
	ExpectWritten({
		// Whole days are lost, and without a sign the hours of negative times run backwards
		{kPAL, k25, 0, {{90, "00:00:03:15"}, {24 * 90'000 + 5, "00:00:00:05"}, {-1, "23:00:00:01"}}},
		{kFrameRate_Video10, k25, 0, {{-400'000, "12:06:40:00"}}},
		{kMs, kMilliseconds, 0, {{1'500, "00:00:01.500"}}},
		// The display that fits the rate, no rate and no display
		{kNTSC, kTimeDisplay_Auto, 0, {{1'800, "00:01:00;02"}}},
		{kMs, kTimeDisplay_Auto, 0, {{3'000, "00:00:02;29"}}},
		{FrameRate(0), kSamples, 0, {{5, "00:00:00:0"}}},
		{FrameRate(-10), kSamples, 0, {{-5, "00:00:00:0"}}},
		{kPAL, kNoDisplay, 0, {{5, "00:00:00:0"}, {-5, "23:00:00:0"}}},
	});
}

TEST(TimeToTimecode, FollowsItsFlags)
{
	ExpectWritten({
		{kPAL, k25, kSign, {{-1, "-00:00:00:01"}, {1, "+00:00:00:01"}, {0, "00:00:00:00"}}},
		{kPAL, k25, kTrim, {{0, "0:00"}, {137, "5:12"}, {90'000, "1:00:00:00"}}},
		{kPAL, k25, kSign | kTrim, {{125, "+5:00"}}}, {kPAL, k25, kOmit | kTrim, {{90'025, "1:00"}}},
		{k48k, kSamples, kOmit | kTrim, {{3'900, "0:03900"}}},
		{kPAL, k25, kLast, {{25, "00:00:00:24"}, {0, "23:00:00:01"}}}, {kPAL, kFrames, kLast, {{0, "-1"}}},
		{kPAL, k25, 0xFFFF'FFF0, {{1, "00:00:00:01"}}},   // no flags
	});
}

// As many digits as the rate needs, up to five, and with some room above each power of ten.
TEST(TimeToTimecode, PadsSamples)
{
	const std::pair<std::int64_t, const char*> cases[] = {{10, "00:00:00:7"}, {11, "00:00:00:07"}, {109, "00:00:00:07"},
		{110, "00:00:00:007"}, {1'099, "00:00:00:007"}, {1'100, "00:00:00:0007"}, {11'000, "00:00:00:00007"},
		{48'000, "00:00:00:00007"}, {110'000, "00:00:00:7"}, {192'000, "00:00:00:7"}};
	for (const auto& [frequency, text] : cases)
		ExpectWritten({{FrameRate(kTicksPerSecond / frequency), kSamples, 0, {{7, text}}}});
	ExpectWritten({{FrameRate(kTicksPerSecond / 1'099), kSamples, 0, {{1'007, "00:00:00:1007"}}},
		{k48k, kSamples, 0, {{100'000, "00:00:02:04000"}}}});
}

TEST(TimeToTimecode, WritesCountsAndFeet)
{
	ExpectWritten({
		{kPAL, kFrames, kTrim, {{1'000, "1000"}, {-1'000, "-1000"}}},
		{kPAL, kFrames, kSign, {{1'000, "+1000"}}},
		{FrameRate(0), kFrames, 0, {{5, "0"}}},
		{kPAL, k35mm, 0, {{1'000, "62+08"}, {-1'000, "-62+08"}}},
		{kPAL, k16mm, 0, {{1'039, "25+39"}}},
	});
}

TEST(TimeToTimecode, WritesTimesThatNoFrameStartsAt)
{
	EXPECT_EQ(Out(TickTime(-1), kPAL, k25), "23:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, k25, kSign), "-00:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, k35mm), "-0+00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, kFrames), "0");
	EXPECT_EQ(Out(kTime_Invalid, kPAL, k25), "08:06:40:00");
	EXPECT_EQ(Out(TickTime(kLeast), FrameRate(1), k16mm), "-230584300921369395+08");
	EXPECT_EQ(Out(TickTime(kTicksPerSecond - 1), FrameRate(1), kSamples, kSign), "+00:00:00:254015999999");
	EXPECT_EQ(Out(Frames(5, kPAL), FrameRate(-kPAL.GetTicksPerFrame()), kFrames, kSign), "+-5");
}

// The rows of the table in the header, and what lies at their limits.
TEST(TimecodeToTime, ReadsGroups)
{
	ExpectRead({
		{kPAL, k25, 0,
			{{0, ""}, {90, "00:00:03:15"}, {90, "+3:15"}, {90, "3.15"}, {90, "+00.00;03:15"}, {-90, "-3:15"},
				{75, "3:"}, {90'000, "1:0:0:0"}, {90'000, "1:0:0:"}, {90'000, "25:0:0:0"}, {26, "0:26"},
				{99 * 1'500, "99:00:00"}, {27, ":1:2"}}},
		{kNTSC, kTimeDisplay_2997NonDropTimecode, 0, {{30, "0:30"}}},
		{kNTSC, kDrop, 0,
			{{1'800, "00:01:00;02"}, {1'800, "00:01:00;00"}, {1'799, "00:01:00;01"}, {1'800, "00:00:59;30"},
				{24 * 107'892 - 1, "23:59:59;29"}, {0, "24:00:00;00"}}},
		{kNTSC_HD, kDrop_HD, 0, {{3'600, "00:01:00;00"}, {3'597, "00:01:00;01"}}},
		{kMs, kMilliseconds, 0, {{1'005, "1.5"}, {1'500, "1.500"}, {1'001, "0.1001"}}},
		{k48k, kSamples, 0, {{3'723 * 48'000 + 5, "1:2:3:5"}}},
		{kNTSC, kTimeDisplay_Auto, 0, {{1'800, "00:01:00;02"}}},
	});
}

TEST(TimecodeToTime, ReadsRunsOfDigitsByTheRateAndCounts)
{
	ExpectRead({
		{kPAL, k25, 0,
			{{125, "500"}, {1'500, "10000"}, {23 * 90'000, "23000000"}, {((60 + 2) * 60 + 3) * 25 + 4, "1020304"},
				{((4 * 60 + 40) * 60 + 1) * 25 + 9, "99995959"},
				{((23 * 60 + 37) * 60 + 15) * 25 + 20, "99999999999999999999"}}},   // 4294967295 at most
		{k48k, k25, 0, {{500 * 1'920, "500"}}},
		{kFrameRate_Video100, k25, 0, {{6'016, "10004"}}},
		{k48k, kSamples, 0, {{100'000, "204000"}}},
		{kFrameRate_Audio8000, kSamples, 0, {{84'000, "104000"}}},
		{kMs, kMilliseconds, 0, {{1'500, "1500"}}},
		{kPAL, kFrames, 0, {{1'000, ".1000"}, {-1'000, "-1000"}, {4'294'967'295, "5000000000"}}},
		{kPAL, k25, 0, {{1'000, ".1000"}, {-1'000, "-:1000"}, {-4'294'967'295, "-;5000000000"}}},
		{k48k, kMilliseconds, 0, {{500, ".500"}}},
		// The last frame of a range, and flags without effect
		{kPAL, k25, kLast, {{0, ""}, {1, "0"}, {-1, "-0"}}},
		{kPAL, k35mm, kLast, {{17, "1+00"}, {-1, "0+00"}, {-17, "-1+00"}}},
		{kPAL, k25, kOmit | kTrim | kSign, {{90, "3:15"}}},
	});
}

// A second sign is the number's own; feet wrap at 32 bits.
TEST(TimecodeToTime, ReadsFeetAndFrames)
{
	ExpectRead({
		{kPAL, k35mm, 0,
			{{200, "12+08"}, {200, "12:8"}, {200, "1208"}, {-200, "-1208"}, {-200, "-12+08"}, {200, " 12; 08x"},
				{200, "\t\r12+08"}, {8, "8"}, {8, "+8"}, {0, "-"}, {0, "x+y"}, {192, "12+"}, {-184, "+-1208"},
				{184, "--12+8"}, {5 - 0x8000'0000ll, "134217728+5"}, {5, "268435456+5"},
				{675'282'944, "9000000000000000000+0"}, {-16, "99999999999999999999+0"},
				{16, "-99999999999999999999+0"}, {1, "+-99999999999999999999+1"}, {15, "1+99999999999999999999"}}},
		{kPAL, k16mm, 0, {{488, "12:8"}}},
	});
}

TEST(TimecodeToTime, RejectsOtherText)
{
	for (const char* text : {"-", "+", ":", "-.", "::", "1::2", ":1::2", "1:2:3:4:5", ":1:2:3:4:5", "1:2:3:4:", " 1",
			 "1 ", "--1", "+-1", "1-2", "1:2a", "x", "1:2:3:x", ":;1"})
		for (const TimeDisplay display : {k25, kDrop, kSamples, kMilliseconds, kTimeDisplay_Auto, kNoDisplay})
			EXPECT_EQ(In(text, kPAL, display, kLast), kTime_Invalid) << text;
	for (const char* text : {"1:2", "5:", "1.5", "-1:", "1 ", "12x"})
		EXPECT_EQ(In(text, kPAL, kFrames), kTime_Invalid) << text;
	for (const char* text : {"1+2+3", "1:2+3", "1::2", "++1+2"})
		EXPECT_EQ(In(text, kPAL, k35mm), kTime_Invalid) << text;
	zoncore::UTF16String wide = zoncore::utility::AsciiToUTF16("00:00:01:00");
	wide[6] = 0x0661;   // an Arabic digit
	EXPECT_EQ(TimecodeToTime(wide, kPAL, k25), kTime_Invalid);
}

TEST(Timecode, ConvertsRatioTime)
{
	const auto text = zoncore::utility::AsciiToUTF16("00:00:03:15");
	EXPECT_EQ(TimecodeToRatioTime(text, kPAL, k25), RatioTime(18, 5));
	EXPECT_EQ(TimecodeToRatioTime(text.substr(1, 1), kPAL, kNoDisplay), TimeToRatioTime(In("0", kPAL, kNoDisplay)));
	EXPECT_EQ(RatioTimeToTimecode({18, 5}, kPAL, k25), text);
}

// ---- Fields ----------------------------------------------------------------------------------------------------------

constexpr FrameRate kBackwards(-kPAL.GetTicksPerFrame());
constexpr FrameRate kSecond(kTicksPerSecond);

TimecodeFields FieldsOf(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay)
{
	TimecodeFields fields{1, 2, 3, true, 4};
	TimeToHMSF(
		fields.mHours, fields.mMinutes, fields.mSeconds, fields.mFrames, fields.mNegative, inTime, inRate, inDisplay);
	return fields;
}

TEST(TimeToHMSF, GivesTheFieldsOfTheDisplay)
{
	const struct
	{
		TickTime mTime;
		FrameRate mRate;
		TimeDisplay mDisplay;
		TimecodeFields mFields;
	} cases[] = {
		{Frames(90'026, kPAL), kPAL, k25, {1, 0, 1, false, 1}},
		{Frames(25 * 90'000, kPAL), kPAL, k25, {1, 0, 0, false, 0}},
		{TickTime(1 - kPAL.GetTicksPerFrame()), kPAL, k25, {0, 0, 0, false, 0}},   // frame 0 is not negative
		{Frames(-1, kPAL), kPAL, k25, {0, 0, 0, true, 1}},
		{TickTime(-1), kNTSC, kDrop, {0, 0, 0, true, 0}},   // with dropped frames the time's sign counts
		{Frames(24 * 107'892 + 1, kNTSC), kNTSC, kDrop, {0, 0, 0, false, 1}},
		{Frames(24 * 215'784 + 3, kNTSC_HD), kNTSC_HD, kDrop_HD,
			{0, 0, 0, false, 3}},   // labels begin anew 86 ms before a day
		{Frames(-1'800, kNTSC), kPAL, kDrop, {0, 1, 0, true, 2}},
		{Frames(100, kPAL), kPAL, k35mm, {0, 0, 4, false, 0}},
		{Frames(-100, kPAL), kPAL, kFrames, {0, 0, 0, true, 0 - 100ull}},
		{TickTime(-1), kPAL, kFrames, {0, 0, 0, true, 0}},
		{Frames(100, kPAL), kBackwards, kFrames, {0, 0, 0, false, 0 - 100ull}},
		{TickTime(kLeast), FrameRate(-1), kFrames, {0, 0, 0, true, 1ull << 63}},
		{Frames(61, kSecond), kSecond, kSamples, {0, 1, 1, false, 0}},
		{TickTime(-1), kSecond, kSamples, {0, 0, 0, false, 0}},
		{TickTime(kLeast), FrameRate(1), kSamples, {6, 10, 1, true, 0x8000'0000'0000'0000 % kTicksPerSecond}},
	};
	for (const auto& [time, rate, display, fields] : cases)
		EXPECT_EQ(FieldsOf(time, rate, display), fields) << time.GetTicks() << " at " << rate << " in " << display;
}

TEST(TimeToHMSF, GivesOnlyTheSignWithoutARate)
{
	const std::pair<FrameRate, TimeDisplay> cases[]
		= {{kBackwards, kSamples}, {FrameRate(kTicksPerSecond + 1), kSamples}, {FrameRate(0), kFrames},
			{kPAL, kTimeDisplay_Auto}, {kPAL, kNoDisplay}};
	for (const auto& [rate, display] : cases)
		for (const bool isNegative : {true, false})
			EXPECT_EQ(FieldsOf(TickTime(isNegative ? -5 : 5), rate, display), (TimecodeFields{0, 0, 0, isNegative, 0}))
				<< rate << " in " << display;
}

// Fields and the frame that they stand for, at the rate of the display.
struct FieldsCase
{
	TimecodeFields mFields;
	FrameRate mRate;
	TimeDisplay mDisplay;
	std::int64_t mFrame;
};

void ExpectFrames(std::initializer_list<FieldsCase> inCases)
{
	for (const auto& [fields, rate, display, frame] : inCases)
	{
		const auto& [hours, minutes, seconds, isNegative, count] = fields;
		const TickTime time = HMSFToTime(hours, minutes, seconds, count, isNegative, rate, display);
		const FrameRate shown = GetFrameRateForTimeDisplay(display, rate);
		EXPECT_EQ(time, Frames(frame, shown)) << hours << ':' << minutes << ':' << seconds << ':' << count << " at "
											  << rate << ": " << time.ToFrame64(shown);
	}
}

TEST(HMSFToTime, CarriesWhatIsTooLarge)
{
	constexpr unsigned kMostSeconds = std::numeric_limits<unsigned>::max();
	ExpectFrames({
		{{1, 2, 3, false, 4}, kPAL, k25, 93'079},
		{{1, 2, 3, true, 4}, kPAL, k25, -93'079},
		{{25, 61, 61, false, 26}, kPAL, k25, (2 * 3'600 + 2 * 60 + 2) * 25 + 1},
		{{24, 0, 0, false, 0}, kPAL, k25, 0},
		{{23, 60, 0, false, 0}, kPAL, k25, 0},
		{{0, 0, 60, false, 0}, kNTSC, kDrop, 1'800},
		{{0, 0, kMostSeconds, false, 25}, kPAL, k25, 23'295 * 25 + 25},
		{{0, 0, 0, false, 30}, kNTSC, kDrop, 30},
		{{0, 1, 0, false, 0}, kNTSC_HD, kDrop_HD, 3'600},
		{{0, 10, 0, false, 0}, kNTSC_HD, kDrop_HD, 35'964},
		{{0, 0, 0, false, 40'000'000}, kPAL, k25, 40'000'000 % (86'400 * 25)},
		{{0, 0, 0, false, kTicksPerSecond + 1}, FrameRate(1), k25, 26},
		{{0, 0, 0, false, 0 - 5ull}, kPAL, k25, 1'353'211},
	});
}

// Seconds of a rate that is not whole are truncated, and rounded with the frames where frames are counted.
TEST(HMSFToTime, CountsAtTheCallersRateWithoutAnother)
{
	ExpectFrames({
		{{0, 0, 1, false, 29}, kNTSC, kSamples, 58},
		{{0, 0, 10, false, 0}, kNTSC, kFrames, 299},
		{{0, 0, 0, false, 31}, FrameRate(kTicksPerSecond / 30 + 1), kSamples, 30},
		{{0, 0, 0, false, 48'003}, FrameRate(kTicksPerSecond / 48'001), kSamples, 48'002},
		{{0, 0, 1, false, 7}, FrameRate(kTicksPerSecond + 1), kSamples, 7},
		{{0, 0, 1, false, 3}, FrameRate(kTicksPerSecond), kSamples, 4},
		{{0, 0, 1, false, 7}, kFrameRate_Zero, kSamples, 7},
		{{0, 0, 1, false, 7}, FrameRate(-kPAL.GetTicksPerFrame()), kSamples, 0 - 25 + 7},
		{{0, 0, 1, false, 31}, FrameRate(-kNTSC.GetTicksPerFrame()), kSamples, 2},
		{{0, 0, 1, false, 31}, FrameRate(-kNTSC.GetTicksPerFrame()), kFrames, 1},
		{{0, 0, 1, false, 7}, kPAL, kNoDisplay, 7},
	});
}

// ---- A day of frames -------------------------------------------------------------------------------------------------

struct Day
{
	TimeDisplay mDisplay;
	int mLabels;        // in a second
	int mDropped = 0;   // at the start of most minutes
};

#if ZON_HAS_LIBAVUTIL
AVTimecode PeerOf(const Day& inDay, FrameRate inRate)
{
	const auto ratio = FrameRateToRatio(inRate);
	const AVRational rate{static_cast<int>(ratio.numerator()), static_cast<int>(ratio.denominator())};
	AVTimecode peer;
	const int flags = inDay.mDropped != 0 ? static_cast<int>(AV_TIMECODE_FLAG_DROPFRAME) : 0;
	EXPECT_EQ(0, av_timecode_init(&peer, rate, flags, 0, nullptr));
	return peer;
}
#endif

// The labels are counted as a clock counts them, and as libavutil does.
void WalkDay(const Day& inDay)
{
	const auto& [display, labels, dropped] = inDay;
	const FrameRate rate = GetFrameRateForTimeDisplay(display, {});
#if ZON_HAS_LIBAVUTIL
	const AVTimecode peer = PeerOf(inDay, rate);
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

TEST(FramesOfADay, HaveTheNextLabelAndAreReadBack)
{
	for (const Day& day : {Day{kTimeDisplay_24Timecode, 24}, Day{k25, 25}, Day{kDrop, 30, 2},
			 Day{kTimeDisplay_2997NonDropTimecode, 30}, Day{kTimeDisplay_30Timecode, 30},
			 Day{kTimeDisplay_50Timecode, 50}, Day{kDrop_HD, 60, 4}, Day{kTimeDisplay_5994NonDropTimecode, 60},
			 Day{kTimeDisplay_60Timecode, 60}, Day{kTimeDisplay_23976Timecode, 24}, Day{kTimeDisplay_48Timecode, 48}})
		WalkDay(day);
}

}   // namespace
}   // namespace zonmediatypes
