/// Text as outlines.
#pragma once

#include "tools/convert/GlyphOutlines.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// Appends the outlines of all glyphs of `text` to `path`; glyphs of Type 3 fonts have none.
void readOutlines(GlyphOutlines& outlines, const fz_text& text, const fz_matrix& matrix,
                  PathData& path);

} // namespace DrawmereConvert
