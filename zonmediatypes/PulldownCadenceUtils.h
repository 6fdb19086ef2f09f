#pragma once

/// \file
/// Film in video: where the frames of film lie on a video frame grid that has five frames for every four of film.
///
/// The field pulldown of 24 film frames into 30 video frames (23.976 into 29.97) makes groups of five video frames,
/// three of them whole (W), with both fields of one film frame, and two split (S), with fields of two. The cadence says
/// where in the group the first frame of the stream lies.
///
///     bool isMarked = false;
///     const TickTime film(10'594'584'000 * 2);   // the third film frame
///     MapPulldownFrameTo2997Frame(film, kFrameRate_VideoNTSC, kPulldownCadence_WWSSW, isMarked);
///                                                // the fourth video frame, 3 * 8,475,667,200 ticks

#include "zonmediatypes/Export.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"

#include <cstdint>

namespace zonmediatypes
{

/// Whole and split frames of the first group, in order; the advanced (2:3:3:2) cadences have a single split frame. A
/// number that is no enumerator acts as None, which maps as WWSSW does.
enum PulldownCadence : std::int32_t
{
	kPulldownCadence_None = 0,
	kPulldownCadence_WSSWW = 1,
	kPulldownCadence_SSWWW = 2,
	kPulldownCadence_SWWWS = 3,
	kPulldownCadence_WWWSS = 4,
	kPulldownCadence_WWSSW = 5,
	kPulldownCadence_Advanced_WWWSW = 6,
	kPulldownCadence_Advanced_WWSWW = 7,
	kPulldownCadence_Advanced_WSWWW = 8,
	kPulldownCadence_Advanced_SWWWW = 9,
	kPulldownCadence_Advanced_WWWWS = 10
};

/// The time of the video frame that carries the film frame at inTime, a time on the grid of 4/5 of inVideoRate. Times
/// between two film frames count as the earlier one after zero; before zero they are truncated toward zero and the
/// cadence runs on backwards. outFlag tells that the video frame is the second of two split ones, of which only one field
/// belongs to the film frame; it is never set at or before the first video frame and never for an advanced cadence.
///
/// The film frame is a 32-bit number. A rate that is not usable puts every time into film frame 0.
ZONMEDIATYPES_API TickTime MapPulldownFrameTo2997Frame(
	TickTime inTime, FrameRate inVideoRate, PulldownCadence inCadence, bool& outFlag) noexcept;

}   // namespace zonmediatypes
