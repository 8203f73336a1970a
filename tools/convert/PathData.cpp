#include "tools/convert/PathData.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

namespace DrawmereConvert {
namespace {

// Documents use huge numbers for "everything"; beyond this a float has no hundredths anyway.
constexpr float farAway = 100000.0F;

float snap(float value) {
    // A NaN fails both comparisons and becomes the limit.
    const float near = value < farAway ? (value > -farAway ? value : -farAway) : farAway;
    return std::rint(near * PathData::stepsPerPoint) / PathData::stepsPerPoint;
}

bool isSame(const fz_point& one, const fz_point& other) {
    return one.x == other.x && one.y == other.y;
}

} // namespace

void PathData::clear() {
    steps.clear();
    points.clear();
}

void PathData::addPoint(float x, float y) { points.push_back({snap(x), snap(y)}); }

void PathData::curveTo(float x1, float y1, float x2, float y2, float x, float y) {
    add(PATHSTEP_CURVE, x1, y1);
    addPoint(x2, y2);
    addPoint(x, y);
}

void PathData::close() {
    if (!steps.empty() && steps.back() != PATHSTEP_CLOSE) {
        steps.push_back(PATHSTEP_CLOSE);
    }
}

void PathData::tidy() {
    while (!steps.empty() && steps.back() == PATHSTEP_MOVE) {
        steps.pop_back();
        points.pop_back();
    }
}

bool PathData::isRectangle(fz_rect& rect) const {
    const bool isClosed = !steps.empty() && steps.back() == PATHSTEP_CLOSE;
    const std::size_t corners = steps.size() - (isClosed ? 1 : 0);
    const bool returns = corners == 5 && points.size() == 5 && isSame(points[0], points[4]);
    if (points.size() != corners || !(corners == 4 || returns) || (!isClosed && !returns) ||
        std::count(steps.begin(), steps.end(), PATHSTEP_LINE) !=
            static_cast<std::ptrdiff_t>(corners) - 1) {
        return false;
    }
    const fz_point& a = points[0];
    const fz_point& b = points[1];
    const fz_point& c = points[2];
    const fz_point& d = points[3];
    const bool across = a.y == b.y && b.x == c.x && c.y == d.y && d.x == a.x;
    const bool down = a.x == b.x && b.y == c.y && c.x == d.x && d.y == a.y;
    rect = {std::min(a.x, c.x), std::min(a.y, c.y), std::max(a.x, c.x), std::max(a.y, c.y)};
    return across || down;
}

bool PathData::isLine() const {
    return steps.size() == 2 && steps[0] == PATHSTEP_MOVE && steps[1] == PATHSTEP_LINE;
}

fz_rect PathData::getBounds() const {
    if (points.empty()) {
        return fz_empty_rect;
    }
    fz_rect bounds = {points[0].x, points[0].y, points[0].x, points[0].y};
    for (const fz_point& point : points) {
        bounds.x0 = std::min(bounds.x0, point.x);
        bounds.y0 = std::min(bounds.y0, point.y);
        bounds.x1 = std::max(bounds.x1, point.x);
        bounds.y1 = std::max(bounds.y1, point.y);
    }
    return bounds;
}

bool PathData::operator==(const PathData& other) const {
    return steps == other.steps && std::equal(points.begin(), points.end(), other.points.begin(),
                                              other.points.end(), isSame);
}

} // namespace DrawmereConvert
