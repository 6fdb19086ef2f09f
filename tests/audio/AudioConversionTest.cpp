#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/Walks.h"
#include "tests/audio/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cfenv>
#include <limits>
#include <random>
#include <vector>

namespace
{

using namespace zonmediatypes;

// ---- Matrices --------------------------------------------------------------------------------------------------------

constexpr int kNoSpeaker = std::numeric_limits<int>::max();

// The squared distance between two channels, by the required positions; the origin is that of numbers without a name.
int SquaredDistance(AudioChannelLabel inFirst, AudioChannelLabel inSecond)
{
	std::array<int, 3> way{};
	for (const RequiredLabel& label : kRequiredLabels)
	{
		const int sign = (label.mLabel == inFirst ? 1 : 0) - (label.mLabel == inSecond ? 1 : 0);
		if (sign != 0 && (label.mAbbreviation == "*" || label.mAbbreviation.starts_with("LFE")))
			return kNoSpeaker;
		for (std::size_t axis = 0; axis < way.size(); ++axis)
			way[axis] += sign * label.mPosition[axis];
	}
	return way[0] * way[0] + way[1] * way[1] + way[2] * way[2];
}

// What a labelled channel takes: the first source channel of its label, or equal shares of the nearest ones.
std::vector<double> SharesOf(AudioChannelLabel inLabel, const AudioChannelLayout& inSource)
{
	std::vector<double> shares(inSource.size());
	if (const auto same = std::ranges::find(inSource, inLabel, &AudioChannelDescription::mLabel);
		same != inSource.end())
		return shares[static_cast<std::size_t>(same - inSource.begin())] = 1, shares;
	const auto distance = [=](AudioChannelDescription inChannel) { return SquaredDistance(inChannel.mLabel, inLabel); };
	const int nearest = inSource.empty() ? kNoSpeaker : distance(*std::ranges::min_element(inSource, {}, distance));
	const auto takers = static_cast<double>(std::ranges::count(inSource, nearest, distance));
	std::ranges::transform(
		inSource, shares.begin(),
		[&](int inDistance) { return inDistance == nearest && nearest != kNoSpeaker ? 1 / takers : 0; }, distance);
	return shares;
}

ChannelConversionMatrix Convert(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination)
{
	ChannelConversionMatrix matrix(3);
	ComputeChannelConversionMatrix(inSource, inDestination, matrix);
	return matrix;
}

// All pairs of the catalogue and of short layouts of any labels, numbers that are none, and unlabelled channels.
TEST(ConversionMatrix, GivesLabelledChannelsWhatIsNearest)
{
	std::mt19937 random(1);
	std::vector<AudioChannelLayout> layouts;
	for (const NamedChannelLayout& named : AllChannelLayouts())
		layouts.emplace_back(named.mLabels.begin(), named.mLabels.end());
	for (int i = 0; i < zontest::WalkLength(200, 50); ++i)
	{
		AudioChannelLayout& layout = layouts.emplace_back(random() % 7);
		for (AudioChannelDescription& channel : layout)
			if (random() % 8 != 0)
				channel = static_cast<AudioChannelLabel>(random() % 60 + 90);   // [90, 149]
	}
	for (const AudioChannelLayout& source : layouts)
	{
		for (const AudioChannelLayout& destination : layouts)
		{
			if (!HasChannelLabeling(source) || !HasChannelLabeling(destination))
				continue;
			const ChannelConversionMatrix matrix = Convert(source, destination);
			ASSERT_EQ(matrix.size(), destination.size());
			for (std::size_t i = 0; i < matrix.size(); ++i)
				ASSERT_TRUE(destination[i] == kAudioChannelLabel_Discrete
					|| std::ranges::equal(matrix[i], SharesOf(destination[i].mLabel, source)));
		}
	}
}

TEST(ConversionMatrix, OfKnownLayouts)
{
	struct Case
	{
		const char *mSource, *mDestination;
		ChannelConversionMatrix mMatrix;
	};
	std::feclearexcept(FE_ALL_EXCEPT);   // a host may let floating-point exceptions stop it
	for (const auto& [source, destination, matrix] : std::initializer_list<Case>{
			 {"L R", "L R C LFE Ls Rs", {{1, 0}, {0, 1}, {0.5, 0.5}, {0, 0}, {1, 0}, {0, 1}}},
			 {"L R C LFE Ls Rs", "L R", {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}}, {"*", "L LFE *", {{1}, {1}, {1}}},
			 {"L R", "*", {{0.5, 0.5}}}, {"* *", "*", {{1, 0}}}, {"* *", "L", {{0, 0}}}, {"C", "* *", {{0}, {0}}},
			 {"* *", "L R C", {{1, 0}, {0, 1}, {0, 0}}}, {"L R", "", {}}, {"", "L R", {{}, {}}}, {"", "*", {{}}},
			 {"Lw L R", "L", {{0, 1, 0}}},   // the same label beats an equal position before it
		 })
		EXPECT_EQ(Convert(ReadLayout(source), ReadLayout(destination)), matrix) << source << " to " << destination;
	EXPECT_EQ(std::fetestexcept(FE_DIVBYZERO), 0);
}

TEST(IdentityMatrix, IsCutOrPadded)
{
	ChannelConversionMatrix matrix(7);
	CreateIdentityChannelConversionMatrix(2, 3, matrix);
	EXPECT_EQ(matrix, (ChannelConversionMatrix{{1, 0}, {0, 1}, {0, 0}}));
	CreateIdentityChannelConversionMatrix(3, 2, matrix);
	EXPECT_EQ(matrix, (ChannelConversionMatrix{{1, 0, 0}, {0, 1, 0}}));
	CreateIdentityChannelConversionMatrix(std::numeric_limits<std::size_t>::max(), 0, matrix);
	EXPECT_EQ(matrix, ChannelConversionMatrix());
}

// ---- Reordering ------------------------------------------------------------------------------------------------------

TEST(ChannelOrdering, FindsTheSourceOfEachChannel)
{
	struct Case
	{
		const char *mSource, *mDestination;
		bool mFound;
		ChannelOrdering mOrdering;
	};
	const ChannelOrdering untouched = {42};
	for (const auto& [source, destination, found, expected] :
		std::initializer_list<Case>{{"L R C LFE Ls Rs", "L R Ls Rs C LFE", true, {0, 1, 4, 5, 2, 3}},
			{"L R", "", true, {}}, {"", "L", false, untouched}, {"L R C", "L R", false, untouched},
			{"L R", "L C", false, untouched}, {"L R R", "R R L", true, {1, 1, 0}},   // no permutation
			{"* L *", "L * *", true, {1, 0, 2}}, {"* L R", "* * L", false, untouched}, {"5 -1", "-1 5", true, {1, 0}}})
	{
		ChannelOrdering ordering = untouched;
		EXPECT_EQ(RemapChannelOrdering(ReadLayout(source), ReadLayout(destination), ordering), found);
		EXPECT_EQ(ordering, expected) << source << " to " << destination;
	}
}

// ---- Labels for unlabelled channels ----------------------------------------------------------------------------------

TEST(ReplaceDiscreteLabels, GivesEachMissingLabelOnce)
{
	struct Case
	{
		const char *mSource, *mDestination;
		bool mHasChanged;
		const char* mResult;
	};
	for (const auto& [source, destination, hasChanged, result] :
		std::initializer_list<Case>{{"L * *", "L R C", true, "L R C"}, {"* * *", "L L R", true, "L R *"},
			{"* * *", "* C *", true, "C * *"}, {"* *", "L R C", true, "L R"}, {"* R", "R C L", true, "C R"},
			{"* 5", "5 6", true, "6 5"}, {"L R", "C LFE", false, "Pl"}, {"* *", "", false, "Pl"},
			{"* *", "* *", false, "Pl"}, {"L *", "L", false, "Pl"}, {"", "L R", false, "Pl"}})
	{
		AudioChannelLayout layout = ReadLayout("Pl");
		EXPECT_EQ(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ReadLayout(source), ReadLayout(destination), layout),
			hasChanged);
		EXPECT_EQ(layout, ReadLayout(result)) << source << " to " << destination;
	}
	AudioChannelLayout source = ReadLayout("* *");   // the output may be an input
	EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(source, ReadLayout("L R"), source));
	EXPECT_EQ(source, ReadLayout("L R"));
	AudioChannelLayout destination = ReadLayout("C LFE");
	EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ReadLayout("* L"), destination, destination));
	EXPECT_EQ(destination, ReadLayout("C L"));
}

// A search from the start for each channel would take minutes.
TEST(ManyChannels, CostTimeInProportion)
{
	constexpr int kMany = 300'000, kDistinct = 200'000;   // a third of the labels stand twice: the first one counts
	AudioChannelLayout many = CreateMultichannelLayout(kMany);
	AudioChannelLayout unlabelled = many;
	for (int i = 0; i < kMany; ++i)
		many[static_cast<std::size_t>(i)] = static_cast<AudioChannelLabel>(1'000 + i % kDistinct);
	ChannelOrdering ordering;
	ASSERT_TRUE(RemapChannelOrdering(many, {many.rbegin(), many.rend()}, ordering));
	EXPECT_TRUE(ordering[0] == 99'999 && ordering[100'000] == kDistinct - 1 && ordering[kMany - 1] == 0);
	unlabelled.front() = many[7];
	ASSERT_TRUE(RemapChannelOrdering(unlabelled, {unlabelled.rbegin(), unlabelled.rend()}, ordering));
	EXPECT_TRUE(ordering[0] == 1 && ordering[kMany - 1] == 0);
	ASSERT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(unlabelled, many, unlabelled));
	EXPECT_TRUE(
		unlabelled[7] == many[6] && unlabelled[8] == many[8] && unlabelled[kDistinct - 1] == many[kDistinct - 1]);
	EXPECT_EQ(unlabelled[kDistinct], kAudioChannelLabel_Discrete);
}

}   // namespace
