#include "tools/convert/PagePainter.h"

#include "tools/convert/OutlineText.h"
#include "tools/convert/PathReader.h"

namespace DrawmereConvert {
namespace {

constexpr int ownDepth = 8; // of elements around and inside the containers of clips

fz_rect getBounds(const PathData& path, const fz_matrix& matrix, float reach) {
    return fz_transform_rect(fz_expand_rect(path.getBounds(), reach), matrix);
}

} // namespace

PagePainter::PagePainter(fz_context* context, const ConvertOptions& chosen,
                         GlyphOutlines& glyphOutlines, PageReport& pageReport, Drawmere& drawmere,
                         const fz_rect& area)
    : colors(context), ctx(context), report(pageReport), options(chosen), outlines(glyphOutlines),
      canvas(drawmere), clips(canvas, report, area, chosen.maxDepth - ownDepth) {}

void PagePainter::fillPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix,
                           const Paint& paint) {
    current.clear();
    readPath(ctx, path, matrix, current);
    if (!current.isEmpty() && clips.enter(current.getBounds())) {
        canvas.fill(current, isEvenOdd, paint);
    }
}

void PagePainter::strokePath(const fz_path* path, const fz_stroke_state& style,
                             const fz_matrix& matrix, const Paint& paint) {
    const StrokeMatrices matrices = splitMatrix(matrix);
    current.clear();
    readPath(ctx, path, matrices.points, current);
    stroke(style, matrices, paint);
}

void PagePainter::stroke(const fz_stroke_state& style, const StrokeMatrices& matrices,
                         const Paint& paint) {
    const Pen pen = toPen(style, matrices.penScale);
    if (current.isEmpty() || !clips.enter(getBounds(current, matrices.document, getReach(pen)))) {
        return;
    }
    if (matrices.isPlain) {
        canvas.stroke(current, paint, pen);
        return;
    }
    canvas.push();
    canvas.transform(matrices.document);
    canvas.stroke(current, paint, pen);
    canvas.pop();
}

void PagePainter::clipPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix) {
    current.clear();
    readPath(ctx, path, matrix, current);
    clips.push(current, isEvenOdd);
}

void PagePainter::popClip() { clips.pop(); }

void PagePainter::fillText(const fz_text& text, const fz_matrix& matrix, const Paint& paint) {
    current.clear();
    readOutlines(outlines, text, matrix, current);
    if (!current.isEmpty() && clips.enter(current.getBounds())) {
        canvas.fillText(current, paint);
    }
}

void PagePainter::strokeText(const fz_text& text, const fz_stroke_state& style,
                             const fz_matrix& matrix, const Paint& paint) {
    const StrokeMatrices matrices = splitMatrix(matrix);
    current.clear();
    readOutlines(outlines, text, matrices.points, current);
    stroke(style, matrices, paint);
}

void PagePainter::clipText(const fz_text& text, const fz_matrix& matrix) {
    current.clear();
    readOutlines(outlines, text, matrix, current);
    clips.push(current, /*isEvenOdd=*/false);
}

void PagePainter::finish() {
    clips.leave();
    canvas.flush();
}

} // namespace DrawmereConvert
