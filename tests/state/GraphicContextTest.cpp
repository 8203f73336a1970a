#include "state/GraphicContext.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;

namespace {

/// Reads the defaults before main, as a static object of a caller may.
const UnicodeString paintSeenBeforeMain = defaultGC.strokeColor;

TEST(GraphicContext, HasTheDefaultsOfTheSystem) {
    const GraphicContext record;
    EXPECT_EQ(record.strokeColor, u"none");
    EXPECT_EQ(record.strokeWidth.getRawValue(), 1.0F);
    EXPECT_EQ(record.lineCap, 0);
    EXPECT_EQ(record.lineJoin, 0);
    EXPECT_TRUE(record.dashArray.empty());
    EXPECT_EQ(record.dashOffset.getRawValue(), 0.0F);
    EXPECT_EQ(record.miterLimit, 4.0F);
    EXPECT_EQ(record.strokeOpacity, 1.0F);
    EXPECT_EQ(record.maskReference, u"none");
    EXPECT_EQ(record.fillOpacity, 1.0F);
    EXPECT_EQ(record.letterSpacing.getRawValue(), 0.0F);
    EXPECT_EQ(record.wordSpacing.getRawValue(), 0.0F);
    EXPECT_EQ(record.writingMode.number, 1000U);
    EXPECT_EQ(record.textAnchor, 3);
    EXPECT_EQ(record.textDecoration, 0);
    EXPECT_EQ(record.clipRule, 1);
    EXPECT_EQ(record.opacity, 1.0F);
    EXPECT_EQ(record.transMatrix.a, 1.0F);
    EXPECT_EQ(record.transMatrix.type, MATRIXTYPE_ROTATE);
}

TEST(GraphicContext, ItsDefaultsAreNotThoseOfSvg) {
    const GraphicContext record;
    EXPECT_EQ(record.fillRule, u"evenodd");
    EXPECT_EQ(record.fillColor, u"none");
    EXPECT_EQ(record.strokeColor, u"none");
}

TEST(GraphicContext, ItsFontIsAFreshFont) {
    const GraphicContext record;
    EXPECT_TRUE(record.font.fontName.isEmpty());
    EXPECT_EQ(record.font.fontWeight, 400);
    EXPECT_EQ(record.font.fontSize.getRawValue(), -6.0F);
}

/// A record that has no default in any member.
GraphicContext makeOddRecord() {
    GraphicContext record;
    record.strokeColor = u"#123456";
    record.strokeWidth = MoxLength::fromRaw(2.0F);
    record.lineCap = LINECAP_ROUND;
    record.lineJoin = LINEJOIN_BEVEL;
    record.dashArray = {MoxLength::fromRaw(3.0F)};
    record.dashOffset = MoxLength::fromRaw(4.0F);
    record.miterLimit = 5.0F;
    record.strokeOpacity = 0.6F;
    record.maskReference = u"url(#m7)";
    record.fillColor = u"url(#a-reference-of-more-than-27-units)";
    record.fillRule = u"nonzero";
    record.fillOpacity = 0.8F;
    record.font.setFontAttribute(u"A B", MoxLength::fromRaw(9.0F), 700, FSTYLE_ITALIC, u"C", false);
    record.font.setFontAdjust(MoxLength::fromRaw(10.0F));
    record.font.setFontVariant(FVARIANT_SMALLCAPS);
    record.font.setFontStretch(FONTSTRECH_EXPANDED);
    record.font.setEmbedAttribute(true, true);
    record.letterSpacing = MoxLength::fromRaw(11.0F);
    record.wordSpacing = MoxLength::fromRaw(12.0F);
    record.writingMode = MoxCommonNS::MOXNAME_TB;
    record.textAnchor = TEXTANCHOR_END;
    record.textDecoration = TEXTDECORATION_BLINK;
    record.clipRule = CLIPRULE_NONZERO;
    record.opacity = 0.5F;
    record.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    return record;
}

void expectSamePaint(const GraphicContext& one, const GraphicContext& other) {
    EXPECT_EQ(one.strokeColor, other.strokeColor);
    EXPECT_EQ(one.strokeWidth, other.strokeWidth);
    EXPECT_EQ(one.lineCap, other.lineCap);
    EXPECT_EQ(one.lineJoin, other.lineJoin);
    EXPECT_EQ(one.dashArray, other.dashArray);
    EXPECT_EQ(one.dashOffset, other.dashOffset);
    EXPECT_EQ(one.miterLimit, other.miterLimit);
    EXPECT_EQ(one.strokeOpacity, other.strokeOpacity);
    EXPECT_EQ(one.maskReference, other.maskReference);
    EXPECT_EQ(one.fillColor, other.fillColor);
    EXPECT_EQ(one.fillRule, other.fillRule);
    EXPECT_EQ(one.fillOpacity, other.fillOpacity);
    EXPECT_EQ(one.clipRule, other.clipRule);
    EXPECT_EQ(one.opacity, other.opacity);
    EXPECT_EQ(one.transMatrix.a, other.transMatrix.a);
    EXPECT_EQ(one.transMatrix.type, other.transMatrix.type);
}

void expectSameText(const GraphicContext& one, const GraphicContext& other) {
    EXPECT_EQ(one.font.fontName, other.font.fontName);
    EXPECT_EQ(one.font.fontWeight, other.font.fontWeight);
    EXPECT_EQ(one.font.fontStyle, other.font.fontStyle);
    EXPECT_EQ(one.font.fontSize, other.font.fontSize);
    EXPECT_EQ(one.font.fontAdjust, other.font.fontAdjust);
    EXPECT_EQ(one.font.fontVariant, other.font.fontVariant);
    EXPECT_EQ(one.font.fontStretch, other.font.fontStretch);
    EXPECT_EQ(one.font.embedFont, other.font.embedFont);
    EXPECT_EQ(one.font.embedGlyphIds, other.font.embedGlyphIds);
    EXPECT_EQ(one.font.fontFamily, other.font.fontFamily);
    EXPECT_EQ(one.letterSpacing, other.letterSpacing);
    EXPECT_EQ(one.wordSpacing, other.wordSpacing);
    EXPECT_EQ(one.writingMode, other.writingMode);
    EXPECT_EQ(one.textAnchor, other.textAnchor);
    EXPECT_EQ(one.textDecoration, other.textDecoration);
}

TEST(GraphicContext, AssigningCopiesEveryMemberThereAndBack) {
    const GraphicContext odd = makeOddRecord();
    const GraphicContext plain;
    GraphicContext record;
    record = odd;
    expectSamePaint(record, odd);
    expectSameText(record, odd);
    record = plain;
    expectSamePaint(record, plain);
    expectSameText(record, plain);
}

TEST(GraphicContext, AssigningTellsTextsOfOneLengthApart) {
    GraphicContext record;
    GraphicContext other;
    for (const char16_t* text : {u"nonf", u"xone", u"abcde", u"abcdf", u"abcdefgh", u"abcdefgx"}) {
        other.strokeColor = text;
        record = other;
        EXPECT_EQ(record.strokeColor, text);
    }
    other.strokeColor.setToBogus();
    record.strokeColor.remove();
    record = other;
    EXPECT_TRUE(record.strokeColor.isBogus());
}

TEST(GraphicContext, AssigningTellsPatternsOfOneLengthApart) {
    GraphicContext record;
    GraphicContext other;
    record.dashArray = {MoxLength::fromRaw(3.0F), MoxLength::fromRaw(2.0F)};
    other.dashArray = {MoxLength::fromRaw(3.0F), MoxLength::fromRaw(1.0F)};
    record = other;
    EXPECT_EQ(record.dashArray, other.dashArray);
}

TEST(GraphicContext, AssigningARecordToItselfChangesNothing) {
    GraphicContext record = makeOddRecord();
    const GraphicContext& same = record;
    record = same;
    expectSamePaint(record, makeOddRecord());
    expectSameText(record, makeOddRecord());
}

TEST(GraphicContext, TheDefaultRecordIsReadyBeforeMain) {
    EXPECT_EQ(paintSeenBeforeMain, u"none");
    EXPECT_EQ(&defaultGC, &getDefaultGC());
}

} // namespace
