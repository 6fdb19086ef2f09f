#include "zonmediatypes/AudioChannelLayout.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <cfenv>
#include <cmath>
#include <limits>
#include <map>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

// ---- The rule, step by step ------------------------------------------------------------------------------------------

struct RequiredPosition
{
	std::string mLabels;
	int mX, mY, mZ;
};

// clang-format off
const std::vector<RequiredPosition> sRequiredPositions = {
	{"L Lw", -2, 0, 2},
	{"R Rw", 2, 0, 2},
	{"C Z", 0, 0, 2},
	{"Lc", -1, 0, 2},
	{"Rc", 1, 0, 2},
	{"Ls Rls", -2, 0, -2},
	{"Rs Rrs", 2, 0, -2},
	{"Cs", 0, 0, -2},
	{"Lsd Lt X", -2, 0, 0},
	{"Rsd Rt", 2, 0, 0},
	{"Pl", -1, 0, 0},
	{"Pr", 1, 0, 0},
	{"Ts Y", 0, 2, 0},
	{"Vhl", -2, 2, 2},
	{"Vhr", 2, 2, 2},
	{"Vhc", 0, 2, 2},
	{"Tsl", -2, 2, 0},
	{"Tsr", 2, 2, 0},
	{"Tbl", -2, 2, -2},
	{"Tbr", 2, 2, -2},
	{"Tbc", 0, 2, -2},
	{"Bfl", -2, -2, 2},
	{"Bfc", 0, -2, 2},
	{"Bfr", 2, -2, 2},
};
// clang-format on

RequiredPosition PositionOf(AudioChannelLabel inLabel)
{
	for (const RequiredPosition& position : sRequiredPositions)
	{
		if (HasChannelLabel(ReadLayout(position.mLabels), inLabel))
			return position;
	}
	return {"", 0, 0, 0};
}

double Distance(AudioChannelLabel inFirst, AudioChannelLabel inSecond)
{
	static std::map<std::pair<int, int>, double> sDistances;
	const auto [row, isNew] = sDistances.try_emplace({inFirst, inSecond});
	if (isNew)
	{
		const RequiredPosition first = PositionOf(inFirst);
		const RequiredPosition second = PositionOf(inSecond);
		const int dx = first.mX - second.mX;
		const int dy = first.mY - second.mY;
		const int dz = first.mZ - second.mZ;
		row->second = std::sqrt(static_cast<double>(dx * dx + dy * dy + dz * dz));
	}
	return row->second;
}

bool IsLFE(AudioChannelLabel inLabel)
{
	return inLabel == kAudioChannelLabel_LowFrequency || inLabel == kAudioChannelLabel_LFE2;
}

// The source channels that a destination channel takes, scanning as the rule is stated.
std::vector<std::size_t> Chosen(const AudioChannelLayout& inSource, AudioChannelLabel inLabel, int inDiscreteSeen)
{
	std::vector<std::size_t> chosen;
	double best = std::numeric_limits<double>::infinity();
	int discrete = 0;
	for (std::size_t i = 0; i < inSource.size(); ++i)
	{
		const AudioChannelLabel label = inSource[i].mLabel;
		if (label != kAudioChannelLabel_Discrete && label == inLabel)
			return {i};
		if (label == kAudioChannelLabel_Discrete)
		{
			if (inSource.size() == 1)
				return {i};
			++discrete;
			if (inLabel == kAudioChannelLabel_Discrete && discrete == inDiscreteSeen)
				return {i};
		}
		if (IsLFE(inLabel) || IsLFE(label) || label == kAudioChannelLabel_Discrete
			|| inLabel == kAudioChannelLabel_Discrete)
			continue;
		const double distance = Distance(label, inLabel);
		if (distance < best)
		{
			best = distance;
			chosen.clear();
		}
		if (std::abs(best - distance) < 2.220446049250313e-14)
			chosen.push_back(i);
	}
	return chosen;
}

ChannelConversionMatrix Oracle(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination)
{
	ChannelConversionMatrix matrix(inDestination.size());
	const bool byLabel = inSource.size() == 1 || inDestination.size() == 1
		|| (HasChannelLabeling(inSource) && HasChannelLabeling(inDestination));
	int discreteSeen = 0;
	for (std::size_t j = 0; j < inDestination.size(); ++j)
	{
		const AudioChannelLabel label = inDestination[j].mLabel;
		discreteSeen += label == kAudioChannelLabel_Discrete;
		std::vector<std::size_t> chosen;
		if (byLabel)
			chosen = Chosen(inSource, label, discreteSeen);
		else if (j < inSource.size())
			chosen = {j};
		if (byLabel && chosen.empty() && inDestination.size() == 1 && label == kAudioChannelLabel_Discrete)
		{
			for (std::size_t i = 0; i < inSource.size(); ++i)
				chosen.push_back(i);
		}
		matrix[j].assign(inSource.size(), 0.0);
		for (const std::size_t i : chosen)
			matrix[j][i] = 1.0 / static_cast<double>(chosen.size());
	}
	return matrix;
}

ChannelConversionMatrix Convert(const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination)
{
	ChannelConversionMatrix matrix(3);
	ComputeChannelConversionMatrix(inSource, inDestination, matrix);
	return matrix;
}

// Short layouts of all labels, numbers that are none, and many Discrete channels.
AudioChannelLayout RandomLayout(std::mt19937& ioRandom)
{
	AudioChannelLayout layout(ioRandom() % 7);
	for (AudioChannelDescription& channel : layout)
	{
		const int value = static_cast<int>(ioRandom() % 60) + 90;   // [90, 149]
		channel = static_cast<AudioChannelLabel>(value < 100 ? 0 : value < 147 ? value : value - 150);
	}
	return layout;
}

TEST(ConversionMatrix, FollowsTheRuleForAllPairsOfLayouts)
{
	for (const NamedChannelLayout& from : AllChannelLayouts())
	{
		const AudioChannelLayout source(from.mLabels.begin(), from.mLabels.end());
		for (const NamedChannelLayout& to : AllChannelLayouts())
		{
			const AudioChannelLayout destination(to.mLabels.begin(), to.mLabels.end());
			ASSERT_EQ(Convert(source, destination), Oracle(source, destination)) << from.mName << " to " << to.mName;
		}
	}
}

TEST(ConversionMatrix, FollowsTheRuleForAnyLabels)
{
	std::mt19937 random(1);
	for (int i = 0; i < 20'000; ++i)
	{
		const AudioChannelLayout source = RandomLayout(random);
		const AudioChannelLayout destination = RandomLayout(random);
		ASSERT_EQ(Convert(source, destination), Oracle(source, destination)) << i;
	}
}

struct MatrixCase
{
	const char* mSource;
	const char* mDestination;
	ChannelConversionMatrix mMatrix;
};

TEST(ConversionMatrix, OfKnownLayouts)
{
	const std::vector<MatrixCase> cases = {
		{"L R", "L R C LFE Ls Rs", {{1, 0}, {0, 1}, {0.5, 0.5}, {0, 0}, {1, 0}, {0, 1}}},
		{"L R C LFE Ls Rs", "L R", {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}}, {"*", "L LFE *", {{1}, {1}, {1}}},
		{"L R", "*", {{0.5, 0.5}}}, {"L R LFE", "*", {{1.0 / 3, 1.0 / 3, 1.0 / 3}}}, {"* *", "*", {{1, 0}}},
		{"* *", "L", {{0, 0}}}, {"C", "* *", {{0}, {0}}}, {"* *", "L R", {{1, 0}, {0, 1}}},
		{"* * * *", "* * * * * *",
			{{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}, {0, 0, 0, 0}, {0, 0, 0, 0}}},
		{"L R", "", {}}, {"", "", {}}, {"", "L R", {{}, {}}}, {"", "*", {{}}}, {"L L", "L R", {{1, 0}, {0.5, 0.5}}},
		{"Lw L R", "L", {{0, 1, 0}}},   // the same label beats an equal position before it
		{"LFE2 L", "LFE", {{0, 0}}},
		{"5 L", "5 6 W", {{1, 0}, {1, 0}, {1, 0}}},   // numbers without a name stand at the origin
	};
	for (const MatrixCase& test : cases)
		EXPECT_EQ(Convert(ReadLayout(test.mSource), ReadLayout(test.mDestination)), test.mMatrix)
			<< test.mSource << " to " << test.mDestination;
}

// A host may let floating-point exceptions stop it.
TEST(ConversionMatrix, OfNoChannelsDividesNothing)
{
	std::feclearexcept(FE_ALL_EXCEPT);
	EXPECT_EQ(Convert(ReadLayout(""), ReadLayout("*")), (ChannelConversionMatrix{{}}));
	EXPECT_EQ(std::fetestexcept(FE_DIVBYZERO), 0);
}

TEST(ConversionMatrix, OfManyChannels)
{
	const AudioChannelLayout many(100'000, kAudioChannelLabel_FrontLeft);
	const ChannelConversionMatrix folded = Convert(many, ReadLayout("* "));
	ASSERT_EQ(folded.size(), 1u);
	EXPECT_EQ(folded[0], ChannelConversionMatrix::value_type(100'000, 1.0 / 100'000));
	const ChannelConversionMatrix spread = Convert(ReadLayout("*"), many);
	EXPECT_EQ(spread, ChannelConversionMatrix(100'000, {1.0}));
	const ChannelConversionMatrix nearest = Convert(many, ReadLayout("L Ls"));
	EXPECT_EQ(nearest[0][0], 1.0);
	EXPECT_EQ(nearest[0][1], 0.0);
	EXPECT_EQ(nearest[1][99'999], 1.0 / 100'000);
}

TEST(IdentityMatrix, IsCutOrPadded)
{
	const auto identity = [](unsigned long inSource, unsigned long inDestination)
	{
		ChannelConversionMatrix matrix(7);
		CreateIdentityChannelConversionMatrix(inSource, inDestination, matrix);
		return matrix;
	};
	EXPECT_EQ(identity(2, 3), (ChannelConversionMatrix{{1, 0}, {0, 1}, {0, 0}}));
	EXPECT_EQ(identity(3, 2), (ChannelConversionMatrix{{1, 0, 0}, {0, 1, 0}}));
	EXPECT_EQ(identity(0, 2), (ChannelConversionMatrix{{}, {}}));
	EXPECT_EQ(identity(2, 0), ChannelConversionMatrix());
	EXPECT_EQ(identity(std::numeric_limits<unsigned long>::max(), 0), ChannelConversionMatrix());
}

// ---- Reordering ------------------------------------------------------------------------------------------------------

struct OrderingCase
{
	const char* mSource;
	const char* mDestination;
	bool mFound;
	ChannelOrdering mOrdering;
};

TEST(ChannelOrdering, FindsTheSourceOfEachChannel)
{
	const ChannelOrdering untouched = {42};
	const std::vector<OrderingCase> cases = {
		{"L R C LFE Ls Rs", "L R Ls Rs C LFE", true, {0, 1, 4, 5, 2, 3}},
		{"L R", "", true, {}},
		{"", "", true, {}},
		{"", "L", false, untouched},
		{"L R C", "L R", false, untouched},
		{"L R", "L C", false, untouched},
		{"L R R", "R R L", true, {1, 1, 0}},   // no permutation
		{"* L *", "L * *", true, {1, 0, 2}},
		{"* L R", "* * L", false, untouched},
		{"5 -1", "-1 5", true, {1, 0}},
	};
	for (const OrderingCase& test : cases)
	{
		ChannelOrdering ordering = untouched;
		EXPECT_EQ(RemapChannelOrdering(ReadLayout(test.mSource), ReadLayout(test.mDestination), ordering), test.mFound);
		EXPECT_EQ(ordering, test.mOrdering) << test.mSource << " to " << test.mDestination;
	}
}

TEST(ChannelOrdering, OfManyNumberedChannels)
{
	AudioChannelLayout source = CreateMultichannelLayout(100'000);
	source.back() = kAudioChannelLabel_FrontLeft;
	const AudioChannelLayout destination(source.rbegin(), source.rend());
	ChannelOrdering ordering;
	ASSERT_TRUE(RemapChannelOrdering(source, destination, ordering));
	for (std::size_t i = 0; i < ordering.size(); ++i)
		ASSERT_EQ(ordering[i], i == 0 ? 99'999 : i - 1);
}

// ---- Labels for unlabelled channels ----------------------------------------------------------------------------------

struct RelabelCase
{
	const char* mSource;
	const char* mDestination;
	const char* mResult;   // null when nothing changes
};

TEST(ReplaceDiscreteLabels, GivesEachMissingLabelOnce)
{
	const std::vector<RelabelCase> cases = {
		{"L * *", "L R C", "L R C"},
		{"* * *", "L L R", "L R *"},
		{"* * *", "* C *", "C * *"},
		{"* *", "L R C", "L R"},
		{"* R", "R C L", "C R"},
		{"* 5", "5 6", "6 5"},
		{"L R", "C LFE", nullptr},
		{"* *", "", nullptr},
		{"* *", "* *", nullptr},
		{"L *", "L", nullptr},
		{"", "L R", nullptr},
	};
	const AudioChannelLayout untouched = ReadLayout("Pl");
	for (const RelabelCase& test : cases)
	{
		AudioChannelLayout layout = untouched;
		const bool hasChanged = ReplaceDiscreteLabelsWithDestinationLayoutLabels(
			ReadLayout(test.mSource), ReadLayout(test.mDestination), layout);
		EXPECT_EQ(hasChanged, test.mResult != nullptr) << test.mSource;
		EXPECT_EQ(layout, test.mResult != nullptr ? ReadLayout(test.mResult) : untouched) << test.mSource;
	}
}

TEST(ReplaceDiscreteLabels, OutputMayBeAnInput)
{
	AudioChannelLayout source = ReadLayout("* *");
	EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(source, ReadLayout("L R"), source));
	EXPECT_EQ(source, ReadLayout("L R"));
	AudioChannelLayout destination = ReadLayout("C LFE");
	EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ReadLayout("* L"), destination, destination));
	EXPECT_EQ(destination, ReadLayout("C L"));
}

TEST(ReplaceDiscreteLabels, OfManyChannels)
{
	const AudioChannelLayout many = CreateMultichannelLayout(100'000);
	AudioChannelLayout layout;
	EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(many, CreateVST22_2ChannelLayout(), layout));
	EXPECT_EQ(layout.size(), 100'000u);
	EXPECT_EQ(layout[23], kAudioChannelLabel_BottomFrontRight);
	EXPECT_EQ(layout[24], kAudioChannelLabel_Discrete);
}

}   // namespace
}   // namespace zonmediatypes
