// Where attributes stand: on the group what differs from the defaults, on an element what differs
// from its group.
#include "tests/state/DrawnState.h"

namespace DrawmereTest {
namespace {

TEST(Hoisting, ShapesOfDefaultsCarryNothingButTheirPaint) {
    SvgPage page;
    drawBox(page, 10, PAINTMODE_FILLSTROKE);
    drawBox(page, 40, PAINTMODE_NONE);
    EXPECT_GOLDEN(page, "state/defaults-say-nothing");
}

TEST(Hoisting, LineCapStandsOnTheGroupNotOnTheLine) {
    SvgPage page;
    page->setLineCap(LINECAP_ROUND);
    page->drawLine(pt(0), pt(0), pt(10), pt(10), PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "state/line-cap-on-group");
}

TEST(Hoisting, WhatTheFirstShapeHasStandsOnTheGroupInFixedOrder) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    setEverything(page);
    drawBox(page, 10);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/everything-on-group");
}

TEST(Hoisting, WhatALaterShapeHasStandsOnTheShapeInTheSameOrder) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    drawBox(page, 10);
    setEverything(page);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/everything-on-shape");
}

TEST(Hoisting, DefaultsAreWrittenOnAShapeWhoseGroupHasOthers) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    setEverything(page);
    drawBox(page, 10);
    setDefaults(page);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/defaults-against-group");
}

TEST(Hoisting, EachAttributeIsComparedByItself) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    drawBox(page, 0);
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 20);
    page->setLineJoin(LINEJOIN_BEVEL);
    page->setLineCap(LINECAP_BUTT);
    drawBox(page, 40);
    page->setMiterLimit(4.5F);
    page->setLineJoin(LINEJOIN_MITER);
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/each-attribute-by-itself");
}

TEST(Hoisting, SettingsBehindTheLastShapeDoNotReachItsGroup) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setStrokeWidth(pt(3));
    drawBox(page, 10);
    page->setStrokeWidth(pt(5));
    page->pushState();
    drawBox(page, 40);
    page->popState();
    EXPECT_GOLDEN(page, "state/settings-behind-last-shape");
}

TEST(Hoisting, AnAnchorCountsAsTheFirstElementOfItsGroup) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setInternalLinkAnchor(u"here", 0, 20);
    page->setStrokeWidth(pt(3));
    drawBox(page, 10);
    EXPECT_GOLDEN(page, "state/anchor-opens-group");
}

TEST(Hoisting, PaintAndFillRuleStandOnShapesAndNeverOnTheGroup) {
    SvgPage page;
    page->setFillColor(MoxColor(255, 0, 0));
    page->setFillRule(FILLRULE_NONZERO);
    page->setStrokeColor(MoxColor(0, 0, 255));
    drawBox(page, 0, PAINTMODE_FILLSTROKE);
    drawBox(page, 20, PAINTMODE_FILL);
    drawBox(page, 40, PAINTMODE_STROKE);
    page->setFillRule(FILLRULE_EVENODD);
    page->setFillColor(MoxColor());
    drawBox(page, 60, PAINTMODE_FILL);
    page->setFillColorId(u"lg1");
    page->setStrokeColorName(u"currentColor");
    drawBox(page, 80, PAINTMODE_FILLSTROKE);
    EXPECT_GOLDEN(page, "state/paint-on-shapes");
}

TEST(Hoisting, StrokeWidthNeedsAStrokeWhereItIsWritten) {
    SvgPage page;
    page->setStrokeWidth(pt(3));
    drawBox(page, 10);
    page->setStrokeColor(MoxColor());
    drawBox(page, 40); // agrees with the group, which has not written the width
    EXPECT_GOLDEN(page, "state/stroke-width-lost-without-stroke");
}

TEST(Hoisting, StrokeWidthOfALaterShapeNeedsAStrokeToo) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    drawBox(page, 10);
    page->setStrokeColorName(u"none");
    page->setStrokeWidth(pt(3));
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/stroke-width-needs-stroke");
}

TEST(Hoisting, StrokeWidthIsComparedWithTheGroupNotWithTheDefault) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setStrokeWidth(pt(3));
    drawBox(page, 10);
    page->setStrokeWidth(pt(1));
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/stroke-width-against-group");
}

TEST(Hoisting, AWidthOfZeroIsWrittenAsAHairline) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setStrokeWidth(pt(0));
    drawBox(page, 10);
    EXPECT_GOLDEN(page, "state/stroke-width-zero");
}

TEST(Hoisting, UnstatedLineCapsAndJoinsAreWrittenOutAndUnlistedOnesAreNot) {
    SvgPage page;
    drawBox(page, 0);
    for (const int number : {-1, 0, 1, 2, 3, -2}) {
        page->setLineCap(static_cast<LINECAP>(number));
        drawBox(page, static_cast<float>(number));
    }
    page->setLineCap(LINECAP_BUTT);
    for (const int number : {-1, 0, 1, 2, 3, -2}) {
        page->setLineJoin(static_cast<LINEJOIN>(number));
        drawBox(page, static_cast<float>(number));
    }
    EXPECT_GOLDEN(page, "state/caps-and-joins-by-number");
}

TEST(Hoisting, AnOddDashPatternIsWrittenTwiceAndAnEmptiedOneAsNone) {
    SvgPage page;
    setDashes(page, {3, 2});
    drawBox(page, 0);
    setDashes(page, {3, 2, 1});
    drawBox(page, 20);
    setDashes(page, {3});
    drawBox(page, 40);
    setDashes(page, {});
    drawBox(page, 60);
    setDashes(page, {3, 2});
    drawBox(page, 80);
    EXPECT_GOLDEN(page, "state/dash-patterns");
}

TEST(Hoisting, ADashOffsetIsWrittenWithoutAPatternToo) {
    SvgPage page;
    setDashes(page, {}, 2.5F);
    drawBox(page, 10);
    setDashes(page, {}, 4);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/dash-offset-alone");
}

TEST(Hoisting, OpacitiesAreWrittenWhereTheyDiffer) {
    SvgPage page;
    page->setOpacity(0.5F, OPACITYDEST_ELEMENT);
    drawBox(page, 0);
    page->setOpacity(1, OPACITYDEST_ELEMENT);
    drawBox(page, 20);
    page->setOpacity(0.5F, OPACITYDEST_ELEMENT);
    page->setOpacity(0.5F, OPACITYDEST_STROKE);
    drawBox(page, 40);
    page->setOpacity(0.5F, OPACITYDEST_FILL);
    page->setOpacity(1, OPACITYDEST_STROKE);
    drawBox(page, 60);
    page->setOpacity(0.125F, static_cast<OPACITYDEST>(3)); // an unlisted destination sets nothing
    drawBox(page, 80);
    EXPECT_GOLDEN(page, "state/opacities");
}

TEST(Hoisting, AColourBringsItsOpacityAndAnOpaqueOneTakesItBack) {
    SvgPage page;
    page->setOpacity(0.25F, OPACITYDEST_FILL); // the colour that follows resets it
    page->setFillColor(MoxColor(255, 0, 0));
    drawBox(page, 0, PAINTMODE_FILL);
    page->setFillColor(MoxColor(255, 0, 0, 51));
    page->setStrokeColor(MoxColor(0, 0, 255, 102));
    drawBox(page, 20, PAINTMODE_FILLSTROKE);
    page->setFillColor(MoxColor(255, 0, 0));
    page->setStrokeColor(MoxColor(0, 0, 255));
    drawBox(page, 40, PAINTMODE_FILLSTROKE);
    EXPECT_GOLDEN(page, "state/colour-opacity");
}

TEST(Hoisting, AMaskIsTakenOffByNone) {
    SvgPage page;
    page->setMaskReference(u"m1");
    drawBox(page, 0);
    page->setMaskReference(u"none");
    drawBox(page, 20);
    page->pushState();
    drawBox(page, 40);
    page->popState();
    EXPECT_GOLDEN(page, "state/masks");
}

TEST(Hoisting, SettingsOfTextShowOnNoShape) {
    SvgPage page;
    SVGFont font;
    font.setFontAttribute(u"Serif", pt(12), FONTWEIGHT_BOLD, FSTYLE_ITALIC, UnicodeString(), false);
    page->setFont(&font, nullptr);
    page->setTextAnchor(TEXTANCHOR_END);
    page->setTextDecoration(TEXTDECORATION_UNDERLINE);
    page->setLetterSpacing(pt(2));
    page->setWordSpacing(pt(2));
    page->setWritingMode(MoxName(MoxCommonNS::MOXNAME_TB_RL));
    page->setClipRuleAttrVal(CLIPRULE_NONZERO);
    drawBox(page, 10);
    EXPECT_GOLDEN(page, "state/text-settings-not-on-shapes");
    EXPECT_EQ(page.rootTag().find("Serif"), std::string::npos);
}

class HoistingByProfile : public testing::TestWithParam<SVGConfig::SVGTYPE> {};

/// The profiles whose graphic state is not that of Tiny.
INSTANTIATE_TEST_SUITE_P(WithOpacity, HoistingByProfile,
                         testing::Values(SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC,
                                         SVGConfig::SVGTYPE_WISP, SVGConfig::SVGTYPE_PLAZMIC));

TEST_P(HoistingByProfile, WritesOpacityAndMask) {
    SvgPage page(GetParam());
    page->setStrokeColor(MoxColor());
    setEverything(page);
    drawBox(page, 10);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/everything-on-group");
}

TEST(Hoisting, TinyHasNeitherOpacityNorMaskAndAllElse) {
    SvgPage page(SVGConfig::SVGTYPE_TINY);
    page->setStrokeColor(MoxColor());
    setEverything(page);
    drawBox(page, 10);
    setDefaults(page);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/tiny-without-opacity");
}

TEST(Hoisting, TinyHasNoPaintReferenceForAFillAndOneForAStroke) {
    SvgPage page(SVGConfig::SVGTYPE_TINY);
    page->setFillColorId(u"lg1");
    page->setStrokeColorId(u"lg1");
    drawBox(page, 10, PAINTMODE_FILLSTROKE);
    EXPECT_GOLDEN(page, "state/tiny-paint-references");
}

} // namespace
} // namespace DrawmereTest
