#include "zoncore/Debug.h"
#include "zonmediatypes/src/sampleclock/SampleClock.h"

#include <algorithm>
#include <array>
#include <atomic>
#include <cstddef>

namespace zonmediatypes::utility
{
namespace
{

// How hosts know a place.
struct MisuseRow
{
	Misuse mMisuse;
	const char* mCondition;
	const char* mMessage;
	const char* mFunction;
	int mLine = 0;   // 0: that of the call
};

constexpr const char* kFile = "zonmediatypes/src/TimeConversionUtils.cpp";

constexpr const char* kReader
	= "bool zonmediatypes::utility::ConvertTimecodeToSamples(std::int64_t &, const zoncore::UTF16String &, "
	  "TimecodeFormat, std::int32_t, std::int32_t, BeatInfo *, bool)";
constexpr const char* kWriter
	= "bool zonmediatypes::utility::ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, "
	  "TimecodeFormat, std::int32_t, const BeatInfo *, bool)";
constexpr const char* kFlagsWriter
	= "bool zonmediatypes::utility::ConvertSamplesToTimecode(zoncore::UTF16String &, std::int64_t, std::int32_t, "
	  "std::int32_t, bool, bool, bool, bool, bool, bool, bool)";
constexpr const char* kBarsWriter
	= "bool zonmediatypes::utility::ConvertSamplesToBarsAndBeats(zoncore::UTF16String &, double, double, "
	  "const BeatInfo &, bool, int)";

// clang-format off
constexpr auto sMisuses = std::to_array<MisuseRow>({
	{Misuse::ReadBeats,         "inBeatInfo", "programmer error!\n", kReader},
	{Misuse::ReadBarsAndBeats,  "inBeatInfo", "programmer error!\n", kReader},
	{Misuse::WriteBeats,        "inBeatInfo", "programmer error!\n", kWriter},
	{Misuse::WriteBarsAndBeats, "inBeatInfo", "programmer error!\n", kWriter},
	{Misuse::DropFrameNTSC,     "false", "ConvertSamplesToTimecode programmer error!", kFlagsWriter},
	{Misuse::NoBeatsPerBar,     "inBeatInfo.iBeatsPerBar != 0", "programmer error!", kBarsWriter, 980},
});
// clang-format on
static_assert(std::ranges::all_of(sMisuses,
	[](const MisuseRow& inRow) { return &inRow - sMisuses.data() == static_cast<std::ptrdiff_t>(inRow.mMisuse); }));

constinit std::array<std::atomic<bool>, sMisuses.size()> sIsDisabled{};

}   // namespace

bool ReportMisuse(Misuse inMisuse, int inLine)
{
	const auto place = static_cast<std::size_t>(inMisuse);
	const MisuseRow& row = sMisuses[place];
	const bool wantsBreak = zoncore::debug::BreakAfterAssertDialog(sIsDisabled[place], row.mCondition, row.mMessage,
		kFile, row.mLine != 0 ? row.mLine : inLine, row.mFunction, true);
	if (wantsBreak && zoncore::debug::IsDebuggerAttached())
		zoncore::debug::Break();
	return false;
}

}   // namespace zonmediatypes::utility
