/// An element that takes the names of SVG 1.1.
#pragma once

#include "foundation/common/MoxElement.h"
#include "foundation/names/SVGName.h"

namespace DrawmereNS {

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxValue;
using TalCommon::SVGName;

class SVGDocument;

/// A thin layer on the foundation's element. Every element that a `SVGDocument` makes is one; it
/// answers the type number of its base.
class DRAWMERE_API SVGElement : public MoxElement {
public:
    /// Borrows: `document`, as the base does.
    explicit SVGElement(SVGDocument* document);
    ~SVGElement() override;

    /// Sets or replaces an attribute. Ignores: a null value.
    void setSVGAttribute(SVGName name, const MoxValue& value);

    /// The same for a value that nobody needs any longer.
    void setSVGAttribute(SVGName name, MoxValue&& value) { setAttribute(name, std::move(value)); }

protected:
    MoxPtr<MoxElement> makeBlank() const override;
};

} // namespace DrawmereNS
