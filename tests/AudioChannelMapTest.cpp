#include "zonmediatypes/AudioChannelMap.h"

#include "tests/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <sstream>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace zonmediatypes
{
namespace
{

constexpr int kLowest = std::numeric_limits<std::int32_t>::min();
constexpr int kHighest = std::numeric_limits<std::int32_t>::max();

const AudioChannelLayout sCanonicalOrder
	= ReadLayout("L R C LFE Ls Rs Lc Rc Cs Lsd Rsd Ts Vhl Vhc Vhr "
				 "Tbl Tbc Tbr Lw Rw Tsl Tsr Rls Rrs LFE2 Lt Rt W X Y Z Bfl Bfc Bfr Pl Pr");

static_assert(std::has_virtual_destructor_v<ChannelMap> && std::is_nothrow_move_constructible_v<ChannelMap>);
static_assert(!std::is_convertible_v<int, ChannelMap> && !std::is_convertible_v<AudioChannelLayout, ChannelMap>);

// A map written as text: "0:L R|1:C|-1:" has three entries.
ChannelMap ReadMap(const std::string& inText)
{
	ChannelMap map;
	std::istringstream entries(inText);
	for (std::string entry; std::getline(entries, entry, '|');)
	{
		const auto colon = entry.find(':');
		map.AddChannel(ReadLayout(entry.substr(colon + 1)), std::stoi(entry.substr(0, colon)));
	}
	return map;
}

TEST(ChannelMap, OfACountHasTheCanonicalLabelsUnassigned)
{
	for (const int count : {-1, 0, 1, 3, 36, 40})
	{
		const ChannelMap map(count);
		ASSERT_EQ(map.GetNumberOfChannels(), static_cast<std::size_t>(std::max(count, 0)));
		for (int i = 0; i < count; ++i)
		{
			const auto label
				= i < 36 ? sCanonicalOrder[static_cast<std::size_t>(i)].mLabel : static_cast<AudioChannelLabel>(-1);
			EXPECT_EQ(map.GetChannelLayout(i), AudioChannelLayout{label}) << i;
			EXPECT_EQ(map[i], -1);
		}
	}
	EXPECT_EQ(ChannelMap(), ChannelMap(kLowest));
	EXPECT_EQ(ChannelMap(ReadLayout("C * C")), ReadMap("-1:C|-1:*|-1:C"));
}

TEST(ChannelMap, DefaultsRouteEachChannelToItself)
{
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(1), ReadMap("0:*"));
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(2), ReadMap("0:L|1:R"));
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(3), ReadMap("0:L|1:R|2:C"));
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(6), ReadMap("0:L|1:R|2:C|3:LFE|4:Ls|5:Rs"));
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(8), ReadMap("0:L|1:R|2:C|3:LFE|4:Ls|5:Rs|6:Lc|7:Rc"));
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(0), ChannelMap());
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(-5), ChannelMap());
	EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(38)[37], 37);
}

TEST(ChannelMap, CopiesAreDeep)
{
	const ChannelMap map = ReadMap("0:L R|1:C");
	ChannelMap copy = map;
	EXPECT_EQ(copy, map);
	copy.SetChannelLayout(1, ReadLayout("LFE"));
	EXPECT_NE(copy, map);
	EXPECT_EQ(map, ReadMap("0:L R|1:C"));
	copy = map;
	EXPECT_EQ(copy, map);
	copy = *&copy;
	EXPECT_EQ(copy, map);
	EXPECT_NE(map, ReadMap("0:L R|2:C"));
	EXPECT_NE(map, ReadMap("0:R L|1:C"));
	EXPECT_NE(map, ReadMap("0:L R"));
}

TEST(ChannelMap, IgnoresEntriesOutsideIt)
{
	const ChannelMap original = ReadMap("0:L|1:R");
	ChannelMap map = original;
	for (const int index : {kLowest, -1, 2, kHighest})
	{
		map.SetChannel(index, 5);
		map.SetChannelLayout(index, ReadLayout("C"));
		EXPECT_EQ(map, original);
		EXPECT_EQ(map[index], -1);
		EXPECT_EQ(map.GetChannelLayout(index), AudioChannelLayout());
		EXPECT_EQ(map.Find(index), -1);
	}
	map.SetChannel(1, 5);
	map.SetChannelLayout(0, ReadLayout("C LFE"));
	EXPECT_EQ(map, ReadMap("0:C LFE|5:R"));
	EXPECT_EQ(map.Find(5), 1);
}

TEST(ChannelMap, CountsTheLabelsOfTheEntriesThatAssignmentsName)
{
	EXPECT_EQ(ChannelMap().GetNumberOfAssignments(), 0u);
	EXPECT_EQ(ChannelMap(4).GetNumberOfAssignments(), 0u);
	EXPECT_EQ(ReadMap("0:L R|1:C").GetNumberOfAssignments(), 3u);
	EXPECT_EQ(ReadMap("1:L R|1:C").GetNumberOfAssignments(), 2u);   // entry 1 twice
	EXPECT_EQ(ReadMap("0:L R|2:C|-1:Ls").GetNumberOfAssignments(), 3u);
}

TEST(ChannelMap, FindsTheChannelOfALabel)
{
	const ChannelMap map = ReadMap("7:L R|3:C|4:C Pr|-1:LFE");
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kAudioChannelLabel_FrontRight), 7);
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kAudioChannelLabel_FrontCenter), 3);
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kAudioChannelLabel_LowFrequency), -1);
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kAudioChannelLabel_BackLeft), -1);

	const ChannelMap all = ChannelMap::CreateDefaultChannelMap(36);
	for (int i = 0; i < 36; ++i)
		EXPECT_EQ(all.GetSourceChannelIndexForChannelLabelIndex(i), i);
	for (const int index : {36, kHighest, -1, kLowest})
		EXPECT_EQ(all.GetSourceChannelIndexForChannelLabelIndex(index), -2);
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(35), 4);
	EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(34), -1);
}

struct MoveCase
{
	const char* mBefore;
	const char* mLabel;
	int mChannel;
	const char* mAfter;
};

TEST(ChannelMap, MovesALabel)
{
	const std::vector<MoveCase> cases = {
		{"0:L|1:R", "L", 1, "1:R L"},
		{"0:L|1:R", "L", 0, "1:R|0:L"},       // emptied and made anew
		{"0:L R|1:C", "L", 0, "0:R L|1:C"},   // last of its entry
		{"0:L|1:R", "L", -1, "1:R"},
		{"0:L|1:R", "C", -1, "0:L|1:R"},
		{"0:L|1:R", "C", 5, "0:L|1:R|5:C"},
		{"0:L|1:R", "C", 1, "0:L|1:R C"},
		{"", "C", 0, "0:C"},
		{"0:L L|1:L", "L", 1, "0:L|1:L"},   // one occurrence goes, and the target has it
		{"-1:L|1:R", "L", 1, "1:R L"},
		{"0:L|0:R|1:C", "R", 2, "0:L|1:C|2:R"},   // the first assignment to 0 goes: equal values
		{"0:|1:L|2:R", "L", 3, "0:|2:R|3:L"},     // the empty entry that goes is not the one emptied
		{"5:|5:L|2:R", "L", 2, "5:|2:R L"},
	};
	for (const MoveCase& test : cases)
	{
		ChannelMap map = ReadMap(test.mBefore);
		map.SetDeviceChannelIndexForChannelLabel(LabelByAbbreviation(test.mLabel), test.mChannel);
		EXPECT_EQ(map, ReadMap(test.mAfter)) << test.mBefore << " : " << test.mLabel << " to " << test.mChannel;
	}
}

TEST(ChannelMap, ErasesFirstEmptyLabelsAndFirstEqualAssignmentOnTheirOwn)
{
	// Two entries are assigned to 0: emptying the second erases its labels but the assignment of the first.
	ChannelMap map = ReadMap("0:L|7:C|0:R");
	map.SetDeviceChannelIndexForChannelLabel(kAudioChannelLabel_FrontRight, -1);
	EXPECT_EQ(map, ReadMap("7:L|0:C"));
}

}   // namespace
}   // namespace zonmediatypes
