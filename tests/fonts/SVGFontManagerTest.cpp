#include "fonts/SVGFontManager.h"

#include "Drawmere.h"
#include "fonts/SVGEmbFont.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/Golden.h"
#include "tests/support/SvgPage.h"
#include "tests/support/TempDir.h"

#include <gtest/gtest.h>
#include <memory>

namespace DrawmereTest {
namespace {

void drawText(SvgPage& page, const UnicodeString& text, TLStringWithGlyphInfo* glyphs = nullptr,
              bool wholeRun = false) {
    page->drawText(text, pt(10), pt(20), PAINTMODE_FILL, glyphs, wholeRun, /*leftToRight=*/true);
}

/// A registry that nobody writes.
struct Registry : SVGFontManager {
    Registry() : SVGFontManager(nullptr) {}

    SVGEmbFont* select(SVGFont font) {
        setCurrentFont(&font, &testFonts());
        return currentFont;
    }
};

TEST(SVGFontManager, StartsEmpty) {
    const Registry fonts;
    EXPECT_EQ(fonts.currentFont, nullptr);
    EXPECT_TRUE(fonts.embFonts.empty());
}

TEST(SVGFontManager, KeepsTheOrderOfItsMembers) {
    const Registry fonts;
    const auto placeOf = [&fonts](const auto& member) {
        return reinterpret_cast<const char*>(&member) - reinterpret_cast<const char*>(&fonts);
    };
    EXPECT_EQ(placeOf(fonts.treeManager), 0);
    EXPECT_LT(placeOf(fonts.treeManager), placeOf(fonts.currentFont));
    EXPECT_LT(placeOf(fonts.currentFont), placeOf(fonts.embFonts));
}

TEST(SVGFontManager, AFontThatIsNotEmbeddedIsNoCurrentFont) {
    Registry fonts;
    SVGEmbFont* const first = fonts.select(makeFont(uprightFace, false));
    ASSERT_NE(first, nullptr);
    SVGFont plain = makeFont(uprightFace, false);
    plain.setEmbedAttribute(false, false);
    EXPECT_EQ(fonts.select(plain), nullptr);
    fonts.embedTextOrGlyph(u"X", nullptr, false, false);
    EXPECT_TRUE(first->horizontalGlyphs.empty());
    EXPECT_EQ(fonts.embFonts.size(), 1U);
}

TEST(SVGFontManager, ANullFontChangesNothing) {
    Registry fonts;
    SVGEmbFont* const first = fonts.select(makeFont(uprightFace, false));
    fonts.setCurrentFont(nullptr, nullptr);
    EXPECT_EQ(fonts.currentFont, first);
}

TEST(SVGFontManager, AKnownKeyIsUsedAgainWithoutLookingForTheFace) {
    Registry fonts;
    SVGEmbFont* const first = fonts.select(makeFont(uprightFace, false));
    SVGFont same = makeFont(uprightFace, false);
    fonts.setCurrentFont(&same, nullptr); // where no such face is found
    EXPECT_EQ(fonts.currentFont, first);
    EXPECT_EQ(fonts.embFonts.size(), 1U);
    EXPECT_EQ(utf8(first->getErrorMessage()), "");
}

TEST(SVGFontManager, ItalicAndObliqueAreOneFont) {
    Registry fonts;
    SVGEmbFont* const italic = fonts.select(makeFont(uprightFace, false, 400, FSTYLE_ITALIC));
    EXPECT_EQ(fonts.select(makeFont(uprightFace, false, 400, FSTYLE_OBLIQUE)), italic);
    EXPECT_EQ(fonts.embFonts.size(), 1U);
}

TEST(SVGFontManager, TwoKeysOfOneFaceAreOneFontUnderTheFirst) {
    Registry fonts;
    SVGFont request = makeFont(uprightFace, false);
    request.fontFamily = u"First";
    SVGEmbFont* const first = fonts.select(request);
    SVGFont bold = makeFont(uprightFace, false, 700);
    bold.fontFamily = u"Second";
    EXPECT_EQ(fonts.select(bold), first);
    EXPECT_EQ(fonts.select(bold), first); // its key is looked for once more
    ASSERT_EQ(fonts.embFonts.size(), 1U);
    EXPECT_EQ(fonts.embFonts.begin()->first.fontWeight, 400);
    EXPECT_EQ(utf8(first->faceFamily), "First");
    EXPECT_EQ(first->fontAttribute.fontWeight, 400);
}

TEST(SVGFontManager, FontsStandInTheOrderOfTheirKeys) {
    Registry fonts;
    SVGEmbFont* const upright = fonts.select(makeFont(uprightFace, false));
    SVGEmbFont* const han = fonts.select(makeFont(hanFace, false));
    SVGEmbFont* const latin = fonts.select(makeFont(latinFace, false));
    std::vector<SVGEmbFont*> found;
    for (const auto& [key, font] : fonts.embFonts) {
        found.push_back(font);
    }
    EXPECT_EQ(found, (std::vector<SVGEmbFont*>{han, latin, upright}));
}

TEST(SVGFontManager, AFaceThatCanNotBeOpenedIsAFontAllTheSame) {
    Registry fonts;
    SVGEmbFont* const font = fonts.select(makeFont(u"No Such Face", false));
    ASSERT_NE(font, nullptr);
    EXPECT_EQ(fonts.embFonts.size(), 1U);
    const std::string message = utf8(font->getErrorMessage());
    EXPECT_EQ(message.find("Create font error"), message.rfind("Create font error"));
}

TEST(SVGFontManager, TheLastSelectionDecidesHowTextIsCollected) {
    Registry fonts;
    TLStringWithGlyphInfo glyphs({{1, 9}, {1, 8}});
    SVGEmbFont* const font = fonts.select(makeFont(uprightFace, false));
    fonts.embedTextOrGlyph(u"X[", &glyphs, false, false);
    EXPECT_EQ(describe(font->horizontalGlyphs), "[=3, X=2");
    EXPECT_EQ(fonts.select(makeFont(uprightFace, true)), font);
    EXPECT_TRUE(font->fontAttribute.embedGlyphIds);
    fonts.embedTextOrGlyph(u"X]", &glyphs, false, false);
    EXPECT_EQ(describe(font->horizontalGlyphs), "]=8, [=3, X=2");
}

TEST(SVGFontManager, WithoutACurrentFontOrItsFlagNothingIsCollected) {
    Registry fonts;
    fonts.embedTextOrGlyph(u"X", nullptr, false, false);
    SVGEmbFont* const font = fonts.select(makeFont(uprightFace, false));
    font->fontAttribute.embedFont = false;
    fonts.embedTextOrGlyph(u"X", nullptr, false, false);
    EXPECT_TRUE(font->horizontalGlyphs.empty());
}

TEST(SVGFontManager, AFontThatIsSelectedAgainIsEmbeddedAgain) {
    Registry fonts;
    SVGEmbFont* const font = fonts.select(makeFont(uprightFace, false));
    font->fontAttribute.embedFont = false;
    fonts.select(makeFont(uprightFace, false));
    fonts.embedTextOrGlyph(u"X", nullptr, false, false);
    EXPECT_EQ(describe(font->horizontalGlyphs), "X=2");
}

// On purpose: fonts without a face can't be told apart, so they are one, that of the first request.
TEST(SVGFontManager, FontsWithoutAFaceAreOneFont) {
    Registry fonts;
    SVGEmbFont* const first = fonts.select(makeFont(u"No Such Face", false));
    EXPECT_EQ(fonts.select(makeFont(u"No Such Face Either", false, 700, FSTYLE_ITALIC)), first);
    EXPECT_EQ(utf8(first->faceFamily), "'No Such Face'");
    EXPECT_EQ(fonts.embFonts.size(), 1U);
}

// Whole documents.

TEST(EmbeddedFonts, AreWrittenWithTheGlyphsOfTheirTexts) {
    SvgPage page;
    SVGFont font = makeFont(uprightFace, false);
    page->setFont(&font, &testFonts());
    drawText(page, u"X \u337B\u337B");
    EXPECT_GOLDEN(page, "fonts/characters");
}

TEST(EmbeddedFonts, OutlinesOfQuadraticCurvesStayQuadratic) {
    SvgPage page;
    SVGFont font = makeFont(arabicFace, true);
    page->setFont(&font, &testFonts());
    TLStringWithGlyphInfo glyphs({{1, 20}});
    drawText(page, u"\u0628", &glyphs);
    EXPECT_GOLDEN(page, "fonts/quadratic-outlines");
}

TEST(EmbeddedFonts, OutlinesOfCubicCurvesStayCubic) {
    SvgPage page;
    SVGFont font = makeFont(hanFace, false);
    page->setFont(&font, &testFonts());
    drawText(page, u"A");
    EXPECT_GOLDEN(page, "fonts/cubic-outlines");
}

TEST(EmbeddedFonts, VerticalTextBringsItsForms) {
    SvgPage page;
    SVGFont font = makeFont(hanFace, false);
    page->setFont(&font, &testFonts());
    page->setWritingMode(MoxCommonNS::MOXNAME_TB_RL);
    drawText(page, u"\u3041");
    page->setWritingMode(MoxCommonNS::MOXNAME_LR_TB);
    drawText(page, u"\u3041");
    EXPECT_GOLDEN(page, "fonts/vertical-forms");
}

TEST(EmbeddedFonts, BothVerticalModesCountAsVertical) {
    for (const auto mode : {MoxCommonNS::MOXNAME_TB_RL, MoxCommonNS::MOXNAME_TB}) {
        SvgPage page;
        SVGFont font = makeFont(hanFace, false);
        page->setFont(&font, &testFonts());
        page->setWritingMode(mode);
        drawText(page, u"\u3041");
        EXPECT_NE(page.body().find("vert-adv-y"), std::string::npos);
    }
}

TEST(EmbeddedFonts, LigaturesAndTheirLettersAreGlyphsOfOneFont) {
    SvgPage page;
    SVGFont font = makeFont(latinFace, true);
    page->setFont(&font, &testFonts());
    TLStringWithGlyphInfo glyphs({{1, 192}, {2, 199}});
    drawText(page, u"ffi", &glyphs);
    EXPECT_GOLDEN(page, "fonts/clusters");
}

TEST(EmbeddedFonts, TwoFontsStandOneAfterTheOtherByTheirKeys) {
    SvgPage page;
    for (const char16_t* name : {uprightFace, latinFace}) {
        SVGFont font = makeFont(name, false);
        page->setFont(&font, &testFonts());
        drawText(page, u"X");
    }
    const std::string body = page.body();
    EXPECT_LT(body.find("<font-face font-family=\"'Latin Test'\""),
              body.find("<font-face font-family=\"'Upright Test'\""));
    EXPECT_NE(body.find("<font-face font-family=\"'Upright Test'\""), std::string::npos);
}

TEST(EmbeddedFonts, AFontThatNoTextUsedLeavesNothing) {
    SvgPage page;
    SVGFont font = makeFont(uprightFace, false);
    page->setFont(&font, &testFonts());
    EXPECT_EQ(page.body().find("<font"), std::string::npos);
}

TEST(EmbeddedFonts, EachDocumentOfARunCarriesItsOwn) {
    const TempDir directory;
    SVGConfig config;
    config.streamOutput = false;
    SVGPageUri uri(directory.uri("page.svg"));
    Drawmere drawmere(&config, &uri);
    for (const int number : {1, 2}) {
        drawmere.initRootSvg(directory.uri("page.svg"));
        drawmere.startPage(number, MoxRectT<MoxLength>());
        SVGFont font = makeFont(uprightFace, false);
        drawmere.setFont(&font, &testFonts());
        drawmere.drawText(number == 1 ? u"X" : u"[", pt(1), pt(2), PAINTMODE_FILL, nullptr, false,
                          true);
        drawmere.endPage();
        drawmere.finishRootSvg();
    }
    drawmere.finish();
    const std::string first = directory.read("page1.svg");
    const std::string second = directory.read("page2.svg");
    EXPECT_NE(first.find("<glyph unicode=\"X\""), std::string::npos);
    EXPECT_EQ(first.find("<glyph unicode=\"[\""), std::string::npos);
    EXPECT_NE(second.find("<glyph unicode=\"[\""), std::string::npos);
    EXPECT_EQ(second.find("<glyph unicode=\"X\""), std::string::npos);
}

TEST(EmbeddedFonts, EndingADocumentOnceMoreAfterAFailureWritesThemOnceMore) {
    const TempDir directory;
    SVGConfig config;
    config.streamOutput = false;
    SVGPageUri uri(directory.uri("later/page.svg"));
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(directory.uri("later/page.svg"));
    drawmere.startPage(1, MoxRectT<MoxLength>());
    SVGFont font = makeFont(uprightFace, false);
    drawmere.setFont(&font, &testFonts());
    drawmere.drawText(u"X", pt(1), pt(2), PAINTMODE_FILL, nullptr, false, true);
    drawmere.endPage();
    EXPECT_THROW(drawmere.finishRootSvg(), MoxError);
    std::filesystem::create_directory(directory.path("later"));
    drawmere.finishRootSvg();
    drawmere.finish();
    const std::string document = directory.read("later/page.svg");
    const std::size_t first = document.find("<glyph unicode=\"X\"");
    EXPECT_NE(first, std::string::npos);
    EXPECT_NE(document.find("<glyph unicode=\"X\"", first + 1), std::string::npos);
}

TEST(EmbeddedFonts, TheSetOfFurtherFontsMayGoBeforeTheDocumentEnds) {
    SvgPage page;
    auto fonts = std::make_unique<FS_ExtraFonts>(testFonts());
    SVGFont font = makeFont(uprightFace, false);
    page->setFont(&font, fonts.get());
    fonts.reset();
    drawText(page, u"X");
    EXPECT_NE(page.body().find("<glyph unicode=\"X\""), std::string::npos);
}

TEST(EmbeddedFonts, StandInDocumentsOfAllProfiles) {
    for (const auto profile : {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC,
                               SVGConfig::SVGTYPE_TINY, SVGConfig::SVGTYPE_PLAZMIC}) {
        SvgPage page(profile);
        SVGFont font = makeFont(uprightFace, false);
        page->setFont(&font, &testFonts());
        drawText(page, u"X");
        EXPECT_NE(page.body().find("<glyph unicode=\"X\""), std::string::npos) << profile;
    }
}

} // namespace
} // namespace DrawmereTest
