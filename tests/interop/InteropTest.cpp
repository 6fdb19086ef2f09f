#include "zonmediatypes/interop/Fmt.h"
#include "zonmediatypes/interop/Hash.h"
#include "zonmediatypes/interop/Streams.h"
#include "zonmediatypes/interop/Strings.h"

#include <gmock/gmock.h>

#include <iomanip>
#include <type_traits>
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

// Tolerant equality has no hash that agrees with it.
static_assert(!std::is_default_constructible_v<std::hash<PixelAspectRatio>>);

// ---- Hashes ----------------------------------------------------------------------------------------------------------

TEST(Hashes, DifferByEveryFieldAndServeAsKeys)
{
	const PixelFormat vuya = kPixelFormat_VUYA_4444_8u;
	const std::vector<std::size_t> differing[] = {
		{Hash(RectT<int>{1, 2, 3, 4}), Hash(RectT<int>{2, 1, 3, 4}), Hash(RectT<int>{1, 2, 4, 3})},
		{Hash(PointT<int>{1, 2}), Hash(PointT<int>{2, 1})},
		{Hash(AudioChannelLayout()), Hash(CreateMultichannelLayout(1)), Hash(CreateMultichannelLayout(2))},
		{Hash(vuya), Hash(PixelFormat{{}, vuya.mProperties}), Hash(PixelFormat{vuya.mName, {}})},
		{Hash(kPixelFormatProperties_Any), Hash(kPixelFormatProperties_Invalid)},
		{Hash(zoncore::Flags<unsigned>(1)), Hash(zoncore::Flags<unsigned>(2))},
		{Hash(kFrameRate_VideoNTSC), Hash(kFrameRate_VideoNTSC_HD)},
	};
	for (const auto& hashes : differing)
		EXPECT_EQ(std::unordered_set<std::size_t>(hashes.begin(), hashes.end()).size(), hashes.size());

	std::unordered_map<AudioChannelLayout, std::string_view> names;
	for (const NamedChannelLayout& layout : AllChannelLayouts())
		names.try_emplace(AudioChannelLayout(layout.mLabels.begin(), layout.mLabels.end()), layout.mName);
	EXPECT_EQ(names.at(CreateVST22_2ChannelLayout()), "VST22_2");
	EXPECT_EQ(names.count(CreateMultichannelLayout(3)), 0u);
	const std::unordered_map<zoncore::UTF16String, int> texts{{FromUTF8("Länge"), 1}, {FromUTF8("L"), 2}};
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
	const std::string text = "Länge \U0001D11E";   // with a character beyond 16 bits
	EXPECT_EQ(ToUTF8(FromUTF8(text)), text);
	EXPECT_EQ(ToU16String(FromUTF8(text)), u"Länge \U0001D11E");
	EXPECT_EQ(FromU16String(u"Länge \U0001D11E"), FromUTF8(text));
	const std::u16string lone(1, char16_t{0xD834});
	EXPECT_EQ(ToU16String(FromU16String(lone)), lone);
	EXPECT_EQ(ToUTF8(FromU16String(lone)), "\uFFFD");
}

// ---- Streams and fmt -------------------------------------------------------------------------------------------------

template <class T>
std::string Stream(const T& inValue)
{
	std::ostringstream stream;
	stream.imbue(std::locale::classic());
	stream << inValue;
	return stream.str();
}

template <class T>
void ExpectText(const T& inValue, const std::string& inText)
{
	EXPECT_EQ(Stream(inValue), inText);
#ifdef FMT_VERSION
	EXPECT_EQ(fmt::format("{}", inValue), inText);
#endif
}

TEST(Streams, WriteEveryValue)
{
	ExpectText(TickTime(kTicksPerSecond * 3 / 2), "1.5");
	ExpectText(kFrameRate_23976, "23.976");
	ExpectText(TimeBase::FromRate(kFrameRate_VideoNTSC).value(), "1001/30000 s");
	ExpectText(kAudioChannelLabel_BackLeft, "Ls");
	ExpectText(kAudioChannelLabel_Discrete, "*");
	ExpectText(static_cast<AudioChannelLabel>(120), "label 120");
	ExpectText(AudioChannelDescription(kAudioChannelLabel_LFE2), "LFE2");
	ExpectText(CreateBroadcast51ChannelLayout(), "L R C LFE Ls Rs");
	ExpectText(AudioChannelLayout(), "no channels");
	ExpectText(AudioFormat::CreateDefaultAudioFormat(2, 48'000), "48000 Hz, 32 bits, L R");
	ExpectText(AudioFormat(), "0 Hz, 0 bits, no channels");
	ExpectText(MakePixelFormatName('v', '2', '1', '0'), "v210");
	ExpectText(kPixelFormatFourCC_Any, "any");
	ExpectText(MakePixelFormatName('a', 'b', 'c', '\0'), "0x636261");
	ExpectText(MakePixelFormatName('a', '\n', 'c', 'd'), "0x64630a61");
	ExpectText(kPixelFormat_VUYA_4444_8u.mProperties, "0x400c1");
	ExpectText(kPixelFormat_VUYA_4444_8u, "VUYA 4444 8u");
	ExpectText(kPixelAspectRatio_DVNTSC, "0.9091");
	ExpectText(PointT<int>{1'920, -1}, "(1920, -1)");
	ExpectText(RectT<int>{0, 1, 1'920, 1'080}, "(0, 1, 1920, 1080)");
	ExpectText(zoncore::Flags<unsigned char>(0x1B), "0x1b");
	EXPECT_EQ(Stream(FromUTF8("Länge")), "Länge");
	ExpectText(
		utility::BeatInfo{
			.iTicksPerBeat = -1, .dTempo = 92.5, .iBeatsPerBar = 6, .iBeatValue = 8, .dOffsetMilliseconds = 0},
		"92.5 in 6/8, -1 ticks a beat, from 0 ms");
	ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
	map.AddChannel(CreateQuadraphonicChannelLayout(), -1);
	ExpectText(map, "L -> 0, R -> 1, L R Ls Rs -> none");
	ExpectText(ChannelMap(), "no entries");

	std::ostringstream padded;
	padded << std::setw(12) << std::setfill('.') << PointT<int>{1, 2} << std::setw(5) << CreateStereoChannelLayout();
	EXPECT_EQ(padded.str(), "......(1, 2)..L R");
}

}   // namespace
