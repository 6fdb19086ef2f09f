#include "zonmediatypes/AudioChannelMap.h"

#include "tests/audio/AudioTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <sstream>
#include <string>
#include <type_traits>

namespace
{

using namespace zonmediatypes;

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

TEST(ChannelMap, OfACountHasTheCanonicalLabels)
{
	for (const int count : {kLowest, -1, 0, 1, 2, 3, 6, 8, 36, 40})
	{
		const ChannelMap map(count);
		const ChannelMap routed = ChannelMap::CreateDefaultChannelMap(count);
		ASSERT_EQ(map.GetNumberOfChannels(), static_cast<std::size_t>(std::max(count, 0)));
		ASSERT_EQ(routed.GetNumberOfChannels(), map.GetNumberOfChannels());
		EXPECT_EQ(map.GetNumberOfAssignments(), 0u);
		for (int i = 0; i < count; ++i)
		{
			const auto label
				= i < 36 ? sCanonicalOrder[static_cast<std::size_t>(i)] : static_cast<AudioChannelLabel>(-1);
			EXPECT_EQ(map.GetChannelLayout(i), AudioChannelLayout{label}) << i;
			EXPECT_EQ(routed.GetChannelLayout(i), count == 1 ? ReadLayout("*") : AudioChannelLayout{label}) << i;
			EXPECT_EQ(map[i], -1);
			EXPECT_EQ(routed[i], i);
		}
	}
	EXPECT_EQ(ChannelMap(ReadLayout("C * C")), ReadMap("-1:C|-1:*|-1:C"));
}

TEST(ChannelMap, ComparesAndCopiesAllOfIt)
{
	const ChannelMap map = ReadMap("0:L R|1:C");
	for (const char* const other : {"0:L R|1:LFE", "0:L R|2:C", "0:R L|1:C", "0:L R"})
	{
		ChannelMap copy = ReadMap(other);
		EXPECT_NE(copy, map);
		copy = map;
		EXPECT_EQ(copy, map);
		copy.SetChannelLayout(1, ReadLayout("Cs"));
		EXPECT_EQ(map, ReadMap("0:L R|1:C"));
	}
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

TEST(ChannelMap, CountsAndFindsLabels)
{
	EXPECT_EQ(ReadMap("0:L R|1:C").GetNumberOfAssignments(), 3u);
	EXPECT_EQ(
		ReadMap("1:L R|1:C").GetNumberOfAssignments(), 2u);   // of the entries that assignments name: entry 1 twice
	EXPECT_EQ(ReadMap("0:L R|2:C|-1:Ls").GetNumberOfAssignments(), 3u);

	const ChannelMap map = ReadMap("7:L R|3:C|4:C Pr|-1:LFE");
	for (const auto& [label, channel] : {std::pair("R", 7), {"C", 3}, {"LFE", -1}, {"Ls", -1}})
		EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(LabelByAbbreviation(label)), channel);
	const ChannelMap all = ChannelMap::CreateDefaultChannelMap(36);
	for (int i = 0; i < 36; ++i)
		EXPECT_EQ(all.GetSourceChannelIndexForChannelLabelIndex(i), i);
	for (const int index : {36, kHighest, -1, kLowest})
		EXPECT_EQ(all.GetSourceChannelIndexForChannelLabelIndex(index), -2);
}

TEST(ChannelMap, MovesALabel)
{
	struct Case
	{
		const char *mBefore, *mLabel;
		int mChannel;
		const char* mAfter;
	};
	for (const auto& [before, label, channel, after] : std::initializer_list<Case>{
			 {"0:L|1:R", "L", 1, "1:R L"},
			 {"0:L|1:R", "L", 0, "1:R|0:L"},
			 {"0:L R|1:C", "L", 0, "0:R L|1:C"},
			 {"0:L|1:R", "L", -1, "1:R"},
			 {"0:L|1:R", "C", -1, "0:L|1:R"},
			 {"0:L|1:R", "C", 5, "0:L|1:R|5:C"},
			 {"", "C", 0, "0:C"},
			 {"-1:L|1:R", "L", 1, "1:R L"},
			 {"0:L L|1:L", "L", 1, "0:L|1:L"},         // one occurrence goes, and the target has it
			 {"0:L|0:R|1:C", "R", 2, "0:L|1:C|2:R"},   // the first assignment to 0 goes: equal values
			 {"0:L|7:C|0:R", "R", -1, "7:L|0:C"},      // the same, while the labels of the second go
			 {"0:|1:L|2:R", "L", 3, "0:|2:R|3:L"},     // the empty entry that goes is not the one emptied
			 {"5:|5:L|2:R", "L", 2, "5:|2:R L"},
		 })
	{
		ChannelMap map = ReadMap(before);
		map.SetDeviceChannelIndexForChannelLabel(LabelByAbbreviation(label), channel);
		EXPECT_EQ(map, ReadMap(after)) << before << " : " << label << " to " << channel;
	}
}

}   // namespace
