#pragma once

#include <locale>
#include <string>

namespace zontest
{

/// Makes numbers look like "1.234,5" and Booleans like "wahr" to everything that follows the global C++ locale, for as
/// long as it lives.
class HostileLocale
{
public:
	HostileLocale() : mBefore(std::locale::global(std::locale(std::locale::classic(), new Punctuation))) {}
	HostileLocale(const HostileLocale&) = delete;
	HostileLocale& operator=(const HostileLocale&) = delete;
	~HostileLocale() { std::locale::global(mBefore); }

private:
	class Punctuation : public std::numpunct<char>
	{
		char do_decimal_point() const override { return ','; }
		char do_thousands_sep() const override { return '.'; }
		std::string do_grouping() const override { return "\3"; }
		std::string do_truename() const override { return "wahr"; }
		std::string do_falsename() const override { return "falsch"; }
	};

	std::locale mBefore;
};

}   // namespace zontest
