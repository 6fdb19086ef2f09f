#include "zonmediatypes/Timecode.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <ostream>
#include <random>
#include <string>
#include <string_view>
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

constexpr std::int64_t kMost = std::numeric_limits<std::int64_t>::max();
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

// ---- Text out --------------------------------------------------------------------------------------------------------

struct OutCase
{
	std::int64_t mFrames;   // at mRate
	FrameRate mRate;
	int mDisplay;
	unsigned mFlags;
	const char* mText;
};

TEST(TimeToTimecode, WritesWhatTheDisplayShows)
{
	for (const auto& [frames, rate, display, flags, text] : std::to_array<OutCase>({
			 {0, kPAL, 101, 0, "00:00:00:00"},
			 {30, kPAL, 101, 0, "00:00:01:05"},
			 {90, kPAL, 101, 0, "00:00:03:15"},
			 {24 * 90'000 + 5, kPAL, 101, 0, "00:00:00:05"},   // whole days are lost
			 {1'799, kNTSC, 102, 0, "00:00:59;29"},
			 {1'800, kNTSC, 102, 0, "00:01:00;02"},
			 {17'982, kNTSC, 102, 0, "00:10:00;00"},
			 {107'892, kNTSC, 102, 0, "01:00:00;00"},
			 {3'600, kNTSC_HD, 106, 0, "00:01:00;04"},
			 {107'892, kNTSC, 103, 0, "00:59:56:12"},
			 {24 * 60, kFrameRate_23976, 110, 0, "00:01:00:00"},
			 {1'500, kMs, 201, 0, "00:00:01.500"},
			 {100'000, k48k, 200, 0, "00:00:02:04000"},
			 {192'001, kFrameRate_Audio192000, 200, 0, "00:00:01:1"},   // unpadded above five digits
			 {7, kFrameRate_Video10, 200, 0, "00:00:00:7"},
			 {7, FrameRate(kTicksPerSecond / 11), 200, 0, "00:00:00:07"},
			 {7, FrameRate(kTicksPerSecond / 109), 200, 0, "00:00:00:07"},
			 {7, FrameRate(kTicksPerSecond / 110), 200, 0, "00:00:00:007"},
			 {1'007, FrameRate(kTicksPerSecond / 1'099), 200, 0, "00:00:00:1007"},
			 {7, FrameRate(kTicksPerSecond / 1'100), 200, 0, "00:00:00:0007"},
			 {7, FrameRate(kTicksPerSecond / 11'000), 200, 0, "00:00:00:00007"},
			 {7, FrameRate(kTicksPerSecond / 110'000), 200, 0, "00:00:00:7"},
			 // Signs
			 {-1, kPAL, 101, 0, "23:00:00:01"},
			 {-1, kPAL, 101, kSign, "-00:00:00:01"},
			 {1, kPAL, 101, kSign, "+00:00:00:01"},
			 {0, kPAL, 101, kSign, "00:00:00:00"},
			 {-3 * 90'000 - 62, kPAL, 101, 0, "20:00:02:12"},
			 {-400'000, kFrameRate_Video10, 101, 0, "12:06:40:00"},
			 // Leading fields
			 {5 * 25 + 12, kPAL, 101, kTrim, "5:12"},
			 {0, kPAL, 101, kTrim, "0:00"},
			 {65 * 25, kPAL, 101, kTrim, "1:05:00"},
			 {90'000, kPAL, 101, kTrim, "1:00:00:00"},
			 {12 * 90'000, kPAL, 101, kTrim, "12:00:00:00"},
			 {-25, kPAL, 101, kTrim, "23:00:01:00"},
			 {5 * 25, kPAL, 101, kSign | kTrim, "+5:00"},
			 {-5 * 25, kPAL, 101, kSign | kTrim, "-5:00"},
			 {90'000 + 25, kPAL, 101, kOmit, "00:01:00"},
			 {90'000 + 25, kPAL, 101, kOmit | kTrim, "1:00"},
			 {-1, kPAL, 101, kOmit | kSign, "-00:00:01"},
			 {3'900, k48k, 200, kTrim | kOmit, "0:03900"},
			 // The last frame of a range
			 {25, kPAL, 101, kLast, "00:00:00:24"},
			 {0, kPAL, 101, kLast, "23:00:00:01"},
			 {0, kPAL, 109, kLast, "-1"},
			 {1, kPAL, 101, kLast | kSign, "00:00:00:00"},
			 {1, kPAL, 101, 0xFFFF'FFF0, "00:00:00:01"},
			 // Counts
			 {1'000, kPAL, 109, kTrim, "1000"},
			 {-1'000, kPAL, 109, 0, "-1000"},
			 {-1'000, kPAL, 109, kSign, "-1000"},
			 {1'000, kPAL, 109, kSign, "+1000"},
			 {1'000, kPAL, 112, 0, "62+08"},
			 {1'000, kPAL, 112, kSign, "+62+08"},
			 {-1'000, kPAL, 112, 0, "-62+08"},
			 {-1'000, kPAL, 112, kSign, "-62+08"},
			 {1'000, kPAL, 111, 0, "25+00"},
			 {1'039, kPAL, 111, 0, "25+39"},
			 // The display that fits the rate
			 {1'800, kNTSC, 999, 0, "00:01:00;02"},
			 {30, kPAL, 999, 0, "00:00:01:05"},
			 {100'000, k48k, 999, 0, "00:00:02:04000"},
			 {3'000, kMs, 999, 0, "00:00:02;29"},
			 // No rate and no display
			 {5, FrameRate(0), 200, 0, "00:00:00:0"},
			 {-5, FrameRate(-10), 200, 0, "00:00:00:0"},
			 {5, kPAL, 7, 0, "00:00:00:0"},
			 {-5, kPAL, 7, 0, "23:00:00:0"},
			 {5, FrameRate(0), 109, 0, "0"},
		 }))
		EXPECT_EQ(Out(Frames(frames, rate), rate, display, flags), text) << frames << " at " << rate;
}

TEST(TimeToTimecode, WritesTimesThatNoFrameStartsAt)
{
	EXPECT_EQ(Out(TickTime(-1), kPAL, 101), "23:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 101, kSign), "-00:00:00:00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 112), "-0+00");
	EXPECT_EQ(Out(TickTime(-1), kPAL, 109), "0");
	EXPECT_EQ(Out(kTime_Invalid, kPAL, 101), "08:06:40:00");
	EXPECT_EQ(Out(TickTime(kLeast), FrameRate(1), 109), "-9223372036854775808");
	EXPECT_EQ(Out(TickTime(kLeast), FrameRate(1), 111), "-230584300921369395+08");
	EXPECT_EQ(Out(TickTime(kTicksPerSecond - 1), FrameRate(1), 200, kSign), "+00:00:00:254015999999");
	EXPECT_EQ(Out(Frames(5, kPAL), FrameRate(-kPAL.GetTicksPerFrame()), 109, kSign), "+-5");
}

// ---- Text in ---------------------------------------------------------------------------------------------------------

struct InCase
{
	const char* mText;
	FrameRate mRate;
	int mDisplay;
	unsigned mFlags;
	std::int64_t mFrames;   // at mRate
};

TEST(TimecodeToTime, ReadsWhatUsersType)
{
	for (const auto& [text, rate, display, flags, frames] : std::to_array<InCase>({
			 {"", kPAL, 101, 0, 0},
			 {"", kPAL, 101, kLast, 0},
			 {"00:00:03:15", kPAL, 101, 0, 90},
			 {"+00.00;03:15", kPAL, 101, 0, 90},
			 {"-00:00:03:15", kPAL, 101, 0, -90},
			 {"3:15", kPAL, 101, 0, 90},
			 {"3:", kPAL, 101, 0, 75},
			 {"1:0:0:0", kPAL, 101, 0, 90'000},
			 {"1:0:0:", kPAL, 101, 0, 90'000},
			 {"25:0:0:0", kPAL, 101, 0, 90'000},
			 {"99:00:00", kPAL, 101, 0, 99 * 60 * 25},
			 {"0:0:3675:0", kPAL, 101, 0, 3'675 * 25},
			 {"0:25", kPAL, 101, 0, 25},
			 {"0:26", kPAL, 101, 0, 26},
			 {"0:30", kNTSC, 103, 0, 30},
			 // Dropped labels
			 {"00:01:00;00", kNTSC, 102, 0, 1'800},
			 {"00:01:00;01", kNTSC, 102, 0, 1'799},
			 {"00:01:00;02", kNTSC, 102, 0, 1'800},
			 {"00:10:00;00", kNTSC, 102, 0, 17'982},
			 {"00:00:00;30", kNTSC, 102, 0, 30},
			 {"00:00:59;30", kNTSC, 102, 0, 1'800},
			 {"00:01:00;00", kNTSC_HD, 106, 0, 3'600},
			 {"00:01:00;01", kNTSC_HD, 106, 0, 3'597},
			 {"00:01:00;03", kNTSC_HD, 106, 0, 3'599},
			 {"00:01:00;04", kNTSC_HD, 106, 0, 3'600},
			 {"23:59:59;29", kNTSC, 102, 0, 24 * 107'892 - 1},
			 {"24:00:00;00", kNTSC, 102, 0, 0},
			 // Runs of digits
			 {"12", kPAL, 101, 0, 12},
			 {"500", kPAL, 101, 0, 125},
			 {"500", k48k, 101, 0, 500 * 1'920},
			 {"10000", kPAL, 101, 0, 60 * 25},
			 {"1020304", kPAL, 101, 0, ((60 + 2) * 60 + 3) * 25 + 4},
			 {"99995959", kPAL, 101, 0, ((4 * 60 + 40) * 60 + 1) * 25 + 9},
			 {"4294967295", kPAL, 101, 0, ((23 * 60 + 37) * 60 + 15) * 25 + 20},
			 {"99999999999999999999", kPAL, 101, 0, ((23 * 60 + 37) * 60 + 15) * 25 + 20},
			 // Counts
			 {"1000", kPAL, 109, 0, 1'000},
			 {"-1000", kPAL, 109, 0, -1'000},
			 {".1000", kPAL, 109, 0, 1'000},
			 {"-:1000", kPAL, 101, 0, -1'000},
			 {".1000", kPAL, 101, 0, 1'000},
			 {":1:2", kPAL, 101, 0, 27},
			 {"5000000000", kPAL, 109, 0, 4'294'967'295},
			 {"-;5000000000", kPAL, 104, 0, -4'294'967'295},
			 // Milliseconds
			 {"00:00:01.500", kMs, 201, 0, 1'500},
			 {"1.5", kMs, 201, 0, 1'005},
			 {"1500", kMs, 201, 0, 1'500},
			 {"0.1001", kMs, 201, 0, 1'001},
			 {".500", k48k, 201, 0, 500},
			 // Samples
			 {"2:4000", k48k, 200, 0, 100'000},
			 {"204000", k48k, 200, 0, 100'000},
			 {"104000", kFrameRate_Audio8000, 200, 0, 10 * 8'000 + 4'000},
			 // The last frame of a range
			 {"00:00:00:24", kPAL, 101, kLast, 25},
			 {"-00:00:00:24", kPAL, 101, kLast, -25},
			 {"0", kPAL, 101, kLast, 1},
			 {"-0", kPAL, 101, kLast, -1},
			 {"1+00", kPAL, 112, kLast, 17},
			 {"0+00", kPAL, 112, kLast, -1},
			 {"-1+00", kPAL, 112, kLast, -17},
			 // Flags without effect
			 {"3:15", kPAL, 101, kOmit | kTrim | kSign, 90},
			 // Feet and frames
			 {"12+08", kPAL, 112, 0, 200},
			 {"1208", kPAL, 112, 0, 200},
			 {"-1208", kPAL, 112, 0, -200},
			 {"12:8", kPAL, 111, 0, 488},
			 {"8", kPAL, 112, 0, 8},
			 {"+8", kPAL, 112, 0, 8},
			 {"-", kPAL, 112, 0, 0},
			 {"+-1208", kPAL, 112, 0, -12 * 16 + 8},
			 {"--12+8", kPAL, 112, 0, 12 * 16 - 8},
			 {" 12; 08x", kPAL, 112, 0, 200},
			 {"x+y", kPAL, 112, 0, 0},
			 {"12+", kPAL, 112, 0, 192},
			 {"134217728+5", kPAL, 112, 0, 5 - 0x8000'0000ll},
			 {"268435456+5", kPAL, 112, 0, 5},
			 {"99999999999999999999+0", kPAL, 112, 0, -16},
			 {"-99999999999999999999+0", kPAL, 112, 0, 16},
			 {"+-99999999999999999999+1", kPAL, 112, 0, 1},
			 {"1+99999999999999999999", kPAL, 112, 0, 15},
			 // The display that fits the rate
			 {"00:01:00;02", kNTSC, 999, 0, 1'800},
		 }))
		EXPECT_EQ(In(text, rate, display, flags), Frames(frames, rate)) << text;
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

// ---- Every frame of a day --------------------------------------------------------------------------------------------

struct DayCase
{
	const char* mName;
	TimeDisplay mDisplay;
	FrameRate mRate;
	int mLabels, mDropped;
};

class EveryFrameOfADay : public testing::TestWithParam<DayCase>
{
};

// The labels in the order in which a clock counts them.
class LabelClock
{
public:
	explicit LabelClock(const DayCase& inCase) : mCase(inCase) {}

	void Advance()
	{
		if (++mFrame < mCase.mLabels)
			return;
		mFrame = 0;
		if (++mSecond < 60)
			return;
		mSecond = 0;
		++mMinute;
		if (mMinute % 10 != 0)
			mFrame = mCase.mDropped;
	}

	bool IsAtEndOfDay() const { return mMinute == 24 * 60; }

	// Compared without making a text: this is done tens of millions of times.
	bool Matches(zoncore::UTF16StringView inText) const
	{
		const auto two = [&](std::size_t inAt, int inNumber)
		{ return inText[inAt] == '0' + inNumber / 10 && inText[inAt + 1] == '0' + inNumber % 10; };
		return inText.size() == 11 && two(0, mMinute / 60) && inText[2] == ':' && two(3, mMinute % 60)
			&& inText[5] == ':' && two(6, mSecond) && inText[8] == (mCase.mDropped != 0 ? ';' : ':') && two(9, mFrame);
	}

private:
	DayCase mCase;
	int mMinute = 0, mSecond = 0, mFrame = 0;
};

TEST_P(EveryFrameOfADay, HasTheNextLabelAndIsReadBack)
{
	const DayCase& day = GetParam();
	TickTime time;
	for (LabelClock clock(day); !clock.IsAtEndOfDay(); clock.Advance(), time.AddFrames(1, day.mRate))
	{
		const zoncore::UTF16String text = TimeToTimecode(time, day.mRate, day.mDisplay);
		if (!clock.Matches(text) || TimecodeToTime(text, day.mRate, day.mDisplay) != time)
			FAIL() << zoncore::utility::UTF16to8(text) << " at frame " << time.ToFrame64(day.mRate);
	}
	EXPECT_EQ(Out(time, day.mRate, day.mDisplay).substr(0, 8), "00:00:00");
}

#if ZON_HAS_LIBAVUTIL
TEST_P(EveryFrameOfADay, HasTheTextOfLibavutil)
{
	const DayCase& day = GetParam();
	const auto rate = FrameRateToRatio(day.mRate);
	const AVRational avRate{static_cast<int>(rate.numerator()), static_cast<int>(rate.denominator())};
	AVTimecode timecode;
	ASSERT_EQ(0, av_timecode_init(&timecode, avRate, day.mDropped != 0 ? AV_TIMECODE_FLAG_DROPFRAME : 0, 0, nullptr));
	const int frames = static_cast<int>(In("23:59:59:00", day.mRate, day.mDisplay).ToFrame64(day.mRate)) + day.mLabels;
	// Every frame where labels are dropped; elsewhere libavutil divides as we do.
	std::array<char, AV_TIMECODE_STR_SIZE> expected;
	for (int frame = 0; frame < frames; frame += day.mDropped != 0 ? 1 : 97)
	{
		av_timecode_make_string(&timecode, expected.data(), frame);
		ASSERT_EQ(Out(Frames(frame, day.mRate), day.mRate, day.mDisplay), expected.data()) << frame;
	}
}
#endif

INSTANTIATE_TEST_SUITE_P(Timecode, EveryFrameOfADay,
	testing::Values(DayCase{"24", kTimeDisplay_24Timecode, kFrameRate_Film24, 24, 0},
		DayCase{"25", kTimeDisplay_25Timecode, kPAL, 25, 0},
		DayCase{"2997Drop", kTimeDisplay_2997DropTimecode, kNTSC, 30, 2},
		DayCase{"2997NonDrop", kTimeDisplay_2997NonDropTimecode, kNTSC, 30, 0},
		DayCase{"30", kTimeDisplay_30Timecode, kFrameRate_Video30, 30, 0},
		DayCase{"50", kTimeDisplay_50Timecode, kFrameRate_VideoPAL_HD, 50, 0},
		DayCase{"5994Drop", kTimeDisplay_5994DropTimecode, kNTSC_HD, 60, 4},
		DayCase{"5994NonDrop", kTimeDisplay_5994NonDropTimecode, kNTSC_HD, 60, 0},
		DayCase{"60", kTimeDisplay_60Timecode, kFrameRate_Video60, 60, 0},
		DayCase{"23976", kTimeDisplay_23976Timecode, kFrameRate_23976, 24, 0},
		DayCase{"48", kTimeDisplay_48Timecode, kFrameRate_Film48, 48, 0}),
	[](const auto& inInfo) { return inInfo.param.mName; });

// ---- Any input -------------------------------------------------------------------------------------------------------

struct Fields
{
	unsigned int mHours = 0, mMinutes = 0, mSeconds = 0;
	unsigned long long mFrames = 0;
	bool mNegative = false;

	bool operator==(const Fields&) const = default;
	friend std::ostream& operator<<(std::ostream& inStream, const Fields& inFields)
	{
		return inStream << (inFields.mNegative ? '-' : '+') << inFields.mHours << ':' << inFields.mMinutes << ':'
						<< inFields.mSeconds << ':' << inFields.mFrames;
	}
};

Fields FieldsOf(TickTime inTime, FrameRate inRate, int inDisplay)
{
	Fields fields{1, 2, 3, 4, true};
	TimeToHMSF(fields.mHours, fields.mMinutes, fields.mSeconds, fields.mFrames, fields.mNegative, inTime, inRate,
		Display(inDisplay));
	return fields;
}

TickTime TimeOf(const Fields& inFields, FrameRate inRate, int inDisplay)
{
	return HMSFToTime(inFields.mHours, inFields.mMinutes, inFields.mSeconds, inFields.mFrames, inFields.mNegative,
		inRate, Display(inDisplay));
}

bool IsDrop(int inDisplay)
{
	return inDisplay == 102 || inDisplay == 106;
}

// Step by step, minute by minute, with the drop-frame numbers as the standard lists them (29.97; twice that at 59.94).
Fields ReferenceFields(TickTime inTime, FrameRate inRate, int inDisplay)
{
	Fields fields;
	fields.mNegative = inTime < kTime_Zero;
	const FrameRate rate = GetFrameRateForTimeDisplay(Display(inDisplay), inRate);
	const std::int64_t number = inTime.ToFrame64(rate);
	if (inDisplay == 109)
	{
		fields.mFrames = static_cast<std::uint64_t>(number);
		return fields;
	}
	if (rate.GetTicksPerFrame() <= 0 || kTicksPerSecond / rate.GetTicksPerFrame() < 1)
		return fields;
	std::uint64_t frames = static_cast<std::uint64_t>(number < 0 ? -number : number);
	if (IsDrop(inDisplay))
	{
		const std::uint64_t m = inDisplay == 106 ? 2 : 1;
		std::uint64_t minutes = frames / (17'982 * m) * 10;
		frames %= 17'982 * m;
		if (frames >= 1'800 * m)
		{
			const std::uint64_t shortMinutes = (frames - 1'800 * m) / (1'798 * m) + 1;
			minutes += shortMinutes;
			frames -= shortMinutes * 1'798 * m;
		}
		fields.mHours = static_cast<unsigned>(minutes / 60 % 24);
		fields.mMinutes = static_cast<unsigned>(minutes % 60);
		fields.mSeconds = static_cast<unsigned>(frames / (30 * m));
		fields.mFrames = frames % (30 * m);
		return fields;
	}
	fields.mNegative = number < 0;
	const std::uint64_t nominal = inDisplay == 103 ? 30
		: inDisplay == 107                         ? 60
		: inDisplay == 110                         ? 24
						   : static_cast<std::uint64_t>(kTicksPerSecond / rate.GetTicksPerFrame());
	fields.mHours = static_cast<unsigned>(frames / (3'600 * nominal) % 24);
	frames %= 3'600 * nominal;
	fields.mMinutes = static_cast<unsigned>(frames / (60 * nominal));
	frames %= 60 * nominal;
	fields.mSeconds = static_cast<unsigned>(frames / nominal);
	fields.mFrames = frames % nominal;
	return fields;
}

std::uint64_t Truncated(double inValue)
{
	return static_cast<std::uint64_t>(zoncore::utility::TruncateTo<std::int64_t>(inValue));
}

double PerSecond(FrameRate inRate)
{
	return inRate.IsUsable() ? 254016000000.0 / static_cast<double>(inRate.GetTicksPerFrame()) : 0.0;
}

std::uint64_t ReferenceNumber(const Fields& inFields, FrameRate inRate, int inDisplay)
{
	const auto [hours, minutes, seconds, frames, negative] = inFields;
	const std::uint64_t total = (hours * 60 + minutes) * 60 + seconds;
	if (IsDrop(inDisplay))
	{
		const std::uint64_t m = inDisplay == 106 ? 2 : 1;
		const std::uint64_t base = hours * 107'892 * m + minutes / 10 * 17'982 * m;
		if (minutes % 10 == 0)
			return base + seconds * 30 * m + frames;
		const std::uint64_t first = base + 1'800 * m + (minutes % 10 - 1) * 1'798 * m;
		if (seconds >= 1)
			return first + 28 * m + 30 * m * (seconds - 1) + frames;
		return frames >= 1 ? first + frames - 2 * m : first;
	}
	if (inDisplay == 103 || inDisplay == 107 || inDisplay == 110)
		return total * (inDisplay == 103 ? 30 : inDisplay == 107 ? 60 : 24) + frames;
	if (inDisplay == 109)
		return Truncated(static_cast<double>(total) * PerSecond(inRate) + static_cast<double>(frames));
	const FrameRate rate = GetFrameRateForTimeDisplay(Display(inDisplay), inRate);
	return Truncated(static_cast<double>(total) * PerSecond(rate)) + frames;
}

// The formula with all its doubles.
TickTime ReferenceTime(Fields inFields, FrameRate inRate, int inDisplay)
{
	auto& [hours, minutes, seconds, frames, negative] = inFields;
	const double perSecond = PerSecond(inRate);
	if (static_cast<double>(frames) > perSecond && inRate.IsUsable() && perSecond >= 1)
	{
		const double nominal = 254016000000.0 / static_cast<double>(Truncated(254016000000.0 / std::ceil(perSecond)));
		const std::uint64_t carry = Truncated(static_cast<double>(frames) / nominal);
		frames -= carry * Truncated(nominal);
		seconds += static_cast<unsigned>(carry);
	}
	minutes += seconds / 60;
	seconds %= 60;
	hours += minutes / 60;
	minutes %= 60;
	hours %= 24;
	const FrameRate rate = GetFrameRateForTimeDisplay(Display(inDisplay), inRate);
	const TickTime time = Frames(static_cast<std::int64_t>(ReferenceNumber(inFields, inRate, inDisplay)), rate);
	return negative ? -time : time;
}

// Numbers of every size, extremes among them, and small ones more often than not.
class OddNumbers
{
public:
	std::uint64_t Any()
	{
		const std::uint64_t bits = mEngine() >> (mEngine() % 64);
		return mEngine() % 4 == 0 ? 0 - bits : bits;
	}
	template <class T>
	T Of(const std::vector<T>& inValues)
	{
		return inValues[mEngine() % inValues.size()];
	}
	FrameRate Rate()
	{
		static const auto sNamed = AllFrameRates();
		switch (mEngine() % 4)
		{
		case 0:
			return FrameRate(Of<std::int64_t>({0, -1, 1, kMost, kLeast, kTicksPerSecond, kTicksPerSecond + 1,
				kTicksPerSecond - 1, 10'594'583'999, -kNTSC.GetTicksPerFrame()}));
		case 1:
			return FrameRate(static_cast<std::int64_t>(Any()));
		default:
			return sNamed[mEngine() % sNamed.size()];
		}
	}
	int Display()
	{
		const auto all = AllTimeDisplays();
		return mEngine() % 8 == 0 ? static_cast<int>(Any()) : all[mEngine() % all.size()];
	}

private:
	std::mt19937_64 mEngine{20'261'121};
};

constexpr int kOddInputs = 300'000;

TEST(TimecodeOfAnyInput, FollowsTheStepwiseFormulas)
{
	OddNumbers numbers;
	for (int i = 0; i < kOddInputs; ++i)
	{
		const FrameRate rate = numbers.Rate();
		const int display = numbers.Display();
		const TickTime time(static_cast<std::int64_t>(numbers.Any()));
		ASSERT_EQ(FieldsOf(time, rate, display), ReferenceFields(time, rate, display))
			<< time.GetTicks() << ' ' << rate.GetTicksPerFrame() << ' ' << display;
		const Fields fields{static_cast<unsigned>(numbers.Any()), static_cast<unsigned>(numbers.Any()),
			static_cast<unsigned>(numbers.Any()), numbers.Any(), numbers.Any() % 2 == 0};
		ASSERT_EQ(TimeOf(fields, rate, display), ReferenceTime(fields, rate, display))
			<< fields << ' ' << rate.GetTicksPerFrame() << ' ' << display;
	}
}

// Frame counts about one second decide about a carry that is found without the formula's division.
TEST(TimecodeOfAnyInput, CarriesAtOneSecondOfEveryRate)
{
	OddNumbers numbers;
	for (int i = 0; i < kOddInputs; ++i)
	{
		const FrameRate rate = numbers.Rate();
		const auto second = static_cast<std::uint64_t>(TickTime(kTicksPerSecond).ToFrame64(rate));
		for (const std::uint64_t frames : {second - 1, second, second + 1, 2 * second, 2 * second + 1})
			ASSERT_EQ(TimeOf({0, 0, 0, frames}, rate, 103), ReferenceTime({0, 0, 0, frames}, rate, 103))
				<< frames << " at " << rate.GetTicksPerFrame();
	}
}

TEST(TimecodeOfAnyInput, HasTextAndIsRead)
{
	OddNumbers numbers;
	const zoncore::UTF16String alphabet = zoncore::utility::AsciiToUTF16("0123456789:;.+- x");
	for (int i = 0; i < kOddInputs; ++i)
	{
		const FrameRate rate = numbers.Rate();
		const TimeDisplay display = Display(numbers.Display());
		const auto flags = static_cast<unsigned>(numbers.Any());
		const TickTime time(static_cast<std::int64_t>(numbers.Any()));
		ASSERT_FALSE(TimeToTimecode(time, rate, display, flags).empty());
		zoncore::UTF16String text;
		for (std::uint64_t left = numbers.Any() % 24; left != 0; --left)
		{
			const std::uint64_t number = numbers.Any();
			text += static_cast<zoncore::UTF16Char>(i % 8 == 0 ? number : alphabet[number % alphabet.size()]);
		}
		ASSERT_EQ(TimecodeToTime(text, rate, display, flags),
			TimecodeToTime(zoncore::UTF16StringView(text), rate, display, flags));
	}
}

}   // namespace
}   // namespace zonmediatypes
