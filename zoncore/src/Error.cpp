#include "zoncore/Error.h"

#include "zoncore/src/Hook.h"
#include "zoncore/src/TextKey.h"

#include <string>
#include <utility>

namespace zoncore::config
{
namespace
{

constinit Hook<void(int, const char*, const std::vector<ReplacementValue>&)> sReporter;

const char* OrEmpty(const char* inText)
{
	return inText != nullptr ? inText : "";
}

}   // namespace

Error::Error(int inLevel, const char* inKey)
	: std::runtime_error(std::string(EnglishText(OrEmpty(inKey)))), mLevel(inLevel), mKey(OrEmpty(inKey))
{
}

Error::~Error() = default;

ErrorReporter SetErrorReporter(ErrorReporter inReporter)
{
	return sReporter.Exchange(std::move(inReporter));
}

void ThrowError(int inLevel, const char* inKey, const std::vector<ReplacementValue>& inValues)
{
	const auto reporter = sReporter.Get();
	if (!reporter)
		throw Error(inLevel, inKey);
	(*reporter)(inLevel, inKey, inValues);
}

}   // namespace zoncore::config
