#pragma once

/// \file
/// How a violated contract is reported: through a reporter that the host may replace.

#include "zoncore/Export.h"
#include "zoncore/UTF16String.h"

#include <functional>
#include <stdexcept>
#include <vector>

namespace zoncore::config
{

/// A text that fills a placeholder of an error's message.
using ReplacementValue = UTF16String;

/// Receives the level (0 for a violated contract), the key of the message (English text after "=") and the texts for its
/// placeholders, which live as long as the call. It may throw, which the caller of the failing operation sees, or return,
/// after which the operation proceeds unchecked. It is called with no lock held, from any thread and by several at once.
using ErrorReporter
	= std::function<void(int inLevel, const char* inKey, const std::vector<ReplacementValue>& inValues)>;

/// What the default reporter throws; what() is the English text of the key.
class ZONCORE_API Error : public std::runtime_error
{
public:
	/// A null inKey is an empty one.
	Error(int inLevel, const char* inKey);
	~Error() override;
	Error(const Error&) = default;
	Error& operator=(const Error&) = default;

	int GetLevel() const noexcept { return mLevel; }
	/// The whole key, "=" and English text included; valid as long as the error.
	const char* GetKey() const noexcept { return mKey.what(); }

private:
	int mLevel;
	std::runtime_error mKey;   // a string whose copy cannot throw
};

/// Installs inReporter and returns a copy of the one before it; an empty one stands for the default, which throws Error.
/// Any thread may call it while others report: a report that has begun ends with the reporter it began with.
ZONCORE_API ErrorReporter SetErrorReporter(ErrorReporter inReporter);

/// Hands an error to the installed reporter; returns when the reporter does.
ZONCORE_API void ThrowError(int inLevel, const char* inKey, const std::vector<ReplacementValue>& inValues = {});

}   // namespace zoncore::config
