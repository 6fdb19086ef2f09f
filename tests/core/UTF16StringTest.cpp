#include "zoncore/UTF16Stream.h"

#include "tests/HostileLocale.h"
#include "zoncore/StringUtils.h"

#include <gtest/gtest.h>

#include <iomanip>
#include <limits>
#include <numeric>
#include <sstream>

namespace
{

using namespace zoncore;
using utility::AsciiToUTF16;
using utility::UTF16to8;

// Every case runs under a locale that groups digits and writes a decimal comma.
const zontest::HostileLocale sHostileLocale;

// One line for each way of writing.
template <class Stream>
Stream WriteEverything(Stream ioStream)
{
	const auto fill = [](char inChar) { return std::setfill(static_cast<typename Stream::char_type>(inChar)); };
	ioStream << 0 << " " << -1 << " " << 1'234'567 << " " << std::numeric_limits<std::uint64_t>::max() << std::endl;
	ioStream << std::numeric_limits<long long>::min() << std::setw(6) << 42 << std::setw(6) << -4.5 << "\n";
	ioStream << 0.0 << " " << -0.0 << " " << 29.97 << " " << 1e6 << " " << 1234567.0 << " " << 1e-5 << "\n";
	ioStream << std::numeric_limits<double>::infinity() << std::numeric_limits<float>::quiet_NaN() << "\n";
	ioStream << fill('0') << std::setw(4) << -3 << std::internal << std::setw(4) << -3 << std::ends << "\n";
	ioStream << std::left << fill('*') << std::setw(6) << "ab" << std::setw(4) << 1 << "|\n";
	ioStream << std::hex << std::showbase << std::uppercase << 48'879 << std::oct << 8 << std::dec << "\n";
	ioStream << std::showpos << 1 << std::showpoint << 2.0 << std::boolalpha << true << false << "\n";
	ioStream << std::fixed << std::setprecision(3) << 1234567.8905 << " " << 1e300 << "\n";
	ioStream << std::setprecision(17) << 0.1 << std::scientific << -1e-300 << std::hexfloat << 0.1 << "\n";
	return ioStream;
}

// All values that can be read from a text one after the other, as text, until reading fails; then what is left.
template <class Value, class Stream>
std::string ReadAll(Stream ioStream)
{
	std::ostringstream result;
	for (Value value{}; ioStream >> value;)
		result << value << ';';
	ioStream.clear();
	for (auto unit = ioStream.get(); ioStream; unit = ioStream.get())
		result << unit << ',';
	return result.str();
}

// A narrow stream with the classic locale is the reference.
template <class Stream, class... Text>
Stream Narrow(const Text&... inText)
{
	Stream stream(inText...);
	stream.imbue(std::locale::classic());
	return stream;
}

TEST(UTF16Stream, WritesAndReadsAsNarrowStreamsDo)
{
	const std::string written = WriteEverything(Narrow<std::ostringstream>()).str();
	EXPECT_EQ(UTF16to8(WriteEverything(oUTF16StringStream()).str()), written);
	EXPECT_EQ(UTF16to8(WriteEverything(UTF16StringStream()).str()), written);

	const auto compare = []<class Value>(Value, const char* inText)
	{
		EXPECT_EQ(ReadAll<Value>(iUTF16StringStream(AsciiToUTF16(inText))),
			ReadAll<Value>(Narrow<std::istringstream>(inText)))
			<< inText;
	};
	for (const char* const text : {"12 -7\t+3\n2147483647 2147483648", "1.234 5", "1,234", "x", "", "  ", "0x1F 017",
			 "9e1", "1.5 -.5e2 1e999", "1 0 2"})
	{
		compare(int{}, text);
		compare(0ll, text);
		compare(double{}, text);
		compare(bool{}, text);
	}
}

// Text of either kind is text, a code unit is a number.
TEST(UTF16Stream, WritesAndReadsTextAndLines)
{
	UTF16StringStream stream;
	stream << std::setw(6) << "two " << AsciiToUTF16("words").c_str() << "\n7 true" << AsciiToUTF16(" ")
		   << UTF16Char('A');
	UTF16String first, rest;
	int number = 0, unit = 0;
	bool truth = false;
	stream >> first >> std::ws;
	std::getline(stream, rest);
	EXPECT_EQ(UTF16to8(first) + "|" + UTF16to8(rest), "two|words");
	EXPECT_TRUE(stream >> number >> std::boolalpha >> truth >> unit);
	EXPECT_TRUE(number == 7 && truth && unit == 65);
	EXPECT_FALSE(std::getline(stream, rest));
}

TEST(UTF16Stream, KeepsItsFacetsWhenMovedSwappedAndCopied)
{
	oUTF16StringStream first;
	first << 1.5;
	oUTF16StringStream second(std::move(first));
	oUTF16StringStream third(AsciiToUTF16("12"), std::ios_base::out | std::ios_base::ate);
	third << 34.5;
	third.swap(second);
	third << std::setw(6) << 1'000;
	oUTF16StringStream fourth(AsciiToUTF16("overwritten"));
	fourth = std::move(second);
	fourth << "|" << 2.5;
	UTF16StringStream copied(AsciiToUTF16("123"));
	copied.copyfmt(fourth);
	copied << 4.5;
	EXPECT_EQ(UTF16to8(third.str() + fourth.str() + copied.str()), "1.5  10001234.5|2.54.5");
}

TEST(UTF16Facets, AgreeWithTheClassicOnesOnAsciiAndLeaveTheRestAlone)
{
	const auto& facet = std::use_facet<std::ctype<UTF16Char>>(ClassicUTF16Locale());
	const auto& classic = std::use_facet<std::ctype<char>>(std::locale::classic());
	UTF16String all(0x10000, 0);
	std::iota(all.begin(), all.end(), UTF16Char{0});
	UTF16String upper = all, lower = all;
	std::vector<std::ctype_base::mask> masks(all.size());
	std::string narrow(all.size(), ' ');
	const UTF16Char* const end = all.data() + all.size();
	EXPECT_EQ(facet.is(all.data(), end, masks.data()), end);
	EXPECT_EQ(facet.narrow(all.data(), end, '?', narrow.data()), end);
	EXPECT_EQ(facet.toupper(upper.data(), upper.data() + upper.size()), upper.data() + upper.size());
	EXPECT_EQ(facet.tolower(lower.data(), lower.data() + lower.size()), lower.data() + lower.size());
	for (const UTF16Char unit : all)
	{
		const bool isAscii = unit < 0x80;
		const char character = isAscii ? static_cast<char>(unit) : 'x';
		ASSERT_EQ(masks[unit], isAscii ? classic.table()[unit] : std::ctype_base::mask{}) << unit;
		ASSERT_EQ(facet.is(std::ctype_base::alpha, unit), isAscii && classic.is(std::ctype_base::alpha, character));
		ASSERT_EQ(upper[unit], isAscii ? classic.toupper(character) : unit);
		ASSERT_EQ(lower[unit], isAscii ? classic.tolower(character) : unit);
		ASSERT_EQ(narrow[unit], isAscii ? character : '?');
	}
	EXPECT_EQ(facet.scan_is(std::ctype_base::digit, all.data(), end) - all.data(), '0');
	EXPECT_EQ(facet.scan_not(std::ctype_base::cntrl, all.data(), end) - all.data(), ' ');
	EXPECT_EQ(facet.widen('\xE9'), 0xE9);
}

}   // namespace
