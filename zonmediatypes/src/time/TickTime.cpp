#include "zonmediatypes/TickTime.h"

#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16String.h"

#include <charconv>
#include <string_view>

namespace zonmediatypes
{
namespace
{

double Seconds(TickTime inTime)
{
	return static_cast<double>(inTime.GetTicks()) / static_cast<double>(kTicksPerSecond);
}

}   // namespace

void TickTime::ReportZeroDivisor(const char* inCondition, const char* inSignature, int inLine)
{
	if (zoncore::debug::BreakAfterContractDialog(inCondition, "zonmediatypes/src/TickTime.cpp", inSignature, inLine)
		&& zoncore::debug::IsDebuggerAttached())
		zoncore::debug::Break();
	zoncore::config::ThrowError(
		0, "$$$/zoncore/utility/Error/Contract/InputContractViolation=An input contract violation has occurred!");
}

std::basic_ostream<char>& operator<<(std::basic_ostream<char>& inStream, const TickTime& inTime)
{
	return inStream << Seconds(inTime);
}

std::basic_ostream<unsigned short>& operator<<(std::basic_ostream<unsigned short>& inStream, const TickTime& inTime)
{
	constexpr int kSignificantDigits = 6;
	char buffer[32];
	const auto result
		= std::to_chars(buffer, std::end(buffer), Seconds(inTime), std::chars_format::general, kSignificantDigits);
	return inStream << zoncore::utility::AsciiToUTF16(std::string_view(buffer, result.ptr));
}

}   // namespace zonmediatypes
