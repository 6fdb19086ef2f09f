#include "zonmediatypes/PulldownCadenceUtils.h"

#include "zoncore/NumberConversion.h"
#include "zoncore/WrappingArithmetic.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace zonmediatypes
{
namespace
{

constexpr std::int64_t kFilmFrames = 4;    // in a group
constexpr std::int64_t kVideoFrames = 5;   // in the same group
constexpr std::int64_t kMarked = 3;        // the marked position, counted from where the phase puts the group

// The video frames of a group that carry the film frames, by phase; the one that is left out is the extra frame.
constexpr auto sCarriers = std::to_array<std::array<std::int32_t, kFilmFrames>>({
	{0, 1, 3, 4},
	{0, 2, 3, 4},
	{1, 2, 3, 4},
	{0, 1, 2, 3},
	{0, 1, 2, 4},
});
static_assert(sCarriers.size() == kVideoFrames);

struct CadenceRow
{
	PulldownCadence mCadence;
	std::size_t mPhase;
	bool mIsMarked;
};

constexpr auto sCadences = std::to_array<CadenceRow>({
	{kPulldownCadence_None, 0, true},
	{kPulldownCadence_WSSWW, 1, true},
	{kPulldownCadence_SSWWW, 2, true},
	{kPulldownCadence_SWWWS, 3, true},
	{kPulldownCadence_WWWSS, 4, true},
	{kPulldownCadence_WWSSW, 0, true},
	{kPulldownCadence_Advanced_WWWSW, 4, false},
	{kPulldownCadence_Advanced_WWSWW, 0, false},
	{kPulldownCadence_Advanced_WSWWW, 1, false},
	{kPulldownCadence_Advanced_SWWWW, 2, false},
	{kPulldownCadence_Advanced_WWWWS, 3, false},
});
static_assert(std::ranges::all_of(
	sCadences, [](const CadenceRow& inRow) { return &inRow - sCadences.data() == inRow.mCadence; }));

constexpr CadenceRow FindCadence(PulldownCadence inCadence)
{
	const auto index = static_cast<std::size_t>(inCadence);   // a negative number is a very large one
	return index < sCadences.size() ? sCadences[index] : sCadences[kPulldownCadence_None];
}

// The rate of the film in a video, through double: exact to the tick at the rates that film is carried at.
FrameRate FilmRate(FrameRate inVideoRate)
{
	constexpr auto kSecond = static_cast<double>(kTicksPerSecond);
	if (inVideoRate == kFrameRate_Zero)
		return kFrameRate_Zero;
	const double framesPerSecond = kSecond / static_cast<double>(inVideoRate.GetTicksPerFrame())
		* static_cast<double>(kFilmFrames) / static_cast<double>(kVideoFrames);
	return FrameRate(zoncore::utility::TruncateTo<std::int64_t>(kSecond / framesPerSecond));
}

}   // namespace

TickTime MapPulldownFrameTo2997Frame(
	TickTime inTime, FrameRate inVideoRate, PulldownCadence inCadence, bool& outFlag) noexcept
{
	const std::int64_t filmFrame = inTime.ToFrame32(FilmRate(inVideoRate));
	const std::int64_t inGroup = (filmFrame % kFilmFrames + kFilmFrames) % kFilmFrames;   // [0, 3]
	const std::int64_t group = (filmFrame - inGroup) / kFilmFrames;
	const CadenceRow cadence = FindCadence(inCadence);
	const std::int64_t carrier = sCarriers[cadence.mPhase][static_cast<std::size_t>(inGroup)];
	const std::int64_t videoFrame = group * kVideoFrames + carrier;

	const std::int64_t position = (carrier + static_cast<std::int64_t>(cadence.mPhase)) % kVideoFrames;
	outFlag = cadence.mIsMarked && videoFrame > 0 && position == kMarked;
	return TickTime(zoncore::utility::WrappingMultiply(videoFrame, inVideoRate.GetTicksPerFrame()));
}

}   // namespace zonmediatypes
