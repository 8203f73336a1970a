/// Turns pixels as a file asks for it.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"

namespace MoxGraphicService_NS {

/// Makes `target` what `source` shows under an orientation from 2 to 8, as Exif counts them.
/// Returns: false when memory ran out.
bool turnBitmap(const GS_Bitmap& source, int orientation, GS_Bitmap& target);

} // namespace MoxGraphicService_NS
