#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::APPROXIMATION_SHADING;
using testing::HasSubstr;

std::string makeShading(const std::string& kind, const std::string& entries) {
    return "/Shading<</S<</ShadingType " + kind + "/ColorSpace/DeviceRGB" + entries +
           "/Function<</FunctionType 2/Domain[0 1]/C0[1 0 0]/C1[0 0 1]/N 1>>>>>>";
}

TEST(ShadingWriter, ALinearShadingHasTheStopsOfItsEnds) {
    const DrawnPage page({"/S sh", makeShading("2", "/Coords[0 0 200 0]/Extend[true true]")});
    EXPECT_EQ(page.count("linearGradient"), 1);
    EXPECT_EQ(page.count("stop"), 2);
    EXPECT_EQ(page.attribute("linearGradient", "x2"), "200");
    EXPECT_EQ(page.attribute("linearGradient", "gradientTransform"), "(none)");
    EXPECT_EQ(page.attribute("rect", "fill"), "url(#g0)");
    EXPECT_EQ(page.report.countApproximations(), 0);
}

TEST(ShadingWriter, AShadingFillsTheShapeOfItsClip) {
    const DrawnPage page({"10 10 m 60 10 l 35 40 l W n /S sh",
                          makeShading("2", "/Coords[0 0 200 0]/Extend[true true]")});
    EXPECT_EQ(page.count("clipPath"), 0);
    EXPECT_EQ(page.attribute("path", "fill"), "url(#g0)");
    EXPECT_EQ(page.attribute("path", "d"), "M10,90h50l-25,-30");
}

TEST(ShadingWriter, WhereAShadingEndsNothingShows) {
    const DrawnPage page({"/S sh", makeShading("2", "/Coords[50 0 150 0]/Extend[false true]")});
    EXPECT_EQ(page.count("stop"), 3);
    EXPECT_EQ(page.attribute("stop", "stop-opacity"), "0");
}

TEST(ShadingWriter, TheSameShadingIsDefinedOnce) {
    const DrawnPage page({"q 0 0 20 20 re W n /S sh Q q 30 0 20 20 re W n /S sh Q",
                          makeShading("2", "/Coords[0 0 200 0]/Extend[true true]")});
    EXPECT_EQ(page.count("linearGradient"), 1);
    EXPECT_EQ(page.count("rect"), 2);
}

TEST(ShadingWriter, CirclesInsideEachOtherAreARadialGradient) {
    const DrawnPage page(
        {"/S sh", makeShading("3", "/Coords[100 50 10 100 50 40]/Extend[true true]")});
    EXPECT_EQ(page.attribute("radialGradient", "r"), "40");
    EXPECT_EQ(page.attribute("radialGradient", "cx"), "100");
    EXPECT_EQ(page.attribute("radialGradient", "fx"), "100");
    EXPECT_EQ(page.attribute("stop", "offset"), "0.25"); // the inner circle's share of the outer
}

TEST(ShadingWriter, CirclesBesideEachOtherAreAnImage) {
    const DrawnPage page(
        {"/S sh", makeShading("3", "/Coords[50 50 10 150 50 20]/Extend[false false]")});
    EXPECT_EQ(page.count("radialGradient"), 0);
    EXPECT_EQ(page.count("image"), 1);
    EXPECT_EQ(page.countNotes(APPROXIMATION_SHADING), 1);
}

TEST(ShadingWriter, AMeshIsAnImageOfTheChosenResolution) {
    DrawmereConvert::ConvertOptions options;
    const std::string path = Conversion::document("coons-allflags-withfunction.pdf");
    options.shadeDpi = 36;
    const DrawnPage coarse(path, 0, options);
    options.shadeDpi = 144;
    const DrawnPage fine(path, 0, options);
    EXPECT_EQ(coarse.count("image"), 1);
    EXPECT_GT(fine.svg.size(), 2 * coarse.svg.size());
    EXPECT_EQ(fine.countNotes(APPROXIMATION_SHADING), 1);
}

TEST(ShadingWriter, WithoutGradientsAShadingHasTheColourBetweenItsEnds) {
    const DrawnPage page({"/S sh", makeShading("2", "/Coords[0 0 200 0]/Extend[true true]")}, {},
                         DrawmereNS::SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(page.attribute("rect", "fill"), "#7f007f");
    EXPECT_EQ(page.countNotes(DrawmereConvert::APPROXIMATION_GRADIENT), 1);
}

TEST(ShadingWriter, AStrokeWithAShadingIsStrokedWithIt) {
    const DrawnPage page(
        {"/Pattern CS /P SCN 5 w 10 10 m 60 10 l 35 40 l S",
         "/Pattern<</P<</PatternType 2/Shading<</ShadingType 2/ColorSpace/DeviceRGB"
         "/Coords[0 0 200 0]/Extend[true true]"
         "/Function<</FunctionType 2/Domain[0 1]/C0[1 0 0]/C1[0 0 1]/N 1>>>>>>>>"});
    EXPECT_EQ(page.attribute("path", "stroke"), "url(#g0)");
    EXPECT_EQ(page.count("mask"), 0);
}

} // namespace
} // namespace DrawmereTest
