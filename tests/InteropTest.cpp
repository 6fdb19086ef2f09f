#include "zonmediatypes/interop/Hash.h"
#include "zonmediatypes/interop/Strings.h"

#include <gmock/gmock.h>

#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace
{

using namespace zonmediatypes;
using zoncore::PointT;
using zoncore::RectT;

template <class T>
std::size_t Hash(const T& inValue)
{
	return std::hash<T>()(inValue);
}

// ---- Hashes ----------------------------------------------------------------------------------------------------------

TEST(Hashes, AreEqualForEqualValuesAndDifferByField)
{
	EXPECT_EQ(Hash(kFrameRate_VideoNTSC * 2), Hash(kFrameRate_VideoNTSC_HD));
	const std::vector<RectT<int>> rects{{1, 2, 3, 4}, {2, 1, 3, 4}, {1, 2, 4, 3}, {1, 2, 3, 5}, {0, 2, 3, 4}};
	std::unordered_set<std::size_t> hashes;
	for (const RectT<int>& rect : rects)
		hashes.insert(Hash(rect));
	EXPECT_EQ(hashes.size(), rects.size());
	EXPECT_NE(Hash(PointT<int>{1, 2}), Hash(PointT<int>{2, 1}));
	EXPECT_NE(Hash(AudioChannelLayout()), Hash(CreateMultichannelLayout(1)));
	EXPECT_NE(Hash(CreateMultichannelLayout(2)), Hash(CreateMultichannelLayout(3)));
	EXPECT_NE(Hash(zoncore::Flags<unsigned int>(1)), Hash(zoncore::Flags<unsigned int>(2)));
}

TEST(Hashes, ServeAsKeys)
{
	std::unordered_map<AudioChannelLayout, std::string_view> names;
	for (const NamedChannelLayout& layout : AllChannelLayouts())
		names.try_emplace(AudioChannelLayout(layout.mLabels.begin(), layout.mLabels.end()), layout.mName);
	EXPECT_EQ(names.at(CreateVST22_2ChannelLayout()), "VST22_2");
	EXPECT_EQ(names.count(CreateMultichannelLayout(3)), 0u);

	std::unordered_map<zoncore::UTF16String, int> texts{{FromUTF8("Länge"), 1}, {FromUTF8("L"), 2}};
	EXPECT_EQ(texts.at(FromUTF8("Länge")), 1);
}

// Times lie on frames, so their low bits are all alike; tables of a power of two look at low bits only.
TEST(Hashes, SpreadTimesThatLieOnFrames)
{
	std::vector<int> buckets(256);
	for (int frame = 0; frame < 25'600; ++frame)
	{
		TickTime time;
		time.AddFrames(frame, kFrameRate_Film24);
		++buckets[Hash(time) % buckets.size()];
	}
	EXPECT_THAT(buckets, testing::Each(testing::AllOf(testing::Gt(50), testing::Lt(170))));
}

// ---- Strings ---------------------------------------------------------------------------------------------------------

TEST(Strings, ConvertBothWays)
{
	const std::string text = "Länge \xF0\x9D\x84\x9E";   // with a character beyond 16 bits
	EXPECT_EQ(ToUTF8(FromUTF8(text)), text);
	EXPECT_EQ(ToU16String(FromUTF8(text)), u"Länge \U0001D11E");
	EXPECT_EQ(FromU16String(u"Länge \U0001D11E"), FromUTF8(text));
	const std::u16string lone(1, char16_t{0xD834});
	EXPECT_EQ(ToU16String(FromU16String(lone)), lone);
	EXPECT_EQ(ToUTF8(FromU16String(lone)), "\uFFFD");
}

}   // namespace
