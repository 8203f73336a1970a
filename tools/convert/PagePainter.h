/// Draws what the interpreter of a page calls for.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ClipStack.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/GlyphOutlines.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"
#include "tools/convert/Strokes.h"

#include <mupdf/fitz.h>

#include <exception>

namespace DrawmereConvert {

/// One page on its way into the open document. Its operations are the callbacks of a device of
/// MuPDF; matrices lead to the document's coordinates. They throw; `PageDevice` keeps that from
/// MuPDF.
class PagePainter {
public:
    /// Shape: `area`, where the page is in the document.
    PagePainter(fz_context* context, const ConvertOptions& chosen, GlyphOutlines& glyphOutlines,
                PageReport& pageReport, Drawmere& drawmere, const fz_rect& area);

    void fillPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix, const Paint& paint);
    void strokePath(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                    const Paint& paint);
    void clipPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix);
    void popClip();

    void fillText(const fz_text& text, const fz_matrix& matrix, const Paint& paint);
    void strokeText(const fz_text& text, const fz_stroke_state& style, const fz_matrix& matrix,
                    const Paint& paint);
    void clipText(const fz_text& text, const fz_matrix& matrix);

    /// Draws what waits; to be called at the end of the page.
    void finish();

    PaintColors colors;
    std::exception_ptr failure; ///< what ended the drawing, null as long as all is well

private:
    void stroke(const fz_stroke_state& style, const StrokeMatrices& matrices, const Paint& paint);

    fz_context* ctx;
    PageReport& report;
    const ConvertOptions& options;
    GlyphOutlines& outlines;
    Canvas canvas;
    ClipStack clips;
    PathData current; // kept for its memory
};

} // namespace DrawmereConvert
