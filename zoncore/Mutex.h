#pragma once

/// \file
/// The mutexes of the standard library, where it has them as this project needs them.

#include "zoncore/Export.h"

#include <mutex>

/// Whether programs for this system have threads at all.
#if defined(__wasm__) && !defined(_REENTRANT)
	#define ZONCORE_HAS_THREADS 0
#else
	#define ZONCORE_HAS_THREADS 1
#endif

namespace zoncore::threads
{

#if !ZONCORE_HAS_THREADS

/// A program with one thread has nothing to lock.
class Mutex
{
public:
	void lock() noexcept {}
	void unlock() noexcept {}
};

using StandardRecursiveMutex = Mutex;

#elif defined(_WIN32)

/// A mutex that is there before any code runs and needs no destruction: static objects take it in any order. Windows' own
/// is such a one, std::mutex there is not.
class ZONCORE_API Mutex
{
public:
	constexpr Mutex() noexcept = default;
	Mutex(const Mutex&) = delete;
	Mutex& operator=(const Mutex&) = delete;
	~Mutex() = default;

	void lock() noexcept;
	void unlock() noexcept;

private:
	void* mState = nullptr;   // a slim reader/writer lock of the system
};

using StandardRecursiveMutex = std::recursive_mutex;

#else

using Mutex = std::mutex;
using StandardRecursiveMutex = std::recursive_mutex;

#endif

}   // namespace zoncore::threads
