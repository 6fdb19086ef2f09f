#include "zoncore/UTF16Stream.h"

#include <algorithm>
#include <array>

using zoncore::UTF16Char;

// The facets classify and convert as the classic locale's own facet does for `char`, for the characters of ASCII.
namespace
{

constexpr UTF16Char kLastAsciiChar = 0x7F;

const std::ctype<char>& AsciiFacet()
{
	return std::use_facet<std::ctype<char>>(std::locale::classic());
}

bool IsAscii(UTF16Char inChar)
{
	return inChar <= kLastAsciiChar;
}

std::ctype_base::mask Classify(UTF16Char inChar)
{
	return IsAscii(inChar) ? AsciiFacet().table()[inChar] : std::ctype_base::mask{};
}

}   // namespace

#if !defined(__GLIBCXX__)
zoncore::UTF16CtypeBase::~UTF16CtypeBase() = default;
#endif

std::locale::id std::ctype<UTF16Char>::id;

bool std::ctype<UTF16Char>::do_is(mask inMask, char_type inChar) const
{
	return (Classify(inChar) & inMask) != 0;
}

const UTF16Char* std::ctype<UTF16Char>::do_is(const char_type* inBegin, const char_type* inEnd, mask* outMasks) const
{
	std::transform(inBegin, inEnd, outMasks, Classify);
	return inEnd;
}

const UTF16Char* std::ctype<UTF16Char>::do_scan_is(mask inMask, const char_type* inBegin, const char_type* inEnd) const
{
	return std::find_if(inBegin, inEnd, [&](char_type inChar) { return do_is(inMask, inChar); });
}

const UTF16Char* std::ctype<UTF16Char>::do_scan_not(mask inMask, const char_type* inBegin, const char_type* inEnd) const
{
	return std::find_if_not(inBegin, inEnd, [&](char_type inChar) { return do_is(inMask, inChar); });
}

UTF16Char std::ctype<UTF16Char>::do_toupper(char_type inChar) const
{
	return IsAscii(inChar) ? do_widen(AsciiFacet().toupper(static_cast<char>(inChar))) : inChar;
}

const UTF16Char* std::ctype<UTF16Char>::do_toupper(char_type* ioBegin, const char_type* inEnd) const
{
	for (; ioBegin != inEnd; ++ioBegin)
		*ioBegin = do_toupper(*ioBegin);
	return inEnd;
}

UTF16Char std::ctype<UTF16Char>::do_tolower(char_type inChar) const
{
	return IsAscii(inChar) ? do_widen(AsciiFacet().tolower(static_cast<char>(inChar))) : inChar;
}

const UTF16Char* std::ctype<UTF16Char>::do_tolower(char_type* ioBegin, const char_type* inEnd) const
{
	for (; ioBegin != inEnd; ++ioBegin)
		*ioBegin = do_tolower(*ioBegin);
	return inEnd;
}

UTF16Char std::ctype<UTF16Char>::do_widen(char inChar) const
{
	return static_cast<unsigned char>(inChar);
}

const char* std::ctype<UTF16Char>::do_widen(const char* inBegin, const char* inEnd, char_type* outChars) const
{
	std::transform(inBegin, inEnd, outChars, [&](char inChar) { return do_widen(inChar); });
	return inEnd;
}

char std::ctype<UTF16Char>::do_narrow(char_type inChar, char inDefault) const
{
	return IsAscii(inChar) ? static_cast<char>(inChar) : inDefault;
}

const UTF16Char* std::ctype<UTF16Char>::do_narrow(
	const char_type* inBegin, const char_type* inEnd, char inDefault, char* outChars) const
{
	std::transform(inBegin, inEnd, outChars, [&](char_type inChar) { return do_narrow(inChar, inDefault); });
	return inEnd;
}

std::locale::id std::numpunct<UTF16Char>::id;

UTF16Char std::numpunct<UTF16Char>::do_decimal_point() const
{
	return '.';
}

UTF16Char std::numpunct<UTF16Char>::do_thousands_sep() const
{
	return ',';
}

std::string std::numpunct<UTF16Char>::do_grouping() const
{
	return {};
}

std::numpunct<UTF16Char>::string_type std::numpunct<UTF16Char>::do_truename() const
{
	return {'t', 'r', 'u', 'e'};
}

std::numpunct<UTF16Char>::string_type std::numpunct<UTF16Char>::do_falsename() const
{
	return {'f', 'a', 'l', 's', 'e'};
}

template class std::num_get<UTF16Char, std::istreambuf_iterator<UTF16Char, zoncore::UTF16CharTraits>>;
template class std::num_put<UTF16Char, std::ostreambuf_iterator<UTF16Char, zoncore::UTF16CharTraits>>;

namespace
{

// A facet that no locale deletes, in memory of its own that is never given back: streams may still be made while static
// objects are destroyed.
template <class Facet>
union PermanentFacet
{
	struct Kept : Facet
	{
		Kept() : Facet(1) {}   // the reference that stays
	};

	PermanentFacet() : mFacet() {}
	PermanentFacet(const PermanentFacet&) = delete;
	PermanentFacet& operator=(const PermanentFacet&) = delete;
	~PermanentFacet() {}

	Kept mFacet;
};

template <class Facet>
Facet* GetPermanentFacet()
{
	static PermanentFacet<Facet> sFacet;
	return &sFacet.mFacet;
}

template <class Facet>
std::locale With(const std::locale& inLocale)
{
	return std::locale(inLocale, GetPermanentFacet<Facet>());
}

}   // namespace

const std::locale& zoncore::ClassicUTF16Locale()
{
	// Never destroyed, for the same reason.
	static const std::locale& sLocale
		= *new std::locale(With<zoncore::UTF16NumberReader>(With<zoncore::UTF16NumberWriter>(
			With<std::numpunct<UTF16Char>>(With<std::ctype<UTF16Char>>(std::locale::classic())))));
	return sLocale;
}
