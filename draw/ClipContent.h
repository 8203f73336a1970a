/// What the profiles let into a clip path.
#pragma once

#include "tree/SVGUtil.h"

#include <algorithm>
#include <span>

namespace DrawmereNS {

/// Returns: true for an element of the `allowed` names, and for a clip path whose parent is none.
inline bool mayStandInClip(const SVGElement* element, std::span<const SVGName::Number> allowed) {
    const SVGName name = SVGUtil::getSVGLocalName(element);
    if (name == SVGName::clipPath) {
        const auto* parent = MoxCommonNS::narrow<MoxElement>(element->getParentNode());
        return SVGUtil::getSVGLocalName(parent) != SVGName::clipPath;
    }
    return std::any_of(allowed.begin(), allowed.end(),
                       [name](SVGName::Number known) { return name == known; });
}

} // namespace DrawmereNS
