#include "zoncore/CheckRegistry.h"

#include <algorithm>
#include <exception>
#include <iterator>
#include <mutex>
#include <set>
#include <utility>

namespace zoncore
{
namespace
{

bool RunCheck(const CheckRegistry::Check& inCheck, std::string& outMessage)
{
	try
	{
		return inCheck(outMessage);
	}
	catch (const std::exception& error)
	{
		outMessage = error.what();
	}
	catch (...)
	{
		outMessage = "an exception of an unknown type";
	}
	return false;
}

}   // namespace

CheckRegistry& CheckRegistry::Get()
{
	// Made by the first library that registers; never destroyed, since libraries are unloaded in any order.
	static CheckRegistry& sRegistry = *new CheckRegistry;
	return sRegistry;
}

void CheckRegistry::Register(std::string_view inSuite, std::string_view inCheck, Check inCheckFunction)
{
	const std::lock_guard lock(mMutex);
	const auto found = std::ranges::find_if(
		mEntries, [&](const Entry& inEntry) { return inEntry.mSuite == inSuite && inEntry.mName == inCheck; });
	if (found == mEntries.end())
		mEntries.push_back({std::string(inSuite), std::string(inCheck), std::move(inCheckFunction)});
	else
		found->mCheck.swap(inCheckFunction);   // the one that was there ends with the call, without the lock
}

std::vector<std::string> CheckRegistry::GetSuites() const
{
	std::set<std::string> suites;
	{
		const std::lock_guard lock(mMutex);
		for (const Entry& entry : mEntries)
			suites.insert(entry.mSuite);
	}
	return {suites.begin(), suites.end()};
}

bool CheckRegistry::Run(std::string_view inSuite, const Report& inReport) const
{
	std::vector<Entry> entries;
	{
		const std::lock_guard lock(mMutex);
		std::ranges::copy_if(
			mEntries, std::back_inserter(entries), [&](const Entry& inEntry) { return inEntry.mSuite == inSuite; });
	}
	bool passed = !entries.empty();
	for (const Entry& entry : entries)
	{
		std::string message;
		const bool checkPassed = RunCheck(entry.mCheck, message);
		if (inReport)
			inReport(entry.mName, checkPassed, message);
		passed = passed && checkPassed;
	}
	return passed;
}

}   // namespace zoncore
