#include "zonmediatypes/Timecode.h"

#include "zoncore/TextWriter.h"
#include "zonmediatypes/TimeUtils.h"
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
using zoncore::utility::CopyText;
using zoncore::utility::kLongestInteger;
using zoncore::utility::Magnitude;
using zoncore::utility::WriteTwoDigits;

using TimecodeWriter = zoncore::utility::TextWriter<kLongestTimecode>;
static_assert(kLongestTimecode >= std::string_view("-23:59:59:").size() + kLongestInteger);

constexpr char FrameSeparator(const TimeDisplayRow& inRow)
{
	if (inRow.mNumbering == FrameNumbering::Drop)
		return ';';
	return inRow.mKind == DisplayKind::Milliseconds ? '.' : ':';
}

// Frame labels or samples in a second, as far as they are shown in a field.
constexpr std::uint64_t NominalCount(const TimeDisplayRow& inRow, FrameRate inRate)
{
	if (inRow.mKind != DisplayKind::Samples)
		return inRow.mCount.mNominal;
	const std::int64_t duration = inRate.GetTicksPerFrame();
	return duration < 1 ? 0 : static_cast<std::uint64_t>(kTicksPerSecond / duration);
}

// How many digits the frames field has at least: those of the largest frame number, up to five and with some room for
// rates that are just above a power of ten.
constexpr std::size_t FrameDigits(std::uint64_t inNominal)
{
	if (inNominal < 11 || inNominal > 109'999)
		return 1;
	return inNominal <= 109 ? 2 : inNominal <= 1'099 ? 3 : inNominal <= 10'999 ? 4 : 5;
}

// Whether every frame number has exactly two digits.
constexpr bool HasTwoFrameDigits(std::uint64_t inNominal)
{
	return inNominal > 10 && inNominal <= 100;
}
static_assert(!HasTwoFrameDigits(10) && !HasTwoFrameDigits(101) && FrameDigits(10) == 1 && FrameDigits(120) == 3);

// What the texts of one rate, display and set of flags have in common.
class TextForm
{
public:
	TextForm(FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
		: mPlace(PlaceOf(ChooseDisplay(inDisplay, inRate))),
		  mRow(kTimeDisplayTable[mPlace]),
		  mRate(inRate),
		  mFlags(inFlags),
		  mNominal(NominalCount(mRow, inRate))
	{
	}

	bool IsFullForm() const
	{
		constexpr TimecodeFlags kOtherForms
			= kTimecodeFlag_OmitHours | kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_ShowSign;
		return mRow.mKind == DisplayKind::Timecode && HasTwoFrameDigits(mNominal)
			&& (mFlags & kOtherForms) == TimecodeFlags();
	}

	// Of the display whose fields are shown: feet are made of frames.
	std::size_t GetFieldPlace() const
	{
		return mRow.mKind == DisplayKind::Film ? PlaceOf(kTimeDisplay_Frames) : mPlace;
	}

	TickTime ShownTime(TickTime inTime) const
	{
		return mFlags.Test(kTimecodeFlag_LastFrame) ? MovedByFrames(inTime, -1, mRate) : inTime;
	}

	// Writes kFullFormLength characters; inFields are those of inShown.
	template <class Char>
	void WriteFullForm(Char* outText, TickTime inShown, TimecodeFields inFields) const
	{
		const TimecodeFields fields = ShownFields(inShown, inFields);
		WriteTwoDigits(fields.mHours, outText);
		outText[2] = Char{':'};
		WriteTwoDigits(fields.mMinutes, outText + 3);
		outText[5] = Char{':'};
		WriteTwoDigits(fields.mSeconds, outText + 6);
		outText[8] = static_cast<Char>(static_cast<unsigned char>(FrameSeparator(mRow)));
		WriteTwoDigits(fields.mFrames, outText + 9);
	}

	// Puts any form.
	void Put(TimecodeWriter& ioText, TickTime inShown, TimecodeFields inFields) const;

private:
	// Of a negative time without a sign the hours run backwards.
	TimecodeFields ShownFields(TickTime inShown, TimecodeFields inFields) const
	{
		if (inShown < kTime_Zero && !mFlags.Test(kTimecodeFlag_ShowSign))
			inFields.mHours = 23 - inFields.mHours;
		return inFields;
	}

	void PutFields(TimecodeWriter& ioText, TimecodeFields inFields) const;

	std::size_t mPlace;
	const TimeDisplayRow& mRow;
	FrameRate mRate;
	TimecodeFlags mFlags;
	std::uint64_t mNominal;
};

void TextForm::PutFields(TimecodeWriter& ioText, TimecodeFields inFields) const
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
	ioText.PutNumber(inFields.mFrames, FrameDigits(mNominal));
}

void PutFeet(TimecodeWriter& ioText, std::int64_t inFrames, int inFramesPerFoot)
{
	ioText.PutNumber(Magnitude(inFrames / inFramesPerFoot), 1);
	ioText.Put('+');
	ioText.PutTwoDigits(Magnitude(inFrames % inFramesPerFoot));
}

void TextForm::Put(TimecodeWriter& ioText, TickTime inShown, TimecodeFields inFields) const
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
		  mFields(FieldsOf(mTime, inRate, mForm.GetFieldPlace()))
	{
	}

	template <class Char>
	void WriteFullForm(Char* outText) const
	{
		mForm.WriteFullForm(outText, mTime, mFields);
	}

	void Put(TimecodeWriter& ioText) const { mForm.Put(ioText, mTime, mFields); }

	TextForm mForm;
	TickTime mTime;
	TimecodeFields mFields;
};

template <class Char>
std::size_t WriteTimecode(std::span<Char> outText, const ShownTimecode& inShown)
{
	if (inShown.mForm.IsFullForm())
	{
		if (outText.size() >= kFullFormLength)
			inShown.WriteFullForm(outText.data());
		return kFullFormLength;
	}
	TimecodeWriter text;
	inShown.Put(text);
	return CopyText(text.GetText(), outText);
}

}   // namespace

UTF16String TimeToTimecode(TickTime inTime, FrameRate inRate, TimeDisplay inDisplay, TimecodeFlags inFlags)
{
	const ShownTimecode shown(inTime, inRate, inDisplay, inFlags);
	if (shown.mForm.IsFullForm())
	{
		UTF16String text(kFullFormLength, UTF16Char{});
		shown.WriteFullForm(text.data());
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
	const bool isFullForm = form.IsFullForm();
	WithSplitter<zoncore::utility::Reciprocal>(inRate, form.GetFieldPlace(),
		[=](auto inSplit)
		{
			for (std::size_t i = 0; i < count; ++i)
			{
				const TickTime time = form.ShownTime(inTimes[i]);
				const TimecodeFields fields = inSplit(time);
				TimecodeText& text = outTexts[i];
				if (isFullForm)
				{
					form.WriteFullForm(text.mCharacters.data(), time, fields);
					text.mLength = kFullFormLength;
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
