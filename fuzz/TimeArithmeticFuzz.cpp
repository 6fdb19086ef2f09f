// Arithmetic on times, rates, ratios and time bases with any integers; divisions by 0 are left out, they are faults.

#include "FuzzInput.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PulldownCadenceUtils.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/TimeDisplayUtils.h"
#include "zonmediatypes/TimeUtils.h"
#include "zonmediatypes/interop/TimeBase.h"

#include <boost/multiprecision/cpp_int.hpp>

#include <cmath>
#include <cstdlib>

namespace
{

using namespace zonmediatypes;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

using Exact = boost::multiprecision::cpp_int;

FrameRate TakeRate(FuzzInput& ioInput)
{
	return ioInput.Flag() ? FrameRate(ioInput.Edge<std::int64_t>()) : ioInput.OneOf(AllFrameRates());
}

// The low 64 bits of an exact result, as arithmetic that wraps gives them.
std::int64_t Wrapped(Exact inValue)
{
	const Exact low = ((inValue % (Exact(1) << 64)) + (Exact(1) << 64)) % (Exact(1) << 64);
	return static_cast<std::int64_t>(static_cast<std::uint64_t>(low));
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
		static_cast<void>(time / divisor);
	static_cast<void>(time * ioInput.Any<double>());
	Require(TickTime(time).Abs() == (time < kTime_Zero ? -time : time), "magnitudes wrap");
	if (other != kTime_Zero)
		Require(!std::isnan(time / other), "times have a ratio");
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

	FrameRate calculated;
	time.CalculateFrameRate(ioInput.Edge<unsigned long long>(), calculated);
	Require(calculated.GetTicksPerFrame() != 0, "there is no rate without duration");
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
	static_cast<void>(rate * ioInput.Any<double>());
	static_cast<void>(rate / ioInput.Any<double>());
	static_cast<void>(GetFrameRateRatio(rate, TakeRate(ioInput)));
	Require(!FrameRateDescription(rate).empty(), "every rate has a description");
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
	bool isMarked = false;
	static_cast<void>(MapPulldownFrameTo2997Frame(TickTime(ioInput.Edge<std::int64_t>()), rate,
		static_cast<PulldownCadence>(ioInput.Edge<std::int32_t>()), isMarked));
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
	Require(!base || (numerator > 0 && denominator > 0), "time runs forward");
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
	const Exact ticks = Exact(kTicksPerSecond) * numerator;
	expect(base->FromTicks(TickTime(value), rounding), denominator, ticks);
	const auto time = base->ToTicks(value, rounding);
	expect(time ? std::optional(time->GetTicks()) : std::nullopt, ticks, denominator);
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	switch (input.Below(6))
	{
	case 0:
		CheckTime(input);
		break;
	case 1:
		CheckFrames(input);
		break;
	case 2:
		CheckRate(input);
		break;
	case 3:
		CheckDisplay(input);
		break;
	case 4:
		CheckRatio(input);
		break;
	case 5:
		CheckTimeBase(input);
		break;
	}
	return 0;
}
