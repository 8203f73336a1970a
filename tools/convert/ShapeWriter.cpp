#include "tools/convert/ShapeWriter.h"

#include "tools/convert/PathReader.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace DrawmereConvert {
namespace {

// In the order of FZ_LINECAP; there are no triangles in SVG 1.1.
constexpr std::array<LINECAP, 4> lineCaps = {LINECAP_BUTT, LINECAP_ROUND, LINECAP_SQUARE,
                                             LINECAP_BUTT};

// In the order of FZ_LINEJOIN; the last differs in how far its corners reach.
constexpr std::array<LINEJOIN, 4> lineJoins = {LINEJOIN_MITER, LINEJOIN_ROUND, LINEJOIN_BEVEL,
                                               LINEJOIN_MITER};

constexpr float circleTolerance = 1e-4F;

} // namespace

Pen toPen(const fz_stroke_state& stroke, float scale) {
    Pen pen;
    pen.width = stroke.linewidth * scale;
    pen.cap = lineCaps.at(stroke.dash_len > 0 ? stroke.dash_cap : stroke.start_cap);
    pen.join = lineJoins.at(stroke.linejoin);
    if (pen.join == LINEJOIN_MITER) {
        pen.miterLimit = std::max(stroke.miterlimit, 1.0F);
    }
    pen.dashCount = std::min(stroke.dash_len, static_cast<int>(pen.dashes.size()));
    float sum = 0;
    for (int i = 0; i < pen.dashCount; ++i) {
        pen.dashes.at(i) = stroke.dash_list[i] * scale;
        sum += pen.dashes.at(i);
    }
    if (!(sum > 0)) { // a pattern of nothing is no pattern
        pen.dashCount = 0;
        pen.dashes = {};
        return pen;
    }
    pen.dashOffset = stroke.dash_phase * scale;
    return pen;
}

bool keepsCircles(const fz_matrix& matrix) {
    const float size =
        std::max({std::abs(matrix.a), std::abs(matrix.b), std::abs(matrix.c), std::abs(matrix.d)}) *
        circleTolerance;
    const bool turns =
        std::abs(matrix.a - matrix.d) <= size && std::abs(matrix.b + matrix.c) <= size;
    const bool mirrors =
        std::abs(matrix.a + matrix.d) <= size && std::abs(matrix.b - matrix.c) <= size;
    return turns || mirrors;
}

void ShapeWriter::fill(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix,
                       const Paint& paint) {
    flush();
    readPath(ctx, path, matrix, waiting);
    waitingIsEvenOdd = isEvenOdd;
    waitingPaint = paint;
}

void ShapeWriter::stroke(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                         const Paint& paint) {
    if (!keepsCircles(matrix)) {
        flush();
        strokeTransformed(path, style, matrix, paint);
        return;
    }
    current.clear();
    readPath(ctx, path, matrix, current);
    const Pen pen = toPen(style, fz_matrix_expansion(matrix));
    if (!waiting.isEmpty() && waiting == current) {
        waiting.clear();
        canvas.fillAndStroke(current, waitingIsEvenOdd, waitingPaint, paint, pen);
        return;
    }
    flush();
    canvas.stroke(current, paint, pen);
}

// A pen that such a matrix turns into an ellipse needs the matrix in the document. The matrix keeps
// the size of the drawing, so that the hundredths of coordinates mean the same everywhere.
void ShapeWriter::strokeTransformed(const fz_path* path, const fz_stroke_state& style,
                                    const fz_matrix& matrix, const Paint& paint) {
    const float scale = fz_matrix_expansion(matrix);
    if (!(scale > 0)) {
        return;
    }
    current.clear();
    readPath(ctx, path, fz_scale(scale, scale), current);
    canvas.push();
    canvas.transform(fz_pre_scale(matrix, 1 / scale, 1 / scale));
    canvas.stroke(current, paint, toPen(style, scale));
    canvas.pop();
}

void ShapeWriter::flush() {
    if (!waiting.isEmpty()) {
        canvas.fill(waiting, waitingIsEvenOdd, waitingPaint);
        waiting.clear();
    }
}

} // namespace DrawmereConvert
