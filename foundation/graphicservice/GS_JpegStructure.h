/// The markers of a JPEG file.
#pragma once

#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Follows the markers of the JPEG file in `input` (ITU-T T.81) from its first byte to the end of
/// the image. What comes after it is not looked at.
/// Returns: false when a segment is cut off or out of place, for a process that can't be decoded
/// (lossless, hierarchical, more than 8 bits), when there are too many scans, or when there is less
/// data than the size needs at one bit a block.
bool readJpegInfo(GS_Input& input, GS_ImageInfo& info);

} // namespace MoxGraphicService_NS
