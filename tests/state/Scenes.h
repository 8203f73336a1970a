/// Scenes that any page with the drawing calls can draw: `Drawmere` and `NaivePage` alike.
#pragma once

#include "tests/support/SvgPage.h"

#include <cmath>
#include <vector>

namespace DrawmereTest {

using namespace DrawmereNS;

// What the scenes are made of.

inline SVGMatrix shift(float x, float y) { return {1, 0, 0, 1, x, y}; }

inline SVGMatrix scaling(float x, float y) { return {x, 0, 0, y, 0, 0}; }

inline SVGMatrix rotation(float degrees) { return SVGMatrix().rotate(degrees); }

inline MoxColor hue(int step) { return {step * 97 % 256, step * 57 % 256, step * 173 % 256}; }

template <typename Page> void box(Page& page, float x, float y, float side, PAINTMODE mode) {
    page.drawRect(pt(x), pt(y), pt(side), pt(side), pt(0), pt(0), mode);
}

template <typename Page> void dash(Page& page, std::vector<float> lengths, float offset) {
    std::vector<MoxLength> dashes;
    for (const float length : lengths) {
        dashes.push_back(pt(length));
    }
    page.setDashLine(dashes.data(), static_cast<int>(dashes.size()), pt(offset));
}

template <typename Page> void star(Page& page, float x, float y, float radius) {
    std::vector<float> points;
    for (int corner = 0; corner < 5; ++corner) {
        const float angle = static_cast<float>(corner) * 2.5132741F;
        points.push_back(x + radius * std::sin(angle));
        points.push_back(y - radius * std::cos(angle));
    }
    page.drawPolygon(points.data(), static_cast<int>(points.size()), PAINTMODE_FILLSTROKE);
}

// The scenes.

template <typename Page> void allShapes(Page& page) {
    page.setFillColor(hue(1));
    page.setStrokeColor(hue(2));
    page.setStrokeWidth(pt(3));
    page.drawRect(pt(5), pt(5), pt(30), pt(20), pt(6), pt(3), PAINTMODE_FILLSTROKE);
    page.drawCircle(pt(60), pt(20), pt(14), PAINTMODE_FILL);
    page.drawEllipse(pt(50), pt(50), pt(40), pt(12), PAINTMODE_STROKE);
    page.drawLine(pt(5), pt(95), pt(95), pt(40), PAINTMODE_STROKE);
    float points[] = {10, 60, 40, 95, 70, 60, 90, 95};
    page.drawPolyline(points, 8, PAINTMODE_STROKE);
    page.setFillColor(hue(3));
    star(page, 70, 70, 20);
}

template <typename Page> void nestedFrames(Page& page) {
    page.setStrokeColor(hue(1));
    for (int depth = 0; depth < 8; ++depth) {
        page.pushState();
        page.setTransMatrix(shift(6, 4));
        page.setTransMatrix(scaling(0.85F, 0.85F));
        page.setStrokeColor(hue(depth));
        box(page, 5, 5, 85, PAINTMODE_STROKE);
    }
    for (int depth = 0; depth < 8; ++depth) {
        page.popState();
        page.drawCircle(pt(50), pt(50), pt(4), PAINTMODE_STROKE);
    }
}

template <typename Page> void pinwheel(Page& page) {
    page.setTransMatrix(shift(50, 50));
    for (int blade = 0; blade < 12; ++blade) {
        page.pushState();
        page.setTransMatrix(rotation(static_cast<float>(30 * blade)));
        page.setFillColor(hue(blade));
        page.drawRect(pt(10), pt(-4), pt(35), pt(8), pt(2), pt(2), PAINTMODE_FILL);
        page.popState();
    }
}

template <typename Page> void transformsInsideAGroup(Page& page) {
    page.setFillColor(hue(1));
    box(page, 0, 0, 20, PAINTMODE_FILL);
    page.setTransMatrix(shift(25, 10));
    page.setFillColor(hue(2));
    box(page, 0, 0, 20, PAINTMODE_FILL);
    page.setTransMatrix(rotation(20));
    page.setFillColor(hue(3));
    box(page, 15, 15, 20, PAINTMODE_FILL);
    page.setTransMatrix(scaling(1.5F, 0.5F));
    page.setFillColor(hue(4));
    box(page, 20, 70, 20, PAINTMODE_FILL);
}

template <typename Page> void transformsBehindGroups(Page& page) {
    page.setStrokeColor(hue(1));
    for (int step = 0; step < 5; ++step) {
        box(page, 5, 5, 20, PAINTMODE_STROKE);
        page.setTransMatrix(shift(14, 9));
        page.pushState();
        page.drawCircle(pt(15), pt(15), pt(5), PAINTMODE_STROKE);
        page.setTransMatrix(shift(0, 30));
        page.popState();
    }
}

template <typename Page> void transformsBeforeGroups(Page& page) {
    page.setFillColor(hue(5));
    page.setTransMatrix(shift(10, 10));
    page.pushState();
    page.setTransMatrix(scaling(2, 1));
    page.pushState();
    page.setTransMatrix(rotation(-15));
    box(page, 5, 20, 20, PAINTMODE_FILL);
    page.popState();
    page.setFillColor(hue(6));
    box(page, 5, 50, 10, PAINTMODE_FILL);
    page.popState();
    page.setFillColor(hue(7));
    box(page, 60, 60, 10, PAINTMODE_FILL);
}

template <typename Page> void transformsWithNothingDrawn(Page& page) {
    page.setTransMatrix(shift(10, 5));
    page.pushState();
    page.setTransMatrix(scaling(0.5F, 0.5F));
    page.pushState();
    page.pushState();
    page.setTransMatrix(rotation(30));
    page.popState();
    page.setFillColor(hue(2));
    box(page, 20, 20, 60, PAINTMODE_FILL);
    page.popState();
    page.setTransMatrix(shift(90, 90));
    page.setFillColor(hue(3));
    box(page, 0, 0, 60, PAINTMODE_FILL);
    page.popState();
    page.setFillColor(hue(4));
    box(page, 0, 60, 20, PAINTMODE_FILL);
}

template <typename Page> void skews(Page& page) {
    page.setFillColor(hue(8));
    page.setStrokeColor(hue(9));
    for (int step = 0; step < 4; ++step) {
        page.pushState();
        page.setTransMatrix(shift(10, static_cast<float>(5 + 22 * step)));
        page.setTransMatrix(SVGMatrix().skewX(static_cast<float>(15 * step)));
        box(page, 0, 0, 15, PAINTMODE_FILLSTROKE);
        page.setTransMatrix(SVGMatrix().skewY(20));
        box(page, 40, -15, 15, PAINTMODE_FILLSTROKE);
        page.popState();
    }
}

template <typename Page> void mirrors(Page& page) {
    page.setFillColor(hue(4));
    const float signs[][2] = {{1, 1}, {-1, 1}, {1, -1}, {-1, -1}};
    page.setTransMatrix(shift(50, 50));
    for (const auto& sign : signs) {
        page.pushState();
        page.setTransMatrix(scaling(sign[0], sign[1]));
        float points[] = {5, 5, 45, 10, 15, 40};
        page.drawPolygon(points, 6, PAINTMODE_FILL);
        page.popState();
    }
}

template <typename Page> void strokesInOneGroup(Page& page) {
    page.setStrokeColor(hue(3));
    for (int step = 0; step < 6; ++step) {
        page.setStrokeWidth(pt(static_cast<float>(2 + 2 * (step % 3))));
        page.setLineCap(static_cast<LINECAP>(step % 3));
        page.setLineJoin(static_cast<LINEJOIN>((step + 1) % 3));
        page.setMiterLimit(step % 2 == 0 ? 1.5F : 10.0F);
        const float y = static_cast<float>(14 * step + 14);
        float points[] = {10, y, 40, y - 8, 70, y, 45, y + 4};
        page.drawPolyline(points, 8, PAINTMODE_STROKE);
    }
}

template <typename Page> void dashesOnAndOff(Page& page) {
    page.setStrokeColor(hue(6));
    page.setStrokeWidth(pt(4));
    const std::vector<std::vector<float>> patterns = {{8, 4}, {}, {6, 3, 1}, {5}, {}, {8, 4}};
    float y = 8;
    for (const std::vector<float>& pattern : patterns) {
        dash(page, pattern, y / 4);
        page.drawLine(pt(5), pt(y), pt(95), pt(y), PAINTMODE_STROKE);
        y += 15;
    }
    page.pushState();
    dash(page, {2, 2}, 0);
    page.drawCircle(pt(50), pt(50), pt(40), PAINTMODE_STROKE);
    page.popState();
    page.drawCircle(pt(50), pt(50), pt(30), PAINTMODE_STROKE);
}

template <typename Page> void fillRules(Page& page) {
    page.setFillColor(hue(1));
    star(page, 25, 25, 22);
    page.setFillRule(FILLRULE_NONZERO);
    star(page, 75, 25, 22);
    page.pushState();
    page.setFillRule(FILLRULE_EVENODD);
    star(page, 25, 75, 22);
    page.popState();
    star(page, 75, 75, 22);
}

template <typename Page> void opacitiesOfPaint(Page& page) {
    page.setStrokeWidth(pt(8));
    for (int step = 0; step < 5; ++step) {
        page.setFillColor(hue(step));
        page.setStrokeColor(hue(step + 5));
        page.setOpacity(0.2F * static_cast<float>(step + 1), OPACITYDEST_FILL);
        page.setOpacity(1.0F - 0.2F * static_cast<float>(step), OPACITYDEST_STROKE);
        const float place = static_cast<float>(10 + 14 * step);
        box(page, place, place, 20, PAINTMODE_FILLSTROKE);
    }
}

template <typename Page> void opacitiesOfSingleShapes(Page& page) {
    page.setStrokeWidth(pt(8));
    for (int step = 0; step < 5; ++step) {
        page.pushState();
        page.setFillColor(hue(step));
        page.setStrokeColor(hue(step + 5));
        page.setOpacity(0.2F * static_cast<float>(step + 1), OPACITYDEST_ELEMENT);
        const float place = static_cast<float>(10 + 14 * step);
        box(page, place, place, 20, PAINTMODE_FILLSTROKE);
        page.popState();
    }
}

template <typename Page> void opacitiesOfLaterShapes(Page& page) {
    page.setFillColor(hue(1));
    box(page, 5, 5, 50, PAINTMODE_FILL); // opaque, so the group is
    page.setOpacity(0.5F, OPACITYDEST_ELEMENT);
    page.setFillColor(hue(2));
    box(page, 30, 30, 40, PAINTMODE_FILL);
    page.setFillColor(hue(3));
    box(page, 50, 50, 40, PAINTMODE_FILL);
}

template <typename Page> void transparentColours(Page& page) {
    page.setStrokeWidth(pt(6));
    for (int alpha = 0; alpha <= 255; alpha += 51) {
        page.setFillColor(MoxColor(200, 40, 40, alpha));
        page.setStrokeColor(MoxColor(20, 40, 220, 255 - alpha));
        const float place = static_cast<float>(alpha) / 4.0F;
        page.drawCircle(pt(20 + place), pt(20 + place), pt(14), PAINTMODE_FILLSTROKE);
    }
}

template <typename Page> void statesTakenBack(Page& page) {
    page.setStrokeColor(hue(1));
    page.setFillColor(hue(2));
    for (int depth = 0; depth < 6; ++depth) {
        page.pushState();
        page.setStrokeWidth(pt(static_cast<float>(1 + depth)));
        page.setLineJoin(static_cast<LINEJOIN>(depth % 3));
        page.setFillColor(hue(depth + 3));
        page.setTransMatrix(rotation(5));
        if (depth % 2 == 0) {
            box(page, 30, 10, 40, PAINTMODE_FILLSTROKE);
        }
    }
    for (int depth = 0; depth < 6; ++depth) {
        page.popState();
        page.drawRect(pt(5), pt(static_cast<float>(14 * depth + 8)), pt(12), pt(6), pt(2), pt(2),
                      PAINTMODE_FILLSTROKE);
    }
}

template <typename Page> void grid(Page& page) {
    for (int row = 0; row < 5; ++row) {
        page.pushState();
        page.setTransMatrix(shift(0, static_cast<float>(20 * row)));
        for (int column = 0; column < 5; ++column) {
            page.pushState();
            page.setTransMatrix(shift(static_cast<float>(20 * column), 0));
            page.setFillColor(hue(5 * row + column));
            box(page, 2, 2, 16, PAINTMODE_FILL);
            page.setTransMatrix(scaling(0.5F, 0.5F));
            page.setFillColor(hue(row + column));
            page.drawCircle(pt(20), pt(20), pt(8), PAINTMODE_FILL);
            page.popState();
        }
        page.popState();
    }
}

template <typename Page> void stretchedStrokes(Page& page) {
    page.setStrokeColor(hue(7));
    page.setStrokeWidth(pt(2));
    page.setTransMatrix(scaling(4, 1));
    box(page, 3, 10, 18, PAINTMODE_STROKE);
    page.pushState();
    page.setTransMatrix(scaling(0.25F, 3));
    box(page, 10, 15, 15, PAINTMODE_STROKE);
    page.popState();
    dash(page, {1, 2}, 0);
    page.drawLine(pt(2), pt(90), pt(22), pt(60), PAINTMODE_STROKE);
}

template <typename Page> void linkedShapes(Page& page) {
    page.setFillColor(hue(1));
    page.setStrokeColor(hue(2));
    page.setTransMatrix(shift(5, 5));
    box(page, 0, 0, 20, PAINTMODE_FILLSTROKE);
    page.startLink(u"other.svg", MoxName());
    page.setStrokeWidth(pt(4));
    box(page, 30, 0, 20, PAINTMODE_FILLSTROKE);
    page.pushState();
    page.setTransMatrix(rotation(10));
    box(page, 60, 10, 20, PAINTMODE_FILLSTROKE);
    page.popState();
    box(page, 0, 30, 20, PAINTMODE_FILLSTROKE);
    page.endLink();
    page.setTransMatrix(shift(30, 30));
    box(page, 0, 0, 20, PAINTMODE_FILLSTROKE);
    page.startLink(u"third.svg", MoxName());
    box(page, 30, 0, 20, PAINTMODE_FILLSTROKE);
    page.endLink();
    box(page, 0, 30, 20, PAINTMODE_FILLSTROKE);
}

template <typename Page> void branch(Page& page, int depth) {
    page.drawLine(pt(0), pt(0), pt(0), pt(-25), PAINTMODE_STROKE);
    if (depth == 0) {
        return;
    }
    for (const float angle : {-28.0F, 22.0F}) {
        page.pushState();
        page.setTransMatrix(shift(0, -25));
        page.setTransMatrix(rotation(angle));
        page.setTransMatrix(scaling(0.75F, 0.75F));
        page.setStrokeColor(hue(depth));
        branch(page, depth - 1);
        page.popState();
    }
}

template <typename Page> void tree(Page& page) {
    page.setStrokeColor(hue(1));
    page.setStrokeWidth(pt(4));
    page.setLineCap(LINECAP_ROUND);
    page.setTransMatrix(shift(50, 98));
    branch(page, 5);
}

template <typename Page> void manyTurnsInOneGroup(Page& page) {
    page.setStrokeColor(hue(4));
    page.setTransMatrix(shift(50, 50));
    for (int turn = 0; turn < 36; ++turn) {
        page.setTransMatrix(rotation(10));
        page.drawLine(pt(12), pt(0), pt(45), pt(6), PAINTMODE_STROKE);
    }
}

template <typename Page> void hairlines(Page& page) {
    page.setStrokeColor(hue(2));
    box(page, 10, 10, 30, PAINTMODE_STROKE);
    page.setStrokeWidth(pt(0)); // a stroke without a width shows nowhere
    box(page, 50, 10, 30, PAINTMODE_STROKE);
    page.pushState();
    box(page, 50, 50, 30, PAINTMODE_STROKE);
    page.popState();
}

} // namespace DrawmereTest
