#include "zonmediatypes/FrameRate.h"

#include "tests/Platform.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"

#include <gtest/gtest.h>

#include <cmath>
#include <csignal>
#include <iomanip>
#include <limits>
#include <sstream>
#include <string>

namespace zonmediatypes
{
namespace
{

constexpr std::int64_t kMost = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();

template <class Char>
std::basic_string<Char> Text(FrameRate inRate)
{
	std::basic_ostringstream<Char> stream;
	stream << inRate;
	return stream.str();
}

struct NamedRate
{
	FrameRate mRate;
	std::int64_t mTicksPerFrame;
	const char* mText;
};

constexpr NamedRate sRates[] = {
	{kFrameRate_Video10, 25'401'600'000, "10"},
	{kFrameRate_Video12, 21'168'000'000, "12"},
	{kFrameRate_Video12_5, 20'321'280'000, "12.5"},
	{kFrameRate_Video15, 16'934'400'000, "15"},
	{kFrameRate_23976, 10'594'584'000, "23.976"},
	{kFrameRate_Film24, 10'584'000'000, "24"},
	{kFrameRate_VideoPAL, 10'160'640'000, "25"},
	{kFrameRate_VideoNTSC, 8'475'667'200, "29.97"},
	{kFrameRate_Video30, 8'467'200'000, "30"},
	{kFrameRate_Film48, 5'292'000'000, "48"},
	{kFrameRate_VideoPAL_HD, 5'080'320'000, "50"},
	{kFrameRate_VideoNTSC_HD, 4'237'833'600, "59.94"},
	{kFrameRate_Video60, 4'233'600'000, "60"},
	{kFrameRate_Video100, 2'540'160'000, "100"},
	{kFrameRate_Video1000, 254'016'000, "1000"},
	{kFrameRate_Audio8000, 31'752'000, "8000"},
	{kFrameRate_Audio11025, 23'040'000, "11025"},
	{kFrameRate_Audio22050, 11'520'000, "22050"},
	{kFrameRate_Audio32000, 7'938'000, "32000"},
	{kFrameRate_Audio44100, 5'760'000, "44100"},
	{kFrameRate_Audio48000, 5'292'000, "48000"},
	{kFrameRate_Audio88200, 2'880'000, "88200"},
	{kFrameRate_Audio96000, 2'646'000, "96000"},
	{kFrameRate_Audio192000, 1'323'000, "192000"},
	{kFrameRate_Zero, 9'223'372'036'854'775'807, "0"},
};

TEST(FrameRate, HasTheNamedDurationsAndTheirTexts)
{
	ASSERT_EQ(AllFrameRates().size(), std::size(sRates));
	const FrameRate* listed = AllFrameRates().data();
	for (const auto& [rate, ticks, text] : sRates)
	{
		EXPECT_EQ(rate.GetTicksPerFrame(), ticks);
		EXPECT_EQ(*listed++, rate);
		EXPECT_EQ(Text<char>(rate), text);
		EXPECT_EQ(zoncore::utility::UTF16to8(zoncore::utility::Coercion(rate)), text);
#if ZONCORE_HAS_BYTE_STREAMS
		const auto bytes = Text<unsigned char>(rate);
		EXPECT_EQ(std::string(bytes.begin(), bytes.end()), text);
#endif
	}
}

TEST(FrameRate, IsWrittenWhateverItIs)
{
	EXPECT_EQ(Text<char>(FrameRate(0)), "inf");
	EXPECT_EQ(Text<char>(FrameRate(-8'475'667'200)), "-29.97");
	EXPECT_EQ(Text<char>(FrameRate(10'594'583'999)), "23.98");   // a tick beside the rate with three decimals

	std::ostringstream narrow;
	narrow << std::setprecision(1) << std::setfill('*') << std::setw(7) << kFrameRate_23976;
	EXPECT_EQ(narrow.str(), "*23.976");
	zoncore::oUTF16StringStream wide;
	wide << std::left << std::setw(7) << kFrameRate_VideoNTSC << std::setw(3) << kFrameRate_VideoPAL;
	EXPECT_EQ(zoncore::utility::UTF16to8(wide.str()), "29.97  25 ");
}

TEST(FrameRate, ScalesTheRate)
{
	static_assert(FrameRate() == kFrameRate_Zero && !kFrameRate_Zero.IsUsable() && !FrameRate(0).IsUsable());
	static_assert(FrameRate(-1).IsUsable() && kFrameRate_VideoNTSC != kFrameRate_VideoPAL);
	static_assert(kFrameRate_VideoNTSC * 2 == kFrameRate_VideoNTSC_HD);
	static_assert(kFrameRate_VideoPAL_HD / 2 == kFrameRate_VideoPAL);
	static_assert(FrameRate(-7) * 2 == FrameRate(-3) && FrameRate(kLeast) * -1 == FrameRate(kLeast));
	static_assert(FrameRate(kMost) / 2 == FrameRate(-2));
	EXPECT_EQ((kFrameRate_Film24 * 1.001).GetTicksPerFrame(), 10'573'426'573);
	EXPECT_EQ((kFrameRate_Film24 / 1.001).GetTicksPerFrame(), 10'594'583'999);
	for (const double odd : {0.0, std::nan(""), 1e-300})
		EXPECT_EQ((kFrameRate_Film24 * odd).GetTicksPerFrame(), kLeast);
	FrameRate rate = kFrameRate_Film24;
	EXPECT_EQ(((rate *= 4) /= 2), kFrameRate_Film48);
	EXPECT_EQ(((rate /= 4.0) *= 2.0), kFrameRate_Film24);
}

TEST(FrameRateDeathTest, TimesIntegerZeroIsADivideFault)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
	const auto multiply = []
	{
		std::signal(SIGFPE, SIG_DFL);   // sanitizers have a handler of their own
		static_cast<void>(kFrameRate_Film24 * 0);
	};
	EXPECT_EXIT(multiply(), zontest::EndedBy(SIGFPE), "");
}

TEST(FrameRate, IsOrderedByFramesASecond)
{
	const std::int64_t durations[] = {-1, -2, kLeast, kMost, kMost - 1, 8'475'667'200, 8'467'200'000, 1, 0};
	for (const std::int64_t& left : durations)
		for (const std::int64_t& right : durations)
			EXPECT_EQ(FewerFramesPerSecond()(FrameRate(left), FrameRate(right)), &left < &right)
				<< left << ' ' << right;
}

TEST(FrameRate, HasARatio)
{
	static_assert(GetFrameRateRatio(kFrameRate_Video60, kFrameRate_Video30) == 2.0);
	EXPECT_EQ(GetFrameRateRatio(FrameRate(0), kFrameRate_Video30), 0.0);
	EXPECT_EQ(GetFrameRateRatio(kFrameRate_Video30, FrameRate(0)), 0.0);
	EXPECT_EQ(GetFrameRateRatio(FrameRate(1), kFrameRate_Zero), 0x1p63);
}

}   // namespace
}   // namespace zonmediatypes
