#pragma once

#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zontest
{

/// A translator that writes down which keys it is asked for, for as long as it lives. It translates all of them alike, or
/// none.
class KeyRecorder
{
public:
	explicit KeyRecorder(const std::string& inTranslation = {})
	{
		zoncore::config::Localizer::Get().SetTranslator(
			[this, inTranslation](std::string_view inKey, zoncore::UTF16String& outText)
			{
				mKeys.emplace_back(inKey);
				outText = zoncore::utility::AsciiToUTF16(inTranslation);
				return !inTranslation.empty();
			});
	}
	KeyRecorder(const KeyRecorder&) = delete;
	KeyRecorder& operator=(const KeyRecorder&) = delete;
	~KeyRecorder() { zoncore::config::Localizer::Get().SetTranslator({}); }

	std::vector<std::string> TakeKeys() { return std::exchange(mKeys, {}); }

private:
	std::vector<std::string> mKeys;
};

}   // namespace zontest
