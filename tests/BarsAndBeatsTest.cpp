#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <random>
#include <string>
#include <string_view>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::oUTF16StringStream;
using zoncore::UTF16String;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::TruncateTo;
using zoncore::utility::UTF16to8;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

std::string Write(double inSamples, const BeatInfo& inBeats, bool inIsDuration, int inStyle, double inRate = 48'000)
{
	UTF16String text = AsciiToUTF16("before");
	EXPECT_TRUE(ConvertSamplesToBarsAndBeats(text, inSamples, inRate, inBeats, inIsDuration, inStyle));
	return UTF16to8(text);
}

std::string WriteBeats(std::int64_t inSamples, int inRate, double inTempo)
{
	UTF16String text;
	ConvertSamplesToBeats(text, inSamples, inRate, inTempo);
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

TEST(BarsAndBeats, AreWritten)
{
	struct Case
	{
		double mSamples;
		BeatInfo mBeats;
		bool mIsDuration;
		int mStyle;
		const char* mText;
	};
	for (const auto& [samples, beats, isDuration, style, expected] : std::initializer_list<Case>{
			 {132'000, kCommonTime, false, 2, "2:2.480"}, {132'000, kCommonTime, false, 0, "2"},
			 {132'000, kCommonTime, false, 1, "2:2"}, {132'000, kCommonTime, false, 3, "2:2.480.000"},
			 {132'000, kCommonTime, false, 99, "2:2.480.000"}, {132'000, kCommonTime, false, -1, ""},
			 {132'000, kCommonTime, true, 2, "1:1.480"}, {0, kCommonTime, true, 1, "0:0"},
			 {0, kCommonTime, false, 2, "1:1.000"}, {1, kCommonTime, false, 3, "1:1.000.040"},   // 0.04 ticks
			 {72'000, kWithOffset, false, 2, "1:1.000"}, {72'000, {10, 120, 4, 4, 1'500}, false, 2, "1:1.0"},
			 {72'000, {11, 120, 4, 4, 1'500}, false, 2, "1:1.00"},
			 {72'000, {101, 120, 4, 4, 1'500}, false, 2, "1:1.000"},
			 {72'000, {1'001, 120, 4, 4, 1'500}, false, 2, "1:1.0000"},
			 {72'000, {0, 120, 4, 4, 1'500}, true, 0, "-2305843009213693952"},   // the nudge divides by it
			 {48'000, kWithOffset, false, 2, "0:4.000"}, {-24'000, kCommonTime, false, 2, "0:4.000"},
			 {-96'000, kCommonTime, false, 1, "0:1"}, {-96'001, kCommonTime, false, 1, "-1:4"},
			 {80'000, kCompound, false, 2, "1:6.000"},   // eighths at 180 a minute
			 {96'000, kCompound, false, 2, "2:1.000"},
			 {0, kDecimal, false, 2, "04.000"},   // the nudge of -0.0005 beats lies in the bar before
			 {30'000, kDecimal, false, 0, "12.000"}, {30'000, kDecimal, false, 3, "12.000.000"},
			 {36'012, kDecimal, false, 2, "12.0"},
			 {24'012, kDecimal, false, 2, "12"},   // nothing behind a point that is not there
		 })
		EXPECT_EQ(Write(samples, beats, isDuration, style), expected) << samples << " in style " << style;
	EXPECT_EQ(Write(5, kCommonTime, true, 1, 0), "-2305843009213693952:0") << "an infinite position";
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
	constexpr auto kLowest = std::numeric_limits<std::int64_t>::min();
	for (const auto& [text, beats, isDuration, expected] : std::initializer_list<Case>{
			 {"2:2.480", kCommonTime, false, 132'000},
			 {"1:1.480", kCommonTime, true, 132'000},
			 {"3", kCommonTime, false, 192'000},
			 {"3", kCommonTime, true, 288'000},
			 {"3", kWithOffset, false, 264'000},
			 {"3", kWithOffset, true, 288'000},
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
			 {"2:4", kCompound, true, 256'000},
			 {"2147483648:2", kCommonTime, true, 48'000},
			 {"-2147483648:1", kCommonTime, false, -95'999},   // 2147483647 bars of four are -4 beats in 32 bits
			 {"1:1.5", {0, 120, 4, 4, 0}, true, kLowest},
			 {"1:1", {960, 0, 4, 4, 0}, true, kLowest},
			 {"0:0", {960, 120, 4, 0, 0}, true, kLowest},
		 })
		EXPECT_EQ(Read(text, beats, isDuration), expected) << text << isDuration;
}

TEST(Beats, AreWritten)
{
	EXPECT_EQ(WriteBeats(96'000, 48'000, 120), "4.000");
	EXPECT_EQ(WriteBeats(-36'000, 48'000, 120), "-1.-499");
	EXPECT_EQ(WriteBeats(-84, 48'000, 120), "0.0-3");
	EXPECT_EQ(WriteBeats(5, 0, 120), "0");
	EXPECT_EQ(WriteBeats(24'000, -48'000, 120), "0.-999");
	EXPECT_EQ(WriteBeats(48'000, 48'000, 0), "0.000");
	EXPECT_EQ(WriteBeats(48'000, 48'000, kInfinity), "-2147483648.-2147483648");
	EXPECT_EQ(WriteBeats(std::numeric_limits<std::int64_t>::max(), 1, 60), "-2147483648.000");
}

// The text by its rules and through a stream, with 64-bit numbers that wrap.
UTF16String OracleBarsAndBeats(
	double inSamples, double inRate, const BeatInfo& inBeats, bool inIsDuration, std::int32_t inStyle)
{
	__extension__ typedef __int128 Wide;   // NOLINT(modernize-use-using): the extension needs it
	const auto wrap = [](Wide inValue) { return static_cast<std::int64_t>(static_cast<std::uint64_t>(inValue)); };
	const std::int64_t perBar = inBeats.iBeatsPerBar;
	const std::int64_t perBeat = inBeats.iTicksPerBeat;
	double s = inSamples;
	if (!inIsDuration)
		s = s - std::floor(inBeats.dOffsetMilliseconds * inRate / 1000.0 + 0.5);
	double x = inBeats.iBeatValue * inBeats.dTempo * 0.25 * s / 60.0 / inRate + 0.5 / inBeats.iTicksPerBeat / 1000.0;
	std::int64_t k = 0;
	if (x < 0)
	{
		k = wrap(Wide{TruncateTo<std::int64_t>(-x / inBeats.iBeatsPerBar)} + 1);
		x += static_cast<double>(wrap(Wide{k} * perBar));
	}
	std::int64_t ticks = 0;
	std::int64_t milliTicks = 0;
	if (perBeat >= 1)
	{
		const double f = std::fmod(x, 1.0);
		const auto t = TruncateTo<std::int64_t>(f * inBeats.iTicksPerBeat);
		if (t == perBeat)
			x += 1.0 / inBeats.iTicksPerBeat;
		else
		{
			ticks = t;
			milliTicks = wrap(Wide{TruncateTo<std::int64_t>(f * inBeats.iTicksPerBeat * 1000)} - Wide{t} * 1'000);
		}
	}
	const Wide whole = TruncateTo<std::int64_t>(x);
	const std::int64_t bar = wrap(whole / perBar);
	const std::int64_t base = inIsDuration ? 0 : 1;
	const std::int64_t beatNumber = wrap(whole - Wide{bar} * perBar + base);
	const std::int64_t barNumber = wrap(Wide{bar} + base - k);

	oUTF16StringStream stream;
	UTF16String text;
	if (perBeat == -1)
	{
		const auto thousandths = TruncateTo<std::int64_t>(std::fmod(x, 1.0) * 1000);
		stream << barNumber << static_cast<double>(beatNumber) + static_cast<double>(thousandths) / 1000.0;
		text = stream.str();
		for (std::size_t i = text.find('.'); i < text.size() && i + 1 < text.size(); ++i)
			text[i + 1] = '0';
	}
	else
	{
		stream.fill('0');
		if (inStyle >= 0)
			stream << barNumber;
		if (inStyle >= 1)
			stream << AsciiToUTF16(":") << beatNumber;
		if (inStyle >= 2)
		{
			stream << AsciiToUTF16(".");
			stream.width(perBeat < 11 ? 1 : perBeat < 101 ? 2 : perBeat < 1'001 ? 3 : 4);
			stream << ticks;
		}
		text = stream.str();
	}
	if (inStyle < 3)
		return text;
	oUTF16StringStream milli;
	milli.fill('0');
	milli.width(3);
	milli << milliTicks;
	return text + AsciiToUTF16(".") + milli.str();
}

UTF16String OracleBeats(std::int64_t inSamples, int inRate, double inTempo)
{
	const double b = static_cast<double>(inSamples) / (inRate * 60.0 / inTempo) + 0.0005;
	oUTF16StringStream stream;
	stream.fill('0');
	stream << TruncateTo<std::int32_t>(b);
	stream.put('.');
	stream.width(3);
	stream << TruncateTo<std::int32_t>(std::fmod(b, 1.0) * 1000);
	return stream.str();
}

TEST(AnyMusicalPosition, IsWrittenAsAStreamWouldWriteIt)
{
	std::mt19937_64 random(11);
	const auto pick
		= [&]<class T>(std::initializer_list<T> inChoices) { return inChoices.begin()[random() % inChoices.size()]; };
	constexpr auto kMost = std::numeric_limits<std::int32_t>::max();
	constexpr auto kLeast = std::numeric_limits<std::int32_t>::min();
	UTF16String text;
	for (int i = 0; i < 200'000; ++i)
	{
		const BeatInfo beats{pick({-1, -1, 480, 960, 1, 10, 11, 101, 1'001, 0, -2, kMost, kLeast}),
			pick({120.0, 60.0, 137.3, 0.0, -90.0, 1e300, kInfinity, -kInfinity, std::nan("")}),
			pick({4, 3, 6, 1, -1, -4, kMost, kLeast}), pick({4, 8, 2, 16, 0, -4, kMost}),
			pick({0.0, 1'500.0, -33.3, 1e18, kInfinity})};
		const auto samples = static_cast<std::int64_t>(random()) >> random() % 64;
		const double position = random() % 20 == 0 ? pick({kInfinity, -kInfinity, std::nan(""), 1e300, -0.0})
												   : static_cast<double>(samples);
		const double rate = pick({48'000.0, 44'100.0, 1.0, 0.0, -48'000.0, kInfinity});
		const bool isDuration = random() % 2 == 0;
		const int style = static_cast<int>(random() % 6) - 1;
		ASSERT_TRUE(ConvertSamplesToBarsAndBeats(text, position, rate, beats, isDuration, style));
		ASSERT_EQ(UTF16to8(text), UTF16to8(OracleBarsAndBeats(position, rate, beats, isDuration, style)))
			<< position << " at " << rate << ": " << beats.iTicksPerBeat << " " << beats.dTempo << " "
			<< beats.iBeatsPerBar << "/" << beats.iBeatValue << " " << beats.dOffsetMilliseconds;
		const int wholeRate = pick({48'000, 44'100, 1, -8'000, kMost});
		ASSERT_EQ(WriteBeats(samples, wholeRate, beats.dTempo), UTF16to8(OracleBeats(samples, wholeRate, beats.dTempo)))
			<< samples << " at " << wholeRate << " " << beats.dTempo;
		// Whatever was written can be read, and whatever is read has a result.
		ConvertBarsAndBeatsToSamples(text, rate, beats, isDuration);
	}
}

TEST(MusicalPositions, SurviveText)
{
	for (const BeatInfo& beats : {kCommonTime, kCompound, kWithOffset, BeatInfo{480, 100, 7, 8, -250}})
	{
		const double perBeat = 48'000 * 60.0 / (beats.iBeatValue * beats.dTempo * 0.25);
		for (int tick = 0; tick < 200'000; tick += 7)
		{
			const auto offset = static_cast<std::int64_t>(beats.dOffsetMilliseconds * 48);
			const auto samples = static_cast<std::int64_t>(std::ceil(tick * perBeat / beats.iTicksPerBeat)) + offset;
			const std::int64_t back = Read(Write(static_cast<double>(samples), beats, false, 2), beats);
			ASSERT_LE(std::abs(back - samples), 1) << tick;
		}
	}
}

}   // namespace
}   // namespace zonmediatypes::utility
