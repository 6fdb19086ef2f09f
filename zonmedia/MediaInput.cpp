#include "zonmedia/MediaInput.h"

#include "zonmedia/Problem.h"
#include "zonmedia/StandardInput.h"

#include <algorithm>
#include <array>
#include <filesystem>
#include <string_view>
#include <system_error>

extern "C"
{
#include <libavutil/dict.h>
#include <libavutil/error.h>
#include <libavutil/intreadwrite.h>
}

namespace zonmedia
{

namespace
{

namespace fs = std::filesystem;

constexpr const char* kNoMedia = "not a media file";

// FFmpeg's names of what reads pictures: by its contents ("png_pipe"), and by the name of the file.
constexpr std::string_view kPicture = "_pipe";
constexpr std::string_view kNumberedPictures = "image2";

struct CloseIO
{
	void operator()(AVIOContext* inFile) const { avio_close(inFile); }
};

// What is missing or locked is left to be found by opening.
void CheckIsFile(const std::string& inPath)
{
	std::error_code error;
	const fs::file_status status = fs::status(inPath, error);
	if (fs::is_directory(status))
		throw InputProblem("a folder; expected a file");
	if (fs::exists(status) && !fs::is_regular_file(status))
		throw InputProblem("no regular file; what comes through a pipe is read from standard input, as -");
	if (fs::is_regular_file(status) && fs::file_size(inPath, error) == 0 && !error)
		throw InputProblem(std::string(kNoMedia) + ": it is empty");
}

// ---- What is wrong ---------------------------------------------------------------------------------------------------

// The kinds of a QuickTime file's outermost atoms are read until one is inKind. Each has its size in front of its kind: 1 is
// a size that did not fit and follows, 0 an atom up to the end of the file.
bool HasAtom(AVIOContext& ioFile, std::uint32_t inKind)
{
	constexpr std::int64_t kMostAtoms = 10'000;
	std::int64_t position = 0;
	for (std::int64_t atom = 0; atom < kMostAtoms && avio_seek(&ioFile, position, SEEK_SET) == position; ++atom)
	{
		std::uint64_t size = avio_rb32(&ioFile);
		const std::uint32_t kind = avio_rb32(&ioFile);
		if (avio_feof(&ioFile) != 0)
			return false;
		if (kind == inKind)
			return true;
		size = size == 1 ? avio_rb64(&ioFile) : size;
		constexpr std::uint64_t kHead = 8;
		if (size < kHead || size > static_cast<std::uint64_t>(INT64_MAX - position))
			return false;
		position += static_cast<std::int64_t>(size);
	}
	return false;
}

std::string ErrorText(int inError)
{
	std::array<char, AV_ERROR_MAX_STRING_SIZE> text{};
	av_strerror(inError, text.data(), text.size());
	return text.data();
}

// What is known of a file that looks like media and could not be opened as such.
std::string Damage(const std::string& inName)
{
	AVIOContext* opened = nullptr;
	if (avio_open(&opened, inName.c_str(), AVIO_FLAG_READ) < 0)
		return kNoMedia;
	const std::unique_ptr<AVIOContext, CloseIO> file(opened);
	const AVInputFormat* format = nullptr;
	const int score = av_probe_input_buffer2(file.get(), &format, nullptr, nullptr, 0, 0);
	if (score == AVERROR(EIO))
		return ErrorText(score);
	if (score <= AVPROBE_SCORE_RETRY || format == nullptr)
		return kNoMedia;
	const std::string name = format->long_name;
	if (std::string_view(format->name).starts_with("mov") && !HasAtom(*file, MKBETAG('m', 'o', 'o', 'v')))
		return name + " without its index (moov): the recording was not finished, or its end is missing";
	return name + " whose beginning is damaged";
}

std::string Reason(int inError, const std::string& inName)
{
	// Some readers take an end that comes too early for a failure to read.
	const bool canBeDamage = inError == AVERROR_INVALIDDATA || inError == AVERROR_EOF || inError == AVERROR(EIO);
	return canBeDamage ? Damage(inName) : ErrorText(inError);
}

Format OpenFile(const std::string& inPath)
{
	CheckIsFile(inPath);
	const std::string name = "file:" + inPath;   // whatever it looks like, it is no address
	AVDictionary* options = nullptr;
	av_dict_set(&options, "protocol_whitelist", "file", 0);   // a file may refer to other files only
	av_dict_set(&options, "pattern_type", "none", 0);         // a "%d" in the name of a picture is no counter
	AVFormatContext* context = nullptr;
	const int opened = avformat_open_input(&context, name.c_str(), nullptr, &options);
	av_dict_free(&options);
	if (opened < 0)
		throw InputProblem(Reason(opened, name));
	Format format(context);
	// Plain text passes for the drawings of text terminals, which are no media.
	if (std::string_view(format->iformat->name) == "tty")
		throw InputProblem(kNoMedia);
	const int read = avformat_find_stream_info(format.get(), nullptr);
	if (read < 0)
		throw InputProblem(Reason(read, name));
	return format;
}

}   // namespace

Format OpenMedia(const std::string& inPath)
{
	return inPath == kStandardInput ? OpenFile(StandardInput().Path()) : OpenFile(inPath);
}

std::string FormatName(const AVFormatContext& inFile)
{
	if (!IsStill(inFile))
		return inFile.iformat->long_name;
	std::string_view name = inFile.iformat->name;
	if (name == kNumberedPictures && inFile.nb_streams > 0)
	{
		const AVCodecID codec = inFile.streams[0]->codecpar->codec_id;
		name = codec == AV_CODEC_ID_MJPEG ? "jpeg" : avcodec_get_name(codec);   // one picture is no motion
	}
	std::string upper(name.substr(0, name.size() - (name.ends_with(kPicture) ? kPicture.size() : 0)));
	std::ranges::transform(upper, upper.begin(),
		[](char inChar) { return inChar >= 'a' && inChar <= 'z' ? static_cast<char>(inChar - 'a' + 'A') : inChar; });
	return upper;
}

bool IsStill(const AVFormatContext& inFile)
{
	const std::string_view name = inFile.iformat->name;
	return name == kNumberedPictures || name == "ico" || name.ends_with(kPicture);
}

}   // namespace zonmedia
