#include "zonmediatypes/Timecode.h"

#include "zonmediatypes/src/timecode/TimecodeFields.h"

#include <algorithm>

namespace zonmediatypes
{

void TimeToHMSF(unsigned int& outHours, unsigned int& outMinutes, unsigned int& outSeconds,
	unsigned long long& outFrames, bool& outNegative, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	const HMSF fields = FieldsOf(inTime, inRate, inDisplay);
	outHours = fields.mHours;
	outMinutes = fields.mMinutes;
	outSeconds = fields.mSeconds;
	outFrames = fields.mFrames;
	outNegative = inTime.GetTicks() <= LastNegativeTick(inRate, FindTimeDisplay(inDisplay));
}

std::size_t TimesToHMSF(std::span<TimecodeFields> outFields, std::span<const TickTime> inTimes, FrameRate inRate,
	TimeDisplay inDisplay) noexcept
{
	const std::size_t count = std::min(outFields.size(), inTimes.size());
	const std::int64_t lastNegative = LastNegativeTick(inRate, FindTimeDisplay(inDisplay));
	WithSplitter<zoncore::utility::Reciprocal>(inRate, inDisplay,
		[=](auto inSplit)
		{
			for (std::size_t i = 0; i < count; ++i)
			{
				const HMSF fields = inSplit(inTimes[i]);
				outFields[i] = {fields.mHours, fields.mMinutes, fields.mSeconds, inTimes[i].GetTicks() <= lastNegative,
					fields.mFrames};
			}
		});
	return count;
}

TickTime HMSFToTime(unsigned int inHours, unsigned int inMinutes, unsigned int inSeconds, unsigned long long inFrames,
	bool inNegative, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	return FieldsToTime({inHours, inMinutes, inSeconds, inFrames}, inNegative, inRate, FindTimeDisplay(inDisplay));
}

}   // namespace zonmediatypes
