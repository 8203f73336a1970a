/// Decodes BMP files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Reads the headers of the BMP file in `input`.
/// Returns: false when they are damaged, or the file is shorter than they say.
bool readBmpInfo(GS_Input& input, GS_ImageInfo& info);

/// Decodes the file.
/// Returns: false when it can't be decoded.
bool readBmpPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                   GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
