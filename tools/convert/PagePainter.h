/// Draws what the interpreter of a page calls for.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"
#include "tools/convert/ShapeWriter.h"

#include <mupdf/fitz.h>

#include <exception>

namespace DrawmereConvert {

/// One page on its way into the open document. Its operations are the callbacks of a device of
/// MuPDF; matrices lead to the document's coordinates. They throw; `PageDevice` keeps that from
/// MuPDF.
class PagePainter {
public:
    PagePainter(fz_context* context, const ConvertOptions& chosen, PageReport& pageReport,
                Drawmere& drawmere);

    void fillPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix, const Paint& paint);
    void strokePath(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                    const Paint& paint);

    /// Draws what waits; to be called at the end of the page.
    void finish();

    PaintColors colors;
    std::exception_ptr failure; ///< what ended the drawing, null as long as all is well

private:
    PageReport& report;
    const ConvertOptions& options;
    Canvas canvas;
    ShapeWriter shapes;
};

} // namespace DrawmereConvert
