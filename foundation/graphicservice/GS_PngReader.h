/// Decodes PNG files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Decodes the PNG file in `input`, whose structure gave `info`, into `bitmap`. A file that states
/// another gamma than that of sRGB, and has no profile, is brought to sRGB.
/// Returns: false when it can't be decoded.
bool readPngPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                   GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
