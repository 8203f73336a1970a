/// The data of paths that tests draw.
#pragma once

#include "draw/DrawmereImpl.h"
#include "tests/support/SvgPage.h"
#include "tests/support/XmlReader.h"

#include <string>

namespace DrawmereTest {

using namespace DrawmereNS;

inline MoxPointT<MoxLength> at(float x, float y) { return {pt(x), pt(y)}; }

/// Returns: the data of the only path of a page that `draw` draws into.
template <typename Draw> std::string dataOf(Draw draw, bool wispMode = false) {
    SvgPage page;
    page.config.wispMode = wispMode;
    page->startPathData();
    draw(*page.drawmere.impl);
    page->endPathData(PAINTMODE_STROKE);
    const XmlReading reading = readXml(page.document());
    return reading.error + reading.element("path").attribute("d");
}

} // namespace DrawmereTest
