#pragma once

#include "fuzz/FuzzInput.h"
#include "zoncore/SourcePlace.h"

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <vector>

namespace zonfuzz
{

/// Ends the program, for the fuzzer to record the input, when an invariant does not hold.
inline void Require(bool inCondition, const char* inWhat, const char* inFile = zoncore::debug::SourceFile(),
	int inLine = zoncore::debug::SourceLine())
{
	if (inCondition)
		return;
	std::fprintf(stderr, "%s:%d: does not hold: %s\n", inFile, inLine, inWhat);
	std::abort();
}

/// A target is a list of checks. Each takes its arguments off the input and requires what must hold for them.
using Check = void (*)(FuzzInput& ioInput);

/// Which checks of the target have run, for the replay to tell what its inputs never reach; empty for a target without.
inline std::vector<bool> sReachedChecks;

/// Runs the check that the first byte chooses on the bytes behind it. Returns what the fuzzer expects of a target.
template <std::size_t inCount>
int RunOneOf(const Check (&inChecks)[inCount], const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	const std::size_t chosen = input.Below(inCount);
	sReachedChecks.resize(inCount);
	sReachedChecks[chosen] = true;
	inChecks[chosen](input);
	return 0;
}

}   // namespace zonfuzz
