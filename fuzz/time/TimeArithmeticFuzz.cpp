// Arithmetic on times, rates, ratios and time bases with any integers; divisions by 0 are left out, they are faults.

#include "fuzz/BufferChecks.h"
#include "fuzz/RateInput.h"
#include "tests/Platform.h"
#include "zoncore/Reciprocal.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PulldownCadenceUtils.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeBase.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"

#include <boost/multiprecision/cpp_int.hpp>

#include <algorithm>
#include <cmath>
#include <cstdlib>

namespace
{

using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;
using zonfuzz::RequireInBuffers;
using zonfuzz::TakeRate;

using Exact = boost::multiprecision::cpp_int;

// The low 64 bits of an exact result, as arithmetic that wraps gives them.
std::int64_t Wrapped(Exact inValue)
{
	const Exact low = ((inValue % (Exact(1) << 64)) + (Exact(1) << 64)) % (Exact(1) << 64);
	return static_cast<std::int64_t>(static_cast<std::uint64_t>(low));
}

// Requires a count of ticks that went through double: truncated, the most negative one where it does not fit. Two roundings
// of a double are allowed for.
void RequireThroughDouble(std::int64_t inTicks, long double inExact)
{
	const long double size = std::abs(inExact), slack = size * 0x1p-51L;
	if (!(size - slack < 0x1p63L))
		return Require(inTicks == INT64_MIN, "what does not fit is the most negative count");
	const long double ticks = std::abs(static_cast<long double>(inTicks));
	if (inTicks != INT64_MIN || size + slack < 0x1p63L)   // near to 2^63 either may be
		Require(ticks <= size + slack && ticks > size - slack - 1 && (inTicks == 0 || (inTicks < 0) == (inExact < 0)),
			"products and quotients are truncated");
}

void RequireRatio(double inRatio, std::int64_t inDividend, std::int64_t inDivisor)
{
	const long double dividend = static_cast<long double>(inDividend);
	Require(std::abs(static_cast<long double>(inRatio) * static_cast<long double>(inDivisor) - dividend)
			<= std::abs(dividend) * 0x1p-50L,
		"ratios are quotients");
}

void CheckTime(FuzzInput& ioInput)
{
	const TickTime time(ioInput.Edge<std::int64_t>()), other(ioInput.Edge<std::int64_t>());
	const auto factor = ioInput.Edge<std::int32_t>();
	const auto unsignedFactor = ioInput.Edge<std::uint32_t>();
	const Exact exact(time.GetTicks());
	Require((time + other).GetTicks() == Wrapped(exact + other.GetTicks()), "sums wrap");
	Require(time - other + other == time && -(-time) == time, "differences and negatives wrap");
	Require((time * factor).GetTicks() == Wrapped(exact * factor), "products wrap");
	Require(
		(time * unsignedFactor).GetTicks() == Wrapped(exact * unsignedFactor), "products with unsigned numbers wrap");
	if (factor != 0)
		Require((time / factor).GetTicks() == Wrapped(exact / factor), "quotients are truncated, and wrap");
	if (unsignedFactor != 0)
		Require((time / unsignedFactor).GetTicks() == Wrapped(exact / unsignedFactor), "so are unsigned ones");
	if (const auto divisor = ioInput.Any<double>(); divisor != 0)
		RequireThroughDouble((time / divisor).GetTicks(), static_cast<long double>(time.GetTicks()) / divisor);
	const auto scale = ioInput.Any<double>();
	RequireThroughDouble((time * scale).GetTicks(), static_cast<long double>(time.GetTicks()) * scale);
	Require(TickTime(time).Abs() == (time < kTime_Zero ? -time : time), "magnitudes wrap");
	if (other != kTime_Zero)
		RequireRatio(time / other, time.GetTicks(), other.GetTicks());
}

void CheckFrames(FuzzInput& ioInput)
{
	const TickTime time(ioInput.Edge<std::int64_t>());
	const FrameRate rate = TakeRate(ioInput);
	const auto frames = ioInput.Edge<long long>();
	TickTime moved = time;
	moved.AddFrames(frames, rate);
	Require(
		moved.GetTicks() == Wrapped(Exact(time.GetTicks()) + Exact(frames) * rate.GetTicksPerFrame()), "frames wrap");

	const std::int64_t number = rate.IsUsable() ? Wrapped(Exact(time.GetTicks()) / rate.GetTicksPerFrame()) : 0;
	Require(time.ToFrame64(rate) == number, "a time lies in the frame of the truncated quotient");
	Require(time.ToFrame32(rate) == static_cast<std::int32_t>(number), "of which the low 32 bits count");

	TickTime aligned = time, ceiling = time, nearest = time;
	aligned.AlignToFrame(rate);
	ceiling.AlignToFrameCeil(rate);
	nearest.AlignToNearestFrame(rate);
	TickTime start;
	start.AddFrames(time.ToFrame64(rate), rate);
	Require(aligned == (rate.IsUsable() ? start : time), "a frame begins where its number says");
	if (!rate.IsUsable())
		Require(ceiling == time && nearest == time, "without a rate nothing is aligned");
	else
		Require(nearest >= kTime_Min && nearest <= kTime_Max, "the nearest frame is within a hundred hours");
	const std::int64_t ticks = time.GetTicks(), frame = rate.GetTicksPerFrame();
	if (ticks >= 0 && frame > 0 && ticks <= INT64_MAX - frame)
	{
		const std::int64_t up = ceiling.GetTicks(), near = nearest.GetTicks();
		Require(
			up % frame == 0 && up >= ticks && up - ticks < frame, "the ceiling is the first frame start from there");
		const std::int64_t distance = near > ticks ? near - ticks : ticks - near;
		Require(nearest == kTime_Max || (near % frame == 0 && distance <= frame - frame / 2), "the nearest is near");
	}

	FrameRate calculated;
	const auto count = ioInput.Edge<unsigned long long>();
	time.CalculateFrameRate(count, calculated);
	const std::int64_t divisor = static_cast<std::int64_t>(count);
	const std::int64_t duration = divisor == 0 ? 0 : Wrapped(Exact(ticks) / divisor);
	Require(calculated == (duration == 0 ? kFrameRate_Zero : FrameRate(duration)), "frames fill the time");
}

void CheckRate(FuzzInput& ioInput)
{
	const FrameRate rate = TakeRate(ioInput);
	const auto factor = ioInput.Edge<std::int32_t>();
	Require(
		(rate / factor).GetTicksPerFrame() == Wrapped(Exact(rate.GetTicksPerFrame()) * factor), "slower rates wrap");
	if (factor != 0)
		Require(
			(rate * factor).GetTicksPerFrame() == Wrapped(Exact(rate.GetTicksPerFrame()) / factor), "faster ones, too");
	const auto faster = ioInput.Any<double>(), slower = ioInput.Any<double>();
	const auto duration = static_cast<long double>(rate.GetTicksPerFrame());
	RequireThroughDouble((rate * faster).GetTicksPerFrame(), duration / faster);
	RequireThroughDouble((rate / slower).GetTicksPerFrame(), duration * slower);
	const FrameRate other = TakeRate(ioInput);
	if (const double ratio = GetFrameRateRatio(rate, other); rate.GetTicksPerFrame() != 0)
		RequireRatio(ratio, other.GetTicksPerFrame(), rate.GetTicksPerFrame());
	else
		Require(ratio == 0, "without a duration there is no ratio");
	const zoncore::UTF16String description = FrameRateDescription(rate);
	Require(!description.empty(), "every rate has a description");
	RequireInBuffers(description, [rate](auto outText) { return FrameRateDescription(outText, rate); });
	if (rate.GetTicksPerFrame() > 0)
		Require(
			FrameRateToRatio(rate) == boost::rational<long long>(kTicksPerSecond, rate.GetTicksPerFrame()), "exact");
}

void CheckDisplay(FuzzInput& ioInput)
{
	const auto display
		= static_cast<TimeDisplay>(ioInput.Flag() ? 90 + ioInput.Any<std::int8_t>() : ioInput.Edge<std::int32_t>());
	const FrameRate rate = TakeRate(ioInput);
	const TimeDisplay chosen = GetTimeDisplayForFrameRate(rate, ioInput.Flag(), false, display, ioInput.Flag());
	Require(chosen == display || GetFrameRateForTimeDisplay(chosen, rate) == rate,
		"a display that fits counts at the rate");
	Require(
		!IsTimeDisplayDropFrame(display) || IsDropFrameApplicableForTimeDisplay(display), "drop frames are applicable");
	static_cast<void>(TimeDisplayDescription(display));
	const FrameRate counted = GetFrameRateForTimeDisplay(display, rate);
	if (const FrameRate own = GetFrameRateForTimeDisplay(display, {}); own.IsUsable())
		Require(counted == own
				&& GetTimeDisplayForFrameRate(own, IsTimeDisplayDropFrame(display), false, kTimeDisplay_Auto, true)
					== display,
			"a display's own rate finds the display");
	Require(!IsTimeDisplayDropFrame(display) || counted == kFrameRate_VideoNTSC || counted == kFrameRate_VideoNTSC_HD,
		"drop frames are those of NTSC");
	const auto displays = AllTimeDisplays();
	const bool isDisplay = std::find(displays.begin(), displays.end(), display) != displays.end();
	Require(isDisplay || (counted == kFrameRate_Zero && !IsTimeDisplayFormatAudio(display)), "others have no rate");
}

void CheckReciprocal(FuzzInput& ioInput)
{
	constexpr std::uint64_t kMost = zoncore::utility::Reciprocal::kMostDividend;
	const std::uint64_t divisor = ioInput.Edge<std::uint64_t>() % kMost + 1, any = ioInput.Edge<std::uint64_t>();
	const zoncore::utility::Reciprocal reciprocal(divisor);
	const std::uint64_t multiple
		= kMost / divisor == 0 ? 0 : any % (kMost / divisor + 1) * divisor;   // where it is tight
	for (const std::uint64_t dividend : {any % (kMost + 1), multiple, multiple == 0 ? 0 : multiple - 1, kMost})
		Require(reciprocal.Divide(dividend) == dividend / divisor, "a multiplication divides");
}

void CheckPulldown(FuzzInput& ioInput)
{
	const TickTime time(ioInput.Edge<std::int64_t>());
	const FrameRate rate = TakeRate(ioInput);
	const auto cadence = static_cast<PulldownCadence>(
		ioInput.Flag() ? static_cast<std::int32_t>(ioInput.Below(11)) : ioInput.Edge<std::int32_t>());
	bool isMarked = false, isAlsoMarked = true;
	const TickTime carrier = MapPulldownFrameTo2997Frame(time, rate, cadence, isMarked);
	Require(!isMarked || cadence < kPulldownCadence_Advanced_WWWSW || cadence > kPulldownCadence_Advanced_WWWWS,
		"advanced cadences mark nothing");
	if (cadence < kPulldownCadence_None || cadence > kPulldownCadence_Advanced_WWWWS)
		Require(MapPulldownFrameTo2997Frame(time, rate, kPulldownCadence_WWSSW, isAlsoMarked) == carrier
				&& isMarked == isAlsoMarked,
			"what is no cadence acts as none");
	const std::int64_t frame = rate.GetTicksPerFrame();
	const bool isOrdinary = frame >= kTicksPerSecond / 120 && frame <= kTicksPerSecond * 10;
	if (time < kTime_Min || time > kTime_Max || !isOrdinary)
		return;
	Require(carrier.GetTicks() % frame == 0, "a film frame is carried by a whole frame");
	Require(!isMarked || carrier > kTime_Zero, "nothing is marked at or before the first frame");
	const double distance = static_cast<double>(carrier.GetTicks() - time.GetTicks());
	Require(std::abs(distance) <= 2.5 * static_cast<double>(frame), "film and video run alongside");
}

void CheckRatio(FuzzInput& ioInput)
{
	const TickTime time(ioInput.Edge<std::int64_t>());
	const RatioTime seconds = TimeToRatioTime(time);
	Require(Exact(seconds.numerator()) * kTicksPerSecond == Exact(time.GetTicks()) * seconds.denominator(), "exact");
	const LegacyRatioTime legacy = RatioTimeToLegacyRatioTime(seconds);
	const bool fits = std::llabs(seconds.numerator()) <= 2'147'483'646 && seconds.denominator() <= 2'147'483'646;
	Require(!fits || LegacyRatioTimeToRatioTime(legacy) == seconds, "what fits in 32 bits is kept");
	const auto scale = ioInput.Edge<long long>();
	static_cast<void>(CorrectLegacyRatioTimeAtTimeScale(legacy, scale));
	if (!zontest::kHasExceptions && IsLegacyTimeScale(scale))
		return;   // it may throw
	try
	{
		const RatioTime corrected = CorrectLegacyRatioTimeAtTimeScale(seconds, scale);
		Require(IsLegacyTimeScale(scale) || corrected == seconds, "other scales are left alone");
	}
	catch (const boost::bad_rational&)
	{
		Require(IsLegacyTimeScale(scale), "only a correction can be too large");
	}
	const double exact = static_cast<double>(time.GetTicks());
	const double back = static_cast<double>(RatioTimeToTime(seconds).GetTicks());
	Require(
		std::abs(back - exact) <= 1 + std::abs(exact) * 0x1p-50 || std::abs(exact) > 0x1p62, "there and nearly back");
}

void CheckTimeBase(FuzzInput& ioInput)
{
	const auto numerator = ioInput.Edge<std::int64_t>();
	const auto denominator = ioInput.Edge<std::int64_t>();
	const auto base = TimeBase::FromRatio(numerator, denominator);
	const Exact ticks = Exact(kTicksPerSecond) * numerator;
	const bool isPositive = numerator > 0 && denominator > 0;
	Require(base.has_value() == (isPositive && ticks / gcd(ticks, Exact(denominator)) <= INT64_MAX),
		"empty only for what does not fit");
	if (!base)
		return;
	const auto rounding = static_cast<Rounding>(ioInput.Below(4));
	const auto value = ioInput.Edge<std::int64_t>();
	const auto expect = [&](const std::optional<std::int64_t>& inResult, const Exact& inFactor, const Exact& inDivisor)
	{
		const Exact dividend = Exact(value) * inFactor;
		const Exact distance = inResult ? Exact(*inResult) * inDivisor - dividend : Exact(0);
		const bool isZeroward = value >= 0 ? distance <= 0 : distance >= 0;
		if (!inResult)
			Require(abs(dividend) >= ((Exact(1) << 63) - 1) * inDivisor, "only what does not fit is empty");
		else if (rounding == Rounding::Nearest)
			Require(abs(distance) * 2 <= inDivisor, "the nearest");
		else
			Require(abs(distance) < inDivisor
					&& (rounding == Rounding::TowardZero ? isZeroward
							: rounding == Rounding::Down ? distance <= 0
														 : distance >= 0),
				"on the side asked for");
	};
	expect(base->FromTicks(TickTime(value), rounding), denominator, ticks);
	if (const auto ratio = base->ToRatio())
		Require(Exact(ratio->mNumerator) * denominator == Exact(numerator) * ratio->mDenominator
				&& TimeBase::FromRatio(ratio->mNumerator, ratio->mDenominator) == base,
			"a ratio is kept in lowest terms");
	const auto time = base->ToTicks(value, rounding);
	expect(time ? std::optional(time->GetTicks()) : std::nullopt, ticks, denominator);
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	return zonfuzz::RunOneOf(
		{CheckTime, CheckFrames, CheckRate, CheckDisplay, CheckRatio, CheckTimeBase, CheckPulldown, CheckReciprocal},
		inData, inSize);
}
