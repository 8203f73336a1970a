// What the implementation does with the tree: routing of elements, comments, inherited attributes.
#include "draw/DrawmereImpl.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/DrawnTree.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using BaseTree = DrawnTree<DrawmereImpl>;

// Where elements go.

struct RouteRow {
    SVGConfig::SVGTYPE profile;
    int type;
    bool direct;
    const char* place; // "group", "tree" or nothing for an element that is dropped
};

class DrawmereImplRouting : public testing::TestWithParam<RouteRow> {};

constexpr auto full = SVGConfig::SVGTYPE_FULL;
constexpr auto tiny = SVGConfig::SVGTYPE_TINY;

INSTANTIATE_TEST_SUITE_P(
    , DrawmereImplRouting,
    testing::Values(RouteRow{full, -2, false, "group"}, RouteRow{full, -2, true, "tree"},
                    RouteRow{full, -1, false, "group"}, RouteRow{full, -1, true, "tree"},
                    RouteRow{full, 0, false, "group"}, RouteRow{full, 1, true, "tree"},
                    RouteRow{full, 2, false, "group"}, RouteRow{full, 3, false, "tree"},
                    RouteRow{full, 3, true, "tree"}, RouteRow{full, 4, false, "group"},
                    RouteRow{SVGConfig::SVGTYPE_PLAZMIC, 2, false, "group"},
                    RouteRow{SVGConfig::SVGTYPE_WISP, 3, false, "tree"},
                    RouteRow{tiny, -2, false, "group"}, RouteRow{tiny, -2, true, "tree"},
                    RouteRow{tiny, -1, false, "group"}, RouteRow{tiny, 0, false, ""},
                    RouteRow{tiny, 0, true, ""}, RouteRow{tiny, 1, true, ""},
                    RouteRow{tiny, 2, false, ""}, RouteRow{tiny, 3, false, ""},
                    RouteRow{tiny, 3, true, ""}, RouteRow{tiny, 4, false, "group"},
                    RouteRow{tiny, 5, true, "tree"}));

TEST_P(DrawmereImplRouting, DependsOnProfileAndWhatIsDefined) {
    const RouteRow& row = GetParam();
    BaseTree tree(row.profile);
    tree.impl.getGContext()->setType(row.type);
    const MoxPtr<SVGElement> element = tree.make(SVGName::rect);
    tree.impl.addElement(element.get(), row.direct, /*makeCurrent=*/false);
    const MoxNode* const parent = element->getParentNode();
    const MoxNode* const group = tree.impl.groupManager->getGroupRootNode();
    const char* const place = !parent ? "" : parent == group ? "group" : "tree";
    EXPECT_STREQ(place, row.place);
    EXPECT_EQ(parent == tree.root(), *row.place == 't');
}

TEST(DrawmereImpl, MakesAnElementCurrentWhenAsked) {
    BaseTree tree;
    const MoxPtr<SVGElement> outer = tree.make(SVGName::mask);
    const MoxPtr<SVGElement> inner = tree.make(SVGName::stop);
    tree.impl.addElement(outer.get(), /*direct=*/true, /*makeCurrent=*/true);
    tree.impl.addElement(inner.get(), /*direct=*/true, /*makeCurrent=*/false);
    EXPECT_EQ(inner->getParentNode(), outer.get());
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), outer.get());
}

TEST(DrawmereImpl, StampsTheClipRuleOnAllOfAClipDefinitionButTheClipPath) {
    BaseTree tree;
    tree.impl.getGContext()->setType(ELEMENT_TYPE_CLIP);
    tree.impl.getGContext()->setClipRuleAttrVal(CLIPRULE_NONZERO);
    const MoxPtr<SVGElement> clip = tree.make(SVGName::clipPath);
    const MoxPtr<SVGElement> rect = tree.make(SVGName::rect);
    tree.impl.addElement(clip.get(), /*direct=*/true, /*makeCurrent=*/true);
    tree.impl.addElement(rect.get(), /*direct=*/false, /*makeCurrent=*/false);
    EXPECT_EQ(tree.content(), "<clipPath>\n<rect clip-rule=\"nonzero\"/>\n</clipPath>\n");
}

TEST(DrawmereImpl, IgnoresNullElements) {
    BaseTree tree;
    tree.impl.addElement(nullptr, /*direct=*/true, /*makeCurrent=*/true);
    tree.impl.addElement(nullptr, /*direct=*/false, /*makeCurrent=*/false);
    tree.impl.setPaintAttr(nullptr, PAINTMODE_FILL);
    EXPECT_EQ(tree.content(), "");
}

// Comments.

TEST(DrawmereImplComment, GoesIntoAnEmptyRoot) {
    DrawnTree tree;
    tree.impl.setComment();
    EXPECT_EQ(tree.content(), "<desc>\n</desc>\n");
}

TEST(DrawmereImplComment, GoesBeforeAFirstElementAndBehindAFirstText) {
    DrawnTree tree;
    tree.root()->appendChild(tree.make(SVGName::g).get());
    tree.impl.setComment();
    EXPECT_EQ(tree.content(), "<desc>\n</desc>\n<g/>\n");
    DrawnTree texts;
    texts.root()->appendChildText(u"text");
    texts.root()->appendChild(texts.make(SVGName::g).get());
    texts.impl.setComment();
    EXPECT_EQ(texts.content(), "text\n<g/>\n<desc>\n</desc>\n");
}

TEST(DrawmereImplComment, GoesBehindTheDefsAndBeforeTheElementThatFollows) {
    DrawnTree tree;
    tree.root()->appendChild(tree.make(SVGName::defs).get());
    tree.root()->appendChild(tree.make(SVGName::g).get());
    tree.impl.setComment();
    EXPECT_EQ(tree.content(), "<defs/>\n<desc>\n</desc>\n<g/>\n");
}

TEST(DrawmereImplComment, GoesToTheEndWhenNoElementFollowsTheDefs) {
    DrawnTree alone;
    alone.root()->appendChild(alone.make(SVGName::defs).get());
    alone.impl.setComment();
    EXPECT_EQ(alone.content(), "<defs/>\n<desc>\n</desc>\n");
    DrawnTree texts;
    texts.root()->appendChild(texts.make(SVGName::defs).get());
    texts.root()->appendChildText(u"text");
    texts.root()->appendChild(texts.make(SVGName::g).get());
    texts.impl.setComment();
    EXPECT_EQ(texts.content(), "<defs/>\ntext\n<g/>\n<desc>\n</desc>\n");
}

// Inherited attributes.

class DrawmereImplInherit : public testing::Test {
protected:
    DrawmereImplInherit() {
        tree.root()->setAttribute(fill, u"rootfill");
        tree.root()->appendChild(outer.get());
        outer->appendChild(inner.get());
        inner->appendChild(leaf.get());
    }

    std::string find(const MoxElement* element, bool stopAtRoot = false) {
        return utf8(tree.impl.getInheritAttribute(element, fill, stopAtRoot).toString());
    }

    DrawnTree<> tree;
    MoxName fill = SVGName(SVGName::fill);
    MoxPtr<SVGElement> outer = tree.make(SVGName::g);
    MoxPtr<SVGElement> inner = tree.make(SVGName::svg);
    MoxPtr<SVGElement> leaf = tree.make(SVGName::rect);
};

TEST_F(DrawmereImplInherit, IsThatOfTheNearestElement) {
    EXPECT_EQ(find(leaf.get()), "rootfill");
    outer->setAttribute(fill, u"outer");
    EXPECT_EQ(find(leaf.get()), "outer");
    leaf->setAttribute(fill, u"leaf");
    EXPECT_EQ(find(leaf.get()), "leaf");
}

TEST_F(DrawmereImplInherit, StopsAtAnSvgElementWithoutIt) {
    outer->setAttribute(fill, u"outer");
    EXPECT_EQ(find(leaf.get(), /*stopAtRoot=*/true), "");
    inner->setAttribute(fill, u"inner");
    EXPECT_EQ(find(leaf.get(), /*stopAtRoot=*/true), "inner");
}

TEST_F(DrawmereImplInherit, IsNullWhereThereIsNone) {
    tree.root()->removeAttribute(fill);
    EXPECT_EQ(tree.impl.getInheritAttribute(leaf.get(), fill, false), MoxValue::NULL_VALUE);
    EXPECT_EQ(tree.impl.getInheritAttribute(nullptr, fill, false), MoxValue::NULL_VALUE);
}

} // namespace
} // namespace DrawmereTest
