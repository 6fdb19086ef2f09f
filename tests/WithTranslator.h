#pragma once

#include "zoncore/Localizer.h"

#include <utility>

namespace zontest
{

/// The host's translator for as long as it lives.
class WithTranslator
{
public:
	explicit WithTranslator(zoncore::config::Translator inTranslator)
	{
		zoncore::config::Localizer::Get().SetTranslator(std::move(inTranslator));
	}
	WithTranslator(const WithTranslator&) = delete;
	WithTranslator& operator=(const WithTranslator&) = delete;
	~WithTranslator() { zoncore::config::Localizer::Get().SetTranslator({}); }
};

}   // namespace zontest
