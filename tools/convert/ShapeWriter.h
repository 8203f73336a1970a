/// Fills and strokes paths.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/PathData.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// Returns: the pen of `stroke` with all lengths multiplied by `scale`.
Pen toPen(const fz_stroke_state& stroke, float scale);

/// Returns: whether `matrix` turns circles into circles, so that a pen can go through it.
bool keepsCircles(const fz_matrix& matrix);

/// Draws paths. A fill waits for the next call, since a stroke of the same path makes one element
/// with it.
class ShapeWriter {
public:
    ShapeWriter(fz_context* context, Canvas& target) : ctx(context), canvas(target) {}

    void fill(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix, const Paint& paint);
    void stroke(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                const Paint& paint);

    /// Draws the fill that waits; to be called before anything else is drawn.
    void flush();

private:
    void strokeTransformed(const fz_path* path, const fz_stroke_state& style,
                           const fz_matrix& matrix, const Paint& paint);

    fz_context* ctx;
    Canvas& canvas;
    PathData waiting; // empty when no fill waits
    bool waitingIsEvenOdd = false;
    Paint waitingPaint;
    PathData current;
};

} // namespace DrawmereConvert
