#include "draw/SVGBasicImpl.h"

#include "SVGConfig.h"
#include "draw/ClipContent.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {
namespace {

constexpr SVGName::Number clipContent[] = {SVGName::rect};
constexpr float coordinateLimit = 32768.0F;

/// A NaN stays one.
float clampCoordinate(float number) {
    if (number > coordinateLimit) {
        return coordinateLimit;
    }
    return number < -coordinateLimit ? -coordinateLimit : number;
}

} // namespace

SVGBasicImpl::SVGBasicImpl(SVGConfig* options) : DrawmereImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_BASIC);
}

SVGBasicImpl::~SVGBasicImpl() = default;

void SVGBasicImpl::drawPoly(float* coordinates, int count, bool open, PAINTMODE mode) {
    for (int i = 0; coordinates && i < count; ++i) {
        coordinates[i] = clampCoordinate(coordinates[i]);
    }
    DrawmereImpl::drawPoly(coordinates, count, open, mode);
}

void SVGBasicImpl::addElement(SVGElement* element, bool direct, bool makeCurrent) {
    if (getGContext()->getType() != ELEMENT_TYPE_CLIP || mayStandInClip(element, clipContent)) {
        DrawmereImpl::addElement(element, direct, makeCurrent);
    }
}

} // namespace DrawmereNS
