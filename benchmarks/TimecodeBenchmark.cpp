// Timecode of 100,000 frames spread over a day, beside libavutil's and GStreamer's.

#include "Comparison.h"

#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PulldownCadenceUtils.h"
#include "zonmediatypes/Timecode.h"

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#if ZON_HAS_GSTREAMER
	#include <gst/video/video.h>
#endif

extern "C"
{
#include <libavutil/timecode.h>
}

namespace benchmarks
{
namespace
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace)

constexpr int kFrames = 100'000;

struct Case
{
	const char* mName;
	TimeDisplay mDisplay;
	FrameRate mRate;
	AVRational mAVRate;
	int mAVFlags;
	double mWantedIntoBuffer;   // times as fast as the peer's text
};

constexpr auto sCases = std::to_array<Case>({
	{"25 fps", kTimeDisplay_25Timecode, kFrameRate_VideoPAL, {25, 1}, 0, 14},
	{"29.97 drop-frame", kTimeDisplay_2997DropTimecode, kFrameRate_VideoNTSC, {30'000, 1'001},
		AV_TIMECODE_FLAG_DROPFRAME, 12},
	{"59.94 drop-frame", kTimeDisplay_5994DropTimecode, kFrameRate_VideoNTSC_HD, {60'000, 1'001},
		AV_TIMECODE_FLAG_DROPFRAME, 12},
});

// Displays that the peers do not have.
constexpr auto sCountCases = std::to_array<Case>({
	{"feet and frames of 35 mm film", kTimeDisplay_35mmFeetFrames, kFrameRate_Film24, {}, 0, 0},
	{"feet and frames of 16 mm film", kTimeDisplay_16mmFeetFrames, kFrameRate_Film24, {}, 0, 0},
	{"frame count", kTimeDisplay_Frames, kFrameRate_VideoPAL, {}, 0, 0},
	{"milliseconds", kTimeDisplay_Milliseconds, kFrameRate_VideoPAL, {}, 0, 0},
});

// The frame numbers, in an order that keeps the processor from learning the digits that follow.
std::vector<int> SpreadFrames(const Case& inCase)
{
	const auto day = TickTime(86'400 * kTicksPerSecond).ToFrame64(inCase.mRate);
	std::vector<int> frames;
	for (std::int64_t i = 0; i < kFrames; ++i)
		frames.push_back(static_cast<int>(i * 61'803 % kFrames * day / kFrames));
	return frames;
}

std::vector<TickTime> SpreadTimes(const Case& inCase)
{
	std::vector<TickTime> times;
	for (const int frame : SpreadFrames(inCase))
		times.emplace_back(frame * inCase.mRate.GetTicksPerFrame());
	return times;
}

// Texts that lie one behind the other, as the short strings of the peer do: what is measured is reading, not memory.
template <class Char>
struct ShortText
{
	static constexpr std::size_t kLength = 11;

	std::basic_string_view<Char> Get() const { return {mChars.data(), kLength}; }

	std::array<Char, 32 / sizeof(Char)> mChars{};
};

template <class Char>
std::vector<ShortText<Char>> SpreadTexts(const Case& inCase)
{
	std::vector<ShortText<Char>> texts(kFrames);
	auto text = texts.begin();
	for (const TickTime time : SpreadTimes(inCase))
		TimeToTimecode(std::span<Char>((text++)->mChars), time, inCase.mRate, inCase.mDisplay);
	return texts;
}

std::vector<TimecodeFields> SpreadFields(const Case& inCase)
{
	const std::vector<TickTime> times = SpreadTimes(inCase);
	std::vector<TimecodeFields> fields(times.size());
	TimesToHMSF(fields, times, inCase.mRate, inCase.mDisplay);
	return fields;
}

// A column at once; inFill fills it.
template <class Row, class MakeInputs, class Fill>
Work FillColumn(MakeInputs inMakeInputs, Fill inFill)
{
	return [inMakeInputs, inFill](benchmark::State& ioState)
	{
		const auto inputs = inMakeInputs();
		std::vector<Row> rows(inputs.size());
		for (auto _ : ioState)
		{
			inFill(rows, inputs);
			benchmark::DoNotOptimize(rows.data());
			benchmark::ClobberMemory();
		}
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inputs.size()));
	};
}

// ---- The peers -------------------------------------------------------------------------------------------------------

Work PeerTextOut(const Case& inCase)
{
	AVTimecode timecode;
	av_timecode_init(&timecode, inCase.mAVRate, inCase.mAVFlags, 0, nullptr);
	return ForEach([&inCase] { return SpreadFrames(inCase); },
		[timecode, text = std::array<char, AV_TIMECODE_STR_SIZE>()](int inFrame) mutable
		{ return *av_timecode_make_string(&timecode, text.data(), inFrame); });
}

Work PeerTextIn(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTexts<char>(inCase); },
		[&inCase](const ShortText<char>& inText)
		{
			AVTimecode timecode;
			av_timecode_init_from_string(&timecode, inCase.mAVRate, inText.mChars.data(), nullptr);
			return timecode.start;
		});
}

#if ZON_HAS_GSTREAMER

// A timecode of no day in particular.
GstVideoTimeCode StreamerTimecode(const Case& inCase, guint inHours, guint inMinutes, guint inSeconds, guint inFrames)
{
	const bool isDropFrame = inCase.mAVFlags == AV_TIMECODE_FLAG_DROPFRAME;
	GstVideoTimeCode timecode{};
	gst_video_time_code_init(&timecode, static_cast<guint>(inCase.mAVRate.num), static_cast<guint>(inCase.mAVRate.den),
		nullptr, isDropFrame ? GST_VIDEO_TIME_CODE_FLAGS_DROP_FRAME : GST_VIDEO_TIME_CODE_FLAGS_NONE, inHours,
		inMinutes, inSeconds, inFrames, 0);
	return timecode;
}

GstVideoTimeCode StreamerFields(const Case& inCase, int inFrame)
{
	GstVideoTimeCode timecode = StreamerTimecode(inCase, 0, 0, 0, 0);
	gst_video_time_code_add_frames(&timecode, inFrame);
	return timecode;
}

Work StreamerFieldsOut(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadFrames(inCase); },
		[&inCase](int inFrame) { return StreamerFields(inCase, inFrame).frames; });
}

Work StreamerTextOut(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadFrames(inCase); },
		[&inCase](int inFrame)
		{
			const GstVideoTimeCode timecode = StreamerFields(inCase, inFrame);
			gchar* const text = gst_video_time_code_to_string(&timecode);
			const char first = *text;
			g_free(text);
			return first;
		});
}

Work StreamerFieldsIn(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadFields(inCase); },
		[&inCase](const TimecodeFields& inFields)
		{
			const GstVideoTimeCode timecode
				= StreamerTimecode(inCase, static_cast<guint>(inFields.mHours), static_cast<guint>(inFields.mMinutes),
					static_cast<guint>(inFields.mSeconds), static_cast<guint>(inFields.mFrames));
			return gst_video_time_code_frames_since_daily_jam(&timecode);
		});
}

// Text has no rate: it makes fields, which count as frames once they have one.
Work StreamerTextIn(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTexts<char>(inCase); },
		[&inCase](const ShortText<char>& inText)
		{
			GstVideoTimeCode* const read = gst_video_time_code_new_from_string(inText.mChars.data());
			const GstVideoTimeCode timecode
				= StreamerTimecode(inCase, read->hours, read->minutes, read->seconds, read->frames);
			gst_video_time_code_free(read);
			return gst_video_time_code_frames_since_daily_jam(&timecode);
		});
}

#else

Work StreamerFieldsOut(const Case&)
{
	return {};
}

Work StreamerTextOut(const Case&)
{
	return {};
}

Work StreamerFieldsIn(const Case&)
{
	return {};
}

Work StreamerTextIn(const Case&)
{
	return {};
}

#endif

// ---- Ours ------------------------------------------------------------------------------------------------------------

template <class Char>
Work TextIntoBuffer(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTimes(inCase); },
		[&inCase, text = std::array<Char, kLongestTimecode>()](TickTime inTime) mutable
		{
			TimeToTimecode(std::span(text), inTime, inCase.mRate, inCase.mDisplay);
			return text[0];
		});
}

Work TextOut(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTimes(inCase); },
		[&inCase](TickTime inTime) { return TimeToTimecode(inTime, inCase.mRate, inCase.mDisplay); });
}

Work TextColumn(const Case& inCase)
{
	return FillColumn<TimecodeText>([&inCase] { return SpreadTimes(inCase); },
		[&inCase](auto& outTexts, const auto& inTimes)
		{ TimesToTimecode(outTexts, inTimes, inCase.mRate, inCase.mDisplay); });
}

Work TextIn(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTexts<zoncore::UTF16Char>(inCase); },
		[&inCase](const ShortText<zoncore::UTF16Char>& inText)
		{ return TimecodeToTime(inText.Get(), inCase.mRate, inCase.mDisplay); });
}

// Texts of any length.
Work LongTextIn(const Case& inCase)
{
	const auto texts = [&inCase]
	{
		std::vector<zoncore::UTF16String> result;
		for (const TickTime time : SpreadTimes(inCase))
			result.push_back(TimeToTimecode(time, inCase.mRate, inCase.mDisplay));
		return result;
	};
	return ForEach(texts,
		[&inCase](const zoncore::UTF16String& inText)
		{ return TimecodeToTime(inText, inCase.mRate, inCase.mDisplay); });
}

Work TextColumnIn(const Case& inCase)
{
	return [&inCase](benchmark::State& ioState)
	{
		const auto texts = SpreadTexts<zoncore::UTF16Char>(inCase);
		const auto views = [&texts]
		{
			std::vector<zoncore::UTF16StringView> result;
			for (const auto& text : texts)
				result.push_back(text.Get());
			return result;
		};
		FillColumn<TickTime>(views,
			[&inCase](auto& outTimes, const auto& inViews)
			{ TimecodesToTimes(outTimes, inViews, inCase.mRate, inCase.mDisplay); })(ioState);
	};
}

Work FieldsOut(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadTimes(inCase); },
		[&inCase](TickTime inTime)
		{
			TimecodeFields fields;
			TimeToHMSF(fields.mHours, fields.mMinutes, fields.mSeconds, fields.mFrames, fields.mNegative, inTime,
				inCase.mRate, inCase.mDisplay);
			return fields.mFrames;
		});
}

Work FieldsColumn(const Case& inCase)
{
	return FillColumn<TimecodeFields>([&inCase] { return SpreadTimes(inCase); },
		[&inCase](auto& outFields, const auto& inTimes)
		{ TimesToHMSF(outFields, inTimes, inCase.mRate, inCase.mDisplay); });
}

Work FieldsIn(const Case& inCase)
{
	return ForEach([&inCase] { return SpreadFields(inCase); },
		[&inCase](const TimecodeFields& inFields)
		{
			return HMSFToTime(inFields.mHours, inFields.mMinutes, inFields.mSeconds, inFields.mFrames,
				inFields.mNegative, inCase.mRate, inCase.mDisplay);
		});
}

Work FilmToVideo(PulldownCadence inCadence)
{
	static constexpr Case kFilm{"", kTimeDisplay_23976Timecode, kFrameRate_23976, {}, 0, 0};
	return ForEach([] { return SpreadTimes(kFilm); },
		[inCadence, isSplit = false](TickTime inTime) mutable
		{ return MapPulldownFrameTo2997Frame(inTime, kFrameRate_VideoNTSC, inCadence, isSplit); });
}

[[maybe_unused]] const bool sAdded = []
{
	constexpr const char* kArea = "Timecode";
	for (const Case& row : sCases)
	{
		const auto with = [&row](const char* inWhat) { return std::string(inWhat) + ", " + row.mName; };
		const std::vector<Peer> out{{"libavutil", PeerTextOut(row), row.mWantedIntoBuffer}};
		Compare(kArea, with("text into a buffer of char"), TextIntoBuffer<char>(row), out);
		Compare(kArea, with("text into a buffer of UTF-16"), TextIntoBuffer<zoncore::UTF16Char>(row), out);
		Compare(kArea, with("text as a string"), TextOut(row),
			{{"libavutil", PeerTextOut(row)}, {"GStreamer", StreamerTextOut(row)}});
		Compare(kArea, with("column of texts, a row"), TextColumn(row), {{"libavutil", PeerTextOut(row)}});
		Compare(kArea, with("text in"), TextIn(row),
			{{"libavutil", PeerTextIn(row), 10}, {"GStreamer", StreamerTextIn(row)}});
		Compare(kArea, with("column of texts in, a row"), TextColumnIn(row), {{"libavutil", PeerTextIn(row), 10}});
		Compare(kArea, with("fields"), FieldsOut(row), {{"GStreamer", StreamerFieldsOut(row)}});
		Compare(kArea, with("column of fields, a row"), FieldsColumn(row));
		Compare(kArea, with("fields in"), FieldsIn(row), {{"GStreamer", StreamerFieldsIn(row)}});
	}
	for (const Case& row : sCountCases)
	{
		const auto with = [&row](const char* inWhat) { return std::string(inWhat) + ", " + row.mName; };
		Compare(kArea, with("text into a buffer of char"), TextIntoBuffer<char>(row));
		Compare(kArea, with("text as a string"), TextOut(row));
		Compare(kArea, with("text in"), LongTextIn(row));
	}
	Compare(kArea, "film frame to video frame, cadence WWSSW", FilmToVideo(kPulldownCadence_WWSSW));
	Compare(kArea, "film frame to video frame, cadence WWWSW", FilmToVideo(kPulldownCadence_Advanced_WWWSW));
	const auto rates = [] { return std::vector<FrameRate>(AllFrameRates().begin(), AllFrameRates().end()); };
	Compare(kArea, "description of a rate as a string",
		ForEach(rates, [](FrameRate inRate) { return FrameRateDescription(inRate); }));
	Compare(kArea, "description of a rate into a buffer",
		ForEach(rates,
			[text = std::array<zoncore::UTF16Char, 64>()](FrameRate inRate) mutable
			{ return FrameRateDescription(std::span(text), inRate); }));
	return true;
}();

}   // namespace
}   // namespace benchmarks
