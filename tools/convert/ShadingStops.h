/// The colours of a shading as the stops of a gradient.
#pragma once

#include "tools/convert/PaintColors.h"

#include <mupdf/fitz.h>

#include <vector>

namespace DrawmereConvert {

struct ShadingStop {
    float offset = 0; ///< 0 to 1
    MoxColor color{}; ///< with its opacity
};

/// Returns: the fewest stops, of those that a walk from the start finds, between which no colour of
/// the shading is more than a 255th off.
std::vector<ShadingStop> findStops(fz_context* ctx, const fz_shade& shade, PaintColors& colors);

/// Returns: the colour between the first and the last of a shading.
MoxColor findMiddleColor(fz_context* ctx, const fz_shade& shade, PaintColors& colors);

} // namespace DrawmereConvert
