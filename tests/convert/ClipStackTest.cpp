#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::APPROXIMATION_CLIP;
using DrawmereConvert::APPROXIMATION_DEPTH;
using DrawmereConvert::ConvertOptions;
using DrawmereNS::SVGConfig;

TEST(ClipStack, AClipThatCutsNothingIsNotWritten) {
    const DrawnPage page({"10 10 100 50 re W n 20 20 30 30 re f", ""});
    EXPECT_EQ(page.count("clipPath"), 0);
    EXPECT_EQ(page.count("rect"), 1);
}

TEST(ClipStack, AClipThatCutsIsWritten) {
    const DrawnPage page({"10 10 100 50 re W n 20 20 30 80 re f", ""});
    EXPECT_EQ(page.count("clipPath"), 1);
    EXPECT_EQ(page.attribute("clipPath", "id"), "c0");
}

TEST(ClipStack, WhatLiesOutsideIsNotDrawn) {
    const DrawnPage page({"10 10 20 20 re W n 50 50 30 30 re f", ""});
    EXPECT_EQ(page.count("rect"), 0);
}

TEST(ClipStack, WhatLiesOutsideOfThePageIsNotDrawn) {
    const DrawnPage page({"300 50 30 30 re f", ""});
    EXPECT_EQ(page.count("rect"), 0);
}

TEST(ClipStack, RectanglesInsideEachOtherAreOneClip) {
    const DrawnPage page({"10 10 100 50 re W n 50 0 100 100 re W n 0 0 200 80 re f", ""});
    EXPECT_EQ(page.count("clipPath"), 1);
    EXPECT_EQ(page.attribute("rect", "x"), "50");
    EXPECT_EQ(page.attribute("rect", "y"), "40");
    EXPECT_EQ(page.attribute("rect", "width"), "60");
}

TEST(ClipStack, TheSameClipAgainGoesOnInTheSameContainer) {
    const std::string clipped = "q 10 10 m 60 10 l 35 40 l W n ";
    const DrawnPage page({clipped + "0 0 100 50 re f Q " + clipped + "0 0 90 50 re f Q", ""});
    EXPECT_EQ(page.count("clipPath"), 1);
    EXPECT_EQ(page.count("rect"), 2);
}

TEST(ClipStack, AClipEndsWithItsState) {
    const DrawnPage page({"q 10 10 m 60 10 l 35 40 l W n 0 0 100 50 re f Q 0 50 99 9 re f", ""});
    const std::string after = page.svg.substr(page.svg.find("width=\"99\""));
    EXPECT_EQ(page.count("clipPath"), 1);
    EXPECT_EQ(after.find("clip-path"), std::string::npos);
    EXPECT_LT(page.svg.find("</g></g>"), page.svg.find("width=\"99\""));
}

TEST(ClipStack, TheRuleOfAClipGoesThrough) {
    const std::string star = "10 10 m 90 10 l 50 80 l h 20 20 m 80 20 l 50 60 l h ";
    const std::string fill = " n 0 0 200 100 re f";
    EXPECT_EQ(DrawnPage({star + "W*" + fill, ""}).attribute("path", "clip-rule"), "evenodd");
    EXPECT_EQ(DrawnPage({star + "W" + fill, ""}).attribute("path", "clip-rule"), "nonzero");
}

TEST(ClipStack, ElementsDontNestDeeperThanAllowed) {
    std::string content;
    for (int i = 0; i < 40; ++i) {
        content += "0 0 m 199 0 l " + std::to_string(100 + i) + " 99 l W n ";
    }
    ConvertOptions options;
    options.maxDepth = 20;
    const DrawnPage page({content + "0 0 200 100 re f", ""}, options);
    EXPECT_LE(page.depth(), 20);
    EXPECT_GT(page.depth(), 10);
    EXPECT_EQ(page.countNotes(APPROXIMATION_DEPTH), 1);
}

const PageSource triangleClip = {"10 10 m 60 10 l 35 40 l W n 0 0 100 50 re f", ""};

TEST(ClipStack, BasicClipsByTheRectangleAroundAPath) {
    const DrawnPage page(triangleClip, {}, SVGConfig::SVGTYPE_BASIC);
    EXPECT_EQ(page.count("clipPath"), 1);
    EXPECT_EQ(page.attribute("rect", "x"), "10");
    EXPECT_EQ(page.attribute("rect", "width"), "50");
    EXPECT_EQ(page.countNotes(APPROXIMATION_CLIP), 1);
}

TEST(ClipStack, TinyCutsRectanglesAndNothingElse) {
    const DrawnPage page({"10 10 50 50 re W n 0 0 100 30 re f", ""}, {}, SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(page.attribute("rect", "x"), "10");
    EXPECT_EQ(page.attribute("rect", "width"), "50");
    EXPECT_EQ(page.report.countApproximations(), 0);
    const DrawnPage other({"10 10 50 50 re W n 0 0 m 99 0 l 50 99 l f", ""}, {},
                          SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(other.count("clipPath"), 0);
    EXPECT_EQ(other.count("path"), 1);
    EXPECT_EQ(other.countNotes(APPROXIMATION_CLIP), 1);
}

} // namespace
} // namespace DrawmereTest
