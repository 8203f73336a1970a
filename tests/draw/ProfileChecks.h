/// What the tests of all profiles ask.
#pragma once

#include "SVGConfig.h"
#include "state/SVGGraphicContext.h"
#include "tests/draw/DrawnTree.h"

#include <gtest/gtest.h>

#include <string>

namespace DrawmereTest {

/// Returns: the dialect that the graphic state of a new `Impl` has.
template <typename Impl> int dialectOf() {
    SVGConfig config;
    const Impl impl(&config);
    return impl.getGContext()->getSVGType();
}

/// Returns: the names of the elements that a clip definition takes, with blanks between them.
template <typename Impl> std::string listClipContent(SVGConfig::SVGTYPE profile) {
    std::string names;
    for (const SVGName::Number number :
         {SVGName::a, SVGName::circle, SVGName::clipPath, SVGName::ellipse, SVGName::g,
          SVGName::image, SVGName::line, SVGName::path, SVGName::polygon, SVGName::polyline,
          SVGName::rect, SVGName::text, SVGName::use}) {
        DrawnTree<Impl> tree(profile);
        tree.impl.getGContext()->setType(ELEMENT_TYPE_CLIP);
        const MoxPtr<SVGElement> element = tree.make(number);
        tree.impl.addElement(element.get(), /*direct=*/false, /*makeCurrent=*/false);
        if (element->getParentNode()) {
            names += (names.empty() ? "" : " ") +
                     utf8(MoxCommonNS::MoxNameTable::getSharedNameString(element->getNodeName()));
        }
    }
    return names;
}

/// Returns: whether a clip path that stands in another is taken.
template <typename Impl> bool takesClipPathInClipPath() {
    DrawnTree<Impl> tree;
    tree.impl.getGContext()->setType(ELEMENT_TYPE_CLIP);
    const MoxPtr<SVGElement> outer = tree.make(SVGName::clipPath);
    const MoxPtr<SVGElement> inner = tree.make(SVGName::clipPath);
    outer->appendChild(inner.get());
    tree.impl.addElement(inner.get(), /*direct=*/true, /*makeCurrent=*/false);
    return inner->getParentNode() != outer.get();
}

/// Returns: the list of points that a polyline of these coordinates gets.
template <typename Impl> std::string drawPoints(float* points, int count) {
    DrawnTree<Impl> tree;
    tree.impl.drawPoly(points, count, /*open=*/true, PAINTMODE_NONE);
    return tree.shape();
}

} // namespace DrawmereTest
