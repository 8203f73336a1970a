#include "draw/SVGPlazmicImpl.h"

#include "SVGConfig.h"
#include "foundation/common/MoxUtil.h"
#include "state/SVGGraphicContext.h"

#include <cmath>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxUtil;

constexpr double screenWidth = 240.0;
constexpr double screenHeight = 160.0;

constexpr char16_t playerDoctype[] = u"svg SYSTEM \"http://www.example.com/dtd/1_0/svg.dtd\"";

double readNumber(const MoxElement& element, SVGName name) {
    return static_cast<double>(element.getAttribute(name).getRealValue(MoxCommonNS::MOXUNIT_NONE));
}

/// Returns: what makes a page of this size fit the screen; 1 for a page without a size, which no
/// factor could make fit.
double findFactor(double width, double height) {
    const double x = width / screenWidth;
    const double y = height / screenHeight;
    const double factor = 1.0 / (x > y ? x : y);
    return std::isfinite(factor) ? factor : 1.0;
}

void fitToScreen(MoxElement& root) {
    root.removeAttribute(SVGName(SVGName::version));
    root.removeAttribute(SVGName(SVGName::baseProfile));
    const double factor =
        findFactor(readNumber(root, SVGName::width), readNumber(root, SVGName::height));
    root.setAttribute(SVGName(SVGName::width), MoxValue(MoxUtil::toString(screenWidth)));
    root.setAttribute(SVGName(SVGName::height), MoxValue(MoxUtil::toString(screenHeight)));
    root.removeAttribute(SVGName(SVGName::viewBox));
    root.setAttribute(SVGName(SVGName::transform),
                      MoxValue(u"scale(" + MoxUtil::toString(factor) + u")"));
}

} // namespace

SVGPlazmicImpl::SVGPlazmicImpl(SVGConfig* options) : SVGTinyImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_FULL);
}

SVGPlazmicImpl::~SVGPlazmicImpl() = default;

void SVGPlazmicImpl::outputStream(MoxDocument* document, const UnicodeString& encoding,
                                  std::ostream* stream, const UnicodeString& saveOptions) {
    if (!document || !stream) {
        return;
    }
    if (MoxElement* root = document->getDocumentElement()) {
        fitToScreen(*root);
    }
    document->save(encoding, playerDoctype, *stream, nullptr, saveOptions, UnicodeString());
}

} // namespace DrawmereNS
