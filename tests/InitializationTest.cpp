#include "zonmediatypes/ZONMediaTypes.h"
#include "zonmediatypes/src/InitializationCount.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

namespace zonmediatypes
{
namespace
{

TEST(Initialization, CountsClientsAndGoesBelowZero)
{
	const auto start = InitializationCount();
	Initialize();
	Initialize();
	Terminate();
	EXPECT_EQ(InitializationCount(), start + 1);
	Terminate();
	Terminate();
	EXPECT_EQ(InitializationCount(), start - 1);
	Initialize();
}

TEST(Initialization, LosesNoCallOfManyThreads)
{
	constexpr int kCalls = 10'000;
	const auto start = InitializationCount();
	const auto call = [](void (*inFunction)())
	{
		for (int i = 0; i < kCalls; ++i)
			inFunction();
	};
	std::vector<std::thread> threads;
	for (int i = 0; i < 3; ++i)
		threads.emplace_back(call, Initialize);
	for (int i = 0; i < 2; ++i)
		threads.emplace_back(call, Terminate);
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(InitializationCount(), start + kCalls);
	for (int i = 0; i < kCalls; ++i)
		Terminate();
}

}   // namespace
}   // namespace zonmediatypes
