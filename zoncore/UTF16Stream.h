#pragma once

/// \file
/// Streams over 16-bit text.
///
///     oUTF16StringStream stream;
///     stream << std::setw(4) << std::setfill(UTF16Char('0')) << 12 << " " << 29.97 << " fps";
///     stream.str();   // "0012 29.97 fps"
///
/// The streams format and read integers, doubles and Booleans as a `char` stream with the classic locale does, width, fill
/// and precision included, whatever the global locale is. Text is written as UTF16String, as UTF16Char*, as a narrow literal
/// (" fps"), or character by character with put(). A single code unit is a number to `<<` and `>>`, and so is a narrow
/// character: `stream << UTF16Char(65)` and `stream << 'A'` write "65". A stream is for one thread at a time, as standard
/// streams are.
///
/// The standard library has no character facets for 16-bit characters; they are declared here and live in this library,
/// so that a stream made on one side of a shared library's boundary works on the other.

#include "zoncore/Export.h"
#include "zoncore/UTF16String.h"

#include <cstddef>
#include <ios>
#include <istream>
#include <iterator>
#include <locale>
#include <ostream>
#include <sstream>
#include <streambuf>
#include <string>
#include <utility>

namespace zoncore
{

#if defined(__GLIBCXX__)
using UTF16CtypeBase = std::__ctype_abstract_base<UTF16Char>;
#else
/// The interface of std::ctype, for standard libraries that have none that others can implement.
class ZONCORE_API UTF16CtypeBase : public std::locale::facet, public std::ctype_base
{
public:
	using char_type = UTF16Char;

	bool is(mask inMask, char_type inChar) const { return do_is(inMask, inChar); }
	const char_type* is(const char_type* inBegin, const char_type* inEnd, mask* outMasks) const
	{
		return do_is(inBegin, inEnd, outMasks);
	}
	const char_type* scan_is(mask inMask, const char_type* inBegin, const char_type* inEnd) const
	{
		return do_scan_is(inMask, inBegin, inEnd);
	}
	const char_type* scan_not(mask inMask, const char_type* inBegin, const char_type* inEnd) const
	{
		return do_scan_not(inMask, inBegin, inEnd);
	}
	char_type toupper(char_type inChar) const { return do_toupper(inChar); }
	const char_type* toupper(char_type* ioBegin, const char_type* inEnd) const { return do_toupper(ioBegin, inEnd); }
	char_type tolower(char_type inChar) const { return do_tolower(inChar); }
	const char_type* tolower(char_type* ioBegin, const char_type* inEnd) const { return do_tolower(ioBegin, inEnd); }
	char_type widen(char inChar) const { return do_widen(inChar); }
	const char* widen(const char* inBegin, const char* inEnd, char_type* outChars) const
	{
		return do_widen(inBegin, inEnd, outChars);
	}
	char narrow(char_type inChar, char inDefault) const { return do_narrow(inChar, inDefault); }
	const char_type* narrow(const char_type* inBegin, const char_type* inEnd, char inDefault, char* outChars) const
	{
		return do_narrow(inBegin, inEnd, inDefault, outChars);
	}

protected:
	explicit UTF16CtypeBase(std::size_t inReferences) : std::locale::facet(inReferences) {}
	~UTF16CtypeBase() override;

	virtual bool do_is(mask inMask, char_type inChar) const = 0;
	virtual const char_type* do_is(const char_type* inBegin, const char_type* inEnd, mask* outMasks) const = 0;
	virtual const char_type* do_scan_is(mask inMask, const char_type* inBegin, const char_type* inEnd) const = 0;
	virtual const char_type* do_scan_not(mask inMask, const char_type* inBegin, const char_type* inEnd) const = 0;
	virtual char_type do_toupper(char_type inChar) const = 0;
	virtual const char_type* do_toupper(char_type* ioBegin, const char_type* inEnd) const = 0;
	virtual char_type do_tolower(char_type inChar) const = 0;
	virtual const char_type* do_tolower(char_type* ioBegin, const char_type* inEnd) const = 0;
	virtual char_type do_widen(char inChar) const = 0;
	virtual const char* do_widen(const char* inBegin, const char* inEnd, char_type* outChars) const = 0;
	virtual char do_narrow(char_type inChar, char inDefault) const = 0;
	virtual const char_type* do_narrow(
		const char_type* inBegin, const char_type* inEnd, char inDefault, char* outChars) const = 0;
};
#endif

/// The facets that read and write numbers on 16-bit streams.
using UTF16NumberReader = std::num_get<UTF16Char, std::istreambuf_iterator<UTF16Char, UTF16CharTraits>>;
using UTF16NumberWriter = std::num_put<UTF16Char, std::ostreambuf_iterator<UTF16Char, UTF16CharTraits>>;

}   // namespace zoncore

/// Classification and case of ASCII; every code unit above 7F is of no class and its own upper and lower case.
template <>
class ZONCORE_API std::ctype<zoncore::UTF16Char> : public zoncore::UTF16CtypeBase
{
public:
	using char_type = zoncore::UTF16Char;

	static std::locale::id id;

	explicit ctype(std::size_t inReferences = 0) : zoncore::UTF16CtypeBase(inReferences) {}

protected:
	~ctype() override = default;

	bool do_is(mask inMask, char_type inChar) const override;
	const char_type* do_is(const char_type* inBegin, const char_type* inEnd, mask* outMasks) const override;
	const char_type* do_scan_is(mask inMask, const char_type* inBegin, const char_type* inEnd) const override;
	const char_type* do_scan_not(mask inMask, const char_type* inBegin, const char_type* inEnd) const override;
	char_type do_toupper(char_type inChar) const override;
	const char_type* do_toupper(char_type* ioBegin, const char_type* inEnd) const override;
	char_type do_tolower(char_type inChar) const override;
	const char_type* do_tolower(char_type* ioBegin, const char_type* inEnd) const override;
	char_type do_widen(char inChar) const override;
	const char* do_widen(const char* inBegin, const char* inEnd, char_type* outChars) const override;
	char do_narrow(char_type inChar, char inDefault) const override;
	const char_type* do_narrow(
		const char_type* inBegin, const char_type* inEnd, char inDefault, char* outChars) const override;
};

/// The classic punctuation of numbers: "." as decimal point and no grouping.
template <>
class ZONCORE_API std::numpunct<zoncore::UTF16Char> : public std::locale::facet
{
public:
	using char_type = zoncore::UTF16Char;
	using string_type = std::basic_string<char_type, zoncore::UTF16CharTraits>;

	static std::locale::id id;

	explicit numpunct(std::size_t inReferences = 0) : std::locale::facet(inReferences) {}

	char_type decimal_point() const { return do_decimal_point(); }
	char_type thousands_sep() const { return do_thousands_sep(); }
	std::string grouping() const { return do_grouping(); }
	string_type truename() const { return do_truename(); }
	string_type falsename() const { return do_falsename(); }

protected:
	~numpunct() override = default;

	virtual char_type do_decimal_point() const;
	virtual char_type do_thousands_sep() const;
	virtual std::string do_grouping() const;
	virtual string_type do_truename() const;
	virtual string_type do_falsename() const;
};

extern template class ZONCORE_API
	std::num_get<zoncore::UTF16Char, std::istreambuf_iterator<zoncore::UTF16Char, zoncore::UTF16CharTraits>>;
extern template class ZONCORE_API
	std::num_put<zoncore::UTF16Char, std::ostreambuf_iterator<zoncore::UTF16Char, zoncore::UTF16CharTraits>>;

namespace zoncore
{

/// The classic locale with the facets that 16-bit streams need. The streams below have it from construction on; a 16-bit
/// stream of another kind is given it with imbue().
ZONCORE_API const std::locale& ClassicUTF16Locale();

/// A standard string stream with the classic facets for 16-bit characters; it moves and swaps as the standard one does.
template <class Stream>
class ClassicUTF16Stream : public Stream
{
public:
	ClassicUTF16Stream() { Imbue(); }
	explicit ClassicUTF16Stream(std::ios_base::openmode inMode) : Stream(inMode) { Imbue(); }
	explicit ClassicUTF16Stream(const UTF16String& inText) : Stream(inText) { Imbue(); }
	ClassicUTF16Stream(const UTF16String& inText, std::ios_base::openmode inMode) : Stream(inText, inMode) { Imbue(); }

	// Written out: the virtual base of streams does not move by itself, the standard streams move what it holds.
	ClassicUTF16Stream(ClassicUTF16Stream&& ioOther) noexcept : Stream(std::move(ioOther)) {}
	ClassicUTF16Stream& operator=(ClassicUTF16Stream&& ioOther) noexcept
	{
		Stream::operator=(std::move(ioOther));
		return *this;
	}

private:
	void Imbue() { this->imbue(ClassicUTF16Locale()); }
};

}   // namespace zoncore
