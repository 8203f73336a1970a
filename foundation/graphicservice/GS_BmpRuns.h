/// Decodes the runs of BMP files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_BmpHeader.h"
#include "foundation/graphicservice/GS_Input.h"

namespace MoxGraphicService_NS {

/// Decodes pixels of 8 or 4 bits that are written as runs into `bitmap`, which has the size of the
/// header and three channels. Pixels that the runs leave out have the colour of index 0.
/// Returns: false when the runs end before the image does, or go on above it.
bool readBmpRuns(GS_Input& input, const GS_BmpHeader& header, GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
