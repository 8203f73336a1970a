#include "SVGFont.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;

namespace {

constexpr MoxLength size = MoxLength::fromRaw(12.0F);

UnicodeString familyOf(const char16_t* name, const char16_t* family, bool familyOnly) {
    SVGFont font;
    font.setFontAttribute(name, size, FONTWEIGHT_NORMAL, FSTYLE_NORMAL, family, familyOnly);
    return font.fontFamily;
}

FONTATTRIBUTEKEY key(const char16_t* name, FONTWEIGHT weight = 400, FSTYLE style = FSTYLE_NORMAL) {
    FONTATTRIBUTEKEY result;
    result.fontName = name;
    result.fontWeight = weight;
    result.fontStyle = style;
    return result;
}

TEST(FONTATTRIBUTEKEY, StartsUprightAndOfNormalWeight) {
    const FONTATTRIBUTEKEY fresh;
    EXPECT_TRUE(fresh.fontName.isEmpty());
    EXPECT_EQ(fresh.fontWeight, 400);
    EXPECT_EQ(fresh.fontStyle, 0);
}

TEST(FONTATTRIBUTE, StartsWithKeywordSizeAndEmbedsNothing) {
    const FONTATTRIBUTE fresh;
    EXPECT_EQ(fresh.fontSize.getRawValue(), -6.0F);
    EXPECT_EQ(fresh.fontAdjust.getRawValue(), -1.0F);
    EXPECT_EQ(fresh.fontVariant, 0);
    EXPECT_EQ(fresh.fontStretch, -11);
    EXPECT_FALSE(fresh.embedFont);
    EXPECT_FALSE(fresh.embedGlyphIds);
    EXPECT_TRUE(fresh.fontFamily.isEmpty());
}

TEST(FONTATTRIBUTEKEY, EqualKeysAgreeInNameWeightAndSlant) {
    EXPECT_TRUE(key(u"Arial") == key(u"Arial"));
    EXPECT_FALSE(key(u"Arial") == key(u"Arial", 700));
    EXPECT_FALSE(key(u"Arial") == key(u"Arial", 400, FSTYLE_ITALIC));
}

TEST(FONTATTRIBUTEKEY, ItalicAndObliqueAreOneKey) {
    const FONTATTRIBUTEKEY italic = key(u"Arial", 400, FSTYLE_ITALIC);
    const FONTATTRIBUTEKEY oblique = key(u"Arial", 400, FSTYLE_OBLIQUE);
    EXPECT_TRUE(italic == oblique);
    EXPECT_FALSE(italic < oblique);
    EXPECT_FALSE(oblique < italic);
}

TEST(FONTATTRIBUTEKEY, UprightOrdersBeforeSlanted) {
    EXPECT_TRUE(key(u"Arial") < key(u"Arial", 400, FSTYLE_ITALIC));
    EXPECT_FALSE(key(u"Arial", 400, FSTYLE_ITALIC) < key(u"Arial"));
}

TEST(FONTATTRIBUTEKEY, CaseOfNamesCounts) {
    EXPECT_FALSE(key(u"Arial") == key(u"arial"));
    EXPECT_TRUE(key(u"Arial") < key(u"arial"));
}

TEST(FONTATTRIBUTEKEY, OrdersByNameThenWeightThenSlant) {
    EXPECT_TRUE(key(u"A", 900, FSTYLE_ITALIC) < key(u"B", 100));
    EXPECT_FALSE(key(u"B", 100) < key(u"A", 900, FSTYLE_ITALIC));
    EXPECT_TRUE(key(u"A", 100, FSTYLE_ITALIC) < key(u"A", 200));
    EXPECT_TRUE(key(u"A", -5) < key(u"A", 5));
    EXPECT_FALSE(key(u"A") < key(u"A"));
}

TEST(FONTATTRIBUTEKEY, OrdersNamesByCodeUnits) {
    EXPECT_TRUE(key(u"Sans") < key(u"Sans Mono"));
    // U+10000 is above U+FF21 as a character, and below it by its first code unit.
    EXPECT_TRUE(key(u"\U00010000") < key(u"\uFF21"));
}

TEST(SVGFont, StoresWhatItIsGiven) {
    SVGFont font;
    font.setFontAttribute(u"Face", size, 650, FSTYLE_OBLIQUE, u"", false);
    EXPECT_EQ(font.fontName, u"Face");
    EXPECT_EQ(font.fontSize, size);
    EXPECT_EQ(font.fontWeight, 650);
    EXPECT_EQ(font.fontStyle, FSTYLE_OBLIQUE);
}

TEST(SVGFont, QuotesBothNamesOfTwo) {
    EXPECT_EQ(familyOf(u"Ab Cd", u"Ef", false), u"'Ab Cd','Ef'");
    EXPECT_EQ(familyOf(u"Serif", u"Sans", false), u"'Serif','Sans'");
}

TEST(SVGFont, OneNameIsQuotedOnlyWithABlank) {
    EXPECT_EQ(familyOf(u"Arial", u"", false), u"Arial");
    EXPECT_EQ(familyOf(u"Arial Bold", u"", false), u"'Arial Bold'");
    EXPECT_EQ(familyOf(u"Arial", u"Arial", false), u"Arial");
    EXPECT_EQ(familyOf(u"A B", u"A B", false), u"'A B'");
    EXPECT_EQ(familyOf(u"A\tB", u"", false), u"A\tB");
}

TEST(SVGFont, FamilyOnlyLeavesTheNameOut) {
    EXPECT_EQ(familyOf(u"Name", u"Family", true), u"Family");
    EXPECT_EQ(familyOf(u"Name", u"The Family", true), u"'The Family'");
    EXPECT_EQ(familyOf(u"Name", u"", true), u"");
}

TEST(SVGFont, TakesItsOwnTextsAsArguments) {
    SVGFont font;
    font.setFontAttribute(u"A B", size, 400, FSTYLE_NORMAL, u"C", false);
    font.setFontAttribute(font.fontFamily, size, 400, FSTYLE_NORMAL, font.fontName, true);
    EXPECT_EQ(font.fontName, u"'A B','C'");
    EXPECT_EQ(font.fontFamily, u"'A B'");
}

TEST(SVGFont, OtherSettersStoreOneThing) {
    SVGFont font;
    font.setEmbedAttribute(true, false);
    EXPECT_TRUE(font.embedFont);
    EXPECT_FALSE(font.embedGlyphIds);
    font.setEmbedAttribute(false, true);
    EXPECT_FALSE(font.embedFont);
    EXPECT_TRUE(font.embedGlyphIds);
    font.setFontAdjust(size);
    EXPECT_EQ(font.fontAdjust, size);
    font.setFontVariant(FVARIANT_SMALLCAPS);
    EXPECT_EQ(font.fontVariant, FVARIANT_SMALLCAPS);
    font.setFontStretch(FONTSTRECH_EXPANDED);
    EXPECT_EQ(font.fontStretch, FONTSTRECH_EXPANDED);
    EXPECT_TRUE(font.fontFamily.isEmpty());
}

} // namespace
