#include "zonmediatypes/TickTime.h"

#include "tests/Platform.h"
#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <csignal>
#include <functional>
#include <iomanip>
#include <limits>
#include <locale>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr std::int64_t kMost = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kLeast = std::numeric_limits<std::int64_t>::min();
constexpr FrameRate kTen(10);

static_assert(kTime_Zero == TickTime() && kTime_Zero.GetTicks() == 0);
static_assert(kTime_Max.GetTicks() == 91'445'760'000'000'000);
static_assert(kTime_Min.GetTicks() == -91'445'760'000'000'000);
static_assert(kTime_Invalid.GetTicks() == -101'606'400'000'000'000);
static_assert(TickTime(1) > kTime_Zero && TickTime(-1) <= kTime_Zero && TickTime(1) != TickTime(2));

template <class Operation>
constexpr std::int64_t Apply(std::int64_t inTicks, Operation inOperation)
{
	TickTime time(inTicks);
	inOperation(time);
	return time.GetTicks();
}

// ---- Frames ----------------------------------------------------------------------------------------------------------

TEST(TickTimeFrames, CountsTowardZero)
{
	EXPECT_EQ(TickTime(-9).ToFrame64(kTen), 0);
	EXPECT_EQ(TickTime(-10).ToFrame64(kTen), -1);
	EXPECT_EQ(TickTime(-19).ToFrame64(kTen), -1);
	EXPECT_EQ(TickTime(19).ToFrame64(kTen), 1);
	EXPECT_EQ(TickTime(25).ToFrame64(FrameRate(-10)), -2);
	EXPECT_EQ(TickTime(kLeast).ToFrame64(FrameRate(-1)), kLeast);
	for (const FrameRate unusable : {FrameRate(0), kFrameRate_Zero})
		EXPECT_EQ(TickTime(kMost).ToFrame64(unusable), 0);
	EXPECT_EQ(TickTime(0x1'2345'6789'0).ToFrame32(FrameRate(0x10)), 0x2345'6789);
	EXPECT_EQ(TickTime(0xFFFF'FFFFll).ToFrame32(FrameRate(1)), -1);
}

TEST(TickTimeFrames, MovesByFrames)
{
	EXPECT_EQ(Apply(1, [](TickTime& t) { t.AddFrames(90, kFrameRate_VideoPAL); }), 914'457'600'001);
	EXPECT_EQ(Apply(0, [](TickTime& t) { t.AddFrames(-2, kTen); }), -20);
	EXPECT_EQ(Apply(0, [](TickTime& t) { t.AddFrames(3, kFrameRate_Zero); }), kMost - 2);   // wraps
}

TEST(TickTimeFrames, BeginExactlyOrNowhere)
{
	constexpr FrameRate kLong(kLeast / 2), kBack(-1);
	static_assert(TickTime::FromFrames(-90, kFrameRate_VideoPAL) == TickTime(-914'457'600'000));
	static_assert(TickTime::FromFrames(0, kTen) == kTime_Zero && TickTime::FromFrames(kLeast, FrameRate(1)));
	static_assert(TickTime::FromFrames(kMost / 10, kTen) == TickTime(kMost - 7));
	static_assert(TickTime::FromFrames(kLeast / 10, kTen) == TickTime(kLeast + 8));
	static_assert(!TickTime::FromFrames(kMost / 10 + 1, kTen) && !TickTime::FromFrames(kLeast / 10 - 1, kTen));
	static_assert(TickTime::FromFrames(2, kLong) == TickTime(kLeast) && !TickTime::FromFrames(-2, kLong));
	static_assert(TickTime::FromFrames(kMost, kBack) == TickTime(-kMost) && !TickTime::FromFrames(kLeast, kBack));
	static_assert(!TickTime::FromFrames(0, kFrameRate_Zero) && !TickTime::FromFrames(1, FrameRate(0)));
}

TEST(TickTimeFrames, Aligns)
{
	constexpr std::int64_t kLatest = kTime_Max.GetTicks();
	constexpr std::int64_t kEarliest = kTime_Min.GetTicks();
	constexpr std::int64_t kNone = kTime_Invalid.GetTicks();
	const struct
	{
		std::int64_t mDuration, mTicks, mAligned, mCeil, mNearest;
	} cases[] = {
		{10, 0, 0, 0, 0},
		{10, 4, 0, 10, 0},
		{10, 5, 0, 10, 10},
		{10, 15, 10, 20, 20},
		{10, 20, 20, 20, 20},
		{10, -4, 0, 0, 0},
		{10, -5, 0, 0, -10},
		{10, -10, -10, 0, -10},
		{10, -19, -10, -10, -20},
		{3, 1, 0, 3, 0},
		{3, 2, 0, 3, 3},
		{-10, 15, 10, 0, 10},
		{0, kMost, kMost, kMost, kMost},   // not clamped
		{kMost, 15, 15, 15, 15},
		{1, kLatest + 1, kLatest + 1, kLatest + 1, kLatest},
		{1, kNone, kNone, kNone, kEarliest},
		{-1, kLeast, kLeast, kMost - 1, kEarliest},
	};
	for (const auto& [duration, ticks, aligned, ceil, nearest] : cases)
	{
		SCOPED_TRACE(testing::Message() << ticks << " at " << duration);
		const FrameRate rate(duration);
		EXPECT_EQ(Apply(ticks, [rate](TickTime& t) { t.AlignToFrame(rate); }), aligned);
		EXPECT_EQ(Apply(ticks, [rate](TickTime& t) { t.AlignToNearestFrame(rate); }), nearest);
		EXPECT_EQ(Apply(ticks, [rate](TickTime& t) { t.AlignToFrameCeil(rate); }), ceil);
	}
}

TEST(TickTimeFrames, CalculatesTheRateOfACount)
{
	const auto rate = [](std::int64_t inTicks, unsigned long long inCount)
	{
		FrameRate result(7);
		TickTime(inTicks).CalculateFrameRate(inCount, result);
		return result;
	};
	EXPECT_EQ(rate(kTicksPerSecond, 30), kFrameRate_Video30);
	EXPECT_EQ(rate(kTicksPerSecond, 0), kFrameRate_Zero);
	EXPECT_EQ(rate(29, 30), kFrameRate_Zero);
	EXPECT_EQ(rate(-59, 30), FrameRate(-1));
	EXPECT_EQ(rate(59, 0xFFFF'FFFF'FFFF'FFE2), FrameRate(-1));   // a count is signed
	EXPECT_EQ(rate(kLeast, 0xFFFF'FFFF'FFFF'FFFF), FrameRate(kLeast));
}

// ---- Arithmetic ------------------------------------------------------------------------------------------------------

TEST(TickTimeArithmetic, WrapsAndTruncates)
{
	constexpr TickTime second(kTicksPerSecond);
	static_assert((second / 2).GetTicks() == 127'008'000'000 && (second / -2).GetTicks() == -127'008'000'000);
	static_assert((TickTime(7) / -2).GetTicks() == -3 && (TickTime(-7) / 2.0).GetTicks() == -3);
	static_assert((TickTime(-1) / 4'294'967'295u).GetTicks() == 0 && (TickTime(kLeast) / -1).GetTicks() == kLeast);
	static_assert((TickTime(-2) * 4'294'967'295u).GetTicks() == -8'589'934'590);
	static_assert((TickTime(kMost) * 2).GetTicks() == -2 && (TickTime(3) * -0.5).GetTicks() == -1);
	static_assert(second / TickTime(kTicksPerSecond / 4) == 4.0);
	static_assert((-TickTime(kLeast)).GetTicks() == kLeast && TickTime(kLeast).Abs().GetTicks() == kLeast);
	static_assert((TickTime(kMost) + TickTime(1)).GetTicks() == kLeast);
	static_assert((TickTime(kLeast) - TickTime(1)).GetTicks() == kMost);
	EXPECT_EQ((TickTime(kMost) * 2.0).GetTicks(), kLeast);
	EXPECT_EQ((TickTime(1) / std::nan("")).GetTicks(), kLeast);
	EXPECT_EQ(Apply(-5, [](TickTime& t) { t.Abs(); }), 5);
	EXPECT_EQ(Apply(-5, [](TickTime& t) { t = t.Abs() * 3; }), 15);
}

// Every integer gives what it gives where it fits 32 bits, on either side; wider ones wrap as they do.
template <class... Integers>
void ExpectIntegersToScale()
{
	const auto expectOne = []<class Integer>(Integer inFive)
	{
		EXPECT_EQ((TickTime(-7) * inFive).GetTicks(), -35);
		EXPECT_EQ((inFive * TickTime(-7)).GetTicks(), -35);
		EXPECT_EQ((TickTime(-7) / inFive).GetTicks(), -1);
		EXPECT_EQ((TickTime(-7) % inFive).GetTicks(), -2);
	};
	(expectOne(Integers{5}), ...);
}

TEST(TickTimeArithmetic, TakesAnyNumber)
{
	ExpectIntegersToScale<char, short, unsigned short, int, unsigned, long, unsigned long, long long,
		unsigned long long>();
	static_assert((2.5 * TickTime(2)).GetTicks() == 5 && (0.5f * TickTime(3)).GetTicks() == 1);
	static_assert((TickTime(3) * kMost).GetTicks() == kMost - 2 && (TickTime(-3) * ~0ULL).GetTicks() == 3);
	static_assert((TickTime(kLeast) / -1LL).GetTicks() == kLeast && (TickTime(kMost) / kLeast).GetTicks() == 0);
	static_assert((TickTime(kLeast) % -1LL).GetTicks() == 0 && (TickTime(kMost) % kLeast).GetTicks() == kMost);
	constexpr auto kBeyond = static_cast<std::uint64_t>(kLeast);   // 2^63
	static_assert((TickTime(kLeast) / kBeyond).GetTicks() == -1 && (TickTime(kLeast) % kBeyond).GetTicks() == 0);
	static_assert((TickTime(kLeast) / (kBeyond + 1)).GetTicks() == 0 && (TickTime(-1) / ~0ULL).GetTicks() == 0);
	static_assert((TickTime(kLeast) % (kBeyond + 1)).GetTicks() == kLeast && (TickTime(-1) % ~0ULL).GetTicks() == -1);
	static_assert((TickTime(-25) % TickTime(10)).GetTicks() == -5 && (TickTime(25) % TickTime(-10)).GetTicks() == 5);
	static_assert((TickTime(kLeast) % TickTime(-1)).GetTicks() == 0);
}

// ---- Division by zero ------------------------------------------------------------------------------------------------

TEST(ZeroDivisor, IsReportedByEachOperatorBeforeItGoesOn)
{
	std::vector<std::string> reports;
	int errors = 0;
	const auto dialog = zoncore::debug::SetContractDialog(
		[&](const char* inCondition, const char* inPath, const char* inSignature, int inLine)
		{
			EXPECT_STREQ(inPath, "zonmediatypes/src/TickTime.cpp");
			EXPECT_GT(inLine, 0);
			reports.push_back(std::string(inCondition) + " in " + inSignature);
			return true;   // without a debugger nothing breaks
		});
	const auto reporter = zoncore::config::SetErrorReporter(
		[&](int inLevel, const char* inKey, const std::vector<zoncore::config::ReplacementValue>& inValues)
		{
			EXPECT_EQ(inLevel, 0);
			EXPECT_STREQ(inKey,
				"$$$/zoncore/utility/Error/Contract/InputContractViolation=An input contract violation has occurred!");
			EXPECT_TRUE(inValues.empty());
			++errors;
		});
	EXPECT_EQ((TickTime(kTicksPerSecond) / 0.0).GetTicks(), kLeast);
	EXPECT_EQ(Apply(1, [](TickTime& t) { t /= -0.0; }), kLeast);
	EXPECT_TRUE(std::isinf(TickTime(1) / kTime_Zero));
	EXPECT_THAT(reports,
		testing::ElementsAre("inValue != 0 in zonmediatypes::TickTime zonmediatypes::TickTime::operator/(double) const",
			"inValue != 0 in zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(double)",
			"inValue != 0 in zonmediatypes::TickTime &zonmediatypes::TickTime::operator/=(double)",
			"inRHS.mTicks != 0 in double zonmediatypes::TickTime::operator/(const zonmediatypes::TickTime &) const"));
	EXPECT_EQ(errors, 4);
	zoncore::debug::SetContractDialog(dialog);
	zoncore::config::SetErrorReporter(reporter);

	TickTime time(5);
	EXPECT_THROW(time /= 0, zoncore::config::Error) << "the default reporter throws";
	EXPECT_EQ(time, TickTime(5));
}

TEST(ZeroDivisorDeathTest, OfAnIntegerIsADivideFaultAfterItsReports)
{
	testing::FLAGS_gtest_death_test_style = "threadsafe";
	const auto divide = [](auto inDivisor, auto inOperation)
	{
		std::signal(SIGFPE, SIG_DFL);   // sanitizers have a handler of their own
		zoncore::config::SetErrorReporter([](auto&&...) {});
		static_cast<void>(inOperation(TickTime(1), inDivisor));
	};
	// The dialog by default prints each report.
	const auto reports = [](const std::string& inType)
	{
		const std::string place = "inValue != 0 in zonmediatypes::TickTime ";
		return testing::AllOf(testing::HasSubstr(place + "zonmediatypes::TickTime::operator/(" + inType + ") const"),
			testing::HasSubstr(place + "&zonmediatypes::TickTime::operator/=(" + inType + ")"));
	};
	const zontest::EndedBy isFault(SIGFPE);
	EXPECT_EXIT(divide(0, std::divides<>()), isFault, reports("std::int32_t"));
	EXPECT_EXIT(divide(0u, std::divides<>()), isFault, reports("std::uint32_t"));
	EXPECT_EXIT(divide(0ull, std::divides<>()), isFault, testing::HasSubstr("TickTime::operator/=(WideInteger)"));
	EXPECT_EXIT(divide(0, std::modulus<>()), isFault, testing::HasSubstr("TickTime::operator%=(std::integral)"));
	EXPECT_EXIT(divide(kTime_Zero, std::modulus<>()), isFault, testing::HasSubstr("inRHS.mTicks != 0"));
}

// ---- Text ------------------------------------------------------------------------------------------------------------

TEST(TickTimeText, IsSecondsAndFollowsTheStreamOnNarrowOnesOnly)
{
	const auto narrow = [](const auto&... inValues)
	{
		std::ostringstream stream;
		stream.imbue(std::locale::classic());
		(stream << ... << inValues);
		return stream.str();
	};
	const auto wide = [](const auto&... inValues)
	{
		zoncore::oUTF16StringStream stream;
		(stream << ... << inValues);
		return zoncore::utility::UTF16to8(stream.str());
	};
	const TickTime third(kTicksPerSecond / 3);
	const std::pair<TickTime, const char*> cases[]
		= {{kTime_Zero, "0"}, {TickTime(kTicksPerSecond) * 1.5, "1.5"}, {third, "0.333333"}, {kTime_Max, "360000"},
			{kTime_Invalid, "-400000"}, {TickTime(kMost), "3.63102e+07"}, {TickTime(1), "3.93676e-12"}};
	for (const auto& [time, text] : cases)
	{
		EXPECT_EQ(narrow(time), text);
		EXPECT_EQ(wide(time), text);
	}
	EXPECT_EQ(narrow(std::setprecision(2), std::setfill('*'), std::setw(6), third), "**0.33");
	EXPECT_EQ(wide(std::setprecision(2), std::setw(10), third), "  0.333333");
	EXPECT_EQ(wide(std::setw(10), std::left, third), "0.333333  ");
}

}   // namespace
}   // namespace zonmediatypes
