// Path calls. Without an open path each of them has no effect, and no path can be opened so far.
#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

void DrawmereImpl::startPathData() {}

void DrawmereImpl::endPathData(PAINTMODE /*mode*/) {}

void DrawmereImpl::setPathMoveTo(const MoxPointT<MoxLength>& /*point*/) {}

void DrawmereImpl::setPathClosepath() {}

void DrawmereImpl::setPathLineTo(const MoxPointT<MoxLength>& /*point*/) {}

void DrawmereImpl::setPathCubicBezierCurveTo(const MoxPointT<MoxLength>& /*point1*/,
                                             const MoxPointT<MoxLength>& /*point2*/,
                                             const MoxPointT<MoxLength>& /*point3*/) {}

void DrawmereImpl::setPathQuadraticBezierCurveTo(const MoxPointT<MoxLength>& /*point1*/,
                                                 const MoxPointT<MoxLength>& /*point2*/) {}

void DrawmereImpl::ellipticalArcTo(float /*rx*/, float /*ry*/, float /*angle*/, bool /*largeArc*/,
                                   bool /*sweep*/, float /*x*/, float /*y*/, bool /*absolute*/) {}

void DrawmereImpl::closePath(bool /*absolute*/) {}

} // namespace DrawmereNS
