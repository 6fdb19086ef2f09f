#include "zoncore/CheckRegistry.h"

#include <algorithm>
#include <exception>

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
	std::vector<NamedCheck>& checks = mSuites.try_emplace(std::string(inSuite)).first->second;
	const auto found = std::ranges::find(checks, inCheck, &NamedCheck::first);
	if (found == checks.end())
		checks.emplace_back(inCheck, std::move(inCheckFunction));
	else
		found->second = std::move(inCheckFunction);
}

std::vector<std::string> CheckRegistry::GetSuites() const
{
	const std::lock_guard lock(mMutex);
	std::vector<std::string> suites;
	for (const auto& [suite, checks] : mSuites)
		suites.push_back(suite);
	return suites;
}

bool CheckRegistry::Run(std::string_view inSuite, const Report& inReport) const
{
	std::vector<NamedCheck> checks;
	{
		const std::lock_guard lock(mMutex);
		if (const auto found = mSuites.find(inSuite); found != mSuites.end())
			checks = found->second;
	}
	bool passed = !checks.empty();
	for (const auto& [name, check] : checks)
	{
		std::string message;
		const bool checkPassed = RunCheck(check, message);
		inReport(name, checkPassed, message);
		passed = passed && checkPassed;
	}
	return passed;
}

}   // namespace zoncore
