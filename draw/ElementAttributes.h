/// Attributes that calls of several kinds write.
#pragma once

#include "DrawmereTypes.h"
#include "foundation/common/MoxLength.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGElement.h"

namespace DrawmereNS {

/// Writes a length as a number of points.
inline void setLength(SVGElement& element, SVGName name, MoxCommonNS::MoxLength length) {
    element.setSVGAttribute(name, MoxValue(length.getRealValue(MoxCommonNS::MOXUNIT_POINT)));
}

/// Writes a matrix as a transform. Ignores: the identity.
inline void setMatrix(SVGElement& element, SVGName name, const SVGMatrix& matrix) {
    if (!SVGGraphicContext::IsUnitMatrix(matrix)) {
        element.setSVGAttribute(name, SVGGraphicContext::convertMatrixToString(matrix));
    }
}

/// An attribute that tells the units of a definition, and the only value that it is written with:
/// the other one is what SVG takes it for when it is absent.
struct UnitsAttribute {
    SVGName::Number name;
    UNITSTYPE written;
};

inline constexpr UnitsAttribute clipPathUnits = {SVGName::clipPathUnits, OBJECTBOUNDINGBOX};
inline constexpr UnitsAttribute gradientUnits = {SVGName::gradientUnits, USERSPACEONUSE};
inline constexpr UnitsAttribute maskUnits = {SVGName::maskUnits, USERSPACEONUSE};
inline constexpr UnitsAttribute maskContentUnits = {SVGName::maskContentUnits, OBJECTBOUNDINGBOX};
inline constexpr UnitsAttribute patternUnits = {SVGName::patternUnits, USERSPACEONUSE};
inline constexpr UnitsAttribute patternContentUnits = {SVGName::patternContentUnits,
                                                       OBJECTBOUNDINGBOX};

/// Ignores: the units that SVG takes anyway, and an unlisted number.
inline void setUnits(SVGElement& element, const UnitsAttribute& attribute, UNITSTYPE units) {
    if (units == attribute.written) {
        element.setSVGAttribute(attribute.name,
                                units == USERSPACEONUSE ? u"userSpaceOnUse" : u"objectBoundingBox");
    }
}

} // namespace DrawmereNS
