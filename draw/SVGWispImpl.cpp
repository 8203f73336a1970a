#include "draw/SVGWispImpl.h"

#include "SVGConfig.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {

SVGWispImpl::SVGWispImpl(SVGConfig* options) : DrawmereImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_TINY);
}

SVGWispImpl::~SVGWispImpl() = default;

} // namespace DrawmereNS
