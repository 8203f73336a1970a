#include "state/SVGGraphicContext.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

#include <limits>

using namespace DrawmereNS;

namespace {

constexpr float nan = std::numeric_limits<float>::quiet_NaN();

SVGFont makeFont(const char16_t* name, float size) {
    SVGFont font;
    font.setFontAttribute(name, pt(size), 0, FSTYLE_NORMAL, u"", false);
    return font;
}

/// Sets everything that the stroke block writes.
void setAllOfStroke(SVGGraphicContext& state) {
    const MoxLength dashes[] = {pt(3), pt(2)};
    state.setDashLine(dashes, 2, pt(5));
    state.setOpacity(0.5F, OPACITYDEST_FILL);
    state.setOpacity(0.25F, OPACITYDEST_STROKE);
    state.setMiterLimit(7);
    state.setStrokeColorName(u"red");
    state.setStrokeWidth(pt(3));
    state.setLineJoin(LINEJOIN_BEVEL);
    state.setLineCap(LINECAP_ROUND);
}

const char* const allOfStroke =
    "stroke-linecap=round stroke-linejoin=bevel stroke-width=3 stroke-miterlimit=7 "
    "stroke-opacity=0.25 stroke-dashoffset=5 stroke-dasharray=3,2 fill-opacity=0.5";

const char* const allOfStrokeInTiny =
    "stroke-linecap=round stroke-linejoin=bevel stroke-width=3 stroke-miterlimit=7 "
    "stroke-dashoffset=5 stroke-dasharray=3,2";

/// Sets everything else that a shape writes.
void setAllOfTail(SVGGraphicContext& state) {
    state.setMaskReference(u"m1");
    state.setOpacity(0.75F, OPACITYDEST_ELEMENT);
}

/// Sets everything that the text block writes, fonts aside.
void setAllOfText(SVGGraphicContext& state) {
    state.setLetterSpacing(pt(1));
    state.setWordSpacing(pt(2));
    state.setWritingMode(MoxCommonNS::MOXNAME_TB);
    state.setTextAnchor(TEXTANCHOR_END);
    state.setTextDecoration(TEXTDECORATION_UNDERLINE);
}

std::string familyOfRoot(const StatePage& page) {
    return utf8(page.root()->getAttribute(SVGName(SVGName::font_family)).toString());
}

TEST(SVGGraphicContextCompare, DefaultsAreWrittenNowhere) {
    StatePage page;
    SVGElement* rect = page.drawRect();
    EXPECT_EQ(attributesOf(rect), "");
    EXPECT_EQ(attributesOf(page.close()), "");
}

TEST(SVGGraphicContextCompare, AGroupTakesWhatDiffersFromTheDefaultsInThisOrder) {
    StatePage page;
    setAllOfTail(page.state());
    setAllOfStroke(page.state());
    SVGElement* rect = page.drawRect();
    EXPECT_EQ(attributesOf(rect), "");
    EXPECT_EQ(attributesOf(page.close()), std::string(allOfStroke) + " mask=url(#m1) opacity=0.75");
}

TEST(SVGGraphicContextCompare, AnElementTakesWhatDiffersFromItsGroupInThisOrder) {
    StatePage page;
    page.drawRect();
    setAllOfTail(page.state());
    setAllOfStroke(page.state());
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    EXPECT_EQ(attributesOf(page.drawRect()), "transform=translate(5,6) " +
                                                 std::string(allOfStroke) +
                                                 " mask=url(#m1) opacity=0.75");
    EXPECT_EQ(attributesOf(page.close()), "");
}

TEST(SVGGraphicContextCompare, TinyLeavesOutOpacitiesAndMasks) {
    StatePage page(SVGConfig::SVGTYPE_TINY);
    page.drawRect();
    setAllOfTail(page.state());
    setAllOfStroke(page.state());
    EXPECT_EQ(attributesOf(page.drawRect()), allOfStrokeInTiny);
    page.close();
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), allOfStrokeInTiny);
}

TEST(SVGGraphicContextCompare, BasicWritesWhatFullWrites) {
    StatePage page(SVGConfig::SVGTYPE_BASIC);
    setAllOfTail(page.state());
    setAllOfStroke(page.state());
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), std::string(allOfStroke) + " mask=url(#m1) opacity=0.75");
}

TEST(SVGGraphicContextCompare, AnImageTakesTransformMaskAndOpacityOnly) {
    StatePage page;
    page.drawImage();
    setAllOfTail(page.state());
    setAllOfStroke(page.state());
    setAllOfText(page.state());
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    EXPECT_EQ(attributesOf(page.drawImage()),
              "transform=translate(5,6) mask=url(#m1) opacity=0.75");
    page.close();
    page.drawImage();
    EXPECT_EQ(attributesOf(page.close()), "transform=translate(5,6) mask=url(#m1) opacity=0.75");
}

TEST(SVGGraphicContextCompare, ShapesTakeNothingOfTexts) {
    StatePage page;
    page.drawRect();
    setAllOfText(page.state());
    page.state().setFont(makeFont(u"Serif", 12));
    EXPECT_EQ(attributesOf(page.drawRect()), "");
    page.close();
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "");
}

TEST(SVGGraphicContextCompare, ALaterDefaultIsWrittenAgainstTheGroup) {
    StatePage page;
    page.state().setStrokeColorName(u"red");
    page.state().setStrokeWidth(pt(3));
    SVGElement* first = page.drawRect();
    page.state().setStrokeWidth(pt(1));
    SVGElement* second = page.drawRect();
    EXPECT_EQ(attributesOf(first), "");
    EXPECT_EQ(attributesOf(second), "stroke-width=1");
    EXPECT_EQ(attributesOf(page.close()), "stroke-width=3");
}

TEST(SVGGraphicContextCompare, AWidthFirstMetWithoutAStrokeStandsNowhere) {
    StatePage page;
    page.state().setStrokeWidth(pt(3));
    SVGElement* first = page.drawRect();
    page.state().setStrokeColorName(u"red");
    SVGElement* second = page.drawRect();
    EXPECT_EQ(attributesOf(first), "");
    EXPECT_EQ(attributesOf(second), "");
    EXPECT_EQ(attributesOf(page.close()), "");
}

TEST(SVGGraphicContextCompare, AGroupHasTheAttributesOfItsFirstElement) {
    StatePage page;
    page.state().setMiterLimit(7);
    page.drawRect();
    page.state().setMiterLimit(9);
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "stroke-miterlimit=7");
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "stroke-miterlimit=9");
}

TEST(SVGGraphicContextCompare, DashesTakenOffInADashedGroupAreNone) {
    StatePage page;
    const MoxLength dashes[] = {pt(3), pt(2)};
    page.state().setDashLine(dashes, 2, pt(0));
    page.drawRect();
    page.state().setDashLine(dashes, 1, pt(0));
    EXPECT_EQ(attributesOf(page.drawRect()), "stroke-dasharray=3,3");
    page.state().setDashLine(dashes, 0, pt(0));
    EXPECT_EQ(attributesOf(page.drawRect()), "stroke-dasharray=none");
    EXPECT_EQ(attributesOf(page.close()), "stroke-dasharray=3,2");
}

TEST(SVGGraphicContextCompare, OneOtherDashMakesAnotherPattern) {
    StatePage page;
    const MoxLength dashes[] = {pt(3), pt(2)};
    const MoxLength others[] = {pt(3), pt(1)};
    page.state().setDashLine(dashes, 2, pt(0));
    page.drawRect();
    page.state().setDashLine(others, 2, pt(0));
    EXPECT_EQ(attributesOf(page.drawRect()), "stroke-dasharray=3,1");
}

TEST(SVGGraphicContextCompare, NaNsDifferFromEverything) {
    StatePage page;
    const MoxLength dashes[] = {pt(nan), pt(2)};
    page.state().setStrokeColorName(u"red");
    page.state().setStrokeWidth(pt(nan));
    page.state().setMiterLimit(nan);
    page.state().setOpacity(nan, OPACITYDEST_ELEMENT);
    page.state().setDashLine(dashes, 2, pt(nan));
    EXPECT_EQ(attributesOf(page.drawRect()),
              "stroke-width=0 stroke-miterlimit=0 stroke-dashoffset=0 stroke-dasharray=0,2 "
              "opacity=0");
}

TEST(SVGGraphicContextCompare, TheTextBlockOfATextHasThisOrder) {
    StatePage page;
    const MoxPtr<SVGElement> text = page.make(SVGName::text);
    setAllOfText(page.state());
    setAllOfTail(page.state());
    page.state().setLineCap(LINECAP_ROUND);
    page.state().AttrValueCompare(text.get(), /*isGroup=*/false, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(text.get()),
              "stroke-linecap=round word-spacing=2 writing-mode=tb text-anchor=end "
              "text-decoration=underline mask=url(#m1) opacity=0.75");
}

TEST(SVGGraphicContextCompare, TinyTextsTakeTheAnchorOnly) {
    StatePage page(SVGConfig::SVGTYPE_TINY);
    const MoxPtr<SVGElement> text = page.make(SVGName::text);
    setAllOfText(page.state());
    setAllOfTail(page.state());
    page.state().AttrValueCompare(text.get(), /*isGroup=*/false, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(text.get()), "text-anchor=end");
}

TEST(SVGGraphicContextCompare, EachTextCarriesItsWordSpacingAndDecoration) {
    StatePage page;
    setAllOfText(page.state());
    SVGElement* text = page.drawText();
    EXPECT_EQ(attributesOf(text), "word-spacing=2 text-decoration=underline");
    EXPECT_EQ(attributesOf(page.close()), "font-size=medium font-weight=400 writing-mode=tb "
                                          "text-anchor=end");
}

TEST(SVGGraphicContextCompare, AShapeAmongTextsTakesItsStrokeAndStops) {
    StatePage page;
    const MoxPtr<SVGElement> rect = page.make(SVGName::rect);
    setAllOfStroke(page.state());
    setAllOfTail(page.state());
    page.state().AttrValueCompare(rect.get(), /*isGroup=*/false, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(rect.get()), allOfStroke);
}

TEST(SVGGraphicContextCompare, UnlistedKindsTakeTheTailWhereTextsAndGroupsDo) {
    StatePage page;
    setAllOfStroke(page.state());
    setAllOfTail(page.state());
    const auto writtenOn = [&page](SVGName name, int kind) {
        const MoxPtr<SVGElement> element = page.make(name);
        page.state().AttrValueCompare(element.get(), false, static_cast<ELEMENTTYPE>(kind));
        return attributesOf(element.get());
    };
    EXPECT_EQ(writtenOn(SVGName::rect, 3), "");
    EXPECT_EQ(writtenOn(SVGName::g, 3), "mask=url(#m1) opacity=0.75");
    EXPECT_EQ(writtenOn(SVGName::text, 3), "mask=url(#m1) opacity=0.75");
    EXPECT_EQ(writtenOn(SVGName::rect, -1), "mask=url(#m1) opacity=0.75");
}

TEST(SVGGraphicContextCompare, ContentOfAClipDefinitionIsComparedAsTextIs) {
    StatePage page;
    page.manager.push(ELEMENT_TYPE_CLIP);
    page.tree.push(ELEMENT_TYPE_CLIP, &page.state());
    setAllOfStroke(page.state());
    setAllOfTail(page.state());
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    page.tree.addElement(page.make(SVGName::clipPath).get(), /*makeCurrent=*/true);
    const MoxPtr<SVGElement> rect = page.make(SVGName::rect);
    page.tree.addElement(rect.get(), /*makeCurrent=*/false);
    EXPECT_EQ(attributesOf(rect.get()), "transform=translate(5,6) " + std::string(allOfStroke));
}

TEST(SVGGraphicContextCompare, TheFirstFamilyGoesToTheRoot) {
    StatePage page;
    page.state().setFont(makeFont(u"Serif", 12));
    SVGElement* text = page.drawText();
    EXPECT_EQ(attributesOf(text), "");
    EXPECT_EQ(attributesOf(page.close()), "font-size=12");
    EXPECT_EQ(familyOfRoot(page), "Serif");
    page.state().setFont(makeFont(u"Sans", 12));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-family=Sans font-size=12");
    page.state().setFont(makeFont(u"Serif", 10));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-size=10");
    page.state().setFont(makeFont(u"Serif\u00E9", 10));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-family=Serif\u00E9 font-size=10");
    EXPECT_EQ(familyOfRoot(page), "Serif");
}

TEST(SVGGraphicContextCompare, AFamilyOnTheRootMayBeAName) {
    StatePage page;
    page.root()->setAttribute(SVGName(SVGName::font_family), MoxValue(MoxName(u"Serif")));
    page.state().setFont(makeFont(u"Serif", 12));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-size=12");
    page.state().setFont(makeFont(u"Sans", 12));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-family=Sans font-size=12");
}

TEST(SVGGraphicContextCompare, AFamilyOnTheRootThatIsNoTextCountsAsEmpty) {
    StatePage page;
    page.root()->setAttribute(SVGName(SVGName::font_family), MoxValue(5));
    page.state().setFont(makeFont(u"5", 12));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-family=5 font-size=12");
    page.state().setFont(makeFont(u"", 12));
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-size=12");
}

TEST(SVGGraphicContextCompare, FontSizeStandsOnEachTextGroup) {
    StatePage page;
    page.state().setFont(makeFont(u"Serif", 12));
    page.drawText();
    page.close();
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-size=12");
}

TEST(SVGGraphicContextCompare, FontAttributesStandInThisOrder) {
    StatePage page;
    SVGFont font;
    font.setFontAttribute(u"Sans", FONTSIZE_LARGE, 700, FSTYLE_OBLIQUE, u"", false);
    font.setFontStretch(FONTSTRECH_EXPANDED);
    font.setFontVariant(FVARIANT_SMALLCAPS);
    font.setFontAdjust(pt(3));
    page.root()->setAttribute(SVGName(SVGName::font_family), MoxValue(u"Serif"));
    page.state().setFont(font);
    setAllOfText(page.state());
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()),
              "font-family=Sans font-size=large font-style=oblique font-weight=700 "
              "font-stretch=expanded writing-mode=tb text-anchor=end");
}

TEST(SVGGraphicContextCompare, TinyHasNoFontStretch) {
    StatePage page(SVGConfig::SVGTYPE_TINY);
    SVGFont font = makeFont(u"Serif", 12);
    font.setFontStretch(FONTSTRECH_EXPANDED);
    page.state().setFont(font);
    page.drawText();
    EXPECT_EQ(attributesOf(page.close()), "font-size=12");
}

TEST(SVGGraphicContextCompare, OnlyAGroupWhoseFirstChildIsATextHasAFont) {
    StatePage page;
    page.state().setFont(makeFont(u"Serif", 12));
    const MoxPtr<SVGElement> group = page.make(SVGName::g);
    group->appendChild(page.make(SVGName::rect).get());
    group->appendChild(page.make(SVGName::text).get());
    page.state().AttrValueCompare(group.get(), /*isGroup=*/true, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(group.get()), "");
    const MoxPtr<SVGElement> link = page.make(SVGName::a);
    link->appendChild(page.make(SVGName::text).get());
    page.state().AttrValueCompare(link.get(), /*isGroup=*/true, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(link.get()), "");
}

TEST(SVGGraphicContextCompare, AGroupWithoutARootKeepsItsFamily) {
    SVGTreeManager tree; // without a root
    SVGGraphicContext state(nullptr);
    state.groupGC.font = makeFont(u"Serif", 12);
    const MoxPtr<SVGElement> group = tree.document->createSVGElement(SVGName::g);
    group->appendChild(tree.document->createSVGElement(SVGName::text).get());
    state.AttrValueCompare(group.get(), /*isGroup=*/true, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(group.get()), "font-family=Serif font-size=12");
}

TEST(SVGGraphicContextCompare, GroupAttributesTakeTheCountOfFillRulesBack) {
    StatePage page;
    page.state().setFillRule(FILLRULE_NONZERO);
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), ""); // the rule itself is never a group's
    EXPECT_EQ(page.state().changeCount, 0);
}

} // namespace
