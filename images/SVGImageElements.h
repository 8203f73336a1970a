/// What the elements of referred and embedded images have in common.
#pragma once

#include "foundation/common/MoxLength.h"
#include "tree/SVGElement.h"

namespace DrawmereNS {

/// The value of `preserveAspectRatio`: the image fills its box.
inline constexpr char16_t imageAspect[] = u"none meet";

inline MoxCommonNS::MoxName getHrefName() {
    static const MoxCommonNS::MoxName name(u"xlink:href");
    return name;
}

/// Sets a length as a plain number of points.
inline void setImageLength(SVGElement& element, SVGName name, MoxCommonNS::MoxLength length) {
    element.setSVGAttribute(name, MoxValue(length.getRealValue(MoxCommonNS::MOXUNIT_POINT)));
}

} // namespace DrawmereNS
