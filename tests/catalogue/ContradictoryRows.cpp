// Rows that must not compile, each for the reason above it: the test reads the reasons here, and looks for them among the
// compiler's messages.

#include "zonmediatypes/src/video/PerfectIndex.h"
#include "zonmediatypes/src/video/PixelFormatFacts.h"

#include <array>
#include <cstdint>

using namespace zonmediatypes;
using namespace zonmediatypes::catalogue;

constexpr PixelFormatName kCode = MakePixelFormatName('c', 'o', 'd', 'e');

// an RGB row names a YUV matrix or range
const auto k1 = Format(Row("A_4444_8u_709", kCode, RGB, D8u, Rec709, Full, Straight, C4444));
// a YUV row is in linear light
const auto k2 = Format(Row("A_4444_32f_Linear", kCode, YUV, D32f, Rec601, Video, Straight, C4444, Usual, Linear));
// integer components are in linear light
const auto k3 = Format(Row("A_4444_8u_Linear", kCode, RGB, D8u, Rec601, Full, Straight, C4444, Usual, Linear));
// an RGB row has subsampled chroma
const auto k4 = Format(Row("A_422_8u", kCode, RGB, D8u, Rec601, Full, None, C422));
// a row with subsampled chroma has an alpha component
const auto k5 = Format(Row("A_422_8u", kCode, YUV, D8u, Rec601, Video, Straight, C422));
// the DV chroma layout is that of DV, and of nothing else
const auto k6 = Format(Row("A", kCode, YUV, D8u, Rec601, Video, None, DV, MPEG2Field));
// planar 4:2:0 is that of MPEG, and of nothing else
const auto k7 = Format(Row("A_420_8u", kCode, YUV, D8u, Rec601, Video, None, C420));
// a compressed row is not of 8-bit YUV
const auto k8 = Format(Row("A_420_10u", kCode, YUV, D10u, Rec601, Video, None, C420, MPEG2Field));
// the name has another depth or another chroma than the row
const auto k9 = Format(Row("A_422_10u", kCode, YUV, D8u, Rec601, Video, None, C422));
// the name has another matrix than the row
const auto k10 = Format(Row("A_422_8u", kCode, YUV, D8u, Rec709, Video, None, C422));
// the name has another light than the row
const auto k11 = Format(Row("A_4444_32f", kCode, RGB, D32f, Rec601, Full, Straight, C4444, Usual, Linear));
// the name has another range than the row
const auto k12 = Format(Row("A_422_8u", kCode, YUV, D8u, Rec601, Full, None, C422));
// the name has another number of components than the row
const auto k13 = Format(Row("A_4444_8u", kCode, RGB, D8u, Rec601, Full, None, C4444));
// a key stands in two places
const auto k14 = PerfectIndex<16>(std::array<std::uint32_t, 3>{4, 5, 4});
