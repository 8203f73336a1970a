/// The chunks of a PNG file.
#pragma once

#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Follows the chunks of the PNG file in `input` (ISO/IEC 15948) from its first byte to `IEND`.
/// What comes after it is not looked at. Returns: false when a chunk is cut off, out of place or
/// has a false checksum, when the header asks for what there is not, or when there is less data
/// than the size needs at the highest compression. A false checksum of a chunk that pictures can do
/// without only drops the chunk.
bool readPngInfo(GS_Input& input, GS_ImageInfo& info);

} // namespace MoxGraphicService_NS
