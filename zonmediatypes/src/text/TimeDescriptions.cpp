#include "zonmediatypes/Descriptions.h"

#include "zoncore/Localizer.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/src/text/TextKeys.h"
#include "zonmediatypes/src/text/TimeTextKeys.h"
#include "zonmediatypes/src/time/RateText.h"
#include "zonmediatypes/src/timecode/TimeDisplayTable.h"

#include <algorithm>
#include <boost/lexical_cast.hpp>
#include <string>

namespace zonmediatypes
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::config::Localizer;
using zoncore::utility::UTF16to8;
using zoncore::utility::UTF8to16;

namespace
{

constexpr bool IsDescribed(const TimeDisplayRow& inRow)
{
	return std::ranges::find(kTimeDisplayKeys, inRow.mDisplay, &KeyFor<TimeDisplay>::mValue) != kTimeDisplayKeys.end();
}
static_assert(std::ranges::all_of(kTimeDisplayTable,
				  [](const TimeDisplayRow& inRow)
				  {
					  const bool isDisplay = inRow.mKind != DisplayKind::Auto && inRow.mKind != DisplayKind::None;
					  return IsDescribed(inRow) == isDisplay;
				  }),
	"every display but the automatic one has a description");

UTF16String RateFormat(FrameRate inRate)
{
	const bool isAudio = inRate.GetTicksPerFrame() <= kFrameRate_Audio8000.GetTicksPerFrame();
	return Localizer::Get().Lookup(isAudio ? kAudioRateKey : kVideoRateKey);
}

}   // namespace

UTF16String FrameRateDescription(FrameRate inRate)
{
	const UTF16String format = RateFormat(inRate);
	const UTF16String number = UTF8to16(boost::lexical_cast<std::string>(inRate));
	return zoncore::FillPlaceholders(format, {&number, 1});
}

std::size_t FrameRateDescription(std::span<UTF16Char> outText, FrameRate inRate)
{
	const UTF16String number = RateText(inRate);
	return zoncore::FillPlaceholders(outText, RateFormat(inRate), {&number, 1});
}

std::size_t FrameRateDescription(std::span<char> outText, FrameRate inRate)
{
	const UTF16String number = RateText(inRate);
	const std::string text = UTF16to8(zoncore::FillPlaceholders(RateFormat(inRate), {&number, 1}));
	if (text.size() <= outText.size())
		std::ranges::copy(text, outText.begin());
	return text.size();
}

UTF16String TimeDisplayDescription(TimeDisplay inDisplay)
{
	return Describe<TimeDisplay>(kTimeDisplayKeys, inDisplay);
}

}   // namespace zonmediatypes
