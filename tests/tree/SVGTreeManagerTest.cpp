#include "tree/SVGTreeManager.h"

#include "SVGConfig.h"
#include "foundation/common/MoxNameTable.h"
#include "state/SVGGraphicContext.h"
#include "tests/support/Utf8.h"
#include "tree/SVGUtil.h"

#include <gtest/gtest.h>
#include <string>

namespace {

using namespace DrawmereNS;
using DrawmereTest::utf8;
using MoxCommonNS::narrow;

std::string nameOf(const MoxNode* node) {
    return utf8(MoxCommonNS::MoxNameTable::getSharedNameString(node->getNodeName()));
}

std::string childrenOf(const MoxNode* parent) {
    std::string names;
    for (const MoxNode* child = parent->getFirstChild(); child; child = child->getNextSibling()) {
        names += (names.empty() ? "" : " ") + nameOf(child);
    }
    return names;
}

std::string attributesOf(const MoxElement* element) {
    std::string text;
    for (const MoxValue& value : element->getAttributes()) {
        text += text.empty() ? "" : " ";
        text += utf8(MoxCommonNS::MoxNameTable::getSharedNameString(value.getKey()));
        text += "=" + utf8(value.toString());
    }
    return text;
}

/// A document with a root, and a state whose matrices tell which of them was written: the root's
/// shifts by 1, the group's by 2, the current one by 4.
class SVGTreeManagerTest : public testing::Test {
protected:
    SVGTreeManagerTest() {
        tree.setSVGDocProp(u"1.1", &config);
        root = tree.getCurrentNode();
        state.rootMatrix = SVGMatrix(1.0F, 0.0F, 0.0F, 1.0F, 1.0F, 0.0F);
        state.groupGC.transMatrix = SVGMatrix(1.0F, 0.0F, 0.0F, 1.0F, 2.0F, 0.0F);
        state.currentGC.transMatrix = SVGMatrix(1.0F, 0.0F, 0.0F, 1.0F, 4.0F, 0.0F);
        state.clipPathId = u"url(#c)";
    }

    MoxPtr<SVGElement> make(SVGName name) { return tree.document->createSVGElement(name); }

    SVGElement* add(SVGName name, bool makeCurrent) {
        const MoxPtr<SVGElement> element = make(name);
        tree.addElement(element.get(), makeCurrent);
        return narrow<SVGElement>(element->getParentNode() ? element.get() : nullptr);
    }

    void setFontName(const char16_t* name) { state.currentGC.font.fontName = name; }

    SVGConfig config;
    SVGGraphicContext state{&config};
    SVGTreeManager tree;
    SVGElement* root = nullptr;
};

TEST(SVGTreeManager, StartsWithAnEmptyDocument) {
    const SVGTreeManager tree;
    ASSERT_NE(tree.document, nullptr);
    EXPECT_EQ(tree.document->getDocumentElement(), nullptr);
    EXPECT_EQ(tree.document->getReferenceCount(), 1);
    EXPECT_EQ(tree.getCurrentNode(), nullptr);
    EXPECT_TRUE(tree.nodeStack.empty());
    EXPECT_TRUE(tree.fontStack.empty());
    EXPECT_EQ(tree.context, nullptr);
    EXPECT_TRUE(tree.unlocked);
    EXPECT_EQ(tree.defsElement, nullptr);
}

TEST(SVGTreeManager, TheDocumentOutlivesIt) {
    SVGConfig config;
    MoxPtr<SVGDocument> document;
    {
        SVGTreeManager tree;
        tree.setSVGDocProp(u"1.1", &config);
        tree.findDefs(tree.getCurrentNode());
        document = tree.document;
    }
    EXPECT_EQ(document->getReferenceCount(), 1);
    EXPECT_EQ(childrenOf(document->getDocumentElement()), "defs");
}

TEST(SVGTreeManager, WithoutARootEverythingIsIgnored) {
    SVGTreeManager tree;
    SVGConfig config;
    SVGGraphicContext state(&config);
    SVGFont font;
    const MoxPtr<SVGElement> g = tree.document->createSVGElement(SVGName::g);
    tree.addElement(g.get(), true);
    tree.appendNewGroup(g.get(), true);
    EXPECT_EQ(tree.findDefs(nullptr), nullptr);
    for (const int type : {-2, -1, 0, 1, 2, 3, 4, 5, 6}) {
        tree.push(static_cast<ELEMENT_TYPE>(type), &state);
        tree.addElement(g.get(), true);
        tree.pop(static_cast<ELEMENT_TYPE>(type), &font);
    }
    EXPECT_EQ(tree.getCurrentNode(), nullptr);
    EXPECT_EQ(g->getParentNode(), nullptr);
    EXPECT_FALSE(tree.document->hasChildNodes());
}

TEST(SVGTreeManager, TheRootHasItsAttributesInOrder) {
    const struct {
        SVGConfig::SVGTYPE type;
        const char* baseProfile;
    } rows[] = {
        {SVGConfig::SVGTYPE_FULL, ""},
        {SVGConfig::SVGTYPE_BASIC, " baseProfile=basic"},
        {SVGConfig::SVGTYPE_TINY, " baseProfile=tiny"},
        {SVGConfig::SVGTYPE_WISP, ""},
        {SVGConfig::SVGTYPE_PLAZMIC, ""},
        {static_cast<SVGConfig::SVGTYPE>(-7), ""},
    };

    for (const auto& row : rows) {
        SVGConfig config;
        config.svgType = row.type;
        SVGTreeManager tree;
        tree.setSVGDocProp(u"1.2", &config);
        EXPECT_EQ(attributesOf(tree.getCurrentNode()),
                  std::string("xmlns:xlink=http://www.w3.org/1999/xlink xml:space=preserve "
                              "version=1.2") +
                      row.baseProfile +
                      " fill=#000 fill-rule=evenodd font-style=normal font-weight=normal "
                      "font-stretch=normal");
        EXPECT_EQ(tree.document->getDocumentElement(), tree.getCurrentNode());
        EXPECT_EQ(nameOf(tree.getCurrentNode()), "svg");
    }
}

TEST(SVGTreeManager, OnlyAPlazmicRootHasNoNamespace) {
    for (const int type : {0, 1, 2, 3, 4, 5}) {
        SVGConfig config;
        config.svgType = static_cast<SVGConfig::SVGTYPE>(type);
        SVGTreeManager tree;
        tree.setSVGDocProp(u"1.1", &config);
        const MoxName uri = type == 4 ? MoxName() : MoxName(MoxCommonNS::MOXNAME_SVG_NAMESPACE);
        EXPECT_EQ(tree.getCurrentNode()->getNamespaceURI(), uri) << type;
        EXPECT_EQ(tree.getCurrentNode()->getPrefix(), MoxName()) << type;
        EXPECT_TRUE(tree.getCurrentNode()->hasAttribute(MoxName(u"xmlns:xlink"))) << type;
    }
}

TEST_F(SVGTreeManagerTest, NamespaceAndSpaceAreNameValues) {
    EXPECT_EQ(root->getAttribute(MoxName(u"xmlns:xlink")).getType(), MoxCommonNS::MOXVALUE_NAME);
    EXPECT_EQ(root->getAttribute(MoxName(u"xml:space")).getType(), MoxCommonNS::MOXVALUE_NAME);
}

TEST_F(SVGTreeManagerTest, ASecondRootIsIgnored) {
    tree.setSVGDocProp(u"1.2", &config);
    tree.setSVGDocProp(u"1.2", nullptr);
    EXPECT_EQ(tree.getCurrentNode(), root);
    EXPECT_EQ(tree.document->getDocumentElement(), root);
    EXPECT_EQ(utf8(root->getAttribute(MoxName(u"version")).toString()), "1.1");
}

TEST_F(SVGTreeManagerTest, AddElementMovesTheCursorOnlyWhenAsked) {
    const SVGElement* rect = add(SVGName::rect, false);
    EXPECT_EQ(tree.getCurrentNode(), root);
    SVGElement* g = add(SVGName::g, true);
    EXPECT_EQ(tree.getCurrentNode(), g);
    add(SVGName::circle, false);
    EXPECT_EQ(childrenOf(root), "rect g");
    EXPECT_EQ(childrenOf(g), "circle");
    EXPECT_EQ(attributesOf(rect), ""); // without a context nothing is stamped
}

TEST_F(SVGTreeManagerTest, AddElementIgnoresNullAndTheCursorItself) {
    tree.addElement(nullptr, true);
    EXPECT_EQ(tree.getCurrentNode(), root);
    SVGElement* g = add(SVGName::g, true);
    tree.addElement(g, true);
    tree.addElement(root, true);
    EXPECT_EQ(tree.getCurrentNode(), g);
    EXPECT_EQ(g->getParentNode(), root);
}

TEST_F(SVGTreeManagerTest, ALinkUnderTheRootGetsTheRootsTransformAndTheClip) {
    tree.context = &state;
    EXPECT_EQ(attributesOf(add(SVGName::a, false)), "transform=translate(1,0) clip-path=url(#c)");
}

TEST_F(SVGTreeManagerTest, ALinkAnywhereElseGetsTheGroupsTransformAlone) {
    tree.context = &state;
    add(SVGName::g, true);
    EXPECT_EQ(attributesOf(add(SVGName::a, false)), "transform=translate(2,0)");
}

TEST_F(SVGTreeManagerTest, OtherElementsGetNothing) {
    tree.context = &state;
    for (const SVGName::Number name : {SVGName::rect, SVGName::g, SVGName::text, SVGName::use}) {
        EXPECT_EQ(attributesOf(add(name, false)), "");
    }
}

TEST_F(SVGTreeManagerTest, InAClipDefinitionContentGetsItsAttributes) {
    tree.context = &state;
    state.setType(ELEMENT_TYPE_CLIP);
    state.setLineCap(LINECAP_ROUND);
    EXPECT_EQ(attributesOf(add(SVGName::clipPath, false)), "");
    EXPECT_EQ(attributesOf(add(SVGName::g, false)), "");
    EXPECT_NE(attributesOf(add(SVGName::path, false)).find("stroke-linecap=round"),
              std::string::npos);
    // A link is content too: first its transform and clip path, then the rest.
    const std::string link = attributesOf(add(SVGName::a, false));
    EXPECT_EQ(link.find("transform="), 0U) << link;
    EXPECT_NE(link.find("clip-path=url(#c) stroke-linecap=round"), std::string::npos) << link;

    state.setType(ELEMENT_TYPE_MASK);
    EXPECT_EQ(attributesOf(add(SVGName::path, false)), "");
}

TEST_F(SVGTreeManagerTest, TheStopLockDropsWhatIsAdded) {
    tree.context = &state;
    const MoxPtr<SVGElement> g = make(SVGName::g);
    tree.setupStopLock();
    EXPECT_FALSE(tree.unlocked);
    tree.addElement(g.get(), true);
    tree.appendNewGroup(g.get(), true);
    tree.appendNewGroup(g.get(), false);
    EXPECT_EQ(g->getParentNode(), nullptr);
    EXPECT_EQ(attributesOf(g.get()), "");
    EXPECT_EQ(tree.getCurrentNode(), root);
    tree.defuseStopLock();
    EXPECT_TRUE(tree.unlocked);
    tree.addElement(g.get(), true);
    EXPECT_EQ(tree.getCurrentNode(), g.get());
}

TEST_F(SVGTreeManagerTest, ANewCurrentGroupIsAppendedWithAllMatricesAndTheClip) {
    tree.context = &state;
    add(SVGName::g, true);
    const MoxPtr<SVGElement> group = make(SVGName::g);
    tree.appendNewGroup(group.get(), true);
    EXPECT_EQ(attributesOf(group.get()), "transform=translate(6,0) clip-path=url(#c)");
    EXPECT_EQ(tree.getCurrentNode(), group.get());
    EXPECT_EQ(childrenOf(root), "g");
    EXPECT_EQ(group->getParentNode(), root->getFirstChild());
    EXPECT_EQ(state.rootMatrix.e, 7.0F); // they have moved to the root
}

TEST_F(SVGTreeManagerTest, ANewGroupThatIsNotCurrentIsStampedButNotAppended) {
    tree.context = &state;
    const MoxPtr<SVGElement> group = make(SVGName::g);
    tree.appendNewGroup(group.get(), false);
    EXPECT_EQ(attributesOf(group.get()), "transform=translate(4,0) clip-path=url(#c)");
    EXPECT_EQ(group->getParentNode(), nullptr);
    EXPECT_EQ(tree.getCurrentNode(), root);
    EXPECT_EQ(state.groupGC.transMatrix.e, 6.0F); // the current matrix has moved to the group
}

TEST_F(SVGTreeManagerTest, AnEmptyGroupIsAClippingOneThatNothingWentInto) {
    EXPECT_FALSE(tree.hasEmptyGroup());
    const MoxPtr<SVGElement> group = make(SVGName::g);
    tree.appendNewGroup(group.get(), true);
    EXPECT_TRUE(tree.hasEmptyGroup());
    add(SVGName::rect, false);
    EXPECT_FALSE(tree.hasEmptyGroup());
    tree.appendNewGroup(make(SVGName::g).get(), false);
    EXPECT_TRUE(tree.hasEmptyGroup());
}

TEST_F(SVGTreeManagerTest, AGroupThatCameUnderTheStopLockMayStandInTheTreeAndCountsToo) {
    const MoxPtr<SVGElement> group = make(SVGName::g);
    root->appendChild(group.get());
    tree.setupStopLock();
    tree.appendNewGroup(group.get(), false);
    EXPECT_TRUE(tree.hasEmptyGroup());
}

TEST_F(SVGTreeManagerTest, ANewGroupNeedsNoContext) {
    const MoxPtr<SVGElement> group = make(SVGName::g);
    tree.appendNewGroup(group.get(), true);
    tree.appendNewGroup(nullptr, true);
    EXPECT_EQ(attributesOf(group.get()), "");
    EXPECT_EQ(tree.getCurrentNode(), group.get());
}

TEST_F(SVGTreeManagerTest, TheFirstDefinitionMakesDefsTheSecondFindsIt) {
    MoxElement* defs = tree.findDefs(root);
    ASSERT_NE(defs, nullptr);
    EXPECT_EQ(tree.getCurrentNode(), defs);
    EXPECT_EQ(tree.defsElement.get(), defs);
    tree.currentNode = root;
    EXPECT_EQ(tree.findDefs(root), defs);
    EXPECT_EQ(tree.getCurrentNode(), defs);
    EXPECT_EQ(childrenOf(root), "defs");
}

TEST_F(SVGTreeManagerTest, DefsIsTheFirstChildEvenWhenDrawingHasBegun) {
    add(SVGName::rect, false);
    tree.findDefs(root);
    EXPECT_EQ(childrenOf(root), "defs rect");
    tree.currentNode = root;
    add(SVGName::circle, false);
    tree.findDefs(root);
    EXPECT_EQ(childrenOf(root), "defs rect circle");
}

TEST_F(SVGTreeManagerTest, DefsGoesBehindATextThatIsTheFirstChild) {
    root->appendChildText(u"x");
    add(SVGName::rect, false);
    tree.findDefs(root);
    EXPECT_EQ(childrenOf(root), "#text rect defs");
    // It is not found there, so the next definition makes another one.
    const MoxElement* first = tree.defsElement.get();
    EXPECT_NE(tree.findDefs(root), first);
    EXPECT_EQ(childrenOf(root), "#text rect defs defs");
}

TEST_F(SVGTreeManagerTest, DefsThatSomebodyElseMadeAreFoundToo) {
    const MoxPtr<SVGElement> defs = make(SVGName::defs);
    root->appendChild(defs.get());
    EXPECT_EQ(tree.findDefs(root), defs.get());
    EXPECT_EQ(tree.getCurrentNode(), defs.get());
    EXPECT_EQ(childrenOf(root), "defs");
}

struct TypeRow {
    int type;
    bool saves;
    const char* destination; // empty: stays
};

constexpr TypeRow typeRows[] = {
    {-100, false, ""}, {-2, false, ""},   {-1, true, ""},    {0, true, "defs"},
    {1, true, "defs"}, {2, true, "defs"}, {3, true, "defs"}, {4, false, ""},
    {5, true, "svg"},  {6, false, ""},    {1000, false, ""},
};

TEST_F(SVGTreeManagerTest, PushSavesAndMovesByType) {
    for (const TypeRow& row : typeRows) {
        SVGTreeManager own;
        own.setSVGDocProp(u"1.1", &config);
        const MoxPtr<SVGElement> g = own.document->createSVGElement(SVGName::g);
        own.addElement(g.get(), true);
        own.push(static_cast<ELEMENT_TYPE>(row.type), &state);

        EXPECT_EQ(own.nodeStack.size(), row.saves ? 1U : 0U) << row.type;
        EXPECT_EQ(own.fontStack.size(), 1U) << row.type;
        EXPECT_EQ(own.context, &state) << row.type;
        const std::string expected = *row.destination ? row.destination : "g";
        EXPECT_EQ(nameOf(own.getCurrentNode()), expected) << row.type;
        if (row.saves) {
            EXPECT_EQ(own.nodeStack.back(), g.get()) << row.type;
        }
    }
}

TEST_F(SVGTreeManagerTest, PopRestoresByType) {
    for (const TypeRow& row : typeRows) {
        SVGTreeManager own;
        own.setSVGDocProp(u"1.1", &config);
        const SVGElement* ownRoot = own.getCurrentNode();
        own.push(ELEMENT_TYPE_PLAIN, &state);
        const MoxPtr<SVGElement> g = own.document->createSVGElement(SVGName::g);
        own.addElement(g.get(), true);
        SVGFont font;
        own.pop(static_cast<ELEMENT_TYPE>(row.type), &font);

        EXPECT_EQ(own.nodeStack.size(), row.saves ? 0U : 1U) << row.type;
        EXPECT_EQ(own.fontStack.size(), 0U) << row.type;
        EXPECT_EQ(own.getCurrentNode(), row.saves ? ownRoot : g.get()) << row.type;
    }
}

TEST_F(SVGTreeManagerTest, FontsAreSavedByValueAndComeBackInReverse) {
    SVGFont font;
    setFontName(u"one");
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    setFontName(u"two");
    state.currentGC.font.fontSize = MoxLength::fromRaw(12.0F);
    tree.push(ELEMENT_TYPE_PATTERN, &state);
    setFontName(u"three");
    tree.pop(ELEMENT_TYPE_PATTERN, &font);
    EXPECT_EQ(utf8(font.fontName), "two");
    EXPECT_EQ(font.fontSize, MoxLength::fromRaw(12.0F));
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(utf8(font.fontName), "one");
}

TEST_F(SVGTreeManagerTest, AllFieldsOfTheFontComeBack) {
    SVGFont& saved = state.currentGC.font;
    saved.setFontAttribute(u"Some Name", MoxLength::fromRaw(9.0F), FONTWEIGHT_BOLD, FSTYLE_ITALIC,
                           u"family", false);
    saved.setEmbedAttribute(true, true);
    saved.setFontAdjust(MoxLength::fromRaw(0.5F));
    saved.setFontVariant(FVARIANT_SMALLCAPS);
    saved.setFontStretch(FONTSTRECH_EXPANDED);
    const SVGFont expected = saved;
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    saved = SVGFont();
    SVGFont font;
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(font, expected);
    EXPECT_EQ(font.fontSize, expected.fontSize);
    EXPECT_EQ(font.fontAdjust, expected.fontAdjust);
    EXPECT_EQ(font.fontVariant, expected.fontVariant);
    EXPECT_EQ(font.fontStretch, expected.fontStretch);
    EXPECT_EQ(font.fontFamily, expected.fontFamily);
    EXPECT_TRUE(font.embedFont);
    EXPECT_TRUE(font.embedGlyphIds);
}

TEST_F(SVGTreeManagerTest, PopOnAnEmptyStackLeavesTheFontUntouched) {
    setFontName(u"saved");
    tree.push(ELEMENT_TYPE_UNUSED, &state); // a font, but no cursor
    SVGFont font;
    font.fontName = u"untouched";
    for (const TypeRow& row : typeRows) {
        tree.pop(static_cast<ELEMENT_TYPE>(row.type), &font);
    }
    EXPECT_EQ(utf8(font.fontName), "untouched");
    EXPECT_EQ(tree.fontStack.size(), 1U);
    EXPECT_EQ(tree.getCurrentNode(), root);
}

// On purpose: a type without a cursor saves its font all the same, which leaves the two stacks out
// of step.
TEST_F(SVGTreeManagerTest, ATypeWithoutACursorSavesItsFontAllTheSame) {
    SVGFont font;
    setFontName(u"one");
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    setFontName(u"two");
    tree.push(ELEMENT_TYPE_UNUSED, &state);
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(utf8(font.fontName), "two");
    EXPECT_EQ(tree.fontStack.size(), 1U);
    EXPECT_TRUE(tree.nodeStack.empty());
}

TEST_F(SVGTreeManagerTest, PopWithTypeFourLeavesTheCursorButTakesAFont) {
    SVGFont font;
    setFontName(u"one");
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    const SVGElement* g = add(SVGName::g, true);
    tree.pop(ELEMENT_TYPE_UNUSED, &font);
    EXPECT_EQ(utf8(font.fontName), "one");
    EXPECT_EQ(tree.getCurrentNode(), g);
    EXPECT_EQ(tree.nodeStack.size(), 1U);
    // The cursor is still saved, but there is no font left to take.
    font.fontName = u"kept";
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(utf8(font.fontName), "kept");
    EXPECT_EQ(tree.getCurrentNode(), root);
}

TEST_F(SVGTreeManagerTest, OnlyAGradientsPopClearsTheStopLock) {
    SVGFont font;
    for (const TypeRow& row : typeRows) {
        tree.push(ELEMENT_TYPE_PLAIN, &state);
        tree.setupStopLock();
        tree.pop(static_cast<ELEMENT_TYPE>(row.type), &font);
        EXPECT_EQ(tree.unlocked, row.type == 1) << row.type;
        tree.nodeStack.clear();
        tree.fontStack.clear();
    }
    tree.setupStopLock();
    tree.pop(ELEMENT_TYPE_GRADIENT, &font); // nothing is saved, so nothing happens
    EXPECT_FALSE(tree.unlocked);
}

TEST_F(SVGTreeManagerTest, PopDoesNotRestoreTheContext) {
    SVGGraphicContext other(&config);
    SVGFont font;
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    tree.push(ELEMENT_TYPE_PLAIN, &other);
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(tree.context, &other);
    tree.pop(ELEMENT_TYPE_PLAIN, &font);
    EXPECT_EQ(tree.context, &other);
}

TEST_F(SVGTreeManagerTest, NullArgumentsAreIgnored) {
    tree.push(ELEMENT_TYPE_PLAIN, nullptr);
    EXPECT_TRUE(tree.nodeStack.empty());
    EXPECT_TRUE(tree.fontStack.empty());
    tree.push(ELEMENT_TYPE_PLAIN, &state);
    tree.pop(ELEMENT_TYPE_PLAIN, nullptr);
    EXPECT_TRUE(tree.nodeStack.empty());
    EXPECT_TRUE(tree.fontStack.empty());
}

TEST_F(SVGTreeManagerTest, ASavedCursorOutlivesItsPlaceInTheTree) {
    SVGFont font;
    add(SVGName::g, true);
    tree.push(ELEMENT_TYPE_LINK, &state);
    root->removeChild(root->getFirstChild());
    tree.pop(ELEMENT_TYPE_LINK, &font);
    EXPECT_EQ(nameOf(tree.getCurrentNode()), "g");
    EXPECT_EQ(tree.getCurrentNode()->getParentNode(), nullptr);
    EXPECT_NE(add(SVGName::rect, false), nullptr);
    EXPECT_EQ(childrenOf(root), "");
}

TEST_F(SVGTreeManagerTest, DefinitionsNestAndComeBackOutWhereDrawingWas) {
    SVGFont font;
    SVGElement* g = add(SVGName::g, true);
    tree.push(ELEMENT_TYPE_PATTERN, &state);
    const SVGElement* pattern = add(SVGName::pattern, true);
    tree.push(ELEMENT_TYPE_CLIP, &state);
    add(SVGName::clipPath, true);
    tree.pop(ELEMENT_TYPE_CLIP, &font);
    EXPECT_EQ(tree.getCurrentNode(), pattern);
    tree.pop(ELEMENT_TYPE_PATTERN, &font);
    EXPECT_EQ(tree.getCurrentNode(), g);
    EXPECT_EQ(childrenOf(root), "defs g");
    EXPECT_EQ(childrenOf(tree.defsElement.get()), "pattern clipPath");
}

TEST_F(SVGTreeManagerTest, ALinkMovesToTheRoot) {
    SVGFont font;
    SVGElement* g = add(SVGName::g, true);
    tree.push(ELEMENT_TYPE_LINK, &state);
    EXPECT_EQ(tree.getCurrentNode(), root);
    add(SVGName::a, true);
    tree.pop(ELEMENT_TYPE_LINK, &font);
    EXPECT_EQ(tree.getCurrentNode(), g);
    EXPECT_EQ(childrenOf(root), "g a");
}

} // namespace
