#include "tools/convert/Rectangles.h"

#include <gtest/gtest.h>

#include <limits>

namespace DrawmereTest {
namespace {

using DrawmereConvert::PathData;
using DrawmereConvert::toPath;

TEST(PathData, PointsAreRoundedToHundredths) {
    PathData path;
    path.moveTo(1.2345F, -0.006F);
    EXPECT_FLOAT_EQ(path.points[0].x, 1.23F);
    EXPECT_FLOAT_EQ(path.points[0].y, -0.01F);
}

TEST(PathData, PointsOutOfReachStayInReach) {
    PathData path;
    path.moveTo(1e30F, std::numeric_limits<float>::quiet_NaN());
    path.lineTo(-1e30F, 0);
    EXPECT_FLOAT_EQ(path.points[0].x, 100000);
    EXPECT_TRUE(path.points[0].y == path.points[0].y);
    EXPECT_FLOAT_EQ(path.points[1].x, -100000);
}

TEST(PathData, ABoxIsARectangleWhereverItBegins) {
    fz_rect rect{};
    EXPECT_TRUE(toPath({10, 20, 30, 50}).isRectangle(rect));
    EXPECT_TRUE(toPath({30, 50, 10, 20}).isRectangle(rect));
    EXPECT_FLOAT_EQ(rect.x0, 10);
    EXPECT_FLOAT_EQ(rect.y1, 50);
}

TEST(PathData, WhatIsNotUprightOrNotClosedIsNoRectangle) {
    fz_rect rect{};
    PathData slanted = toPath({0, 0, 10, 10});
    slanted.points[2].x = 11;
    EXPECT_FALSE(slanted.isRectangle(rect));
    PathData open = toPath({0, 0, 10, 10});
    open.steps.pop_back();
    EXPECT_FALSE(open.isRectangle(rect));
    EXPECT_FALSE(PathData().isRectangle(rect));
}

TEST(PathData, MovesThatNothingFollowsAreDropped) {
    PathData path = toPath({0, 0, 1, 1});
    path.moveTo(5, 5);
    path.moveTo(6, 6);
    path.tidy();
    EXPECT_TRUE(path == toPath({0, 0, 1, 1}));
}

TEST(PathData, BoundsHoldAllPoints) {
    PathData path;
    path.moveTo(5, 5);
    path.curveTo(0, 20, 30, -4, 6, 6);
    const fz_rect bounds = path.getBounds();
    EXPECT_FLOAT_EQ(bounds.x0, 0);
    EXPECT_FLOAT_EQ(bounds.y0, -4);
    EXPECT_FLOAT_EQ(bounds.x1, 30);
    EXPECT_FLOAT_EQ(bounds.y1, 20);
}

} // namespace
} // namespace DrawmereTest
