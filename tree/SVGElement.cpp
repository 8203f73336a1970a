#include "tree/SVGElement.h"

#include "tree/SVGDocument.h"

namespace DrawmereNS {

SVGElement::SVGElement(SVGDocument* document) : MoxElement(document) {}

SVGElement::~SVGElement() = default;

void SVGElement::setSVGAttribute(SVGName name, const MoxValue& value) { setAttribute(name, value); }

MoxPtr<MoxElement> SVGElement::makeBlank() const { return new SVGElement(nullptr); }

} // namespace DrawmereNS
