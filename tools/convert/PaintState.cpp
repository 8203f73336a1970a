#include "tools/convert/PaintState.h"

#include <algorithm>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr float hairWidth = 0.15F; // a line of no width is the thinnest that can be seen

} // namespace

void PaintState::setFill(const Paint& paint) {
    if (now.fill == paint) {
        return;
    }
    now.fill = paint;
    out.setFillColor(paint.color);
    if (!paint.id.isEmpty()) {
        out.setFillColorId(paint.id);
    }
}

void PaintState::setStroke(const Paint& paint, const Pen& pen) {
    if (now.stroke != paint) {
        now.stroke = paint;
        out.setStrokeColor(paint.color);
        if (!paint.id.isEmpty()) {
            out.setStrokeColorId(paint.id);
        }
    }
    setPen(pen);
}

void PaintState::setNoFill() {
    if (now.fill.color.hasAlpha()) {
        setFill(Paint());
    }
}

void PaintState::setNoStroke() {
    const Paint none{MoxColor(), u"none"};
    if (now.stroke != none) {
        now.stroke = none;
        out.setStrokeColor(none.color);
        out.setStrokeColorName(none.id);
        setPen(Pen());
    }
}

void PaintState::setPen(const Pen& pen) {
    if (now.pen == pen) {
        return;
    }
    if (now.pen.width != pen.width) {
        out.setStrokeWidth(pt(pen.width == 0 ? hairWidth : pen.width));
    }
    if (now.pen.cap != pen.cap) {
        out.setLineCap(pen.cap);
    }
    if (now.pen.join != pen.join) {
        out.setLineJoin(pen.join);
    }
    if (now.pen.miterLimit != pen.miterLimit) {
        out.setMiterLimit(pen.miterLimit);
    }
    setDashes(pen);
    now.pen = pen;
}

void PaintState::setDashes(const Pen& pen) {
    if (now.pen.dashes == pen.dashes && now.pen.dashCount == pen.dashCount &&
        now.pen.dashOffset == pen.dashOffset) {
        return;
    }
    std::array<MoxLength, Pen::maxDashes> dashes;
    std::transform(pen.dashes.begin(), pen.dashes.end(), dashes.begin(), pt);
    out.setDashLine(dashes.data(), pen.dashCount, pt(pen.dashOffset));
}

void PaintState::setFillRule(FILLRULE rule) {
    if (now.fillRule != rule) {
        now.fillRule = rule;
        out.setFillRule(rule);
    }
}

void PaintState::setOpacity(float opacity) {
    if (now.opacity != opacity) {
        now.opacity = opacity;
        out.setOpacity(opacity, OPACITYDEST_ELEMENT);
    }
}

void PaintState::setMask(const UnicodeString& id) {
    const UnicodeString name = id.isEmpty() ? UnicodeString(u"none") : id;
    if (now.mask != name) {
        now.mask = name;
        out.setMaskReference(name);
    }
}

void PaintState::save(bool isDefinition) {
    saved.push_back(now);
    if (isDefinition) {
        now = Settings();
    }
}

void PaintState::restore() {
    now = std::move(saved.back());
    saved.pop_back();
}

} // namespace DrawmereConvert
