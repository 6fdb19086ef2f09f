#pragma once

/// \file
/// The companion's own texts, in the language of the run. They are keys as the library's are, below a path of their own.
///
/// The names of rows, columns and tables stand in the code as they read in English, because JSON's names are made from them;
/// NameInLanguage translates what is shown. All other texts have a constant.

#include <initializer_list>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zonmedia
{

/// A text with its key and what a translator must know of it.
struct OwnText
{
	std::string_view mKey;
	std::string_view mNote;
};

// clang-format off
inline constexpr OwnText kText_DecimalSign{"$$$/zonmedia/DecimalSign=.", "The sign between the whole part and the decimals of a number."};
inline constexpr OwnText kText_Yes{"$$$/zonmedia/Answer/Yes=yes", "An answer in a row of its own."};
inline constexpr OwnText kText_No{"$$$/zonmedia/Answer/No=no", "An answer in a row of its own."};
inline constexpr OwnText kText_NoBecause{"$$$/zonmedia/Answer/NoBecause=no: @0", "An answer. @0: why."};
inline constexpr OwnText kText_Unknown{"$$$/zonmedia/Value/Unknown=unknown", "Instead of a value that is not known."};
inline constexpr OwnText kText_None{"$$$/zonmedia/Value/None=none", "Instead of a value that there is none of."};
inline constexpr OwnText kText_Ticks{"$$$/zonmedia/Value/Ticks=Ticks", "A way to write times: as a count of the library's unit, the tick."};
inline constexpr OwnText kText_TickCount{"$$$/zonmedia/Value/TickCount=@0 ticks", "A duration. @0: how many ticks."};
inline constexpr OwnText kText_RoundedTickCount{"$$$/zonmedia/Value/RoundedTickCount=@0 ticks, rounded: at this rate it is no whole number of ticks", "The duration of a frame. @0: how many ticks."};
inline constexpr OwnText kText_RoundedRate{"$$$/zonmedia/Value/RoundedRate=yes: one frame is no whole number of ticks", "Whether a rate is rounded."};
inline constexpr OwnText kText_LastFrame{"$$$/zonmedia/Value/LastFrame=@0 (last frame @1)", "Where a video ends. @0, @1: times."};
inline constexpr OwnText kText_LastSample{"$$$/zonmedia/Value/LastSample=@0 (last sample @1)", "Where a sound ends. @0, @1: times."};
inline constexpr OwnText kText_NotCounted{"$$$/zonmedia/Value/NotCounted=@0 (not counted; --scan does)", "How many frames there are. @0: a number, or that it is unknown."};
inline constexpr OwnText kText_NoTimecode{"$$$/zonmedia/Value/NoTimecode=@0 (no timecode: the start is taken as 0)", "@0: a text from a file that should be a timecode."};
inline constexpr OwnText kText_NoCounterpart{"$$$/zonmedia/Value/NoCounterpart=none: the library has no counterpart of @0 @1", "Instead of a pixel format. @0: a codec; @1: a format of its pixels."};
inline constexpr OwnText kText_Average{"$$$/zonmedia/Value/Average=@0 on average", "A frame rate that varies. @0: a rate."};
inline constexpr OwnText kText_AverageAndRange{"$$$/zonmedia/Value/AverageAndRange=@0 on average, @1 to @2", "A frame rate that varies. @0, @1, @2: rates."};
inline constexpr OwnText kText_Truncated{"$$$/zonmedia/Value/Truncated=truncated: @0 of @1 frames are there", "What is missing of a file. @0, @1: numbers."};
inline constexpr OwnText kText_TruncatedSound{"$$$/zonmedia/Value/TruncatedSound=truncated: @0 of @1 samples are there", "What is missing of a file. @0, @1: numbers."};
inline constexpr OwnText kText_FromTo{"$$$/zonmedia/Value/FromTo=@0 to @1", "The headline of a conversion. @0, @1: what from and to."};
inline constexpr OwnText kText_Untaken{"$$$/zonmedia/Audio/Untaken=No channel takes @0", "@0: abbreviations of channels."};
inline constexpr OwnText kText_ChannelCounts{"$$$/zonmedia/Audio/ChannelCounts=the layouts have @0 and @1 channels", "Why channels cannot be reordered. @0, @1: numbers."};
inline constexpr OwnText kText_MissingChannel{"$$$/zonmedia/Audio/MissingChannel=the source has no @0", "Why channels cannot be reordered. @0: the abbreviation of a channel."};
inline constexpr OwnText kText_FewerUnlabelled{"$$$/zonmedia/Audio/FewerUnlabelled=the source has fewer channels without a label", "Why channels cannot be reordered."};
inline constexpr OwnText kText_Straight{"$$$/zonmedia/Video/Straight=straight", "A kind of alpha channel."};
inline constexpr OwnText kText_Premultiplied{"$$$/zonmedia/Video/Premultiplied=premultiplied", "A kind of alpha channel."};
inline constexpr OwnText kText_Ignored{"$$$/zonmedia/Video/Ignored=ignored", "A kind of alpha channel."};
inline constexpr OwnText kText_FullRange{"$$$/zonmedia/Video/FullRange=@0 full", "A colour matrix in full range. @0: the matrix."};
inline constexpr OwnText kText_Impossible{"$$$/zonmedia/Video/Impossible=@0 (impossible)", "What a conversion costs. @0: a number."};
inline constexpr OwnText kText_NothingUsable{"$$$/zonmedia/Video/NothingUsable=no format of either side can be used", "Why a pixel format was chosen."};
inline constexpr OwnText kText_Requested{"$$$/zonmedia/Video/Requested=it was requested, and the destination takes it", "Why a pixel format was chosen."};
inline constexpr OwnText kText_BothKnow{"$$$/zonmedia/Video/BothKnow=both sides know it", "Why a pixel format was chosen."};
inline constexpr OwnText kText_NothingConverts{"$$$/zonmedia/Video/NothingConverts=nothing converts; it is the first that frames can be worked in", "Why a pixel format was chosen."};
inline constexpr OwnText kText_Cheapest{"$$$/zonmedia/Video/Cheapest=the cheapest conversion, from @0 at a cost of @1", "Why a pixel format was chosen. @0: a format; @1: a number."};
inline constexpr OwnText kText_LegacyRatio{"$$$/zonmedia/Video/LegacyRatio=a wrong ratio of older projects for @0", "A pixel aspect ratio. @0: the right one."};
// clang-format on

// The library's, for rates that it need not know.
inline constexpr OwnText kText_FrameRate{"$$$/zonmediatypes/FrameRateFormat/Video=@0fps", ""};
inline constexpr OwnText kText_SampleRate{"$$$/zonmediatypes/FrameRateFormat/Audio=@0Hz", ""};

/// All of the companion's texts, the names of rows, columns and tables among them, in an order that stays.
std::vector<std::pair<std::string, std::string_view>> AllOwnTexts();

/// A text in the language of the run, with its placeholders filled.
std::string Say(const OwnText& inText, std::initializer_list<std::string> inReplacements = {});

/// The name of a row, a column or a table, in the language of the run. What is no such name, as the channels over a matrix, stays
/// as it is.
std::string NameInLanguage(std::string_view inEnglish);

/// inText with the decimal sign of the run's language in its numbers: between digits.
std::string WithDecimalSign(std::string_view inText);

}   // namespace zonmedia
