/// An implementation that tells its elements.
#pragma once

#include "tests/draw/DrawnTree.h"

namespace DrawmereTest {

/// Tells what comes to where the profiles filter.
struct FilteringImpl : SVGFullImpl {
    using SVGFullImpl::SVGFullImpl;

    void addElement(SVGElement* element, bool direct, bool makeCurrent) override {
        told += utf8(MoxValue(element->getLocalName()).toString()) + (direct ? " direct" : "") +
                (makeCurrent ? " current" : "") + "\n";
        SVGFullImpl::addElement(element, direct, makeCurrent);
    }

    std::string told;
};

} // namespace DrawmereTest
