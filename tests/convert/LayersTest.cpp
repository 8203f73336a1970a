#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::APPROXIMATION_BLEND;
using DrawmereConvert::APPROXIMATION_MASK;
using DrawmereConvert::APPROXIMATION_MIXTURE;
using DrawmereConvert::APPROXIMATION_OVERPRINT;
using DrawmereConvert::APPROXIMATION_PATTERN;
using DrawmereNS::SVGConfig;
using testing::HasSubstr;
using testing::Not;

constexpr const char* form = "/Type/XObject/Subtype/Form/BBox[0 0 200 100]"
                             "/Group<</S/Transparency/CS/DeviceGray>>";

/// A page that draws the group `content` at half opacity.
PageSource makeGroup(const std::string& content) {
    return {"/G gs /F Do", "/ExtGState<</G<</ca 0.5>>>>/XObject<</F 5 0 R>>", {{form, content}}};
}

/// A page that draws `content` through the mask `mask`.
PageSource makeMasked(const std::string& mask, const std::string& content,
                      const std::string& kind = "Luminosity", const std::string& states = "") {
    return {"/G gs " + content,
            "/ExtGState<</G<</SMask<</S/" + kind + "/G 5 0 R>>>>" + states + ">>",
            {{form, mask}}};
}

TEST(Layers, AGroupOfOneObjectGivesItItsOpacity) {
    const DrawnPage page(makeGroup("10 10 m 60 10 l 35 40 l f"));
    EXPECT_EQ(page.count("pattern"), 0);
    EXPECT_THAT(page.body(), HasSubstr(" opacity=\"0.5\""));
}

TEST(Layers, ObjectsThatDontOverlapHaveTheOpacityOneByOne) {
    const DrawnPage page(makeGroup("10 10 20 20 re f 50 10 20 20 re f"));
    EXPECT_EQ(page.count("pattern"), 0);
    EXPECT_EQ(page.count("rect"), 2);
}

TEST(Layers, ObjectsThatOverlapBecomeAPatternThatHasTheOpacity) {
    const DrawnPage page(makeGroup("1 0 0 rg 10 10 20 20 re f 0 0 1 rg 20 10 20 20 re f"));
    EXPECT_EQ(page.count("pattern"), 1);
    EXPECT_EQ(page.count("rect"), 3);
    EXPECT_THAT(page.svg.substr(page.svg.find("</defs>")), HasSubstr(" opacity=\"0.5\""));
    EXPECT_THAT(page.svg.substr(0, page.svg.find("</defs>")), Not(HasSubstr("opacity")));
}

TEST(Layers, ALuminosityMaskIsGrey) {
    const DrawnPage page(makeMasked("1 0 0 rg 0 0 200 100 re f", "10 10 50 50 re f"));
    EXPECT_EQ(page.count("mask"), 1);
    EXPECT_EQ(page.attribute("rect", "fill"), "#4d4d4d"); // the brightness of red
    EXPECT_THAT(page.svg.substr(page.svg.find("</defs>")), HasSubstr("mask=\"url(#i0)\""));
}

TEST(Layers, AnAlphaMaskIsWhite) {
    const DrawnPage page(makeMasked("1 0 0 rg 0 0 99 99 re f", "10 10 50 50 re f", "Alpha"));
    EXPECT_EQ(page.attribute("rect", "fill"), "#fff");
}

TEST(Layers, AMaskedGroupIsMaskedTogether) {
    PageSource source = makeMasked("0.5 g 0 0 200 100 re f", "/X Do");
    source.resources += "/XObject<</X 6 0 R>>";
    source.objects.emplace_back(form, "10 10 50 50 re f 1 0 0 rg 30 30 50 50 re f");
    const DrawnPage page(source);
    EXPECT_EQ(page.count("mask"), 1);
    EXPECT_EQ(page.count("pattern"), 1);
    EXPECT_THAT(page.svg.substr(page.svg.find("</defs>")), HasSubstr("fill=\"url(#t0)\""));
}

TEST(Layers, ATilingPatternIsAPattern) {
    const DrawnPage page(
        {"/Pattern cs /P scn 10 10 m 90 10 l 50 80 l f",
         "/Pattern<</P 5 0 R>>",
         {{"/PatternType 1/PaintType 1/TilingType 1/BBox[0 0 10 10]/XStep 10/YStep 10/Resources<<>>",
           "1 0 0 rg 0 0 5 5 re f"}}});
    EXPECT_EQ(page.count("pattern"), 1);
    EXPECT_EQ(page.attribute("pattern", "width"), "10");
    EXPECT_EQ(page.attribute("path", "fill"), "url(#t0)");
    EXPECT_EQ(page.count("clipPath"), 0);
    EXPECT_EQ(page.report.countApproximations(), 0);
}

TEST(Layers, WithoutPatternsAndMasksWhatTheyPaintIsLeftOutAndCounted) {
    const DrawnPage tiled(
        {"/Pattern cs /P scn 10 10 80 80 re f",
         "/Pattern<</P 5 0 R>>",
         {{"/PatternType 1/PaintType 1/TilingType 1/BBox[0 0 9 9]/XStep 9/YStep 9/Resources<<>>",
           "1 0 0 rg 0 0 5 5 re f"}}},
        {}, SVGConfig::SVGTYPE_PLAZMIC);
    EXPECT_EQ(tiled.count("rect"), 0);
    EXPECT_EQ(tiled.countNotes(APPROXIMATION_PATTERN), 1);
    const DrawnPage masked(makeMasked("0 0 99 99 re f", "10 10 50 50 re f"), {},
                           SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(masked.count("rect"), 1);
    EXPECT_EQ(masked.countNotes(APPROXIMATION_MASK), 1);
}

TEST(Layers, APatternWhoseCellsOverlapIsCounted) {
    const DrawnPage page(
        {"/Pattern cs /P scn 10 10 80 80 re f",
         "/Pattern<</P 5 0 R>>",
         {{"/PatternType 1/PaintType 1/TilingType 1/BBox[0 0 20 20]/XStep 10/YStep 10/Resources<<>>",
           "1 0 0 rg 0 0 15 15 re f"}}});
    EXPECT_EQ(page.countNotes(APPROXIMATION_PATTERN), 1);
}

TEST(Layers, AMaskEndsWithWhatItMasks) {
    const DrawnPage page(makeMasked("0.5 g 0 0 200 100 re f",
                                    "10 10 50 50 re f /N gs 30 30 50 50 re f", "Luminosity",
                                    "/N<</SMask/None>>"));
    EXPECT_THAT(page.svg, HasSubstr("mask=\"url(#i0)\"><rect x=\"10\" y=\"40\" width=\"50\" "
                                    "height=\"50\"/></g>"));
    EXPECT_EQ(page.count("rect"), 3);
}

TEST(Layers, AMaskStaysWhereItIsWhenWhatItMasksHasAMatrix) {
    const DrawnPage page(makeMasked("0.5 g 0 0 200 100 re f", "1 0 0 4 0 0 cm 5 w 5 2 m 60 9 l S"));
    EXPECT_EQ(page.count("pattern"), 1);
    const std::string body = page.svg.substr(page.svg.rfind("</defs>"));
    EXPECT_THAT(body, HasSubstr("mask=\"url(#i0)\""));
    EXPECT_THAT(body, Not(HasSubstr("matrix(")));
}

/// A page that fills `backdrop`, and over it a green square with a blend mode.
PageSource makeBlended(const std::string& mode, const std::string& backdrop) {
    return {backdrop + " /G gs 0 1 0 rg 10 10 50 50 re f", "/ExtGState<</G<</BM/" + mode + ">>>>"};
}

TEST(Layers, AMixtureOfColoursIsAPicture) {
    const DrawnPage page(makeBlended("Multiply", "1 0 0 rg 30 30 100 50 re f"));
    EXPECT_EQ(page.count("image"), 1);
    EXPECT_EQ(page.count("rect"), 1);
    EXPECT_EQ(page.countNotes(APPROXIMATION_MIXTURE), 1);
    EXPECT_EQ(page.report.countApproximations(), 1);
}

TEST(Layers, ABlendModeWithoutEffectIsLeftOut) {
    const DrawnPage page(makeBlended("Multiply", "0 0 1 rg 70 70 20 20 re f"));
    EXPECT_EQ(page.count("image"), 0);
    EXPECT_EQ(page.count("rect"), 2);
    EXPECT_EQ(page.report.countApproximations(), 0);
}

TEST(Layers, WhatComesBehindAPictureIsDrawnAgain) {
    PageSource source = makeBlended("Difference", "1 0 0 rg 30 30 100 50 re f");
    source.content += " /N gs 0 0 1 rg 1 1 5 5 re f";
    source.resources = "/ExtGState<</G<</BM/Difference>>/N<</BM/Normal>>>>";
    EXPECT_EQ(DrawnPage(source).count("rect"), 2);
}

TEST(Layers, TextInAPictureCanBeSearchedFor) {
    PageSource source = makeBlended("Multiply", "1 0 0 rg 30 30 100 50 re f");
    source.content += " BT /T 20 Tf 40 40 Td (Hello) Tj ET";
    source.resources += "/Font<</T<</Type/Font/Subtype/Type1/BaseFont/Helvetica>>>>";
    const DrawnPage page(source, withText(DrawmereConvert::TEXTMODE_PLAIN));
    EXPECT_EQ(page.countNotes(APPROXIMATION_MIXTURE), 2);
    EXPECT_THAT(page.body(), HasSubstr("Hello"));
    EXPECT_THAT(page.body(), HasSubstr("fill=\"none\""));
}

TEST(Layers, BlendModesInAPatternAreCounted) {
    const DrawnPage page({"/Pattern cs /P scn 10 10 80 80 re f",
                          "/Pattern<</P 5 0 R>>",
                          {{"/PatternType 1/PaintType 1/TilingType 1/BBox[0 0 9 9]/XStep 9/YStep 9"
                            "/Resources<</ExtGState<</G<</BM/Multiply>>>>>>",
                            "/G gs 1 0 0 rg 0 0 5 5 re f"}}});
    EXPECT_EQ(page.countNotes(APPROXIMATION_BLEND), 1);
    EXPECT_EQ(page.count("image"), 0);
}

TEST(Layers, OverprintIsCountedOnceAPage) {
    const DrawnPage page({"/O gs 9 9 9 9 re f 29 9 9 9 re f", "/ExtGState<</O<</OP true>>>>"});
    EXPECT_EQ(page.countNotes(APPROXIMATION_OVERPRINT), 1);
    EXPECT_EQ(page.report.countApproximations(), 1);
}

TEST(Layers, TextClipsWhatComesAfterIt) {
    const DrawnPage page(Conversion::document("TextClippingModeChanges.pdf"), 0);
    EXPECT_GT(page.count("clipPath"), 0);
}

TEST(Layers, StrokedTextThatAShadingShowsThroughHasAGradientForItsPen) {
    const std::string text = "BT /F 40 Tf 1 Tr 6 w /Pattern CS /P SCN 10 30 Td (Hello) Tj ET";
    const DrawnPage page({text, "/Font<</F<</Type/Font/Subtype/Type1/BaseFont/Helvetica>>>>"
                                "/Pattern<</P<</PatternType 2/Shading<</ShadingType 2"
                                "/ColorSpace/DeviceRGB/Coords[0 0 200 0]/Function<</FunctionType 2"
                                "/Domain[0 1]/C0[1 0 0]/C1[0 0 1]/N 1>>>>>>>>"});
    EXPECT_EQ(page.count("linearGradient"), 1);
    EXPECT_EQ(page.count("path"), 1);
    EXPECT_EQ(page.attribute("path", "stroke"),
              "url(#" + page.attribute("linearGradient", "id") + ")");
    EXPECT_EQ(page.attribute("path", "fill"), "none");
    EXPECT_THAT(page.svg, HasSubstr("stroke-width=\"6\""));
}

TEST(Layers, AMaskWithABackdropCoversWhatItsContentLeavesOut) {
    const DrawnPage page(Conversion::document("issue7891_bc1.pdf"), 0);
    EXPECT_EQ(page.count("mask"), 1);
}

} // namespace
} // namespace DrawmereTest
