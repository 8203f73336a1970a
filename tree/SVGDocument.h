/// A document that makes SVG elements.
#pragma once

#include "foundation/common/MoxDocument.h"
#include "tree/SVGElement.h"

namespace DrawmereNS {

using MoxCommonNS::MoxDocument;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNode;

/// A thin layer on the foundation's document; it answers the type number of its base.
class DRAWMERE_API SVGDocument : public MoxDocument {
public:
    SVGDocument();
    ~SVGDocument() override;

    // Both make real `SVGElement`s, so that no narrowing pretends to a class.
    MoxPtr<MoxElement> createElement(MoxName name) override;
    MoxPtr<MoxElement> createElementNS(MoxName uri, MoxName prefix, MoxName local) override;

    /// Makes an element that stands nowhere yet and has no namespace of its own.
    /// Returns: null when the virtual `createElement` gives none.
    MoxPtr<SVGElement> createSVGElement(SVGName name);

protected:
    MoxPtr<MoxNode> cloneAlone() const override;
};

} // namespace DrawmereNS
