// Message catalogues of any content: read whole or refused, never half.

#include "FuzzInput.h"
#include "zoncore/MessageCatalogue.h"

#include <string>
#include <utility>

namespace
{

using zoncore::config::MessageCatalogue;
using zonfuzz::FuzzInput;
using zonfuzz::Require;

std::string Word(std::size_t inValue)
{
	std::string bytes;
	for (unsigned shift = 0; shift < 32; shift += 8)
		bytes.push_back(static_cast<char>(inValue >> shift & 0xFF));
	return bytes;
}

// A sound catalogue of one message: "$$$/a=b" is "c".
std::string SmallCatalogue()
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

void CheckLookups(const MessageCatalogue& inCatalogue, std::string_view inBytes)
{
	for (std::size_t begin = 0; begin < inBytes.size(); begin += 1 + inBytes.size() / 8)
	{
		const std::string_view text = inCatalogue.Find(inBytes.substr(begin, 20));
		Require(text.empty() || inBytes.find(text) != std::string_view::npos, "translations come from the catalogue");
	}
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	const std::string_view bytes = FuzzInput(inData, inSize).Rest();
	static const std::string sSmall = SmallCatalogue();
	MessageCatalogue catalogue;
	std::string error;
	Require(catalogue.Parse(sSmall, error), "a sound catalogue is read");
	if (catalogue.Parse(bytes, error))
	{
		CheckLookups(catalogue, bytes);
		MessageCatalogue moved = std::move(catalogue);
		CheckLookups(moved, bytes);
		return 0;
	}
	Require(!error.empty() && error.find('\n') == std::string::npos, "a refusal has a reason of one line");
	Require(catalogue.GetSize() == 1 && catalogue.Find("$$$/a=b") == "c", "a refused catalogue changes nothing");
	return 0;
}
