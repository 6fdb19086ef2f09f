#pragma once

#include <atomic>
#include <functional>
#include <memory>
#include <mutex>
#include <utility>

namespace zoncore
{

/// An immutable value that may be replaced at any time, from any thread, while others use it: users hold the value that
/// they found for as long as they need it, and no lock meanwhile. To find none costs one atomic load. Instances are
/// constant-initialised and never destroyed: they serve static objects to the end of the process.
template <class Value>
class Replaceable
{
public:
	constexpr Replaceable() : mState() {}
	Replaceable(const Replaceable&) = delete;
	Replaceable& operator=(const Replaceable&) = delete;
	~Replaceable() {}   // deliberately leaves mState alone

	/// The current value; null when there is none.
	std::shared_ptr<const Value> Get() const
	{
		if (!mState.mIsThere.load(std::memory_order_acquire))
			return {};
		const std::lock_guard lock(mState.mMutex);
		return mState.mValue;
	}

	/// Stores inValue, null for none, and returns the value before it.
	std::shared_ptr<const Value> Exchange(std::shared_ptr<const Value> inValue)
	{
		const std::lock_guard lock(mState.mMutex);
		mState.mIsThere.store(inValue != nullptr, std::memory_order_release);
		mState.mValue.swap(inValue);
		return inValue;
	}

private:
	struct State
	{
		std::atomic<bool> mIsThere = false;
		mutable std::mutex mMutex;
		std::shared_ptr<const Value> mValue;
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

	/// The installed function; null when there is none.
	std::shared_ptr<const Function> Get() const { return mFunction.Get(); }

	/// Installs inFunction, an empty one for none, and returns the one before it.
	Function Exchange(Function inFunction)
	{
		const auto before
			= mFunction.Exchange(inFunction ? std::make_shared<const Function>(std::move(inFunction)) : nullptr);
		return before ? *before : Function();
	}

private:
	Replaceable<Function> mFunction;
};

}   // namespace zoncore
