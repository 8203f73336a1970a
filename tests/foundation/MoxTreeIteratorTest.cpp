#include "foundation/common/MoxTreeIterator.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>
#include <string>

namespace {

using namespace MoxCommonNS;

/// The tree root(a(b #text) c(d(e)) f).
class MoxTreeIteratorTest : public testing::Test {
protected:
    MoxTreeIteratorTest() {
        document->appendChild(root.get());
        root->appendChild(a.get());
        a->appendChild(make(u"b").get());
        a->appendChildText(u"x");
        root->appendChild(c.get());
        c->appendChild(d.get());
        d->appendChild(make(u"e").get());
        root->appendChild(make(u"f").get());
    }

    MoxPtr<MoxElement> make(const char16_t* name) { return document->createElement(MoxName(name)); }

    static std::string nameOf(const MoxNode* node) {
        return DrawmereTest::utf8(MoxNameTable::getSharedNameString(node->getNodeName()));
    }

    static std::string walk(MoxTreeIterator nodes) {
        std::string names;
        while (nodes.hasNextNode()) {
            names += nameOf(nodes.nextNode()) + " ";
        }
        EXPECT_EQ(nodes.nextNode(), nullptr);
        return names;
    }

    MoxPtr<MoxDocument> document = new MoxDocument;
    MoxPtr<MoxElement> root = make(u"root");
    MoxPtr<MoxElement> a = make(u"a");
    MoxPtr<MoxElement> c = make(u"c");
    MoxPtr<MoxElement> d = make(u"d");
};

TEST_F(MoxTreeIteratorTest, WalksDepthFirst) {
    EXPECT_EQ(walk(document->getIterator()), "#document root a b #text c d e f ");
}

TEST_F(MoxTreeIteratorTest, StaysInsideItsSubtree) {
    EXPECT_EQ(walk(a->getIterator()), "a b #text ");
    EXPECT_EQ(walk(d->getIterator()), "d e ");
    EXPECT_EQ(walk(root->getFirstChild()->getFirstChild()->getIterator()), "b ");
}

TEST_F(MoxTreeIteratorTest, OverNothingIsEmpty) { EXPECT_EQ(walk(MoxTreeIterator(nullptr)), ""); }

TEST_F(MoxTreeIteratorTest, WhatWasGivenBeforeMayBeRemoved) {
    // Every node goes as soon as the next one was given, unless that one stands in it.
    std::string names;
    MoxPtr<MoxNode> before;
    for (MoxTreeIterator nodes = root->getIterator(); nodes.hasNextNode();) {
        MoxNode* node = nodes.nextNode();
        names += nameOf(node) + " ";
        if (before && before->getParentNode() && node->getParentNode() != before.get()) {
            before->getParentNode()->removeChild(before.get());
        }
        before = node;
    }
    EXPECT_EQ(names, "root a b #text c d e f ");
    EXPECT_EQ(walk(root->getIterator()), "root a c d f ");
}

TEST_F(MoxTreeIteratorTest, ALeafJustGivenMayBeRemoved) {
    std::string names;
    for (MoxTreeIterator nodes = root->getIterator(); nodes.hasNextNode();) {
        MoxNode* node = nodes.nextNode();
        names += nameOf(node) + " ";
        if (!node->hasChildNodes()) {
            node->getParentNode()->removeChild(node);
        }
    }
    EXPECT_EQ(names, "root a b #text c d e f ");
    EXPECT_EQ(walk(root->getIterator()), "root a c d ");
}

TEST_F(MoxTreeIteratorTest, WhatIsAddedBehindIsGivenToo) {
    MoxTreeIterator nodes = root->getIterator();
    nodes.nextNode();
    nodes.nextNode();
    root->appendChild(make(u"g").get());
    EXPECT_EQ(walk(nodes), "b #text c d e f g ");
}

TEST_F(MoxTreeIteratorTest, EndsWhenItsPlaceLeavesTheTree) {
    MoxTreeIterator nodes = root->getIterator();
    for (int i = 0; i < 6; ++i) { // d was given, e comes next
        nodes.nextNode();
    }
    const MoxPtr<MoxElement> held(c);
    root->removeChild(c.get());
    EXPECT_EQ(walk(nodes), "e ");
}

} // namespace
