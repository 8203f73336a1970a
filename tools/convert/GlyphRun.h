/// Glyphs that are drawn with one path.
#pragma once

#include "tools/convert/GridFont.h"
#include "tools/convert/PaintState.h"

#include <vector>

namespace DrawmereConvert {

/// The outline of a glyph and the place of its origin on the grid.
struct PlacedGlyph {
    fz_rect getBounds() const {
        return {outline->bounds.x0 + origin.x, outline->bounds.y0 + origin.y,
                outline->bounds.x1 + origin.x, outline->bounds.y1 + origin.y};
    }

    const GridOutline* outline; // borrowed
    fz_point origin;            // in steps
};

/// Outlines on one grid, each with its place on it. Borrows the outlines.
class GlyphRun {
public:
    void clear();

    bool isEmpty() const { return glyphs.empty(); }

    /// Returns: whether outlines of a grid with these steps can join.
    bool accepts(float otherStep) const { return isEmpty() || step == otherStep; }

    /// Adds the outline of a glyph, if it has one. Shape: `origin` in points, rounded to the grid.
    /// Ignores: a grid that is not accepted.
    void add(const GridOutline& outline, float gridStep, const fz_point& origin);

    /// Adds what is in a run that is accepted.
    void append(const GlyphRun& other);

    /// Returns: the distance of the lines of the grid in points.
    float getStep() const { return step; }

    std::size_t countPoints() const { return points; }

    /// Returns: the smallest rectangle around all points, in points.
    fz_rect getBounds() const;

    /// Returns: whether a glyph may be inside `area`, in points, at least in part.
    bool touches(const fz_rect& area) const;

    /// Returns: whether a glyph may cover a part of one in another run.
    bool touches(const GlyphRun& other) const;

    /// Draws the segments, in steps of the grid, into the path that is open in `out`. Glyphs come
    /// in the order that packs best, which a path of one colour doesn't show.
    void draw(Drawmere& out) const;

    /// Appends the outlines to `path`, in points.
    void appendTo(PathData& path) const;

private:
    bool touchesSteps(const fz_rect& area) const;
    void push(const PlacedGlyph& glyph);

    std::vector<PlacedGlyph> glyphs;
    std::vector<fz_rect> blocks; // what bounds so many glyphs each, in steps
    float step = 0;
    fz_rect bounds{}; // of all, in steps
    std::size_t points = 0;
};

} // namespace DrawmereConvert
