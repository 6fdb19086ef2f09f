#include "zoncore/CheckRegistry.h"
#include "zoncore/Error.h"
#include "zoncore/StringUtils.h"
#include "zoncore/UTF16Stream.h"
#include "zonmediatypes/FrameRate.h"
#include "zonmediatypes/TickTime.h"
#include "zonmediatypes/Version.h"
#include "zonmediatypes/ZONMediaTypes.h"

#include <algorithm>
#include <iomanip>
#include <iostream>
#include <string_view>

// Uses what can go wrong between a program and the library: both libraries, inline and compiled functions, a 16-bit stream
// across the boundary, an exception thrown inside, what registers itself at load.
int main()
{
	using namespace zonmediatypes;

	TickTime time = kTime_Zero;
	time.AddFrames(1'800, kFrameRate_VideoNTSC);
	zoncore::oUTF16StringStream stream;
	stream << kFrameRate_VideoNTSC << std::setw(6) << time.ToFrame64(kFrameRate_VideoNTSC) << std::setw(4) << 1.5;
	const auto text = zoncore::utility::UTF16to8(stream.str());

	bool caught = false;
	try
	{
		zoncore::config::ThrowError(0, "$$$/adopter/Error=as expected");
	}
	catch (const zoncore::config::Error& error)
	{
		caught = std::string_view(error.what()) == "as expected";
	}

	const auto suites = zoncore::CheckRegistry::Get().GetSuites();
	const bool isRegistered = std::ranges::count(suites, "ZON.MediaTypes") == 1;
	const bool isRight = std::string_view(Version()) == ZONMEDIATYPES_VERSION_STRING && text == "29.97  1800 1.5"
		&& caught && isRegistered;
	std::cout << Version() << ": " << text << (isRight ? "" : " is wrong") << '\n';
	return isRight ? 0 : 1;
}
