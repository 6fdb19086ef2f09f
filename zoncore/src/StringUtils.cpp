#include "zoncore/StringUtils.h"

#include <algorithm>
#include <cstddef>
#include <type_traits>

namespace zoncore::utility
{
namespace
{

constexpr char32_t kReplacementCharacter = 0xFFFD;
constexpr char32_t kFirstSupplementary = 0x10000;
constexpr char32_t kHighSurrogate = 0xD800;
constexpr char32_t kLowSurrogate = 0xDC00;
constexpr char32_t kSurrogateMask = 0xFC00;
constexpr char32_t kSurrogatePayload = 0x3FF;
constexpr unsigned kSurrogateBits = 10;

template <class Char>
constexpr bool IsAscii(Char inChar)
{
	return static_cast<std::make_unsigned_t<Char>>(inChar) < 0x80;
}

// The length of the ASCII text at the start of inText.
template <class View>
std::size_t CountAscii(View inText)
{
	const auto isAscii = IsAscii<typename View::value_type>;
	return static_cast<std::size_t>(std::ranges::find_if_not(inText, isAscii) - inText.begin());
}

struct Decoded
{
	char32_t mCodePoint;
	std::size_t mLength;   // code units that it took, at least 1
};

// What a lead byte announces: how many continuation bytes follow and what the first of them may be (table 3-7 of the
// Unicode Standard). No continuation bytes means that the byte can begin nothing.
struct LeadByte
{
	std::size_t mContinuations;
	unsigned char mLowest;
	unsigned char mHighest;
	unsigned char mPayloadMask;
};

// clang-format off
constexpr LeadByte ReadLeadByte(unsigned char inByte)
{
	if (inByte < 0xC2)   return {};
	if (inByte < 0xE0)   return {1, 0x80, 0xBF, 0x1F};
	if (inByte == 0xE0)  return {2, 0xA0, 0xBF, 0x0F};
	if (inByte == 0xED)  return {2, 0x80, 0x9F, 0x0F};
	if (inByte < 0xF0)   return {2, 0x80, 0xBF, 0x0F};
	if (inByte == 0xF0)  return {3, 0x90, 0xBF, 0x07};
	if (inByte < 0xF4)   return {3, 0x80, 0xBF, 0x07};
	if (inByte == 0xF4)  return {3, 0x80, 0x8F, 0x07};
	return {};
}
// clang-format on

// The first code point of inText, which begins with a byte that is not ASCII; U+FFFD for a maximal subpart that is
// ill-formed.
Decoded DecodeUTF8(std::string_view inText)
{
	const auto first = static_cast<unsigned char>(inText.front());
	const LeadByte lead = ReadLeadByte(first);
	if (lead.mContinuations == 0)
		return {kReplacementCharacter, 1};

	char32_t codePoint = first & lead.mPayloadMask;
	for (std::size_t i = 1; i <= lead.mContinuations; ++i)
	{
		const unsigned char lowest = i == 1 ? lead.mLowest : 0x80;
		const unsigned char highest = i == 1 ? lead.mHighest : 0xBF;
		if (i >= inText.size())
			return {kReplacementCharacter, i};
		const auto byte = static_cast<unsigned char>(inText[i]);
		if (byte < lowest || byte > highest)
			return {kReplacementCharacter, i};
		codePoint = codePoint << 6 | (byte & 0x3Fu);
	}
	return {codePoint, lead.mContinuations + 1};
}

Decoded DecodeUTF16(UTF16StringView inText)
{
	const char32_t first = inText.front();
	if ((first & kSurrogateMask) == kHighSurrogate && inText.size() > 1
		&& (inText[1] & kSurrogateMask) == kLowSurrogate)
		return {
			kFirstSupplementary + ((first & kSurrogatePayload) << kSurrogateBits | (inText[1] & kSurrogatePayload)), 2};
	const bool isSurrogate = (first & kSurrogateMask) == kHighSurrogate || (first & kSurrogateMask) == kLowSurrogate;
	return {isSurrogate ? kReplacementCharacter : first, 1};
}

// Writes a code point at outText and returns the place after it: one code unit or two.
UTF16Char* WriteUTF16(UTF16Char* outText, char32_t inCodePoint)
{
	if (inCodePoint < kFirstSupplementary)
	{
		*outText = static_cast<UTF16Char>(inCodePoint);
		return outText + 1;
	}
	const char32_t payload = inCodePoint - kFirstSupplementary;
	outText[0] = static_cast<UTF16Char>(kHighSurrogate | payload >> kSurrogateBits);
	outText[1] = static_cast<UTF16Char>(kLowSurrogate | (payload & kSurrogatePayload));
	return outText + 2;
}

// How many bytes inText can take in UTF-8; a surrogate is counted as a lone one.
std::size_t MostUTF8Bytes(UTF16StringView inText)
{
	std::size_t bytes = 0;
	for (const UTF16Char unit : inText)
		bytes += unit < 0x80 ? 1 : unit < 0x800 ? 2 : 3;
	return bytes;
}

void AppendUTF8(std::string& ioText, char32_t inCodePoint)
{
	const auto continuation
		= [&](unsigned inShift) { ioText.push_back(static_cast<char>(0x80 | (inCodePoint >> inShift & 0x3F))); };
	if (inCodePoint < 0x80)
	{
		ioText.push_back(static_cast<char>(inCodePoint));
	}
	else if (inCodePoint < 0x800)
	{
		ioText.push_back(static_cast<char>(0xC0 | inCodePoint >> 6));
		continuation(0);
	}
	else if (inCodePoint < kFirstSupplementary)
	{
		ioText.push_back(static_cast<char>(0xE0 | inCodePoint >> 12));
		continuation(6);
		continuation(0);
	}
	else
	{
		ioText.push_back(static_cast<char>(0xF0 | inCodePoint >> 18));
		continuation(12);
		continuation(6);
		continuation(0);
	}
}

}   // namespace

UTF16String AsciiToUTF16(std::string_view inText)
{
	UTF16String text(inText.size(), 0);
	std::ranges::transform(inText, text.begin(),
		[](unsigned char inByte) { return static_cast<UTF16Char>(IsAscii(inByte) ? inByte : kReplacementCharacter); });
	return text;
}

UTF16String UTF8to16(std::string_view inText)
{
	if (CountAscii(inText) == inText.size())
		return {inText.begin(), inText.end()};
	// No form of a code point has more code units in UTF-16 than bytes in UTF-8, and nor has U+FFFD for an ill-formed piece.
	UTF16String text(inText.size(), 0);
	UTF16Char* end = text.data();
	while (!inText.empty())
	{
		const std::size_t ascii = CountAscii(inText);
		end = std::copy_n(inText.begin(), ascii, end);
		inText.remove_prefix(ascii);
		if (inText.empty())
			break;
		const Decoded decoded = DecodeUTF8(inText);
		end = WriteUTF16(end, decoded.mCodePoint);
		inText.remove_prefix(decoded.mLength);
	}
	text.resize(static_cast<std::size_t>(end - text.data()));
	return text;
}

std::string UTF16to8(UTF16StringView inText)
{
	const std::size_t ascii = CountAscii(inText);
	std::string text;
	text.reserve(ascii + MostUTF8Bytes(inText.substr(ascii)));
	text.resize(ascii);
	std::ranges::transform(
		inText.substr(0, ascii), text.begin(), [](UTF16Char inChar) { return static_cast<char>(inChar); });
	inText.remove_prefix(ascii);
	while (!inText.empty())
	{
		const Decoded decoded = DecodeUTF16(inText);
		AppendUTF8(text, decoded.mCodePoint);
		inText.remove_prefix(decoded.mLength);
	}
	return text;
}

void ReplaceInString(UTF16String& ioText, const UTF16String& inWhat, const UTF16String& inWith)
{
	if (inWhat.empty())
		return;
	UTF16String result;
	std::size_t begin = 0;
	for (std::size_t found = ioText.find(inWhat); found != UTF16String::npos; found = ioText.find(inWhat, begin))
	{
		result.append(ioText, begin, found - begin);
		result.append(inWith);
		begin = found + inWhat.size();
	}
	if (begin == 0)
		return;
	result.append(ioText, begin);
	ioText.swap(result);
}

}   // namespace zoncore::utility
