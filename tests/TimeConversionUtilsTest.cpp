#include "zonmediatypes/TimeConversionUtils.h"

#include "tests/Allocations.h"
#include "zoncore/Debug.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"

#include <atomic>
#include <cmath>
#include <functional>
#include <gtest/gtest.h>
#include <limits>
#include <random>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zonmediatypes::utility
{
namespace
{

using zoncore::oUTF16StringStream;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zoncore::utility::AsciiToUTF16;
using zoncore::utility::UTF16to8;

constexpr auto kSampleRates = {8'000, 11'025, 16'000, 22'050, 32'000, 44'100, 48'000, 88'200, 96'000, 176'400, 192'000};

std::int64_t ReadTimecode(std::string_view inText, int inRate, int inFrameRate, bool inNTSC, bool inDropFrame)
{
	std::int64_t samples = 77;
	EXPECT_TRUE(ConvertTimecodeToSamples(samples, AsciiToUTF16(inText), inRate, inFrameRate, inNTSC, inDropFrame));
	return samples;
}

std::int64_t Read(std::string_view inText, unsigned inFormat, int inRate = 48'000, int inFrameRate = 30)
{
	BeatInfo beats;
	std::int64_t samples = 77;
	const auto format = static_cast<TimecodeFormat>(inFormat);
	EXPECT_TRUE(ConvertTimecodeToSamples(samples, AsciiToUTF16(inText), format, inRate, inFrameRate, &beats, false));
	return samples;
}

std::string Write(std::int64_t inSamples, unsigned inFormat, int inRate = 48'000, int inFrameRate = 30)
{
	const BeatInfo beats;
	UTF16String text = AsciiToUTF16("before");
	const auto format = static_cast<TimecodeFormat>(inFormat);
	EXPECT_TRUE(ConvertSamplesToTimecode(text, inSamples, inRate, format, inFrameRate, &beats, false));
	return UTF16to8(text);
}

// The flags of the timecode formatter by letter: d(rop frame), n(TSC), c(ount), o(mit frames), s(uppress), f(raction),
// m(inutes).
bool WriteFlags(UTF16String& outText, std::int64_t inSamples, int inRate, int inFrameRate, std::string_view inFlags)
{
	const auto has = [&](char inFlag) { return inFlags.find(inFlag) != std::string_view::npos; };
	return ConvertSamplesToTimecode(
		outText, inSamples, inRate, inFrameRate, has('d'), has('n'), has('c'), has('o'), has('s'), has('f'), has('m'));
}

std::string WriteFlags(std::int64_t inSamples, int inRate, int inFrameRate, std::string_view inFlags)
{
	UTF16String text;
	EXPECT_TRUE(WriteFlags(text, inSamples, inRate, inFrameRate, inFlags));
	return UTF16to8(text);
}

// ---- Text to samples -------------------------------------------------------------------------------------------------

TEST(TimecodeText, IsRead)
{
	struct Case
	{
		const char* mText;
		int mFrameRate;
		const char* mFlags;
		std::int64_t mSamples;
		int mRate = 48'000;
	};
	for (const auto& [text, frameRate, flags, expected, rate] : std::initializer_list<Case>{
			 {"00:00:01:00", 30, "", 48'000},
			 {"00:00:01:00", 30, "n", 48'048},
			 {"00:01:00;00", 30, "nd", 2'882'880},   // labels 00 and 01 of a short minute are those of 02
			 {"00:01:00;01", 30, "nd", 2'882'880},
			 {"00:01:00;02", 30, "nd", 2'882'880},
			 {"00:01:00;03", 30, "nd", 2'884'482},
			 {"00:01:00;03", 60, "nd", 2'882'880},   // frame 3600
			 {"00:01:00;05", 60, "nd", 2'883'681},
			 {"00:10:00;00", 30, "nd", 28'799'972},   // frame 17982
			 {"01:00:00;00", 30, "nd", 172'799'828},
			 {"00:01:00;00", 30, "d", 2'880'000},   // drop-frame labels do not imply the scaled rate
			 {"00:00:00:10.50", 30, "", 16'800},
			 {"00:00:00:10.5", 30, "", 16'800},
			 {"00:00:00:10.5 ", 30, "", 16'080},   // what follows the fraction counts as its digits
			 {"00:00:00:01", 30, "n", 1'472, 44'100},
			 {"1:2:3:4:5", 30, "", 7'384 * 48'000 + 8'000},
			 {"1:2:3:4:5:6", 30, "", 7'384 * 48'000 + 8'000},
			 {"1:2:3:4:5.9", 30, "", 7'384 * 48'000 + 8'000},
			 {"3:04", 30, "", 150'400},
			 {"-3:04", 30, "", 150'400},
			 {"10", 30, "", 16'000},
			 {"1:2:3:4.", 30, "", 62 * 48'000 + 3 * 1'600 + 64},   // 0:01:02:03 and 4/100
			 {".5", 30, "", 800},
			 {"12.", 30, "", 20},   // 12/1000
			 {"1:2:3:4:.25", 30, "", 3'723 * 48'000 + 4 * 1'600 + 400},
			 {"1.5:7", 30, "", 1'600 + 8},   // 5/1000: the digit, ":" and "7"
			 {"00:00:00:01.123456789", 30, "", 1'798},
			 {"00:00:00:01.1234567890", 30, "", 681},   // ten characters: a divisor of -2^31
			 {"2147483648:00", 30, "", 0},
			 {"2147483647", 1, "", 2'147'483'647, 1},
			 {"", 30, "", -1},
			 {"abc.", 30, "", 0},
			 {"00:00:01:00", 0, "", 0},
		 })
	{
		const std::string_view set = flags;
		EXPECT_EQ(ReadTimecode(text, rate, frameRate, set.starts_with('n'), set.ends_with('d')), expected)
			<< text << " at " << frameRate << flags;
	}
}

TEST(FormattedText, IsRead)
{
	struct Case
	{
		const char* mText;
		unsigned mFormat;
		std::int64_t mSamples;
	};
	for (const auto& [text, format, expected] : std::initializer_list<Case>{
			 {"00:01:30.5", 0, 4'344'000}, {"90.5", 0, 4'344'000}, {"1:30", 0, 90 * 48'000},
			 {"1:00:00", 0, 3'600 * 48'000}, {"1:00:00:00", 0, 0},   // four fields lose the first one
			 {"1:2:03.25", 0, 3'723 * 48'000 + 12'000}, {"0.00001", 0, 0}, {"0.0000105", 0, 1},
			 {"4005888", 1, 4'005'888}, {" -12 frames", 1, -12},
			 {"9223372036854775807", 1, std::numeric_limits<std::int64_t>::max()}, {"9223372036854775808", 1, 0},
			 {"1000.5", 11, 48'024}, {"2:00", 11, 5'760},   // 120 ms
			 {"4", 5, 96'000}, {"4.25", 5, 102'000}, {"3", 6, 192'000}, {"10", 8, 16'000}, {"1:00", 10, 48'000},
			 {"1:00", 3, 48'048}, {"1:00", 4, 48'048}, {"1:00;00", 9, 2'882'880}, {"1:00", 7, 0}, {"1:00", 15, 0},
			 {"1:00", 0xFFFFFFFF, 0}, {"", 1, -1}, {"", 7, -1}, {"", 5, -1}, {"", 99, -1}, {"abc", 2, 0},
			 {"abc", 6, -95'999},   // bar 0, rounded upward
		 })
		EXPECT_EQ(Read(text, format), expected) << text << " in " << format;
	for (const char* const text : {"1:02:03:04.5", "0:10:00:00", "0:01:00:00"})
	{
		EXPECT_EQ(Read(text, 12), Read(text, 3));
		EXPECT_EQ(Read(text, 13), Read(text, 4));
		EXPECT_EQ(Read(text, 14), Read(text, 3));
	}
}

// The rules of reading field by field and in 128 bits, brought back to the widths that they are stated in.
std::int64_t OracleRead(
	const UTF16String& inText, std::int32_t inRate, std::int32_t inFrameRate, bool inNTSC, bool inDropFrame)
{
	__extension__ typedef __int128 Wide;   // NOLINT(modernize-use-using): the extension needs it
	const auto narrow = [](Wide inValue) { return static_cast<std::int32_t>(static_cast<std::uint32_t>(inValue)); };
	const auto isDigit = [&](std::size_t inIndex) { return inText[inIndex] >= '0' && inText[inIndex] <= '9'; };
	std::vector<int> fields;
	int divisor = 1;
	std::size_t begin = 0;
	bool hasPoint = false;
	for (std::size_t i = 0; i < inText.size() && fields.size() < 5; ++i)
	{
		if (!isDigit(i) || (i > 0 && isDigit(i - 1)))
		{
			hasPoint = hasPoint || inText[i] == '.';
			continue;
		}
		begin = i;
		int value = 0;
		zoncore::utility::StringToNumber(inText.substr(i), value, 6);
		fields.push_back(value);
		if (hasPoint)
			break;
	}
	int subframes = 0;
	if (hasPoint && !fields.empty())
	{
		subframes = fields.back();
		fields.pop_back();
		divisor = zoncore::utility::TruncateTo<std::int32_t>(
			std::pow(10.0, static_cast<double>(inText.size() - begin)) + 0.5);
	}
	if (fields.size() == 5)
		fields.erase(fields.begin());
	fields.insert(fields.begin(), 4 - fields.size(), 0);

	const Wide h = fields[0];
	const Wide m = fields[1];
	const Wide s = fields[2];
	Wide f = fields[3];
	const Wide fps = inFrameRate;
	Wide total = h * fps * 3'600 + m * fps * 60 + s * fps + f;
	if (inDropFrame)
	{
		const Wide perHour = narrow(fps * 3'600 - narrow(fps * 108) / 30);
		const Wide dropped = fps / 15;
		if (m % 10 != 0 && s == 0 && f < dropped)
			f = dropped;
		total = h * perHour + (m / 10) * (perHour / 6) + (m % 10) * fps * 60 - dropped * (m % 10) + s * fps + f;
	}
	const Wide frames = narrow(total);
	const Wide rate = inNTSC ? narrow(fps * 1'000) : inFrameRate;
	const Wide factor = inNTSC ? 1'001 : 1;
	const Wide denominator = rate * divisor;
	if (denominator == 0)
		return 0;
	const double estimate = static_cast<double>(static_cast<std::int64_t>(denominator - 1))
		+ inRate * (static_cast<double>(factor) * (subframes + static_cast<double>(frames) * divisor));
	if (estimate > 8070450532247928832.0)
		return zoncore::utility::TruncateTo<std::int64_t>(
			estimate / (static_cast<double>(rate) * static_cast<double>(divisor)));
	const Wide numerator = factor * inRate * (subframes + divisor * frames) + denominator - 1;
	return static_cast<std::int64_t>(static_cast<std::int64_t>(numerator) / denominator);
}

TEST(AnyText, IsReadAsTheRulesSay)
{
	std::mt19937 random(5);
	const std::string_view characters = "0123456789012345678901234567890123456789::::;;.. -+,xe\t";
	const std::initializer_list<std::int32_t> numbers
		= {0, 1, -1, 2, 10, 15, 24, 25, 29, 30, 60, 120, 1'001, 44'100, 48'000, 192'000, 1'000'000'007, -30, -48'000,
			std::numeric_limits<std::int32_t>::max(), std::numeric_limits<std::int32_t>::min()};
	const auto anyNumber = [&] { return numbers.begin()[random() % numbers.size()]; };
	BeatInfo beats;
	for (int i = 0; i < 200'000; ++i)
	{
		UTF16String text;
		for (auto length = random() % 24; length > 0; --length)
			text.push_back(static_cast<unsigned char>(characters[random() % characters.size()]));
		const std::int32_t rate = anyNumber();
		const std::int32_t frameRate = anyNumber();
		const bool isNTSC = random() % 2 == 0;
		const bool isDropFrame = random() % 2 == 0;
		std::int64_t samples = 0;
		ASSERT_TRUE(ConvertTimecodeToSamples(samples, text, rate, frameRate, isNTSC, isDropFrame));
		ASSERT_EQ(samples, text.empty() ? -1 : OracleRead(text, rate, frameRate, isNTSC, isDropFrame))
			<< UTF16to8(text) << " at " << rate << " " << frameRate << isNTSC << isDropFrame;
		const auto format = static_cast<TimecodeFormat>(random() % 17);
		ASSERT_TRUE(ConvertTimecodeToSamples(samples, UTF16StringView(text), format, rate, frameRate, &beats, false));
	}
}

// ---- Samples to text -------------------------------------------------------------------------------------------------

TEST(Samples, AreWrittenInEveryFormat)
{
	struct Case
	{
		std::int64_t mSamples;
		unsigned mFormat;
		const char* mText;
		int mRate = 48'000;
		int mFrameRate = 30;
	};
	constexpr auto kLowest = std::numeric_limits<std::int64_t>::min();
	for (const auto& [samples, format, expected, rate, frameRate] : std::initializer_list<Case>{
			 {4'005'888, 0, "   1:23.456"},
			 {-4'005'888, 0, "  -1:23.456"},
			 {178'728'000, 0, "1:02:03.500"},
			 {-178'728'000, 0, "-1:02:03.500"},
			 {1'728'024'000, 0, "10:00:00.50"},
			 {0, 0, "   0:00.000"},
			 {0, 0, "   0:00.001", 500},
			 {0, 0, "   0:00.500", 1},
			 {5, 0, "0", 0},
			 {5, 0, "0", -48'000},
			 {-12, 1, "-12"},
			 {kLowest, 1, "-9223372036854775808"},
			 {175'729'600, 2, "01:01:01:01"},
			 {-2'928'000, 2, "-00:01:01:00"},
			 {-1, 2, "-00:00:00:00"},
			 {48'000 * 360'000LL, 2, "100:00:00:00"},
			 {48'048, 3, "00:00:01:00"},
			 {48'047, 3, "00:00:00:29"},
			 {2'882'880, 4, "00;01;00;02"},
			 {2'882'879, 4, "00;00;59;29"},
			 {-2'882'880, 4, "-00;01;00;02"},
			 {28'799'972, 4, "00;10;00;00"},
			 {2'882'880, 4, "00;01;00;04", 48'000, 60},
			 {96'000, 5, "4.000"},
			 {132'000, 6, "2:2.480"},
			 {48'000, 7, "before"},
			 {-48'000, 8, "30"},
			 {-96'096, 9, "60"},
			 {240'800, 10, "5:00.50"},
			 {3'120'000, 10, "1:05:00.00"},
			 {0, 10, "0.00"},
			 {-1'600, 10, "-1.00"},
			 {59'256, 11, "1234.5"},
			 {96'000, 11, "2000"},
			 {0, 11, "0"},
			 {1, 11, "0", 44'100},
			 {3, 11, "0.1", 44'100},
			 {-3, 11, "0", 44'100},
			 {1'234'567, 11, "123457", 10'000},   // 123456.7 ms
			 {1'234'567, 11, "1.23457e+06", 1'000},
			 {5, 11, "0", 0},
			 {48'048, 12, "00:00:01:00"},
			 {2'882'880, 13, "00;01;00;02"},
			 {48'048, 14, "00:00:01:00"},
			 {48'000, 15, "before"},
			 {48'000, 0xFFFFFFFF, "before"},
			 {48'000, 2, "0", 0},
			 {48'000, 2, "0", -1},
			 {48'000, 2, "0", 48'000, 0},
			 {48'000, 8, "0", 48'000, -30},
			 {48'000, 4, "0", 48'000, 29},
			 {48'000, 2, "0", 48'000, 1 << 30},   // 60 frame rates are 0 in 32 bits
			 {48'000, 4, "0", 48'000, 1 << 28},
		 })
		EXPECT_EQ(Write(samples, format, rate, frameRate), expected) << samples << " in " << format;
}

TEST(TimecodeFormatter, FollowsItsFlags)
{
	struct Case
	{
		std::int64_t mSamples;
		const char* mFlags;
		const char* mText;
		int mFrameRate = 30;
	};
	for (const auto& [samples, flags, expected, frameRate] : std::initializer_list<Case>{
			 {178'800'000, "m", "62:05:00"},
			 {178'800'000, "o", "01:02:05"},
			 {178'800'000, "mo", "62:05"},
			 {178'800'000, "s", "01:02:05:00"},
			 {0, "s", "0"},
			 {0, "so", "00"},
			 {0, "sf", "0.00"},
			 {0, "m", "00:00:00"},
			 {0, "ms", "0"},
			 {-48'000, "s", "-1:00"},
			 {59 * 48'000 + 4'800, "s", "59:03"},
			 {60 * 48'000, "s", "1:00:00"},
			 {3'600 * 48'000, "sm", "60:00:00"},
			 {-1'599, "s", "-0"},
			 {2'882'880, "dosfm", "00;01;00;02"},
			 {2'882'880, "dc", "1800"},
			 {48'048, "nf", "00:00:01:00.00"},
			 {48'000, "", "00:00:01:0", 8},
			 {48'000, "", "00:00:01:0", 10},
			 {48'000, "", "00:00:01:00", 11},
			 {48'000, "", "00:00:01:00", 100},
			 {48'000, "", "00:00:01:000", 120},
			 {48'000, "", "00:00:01:000", 1'000},
			 {48'000, "", "00:00:01:0000", 1'001},
			 {24'000, "", "00:00:00:10000", 20'000},
		 })
		EXPECT_EQ(WriteFlags(samples, 48'000, frameRate, flags), expected) << samples << flags;
}

TEST(DecimalTimecode, LeavesItsFractionOut)
{
	UTF16String text;
	ConvertSamplesToDecimalTimecode(text, -4'005'888, 48'000, true);
	EXPECT_EQ(UTF16to8(text), "  -1:23");
	ConvertSamplesToDecimalTimecode(text, 1'728'024'000, 48'000, true);
	EXPECT_EQ(UTF16to8(text), "10:00:00");
}

// The texts by their rules and through a stream. inRate and inFrameRate are such that nothing divides by zero.
UTF16String OracleTimecode(std::int64_t inSamples, int inRate, int inFrameRate, std::string_view inFlags)
{
	const auto has = [&](char inFlag) { return inFlags.find(inFlag) != std::string_view::npos; };
	const bool isScaled = has('d') || has('n');
	const std::uint64_t magnitude
		= inSamples < 0 ? 0 - static_cast<std::uint64_t>(inSamples) : static_cast<std::uint64_t>(inSamples);
	const auto fps = static_cast<std::uint32_t>(inFrameRate);
	const std::uint64_t numerator = magnitude * (isScaled ? std::uint64_t{fps} * 1'000 : fps);
	const std::uint64_t denominator = static_cast<std::uint64_t>(inRate) * (isScaled ? 1'001 : 1);
	const std::uint64_t frames = numerator / denominator;
	UTF16String sign = AsciiToUTF16(inSamples < 0 ? "-" : "");
	oUTF16StringStream stream;
	stream.fill('0');
	const auto number = [&](std::uint64_t inValue, int inWidth)
	{
		stream << sign;
		sign.clear();
		stream.width(inWidth);
		stream << inValue;
	};
	if (has('c') && has('d'))
	{
		const double m = inFrameRate / 30.0;
		double a = inFrameRate * 600.0 / 1.001;
		a = a / (17982.0 * m);
		a = a * static_cast<double>(magnitude);
		a = a / inRate;
		a = a * 29.97;
		a = a * m;
		stream << zoncore::utility::TruncateTo<std::int32_t>(a);
		return stream.str();
	}
	if (has('c'))
	{
		stream << static_cast<std::int32_t>(frames);
		return stream.str();
	}
	if (has('d'))
	{
		// Every ten minutes skip 9 * d labels, every minute behind the first of them d.
		const std::uint64_t multiple = fps / 30;
		const std::uint64_t tens = frames / (17'982 * multiple);
		const std::uint64_t rest = frames % (17'982 * multiple);
		const std::uint64_t skipped = rest < 1'800 * multiple ? 0 : (rest - 1'800 * multiple) / (1'798 * multiple) + 1;
		const std::uint64_t label = frames + 2 * multiple * (9 * tens + skipped);
		const std::uint64_t nominal = 30 * multiple;
		number(static_cast<std::uint32_t>(label / nominal / 3'600), 2);
		for (const std::uint64_t field : {label / nominal / 60 % 60, label / nominal % 60, label % nominal})
		{
			stream.put(';');
			number(field, 2);
		}
		return stream.str();
	}
	std::uint64_t hours = frames / (fps * 3'600);
	std::uint64_t minutes = frames % (fps * 3'600) / (fps * 60);
	const std::uint64_t rest = frames % (fps * 3'600) % (fps * 60);
	const bool isSuppressing = has('s');
	if (has('m'))
		minutes += std::exchange(hours, 0) * 60;
	else if (!isSuppressing || hours != 0)
	{
		number(hours, 2);
		stream.put(':');
	}
	if (hours != 0 || !isSuppressing || minutes != 0)
	{
		number(minutes, hours != 0 || !isSuppressing ? 2 : 0);
		stream.put(':');
	}
	if (has('o'))
	{
		number(rest / fps, 2);
		return stream.str();
	}
	const bool isPadded = hours != 0 || minutes != 0 || !isSuppressing;
	if (isPadded || rest / fps != 0)
	{
		number(rest / fps, isPadded ? 2 : 0);
		stream.put(':');
	}
	number(rest % fps, isPadded || rest / fps != 0 ? (fps <= 10 ? 1 : fps <= 100 ? 2 : fps <= 1'000 ? 3 : 4) : 0);
	if (has('f'))
	{
		stream.put('.');
		number(numerator * 100 / denominator % 100, 2);
	}
	return stream.str();
}

UTF16String OracleDecimal(std::int64_t inSamples, int inRate)
{
	const auto rate = static_cast<std::uint64_t>(inRate);
	const std::uint64_t magnitude
		= inSamples < 0 ? 0 - static_cast<std::uint64_t>(inSamples) : static_cast<std::uint64_t>(inSamples);
	const std::uint64_t seconds = magnitude / rate;
	const std::uint64_t rest = magnitude - seconds * rate;
	oUTF16StringStream stream;
	const auto padded = [&](auto inValue, int inWidth)
	{
		stream.fill('0');
		stream.width(inWidth);
		stream << inValue;
	};
	stream.width(seconds < 3'600 ? 3 : 0);
	stream << AsciiToUTF16(inSamples < 0 ? "-" : "");
	if (seconds < 3'600)
		stream << seconds / 60;
	else
	{
		stream << seconds / 3'600 << AsciiToUTF16(":");
		padded(seconds / 60 % 60, 2);
	}
	stream.put(':');
	padded(seconds % 60, 2);
	stream.put('.');
	if (seconds < 36'000)
		padded(static_cast<std::int64_t>((static_cast<double>(rest) + 0.5) * 1'000.0 / inRate), 3);
	else
		padded(rest * 100 / rate, 2);
	return stream.str();
}

UTF16String OracleMilliseconds(std::int64_t inSamples, int inRate)
{
	double tenths = static_cast<double>(inSamples) * 10000.0 / inRate + 0.5;
	tenths = tenths - std::fmod(tenths, 1.0);
	oUTF16StringStream stream;
	stream << tenths / 10.0;
	return stream.str();
}

TEST(AnyPosition, IsWrittenAsAStreamWouldWriteIt)
{
	std::mt19937_64 random(7);
	const std::initializer_list<int> rates
		= {1, 3, 499, 8'000, 44'100, 48'000, 192'000, std::numeric_limits<int>::max()};
	const std::initializer_list<int> frameRates = {1, 7, 10, 11, 24, 25, 29, 30, 45, 50, 60, 120, 1'000, 1'001, 20'000,
		1'000'000'007, std::numeric_limits<int>::max()};
	const std::string_view flags = "dncosfm";
	UTF16String text;
	for (int i = 0; i < 200'000; ++i)
	{
		const auto samples = static_cast<std::int64_t>(random()) >> random() % 64;
		const int rate = rates.begin()[random() % rates.size()];
		const int frameRate = frameRates.begin()[random() % frameRates.size()];
		std::string set;
		for (const char flag : flags)
		{
			if (random() % 3 == 0 && !(flag == 'n' && set == "d") && !(flag == 'd' && frameRate < 30))
				set += flag;
		}
		ASSERT_TRUE(WriteFlags(text, samples, rate, frameRate, set));
		ASSERT_EQ(UTF16to8(text), UTF16to8(OracleTimecode(samples, rate, frameRate, set)))
			<< samples << " at " << rate << ", " << frameRate << set;
		ConvertSamplesToDecimalTimecode(text, samples, rate, false);
		ASSERT_EQ(UTF16to8(text), UTF16to8(OracleDecimal(samples, rate))) << samples << " at " << rate;
		ASSERT_EQ(Write(samples, 11, rate), UTF16to8(OracleMilliseconds(samples, rate))) << samples << " at " << rate;
		ASSERT_EQ(Write(samples, 1), std::to_string(samples));
	}
}

struct Labels
{
	std::uint32_t mHours;
	std::uint32_t mMinutes;
	std::uint32_t mSeconds;
	std::uint32_t mFrames;

	bool operator==(const Labels&) const = default;
};

std::int64_t Split(std::int64_t inFrame, std::int32_t inFrameRate, Labels& ioLabels)
{
	return DropFrameToHMSF(
		inFrame, inFrameRate, ioLabels.mHours, ioLabels.mMinutes, ioLabels.mSeconds, ioLabels.mFrames);
}

TEST(DropFrameToHMSF, GivesEveryLabelOfTwoHours)
{
	for (const std::uint32_t rate : {30u, 60u, 120u})
	{
		std::uint32_t label = 0;
		for (std::int64_t frame = 0; frame < 2 * 3'600 * rate; ++frame, ++label)
		{
			if (label % (60 * rate) == 0 && label / (60 * rate) % 10 != 0)
				label += rate / 15;
			Labels fields{};
			const std::int64_t result = Split(-frame, static_cast<std::int32_t>(rate), fields);
			const auto& [hours, minutes, seconds, frames] = fields;
			ASSERT_EQ(((hours * 60 + minutes) * 60 + seconds) * rate + frames, label) << frame << " at " << rate;
			ASSERT_TRUE(minutes < 60 && seconds < 60 && frames < rate && result == seconds) << frame << " at " << rate;
		}
	}
}

TEST(DropFrameToHMSF, WritesOnlyWhatItReaches)
{
	struct Case
	{
		std::int64_t mFrame;
		int mFrameRate;
		std::int64_t mResult;
		Labels mLabels;
	};
	constexpr auto kLowest = std::numeric_limits<std::int64_t>::min();
	for (const auto& [frame, rate, expected, labels] : std::initializer_list<Case>{
			 {29, 30, 0, {7, 7, 7, 29}},
			 {-31, 30, 1, {7, 7, 1, 1}},
			 {1'800, 30, 0, {7, 8, 7, 2}},   // the minute is added to the caller's
			 {17'982, 30, 0, {7, 10, 7, 0}},
			 {107'892, 30, 0, {1, 7, 7, 0}},
			 {kLowest, 30, 16, {50'954'270, 22, 16, 0}},
			 {1'000, 29, 0, {7, 7, 7, 7}},
			 {1'000, -60, 0, {7, 7, 7, 7}},
		 })
	{
		Labels written{7, 7, 7, 7};
		EXPECT_EQ(Split(frame, rate, written), expected) << frame;
		EXPECT_EQ(written, labels) << frame;
	}
}

// ---- Both ways -------------------------------------------------------------------------------------------------------

// The first sample of a frame.
std::int64_t FrameStart(std::int64_t inFrame, int inRate, int inFrameRate, bool inNTSC)
{
	const std::int64_t numerator = inFrame * inRate * (inNTSC ? 1'001 : 1);
	const std::int64_t denominator = inFrameRate * (inNTSC ? 1'000LL : 1);
	return (numerator + denominator - 1) / denominator;
}

void WalkFrames(unsigned inFormat, int inFrameRate, bool inNTSC, int inHours, int inStep)
{
	UTF16String text;
	for (const int rate : kSampleRates)
	{
		for (std::int64_t frame = 0; frame < inHours * 3'600 * inFrameRate; frame += inStep)
		{
			const std::int64_t start = FrameStart(frame, rate, inFrameRate, inNTSC);
			const auto format = static_cast<TimecodeFormat>(inFormat);
			std::int64_t samples = 0;
			ConvertSamplesToTimecode(text, start, rate, format, inFrameRate, nullptr, false);
			ConvertTimecodeToSamples(samples, text, format, rate, inFrameRate, nullptr, false);
			ASSERT_EQ(samples, start) << UTF16to8(text) << " in " << inFormat << " at " << rate << ", " << inFrameRate;
		}
	}
}

TEST(FramePositions, SurviveText)
{
	constexpr int kStep = 61;   // meets every label of every rate
	for (const int frameRate : {24, 25, 30, 50, 60})
	{
		for (const unsigned format : {2u, 8u, 10u})
			WalkFrames(format, frameRate, false, 5, kStep);
		for (const unsigned format : {3u, 12u, 14u})
			WalkFrames(format, frameRate, true, 5, kStep);
	}
	for (const int frameRate : {30, 60})
	{
		for (const unsigned format : {4u, 13u})
			WalkFrames(format, frameRate, true, 25, kStep);
		WalkFrames(4, frameRate, true, 1, 1);
	}
}

// The formula of drop-frame counts goes through doubles that fall just below a whole number on some frames.
TEST(DropFrameCounts, AreOneShortOnSomeFrames)
{
	std::vector<std::int64_t> shortFrames;
	for (std::int64_t frame = 0; frame < 107'892; ++frame)
	{
		const std::int64_t start = FrameStart(frame, 48'000, 30, true);
		const std::int64_t count = std::stoll(Write(start, 9));
		ASSERT_TRUE(count == frame || count == frame - 1) << frame;
		ASSERT_EQ(ReadTimecode(Write(start, 4), 48'000, 30, true, true), start) << "the label is right";
		if (count != frame)
			shortFrames.push_back(frame);
	}
	ASSERT_EQ(shortFrames.size(), 5'480u);   // of the first hour
	shortFrames.resize(8);
	EXPECT_EQ(shortFrames, (std::vector<std::int64_t>{5, 10, 20, 25, 35, 40, 45, 50}));
}

// ---- Misuse ----------------------------------------------------------------------------------------------------------

struct Report
{
	std::string mCondition, mMessage, mFile, mFunction;
	int mLine;
};

TEST(Misuse, IsReportedOncePerPlaceAndChangesNothing)
{
	std::vector<Report> reports;
	bool switchesOff = false;
	const auto before = zoncore::debug::SetAssertDialog(
		[&](std::atomic<bool>& ioDisabled, const char* inCondition, const char* inMessage, const char* inFile,
			int inLine, const char* inFunction)
		{
			reports.push_back({inCondition, inMessage, inFile, inFunction, inLine});
			ioDisabled = switchesOff;
			return true;   // without a debugger nothing stops
		});

	UTF16String text = AsciiToUTF16("1:1.5");
	std::int64_t samples = 77;
	BeatInfo noBeats;
	noBeats.iBeatsPerBar = 0;
	const auto read = [&](TimecodeFormat inFormat)
	{ return ConvertTimecodeToSamples(samples, text, inFormat, 48'000, 30, nullptr, false); };
	const auto write = [&](TimecodeFormat inFormat)
	{ return ConvertSamplesToTimecode(text, 48'000, 48'000, inFormat, 30, nullptr, false); };
	const std::vector<std::function<bool()>> misuses = {
		[&] { return read(kTimecodeFormat_Beats); },
		[&] { return read(kTimecodeFormat_BarsAndBeats); },
		[&] { return write(kTimecodeFormat_Beats); },
		[&] { return write(kTimecodeFormat_BarsAndBeats); },
		[&] { return WriteFlags(text, 48'000, 48'000, 30, "dn"); },
		[&] { return ConvertSamplesToBarsAndBeats(text, 48'000, 48'000, noBeats, false, 2); },
	};
	for (const bool isLast : {false, true})
	{
		switchesOff = isLast;
		for (const auto& misuse : misuses)
			EXPECT_FALSE(misuse());
	}
	EXPECT_EQ(reports.size(), 2 * misuses.size());
	for (const auto& misuse : misuses)
		EXPECT_FALSE(misuse());
	EXPECT_EQ(reports.size(), 2 * misuses.size()) << "a place that was switched off reported";
	EXPECT_EQ(UTF16to8(text), "1:1.5");
	EXPECT_EQ(samples, 77);
	zoncore::debug::SetAssertDialog(before);

	const std::string reading
		= "bool zonmediatypes::utility::ConvertTimecodeToSamples(std::int64_t &, const zoncore::UTF16String &, "
		  "TimecodeFormat, std::int32_t, std::int32_t, BeatInfo *, bool)";
	const std::string writing
		= "bool zonmediatypes::utility::ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, "
		  "TimecodeFormat, std::int32_t, const BeatInfo *, bool)";
	const Report expected[] = {
		{"inBeatInfo", "programmer error!\n", "", reading, 0},
		{"inBeatInfo", "programmer error!\n", "", reading, 0},
		{"inBeatInfo", "programmer error!\n", "", writing, 0},
		{"inBeatInfo", "programmer error!\n", "", writing, 0},
		{"false", "ConvertSamplesToTimecode programmer error!", "",
			"bool zonmediatypes::utility::ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, "
			"std::int32_t, bool, bool, bool, bool, bool, bool, bool)",
			0},
		{"inBeatInfo.iBeatsPerBar != 0", "programmer error!", "",
			"bool zonmediatypes::utility::ConvertSamplesToBarsAndBeats(zoncore::UTF16String &, double, double, "
			"const BeatInfo &, bool, int)",
			980},
	};
	for (std::size_t i = 0; i < std::size(expected); ++i)
	{
		EXPECT_EQ(reports[i].mCondition, expected[i].mCondition);
		EXPECT_EQ(reports[i].mMessage, expected[i].mMessage);
		EXPECT_EQ(reports[i].mFunction, expected[i].mFunction);
		EXPECT_EQ(reports[i].mFile, "zonmediatypes/src/TimeConversionUtils.cpp");
		EXPECT_TRUE(expected[i].mLine == 0 ? reports[i].mLine > 0 : reports[i].mLine == expected[i].mLine);
	}
}

// ---- Memory ----------------------------------------------------------------------------------------------------------

TEST(Conversions, AllocateNothingButTheirText)
{
	BeatInfo beats;
	UTF16String text;
	text.reserve(100);
	const UTF16String longText = AsciiToUTF16("1:2." + std::string(100'000, '7') + ":3");
	std::int64_t samples = 0;
	const auto convert = [&](TimecodeFormat inFormat)
	{
		ConvertSamplesToTimecode(text, 123'456'789, 48'000, inFormat, 30, &beats, false);
		ConvertTimecodeToSamples(samples, longText, inFormat, 48'000, 30, &beats, false);
	};
	for (const std::int32_t ticks : {-1, 960})
	{
		beats.iTicksPerBeat = ticks;
		for (unsigned format = 0; format <= 15; ++format)
			EXPECT_EQ(zontest::CountAllocations([&] { convert(static_cast<TimecodeFormat>(format)); }), 0u) << format;
	}
}

TEST(Conversions, LeaveTheTextAloneWhenMemoryRunsOut)
{
	const UTF16String before = AsciiToUTF16("before");
	UTF16String text = before;
	zontest::FailEachAllocation([&]
		{ ConvertSamplesToTimecode(text, 123'456'789, 48'000, kTimecodeFormat_Timecode, 30, nullptr, false); },
		[&] { EXPECT_EQ(text, before); });
	EXPECT_EQ(UTF16to8(text), "00:42:52:00");
}

}   // namespace
}   // namespace zonmediatypes::utility
