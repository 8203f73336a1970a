#include "state/SVGGraphicContext.h"

#include "foundation/common/MoxColor.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

#include <limits>

using namespace DrawmereNS;

namespace {

constexpr float infinity = std::numeric_limits<float>::infinity();

/// A state by itself, with its configuration.
struct State : SVGConfig, SVGGraphicContext {
    State() : SVGGraphicContext(this) {}
};

const MoxColor halfRed(255, 0, 0, 51);

TEST(SVGGraphicContext, StartsWithDefaults) {
    SVGConfig config;
    SVGGraphicContext state(&config);
    EXPECT_EQ(state.getType(), -2);
    EXPECT_EQ(state.changeCount, 0);
    EXPECT_TRUE(state.clipPathId.isEmpty());
    EXPECT_FALSE(state.clipState);
    EXPECT_EQ(state.getSVGType(), 0);
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(state.rootMatrix));
    EXPECT_TRUE(state.tinyFillColors.empty());
    EXPECT_EQ(state.config, &config);
    EXPECT_EQ(state.getCurrentGC()->strokeColor, u"none");
    EXPECT_EQ(state.getGroupGC()->fillRule, u"evenodd");
}

TEST(SVGGraphicContext, ACopyIsDeepAndSharesTheConfiguration) {
    State state;
    state.tinyFillColors[u"g1"] = u"#fff";
    state.setClipPathID(u"c1");
    SVGGraphicContext copy(state);
    state.tinyFillColors[u"g1"] = u"#000";
    state.setStrokeWidth(pt(9));
    EXPECT_EQ(copy.tinyFillColors[u"g1"], u"#fff");
    EXPECT_EQ(copy.currentGC.strokeWidth, pt(1));
    EXPECT_EQ(copy.clipPathId, u"url(#c1)");
    EXPECT_EQ(copy.config, state.config);
}

TEST(SVGGraphicContext, AStrokeColorBecomesTextAtOnce) {
    State state;
    state.setStrokeColor(MoxColor(255, 0, 0));
    EXPECT_EQ(state.currentGC.strokeColor, u"red");
    state.colorFlag = false;
    state.setStrokeColor(MoxColor(255, 0, 0));
    EXPECT_EQ(state.currentGC.strokeColor, u"#f00");
}

TEST(SVGGraphicContext, ATransparentStrokeColorSplitsIntoColorAndOpacity) {
    State state;
    state.setStrokeColor(halfRed);
    EXPECT_EQ(state.currentGC.strokeColor, u"red");
    EXPECT_EQ(state.currentGC.strokeOpacity, 0.2F);
}

TEST(SVGGraphicContext, AnOpaqueStrokeColorTakesTheOpacityBack) {
    State state;
    state.setStrokeColor(halfRed);
    state.setStrokeColor(MoxColor(0, 0, 255));
    EXPECT_EQ(state.currentGC.strokeOpacity, 1.0F);
}

TEST(SVGGraphicContext, AFullyTransparentColorKeepsItsColorText) {
    State state;
    state.setFillColor(MoxColor(255, 0, 0, 0));
    EXPECT_EQ(state.currentGC.fillColor, u"red");
    EXPECT_EQ(state.currentGC.fillOpacity, 0.0F);
}

TEST(SVGGraphicContext, AFillColorResetsAnEarlierFillOpacity) {
    State state;
    state.setOpacity(0.5F, OPACITYDEST_FILL);
    state.setFillColor(MoxColor(0, 0, 255));
    EXPECT_EQ(state.currentGC.fillColor, u"#00f");
    EXPECT_EQ(state.currentGC.fillOpacity, 1.0F);
    state.setFillColor(halfRed);
    EXPECT_EQ(state.currentGC.fillOpacity, 0.2F);
    EXPECT_EQ(state.currentGC.strokeOpacity, 1.0F);
}

TEST(SVGGraphicContext, ColorNamesAreTakenAsGiven) {
    State state;
    state.setStrokeColorName(u"papaya whip");
    state.setFillColorName(u"inherit");
    EXPECT_EQ(state.currentGC.strokeColor, u"papaya whip");
    EXPECT_EQ(state.currentGC.fillColor, u"inherit");
}

TEST(SVGGraphicContext, ColorIdsBecomeReferences) {
    State state;
    state.setStrokeColorId(u"g1");
    state.setFillColorId(u"g2");
    EXPECT_EQ(state.currentGC.strokeColor, u"url(#g1)");
    EXPECT_EQ(state.currentGC.fillColor, u"url(#g2)");
    state.setSVGType(SVGConfig::SVGTYPE_BASIC);
    state.setFillColorId(u"g3");
    EXPECT_EQ(state.currentGC.fillColor, u"url(#g3)");
}

TEST(SVGGraphicContext, TinyFillsWithTheSolidColorNotedForAnId) {
    State state;
    state.setSVGType(SVGConfig::SVGTYPE_TINY);
    state.tinyFillColors[u"g1"] = u"#abc";
    state.setFillColorId(u"g1");
    EXPECT_EQ(state.currentGC.fillColor, u"#abc");
    state.setFillColorId(u"g2");
    EXPECT_EQ(state.currentGC.fillColor, u"none");
}

TEST(SVGGraphicContext, TinyStrokesWithAReferenceAllTheSame) {
    State state;
    state.setSVGType(SVGConfig::SVGTYPE_TINY);
    state.tinyFillColors[u"g1"] = u"#abc";
    state.setStrokeColorId(u"g1");
    EXPECT_EQ(state.currentGC.strokeColor, u"url(#g1)");
}

TEST(SVGGraphicContext, AnIdMayBeTheStatesOwnText) {
    State state;
    state.setFillColorName(u"x");
    state.setFillColorId(state.currentGC.fillColor);
    EXPECT_EQ(state.currentGC.fillColor, u"url(#x)");
}

TEST(SVGGraphicContext, OpacityGoesWhereItIsMeantTo) {
    State state;
    state.setOpacity(0.25F, OPACITYDEST_STROKE);
    state.setOpacity(0.5F, OPACITYDEST_FILL);
    state.setOpacity(0.75F, OPACITYDEST_ELEMENT);
    state.setOpacity(0.1F, static_cast<OPACITYDEST>(3));
    state.setOpacity(0.1F, static_cast<OPACITYDEST>(-1));
    EXPECT_EQ(state.currentGC.strokeOpacity, 0.25F);
    EXPECT_EQ(state.currentGC.fillOpacity, 0.5F);
    EXPECT_EQ(state.currentGC.opacity, 0.75F);
}

TEST(SVGGraphicContext, FillRulesOtherThanOneAreNonzeroAndAreCounted) {
    State state;
    state.setFillRule(FILLRULE_NONZERO);
    EXPECT_EQ(state.currentGC.fillRule, u"nonzero");
    state.setFillRule(FILLRULE_EVENODD);
    EXPECT_EQ(state.currentGC.fillRule, u"evenodd");
    state.setFillRule(static_cast<FILLRULE>(7));
    EXPECT_EQ(state.currentGC.fillRule, u"nonzero");
    EXPECT_EQ(state.changeCount, 3);
}

TEST(SVGGraphicContext, PlainSettersStoreTheirValue) {
    State state;
    state.setStrokeWidth(pt(3));
    state.setMiterLimit(7);
    state.setLetterSpacing(pt(4));
    state.setWordSpacing(pt(5));
    state.setWritingMode(MoxCommonNS::MOXNAME_TB);
    state.setTextAnchor(TEXTANCHOR_END);
    state.setTextDecoration(TEXTDECORATION_BLINK);
    state.setLineCap(LINECAP_SQUARE);
    state.setLineJoin(LINEJOIN_BEVEL);
    state.setClipState(true);
    state.setClipRuleAttrVal(CLIPRULE_NONZERO);
    EXPECT_EQ(state.currentGC.strokeWidth, pt(3));
    EXPECT_EQ(state.currentGC.miterLimit, 7);
    EXPECT_EQ(state.currentGC.letterSpacing, pt(4));
    EXPECT_EQ(state.currentGC.wordSpacing, pt(5));
    EXPECT_EQ(state.currentGC.writingMode, MoxName(MoxCommonNS::MOXNAME_TB));
    EXPECT_EQ(state.currentGC.textAnchor, TEXTANCHOR_END);
    EXPECT_EQ(state.currentGC.textDecoration, TEXTDECORATION_BLINK);
    EXPECT_EQ(state.currentGC.lineCap, LINECAP_SQUARE);
    EXPECT_EQ(state.currentGC.lineJoin, LINEJOIN_BEVEL);
    EXPECT_TRUE(state.clipState);
    EXPECT_EQ(state.currentGC.clipRule, CLIPRULE_NONZERO);
    EXPECT_EQ(state.groupGC.strokeWidth, pt(1));
}

TEST(SVGGraphicContext, ADashLineReplacesThePattern) {
    State state;
    const MoxLength lengths[] = {pt(3), pt(2), pt(1)};
    state.setDashLine(lengths, 3, pt(4));
    EXPECT_EQ(state.currentGC.dashArray, (std::vector<MoxLength>{pt(3), pt(2), pt(1)}));
    EXPECT_EQ(state.currentGC.dashOffset, pt(4));
    state.setDashLine(state.currentGC.dashArray.data() + 1, 2, pt(5));
    EXPECT_EQ(state.currentGC.dashArray, (std::vector<MoxLength>{pt(2), pt(1)}));
}

TEST(SVGGraphicContext, ACountBelowOneEmptiesThePatternAndStoresTheOffset) {
    State state;
    const MoxLength lengths[] = {pt(3)};
    for (const int count : {0, -1, std::numeric_limits<int>::min()}) {
        state.setDashLine(lengths, 1, pt(0));
        state.setDashLine(lengths, count, pt(6));
        EXPECT_TRUE(state.currentGC.dashArray.empty());
        EXPECT_EQ(state.currentGC.dashOffset, pt(6));
    }
    state.setDashLine(nullptr, 3, pt(7));
    EXPECT_TRUE(state.currentGC.dashArray.empty());
    EXPECT_EQ(state.currentGC.dashOffset, pt(7));
}

TEST(SVGGraphicContext, AFontIsCopiedAndReachable) {
    State state;
    SVGFont font;
    font.setFontAttribute(u"Face", pt(12), 700, FSTYLE_ITALIC, u"", false);
    state.setFont(font);
    EXPECT_EQ(state.getFont(), &state.currentGC.font);
    EXPECT_EQ(state.getFont()->fontFamily, u"Face");
    EXPECT_EQ(state.getFont()->fontSize, pt(12));
}

TEST(SVGGraphicContext, AMaskOfNoneIsNoReference) {
    State state;
    state.setMaskReference(u"m1");
    EXPECT_EQ(state.currentGC.maskReference, u"url(#m1)");
    state.setMaskReference(u"none");
    EXPECT_EQ(state.currentGC.maskReference, u"none");
}

TEST(SVGGraphicContext, AClipPathIsAReferenceEvenToNone) {
    State state;
    state.setClipPathID(u"none");
    EXPECT_EQ(state.clipPathId, u"url(#none)");
}

TEST(SVGGraphicContext, TheGroupsRecordCanBeSet) {
    State state;
    GraphicContext record;
    record.strokeWidth = pt(8);
    record.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    state.setGroupGC(record);
    EXPECT_EQ(state.getGroupGC()->strokeWidth, pt(8));
    EXPECT_EQ(state.getGroupGC()->transMatrix.type, MATRIXTYPE_SCALE);
}

TEST(SVGGraphicContext, CopyToTheGroupKeepsBothMatrices) {
    State state;
    state.groupGC.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    state.currentGC.transMatrix = SVGMatrix(1, 0, 0, 1, 5, 6);
    state.setStrokeWidth(pt(3));
    state.copyCur2Group(/*multiply=*/false);
    EXPECT_EQ(state.groupGC.strokeWidth, pt(3));
    EXPECT_EQ(state.groupGC.transMatrix.a, 2);
    EXPECT_EQ(state.currentGC.transMatrix.e, 5);
}

TEST(SVGGraphicContext, CopyToTheGroupMovesTheMatrixWhenTold) {
    State state;
    state.groupGC.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    state.currentGC.transMatrix = SVGMatrix(1, 0, 0, 1, 5, 6);
    state.setStrokeWidth(pt(3));
    state.copyCur2Group(/*multiply=*/true);
    EXPECT_EQ(state.groupGC.strokeWidth, pt(3));
    EXPECT_EQ(state.groupGC.transMatrix.a, 2);
    EXPECT_EQ(state.groupGC.transMatrix.e, 10);
    EXPECT_EQ(state.groupGC.transMatrix.f, 12);
    EXPECT_EQ(state.groupGC.transMatrix.type, MATRIXTYPE_ROTATE); // as a product comes
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(state.currentGC.transMatrix));
}

TEST(SVGGraphicContext, CopyToTheRootMovesEverythingThere) {
    State state;
    state.rootMatrix = SVGMatrix(1, 0, 0, 1, 100, 0);
    state.groupGC.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    state.currentGC.transMatrix = SVGMatrix(1, 0, 0, 1, 5, 6);
    state.setLineCap(LINECAP_ROUND);
    state.copyGroup2Root();
    EXPECT_EQ(SVGGraphicContext::convertMatrixToString(state.rootMatrix),
              u"matrix(2,0,0,2,110,12)");
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(state.groupGC.transMatrix));
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(state.currentGC.transMatrix));
    EXPECT_EQ(state.groupGC.lineCap, LINECAP_ROUND);
}

TEST(SVGGraphicContext, DefaultsReachTheRecordsAndTheRootMatrixOnly) {
    State state;
    state.setStrokeWidth(pt(3));
    state.copyCur2Group(/*multiply=*/false);
    state.rootMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    state.setFillRule(FILLRULE_NONZERO);
    state.setType(ELEMENT_TYPE_MASK);
    state.setClipPathID(u"c1");
    state.setClipState(true);
    state.setSVGType(SVGConfig::SVGTYPE_BASIC);
    state.tinyFillColors[u"g1"] = u"#abc";
    state.setDefaultGC();
    EXPECT_EQ(state.currentGC.strokeWidth, pt(1));
    EXPECT_EQ(state.currentGC.fillRule, u"evenodd");
    EXPECT_EQ(state.groupGC.strokeWidth, pt(1));
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(state.rootMatrix));
    EXPECT_EQ(state.getType(), ELEMENT_TYPE_MASK);
    EXPECT_EQ(state.changeCount, 1);
    EXPECT_EQ(state.clipPathId, u"url(#c1)");
    EXPECT_TRUE(state.clipState);
    EXPECT_EQ(state.getSVGType(), SVGConfig::SVGTYPE_BASIC);
    EXPECT_EQ(state.tinyFillColors.size(), 1U);
}

TEST(SVGGraphicContext, ACopyFromItselfChangesNothing) {
    State state;
    state.setStrokeColorName(u"a colour with quite a long name");
    state.copyFrom(state);
    EXPECT_EQ(state.currentGC.strokeColor, u"a colour with quite a long name");
}

TEST(SVGGraphicContext, WorksWithoutAConfiguration) {
    SVGGraphicContext state(nullptr);
    state.setStrokeColor(MoxColor(255, 0, 0));
    EXPECT_EQ(state.currentGC.strokeColor, u"red");
}

TEST(SVGGraphicContext, NumbersOutOfRangeAreKeptAsTheyAre) {
    State state;
    state.setOpacity(-3.5F, OPACITYDEST_FILL);
    state.setOpacity(infinity, OPACITYDEST_ELEMENT);
    state.setStrokeWidth(pt(-1));
    EXPECT_EQ(state.currentGC.fillOpacity, -3.5F);
    EXPECT_EQ(state.currentGC.opacity, infinity);
    EXPECT_EQ(state.currentGC.strokeWidth, pt(-1));
}

} // namespace
