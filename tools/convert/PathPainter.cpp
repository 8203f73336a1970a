#include "tools/convert/PathPainter.h"

#include "tools/convert/PathReader.h"

namespace DrawmereConvert {

void PathPainter::fill(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix,
                       const Paint& paint) {
    read(path, tools.layers.place(matrix));
    tools.layers.cutByHand(current);
    if (!current.isEmpty() && tools.layers.enter(current.getBounds())) {
        noteLength(current.points.size());
        tools.canvas.fill(current, isEvenOdd, paint);
    }
}

void PathPainter::stroke(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                         const Paint& paint) {
    const StrokeMatrices matrices = splitMatrix(tools.layers.place(matrix));
    read(path, matrices.points);
    strokeRead(current, style, matrices, paint);
}

void PathPainter::clip(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix) {
    read(path, tools.layers.place(matrix));
    noteLength(current.points.size());
    tools.layers.pushClip(current, isEvenOdd);
}

void PathPainter::clipStroke(const fz_path* path, const fz_stroke_state& style,
                             const fz_matrix& matrix) {
    const StrokeMatrices matrices = splitMatrix(tools.layers.place(matrix));
    read(path, matrices.points);
    tools.layers.pushStrokeClip({current, matrices, toPen(style, matrices.penScale)});
}

void PathPainter::strokeRead(const PathData& path, const fz_stroke_state& style,
                             const StrokeMatrices& matrices, const Paint& paint) {
    const Pen pen = toPen(style, matrices.penScale);
    const fz_rect reached = fz_expand_rect(path.getBounds(), getReach(pen));
    const fz_rect bounds = fz_transform_rect(reached, matrices.document);
    if (path.isEmpty() || !tools.layers.enter(bounds)) {
        return;
    }
    noteLength(path.points.size());
    if (matrices.isPlain) {
        tools.canvas.stroke(path, paint, pen);
        return;
    }
    tools.layers.drawMoved(bounds, [&] {
        tools.canvas.push();
        tools.canvas.transform(matrices.document);
        tools.canvas.stroke(path, paint, pen);
        tools.canvas.pop();
    });
}

void PathPainter::noteLength(std::size_t points) {
    if (points > tools.options.maxPathPoints) {
        tools.report.note(APPROXIMATION_LIMIT);
    }
}

void PathPainter::read(const fz_path* path, const fz_matrix& matrix) {
    current.clear();
    readPath(tools.ctx, path, matrix, current);
}

} // namespace DrawmereConvert
