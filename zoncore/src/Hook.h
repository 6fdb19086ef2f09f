#pragma once

#include <atomic>
#include <functional>
#include <memory>
#include <mutex>
#include <utility>

namespace zoncore
{

/// A function that the host may replace at any time, from any thread. Callers hold the function that they found for as
/// long as they use it, and no lock while they call it. An empty function costs its users one atomic load. Instances are
/// constant-initialised and never destroyed: they serve static objects to the end of the process.
template <class Signature>
class Hook
{
public:
	using Function = std::function<Signature>;
	using Pointer = std::shared_ptr<const Function>;

	constexpr Hook() : mState() {}
	Hook(const Hook&) = delete;
	Hook& operator=(const Hook&) = delete;
	~Hook() {}   // deliberately leaves mState alone

	/// The installed function; null when there is none.
	Pointer Get() const
	{
		if (!mState.mIsInstalled.load(std::memory_order_acquire))
			return {};
		const std::lock_guard lock(mState.mMutex);
		return mState.mFunction;
	}

	/// Installs inFunction and returns a copy of the one before it. When copying throws, nothing has changed.
	Function Exchange(Function inFunction)
	{
		const Pointer next = MakePointer(std::move(inFunction));
		for (;;)
		{
			const Pointer previous = Get();
			Function copy = previous ? *previous : Function();
			if (ReplaceIfStill(previous, next))
				return copy;
		}
	}

	/// Installs inFunction; the one before it is not copied.
	void Set(Function inFunction)
	{
		const Pointer next = MakePointer(std::move(inFunction));
		while (!ReplaceIfStill(Get(), next))
			continue;
	}

private:
	static Pointer MakePointer(Function inFunction)
	{
		return inFunction ? std::make_shared<const Function>(std::move(inFunction)) : nullptr;
	}

	// The host's functions are copied and destroyed without the lock: the caller holds inPrevious.
	bool ReplaceIfStill(const Pointer& inPrevious, const Pointer& inNext)
	{
		const std::lock_guard lock(mState.mMutex);
		if (mState.mFunction != inPrevious)
			return false;
		mState.mFunction = inNext;
		mState.mIsInstalled.store(inNext != nullptr, std::memory_order_release);
		return true;
	}

	struct State
	{
		std::atomic<bool> mIsInstalled = false;
		mutable std::mutex mMutex;
		Pointer mFunction;
	};
	union
	{
		State mState;
	};
};

}   // namespace zoncore
