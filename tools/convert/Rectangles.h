/// What is asked of rectangles besides MuPDF's own functions.
#pragma once

#include "tools/convert/PathData.h"

namespace DrawmereConvert {

/// Returns: what both have. MuPDF's own intersection takes a rectangle without width for an empty
/// one; a line has none.
fz_rect intersect(const fz_rect& one, const fz_rect& other);

/// Returns: whether it has no area.
bool isEmpty(const fz_rect& rect);

/// Returns: its sides, closed.
PathData toPath(const fz_rect& rect);

} // namespace DrawmereConvert
