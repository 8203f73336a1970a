/// The outlines of a font as they are written at one size.
#pragma once

#include "tools/convert/PathData.h"

#include <mupdf/fitz.h>

#include <cstdint>
#include <unordered_map>
#include <vector>

namespace DrawmereConvert {

class GlyphOutlines;
struct GlyphOutline;

/// The outline of a glyph in whole steps of a grid on which its origin stands. So it has the same
/// text wherever it is written, and a compressor packs all but the first into a few bytes.
struct GridOutline {
    std::vector<PATHSTEP> steps;
    std::vector<fz_point> points;
    fz_rect bounds = fz_empty_rect; ///< of `points`
    std::uint32_t number = 0;       ///< among all outlines on grids, from 0
    bool isDrawing = false;         ///< as in `GlyphOutline`
};

/// A font with a matrix. Its grid has steps of twice the error that is allowed, and finer ones for
/// text that is very small.
class GridFont {
public:
    /// Shape: `matrix`, whose shift does not count; `precision`, the largest error in points.
    /// Borrows: all.
    GridFont(GlyphOutlines& outlines, fz_font* font, const fz_matrix& matrix, float precision);

    /// Returns: the outline of a glyph, without steps for one that is blank; good as long as this.
    const GridOutline& find(int glyph);

    /// Returns: the distance of the lines of the grid in points.
    float getStep() const { return step; }

    /// Returns: how many points are kept.
    std::size_t countPoints() const { return points; }

private:
    GridOutline make(const GlyphOutline& fitted);

    GlyphOutlines& outlines; // borrowed
    fz_font* font;           // borrowed
    fz_matrix matrix;        // from the em to the grid
    float step;
    int toleranceSteps;
    std::unordered_map<int, GridOutline> glyphs;
    std::size_t points = 0;
};

} // namespace DrawmereConvert
