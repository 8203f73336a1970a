// What a font collects.
#include "fonts/SVGEmbFont.h"

#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/TinyFont.h"

#include <gtest/gtest.h>
#include <limits>
#include <type_traits>

namespace DrawmereTest {
namespace {

/// A font of the tests, opened.
struct OpenFont : SVGEmbFont {
    explicit OpenFont(const char16_t* name) : SVGEmbFont(makeFont(name, false), &testFonts()) {}

    void embed(const UnicodeString& text, std::vector<TLGlyphEntry> entries, bool wholeRun = false,
               bool vertical = false) {
        embedGlyphs(*this, text, std::move(entries), wholeRun, vertical);
    }
};

std::string horizontal(const SVGEmbFont& font) { return describe(font.horizontalGlyphs); }

std::string vertical(const SVGEmbFont& font) { return describe(font.verticalGlyphs); }

TEST(SVGEmbFont, StartsWithTheAttributesOfItsRequestAndAnOpenFace) {
    SVGFont request = makeFont(uprightFace, true);
    request.fontFamily = u"'One','Two'";
    const SVGEmbFont font(request, &testFonts());
    EXPECT_TRUE(font.fontInfo.isCreatedFont());
    EXPECT_TRUE(font.fontAttribute == request);
    EXPECT_TRUE(font.fontAttribute.embedFont);
    EXPECT_TRUE(font.fontAttribute.embedGlyphIds);
    EXPECT_EQ(utf8(font.faceFamily), "'One','Two'");
    EXPECT_TRUE(font.horizontalGlyphs.empty());
    EXPECT_TRUE(font.verticalGlyphs.empty());
    EXPECT_EQ(font.errorHandler, DrawmereErrHandler::getDefault());
    EXPECT_EQ(utf8(font.getErrorMessage()), "");
    EXPECT_TRUE(font.reservedFlags.empty());
    EXPECT_TRUE(std::has_virtual_destructor_v<SVGEmbFont>);
}

// Faces that can't be opened.

TEST(SVGEmbFont, AFaceThatCanNotBeOpenedLeavesAMessageForEachAttempt) {
    SVGEmbFont font(makeFont(u"No Such Face", false, 700, FSTYLE_ITALIC), nullptr);
    const std::string message = "  Create font error:\n"
                                "    Font name:No Such Face\n"
                                "    Font weight:700\n"
                                "    Font variant:normal\n";
    EXPECT_FALSE(font.fontInfo.isCreatedFont());
    EXPECT_EQ(utf8(font.getErrorMessage()), message);
    EXPECT_TRUE(font.loadFont(nullptr));
    EXPECT_EQ(utf8(font.getErrorMessage()), message + message);
}

TEST(SVGEmbFont, TheMessageNamesTheVariantAndAWeightThatIsNone) {
    SVGFont request = makeFont(u"No Such Face", false, 1001);
    request.setFontVariant(FVARIANT_SMALLCAPS);
    const SVGEmbFont font(request, nullptr);
    EXPECT_EQ(utf8(font.getErrorMessage()), "  Create font error:\n"
                                            "    Font name:No Such Face\n"
                                            "    Font weight:normal\n"
                                            "    Font variant:small-caps\n");
}

TEST(SVGEmbFont, AnOpenFaceIsNotOpenedAgain) {
    OpenFont font(uprightFace);
    EXPECT_TRUE(font.loadFont(nullptr)); // which could not find it
    EXPECT_TRUE(font.fontInfo.isCreatedFont());
    EXPECT_EQ(utf8(font.getErrorMessage()), "");
}

TEST(SVGEmbFont, TextOfAFaceThatCameLateIsCollected) {
    SVGEmbFont font(makeFont(uprightFace, false), nullptr);
    font.embedText(u"X", false);
    EXPECT_EQ(horizontal(font), "");
    font.loadFont(&testFonts());
    font.embedText(u"X", false);
    EXPECT_EQ(horizontal(font), "X=2");
}

// One face.

TEST(SVGEmbFont, TwoRequestsOfOneFaceAreTheSameFont) {
    OpenFont font(uprightFace);
    SVGEmbFont bold(makeFont(uprightFace, true, 700), &testFonts()); // there is a regular face only
    EXPECT_TRUE(font.isSameFont(bold));
    EXPECT_TRUE(bold.isSameFont(font));
}

TEST(SVGEmbFont, FontsOfOtherNamesAreNotTheSame) {
    OpenFont font(uprightFace);
    OpenFont other(hanFace);
    EXPECT_FALSE(font.isSameFont(other));
}

TEST(SVGEmbFont, FacesOfOneFamilyDifferByWeightAndBySlant) {
    FS_ExtraFonts family;
    const UnicodeString path = fontPath("le-murmure.otf");
    const auto add = [&](int weight, MoxFontService_NS::FSSLANT slant) {
        family.addFile(path, {.names = {u"Family"}, .weight = weight, .slant = slant});
    };
    add(400, MoxFontService_NS::FSSLANT_UPRIGHT);
    add(700, MoxFontService_NS::FSSLANT_UPRIGHT);
    add(400, MoxFontService_NS::FSSLANT_ITALIC);
    SVGEmbFont regular(makeFont(u"Family", false), &family);
    SVGEmbFont bold(makeFont(u"Family", false, 700), &family);
    SVGEmbFont italic(makeFont(u"Family", false, 400, FSTYLE_ITALIC), &family);
    SVGEmbFont oblique(makeFont(u"Family", false, 400, FSTYLE_OBLIQUE), &family);
    EXPECT_FALSE(regular.isSameFont(bold));
    EXPECT_FALSE(regular.isSameFont(italic));
    EXPECT_TRUE(italic.isSameFont(oblique));
}

TEST(SVGEmbFont, TheStretchChoosesTheWidthOfTheFace) {
    constexpr FONTSTRECH stretches[] = {
        FONTSTRECH_ULTRACONDENSED, FONTSTRECH_EXTRACONDENSED, FONTSTRECH_CONDENSED,
        FONTSTRECH_SEMICONDENSED,  FONTSTRECH_NORMAL,         FONTSTRECH_SEMIEXPANDED,
        FONTSTRECH_EXPANDED,       FONTSTRECH_EXTRAEXPANDED,  FONTSTRECH_ULTRAEXPANDED,
    };
    FS_ExtraFonts family;
    const UnicodeString path = fontPath("le-murmure.otf");
    for (int width = 1; width <= 9; ++width) {
        family.addFile(path, {.names = {u"Family"}, .widthClass = width});
    }
    const auto widthOf = [&family](FONTSTRECH stretch) {
        SVGFont request = makeFont(u"Family", false);
        request.setFontStretch(stretch);
        const SVGEmbFont font(request, &family);
        int width = 0;
        font.fontInfo.getFontStyle(nullptr, nullptr, &width);
        return width;
    };
    for (int width = 1; width <= 9; ++width) {
        EXPECT_EQ(widthOf(stretches[width - 1]), width);
    }
    for (const int other : {-10, -9, 0, 1, -12, std::numeric_limits<int>::min()}) {
        EXPECT_EQ(widthOf(static_cast<FONTSTRECH>(other)), 5) << other;
    }
}

// Texts by their characters.

TEST(SVGEmbFontText, NotesEachCharacterOnce) {
    OpenFont font(uprightFace);
    font.embedText(u"X[X X", false);
    EXPECT_EQ(horizontal(font), "[=3, X=2,  =1");
    EXPECT_EQ(vertical(font), "");
}

TEST(SVGEmbFontText, ACharacterWithoutAGlyphLeavesNoTrace) {
    OpenFont font(uprightFace);
    font.embedText(u"aXb\U0001F600", false);
    font.embedText(u"ab", true);
    EXPECT_EQ(horizontal(font), "X=2");
    EXPECT_EQ(vertical(font), "");
}

TEST(SVGEmbFontText, APairOfCodeUnitsIsOneStep) {
    OpenFont without(uprightFace);
    without.embedText(u"\U0002000BX", false);
    EXPECT_EQ(horizontal(without), "X=2"); // neither half was taken for a character of the face

    TinyFont file("Pair Test");
    file.characters = {{'X', file.addGlyph({})}, {0x2000B, file.addGlyph({})}};
    FS_ExtraFonts fonts;
    ASSERT_TRUE(fonts.addBytes(file.build()));
    SVGEmbFont font(makeFont(u"Pair Test", false), &fonts);
    font.embedText(UnicodeString(char16_t(0xD840)) + u"X", false);
    EXPECT_EQ(horizontal(font), "X=1");
    font.embedText(u"X\U0002000B", false); // which its half did not stand for
    EXPECT_EQ(horizontal(font), "\xF0\xA0\x80\x8B=2, X=1");
    EXPECT_EQ(font.horizontalGlyphs.begin()->first.length(), 2);
}

TEST(SVGEmbFontText, FormsForVerticalTextGoToAMapOfTheirOwn) {
    OpenFont font(uprightFace);
    font.embedText(u"\uFF3B\u337B", true);
    EXPECT_EQ(vertical(font), "\uFF3B=14, \u337B=13");
    EXPECT_EQ(horizontal(font), "");
}

TEST(SVGEmbFontText, ACharacterWithOneGlyphForBothDirectionsIsHorizontal) {
    OpenFont font(uprightFace);
    font.embedText(u"\u4E00", true);
    EXPECT_EQ(horizontal(font), "\u4E00=7");
    EXPECT_EQ(vertical(font), "");
}

TEST(SVGEmbFontText, EachDirectionNotesTheSameCharacter) {
    OpenFont font(uprightFace);
    font.embedText(u"\uFF3B", false);
    font.embedText(u"\uFF3B", true);
    EXPECT_EQ(horizontal(font), "\uFF3B=9");
    EXPECT_EQ(vertical(font), "\uFF3B=14");
}

TEST(SVGEmbFontText, TheGlyphsOfAKnownTextStay) {
    OpenFont font(uprightFace);
    font.embed(u"X", {{1, 99}});
    font.embedText(u"X", false);
    EXPECT_EQ(horizontal(font), "X=99");
}

TEST(SVGEmbFontText, WhatGlyphsNotedIsStillLookedAtInVerticalText) {
    OpenFont font(uprightFace);
    font.embed(u"X", {{1, 99}}, false, /*vertical=*/true);
    font.embedText(u"X", true); // the face has no vertical form of it
    EXPECT_EQ(vertical(font), "X=99");
    EXPECT_EQ(horizontal(font), "X=2");
}

TEST(SVGEmbFontText, AMapThatWasEmptiedFromOutsideFillsAgain) {
    OpenFont font(uprightFace);
    font.embedText(u"X", false);
    font.horizontalGlyphs.clear();
    font.embed(u"[", {{1, 3}});
    font.embedText(u"X", false);
    EXPECT_EQ(horizontal(font), "[=3, X=2");
}

// Texts by the glyphs they were shaped into.

TEST(SVGEmbFontGlyphIds, EachClusterIsAnEntry) {
    OpenFont font(latinFace);
    font.embed(u"affix", {{1, 4}, {3, 7}, {1, 9}});
    EXPECT_EQ(horizontal(font), "ffi=7, x=9, a=4");
}

TEST(SVGEmbFontGlyphIds, AClusterMayHaveSeveralGlyphs) {
    OpenFont font(latinFace);
    font.embed(u"a\u0301b", {{2, 4}, {0, 5}, {0, 6}, {1, 9}, {0, 8}});
    EXPECT_EQ(horizontal(font), "a\u0301=4 5 6, b=9 8");
}

TEST(SVGEmbFontGlyphIds, AFurtherGlyphThatIsNoneIsLeftOut) {
    OpenFont font(latinFace);
    font.embed(u"a", {{1, 4}, {0, noGlyph}, {0, 65534}});
    EXPECT_EQ(horizontal(font), "a=4 65534");
}

TEST(SVGEmbFontGlyphIds, AFirstGlyphThatIsNoneIsKept) {
    OpenFont font(latinFace);
    font.embed(u"a", {{1, noGlyph}, {0, 5}});
    EXPECT_EQ(horizontal(font), "a=65535 5");
}

TEST(SVGEmbFontGlyphIds, AKnownClusterDropsItsFurtherGlyphsToo) {
    OpenFont font(latinFace);
    font.embed(u"ab", {{1, 4}, {1, 5}, {0, 6}});
    font.embed(u"ba", {{1, 9}, {0, 8}, {1, 7}, {0, 3}});
    EXPECT_EQ(horizontal(font), "b=5 6, a=4");
}

TEST(SVGEmbFontGlyphIds, AGlyphBeforeAnyClusterIsLeftOut) {
    OpenFont font(latinFace);
    font.embed(u"a", {{0, 3}, {1, 4}});
    EXPECT_EQ(horizontal(font), "a=4");
}

TEST(SVGEmbFontGlyphIds, WithoutEntriesNothingIsNoted) {
    OpenFont font(latinFace);
    font.embed(u"a", {});
    font.embedGlyphId(u"a", nullptr, false, false);
    font.embedGlyphId(u"a", nullptr, true, false);
    EXPECT_EQ(horizontal(font), "");
}

TEST(SVGEmbFontGlyphIds, VerticalTextFillsTheOtherMap) {
    OpenFont font(latinFace);
    font.embed(u"ab", {{1, 4}, {1, 5}}, false, /*vertical=*/true);
    font.embed(u"b", {{1, 6}}, false, /*vertical=*/false);
    font.embed(u"run", {{3, 7}}, /*wholeRun=*/true, /*vertical=*/true);
    EXPECT_EQ(vertical(font), "run=7, b=5, a=4");
    EXPECT_EQ(horizontal(font), "b=6");
}

TEST(SVGEmbFontGlyphIds, CountsThatReachBeyondTheTextTakeWhatThereIs) {
    OpenFont font(latinFace);
    font.embed(u"abc", {{2, 4}, {5, 6}});
    EXPECT_EQ(horizontal(font), "ab=4, c=6");
    OpenFont empty(latinFace);
    empty.embed(u"abc", {{3, 4}, {1, 5}, {-2, 6}, {1, 7}});
    EXPECT_EQ(horizontal(empty), "abc=4, c=7, =5");
}

TEST(SVGEmbFontGlyphIds, CountsOfAnySizeStayInTheText) {
    OpenFont font(latinFace);
    font.embed(u"ab", std::vector<TLGlyphEntry>(100'000, {32767, 1}));
    font.embed(u"ab", std::vector<TLGlyphEntry>(100'000, {-32768, 1}));
    EXPECT_EQ(horizontal(font), "ab=1, =1");
}

TEST(SVGEmbFontGlyphIds, AWholeRunIsOneEntryWithAllItsGlyphs) {
    OpenFont font(latinFace);
    font.embed(u"affix", {{1, 4}, {3, 7}, {0, noGlyph}, {99, 9}}, /*wholeRun=*/true);
    EXPECT_EQ(horizontal(font), "affix=4 7 9");
}

TEST(SVGEmbFontGlyphIds, AWholeRunWithoutGlyphsIsAnEntryWithNone) {
    OpenFont font(latinFace);
    font.embed(u"a", {{1, noGlyph}}, /*wholeRun=*/true);
    font.embed(u"b", {}, /*wholeRun=*/true);
    EXPECT_EQ(horizontal(font), "b=, a=");
}

TEST(SVGEmbFontGlyphIds, AWholeRunThatIsKnownChangesNothing) {
    OpenFont font(latinFace);
    font.embed(u"ab", {{2, 4}});
    font.embed(u"ab", {{1, 5}, {1, 6}}, /*wholeRun=*/true);
    EXPECT_EQ(horizontal(font), "ab=4");
}

TEST(SVGEmbFontGlyphIds, LigaturesStandBeforeTheirParts) {
    OpenFont font(latinFace);
    font.embed(u"ffiffi", {{1, 1}, {2, 2}, {3, 3}});
    EXPECT_EQ(horizontal(font), "ffi=3, fi=2, f=1");
}

} // namespace
} // namespace DrawmereTest
