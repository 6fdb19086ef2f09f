#pragma once

#include <cstddef>
#include <string>

namespace zonfuzz
{

inline std::string Word(std::size_t inValue)
{
	std::string bytes;
	for (unsigned shift = 0; shift < 32; shift += 8)
		bytes.push_back(static_cast<char>(inValue >> shift & 0xFF));
	return bytes;
}

/// A sound catalogue of one message: "$$$/a=b" is "c".
inline std::string SmallCatalogue()
{
	const std::string header = "charset=UTF-8";
	std::string texts, table;
	for (const std::string& text : {std::string(), std::string("$$$/a\4b"), header, std::string("c")})
	{
		table += Word(text.size()) + Word(28 + 4 * 8 + texts.size());
		texts += text + '\0';
	}
	return Word(0x950412DE) + Word(0) + Word(2) + Word(28) + Word(28 + 2 * 8) + Word(0) + Word(0) + table + texts;
}

}   // namespace zonfuzz
