/// Text as outlines.
#pragma once

#include "tools/convert/GlyphOutlines.h"

#include <mupdf/fitz.h>

#include <vector>

namespace DrawmereConvert {

/// A glyph that is drawn as the content of a page is, since it has no outline.
struct DrawnGlyph {
    fz_font* font = nullptr; // borrowed from the text
    int glyph = 0;
    fz_matrix matrix = fz_identity; ///< from the em to the text
};

/// Appends the outlines of all glyphs of `span` to `path`, and to `drawn` the glyphs without one.
void readOutlines(GlyphOutlines& outlines, const fz_text_span& span, const fz_matrix& matrix,
                  PathData& path, std::vector<DrawnGlyph>& drawn);

/// The same for all of `text`. Returns: the glyphs without outline.
std::vector<DrawnGlyph> readOutlines(GlyphOutlines& outlines, const fz_text& text,
                                     const fz_matrix& matrix, PathData& path);

} // namespace DrawmereConvert
