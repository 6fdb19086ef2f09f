#include "zoncore/StringUtils.h"
#include "zonmedia/AudioNames.h"
#include "zonmedia/Commands.h"
#include "zonmedia/Texts.h"
#include "zonmediatypes/Descriptions.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <string>
#include <utility>
#include <vector>

namespace zonmedia
{

using namespace zonmediatypes;   // NOLINT(google-build-using-namespace): a host of the library speaks its language
using zoncore::utility::UTF16to8;

namespace
{

struct LayoutArguments : CommonArguments
{
	std::string mLayout;
};

struct ConversionArguments : CommonArguments
{
	std::string mFrom;
	std::string mTo;
};

std::string Description(const AudioChannelLayout& inLayout)
{
	return UTF16to8(AudioChannelLayoutDescription(inLayout));
}

// The abbreviations of a layout's channels: as text with blanks between, as an array for programs.
Value ChannelsOf(const AudioChannelLayout& inLayout)
{
	std::string text;
	Json array = Json::array();
	for (const AudioChannelDescription channel : inLayout)
	{
		text.append(text.empty() ? "" : " ").append(Abbreviation(channel.mLabel));
		array.push_back(Abbreviation(channel.mLabel));
	}
	return {text, array};
}

// ---- layouts, layout -------------------------------------------------------------------------------------------------

Status RunLayouts(const CommonArguments& inArguments)
{
	// The channels come last: a single long list of them would keep all descriptions off a terminal.
	Table table{"Layouts", {"Name", "Count", "Description", "Channels"}, {}};
	for (const auto& [name, layout] : LayoutNames())
		table.mRows.push_back(
			{name, static_cast<std::int64_t>(layout.size()), Description(layout), ChannelsOf(layout)});
	Print({{"", ""}, {std::move(table)}}, inArguments.GetStyle());
	return Status::Fine;
}

Status RunLayout(const LayoutArguments& inArguments)
{
	const AudioChannelLayout layout = ReadLayout(inArguments.mLayout);
	Record record{{"Layout", inArguments.mLayout}, {}};
	record.mItems = {
		Field{"Description", Description(layout)},
		Field{"Channels", ChannelsOf(layout)},
		Field{"Has labels", HasChannelLabeling(layout)},
		Field{"Has LFE", HasLFEChannel(layout)},
	};
	Table table{"Labels", {"Channel", "Label", "Number", "Description", "Left right", "Front back"}, {}};
	for (const AudioChannelDescription channel : layout)
	{
		const auto partner = [](AudioChannelLabel inLabel)
		{ return inLabel == kAudioChannelLabel_Discrete ? Value("", nullptr) : Value(Abbreviation(inLabel)); };
		table.mRows.push_back({static_cast<std::int64_t>(table.mRows.size()), Abbreviation(channel.mLabel),
			std::int64_t{channel.mLabel}, UTF16to8(AudioChannelLabelDescription(channel.mLabel, false)),
			partner(LeftRightPair(channel.mLabel)), partner(FrontBackPair(channel.mLabel))});
	}
	record.mItems.emplace_back(std::move(table));
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// ---- matrix ----------------------------------------------------------------------------------------------------------

// A gain as people read it: four places, and a point for silence so that the others stand out.
std::string GainText(double inGain)
{
	if (inGain == 0.0)
		return ".";
	std::array<char, 32> text{};
	const auto end = std::to_chars(text.data(), text.data() + text.size(), inGain, std::chars_format::general, 4).ptr;
	return WithDecimalSign({text.data(), end});
}

Grid MatrixGrid(
	const AudioChannelLayout& inFrom, const AudioChannelLayout& inTo, const ChannelConversionMatrix& inMatrix)
{
	Table table{"Matrix", {""}, {}};
	for (const AudioChannelDescription channel : inFrom)
		table.mColumns.push_back(Abbreviation(channel.mLabel));
	Json gains = Json::array();
	for (std::size_t row = 0; row < inMatrix.size(); ++row)
	{
		std::vector<Value>& cells = table.mRows.emplace_back(std::vector<Value>{Abbreviation(inTo[row].mLabel)});
		for (const double gain : inMatrix[row])
			cells.emplace_back(GainText(gain), gain);
		gains.push_back(Json(std::vector<double>(inMatrix[row].begin(), inMatrix[row].end())));
	}
	return {std::move(table), std::move(gains)};
}

// A channel by its abbreviation, with its number where that alone would not tell which.
std::string ChannelName(const AudioChannelLayout& inLayout, std::size_t inIndex)
{
	const std::string name = Abbreviation(inLayout[inIndex].mLabel);
	return std::ranges::count(inLayout, inLayout[inIndex]) == 1 ? name : name + "(" + std::to_string(inIndex) + ")";
}

// The source channels that no destination channel takes, for people by name.
Value Untaken(const AudioChannelLayout& inFrom, const ChannelConversionMatrix& inMatrix)
{
	std::string text;
	Json array = Json::array();
	for (std::size_t column = 0; column < inFrom.size(); ++column)
	{
		const auto takes = [column](const auto& inRow) { return inRow[column] != 0.0; };
		if (std::ranges::any_of(inMatrix, takes))
			continue;
		text.append(text.empty() ? "" : " ").append(ChannelName(inFrom, column));
		array.push_back(Abbreviation(inFrom[column].mLabel));
	}
	return {text, array};
}

Record ConversionRecord(const AudioChannelLayout& inFrom, const AudioChannelLayout& inTo)
{
	Record record{{"From", Description(inFrom)}, {}};
	record.mSubject.mValue = {Say(kText_FromTo, {Description(inFrom), Description(inTo)}), Description(inFrom)};
	record.mItems = {
		Field{"To", {"", Description(inTo)}},
		Field{"Source channels", {"", ChannelsOf(inFrom).mJson}},
		Field{"Destination channels", {"", ChannelsOf(inTo).mJson}},
	};
	return record;
}

Status RunMatrix(const ConversionArguments& inArguments)
{
	const AudioChannelLayout from = ReadLayout(inArguments.mFrom);
	const AudioChannelLayout to = ReadLayout(inArguments.mTo);
	ChannelConversionMatrix matrix;
	ComputeChannelConversionMatrix(from, to, matrix);
	Record record = ConversionRecord(from, to);
	record.mItems.emplace_back(MatrixGrid(from, to, matrix));
	const Value untaken = Untaken(from, matrix);
	if (!untaken.mText.empty())
		record.mItems.emplace_back(Note{Say(kText_Untaken, {untaken.mText})});
	record.mItems.emplace_back(Field{"Untaken", {"", untaken.mJson}});
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// ---- map -------------------------------------------------------------------------------------------------------------

std::string WhyNoReordering(const AudioChannelLayout& inFrom, const AudioChannelLayout& inTo)
{
	if (inFrom.size() != inTo.size())
		return Say(kText_ChannelCounts, {std::to_string(inFrom.size()), std::to_string(inTo.size())});
	const auto isMissing
		= [&](AudioChannelDescription inChannel) { return !HasChannelLabel(inFrom, inChannel.mLabel); };
	const auto missing = std::ranges::find_if(inTo, isMissing);
	return missing != inTo.end() ? Say(kText_MissingChannel, {Abbreviation(missing->mLabel)})
								 : Say(kText_FewerUnlabelled);
}

Status RunMap(const ConversionArguments& inArguments)
{
	const AudioChannelLayout from = ReadLayout(inArguments.mFrom);
	const AudioChannelLayout to = ReadLayout(inArguments.mTo);
	ChannelOrdering ordering;
	const bool isReordering = RemapChannelOrdering(from, to, ordering);
	Record record = ConversionRecord(from, to);
	record.mItems.emplace_back(
		Field{"Is reordering", {isReordering ? "" : Say(kText_NoBecause, {WhyNoReordering(from, to)}), isReordering}});
	Table table{"Ordering", {"Destination", "Label", "Source"}, {}};
	for (std::size_t channel = 0; channel < ordering.size(); ++channel)
		table.mRows.push_back({static_cast<std::int64_t>(channel), Abbreviation(to[channel].mLabel),
			static_cast<std::uint64_t>(ordering[channel])});
	record.mItems.emplace_back(std::move(table));
	Print(record, inArguments.GetStyle());
	return Status::Fine;
}

// ---- Arguments -------------------------------------------------------------------------------------------------------

constexpr const char* kLayoutHelp
	= "A name of the catalogue (Broadcast51), or abbreviations (L,R,LFE; \"*\" has no label)";

void AddConversionCommand(CLI::App& ioAudio, Run& outRun, const char* inName, const char* inDescription,
	const char* inExamples, Status (*inRun)(const ConversionArguments&))
{
	const auto arguments = std::make_shared<ConversionArguments>();
	CLI::App& command = AddCommand(ioAudio, outRun, inName, inDescription, inExamples, arguments, inRun);
	command.add_option("FROM", arguments->mFrom, kLayoutHelp)->required();
	command.add_option("TO", arguments->mTo, kLayoutHelp)->required();
}

}   // namespace

void AddAudioCommands(CLI::App& ioApplication, Run& outRun)
{
	CLI::App& audio = AddGroup(ioApplication, "audio", "Channel layouts and conversions between them",
		"  zonmedia audio layouts\n  zonmedia audio matrix Stereo Broadcast51");
	AddCommand(audio, outRun, "layouts", "List the catalogue of channel layouts", "  zonmedia audio layouts",
		std::make_shared<CommonArguments>(), RunLayouts);
	const auto layout = std::make_shared<LayoutArguments>();
	AddCommand(audio, outRun, "layout", "Describe a channel layout",
		"  zonmedia audio layout Broadcast51\n  zonmedia audio layout L,R,C,LFE,Ls,Rs", layout, RunLayout)
		.add_option("NAME", layout->mLayout, kLayoutHelp)
		->required();
	AddConversionCommand(audio, outRun, "matrix", "Show the gains with which one layout is converted to another",
		"  zonmedia audio matrix Broadcast51 Stereo\n  zonmedia audio matrix L,R Broadcast51 --json", RunMatrix);
	AddConversionCommand(audio, outRun, "map", "Show how the channels of one layout are reordered into another",
		"  zonmedia audio map Broadcast51 Legacy51", RunMap);
}

}   // namespace zonmedia
