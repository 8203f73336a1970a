/// Makes images smaller.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Types.h"

namespace MoxGraphicService_NS {

/// Makes `target` of `source` at `columns` by `rows` pixels, neither above what `source` has.
/// Samples are summed in linear light by the curve of sRGB, colours weighted by their alpha.
/// Returns: false when memory ran out.
bool resampleBitmap(const GS_Bitmap& source, int columns, int rows, GSMP_SAMPLINGTYPE type,
                    GS_Bitmap& target);

} // namespace MoxGraphicService_NS
