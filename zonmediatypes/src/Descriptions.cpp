#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/src/TextKeys.h"
#include "zonmediatypes/src/TimeTextKeys.h"

#include <boost/lexical_cast.hpp>
#include <string>

namespace zonmediatypes
{

using zoncore::UTF16String;
using zoncore::config::Localizer;

// ---- Time ------------------------------------------------------------------------------------------------------------

UTF16String FrameRateDescription(FrameRate inRate)
{
	const bool isAudio = inRate.GetTicksPerFrame() <= kFrameRate_Audio8000.GetTicksPerFrame();
	const UTF16String format = Localizer::Get().Lookup(isAudio ? kAudioRateKey : kVideoRateKey);
	const UTF16String number = zoncore::utility::UTF8to16(boost::lexical_cast<std::string>(inRate));
	return zoncore::FillPlaceholders(format, {&number, 1});
}

UTF16String TimeDisplayDescription(TimeDisplay inDisplay)
{
	return Describe<TimeDisplay>(kTimeDisplayKeys, inDisplay);
}

// ---- Audio -----------------------------------------------------------------------------------------------------------

// ---- Video -----------------------------------------------------------------------------------------------------------

// ---- Keys ------------------------------------------------------------------------------------------------------------

namespace
{

constexpr auto sAllTextKeys = JoinKeys(kTimeTextKeys);

}   // namespace

std::span<const std::string_view> AllTextKeys() noexcept
{
	return sAllTextKeys;
}

}   // namespace zonmediatypes
