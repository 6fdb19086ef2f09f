#include "zonmedia/Names.h"

#include <numeric>
#include <utility>

namespace zonmedia
{

namespace
{

constexpr std::size_t kSuggestions = 4;
constexpr std::size_t kMostOfShortList = 20;   // a list that is shown whole when nothing in it is close

constexpr bool IsIgnored(char inChar)
{
	return inChar == '_' || inChar == '-' || inChar == ' ';
}

constexpr char Lowered(char inChar)
{
	return inChar >= 'A' && inChar <= 'Z' ? static_cast<char>(inChar - 'A' + 'a') : inChar;
}

std::string Folded(std::string_view inText)
{
	std::string folded;
	folded.reserve(inText.size());
	for (const char character : inText)
	{
		if (!IsIgnored(character))
			folded.push_back(Lowered(character));
	}
	return folded;
}

// "7.1" and "7_1" have the same letters and digits.
std::string LettersAndDigits(std::string_view inText)
{
	std::string text = Folded(inText);
	std::erase_if(
		text, [](char inChar) { return !(inChar >= '0' && inChar <= '9') && !(inChar >= 'a' && inChar <= 'z'); });
	return text;
}

}   // namespace

std::size_t EditDistance(std::string_view inLHS, std::string_view inRHS)
{
	const std::string lhs = Folded(inLHS);
	const std::string rhs = Folded(inRHS);
	std::vector<std::size_t> row(rhs.size() + 1);   // distances of the left text so far to every beginning of the right
	std::iota(row.begin(), row.end(), std::size_t{0});
	for (const char left : lhs)
	{
		std::size_t diagonal = row[0]++;
		for (std::size_t i = 0; i < rhs.size(); ++i)
		{
			const std::size_t replaced = diagonal + (left == rhs[i] ? 0 : 1);
			diagonal = row[i + 1];
			row[i + 1] = std::min(replaced, std::min(row[i], diagonal) + 1);
		}
	}
	return row.back();
}

bool IsSameName(std::string_view inLHS, std::string_view inRHS)
{
	for (;; inLHS.remove_prefix(1), inRHS.remove_prefix(1))
	{
		for (std::string_view* const text : {&inLHS, &inRHS})
		{
			while (!text->empty() && IsIgnored(text->front()))
				text->remove_prefix(1);
		}
		if (inLHS.empty() || inRHS.empty())
			return inLHS.empty() && inRHS.empty();
		if (Lowered(inLHS.front()) != Lowered(inRHS.front()))
			return false;
	}
}

std::string UnknownName(std::string_view inWhat, std::string_view inText, std::vector<std::string_view> inNames)
{
	// A name that holds what was typed is nearer than one of the same length: "22.2" means VST22_2, not 51.
	const std::string typed = LettersAndDigits(inText);
	using Distance = std::pair<bool, std::size_t>;
	std::vector<std::pair<Distance, std::string_view>> byDistance;
	for (const std::string_view name : inNames)
	{
		const bool isWithin = !typed.empty() && LettersAndDigits(name).find(typed) != std::string::npos;
		byDistance.emplace_back(Distance{!isWithin, EditDistance(name, inText)}, name);
	}
	std::ranges::stable_sort(byDistance, {}, &std::pair<Distance, std::string_view>::first);
	std::string sentence = "no " + std::string(inWhat) + " is named " + Quoted(inText);
	if (!byDistance.empty() && byDistance.front().first < Distance{true, Folded(inText).size()})
	{
		std::ranges::transform(byDistance, inNames.begin(), &std::pair<Distance, std::string_view>::second);
		inNames.resize(std::min(kSuggestions, inNames.size()));
		return sentence + "; the closest are " + Joined(inNames);
	}
	return inNames.size() <= kMostOfShortList ? sentence + "; there are " + Joined(inNames) : sentence;
}

std::string Joined(std::span<const std::string_view> inNames)
{
	std::string text;
	for (const std::string_view name : inNames)
		text.append(text.empty() ? "" : ", ").append(name);
	return text;
}

std::vector<std::string_view> ItemsOf(std::string_view inText, char inMark)
{
	std::vector<std::string_view> items;
	for (std::size_t begin = 0; begin <= inText.size();)
	{
		const std::size_t end = std::min(inText.find(inMark, begin), inText.size());
		items.push_back(inText.substr(begin, end - begin));
		begin = end + 1;
	}
	if (items.size() > 1 && items.back().empty())
		items.pop_back();
	if (std::ranges::any_of(items, [](std::string_view inItem) { return IsSameName(inItem, ""); }))
		throw UsageProblem("a name is missing in " + Quoted(inText));
	return items;
}

}   // namespace zonmedia
