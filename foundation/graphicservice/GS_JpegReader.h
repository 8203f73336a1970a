/// Decodes JPEG files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Decodes the JPEG file in `input` into `bitmap`, at the smallest size of those that the decoder
/// can make while decoding (eighths) that is not below `wanted`. CMYK becomes RGB; samples are
/// inverted in files with the marker of Adobe, as all programs that write the marker do.
/// Returns: false when it can't be decoded.
bool readJpegPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                    GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
