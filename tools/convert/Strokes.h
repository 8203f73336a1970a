/// Pens of documents and what becomes of them.
#pragma once

#include "tools/convert/PaintState.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// Returns: the pen of `stroke` with all lengths multiplied by `scale`.
Pen toPen(const fz_stroke_state& stroke, float scale);

/// Returns: whether `matrix` turns circles into circles, so that a pen can go through it.
bool keepsCircles(const fz_matrix& matrix);

/// Returns: how far a stroke may reach beyond its path.
float getReach(const Pen& pen);

/// The matrix that a stroke needs in the document, and the one that its points go through before.
/// Together they are the matrix of the drawing. The first keeps sizes, so that hundredths mean the
/// same in all coordinates.
struct StrokeMatrices {
    fz_matrix document = fz_identity;
    fz_matrix points = fz_identity;
    float penScale = 1;
    bool isPlain = true; ///< the document needs none
};

StrokeMatrices splitMatrix(const fz_matrix& matrix);

} // namespace DrawmereConvert
