#include "zonmediatypes/Timecode.h"

#include "zonmediatypes/src/TextWriter.h"
#include "zonmediatypes/src/timecode/TimecodeFields.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace zonmediatypes
{
namespace
{

using zoncore::UTF16Char;
using zoncore::UTF16String;
using zoncore::utility::Magnitude;

using TimecodeWriter = TextWriter<kLongestTimecode>;
static_assert(kLongestTimecode >= std::string_view("-23:59:59:").size() + kLongestInteger);

constexpr char FrameSeparator(const TimeDisplayRow& inRow)
{
	if (inRow.mNumbering == FrameNumbering::Drop)
		return ';';
	return inRow.mKind == DisplayKind::Milliseconds ? '.' : ':';
}

// How many digits the frames field has at least: those of the largest frame number, up to five and with some room for
// rates that are just above a power of ten.
std::size_t FrameDigits(const TimeDisplayRow& inRow, FrameRate inRate)
{
	if (inRow.mKind == DisplayKind::Timecode)
		return 2;
	const std::int64_t duration = (inRow.CountsAtCallersRate() ? inRate : inRow.mRate).GetTicksPerFrame();
	const std::int64_t nominal = duration < 1 ? 0 : kTicksPerSecond / duration;
	if (nominal < 11 || nominal > 109'999)
		return 1;
	return nominal <= 109 ? 2 : nominal <= 1'099 ? 3 : nominal <= 10'999 ? 4 : 5;
}

// What the texts of one rate, display and set of flags have in common.
class TextForm
{
public:
	TextForm(FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
		: mDisplay(ChooseDisplay(inDisplay, inRate)),
		  mRow(FindTimeDisplay(mDisplay)),
		  mRate(inRate),
		  mFlags(inFlags),
		  mFrameDigits(FrameDigits(mRow, inRate))
	{
	}

	bool IsUsual() const
	{
		constexpr TimecodeFlags kOtherForms
			= kTimecodeFlag_OmitHours | kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_ShowSign;
		return mRow.mKind == DisplayKind::Timecode && (mFlags & kOtherForms) == TimecodeFlags();
	}

	// The display whose fields are shown: feet are made of frames.
	TimeDisplay GetFieldDisplay() const { return mRow.mKind == DisplayKind::Film ? kTimeDisplay_Frames : mDisplay; }

	TickTime ShownTime(TickTime inTime) const
	{
		return mFlags.Test(kTimecodeFlag_LastFrame) ? MovedByFrames(inTime, -1, mRate) : inTime;
	}

	// Writes kUsualLength characters; inFields are those of inShown.
	template <class Char>
	void WriteUsual(Char* outText, TickTime inShown, HMSF inFields) const
	{
		const HMSF fields = ShownFields(inShown, inFields);
		WriteTwoDigits(fields.mHours, outText);
		outText[2] = Char{':'};
		WriteTwoDigits(fields.mMinutes, outText + 3);
		outText[5] = Char{':'};
		WriteTwoDigits(fields.mSeconds, outText + 6);
		outText[8] = static_cast<Char>(static_cast<unsigned char>(FrameSeparator(mRow)));
		WriteTwoDigits(fields.mFrames, outText + 9);
	}

	// Puts any form.
	void Put(TimecodeWriter& ioText, TickTime inShown, HMSF inFields) const;

private:
	// Of a negative time without a sign the hours run backwards.
	HMSF ShownFields(TickTime inShown, HMSF inFields) const
	{
		if (inShown < kTime_Zero && !mFlags.Test(kTimecodeFlag_ShowSign))
			inFields.mHours = 23 - inFields.mHours;
		return inFields;
	}

	void PutFields(TimecodeWriter& ioText, HMSF inFields) const;

	TimeDisplay mDisplay;
	const TimeDisplayRow& mRow;
	FrameRate mRate;
	TimecodeFlags mFlags;
	std::size_t mFrameDigits;
};

void TextForm::PutFields(TimecodeWriter& ioText, HMSF inFields) const
{
	bool isLeading = mFlags.Test(kTimecodeFlag_TrimLeadingZeros);
	const auto put = [&](std::uint32_t inField)
	{
		if (!isLeading)
			return ioText.PutTwoDigits(inField);
		ioText.PutNumber(inField, 1);
		isLeading = false;
	};
	const auto putBeforeColon = [&](std::uint32_t inField)
	{
		if (isLeading && inField == 0)
			return;
		put(inField);
		ioText.Put(':');
	};
	if (!mFlags.Test(kTimecodeFlag_OmitHours))
		putBeforeColon(inFields.mHours);
	putBeforeColon(inFields.mMinutes);
	put(inFields.mSeconds);
	ioText.Put(FrameSeparator(mRow));
	ioText.PutNumber(inFields.mFrames, mFrameDigits);
}

void PutFeet(TimecodeWriter& ioText, std::int64_t inFrames, int inFramesPerFoot)
{
	ioText.PutNumber(Magnitude(inFrames / inFramesPerFoot), 1);
	ioText.Put('+');
	ioText.PutTwoDigits(Magnitude(inFrames % inFramesPerFoot));
}

void TextForm::Put(TimecodeWriter& ioText, TickTime inShown, HMSF inFields) const
{
	const bool showsSign = mFlags.Test(kTimecodeFlag_ShowSign);
	const auto count = static_cast<std::int64_t>(inFields.mFrames);
	if (showsSign && inShown > kTime_Zero)
		ioText.Put('+');
	// A count has the sign of its own number, feet have that of the time with and without the flag.
	const bool isNegative = mRow.mKind == DisplayKind::Frames ? count < 0
		: mRow.mKind == DisplayKind::Film                     ? inShown < kTime_Zero
															  : inShown < kTime_Zero && showsSign;
	if (isNegative)
		ioText.Put('-');
	if (mRow.mKind == DisplayKind::Frames)
		ioText.PutNumber(Magnitude(count), 1);
	else if (mRow.mKind == DisplayKind::Film)
		PutFeet(ioText, count, mRow.mFramesPerFoot);
	else
		PutFields(ioText, ShownFields(inShown, inFields));
}

// One time, taken apart for its text.
struct ShownTimecode
{
	ShownTimecode(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
		: mForm(inRate, inDisplay, inFlags),
		  mTime(mForm.ShownTime(inTime)),
		  mFields(FieldsOf(mTime, inRate, mForm.GetFieldDisplay()))
	{
	}

	template <class Char>
	void WriteUsual(Char* outText) const
	{
		mForm.WriteUsual(outText, mTime, mFields);
	}

	void Put(TimecodeWriter& ioText) const { mForm.Put(ioText, mTime, mFields); }

	TextForm mForm;
	TickTime mTime;
	HMSF mFields;
};

template <class Char>
std::size_t WriteTimecode(std::span<Char> outText, const ShownTimecode& inShown)
{
	if (inShown.mForm.IsUsual())
	{
		if (outText.size() >= kUsualLength)
			inShown.WriteUsual(outText.data());
		return kUsualLength;
	}
	TimecodeWriter text;
	inShown.Put(text);
	return CopyText(text.GetText(), outText);
}

}   // namespace

UTF16String TimeToTimecode(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	const ShownTimecode shown(inTime, inRate, inDisplay, inFlags);
	if (shown.mForm.IsUsual())
	{
		UTF16String text(kUsualLength, UTF16Char{});
		shown.WriteUsual(text.data());
		return text;
	}
	TimecodeWriter text;
	shown.Put(text);
	return UTF16String(text.GetText());
}

std::size_t TimeToTimecode(std::span<UTF16Char> outText, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay,
	TimecodeFlags inFlags) noexcept
{
	return WriteTimecode(outText, ShownTimecode(inTime, inRate, inDisplay, inFlags));
}

std::size_t TimeToTimecode(
	std::span<char> outText, TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags) noexcept
{
	return WriteTimecode(outText, ShownTimecode(inTime, inRate, inDisplay, inFlags));
}

std::size_t TimesToTimecode(std::span<TimecodeText> outTexts, std::span<const TickTime> inTimes, FrameRate inRate,
	TimeDisplay inDisplay, TimecodeFlags inFlags) noexcept
{
	const std::size_t count = std::min(outTexts.size(), inTimes.size());
	const TextForm form(inRate, inDisplay, inFlags);
	const bool isUsual = form.IsUsual();
	WithSplitter<zoncore::utility::Reciprocal>(inRate, form.GetFieldDisplay(),
		[&](auto inSplit)
		{
			for (std::size_t i = 0; i < count; ++i)
			{
				const TickTime time = form.ShownTime(inTimes[i]);
				const HMSF fields = inSplit(time);
				TimecodeText& text = outTexts[i];
				if (isUsual)
				{
					form.WriteUsual(text.mCharacters.data(), time, fields);
					text.mLength = kUsualLength;
					continue;
				}
				TimecodeWriter writer;
				form.Put(writer, time, fields);
				text.mLength = static_cast<std::uint16_t>(CopyText<UTF16Char>(writer.GetText(), text.mCharacters));
			}
		});
	return count;
}

UTF16String RatioTimeToTimecode(RatioTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	return TimeToTimecode(RatioTimeToTime(inTime), inRate, inDisplay, inFlags);
}

}   // namespace zonmediatypes
