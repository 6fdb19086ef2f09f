#pragma once

#include "zoncore/Mutex.h"

#include <atomic>
#include <functional>
#include <memory>
#include <mutex>
#include <utility>

namespace zoncore
{

/// An immutable value that may be replaced at any time, from any thread. Users hold the value that they found for as long
/// as they need it, and no lock meanwhile. To find none costs one atomic load. Instances are constant-initialised and never
/// destroyed: they serve static objects to the end of the process.
template <class Value>
class Replaceable
{
public:
	using Pointer = std::shared_ptr<const Value>;

	constexpr Replaceable() : mState() {}
	Replaceable(const Replaceable&) = delete;
	Replaceable& operator=(const Replaceable&) = delete;
	~Replaceable() {}   // deliberately leaves mState alone

	/// The current value; null when there is none.
	Pointer Get() const
	{
		if (!mState.mIsThere.load(std::memory_order_acquire))
			return {};
		const std::lock_guard lock(mState.mMutex);
		return mState.mValue;
	}

	/// Stores inNext, null for none.
	void Set(const Pointer& inNext)
	{
		while (!ReplaceIfStill(Get(), inNext))
			continue;
	}

	/// Stores inNext unless the value is no longer inPrevious, which the caller holds: what the host gave is copied and
	/// destroyed without the lock.
	bool ReplaceIfStill(const Pointer& inPrevious, const Pointer& inNext)
	{
		const std::lock_guard lock(mState.mMutex);
		if (mState.mValue != inPrevious)
			return false;
		mState.mValue = inNext;
		mState.mIsThere.store(inNext != nullptr, std::memory_order_release);
		return true;
	}

private:
	struct State
	{
		std::atomic<bool> mIsThere = false;
		mutable threads::Mutex mMutex;
		Pointer mValue;
	};
	union
	{
		State mState;
	};
};

/// A function that the host may replace.
template <class Signature>
class Hook
{
public:
	using Function = std::function<Signature>;
	using Pointer = std::shared_ptr<const Function>;

	/// The installed function; null when there is none.
	Pointer Get() const { return mFunction.Get(); }

	/// Installs inFunction and returns a copy of the one before it. When copying throws, nothing has changed.
	Function Exchange(Function inFunction)
	{
		const Pointer next = MakePointer(std::move(inFunction));
		for (;;)
		{
			const Pointer previous = Get();
			Function copy = previous ? *previous : Function();
			if (mFunction.ReplaceIfStill(previous, next))
				return copy;
		}
	}

	/// Installs inFunction; the one before it is not copied.
	void Set(Function inFunction) { mFunction.Set(MakePointer(std::move(inFunction))); }

private:
	static Pointer MakePointer(Function inFunction)
	{
		return inFunction ? std::make_shared<const Function>(std::move(inFunction)) : nullptr;
	}

	Replaceable<Function> mFunction;
};

}   // namespace zoncore
