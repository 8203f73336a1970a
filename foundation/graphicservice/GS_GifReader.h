/// Decodes GIF files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Reads the header of the GIF file in `input` (GIF89a) and goes over the blocks of its first
/// picture. The size is that of the logical screen, or that of the picture when the screen has
/// none. Returns: false when anything of that is missing.
bool readGifInfo(GS_Input& input, GS_ImageInfo& info);

/// Decodes the first picture of the file into its place on the logical screen. The screen is
/// transparent where the picture leaves it, and what lies outside the screen is cut off.
/// Returns: false when it can't be decoded.
bool readGifPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                   GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
