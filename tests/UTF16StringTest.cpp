#include "zoncore/UTF16String.h"

#include "tests/HostileLocale.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <iomanip>
#include <limits>
#include <optional>
#include <sstream>
#include <tuple>
#include <utility>

namespace zoncore
{
namespace
{

using utility::AsciiToUTF16;
using utility::UTF16to8;

// Every case runs with the classic global locale and with one that groups digits and writes a decimal comma.
class UTF16Stream : public testing::TestWithParam<bool>
{
	std::optional<zontest::HostileLocale> mHostile;

	void SetUp() override
	{
		if (GetParam())
			mHostile.emplace();
	}
};
INSTANTIATE_TEST_SUITE_P(, UTF16Stream, testing::Bool(),
	[](const auto& inInfo) { return inInfo.param ? "HostileLocale" : "ClassicLocale"; });

template <class Stream>
auto Fill(const Stream&, char inChar)
{
	return std::setfill(static_cast<typename Stream::char_type>(inChar));
}

// What the streams of both widths are told to write: the narrow one with the classic locale is the reference.
const auto kWriters = std::make_tuple([](auto& ioStream)
	{ ioStream << 0 << " " << -1 << " " << 1'234'567 << " " << 18'446'744'073'709'551'615u; },
	[](auto& ioStream) { ioStream << std::numeric_limits<long long>::min() << std::numeric_limits<int>::max(); },
	[](auto& ioStream)
	{ ioStream << 0.0 << " " << -0.0 << " " << 29.97 << " " << 1e6 << " " << 1234567.0 << " " << 1e-5; },
	[](auto& ioStream) { ioStream << std::fixed << std::setprecision(3) << 1234567.8905 << " " << 1e300; },
	[](auto& ioStream)
	{ ioStream << std::setprecision(17) << 0.1 << std::scientific << -1e-300 << std::hexfloat << 0.1; },
	[](auto& ioStream)
	{ ioStream << std::numeric_limits<double>::infinity() << std::numeric_limits<float>::quiet_NaN(); },
	[](auto& ioStream)
	{
		ioStream << std::setw(6) << 42 << std::setw(6) << -4.5 << std::setw(3) << "abcd"
				 << "x";
	},
	[](auto& ioStream)
	{ ioStream << Fill(ioStream, '0') << std::setw(4) << -3 << std::internal << std::setw(4) << -3; },
	[](auto& ioStream)
	{ ioStream << std::left << Fill(ioStream, '*') << std::setw(6) << "ab" << std::setw(4) << 1 << "|"; },
	[](auto& ioStream) { ioStream << std::hex << std::showbase << std::uppercase << 48'879 << std::oct << 8; },
	[](auto& ioStream) { ioStream << std::showpos << 1 << std::showpoint << 2.0 << std::boolalpha << true << false; },
	[](auto& ioStream) { ioStream << "line" << std::endl
								  << std::setw(3) << "c" << std::ends; });

TEST_P(UTF16Stream, WritesWhatNarrowStreamsWrite)
{
	const auto compare = [](const auto& inWriter)
	{
		std::ostringstream narrow;
		narrow.imbue(std::locale::classic());
		inWriter(narrow);
		oUTF16StringStream output;
		inWriter(output);
		UTF16StringStream both;
		inWriter(both);
		EXPECT_TRUE(output.good());
		EXPECT_EQ(UTF16to8(output.str()), narrow.str());
		EXPECT_EQ(UTF16to8(both.str()), narrow.str());
	};
	std::apply([&](const auto&... inWriters) { (compare(inWriters), ...); }, kWriters);
}

TEST_P(UTF16Stream, WritesTextOfEitherKindAndCodeUnitsAsNumbers)
{
	const UTF16String text = AsciiToUTF16("text");
	oUTF16StringStream stream;
	stream << std::setw(6) << text << text.c_str() << UTF16Char('A') << 'A';
	stream.put('A');
	EXPECT_EQ(UTF16to8(stream.str()), "  texttext6565A");
}

// All values that can be read from a text one after the other, as text, until reading fails; then what is left.
template <class Value, class Stream>
std::string ReadAll(Stream&& ioStream)
{
	std::ostringstream result;
	result.imbue(std::locale::classic());
	for (Value value{}; ioStream >> value;)
		result << value << ';';
	ioStream.clear();
	for (auto unit = ioStream.get(); ioStream; unit = ioStream.get())
		result << unit << ',';
	return result.str();
}

TEST_P(UTF16Stream, ReadsWhatNarrowStreamsRead)
{
	const auto compare = []<class Value>(Value, const char* inText)
	{
		std::istringstream narrow(inText);
		narrow.imbue(std::locale::classic());
		EXPECT_EQ(ReadAll<Value>(iUTF16StringStream(AsciiToUTF16(inText))), ReadAll<Value>(std::move(narrow)))
			<< inText;
	};
	for (const char* const text :
		{"12 -7\t+3\n2147483647 2147483648", "1.234 5", "1,234", "x", "", "  ", "0x1F 017", "9e1"})
	{
		compare(int{}, text);
		compare(0ll, text);
		compare(double{}, text);
	}
	compare(double{}, "1.5 -.5e2 1e999");
	compare(bool{}, "1 0 2");
}

TEST_P(UTF16Stream, ReadsTextAndLines)
{
	iUTF16StringStream words(AsciiToUTF16("  two words\nline"));
	UTF16String first, rest, line, none;
	words >> first >> std::ws;
	std::getline(words, rest);
	std::getline(words, line);
	EXPECT_EQ(UTF16to8(first) + "|" + UTF16to8(rest) + "|" + UTF16to8(line), "two|words|line");
	EXPECT_FALSE(std::getline(words, none));
	UTF16StringStream both;
	bool truth = false;
	both << "7 true";
	int number = 0;
	EXPECT_TRUE(both >> number >> std::boolalpha >> truth);
	EXPECT_TRUE(number == 7 && truth);
}

TEST_P(UTF16Stream, KeepsItsFacetsWhenMovedSwappedAndCopied)
{
	oUTF16StringStream first;
	first << 1.5;
	oUTF16StringStream second(std::move(first));
	second << " " << 1'000;
	oUTF16StringStream third;
	third << "third";
	third.swap(second);
	third << std::setw(4) << 2.5;
	second = oUTF16StringStream();
	second << 3.5;
	UTF16StringStream copied;
	copied.copyfmt(second);
	copied << std::setw(5) << 12'345 << std::endl;
	EXPECT_EQ(UTF16to8(third.str()) + "|" + UTF16to8(second.str()) + "|" + UTF16to8(copied.str()),
		"1.5 1000 2.5|3.5|12345\n");
}

TEST_P(UTF16Stream, TakesTheModesOfStandardStreams)
{
	oUTF16StringStream atEnd(AsciiToUTF16("12"), std::ios_base::out | std::ios_base::ate);
	atEnd << 3;
	oUTF16StringStream overwritten(AsciiToUTF16("12"));
	overwritten << 3;
	EXPECT_EQ(UTF16to8(atEnd.str()) + " " + UTF16to8(overwritten.str()), "123 32");
}

TEST(UTF16Facets, AgreeWithTheClassicOnesOnAsciiAndLeaveTheRestAlone)
{
	const auto& wide = std::use_facet<std::ctype<UTF16Char>>(ClassicUTF16Locale());
	const auto& narrow = std::use_facet<std::ctype<char>>(std::locale::classic());
	for (unsigned unit = 0; unit <= 0xFFFF; ++unit)
	{
		const auto wideChar = static_cast<UTF16Char>(unit);
		const bool isAscii = unit < 0x80;
		const char narrowChar = isAscii ? static_cast<char>(unit) : 'x';
		std::ctype_base::mask wideMask{};
		wide.is(&wideChar, &wideChar + 1, &wideMask);
		ASSERT_EQ(wideMask, isAscii ? narrow.table()[unit] : std::ctype_base::mask{}) << unit;
		ASSERT_EQ(wide.is(std::ctype_base::alpha, wideChar), isAscii && narrow.is(std::ctype_base::alpha, narrowChar));
		ASSERT_EQ(wide.toupper(wideChar), isAscii ? narrow.toupper(narrowChar) : wideChar);
		ASSERT_EQ(wide.tolower(wideChar), isAscii ? narrow.tolower(narrowChar) : wideChar);
		ASSERT_EQ(wide.narrow(wideChar, '?'), isAscii ? narrowChar : '?');
	}
	EXPECT_EQ(wide.widen('\xE9'), 0xE9);
}

TEST(UTF16Facets, ScanAndChangeRanges)
{
	const auto& facet = std::use_facet<std::ctype<UTF16Char>>(ClassicUTF16Locale());
	UTF16String text = AsciiToUTF16("ab 12");
	const UTF16Char* const begin = text.data();
	const UTF16Char* const end = begin + text.size();
	EXPECT_EQ(facet.scan_is(std::ctype_base::space, begin, end) - begin, 2);
	EXPECT_EQ(facet.scan_not(std::ctype_base::alpha, begin, end) - begin, 2);
	EXPECT_EQ(facet.scan_is(std::ctype_base::cntrl, begin, end), end);
	facet.toupper(text.data(), end);
	EXPECT_EQ(UTF16to8(text), "AB 12");
	facet.tolower(text.data(), end);
	char narrowed[5];
	facet.narrow(begin, end, '?', narrowed);
	EXPECT_EQ(std::string(narrowed, 5), "ab 12");
}

}   // namespace
}   // namespace zoncore
