#include "foundation/common/MoxNode.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxText.h"
#include "foundation/common/MoxTreeIterator.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>
#include <string>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

std::string nameOf(const MoxNode* node) {
    return utf8(MoxNameTable::getSharedNameString(node->getNodeName()));
}

/// The children's names; both directions of the links must agree.
std::string childrenOf(const MoxNode& parent) {
    std::string forth;
    std::string back;
    const MoxNode* last = nullptr;
    for (const MoxNode* child = parent.getFirstChild(); child; child = child->getNextSibling()) {
        EXPECT_EQ(child->getParentNode(), &parent);
        forth += (forth.empty() ? "" : " ") + nameOf(child);
        last = child;
    }
    for (const MoxNode* child = last; child; child = child->getPreviousSibling()) {
        const std::string name = nameOf(child);
        back.insert(0, back.empty() ? name : name + " ");
    }
    EXPECT_EQ(forth, back);
    EXPECT_EQ(parent.hasChildNodes(), !forth.empty());
    return forth;
}

/// A document with a root that has the children a, b, c.
class MoxNodeTest : public testing::Test {
protected:
    MoxNodeTest() {
        document->appendChild(root.get());
        for (const MoxPtr<MoxElement>& child : {a, b, c}) {
            root->appendChild(child.get());
        }
    }

    MoxPtr<MoxElement> make(const char16_t* name) { return document->createElement(MoxName(name)); }

    MoxPtr<MoxDocument> document = new MoxDocument;
    MoxPtr<MoxElement> root = make(u"root");
    MoxPtr<MoxElement> a = make(u"a");
    MoxPtr<MoxElement> b = make(u"b");
    MoxPtr<MoxElement> c = make(u"c");
};

TEST_F(MoxNodeTest, ANewNodeStandsNowhere) {
    const MoxPtr<MoxElement> node = make(u"new");
    EXPECT_EQ(node->getParentNode(), nullptr);
    EXPECT_EQ(node->getFirstChild(), nullptr);
    EXPECT_EQ(node->getPreviousSibling(), nullptr);
    EXPECT_EQ(node->getNextSibling(), nullptr);
    EXPECT_FALSE(node->hasChildNodes());
    EXPECT_EQ(node->getReferenceCount(), 1);
    EXPECT_EQ(node->getOwnerDocument(), document.get());
}

TEST_F(MoxNodeTest, AppendChildAppendsReturnsAndCounts) {
    EXPECT_EQ(childrenOf(*root), "a b c");
    EXPECT_EQ(a->getReferenceCount(), 2);
    const MoxPtr<MoxElement> d = make(u"d");
    EXPECT_EQ(root->appendChild(d.get()), d.get());
    EXPECT_EQ(childrenOf(*root), "a b c d");
    EXPECT_EQ(d->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, ANewChildWithoutAnyReferenceBelongsToItsParent) {
    auto* text = new MoxText(document.get(), u"x");
    EXPECT_EQ(a->appendChild(text), text);
    EXPECT_EQ(text->getReferenceCount(), 1);
}

TEST_F(MoxNodeTest, AppendingAChildAgainMovesItToTheEnd) {
    EXPECT_EQ(root->appendChild(a.get()), a.get());
    EXPECT_EQ(childrenOf(*root), "b c a");
    EXPECT_EQ(root->appendChild(a.get()), a.get());
    EXPECT_EQ(childrenOf(*root), "b c a");
    EXPECT_EQ(a->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, AChildThatHasAParentMoves) {
    b->appendChild(a.get());
    EXPECT_EQ(childrenOf(*root), "b c");
    EXPECT_EQ(childrenOf(*b), "a");
    EXPECT_EQ(a->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, AChildThatOnlyItsParentHoldsSurvivesAMove) {
    MoxElement* plain = a.get();
    a = nullptr;
    EXPECT_EQ(b->appendChild(plain), plain);
    EXPECT_EQ(plain->getReferenceCount(), 1);
    EXPECT_EQ(childrenOf(*b), "a");
}

TEST_F(MoxNodeTest, InsertBeforePutsAChildBeforeAnyOther) {
    const MoxPtr<MoxElement> first = make(u"first");
    const MoxPtr<MoxElement> middle = make(u"middle");
    const MoxPtr<MoxElement> last = make(u"last");
    EXPECT_EQ(root->insertBefore(first.get(), a.get()), first.get());
    EXPECT_EQ(root->insertBefore(middle.get(), c.get()), middle.get());
    EXPECT_EQ(root->insertBefore(last.get(), nullptr), last.get());
    EXPECT_EQ(childrenOf(*root), "first a b middle c last");
}

TEST_F(MoxNodeTest, InsertBeforeMovesAmongSiblings) {
    root->insertBefore(c.get(), a.get());
    EXPECT_EQ(childrenOf(*root), "c a b");
    root->insertBefore(c.get(), b.get());
    EXPECT_EQ(childrenOf(*root), "a c b");
    root->insertBefore(a.get(), nullptr);
    EXPECT_EQ(childrenOf(*root), "c b a");
}

TEST_F(MoxNodeTest, InsertingWhereAChildStandsAlreadyChangesNothing) {
    EXPECT_EQ(root->insertBefore(a.get(), b.get()), a.get());
    EXPECT_EQ(root->insertBefore(b.get(), c.get()), b.get());
    EXPECT_EQ(root->insertBefore(b.get(), b.get()), b.get());
    EXPECT_EQ(root->insertBefore(c.get(), nullptr), c.get());
    EXPECT_EQ(childrenOf(*root), "a b c");
    EXPECT_EQ(b->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, RefusesNull) {
    EXPECT_EQ(root->appendChild(nullptr), nullptr);
    EXPECT_EQ(root->insertBefore(nullptr, a.get()), nullptr);
    EXPECT_EQ(childrenOf(*root), "a b c");
}

TEST_F(MoxNodeTest, RefusesToBecomeItsOwnAncestor) {
    a->appendChild(b.get());
    EXPECT_EQ(a->appendChild(a.get()), nullptr);
    EXPECT_EQ(b->appendChild(a.get()), nullptr);
    EXPECT_EQ(b->appendChild(root.get()), nullptr);
    EXPECT_EQ(b->insertBefore(root.get(), nullptr), nullptr);
    EXPECT_EQ(c->appendChild(c.get()), nullptr);
    EXPECT_EQ(childrenOf(*root), "a c");
    EXPECT_EQ(childrenOf(*a), "b");
    EXPECT_EQ(root->getParentNode(), document.get());
}

TEST_F(MoxNodeTest, RefusesAnAncestorFarAbove) {
    constexpr int depth = 1000;
    MoxNode* bottom = a.get();
    for (int i = 0; i < depth; ++i) {
        bottom->appendChild(make(u"beside").get());
        bottom = bottom->appendChild(make(u"below").get());
    }
    EXPECT_EQ(bottom->appendChild(a.get()), nullptr);
    EXPECT_EQ(bottom->appendChild(root.get()), nullptr);
    EXPECT_EQ(bottom->appendChild(b.get()), b.get());
    EXPECT_EQ(childrenOf(*root), "a c");
}

TEST_F(MoxNodeTest, RefusesAReferenceThatIsNoChild) {
    const MoxPtr<MoxElement> foreign = make(u"foreign");
    const MoxPtr<MoxElement> node = make(u"node");
    a->appendChild(b.get());
    EXPECT_EQ(root->insertBefore(node.get(), foreign.get()), nullptr);
    EXPECT_EQ(root->insertBefore(node.get(), b.get()), nullptr); // a grandchild
    EXPECT_EQ(root->insertBefore(c.get(), root.get()), nullptr);
    EXPECT_EQ(root->insertBefore(foreign.get(), foreign.get()), nullptr);
    EXPECT_EQ(node->getReferenceCount(), 1);
    EXPECT_EQ(childrenOf(*root), "a c");
}

TEST_F(MoxNodeTest, RefusesADocumentAsChild) {
    const MoxPtr<MoxDocument> other(new MoxDocument);
    EXPECT_EQ(root->appendChild(other.get()), nullptr);
    EXPECT_EQ(document->appendChild(other.get()), nullptr);
    EXPECT_EQ(a->appendChild(document.get()), nullptr);
    EXPECT_EQ(other->getReferenceCount(), 1);
}

TEST_F(MoxNodeTest, ATextTakesNoChildren) {
    auto* text = static_cast<MoxText*>(a->appendChildText(u"x"));
    const MoxPtr<MoxElement> node = make(u"node");
    EXPECT_EQ(text->appendChild(node.get()), nullptr);
    EXPECT_EQ(text->appendChildText(u"y"), nullptr);
    EXPECT_FALSE(text->hasChildNodes());
}

TEST_F(MoxNodeTest, ADocumentTakesOneElementAndNoText) {
    const MoxPtr<MoxElement> second = make(u"second");
    const MoxPtr<MoxText> text(new MoxText(document.get(), u"x"));
    EXPECT_EQ(document->appendChild(second.get()), nullptr);
    EXPECT_EQ(document->insertBefore(second.get(), root.get()), nullptr);
    EXPECT_EQ(document->appendChild(text.get()), nullptr);
    EXPECT_EQ(document->appendChildText(u"x"), nullptr);
    EXPECT_EQ(document->appendChild(root.get()), root.get());
    EXPECT_EQ(childrenOf(*document), "root");
    const MoxPtr<MoxDocument> empty(new MoxDocument);
    EXPECT_EQ(empty->appendChild(text.get()), nullptr);
    EXPECT_EQ(empty->appendChildText(u"x"), nullptr);
    EXPECT_EQ(text->getReferenceCount(), 1);
}

TEST_F(MoxNodeTest, RemoveChildUnlinksAndDropsTheReference) {
    root->removeChild(b.get());
    EXPECT_EQ(childrenOf(*root), "a c");
    EXPECT_EQ(b->getReferenceCount(), 1);
    EXPECT_EQ(b->getParentNode(), nullptr);
    EXPECT_EQ(b->getNextSibling(), nullptr);
    EXPECT_EQ(b->getPreviousSibling(), nullptr);
    root->removeChild(a.get());
    root->removeChild(c.get());
    EXPECT_EQ(childrenOf(*root), "");
}

TEST_F(MoxNodeTest, RemoveChildIgnoresWhatIsNoChild) {
    const MoxPtr<MoxElement> foreign = make(u"foreign");
    a->appendChild(b.get());
    root->removeChild(nullptr);
    root->removeChild(foreign.get());
    root->removeChild(b.get());
    root->removeChild(root.get());
    EXPECT_EQ(childrenOf(*root), "a c");
    EXPECT_EQ(childrenOf(*a), "b");
}

TEST_F(MoxNodeTest, ReplaceChildTakesTheSamePlace) {
    const MoxPtr<MoxElement> node = make(u"node");
    root->replaceChild(node.get(), b.get());
    EXPECT_EQ(childrenOf(*root), "a node c");
    EXPECT_EQ(b->getParentNode(), nullptr);
    EXPECT_EQ(b->getReferenceCount(), 1);
    EXPECT_EQ(node->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, ReplaceChildWorksWithNeighboursAndItself) {
    root->replaceChild(b.get(), a.get());
    EXPECT_EQ(childrenOf(*root), "b c");
    root->appendChild(a.get());
    root->replaceChild(c.get(), a.get());
    EXPECT_EQ(childrenOf(*root), "b c");
    root->replaceChild(c.get(), c.get());
    EXPECT_EQ(childrenOf(*root), "b c");
    EXPECT_EQ(c->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, ReplaceChildTakesANodeOutOfTheOldOne) {
    a->appendChild(b.get());
    b->appendChildText(u"x");
    root->replaceChild(b.get(), a.get());
    EXPECT_EQ(childrenOf(*root), "b c");
    EXPECT_EQ(childrenOf(*a), "");
}

TEST_F(MoxNodeTest, ReplaceChildTakesANodeFromFarAway) {
    const MoxPtr<MoxDocument> other(new MoxDocument);
    other->appendChild(other->createElement(MoxName(u"far")).get());
    root->replaceChild(other->getFirstChild(), c.get());
    EXPECT_EQ(childrenOf(*root), "a b far");
    EXPECT_FALSE(other->hasChildNodes());
    EXPECT_EQ(root->getFirstChild()->getNextSibling()->getNextSibling()->getOwnerDocument(),
              document.get());
}

TEST_F(MoxNodeTest, ReplaceChildExchangesTheRoot) {
    const MoxPtr<MoxElement> node = make(u"node");
    document->replaceChild(node.get(), root.get());
    EXPECT_EQ(document->getDocumentElement(), node.get());
    EXPECT_EQ(root->getParentNode(), nullptr);
    EXPECT_EQ(childrenOf(*root), "a b c");
    document->replaceChild(a.get(), node.get());
    EXPECT_EQ(document->getDocumentElement(), a.get());
    EXPECT_EQ(childrenOf(*root), "b c");
}

TEST_F(MoxNodeTest, ReplaceChildLeavesTheTreeWhereItRefuses) {
    const MoxPtr<MoxElement> node = make(u"node");
    const MoxPtr<MoxText> text(new MoxText(document.get(), u"x"));
    a->appendChild(b.get());
    root->replaceChild(nullptr, a.get());
    root->replaceChild(nullptr, c.get()); // the last one, which has no node behind it
    root->replaceChild(node.get(), nullptr);
    root->replaceChild(node.get(), b.get());
    root->replaceChild(root.get(), a.get());
    root->replaceChild(document.get(), a.get());
    a->replaceChild(root.get(), b.get());
    document->replaceChild(text.get(), root.get());
    EXPECT_EQ(childrenOf(*document), "root");
    EXPECT_EQ(childrenOf(*root), "a c");
    EXPECT_EQ(childrenOf(*a), "b");
    EXPECT_EQ(node->getReferenceCount(), 1);
    EXPECT_EQ(a->getReferenceCount(), 2);
    EXPECT_EQ(root->getReferenceCount(), 2);
}

TEST_F(MoxNodeTest, ReplaceChildMayEndTheOldOne) {
    const MoxPtr<MoxElement> node = make(u"node");
    MoxElement* old = a.get();
    a = nullptr;
    root->replaceChild(node.get(), old);
    EXPECT_EQ(childrenOf(*root), "node b c");
}

TEST_F(MoxNodeTest, AMoveToAnotherDocumentTakesAllBelowAlong) {
    const MoxPtr<MoxDocument> other(new MoxDocument);
    a->appendChild(b.get());
    auto* text = b->appendChildText(u"x");
    EXPECT_EQ(other->appendChild(a.get()), a.get());
    EXPECT_EQ(childrenOf(*root), "c");
    EXPECT_EQ(a->getOwnerDocument(), other.get());
    EXPECT_EQ(b->getOwnerDocument(), other.get());
    EXPECT_EQ(text->getOwnerDocument(), other.get());
    EXPECT_EQ(c->getOwnerDocument(), document.get());
}

TEST_F(MoxNodeTest, NodesThatOutliveTheDocumentBelongToNone) {
    const MoxPtr<MoxElement> loose = make(u"loose");
    a->appendChild(b.get());
    root->removeChild(c.get());
    root = nullptr;
    document = nullptr;
    for (const MoxPtr<MoxElement>& node : {loose, a, b, c}) {
        EXPECT_EQ(node->getOwnerDocument(), nullptr);
    }
    EXPECT_EQ(a->getParentNode(), nullptr);
    EXPECT_EQ(a->getNextSibling(), nullptr);
    EXPECT_EQ(b->getParentNode(), a.get()); // what somebody holds keeps what is below
}

TEST_F(MoxNodeTest, NodesThatOutliveTheDocumentStayOfUse) {
    document = nullptr;
    a->setAttribute(MOXNAME_ID, u"kept");
    a->appendChildText(u"x");
    EXPECT_EQ(a->getFirstChild()->getOwnerDocument(), nullptr);
    const MoxPtr<MoxNode> copy = a->cloneNode(/*deep=*/true);
    EXPECT_EQ(nameOf(copy.get()), "a");
    EXPECT_EQ(childrenOf(*copy), "#text");
    EXPECT_EQ(a->getAttributeNS(MOXNAME_XLINK_NAMESPACE, MoxName(u"href")), MoxValue::NULL_VALUE);

    const MoxPtr<MoxDocument> other(new MoxDocument);
    other->appendChild(a.get());
    EXPECT_EQ(a->getOwnerDocument(), other.get());
    EXPECT_EQ(a->getFirstChild()->getOwnerDocument(), other.get());
}

TEST_F(MoxNodeTest, AChildThatIsHeldSurvivesItsParent) {
    a->appendChild(b.get());
    root->removeChild(a.get());
    a = nullptr;
    EXPECT_EQ(b->getParentNode(), nullptr);
    EXPECT_EQ(b->getReferenceCount(), 1);
    EXPECT_EQ(b->getOwnerDocument(), document.get());
}

TEST_F(MoxNodeTest, DyingTreesKeepWhatIsHeldAnywhereInThem) {
    // a - b - c, with further nodes on both sides of each; only c is held.
    a->appendChildText(u"before");
    a->appendChild(b.get());
    a->appendChildText(u"behind");
    b->appendChildText(u"before");
    b->appendChild(c.get());
    b->appendChildText(u"behind");
    c->appendChildText(u"below");
    root->removeChild(a.get());
    b = nullptr;
    a = nullptr;
    EXPECT_EQ(c->getParentNode(), nullptr);
    EXPECT_EQ(c->getPreviousSibling(), nullptr);
    EXPECT_EQ(c->getNextSibling(), nullptr);
    EXPECT_EQ(childrenOf(*c), "#text");
}

TEST_F(MoxNodeTest, CloneNodeCopiesTheNodeAlone) {
    a->setAttribute(MOXNAME_ID, u"one");
    a->appendChildText(u"x");
    const MoxPtr<MoxNode> copy = a->cloneNode(/*deep=*/false);
    EXPECT_EQ(copy->getReferenceCount(), 1);
    EXPECT_EQ(copy->getParentNode(), nullptr);
    EXPECT_EQ(copy->getNextSibling(), nullptr);
    EXPECT_FALSE(copy->hasChildNodes());
    EXPECT_EQ(copy->getOwnerDocument(), document.get());
    EXPECT_EQ(nameOf(copy.get()), "a");
    EXPECT_EQ(copy->getAttributes().getLength(), 1);
}

TEST_F(MoxNodeTest, CloneNodeCopiesAllBelowWhenDeep) {
    a->appendChild(b.get());
    b->setAttribute(MOXNAME_ID, u"one");
    b->appendChildText(u"x");
    b->appendChild(make(u"d").get());
    a->appendChildText(u"y");
    const MoxPtr<MoxNode> copy = root->cloneNode(/*deep=*/true);

    std::string names;
    for (MoxTreeIterator nodes = copy->getIterator(); nodes.hasNextNode();) {
        names += nameOf(nodes.nextNode()) + " ";
    }
    EXPECT_EQ(names, "root a b #text d #text c ");
    // The copy is a tree of its own.
    b->setAttribute(MOXNAME_ID, u"two");
    b->getFirstChild()->setText(u"z");
    const auto* copyOfB = narrow<MoxElement>(copy->getFirstChild()->getFirstChild());
    EXPECT_EQ(utf8(copyOfB->getAttribute(MOXNAME_ID).toString()), "one");
    EXPECT_EQ(utf8(copyOfB->getFirstChild()->getText()), "x");
}

TEST_F(MoxNodeTest, ADeepCloneEndsWithTheNodeItBeganWith) {
    a->appendChildText(u"x");
    const MoxPtr<MoxNode> copy = a->cloneNode(/*deep=*/true);
    EXPECT_EQ(childrenOf(*copy), "#text"); // not b and c, which follow a
}

TEST_F(MoxNodeTest, OnlyElementsAreElementsAndOnlyTextsAreTexts) {
    const MoxPtr<MoxText> text(new MoxText(document.get(), u"x"));

    const struct {
        const MoxNode* node;
        int type;
        bool isElement;
        bool isText;
    } rows[] = {
        {root.get(), 1, true, false},
        {text.get(), 3, false, true},
        {document.get(), 9, false, false},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(row.node->getNodeType(), row.type);
        EXPECT_EQ(row.node->isElementNode(), row.isElement);
        EXPECT_EQ(row.node->isText(), row.isText);
        EXPECT_FALSE(row.node->saveTextTag());
    }
}

TEST_F(MoxNodeTest, NodesThatAreNoTextHaveNoTextAndNoValue) {
    root->setText(u"ignored");
    document->setText(u"ignored");
    EXPECT_EQ(utf8(root->getText()), "");
    EXPECT_EQ(utf8(document->getText()), "");
    EXPECT_EQ(root->getNodeValue(), MoxValue::NULL_VALUE);
    EXPECT_EQ(document->getNodeValue(), MoxValue::NULL_VALUE);
    EXPECT_EQ(document->getAttributes().getLength(), 0);
    EXPECT_EQ(childrenOf(*root), "a b c");
}

TEST_F(MoxNodeTest, AppendChildTextAppendsATextNode) {
    MoxNode* text = root->appendChildText(u"some text");
    ASSERT_NE(text, nullptr);
    EXPECT_EQ(childrenOf(*root), "a b c #text");
    EXPECT_EQ(utf8(text->getText()), "some text");
    EXPECT_EQ(text->getReferenceCount(), 1);
    EXPECT_EQ(text->getOwnerDocument(), document.get());
    root->appendChildText(UnicodeString());
    EXPECT_EQ(childrenOf(*root), "a b c #text #text");
}

TEST_F(MoxNodeTest, NarrowingAsksForTheType) {
    MoxNode* text = root->appendChildText(u"x");
    MoxNode* node = a.get();
    EXPECT_EQ(narrow<MoxElement>(node), a.get());
    EXPECT_EQ(narrow<MoxElement>(text), nullptr);
    EXPECT_EQ(narrow<MoxElement>(static_cast<MoxNode*>(document.get())), nullptr);
    EXPECT_EQ(narrow<MoxElement>(static_cast<MoxNode*>(nullptr)), nullptr);
    EXPECT_EQ(narrow<MoxDocument>(static_cast<const MoxNode*>(document.get())), document.get());
    EXPECT_EQ(narrow<MoxDocument>(static_cast<const MoxNode*>(node)), nullptr);
}

TEST_F(MoxNodeTest, DepthCostsNoStack) {
    constexpr int depth = 1000000;
    const MoxName g(u"g");
    MoxPtr<MoxElement> top = document->createElement(g);
    MoxNode* deepest = top.get();
    for (int i = 1; i < depth; ++i) {
        deepest = deepest->appendChild(document->createElement(g).get());
    }
    a->appendChild(top.get());

    MoxPtr<MoxNode> copy = top->cloneNode(/*deep=*/true);
    int count = 0;
    for (MoxTreeIterator nodes = copy->getIterator(); nodes.hasNextNode(); nodes.nextNode()) {
        ++count;
    }
    EXPECT_EQ(count, depth);
    EXPECT_EQ(deepest->appendChild(root.get()), nullptr); // its own ancestor, far above

    const MoxPtr<MoxDocument> other(new MoxDocument);
    other->appendChild(copy.get());
    const MoxPtr<MoxNode> held(copy->getFirstChild()->getFirstChild());
    copy = nullptr;
    EXPECT_EQ(held->getOwnerDocument(), other.get());
    root->removeChild(a.get());
    a = nullptr;
    top = nullptr;
}

} // namespace
