// Values for the debugger to show; see ShowValues.gdb beside.

#include "zoncore/Flags.h"
#include "zoncore/StringUtils.h"
#include "zonmediatypes/ZONMediaTypes.h"

using namespace zonmediatypes;

namespace
{

[[gnu::noinline]] void StopHere(const void* inUsed)
{
	asm volatile("" : : "r"(inUsed) : "memory");
}

}   // namespace

int main()
{
	TickTime mark;
	mark.AddFrames(1'800, kFrameRate_VideoNTSC);
	const TickTime invalid = kTime_Invalid;
	const FrameRate ntsc = kFrameRate_VideoNTSC;
	const FrameRate noRate;
	const AudioChannelDescription channel = kAudioChannelLabel_BackLeft;
	const PixelFormatName name = MakePixelFormatName('b', 'g', 'r', 'a');
	const PixelFormatName anyName = kPixelFormatFourCC_Any;
	const auto oddName = static_cast<PixelFormatName>(1);
	const PixelFormat format = kPixelFormat_V210_422_10u;
	const PixelFormatProperties properties;
	const PixelAspectRatio ratio = kPixelAspectRatio_DVPALWide;
	const zoncore::Flags<unsigned int> flags = kTimecodeFlag_ShowSign | kTimecodeFlag_LastFrame;
	const zoncore::UTF16String text = zoncore::utility::UTF8to16("L\xC3\xA4nge");
	const zoncore::UTF16String empty;
	const void* const used[] = {&mark, &invalid, &ntsc, &noRate, &channel, &name, &anyName, &oddName, &format,
		&properties, &ratio, &flags, &text, &empty};
	StopHere(used);
}
