#include "tools/convert/Strokes.h"

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

void setDashes(const fz_stroke_state& stroke, float scale, Pen& pen) {
    const int count = std::min(stroke.dash_len, static_cast<int>(Pen::maxDashes));
    float sum = 0;
    for (int i = 0; i < count; ++i) {
        pen.dashes.at(i) = stroke.dash_list[i] * scale;
        sum += pen.dashes.at(i);
    }
    if (sum > 0) {
        pen.dashCount = count;
        pen.dashOffset = stroke.dash_phase * scale;
    } else {
        pen.dashes = {}; // a pattern of nothing is none
    }
}

} // namespace

Pen toPen(const fz_stroke_state& stroke, float scale) {
    Pen pen;
    pen.width = stroke.linewidth * scale;
    pen.cap = lineCaps.at(stroke.dash_len > 0 ? stroke.dash_cap : stroke.start_cap);
    pen.join = lineJoins.at(stroke.linejoin);
    if (pen.join == LINEJOIN_MITER) {
        pen.miterLimit = std::max(stroke.miterlimit, 1.0F);
    }
    setDashes(stroke, scale, pen);
    return pen;
}

bool keepsCircles(const fz_matrix& matrix) {
    const float limit = circleTolerance * std::max({std::abs(matrix.a), std::abs(matrix.b),
                                                    std::abs(matrix.c), std::abs(matrix.d)});
    const bool turns =
        std::abs(matrix.a - matrix.d) <= limit && std::abs(matrix.b + matrix.c) <= limit;
    const bool mirrors =
        std::abs(matrix.a + matrix.d) <= limit && std::abs(matrix.b - matrix.c) <= limit;
    return turns || mirrors;
}

float getReach(const Pen& pen) {
    const float corner = pen.join == LINEJOIN_MITER ? pen.miterLimit : 1.0F;
    return pen.width / 2 * std::max(corner, 1.5F);
}

StrokeMatrices splitMatrix(const fz_matrix& matrix) {
    StrokeMatrices result;
    result.penScale = fz_matrix_expansion(matrix);
    if (keepsCircles(matrix) || !(result.penScale > 0)) {
        result.points = matrix;
        return result;
    }
    const float scale = result.penScale;
    result.points = fz_scale(scale, scale);
    result.document = fz_pre_scale(matrix, 1 / scale, 1 / scale);
    result.isPlain = false;
    return result;
}

} // namespace DrawmereConvert
