// The core layer beside the C and C++ libraries: each pair of functions does the same work on the same data.

#include "Comparison.h"

#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/SmallBlockAllocator.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"

#include <array>
#include <boost/rational.hpp>
#include <clocale>
#include <cstddef>
#include <cstdio>
#include <cstdlib>
#include <libintl.h>
#include <memory>
#include <new>
#include <string>
#include <vector>

namespace benchmarks
{
namespace
{

using namespace zoncore;            // NOLINT(google-build-using-namespace)
using namespace zoncore::utility;   // NOLINT(google-build-using-namespace)

// ---- Small blocks ----------------------------------------------------------------------------------------------------

struct PoolMemory
{
	static void* Allocate(std::size_t inSize) { return SmallBlockAllocator::Allocate(inSize); }
	static void Dispose(void* inBlock, std::size_t inSize) { SmallBlockAllocator::Dispose(inBlock, inSize); }
};

struct SystemMemory
{
	static void* Allocate(std::size_t inSize) { return ::operator new(inSize); }
	static void Dispose(void* inBlock, std::size_t) { ::operator delete(inBlock); }
};

template <class Memory>
Work OneBlock(std::size_t inSize)
{
	return [inSize](benchmark::State& ioState)
	{
		for (auto _ : ioState)
		{
			void* const block = Memory::Allocate(inSize);
			benchmark::DoNotOptimize(block);
			Memory::Dispose(block, inSize);
		}
	};
}

template <class Memory>
Work ManyBlocks(std::size_t inSize)
{
	return [inSize](benchmark::State& ioState)
	{
		std::vector<void*> blocks(1'000);
		for (auto _ : ioState)
		{
			for (void*& block : blocks)
				block = Memory::Allocate(inSize);
			benchmark::DoNotOptimize(blocks.data());
			for (void* const block : blocks)
				Memory::Dispose(block, inSize);
		}
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(blocks.size()));
	};
}

// ---- Translations ----------------------------------------------------------------------------------------------------

constexpr const char* kDomain = "zonmediatypes";

std::vector<std::string_view> Keys()
{
	return {zonmediatypes::AllTextKeys().begin(), zonmediatypes::AllTextKeys().end()};
}

std::shared_ptr<const config::MessageCatalogue> German()
{
	auto catalogue = std::make_shared<config::MessageCatalogue>();
	std::string error;
	catalogue->Load(std::string(ZON_CATALOGUES "/de/LC_MESSAGES/") + kDomain + ".mo", error);
	return catalogue;
}

Work FindMessage()
{
	return ForEach(Keys, [german = German()](std::string_view inKey) { return german->Find(inKey); });
}

Work LookupWithCatalogue()
{
	return [](benchmark::State& ioState)
	{
		config::Localizer::Get().SetCatalogue(German());
		ForEach(Keys, [](std::string_view inKey) { return config::Localizer::Get().Lookup(inKey); })(ioState);
		config::Localizer::Get().SetCatalogue(nullptr);
	};
}

// The peer takes a key as a catalogue has it, and translates in no locale that is called "C".
Work PeerFindMessage()
{
	const auto keys = []
	{
		std::vector<std::string> result;
		for (const std::string_view key : Keys())
			result.emplace_back(key).at(key.find('=')) = '\4';
		return result;
	};
	return [keys](benchmark::State& ioState)
	{
		std::setlocale(LC_MESSAGES, "C.UTF-8");
		setenv("LANGUAGE", "de", 1);
		bindtextdomain(kDomain, ZON_CATALOGUES);
		bind_textdomain_codeset(kDomain, "UTF-8");
		ForEach(keys, [](const std::string& inKey) { return dgettext(kDomain, inKey.c_str()); })(ioState);
		std::setlocale(LC_MESSAGES, "C");
	};
}

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Core";
	constexpr const char* kNew = "operator new";
	for (const std::size_t size : {24U, 200U})
		Compare(kArea, "a block of " + std::to_string(size) + " bytes, served and taken back",
			OneBlock<PoolMemory>(size), {{kNew, OneBlock<SystemMemory>(size)}});
	Compare(
		kArea, "1,000 blocks of 40 bytes, a block", ManyBlocks<PoolMemory>(40), {{kNew, ManyBlocks<SystemMemory>(40)}});

	Compare(kArea, "look-up of a text without a translator",
		Repeat(
			[]
			{
				return config::Localizer::Get().Lookup(
					"$$$/zonmediatypes/TimeDisplay/2997DropTimecode=29.97 fps Drop-Frame Timecode");
			}));
	Compare(kArea, "template with three texts filled in",
		Repeat([texts = std::array{AsciiToUTF16("1920"), AsciiToUTF16("1080"), AsciiToUTF16("1.0")}]() -> UTF16String
			{ return ZString("$$$/zonmediatypes/VideoFrameSizeFormatPAR=@0w @1h (@2)", texts); }));
	Compare(kArea, "template with three texts filled into a buffer (of char there)",
		Repeat([pattern = AsciiToUTF16("@0w @1h (@2)"),
				   texts = std::array{AsciiToUTF16("1920"), AsciiToUTF16("1080"), AsciiToUTF16("1.0")},
				   text = std::array<UTF16Char, 40>()]() mutable
			{ return FillPlaceholders(std::span(text), pattern, texts); }),
		{{"snprintf",
			Repeat(
				[texts = std::array<std::string, 3>{"1920", "1080", "1.0"}, text = std::array<char, 40>()]() mutable
				{
					return std::snprintf(
						text.data(), text.size(), "%sw %sh (%s)", texts[0].c_str(), texts[1].c_str(), texts[2].c_str());
				})}});
	if (German()->GetSize() != 0)   // where gettext compiled it
	{
		Compare(kArea, "message of a catalogue", FindMessage(), {{"gettext", PeerFindMessage()}});
		Compare(kArea, "look-up of a text with a catalogue", LookupWithCatalogue());
	}
	for (const auto& [name, character] :
		{std::pair("1,000 ASCII characters", "x"), std::pair("1,000 x \"€\"", "\u20AC")})
	{
		std::string text;
		for (int i = 0; i < 1'000; ++i)
			text += character;
		Compare(kArea, std::string("UTF-8 to UTF-16, ") + name, Repeat([text] { return UTF8to16(text); }));
		Compare(
			kArea, std::string("UTF-16 to UTF-8, ") + name, Repeat([text = UTF8to16(text)] { return UTF16to8(text); }));
	}

	Compare(kArea, "a double as text",
		Repeat([value = 30'000 / 1'001.0] { return NumberToString(value, 1, 4, kNumberFlag_DropTrailingZeros, 31); }),
		{{"snprintf",
			Repeat([value = 30'000 / 1'001.0, text = std::array<char, 40>()]() mutable
				{ return std::snprintf(text.data(), text.size(), "%.4f", value); })}});
	Compare(kArea, "a double from text",
		Repeat(
			[text = AsciiToUTF16("29.97002997")]
			{
				double value = 0;
				StringToNumber(text, value, 0);
				return value;
			}),
		{{"strtod", Repeat([text = std::string("29.97002997")] { return std::strtod(text.c_str(), nullptr); })}});
	Compare(kArea, "a double as the closest fraction",
		ForEach(
			[] {
				return std::vector{29.97, 23.976, 59.94, 0.9091, 1.0667};
			},
			[](double inValue) { return RationalApproximation(inValue); }));
	return true;
}();

}   // namespace
}   // namespace benchmarks
