#include "foundation/common/MoxDocument.h"

#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>
#include <sstream>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::readXml;
using DrawmereTest::utf8;

/// Makes elements of its own class.
class OwnElement : public MoxElement {
public:
    using MoxElement::MoxElement;

    const char* getTypeName() const override { return "OwnElement"; }
};

class OwnDocument : public MoxDocument {
public:
    MoxPtr<MoxElement> createElement(MoxName name) override {
        MoxPtr<MoxElement> element(new OwnElement(this));
        element->setName({}, {}, name);
        return element;
    }
};

TEST(MoxDocument, IsItsOwnOwnerAndHasNoRootAtFirst) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    EXPECT_EQ(document->getOwnerDocument(), document.get());
    EXPECT_EQ(document->getDocumentElement(), nullptr);
    EXPECT_EQ(document->getParentNode(), nullptr);
}

TEST(MoxDocument, HasTheNameOfAllDocuments) {
    const MoxDocument document;
    EXPECT_EQ(document.getLocalName().number, 184U);
    EXPECT_EQ(document.getNodeName().number, 184U);
    EXPECT_EQ(document.getPrefix(), MoxName());
    EXPECT_EQ(document.getNodeType(), 9);
}

TEST(MoxDocument, IsNoElement) {
    const MoxDocument document;
    EXPECT_TRUE(document.isA(0x2A780AB6));
    EXPECT_FALSE(document.isA(0x9B60777D));
}

TEST(MoxDocument, ItsFirstElementIsTheRoot) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    document->appendChild(root.get());
    EXPECT_EQ(document->getDocumentElement(), root.get());
    document->removeChild(root.get());
    EXPECT_EQ(document->getDocumentElement(), nullptr);
}

TEST(MoxDocument, AnElementItMakesIsNotLinked) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> element = document->createElement(MOXNAME_SVG);
    EXPECT_EQ(element->getParentNode(), nullptr);
    EXPECT_EQ(element->getOwnerDocument(), document.get());
    EXPECT_EQ(element->getReferenceCount(), 1);
    EXPECT_FALSE(document->hasChildNodes());
}

TEST(MoxDocument, SubclassesMakeTheirOwnElements) {
    const MoxPtr<OwnDocument> own(new OwnDocument);
    MoxDocument& document = *own;
    EXPECT_STREQ(document.createElement(MOXNAME_SVG)->getTypeName(), "OwnElement");
}

TEST(MoxDocument, KnowsItsNodesAfterASubclassEnds) {
    MoxPtr<MoxElement> element;
    {
        const MoxPtr<OwnDocument> own(new OwnDocument);
        element = own->createElement(MOXNAME_SVG);
        own->appendChild(element.get());
    }
    EXPECT_EQ(element->getOwnerDocument(), nullptr);
    EXPECT_EQ(element->getParentNode(), nullptr);
}

TEST(MoxDocument, ADeepCloneIsADocumentOfItsOwn) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    document->appendChild(root.get());
    root->appendChildText(u"x");

    const MoxPtr<MoxNode> node = document->cloneNode(/*deep=*/true);
    const auto* copy = narrow<MoxDocument>(node.get());
    ASSERT_NE(copy, nullptr);
    ASSERT_NE(copy->getDocumentElement(), nullptr);
    EXPECT_NE(copy->getDocumentElement(), root.get());
    EXPECT_EQ(copy->getDocumentElement()->getOwnerDocument(), copy);
    EXPECT_EQ(copy->getDocumentElement()->getFirstChild()->getOwnerDocument(), copy);
    EXPECT_EQ(document->cloneNode(/*deep=*/false)->getFirstChild(), nullptr);
}

TEST(MoxDocument, SavesTheDocumentOrTheSubtreeThatIsGiven) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    document->appendChild(root.get());
    const MoxPtr<MoxElement> child = document->createElement(MoxName(u"g"));
    root->appendChild(child.get());
    root->appendChild(document->createElement(MoxName(u"behind")).get());

    std::ostringstream all;
    document->save(u"", u"svg SYSTEM \"a.dtd\"", all, nullptr, u"", u"passed through");
    EXPECT_EQ(all.str(), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                         "<!DOCTYPE svg SYSTEM \"a.dtd\">\n<svg><g/><behind/></svg>\n");
    std::ostringstream part;
    document->save(u"", u"", part, child.get(), u"", u"");
    EXPECT_EQ(part.str(), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<g/>\n");
    std::ostringstream same;
    document->save(u"", u"", same, document.get(), u"indent", u"");
    EXPECT_EQ(same.str(), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                          "<svg>\n  <g/>\n  <behind/>\n</svg>\n");
}

TEST(MoxDocument, SavingWithoutARootWritesTheDeclarationAlone) {
    const MoxDocument document;
    std::ostringstream stream;
    document.save(u"", u"", stream, nullptr, u"", u"");
    EXPECT_EQ(stream.str(), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n");
}

TEST(MoxDocument, SavingASubtreeDeclaresItsNamespace) {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> root =
        document->createElementNS(MOXNAME_SVG_NAMESPACE, MoxName(), MOXNAME_SVG);
    document->appendChild(root.get());
    const MoxPtr<MoxElement> child =
        document->createElementNS(MOXNAME_SVG_NAMESPACE, MoxName(), MoxName(u"g"));
    root->appendChild(child.get());
    std::ostringstream stream;
    document->save(u"", u"", stream, child.get(), u"", u"");
    EXPECT_EQ(readXml(stream.str()).element("g").attribute("xmlns"), "http://www.w3.org/2000/svg");
}

} // namespace
