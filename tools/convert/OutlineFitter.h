/// Outlines with fewer and shorter segments.
#pragma once

#include "tools/convert/GlyphOutline.h"

namespace DrawmereConvert {

/// Appends to `fitted` an outline that is nowhere farther than `tolerance` from `outline`: curves
/// that are as good as straight become lines, neighbouring curves one, and cubic ones quadratic.
/// Subpaths stay open, as a fill closes them, and a line to where one begins is left out.
void fitOutline(const GlyphOutline& outline, float tolerance, LooseOutline& fitted);

} // namespace DrawmereConvert
