#pragma once

/// \file
/// The fields of a video stream, as its own first frame has them.

#include "zonmedia/MediaInput.h"
#include "zonmediatypes/Descriptions.h"

namespace zonmedia
{

class PacketReader;

/// The field that is shown first. The stream's first frame outranks what the container says, where a decoder is there and the
/// codec says in its frames whether they are in fields. Reads on in the file, no farther than that frame. For streams that
/// state nothing, what the container says.
zonmediatypes::FieldType ReadFieldType(
	const AVFormatContext& inFile, const AVStream& inStream, PacketReader& ioPackets);

}   // namespace zonmedia
