/// Text as outlines.
#pragma once

#include "tools/convert/GlyphOutlines.h"
#include "tools/convert/GlyphRun.h"

#include <mupdf/fitz.h>

#include <vector>

namespace DrawmereConvert {

/// A glyph that is drawn as the content of a page is, since it has no outline.
struct DrawnGlyph {
    fz_font* font = nullptr; // borrowed from the text
    int glyph = 0;
    fz_matrix matrix = fz_identity; ///< from the em to the text
};

/// Appends the outlines of all glyphs of `span`, whose font is that of `grid`, to `run`, and to
/// `drawn` the glyphs without one.
void readRun(GridFont& grid, const fz_text_span& span, const fz_matrix& matrix, GlyphRun& run,
             std::vector<DrawnGlyph>& drawn);

/// Appends the outlines of all glyphs of `span` to `path`, as a run has them, and to `drawn` the
/// glyphs without one.
void appendRun(GlyphOutlines& outlines, const fz_text_span& span, const fz_matrix& matrix,
               PathData& path, std::vector<DrawnGlyph>& drawn);

/// Appends the outlines of all glyphs of `text` to `path`, as exact as a path can be.
void readOutlines(GlyphOutlines& outlines, const fz_text& text, const fz_matrix& matrix,
                  PathData& path);

} // namespace DrawmereConvert
