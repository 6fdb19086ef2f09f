#include "tests/audio/AudioTables.h"

#include <gtest/gtest.h>

#include <limits>
#include <optional>
#include <string>
#include <utility>

#if ZON_HAS_LIBAVUTIL
	#include "zonmediatypes/interop/FFmpeg.h"
#endif

namespace
{

using namespace zonmediatypes;

#if ZON_HAS_LIBAVUTIL

// ---- Time ------------------------------------------------------------------------------------------------------------

TEST(FFmpegTime, ConvertsRatesBothWays)
{
	for (const FrameRate rate : AllFrameRates())
	{
		const auto ratio = ToAVRational(rate);
		ASSERT_TRUE(ratio.has_value());
		EXPECT_EQ(ToFrameRate(*ratio), rate);
		EXPECT_NEAR(av_q2d(*ratio),
			rate == kFrameRate_Zero ? 0.0 : 254'016'000'000.0 / static_cast<double>(rate.GetTicksPerFrame()), 1e-6);
	}
	EXPECT_EQ(ToFrameRate({50, 2}), kFrameRate_VideoPAL);
	// No rates, no whole number of ticks, a term beyond 32 bits
	for (const AVRational none : {AVRational{-25, 1}, {25, -1}, {25, 0}, {0, 0}, {2'997, 100}})
		EXPECT_EQ(ToFrameRate(none), std::nullopt);
	for (const std::int64_t duration : {0LL, -5LL, 10'594'583'999LL})
		EXPECT_FALSE(ToAVRational(FrameRate(duration)).has_value());
	EXPECT_FALSE(ToTimeBase({1, 0}).has_value());
	EXPECT_FALSE(ToTimeBase({-1, 25}).has_value());
}

TEST(FFmpegTime, RescalesTimestampsAsAvRescaleDoes)
{
	for (const AVRational base : {AVRational{1, 90'000}, {1'001, 30'000}, {2, 44'100}, {7, 30}, {1, 1'000'000'000}})
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

struct PeerLayout : AVChannelLayout
{
	explicit PeerLayout(const AVChannelLayout& inLayout) : AVChannelLayout(inLayout) {}
	PeerLayout(const PeerLayout&) = delete;
	PeerLayout& operator=(const PeerLayout&) = delete;
	~PeerLayout() { av_channel_layout_uninit(this); }
};

// By libavutil's own name.
PeerLayout PeerNamed(const char* inName)
{
	AVChannelLayout layout{};
	EXPECT_GE(av_channel_layout_from_string(&layout, inName), 0) << inName;
	return PeerLayout(layout);
}

std::string NameOf(const AVChannelLayout& inLayout)
{
	std::string name(1'000, 0);
	av_channel_layout_describe(&inLayout, name.data(), name.size());
	return name.c_str();
}

using Rows = std::initializer_list<std::pair<const char*, const char*>>;

TEST(FFmpegChannelLayout, GoesByTheRolesOfItsSpeakersBothWays)
{
	for (const auto& [name, labels] : Rows{{"mono", "*"}, {"stereo", "L R"}, {"4.0", "L R C Cs"}, {"quad", "L R Ls Rs"},
			 {"5.1", "L R C LFE Ls Rs"}, {"6.1(back)", "L R C LFE Ls Rs Cs"}, {"7.1", "L R C LFE Rls Rrs Ls Rs"},
			 {"7.1(wide)", "L R C LFE Ls Rs Lc Rc"}, {"downmix", "Lt Rt"}, {"3 channels", "* * *"},
			 {"22.2", "L R C LFE Rls Rrs Lc Rc Cs Ls Rs Ts Vhl Vhc Vhr Tbl Tbc Tbr LFE2 Tsl Tsr Bfc Bfl Bfr"}})
	{
		EXPECT_EQ(ToAudioChannelLayout(PeerNamed(name)), ReadLayout(labels)) << name;
		const PeerLayout layout(ToAVChannelLayout(ReadLayout(labels)));
		EXPECT_EQ(NameOf(layout), name);
		EXPECT_TRUE(av_channel_layout_check(&layout));
	}
}

TEST(FFmpegChannelLayout, IsReadWhateverItHas)
{
	for (const auto& [name, labels] : Rows{{"5.1(side)", "L R C LFE Ls Rs"}, {"6.1", "L R C LFE Cs Ls Rs"},
			 {"7.1(wide-side)", "L R C LFE Lc Rc Ls Rs"}, {"WL+WR+SDL+SDR", "Lw Rw Lsd Rsd"},
			 {"ambisonic 1", "* * * *"}, {"ambisonic 1+stereo", "* * * * L R"}, {"LFE+FC+FL", "LFE C L"},
			 {"BL+SL", "Rls Ls"}, {"BR", "Rs"}, {"USR62+FL", "* L"}})
		EXPECT_EQ(ToAudioChannelLayout(PeerNamed(name)), ReadLayout(labels)) << name;
	EXPECT_EQ(ToAudioChannelLayout(AVChannelLayout{}), AudioChannelLayout());
	AVChannelLayout broken{};
	broken.nb_channels = -2;
	EXPECT_EQ(ToAudioChannelLayout(broken), AudioChannelLayout());
}

TEST(FFmpegChannelLayout, IsMadeInItsNativeOrderWherePossible)
{
	for (const auto& [name, labels] : Rows{{"mono", "C"}, {"3 channels (FR+FL+FC)", "R L C"},
			 {"8 channels (FL+FR+FC+LFE+SL+SR+BL+BR)", "L R C LFE Ls Rs Rls Rrs"}, {"2 channels (FL+FL)", "L L"}})
	{
		const PeerLayout layout(ToAVChannelLayout(ReadLayout(labels)));
		EXPECT_EQ(NameOf(layout), name);
		EXPECT_TRUE(av_channel_layout_check(&layout));
	}
	const PeerLayout half(ToAVChannelLayout(ReadLayout("L *")));
	EXPECT_EQ(av_channel_layout_channel_from_index(&half, 0), AV_CHAN_FRONT_LEFT);
	EXPECT_EQ(av_channel_layout_channel_from_index(&half, 1), AV_CHAN_UNKNOWN);
	for (const char* const labels : {"", "W X Y Z", "L R Pl Pr", "L 5", "-1"})   // a label without a counterpart
		EXPECT_EQ(ToAVChannelLayout(ReadLayout(labels)).nb_channels, 0) << labels;
}

TEST(FFmpegChannelLayout, KeepsEveryLayoutOfTheCatalogueThatHasACounterpart)
{
	int converted = 0;
	for (const NamedChannelLayout& named : AllChannelLayouts())
	{
		const AudioChannelLayout layout(named.mLabels.begin(), named.mLabels.end());
		const PeerLayout peer(ToAVChannelLayout(layout));
		if (peer.nb_channels == 0)
			continue;
		++converted;
		EXPECT_EQ(ToAudioChannelLayout(peer), layout) << named.mName;
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
