#include "foundation/common/MoxElement.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>
#include <new>
#include <string>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

const MoxName x(u"x");
const MoxName y(u"y");
const MoxName href(u"href");

std::string attributesOf(const MoxElement& element) {
    std::string text;
    for (const MoxValue& attribute : element.getAttributes()) {
        text += text.empty() ? "" : " ";
        text += utf8(MoxNameTable::getSharedNameString(attribute.getKey()));
        text += "=" + utf8(attribute.toString());
    }
    return text;
}

class MoxElementTest : public testing::Test {
protected:
    MoxPtr<MoxDocument> document = new MoxDocument;
    MoxPtr<MoxElement> element = document->createElement(MoxName(u"rect"));
};

TEST_F(MoxElementTest, IsSmall) { EXPECT_LE(sizeof(MoxElement), 80U); }

TEST_F(MoxElementTest, HasTheNamesItWasMadeWith) {
    EXPECT_EQ(element->getNodeName(), MoxName(u"rect"));
    EXPECT_EQ(element->getLocalName(), MoxName(u"rect"));
    EXPECT_EQ(element->getPrefix(), MoxName());
    EXPECT_EQ(element->getNamespaceURI(), MoxName());

    const MoxPtr<MoxElement> other =
        document->createElementNS(MOXNAME_SVG_NAMESPACE, MoxName(u"s"), MoxName(u"rect"));
    EXPECT_EQ(other->getNodeName(), MoxName(u"s:rect"));
    EXPECT_EQ(other->getLocalName(), MoxName(u"rect"));
    EXPECT_EQ(other->getPrefix(), MoxName(u"s"));
    EXPECT_EQ(other->getNamespaceURI(), MoxName(MOXNAME_SVG_NAMESPACE));
}

TEST_F(MoxElementTest, AnAbsentAttributeIsTheNullValue) {
    EXPECT_EQ(element->getAttribute(x), MoxValue::NULL_VALUE);
    EXPECT_EQ(element->getAttribute(x).getKey(), MoxName());
    EXPECT_EQ(element->getAttribute(MoxName()), MoxValue::NULL_VALUE);
    EXPECT_FALSE(element->hasAttribute(x));
    element->setAttribute(y, 1);
    EXPECT_EQ(element->getAttribute(x), MoxValue::NULL_VALUE);
    EXPECT_EQ(element->getAttribute(MoxName()), MoxValue::NULL_VALUE);
}

TEST_F(MoxElementTest, AnAttributeThatWasSetIsThere) {
    element->setAttribute(x, MoxValue(7));
    EXPECT_TRUE(element->hasAttribute(x));
    EXPECT_EQ(element->getAttribute(x), MoxValue(7));
    EXPECT_EQ(element->getAttribute(x).getKey(), x);
}

TEST_F(MoxElementTest, SettingAgainReplacesTheValueInItsPlace) {
    element->setAttribute(x, u"a text that is longer than a value");
    element->setAttribute(y, 2);
    element->setAttribute(x, 3);
    EXPECT_EQ(attributesOf(*element), "x=3 y=2");
    element->setAttribute(x, u"\u65E5 is wide");
    EXPECT_EQ(attributesOf(*element), "x=\xE6\x97\xA5 is wide y=2");
}

TEST_F(MoxElementTest, ANullValueSetsNothing) {
    element->setAttribute(x, MoxValue::NULL_VALUE);
    EXPECT_FALSE(element->hasAttribute(x));
    element->setAttribute(x, 1);
    element->setAttribute(x, MoxValue());
    EXPECT_EQ(attributesOf(*element), "x=1");
}

TEST_F(MoxElementTest, TheNameZeroSetsNothing) {
    element->setAttribute(MoxName(), 1);
    EXPECT_EQ(element->getAttributes().getLength(), 0);
}

TEST_F(MoxElementTest, AnEmptyTextIsAValue) {
    element->setAttribute(x, UnicodeString());
    EXPECT_TRUE(element->hasAttribute(x));
    EXPECT_EQ(attributesOf(*element), "x=");
}

TEST_F(MoxElementTest, AnAttributeCanBeSetFromAnotherOfTheSameElement) {
    element->setAttribute(MoxName(u"a0"), u"a text that is longer than a value");
    for (int i = 1; i < 40; ++i) { // the attributes move as they get more
        element->setAttribute(MoxName(UnicodeString(u"a").append(char16_t(u'0' + i))),
                              element->getAttribute(MoxName(u"a0")));
    }
    EXPECT_EQ(element->getAttributes().getLength(), 40);
    for (const MoxValue& attribute : element->getAttributes()) {
        EXPECT_EQ(utf8(attribute.toString()), "a text that is longer than a value");
    }
}

TEST_F(MoxElementTest, RemovingKeepsTheOrderOfTheOthers) {
    const char16_t* const names[] = {u"a", u"b", u"c", u"d"};
    for (const char16_t* name : names) {
        element->setAttribute(MoxName(name), UnicodeString(u"a text that is longer: ") + name);
    }
    element->removeAttribute(MoxName(u"b"));
    element->removeAttribute(MoxName(u"absent"));
    element->removeAttribute(MoxName());
    EXPECT_EQ(attributesOf(*element), "a=a text that is longer: a c=a text that is longer: c "
                                      "d=a text that is longer: d");
    element->removeAttribute(MoxName(u"d"));
    element->removeAttribute(MoxName(u"a"));
    element->removeAttribute(MoxName(u"c"));
    EXPECT_EQ(attributesOf(*element), "");
    element->removeAttribute(MoxName(u"c"));
    element->setAttribute(MoxName(u"b"), 1);
    EXPECT_EQ(attributesOf(*element), "b=1");
}

TEST_F(MoxElementTest, AttributesOfANamespaceAreFoundThroughThePrefixTheRootDeclares) {
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    root->setAttribute(MoxName(u"xmlns:xlink"), MoxName(MOXNAME_XLINK_NAMESPACE));
    document->appendChild(root.get());
    root->appendChild(element.get());
    element->setAttribute(MoxName(u"xlink:href"), u"#a");
    element->setAttribute(href, u"#b");

    EXPECT_EQ(utf8(element->getAttributeNS(MOXNAME_XLINK_NAMESPACE, href).toString()), "#a");
    EXPECT_EQ(utf8(element->getAttributeNS(MoxName(), href).toString()), "#b");
    EXPECT_EQ(element->getAttributeNS(MOXNAME_SVG_NAMESPACE, href), MoxValue::NULL_VALUE);
    EXPECT_EQ(element->getAttributeNS(MOXNAME_XLINK_NAMESPACE, x), MoxValue::NULL_VALUE);
    EXPECT_EQ(root->getAttributeNS(MOXNAME_XLINK_NAMESPACE, href), MoxValue::NULL_VALUE);
}

TEST_F(MoxElementTest, EachPrefixOfANamespaceIsTried) {
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    root->setAttribute(MoxName(u"xmlns:one"), u"http://www.w3.org/1999/xlink");
    root->setAttribute(MoxName(u"xmlns:two"), u"http://www.w3.org/1999/xlink");
    document->appendChild(root.get());
    element->setAttribute(MoxName(u"two:href"), u"#a");
    EXPECT_EQ(utf8(element->getAttributeNS(MOXNAME_XLINK_NAMESPACE, href).toString()), "#a");
}

TEST_F(MoxElementTest, WithoutARootAnElementsOwnDeclarationsCount) {
    element->setAttribute(MoxName(u"xlink:href"), u"#a");
    EXPECT_EQ(element->getAttributeNS(MOXNAME_XLINK_NAMESPACE, href), MoxValue::NULL_VALUE);
    element->setAttribute(MoxName(u"xmlns:xlink"), MoxName(MOXNAME_XLINK_NAMESPACE));
    EXPECT_EQ(utf8(element->getAttributeNS(MOXNAME_XLINK_NAMESPACE, href).toString()), "#a");
}

TEST_F(MoxElementTest, ACloneHasNamesAndAttributesInTheirOrder) {
    const MoxPtr<MoxElement> original =
        document->createElementNS(MOXNAME_SVG_NAMESPACE, MoxName(u"s"), MoxName(u"rect"));
    original->setAttribute(y, u"a text that is longer than a value");
    original->setAttribute(x, 1.5F);
    const MoxPtr<MoxNode> node = original->cloneNode(/*deep=*/false);
    const auto* copy = narrow<MoxElement>(node.get());
    ASSERT_NE(copy, nullptr);
    original->setAttribute(x, 2);
    EXPECT_EQ(copy->getNodeName(), MoxName(u"s:rect"));
    EXPECT_EQ(copy->getNamespaceURI(), MoxName(MOXNAME_SVG_NAMESPACE));
    EXPECT_EQ(attributesOf(*copy), "y=a text that is longer than a value x=1.5");
}

TEST_F(MoxElementTest, HasRoomForManyAttributesAndRefusesMoreUnharmed) {
    constexpr int most = 65535;
    int count = 0;
    try {
        for (; count < 70000; ++count) {
            element->setAttribute(MoxName::fromNumber(0x10000000U + count), count);
        }
        FAIL() << "more attributes than an element can count";
    } catch (const std::bad_alloc&) {
        EXPECT_EQ(count, most);
    }
    ASSERT_EQ(element->getAttributes().getLength(), most);
    for (int i = 0; i < most; ++i) {
        ASSERT_EQ(element->getAttributes().item(i).getNodeValue(), MoxValue(i));
    }
    element->setAttribute(MoxName::fromNumber(0x10000000U), u"replaced");
    EXPECT_EQ(element->getAttributes().item(0).getNodeValue(), MoxValue(u"replaced"));
    element->removeAttribute(MoxName::fromNumber(0x10000000U));
    element->setAttribute(x, 1);
    EXPECT_EQ(element->getAttributes().item(most - 1).getNodeName(), x);
}

TEST_F(MoxElementTest, RoomForAttributesIsNoAttribute) {
    element->reserveAttributes(2);
    EXPECT_EQ(element->getAttributes().getLength(), 0);
    element->setAttribute(x, 1);
    element->reserveAttributes(100);
    element->reserveAttributes(-1);
    EXPECT_EQ(element->getAttribute(x), MoxValue(1));
    for (int i = 0; i < 5; ++i) {
        element->setAttribute(MoxName::fromNumber(0x10000000U + i), i);
    }
    EXPECT_EQ(element->getAttributes().getLength(), 6);
}

} // namespace
