/// Short names for the segments that tests of paths are made of.
#pragma once

#include "foundation/common/MoxPtr.h"
#include "path/SVGDrawElement.h"

namespace DrawmereNS {

using MoxCommonNS::MoxPtr;

inline MoxLength pt(float points) { return MoxLength::fromRaw(points); }

inline MoxPointT<MoxLength> at(float x, float y) { return {pt(x), pt(y)}; }

template <typename Segment>
MoxPtr<SVGDrawElement> named(Segment* segment, DrawmereDrawElementEnum name) {
    segment->setDrawType(DRAWELEMENT_NONE);
    segment->setDrawName(name);
    return MoxPtr<SVGDrawElement>(segment);
}

inline MoxPtr<SVGDrawElement> moveTo(float x, float y) {
    return named(new SVGDrawElementMoveTo(at(x, y)), DRAWELEMENT_MOVE);
}

inline MoxPtr<SVGDrawElement> lineTo(float x, float y) {
    return named(new SVGDrawElementLineTo(at(x, y)), DRAWELEMENT_LINE);
}

inline MoxPtr<SVGDrawElement> closeSubpath() {
    return named(new SVGDrawElementClose, DRAWELEMENT_CLOSE);
}

inline MoxPtr<SVGDrawElement> cubicTo(MoxPointT<MoxLength> control1, MoxPointT<MoxLength> control2,
                                      MoxPointT<MoxLength> target) {
    return named(new SVGDrawElementCubicBezierCurveTo(control1, control2, target),
                 DRAWELEMENT_CUBIC);
}

inline MoxPtr<SVGDrawElement> quadraticTo(MoxPointT<MoxLength> control,
                                          MoxPointT<MoxLength> target) {
    return named(new SVGDrawElementQuadraticBezierCurveTo(control, target), DRAWELEMENT_QUADRATIC);
}

} // namespace DrawmereNS
