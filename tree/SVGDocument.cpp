#include "tree/SVGDocument.h"

namespace DrawmereNS {

SVGDocument::SVGDocument() = default;

SVGDocument::~SVGDocument() = default;

MoxPtr<MoxElement> SVGDocument::createElement(MoxName name) {
    return SVGDocument::createElementNS({}, {}, name);
}

MoxPtr<MoxElement> SVGDocument::createElementNS(MoxName uri, MoxName prefix, MoxName local) {
    MoxPtr<MoxElement> element(new SVGElement(this));
    element->setName(uri, prefix, local);
    return element;
}

MoxPtr<SVGElement> SVGDocument::createSVGElement(SVGName name) {
    return MoxCommonNS::narrow<SVGElement>(createElement(name).get());
}

MoxPtr<MoxNode> SVGDocument::cloneAlone() const { return new SVGDocument; }

} // namespace DrawmereNS
