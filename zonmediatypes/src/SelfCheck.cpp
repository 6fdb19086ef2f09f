#include "zonmediatypes/src/SelfCheck.h"

#include "zoncore/CheckRegistry.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/Timecode.h"

#include <cstdint>
#include <random>
#include <string>
#include <string_view>

// Each check looks at what a host relies on where its compiler, its libraries or its build options could have broken
// it: exact durations, conversions that lose nothing, text that reads back. They take a few milliseconds and give the
// same answer on every run.

namespace zonmediatypes
{
namespace
{

constexpr int kSamples = 500;   // positions that are tried at each rate and display

std::string Describe(FrameRate inRate)
{
	return zoncore::utility::UTF16to8(FrameRateDescription(inRate));
}

TickTime TimeOfFrame(std::int64_t inFrame, FrameRate inRate)
{
	TickTime time;
	time.AddFrames(inFrame, inRate);
	return time;
}

// Calls inCheck with frames on both sides of zero that lie less than a day away from it, zero and its neighbours among
// them; false, and outMessage, at the first one that fails.
template <class Check>
bool CheckFrames(FrameRate inRate, const std::string& inWhat, std::string& outMessage, const Check& inCheck)
{
	constexpr std::int64_t kDay = 86'400 * kTicksPerSecond;
	const std::int64_t framesPerDay = kDay / inRate.GetTicksPerFrame();
	std::minstd_rand random;
	for (int i = -1; i < kSamples; ++i)
	{
		const std::int64_t magnitude = i < 2 ? i : static_cast<std::int64_t>(random()) % framesPerDay;
		const std::int64_t frame = i % 2 == 0 ? magnitude : -magnitude;
		if (inCheck(frame))
			continue;
		outMessage = inWhat + ": frame " + std::to_string(frame) + " is lost";
		return false;
	}
	return true;
}

// ---- The checks ------------------------------------------------------------------------------------------------------

bool CheckFrameRate(FrameRate inRate, std::string& outMessage)
{
	constexpr std::int64_t kWholeSeconds = 2'002;   // at every named rate a whole number of frames
	const TickTime span(kWholeSeconds * kTicksPerSecond);
	const std::int64_t frames = span.ToFrame64(inRate);
	FrameRate calculated;
	span.CalculateFrameRate(static_cast<unsigned long long>(frames), calculated);
	const RatioTime exact = FrameRateToRatio(inRate);
	const bool isExact = TimeOfFrame(frames, inRate) == span && calculated == inRate
		&& exact == RatioTime(frames, kWholeSeconds) && inRate / 2 * 2 == inRate
		&& GetFrameRateRatio(inRate, inRate) == 1.0;
	if (!isExact)
		outMessage = Describe(inRate) + " is not exact";
	return isExact;
}

bool CheckFrameRates(std::string& outMessage)
{
	for (const FrameRate rate : AllFrameRates())
	{
		if (rate.IsUsable() && !CheckFrameRate(rate, outMessage))
			return false;
	}
	return true;
}

bool CheckTickTimeRoundTrips(std::string& outMessage)
{
	for (const FrameRate rate : AllFrameRates())
	{
		const auto survives = [rate](std::int64_t inFrame)
		{
			const TickTime time = TimeOfFrame(inFrame, rate);
			TickTime aligned = time;
			aligned.AlignToFrame(rate);
			return time.ToFrame64(rate) == inFrame && aligned == time && RatioTimeToTime(TimeToRatioTime(time)) == time;
		};
		if (rate.IsUsable() && !CheckFrames(rate, Describe(rate), outMessage, survives))
			return false;
	}
	return true;
}

bool CheckTimecodeRoundTrips(std::string& outMessage)
{
	for (const TimeDisplay display : AllTimeDisplays())
	{
		if (display == kTimeDisplay_Auto)
			continue;
		const FrameRate callers = display == kTimeDisplay_AudioSamples ? kFrameRate_Audio48000 : kFrameRate_VideoPAL;
		const FrameRate rate = GetFrameRateForTimeDisplay(display, callers);
		const auto survives = [display, rate](std::int64_t inFrame)
		{
			const TickTime time = TimeOfFrame(inFrame, rate);
			return TimecodeToTime(TimeToTimecode(time, rate, display, kTimecodeFlag_ShowSign), rate, display) == time;
		};
		const std::string name = zoncore::utility::UTF16to8(TimeDisplayDescription(display));
		if (!CheckFrames(rate, name, outMessage, survives))
			return false;
	}
	return true;
}

}   // namespace

void RegisterSelfChecks()
{
	constexpr std::string_view kSuite = "ZON.MediaTypes";
	zoncore::CheckRegistry& registry = zoncore::CheckRegistry::Get();
	registry.Register(kSuite, "Frame rates", CheckFrameRates);
	registry.Register(kSuite, "Tick time round trips", CheckTickTimeRoundTrips);
	registry.Register(kSuite, "Timecode round trips", CheckTimecodeRoundTrips);
}

}   // namespace zonmediatypes
