#include "tools/convert/Canvas.h"

#include <cmath>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr std::size_t minScaledPoints = 40;
constexpr MoxColor white(255, 255, 255);

constexpr std::size_t maxTextPoints = 20000; // no viewer likes endless paths

MoxPointT<MoxLength> place(const fz_point& point, float scale) {
    return scale == 1 ? MoxPointT<MoxLength>(pt(point.x), pt(point.y))
                      : MoxPointT<MoxLength>(pt(std::rint(point.x * scale)),
                                             pt(std::rint(point.y * scale)));
}

MoxRectT<MoxLength> place(const fz_rect& rect) {
    return {pt(rect.x0), pt(rect.y0), pt(rect.x1), pt(rect.y1)};
}

} // namespace

SVGMatrix toMatrix(const fz_matrix& matrix) {
    SVGMatrix result(matrix.a, matrix.b, matrix.c, matrix.d, matrix.e, matrix.f);
    const bool isRotation = matrix.a == matrix.d && matrix.b == -matrix.c;
    if (result.type == MATRIXTYPE_ROTATE && !isRotation) {
        result.e = 1e-6F;
        result.setType();
    }
    return result;
}

void Canvas::fill(const PathData& path, bool isEvenOdd, const Paint& paint) {
    flush();
    wait(path, isEvenOdd, /*isText=*/false, paint);
}

void Canvas::fillText(const PathData& path, const Paint& paint) {
    const bool joins = waiting.isText && !waiting.path.isEmpty() && waiting.paint == paint &&
                       !paint.color.hasAlpha() && waiting.path.points.size() < maxTextPoints &&
                       effects == Effects();
    if (joins) {
        waiting.path.append(path);
        return;
    }
    flush();
    wait(path, /*isEvenOdd=*/false, /*isText=*/true, paint);
}

void Canvas::wait(const PathData& path, bool isEvenOdd, bool isText, const Paint& paint) {
    waiting.path = path;
    waiting.isEvenOdd = isEvenOdd;
    waiting.isText = isText;
    waiting.paint = paint;
}

void Canvas::flush() {
    if (waiting.path.isEmpty()) {
        return;
    }
    settings.setFill(waiting.paint);
    settings.setNoStroke();
    if (isWorthScaling()) {
        drawScaled();
    } else {
        drawShape(waiting.path, waiting.isEvenOdd, PAINTMODE_FILL);
    }
    waiting.path.clear();
}

/// Returns: whether outlines of text are shorter with a matrix and whole numbers. A paint or mask
/// would go through the matrix too, and lesser profiles have no room for such numbers.
bool Canvas::isWorthScaling() const {
    return waiting.isText && waiting.path.points.size() >= minScaledPoints &&
           waiting.paint.id.isEmpty() && effects.mask.isEmpty() && getClipping() == CLIPPING_ALL;
}

void Canvas::drawScaled() {
    ++elements;
    out.pushState();
    settings.save(/*isDefinition=*/false);
    transform(fz_scale(1 / PathData::stepsPerPoint, 1 / PathData::stepsPerPoint));
    settings.setFillRule(FILLRULE_NONZERO);
    drawPath(waiting.path, PAINTMODE_FILL, PathData::stepsPerPoint);
    out.popState();
    settings.restore();
}

void Canvas::stroke(const PathData& path, const Paint& paint, const Pen& pen) {
    if (!waiting.path.isEmpty() && waiting.path == path) {
        strokeWaiting(paint, pen);
        return;
    }
    flush();
    settings.setNoFill();
    settings.setStroke(paint, pen);
    if (!path.isLine()) {
        drawShape(path, /*isEvenOdd=*/true, PAINTMODE_STROKE);
        return;
    }
    const fz_point& from = path.points[0];
    const fz_point& to = path.points[1];
    beginElement();
    out.drawLine(pt(from.x), pt(from.y), pt(to.x), pt(to.y), PAINTMODE_STROKE);
    endElement();
}

void Canvas::strokeWaiting(const Paint& paint, const Pen& pen) {
    const int alpha = paint.color.getAlpha();
    const bool hides = hidesFills && paint.color.hasAlpha();
    const bool isEven = waiting.paint.color.getAlpha() == alpha;
    if (hides && !isEven && hasDefinitions() && effects.mask.isEmpty()) {
        strokeHiding(paint, pen);
        return;
    }
    if (hides && isEven) {
        Paint inside = waiting.paint;
        Paint outline = paint;
        inside.color.clearAlpha();
        outline.color.clearAlpha();
        settings.setOpacity(effects.opacity * static_cast<float>(alpha) / 255.0F);
        settings.setFill(inside);
        settings.setStroke(outline, pen);
    } else {
        settings.setFill(waiting.paint);
        settings.setStroke(paint, pen);
        elements += hidesFills ? 1 : 0; // the fill shows through, as that of another element would
    }
    drawShape(waiting.path, waiting.isEvenOdd, PAINTMODE_FILLSTROKE);
    settings.setOpacity(effects.opacity);
    waiting.path.clear();
}

// The fill is drawn through a mask that leaves out the outline.
void Canvas::strokeHiding(const Paint& paint, const Pen& pen) {
    const std::int64_t before = elements;
    const WaitingFill shape = std::exchange(waiting, {});
    const fz_rect area = fz_expand_rect(shape.path.getBounds(), 1);
    const Effects outside = effects;
    Effects inside = effects;
    inside.mask = beginMask(area);
    settings.setFill({white});
    settings.setNoStroke();
    out.drawRect(pt(area.x0), pt(area.y0), pt(area.x1 - area.x0), pt(area.y1 - area.y0), pt(0),
                 pt(0), PAINTMODE_FILL);
    stroke(shape.path, {MoxColor()}, pen);
    endMask();
    setEffects(inside);
    fill(shape.path, shape.isEvenOdd, shape.paint);
    setEffects(outside);
    stroke(shape.path, paint, pen);
    elements = before + 1; // as it looks like one
}

void Canvas::setKnockout(bool isKnockout) {
    flush();
    hidesFills = isKnockout;
}

void Canvas::drawShape(const PathData& path, bool isEvenOdd, PAINTMODE mode) {
    beginElement();
    const bool isStroked = (mode & PAINTMODE_STROKE) != 0;
    fz_rect rect;
    // Dashes begin at the first corner, which a rectangle doesn't keep.
    if ((!isStroked || !settings.hasDashes()) && path.isRectangle(rect)) {
        settings.setFillRule(FILLRULE_EVENODD);
        out.drawRect(pt(rect.x0), pt(rect.y0), pt(rect.x1 - rect.x0), pt(rect.y1 - rect.y0), pt(0),
                     pt(0), mode);
    } else {
        settings.setFillRule(isEvenOdd ? FILLRULE_EVENODD : FILLRULE_NONZERO);
        drawPath(path, mode);
    }
    endElement();
}

// The library puts the mask of the first element on the group around it, where it would hold for
// the next ones, too.
void Canvas::beginElement() {
    ++elements;
    if (!effects.mask.isEmpty()) {
        out.pushState();
        settings.save(/*isDefinition=*/false);
    }
}

void Canvas::endElement() {
    if (!effects.mask.isEmpty()) {
        out.popState();
        settings.restore();
    }
}

void Canvas::drawPath(const PathData& path, PAINTMODE mode, float scale) {
    const bool isStroked = (mode & PAINTMODE_STROKE) != 0;
    const std::size_t count = path.steps.size();
    out.startPathData();
    const fz_point* point = path.points.data();
    const fz_point* start = point;
    for (std::size_t i = 0; i < count; ++i) {
        const bool isLast = i + 1 == count || path.steps[i + 1] == PATHSTEP_MOVE;
        const bool closes = i + 1 < count && path.steps[i + 1] == PATHSTEP_CLOSE;
        switch (path.steps[i]) {
        case PATHSTEP_MOVE:
            start = point;
            out.setPathMoveTo(place(*point++, scale));
            break;
        case PATHSTEP_LINE:
            // What closes goes back by itself.
            if (!closes || point->x != start->x || point->y != start->y) {
                out.setPathLineTo(place(*point, scale));
            }
            ++point;
            break;
        case PATHSTEP_CURVE:
            out.setPathCubicBezierCurveTo(place(point[0], scale), place(point[1], scale),
                                          place(point[2], scale));
            point += 3;
            break;
        case PATHSTEP_CLOSE:
            if (isStroked || !isLast) { // a fill closes by itself
                out.setPathClosepath();
            }
            break;
        }
    }
    out.endPathData(mode);
}

void Canvas::setEffects(const Effects& newEffects) {
    if (effects == newEffects) {
        return;
    }
    flush();
    effects = newEffects;
    settings.setOpacity(effects.opacity);
    settings.setMask(effects.mask);
}

CLIPPING Canvas::getClipping() const {
    switch (out.config->svgType) {
    case SVGConfig::SVGTYPE_BASIC:
        return CLIPPING_RECTANGLES;
    case SVGConfig::SVGTYPE_TINY:
    case SVGConfig::SVGTYPE_PLAZMIC:
        return CLIPPING_NONE;
    default:
        return CLIPPING_ALL;
    }
}

void Canvas::push() {
    flush();
    out.pushState();
    settings.save(/*isDefinition=*/false);
}

void Canvas::pop() {
    flush();
    out.popState();
    settings.restore();
}

void Canvas::transform(const fz_matrix& matrix) { out.setTransMatrix(toMatrix(matrix)); }

void Canvas::beginClip(const PathData& path, bool isEvenOdd) {
    push();
    saveDefinition();
    out.startClipDef(USERSPACEONUSE);
    out.setClipRuleAttrVal(isEvenOdd ? CLIPRULE_EVENODD : CLIPRULE_NONZERO);
    drawShape(path, /*isEvenOdd=*/true, PAINTMODE_FILL);
    out.endClipDef();
    restoreDefinition();
    out.doClip();
}

UnicodeString Canvas::beginPattern(const fz_rect& cell, const fz_matrix& matrix) {
    flush();
    saveDefinition();
    return out.startPattern(place(cell), place(cell), toMatrix(matrix), USERSPACEONUSE,
                            USERSPACEONUSE);
}

void Canvas::endPattern() {
    flush();
    out.endPattern();
    restoreDefinition();
}

UnicodeString Canvas::beginMask(const fz_rect& area) {
    flush();
    saveDefinition();
    return out.startMask(pt(area.x0), pt(area.y0), pt(area.x1 - area.x0), pt(area.y1 - area.y0),
                         USERSPACEONUSE, USERSPACEONUSE);
}

void Canvas::endMask() {
    flush();
    out.endMask();
    restoreDefinition();
}

void Canvas::saveDefinition() {
    settings.save(/*isDefinition=*/true);
    savedEffects.push_back(std::exchange(effects, Effects()));
}

void Canvas::restoreDefinition() {
    settings.restore();
    effects = std::move(savedEffects.back());
    savedEffects.pop_back();
}

void Canvas::beginLink(const UnicodeString& uri, bool isNewWindow) {
    flush();
    out.startLink(uri, isNewWindow ? MoxName(u"new") : MoxName());
}

void Canvas::endLink() {
    flush();
    out.endLink();
}

} // namespace DrawmereConvert
