#pragma once

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

namespace zontest
{

using Messages = std::vector<std::pair<std::string, std::string>>;

/// Four bytes of a catalogue, lowest first unless said otherwise.
inline std::string Word(std::size_t inValue, bool inHighestFirst = false)
{
	std::string bytes;
	for (unsigned i = 0; i < 4; ++i)
		bytes.push_back(static_cast<char>(inValue >> 8 * (inHighestFirst ? 3 - i : i)));
	return bytes;
}

/// The file of a catalogue with these messages, in this order: seven words, two tables of lengths and offsets, the texts.
inline std::string MakeCatalogue(const Messages& inMessages, bool inHighestFirst = false)
{
	const std::size_t tableBytes = 8 * inMessages.size();
	std::string bytes;
	std::string texts;
	for (const std::size_t word : {std::size_t{0x950412DE}, std::size_t{0}, inMessages.size(), std::size_t{28},
			 28 + tableBytes, std::size_t{0}, std::size_t{0}})
		bytes += Word(word, inHighestFirst);
	for (const auto text : {&Messages::value_type::first, &Messages::value_type::second})
	{
		for (const auto& message : inMessages)
		{
			bytes += Word((message.*text).size(), inHighestFirst)
				+ Word(28 + 2 * tableBytes + texts.size(), inHighestFirst);
			texts += message.*text + '\0';
		}
	}
	return bytes + texts;
}

}   // namespace zontest
