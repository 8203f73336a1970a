// What a font writes.
#include "fonts/SVGEmbFont.h"

#include "tests/draw/DrawnTree.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tree/SVGTreeManager.h"

#include "SVGConfig.h"

#include <gtest/gtest.h>
#include <limits>

namespace DrawmereTest {
namespace {

using MoxFontService_NS::FS_GlyphPolygon;

/// A font of the tests and a document with a root to write it into.
struct FontTree {
    explicit FontTree(const UnicodeString& name) : font(makeFont(name, false), &testFonts()) {
        tree.setSVGDocProp(u"1.1", &config);
    }

    void embed(const UnicodeString& text, std::vector<TLGlyphEntry> entries, bool vertical = false,
               bool wholeRun = false) {
        embedGlyphs(font, text, std::move(entries), wholeRun, vertical);
    }

    std::string xml(const MoxNode* node) const { return toXml(*tree.document, node); }

    /// Returns: what the root holds, one tag a line.
    std::string content() const {
        std::string text;
        const MoxElement* root = tree.document->getDocumentElement();
        for (const MoxNode* child = root->getFirstChild(); child; child = child->getNextSibling()) {
            text += xml(child);
        }
        return text;
    }

    /// Returns: the font as it is written, without the outlines.
    std::string written() {
        font.doEmbedFont(&tree);
        std::string text = content();
        for (std::size_t at = 0; (at = text.find(" d=\"M", at)) != std::string::npos;) {
            text.erase(at + 4, text.find('"', at + 4) - at - 4);
            text.insert(at + 4, "~");
            ++at;
        }
        return text;
    }

    SVGConfig config;
    SVGTreeManager tree;
    SVGEmbFont font;
};

FS_GlyphDrawInfo makeInfo(int horizontalAdvance, int verticalAdvance, bool withOutline = true) {
    FS_GlyphDrawInfo info;
    info.horizontalAdvance = horizontalAdvance;
    info.verticalAdvance = verticalAdvance;
    if (withOutline) {
        info.polygons = {FS_GlyphPolygon{{0, 0}, {{10, 20}, {30, 20}, {30, 40}}}};
    }
    return info;
}

// One element.

TEST(SVGEmbFontGlyph, HasItsTextItsOutlineAndItsAdvance) {
    FontTree tree(uprightFace);
    int emptyCount = 0;
    const auto glyph = tree.font.convGlyph(makeInfo(600, 1000), u"A", &tree.tree, emptyCount);
    EXPECT_EQ(tree.xml(glyph.get()),
              R"(<glyph unicode="A" d="M10 20L30 20L30 40Z" horiz-adv-x="600"/>)");
    EXPECT_EQ(emptyCount, 0);
}

TEST(SVGEmbFontGlyph, OfAnEmptyTextStandsForWhatIsMissing) {
    FontTree tree(uprightFace);
    int emptyCount = 0;
    const auto glyph = tree.font.convGlyph(makeInfo(600, 1000), u"", &tree.tree, emptyCount);
    EXPECT_EQ(tree.xml(glyph.get()),
              R"(<missing-glyph d="M10 20L30 20L30 40Z" horiz-adv-x="600"/>)");
}

TEST(SVGEmbFontGlyph, OfABlankHasAnEmptyOutlineAndCountsAsEmpty) {
    FontTree tree(uprightFace);
    int emptyCount = 2;
    const auto glyph =
        tree.font.convGlyph(makeInfo(250, 1000, false), u" ", &tree.tree, emptyCount);
    EXPECT_EQ(tree.xml(glyph.get()), R"(<glyph unicode=" " d="" horiz-adv-x="250"/>)");
    EXPECT_EQ(emptyCount, 3);
}

TEST(SVGEmbFontGlyph, WithoutGlyphsHasNoAdvanceAndCountsAsEmptyOnce) {
    FontTree tree(uprightFace);
    int emptyCount = 0;
    auto glyph = tree.font.convGlyph({}, u"x", &tree.tree, emptyCount, false);
    EXPECT_EQ(tree.xml(glyph.get()), R"(<glyph unicode="x" d="" horiz-adv-x="0"/>)");
    EXPECT_EQ(emptyCount, 1);
    glyph = tree.font.convGlyph({}, u"x", &tree.tree, emptyCount, true);
    EXPECT_EQ(tree.xml(glyph.get()), R"(<glyph unicode="x" d="" vert-adv-y="0" orientation="v"/>)");
}

TEST(SVGEmbFontGlyph, SetsSeveralGlyphsOneBehindTheOther) {
    FontTree tree(uprightFace);
    int emptyCount = 0;
    const auto glyph =
        tree.font.convGlyph({makeInfo(600, 1000), makeInfo(50, 900, false), makeInfo(500, 800)},
                            u"ab", &tree.tree, emptyCount, false);
    EXPECT_EQ(
        tree.xml(glyph.get()),
        R"(<glyph unicode="ab" d="M10 20L30 20L30 40ZM660 20L680 20L680 40Z" horiz-adv-x="1150"/>)");
    EXPECT_EQ(emptyCount, 0);
}

TEST(SVGEmbFontGlyph, SetsSeveralGlyphsOfVerticalTextOneAboveTheOther) {
    FontTree tree(uprightFace);
    int emptyCount = 0;
    const auto glyph = tree.font.convGlyph({makeInfo(600, 1000), makeInfo(500, 800)}, u"ab",
                                           &tree.tree, emptyCount, true);
    EXPECT_EQ(tree.xml(glyph.get()), R"(<glyph unicode="ab" d="M10 20L30 20L30 40Z)"
                                     R"(M10 1020L30 1020L30 1040Z" vert-adv-y="1800")"
                                     R"( orientation="v"/>)");
}

TEST(SVGEmbFontGlyph, TellsItsDirectionWhenTheTextHasAVerticalFormToo) {
    FontTree tree(uprightFace);
    tree.embed(u"A", {{1, 2}}, /*vertical=*/true);
    int emptyCount = 0;
    const auto both = tree.font.convGlyph(makeInfo(600, 1000), u"A", &tree.tree, emptyCount);
    EXPECT_EQ(tree.xml(both.get()), R"(<glyph unicode="A" d="M10 20L30 20L30 40Z")"
                                    R"( horiz-adv-x="600" orientation="h"/>)");
    const auto one = tree.font.convGlyph(makeInfo(600, 1000), u"B", &tree.tree, emptyCount);
    EXPECT_EQ(tree.xml(one.get()).find("orientation"), std::string::npos);
}

TEST(SVGEmbFontGlyph, AdvancesThatAnIntegerCanNotHoldStopAtItsLimit) {
    constexpr int highest = std::numeric_limits<int>::max();
    constexpr int lowest = std::numeric_limits<int>::min();
    FontTree tree(uprightFace);
    int emptyCount = 0;
    const auto up = tree.font.convGlyph({makeInfo(highest, 0, false), makeInfo(highest, 0, false)},
                                        u"x", &tree.tree, emptyCount, false);
    EXPECT_EQ(tree.xml(up.get()), R"(<glyph unicode="x" d="" horiz-adv-x="2147483647"/>)");
    const auto down = tree.font.convGlyph({makeInfo(0, lowest, false), makeInfo(0, lowest, false)},
                                          u"x", &tree.tree, emptyCount, true);
    EXPECT_EQ(tree.xml(down.get()),
              R"(<glyph unicode="x" d="" vert-adv-y="-2147483648" orientation="v"/>)");
}

// Reading glyphs.

TEST(SVGEmbFontGlyphs, AreReadInOrderUpToTheFirstThatCanNotBeRead) {
    FontTree tree(uprightFace);
    std::vector<FS_GlyphDrawInfo> infos(7);
    EXPECT_TRUE(tree.font.getGlyphDrawInfos({1, 2, 5}, infos, false));
    ASSERT_EQ(infos.size(), 3U);
    EXPECT_EQ(infos[0].horizontalAdvance, 250);
    EXPECT_EQ(infos[1].horizontalAdvance, 500);
    EXPECT_EQ(infos[2].horizontalAdvance, 750);
    EXPECT_FALSE(tree.font.getGlyphDrawInfos({2, 60000, 5}, infos, false));
    ASSERT_EQ(infos.size(), 1U);
    EXPECT_EQ(infos[0].horizontalAdvance, 500);
    EXPECT_TRUE(tree.font.getGlyphDrawInfos({}, infos, false));
    EXPECT_TRUE(infos.empty());
}

TEST(SVGEmbFontGlyphs, TheGlyphForWhatIsMissingNeedsAFace) {
    FontTree tree(uprightFace);
    const auto font = tree.tree.document->createSVGElement(SVGName::font);
    tree.font.addMissingGlyph(font.get(), &tree.tree);
    ASSERT_NE(font->getFirstChild(), nullptr);
    EXPECT_TRUE(tree.xml(font->getFirstChild()).starts_with("<missing-glyph d=\"M"));
    EXPECT_EQ(font->getFirstChild()->getNextSibling(), nullptr);

    FontTree faceless(u"No Such Face");
    const auto empty = faceless.tree.document->createSVGElement(SVGName::font);
    faceless.font.addMissingGlyph(empty.get(), &faceless.tree);
    EXPECT_FALSE(empty->hasChildNodes());
}

// The whole font.

constexpr const char* uprightStart =
    R"(<font horiz-adv-x="1000">
<font-face font-family="'Upright Test'" font-weight="normal" font-style="normal" units-per-em="1000"/>
<missing-glyph d="~" horiz-adv-x="1000"/>
)";

TEST(SVGEmbFontElement, HasItsFaceWhatIsMissingAndAGlyphForEachText) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"X ", false);
    EXPECT_EQ(tree.written(), std::string(uprightStart) +
                                  R"(<glyph unicode="X" d="~" horiz-adv-x="500"/>
<glyph unicode=" " d="" horiz-adv-x="250"/>
</font>)");
}

TEST(SVGEmbFontElement, GlyphsOfVerticalTextComeFirst) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"\uFF3B\u4E00", true);
    tree.font.embedText(u"\uFF3BX", false);
    EXPECT_EQ(tree.written(), std::string(uprightStart) +
                                  "<glyph unicode=\"\uFF3B\" d=\"~\" vert-adv-y=\"1000\""
                                  " orientation=\"v\"/>\n"
                                  "<glyph unicode=\"\uFF3B\" d=\"~\" horiz-adv-x=\"750\""
                                  " orientation=\"h\"/>\n"
                                  "<glyph unicode=\"\u4E00\" d=\"~\" horiz-adv-x=\"750\"/>\n"
                                  "<glyph unicode=\"X\" d=\"~\" horiz-adv-x=\"500\"/>\n"
                                  "</font>");
}

TEST(SVGEmbFontElement, LongerTextsComeFirst) {
    FontTree tree(latinFace);
    tree.embed(u"ffiffi", {{1, 192}, {2, 192}, {3, 192}});
    const std::string text = tree.written();
    const std::size_t places[] = {text.find("unicode=\"ffi\""), text.find("unicode=\"fi\""),
                                  text.find("unicode=\"f\"")};
    EXPECT_LT(places[0], places[1]);
    EXPECT_LT(places[1], places[2]);
    EXPECT_NE(places[2], std::string::npos);
}

TEST(SVGEmbFontElement, TellsTheWeightAndSlantOfTheFaceThatWasFound) {
    FontTree tree(uprightFace);
    SVGEmbFont bold(makeFont(uprightFace, false, 700, FSTYLE_ITALIC), &testFonts());
    bold.embedText(u"X", false);
    bold.doEmbedFont(&tree.tree);
    EXPECT_NE(tree.content().find(R"(font-weight="normal" font-style="normal")"),
              std::string::npos);
}

TEST(SVGEmbFontElement, WritesBoldAndItalicAsWordsAndOtherWeightsAsNumbers) {
    struct Row {
        int weight;
        MoxFontService_NS::FSSLANT slant;
        const char* text;
    };

    constexpr Row rows[] = {
        {400, MoxFontService_NS::FSSLANT_UPRIGHT, R"(font-weight="normal" font-style="normal")"},
        {700, MoxFontService_NS::FSSLANT_ITALIC, R"(font-weight="bold" font-style="italic")"},
        {600, MoxFontService_NS::FSSLANT_UPRIGHT, R"(font-weight="600" font-style="normal")"},
    };
    const UnicodeString path = fontPath("le-murmure.otf");
    for (const Row& row : rows) {
        FS_ExtraFonts fonts;
        fonts.addFile(path, {.names = {u"Styled"}, .weight = row.weight, .slant = row.slant});
        FontTree tree(uprightFace);
        SVGEmbFont font(makeFont(u"Styled", false), &fonts);
        font.embedText(u"f", false);
        font.doEmbedFont(&tree.tree);
        EXPECT_NE(tree.content().find(row.text), std::string::npos) << row.text;
    }
}

TEST(SVGEmbFontElement, OfBlanksAloneIsTakenOutAgain) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"  \u3000", false);
    EXPECT_EQ(tree.written(), "");
}

TEST(SVGEmbFontElement, WithoutTextIsTakenOutAgain) {
    FontTree tree(uprightFace);
    EXPECT_EQ(tree.written(), "");
    FontTree faceless(u"No Such Face");
    EXPECT_EQ(faceless.written(), "");
}

TEST(SVGEmbFontElement, ATextWithAGlyphThatCanNotBeReadHasNoElement) {
    FontTree tree(uprightFace);
    tree.embed(u"ab", {{1, 2}, {0, 60000}, {1, 3}});
    tree.embed(u"c", {{1, noGlyph}});
    EXPECT_EQ(tree.written(), std::string(uprightStart) +
                                  R"(<glyph unicode="b" d="~" horiz-adv-x="500"/>
</font>)");
}

TEST(SVGEmbFontElement, OfWhichNothingCanBeReadStays) {
    FontTree tree(uprightFace);
    tree.embed(u" ", {{1, 1}});
    tree.embed(u"c", {{1, 60000}});
    EXPECT_EQ(tree.written(), std::string(uprightStart) +
                                  R"(<glyph unicode=" " d="" horiz-adv-x="250"/>
</font>)");
}

TEST(SVGEmbFontElement, OfNoFaceStaysWithoutGlyphsWhenThereIsText) {
    FontTree tree(u"No Such Face");
    tree.embed(u"a", {{1, 5}});
    EXPECT_EQ(tree.written(), R"(<font horiz-adv-x="0">
<font-face font-family="'No Such Face'" font-weight="normal" font-style="normal" units-per-em="1000"/>
</font>)");
    // Once when it was made, once when it was written.
    const std::string message = utf8(tree.font.getErrorMessage());
    EXPECT_NE(message.find("Create font error"), message.rfind("Create font error"));
}

TEST(SVGEmbFontElement, AWholeRunWithoutGlyphsIsAnEmptyGlyph) {
    FontTree tree(uprightFace);
    tree.embed(u"X", {{1, 2}});
    tree.embed(u"run", {{3, noGlyph}}, false, /*wholeRun=*/true);
    EXPECT_NE(tree.written().find(R"(<glyph unicode="run" d="" horiz-adv-x="0"/>)"),
              std::string::npos);
}

TEST(SVGEmbFontElement, TheMapsStayAsTheyWere) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"X", false);
    tree.font.doEmbedFont(&tree.tree);
    EXPECT_EQ(describe(tree.font.horizontalGlyphs), "X=2");
}

TEST(SVGEmbFontElement, ASecondCallWritesASecondFont) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"X", false);
    tree.font.doEmbedFont(&tree.tree);
    const std::string once = tree.content();
    tree.font.doEmbedFont(&tree.tree);
    EXPECT_EQ(tree.content(), once + once);
}

TEST(SVGEmbFontElement, NeedsATreeWithARoot) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"X", false);
    SVGTreeManager empty;
    tree.font.doEmbedFont(&empty);
    tree.font.doEmbedFont(nullptr);
    EXPECT_EQ(empty.document->getDocumentElement(), nullptr);
}

TEST(SVGEmbFontElement, StandsNowhereWhileAGradientIsOpen) {
    FontTree tree(uprightFace);
    tree.font.embedText(u"X", false);
    tree.tree.setupStopLock();
    EXPECT_EQ(tree.written(), "");
}

} // namespace
} // namespace DrawmereTest
