#include "SVGFont.h"

#include <gtest/gtest.h>

#include <limits>

using namespace DrawmereNS;

namespace {

using Texts = SVGFontAttr2String::FONTATTRSTRING;

Texts textsOf(const FONTATTRIBUTE& font) {
    Texts texts;
    SVGFontAttr2String::getFontAttrStr(font, texts);
    return texts;
}

UnicodeString sizeText(float raw) {
    FONTATTRIBUTE font;
    font.fontSize = MoxLength::fromRaw(raw);
    return textsOf(font).fontSize;
}

UnicodeString adjustText(float raw) {
    FONTATTRIBUTE font;
    font.fontAdjust = MoxLength::fromRaw(raw);
    return textsOf(font).fontAdjust;
}

UnicodeString weightText(FONTWEIGHT weight) {
    FONTATTRIBUTE font;
    font.fontWeight = weight;
    return textsOf(font).fontWeight;
}

UnicodeString styleText(int style) {
    FONTATTRIBUTE font;
    font.fontStyle = static_cast<FSTYLE>(style);
    return textsOf(font).fontStyle;
}

UnicodeString variantText(int variant) {
    FONTATTRIBUTE font;
    font.fontVariant = static_cast<FVARIANT>(variant);
    return textsOf(font).fontVariant;
}

UnicodeString stretchText(int stretch) {
    FONTATTRIBUTE font;
    font.fontStretch = static_cast<FONTSTRECH>(stretch);
    return textsOf(font).fontStretch;
}

TEST(SVGFontAttr2String, ANewRecordDescribesNoFontInParticular) {
    const Texts texts;
    EXPECT_EQ(texts.fontName, u"user");
    EXPECT_EQ(texts.fontSize, u"medium");
    EXPECT_EQ(texts.fontAdjust, u"none");
    EXPECT_EQ(texts.fontWeight, u"normal");
    EXPECT_EQ(texts.fontStyle, u"normal");
    EXPECT_EQ(texts.fontVariant, u"normal");
    EXPECT_EQ(texts.fontStretch, u"normal");
    EXPECT_TRUE(texts.fontFamily.isEmpty());
}

TEST(SVGFontAttr2String, AFreshFontFillsEveryMember) {
    const Texts texts = textsOf(FONTATTRIBUTE());
    EXPECT_EQ(texts.fontName, u"");
    EXPECT_EQ(texts.fontSize, u"medium");
    EXPECT_EQ(texts.fontAdjust, u"none");
    EXPECT_EQ(texts.fontWeight, u"400");
    EXPECT_EQ(texts.fontStyle, u"normal");
    EXPECT_EQ(texts.fontVariant, u"normal");
    EXPECT_EQ(texts.fontStretch, u"normal");
    EXPECT_EQ(texts.fontFamily, u"");
}

TEST(SVGFontAttr2String, ReplacesWhatARecordHeld) {
    Texts texts;
    FONTATTRIBUTE font;
    font.fontStyle = FSTYLE_ITALIC;
    font.fontVariant = FVARIANT_SMALLCAPS;
    font.fontStretch = FONTSTRECH_WIDER;
    SVGFontAttr2String::getFontAttrStr(font, texts);
    SVGFontAttr2String::getFontAttrStr(FONTATTRIBUTE(), texts);
    EXPECT_EQ(texts.fontStyle, u"normal");
    EXPECT_EQ(texts.fontVariant, u"normal");
    EXPECT_EQ(texts.fontStretch, u"normal");
}

TEST(SVGFontAttr2String, CopiesNameAndFamily) {
    SVGFont font;
    font.setFontAttribute(u"Ab Cd", MoxLength(), 400, FSTYLE_NORMAL, u"Ef", false);
    EXPECT_EQ(textsOf(font).fontName, u"Ab Cd");
    EXPECT_EQ(textsOf(font).fontFamily, u"'Ab Cd','Ef'");
}

TEST(SVGFontAttr2String, NegativeSizesAreKeywords) {
    const struct {
        float raw;
        const char16_t* word;
    } rows[] = {
        {-9, u"xx-small"}, {-8, u"x-small"},  {-7, u"small"},  {-6, u"medium"},  {-5, u"large"},
        {-4, u"x-large"},  {-3, u"xx-large"}, {-2, u"larger"}, {-1, u"smaller"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(sizeText(row.raw), row.word);
    }
}

TEST(SVGFontAttr2String, OtherSizesAreNumbers) {
    EXPECT_EQ(sizeText(12.0F), u"12");
    EXPECT_EQ(sizeText(10.5F), u"10.5");
    EXPECT_EQ(sizeText(0.0F), u"0");
    EXPECT_EQ(sizeText(-10.0F), u"-10");
    EXPECT_EQ(sizeText(-5.5F), u"-5.5");
    EXPECT_EQ(sizeText(std::numeric_limits<float>::quiet_NaN()), u"0");
}

TEST(SVGFontAttr2String, ASizeInOtherUnitsIsWrittenInPoints) {
    FONTATTRIBUTE font;
    font.fontSize = MoxLength(1.0F, MoxCommonNS::MOXUNIT_INCH);
    EXPECT_EQ(textsOf(font).fontSize, u"72");
}

TEST(SVGFontAttr2String, AdjustMinusOneIsNone) {
    EXPECT_EQ(adjustText(-1.0F), u"none");
    EXPECT_EQ(adjustText(0.5F), u"0.5");
    EXPECT_EQ(adjustText(-6.0F), u"-6"); // no size keyword
    EXPECT_EQ(adjustText(0.0F), u"0");
}

TEST(SVGFontAttr2String, WeightsFromOneToThousandAreNumbers) {
    EXPECT_EQ(weightText(1), u"1");
    EXPECT_EQ(weightText(400), u"400");
    EXPECT_EQ(weightText(1000), u"1000");
    EXPECT_EQ(weightText(1001), u"normal");
    EXPECT_EQ(weightText(0), u"normal");
    EXPECT_EQ(weightText(-400), u"normal");
}

TEST(SVGFontAttr2String, StylesHaveTwoWords) {
    EXPECT_EQ(styleText(0), u"normal");
    EXPECT_EQ(styleText(1), u"italic");
    EXPECT_EQ(styleText(2), u"oblique");
    EXPECT_EQ(styleText(3), u"normal");
    EXPECT_EQ(styleText(-1), u"normal");
}

TEST(SVGFontAttr2String, VariantsHaveOneWord) {
    EXPECT_EQ(variantText(0), u"normal");
    EXPECT_EQ(variantText(1), u"small-caps");
    EXPECT_EQ(variantText(2), u"normal");
}

TEST(SVGFontAttr2String, StretchesHaveTheirWords) {
    const struct {
        int stretch;
        const char16_t* word;
    } rows[] = {
        {-12, u"normal"},   {-11, u"normal"},         {-10, u"wider"},
        {-9, u"narrower"},  {-8, u"ultra-condensed"}, {-7, u"extra-condensed"},
        {-6, u"condensed"}, {-5, u"semi-condensed"},  {-4, u"semi-expanded"},
        {-3, u"expanded"},  {-2, u"extra-expanded"},  {-1, u"ultra-expanded"},
        {0, u"normal"},     {5, u"normal"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(stretchText(row.stretch), row.word) << row.stretch;
    }
}

} // namespace
