#include "foundation/common/MoxDocument.h"

#include "foundation/common/MoxXmlWriter.h"

namespace MoxCommonNS {

MoxDocument::MoxDocument() : MoxNode(MOXNODE_DOCUMENT, nullptr) { beginDocument(this); }

MoxDocument::~MoxDocument() {
    endDocument();
    MoxNodeHeap::stopReuse(); // all nodes go now
}

std::uint32_t MoxDocument::getTypeID() const { return typeId; }

bool MoxDocument::isA(std::uint32_t id) const { return id == typeId || MoxNode::isA(id); }

const char* MoxDocument::getTypeName() const { return "MoxDocument"; }

MoxName MoxDocument::getNodeName() const { return MOXNAME_DOCUMENT; }

MoxName MoxDocument::getLocalName() const { return MOXNAME_DOCUMENT; }

MoxElement* MoxDocument::getDocumentElement() const {
    // A document takes no child but elements.
    return static_cast<MoxElement*>(firstLink());
}

MoxPtr<MoxElement> MoxDocument::createElement(MoxName name) {
    return MoxDocument::createElementNS({}, {}, name);
}

MoxPtr<MoxElement> MoxDocument::createElementNS(MoxName uri, MoxName prefix, MoxName local) {
    MoxPtr<MoxElement> element(new MoxElement(this));
    element->setName(uri, prefix, local);
    return element;
}

void MoxDocument::save(const UnicodeString& encoding, const UnicodeString& doctype,
                       std::ostream& stream, const MoxNode* node, const UnicodeString& options,
                       const UnicodeString& /*reserved*/) const {
    MoxXmlWriter writer(stream, encoding, MoxXmlOptions::parse(options));
    writer.writeDocument(doctype, node ? node : this);
}

MoxPtr<MoxNode> MoxDocument::cloneAlone() const { return new MoxDocument; }

} // namespace MoxCommonNS
