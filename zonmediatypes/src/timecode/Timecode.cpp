#include "zonmediatypes/Timecode.h"

#include "zonmediatypes/src/timecode/TimecodeFields.h"

#include <algorithm>

namespace zonmediatypes
{

void TimeToHMSF(unsigned int& outHours, unsigned int& outMinutes, unsigned int& outSeconds,
	unsigned long long& outFrames, bool& outNegative, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	const std::size_t place = PlaceOf(inDisplay);
	const TimecodeFields fields = FieldsOf(inTime, inRate, place);
	outHours = fields.mHours;
	outMinutes = fields.mMinutes;
	outSeconds = fields.mSeconds;
	outFrames = fields.mFrames;
	outNegative = inTime.GetTicks() <= LastNegativeTick(inRate, kTimeDisplayTable[place]);
}

std::size_t TimesToHMSF(std::span<TimecodeFields> outFields, std::span<const TickTime> inTimes, FrameRate inRate,
	TimeDisplay inDisplay) noexcept
{
	const std::size_t count = std::min(outFields.size(), inTimes.size());
	const std::size_t place = PlaceOf(inDisplay);
	const std::int64_t lastNegative = LastNegativeTick(inRate, kTimeDisplayTable[place]);
	WithSplitter<zoncore::utility::Reciprocal>(inRate, place,
		[=](auto inSplit)
		{
			for (std::size_t i = 0; i < count; ++i)
			{
				outFields[i] = inSplit(inTimes[i]);
				outFields[i].mNegative = inTimes[i].GetTicks() <= lastNegative;
			}
		});
	return count;
}

TickTime HMSFToTime(unsigned int inHours, unsigned int inMinutes, unsigned int inSeconds, unsigned long long inFrames,
	bool inNegative, FrameRate inRate, TimeDisplay inDisplay) noexcept
{
	return FieldsToTime({inHours, inMinutes, inSeconds, inNegative, inFrames}, inRate, FindTimeDisplay(inDisplay));
}

}   // namespace zonmediatypes
