#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

namespace DrawmereTest {
namespace {

using DrawmereConvert::ConvertOptions;
using DrawmereConvert::TEXTMODE;
using DrawmereConvert::TEXTMODE_FONTS;
using DrawmereConvert::TEXTMODE_OUTLINES;
using DrawmereConvert::TEXTMODE_PLAIN;
using testing::HasSubstr;
using testing::Not;

const std::string helvetica =
    "/Font<</F<</Type/Font/Subtype/Type1/BaseFont/Helvetica/Encoding/WinAnsiEncoding>>>>";

DrawnPage drawText(const std::string& operators, TEXTMODE mode) {
    return DrawnPage({"BT /F 20 Tf 10 40 Td " + operators + " ET", helvetica}, withText(mode));
}

/// Returns: the tag of the first text.
std::string findText(const DrawnPage& page) {
    const std::size_t start = std::min(page.svg.find("<text x="), page.svg.size());
    return page.svg.substr(start, page.svg.find('>', start) - start + 1);
}

TEST(OutlineText, ARunOfGlyphsIsOnePath) {
    const DrawnPage page = drawText("(Hello) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(page.count("path"), 1);
    EXPECT_TRUE(page.texts().empty());
}

TEST(OutlineText, RunsOfOneColourAreOnePath) {
    const DrawnPage page =
        drawText("(Hello) Tj ET BT /F 10 Tf 10 20 Td (there) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(page.count("path"), 1);
    const DrawnPage colored = drawText("(Hello) Tj 1 0 0 rg (there) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(colored.count("path"), 2);
}

TEST(OutlineText, LongRunsAreWrittenInWholeNumbers) {
    const DrawnPage page = drawText("(Hello) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(page.attribute("path", "transform"), "scale(0.02,0.02)");
    EXPECT_EQ(page.attribute("path", "d").find('.'), std::string::npos);
    EXPECT_EQ(drawText("(I) Tj", TEXTMODE_OUTLINES).attribute("path", "transform"), "(none)");
}

std::string scaleOf(const std::string& operators, float precision) {
    ConvertOptions options;
    options.precision = precision;
    return DrawnPage({"BT " + operators + " (Hello) Tj ET", helvetica}, options)
        .attribute("path", "transform");
}

TEST(OutlineText, TheGridFollowsThePrecisionAndIsFinerForSmallText) {
    EXPECT_EQ(scaleOf("/F 20 Tf", 0.1F), "scale(0.2,0.2)");
    EXPECT_EQ(scaleOf("/F 20 Tf", 0.001F), "scale(0.002,0.002)");
    EXPECT_EQ(scaleOf("/F 4 Tf", 0.01F), "scale(0.01,0.01)");
    EXPECT_EQ(scaleOf("/F 0.1 Tf", 0.01F), "scale(0.00125,0.00125)");
    EXPECT_EQ(scaleOf("/F 0.1 Tf", 0.001F), "scale(0.000125,0.000125)");
}

/// Returns: the path data from each move to the next, without the places of the moves.
std::vector<std::string> shapesOf(const std::string& data) {
    std::vector<std::string> shapes;
    for (std::size_t move = 0; move != std::string::npos;) {
        const std::size_t next = data.find('m', move + 1);
        const std::string subpath = data.substr(move, next - move);
        const std::size_t shape = subpath.find_first_of("chlqv");
        shapes.push_back(shape == std::string::npos ? "" : subpath.substr(shape));
        move = next;
    }
    return shapes;
}

TEST(OutlineText, AGlyphHasTheSameTextWhereverItStands) {
    const DrawnPage page =
        drawText("(n) Tj 3.137 -7.773 Td (nnn) Tj 30 0 Td (n) Tj", TEXTMODE_OUTLINES);
    const std::vector<std::string> shapes = shapesOf(page.attribute("path", "d"));
    ASSERT_EQ(shapes.size(), 5);
    EXPECT_THAT(shapes, testing::Each(shapes[0]));
    EXPECT_FALSE(shapes[0].empty());
}

TEST(OutlineText, TextOfOneColourIsOnePathAcrossOtherText) {
    EXPECT_EQ(
        drawText("(Hello) Tj 1 0 0 rg (there) Tj 0 g (again) Tj", TEXTMODE_OUTLINES).count("path"),
        2);
}

TEST(OutlineText, WhatIsDrawnOverTextStaysOverIt) {
    const std::string text = "BT /F 20 Tf 10 40 Td (Hello) Tj ET ";
    const auto draw = [&](const std::string& box) {
        return DrawnPage({text + "1 0 0 rg " + box + " re f 0 g " + text, helvetica});
    };
    const DrawnPage over = draw("20 40 5 5");
    EXPECT_EQ(over.count("path"), 2);
    EXPECT_LT(over.svg.find("<path"), over.svg.find("<rect"));
    EXPECT_LT(over.svg.find("<rect"), over.svg.rfind("<path"));
    const DrawnPage beside = draw("20 80 5 5");
    EXPECT_EQ(beside.count("path"), 1);
}

TEST(OutlineText, TextOverTextStaysOverIt) {
    const DrawnPage page =
        drawText("(Hello) Tj 1 0 0 rg 1 0 Td (Hello) Tj 0 g 1 0 Td (Hello) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(page.count("path"), 3);
}

TEST(OutlineText, ClearTextIsNotJoined) {
    ConvertOptions options;
    const DrawnPage page(
        {"/G gs BT /F 20 Tf 10 40 Td (Hello) Tj ET BT /F 20 Tf 10 20 Td (Hello) Tj ET",
         helvetica + "/ExtGState<</G<</ca 0.5>>>>"},
        options);
    EXPECT_EQ(page.count("path"), 2);
}

TEST(OutlineText, TextThatIsFilledAndStrokedIsOneElement) {
    const DrawnPage page = drawText("2 Tr 1 0 0 RG (Hello) Tj", TEXTMODE_OUTLINES);
    EXPECT_EQ(page.count("path"), 1);
    EXPECT_EQ(page.attribute("path", "stroke"), "red");
    EXPECT_THAT(page.attribute("path", "d"), testing::EndsWith("z"));
}

TEST(OutlineText, AStrokeOverTextComesBehindIt) {
    const DrawnPage page({"BT /F 20 Tf 10 40 Td (Hello) Tj ET 3 w 10 37 m 60 37 l S", helvetica});
    EXPECT_LT(page.svg.find("<path"), page.svg.find("<line"));
}

TEST(TextWriter, TextThatFollowsItsFontHasOnePosition) {
    const DrawnPage page = drawText("(Hello) Tj", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"Hello"});
    EXPECT_THAT(page.svg, HasSubstr("<text x=\"10\" y=\"60\""));
    EXPECT_EQ(page.count("font"), 1);
    EXPECT_EQ(page.count("glyph"), 4); // H e l o
}

TEST(TextWriter, TextThatDoesNotHasAPositionForEachCharacter) {
    const DrawnPage page = drawText("[(A) 100 (V) 100 (A)] TJ", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"AVA"});
    EXPECT_THAT(page.svg, HasSubstr("<text x=\"10 21.34 32.68\""));
}

TEST(TextWriter, WhatFollowsTheLastShiftNeedsNoPosition) {
    const DrawnPage page = drawText("[(A) 100 (VAV)] TJ", TEXTMODE_FONTS);
    EXPECT_THAT(page.svg, HasSubstr("<text x=\"10 21.34\""));
}

TEST(TextWriter, EachLineIsATextOfItsOwn) {
    const DrawnPage page = drawText("(one) Tj 0 -20 Td (two) Tj", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), (std::vector<std::string>{"one", "two"}));
}

TEST(TextWriter, TurnedTextHasAMatrix) {
    const DrawnPage page = drawText("0 1 -1 0 50 10 Tm (up) Tj", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"up"});
    EXPECT_THAT(page.body(), HasSubstr("transform=\"rotate(-90)\""));
}

TEST(TextWriter, OutlinesThatOverlapFillByTheirOwnRule) {
    EXPECT_EQ(findText(drawText("(o) Tj", TEXTMODE_FONTS)), "<text x=\"10\" y=\"60\">");
    const DrawnPage page(Conversion::document("corruptionOneByteMissing.pdf"), 0,
                         withText(TEXTMODE_FONTS));
    EXPECT_THAT(page.svg, HasSubstr("fill-rule=\"nonzero\">"));
}

TEST(TextWriter, WordsThatAreEquallyFarApartNeedOnePosition) {
    const DrawnPage page = drawText("[(an) -500 (old) -500 (one)] TJ", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"an old one"});
    // Ten points, less the blank of the font.
    EXPECT_EQ(findText(page), "<text x=\"10\" y=\"60\" word-spacing=\"4.44\">");
    EXPECT_THAT(page.svg, HasSubstr("<glyph unicode=\" \" d=\"\""));
}

TEST(TextWriter, WordSpacingIsNotLeftBehind) {
    const DrawnPage page = drawText("[(an) -500 (old)] TJ 0 -20 Td (one) Tj", TEXTMODE_FONTS);
    EXPECT_EQ(page.svg.find("word-spacing"), page.svg.rfind("word-spacing"));
}

TEST(TextWriter, WordsThatAreNotKeepTheirPositions) {
    const DrawnPage page = drawText("[(an) -500 (old) -700 (one)] TJ", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"an old one"});
    EXPECT_EQ(findText(page), "<text x=\"10 21.12 33 42.24 53.36 57.8 69 82.92\" y=\"60\">");
}

TEST(TextWriter, AProfileWithoutWordSpacingGetsPositions) {
    const DrawnPage page({"BT /F 20 Tf 10 40 Td [(an) -500 (old)] TJ ET", helvetica},
                         withText(TEXTMODE_FONTS), DrawmereNS::SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"an old"});
    EXPECT_EQ(findText(page), "<text x=\"10 21.12 33 42.24\" y=\"60\">");
}

// Where viewers leave out a blank, they leave out its position, and the text behind it moves.
TEST(TextWriter, NoBlankLeadsATextAndNoneFollowsAnother) {
    const std::string shown = "(   lead) Tj 0 -20 Td (a    b) Tj 0 -20 Td (   ) Tj";
    const DrawnPage plain = drawText(shown, TEXTMODE_PLAIN);
    EXPECT_EQ(plain.texts(), (std::vector<std::string>{"lead", "a b"}));
    EXPECT_THAT(plain.svg, HasSubstr("<text x=\"26.68 31.12 42.24 53.36\" y=\"60\">"));
    EXPECT_THAT(plain.svg, HasSubstr("<text x=\"10 21.12 43.36\" y=\"80\">"));
    const DrawnPage fonts = drawText(shown, TEXTMODE_FONTS);
    EXPECT_EQ(fonts.texts(), (std::vector<std::string>{"lead", "a b"}));
    EXPECT_THAT(fonts.svg, HasSubstr("<text x=\"26.68\" y=\"60\">"));
    EXPECT_THAT(fonts.svg, HasSubstr("<text x=\"10 21.12 43.36\" y=\"80\">"));
    EXPECT_TRUE(drawText("3 Tr (  ) Tj", TEXTMODE_FONTS).texts().empty());
}

/// Draws a text with a font of which `map` tells what the codes stand for.
DrawnPage drawMapped(const std::string& operators, const std::string& map, TEXTMODE mode) {
    return DrawnPage({"BT /F 20 Tf 10 40 Td " + operators + " ET",
                      "/Font<</F<</Type/Font/Subtype/Type1/BaseFont/Helvetica/ToUnicode 5 0 R>>>>",
                      {{"", "1 begincodespacerange <00> <ff> endcodespacerange\n" + map}}},
                     withText(mode));
}

/// Draws a text in which the glyph of A stands for the letters fi.
DrawnPage drawLigature(const std::string& operators) {
    const std::string map = "1 beginbfchar <41> <00660069> endbfchar\n"
                            "1 beginbfrange <61> <7a> <0061> endbfrange\n";
    return drawMapped(operators, map, TEXTMODE_FONTS);
}

TEST(TextWriter, ALigatureKeepsItsLettersAndThePlaceInItsLine) {
    const DrawnPage page = drawLigature("[(a) -50 (bAcd)] TJ");
    EXPECT_EQ(page.texts(), std::vector<std::string>{"abficd"});
    EXPECT_EQ(findText(page), "<text x=\"10 22.12\" y=\"60\">");
    EXPECT_THAT(page.svg, HasSubstr("<glyph unicode=\"fi\""));
}

TEST(TextWriter, TheLettersOfALigatureHaveNoPositions) {
    const DrawnPage page = drawLigature("[(a) -50 (A) -50 (c)] TJ");
    EXPECT_EQ(page.texts(), (std::vector<std::string>{"afi", "c"}));
    EXPECT_EQ(findText(page), "<text x=\"10 22.12\" y=\"60\">");
}

TEST(TextWriter, LettersThatALigatureStandsForArePlacedOneByOne) {
    EXPECT_EQ(drawLigature("(Aafi) Tj").texts(), (std::vector<std::string>{"fiaf", "i"}));
}

TEST(TextWriter, ALigatureOfLettersThatWereNotOneIsInAFontOfItsOwn) {
    const DrawnPage page = drawLigature("(fia) Tj (A) Tj");
    EXPECT_EQ(page.texts(), (std::vector<std::string>{"fia", "fi"}));
    EXPECT_EQ(page.count("font"), 2);
}

TEST(TextWriter, ABlankThatShowsOrIsPartOfAGlyphIsNeverLeftOut) {
    const std::string map = "2 beginbfchar <41> <0020> <42> <00200066> endbfchar\n";
    const DrawnPage page = drawMapped("(AA) Tj 0 -20 Td (B) Tj", map, TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), (std::vector<std::string>{"\u00A0\u00A0", "\u00A0f"}));
}

TEST(TextWriter, ACharacterBeyondTheFirstPlaneHasOnePosition) {
    const std::string map = "2 beginbfchar <41> <D835DC00> <42> <0042> endbfchar\n";
    const DrawnPage page = drawMapped("(ABA) Tj", map, TEXTMODE_PLAIN);
    EXPECT_EQ(findText(page), "<text x=\"10 23.34 36.68\" y=\"60\">");
}

/// Draws a text in which nothing is known of the glyph of A, and that of B is a soft hyphen.
DrawnPage drawUnknown(const std::string& shown, TEXTMODE mode) {
    const std::string map = "4 beginbfchar <41> <FFFD> <42> <00AD> <43> <0043> "
                            "<44> <00680065006C006C006F> endbfchar\n";
    return drawMapped(shown, map, mode);
}

TEST(TextWriter, GlyphsWithoutCharactersAreOutlinesUnlessTheirFontIsThere) {
    const DrawnPage plain = drawUnknown("(CA) Tj", TEXTMODE_PLAIN);
    EXPECT_EQ(plain.count("path"), 1);
    EXPECT_THAT(plain.texts().at(0), testing::StartsWith("C")); // to be searched for
    EXPECT_THAT(plain.body(), HasSubstr("fill=\"none\""));
    EXPECT_EQ(plain.report.countApproximations(), 1);
    EXPECT_EQ(drawUnknown("(CA) Tj", TEXTMODE_FONTS).count("path"), 0);
    EXPECT_EQ(drawUnknown("(D) Tj", TEXTMODE_PLAIN).count("path"), 1); // that of a whole word
    EXPECT_EQ(drawUnknown("3 Tr (CA) Tj", TEXTMODE_PLAIN).count("path"), 0);
}

TEST(TextWriter, AHyphenThatViewersHideIsOneThatTheyShow) {
    for (const TEXTMODE mode : {TEXTMODE_PLAIN, TEXTMODE_FONTS}) {
        EXPECT_EQ(drawUnknown("(CB) Tj", mode).texts(), std::vector<std::string>{"C\u2010"});
    }
}

// Widths that are not those of the font that stands in for it stretch its glyphs.
TEST(TextWriter, StrokedTextThatCannotBeWrittenIsStrokedAsOutlines) {
    const DrawnPage page(
        {"BT /F 20 Tf 1 Tr 1 0 0 RG 10 40 Td (Hollow) Tj ET", makeNobodysFont(350)},
        withText(TEXTMODE_FONTS));
    EXPECT_EQ(page.report.countApproximations(), 1);
    EXPECT_EQ(page.attribute("path", "stroke"), "red");
    EXPECT_EQ(page.attribute("path", "fill"), "none");
}

TEST(TextWriter, PlainTextNamesFamiliesAndPlacesEachCharacter) {
    const DrawnPage page = drawText("(Hello) Tj", TEXTMODE_PLAIN);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"Hello"});
    EXPECT_EQ(page.count("font"), 0);
    EXPECT_THAT(page.svg, HasSubstr("font-family=\"Helvetica,"));
    EXPECT_THAT(page.svg, HasSubstr("sans-serif"));
    EXPECT_THAT(page.svg, HasSubstr("<text x=\"10 24.44 35.56 40 44.44\""));
}

TEST(TextWriter, TextThatDoesNotShowIsStillText) {
    const DrawnPage page = drawText("3 Tr (hidden) Tj", TEXTMODE_FONTS);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"hidden"});
    EXPECT_THAT(page.body(), HasSubstr("fill=\"none\""));
    EXPECT_EQ(page.count("font"), 0);
    EXPECT_EQ(drawText("3 Tr (hidden) Tj", TEXTMODE_OUTLINES).count("path"), 0);
}

TEST(TextWriter, TextFromRightToLeftIsInTheOrderOfSpeech) {
    const DrawnPage page(Conversion::document("habibi-rotated.pdf"), 0, withText(TEXTMODE_FONTS));
    EXPECT_THAT(page.svg, HasSubstr("\u062D\u064E\u0628\u064A\u0628\u064A"));
    EXPECT_THAT(page.svg, Not(HasSubstr("direction=\"rtl\"")));
}

TEST(Type3Outline, BitmapGlyphsBecomePathsInEveryMode) {
    for (const TEXTMODE mode : {TEXTMODE_OUTLINES, TEXTMODE_FONTS, TEXTMODE_PLAIN}) {
        const DrawnPage page(Conversion::document("french_diacritics.pdf"), 0, withText(mode));
        EXPECT_EQ(page.count("image"), 0);
        EXPECT_GT(page.count("path"), 0);
        EXPECT_EQ(page.report.countApproximations(), 0);
    }
}

} // namespace
} // namespace DrawmereTest
