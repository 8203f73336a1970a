#include "tree/SVGUtil.h"

#include "foundation/common/MoxText.h"
#include "tests/support/Utf8.h"
#include "tree/SVGDocument.h"

#include <gtest/gtest.h>
#include <limits>

namespace {

using namespace DrawmereNS;
using DrawmereTest::utf8;

const MoxName rectName(u"rect");
const MoxName gName(u"g");

/// A root without children, and the ways to fill it.
class SVGUtilTest : public testing::Test {
protected:
    MoxPtr<SVGElement> make(SVGName name) { return document->createSVGElement(name); }

    MoxElement* add(SVGName name) {
        return static_cast<MoxElement*>(root->appendChild(make(name).get()));
    }

    MoxPtr<SVGDocument> document = new SVGDocument;
    MoxPtr<SVGElement> root = make(SVGName::svg);
};

TEST_F(SVGUtilTest, GivesTheSvgNameOfTheLocalName) {
    EXPECT_EQ(SVGUtil::getSVGLocalName(root.get()), SVGName::svg);
    EXPECT_EQ(SVGUtil::getSVGLocalName(make(SVGName::missing_glyph).get()), SVGName::missing_glyph);
    const MoxPtr<MoxElement> prefixed =
        document->createElementNS(MoxName(u"urn:x"), MoxName(u"p"), rectName);
    EXPECT_EQ(SVGUtil::getSVGLocalName(prefixed.get()), SVGName::rect);
    const MoxPtr<MoxElement> foreign = document->createElement(MoxName(u"body"));
    EXPECT_EQ(SVGUtil::getSVGLocalName(foreign.get()), SVGName::unknown);
    EXPECT_EQ(SVGUtil::getSVGLocalName(nullptr), SVGName::unknown);
}

TEST_F(SVGUtilTest, ReadsAndReplacesTheFirstText) {
    add(SVGName::rect);
    root->appendChildText(u"first");
    root->appendChildText(u"second");
    EXPECT_EQ(utf8(SVGUtil::getTextValue(root.get())), "first");
    SVGUtil::setTextValue(root.get(), u"new");
    EXPECT_EQ(utf8(SVGUtil::getTextValue(root.get())), "new");
    EXPECT_EQ(utf8(root->getFirstChild()->getNextSibling()->getNextSibling()->getText()), "second");
}

TEST_F(SVGUtilTest, WithoutATextNothingIsReadAndNoneIsMade) {
    EXPECT_EQ(utf8(SVGUtil::getTextValue(root.get())), "");
    SVGUtil::setTextValue(root.get(), u"new");
    EXPECT_FALSE(root->hasChildNodes());
    add(SVGName::g)->appendChildText(u"below");
    EXPECT_EQ(utf8(SVGUtil::getTextValue(root.get())), "");
    SVGUtil::setTextValue(root.get(), u"new");
    EXPECT_EQ(utf8(root->getFirstChild()->getFirstChild()->getText()), "below");
    EXPECT_EQ(utf8(SVGUtil::getTextValue(nullptr)), "");
    SVGUtil::setTextValue(nullptr, u"new");
}

TEST_F(SVGUtilTest, AttributesAreEqualInWhateverOrder) {
    const MoxPtr<SVGElement> a = make(SVGName::rect);
    const MoxPtr<SVGElement> b = make(SVGName::rect);
    EXPECT_TRUE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    a->setSVGAttribute(SVGName::x, 1.5F);
    a->setSVGAttribute(SVGName::fill, u"red");
    b->setSVGAttribute(SVGName::fill, u"red");
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(b.get(), a.get()));
    b->setSVGAttribute(SVGName::x, 1.5F);
    EXPECT_TRUE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    EXPECT_TRUE(SVGUtil::hasEqualAttributes(a.get(), a.get()));
}

TEST_F(SVGUtilTest, AttributesDifferInTypeContentAndName) {
    const MoxPtr<SVGElement> a = make(SVGName::rect);
    const MoxPtr<SVGElement> b = make(SVGName::rect);
    a->setSVGAttribute(SVGName::x, 1);
    b->setSVGAttribute(SVGName::x, 2);
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    b->setSVGAttribute(SVGName::x, u"1"); // the same text, but a string
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    b->removeAttribute(MoxName(u"x"));
    b->setSVGAttribute(SVGName::y, 1);
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    b->removeAttribute(MoxName(u"y"));
    b->setAttribute(MoxName(u"p:x"), 1); // prefixes count
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
}

TEST_F(SVGUtilTest, ElementsOfDifferentNamesAreNeverEqual) {
    const MoxPtr<SVGElement> a = make(SVGName::rect);
    const MoxPtr<SVGElement> b = make(SVGName::g);
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), b.get()));
    const MoxPtr<MoxElement> prefixed =
        document->createElementNS(MoxName(u"urn:x"), MoxName(u"p"), rectName);
    EXPECT_TRUE(SVGUtil::hasEqualAttributes(a.get(), prefixed.get())); // the local names count
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(a.get(), nullptr));
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(nullptr, a.get()));
    EXPECT_FALSE(SVGUtil::hasEqualAttributes(nullptr, nullptr));
}

TEST_F(SVGUtilTest, TheFirstChildElementIsFoundBehindTexts) {
    EXPECT_EQ(SVGUtil::getFirstChildElement(root.get()), nullptr);
    root->appendChildText(u"x");
    root->appendChildText(u"y");
    EXPECT_EQ(SVGUtil::getFirstChildElement(root.get()), nullptr);
    const MoxElement* rect = add(SVGName::rect);
    add(SVGName::g);
    EXPECT_EQ(SVGUtil::getFirstChildElement(root.get()), rect);
    EXPECT_EQ(SVGUtil::getFirstChildElement(nullptr), nullptr);
}

// On purpose: looks one sibling ahead, so a text node ends the walk.
TEST_F(SVGUtilTest, LooksOneSiblingAheadSoATextNodeEndsTheWalk) {
    const MoxElement* first = add(SVGName::rect);
    const MoxElement* second = add(SVGName::g);
    root->appendChildText(u"x");
    const MoxElement* third = add(SVGName::rect);
    EXPECT_EQ(SVGUtil::getNextSiblingElement(first), second);
    EXPECT_EQ(SVGUtil::getNextSiblingElement(second), nullptr);
    EXPECT_EQ(SVGUtil::getNextSiblingElement(third), nullptr);
    EXPECT_EQ(SVGUtil::getNextSiblingElement(nullptr), nullptr);
    EXPECT_EQ(SVGUtil::getPreviousSibligElement(third), nullptr);
    EXPECT_EQ(SVGUtil::getPreviousSibligElement(second), first);
    EXPECT_EQ(SVGUtil::getPreviousSibligElement(first), nullptr);
    EXPECT_EQ(SVGUtil::getPreviousSibligElement(nullptr), nullptr);
}

TEST_F(SVGUtilTest, FindsTheFirstSiblingFromTheElementItself) {
    MoxElement* first = add(SVGName::rect);
    MoxElement* second = add(SVGName::g);
    MoxElement* third = add(SVGName::rect);
    EXPECT_EQ(SVGUtil::findFirstSiblingLocalName(first, rectName), first);
    EXPECT_EQ(SVGUtil::findFirstSiblingLocalName(first, gName), second);
    EXPECT_EQ(SVGUtil::findFirstSiblingLocalName(second, rectName), third);
    EXPECT_EQ(SVGUtil::findFirstSiblingLocalName(third, gName), nullptr);
    EXPECT_EQ(SVGUtil::findFirstSiblingLocalName(nullptr, gName), nullptr);
}

TEST_F(SVGUtilTest, FindsTheNextSiblingBehindTheElement) {
    const MoxElement* first = add(SVGName::rect);
    const MoxElement* second = add(SVGName::g);
    const MoxElement* third = add(SVGName::rect);
    EXPECT_EQ(SVGUtil::findNextSiblingLocalName(first, rectName), third);
    EXPECT_EQ(SVGUtil::findNextSiblingLocalName(first, gName), second);
    EXPECT_EQ(SVGUtil::findNextSiblingLocalName(second, gName), nullptr);
    EXPECT_EQ(SVGUtil::findNextSiblingLocalName(nullptr, gName), nullptr);
}

TEST_F(SVGUtilTest, FindsTheFirstChildUpToATextBetweenElements) {
    root->appendChildText(u"before");
    const MoxElement* g = add(SVGName::g);
    const MoxElement* rect = add(SVGName::rect);
    root->appendChildText(u"between");
    add(SVGName::circle);
    EXPECT_EQ(SVGUtil::findFirstChildLocalName(root.get(), gName), g);
    EXPECT_EQ(SVGUtil::findFirstChildLocalName(root.get(), rectName), rect);
    EXPECT_EQ(SVGUtil::findFirstChildLocalName(root.get(), MoxName(u"circle")), nullptr);
    EXPECT_EQ(SVGUtil::findFirstChildLocalName(root.get(), MoxName(u"svg")), nullptr);
    EXPECT_EQ(SVGUtil::findFirstChildLocalName(nullptr, gName), nullptr);
}

TEST_F(SVGUtilTest, TheFlagAsksForColorNames) {
    EXPECT_EQ(utf8(SVGUtil::getColorString(MoxColor(255, 0, 0), true)), "red");
    EXPECT_EQ(utf8(SVGUtil::getColorString(MoxColor(255, 0, 0), false)), "#f00");
    EXPECT_EQ(utf8(SVGUtil::getColorString(MoxColor(), true)), "#000");
    EXPECT_EQ(utf8(SVGUtil::getColorString(MoxColor(255, 0, 0, 128), true)), "red");
    EXPECT_EQ(utf8(SVGUtil::getColorString(MoxColor(255, 0, 0, 0), false)), "transparent");
}

} // namespace
