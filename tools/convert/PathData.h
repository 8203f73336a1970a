/// The segments of a path, in the coordinates in which it is written.
#pragma once

#include <mupdf/fitz.h>

#include <cstdint>
#include <vector>

namespace DrawmereConvert {

enum PATHSTEP : std::uint8_t {
    PATHSTEP_MOVE,      ///< one point
    PATHSTEP_LINE,      ///< one point
    PATHSTEP_CURVE,     ///< three points: two controls and the end of a cubic curve
    PATHSTEP_CLOSE,     ///< no point
    PATHSTEP_QUADRATIC, ///< two points, in outlines of glyphs alone: the control and the end
};

/// Built by the calls `moveTo` to `close`. Points are rounded to hundredths as they come in, since
/// the library writes differences between them: so no error adds up along a path.
class PathData {
public:
    static constexpr float stepsPerPoint = 100;

    void clear();

    bool isEmpty() const { return steps.empty(); }

    void moveTo(float x, float y) { add(PATHSTEP_MOVE, x, y); }

    void lineTo(float x, float y) { add(PATHSTEP_LINE, x, y); }

    void curveTo(float x1, float y1, float x2, float y2, float x, float y);
    void close();

    /// Drops what draws nothing: moves that no segment follows.
    void tidy();

    /// Returns: whether the path is one rectangle with sides along the axes, and which in `rect`.
    bool isRectangle(fz_rect& rect) const;

    /// Returns: whether the path is one straight line.
    bool isLine() const;

    /// Returns: the smallest rectangle around all points; the empty one without points.
    fz_rect getBounds() const;

    bool operator==(const PathData& other) const;

    std::vector<PATHSTEP> steps;
    std::vector<fz_point> points;

private:
    void add(PATHSTEP step, float x, float y) {
        steps.push_back(step);
        addPoint(x, y);
    }

    void addPoint(float x, float y);
};

} // namespace DrawmereConvert
