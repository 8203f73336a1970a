#include "tree/SVGDocument.h"

#include "foundation/common/MoxText.h"
#include "foundation/common/MoxTreeIterator.h"

#include <gtest/gtest.h>
#include <sstream>

namespace {

using namespace DrawmereNS;
using MoxCommonNS::MoxText;
using MoxCommonNS::narrow;

TEST(SVGDocument, AddsNoStateToItsBase) { EXPECT_EQ(sizeof(SVGDocument), sizeof(MoxDocument)); }

TEST(SVGDocument, AnswersForItsBase) {
    const SVGDocument document;
    EXPECT_EQ(document.getTypeID(), 0x2A780AB6U);
    EXPECT_TRUE(document.isA(0x2A780AB6));
    EXPECT_FALSE(document.isA(0x9B60777D));
}

TEST(SVGDocument, AllElementsItMakesAreSvgElements) {
    const MoxPtr<SVGDocument> svg(new SVGDocument);
    MoxDocument& document = *svg;
    const MoxPtr<MoxElement> plain = document.createElement(MoxName(u"g"));
    const MoxPtr<MoxElement> qualified =
        document.createElementNS(MoxName(u"urn:x"), MoxName(u"p"), MoxName(u"g"));
    EXPECT_NE(dynamic_cast<SVGElement*>(plain.get()), nullptr);
    EXPECT_NE(dynamic_cast<SVGElement*>(qualified.get()), nullptr);
    EXPECT_EQ(plain->getNamespaceURI(), MoxName());
    EXPECT_EQ(qualified->getNamespaceURI(), MoxName(u"urn:x"));
    EXPECT_EQ(qualified->getNodeName(), MoxName(u"p:g"));
    EXPECT_EQ(plain->getOwnerDocument(), svg.get());
}

TEST(SVGDocument, AnSvgElementHasNoNamespaceOfItsOwnEvenUnderARootThatHas) {
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<MoxElement> root = document->createElementNS(MoxCommonNS::MOXNAME_SVG_NAMESPACE,
                                                              MoxName(), MoxCommonNS::MOXNAME_SVG);
    document->appendChild(root.get());
    const MoxPtr<SVGElement> element = document->createSVGElement(SVGName::clipPath);
    EXPECT_EQ(element->getNamespaceURI(), MoxName());
    EXPECT_EQ(element->getPrefix(), MoxName());
    EXPECT_EQ(element->getNodeName(), MoxName(u"clipPath"));
    EXPECT_EQ(element->getParentNode(), nullptr);
    EXPECT_EQ(element->getReferenceCount(), 1);

    root->appendChild(element.get());
    std::ostringstream stream;
    document->save(u"", u"", stream, nullptr, u"", u"");
    EXPECT_NE(stream.str().find("\"><clipPath/></svg>"), std::string::npos);
}

TEST(SVGDocument, CreateSvgElementAsksTheVirtualFactory) {
    class Probe : public SVGDocument {
    public:
        MoxPtr<MoxElement> createElement(MoxName name) override {
            lastName = name;
            return makesNothing ? MoxPtr<MoxElement>() : SVGDocument::createElement(name);
        }

        MoxName lastName;
        bool makesNothing = false;
    };

    const MoxPtr<Probe> document(new Probe);
    EXPECT_NE(document->createSVGElement(SVGName::font_face), nullptr);
    EXPECT_EQ(document->lastName, MoxName(u"font-face"));
    document->makesNothing = true;
    EXPECT_EQ(document->createSVGElement(SVGName::g), nullptr);
}

TEST(SVGDocument, ACloneKeepsTheClasses) {
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> root = document->createSVGElement(SVGName::svg);
    document->appendChild(root.get());
    root->appendChild(document->createSVGElement(SVGName::g).get());
    root->appendChildText(u"x");

    const MoxPtr<MoxNode> copy = document->cloneNode(/*deep=*/true);
    ASSERT_NE(dynamic_cast<SVGDocument*>(copy.get()), nullptr);
    int elements = 0;
    for (MoxCommonNS::MoxTreeIterator nodes = copy->getIterator(); nodes.hasNextNode();) {
        MoxNode* node = nodes.nextNode();
        elements += dynamic_cast<SVGElement*>(node) ? 1 : 0;
        EXPECT_EQ(node->getOwnerDocument(), copy.get());
    }
    EXPECT_EQ(elements, 2);
}

TEST(SVGDocument, NarrowingAChildThatIsATextGivesNull) {
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> root = document->createSVGElement(SVGName::svg);
    root->appendChildText(u"x");
    EXPECT_EQ(narrow<SVGElement>(root->getFirstChild()), nullptr);
    EXPECT_EQ(narrow<SVGElement>(static_cast<MoxNode*>(document.get())), nullptr);
}

} // namespace
