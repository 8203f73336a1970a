#include "tools/convert/GlyphRun.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

/// From here on floats have no room for the steps of a glyph.
constexpr float farAway = 4.0e6F;

constexpr std::size_t glyphsInBlock = 32;

float toGrid(float value) {
    // A NaN fails both comparisons and becomes the limit.
    return std::rint(value < farAway ? (value > -farAway ? value : -farAway) : farAway);
}

fz_rect unite(const fz_rect& one, const fz_rect& other) {
    return {std::min(one.x0, other.x0), std::min(one.y0, other.y0), std::max(one.x1, other.x1),
            std::max(one.y1, other.y1)};
}

bool overlap(const fz_rect& one, const fz_rect& other) {
    return one.x0 <= other.x1 && other.x0 <= one.x1 && one.y0 <= other.y1 && other.y0 <= one.y1;
}

fz_rect scale(const fz_rect& rect, float factor) {
    return {rect.x0 * factor, rect.y0 * factor, rect.x1 * factor, rect.y1 * factor};
}

/// Hands points on in the form that the library wants them.
///
/// Behind a quadratic curve it takes the origin for where the pen is. So what follows is counted
/// from the end of the last such curve, and its text is the one it has elsewhere, too.
class GridPen {
public:
    explicit GridPen(Drawmere& drawmere) : out(drawmere) {}

    void draw(const GridOutline& outline, const fz_point& newOrigin) {
        origin = newOrigin;
        shift = {origin.x - zero.x, origin.y - zero.y};
        const fz_point* point = outline.points.data();
        for (const PATHSTEP step : outline.steps) {
            if (step == PATHSTEP_CURVE) {
                out.setPathCubicBezierCurveTo(at(point[0]), at(point[1]), at(point[2]));
                point += 3;
            } else if (step == PATHSTEP_LINE) {
                out.setPathLineTo(at(*point++));
            } else if (step == PATHSTEP_QUADRATIC) {
                out.setPathQuadraticBezierCurveTo(at(point[0]), at(point[1]));
                zero = {origin.x + point[1].x, origin.y + point[1].y};
                shift = {-point[1].x, -point[1].y};
                point += 2;
            } else {
                out.setPathMoveTo(at(*point++));
            }
        }
    }

private:
    MoxPointT<MoxLength> at(const fz_point& point) const {
        return {pt(point.x + shift.x), pt(point.y + shift.y)};
    }

    Drawmere& out;
    fz_point origin{};
    fz_point zero{};
    fz_point shift{};
};

/// Finds the glyphs that a compressor would have forgotten when they come again: those go to the
/// end of the path, where they stand next to each other. All others stay, since the same words move
/// the pen in the same way.
class PackingOrder {
public:
    PackingOrder(const std::vector<PlacedGlyph>& glyphs, std::size_t points) {
        if (points * lettersInPoint <= deflateReach) {
            return;
        }
        std::size_t textLength = 0;
        for (std::size_t i = 0; i < glyphs.size(); ++i) {
            const GridOutline& outline = *glyphs[i].outline;
            Use& use = getUse(outline.number);
            if (use.count == 0) {
                use.first = i;
            } else if (textLength - use.lastPlace > deflateReach) {
                ++use.timesForgotten;
            }
            ++use.count;
            use.lastPlace = textLength;
            textLength += outline.points.size() * lettersInPoint;
        }
    }

    bool isRare(const GridOutline& outline) const {
        if (uses.empty()) {
            return false;
        }
        const Use& use = uses[outline.number];
        return use.timesForgotten * wayBack > use.count;
    }

    /// Returns: where a glyph stands first in its run.
    std::size_t getFirst(const GridOutline& outline) const { return uses[outline.number].first; }

private:
    /// As far back as RFC 1951 can refer, less what estimates are off.
    static constexpr std::size_t deflateReach = 30000;
    static constexpr std::size_t lettersInPoint = 7;
    /// An outline that is written anew takes as much, packed, as so many moves to another place.
    static constexpr std::size_t wayBack = 8;

    struct Use {
        std::size_t count = 0;
        std::size_t first = 0;
        std::size_t lastPlace = 0;
        std::size_t timesForgotten = 0;
    };

    Use& getUse(std::uint32_t number) {
        if (number >= uses.size()) {
            uses.resize(number + 1);
        }
        return uses[number];
    }

    std::vector<Use> uses; // by the number of the outline
};

/// Appends outlines to a path, which has cubic curves alone.
class PathPen {
public:
    PathPen(PathData& target, float gridStep) : path(target), step(gridStep) {}

    void draw(const GridOutline& outline, const fz_point& newOrigin) {
        origin = newOrigin;
        const fz_point* point = outline.points.data();
        for (const PATHSTEP kind : outline.steps) {
            if (kind == PATHSTEP_CURVE) {
                curveTo(at(point[0]), at(point[1]), at(point[2]));
                point += 3;
            } else if (kind == PATHSTEP_QUADRATIC) {
                raise(at(point[0]), at(point[1]));
                point += 2;
            } else {
                startOrLine(kind, at(*point++));
            }
        }
        closeSubpath();
    }

private:
    fz_point at(const fz_point& point) const {
        return {(point.x + origin.x) * step, (point.y + origin.y) * step};
    }

    void startOrLine(PATHSTEP kind, const fz_point& point) {
        if (kind == PATHSTEP_MOVE) {
            closeSubpath();
            path.moveTo(point.x, point.y);
        } else {
            path.lineTo(point.x, point.y);
        }
        last = point;
    }

    void raise(const fz_point& control, const fz_point& end) {
        const auto between = [&](const fz_point& from) {
            return fz_point{from.x + (control.x - from.x) * 2 / 3,
                            from.y + (control.y - from.y) * 2 / 3};
        };
        curveTo(between(last), between(end), end);
    }

    void curveTo(const fz_point& control1, const fz_point& control2, const fz_point& end) {
        path.curveTo(control1.x, control1.y, control2.x, control2.y, end.x, end.y);
        last = end;
    }

    void closeSubpath() { path.close(); }

    PathData& path;
    float step;
    fz_point origin{};
    fz_point last{};
};

} // namespace

void GlyphRun::clear() {
    glyphs.clear();
    blocks.clear();
    points = 0;
}

void GlyphRun::add(const GridOutline& outline, float gridStep, const fz_point& origin) {
    if (!outline.points.empty() && accepts(gridStep)) {
        step = gridStep;
        push({&outline, {toGrid(origin.x / gridStep), toGrid(origin.y / gridStep)}});
    }
}

void GlyphRun::append(const GlyphRun& other) {
    if (accepts(other.step)) {
        step = other.step;
        std::for_each(other.glyphs.begin(), other.glyphs.end(),
                      [this](const PlacedGlyph& glyph) { push(glyph); });
    }
}

void GlyphRun::push(const PlacedGlyph& glyph) {
    const fz_rect box = glyph.getBounds();
    if (glyphs.size() % glyphsInBlock == 0) {
        blocks.push_back(box);
    }
    blocks.back() = unite(blocks.back(), box);
    bounds = glyphs.empty() ? box : unite(bounds, box);
    points += glyph.outline->points.size();
    glyphs.push_back(glyph);
}

fz_rect GlyphRun::getBounds() const { return isEmpty() ? fz_empty_rect : scale(bounds, step); }

bool GlyphRun::touches(const fz_rect& area) const {
    return !isEmpty() && touchesSteps(scale(area, 1 / step));
}

bool GlyphRun::touchesSteps(const fz_rect& area) const {
    if (!overlap(bounds, area)) {
        return false;
    }
    for (std::size_t i = 0; i < blocks.size(); ++i) {
        if (!overlap(blocks[i], area)) {
            continue;
        }
        const std::size_t first = i * glyphsInBlock;
        const std::size_t end = std::min(first + glyphsInBlock, glyphs.size());
        for (std::size_t k = first; k < end; ++k) {
            if (overlap(glyphs[k].getBounds(), area)) {
                return true;
            }
        }
    }
    return false;
}

bool GlyphRun::touches(const GlyphRun& other) const {
    if (isEmpty() || other.isEmpty() || !overlap(getBounds(), other.getBounds())) {
        return false;
    }
    const float factor = other.step / step;
    return std::any_of(other.glyphs.begin(), other.glyphs.end(), [&](const PlacedGlyph& glyph) {
        return touchesSteps(scale(glyph.getBounds(), factor));
    });
}

void GlyphRun::draw(Drawmere& out) const {
    GridPen pen(out);
    const PackingOrder order(glyphs, points);
    std::vector<const PlacedGlyph*> rare;
    for (const PlacedGlyph& glyph : glyphs) {
        if (order.isRare(*glyph.outline)) {
            rare.push_back(&glyph);
        } else {
            pen.draw(*glyph.outline, glyph.origin);
        }
    }
    std::stable_sort(rare.begin(), rare.end(),
                     [&](const PlacedGlyph* one, const PlacedGlyph* other) {
                         return order.getFirst(*one->outline) < order.getFirst(*other->outline);
                     });
    for (const PlacedGlyph* glyph : rare) {
        pen.draw(*glyph->outline, glyph->origin);
    }
}

void GlyphRun::appendTo(PathData& path) const {
    PathPen pen(path, step);
    for (const PlacedGlyph& glyph : glyphs) {
        pen.draw(*glyph.outline, glyph.origin);
    }
}

} // namespace DrawmereConvert
