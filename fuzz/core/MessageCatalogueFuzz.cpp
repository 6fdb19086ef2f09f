// Message catalogues of any content: read whole or refused, never half, against a reading of their own.

#include "fuzz/Checks.h"
#include "fuzz/core/SmallCatalogue.h"
#include "zoncore/MessageCatalogue.h"

#include <algorithm>
#include <array>
#include <map>
#include <optional>
#include <string>
#include <utility>

namespace
{

using zoncore::config::MessageCatalogue;
using zonfuzz::FuzzInput;
using zonfuzz::Require;
using zonfuzz::SmallCatalogue;

using Messages = std::map<std::string, std::string>;   // texts by context, EOT and message id

// The messages of a catalogue by their ids, read once more; nothing for bytes that are no catalogue.
std::optional<Messages> ReadAgain(std::string_view inBytes)
{
	const bool isOtherOrder = inBytes.starts_with("\x95\x04\x12\xDE");
	const auto byte = [&](std::uint64_t inAt) { return inBytes[static_cast<std::size_t>(inAt)]; };
	const auto word = [&](std::uint64_t inAt)
	{
		std::uint64_t value = 0;
		for (std::size_t i = 0; i < 4; ++i)
			value = value << 8 | static_cast<unsigned char>(byte(inAt + (isOtherOrder ? i : 3 - i)));
		return value;
	};
	if (inBytes.size() < 28 || word(0) != 0x950412DE || word(4) >= 0x20000)
		return std::nullopt;
	const std::uint64_t count = word(8);
	if (std::max(word(12), word(16)) + count * 8 > inBytes.size())
		return std::nullopt;

	Messages messages;
	std::string header;
	for (std::uint64_t i = 0; i < count; ++i)
	{
		std::array<std::string, 2> texts;
		for (std::size_t k = 0; k < 2; ++k)
		{
			const std::uint64_t entry = word(12 + 4 * k) + 8 * i, length = word(entry), begin = word(entry + 4);
			if (begin + length >= inBytes.size() || byte(begin + length) != '\0')
				return std::nullopt;
			texts[k] = inBytes.substr(static_cast<std::size_t>(begin), static_cast<std::size_t>(length));
		}
		if (texts[0].empty())
			header = texts[1];
		else if (!messages.empty() && messages.rbegin()->first >= texts[0])
			return std::nullopt;
		else
			messages.emplace(texts[0], texts[1]);
	}
	const std::size_t charset = header.find("charset=");
	const std::string encoding = charset == std::string::npos ? "" : header.substr(charset + 8, 5);
	return messages.empty() || encoding == "UTF-8" || encoding == "utf-8" ? std::optional(messages) : std::nullopt;
}

void CheckLookups(const MessageCatalogue& inCatalogue, const Messages& inMessages, std::string_view inBytes)
{
	Require(inCatalogue.GetSize() == inMessages.size(), "every message but the header is there");
	const auto check = [&](std::string_view inKey)
	{
		const std::size_t equals = std::min(inKey.find('='), inKey.size());
		std::string id(inKey.substr(0, equals));
		id.append("\4").append(inKey.substr(std::min(equals + 1, inKey.size())));
		const auto found = inMessages.find(id);
		Require(
			inCatalogue.Find(inKey) == (found == inMessages.end() ? "" : found->second), "keys have their messages");
	};
	for (const auto& [id, text] : inMessages)
	{
		std::string key = id;
		std::replace(key.begin(), key.end(), '\4', '=');
		check(key);
		check(key.substr(0, key.size() - 1));
		check(key + 'x');
	}
	check(inBytes.substr(inBytes.size() / 2));
}

}   // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* inData, std::size_t inSize)
{
	const std::string_view bytes = FuzzInput(inData, inSize).Rest();
	static const std::string sSmall = SmallCatalogue();
	MessageCatalogue catalogue;
	std::string error;
	Require(catalogue.Parse(sSmall, error), "a sound catalogue is read");
	const std::optional<Messages> messages = ReadAgain(bytes);
	Require(catalogue.Parse(bytes, error) == messages.has_value(), "sound catalogues are read, and no others");
	if (messages)
	{
		CheckLookups(catalogue, *messages, bytes);
		const MessageCatalogue moved = std::move(catalogue);
		CheckLookups(moved, *messages, bytes);
		return 0;
	}
	Require(!error.empty() && error.find('\n') == std::string::npos, "a refusal has a reason of one line");
	Require(catalogue.GetSize() == 1 && catalogue.Find("$$$/a=b") == "c", "a refused catalogue changes nothing");
	return 0;
}
