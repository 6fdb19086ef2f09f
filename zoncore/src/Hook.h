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

	constexpr Hook() : mState() {}
	Hook(const Hook&) = delete;
	Hook& operator=(const Hook&) = delete;
	~Hook() {}   // deliberately leaves mState alone

	/// The installed function; null when there is none.
	std::shared_ptr<const Function> Get() const
	{
		if (!mState.mIsInstalled.load(std::memory_order_acquire))
			return {};
		const std::lock_guard lock(mState.mMutex);
		return mState.mFunction;
	}

	/// Installs inFunction and returns the one before it.
	Function Exchange(Function inFunction)
	{
		std::shared_ptr<const Function> function
			= inFunction ? std::make_shared<const Function>(std::move(inFunction)) : nullptr;
		{
			const std::lock_guard lock(mState.mMutex);
			mState.mFunction.swap(function);
			mState.mIsInstalled.store(mState.mFunction != nullptr, std::memory_order_release);
		}
		return function ? *function : Function();
	}

private:
	struct State
	{
		std::atomic<bool> mIsInstalled = false;
		mutable std::mutex mMutex;
		std::shared_ptr<const Function> mFunction;
	};
	union
	{
		State mState;
	};
};

}   // namespace zoncore
