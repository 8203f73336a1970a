#include "tools/convert/WordGaps.h"

#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::TEXTMODE;
using DrawmereConvert::TEXTMODE_FONTS;
using DrawmereConvert::TEXTMODE_PLAIN;
using DrawmereConvert::TextSpan;
using DrawmereConvert::WordGaps;
using testing::Contains;
using testing::Each;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

/// Sets glyphs that are half of the size of their font, 10 points, and looks for words.
/// Shape: `starts`, a position for each letter.
/// Returns: the letters, with a blank wherever a word ends.
std::u16string separate(const std::u16string& letters, const std::vector<float>& starts) {
    std::vector<TextSpan::Cluster> clusters;
    for (std::size_t i = 0; i < letters.size(); ++i) {
        clusters.push_back({letters.substr(i, 1), 0, {starts[i], 0}, 5, 5, false});
    }
    WordGaps::Clusters line;
    for (const TextSpan::Cluster& cluster : clusters) {
        line.push_back(&cluster);
    }
    const WordGaps gaps(line, 10);
    std::u16string text;
    for (std::size_t i = 0; i < letters.size(); ++i) {
        text += gaps.isBefore(i) ? u" " : u"";
        text += letters[i];
    }
    return text;
}

DrawnPage drawText(const std::string& operators, TEXTMODE mode,
                   const std::string& more = "/Encoding/WinAnsiEncoding") {
    return DrawnPage({"BT /F 20 Tf 10 40 Td " + operators + " ET",
                      "/Font<</F<</Type/Font/Subtype/Type1/BaseFont/Helvetica" + more + ">>>>"},
                     withText(mode));
}

std::string textOf(const std::string& operators, TEXTMODE mode = TEXTMODE_PLAIN) {
    return testing::PrintToString(drawText(operators, mode).texts());
}

TEST(WordGaps, PhrasesOfATypesetPageHaveTheirBlanks) {
    for (const TEXTMODE mode : {TEXTMODE_PLAIN, TEXTMODE_FONTS}) {
        const DrawnPage page(Conversion::document("pdflatex-outline.pdf"), 1, withText(mode));
        EXPECT_THAT(page.texts(), Contains(StartsWith("Hello, here is some text without a")));
        EXPECT_THAT(page.texts(), Contains("1 Foo"));
        EXPECT_THAT(page.texts(), Each(Not(HasSubstr("  "))));
        EXPECT_THAT(page.texts(), Each(Not(StartsWith(" "))));
    }
}

TEST(WordGaps, ABlankTakesAWholePositionAndMovesNoGlyph) {
    const DrawnPage page = drawText("[(an) -300 (old)] TJ", TEXTMODE_PLAIN);
    EXPECT_EQ(page.texts(), std::vector<std::string>{"an old"});
    EXPECT_THAT(page.svg, HasSubstr("<text x=\"10 21.12 33 38.24 49.36 53.8\" y=\"60\">"));
    const DrawnPage fonts = drawText("[(A) 100 (V) -300 (a) -200 (b)] TJ", TEXTMODE_FONTS);
    EXPECT_EQ(fonts.texts(), std::vector<std::string>{"AV a b"});
    EXPECT_THAT(fonts.svg, HasSubstr("<text x=\"10 21.34 35 40.68 52 55.8\" y=\"60\">"));
}

TEST(WordGaps, ANarrowGapHasAPositionWithinIt) {
    const std::vector<TextSpan::Cluster> clusters = {{u"a", 0, {0.1F, 0}, 0.5F, 0.5F, false},
                                                     {u"b", 0, {0.8F, 0}, 0.5F, 0.5F, false},
                                                     {u"c", 0, {1.3F, 0}, 0.5F, 0.5F, false}};
    const WordGaps gaps({&clusters[0], &clusters[1], &clusters[2]}, 1);
    ASSERT_TRUE(gaps.isBefore(1));
    EXPECT_EQ(gaps.size(), 1);
    EXPECT_FLOAT_EQ(gaps.findPlace(1), 0.7F);
}

TEST(WordGaps, NoBlankComesBesideAnother) {
    for (const TEXTMODE mode : {TEXTMODE_PLAIN, TEXTMODE_FONTS}) {
        EXPECT_EQ(textOf("[(an ) -500 (old) -700 ( one)] TJ", mode), "{ \"an old one\" }");
    }
}

TEST(WordGaps, ThinSpacesAndKerningAreNoGaps) {
    EXPECT_EQ(textOf("[(1) -167 (000 is mu) -100 (ch)] TJ"), "{ \"1000 is much\" }");
}

TEST(WordGaps, LettersThatAreSpacedOutAreOneWord) {
    for (const TEXTMODE mode : {TEXTMODE_PLAIN, TEXTMODE_FONTS}) {
        EXPECT_EQ(textOf("6 Tc (Spaced) Tj", mode), "{ \"Spaced\" }");
        EXPECT_EQ(textOf("6 Tc (so) Tj", mode), "{ \"so\" }");
        EXPECT_EQ(textOf("6 Tc [(To) -300 (be)] TJ", mode), "{ \"To be\" }");
        EXPECT_EQ(textOf("[(is) -300] TJ 5 Tc [(very) -300] TJ 0 Tc (far) Tj", mode),
                  "{ \"is very far\" }");
    }
}

TEST(WordGaps, DigitsAndSignsThatAreApartAreWords) {
    EXPECT_EQ(textOf("6 Tc (100) Tj"), "{ \"1 0 0\" }");
    EXPECT_EQ(textOf("6 Tc (x=r*u) Tj"), "{ \"x = r * u\" }");
    EXPECT_EQ(textOf("10 Tc (xyz) Tj"), "{ \"x y z\" }"); // half of the size and more
}

TEST(WordGaps, WordsOfOneLetterAreWords) {
    EXPECT_EQ(textOf("[(is) -300 (a) -300 (big) -300 (a) -300 (b) -300 (one)] TJ"),
              "{ \"is a big a b one\" }");
}

TEST(WordGaps, RowsOfDotsStayTogether) {
    EXPECT_EQ(textOf("[(One) -500] TJ 9 Tc (...2) Tj"), "{ \"One ... 2\" }");
}

TEST(WordGaps, TheDirectionDoesNotMatter) {
    EXPECT_EQ(separate(u"\u05D0\u05D1\u05D2\u05D3", {50, 45, 37, 32}),
              u"\u05D0\u05D1 \u05D2\u05D3");
    // Digits within run from left to right.
    EXPECT_EQ(separate(u"\u05D0\u05D112\u05D2\u05D3", {50, 45, 32, 37, 24, 19}),
              u"\u05D0\u05D1 12 \u05D2\u05D3");
}

TEST(WordGaps, AnAccentIsNoEndOfAWord) {
    EXPECT_EQ(separate(u"e\u00B4tat", {0, 0.5F, 5, 10, 15}), u"e\u00B4tat");
    EXPECT_EQ(separate(u"ab\u05B8cd", {20, 15, 17, 10, 5}), u"ab\u05B8cd");
}

// What it has is the width of the document, not of the font that stands in for its own.
TEST(WordGaps, AFontThatStandsInForAWiderOneHasNoGaps) {
    const DrawnPage page({"BT /F 20 Tf 10 40 Td [(ill)] TJ -300 0 Td [(till) -300 (it)] TJ ET",
                          makeNobodysFont(900)},
                         withText(TEXTMODE_PLAIN));
    EXPECT_EQ(page.texts(), (std::vector<std::string>{"ill till it"}));
}

} // namespace
} // namespace DrawmereTest
