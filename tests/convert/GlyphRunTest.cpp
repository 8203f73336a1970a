#include "tools/convert/GlyphRun.h"

#include "tests/support/SvgPage.h"
#include "tools/convert/TextQueue.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>

namespace DrawmereTest {
namespace {

using namespace DrawmereConvert; // NOLINT(google-build-using-namespace)

constexpr float step = 0.5F;

/// A glyph in steps: a line up, then a curve of each kind.
GridOutline makeOutline(std::uint32_t number, float height) {
    GridOutline outline;
    outline.steps = {PATHSTEP_MOVE, PATHSTEP_LINE, PATHSTEP_QUADRATIC, PATHSTEP_LINE,
                     PATHSTEP_CURVE};
    outline.points = {{1, 0},  {1, -height}, {3, -height}, {3, -2},
                      {5, -2}, {6, -2},      {6, -1},      {5, 0}};
    outline.bounds = {1, -height, 6, 0};
    outline.number = number;
    return outline;
}

std::string draw(const GlyphRun& run) {
    SvgPage page;
    page->startPathData();
    run.draw(page.drawmere);
    page->endPathData(PAINTMODE_FILL);
    const std::string body = page.body();
    const std::size_t begin = body.find("d=\"") + 3;
    return body.substr(begin, body.find('"', begin) - begin);
}

TEST(GlyphRun, WhatFollowsAQuadraticCurveIsWhereItBelongs) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    run.add(outline, step, {10, 20});
    run.add(outline, step, {15, 20});
    EXPECT_EQ(draw(run), "M21,40v-4q2,0 2,2h2c1,0 1,1 0,2m6,0v-4q2,0 2,2h2c1,0 1,1 0,2");
}

TEST(GlyphRun, OriginsAreRoundedToTheGrid) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    run.add(outline, step, {10.2F, 19.9F});
    EXPECT_EQ(draw(run).substr(0, 6), "M21,40");
    EXPECT_FLOAT_EQ(run.getBounds().x0, 10.5F);
    EXPECT_FLOAT_EQ(run.getBounds().y0, 18);
    EXPECT_FLOAT_EQ(run.getBounds().x1, 13);
    EXPECT_FLOAT_EQ(run.getBounds().y1, 20);
}

TEST(GlyphRun, AsAPathItHasCubicCurvesInClosedSubpaths) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    run.add(outline, step, {10, 20});
    PathData path;
    run.appendTo(path);
    EXPECT_EQ(path.steps, (std::vector<PATHSTEP>{PATHSTEP_MOVE, PATHSTEP_LINE, PATHSTEP_CURVE,
                                                 PATHSTEP_LINE, PATHSTEP_CURVE, PATHSTEP_CLOSE}));
    EXPECT_FLOAT_EQ(path.points[2].x, 11.17F); // two thirds of the way to the control point
    EXPECT_FLOAT_EQ(path.points[4].x, 11.5F);
}

TEST(GlyphRun, GridsDoNotMix) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    run.add(outline, step, {10, 20});
    EXPECT_FALSE(run.accepts(1));
    run.add(outline, 1, {10, 20});
    EXPECT_EQ(run.countPoints(), outline.points.size());
    run.clear();
    EXPECT_TRUE(run.accepts(1));
}

TEST(GlyphRun, PlacesOutOfReachStayInReach) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    run.add(outline, step, {1e30F, std::numeric_limits<float>::quiet_NaN()});
    EXPECT_LT(run.getBounds().x1, 1e7F);
    EXPECT_LT(run.getBounds().y1, 1e7F);
}

TEST(GlyphRun, TouchingIsBeingInTheBoxOfAGlyph) {
    const GridOutline outline = makeOutline(0, 4);
    GlyphRun run;
    for (int i = 0; i < 100; ++i) {
        run.add(outline, step, {static_cast<float>(10 * i), 20});
    }
    EXPECT_TRUE(run.touches(fz_rect{900, 19, 901, 19.5F}));
    EXPECT_FALSE(run.touches(fz_rect{904, 19, 909, 19.5F})) << "between two glyphs";
    EXPECT_FALSE(run.touches(fz_rect{0, 21, 1000, 22})) << "below all";
    GlyphRun other;
    other.add(outline, 2 * step, {505, 20});
    EXPECT_TRUE(run.touches(other));
    other.clear();
    other.add(outline, 2 * step, {503, 40});
    EXPECT_FALSE(run.touches(other));
    EXPECT_FALSE(run.touches(GlyphRun()));
}

TEST(GlyphRun, GlyphsThatComeAgainTooLateToBePackedStandTogetherAtTheEnd) {
    const GridOutline usual = makeOutline(0, 4);
    const GridOutline rare = makeOutline(1, 7);
    GlyphRun run;
    run.add(rare, step, {0, 0});
    for (int i = 0; i < 1000; ++i) {
        run.add(usual, step, {0, 10});
    }
    run.add(rare, step, {0, 20});
    const std::string data = draw(run);
    EXPECT_GT(data.find("v-7"), data.rfind("v-4"));
    GlyphRun shortRun;
    shortRun.add(rare, step, {0, 0});
    shortRun.add(usual, step, {0, 10});
    shortRun.add(rare, step, {0, 20});
    EXPECT_LT(draw(shortRun).find("v-7"), draw(shortRun).find("v-4"));
}

GlyphRun makeRun(const GridOutline& outline, float x) {
    GlyphRun run;
    run.add(outline, step, {x, 20});
    return run;
}

TEST(TextQueue, TextThatTouchesIsDrawnFirst) {
    const GridOutline outline = makeOutline(0, 4);
    const Paint black{MoxColor(0, 0, 0)};
    const Paint red{MoxColor(255, 0, 0)};
    TextQueue queue;
    EXPECT_TRUE(queue.add(makeRun(outline, 0), black, true).empty());
    EXPECT_TRUE(queue.add(makeRun(outline, 10), red, true).empty());
    EXPECT_TRUE(queue.add(makeRun(outline, 0), black, true).empty()) << "one path covers itself";
    const TextQueue::Texts before = queue.add(makeRun(outline, 10), black, true);
    ASSERT_EQ(before.size(), 1);
    EXPECT_EQ(before[0].paint, red);
    EXPECT_EQ(queue.takeTouching({9, 18, 11, 20}).size(), 1);
    EXPECT_TRUE(queue.isEmpty());
}

TEST(TextQueue, ManyColoursDoNotWaitForEver) {
    const GridOutline outline = makeOutline(0, 4);
    TextQueue queue;
    std::size_t drawn = 0;
    for (int i = 0; i < 100; ++i) {
        const Paint paint{MoxColor(i, 0, 0)};
        drawn += queue.add(makeRun(outline, static_cast<float>(10 * i)), paint, true).size();
    }
    EXPECT_GT(drawn, 80);
    EXPECT_EQ(drawn + queue.takeAll().size(), 100);
}

TEST(TextQueue, TheSamePathIsFound) {
    const GridOutline outline = makeOutline(0, 4);
    TextQueue queue;
    queue.add(makeRun(outline, 0), {MoxColor(0, 0, 0)}, true);
    queue.add(makeRun(outline, 10), {MoxColor(1, 0, 0)}, true);
    PathData path;
    makeRun(outline, 10).appendTo(path);
    const auto found = queue.takeEqual(path);
    ASSERT_TRUE(found);
    EXPECT_EQ(found->paint.color, MoxColor(1, 0, 0));
    EXPECT_FALSE(queue.takeEqual(path));
    EXPECT_EQ(queue.takeAll().size(), 1);
}

} // namespace
} // namespace DrawmereTest
