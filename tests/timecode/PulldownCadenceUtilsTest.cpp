#include "zonmediatypes/PulldownCadenceUtils.h"

#include <gtest/gtest.h>
#include <limits>
#include <string>

namespace zonmediatypes
{
namespace
{

// Film frames as the video frames that carry them, marked ones with "!".
std::string Frames(int inCadence, std::int64_t inFirst, std::int64_t inLast)
{
	std::string text;
	for (std::int64_t frame = inFirst; frame <= inLast; ++frame)
	{
		bool isMarked = true;
		const TickTime time = MapPulldownFrameTo2997Frame(TickTime(frame * kFrameRate_23976.GetTicksPerFrame()),
			kFrameRate_VideoNTSC, static_cast<PulldownCadence>(inCadence), isMarked);
		EXPECT_EQ(time.GetTicks() % kFrameRate_VideoNTSC.GetTicksPerFrame(), 0);
		text += std::to_string(time.ToFrame64(kFrameRate_VideoNTSC)) + (isMarked ? "! " : " ");
	}
	return text;
}

TEST(Pulldown, PlacesFilmFramesByCadence)
{
	const std::string phases[]
		= {"0 1 3! 4 5 6 8! 9 ", "0 2! 3 4 5 7! 8 9 ", "1! 2 3 4 6! 7 8 9 ", "0 1 2 3 5! 6 7 8 ", "0 1 2 4! 5 6 7 9! "};
	const auto unmarked = [](std::string inText)
	{
		std::erase(inText, '!');
		return inText;
	};
	for (const int cadence : {0, 1, 2, 3, 4, 5, 11, -1, std::numeric_limits<int>::min()})
		EXPECT_EQ(Frames(cadence, 0, 7), phases[cadence >= 1 && cadence <= 4 ? cadence : 0]) << cadence;
	const int advanced[] = {4, 0, 1, 2, 3};
	for (int cadence = 6; cadence <= 10; ++cadence)
		EXPECT_EQ(Frames(cadence, 0, 7), unmarked(phases[advanced[cadence - 6]])) << cadence;
}

TEST(Pulldown, RunsOnBelowZeroAndForADay)
{
	EXPECT_EQ(Frames(0, -8, -1), "-10 -9 -7 -6 -5 -4 -2 -1 ");
	EXPECT_EQ(Frames(2, -4, 0), "-4 -3 -2 -1 1! ");
	EXPECT_EQ(Frames(1, 24 * 86'400, 24 * 86'400 + 3), "2592000 2592002! 2592003 2592004 ");
}

TEST(Pulldown, TakesAnyRateAndTime)
{
	constexpr auto kMost = std::numeric_limits<std::int64_t>::max();
	bool isMarked = true;
	const auto map = [&](std::int64_t inTicks, std::int64_t inDuration, PulldownCadence inCadence)
	{ return MapPulldownFrameTo2997Frame(TickTime(inTicks), FrameRate(inDuration), inCadence, isMarked).GetTicks(); };
	EXPECT_EQ(map(kMost, kMost, kPulldownCadence_None), 0);
	EXPECT_FALSE(isMarked);
	EXPECT_EQ(map(kMost, kMost, kPulldownCadence_SSWWW), kMost);   // film frame 0 lies on video frame 1
	EXPECT_TRUE(isMarked);
	EXPECT_EQ(map(kMost, 0, kPulldownCadence_None), 0);
	EXPECT_EQ(map(-kMost - 1, 1, kPulldownCadence_None), 0);   // the low 32 bits of the film frame
	EXPECT_EQ(map(-12, -8, kPulldownCadence_None), -8);        // film frame 1 of ten negative ticks
}

}   // namespace
}   // namespace zonmediatypes
