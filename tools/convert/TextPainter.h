/// Draws the text of a page.
#pragma once

#include "tools/convert/GlyphOutlines.h"
#include "tools/convert/OutlineText.h"
#include "tools/convert/PageTools.h"
#include "tools/convert/PathPainter.h"
#include "tools/convert/TextFont.h"
#include "tools/convert/TextWriter.h"

#include <vector>

namespace DrawmereConvert {

/// As outlines or as text, as the mode has it. Matrices are in the document's coordinates.
class TextPainter {
public:
    /// Borrows: all of it.
    TextPainter(const PageTools& pageTools, GlyphOutlines& glyphOutlines, FontBook& fontBook,
                PathPainter& pathPainter)
        : tools(pageTools), outlines(glyphOutlines), fonts(fontBook), paths(pathPainter),
          writer(tools.canvas, tools.options.textMode) {}

    void fill(const fz_text& text, const fz_matrix& matrix, const Paint& paint);
    void stroke(const fz_text& text, const fz_stroke_state& style, const fz_matrix& matrix,
                const Paint& paint);
    void ignore(const fz_text& text, const fz_matrix& matrix);
    void clip(const fz_text& text, const fz_matrix& matrix);
    void clipStroke(const fz_text& text, const fz_stroke_state& style, const fz_matrix& matrix);

    fz_device* device = nullptr; ///< that draws glyphs without outlines; borrowed

private:
    /// Writes what the mode of text lets be text. Returns: false for a span that is to be drawn.
    bool writeSpan(const fz_text_span& span, const fz_matrix& matrix, const TextPaint& paint);
    void writeEntered(const TextSpan& text, const TextPaint& paint);
    void write(const fz_text& text, const fz_matrix& matrix, const TextPaint& paint);
    void readSpan(const fz_text_span& span, const fz_matrix& matrix, const Paint& paint,
                  std::vector<DrawnGlyph>& drawn);
    void fillRun(const Paint& paint);
    void drawGlyphs(const std::vector<DrawnGlyph>& glyphs, const fz_matrix& matrix,
                    const Paint& paint);

    PageTools tools;
    GlyphOutlines& outlines;
    FontBook& fonts;
    PathPainter& paths;
    TextWriter writer;
    PathData current; // kept for its memory
    GlyphRun run;     // likewise
};

} // namespace DrawmereConvert
