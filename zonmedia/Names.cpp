#include "zonmedia/Names.h"

#include <numeric>
#include <utility>

namespace zonmedia
{

namespace
{

constexpr std::size_t kSuggestions = 4;

constexpr bool IsIgnored(char inChar)
{
	return inChar == '_' || inChar == '-' || inChar == ' ';
}

std::string Folded(std::string_view inText)
{
	std::string folded;
	for (const char character : inText)
	{
		if (!IsIgnored(character))
			folded.push_back(
				character >= 'A' && character <= 'Z' ? static_cast<char>(character - 'A' + 'a') : character);
	}
	return folded;
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
			row[i + 1] = std::min({replaced, row[i] + 1, row[i + 1] + 1});
		}
	}
	return row.back();
}

std::string UnknownName(std::string_view inWhat, std::string_view inText, std::vector<std::string_view> inNames)
{
	std::vector<std::pair<std::size_t, std::string_view>> byDistance;
	for (const std::string_view name : inNames)
		byDistance.emplace_back(EditDistance(name, inText), name);
	std::ranges::stable_sort(byDistance, {}, &std::pair<std::size_t, std::string_view>::first);
	std::string sentence = "no " + std::string(inWhat) + " is named " + Quoted(inText) + "; the closest are";
	for (std::size_t i = 0; i < std::min(kSuggestions, byDistance.size()); ++i)
		sentence.append(i == 0 ? " " : ", ").append(byDistance[i].second);
	return sentence;
}

}   // namespace zonmedia
