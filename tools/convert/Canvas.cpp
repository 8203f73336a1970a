#include "tools/convert/Canvas.h"

#include <algorithm>

namespace DrawmereConvert {
namespace {

constexpr float hairWidth = 0.15F; // a line of no width is the thinnest that can be seen

bool isNone(const Paint& paint) { return viewOf(paint.id) == u"none"; }

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
    setFill(paint);
    setNoStroke();
    drawShape(path, isEvenOdd, PAINTMODE_FILL);
}

void Canvas::stroke(const PathData& path, const Paint& paint, const Pen& pen) {
    setNoFill();
    setStroke(paint, pen);
    if (path.isLine()) {
        const fz_point& from = path.points[0];
        const fz_point& to = path.points[1];
        out.drawLine(pt(from.x), pt(from.y), pt(to.x), pt(to.y), PAINTMODE_STROKE);
        return;
    }
    drawShape(path, true, PAINTMODE_STROKE);
}

void Canvas::fillAndStroke(const PathData& path, bool isEvenOdd, const Paint& inside,
                           const Paint& outline, const Pen& pen) {
    setFill(inside);
    setStroke(outline, pen);
    drawShape(path, isEvenOdd, PAINTMODE_FILLSTROKE);
}

void Canvas::fillRectangle(const fz_rect& rect, const Paint& paint) {
    setFill(paint);
    setNoStroke();
    drawRectangle(rect, PAINTMODE_FILL);
}

void Canvas::drawShape(const PathData& path, bool isEvenOdd, PAINTMODE mode) {
    fz_rect rect;
    // Dashes begin at the first corner, which a rectangle doesn't keep.
    if (state.pen.dashCount == 0 && path.isRectangle(rect)) {
        drawRectangle(rect, mode);
        return;
    }
    drawPath(path, isEvenOdd, mode);
}

void Canvas::drawRectangle(const fz_rect& rect, PAINTMODE mode) {
    setFillRule(FILLRULE_EVENODD);
    out.drawRect(pt(rect.x0), pt(rect.y0), pt(rect.x1 - rect.x0), pt(rect.y1 - rect.y0), pt(0),
                 pt(0), mode);
}

void Canvas::drawPath(const PathData& path, bool isEvenOdd, PAINTMODE mode) {
    const auto place = [](const fz_point& point) {
        return MoxPointT<MoxLength>(pt(point.x), pt(point.y));
    };
    const bool fills = (mode & PAINTMODE_FILL) != 0;
    setFillRule(isEvenOdd || !fills ? FILLRULE_EVENODD : FILLRULE_NONZERO);
    out.startPathData();
    const fz_point* point = path.points.data();
    for (const PATHSTEP step : path.steps) {
        switch (step) {
        case PATHSTEP_MOVE:
            out.setPathMoveTo(place(*point++));
            break;
        case PATHSTEP_LINE:
            out.setPathLineTo(place(*point++));
            break;
        case PATHSTEP_CURVE:
            out.setPathCubicBezierCurveTo(place(point[0]), place(point[1]), place(point[2]));
            point += 3;
            break;
        case PATHSTEP_CLOSE:
            out.setPathClosepath();
            break;
        }
    }
    out.endPathData(mode);
}

void Canvas::push() {
    out.pushState();
    saved.push_back(state);
}

void Canvas::pop() {
    out.popState();
    leaveDefinition();
}

void Canvas::enterDefinition() {
    saved.push_back(state);
    state = State();
}

void Canvas::leaveDefinition() {
    state = std::move(saved.back());
    saved.pop_back();
}

void Canvas::transform(const fz_matrix& matrix) { out.setTransMatrix(toMatrix(matrix)); }

void Canvas::setFill(const Paint& paint) {
    if (state.fill == paint) {
        return;
    }
    state.fill = paint;
    out.setFillColor(paint.color);
    if (!paint.id.isEmpty()) {
        out.setFillColorId(paint.id);
    }
}

void Canvas::setStroke(const Paint& paint, const Pen& pen) {
    if (state.stroke != paint) {
        state.stroke = paint;
        out.setStrokeColor(paint.color);
        if (!paint.id.isEmpty()) {
            out.setStrokeColorId(paint.id);
        }
    }
    setPen(pen);
}

// What does not paint is set back, so that nothing is written about it.

void Canvas::setNoFill() {
    if (state.fill.color.hasAlpha()) {
        setFill(Paint());
    }
}

void Canvas::setNoStroke() {
    if (isNone(state.stroke)) {
        return;
    }
    state.stroke = {MoxColor(), u"none"};
    out.setStrokeColor(MoxColor());
    out.setStrokeColorName(u"none");
    setPen(Pen());
}

void Canvas::setPen(const Pen& pen) {
    Pen& current = state.pen;
    if (current == pen) {
        return;
    }
    if (current.width != pen.width) {
        out.setStrokeWidth(pt(pen.width == 0 ? hairWidth : pen.width));
    }
    if (current.cap != pen.cap) {
        out.setLineCap(pen.cap);
    }
    if (current.join != pen.join) {
        out.setLineJoin(pen.join);
    }
    if (current.miterLimit != pen.miterLimit) {
        out.setMiterLimit(pen.miterLimit);
    }
    if (current.dashes != pen.dashes || current.dashCount != pen.dashCount ||
        current.dashOffset != pen.dashOffset) {
        std::array<MoxLength, 32> dashes;
        std::transform(pen.dashes.begin(), pen.dashes.end(), dashes.begin(), pt);
        out.setDashLine(dashes.data(), pen.dashCount, pt(pen.dashOffset));
    }
    current = pen;
}

void Canvas::setFillRule(int rule) {
    if (state.fillRule != rule) {
        state.fillRule = rule;
        out.setFillRule(static_cast<FILLRULE>(rule));
    }
}

void Canvas::setOpacity(float opacity) {
    if (state.opacity != opacity) {
        state.opacity = opacity;
        out.setOpacity(opacity, OPACITYDEST_ELEMENT);
    }
}

void Canvas::setMask(const UnicodeString& id) {
    if (state.mask != id) {
        state.mask = id;
        out.setMaskReference(id);
    }
}

} // namespace DrawmereConvert
