#include "foundation/common/MoxPackedNode.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "foundation/common/MoxText.h"
#include "foundation/common/MoxTreeIterator.h"

#include <gtest/gtest.h>
#include <malloc.h>
#include <sstream>
#include <string>

namespace {

using namespace MoxCommonNS;

const MoxPackRules rules = {.keptElement = MoxName(u"link"),
                            .keptAttribute = MoxName(u"mark"),
                            .neverEmpty = MoxName(u"group")};

/// A root with a first child, which is never packed.
class MoxPackedNodeTest : public testing::Test {
protected:
    MoxPackedNodeTest() {
        document->appendChild(document->createElement(MoxName(u"root")).get());
        root = document->getDocumentElement();
        add(u"first");
    }

    MoxElement* add(const char16_t* name, MoxNode* parent = nullptr) {
        const MoxPtr<MoxElement> element = document->createElement(MoxName(name));
        return static_cast<MoxElement*>((parent ? parent : root)->appendChild(element.get()));
    }

    /// Returns: whether the last child of the root is packed now.
    bool packLast() {
        MoxPackedNode::packLast(*root, rules);
        return root->lastLink()->kindLink() == MOXNODE_PACKED;
    }

    std::string save(const char16_t* options = u"", const char16_t* encoding = u"") const {
        std::ostringstream stream;
        document->save(encoding, u"", stream, nullptr, options, u"");
        return stream.str();
    }

    MoxPtr<MoxDocument> document{new MoxDocument};
    MoxElement* root;
};

/// All kinds of value that can be packed, in `element`.
void setEverything(MoxElement& element) {
    element.setAttribute(MoxName(u"integer"), MoxValue(-7));
    element.setAttribute(MoxName(u"real"), MoxValue(1.23456F));
    element.setAttribute(MoxName(u"length"), MoxValue(MoxLength::fromRaw(2.5F)));
    element.setAttribute(MoxName(u"color"), MoxValue(MoxColor(1, 2, 3)));
    element.setAttribute(MoxName(u"name"), MoxValue(MoxName(u"a name & more")));
    element.setAttribute(MoxName(u"empty"), MoxValue(u""));
    element.setAttribute(MoxName(u"short"), MoxValue(u"<short>"));
    element.setAttribute(MoxName(u"few"), MoxValue(u"sixteen letters!"));
    element.setAttribute(MoxName(u"text"), MoxValue(u"a \"text\" that is longer than sixteen"));
    element.setAttribute(MoxName(u"long"), MoxValue(UnicodeString(300, u'x', 300)));
    UnicodeString numbers;
    for (int i = 0; i < 2000; ++i) {
        numbers.append(u"12.5,-3l7.25 ");
    }
    element.setAttribute(MoxName(u"numbers"), MoxValue(numbers));
    element.setAttribute(MoxName(u"wide"), MoxValue(u"\u00e4\u4e2d\U0001F600\xD800"));
}

TEST_F(MoxPackedNodeTest, SaysTheSameWhenSaved) {
    MoxElement* group = add(u"group");
    MoxElement* inner = add(u"inner", group);
    setEverything(*inner);
    inner->appendChildText(u"some <text> & \u4e2d");
    add(u"leaf", inner);
    add(u"leaf", group)->appendChildText(UnicodeString(50, u'1', 50));
    constexpr const char16_t* forms[][2] = {
        {u"", u""}, {u"indent", u""}, {u"decimals=2", u""}, {u"indent", u"US-ASCII"}};
    std::vector<std::string> before;
    for (const auto& [options, encoding] : forms) {
        before.push_back(save(options, encoding));
    }
    ASSERT_TRUE(packLast());
    for (std::size_t i = 0; i < before.size(); ++i) {
        EXPECT_EQ(save(forms[i][0], forms[i][1]), before[i]);
    }
    root->unpackAll();
    EXPECT_EQ(root->lastLink()->kindLink(), MOXNODE_ELEMENT);
    for (std::size_t i = 0; i < before.size(); ++i) {
        EXPECT_EQ(save(forms[i][0], forms[i][1]), before[i]);
    }
}

TEST_F(MoxPackedNodeTest, ValuesComeBackAsTheyWere) {
    setEverything(*add(u"item"));
    const MoxPtr<MoxNode> copy = root->lastLink()->cloneNode(true);
    ASSERT_TRUE(packLast());
    const auto* back = static_cast<MoxElement*>(root->getFirstChild()->getNextSibling());
    const MoxAttributeMap wanted = copy->getAttributes();
    ASSERT_EQ(back->getAttributes().getLength(), wanted.getLength());
    for (int i = 0; i < wanted.getLength(); ++i) {
        EXPECT_EQ(back->getAttributes().item(i).getNodeName(), wanted.item(i).getNodeName());
        EXPECT_EQ(back->getAttributes().item(i).getNodeValue(), wanted.item(i).getNodeValue());
    }
    EXPECT_EQ(back->getOwnerDocument(), document.get());
}

TEST_F(MoxPackedNodeTest, TheFirstChildStaysANode) {
    EXPECT_FALSE(packLast());
    MoxPackedNode::packLast(*root->getFirstChild(), rules);
}

TEST_F(MoxPackedNodeTest, WhatSomebodyHoldsStaysANode) {
    const MoxPtr<MoxElement> held(add(u"item"));
    EXPECT_FALSE(packLast());
    MoxElement* outer = add(u"item");
    const MoxPtr<MoxNode> text(outer->appendChildText(u"x"));
    EXPECT_FALSE(packLast());
}

TEST_F(MoxPackedNodeTest, WhatTheRulesKeepStaysANode) {
    add(u"link", add(u"item"));
    EXPECT_FALSE(packLast());
    add(u"group");
    EXPECT_FALSE(packLast());
    add(u"item")->setAttribute(MoxName(u"mark"), MoxValue(1));
    EXPECT_FALSE(packLast());
    add(u"leaf", add(u"group"));
    EXPECT_TRUE(packLast());
}

TEST_F(MoxPackedNodeTest, WhatTheFormHasNoRoomForStaysANode) {
    const auto keeps = [this](const char16_t* name, MoxValue value) {
        add(u"item")->setAttribute(MoxName(name), std::move(value));
        return !packLast();
    };
    EXPECT_TRUE(keeps(u"xmlns:p", MoxValue(u"uri")));
    EXPECT_TRUE(keeps(u"\u00e4", MoxValue(1)));
    EXPECT_TRUE(keeps(u"map", MoxValue(MoxNamedValueMap())));
    EXPECT_TRUE(keeps(u"long", MoxValue(UnicodeString(40000, u'x', 40000))));
    EXPECT_TRUE(keeps(u"wide", MoxValue(UnicodeString(40000, u'\u4e2d', 40000))));
    MoxByteBlock block = makeZeroBlock(4);
    std::fill_n(block.get(), 4, '1');
    EXPECT_TRUE(keeps(u"adopted", MoxValue::adoptAscii(std::move(block), 0, 4)));
    root->appendChild(document->createElementNS(MoxName(u"uri"), {}, MoxName(u"item")).get());
    EXPECT_FALSE(packLast());
    root->appendChild(document->createElementNS({}, MoxName(u"p"), MoxName(u"item")).get());
    EXPECT_FALSE(packLast());
    MoxElement* many = add(u"item");
    for (int i = 0; i < 256; ++i) {
        many->setAttribute(MoxName(UnicodeString(u"a").append(u'a' + i % 16).append(u'a' + i / 16)),
                           MoxValue(i));
    }
    EXPECT_FALSE(packLast());
    root->appendChildText(u"text");
    EXPECT_FALSE(packLast());
    EXPECT_EQ(root->getFirstChild()->getNextSibling()->kindLink(), MOXNODE_ELEMENT);
}

TEST_F(MoxPackedNodeTest, ASmallPackedRowGoesIntoItsParentAndALargeOneDoesNot) {
    for (const int count : {10, 300}) {
        MoxElement* group = add(u"group");
        for (int i = 0; i < count; ++i) {
            add(u"item", group)->setAttribute(MoxName(u"number"), MoxValue(i));
            MoxPackedNode::packLast(*group, rules);
        }
        const std::string before = save();
        EXPECT_EQ(packLast(), count == 10);
        EXPECT_EQ(save(), before);
        root->unpackAll();
        EXPECT_EQ(save(), before);
    }
}

TEST_F(MoxPackedNodeTest, WhatConsistsOfManyNodesStaysAsItIs) {
    for (const int count : {30, 100}) {
        MoxElement* group = add(u"group");
        for (int i = 0; i < count; ++i) {
            add(u"item", group);
        }
        EXPECT_EQ(packLast(), count == 30);
        MoxElement* inner = add(u"item");
        for (int i = 0; i < count; ++i) {
            inner = add(u"item", inner);
        }
        EXPECT_EQ(packLast(), count == 30);
    }
}

TEST_F(MoxPackedNodeTest, AShortRowTakesLittleMemory) {
    add(u"item")->setAttribute(MoxName(u"number"), MoxValue(1));
    ASSERT_TRUE(packLast());
    const auto* packed = static_cast<const MoxPackedNode*>(root->lastLink());
    add(u"item")->setAttribute(MoxName(u"mark"), MoxValue(1));
    EXPECT_FALSE(packLast());
    // NOLINTNEXTLINE(cppcoreguidelines-pro-type-const-cast): as it came
    auto* const memory = const_cast<char*>(packed->getBytes().data());
    EXPECT_LT(malloc_usable_size(memory), 64U);
}

TEST_F(MoxPackedNodeTest, LargeElementsLeaveLittleMemoryUnused) {
    for (const int length : {1000, 4000, 9000, 30000}) {
        const MoxPtr<MoxElement> holder(add(u"item"));
        add(u"first", holder.get());
        for (int i = 0; i < 600000 / length; ++i) {
            add(u"item", holder.get())
                ->setAttribute(MoxName(u"text"), MoxValue(UnicodeString(length, u'x', length)));
            MoxPackedNode::packLast(*holder, rules);
        }
        std::size_t used = 0;
        std::size_t taken = 0;
        for (const MoxNode* node = holder->firstLink()->nextLink(); node != holder->lastLink();
             node = node->nextLink()) {
            const auto& packed = static_cast<const MoxPackedNode&>(*node);
            used += packed.getBytes().size();
            taken += packed.getMemory();
        }
        EXPECT_GT(used, 500000U);
        EXPECT_LT(taken, used + used / 5) << length;
    }
}

TEST_F(MoxPackedNodeTest, RelativesAreNodesAgain) {
    for (int i = 0; i < 3; ++i) {
        add(u"item")->setAttribute(MoxName(u"number"), MoxValue(i));
        packLast();
    }
    MoxElement* last = add(u"last");
    ASSERT_EQ(root->getFirstChild()->nextLink()->kindLink(), MOXNODE_PACKED);
    auto* before = static_cast<MoxElement*>(last->getPreviousSibling());
    EXPECT_EQ(before->getAttribute(MoxName(u"number")), MoxValue(2));
    EXPECT_EQ(before->getNextSibling(), last);
    EXPECT_EQ(before->getPreviousSibling()->getPreviousSibling()->getPreviousSibling(),
              root->getFirstChild());
    EXPECT_EQ(before->getParentNode(), root);
}

TEST_F(MoxPackedNodeTest, AWalkFindsEveryNode) {
    MoxElement* group = add(u"group");
    add(u"item", group);
    add(u"item", group)->appendChildText(u"x");
    MoxPackedNode::packLast(*group, rules);
    const MoxPtr<MoxNode> held(group);
    add(u"item");
    ASSERT_TRUE(packLast());
    std::size_t count = 0;
    for (MoxTreeIterator walk = root->getIterator(); walk.hasNextNode(); ++count) {
        EXPECT_NE(walk.nextNode()->kindLink(), MOXNODE_PACKED);
    }
    EXPECT_EQ(count, 7U);
}

TEST_F(MoxPackedNodeTest, WhatHasBecomeTheFirstChildIsANodeAgain) {
    add(u"item");
    ASSERT_TRUE(packLast());
    root->removeChild(root->getFirstChild());
    ASSERT_EQ(root->firstLink()->kindLink(), MOXNODE_PACKED);
    EXPECT_TRUE(root->hasChildNodes());
    EXPECT_EQ(static_cast<MoxElement*>(root->getFirstChild())->getLocalName(), MoxName(u"item"));
}

TEST_F(MoxPackedNodeTest, CopiesAreTheirOwn) {
    add(u"item");
    ASSERT_TRUE(packLast());
    const std::string before = save();
    const MoxPtr<MoxNode> copy = document->cloneNode(true);
    root->unpackAll();
    static_cast<MoxElement*>(root->lastLink())->setAttribute(MoxName(u"new"), MoxValue(1));
    std::ostringstream stream;
    static_cast<MoxDocument*>(copy.get())->save(u"", u"", stream, nullptr, u"", u"");
    EXPECT_EQ(stream.str(), before);
    copy->unpackAll();
    EXPECT_EQ(copy->getFirstChild()->lastLink()->getOwnerDocument(), copy.get());
}

TEST_F(MoxPackedNodeTest, NodesBelongToTheDocumentThatTheirParentMovedTo) {
    MoxElement* group = add(u"group");
    add(u"item", group);
    add(u"item", group);
    MoxPackedNode::packLast(*group, rules);
    const MoxPtr<MoxDocument> other(new MoxDocument);
    other->appendChild(group);
    group->unpackAll();
    EXPECT_EQ(group->lastLink()->getOwnerDocument(), other.get());
}

TEST_F(MoxPackedNodeTest, ALongRowComesBackInOrder) {
    constexpr int count = 60000;
    for (int i = 0; i < count; ++i) {
        add(u"item")->setAttribute(MoxName(u"number"), MoxValue(i));
        if (i % 1000 == 0) { // larger than what a chunk has left
            setEverything(*static_cast<MoxElement*>(root->lastLink()));
        }
        packLast();
    }
    std::size_t packed = 0;
    for (const MoxNode* node = root->firstLink(); node; node = node->nextLink()) {
        packed += node->kindLink() == MOXNODE_PACKED ? 1 : 0;
    }
    EXPECT_GT(packed, 20U);
    EXPECT_LT(packed, 200U);
    const MoxNode* node = root->getFirstChild();
    for (int i = 0; i < count; ++i) {
        node = node->getNextSibling();
        ASSERT_TRUE(node);
        ASSERT_EQ(static_cast<const MoxElement*>(node)->getAttribute(MoxName(u"number")),
                  MoxValue(i));
    }
    EXPECT_EQ(node->getNextSibling(), nullptr);
}

} // namespace
