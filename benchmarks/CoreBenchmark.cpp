#include "zoncore/Localizer.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/SmallBlockAllocator.h"
#include "zoncore/StringUtils.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <new>
#include <string>
#include <vector>

// The core layer beside the standard library: each pair of functions does the same work on the same data.

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
void OneBlock(benchmark::State& ioState)
{
	const auto size = static_cast<std::size_t>(ioState.range(0));
	for (auto _ : ioState)
	{
		void* const block = Memory::Allocate(size);
		benchmark::DoNotOptimize(block);
		Memory::Dispose(block, size);
	}
}
BENCHMARK(OneBlock<PoolMemory>)->Arg(24)->Arg(200);
BENCHMARK(OneBlock<SystemMemory>)->Arg(24)->Arg(200);

template <class Memory>
void ManyBlocks(benchmark::State& ioState)
{
	std::vector<void*> blocks(1'000);
	for (auto _ : ioState)
	{
		for (void*& block : blocks)
			block = Memory::Allocate(40);
		for (void* const block : blocks)
			Memory::Dispose(block, 40);
	}
	ioState.SetItemsProcessed(ioState.iterations() * 1'000);
}
BENCHMARK(ManyBlocks<PoolMemory>)->Threads(1)->Threads(2);
BENCHMARK(ManyBlocks<SystemMemory>)->Threads(1)->Threads(2);

// ---- Text ------------------------------------------------------------------------------------------------------------

void LookupWithoutTranslator(benchmark::State& ioState)
{
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(
			config::Localizer::Get().Lookup("$$$/zonmediatypes/TimeDisplay/2997DF=29.97 fps Drop-Frame"));
	}
}
BENCHMARK(LookupWithoutTranslator);

void FillTemplate(benchmark::State& ioState)
{
	const std::array texts{AsciiToUTF16("1920"), AsciiToUTF16("1080"), AsciiToUTF16("1.0")};
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(ZString("$$$/zonmediatypes/VideoFrameSizeFormatPAR=@0w @1h (@2)", texts));
	}
}
BENCHMARK(FillTemplate);

void FromUTF8(benchmark::State& ioState)
{
	const std::string text = ioState.range(0) == 0
		? std::string(1'000, 'x')
		: std::string("\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xAC latin ") + std::string(500, 'x') + "\xE2\x82\xAC";
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(UTF8to16(text));
	}
	ioState.SetBytesProcessed(ioState.iterations() * static_cast<std::int64_t>(text.size()));
}
BENCHMARK(FromUTF8)->Arg(0)->Arg(1);

void ToUTF8(benchmark::State& ioState)
{
	const UTF16String text(1'000, ioState.range(0) == 0 ? UTF16Char{'x'} : UTF16Char{0x20AC});
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(UTF16to8(text));
	}
	ioState.SetBytesProcessed(ioState.iterations() * static_cast<std::int64_t>(2 * text.size()));
}
BENCHMARK(ToUTF8)->Arg(0)->Arg(1);

// ---- Numbers ---------------------------------------------------------------------------------------------------------

void WriteDouble(benchmark::State& ioState)
{
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(NumberToString(30'000 / 1'001.0, 1, 4, kNumberFlag_DropTrailingZeros, 31));
	}
}
BENCHMARK(WriteDouble);

void WriteDoubleSnprintf(benchmark::State& ioState)
{
	for (auto _ : ioState)
	{
		std::array<char, 40> text;
		std::snprintf(text.data(), text.size(), "%.4f", 30'000 / 1'001.0);
		benchmark::DoNotOptimize(text);
	}
}
BENCHMARK(WriteDoubleSnprintf);

void ReadDouble(benchmark::State& ioState)
{
	const UTF16String text = AsciiToUTF16("29.97002997");
	for (auto _ : ioState)
	{
		double value = 0;
		benchmark::DoNotOptimize(StringToNumber(text, value, 0));
		benchmark::DoNotOptimize(value);
	}
}
BENCHMARK(ReadDouble);

void ReadDoubleStrtod(benchmark::State& ioState)
{
	const std::string text = "29.97002997";
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(std::strtod(text.c_str(), nullptr));
	}
}
BENCHMARK(ReadDoubleStrtod);

void ApproximateFraction(benchmark::State& ioState)
{
	double value = 29.97;
	for (auto _ : ioState)
	{
		benchmark::DoNotOptimize(value);
		benchmark::DoNotOptimize(RationalApproximation(value));
	}
}
BENCHMARK(ApproximateFraction);

}   // namespace
