/// Tells photographs from drawings.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Types.h"

namespace MoxGraphicService_NS {

/// Returns: what the pixels of `bitmap` show. A photograph has many colours, and most of its pixels
/// differ from the one before and the one above; a drawing has few, or even areas.
GS_ImageClass classifyBitmap(const GS_Bitmap& bitmap);

} // namespace MoxGraphicService_NS
