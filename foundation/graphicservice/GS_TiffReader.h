/// Decodes TIFF files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Reads the first directory of the TIFF or BigTIFF file in `input` (TIFF 6.0).
/// Returns: false when it is damaged or of a form that can't be decoded.
bool readTiffInfo(GS_Input& input, GS_ImageInfo& info);

/// Decodes the first page of the file.
/// Returns: false when it can't be decoded.
bool readTiffPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                    GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
