/// Output in the SVG Basic profile.
#pragma once

#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

/// What SVG Basic can't show is dropped or clamped: coordinates of polygons beyond 32768, and what
/// stands in clip paths besides rectangles.
class DRAWMERE_API SVGBasicImpl : public DrawmereImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGBasicImpl(SVGConfig* config);
    ~SVGBasicImpl() override;

    /// Clamps the coordinates to -32768 to 32768, in the caller's array, and draws.
    void drawPoly(float* coordinates, int count, bool open, PAINTMODE mode) override;

    /// Drops everything but rectangles and clip paths while a clip path is open.
    void addElement(SVGElement* element, bool direct, bool makeCurrent) override;
};

} // namespace DrawmereNS
