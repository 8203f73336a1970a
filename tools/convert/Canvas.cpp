#include "tools/convert/Canvas.h"

#include "tools/convert/Strokes.h"

#include <optional>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr std::size_t minScaledPoints = 40;
constexpr MoxColor white(255, 255, 255);

MoxPointT<MoxLength> place(const fz_point& point) { return {pt(point.x), pt(point.y)}; }

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
    flushFill();
    fillNow(texts.takeTouching(path.getBounds()));
    waiting.path = path;
    waiting.isEvenOdd = isEvenOdd;
    waiting.paint = paint;
}

void Canvas::fillText(const GlyphRun& run, const Paint& paint) {
    flushFill();
    const bool joins = !paint.color.hasAlpha() && effects == Effects();
    fillNow(texts.add(run, paint, joins));
}

void Canvas::flush() {
    flushFill();
    if (!texts.isEmpty()) {
        fillNow(texts.takeAll());
    }
}

void Canvas::flushFill() {
    if (waiting.path.isEmpty()) {
        return;
    }
    settings.setFill(waiting.paint);
    settings.setNoStroke();
    drawShape(waiting.path, waiting.isEvenOdd, PAINTMODE_FILL);
    waiting.path.clear();
}

void Canvas::fillNow(const TextQueue::Texts& filled) {
    for (const FilledText& text : filled) {
        settings.setFill(text.paint);
        settings.setNoStroke();
        if (isWorthScaling(text)) {
            drawScaled(text.run);
        } else {
            PathData path;
            text.run.appendTo(path);
            drawShape(path, /*isEvenOdd=*/false, PAINTMODE_FILL);
        }
    }
}

/// Returns: whether text is shorter with a matrix and whole numbers. A paint or mask would go
/// through the matrix too, and lesser profiles have no room for such numbers.
bool Canvas::isWorthScaling(const FilledText& text) const {
    return text.run.countPoints() >= minScaledPoints && text.paint.id.isEmpty() &&
           effects.mask.isEmpty() && getClipping() == CLIPPING_ALL;
}

void Canvas::drawScaled(const GlyphRun& run) {
    ++elements;
    out.pushState();
    settings.save(/*isDefinition=*/false);
    transform(fz_scale(run.getStep(), run.getStep()));
    settings.setFillRule(FILLRULE_NONZERO);
    out.startPathData();
    run.draw(out);
    out.endPathData(PAINTMODE_FILL);
    out.popState();
    settings.restore();
}

void Canvas::stroke(const PathData& path, const Paint& paint, const Pen& pen) {
    const fz_rect area = fz_expand_rect(path.getBounds(), getReach(pen));
    if (isWaiting(path)) {
        fillNow(texts.takeTouching(area));
        strokeWaiting(paint, pen);
        return;
    }
    flushFill();
    fillNow(texts.takeTouching(area));
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

/// Returns: whether what waits in `waiting`, perhaps because text was put there, is the same path.
bool Canvas::isWaiting(const PathData& path) {
    if (waiting.path.isEmpty()) {
        const std::optional<FilledText> text = texts.takeEqual(path);
        if (text) {
            waiting = {path, /*isEvenOdd=*/false, text->paint};
        }
        return text.has_value();
    }
    return waiting.path == path;
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

void Canvas::drawPath(const PathData& path, PAINTMODE mode) {
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
            out.setPathMoveTo(place(*point++));
            break;
        case PATHSTEP_LINE:
            // What closes goes back by itself.
            if (!closes || point->x != start->x || point->y != start->y) {
                out.setPathLineTo(place(*point));
            }
            ++point;
            break;
        case PATHSTEP_CURVE:
            out.setPathCubicBezierCurveTo(place(point[0]), place(point[1]), place(point[2]));
            point += 3;
            break;
        case PATHSTEP_QUADRATIC: // a path has none
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
