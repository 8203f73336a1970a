/// Settings and shapes that the tests of drawn pages share.
#pragma once

#include "tests/support/Golden.h"

namespace DrawmereTest {

using namespace DrawmereNS;

/// Draws a square of 20 points at `x`, 10.
inline void drawBox(SvgPage& page, float x, PAINTMODE mode = PAINTMODE_STROKE) {
    page->drawRect(pt(x), pt(10), pt(20), pt(20), pt(0), pt(0), mode);
}

/// Sets a dash pattern and its offset.
inline void setDashes(SvgPage& page, std::vector<float> lengths, float offset = 0) {
    std::vector<MoxLength> dashes;
    for (const float length : lengths) {
        dashes.push_back(pt(length));
    }
    page->setDashLine(dashes.data(), static_cast<int>(dashes.size()), pt(offset));
}

/// Sets everything that is written on shapes and groups alike to something that is no default.
inline void setEverything(SvgPage& page) {
    page->setOpacity(0.25F, OPACITYDEST_FILL);
    setDashes(page, {3, 2}, 1);
    page->setOpacity(0.5F, OPACITYDEST_STROKE);
    page->setMiterLimit(7);
    page->setStrokeWidth(pt(3));
    page->setLineJoin(LINEJOIN_ROUND);
    page->setLineCap(LINECAP_SQUARE);
    page->setMaskReference(u"m1");
    page->setOpacity(0.75F, OPACITYDEST_ELEMENT);
}

/// Sets all of that back to the defaults.
inline void setDefaults(SvgPage& page) {
    page->setOpacity(1, OPACITYDEST_FILL);
    setDashes(page, {});
    page->setOpacity(1, OPACITYDEST_STROKE);
    page->setMiterLimit(4);
    page->setStrokeWidth(pt(1));
    page->setLineJoin(LINEJOIN_MITER);
    page->setLineCap(LINECAP_BUTT);
    page->setMaskReference(u"none");
    page->setOpacity(1, OPACITYDEST_ELEMENT);
}

} // namespace DrawmereTest
