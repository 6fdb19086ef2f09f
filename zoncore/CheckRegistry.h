#pragma once

/// \file
/// The host's registry of self-checks: libraries register theirs at load, the host lists and runs them.

#include "zoncore/Export.h"
#include "zoncore/Mutex.h"

#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace zoncore
{

/// Checks by suite. All members are safe on any thread; a check runs with no lock held and may use the registry.
class ZONCORE_API CheckRegistry
{
public:
	/// True when it passes; outMessage says what was wrong when it does not. A check that throws has failed.
	using Check = std::function<bool(std::string& outMessage)>;
	using Report = std::function<void(std::string_view inCheck, bool inPassed, std::string_view inMessage)>;

	/// The registry of this process.
	static CheckRegistry& Get();

	/// Adds a check to a suite, or replaces the one of that name in it, in its place. Costs time linear in the number of
	/// checks that are registered.
	void Register(std::string_view inSuite, std::string_view inCheck, Check inCheckFunction);

	/// The names of all suites, sorted.
	std::vector<std::string> GetSuites() const;

	/// Runs the checks of a suite in the order of their registration and reports each one; true when every one passed.
	/// A suite that nobody registered has no checks to pass: false, and nothing is reported. An empty inReport is told
	/// nothing. What inReport throws ends the run and reaches the caller.
	bool Run(std::string_view inSuite, const Report& inReport) const;

private:
	struct Entry
	{
		std::string mSuite;
		std::string mName;
		Check mCheck;
	};

	mutable threads::Mutex mMutex;
	std::vector<Entry> mEntries;   // in the order of registration
};

}   // namespace zoncore
