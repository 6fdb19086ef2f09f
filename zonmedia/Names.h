#pragma once

/// \file
/// Names for the values of the library, as they are typed on a command line.
///
/// Every list of names is made from the library's own tables. What is found nowhere is refused with the closest names.

#include "zonmedia/Problem.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace zonmedia
{

template <class T>
struct Named
{
	std::string mName;
	T mValue;
};

/// The least number of characters to put in, take out or replace to turn one text into the other. Letters of either case
/// are the same, as are "_", "-" and blanks.
std::size_t EditDistance(std::string_view inLHS, std::string_view inRHS);

/// Whether two names are one: but for case, "_", "-" and blanks. Compares without writing either anew.
bool IsSameName(std::string_view inLHS, std::string_view inRHS);

/// A sentence that refuses inText: what it is no name of, and the closest of inNames, those first that hold it. Where
/// nothing is close, all of a short list as it stands, and none of a long one.
std::string UnknownName(std::string_view inWhat, std::string_view inText, std::vector<std::string_view> inNames);

/// The names with commas between them.
std::string Joined(std::span<const std::string_view> inNames);

/// The names of all of inAll with commas between them, for a text of help.
template <class T>
std::string NamesOf(std::span<const Named<T>> inAll)
{
	std::vector<std::string_view> names;
	for (const Named<T>& named : inAll)
		names.emplace_back(named.mName);
	return Joined(names);
}

/// The items of inText, which has inMark between them and may have one after the last. Throws UsageProblem when one is
/// empty.
std::vector<std::string_view> ItemsOf(std::string_view inText, char inMark);

/// The value that inText names: exactly, or else but for case and "_". Throws UsageProblem with the closest names.
/// inWhat is what is named: "display"; inElse ends the sentence with what else would serve.
template <class T>
const T& ValueNamed(
	std::span<const Named<T>> inAll, std::string_view inWhat, std::string_view inText, std::string_view inElse = {})
{
	const auto exact = std::ranges::find(inAll, inText, &Named<T>::mName);
	if (exact != inAll.end())
		return exact->mValue;
	const auto isMeant = [inText](const Named<T>& inNamed) { return IsSameName(inNamed.mName, inText); };
	const auto meant = std::ranges::find_if(inAll, isMeant);
	if (meant != inAll.end())
		return meant->mValue;
	std::vector<std::string_view> names;
	for (const Named<T>& named : inAll)
		names.emplace_back(named.mName);
	throw UsageProblem(UnknownName(inWhat, inText, std::move(names)).append(inElse));
}

/// The name of a value; empty when it has none.
template <class T>
std::string NameOf(std::span<const Named<T>> inAll, const T& inValue)
{
	const auto named = std::ranges::find(inAll, inValue, &Named<T>::mValue);
	return named == inAll.end() ? std::string() : named->mName;
}

}   // namespace zonmedia
