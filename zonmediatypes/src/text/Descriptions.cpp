#include "zonmediatypes/Descriptions.h"

#include "zonmediatypes/src/text/AudioTextKeys.h"
#include "zonmediatypes/src/text/TextKeys.h"
#include "zonmediatypes/src/text/TimeTextKeys.h"
#include "zonmediatypes/src/text/VideoTextKeys.h"

// The descriptions of each area have a file of their own; here is what joins them.

namespace zonmediatypes
{
namespace
{

constexpr auto sAllTextKeys = JoinKeys(kTimeTextKeys, kAudioTextKeys, kVideoTextKeys);

}   // namespace

std::span<const std::string_view> AllTextKeys() noexcept
{
	return sAllTextKeys;
}

}   // namespace zonmediatypes
