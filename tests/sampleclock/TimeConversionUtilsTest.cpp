#include "zonmediatypes/TimeConversionUtils.h"

#include "tests/Allocations.h"
#include "tests/Walks.h"
#include "zoncore/Debug.h"
#include "zoncore/StringUtils.h"

#include <atomic>
#include <cstdio>
#include <functional>
#include <gtest/gtest.h>
#include <initializer_list>
#include <limits>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::UTF16String;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::UTF16to8;

constexpr TimecodeFormat kDecimal = kTimecodeFormat_Decimal;
constexpr TimecodeFormat kSamples = kTimecodeFormat_Samples;
constexpr TimecodeFormat kTimecode = kTimecodeFormat_Timecode;
constexpr TimecodeFormat kNTSC = kTimecodeFormat_TimecodeNTSC;
constexpr TimecodeFormat kDropFrame = kTimecodeFormat_TimecodeDropFrame;
constexpr TimecodeFormat kMilliseconds = kTimecodeFormat_Milliseconds;
// None and numbers that are no format.
constexpr TimecodeFormat kNoFormats[]
	= {kTimecodeFormat_None, static_cast<TimecodeFormat>(15), static_cast<TimecodeFormat>(0xFFFF'FFFF)};

constexpr auto kMost = std::numeric_limits<std::int64_t>::max();
constexpr auto kLeast = std::numeric_limits<std::int64_t>::min();

std::int64_t Read(std::string_view inText, TimecodeFormat inFormat, int inFrameRate = 30, int inRate = 48'000)
{
	BeatInfo beats;
	std::int64_t samples = 77;
	EXPECT_TRUE(ConvertTimecodeToSamples(samples, AsciiToUTF16(inText), inFormat, inRate, inFrameRate, &beats, false));
	return samples;
}

std::string Write(std::int64_t inSamples, TimecodeFormat inFormat, int inFrameRate = 30, int inRate = 48'000)
{
	const BeatInfo beats;
	UTF16String text = AsciiToUTF16("before");
	EXPECT_TRUE(ConvertSamplesToTimecode(text, inSamples, inRate, inFormat, inFrameRate, &beats, false));
	return UTF16to8(text);
}

// A caller's buffer gets the same text when it is long enough, and stays as it is when it is not.
template <class Char>
void ExpectInBuffer(
	const std::string& inText, std::int64_t inSamples, TimecodeFormat inFormat, int inFrameRate, int inRate)
{
	const BeatInfo beats;
	std::vector<Char> buffer(inText.size());
	const auto write = [&](std::size_t inRoom)
	{
		const std::span<Char> room(buffer.data(), inRoom);
		return ConvertSamplesToTimecode(room, inSamples, inRate, inFormat, inFrameRate, &beats, false);
	};
	EXPECT_EQ(write(inText.empty() ? 0 : inText.size() - 1), inText.size());
	EXPECT_EQ(buffer, std::vector<Char>(inText.size()));
	EXPECT_EQ(write(inText.size()), inText.size());
	EXPECT_EQ(std::string(buffer.begin(), buffer.end()), inText);
}

// The flags of the timecode formatter by letter: d(rop frame), n(TSC), c(ount), o(mit frames), s(uppress), f(raction),
// m(inutes).
bool WriteFlags(UTF16String& outText, std::int64_t inSamples, int inFrameRate, std::string_view inFlags)
{
	const auto has = [&](char inFlag) { return inFlags.find(inFlag) != std::string_view::npos; };
	return ConvertSamplesToTimecode(
		outText, inSamples, 48'000, inFrameRate, has('d'), has('n'), has('c'), has('o'), has('s'), has('f'), has('m'));
}

// ---- Tables ----------------------------------------------------------------------------------------------------------

// Positions and the texts that stand for them, in one format.
struct TextCases
{
	TimecodeFormat mFormat;
	std::vector<std::pair<std::int64_t, const char*>> mCases;
	int mFrameRate = 30;
	int mRate = 48'000;
};

void ExpectRead(std::initializer_list<TextCases> inGroups)
{
	for (const auto& [format, cases, frameRate, rate] : inGroups)
		for (const auto& [expected, text] : cases)
			EXPECT_EQ(Read(text, format, frameRate, rate), expected) << text << " in " << format << " at " << frameRate;
}

void ExpectWritten(std::initializer_list<TextCases> inGroups)
{
	for (const auto& [format, cases, frameRate, rate] : inGroups)
		for (const auto& [samples, expected] : cases)
		{
			SCOPED_TRACE(testing::Message() << samples << " in " << format);
			EXPECT_EQ(Write(samples, format, frameRate, rate), expected);
			ExpectInBuffer<char>(expected, samples, format, frameRate, rate);
			ExpectInBuffer<zoncore::UTF16Char>(expected, samples, format, frameRate, rate);
		}
}

// The rows of the tables in the header, and what lies at their limits.
TEST(SampleText, IsReadAsTimecode)
{
	ExpectRead({
		{kTimecode,
			{{48'000, "00:00:01:00"}, {150'400, "3:04"}, {150'400, "-3:04"}, {16'000, "10"}, {-1, ""}, {0, "abc"},
				{0, "abc."}, {0, "2147483648:00"}}},
		{kTimecode, {{0x7FFF'FFFF, "2147483647"}}, 1, 1},
		{kTimecode, {{0x3FFF'FFFF'0000'0001, "2147483647"}}, 1, 0x7FFF'FFFF},
		{kTimecode, {{0, "1:00"}}, 0},
		{kNTSC, {{48'048, "00:00:01:00"}, {3'439'409'797'824, "2147483640"}}},   // doubles would gain a sample
		{kNTSC, {{1'472, "00:00:00:01"}}, 30, 44'100},
		{kDropFrame,
			{{2'882'880, "00:01:00;02"}, {2'882'880, "00:01:00;00"}, {2'882'880, "00:01:00;01"},
				{2'884'482, "00:01:00;03"}}},
		{kDropFrame, {{2'882'880, "00:01:00;03"}, {2'883'681, "00:01:00;05"}}, 60},
		{kTimecodeFormat_Frames, {{16'000, "10"}}},
		{kTimecodeFormat_FramesDropFrame, {{2'882'880, "1:00;00"}}},
		{kTimecodeFormat_TimecodeSubframes, {{48'000, "1:00"}}},
	});
	std::int64_t samples = 77;
	EXPECT_TRUE(ConvertTimecodeToSamples(samples, AsciiToUTF16("00:01:00;00"), 48'000, 30, false, true));
	EXPECT_EQ(samples, 2'880'000) << "drop-frame labels do not imply the scaled rate";
}

// Five fields lose the first one; the fraction's digits are all that follows its point.
TEST(SampleText, IsReadWithFractions)
{
	ExpectRead({
		{kTimecode, {{354'440'000, "1:2:3:4:5:6"}, {354'440'000, "1:2:3:4:5.9"}}},
		{kTimecode, {{3'723 * 48'000 + 4 * 1'600 + 400, "1:2:3:4:.25"}, {62 * 48'000 + 3 * 1'600 + 64, "1:2:3:4."}}},
		{kTimecode, {{16'800, "10.50"}, {16'080, "10.5 "}, {20, "12."}, {1'608, "1.5:7"}, {800, ".5"}}},
		{kTimecode, {{681, "1.1234567890"}}},   // ten digits: a divisor of -2^31
		// Just beyond a sample, so that all digits count
		{kTimecode,
			{{4'411, ".1"}, {442, ".01"}, {39'736, ".901"}, {26'025, ".5901"}, {29'064, ".65901"}, {33'778, ".765901"},
				{16'609, ".3765901"}, {10'482, ".23765901"}, {40'740, ".923765901"}},
			1, 44'101},
	});
}

TEST(SampleText, IsReadInItsFormat)
{
	ExpectRead({
		{kDecimal,
			{{4'320'000, "1:30"}, {178'716'000, "1:2:03.25"}, {0, "1:00:00:00"}, {0, "0.00001"}, {1, "0.0000105"}}},
		{kSamples, {{-12, " -12 frames"}, {kMost, "9223372036854775807"}, {0, "9223372036854775808"}}},
		{kTimecodeFormat_Beats, {{102'000, "4.25"}, {-1, ""}}},
		{kTimecodeFormat_BarsAndBeats, {{192'000, "3"}, {-95'999, "abc"}}},   // bar 0, rounded upward
		{kMilliseconds, {{48'024, "1000.5"}, {5'760, "2:00"}}},
	});
	for (const TimecodeFormat none : kNoFormats)
		ExpectRead({{none, {{0, "1:00"}, {-1, ""}}}});
}

TEST(SampleText, IsWrittenAsTimecode)
{
	ExpectWritten({
		{kTimecode, {{175'729'600, "01:01:01:01"}, {-1, "-00:00:00:00"}, {48'000 * 360'000LL, "100:00:00:00"}}},
		{kTimecode, {{48'000, "00:00:01:0"}}, 1},
		{kTimecode, {{5, "00:00:05:00"}}, 30, 1},
		{kNTSC, {{48'047, "00:00:00:29"}, {48'048, "00:00:01:00"}}},
		{kTimecodeFormat_TimecodeNTSCAlt, {{48'048, "00:00:01:00"}}},
		{kTimecodeFormat_TimecodeNTSCAlt2, {{48'048, "00:00:01:00"}}},
		{kDropFrame, {{-2'882'880, "-00;01;00;02"}, {2'882'879, "00;00;59;29"}}},
		{kDropFrame, {{2'882'880, "00;01;00;04"}}, 60},
		{kTimecodeFormat_TimecodeDropFrameAlt, {{2'882'880, "00;01;00;02"}}},
		{kTimecodeFormat_Frames, {{-48'000, "30"}}},
		{kTimecodeFormat_FramesDropFrame, {{-96'096, "60"}}},
		{kTimecodeFormat_FramesDropFrame, {{96'096, "120"}}, 60},
		{kTimecodeFormat_TimecodeSubframes, {{240'800, "5:00.50"}, {-1'600, "-1.00"}}},
	});
}

TEST(SampleText, IsWrittenInItsFormat)
{
	ExpectWritten({
		{kDecimal, {{0, "   0:00.000"}, {-4'005'888, "  -1:23.456"}, {172'800'000, "1:00:00.000"}}},
		{kDecimal, {{-178'728'000, "-1:02:03.500"}, {1'728'047'999, "10:00:00.99"}}},
		{kDecimal, {{5, "   0:05.500"}}, 30, 1},
		{kSamples, {{kLeast, "-9223372036854775808"}}},
		{kTimecodeFormat_Beats, {{96'000, "4.000"}}},
		{kTimecodeFormat_BarsAndBeats, {{132'000, "2:2.480"}}},
		{kMilliseconds, {{59'256, "1234.5"}}},
		{kMilliseconds, {{3, "0.1"}, {-3, "0"}}, 30, 44'100},
		{kMilliseconds, {{1'234'567, "123457"}}, 30, 10'000},   // six digits
		{kMilliseconds, {{1'234'567, "1.23457e+06"}}, 30, 1'000},
	});
	UTF16String text;
	ConvertSamplesToDecimalTimecode(text, 1'728'024'000, 48'000, true);
	EXPECT_EQ(UTF16to8(text), "10:00:00");
}

TEST(SampleText, IsNeutralOrLeftAloneWithoutAnAnswer)
{
	for (const TimecodeFormat none : kNoFormats)
	{
		EXPECT_EQ(Write(48'000, none), "before");
		ExpectInBuffer<char>("", 48'000, none, 30, 48'000);
		ExpectInBuffer<zoncore::UTF16Char>("", 48'000, none, 30, 48'000);
	}
	// Nothing can be divided by these rates; at 2^28, 3600 frame rates are 0 in 32 bits.
	ExpectWritten({
		{kDecimal, {{5, "0"}}, 30, 0},
		{kDecimal, {{5, "0"}}, 30, -48'000},
		{kMilliseconds, {{5, "0"}}, 30, 0},
		{kTimecode, {{48'000, "0"}}, 30, 0},
		{kTimecode, {{48'000, "0"}}, 0},
		{kTimecodeFormat_Frames, {{48'000, "0"}}, -30},
		{kDropFrame, {{48'000, "0"}}, 29},
		{kDropFrame, {{48'000, "0"}}, 1 << 28},
	});
}

TEST(SampleText, FollowsTheFlagsOfTheFormatter)
{
	struct Case
	{
		std::int64_t mSamples;
		const char* mFlags;
		const char* mText;
		int mFrameRate = 30;
	};
	UTF16String text;
	for (const auto& [samples, flags, expected, frameRate] : std::initializer_list<Case>{{178'800'000, "m", "62:05:00"},
			 {178'800'000, "o", "01:02:05"}, {178'800'000, "mo", "62:05"}, {178'800'000, "s", "01:02:05:00"},
			 {60 * 48'000, "s", "1:00:00"}, {2'836'800, "s", "59:03"}, {-48'000, "s", "-1:00"},
			 {3'600 * 48'000, "sm", "60:00:00"}, {0, "m", "00:00:00"}, {0, "s", "0"}, {0, "so", "00"},
			 {0, "sf", "0.00"}, {0, "ms", "0"}, {48'048, "nf", "00:00:01:00.00"}, {2'882'880, "dosfm", "00;01;00;02"},
			 {2'882'880, "dc", "1800"}, {48'000, "", "00:00:01:0", 10}, {48'000, "", "00:00:01:00", 11},
			 {48'000, "", "00:00:01:00", 100}, {48'000, "", "00:00:01:000", 101}, {48'000, "", "00:00:01:000", 1'000},
			 {48'000, "", "00:00:01:0000", 1'001}})
	{
		EXPECT_TRUE(WriteFlags(text, samples, frameRate, flags));
		EXPECT_EQ(UTF16to8(text), expected) << samples << flags;
	}
}

TEST(DropFrameToHMSF, WritesOnlyWhatItReaches)
{
	using Labels = std::vector<std::uint32_t>;
	struct Case
	{
		std::int64_t mFrame;
		int mFrameRate;
		std::int64_t mResult;
		Labels mLabels;
	};
	for (const auto& [frame, rate, expected, labels] : std::initializer_list<Case>{
			 {29, 30, 0, {7, 7, 7, 29}},
			 {-31, 30, 1, {7, 7, 1, 1}},
			 {30, 30, 1, {7, 7, 1, 0}},
			 {1'800, 30, 0, {7, 8, 7, 2}},   // the minute is added to the caller's
			 {17'982, 30, 0, {7, 10, 7, 0}},
			 {107'892, 30, 0, {1, 7, 7, 0}},
			 {kLeast, 30, 16, {50'954'270, 22, 16, 0}},
			 {1'000, 29, 0, {7, 7, 7, 7}},
			 {1'000, -60, 0, {7, 7, 7, 7}},
		 })
	{
		Labels written(4, 7);
		EXPECT_EQ(DropFrameToHMSF(frame, rate, written[0], written[1], written[2], written[3]), expected) << frame;
		EXPECT_EQ(written, labels) << frame;
	}
}

// ---- A day of frames -------------------------------------------------------------------------------------------------

struct Day
{
	TimecodeFormat mFormat;
	int mFrameRate;
	bool mIsScaled = false;
	int mDropped = 0;
	const char* mPattern = "%02d:%02d:%02d:%02d";
};

// The first sample of a frame.
std::int64_t FrameStart(std::int64_t inFrame, const Day& inDay, int inRate)
{
	const std::int64_t numerator = inFrame * inRate * (inDay.mIsScaled ? 1'001 : 1);
	const std::int64_t denominator = inDay.mFrameRate * (inDay.mIsScaled ? 1'000LL : 1);
	return (numerator + denominator - 1) / denominator;
}

// The labels are counted as a clock counts them.
TEST(FramesOfADay, HaveTheNextLabelAndAreReadBack)
{
	const char* const drop = "%02d;%02d;%02d;%02d";
	for (const Day& day : {Day{kTimecode, 24}, Day{kTimecode, 25}, Day{kTimecode, 30}, Day{kTimecode, 50},
			 Day{kNTSC, 24, true}, Day{kNTSC, 30, true}, Day{kNTSC, 60, true}, Day{kDropFrame, 30, true, 2, drop},
			 Day{kDropFrame, 60, true, 4, drop}})
	{
		const int fps = day.mFrameRate;
		const int hours = zontest::WalkLength(day.mDropped != 0 ? 24 : 2, 1);
		for (int label = 0, frame = 0; label < hours * 3'600 * fps; ++label, ++frame)
		{
			if (label % (60 * fps) == 0 && label / (60 * fps) % 10 != 0)
				label += day.mDropped;
			const int seconds = label / fps;
			char text[16];
			std::snprintf(
				text, sizeof text, day.mPattern, seconds / 3'600, seconds / 60 % 60, seconds % 60, label % fps);
			const int rates[] = {8'000, 11'025, 22'050, 32'000, 44'100, 48'000, 88'200, 96'000, 192'000};
			const int rate = rates[static_cast<std::size_t>(frame) % std::size(rates)];
			ASSERT_EQ(Write(FrameStart(frame, day, rate), day.mFormat, fps, rate), text) << frame << " at " << rate;
			ASSERT_EQ(Read(text, day.mFormat, fps, rate), FrameStart(frame, day, rate)) << text << " at " << rate;
		}
	}
}

// The formula of drop-frame counts goes through doubles that fall just below a whole number on some frames.
TEST(DropFrameCounts, AreOneShortOnSomeFrames)
{
	std::vector<std::int64_t> shortFrames;
	for (std::int64_t frame = 0; frame < 107'892; ++frame)
	{
		const std::int64_t count
			= std::stoll(Write(FrameStart(frame, {kDropFrame, 30, true}, 48'000), kTimecodeFormat_FramesDropFrame));
		ASSERT_TRUE(count == frame || count == frame - 1) << frame;
		if (count != frame)
			shortFrames.push_back(frame);
	}
	ASSERT_EQ(shortFrames.size(), 5'480u);   // of the first hour
	shortFrames.resize(8);
	EXPECT_EQ(shortFrames, (std::vector<std::int64_t>{5, 10, 20, 25, 35, 40, 45, 50}));
}

// ---- Misuse and memory -----------------------------------------------------------------------------------------------

// What a host's assert dialog is told; from the second report on it switches the place off.
class Misuse : public testing::Test
{
protected:
	void ExpectTwoReports(const std::string& inReport, const std::function<bool()>& inMisuse)
	{
		mReports.clear();
		EXPECT_FALSE(inMisuse() || inMisuse() || inMisuse());
		EXPECT_EQ(mReports, (std::vector<std::string>{inReport, inReport}));
		EXPECT_GT(mLine, 0);
	}

	std::vector<std::string> mReports;
	int mLine = 0;

private:
	bool Report(std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage, const char* inFile,
		int inLine, const char* inFunction)
	{
		EXPECT_STREQ(inFile, "zonmediatypes/src/TimeConversionUtils.cpp");
		ioDisabled = !mReports.empty();
		mReports.push_back(std::string(inCondition) + ": " + inMessage + ": " + inFunction);
		mLine = inLine;
		return true;   // without a debugger nothing stops
	}

	void SetUp() override
	{
		mDialog = zoncore::debug::SetAssertDialog([this](auto&&... inArguments) { return Report(inArguments...); });
	}
	void TearDown() override { zoncore::debug::SetAssertDialog(mDialog); }

	decltype(zoncore::debug::SetAssertDialog({})) mDialog;
};

TEST_F(Misuse, IsReportedByEachPlaceUntilItIsSwitchedOff)
{
	UTF16String text = AsciiToUTF16("1:1.5");
	std::int64_t samples = 77;
	BeatInfo noBeats;
	noBeats.iBeatsPerBar = 0;
	const std::string space = "bool zonmediatypes::utility::";
	for (const TimecodeFormat format : {kTimecodeFormat_Beats, kTimecodeFormat_BarsAndBeats})
	{
		ExpectTwoReports("inBeatInfo: programmer error!\n: " + space
				+ "ConvertTimecodeToSamples(std::int64_t &, const zoncore::UTF16String &, TimecodeFormat, "
				  "std::int32_t, "
				  "std::int32_t, BeatInfo *, bool)",
			[&] { return ConvertTimecodeToSamples(samples, text, format, 48'000, 30, nullptr, false); });
		ExpectTwoReports("inBeatInfo: programmer error!\n: " + space
				+ "ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, TimecodeFormat, "
				  "std::int32_t, const BeatInfo *, bool)",
			[&] { return ConvertSamplesToTimecode(text, 48'000, 48'000, format, 30, nullptr, false); });
		EXPECT_EQ(ConvertSamplesToTimecode(std::span<char>(), 5, 48'000, format, 30, nullptr, false), 0u);
	}
	ExpectTwoReports("false: ConvertSamplesToTimecode programmer error!: " + space
			+ "ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, std::int32_t, bool, bool, "
			  "bool, bool, bool, bool, bool)",
		[&] { return WriteFlags(text, 48'000, 30, "dn"); });
	ExpectTwoReports("inBeatInfo.iBeatsPerBar != 0: programmer error!: " + space
			+ "ConvertSamplesToBarsAndBeats(zoncore::UTF16String &, double, double, const BeatInfo &, bool, int)",
		[&] { return ConvertSamplesToBarsAndBeats(text, 48'000, 48'000, noBeats, false, 2); });
	EXPECT_EQ(mLine, 980) << "the number that hosts know the last place by";
	EXPECT_EQ(UTF16to8(text), "1:1.5");
	EXPECT_EQ(samples, 77);
}

TEST(Conversions, AllocateNothingButTheirText)
{
	constexpr std::int64_t kPosition = 123'456'789'000'000;
	BeatInfo beats;
	const UTF16String before = AsciiToUTF16("before");
	const UTF16String longText = AsciiToUTF16("1:2." + std::string(100'000, '7') + ":3");
	const auto expectOneText = [&](auto&& inWrite)
	{
		UTF16String text = before;
		zontest::FailEachAllocation([&] { inWrite(text); }, [&] { EXPECT_EQ(text, before); });
		text.reserve(100);
		EXPECT_EQ(zontest::CountAllocations([&] { inWrite(text); }), 0u) << UTF16to8(text);
	};
	for (unsigned number = 0; number <= 15; ++number)
	{
		const auto format = static_cast<TimecodeFormat>(number);
		std::int64_t samples = 0;
		expectOneText([&](UTF16String& outText)
			{ ConvertSamplesToTimecode(outText, kPosition, 48'000, format, 30, &beats, false); });
		const auto read = [&] { ConvertTimecodeToSamples(samples, longText, format, 48'000, 30, &beats, false); };
		EXPECT_EQ(zontest::CountAllocations(read), 0u) << number;
	}
	expectOneText([](UTF16String& outText) { WriteFlags(outText, kPosition, 30, "f"); });
	expectOneText([](UTF16String& outText) { ConvertSamplesToDecimalTimecode(outText, kPosition, 1, false); });
	expectOneText([&](UTF16String& outText) { ConvertSamplesToBarsAndBeats(outText, 1e15, 48'000, beats, false, 3); });
	expectOneText([](UTF16String& outText) { ConvertSamplesToBeats(outText, kPosition, 1, 120); });
}

}   // namespace
}   // namespace zonmediatypes::utility
