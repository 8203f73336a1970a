#include "post/SVGOptimizer.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <unicode/locid.h>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;
using MoxCommonNS::MoxDocument;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNode;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxValue;

namespace {

MoxName name(const UnicodeString& text) { return MoxName(text); }

/// A tree written in short: "svg(g(rect)g)" is a `g` with a `rect` and an empty `g` in an `svg`; a
/// text in quotes, 'a', is a text node.
class SVGOptimizerTest : public testing::Test {
protected:
    void read(const std::string& tree) {
        document = new MoxDocument;
        MoxNode* parent = document.get();
        std::size_t index = 0;
        while (index < tree.size()) {
            if (tree[index] == ')') {
                parent = parent->getParentNode();
                ++index;
            } else {
                parent = readNode(parent, tree, index);
            }
        }
        root = document->getDocumentElement();
    }

    std::string optimized(const std::string& tree, const char16_t* profile = u"") {
        read(tree);
        if (*profile) {
            root->setAttribute(name(u"baseProfile"), MoxValue(profile));
        }
        SVGOptimizer::optimize(root);
        return write(root);
    }

    static std::string write(const MoxNode* node) {
        if (node->isText()) {
            return "'" + utf8(node->getText()) + "'";
        }
        std::string inside;
        std::size_t count = 0;
        for (const MoxNode* child = node->getFirstChild(); child; child = child->getNextSibling()) {
            inside += (count++ ? " " : "") + write(child);
        }
        const std::string tag =
            utf8(MoxCommonNS::MoxNameTable::getSharedNameString(node->getNodeName()));
        return count ? tag + "(" + inside + ")" : tag;
    }

    MoxPtr<MoxDocument> document;
    MoxElement* root = nullptr;

private:
    /// Returns: where the next node goes.
    MoxNode* readNode(MoxNode* parent, const std::string& tree, std::size_t& index) {
        if (tree[index] == ' ') {
            ++index;
            return parent;
        }
        if (tree[index] == '\'') {
            const std::size_t end = tree.find('\'', index + 1);
            const std::string text = tree.substr(index + 1, end - index - 1);
            parent->appendChildText(UnicodeString::fromUTF8(text));
            index = end + 1;
            return parent;
        }
        const std::size_t end = std::min(tree.find_first_of("() ", index), tree.size());
        const auto tag = UnicodeString::fromUTF8(tree.substr(index, end - index));
        MoxNode* element = parent->appendChild(document->createElement(name(tag)).get());
        const bool hasChildren = end < tree.size() && tree[end] == '(';
        index = hasChildren ? end + 1 : end;
        return hasChildren ? element : parent;
    }
};

/// Makes Turkish the locale of the user for one test.
class TurkishLocale {
public:
    TurkishLocale() { set(icu::Locale("tr")); }

    TurkishLocale(const TurkishLocale&) = delete;
    TurkishLocale& operator=(const TurkishLocale&) = delete;

    ~TurkishLocale() { set(before); }

private:
    static void set(const icu::Locale& locale) {
        UErrorCode status = U_ZERO_ERROR;
        icu::Locale::setDefault(locale, status);
    }

    icu::Locale before = icu::Locale::getDefault();
};

} // namespace

TEST_F(SVGOptimizerTest, EmptyGroupIsRemoved) { EXPECT_EQ(optimized("svg(g rect)"), "svg(rect)"); }

TEST_F(SVGOptimizerTest, EmptySiblingsAreRemovedEach) {
    EXPECT_EQ(optimized("svg(g g g rect g g line)"), "svg(rect line)");
}

TEST_F(SVGOptimizerTest, GroupWithContentStays) {
    EXPECT_EQ(optimized("svg(g(rect) g('a') line)"), "svg(g(rect) g('a') line)");
}

TEST_F(SVGOptimizerTest, OtherEmptyElementsStay) {
    EXPECT_EQ(optimized("svg(a defs glyph text line)"), "svg(a defs glyph text line)");
}

TEST_F(SVGOptimizerTest, AttributesDoNotSaveAnEmptyGroup) {
    read("svg(g rect)");
    MoxCommonNS::narrow<MoxElement>(root->getFirstChild())
        ->setAttribute(name(u"transform"), MoxValue(u"scale(2)"));
    SVGOptimizer::optimize(root);
    EXPECT_EQ(write(root), "svg(rect)");
}

// On purpose: an empty group goes only when the walk gives the node behind it. So the last node of
// a document stays.
TEST_F(SVGOptimizerTest, EmptyGroupThatIsTheLastNodeStays) {
    EXPECT_EQ(optimized("svg(rect g)"), "svg(rect g)");
    EXPECT_EQ(optimized("svg(g g)"), "svg(g)");
    EXPECT_EQ(optimized("svg(rect g(line g))"), "svg(rect g(line g))");
}

// On purpose: a group that loses its last group stays, as it was tested before.
TEST_F(SVGOptimizerTest, GroupThatLosesItsLastGroupStays) {
    EXPECT_EQ(optimized("svg(g(g) rect)"), "svg(g rect)");
    EXPECT_EQ(optimized("svg(g(g(g)) rect)"), "svg(g(g) rect)");
    EXPECT_EQ(optimized("svg(g(g))"), "svg(g(g))");
}

TEST_F(SVGOptimizerTest, EmptyGroupInsideDefinitionsIsRemoved) {
    EXPECT_EQ(optimized("svg(defs(g pattern(g rect)) line)"), "svg(defs(pattern(rect)) line)");
}

TEST_F(SVGOptimizerTest, TextBehindAnEmptyGroupIsANodeToo) {
    EXPECT_EQ(optimized("svg(g 'a')"), "svg('a')");
}

TEST_F(SVGOptimizerTest, RootStaysEvenWhenItIsAnEmptyGroup) {
    EXPECT_EQ(optimized("g"), "g");
    SVGOptimizer::optimize(nullptr);
}

TEST_F(SVGOptimizerTest, EmptyDefinitionsGoInOneProfileOnly) {
    EXPECT_EQ(optimized("svg(defs rect)", u"wisp"), "svg(rect)");
    EXPECT_EQ(optimized("svg(defs rect)"), "svg(defs rect)");
    EXPECT_EQ(optimized("svg(defs rect)", u"tiny"), "svg(defs rect)");
    EXPECT_EQ(optimized("svg(defs rect)", u"wisp2"), "svg(defs rect)");
}

TEST_F(SVGOptimizerTest, ProfileIsReadInAnyCaseUnderAnyLocale) {
    EXPECT_EQ(optimized("svg(defs rect)", u"WISP"), "svg(rect)");
    const TurkishLocale turkish;
    EXPECT_EQ(optimized("svg(defs rect)", u"WISP"), "svg(rect)");
}

TEST_F(SVGOptimizerTest, ProfileMayBeAName) {
    read("svg(defs rect)");
    root->setAttribute(name(u"baseProfile"), MoxValue(name(u"Wisp")));
    SVGOptimizer::optimize(root);
    EXPECT_EQ(write(root), "svg(rect)");
}

TEST_F(SVGOptimizerTest, DefinitionsWithAnElementStay) {
    EXPECT_EQ(optimized("svg(defs(mask) rect)", u"wisp"), "svg(defs(mask) rect)");
    EXPECT_EQ(optimized("svg(defs(g) rect)", u"wisp"), "svg(defs rect)");
}

TEST_F(SVGOptimizerTest, DefinitionsWithTextsAloneAreEmpty) {
    EXPECT_EQ(optimized("svg(defs('a') rect)", u"wisp"), "svg(rect)");
}

TEST_F(SVGOptimizerTest, OnlyTheFirstDefinitionsAreLookedAt) {
    EXPECT_EQ(optimized("svg(rect defs(mask) defs line)", u"wisp"),
              "svg(rect defs(mask) defs line)");
    EXPECT_EQ(optimized("svg(rect defs defs line)", u"wisp"), "svg(rect defs line)");
    EXPECT_EQ(optimized("svg(rect line)", u"wisp"), "svg(rect line)");
}

TEST_F(SVGOptimizerTest, DefinitionsAreRemovedByThemselvesToo) {
    read("svg(defs g rect)");
    SVGOptimizer::optimizeDefsTiny(root);
    EXPECT_EQ(write(root), "svg(g rect)");
    SVGOptimizer::optimizeDefsTiny(nullptr);
}

TEST_F(SVGOptimizerTest, DeepTreeIsNoMatterOfTheStack) {
    read("svg");
    MoxPtr<MoxNode> deepest = root;
    for (int i = 0; i < 200000; ++i) {
        deepest = deepest->appendChild(document->createElement(name(u"g")).get());
    }
    root->appendChild(document->createElement(name(u"rect")).get());
    SVGOptimizer::optimize(root);
    EXPECT_EQ(deepest->getParentNode(), nullptr);
}
