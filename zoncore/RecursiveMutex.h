#pragma once

/// \file
/// A mutex that the thread which holds it may lock again.

#include "zoncore/Mutex.h"

namespace zoncore::threads
{

/// Re-entrant for the thread that holds it; each Lock wants its Unlock.
class RecursiveMutex
{
public:
	/// Blocks until the calling thread holds the mutex. inName names the code that takes the lock, for people who look at
	/// a stuck process; it changes nothing. Throws std::system_error when the lock cannot be taken.
	void Lock([[maybe_unused]] const char* inName) const { mMutex.lock(); }

	/// Gives back one Lock of the calling thread.
	void Unlock() const noexcept { mMutex.unlock(); }

private:
	mutable StandardRecursiveMutex mMutex;
};

}   // namespace zoncore::threads
