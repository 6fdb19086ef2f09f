#pragma once

#include <cstdlib>

namespace zontest
{

/// How far a walk over a whole day or a whole catalogue goes, or by which step: inWhole, and inShort under
/// ZON_SHORT_WALKS=1, where the same tests run many times over.
template <class T>
T WalkLength(T inWhole, T inShort)
{
	return std::getenv("ZON_SHORT_WALKS") != nullptr ? inShort : inWhole;
}

}   // namespace zontest
