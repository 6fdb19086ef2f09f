#include "zoncore/StringUtils.h"
#include "zonmedia/Commands.h"
#include "zonmedia/Texts.h"
#include "zonmedia/VideoNames.h"
#include "zonmediatypes/Descriptions.h"
#include "zonmediatypes/PixelAspectRatioUtils.h"
#include "zonmediatypes/PixelFormatSize.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <utility>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;

namespace
{

Value FormatValue(PixelFormat inFormat)
{
	const std::string description = UTF16to8(PixelFormatDescription(inFormat));
	return {
		NameOf(inFormat) + " (" + description + ")", Json{{"name", NameOf(inFormat)}, {"description", description}}};
}

// ---- formats ---------------------------------------------------------------------------------------------------------

// The word for a code of a field; its number when it has none.
template <std::size_t N>
std::string Word(const std::array<const char*, N>& inWords, unsigned inCode)
{
	return inCode < N ? inWords[inCode] : std::to_string(inCode);
}

constexpr std::array<const char*, 6> sDepths{"8", "10", "15", "16", "24", "32"};
constexpr std::array<const OwnText*, 4> sAlphas{&kText_None, &kText_Straight, &kText_Premultiplied, &kText_Ignored};
constexpr std::array<const char*, 4> sSubsamplings{"4:4:4", "4:2:2", "DV", "4:2:0"};

std::string Hexadecimal(std::uint32_t inValue)
{
	std::array<char, 8> text{};
	return "0x" + std::string(text.data(), std::to_chars(text.data(), text.data() + text.size(), inValue, 16).ptr);
}

std::vector<Value> FormatRow(const std::string& inName, PixelFormat inFormat)
{
	const PixelFormatProperties properties = inFormat.mProperties;
	const std::string matrix = properties.Is709() ? "YUV 709" : "YUV 601";
	const unsigned alpha = properties.Alpha();
	const std::string yuv = properties.IsVideoRange() ? matrix : Say(kText_FullRange, {matrix});
	const std::string depth = Word(sDepths, properties.BitDepth()) + (properties.IsFloat() ? "f" : "u");
	const std::uint32_t value = properties.GetValue();
	return {inName, CodeOf(inFormat), {Hexadecimal(value), std::uint64_t{value}}, properties.IsYUV() ? yuv : "RGB",
		depth, Word(sSubsamplings, properties.Subsampling()),
		alpha < sAlphas.size() ? Say(*sAlphas[alpha]) : std::to_string(alpha), properties.ReversedOrder(),
		properties.IsLinear(), properties.IsCompressed(), UTF16to8(PixelFormatDescription(inFormat))};
}

Status RunFormats(const CommonArguments& inArguments)
{
	Table table{"Formats",
		{"Name", "Code", "Properties", "Colour", "Depth", "Chroma", "Alpha", "Reversed", "Linear", "Compressed",
			"Description"},
		{}};
	for (const auto& [name, format] : PixelFormatNames())
		table.mRows.push_back(FormatRow(name, format));
	Print({{"Count", {"", static_cast<std::int64_t>(table.mRows.size())}}, {std::move(table)}}, inArguments.GetStyle());
	return Status::Fine;
}

// ---- cost, nearest ---------------------------------------------------------------------------------------------------

struct CostArguments : CommonArguments
{
	std::string mFrom;
	std::string mTo;
	std::string mQuality = "high";
};

struct NearestArguments : CostArguments
{
	std::string mRequest;
	bool mPrefersRequest = false;
};

Value CostValue(int inCost)
{
	const bool isPossible = inCost < kPixelConversionCost_Impossible;
	const std::string cost = std::to_string(inCost);
	return {isPossible ? cost : Say(kText_Impossible, {cost}), inCost};
}

Status RunCost(const CostArguments& inArguments)
{
	const PixelFormat from = ReadPixelFormat(inArguments.mFrom);
	const PixelFormat to = ReadPixelFormat(inArguments.mTo);
	const RenderQuality quality = ReadQuality(inArguments.mQuality);
	const int cost = PixelConversionCost(from.mProperties, to.mProperties, quality);
	Record record{{"From", FormatValue(from)}, {}};
	record.mSubject.mValue.mText = Say(kText_FromTo, {record.mSubject.mValue.mText, NameOf(to)});
	record.mItems = {
		Field{"To", FormatValue(to)},
		Field{"Quality", UTF16to8(RenderQualityDescription(quality))},
		Field{"Cost", CostValue(cost)},
		Field{"Is possible", cost < kPixelConversionCost_Impossible},
	};
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// A choice between what a producer makes and a consumer takes, and how cheaply the producer gets there.
struct Choice
{
	PixelFormat mChosen;
	PixelFormat mSource;
	int mCost = kPixelConversionCost_Impossible;
};

Choice Choose(const PixelFormats& inFrom, const PixelFormats& inTo, PixelFormat inRequest, RenderQuality inQuality,
	bool inPrefersRequest)
{
	Choice choice{SelectNearestPixelFormat(inFrom, inRequest, inTo, inQuality, inPrefersRequest), kPixelFormat_Invalid};
	for (const PixelFormat source : inFrom)
	{
		const int cost = PixelConversionCost(source.mProperties, choice.mChosen.mProperties, inQuality);
		if (cost < choice.mCost)
			choice = {choice.mChosen, source, cost};
	}
	return choice;
}

std::string Reason(const Choice& inChoice, const PixelFormats& inFrom, const PixelFormats& inTo, PixelFormat inRequest,
	bool inPrefersRequest)
{
	const auto isIn = [&](const PixelFormats& inFormats)
	{ return std::ranges::find(inFormats, inChoice.mChosen) != inFormats.end(); };
	if (inChoice.mChosen == kPixelFormat_Invalid)
		return Say(kText_NothingUsable);
	if (inPrefersRequest && inChoice.mChosen == inRequest)
		return Say(kText_Requested);
	if (isIn(inFrom) && isIn(inTo))
		return Say(kText_BothKnow);
	if (inChoice.mCost == kPixelConversionCost_Impossible)
		return Say(kText_NothingConverts);
	return Say(kText_Cheapest, {NameOf(inChoice.mSource), std::to_string(inChoice.mCost)});
}

Json NamesOf(const PixelFormats& inFormats)
{
	Json names = Json::array();
	for (const PixelFormat format : inFormats)
		names.push_back(NameOf(format));
	return names;
}

Status RunNearest(const NearestArguments& inArguments)
{
	const PixelFormats from = ReadPixelFormats(inArguments.mFrom);
	const PixelFormats to = ReadPixelFormats(inArguments.mTo);
	const PixelFormat request
		= inArguments.mRequest.empty() ? kPixelFormat_Invalid : ReadPixelFormat(inArguments.mRequest);
	const RenderQuality quality = ReadQuality(inArguments.mQuality);
	const Choice choice = Choose(from, to, request, quality, inArguments.mPrefersRequest);
	Record record{{"Nearest", FormatValue(choice.mChosen)}, {}};
	record.mItems = {
		Field{"Why", Reason(choice, from, to, request, inArguments.mPrefersRequest)},
		Field{"From", {"", NamesOf(from)}},
		Field{"To", {"", NamesOf(to)}},
		Field{"Request", {"", NameOf(request)}},
		Field{"Quality", {"", UTF16to8(RenderQualityDescription(quality))}},
		Field{"Source", {"", NameOf(choice.mSource)}},
		Field{"Cost", {"", choice.mCost}},
	};
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// ---- size, ratio -----------------------------------------------------------------------------------------------------

struct SizeArguments : CommonArguments
{
	std::string mSubject;   // the format or the ratio
	std::string mSize;
};

std::string SizeText(zoncore::PointT<int> inSize)
{
	return std::to_string(inSize.x) + "x" + std::to_string(inSize.y);
}

Value SizeValue(zoncore::PointT<int> inSize)
{
	return {SizeText(inSize), Json{{"width", inSize.x}, {"height", inSize.y}}};
}

// A byte count, of which 0 says that there is none.
Value BytesValue(std::int64_t inBytes)
{
	return inBytes == 0 ? Value(Say(kText_None), nullptr) : Value(inBytes);
}

Status RunSize(const SizeArguments& inArguments)
{
	const PixelFormat format = ReadPixelFormat(inArguments.mSubject);
	const zoncore::PointT<int> size = ReadSize(inArguments.mSize);
	zoncore::PointT<int> fixedSize = size;
	FixedSizedFormatDimensions(format, fixedSize.x, fixedSize.y);
	Record record{{"Format", FormatValue(format)}, {}};
	record.mItems = {
		Field{"Size", SizeValue(size)},
		Field{"Frame bytes", BytesValue(PixelFormatSize(format, size.x, size.y))},
		Field{"Row bytes", BytesValue(UncompressedPixelFormatRowBytes(format, size.x))},
		Field{"Fixed size", format.mProperties.IsDV() ? SizeValue(fixedSize) : Value("", nullptr)},
	};
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

Status RunRatio(const SizeArguments& inArguments)
{
	const PixelAspectRatio ratio = ReadPixelAspectRatio(inArguments.mSubject);
	const zoncore::PointT<int> size = ReadSize(inArguments.mSize);
	const PixelAspectRatio corrected = CorrectLegacyPixelAspectRatio(ratio);
	const std::string correction
		= std::to_string(corrected.GetNumerator()) + "/" + std::to_string(corrected.GetDenominator());
	const bool isLegacy = IsLegacyPixelAspectRatio(ratio);
	Record record{{"Ratio", inArguments.mSubject}, {}};
	record.mItems = {
		Field{"Description", WithDecimalSign(UTF16to8(PixelAspectRatioDescription(ratio)))},
		Field{"Frame", WithDecimalSign(UTF16to8(VideoFrameSizeDescription({0, 0, size.x, size.y}, ratio)))},
		Field{"In square pixels", SizeValue(AdjustPixelAspectDimensionToSquarePixelDimension(size, ratio))},
		Field{"From square pixels", SizeValue(AdjustSquarePixelDimensionToPixelAspectDimension(size, ratio))},
		Field{"Legacy", isLegacy ? Value(Say(kText_LegacyRatio, {correction}), correction) : Value("", nullptr)},
	};
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// ---- Arguments -------------------------------------------------------------------------------------------------------

constexpr const char* kFormatHelp = "A name of the catalogue (BGRA_4444_8u), a code (bgra) or any";
constexpr const char* kFormatsHelp = "Names or codes with commas between them";
constexpr const char* kQualityHelp = "Quality of the conversion, one of: draft, low, medium, high, max";

void AddCostCommand(CLI::App& ioVideo, Run& outRun)
{
	const auto arguments = std::make_shared<CostArguments>();
	CLI::App& command = AddCommand(ioVideo, outRun, "cost", "Show what a conversion between two formats costs",
		"  zonmedia video cost BGRA_4444_8u VUYA_4444_8u --quality low", arguments, RunCost);
	command.add_option("FROM", arguments->mFrom, kFormatHelp)->required();
	command.add_option("TO", arguments->mTo, kFormatHelp)->required();
	command.add_option("--quality", arguments->mQuality, kQualityHelp)->capture_default_str();
}

void AddNearestCommand(CLI::App& ioVideo, Run& outRun)
{
	const auto arguments = std::make_shared<NearestArguments>();
	CLI::App& command = AddCommand(ioVideo, outRun, "nearest", "Choose the format between a producer and a consumer",
		"  zonmedia video nearest --from UYVY_422_8u,V210_422_10u --to BGRA_4444_8u,BGRA_4444_32f --quality max",
		arguments, RunNearest);
	command.add_option("--from", arguments->mFrom, std::string("What the producer makes: ") + kFormatsHelp)->required();
	command.add_option("--to", arguments->mTo, std::string("What the consumer takes: ") + kFormatsHelp)->required();
	command.add_option("--request", arguments->mRequest, "The format that decides when several are equally near");
	command.add_flag("--prefer-request", arguments->mPrefersRequest, "Take the request whenever the consumer does");
	command.add_option("--quality", arguments->mQuality, kQualityHelp)->capture_default_str();
}

void AddSizeCommand(CLI::App& ioVideo, Run& outRun, const char* inName, const char* inDescription,
	const char* inExamples, const char* inSubject, const char* inSubjectHelp, Status (*inRun)(const SizeArguments&))
{
	const auto arguments = std::make_shared<SizeArguments>();
	CLI::App& command = AddCommand(ioVideo, outRun, inName, inDescription, inExamples, arguments, inRun);
	command.add_option(inSubject, arguments->mSubject, inSubjectHelp)->required();
	command.add_option("WxH", arguments->mSize, "Width and height in pixels: 1920x1080")->required();
}

}   // namespace

void AddVideoCommands(CLI::App& ioApplication, Run& outRun)
{
	CLI::App& video = AddGroup(ioApplication, "video", "Pixel formats and the shapes of pixels",
		"  zonmedia video formats\n  zonmedia video size V210_422_10u 1920x1080");
	AddCommand(video, outRun, "formats", "List the catalogue of pixel formats", "  zonmedia video formats",
		std::make_shared<CommonArguments>(), RunFormats);
	AddCostCommand(video, outRun);
	AddNearestCommand(video, outRun);
	AddSizeCommand(video, outRun, "size", "Show the bytes of frames and rows",
		"  zonmedia video size V210_422_10u 1920x1080", "FORMAT", kFormatHelp, RunSize);
	AddSizeCommand(video, outRun, "ratio",
		"Describe a pixel aspect ratio, and convert a frame size to square pixels and from them",
		"  zonmedia video ratio 10/11 720x480", "N/D", "Width of a pixel by its height", RunRatio);
}

}   // namespace zonmedia
