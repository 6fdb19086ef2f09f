#include "zoncore/MessageCatalogue.h"

#include "tests/Allocations.h"
#include "tests/CatalogueFile.h"
#include "tests/Platform.h"
#include "tests/WithTranslator.h"
#include "zoncore/StringUtils.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

namespace
{

using namespace zoncore;
using namespace zoncore::config;

using testing::HasSubstr;
using zontest::MakeCatalogue;
using zontest::Messages;
using zontest::Word;

const Messages::value_type kHeader = {"", "Content-Type: text/plain; charset=UTF-8\n"};
const Messages kGerman = {kHeader, {"$$$/a/Draft\4Draft", "Entwurf"}, {"$$$/a/Draft2\4Draft", "Entwurf 2"},
	{"$$$/a/High\4High", "Hoch"}, {"$$$/ab\4", "leer"}, {"Mono", "ohne Kontext"}};

TEST(MessageCatalogue, FindsByPathAndEnglishTextInEitherByteOrder)
{
	for (const bool isHighestFirst : {false, true})
	{
		MessageCatalogue catalogue;
		std::string error;
		ASSERT_TRUE(catalogue.Parse(MakeCatalogue(kGerman, isHighestFirst), error)) << error;
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

	const auto withWord
		= [&](std::size_t inAt, std::size_t inWord) { return std::string(sound).replace(inAt, 4, Word(inWord)); };
	EXPECT_TRUE(catalogue.Parse(withWord(4, 0x1FFFF), error));
	for (const auto& [bytes, complaint] : std::initializer_list<std::pair<std::string, const char*>>{
			 {"", "too short"},
			 {sound.substr(0, 27), "too short"},
			 {"#!" + sound, "magic number"},
			 {withWord(4, 0x20000), "unknown revision"},
			 {withWord(8, 0xFFFFFFFF), "a table of messages lies outside"},
			 {withWord(8, 0x20000000 + kGerman.size()),
				 "a table of messages lies outside"},   // bytes that wrap at 32 bits
			 {withWord(12, 0xFFFFFFF8), "a table of messages lies outside"},
			 {withWord(16, sound.size() - 4), "a table of messages lies outside"},
			 {withWord(28 + 8, 0xFFFFFFFF), "message 1 lies outside"},
			 {withWord(28 + 12, 0xFFFFFFFF), "message 1 lies outside"},
			 {withWord(28 + 40, 0xFFFFFFFF), "message 5 lies outside"},   // the last one, a zero byte before it
			 {withWord(28 + 8, 3), "message 1 lies outside"},             // no zero byte behind the text
			 {sound.substr(0, sound.size() - 1), "message 5 lies outside"},
			 {MakeCatalogue({kHeader, {"b", ""}, {"a", ""}}), "message 2 is not in its sorted place"},
			 {MakeCatalogue({kHeader, {"a", ""}, {"a", ""}}), "sorted"},
			 {MakeCatalogue({{"", "charset=ISO-8859-1"}, {"a", "b"}}), "charset=UTF-8"},
			 {MakeCatalogue({{"a", "b"}}), "charset=UTF-8"},
		 })
	{
		EXPECT_FALSE(catalogue.Parse(bytes, error)) << complaint;
		EXPECT_THAT(error, HasSubstr(complaint));
	}
	const std::string other = MakeCatalogue({kHeader, {"$$$/a/Draft\4Draft", "anders"}});
	EXPECT_GT(zontest::FailEachAllocation([&] { catalogue.Parse(other, error); },
				  [&] { EXPECT_EQ(catalogue.Find("$$$/a/Draft=Draft"), "Entwurf"); }),
		0);
	EXPECT_EQ(catalogue.Find("$$$/a/Draft=Draft"), "anders");

	// Every single flipped bit either is refused or leaves a catalogue that can be searched.
	for (std::size_t bit = 0; bit < 8 * sound.size(); ++bit)
	{
		std::string bytes = sound;
		bytes[bit / 8] = static_cast<char>(bytes[bit / 8] ^ 1 << bit % 8);
		if (catalogue.Parse(bytes, error))
			catalogue.Find("$$$/a/Draft=Draft");
	}
}

TEST(MessageCatalogue, IsReadFromFilesOfUpTo64MB)
{
	MessageCatalogue catalogue;
	std::string error;
	EXPECT_FALSE(catalogue.Load("no/such/catalogue.mo", error));
	EXPECT_EQ(error, "no/such/catalogue.mo: cannot be opened: No such file or directory");
	EXPECT_FALSE(catalogue.Load(".", error));
	EXPECT_TRUE(error.starts_with(".: cannot be read: ") || error == ".: cannot be opened: Permission denied")
		<< error;   // a folder; Windows does not even open one

	const std::string path = testing::TempDir() + "MessageCatalogueTest-" + zontest::ProcessId();
	std::ofstream(path, std::ios::binary) << MakeCatalogue(kGerman);
	for (const unsigned size : {64u << 20, (64u << 20) + 1})
	{
		std::filesystem::resize_file(path, size);   // what follows the texts is not looked at
		EXPECT_EQ(catalogue.Load(path, error), size == 64u << 20) << error;
	}
	EXPECT_THAT(error, HasSubstr("at most 64 MB"));
	EXPECT_EQ(catalogue.Find("$$$/a/Draft=Draft"), "Entwurf");
	std::filesystem::remove(path);
	EXPECT_TRUE(catalogue.Parse(MakeCatalogue({}), error));
}

TEST(MessageCatalogue, IsAskedAfterTheTranslatorAndBeforeTheEnglishText)
{
	const auto catalogue = std::make_shared<MessageCatalogue>();
	std::string error;
	ASSERT_TRUE(catalogue->Parse(MakeCatalogue(kGerman), error)) << error;
	Localizer::Get().SetCatalogue(catalogue);
	const auto lookup = [](std::string_view inKey) { return utility::UTF16to8(Localizer::Get().Lookup(inKey)); };
	{
		const zontest::WithTranslator translator(
			[](std::string_view inKey, UTF16String& outText)
			{
				outText = utility::AsciiToUTF16("host");
				return inKey.starts_with("$$$/a/High");
			});
		EXPECT_EQ(lookup("$$$/a/High=High"), "host");
		EXPECT_EQ(lookup("$$$/a/Draft=Draft"), "Entwurf");
		EXPECT_EQ(lookup("$$$/a/Low=Low"), "Low");
	}
	EXPECT_EQ(lookup("$$$/a/High=High"), "Hoch");
	Localizer::Get().SetCatalogue({});
	EXPECT_EQ(lookup("$$$/a/High=High"), "High");
}

}   // namespace
