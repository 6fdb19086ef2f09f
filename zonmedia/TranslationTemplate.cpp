#include "zonmedia/TranslationTemplate.h"

#include "zonmedia/Texts.h"
#include "zonmediatypes/Descriptions.h"

#include <array>
#include <string>

namespace zonmedia
{

namespace
{

// What a translator must know of the texts below a path. The first row that fits counts.
struct Note
{
	std::string_view mPath;
	std::string_view mText;
};

constexpr std::string_view kRoot = "$$$/zonmediatypes/";

// clang-format off
constexpr auto sNotes = std::to_array<Note>({
	{"FrameRateFormat/Audio",                   "A sample rate. @0: the number."},
	{"FrameRateFormat/Video",                   "A frame rate. @0: the number."},
	{"TimeDisplay/",                            "A way to write times, as a menu item."},
	{"AudioChannelLabel/Discrete",              "An audio channel without a place of its own."},
	{"AudioChannelLabel/",                      "An audio channel, by the place of its loudspeaker or its signal."},
	{"AudioChannelLabelMnemonic/",              "An audio channel as a menu item: the one & precedes its accelerator."},
	{"AudioChannelLabelAbbreviations/",         "The abbreviation of an audio channel; usually kept as it is."},
	{"AudioChannelLayout/NChannels",            "Audio channels without labels. @0: how many."},
	{"AudioChannelLayout/kChannelConfigurationNameTemplate_N",
		"More than eight audio channels. @0: how many; @1 to @7: the abbreviations of the first seven."},
	{"AudioChannelLayout/kChannelConfigurationNameTemplate_",
		"Audio channels. @0, @1 ...: their abbreviations."},
	{"AudioChannelLayout/",                     "A layout of audio channels."},
	{"kChannelConfigurationNameTemplate_51",    "5.1 surround sound. @0 to @5: the abbreviations of its channels."},
	{"SmpteDtv",                                "Sound of digital television. @0 to @7: the abbreviations of its channels."},
	{"AudioChannelConfiguration/Empty",         "A clip without sound."},
	{"AudioChannelConfiguration/NMatchingStreams",
		"Audio streams of one layout. @0: how many; @1: the name of the layout."},
	{"AudioChannelConfiguration/TwoStreams",    "Two audio streams. @0, @1: the names of their layouts."},
	{"AudioChannelConfiguration/NAudioStreams", "Audio streams of several layouts. @0: how many."},
	{"RenderQuality/",                          "A quality of rendering."},
	{"FieldType/",                              "The fields of interlaced video, and which comes first."},
	{"PixelFormat/Linear",                      "Stands in a pixel format with linear light: \"ARGB 4444 32f Linear\"."},
	{"PixelFormat/Custom",                      "A pixel format of the host. @0: its code."},
	{"PixelFormat/UnknownCompressed",           "@0: the code of the pixel format."},
	{"PixelFormat/",                            "A pixel format. 420, 8u and names of standards are kept."},
	{"PixelAspectRatioFormat/",                 "A pixel aspect ratio. @0: the ratio as a number."},
	{"VideoFrameSizeFormatPAR",                 "A frame size. @0: the width; @1: the height; @2: the pixel aspect ratio."},
	{"VideoFrameSizeFormat",                    "A frame size. @0: the width; @1: the height."},
});
// clang-format on

std::string_view NoteFor(std::string_view inPath)
{
	const std::string_view path = inPath.substr(inPath.starts_with(kRoot) ? kRoot.size() : 0);
	const auto fits = [path](const Note& inNote) { return path.starts_with(inNote.mPath); };
	const auto* const note = std::ranges::find_if(sNotes, fits);
	return note == sNotes.end() ? std::string_view() : note->mText;
}

// inText as a string of a .po file.
std::string PoString(std::string_view inText)
{
	std::string text = "\"";
	for (const char character : inText)
	{
		if (character == '"' || character == '\\')
			text.push_back('\\');
		text.push_back(character);
	}
	return text + '"';
}

// The fields in capitals are what msginit fills in.
constexpr std::string_view kHeader = R"(# Display text of zonmediatypes.
#
# The context of a message is the path of its key. @0, @1 ... stand for what is filled in.
#
#, fuzzy
msgid ""
msgstr ""
"Project-Id-Version: zonmediatypes\n"
"PO-Revision-Date: YEAR-MO-DA HO:MI+ZONE\n"
"Last-Translator: FULL NAME <EMAIL@ADDRESS>\n"
"Language-Team: LANGUAGE <LL@li.org>\n"
"Language: \n"
"MIME-Version: 1.0\n"
"Content-Type: text/plain; charset=UTF-8\n"
"Content-Transfer-Encoding: 8bit\n"
)";

void WriteMessage(std::ostream& ioStream, std::string_view inKey, std::string_view inNote)
{
	const TextKey key(inKey);
	ioStream << '\n';
	if (!inNote.empty())
		ioStream << "#. " << inNote << '\n';
	ioStream << "msgctxt " << PoString(key.mPath) << "\nmsgid " << PoString(key.mText) << "\nmsgstr \"\"\n";
}

}   // namespace

void WriteTranslationTemplate(std::ostream& ioStream)
{
	ioStream << kHeader;
	for (const std::string_view text : zonmediatypes::AllTextKeys())
		WriteMessage(ioStream, text, NoteFor(TextKey(text).mPath));
	for (const auto& [text, note] : AllOwnTexts())
		WriteMessage(ioStream, text, note);
}

}   // namespace zonmedia
