#include "draw/SVGTinyImpl.h"

#include "SVGConfig.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {

SVGTinyImpl::SVGTinyImpl(SVGConfig* options) : SVGBasicImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_TINY);
}

SVGTinyImpl::~SVGTinyImpl() = default;

} // namespace DrawmereNS
