#include "zoncore/MessageCatalogue.h"
#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zoncore::config
{
namespace
{

using testing::HasSubstr;
using Messages = std::vector<std::pair<std::string, std::string>>;

enum class ByteOrder
{
	LowestFirst,
	HighestFirst
};

void AppendWord(std::string& ioBytes, std::size_t inWord, ByteOrder inOrder)
{
	for (unsigned i = 0; i < 4; ++i)
		ioBytes.push_back(static_cast<char>(inWord >> 8 * (inOrder == ByteOrder::LowestFirst ? i : 3 - i)));
}

// The file of a catalogue with these messages, in this order.
std::string MakeCatalogue(const Messages& inMessages, ByteOrder inOrder = ByteOrder::LowestFirst)
{
	const std::size_t count = inMessages.size();
	std::string bytes;
	for (const std::size_t word : {std::size_t{0x950412DE}, std::size_t{0}, count, std::size_t{28}, 28 + 8 * count,
			 std::size_t{0}, std::size_t{0}})
		AppendWord(bytes, word, inOrder);
	std::size_t offset = 28 + 16 * count;
	std::string texts;
	const auto appendEntry = [&](const std::string& inText)
	{
		AppendWord(bytes, inText.size(), inOrder);
		AppendWord(bytes, offset + texts.size(), inOrder);
		texts += inText + '\0';
	};
	for (const auto& message : inMessages)
		appendEntry(message.first);
	for (const auto& message : inMessages)
		appendEntry(message.second);
	return bytes + texts;
}

const std::pair<std::string, std::string> kHeader = {"", "Content-Type: text/plain; charset=UTF-8\n"};
const Messages kGerman = {kHeader, {"$$$/a/Draft\4Draft", "Entwurf"}, {"$$$/a/Draft2\4Draft", "Entwurf 2"},
	{"$$$/a/High\4High", "Hoch"}, {"$$$/ab\4", "leer"}, {"Mono", "ohne Kontext"}};

TEST(MessageCatalogue, FindsByPathAndEnglishTextInEitherByteOrder)
{
	for (const ByteOrder order : {ByteOrder::LowestFirst, ByteOrder::HighestFirst})
	{
		MessageCatalogue catalogue;
		std::string error;
		ASSERT_TRUE(catalogue.Parse(MakeCatalogue(kGerman, order), error)) << error;
		EXPECT_EQ(catalogue.GetSize(), 5u);
		EXPECT_EQ(catalogue.Find("$$$/a/Draft=Draft"), "Entwurf");
		EXPECT_EQ(catalogue.Find("$$$/a/Draft2=Draft"), "Entwurf 2");
		EXPECT_EQ(catalogue.Find("$$$/a/High=High"), "Hoch");
		EXPECT_EQ(catalogue.Find("$$$/ab"), "leer");
		for (const std::string_view absent :
			{"$$$/a/Draft=Drafts", "$$$/a/Draf=Draft", "$$$/a/Draft3=Draft", "", "=", "Mono", "~=x"})
			EXPECT_EQ(catalogue.Find(absent), "") << absent;
	}
}

TEST(MessageCatalogue, RefusesDamageAndStaysAsItWas)
{
	const std::string sound = MakeCatalogue(kGerman);
	MessageCatalogue catalogue;
	std::string error;
	ASSERT_TRUE(catalogue.Parse(sound, error));

	const auto withWord = [&](std::size_t inAt, std::size_t inWord)
	{
		std::string bytes = sound;
		std::string word;
		AppendWord(word, inWord, ByteOrder::LowestFirst);
		return bytes.replace(inAt, 4, word);
	};
	const std::vector<std::pair<std::string, const char*>> damages = {
		{"", "too short"},
		{sound.substr(0, 27), "too short"},
		{"#!" + sound, "magic number"},
		{withWord(4, 0x20000), "unknown revision"},
		{withWord(8, 0xFFFFFFFF), "outside the file"},
		{withWord(12, 0xFFFFFFF8), "outside the file"},
		{withWord(16, sound.size() - 4), "outside the file"},
		{withWord(28 + 8, 0xFFFFFFFF), "message 1 lies outside"},
		{withWord(28 + 12, 0xFFFFFFFF), "message 1 lies outside"},
		{withWord(28 + 8, 3), "message 1 lies outside"},   // no zero byte behind the text
		{sound.substr(0, sound.size() - 1), "outside the file"},
		{MakeCatalogue({kHeader, {"b", ""}, {"a", ""}}), "sorted"},
		{MakeCatalogue({kHeader, {"a", ""}, {"a", ""}}), "sorted"},
		{MakeCatalogue({{"", "charset=ISO-8859-1"}, {"a", "b"}}), "charset=UTF-8"},
		{MakeCatalogue({{"a", "b"}}), "charset=UTF-8"},
	};
	for (const auto& [bytes, message] : damages)
	{
		EXPECT_FALSE(catalogue.Parse(bytes, error)) << message;
		EXPECT_THAT(error, HasSubstr(message));
	}
	EXPECT_EQ(catalogue.Find("$$$/a/Draft=Draft"), "Entwurf");

	// Every single flipped bit either is refused or leaves a catalogue that can be searched.
	for (std::size_t bit = 0; bit < 8 * sound.size(); ++bit)
	{
		std::string bytes = sound;
		bytes[bit / 8] = static_cast<char>(bytes[bit / 8] ^ 1 << bit % 8);
		MessageCatalogue other;
		if (other.Parse(bytes, error))
			other.Find("$$$/a/Draft=Draft");
	}
}

TEST(MessageCatalogue, SaysWhyAFileCannotBeRead)
{
	MessageCatalogue catalogue;
	std::string error;
	EXPECT_FALSE(catalogue.Load("no/such/catalogue.mo", error));
	EXPECT_EQ(error, "no/such/catalogue.mo: cannot be opened: No such file or directory");
	EXPECT_FALSE(catalogue.Load(".", error));
	EXPECT_THAT(error, HasSubstr("cannot be read"));
}

TEST(MessageCatalogue, IsAskedAfterTheTranslatorAndBeforeTheEnglishText)
{
	auto catalogue = std::make_shared<MessageCatalogue>();
	std::string error;
	ASSERT_TRUE(catalogue->Parse(MakeCatalogue(kGerman), error)) << error;
	Localizer& localizer = Localizer::Get();
	const auto lookup = [&](std::string_view inKey) { return utility::UTF16to8(localizer.Lookup(inKey)); };

	localizer.SetCatalogue(catalogue);
	localizer.SetTranslator(
		[](std::string_view inKey, UTF16String& outText)
		{
			outText = utility::AsciiToUTF16("host");
			return inKey.starts_with("$$$/a/High");
		});
	EXPECT_EQ(lookup("$$$/a/High=High"), "host");
	EXPECT_EQ(lookup("$$$/a/Draft=Draft"), "Entwurf");
	EXPECT_EQ(lookup("$$$/a/Low=Low"), "Low");
	localizer.SetTranslator({});
	EXPECT_EQ(lookup("$$$/a/High=High"), "Hoch");
	localizer.SetCatalogue({});
	EXPECT_EQ(lookup("$$$/a/High=High"), "High");
}

}   // namespace
}   // namespace zoncore::config
