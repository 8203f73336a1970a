#include "draw/SVGPlazmicImpl.h"

#include "SVGConfig.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {

SVGPlazmicImpl::SVGPlazmicImpl(SVGConfig* options) : SVGTinyImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_FULL);
}

SVGPlazmicImpl::~SVGPlazmicImpl() = default;

} // namespace DrawmereNS
