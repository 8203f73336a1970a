/// The scenes of the example `paint` drawn without SVG.
#pragma once

#include "examples/PaintScenes.h"

#include <cairo.h>

namespace DrawmereTest {

/// Draws the page of the example with cairo's own calls into pixels, from the same numbers.
class PaintTwin {
public:
    /// Draws with `scale` pixels a point.
    explicit PaintTwin(int scale);
    PaintTwin(const PaintTwin&) = delete;
    PaintTwin& operator=(const PaintTwin&) = delete;
    ~PaintTwin();

    /// Returns: the page, borrowed.
    cairo_surface_t* draw();

private:
    cairo_surface_t* surface; // owned
    cairo_t* context;         // owned
};

} // namespace DrawmereTest
