// What programs that are built already rely on, in one table rather than beside the types: what may not change is read,
// and reviewed, in one place. It only has to compile. Layouts inside and signatures: scripts/check-abi.
#include "zoncore/CheckRegistry.h"
#include "zoncore/Error.h"
#include "zoncore/Localizer.h"
#include "zoncore/MessageCatalogue.h"
#include "zoncore/RecursiveMutex.h"
#include "zonmediatypes/ZONMediaTypes.h"

#include <cstddef>
#include <cstdint>
#include <mutex>
#include <type_traits>

namespace zonmediatypes
{
namespace
{

// A value of inSize bytes, aligned like its widest field, that is copied as bytes and passed in registers where it fits.
template <class T, std::size_t inSize, class Widest>
constexpr bool kIsValue = sizeof(T) == inSize && alignof(T) == alignof(Widest)
	&& std::is_trivially_copyable_v<T>&& std::is_standard_layout_v<T>;

static_assert(kIsValue<zoncore::Flags<unsigned short>, 2, unsigned short>);
static_assert(kIsValue<zoncore::PointT<int>, 8, int>);
static_assert(kIsValue<zoncore::RectT<int>, 16, int>);
static_assert(kIsValue<TickTime, 8, std::int64_t>);
static_assert(kIsValue<FrameRate, 8, std::int64_t>);
static_assert(kIsValue<TimeBase, 48, std::int64_t>);
static_assert(kIsValue<zoncore::utility::Reciprocal, 16, std::uint64_t>);
static_assert(kIsValue<TimeBase::Ratio, 16, std::int64_t>);
static_assert(kIsValue<Rounding, 4, int>);
static_assert(kIsValue<TimecodeFields, 24, std::uint64_t>);
static_assert(kIsValue<TimecodeText, 64, std::uint16_t>);
static_assert(kIsValue<TimecodeFlags, 4, unsigned>);
static_assert(kIsValue<utility::BeatInfo, 32, double>);
static_assert(kIsValue<AudioChannelDescription, 4, std::int32_t>);
static_assert(kIsValue<NamedChannelLayout, 32, const void*>);
static_assert(kIsValue<PixelFormatProperties, 4, std::uint32_t>);
static_assert(kIsValue<PixelFormat, 8, std::uint32_t>);
static_assert(kIsValue<PixelAspectRatio, 8, std::uint32_t>);

// A number that may be outside the enumerators: unscoped, over the integer named.
template <class Enumeration, class Integer>
constexpr bool kIsNumber
	= std::is_same_v<std::underlying_type_t<Enumeration>, Integer>&& std::is_convertible_v<Enumeration, Integer>;

static_assert(kIsNumber<TimeDisplay, std::int32_t>);
static_assert(kIsNumber<TimecodeFlag, unsigned>);
static_assert(kIsNumber<PulldownCadence, std::int32_t>);
static_assert(kIsNumber<utility::TimecodeFormat, std::uint32_t>);
static_assert(kIsNumber<AudioChannelLabel, std::int32_t>);
static_assert(kIsNumber<AudioSampleType, std::int32_t>);
static_assert(kIsNumber<PixelFormatName, std::uint32_t>);
static_assert(kIsNumber<PixelFormatBitDepth, std::uint32_t>);
static_assert(kIsNumber<PixelFormatAlpha, std::uint32_t>);
static_assert(kIsNumber<PixelFormatSubsampling, std::uint32_t>);
static_assert(kIsNumber<PixelFormatCompression, std::uint32_t>);
static_assert(kIsNumber<PixelFormatKind, std::uint32_t>);
static_assert(kIsNumber<RenderQuality, std::int32_t>);
static_assert(kIsNumber<FieldType, std::int32_t>);

// The numbers are compiled into programs and written to files: where the last one stays, none came in before it.
static_assert(kTimeDisplay_48Timecode == 113 && kTimeDisplay_Milliseconds == 201 && kTimeDisplay_Auto == 999);
static_assert(kTimecodeFlag_LastFrame == 8);
static_assert(kPulldownCadence_Advanced_WWWWS == 10);
static_assert(utility::kTimecodeFormat_TimecodeNTSCAlt2 == 14);
static_assert(static_cast<int>(Rounding::Nearest) == 3);
static_assert(kAudioChannelLabel_ProximityRight == 142);
static_assert(kAudioSampleType_32Bit == 40);
static_assert(kPixelFormatFourCC_Invalid == 0x66646162);
static_assert(kPixelFormatBitDepth_32 == 5);
static_assert(kPixelFormatAlpha_Ignored == 3);
static_assert(kPixelFormatSubsampling_420 == 3);
static_assert(kPixelFormatCompression_MPEG4Frame == 12);
static_assert(kPixelFormatKind_Any == 2);
static_assert(kRenderQuality_Max == 5);
static_assert(kFieldType_Any == 4);

// boost's fractions are values, too, though no trivial ones.
static_assert(sizeof(RatioTime) == 16 && sizeof(LegacyRatioTime) == 8);

// Containers have the size that libstdc++ gives them, and those that programs derive from have a table of virtual functions.
static_assert(sizeof(zoncore::UTF16String) == 32 && sizeof(zoncore::ZString) == 32);
static_assert(sizeof(PixelFormats) == 24 && sizeof(AudioChannelLayouts) == 24);
static_assert(sizeof(ChannelOrdering) == 24 && sizeof(ChannelConversionMatrix) == 24);
static_assert(sizeof(AudioChannelLayout) == 24 && std::is_nothrow_move_constructible_v<AudioChannelLayout>);
static_assert(sizeof(ChannelMap) == 56 && std::has_virtual_destructor_v<ChannelMap>);
static_assert(sizeof(AudioFormat) == 40 && std::has_virtual_destructor_v<AudioFormat>);
static_assert(sizeof(zoncore::config::Error) == 40 && std::has_virtual_destructor_v<zoncore::config::Error>);
static_assert(sizeof(zoncore::config::MessageCatalogue) == 48);
static_assert(sizeof(zoncore::CheckRegistry) == sizeof(std::mutex) + 24);
static_assert(sizeof(zoncore::threads::RecursiveMutex) == sizeof(std::recursive_mutex));   // which differs by processor

}   // namespace
}   // namespace zonmediatypes
