#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <cmath>
#include <gtest/gtest.h>
#include <initializer_list>
#include <limits>
#include <string>
#include <string_view>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::UTF16String;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::UTF16to8;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

std::string Write(double inSamples, const BeatInfo& inBeats, bool inIsDuration, int inStyle, double inRate = 48'000)
{
	UTF16String text = AsciiToUTF16("before");
	EXPECT_TRUE(ConvertSamplesToBarsAndBeats(text, inSamples, inRate, inBeats, inIsDuration, inStyle));
	return UTF16to8(text);
}

std::int64_t Read(std::string_view inText, const BeatInfo& inBeats, bool inIsDuration = false)
{
	return ConvertBarsAndBeatsToSamples(AsciiToUTF16(inText), 48'000, inBeats, inIsDuration);
}

constexpr BeatInfo kCommonTime{960, 120, 4, 4, 0};
constexpr BeatInfo kCompound{480, 90, 6, 8, 0};
constexpr BeatInfo kDecimal{-1, 120, 4, 4, 0};
constexpr BeatInfo kWithOffset{960, 120, 4, 4, 1'500};

struct WrittenCase
{
	double mSamples;
	BeatInfo mBeats;
	bool mIsDuration;
	int mStyle;
	const char* mText;
};

void ExpectWritten(std::initializer_list<WrittenCase> inCases)
{
	for (const auto& [samples, beats, isDuration, style, expected] : inCases)
		EXPECT_EQ(Write(samples, beats, isDuration, style), expected) << samples << " in style " << style;
}

TEST(BarsAndBeats, AreWritten)
{
	ExpectWritten({
		// Styles
		{132'000, kCommonTime, false, -1, ""},
		{132'000, kCommonTime, false, 0, "2"},
		{132'000, kCommonTime, false, 1, "2:2"},
		{132'000, kCommonTime, false, 2, "2:2.480"},
		{132'000, kCommonTime, false, 99, "2:2.480.000"},
		{1, kCommonTime, false, 3, "1:1.000.040"},   // 0.04 ticks
		{132'000, kCommonTime, true, 2, "1:1.480"},
		// Ticks have as many digits as the largest one
		{72'000, {-2, 120, 4, 4, 0}, true, 3, "0:2.0.000"},
		{132'000, {1, 120, 4, 4, 0}, false, 3, "2:2.0.500"},
		{72'000, {10, 120, 4, 4, 1'500}, false, 2, "1:1.0"},
		{72'000, {11, 120, 4, 4, 1'500}, false, 2, "1:1.00"},
		{72'000, {101, 120, 4, 4, 1'500}, false, 2, "1:1.000"},
		{72'000, {1'001, 120, 4, 4, 1'500}, false, 2, "1:1.0000"},
		// Before the first bar
		{48'000, kWithOffset, false, 2, "0:4.000"},
		{-96'000, kCommonTime, false, 1, "0:1"},
		{-96'001, kCommonTime, false, 1, "-1:4"},
		{12'000, {960, 120, -4, 4, 0}, false, 1, "1:1"},
		{-12'000, {960, 120, -4, 4, 0}, false, 1, "1:1"},
		// Eighths at 180 a minute
		{80'000, kCompound, false, 2, "1:6.000"},
		{96'000, kCompound, false, 2, "2:1.000"},
	});
}

TEST(BarsAndBeats, AreWrittenWhereTheTextMeansLittle)
{
	ExpectWritten({
		// Decimal beats: the nudge of -0.0005 beats lies in the bar before
		{0, kDecimal, false, 2, "04.000"},
		{30'000, kDecimal, false, 0, "12.000"},
		{30'000, kDecimal, false, 3, "12.000.000"},
		{36'012, kDecimal, false, 2, "12.0"},
		{24'012, kDecimal, false, 2, "12"},   // nothing behind a point that is not there
		// No position at all
		{72'000, {0, 120, 4, 4, 1'500}, true, 0, "-2305843009213693952"},   // the nudge divides by it
		{kInfinity, kCommonTime, true, 1, "-2305843009213693952:0"},
	});
}

TEST(BarsAndBeats, AreRead)
{
	struct Case
	{
		const char* mText;
		BeatInfo mBeats;
		bool mIsDuration;
		std::int64_t mSamples;
	};
	constexpr auto kLeast = std::numeric_limits<std::int64_t>::min();
	for (const auto& [text, beats, isDuration, expected] : std::initializer_list<Case>{
			 {"2:2.480", kCommonTime, false, 132'000},
			 {"1:1.480", kCommonTime, true, 132'000},
			 {"0:4", kCommonTime, false, -23'999},
			 {"3", kCommonTime, false, 192'000},
			 {"3", kWithOffset, false, 264'000},
			 {"3", kWithOffset, true, 288'000},
			 {"2:4", kCompound, true, 256'000},
			 {"2:2.5", kCommonTime, true, 240'125},   // five ticks
			 {"2:2.5", kDecimal, true, 252'000},      // half a beat
			 {"0:0.125e1xyz", kDecimal, true, 30'000},
			 {"1:1.", kCommonTime, false, 0},
			 {".5:3", kDecimal, true, 84'000},   // the first point and the first colon, wherever they are
			 {"1:2:3.1.2", {10, 120, 4, 4, 0}, true, 146'400},
			 {"-1:1", kCommonTime, false, -191'999},
			 {" 2 : 3", kCommonTime, false, 144'000},
			 {"", kCommonTime, true, 0},
			 {"", kCommonTime, false, -95'999},
			 {"2147483648:2", kCommonTime, true, 48'000},
			 {"-2147483648:1", kCommonTime, false, -95'999},   // 2147483647 bars of four are -4 beats in 32 bits
			 {"1:1.5", {0, 120, 4, 4, 0}, true, kLeast},
			 {"1:1", {960, 0, 4, 4, 0}, true, kLeast},
			 {"0:0", {960, 120, 4, 0, 0}, true, kLeast},
		 })
		EXPECT_EQ(Read(text, beats, isDuration), expected) << text << isDuration;
}

TEST(Beats, AreWritten)
{
	struct Case
	{
		std::int64_t mSamples;
		int mRate;
		double mTempo;
		const char* mText;
	};
	for (const auto& [samples, rate, tempo, expected] : std::initializer_list<Case>{
			 {96'000, 48'000, 120, "4.000"},
			 {-36'000, 48'000, 120, "-1.-499"},
			 {-84, 48'000, 120, "0.0-3"},
			 {5, 0, 120, "0"},
			 {24'000, -48'000, 120, "0.-999"},
			 {48'000, 48'000, 0, "0.000"},
			 {48'000, 48'000, kInfinity, "-2147483648.-2147483648"},
			 {std::numeric_limits<std::int64_t>::max(), 1, 60, "-2147483648.000"},
		 })
	{
		UTF16String text;
		ConvertSamplesToBeats(text, samples, rate, tempo);
		EXPECT_EQ(UTF16to8(text), expected) << samples << " at " << rate << ", " << tempo;
	}
}

TEST(MusicalPositions, SurviveText)
{
	for (const BeatInfo& beats : {kCommonTime, kCompound, kWithOffset, BeatInfo{480, 100, 7, 8, -250}})
	{
		const double perTick = 48'000 * 60.0 / (beats.iBeatValue * beats.dTempo * 0.25) / beats.iTicksPerBeat;
		for (int tick = -10'000; tick < 200'000; tick += 7)
		{
			const double samples = std::ceil(tick * perTick) + beats.dOffsetMilliseconds * 48;
			const std::string text = Write(samples, beats, false, 2);
			ASSERT_LE(std::abs(static_cast<double>(Read(text, beats)) - samples), tick < 0 ? 2 : 1) << text;
		}
	}
}

}   // namespace
}   // namespace zonmediatypes::utility
