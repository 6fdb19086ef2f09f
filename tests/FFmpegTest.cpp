#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#if ZON_HAS_LIBAVUTIL
	#include "zonmediatypes/interop/FFmpeg.h"
#endif

namespace zonmediatypes
{
namespace
{

#if ZON_HAS_LIBAVUTIL

// ---- Time ------------------------------------------------------------------------------------------------------------

std::optional<FrameRate> RateOf(int inNumerator, int inDenominator)
{
	return ToFrameRate({inNumerator, inDenominator});
}

TEST(FFmpegTime, ConvertsTheNamedRatesBothWays)
{
	EXPECT_EQ(RateOf(30'000, 1'001), kFrameRate_VideoNTSC);
	EXPECT_EQ(RateOf(50, 2), kFrameRate_VideoPAL);
	EXPECT_EQ(RateOf(0, 1), kFrameRate_Zero);
	for (const FrameRate rate : AllFrameRates())
	{
		const auto ratio = ToAVRational(rate);
		ASSERT_TRUE(ratio.has_value());
		EXPECT_EQ(ToFrameRate(*ratio), rate);
		EXPECT_NEAR(av_q2d(*ratio),
			rate == kFrameRate_Zero ? 0.0 : 254'016'000'000.0 / static_cast<double>(rate.GetTicksPerFrame()), 1e-6);
	}
}

TEST(FFmpegTime, HasNoCounterpartForWhatIsNoRate)
{
	EXPECT_EQ(RateOf(-25, 1), std::nullopt);
	EXPECT_EQ(RateOf(25, -1), std::nullopt);
	EXPECT_EQ(RateOf(25, 0), std::nullopt);
	EXPECT_EQ(RateOf(0, 0), std::nullopt);
	EXPECT_EQ(RateOf(2'997, 100), std::nullopt) << "no whole number of ticks";
	EXPECT_FALSE(ToAVRational(FrameRate(0)).has_value());
	EXPECT_FALSE(ToAVRational(FrameRate(-5)).has_value());
	EXPECT_FALSE(ToAVRational(FrameRate(10'594'583'999)).has_value()) << "a term beyond 32 bits";
	EXPECT_FALSE(ToTimeBase({1, 0}).has_value());
	EXPECT_FALSE(ToTimeBase({-1, 25}).has_value());
}

TEST(FFmpegTime, RescalesTimestampsAsAvRescaleDoes)
{
	constexpr AVRational kNanoseconds{1, 1'000'000'000};
	for (const AVRational base :
		{AVRational{1, 90'000}, AVRational{1'001, 30'000}, AVRational{2, 44'100}, AVRational{7, 30}, kNanoseconds})
	{
		const auto reduced = ToAVRational(ToTimeBase(base).value());
		ASSERT_TRUE(reduced.has_value());
		EXPECT_EQ(av_cmp_q(*reduced, base), 0);
		for (const std::int64_t stamp : {0LL, 1LL, -1LL, 12'345LL, -12'345LL, 123'456'789LL})
		{
			const auto time = ToTickTime(stamp, base, Rounding::Nearest);
			ASSERT_TRUE(time.has_value());
			EXPECT_EQ(time->GetTicks(), av_rescale_rnd(stamp * base.num, 254'016'000'000, base.den, AV_ROUND_NEAR_INF));
			EXPECT_EQ(ToTimestamp(*time, base, Rounding::Nearest), stamp);
		}
	}
}

TEST(FFmpegTime, MarksWhatHasNoTimestamp)
{
	EXPECT_EQ(ToTickTime(AV_NOPTS_VALUE, {1, 25}, Rounding::Nearest), std::nullopt);
	EXPECT_EQ(ToTickTime(1, {1, 0}, Rounding::Nearest), std::nullopt);
	EXPECT_EQ(ToTickTime(std::numeric_limits<std::int64_t>::max(), {1, 25}, Rounding::Nearest), std::nullopt);
	EXPECT_EQ(ToTimestamp(kTime_Invalid, {1, 25}, Rounding::Nearest), AV_NOPTS_VALUE);
	EXPECT_EQ(ToTimestamp(kTime_Max, {0, 25}, Rounding::Nearest), AV_NOPTS_VALUE);
	EXPECT_EQ(ToTimestamp(TickTime(1), {1, 25}, Rounding::Up), 1);
}

// ---- Audio -----------------------------------------------------------------------------------------------------------

// A layout by libavutil's own name for it.
class PeerLayout
{
public:
	explicit PeerLayout(const char* inName)
	{
		if (av_channel_layout_from_string(&mLayout, inName) < 0)
			throw std::invalid_argument(inName);
	}
	explicit PeerLayout(const AudioChannelLayout& inLayout) : mLayout(ToAVChannelLayout(inLayout)) {}
	PeerLayout(const PeerLayout&) = delete;
	PeerLayout& operator=(const PeerLayout&) = delete;
	~PeerLayout() { av_channel_layout_uninit(&mLayout); }

	const AVChannelLayout& Get() const { return mLayout; }

	std::string Name() const
	{
		std::string name(1'000, 0);
		av_channel_layout_describe(&mLayout, name.data(), name.size());
		return name.c_str();
	}

private:
	AVChannelLayout mLayout{};
};

struct PeerCase
{
	const char* mName;
	const char* mLabels;
};

TEST(FFmpegChannelLayout, IsReadByTheRolesOfItsSpeakers)
{
	const std::vector<PeerCase> cases = {
		{"mono", "*"},
		{"stereo", "L R"},
		{"3.0", "L R C"},
		{"2.1", "L R LFE"},
		{"4.0", "L R C Cs"},
		{"quad", "L R Ls Rs"},
		{"quad(side)", "L R Ls Rs"},
		{"5.0", "L R C Ls Rs"},
		{"5.1", "L R C LFE Ls Rs"},
		{"5.1(side)", "L R C LFE Ls Rs"},
		{"6.1", "L R C LFE Cs Ls Rs"},
		{"6.1(back)", "L R C LFE Ls Rs Cs"},
		{"7.1", "L R C LFE Rls Rrs Ls Rs"},
		{"7.1(wide)", "L R C LFE Ls Rs Lc Rc"},
		{"7.1(wide-side)", "L R C LFE Lc Rc Ls Rs"},
		{"downmix", "Lt Rt"},
		{"22.2", "L R C LFE Rls Rrs Lc Rc Cs Ls Rs Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfc Bfl Bfr"},
		{"WL+WR+SDL+SDR", "Lw Rw Lsd Rsd"},
		{"2 channels", "* *"},
		{"1 channels", "*"},
		{"ambisonic 1", "* * * *"},
		{"ambisonic 1+stereo", "* * * * L R"},
		{"LFE+FC+FL", "LFE C L"},
		{"BL+SL", "Rls Ls"},
		{"BR", "Rs"},
		{"FL", "L"},
		{"USR62+FL", "* L"},
	};
	for (const PeerCase& test : cases)
		EXPECT_EQ(ToAudioChannelLayout(PeerLayout(test.mName).Get()), ReadLayout(test.mLabels)) << test.mName;
	EXPECT_EQ(ToAudioChannelLayout(AVChannelLayout{}), AudioChannelLayout());
	AVChannelLayout broken{};
	broken.nb_channels = -2;
	EXPECT_EQ(ToAudioChannelLayout(broken), AudioChannelLayout());
}

TEST(FFmpegChannelLayout, IsMadeInItsNativeOrderWherePossible)
{
	const std::vector<PeerCase> cases = {
		{"mono", "*"},
		{"mono", "C"},
		{"stereo", "L R"},
		{"quad", "L R Ls Rs"},
		{"5.1", "L R C LFE Ls Rs"},
		{"6.1(back)", "L R C LFE Ls Rs Cs"},
		{"7.1", "L R C LFE Rls Rrs Ls Rs"},
		{"7.1(wide)", "L R C LFE Ls Rs Lc Rc"},
		{"downmix", "Lt Rt"},
		{"3 channels", "* * *"},
		{"3 channels (FR+FL+FC)", "R L C"},
		{"8 channels (FL+FR+FC+LFE+SL+SR+BL+BR)", "L R C LFE Ls Rs Rls Rrs"},
		{"2 channels (FL+FL)", "L L"},
	};
	for (const PeerCase& test : cases)
	{
		const PeerLayout layout(ReadLayout(test.mLabels));
		EXPECT_EQ(layout.Name(), test.mName);
		EXPECT_TRUE(av_channel_layout_check(&layout.Get()));
	}
}

TEST(FFmpegChannelLayout, HasUnknownChannelsForDiscreteOnes)
{
	const PeerLayout layout(ReadLayout("L *"));
	EXPECT_EQ(av_channel_layout_channel_from_index(&layout.Get(), 0), AV_CHAN_FRONT_LEFT);
	EXPECT_EQ(av_channel_layout_channel_from_index(&layout.Get(), 1), AV_CHAN_UNKNOWN);
}

TEST(FFmpegChannelLayout, IsEmptyWhereALabelHasNoCounterpart)
{
	for (const char* labels : {"", "W X Y Z", "L R Pl Pr", "L 5", "-1"})
		EXPECT_EQ(PeerLayout(ReadLayout(labels)).Get().nb_channels, 0) << labels;
}

TEST(FFmpegChannelLayout, KeepsEveryLayoutOfTheCatalogueThatHasACounterpart)
{
	int converted = 0;
	for (const NamedChannelLayout& named : AllChannelLayouts())
	{
		const AudioChannelLayout layout(named.mLabels.begin(), named.mLabels.end());
		const PeerLayout peer(layout);
		converted += peer.Get().nb_channels != 0;
		if (peer.Get().nb_channels != 0)
		{
			EXPECT_EQ(ToAudioChannelLayout(peer.Get()), layout) << named.mName;
		}
	}
	EXPECT_EQ(converted, 87);   // all but B-format and the one with proximity speakers
}

#else

TEST(FFmpeg, IsNotInstalled)
{
	GTEST_SKIP() << "built without libavutil";
}

#endif

}   // namespace
}   // namespace zonmediatypes
