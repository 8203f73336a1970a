#include "tools/convert/GridFont.h"

#include "tools/convert/GlyphOutlines.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

/// Text below this size, in points, is looked at from nearer, and so its grid is finer; but never
/// finer than `finest` of the usual one.
constexpr float smallEm = 5;
constexpr float finest = 1.0F / 16;

/// Glyphs of broken fonts come with any numbers.
constexpr float farAway = 1.0e6F;

/// Returns: how much `matrix` stretches what it stretches most.
float getStretch(const fz_matrix& matrix) {
    const double a = static_cast<double>(matrix.a);
    const double b = static_cast<double>(matrix.b);
    const double c = static_cast<double>(matrix.c);
    const double d = static_cast<double>(matrix.d);
    const double sum = a * a + b * b + c * c + d * d;
    const double area = a * d - b * c;
    const double rest = std::sqrt(std::max(0.0, sum * sum - 4 * area * area));
    return static_cast<float>(std::sqrt((sum + rest) / 2));
}

float chooseStep(float em, float precision) {
    float share = 1;
    while (em < share * smallEm && share > finest) {
        share /= 2;
    }
    return 2 * precision * share;
}

int toToleranceSteps(float tolerance) {
    constexpr float widest = 1;
    constexpr float narrowest = 1e-6F;
    // A NaN becomes the narrowest.
    const float kept = tolerance > narrowest ? std::min(tolerance, widest) : narrowest;
    return static_cast<int>(std::floor(8 * std::log2(kept)));
}

float toGrid(float value) {
    // A NaN fails both comparisons and becomes the limit.
    return std::rint(value < farAway ? (value > -farAway ? value : -farAway) : farAway);
}

bool isSame(const fz_point& one, const fz_point& other) {
    return one.x == other.x && one.y == other.y;
}

/// Rounds an outline, and drops what rounding has made needless.
class GridTracer {
public:
    GridTracer(const fz_matrix& matrix, GridOutline& target) : toSteps(matrix), outline(target) {}

    void add(PATHSTEP step, const fz_point* points, int count) {
        fz_point rounded[3];
        for (int i = 0; i < count; ++i) {
            const fz_point point = fz_transform_point(points[i], toSteps);
            rounded[i] = {toGrid(point.x), toGrid(point.y)};
        }
        const fz_point end = rounded[count - 1];
        if (step == PATHSTEP_MOVE) {
            dropReturn();
            beginning = outline.points.size();
        } else if (isStraight(rounded, count)) {
            if (isSame(end, last)) {
                return;
            }
            if (joinsLine(end)) {
                outline.points.back() = last = end;
                return;
            }
            step = PATHSTEP_LINE;
            rounded[0] = end;
            count = 1;
        }
        outline.steps.push_back(step);
        outline.points.insert(outline.points.end(), rounded, rounded + count);
        last = end;
    }

    void finish() {
        dropReturn();
        if (outline.points.empty()) {
            return;
        }
        const fz_point first = outline.points.front();
        outline.bounds = {first.x, first.y, first.x, first.y};
        for (const fz_point& point : outline.points) {
            outline.bounds = fz_include_point_in_rect(outline.bounds, point);
        }
    }

private:
    /// Returns: whether a segment has become a line along an axis that doesn't turn back.
    bool isStraight(const fz_point* points, int count) const {
        const fz_point& end = points[count - 1];
        const bool isUpright = std::all_of(
            points, points + count, [&](const fz_point& point) { return point.x == last.x; });
        const bool isLevel = std::all_of(points, points + count,
                                         [&](const fz_point& point) { return point.y == last.y; });
        return count == 1 || ((isUpright || isLevel) &&
                              std::all_of(points, points + count, [&](const fz_point& point) {
                                  return std::min(last.x, end.x) <= point.x &&
                                         point.x <= std::max(last.x, end.x) &&
                                         std::min(last.y, end.y) <= point.y &&
                                         point.y <= std::max(last.y, end.y);
                              }));
    }

    /// Returns: whether a line along an axis goes on from one before it.
    bool joinsLine(const fz_point& end) const {
        if (outline.steps.back() != PATHSTEP_LINE) {
            return false;
        }
        const fz_point& from = outline.points[outline.points.size() - 2];
        return (from.x == last.x && end.x == last.x && (last.y > from.y) == (end.y > last.y)) ||
               (from.y == last.y && end.y == last.y && (last.x > from.x) == (end.x > last.x));
    }

    /// Drops a line to where its subpath begins, and a subpath that is nothing else than a point.
    void dropReturn() {
        if (!outline.steps.empty() && outline.steps.back() == PATHSTEP_LINE &&
            isSame(last, outline.points[beginning])) {
            outline.steps.pop_back();
            outline.points.pop_back();
        }
        if (!outline.steps.empty() && outline.steps.back() == PATHSTEP_MOVE) {
            outline.steps.pop_back();
            outline.points.pop_back();
        }
    }

    const fz_matrix& toSteps;
    GridOutline& outline;
    std::size_t beginning = 0; // of the subpath, among the points
    fz_point last{};
};

int countPointsOf(PATHSTEP step) {
    constexpr int counts[] = {1, 1, 3, 0, 2};
    return counts[step];
}

} // namespace

GridFont::GridFont(GlyphOutlines& glyphOutlines, fz_font* outlineFont, const fz_matrix& place,
                   float precision)
    : outlines(glyphOutlines), font(outlineFont) {
    const float em = getStretch(place);
    step = chooseStep(em, precision);
    toleranceSteps = toToleranceSteps(step / 2 / em);
    matrix = fz_make_matrix(place.a / step, place.b / step, place.c / step, place.d / step, 0, 0);
}

const GridOutline& GridFont::find(int glyph) {
    const auto known = glyphs.find(glyph);
    if (known != glyphs.end()) {
        return known->second;
    }
    GridOutline outline = make(outlines.findFitted(font, glyph, toleranceSteps));
    points += outline.points.size();
    return glyphs.emplace(glyph, std::move(outline)).first->second;
}

GridOutline GridFont::make(const GlyphOutline& fitted) {
    GridOutline outline;
    outline.number = outlines.takeNumber();
    outline.isDrawing = fitted.isDrawing;
    GridTracer tracer(matrix, outline);
    const fz_point* point = fitted.points;
    for (const PATHSTEP* next = fitted.steps; next != fitted.steps + fitted.stepCount; ++next) {
        const int count = countPointsOf(*next);
        if (count > 0) {
            tracer.add(*next, point, count);
        }
        point += count;
    }
    tracer.finish();
    return outline;
}

} // namespace DrawmereConvert
