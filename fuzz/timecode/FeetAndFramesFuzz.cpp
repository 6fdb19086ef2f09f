// Film feet and frames: any text, against a reading of its own.

#include "fuzz/Checks.h"
#include "fuzz/Numbers.h"
#include "zonmediatypes/Timecode.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>

namespace
{

using namespace zonmediatypes;
using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::UTF16StringView;
using zonfuzz::FuzzInput;
using zonfuzz::Numbers;
using zonfuzz::ReadNumbers;
using zonfuzz::Require;

// The number that a text begins with, after white space and a sign; 0 for none, the nearest 64-bit value for a larger one.
std::int64_t ReadNumber(UTF16StringView inText)
{
	const auto isSpace = [](UTF16Char inChar) { return inChar == ' ' || (inChar >= 9 && inChar <= 13); };
	while (!inText.empty() && isSpace(inText.front()))
		inText.remove_prefix(1);
	const bool isNegative = inText.starts_with(UTF16Char{'-'});
	if (isNegative || inText.starts_with(UTF16Char{'+'}))
		inText.remove_prefix(1);
	long double value = 0;   // holds every 64-bit integer
	for (; !inText.empty() && inText.front() >= '0' && inText.front() <= '9'; inText.remove_prefix(1))
		value = std::min(value * 10 + (inText.front() - '0'), 0x1p70L);
	if (isNegative)
		return value >= 0x1p63L ? INT64_MIN : -static_cast<std::int64_t>(value);
	return value >= 0x1p63L ? INT64_MAX : static_cast<std::int64_t>(value);
}

constexpr UTF16Char kSeparators[] = {';', ':', '.', '+'};
constexpr std::size_t kSeparatorCount = std::size(kSeparators);

// Sign, feet, separator and frames, or feet with two characters of frames, or frames alone; kTime_Invalid for more than
// one separator.
TickTime ReadFeetAndFrames(UTF16StringView inText, FrameRate inRate, std::int32_t inFramesPerFoot)
{
	const bool isNegative = inText.front() == '-';
	if (isNegative || inText.front() == '+')
		inText.remove_prefix(1);
	std::size_t feetLength = inText.find_first_of(kSeparators, 0, kSeparatorCount);
	std::size_t framesBegin = feetLength + 1;
	if (feetLength == UTF16StringView::npos)
		framesBegin = feetLength = inText.size() > 2 ? inText.size() - 2 : 0;
	else if (inText.find_first_of(kSeparators, framesBegin, kSeparatorCount) != UTF16StringView::npos)
		return kTime_Invalid;
	const auto feet = static_cast<std::uint64_t>(ReadNumber(inText.substr(0, feetLength)));
	const auto frames = static_cast<std::uint64_t>(ReadNumber(inText.substr(framesBegin)));
	const auto sum = static_cast<std::uint32_t>(feet * static_cast<std::uint64_t>(inFramesPerFoot) + frames);
	TickTime time;
	time.AddFrames(static_cast<std::int32_t>(isNegative ? 0 - sum : sum), inRate);
	return time;
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	FuzzInput input(inData, inSize);
	const bool is35mm = input.Flag();
	const TimeDisplay display = is35mm ? kTimeDisplay_35mmFeetFrames : kTimeDisplay_16mmFeetFrames;
	const std::int32_t perFoot = is35mm ? 16 : 40;
	const FrameRate rate = input.Flag() ? kFrameRate_Film24 : FrameRate(input.Edge<std::int64_t>());
	const UTF16String text = input.Text();
	if (text.empty())
		return 0;
	const TickTime time = TimecodeToTime(text, rate, display);
	Require(time == ReadFeetAndFrames(text, rate, perFoot), "feet and frames are read as they stand");

	const UTF16String written = TimeToTimecode(time, kFrameRate_Film24, display);
	TickTime aligned = time;
	aligned.AlignToFrame(kFrameRate_Film24);
	const std::int64_t frame = aligned.ToFrame64(kFrameRate_Film24);
	if (frame >= INT32_MIN && frame <= INT32_MAX)
	{
		Require(TimecodeToTime(written, kFrameRate_Film24, display) == aligned, "what is written reads back");
		const std::int64_t magnitude = std::abs(frame);
		Require(ReadNumbers(written) == Numbers{magnitude / perFoot, magnitude % perFoot}, "feet and what is left");
		Require((written.front() == '-') == (time < kTime_Zero), "a time before zero has its sign");
	}
	return 0;
}
