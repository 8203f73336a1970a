#include "foundation/fontservice/FS_FontInfo.h"

#include "foundation/fontservice/FS_FaceCache.h"
#include "tests/foundation/TestFonts.h"
#include "tests/support/TinyFont.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <climits>
#include <thread>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

constexpr auto language = MoxLang::LANGUAGE_UNSTATED;

// Returns: the only face of a font in memory.
FS_FontInfo createFrom(const std::string& bytes) {
    FS_ExtraFonts extra;
    FS_ExtraFont description;
    description.names = {u"the font"};
    EXPECT_TRUE(extra.addBytes(bytes, description));
    FS_FontInfo font;
    EXPECT_TRUE(font.createFont(u"the font", 400, false, 5, &extra, true));
    return font;
}

FS_FontInfo createFromFile(const std::string& name) { return createFrom(fontBytes(name)); }

FS_GlyphDrawInfo readGlyph(const FS_FontInfo& font, unsigned short glyphId) {
    FS_GlyphDrawInfo info;
    EXPECT_TRUE(font.getGlyphDrawInfo(glyphId, info, false));
    return info;
}

const TinyContour triangle = {{0, 0}, {500, 0}, {250, 700}};

} // namespace

TEST(FS_FontInfo, HandleWithoutAFaceAnswersNeutralValues) {
    const FS_FontInfo font;
    int weight = 0;
    bool italic = true;
    int width = 0;
    font.getFontStyle(&weight, &italic, &width);
    EXPECT_EQ(weight, 400);
    EXPECT_FALSE(italic);
    EXPECT_EQ(width, 5);
    font.getFontStyle(nullptr, nullptr, nullptr);
    EXPECT_FALSE(font.isCreatedFont());
    EXPECT_TRUE(font.getFamilyName(language).isEmpty());
    EXPECT_EQ(font.getUnitsPerEm(), 1000);
    EXPECT_EQ(font.getGlyphID('A', false), 65535);
    EXPECT_EQ(font.getGlyphID('A', true), 65535);
    EXPECT_EQ(font.getDefaultCharWidth(0), 0.0F);
    FS_NewTextMetricEx metrics;
    font.getOutlineTextMetrics(metrics, -1000);
    EXPECT_EQ(metrics.unitsPerEm, 1000);
    EXPECT_EQ(metrics.ascender, 0);
    FS_GlyphDrawInfo info;
    info.horizontalAdvance = 7;
    info.polygons.resize(2);
    EXPECT_FALSE(font.getGlyphDrawInfo(0, info, false));
    EXPECT_EQ(info.horizontalAdvance, 0);
    EXPECT_TRUE(info.polygons.empty());
}

TEST(FS_FontInfo, FailedCreationLeavesTheHandleAsItWas) {
    FS_FontInfo font;
    EXPECT_FALSE(font.createFont(u"Lobsterr", 400, false, 5, nullptr, true));
    EXPECT_FALSE(font.isCreatedFont());
    ASSERT_TRUE(font.createFont(u"Lobster", 400, false, 5, nullptr, true));
    EXPECT_FALSE(font.createFont(u"Lobsterr", 400, false, 5, nullptr, true));
    EXPECT_TRUE(font.isCreatedFont());
    EXPECT_EQ(utf8(font.getFamilyName(language)), "Lobster");
    EXPECT_NE(font.getGlyphID('A', false), 65535);
}

TEST(FS_FontInfo, CopiesShareTheFace) {
    FS_FontInfo font = createFromFile("Lobster.ttf");
    const unsigned short letter = font.getGlyphID('A', false);
    const FS_FontInfo copy = font;
    font = FS_FontInfo();
    EXPECT_FALSE(font.isCreatedFont());
    EXPECT_EQ(font.getGlyphID('A', false), 65535);
    EXPECT_TRUE(copy.isCreatedFont());
    EXPECT_EQ(copy.getGlyphID('A', false), letter);
}

TEST(FS_FontInfo, AnotherFaceForgetsTheGlyphsOfTheFirst) {
    TinyFont first("First");
    first.characters['A'] = first.addGlyph({triangle});
    TinyFont second("Second");
    second.addGlyph({triangle});
    second.characters['A'] = second.addGlyph({triangle});
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(first.build()));
    ASSERT_TRUE(extra.addBytes(second.build()));
    FS_FontInfo font;
    ASSERT_TRUE(font.createFont(u"First", 400, false, 5, &extra, true));
    EXPECT_EQ(font.getGlyphID('A', false), 1);
    ASSERT_TRUE(font.createFont(u"Second", 400, false, 5, &extra, true));
    EXPECT_EQ(font.getGlyphID('A', false), 2);
}

TEST(FS_FontInfo, LinesAndQuadraticCurvesStayWhatTheyAre) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({triangle});
    tiny.addGlyph({{{0, 0}, {100, 200, false}, {200, 0}}});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "M0,0 L500,0 L250,700 Z");
    EXPECT_EQ(outlineOf(font, 2), "M0,0 Q100,200 200,0 Z");
}

TEST(FS_FontInfo, ImpliedPointsAreMadeExplicitToTheHalfUnit) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({{{0, 0}, {100, 1, false}, {201, 0, false}, {300, 0}}});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "M0,0 Q100,1 150.5,0.5 Q201,0 300,0 Z");
}

TEST(FS_FontInfo, ContoursMayBeginAndEndBetweenTheirPoints) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({{{0, 0, false}, {100, 0}, {100, 100}}});
    tiny.addGlyph({{{0, 0, false}, {100, 0, false}, {100, 100, false}, {0, 100, false}}});
    tiny.addGlyph({{{0, 0}, {100, 0}, {100, 100, false}}});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "M100,100 Q0,0 100,0 Z");
    EXPECT_EQ(outlineOf(font, 2), "M0,50 Q0,0 50,0 Q100,0 100,50 Q100,100 50,100 Q0,100 0,50 Z");
    EXPECT_EQ(outlineOf(font, 3), "M0,0 L100,0 Q100,100 0,0 Z");
}

TEST(FS_FontInfo, TheLineThatClosesAContourIsLeftOut) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({{{0, 0}, {100, 0}, {100, 100}, {0, 0}}});
    tiny.addGlyph({{{5, 5}}, triangle, {{7, 7}, {7, 7}}});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "M0,0 L100,0 L100,100 Z");
    EXPECT_EQ(outlineOf(font, 2), "M0,0 L500,0 L250,700 Z");
}

TEST(FS_FontInfo, CompositeGlyphsAreResolved) {
    TinyFont tiny("Tiny");
    const int part = tiny.addGlyph({{{0, 0}, {50, 0}, {50, 50}}});
    const int pair = tiny.addComposite({part, part}, 640);
    const int four = tiny.addComposite({pair, pair});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(pair)),
              "M0,0 L50,0 L50,50 ZM100,0 L150,0 L150,50 Z");
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(four)),
              "M0,0 L50,0 L50,50 ZM100,0 L150,0 L150,50 Z"
              "M100,0 L150,0 L150,50 ZM200,0 L250,0 L250,50 Z");
    EXPECT_EQ(readGlyph(font, static_cast<unsigned short>(pair)).horizontalAdvance, 640);
}

TEST(FS_FontInfo, AdvancesAreInFontUnits) {
    TinyFont tiny("Tiny");
    tiny.unitsPerEm = 2048;
    tiny.addGlyph({triangle}, 617);
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(font.getUnitsPerEm(), 2048);
    EXPECT_EQ(readGlyph(font, 1).horizontalAdvance, 617);
    EXPECT_EQ(font.getDefaultCharWidth(0), 400.0F);
}

TEST(FS_FontInfo, VerticalAdvancesComeFromTheFontElseFromTheEm) {
    TinyFont tiny("Tiny");
    tiny.unitsPerEm = 2048;
    tiny.addGlyph({triangle}, 617);
    EXPECT_EQ(readGlyph(createFrom(tiny.build()), 1).verticalAdvance, 2048);
    tiny.heights = {1500, 1234};
    EXPECT_EQ(readGlyph(createFrom(tiny.build()), 1).verticalAdvance, 1234);
    EXPECT_EQ(readGlyph(createFrom(tiny.build()), 0).verticalAdvance, 1500);
}

TEST(FS_FontInfo, ReadingIntoUsedRecordsLeavesNothingBehind) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({triangle, {{1, 1}, {2, 1, false}, {2, 2}}}, 617);
    tiny.addGlyph({triangle}, 300);
    const FS_FontInfo font = createFrom(tiny.build());
    FS_GlyphDrawInfo info;
    ASSERT_TRUE(font.getGlyphDrawInfo(1, info, false));
    EXPECT_EQ(info.polygons.size(), 2U);
    ASSERT_TRUE(font.getGlyphDrawInfo(2, info, false));
    EXPECT_EQ(info.polygons.size(), 1U);
    EXPECT_EQ(info.polygons[0].points.size(), 3U);
    EXPECT_EQ(info.horizontalAdvance, 300);
    ASSERT_TRUE(font.getGlyphDrawInfo(0, info, false));
    EXPECT_TRUE(info.polygons.empty());
    EXPECT_FALSE(font.getGlyphDrawInfo(3, info, false));
    EXPECT_EQ(info.horizontalAdvance, 0);
}

TEST(FS_FontInfo, CubicCurvesStayCubic) {
    const FS_FontInfo font = createFromFile("SourceHanSans-subset-vert.otf");
    const FS_GlyphDrawInfo info = readGlyph(font, 1); // the letter A
    ASSERT_EQ(info.polygons.size(), 2U);
    EXPECT_EQ(info.polygons[0].segmentTypes, (std::vector<int>{0, 2, 0, 2, 0}));
    EXPECT_EQ(info.polygons[0].points[0], MoxPointT<float>(191, 298));
    EXPECT_EQ(info.polygons[0].points[2], MoxPointT<float>(253, 493));
    EXPECT_EQ(info.horizontalAdvance, 607);
    EXPECT_EQ(info.verticalAdvance, 1000);
}

TEST(FS_FontInfo, VerticalFormsAreThoseTheFontSubstitutes) {
    const FS_FontInfo font = createFromFile("TestVRTR-TTF-Regular.ttf");
    EXPECT_EQ(font.getGlyphID(0xFF3B, false), 9); // a bracket
    EXPECT_EQ(font.getGlyphID(0xFF3B, true), 14);
    EXPECT_EQ(font.getGlyphID(0x4E00, false), 7);
    EXPECT_EQ(font.getGlyphID(0x4E00, true), 7);
    EXPECT_EQ(font.getGlyphID('A', true), 65535);
    const FS_FontInfo kana = createFromFile("SourceHanSans-subset-vert.otf");
    EXPECT_EQ(kana.getGlyphID(0x3041, false), 2);
    EXPECT_EQ(kana.getGlyphID(0x3041, true), 4);
    EXPECT_EQ(kana.getGlyphID(0x4C2E, true), kana.getGlyphID(0x4C2E, false));
}

TEST(FS_FontInfo, WhatIsNoCharacterHasNoGlyph) {
    const FS_FontInfo font = createFromFile("Lobster.ttf");
    for (const int codePoint : {-1, INT_MIN, INT_MAX, 0x110000, 0x10FFFF, 0xD800, 0xFFFF}) {
        EXPECT_EQ(font.getGlyphID(codePoint, false), 65535) << codePoint;
        EXPECT_EQ(font.getGlyphID(codePoint, true), 65535) << codePoint;
    }
    EXPECT_NE(font.getGlyphID(0x20, false), 65535);
}

TEST(FS_FontInfo, GlyphsAreTheSameForEachHandleAndEachTime) {
    const FS_FontInfo font = createFromFile("Lobster.ttf");
    const FS_FontInfo other = createFromFile("Lobster.ttf");
    for (int round = 0; round < 2; ++round) {
        for (int codePoint = 0; codePoint < 0x2200; ++codePoint) {
            const unsigned short glyph = font.getGlyphID(codePoint, false);
            ASSERT_EQ(glyph, FS_FontInfo(other).getGlyphID(codePoint, false)) << codePoint;
        }
    }
}

TEST(FS_FontInfo, SymbolsAnswerToTheCharactersTheyStandFor) {
    TinyFont tiny("Tiny");
    tiny.symbolic = true;
    tiny.characters[0xF041] = tiny.addGlyph({triangle});
    const FS_FontInfo font = createFrom(tiny.build());
    EXPECT_EQ(font.getGlyphID('A', false), 1);
    EXPECT_EQ(font.getGlyphID(0xF041, false), 1);
    EXPECT_EQ(font.getGlyphID('B', false), 65535);
    EXPECT_EQ(font.getGlyphID(0x141, false), 65535);
}

TEST(FS_FontInfo, ArabicLettersAreFoundAmongSymbols) {
    const FS_FontInfo font = createFromFile("SimpArabicTest.ttf");
    EXPECT_NE(font.getGlyphID(0x628, false), 65535);
    EXPECT_NE(font.getGlyphID(0xF120, false), 65535);
    EXPECT_EQ(font.getGlyphID(0x4E00, false), 65535);
}

TEST(FS_FontInfo, TypeOneFontsAreRead) {
    const FS_FontInfo font = createFrom(buildTypeOne());
    EXPECT_EQ(font.getUnitsPerEm(), 1000);
    const unsigned short letter = font.getGlyphID('A', false);
    EXPECT_EQ(outlineOf(font, letter), "M0,0 L500,0 L250,700 Z");
    EXPECT_EQ(readGlyph(font, letter).horizontalAdvance, 600);
    EXPECT_EQ(readGlyph(font, letter).verticalAdvance, 1000);
    EXPECT_EQ(outlineOf(font, font.getGlyphID('B', false)), "M0,0 C0,100 200,400 600,400 Z");
    EXPECT_EQ(font.getGlyphID('C', false), 65535);
    EXPECT_EQ(font.getGlyphID('A', true), letter);
}

TEST(FS_FontInfo, GlyphsThatAreOnlyBitmapsCantBeRead) {
    const FS_FontInfo font = createFrom(buildBitmapFont());
    const unsigned short letter = font.getGlyphID('A', false);
    EXPECT_NE(letter, 65535);
    EXPECT_EQ(outlineOf(font, letter), "unreadable");
    EXPECT_EQ(font.getUnitsPerEm(), 1000);
    EXPECT_EQ(font.getDefaultCharWidth(0), 0.0F);
}

TEST(FS_FontInfo, ReadsTheOutlinesThatTheHeaderOfTheFontNames) {
    const FS_FontInfo font = createFromFile("TestSFNTOne.otf"); // has two sets of them
    EXPECT_EQ(readGlyph(font, 3).polygons[0].segmentTypes, (std::vector<int>{2, 2, 2, 2, 2, 0, 2}));
}

TEST(FS_FontInfo, MetricsAreGivenInTheUnitsAskedFor) {
    TinyFont tiny("Tiny");
    tiny.unitsPerEm = 2000;
    const FS_FontInfo font = createFrom(tiny.build());
    FS_NewTextMetricEx metrics;
    font.getOutlineTextMetrics(metrics, -2000);
    EXPECT_EQ(metrics.unitsPerEm, 2000);
    EXPECT_EQ(metrics.ascender, 800);
    EXPECT_EQ(metrics.descender, -200);
    EXPECT_EQ(metrics.lineGap, 90);
    EXPECT_EQ(metrics.capHeight, 650);
    EXPECT_EQ(metrics.xHeight, 450);
    EXPECT_EQ(metrics.averageCharWidth, 520);
    EXPECT_EQ(metrics.weight, 400);
    EXPECT_FALSE(metrics.italic);
    font.getOutlineTextMetrics(metrics, 1000);
    EXPECT_EQ(metrics.unitsPerEm, 1000);
    EXPECT_EQ(metrics.ascender, 400);
    font.getOutlineTextMetrics(metrics, 0);
    EXPECT_EQ(metrics.ascender, 800);
    font.getOutlineTextMetrics(metrics, INT_MIN);
    EXPECT_EQ(metrics.unitsPerEm, INT_MAX);
}

TEST(FS_FontInfo, AliasOfTheConfigurationIsTheFontItNames) {
    FS_FontInfo font;
    ASSERT_TRUE(font.createFont(u"Slab Sign", 400, false, 5, nullptr, true));
    EXPECT_EQ(utf8(font.getFamilyName(language)), "Lobster");
}

TEST(FS_FontInfo, VariableFontTellsTheWeightItIsSetTo) {
    FS_FontInfo font;
    int weight = 0;
    ASSERT_TRUE(font.createFont(u"Adobe Variable Font Prototype", 700, false, 5, nullptr, true));
    font.getFontStyle(&weight, nullptr, nullptr);
    EXPECT_EQ(weight, 700);
    FS_FontInfo light;
    ASSERT_TRUE(light.createFont(u"Adobe Variable Font Prototype", 300, false, 5, nullptr, true));
    light.getFontStyle(&weight, nullptr, nullptr);
    EXPECT_EQ(weight, 300);
    EXPECT_EQ(font.getFamilyName(language), light.getFamilyName(language));
    EXPECT_NE(outlineOf(font, 1), outlineOf(light, 1));
}

TEST(FS_FontInfo, TwoThreadsMayUseOneFace) {
    const auto use = [](std::string* outlines) {
        for (int round = 0; round < 50; ++round) {
            FS_FontInfo font;
            ASSERT_TRUE(font.createFont(round % 2 == 0 ? u"Lobster" : u"Slab Sign", 400, false, 5,
                                        nullptr, true));
            FS_FontInfo unknown;
            EXPECT_FALSE(unknown.createFont(u"nobody", 400 + round, false, 5, nullptr, true));
            outlines->clear();
            for (int letter = 'A'; letter <= 'Z'; ++letter) {
                *outlines += outlineOf(font, font.getGlyphID(letter, round % 3 == 0));
            }
        }
    };
    std::string outlines[2];
    std::thread one(use, &outlines[0]);
    std::thread other(use, &outlines[1]);
    one.join();
    other.join();
    EXPECT_GT(outlines[0].size(), 1000U);
    EXPECT_EQ(outlines[0], outlines[1]);
}
