#include "zoncore/StringUtils.h"
#include "zonmediatypes/TimeConversionUtils.h"

#include <cstdio>

// One beat before zero at 63 beats a minute is -32.5 samples at 34.125 Hz, to the last bit of the rounded product, so it
// counts as sample -32. A multiply-add that is contracted rounds once instead of twice, sees that the product lies a little
// above, and comes to -31. Exit status 77: the processor has no contracted multiply-add to show it with.
int main()
{
#if defined(__x86_64__) || defined(__i386__)
	constexpr int kSkipped = 77;
	if (!__builtin_cpu_supports("fma"))
		return kSkipped;
#endif
	const zonmediatypes::utility::BeatInfo beatInfo{960, 63.0, 4, 4, 0.0};
	const auto samples = zonmediatypes::utility::ConvertBarsAndBeatsToSamples(
		zoncore::utility::AsciiToUTF16("0:-1"), 34.125, beatInfo, true);
	std::printf("%lld samples\n", static_cast<long long>(samples));
	return samples == -32 ? 0 : 1;
}
