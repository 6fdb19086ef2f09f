// The companion, run as its users run it: what it prints, what it complains about and how it ends.

#include "tests/companion/ProgramRunner.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <iterator>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>
#include <tuple>
#include <utility>

namespace
{

using nlohmann::json;
using testing::HasSubstr;

const std::string kClip = ZON_CLIP;

// The document that a command prints; a test that expects one fails without.
json Document(std::vector<std::string> inArguments, const std::string& inInput = "", int inStatus = 0)
{
	inArguments.emplace_back("--json");
	const Outcome outcome = Zonmedia(inArguments, inInput);
	EXPECT_EQ(outcome.mStatus, inStatus) << outcome.mErrors;
	json document = json::parse(outcome.mOutput, nullptr, false);
	EXPECT_FALSE(document.is_discarded()) << outcome.mOutput;
	return document;
}

// What a document is expected to say, by place.
using Facts = std::vector<std::pair<const char*, json>>;

void ExpectFacts(const json& inDocument, const Facts& inFacts)
{
	for (const auto& [place, value] : inFacts)
	{
		const json::json_pointer pointer(place);
		ASSERT_TRUE(inDocument.contains(pointer)) << place << " in " << inDocument.dump(2);
		EXPECT_EQ(inDocument.at(pointer), value) << place;
	}
}

constexpr const char* kNoFFmpeg = "ffmpeg makes the files of this test, and it is not installed";

// The folder of what a script makes, once for all tests; empty without ffmpeg.
std::string Made(const std::string& inScript)
{
	const std::string folder = kScratch + inScript;
	if (std::filesystem::exists(folder))
		return folder;
	if (std::system("ffmpeg -version >/dev/null 2>&1") != 0)
		return "";
	EXPECT_EQ(std::system(("sh " + ShellQuoted(ZON_TEST_DATA "/" + inScript) + " " + ShellQuoted(folder)).c_str()), 0);
	return folder;
}

// ---- Results of commands ---------------------------------------------------------------------------------------------

TEST(Zonmedia, PrintsTheResultAlone)
{
	struct Case
	{
		std::vector<std::string> mArguments;
		std::string mOutput, mInput{};
	};
	for (const auto& [arguments, output, input] :
		std::initializer_list<Case>{
			{{"time", "01:00:00;00", "--rate", "29.97", "--to", "frames"}, "107892\n"},
			{{"time", "107892", "--rate", "30000/1001", "--display", "frames", "--to", "29.97df"}, "01:00:00;00\n"},
			{{"time", "62+08", "--rate", "24", "--display", "35mm", "--to", "24"}, "00:00:41:16\n"},
			{{"time", "100", "--rate", "100", "--display", "frames", "--to", "auto"}, "100\n"},   // has no timecode
			{{"time", "00:00:01:00", "--display", "25", "--to", "samples", "--to-rate", "48000Hz"}, "00:00:01:00000\n"},
			// Values that begin as options do
			{{"time", "-00:00:01:00", "--rate", "25", "--to", "ticks"}, "-254016000000\n"},
			{{"time", "-:30", "--rate", "25", "--to", "ms"}, "-00:00:01.200\n"},
			{{"time", "--rate", "25", "--to", "ms", "--", "-:30"}, "-00:00:01.200\n"},
			{{"time", "--to", "frames", "-1001001", "--rate", "48000Hz", "--display", "frames"}, "-1001001\n"},
			{{"time", "-", "--rate", "29.97", "--display", "frames", "--to", "29.97df"},
				"00:00:59;29\n00:01:00;02\n00:10:00;00\n", "1799\n\n 1800 \r\n17982"},
			{{"samples", "00;01;00;02", "--rate", "48000Hz", "--format", "dropframe", "--to", "samples"}, "2882880\n"},
			{{"samples", "132000", "--rate", "48000", "--format", "samples", "--to", "bars", "--meter", "3/4",
				 "--tempo", "60"},
				"1:3.720\n"},
			{{"samples", "-2928000", "--rate", "48000", "--format", "samples", "--to", "timecode"}, "-00:01:01:00\n"},
			{{"audio", "matrix", "L,L,LFE", "R,L"}, R"(3 Channels (L L LFE) to 2 Channels (R L)

  Matrix
       L    L  LFE
  R  0.5  0.5    .
  L    1    .    .

  No channel takes LFE
)"},
			{{"audio", "map", "*,L", "L,*"}, R"(2 Channels (* L) to 2 Channels (L *)

  Ordering
  Destination  Label  Source
            0  L           1
            1  *           0
)"},
			{{"audio", "map", "5.1", "stereo"},
				"5.1 (L, R, C, LFE, Ls, Rs) to Stereo\n  Is reordering  no: the layouts have 6 and 2 channels\n"},
			{{"audio", "map", "5.1 (L, R, C, LFE, Ls, Rs)", "Stereo"},
				"5.1 (L, R, C, LFE, Ls, Rs) to Stereo\n  Is reordering  no: the layouts have 6 and 2 channels\n"},
			{{"audio", "map", "L,L", "L,C"},
				"2 Channels (L L) to 2 Channels (L C)\n  Is reordering  no: the source has no C\n"},
			{{"audio", "map", "*,L", "*,*"},
				"2 Channels (* L) to 2 Channels\n"
				"  Is reordering  no: the source has fewer channels without a label\n"},
		})
	{
		const Outcome outcome = Zonmedia(arguments, input);
		EXPECT_EQ(outcome.mOutput, output) << testing::PrintToString(arguments);
		EXPECT_EQ(outcome.mStatus, 0) << outcome.mErrors;
		EXPECT_EQ(outcome.mErrors, "");
	}
}

TEST(Zonmedia, PrintsOneDocument)
{
	using Arguments = std::vector<std::string>;
	for (const auto& [arguments, facts] : std::initializer_list<std::pair<Arguments, Facts>>{
			 {{"time", "01:00:00;00", "--rate", "29.97"},
				 {{"/times/0/value", "01:00:00;00"}, {"/times/0/rate", "30000/1001"}, {"/times/0/rateIsRounded", false},
					 {"/times/0/ticks", 914'456'685'542'400}, {"/problems", json::array()}}},
			 {{"time", " 5 ", "--rate", "48000Hz"}, {{"/times/0/value", "5"}, {"/times/0/display", "samples"}}},
			 {{"samples", "48000", "--rate", "48000", "--format", "samples", "--fps", "25"},
				 {{"/positions/0/sampleRate", 48'000}, {"/positions/0/formats/2/format", "timecode"},
					 {"/positions/0/formats/2/text", "00:00:01:00"}}},
			 {{"audio", "layouts"}, {{"/layouts/3/name", "Broadcast51"}, {"/layouts/3/count", 6}}},
			 {{"audio", "layout", "l,r,c,lfe,ls,rs,"},
				 {{"/description", "5.1 (L, R, C, LFE, Ls, Rs)"}, {"/hasLfe", true}, {"/labels/4/leftRight", "Rs"},
					 {"/labels/3/frontBack", nullptr}}},
			 {{"AUDIO", "layout", "L R C  LFE Ls Rs"}, {{"/description", "5.1 (L, R, C, LFE, Ls, Rs)"}}},
			 {{"audio", "layout", "8 channels (L R C LFE Rls Rrs Ls Rs)"},
				 {{"/description", "8 Channels (L R C LFE Rls Rrs Ls Rs)"}}},
			 {{"audio", "matrix", "Broadcast51", "L,C"},
				 {{"/from", "5.1 (L, R, C, LFE, Ls, Rs)"}, {"/matrix", {{1, 0, 0, 0, 0, 0}, {0, 0, 1, 0, 0, 0}}},
					 {"/untaken", {"R", "LFE", "Ls", "Rs"}}}},
			 {{"audio", "map", "Broadcast51", "Legacy51"},
				 {{"/isReordering", true}, {"/ordering/2/label", "Ls"}, {"/ordering/2/source", 4}}},
			 {{"video", "formats"},
				 {{"/count", 74}, {"/formats/15/name", "BGRA_4444_8u"}, {"/formats/15/properties", 0x40080},
					 {"/formats/73/code", "Yv1F"}, {"/formats/73/chroma", "4:2:0"}}},
			 {{"video", "cost", "VUYA_4444_8u", "bgra", "--quality", "max"},
				 {{"/cost", 201}, {"/isPossible", true}, {"/to/name", "BGRA_4444_8u"}}},
			 {{"video", "nearest", "--from", "NTSCDV25", "--to", "VUYA_4444_8u,UYVY_422_8u"},
				 {{"/nearest/name", "UYVY_422_8u"}, {"/cost", 2}, {"/source", "NTSCDV25"},
					 {"/why", "the cheapest conversion, from NTSCDV25 at a cost of 2"}}},
			 {{"video", "nearest", "--from", "bgra", "--to", "any", "--request", "v210", "--prefer-request"},
				 {{"/nearest/name", "V210_422_10u"}, {"/why", "it was requested, and the destination takes it"}}},
			 {{"video", "size", "V210_422_10u", "1280x720"}, {{"/frameBytes", 3456 * 720}, {"/rowBytes", 3456}}},
			 {{"video", "size", "PALDV25", "1x1"},
				 {{"/frameBytes", 144'000}, {"/rowBytes", nullptr}, {"/fixedSize", {{"width", 720}, {"height", 576}}}}},
			 {{"video", "ratio", "10/11", "720x480"},
				 {{"/inSquarePixels/width", 655}, {"/fromSquarePixels/width", 792},
					 {"/description", "D1/DV NTSC (0.9091)"}, {"/legacy", nullptr}}},
			 {{"pulldown", "--cadence", "WSSWW"},
				 {{"/rate", "30000/1001"}, {"/frames/1/videoFrame", 2}, {"/frames/1/letter", "S"},
					 {"/frames/1/marked", true}, {"/frames/5/videoTime", "00:00:00;07"}}},
			 {{"check"}, {{"/havePassed", true}, {"/checks/0/suite", "ZON.MediaTypes"}}},
			 {{"keys"}, {{"/keys/0/path", "$$$/zonmediatypes/FrameRateFormat/Audio"}, {"/keys/0/text", "@0Hz"}}},
		 })
		ExpectFacts(Document(arguments), facts);
	ExpectFacts(Document({"time", "-", "--rate", "2997/100", "--display", "frames", "--to", "ms"}, "1\nx\n2\n", 1),
		{{"/times/1/result", "00:00:00.066"}, {"/times/0/rateIsRounded", true},
			{"/problems/0/input", "line 2: \"x\""}});
}

// ---- Complaints ------------------------------------------------------------------------------------------------------

TEST(Zonmedia, ComplainsInOneLine)
{
	struct Case
	{
		std::vector<std::string> mArguments;
		int mStatus;
		const char* mComplaint;
	};
	for (const auto& [arguments, status, complaint] :
		std::initializer_list<Case>{
			{{}, 2, "a command is required: sheet, time, "},
			{{"audio"}, 2, "a command is required: layouts, "},
			{{"time", "5", "--rat", "25"}, 2, "no option is named \"--rat\"; the closest are --rate, "},
			{{"time", "5", "--rate"}, 2, "--rate needs a value"},
			{{"time", "5", "--rate", "25", "--rate", "24"}, 2, "--rate is given more than once"},
			{{"time", "--rate", "25", "5", "--", "--json"}, 2, "--json stands after \"--\""},
			{{"--json", "time", "5", "--rate", "25"}, 2, "--json stands after the command"},
			{{"time", "5", "6", "7", "--rate", "25"}, 2, "\"6\" is one argument too many"},
			{{"time", "1", "--display", "tc"}, 2, "no display is named \"tc\"; there are 24, 25, "},
			{{"tiem"}, 2, "no command is named \"tiem\"; the closest are time"},
			{{"pixel", "--help"}, 2, "no command is named \"pixel\""},
			{{"audio", "pixel", "--help"}, 2, "no command is named \"pixel\""},
			{{"audio", "layout", "4 Channels"}, 2, "no layout is named"},   // there are several
			{{"time"}, 2, "VALUE is required"},
			{{"time", "1", "--display", "frames"}, 2, "the display frames has no rate of its own: --rate is required"},
			{{"time", "1", "--to", "25"}, 2, "--rate is required, or a --display with a rate of its own"},
			{{"time", "1", "--rate", "1/99999999999"}, 2, "up to 254016000000 frames a second, and at most 36310201 s"},
			{{"time", "1", "--rate", "23.98"}, 2, "\"23.98\"; the closest are 23.976"},
			{{"time", "1", "--rate", "25", "--display", "29.97fd"}, 2,
				"no display is named \"29.97fd\"; the closest are 29.97df"},
			{{"time", "1::2", "--display", "29.97df"}, 1, "such as 01:02:03;04 (29.97 fps Drop-Frame Timecode)"},
			{{"time", "62+8x", "--rate", "24", "--display", "35mm"}, 1,
				"\"62+8x\": not a time; expected something such as "},
			{{"time", "abc", "--rate", "24", "--display", "16mm"}, 1, "Feet + Frames 16 mm"},
			{{"time", "99999999+00", "--rate", "24", "--display", "35mm"}, 1, "too large a number in it"},
			{{"time", "  ", "--rate", "24"}, 1, "\"\": not a time"},
			{{"time", std::string(100'000, '9'), "--rate", "24"}, 1, "9...\" (100000 characters): too large a number"},
			{{"time", "4294967296", "--rate", "48000Hz", "--display", "frames"}, 1, "expected 4294967295 at most"},
			{{"time", "907755027", "--rate", "25", "--display", "frames"}, 1, "expected 907755026 at most"},
			{{"time", "1.5", "--rate", "25", "--display", "ticks"}, 1, "whole number of ticks"},
			{{"samples", "none", "--rate", "48000", "--format", "bars"}, 1, "\"none\": no digits"},
			{{"samples", "00:00:0x:01", "--rate", "48000", "--format", "timecode"}, 1,
				"\"x\" in it is neither a digit nor a separator; expected something like \"00:01:01:15\""},
			{{"samples", "1e4", "--rate", "48000", "--format", "ms"}, 1,
				"\"e\" in it is neither a digit nor a separator; expected something like \"61500\""},
			{{"samples", "9223372036854775808", "--rate", "48000", "--format", "samples"}, 1,
				"too large a number in it"},
			{{"samples", "1:2147483648", "--rate", "48000", "--format", "timecode"}, 1, "too large a number in it"},
			{{"samples", "1", "--rate", "48k", "--format", "samples"}, 2, "\"48k\" is no sample rate"},
			{{"samples", "1", "--rate", "0", "--format", "samples"}, 2, "expected 1 to 2147483647 samples a second"},
			{{"samples", "1", "--rate", "2147483648", "--format", "samples"}, 2, "\"2147483648\" is no sample rate"},
			{{"samples", "1", "--rate", "48000", "--format", "bars", "--ticks", "0"}, 2, "--ticks \"0\" is no"},
			{{"samples", "1", "--rate", "48000", "--format", "bars", "--tempo", "nan"}, 2,
				"--tempo \"nan\" is no tempo; expected 0.001 to 100000 quarter notes a minute"},
			{{"samples", "1", "--rate", "48000", "--format", "bars", "--offset", "1e400"}, 2,
				"--offset \"1e400\" is no offset; expected a number of milliseconds"},
			{{"samples", "1", "--rate", "48000", "--format", "timecode", "--fps", "29.97"}, 2,
				"--fps \"29.97\" is no nominal frame rate; expected a whole number from 1 to 100000"},
			{{"samples", "1", "--rate", "48000", "--format", "dropframe", "--fps", "25"}, 2, "--fps 25"},
			{{"samples", "1", "--rate", "48000", "--format", "bars", "--meter", "0/4"}, 2, "\"0/4\""},
			{{"audio", "layout", "7.1"}, 2,
				"the closest are 7_1, 7_1Itu, 7_1Mpeg, 7_1EMagic; abbreviations (L,R,LFE) also"},
			{{"audio", "layout", "22.2"}, 2, "the closest are VST22_2, "},
			{{"audio", "layout", "L,Lz"}, 2, "no channel is named \"Lz\""},
			{{"video", "size", "BGRA4444_8", "1x1"}, 2, "the closest are BGRA_4444_8u"},
			{{"video", "cost", "bgra", "qqqq"}, 2, "named \"qqqq\"; \"zonmedia video formats\" lists them"},
			{{"video", "nearest", "--from", "bgra,,", "--to", "any"}, 2, "a name is missing in \"bgra,,\""},
			{{"video", "size", "bgra", "0x3"}, 2, "\"0x3\" is no frame size"},
			{{"video", "size", "UYVY_422_8u", "2000000000x1"}, 2, "in pixels, 1 to 100000000 each"},
			{{"video", "ratio", "10/0", "720x480"}, 2, "with a denominator above 0"},
			{{"sheet", ""}, 1, "\"\": No such file"},
			{{"sheet", "missing.mov"}, 1, "missing.mov: No such file"},
			{{"sheet", ZON_PROGRAM}, 1, "not a media file"},
			{{"sheet", "http://127.0.0.1/clip.mov"}, 1, "No such file"},   // names are files, never addresses
			{{"sheet", "line\nbreak"}, 1, "line?break"},
		})
	{
		const Outcome outcome = Zonmedia(arguments);
		EXPECT_EQ(outcome.mOutput, "");
		ExpectComplaint(outcome, status, complaint);
	}
}

TEST(Zonmedia, ShowsTheOtherFilesWhenOneIsBad)
{
	const Outcome text = Zonmedia({"sheet", "missing.mov", kClip});
	EXPECT_EQ(text.mStatus, 1);
	EXPECT_THAT(text.mErrors, HasSubstr("missing.mov"));
	EXPECT_THAT(text.mOutput, HasSubstr("00:59:58;00"));
	ExpectFacts(Document({"sheet", "missing.mov", kClip, "\xFF.mov"}, "", 1),
		{{"/files/0/file", kClip}, {"/problems/0/input", "missing.mov"}, {"/problems/1/input", "\uFFFD.mov"}});
}

TEST(Zonmedia, ComplainsWhenNothingCanBeWritten)
{
	const std::string command = ShellQuoted(ZON_PROGRAM) + " sheet " + ShellQuoted(kClip) + " >/dev/full 2>/dev/null";
	EXPECT_EQ(WEXITSTATUS(std::system(command.c_str())), 1);
}

TEST(Zonmedia, HelpsWithExamples)
{
	for (const char* const command : {"sheet", "time", "samples", "check", "keys"})
		EXPECT_THAT(Zonmedia({command, "--help"}).mOutput, HasSubstr("Examples:\n  zonmedia " + std::string(command)));
	EXPECT_THAT(Zonmedia({"--help"}).mOutput, HasSubstr("Exit status"));
	EXPECT_THAT(Zonmedia({"time", "--help"}).mOutput, HasSubstr("one of: 24, 25, 29.97df,"));
}

std::size_t LongestLine(const std::string& inText)
{
	std::istringstream lines(inText);
	std::size_t longest = 0;
	for (std::string line; std::getline(lines, line);)
		longest = std::max(longest, line.size());
	return longest;
}

TEST(Zonmedia, KeepsToTheLine)
{
	for (const std::string command : {"", "sheet", "time", "samples", "pulldown", "audio", "video", "check", "keys",
			 "audio layout", "audio matrix", "video cost", "video nearest", "video size", "video ratio"})
	{
		std::istringstream words(command);
		std::vector<std::string> arguments(std::istream_iterator<std::string>(words), {});
		arguments.emplace_back("--help");
		EXPECT_LE(LongestLine(Zonmedia(arguments).mOutput), 80u) << command;
	}
	const std::vector<std::vector<std::string>> tables = {{"sheet", kClip}, {"video", "formats"}, {"check"},
		{"audio", "matrix", "VST22_2", "VST22_2"}, {"samples", "1", "--rate", "48000", "--format", "samples"}};
	for (const std::vector<std::string>& arguments : tables)
	{
		const std::string whole = Zonmedia(arguments).mOutput;   // for a file: rows as they are
		ASSERT_EQ(setenv("COLUMNS", "80", 1), 0);
		const std::string wrapped = Zonmedia(arguments).mOutput;
		ASSERT_EQ(unsetenv("COLUMNS"), 0);
		EXPECT_LE(LongestLine(wrapped), 80u) << wrapped;
		const auto words = [](const std::string& inText)
		{
			std::istringstream stream(inText);
			return std::set<std::string>(std::istream_iterator<std::string>(stream), {});
		};
		EXPECT_EQ(words(wrapped), words(whole));
	}
}

TEST(Zonmedia, IsCompleted)
{
	const std::string program = ShellQuoted(ZON_PROGRAM);
	for (const auto& [typed, offered] :
		std::initializer_list<std::pair<std::string, std::string>>{{"ti", "time"}, {"audio m", "matrix map"},
			{"--language p", "pt_BR"}, {"--language de ti", "time"}, {"time 5 --display 29", "29.97df 29.97ndf"},
			{"samples 1 --format b", "beats bars"}, {"time --ra", "--rate"}})
	{
		const std::string script = "source " + ShellQuoted(ZON_COMPLETION) + "; COMP_WORDS=(" + program + " " + typed
			+ "); COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); _zonmedia; echo \"${COMPREPLY[*]}\" >" + kScratch + "offered";
		ASSERT_EQ(std::system(("bash -c " + ShellQuoted(script)).c_str()), 0);
		EXPECT_EQ(FileText(kScratch + "offered"), offered + "\n") << typed;
	}
}

// ---- Sheets ----------------------------------------------------------------------------------------------------------

TEST(Zonmedia, ShowsTheClip)
{
	const json document = Document({"sheet", kClip});
	ExpectFacts(document.at("files").at(0),
		{{"/rate", "30000/1001"}, {"/frameDuration", 8'475'667'200}, {"/display", "29.97df"},
			{"/start", {{"text", "00:59:58;00"}, {"ticks", 107'832 * 8'475'667'200}}},
			{"/end", {{"text", "01:00:03;00"}, {"ticks", 107'982 * 8'475'667'200}}},
			{"/lastFrame", {{"text", "01:00:02;29"}, {"ticks", 107'981 * 8'475'667'200}}},
			{"/duration", {{"text", "00:00:05;00"}, {"ticks", 150 * 8'475'667'200}}}, {"/frames", 150},
			{"/audioStreams/0/rate", 48'000}, {"/audioStreams/0/layout", "Stereo"},
			{"/frameSize", {{"text", "720w 480h (0.9091)"}, {"width", 720}, {"height", 480}}},
			{"/pixelShape/text", "D1/DV NTSC (0.9091)"}, {"/pixelFormat/text", "YUV 420 MPEG4 Frame 8u"}});
	const Facts durations = {{"24", "00:00:05:00"}, {"59.94df", "00:00:05;00"}, {"frames", "150"}, {"16mm", "3+30"},
		{"35mm", "9+06"}, {"samples", "00:00:05:00240"}, {"ms", "00:00:05.005"}, {"ticks", "1271350080000"}};
	for (const auto& [display, text] : durations)
	{
		const json& rows = document.at("/files/0/durationInOtherDisplays"_json_pointer);
		const auto row
			= std::ranges::find_if(rows, [name = display](const json& inRow) { return inRow["display"] == name; });
		ASSERT_NE(row, rows.end()) << display;
		EXPECT_EQ((*row)["text"], text) << display;
	}
}

TEST(Zonmedia, ShowsWhatOtherSoftwareWrites)
{
	const std::string folder = Made("make-media.sh");
	if (folder.empty())
		GTEST_SKIP() << kNoFFmpeg;
	for (const auto& [file, facts] : std::initializer_list<std::pair<std::string, Facts>>{
			 {"v210-drop.mov", {{"/start/text", "01:00:00;00"}, {"/lastFrame/text", "01:00:00;01"}, {"/frames", 2}}},
			 {"v210-non-drop.mov", {{"/rate", "24000/1001"}, {"/display", "23.976"}, {"/end/text", "01:00:00:02"}}},
			 {"over-midnight.mov",
				 {{"/display", "59.94df"}, {"/start/text", "23:59:59;58"}, {"/end/text", "00:00:00;06"}}},
			 {"inexact.avi",
				 {{"/rate", "2997/100"}, {"/rateIsRounded", true}, {"/frameDuration", 8'475'675'676},
					 {"/display", "frames"}, {"/end/text", "1000"}}},
			 {"fifteen.mp4", {{"/rate", "15"}, {"/display", "frames"}, {"/lastFrame/text", "14"}}},
			 {"mpeg2-pal.m2v",
				 {{"/frames", 3}, {"/end/text", "00:00:00:03"}, {"/timecodeTag", nullptr},
					 {"/fields", "Lower Field First"}, {"/pixelFormat/text", "YUV 420 MPEG2 Field 8u"}}},
			 {"mpeg2-709.m2v", {{"/pixelFormat/text", "YUV 420 MPEG2 Field 8u 709"}, {"/frameSize/width", 1440}}},
			 {"uyvy.mov", {{"/pixelFormat/name", "UYVY_422_8u"}}},
			 {"yuyv.mov", {{"/pixelFormat/name", "YUYV_422_8u"}}},
			 {"bgra.avi", {{"/pixelFormat/name", "BGRA_4444_8u"}}},
			 {"argb.mov", {{"/pixelFormat/name", "ARGB_4444_8u"}}},
			 {"h264.mp4", {{"/pixelFormat", nullptr}, {"/storedAs", "yuv420p"}, {"/videoCodec", "h264"}}},
			 {"dv25-ntsc.dv", {{"/frames", 1}, {"/frameDuration", 8'475'667'200}, {"/pixelFormat/name", "NTSCDV25"}}},
			 {"dv25-pal.dv", {{"/pixelFormat/name", "PALDV25"}}},
			 {"dv50-ntsc.dv", {{"/pixelFormat/name", "NTSCDV50"}}},
			 {"dv50-pal.dv", {{"/pixelFormat/name", "PALDV50"}}},
			 {"dv100-720p60.mov", {{"/display", "59.94df"}, {"/pixelFormat/name", "NTSC_DV100_720p"}}},
			 {"dv100-1080i60.mov", {{"/pixelFormat/name", "NTSC_DV100_1080i"}}},
			 {"dv100-1080i50.mov", {{"/pixelFormat/name", "PAL_DV100_1080i"}}},
			 {"stereo.wav", {{"/audio", "Stereo"}}},
			 {"5.1-back.wav", {{"/audio", "5.1 (L, R, C, LFE, Ls, Rs)"}}},
			 {"5.1-side.wav", {{"/audio", "5.1 (L, R, C, LFE, Ls, Rs)"}}},
			 {"5.1.m4a", {{"/audio", "5.1 (L, R, C, LFE, Ls, Rs)"}, {"/samples", 2400}}},
			 {"7.1.wav", {{"/audio", "8 Channels (L R C LFE Rls Rrs Ls Rs)"}}},
			 {"mono.wav",
				 {{"/audio", "Mono"}, {"/rate", "48000"}, {"/display", "samples"}, {"/samples", 480},
					 {"/milliseconds", "00:00:00.010"}}},
			 {"ten-hours.wav", {{"/start/text", "10:00:00:00000"}, {"/lastSample/text", "10:00:00:00479"}}},
			 {"stereo.aac", {{"/samples", 49'152}}},
		 })
	{
		SCOPED_TRACE(file);
		ExpectFacts(Document({"sheet", folder + "/" + file}).at("files").at(0), facts);
	}
}

TEST(Zonmedia, TellsHowLongVideoIs)
{
	const std::string folder = Made("make-media.sh");
	if (folder.empty())
		GTEST_SKIP() << kNoFFmpeg;
	const char* const average = "/variableFrameRate/average";
	const char* const lowest = "/variableFrameRate/lowest";
	const Facts twoSeconds = {{"/frames", 50}, {"/duration/text", "00:00:02:00"}, {"/variableFrameRate", nullptr}};
	const Facts uneven = {{"/frames", 62}, {"/duration/text", "00:00:19:21"}, {average, 3.125}, {lowest, 25.0 / 15},
		{"/variableFrameRate/highest", 25.0}, {"/lastFrame", nullptr}, {"/missing", nullptr}};
	for (const auto& [file, facts, isScan] : std::initializer_list<std::tuple<std::string, Facts, bool>>{
			 {"short-picture.mkv", twoSeconds, false},         // beside ten seconds of sound
			 {"large-short-picture.mkv", twoSeconds, false},   // not read, but stated
			 {"large-late-picture.mkv", twoSeconds, false},    // begins at five seconds
			 {"short-picture.ts", twoSeconds, false},
			 {"short.mpg", twoSeconds, false},
			 {"edited.mp4", {{"/frames", 35}}, false},
			 {"large-edited.mp4", {{"/frames", 35}}, false},
			 {"uneven.mp4", uneven, false},
			 {"large-uneven.mp4", uneven, true},
			 {"large-uneven.mp4", {{"/frames", 62}, {average, 3.125}, {lowest, nullptr}}, false},
			 {"large-counted.mkv", {{"/frames", 62}, {lowest, nullptr}}, false},
			 {"large-uneven.mkv", {{"/frames", nullptr}, {lowest, nullptr}}, false},
			 {"large-uneven.mkv", {{"/frames", 62}, {lowest, 25.0 / 15}}, true},
			 {"cut-raw.avi", {{"/frames", 38}, {"/missing", {{"present", 38}, {"stated", 50}}}}, false},
			 {"cut-counted.mkv", {{"/missing/stated", 62}}, true},
			 {"cut-early.mkv", {{"/frames", 0}, {"/lastFrame", nullptr}, {"/missing/stated", 50}}, false},
			 {"tone.flac", {{"/samples", 72'000}, {"/missing", nullptr}}, true},
			 {"cut-tone.flac", {{"/missing/stated", 72'000}}, true},
		 })
	{
		SCOPED_TRACE(file);
		std::vector<std::string> arguments{"sheet", folder + "/" + file};
		if (isScan)
			arguments.emplace_back("--scan");
		ExpectFacts(Document(arguments).at("files").at(0), facts);
	}
	EXPECT_THAT(
		Zonmedia({"sheet", folder + "/cut-raw.avi"}).mOutput, HasSubstr("truncated: 38 of 50 frames are there"));
}

TEST(Zonmedia, ShowsStillsWithoutTimes)
{
	const std::string folder = Made("make-media.sh");
	if (folder.empty())
		GTEST_SKIP() << kNoFFmpeg;
	for (const std::string name : {"still.png", "still.jpg", "still.tiff", "still.dpx", "still.bmp", "still-%03d.png"})
	{
		const json sheet = Document({"sheet", folder + "/" + name}).at("files").at(0);
		EXPECT_EQ(sheet["imageSize"]["width"], 48) << sheet;
		EXPECT_FALSE(sheet.contains("rate") || sheet.contains("duration") || sheet.contains("fields")) << sheet;
	}
	for (const std::string name : {"/still.jpg", "/large-still.jpg"})
		ExpectFacts(
			Document({"sheet", folder + name}), {{"/files/0/format", "JPEG"}, {"/files/0/storedAs", "yuvj444p"}});
}

TEST(Zonmedia, SaysWhatIsNoMediaOrNoFile)
{
	const std::string folder = Made("make-media.sh");
	if (folder.empty())
		GTEST_SKIP() << kNoFFmpeg;
	for (const auto& [file, complaint] : std::initializer_list<std::pair<std::string, const char*>>{
			 {"notes.txt", "not a media file"}, {"letters.bin", "not a media file"},
			 {"empty.mov", "not a media file: it is empty"}, {"empty.h264", "it is empty"},
			 {"empty.flac", "it is empty"}, {"cut-v210-drop.mov", "QuickTime / MOV without its index (moov)"},
			 {"cut-early.flac", "raw FLAC whose beginning is damaged"}, {"cut-still.png", "PNG image that is damaged"},
			 {"pipe", "no regular file"}, {".", "a folder"}})
		ExpectComplaint(Zonmedia({"sheet", folder + "/" + file}), 1, complaint);
}

TEST(Zonmedia, ReadsStandardInput)
{
	const Outcome file = Zonmedia({"sheet", "-"}, FileText(kClip));
	EXPECT_THAT(file.mOutput, HasSubstr("00:59:58;00"));
	const std::string piped = "cat " + ShellQuoted(kClip) + " | " + ShellQuoted(ZON_PROGRAM) + " sheet - >";
	EXPECT_EQ(std::system((piped + ShellQuoted(kScratch + "piped")).c_str()), 0);
	EXPECT_EQ(FileText(kScratch + "piped"), file.mOutput);
	ExpectComplaint(Zonmedia({"sheet", "-"}, "Notes"), 1, "-: not a media file");
}

TEST(Zonmedia, TellsTheOrderOfFields)
{
	const std::string folder = Made("make-fields.sh");
	if (folder.empty())
		GTEST_SKIP() << kNoFFmpeg;
	struct Order
	{
		std::string mMade, mJudged, mShown;
	};
	const Order orders[] = {{"upper", "tff", "Upper Field First"}, {"lower", "bff", "Lower Field First"},
		{"progressive", "progressive", "No Fields (Progressive Scan)"}};
	std::vector<std::string> arguments{"sheet"};
	std::vector<std::pair<std::string, std::string>> judged;   // file and verdict on its pictures
	std::ifstream list(folder + "/judged.txt");
	for (std::string file, verdict; list >> file >> verdict;)
	{
		arguments.push_back(folder + "/" + file);
		judged.emplace_back(file, verdict);
	}
	ASSERT_GT(judged.size(), 100u);
	const json sheets = Document(arguments).at("files");
	ASSERT_EQ(sheets.size(), judged.size());
	for (std::size_t i = 0; i < judged.size(); ++i)
	{
		const auto& [file, verdict] = judged[i];
		const auto order = std::ranges::find_if(
			orders, [name = file](const Order& inOrder) { return name.find(inOrder.mMade) != std::string::npos; });
		ASSERT_NE(order, std::end(orders)) << file;
		EXPECT_EQ(verdict, order->mJudged) << file << ": the file is not what it is to be";
		const bool isSilent = file.starts_with("v210") && file.ends_with(".avi");   // neither of which says
		EXPECT_EQ(sheets[i]["fields"], isSilent ? "Field Presence Unknown" : order->mShown) << file;
	}
}

}   // namespace
