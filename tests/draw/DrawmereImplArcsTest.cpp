// Arcs and closing commands, which reach a path as finished texts.
#include "tests/draw/PathData.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace DrawmereTest {
namespace {

constexpr float largest = std::numeric_limits<float>::max();
constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

struct Arc {
    float rx = 10;
    float ry = 20;
    float angle = 30;
    bool largeArc = false;
    bool sweep = false;
    float x = 40;
    float y = 50;
    bool absolute = true;
};

std::string arcText(const Arc& arc, bool wispMode = false) {
    return dataOf(
        [&arc](DrawmereImpl& impl) {
            impl.ellipticalArcTo(arc.rx, arc.ry, arc.angle, arc.largeArc, arc.sweep, arc.x, arc.y,
                                 arc.absolute);
        },
        wispMode);
}

/// Returns: how x = `x` is written in the small-device mode.
std::string roundedX(float x) {
    const std::string text = arcText({.x = x}, /*wispMode=*/true);
    const std::size_t begin = text.find(" 0 0 ") + 5;
    return text.substr(begin, text.find(' ', begin) - begin);
}

TEST(DrawmereImplArcs, AClosingCommandIsRawText) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) { impl.closePath(true); }), "Z");
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) { impl.closePath(false); }), "z");
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) {
                  impl.setPathMoveTo(at(1, 2));
                  impl.closePath(true);
              }),
              "M1,2");
}

TEST(DrawmereImplArcs, AnArcIsALetterAndSevenNumbers) {
    EXPECT_EQ(arcText({}), "A10 20 30 0 0 40 50");
    EXPECT_EQ(arcText({.absolute = false}), "a10 20 30 0 0 40 50");
    EXPECT_EQ(arcText({.largeArc = true}), "A10 20 30 1 0 40 50");
    EXPECT_EQ(arcText({.sweep = true}), "A10 20 30 0 1 40 50");
    EXPECT_EQ(arcText({.rx = 0.25F, .ry = 1.23456F, .angle = -30, .x = -0.5F}),
              "A0.25 1.23456 -30 0 0 -0.5 50");
}

TEST(DrawmereImplArcs, ArcsAndCloseCommandsFollowEachOtherWithoutABlank) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) {
                  impl.ellipticalArcTo(1, 2, 0, true, false, 3, 4, true);
                  impl.ellipticalArcTo(5, 6, 0, false, true, 7, 8, false);
                  impl.closePath(false);
              }),
              "A1 2 0 1 0 3 4a5 6 0 0 1 7 8z");
}

TEST(DrawmereImplArcs, AnArcAmongSegmentsIsLost) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) {
                  impl.setPathMoveTo(at(1, 2));
                  impl.ellipticalArcTo(1, 2, 0, true, false, 3, 4, true);
                  impl.setPathLineTo(at(3, 4));
              }),
              "M1,2l2,2");
}

TEST(DrawmereImplArcs, LengthsOfAnArcUpToAThousandthOfAMillimetreAreZeroAndItsAngleIsNot) {
    EXPECT_EQ(arcText({.rx = 0.0001F}), "A0 20 30 0 0 40 50");
    EXPECT_EQ(arcText({.ry = -0.0028F}), "A10 0 30 0 0 40 50");
    EXPECT_EQ(arcText({.x = 0.0028F, .y = -0.0F}), "A10 20 30 0 0 0 0");
    EXPECT_EQ(arcText({.rx = 0.0029F, .y = -0.0029F}), "A0.0029 20 30 0 0 40 -0.0029");
    EXPECT_EQ(arcText({.angle = 0.0001F}), "A10 20 0.0001 0 0 40 50");
    constexpr float limit = MoxLength(0.001F, MoxCommonNS::MOXUNIT_MM).getRawValue();
    EXPECT_EQ(arcText({.rx = limit, .x = -limit}), "A0 20 30 0 0 0 50");
    EXPECT_NE(arcText({.rx = std::nextafter(limit, 1.0F)}), "A0 20 30 0 0 40 50");
}

TEST(DrawmereImplArcs, InTheSmallDeviceModeLengthsOfAnArcHaveOneDecimal) {
    EXPECT_EQ(arcText({.rx = 1.24F, .ry = 1.26F, .angle = 1.26F, .x = -1.26F, .y = 1.24F},
                      /*wispMode=*/true),
              "A1.2 1.3 1.26 0 0 -1.3 1.2");
    EXPECT_EQ(roundedX(-1.26F), "-1.3");
    EXPECT_EQ(roundedX(1.24F), "1.2");
    EXPECT_EQ(roundedX(0.25F), "0.3");
    EXPECT_EQ(roundedX(-0.25F), "-0.3");
    EXPECT_EQ(roundedX(0.04F), "0");
    EXPECT_EQ(roundedX(-0.04F), "0");
    EXPECT_EQ(roundedX(0.05F), "0.1");
    EXPECT_EQ(roundedX(7), "7");
}

TEST(DrawmereImplArcs, NumbersOfAnArcBeyondARangeBecomeItsEnd) {
    EXPECT_EQ(roundedX(largest), "214748368");
    EXPECT_EQ(roundedX(-largest), "-214748368");
    EXPECT_EQ(roundedX(infinite), "214748368");
    EXPECT_EQ(roundedX(undefined), "0");
}

TEST(DrawmereImplArcs, NumbersOfAnArcThatAreNotFiniteAreZero) {
    EXPECT_EQ(arcText({.rx = undefined, .ry = infinite, .angle = undefined, .x = -infinite}),
              "A0 0 0 0 0 0 50");
}

} // namespace
} // namespace DrawmereTest
