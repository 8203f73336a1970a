#include "tree/SVGElement.h"

#include "foundation/common/MoxDocument.h"
#include "tests/support/Utf8.h"
#include "tree/SVGDocument.h"

#include <gtest/gtest.h>

namespace {

using namespace DrawmereNS;
using DrawmereTest::utf8;

TEST(SVGElement, AddsNoStateToItsBase) { EXPECT_EQ(sizeof(SVGElement), sizeof(MoxElement)); }

TEST(SVGElement, AnswersForItsBase) {
    const SVGElement element(nullptr);
    EXPECT_EQ(element.getTypeID(), 0x9B60777DU);
    EXPECT_TRUE(element.isA(0x9B60777D));
    EXPECT_STREQ(element.getTypeName(), "MoxElement");
}

TEST(SVGElement, BelongsToItsDocument) {
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> element(new SVGElement(document.get()));
    EXPECT_EQ(element->getOwnerDocument(), document.get());
}

TEST(SVGElement, SetsAttributesByTheirSvgNames) {
    SVGElement element(nullptr);
    element.setSVGAttribute(SVGName::fill_rule, u"evenodd");
    element.setSVGAttribute(SVGName::id, 7);
    EXPECT_EQ(utf8(element.getAttribute(MoxName(u"fill-rule")).toString()), "evenodd");
    EXPECT_EQ(element.getAttribute(MoxCommonNS::MOXNAME_ID), MoxValue(7));
    const MoxValue value(u"nonzero");
    element.setSVGAttribute(SVGName::fill_rule, value);
    EXPECT_EQ(element.getAttribute(SVGName(SVGName::fill_rule)), value);
    EXPECT_EQ(element.getAttributes().getLength(), 2);
}

TEST(SVGElement, NothingAndNoNameSetNothing) {
    SVGElement element(nullptr);
    element.setSVGAttribute(SVGName::fill, MoxValue::NULL_VALUE);
    element.setSVGAttribute(SVGName::fill, MoxValue());
    element.setSVGAttribute(SVGName::unknown, 1);
    EXPECT_EQ(element.getAttributes().getLength(), 0);
}

TEST(SVGElement, CallsTheVirtualSetAttribute) {
    class Probe : public SVGElement {
    public:
        using MoxElement::setAttribute;
        using SVGElement::SVGElement;

        void setAttribute(MoxName name, const MoxValue& value) override {
            lastName = name;
            MoxElement::setAttribute(name, value);
        }

        MoxName lastName;
    };

    Probe probe(nullptr);
    const MoxValue value(1);
    probe.setSVGAttribute(SVGName::x, value);
    EXPECT_EQ(probe.lastName, MoxName(u"x"));
}

TEST(SVGElement, ACloneIsAnSvgElementWhereverItStands) {
    MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> element = document->createSVGElement(SVGName::rect);
    element->setSVGAttribute(SVGName::x, 1);
    EXPECT_NE(dynamic_cast<SVGElement*>(element->cloneNode(/*deep=*/true).get()), nullptr);

    const MoxPtr<MoxDocument> plain(new MoxDocument);
    plain->appendChild(element.get());
    EXPECT_NE(dynamic_cast<SVGElement*>(element->cloneNode(/*deep=*/true).get()), nullptr);
    EXPECT_EQ(element->cloneNode(/*deep=*/true)->getOwnerDocument(), plain.get());

    const MoxPtr<SVGElement> orphan = document->createSVGElement(SVGName::rect);
    document = nullptr;
    EXPECT_NE(dynamic_cast<SVGElement*>(orphan->cloneNode(/*deep=*/true).get()), nullptr);
    EXPECT_EQ(orphan->cloneNode(/*deep=*/true)->getOwnerDocument(), nullptr);
}

} // namespace
