// The shape calls: one element each, its geometry, then the common tail.
#include "draw/DrawmereImpl.h"
#include "draw/ElementAttributes.h"
#include "foundation/common/MoxNumberText.h"
#include "state/SVGGroupManager.h"

#include <string>

namespace DrawmereNS {
namespace {

void appendReal(std::string& text, float number, char separator) {
    char digits[MoxCommonNS::maxRealText];
    text.append(digits, MoxCommonNS::writeReal(number, digits));
    text += separator;
}

} // namespace

void DrawmereImpl::drawRect(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                            MoxLength rx, MoxLength ry, PAINTMODE mode) {
    const MoxPtr<SVGElement> rect = createDrawing(SVGName::rect, 4, mode);
    setLength(*rect, SVGName::x, x);
    setLength(*rect, SVGName::y, y);
    if (rx.getRawValue() != 0.0F || ry.getRawValue() != 0.0F) {
        setLength(*rect, SVGName::rx, rx);
        setLength(*rect, SVGName::ry, ry);
    }
    setLength(*rect, SVGName::width, width);
    setLength(*rect, SVGName::height, height);
    finishShape(rect.get(), mode);
}

void DrawmereImpl::drawCircle(MoxLength cx, MoxLength cy, MoxLength r, PAINTMODE mode) {
    const MoxPtr<SVGElement> circle = createDrawing(SVGName::circle, 3, mode);
    setLength(*circle, SVGName::cx, cx);
    setLength(*circle, SVGName::cy, cy);
    setLength(*circle, SVGName::r, r);
    finishShape(circle.get(), mode);
}

void DrawmereImpl::drawEllipse(MoxLength cx, MoxLength cy, MoxLength rx, MoxLength ry,
                               PAINTMODE mode) {
    const MoxPtr<SVGElement> ellipse = createDrawing(SVGName::ellipse, 4, mode);
    setLength(*ellipse, SVGName::cx, cx);
    setLength(*ellipse, SVGName::cy, cy);
    setLength(*ellipse, SVGName::rx, rx);
    setLength(*ellipse, SVGName::ry, ry);
    finishShape(ellipse.get(), mode);
}

void DrawmereImpl::drawLine(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2,
                            PAINTMODE mode) {
    const MoxPtr<SVGElement> line = createDrawing(SVGName::line, 4, mode);
    setLength(*line, SVGName::x1, x1);
    setLength(*line, SVGName::y1, y1);
    setLength(*line, SVGName::x2, x2);
    setLength(*line, SVGName::y2, y2);
    finishShape(line.get(), mode);
}

void DrawmereImpl::drawPoly(float* coordinates, int count, bool open, PAINTMODE mode) {
    std::string points;
    for (int i = 0; coordinates && i + 1 < count; i += 2) {
        appendReal(points, coordinates[i], ',');
        appendReal(points, coordinates[i + 1], ' ');
    }
    const MoxPtr<SVGElement> poly =
        createDrawing(open ? SVGName::polyline : SVGName::polygon, 1, mode);
    setPaintAttr(poly.get(), mode);
    // On purpose: the points stand behind the paint and end in a blank. Other shapes have their
    // geometry first.
    poly->setSVGAttribute(SVGName::points, MoxValue::fromAscii(points));
    groupManager->setElemMode(mode, ELEMENTTYPE_SHAPE);
    addElement(poly.get(), /*direct=*/false, /*makeCurrent=*/false);
}

void DrawmereImpl::finishShape(SVGElement* element, PAINTMODE mode) {
    setPaintAttr(element, mode);
    groupManager->setElemMode(mode, ELEMENTTYPE_SHAPE);
    addElement(element, /*direct=*/false, /*makeCurrent=*/false);
}

} // namespace DrawmereNS
