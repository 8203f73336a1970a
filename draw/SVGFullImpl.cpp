#include "draw/SVGFullImpl.h"

#include "SVGConfig.h"
#include "draw/ClipContent.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {
namespace {

constexpr SVGName::Number clipContent[] = {
    SVGName::path, SVGName::rect,    SVGName::circle,   SVGName::ellipse,
    SVGName::line, SVGName::polygon, SVGName::polyline, SVGName::text,
};

} // namespace

SVGFullImpl::SVGFullImpl(SVGConfig* options) : DrawmereImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_FULL);
}

SVGFullImpl::~SVGFullImpl() = default;

void SVGFullImpl::addElement(SVGElement* element, bool direct, bool makeCurrent) {
    if (getGContext()->getType() != ELEMENT_TYPE_CLIP || mayStandInClip(element, clipContent)) {
        DrawmereImpl::addElement(element, direct, makeCurrent);
    }
}

} // namespace DrawmereNS
