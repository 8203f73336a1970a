/// What outlines of glyphs are made of.
#pragma once

#include "tools/convert/PathData.h"

#include <mupdf/fitz.h>

#include <cstddef>
#include <vector>

namespace DrawmereConvert {

/// The steps of an outline with points that are not rounded.
struct LooseOutline {
    std::vector<PATHSTEP> steps;
    std::vector<fz_point> points;
};

/// The shape of one glyph, in units of the em. Borrowed from where it is kept.
struct GlyphOutline {
    const PATHSTEP* steps = nullptr;
    std::size_t stepCount = 0;
    const fz_point* points = nullptr;
    bool isDrawing = false; ///< it has no outline, as a Type 3 font draws it in other ways
};

} // namespace DrawmereConvert
