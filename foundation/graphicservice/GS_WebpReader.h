/// Decodes WebP files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Follows the chunks of the WebP file in `input` (RFC 9649) to the length that its header states.
/// Returns: false when one is cut off or the size can't be told.
bool readWebpInfo(GS_Input& input, GS_ImageInfo& info);

/// Decodes the file: the first frame on its canvas when it is animated. The decoder takes the bytes
/// of the file all together.
/// Returns: false when it can't be decoded.
bool readWebpPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                    GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
