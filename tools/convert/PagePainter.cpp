#include "tools/convert/PagePainter.h"

namespace DrawmereConvert {

PagePainter::PagePainter(fz_context* context, const ConvertOptions& chosen, PageReport& pageReport,
                         Drawmere& drawmere)
    : colors(context), report(pageReport), options(chosen), canvas(drawmere),
      shapes(context, canvas) {}

void PagePainter::fillPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix,
                           const Paint& paint) {
    shapes.fill(path, isEvenOdd, matrix, paint);
}

void PagePainter::strokePath(const fz_path* path, const fz_stroke_state& style,
                             const fz_matrix& matrix, const Paint& paint) {
    shapes.stroke(path, style, matrix, paint);
}

void PagePainter::finish() { shapes.flush(); }

} // namespace DrawmereConvert
