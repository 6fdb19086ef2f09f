#include "zoncore/MessageCatalogue.h"

#include "zoncore/src/System.h"
#include "zoncore/src/TextKey.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <compare>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <utility>

namespace zoncore::config
{
namespace
{

// The layout of a catalogue: seven words, then, where the header says, two tables of as many (length, offset) pairs as
// there are messages, then the texts, each ended by a zero byte that its length does not count.
constexpr std::uint32_t kMagic = 0x950412DE;
constexpr std::uint32_t kMagicOfOtherOrder = 0xDE120495;
constexpr std::size_t kWordBytes = 4;
constexpr std::size_t kHeaderBytes = 7 * kWordBytes;
constexpr std::size_t kRevisionAt = 1 * kWordBytes;
constexpr std::size_t kCountAt = 2 * kWordBytes;
constexpr std::size_t kIdTableAt = 3 * kWordBytes;
constexpr std::size_t kTextTableAt = 4 * kWordBytes;
constexpr std::size_t kEntryBytes = 2 * kWordBytes;
constexpr std::uint32_t kLatestMajorRevision = 1;
constexpr char kContextEnd = '\4';

constexpr std::size_t kLargestFile = 64u << 20;

// Bounds-checked reading of a catalogue's bytes. Places and sizes come from the file: they are computed in 64 bits, in which
// nothing that is made of a few words wraps.
class Bytes
{
public:
	explicit Bytes(std::string_view inBytes) : mBytes(inBytes) {}

	bool Has(std::uint64_t inAt, std::uint64_t inCount) const
	{
		return inAt <= mBytes.size() && inCount <= mBytes.size() - inAt;
	}

	// The word at inAt, which must be there, lowest byte first unless the other order was chosen.
	std::uint32_t Word(std::size_t inAt) const
	{
		std::uint32_t word = 0;
		for (std::size_t i = 0; i < kWordBytes; ++i)
		{
			const std::size_t shift = 8 * (mIsOtherOrder ? kWordBytes - 1 - i : i);
			word |= static_cast<std::uint32_t>(static_cast<unsigned char>(mBytes[inAt + i])) << shift;
		}
		return word;
	}

	void ChooseOtherOrder() { mIsOtherOrder = true; }

	// The text that the table entry at inAt refers to; false when it or its zero byte lies outside.
	bool Text(std::size_t inAt, std::string_view& outText) const
	{
		const std::size_t length = Word(inAt);
		const std::size_t offset = Word(inAt + kWordBytes);
		if (!Has(offset, std::uint64_t{length} + 1) || mBytes[offset + length] != '\0')
			return false;
		outText = mBytes.substr(offset, length);
		return true;
	}

private:
	std::string_view mBytes;
	bool mIsOtherOrder = false;
};

// What is wrong with the header words; empty when nothing is.
std::string_view CheckHeader(Bytes& ioBytes)
{
	if (!ioBytes.Has(0, kHeaderBytes))
		return "is too short for a message catalogue";
	if (ioBytes.Word(0) == kMagicOfOtherOrder)
		ioBytes.ChooseOtherOrder();
	if (ioBytes.Word(0) != kMagic)
		return "is not a message catalogue: expected the magic number 950412DE";
	if (ioBytes.Word(kRevisionAt) >> 16 > kLatestMajorRevision)
		return "is a message catalogue of an unknown revision: expected 0 or 1";
	const std::uint64_t tableBytes = std::uint64_t{ioBytes.Word(kCountAt)} * kEntryBytes;
	if (!ioBytes.Has(ioBytes.Word(kIdTableAt), tableBytes) || !ioBytes.Has(ioBytes.Word(kTextTableAt), tableBytes))
		return "is a damaged message catalogue: a table of messages lies outside the file";
	return {};
}

// The text of the message with the empty id says, among other things, the encoding.
bool SaysUTF8(std::string_view inHeader)
{
	constexpr std::string_view kCharset = "charset=";
	const std::size_t found = inHeader.find(kCharset);
	const std::string_view charset
		= found == std::string_view::npos ? std::string_view() : inHeader.substr(found + kCharset.size());
	return charset.starts_with("UTF-8") || charset.starts_with("utf-8");
}

// A message id as the files have it, compared piece by piece so that a look-up builds no text.
std::strong_ordering CompareId(std::string_view inId, std::string_view inContext, std::string_view inText)
{
	const std::size_t contextBytes = std::min(inId.size(), inContext.size());
	if (const auto order = inId.substr(0, contextBytes) <=> inContext; order != 0)
		return order;
	if (inId.size() == contextBytes)
		return std::strong_ordering::less;
	if (inId[contextBytes] != kContextEnd)
		return static_cast<unsigned char>(inId[contextBytes]) <=> static_cast<unsigned char>(kContextEnd);
	return inId.substr(contextBytes + 1) <=> inText;
}

struct CloseFile
{
	void operator()(std::FILE* inFile) const { std::fclose(inFile); }
};

}   // namespace

bool MessageCatalogue::Parse(std::string_view inBytes, std::string& outError)
{
	std::vector<char> storage(inBytes.begin(), inBytes.end());
	Bytes bytes(std::string_view(storage.data(), storage.size()));
	if (const std::string_view error = CheckHeader(bytes); !error.empty())
	{
		outError = error;
		return false;
	}

	std::vector<Message> messages;
	std::string_view header;
	for (std::size_t i = 0, count = bytes.Word(kCountAt); i < count; ++i)
	{
		Message message;
		if (!bytes.Text(bytes.Word(kIdTableAt) + i * kEntryBytes, message.mId)
			|| !bytes.Text(bytes.Word(kTextTableAt) + i * kEntryBytes, message.mText))
		{
			outError
				= "is a damaged message catalogue: the text of message " + std::to_string(i) + " lies outside the file";
			return false;
		}
		if (message.mId.empty())
			header = message.mText;
		else if (!messages.empty() && messages.back().mId >= message.mId)
		{
			outError = "is a damaged message catalogue: message " + std::to_string(i) + " is not in its sorted place";
			return false;
		}
		else
			messages.push_back(message);
	}
	if (!messages.empty() && !SaysUTF8(header))
	{
		outError = "is a message catalogue in another encoding: expected a header with charset=UTF-8";
		return false;
	}
	mBytes.swap(storage);
	mMessages.swap(messages);
	return true;
}

bool MessageCatalogue::Load(const std::string& inPath, std::string& outError)
{
	const std::unique_ptr<std::FILE, CloseFile> file(system::OpenToRead(inPath));
	if (file == nullptr)
	{
		outError = inPath + ": cannot be opened: " + system::ErrorText(errno);
		return false;
	}
	std::string bytes;
	std::array<char, 16 * 1024> buffer;
	while (const std::size_t count = std::fread(buffer.data(), 1, buffer.size(), file.get()))
	{
		bytes.append(buffer.data(), count);
		if (bytes.size() > kLargestFile)
		{
			outError = inPath + ": is too large for a message catalogue: expected at most 64 MB";
			return false;
		}
	}
	if (std::ferror(file.get()) != 0)
	{
		outError = inPath + ": cannot be read: " + system::ErrorText(errno);
		return false;
	}
	std::string error;
	if (Parse(bytes, error))
		return true;
	outError = inPath + ": " + error;
	return false;
}

std::string_view MessageCatalogue::Find(std::string_view inKey) const noexcept
{
	const std::string_view context = KeyPath(inKey);
	const std::string_view text = EnglishText(inKey);
	const auto found = std::ranges::partition_point(
		mMessages, [&](const Message& inMessage) { return CompareId(inMessage.mId, context, text) < 0; });
	const bool isThere = found != mMessages.end() && CompareId(found->mId, context, text) == 0;
	return isThere ? found->mText : std::string_view();
}

}   // namespace zoncore::config
