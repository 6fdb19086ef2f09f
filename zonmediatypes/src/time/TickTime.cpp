#include "zonmediatypes/TickTime.h"

#include "zoncore/Debug.h"
#include "zoncore/Error.h"
#include "zoncore/NumberConversion.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"

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

zoncore::UTF16OutputStream& operator<<(zoncore::UTF16OutputStream& inStream, const TickTime& inTime)
{
	zoncore::utility::GeneralText text;
	return inStream << zoncore::utility::AsciiToUTF16(zoncore::utility::WriteGeneral(Seconds(inTime), text));
}

}   // namespace zonmediatypes
