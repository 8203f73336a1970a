#include "foundation/fontservice/FS_ExtraFonts.h"

#include "foundation/fontservice/FS_FontInfo.h"
#include "tests/foundation/TestFonts.h"
#include "tests/support/TempDir.h"
#include "tests/support/TinyFont.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <memory>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

// Returns: a font whose only glyph besides the missing one is `advance` wide.
TinyFont makeTiny(const std::string& family, int advance) {
    TinyFont tiny(family);
    tiny.addGlyph({{{0, 0}, {500, 0}, {250, 700}}}, advance);
    return tiny;
}

FS_ExtraFont named(std::vector<UnicodeString> names, int weight = 0,
                   FSSLANT slant = FSSLANT_UNSTATED, int widthClass = 0) {
    FS_ExtraFont font;
    font.names = std::move(names);
    font.weight = weight;
    font.slant = slant;
    font.widthClass = widthClass;
    return font;
}

// What a request finds, in one line: the family name, the style, and the width of glyph 1.
std::string find(FS_ExtraFonts& extra, const UnicodeString& name, int weight = 400,
                 bool italic = false, int widthClass = 5) {
    FS_FontInfo font;
    if (!font.createFont(name, weight, italic, widthClass, &extra, true)) {
        return "none";
    }
    int foundWeight = 0;
    bool foundItalic = false;
    int foundWidth = 0;
    font.getFontStyle(&foundWeight, &foundItalic, &foundWidth);
    FS_GlyphDrawInfo info;
    font.getGlyphDrawInfo(1, info, false);
    return utf8(font.getFamilyName(MoxLang::LANGUAGE_UNSTATED)) + ' ' +
           std::to_string(foundWeight) + (foundItalic ? "i " : "u ") + std::to_string(foundWidth) +
           " " + std::to_string(info.horizontalAdvance);
}

// Returns: the x of the first point of glyph 1, which axes move.
float findShift(FS_ExtraFonts& extra, const UnicodeString& name, int weight, bool italic,
                int widthClass) {
    FS_FontInfo font;
    FS_GlyphDrawInfo info;
    EXPECT_TRUE(font.createFont(name, weight, italic, widthClass, &extra, true));
    EXPECT_TRUE(font.getGlyphDrawInfo(1, info, false));
    return info.polygons.at(0).points.at(0).x;
}

} // namespace

TEST(FS_ExtraFonts, FontAnswersToTheNamesThatTheCallerGives) {
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(makeTiny("Own Name", 501).build(), named({u"F1", u"Alias One"})));
    EXPECT_EQ(extra.count(), 1);
    EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 501");
    EXPECT_EQ(find(extra, u"Alias One"), "F1 400u 5 501");
    EXPECT_EQ(find(extra, u"Own Name"), "none");
    EXPECT_EQ(find(extra, u""), "none");
}

TEST(FS_ExtraFonts, FontWithoutGivenNamesAnswersToItsOwn) {
    TinyFont tiny = makeTiny("Own Name", 501);
    tiny.style = "Bold";
    tiny.weight = 700;
    tiny.postScriptName = "OwnName-Bold";
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(tiny.build(), named({u"", u""})));
    EXPECT_EQ(find(extra, u"Own Name"), "Own Name 700u 5 501");
    EXPECT_EQ(find(extra, u"Own Name Bold"), "Own Name 700u 5 501");
    EXPECT_EQ(find(extra, u"OwnName-Bold"), "Own Name 700u 5 501");
    EXPECT_EQ(find(extra, u"Bold"), "none");
}

TEST(FS_ExtraFonts, CaseCountsOnlyWhenANameWouldNotBeFoundOtherwise) {
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build(), named({u"F1"})));
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 502).build(), named({u"f1"})));
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 503).build(), named({u"\u00C9cole"})));
    EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 501");
    EXPECT_EQ(find(extra, u"f1"), "f1 400u 5 502");
    EXPECT_EQ(find(extra, u"\u00E9COLE"), "\u00C9cole 400u 5 503");
}

TEST(FS_ExtraFonts, FurtherFontsGoBeforeThoseOfTheSystem) {
    FS_ExtraFonts extra;
    EXPECT_EQ(find(extra, u"Lobster").substr(0, 14), "Lobster 400u 5");
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build(), named({u"Lobster"})));
    EXPECT_EQ(find(extra, u"Lobster", 700), "Lobster 400u 5 501");
    EXPECT_EQ(find(extra, u"Lobster Regular").substr(0, 14), "Lobster 400u 5");
    EXPECT_NE(find(extra, u"Lobster Regular"), "Lobster 400u 5 501");
}

TEST(FS_ExtraFonts, FontsOfOneNameAreAFamily) {
    FS_ExtraFonts extra;
    TinyFont bold = makeTiny("Own", 502);
    bold.weight = 700;
    TinyFont italic = makeTiny("Own", 503);
    italic.italic = true;
    TinyFont narrow = makeTiny("Own", 504);
    narrow.widthClass = 3;
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build()));
    ASSERT_TRUE(extra.addBytes(bold.build()));
    ASSERT_TRUE(extra.addBytes(italic.build()));
    EXPECT_EQ(find(extra, u"Own"), "Own 400u 5 501");
    EXPECT_EQ(find(extra, u"Own", 900), "Own 700u 5 502");
    EXPECT_EQ(find(extra, u"Own", 700, true), "Own 400i 5 503");
    EXPECT_EQ(find(extra, u"Own", 400, false, 2), "Own 400u 5 501");
    ASSERT_TRUE(extra.addBytes(narrow.build()));
    EXPECT_EQ(find(extra, u"Own", 400, false, 2), "Own Condensed 400u 3 504");
    EXPECT_EQ(find(extra, u"Own"), "Own 400u 5 501");
}

TEST(FS_ExtraFonts, StatedStyleStandsForThatOfTheFile) {
    FS_ExtraFonts extra;
    const std::string bytes = makeTiny("Own", 501).build();
    ASSERT_TRUE(extra.addBytes(bytes, named({u"F1"}, 300)));
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 502).build(), named({u"F1"}, 800, FSSLANT_ITALIC)));
    EXPECT_EQ(find(extra, u"F1", 400), "F1 300u 5 501");
    EXPECT_EQ(find(extra, u"F1", 400, true), "F1 800i 5 502");
    TinyFont italic = makeTiny("Own", 503);
    italic.italic = true;
    ASSERT_TRUE(extra.addBytes(italic.build(), named({u"F2"}, 1001, FSSLANT_UPRIGHT, 10)));
    EXPECT_EQ(find(extra, u"F2"), "F2 400u 5 503");
    ASSERT_TRUE(extra.addBytes(bytes, named({u"F3"}, 0, FSSLANT_UNSTATED, 3)));
    EXPECT_EQ(find(extra, u"F3"), "F3 400u 3 501");
}

TEST(FS_ExtraFonts, AmongEqualsTheOneAddedLastIsTaken) {
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build()));
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 502).build()));
    EXPECT_EQ(find(extra, u"Own"), "Own 400u 5 502");
}

TEST(FS_ExtraFonts, FontInUseOutlivesTheSet) {
    FS_FontInfo font;
    {
        FS_ExtraFonts extra;
        ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build(), named({u"F1"})));
        ASSERT_TRUE(font.createFont(u"F1", 400, false, 5, &extra, true));
    }
    EXPECT_EQ(outlineOf(font, 1), "M0,0 L500,0 L250,700 Z");
}

TEST(FS_ExtraFonts, SameNameInAnotherSetIsAnotherFont) {
    for (const int advance : {501, 502, 503}) {
        FS_ExtraFonts extra;
        ASSERT_TRUE(extra.addBytes(makeTiny("Own", advance).build(), named({u"F1"})));
        EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 " + std::to_string(advance));
    }
}

TEST(FS_ExtraFonts, CopiesChangeOnTheirOwn) {
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(makeTiny("Own", 501).build(), named({u"F1"})));
    FS_ExtraFonts copy = extra;
    ASSERT_TRUE(copy.addBytes(makeTiny("Own", 502).build(), named({u"F2"})));
    EXPECT_EQ(find(copy, u"F1"), "F1 400u 5 501");
    EXPECT_EQ(find(extra, u"F2"), "none");
    extra = copy;
    EXPECT_EQ(find(extra, u"F2"), "F2 400u 5 502");
    EXPECT_EQ(extra.count(), 2);
}

TEST(FS_ExtraFonts, FilesAreReadLikeBytes) {
    const TempDir folder;
    folder.write("a.ttf", makeTiny("Own", 501).build());
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addFile(folder.uri("a.ttf"), named({u"F1"})));
    EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 501");
}

TEST(FS_ExtraFonts, FileThatWasReplacedIsReadAnew) {
    const TempDir folder;
    for (const int advance : {501, 502}) {
        folder.write("next.ttf", makeTiny("Own", advance).build());
        std::filesystem::rename(folder.path("next.ttf"), folder.path("a.ttf"));
        FS_ExtraFonts extra;
        ASSERT_TRUE(extra.addFile(folder.uri("a.ttf"), named({u"F1"})));
        EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 " + std::to_string(advance));
    }
}

TEST(FS_ExtraFonts, NameOfAFileThatIsGoneFailsAndIsNotLookedUpElsewhere) {
    const TempDir folder;
    folder.write("a.ttf", makeTiny("Own", 501).build());
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addFile(folder.uri("a.ttf"), named({u"Lobster"})));
    std::filesystem::remove(folder.path("a.ttf"));
    EXPECT_EQ(find(extra, u"Lobster"), "none");
}

TEST(FS_ExtraFonts, WhatIsNoFontIsNotAdded) {
    const TempDir folder;
    folder.write("empty.ttf", "");
    folder.write("text.ttf", "This is no font.");
    FS_ExtraFonts extra;
    EXPECT_FALSE(extra.addBytes("", named({u"F1"})));
    EXPECT_FALSE(extra.addBytes("This is no font.", named({u"F1"})));
    EXPECT_FALSE(extra.addBytes(std::string("wOFF\0\1\0\0", 8), named({u"F1"})));
    EXPECT_FALSE(extra.addFile(folder.uri("empty.ttf"), named({u"F1"})));
    EXPECT_FALSE(extra.addFile(folder.uri("text.ttf"), named({u"F1"})));
    EXPECT_FALSE(extra.addFile(folder.uri("absent.ttf"), named({u"F1"})));
    EXPECT_FALSE(extra.addFile(folder.uri(), named({u"F1"})));
    EXPECT_FALSE(extra.addFile(u"/dev/zero", named({u"F1"})));
    EXPECT_FALSE(extra.addFile(u"", named({u"F1"})));
    EXPECT_EQ(extra.count(), 0);
    EXPECT_EQ(find(extra, u"F1"), "none");
}

TEST(FS_ExtraFonts, PackedFontThatClaimsToUnpackWithoutBoundIsNotAdded) {
    std::string bytes = "wOFF" + std::string("\0\1\0\0", 4) + std::string(36, '\0');
    bytes.replace(16, 4, "\xFF\xFF\xFF\xFF");
    FS_ExtraFonts extra;
    EXPECT_FALSE(extra.addBytes(bytes, named({u"F1"})));
}

TEST(FS_ExtraFonts, FontWithoutAnyNameNeedsOneFromTheCaller) {
    FS_ExtraFonts extra;
    const std::string bytes = makeTiny("", 501).build();
    EXPECT_FALSE(extra.addBytes(bytes));
    EXPECT_TRUE(extra.addBytes(bytes, named({u"F1"})));
    EXPECT_EQ(find(extra, u"F1"), "F1 400u 5 501");
}

TEST(FS_ExtraFonts, FacesOfACollectionAreAddedOneByOne) {
    const std::string bytes =
        TinyFont::buildCollection({makeTiny("First", 501), makeTiny("Second", 502)});
    FS_ExtraFonts extra;
    FS_ExtraFont font;
    while (extra.addBytes(bytes, font)) {
        ++font.faceIndex;
    }
    EXPECT_EQ(extra.count(), 2);
    EXPECT_EQ(find(extra, u"First"), "First 400u 5 501");
    EXPECT_EQ(find(extra, u"Second"), "Second 400u 5 502");
    font.faceIndex = -1;
    EXPECT_FALSE(extra.addBytes(bytes, font));
    font.faceIndex = 1 << 16;
    EXPECT_FALSE(extra.addBytes(bytes, font));
}

TEST(FS_ExtraFonts, AxesAreSetToTheWantedWeightAndWidth) {
    TinyFont tiny = makeTiny("Own", 501);
    tiny.axes = {{{'w', 'g', 'h', 't'}, 400, 800}, {{'w', 'd', 't', 'h'}, 100, 200}};
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(tiny.build()));
    EXPECT_EQ(findShift(extra, u"Own", 400, false, 5), 0.0F);
    EXPECT_EQ(findShift(extra, u"Own", 600, false, 5), 50.0F);
    EXPECT_EQ(findShift(extra, u"Own", 800, false, 5), 100.0F);
    EXPECT_EQ(findShift(extra, u"Own", 400, false, 8), 100.0F); // half the way of the second axis
    EXPECT_EQ(findShift(extra, u"Own", 800, false, 9), 300.0F);
    EXPECT_EQ(find(extra, u"Own", 600), "Own 600u 5 501");
    EXPECT_EQ(find(extra, u"Own", 400, false, 8), "Own Extra Expanded 400u 8 501");
}

TEST(FS_ExtraFonts, AxesReachNoFurtherThanTheFontHasThem) {
    TinyFont tiny = makeTiny("Own", 501);
    tiny.axes = {{{'w', 'g', 'h', 't'}, 400, 800}};
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(tiny.build()));
    EXPECT_EQ(find(extra, u"Own", 100), "Own 400u 5 501");
    EXPECT_EQ(find(extra, u"Own", 1000), "Own 800u 5 501");
    EXPECT_EQ(find(extra, u"Own", 700, true, 3), "Own 700u 5 501");
}

TEST(FS_ExtraFonts, ItalicSetsTheAxisOfItalicElseThatOfSlant) {
    const TinyAxis italic = {{'i', 't', 'a', 'l'}, 0, 1};
    const TinyAxis slant = {{'s', 'l', 'n', 't'}, -10, 0, /*fromMost=*/true};
    FS_ExtraFonts extra;
    TinyFont tiny = makeTiny("Own", 501);
    tiny.axes = {italic};
    ASSERT_TRUE(extra.addBytes(tiny.build(), named({u"F1"})));
    tiny.axes = {slant};
    ASSERT_TRUE(extra.addBytes(tiny.build(), named({u"F2"})));
    tiny.axes = {slant, italic};
    ASSERT_TRUE(extra.addBytes(tiny.build(), named({u"F3"})));
    for (const char16_t* name : {u"F1", u"F2", u"F3"}) {
        EXPECT_EQ(findShift(extra, name, 400, false, 5), 0.0F);
    }
    EXPECT_EQ(findShift(extra, u"F1", 400, true, 5), 100.0F);
    EXPECT_EQ(findShift(extra, u"F2", 400, true, 5), 100.0F);
    EXPECT_EQ(findShift(extra, u"F3", 400, true, 5), 200.0F);
    EXPECT_EQ(find(extra, u"F1", 400, true), "F1 400i 5 501");
    EXPECT_EQ(find(extra, u"F2", 400, true), "F2 400i 5 501");
    EXPECT_EQ(find(extra, u"F2"), "F2 400u 5 501");
}

TEST(FS_ExtraFonts, StatedWeightSetsTheAxis) {
    TinyFont tiny = makeTiny("Own", 501);
    tiny.axes = {{{'w', 'g', 'h', 't'}, 400, 800}};
    const std::string bytes = tiny.build();
    FS_ExtraFonts extra;
    ASSERT_TRUE(extra.addBytes(bytes, named({u"F1"}, 400)));
    ASSERT_TRUE(extra.addBytes(bytes, named({u"F1"}, 800)));
    EXPECT_EQ(find(extra, u"F1", 900), "F1 800u 5 501");
    EXPECT_EQ(findShift(extra, u"F1", 900, false, 5), 100.0F);
    EXPECT_EQ(findShift(extra, u"F1", 400, false, 5), 0.0F);
}
