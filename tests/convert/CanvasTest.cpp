#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::APPROXIMATION_KNOCKOUT;
using testing::HasSubstr;
using testing::Not;

const std::string halfClear = "/ExtGState<</G<</ca 0.5/CA 0.5>>>>";

TEST(Canvas, AFillAndAStrokeOfOnePathAreOneElement) {
    const DrawnPage page({"1 0 0 rg 0 0 1 RG 2 w 10 10 m 60 10 l 35 40 l b", ""});
    EXPECT_EQ(page.count("path"), 1);
    EXPECT_EQ(page.attribute("path", "fill"), "red");
    EXPECT_EQ(page.attribute("path", "stroke"), "#00f");
    EXPECT_EQ(page.attribute("path", "d"), "M10,90h50l-25,-30z");
}

TEST(Canvas, AFillAndAStrokeOfTwoPathsAreTwoElements) {
    const DrawnPage page({"10 10 m 60 10 l 35 40 l f 10 10 m 60 10 l 35 41 l s", ""});
    EXPECT_EQ(page.count("path"), 2);
}

TEST(Canvas, AnUprightRectangleIsARect) {
    const DrawnPage page({"10 20 50 30 re f", ""});
    EXPECT_EQ(page.count("path"), 0);
    EXPECT_EQ(page.attribute("rect", "x"), "10");
    EXPECT_EQ(page.attribute("rect", "y"), "50");
    EXPECT_EQ(page.attribute("rect", "width"), "50");
    EXPECT_EQ(page.attribute("rect", "height"), "30");
}

TEST(Canvas, ADashedRectangleKeepsItsFirstCorner) {
    const DrawnPage page({"[3 2] 1 d 10 20 50 30 re S", ""});
    EXPECT_EQ(page.count("rect"), 0);
    EXPECT_EQ(page.attribute("path", "d"), "M10,80h50v-30h-50z");
    EXPECT_THAT(page.svg, HasSubstr("stroke-dasharray=\"3,2\""));
    EXPECT_THAT(page.svg, HasSubstr("stroke-dashoffset=\"1\""));
}

TEST(Canvas, AFillIsNotClosed) {
    const DrawnPage page({"10 10 m 60 10 l 35 40 l 10 10 l h f", ""});
    EXPECT_EQ(page.attribute("path", "d"), "M10,90h50l-25,-30");
}

TEST(Canvas, CapsJoinsAndLimitsGoThrough) {
    const DrawnPage page({"1 J 2 j 5 w 10 10 m 60 10 l 35 40 l S", ""});
    EXPECT_THAT(page.body(), HasSubstr("stroke-linecap=\"round\""));
    EXPECT_THAT(page.body(), HasSubstr("stroke-linejoin=\"bevel\""));
    EXPECT_THAT(page.body(), HasSubstr("stroke-width=\"5\""));
    const DrawnPage mitered({"7 M 10 10 m 60 10 l 35 40 l S", ""});
    EXPECT_THAT(mitered.body(), HasSubstr("stroke-miterlimit=\"7\""));
}

TEST(Canvas, BothRulesGoThrough) {
    const std::string twice = "10 10 m 90 10 l 50 80 l h 10 10 m 90 10 l 50 80 l h ";
    EXPECT_EQ(DrawnPage({twice + "f", ""}).attribute("path", "fill-rule"), "nonzero");
    EXPECT_EQ(DrawnPage({twice + "f*", ""}).attribute("path", "fill-rule"), "(none)");
}

TEST(Canvas, WhatIsOnlyFilledSaysNothingOfStrokes) {
    const DrawnPage page({"1 J 4 w 10 10 m 60 10 l S 10 50 m 60 50 l 35 80 l f", ""});
    EXPECT_THAT(page.body().substr(page.body().find("<path")), Not(HasSubstr("stroke")));
}

TEST(Canvas, APenThatBecomesAnEllipseHasItsMatrixInTheDocument) {
    const DrawnPage page({"q 4 0 0 1 0 0 cm 5 w 5 10 m 30 10 l S Q", ""});
    EXPECT_THAT(page.body(), HasSubstr("transform=\"matrix("));
    const DrawnPage plain({"q 4 0 0 4 0 0 cm 5 w 5 10 m 30 10 l S Q", ""});
    EXPECT_THAT(plain.body(), Not(HasSubstr("transform")));
    EXPECT_THAT(plain.body(), HasSubstr("stroke-width=\"20\""));
}

TEST(Canvas, AClearShapeWithAnOutlineIsKnockedOutExactly) {
    const DrawnPage page({"/G gs 1 0 0 rg 6 w 10 10 m 60 10 l 35 40 l b", halfClear});
    EXPECT_THAT(page.body(), HasSubstr(" opacity=\"0.502\""));
    EXPECT_THAT(page.body(), Not(HasSubstr("fill-opacity")));
    EXPECT_EQ(page.countNotes(APPROXIMATION_KNOCKOUT), 0);
}

TEST(Canvas, AnOutlineOfAnotherOpacityMasksTheFillUnderIt) {
    const DrawnPage page(
        {"/G gs 1 0 0 rg 6 w 10 10 m 60 10 l 35 40 l b", "/ExtGState<</G<</ca 0.5/CA 0.25>>>>"});
    EXPECT_EQ(page.count("mask"), 1);
    EXPECT_EQ(page.count("path"), 3); // the outline in the mask, the fill, the outline
    EXPECT_EQ(page.countNotes(APPROXIMATION_KNOCKOUT), 0);
}

} // namespace
} // namespace DrawmereTest
