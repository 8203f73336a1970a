#include "foundation/common/MoxElement.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNodeHeap.h"
#include "foundation/common/MoxXmlUtil.h"

#include <algorithm>
#include <cstring>
#include <limits>
#include <memory>
#include <new>

namespace MoxCommonNS {
namespace {

constexpr std::uint32_t maxCapacity = std::numeric_limits<std::uint16_t>::max();

constexpr std::size_t sizeOf(std::uint32_t capacity) { return capacity * sizeof(MoxValue); }

/// The prefix that `attribute` declares for the namespace with the text `uri`, 0 when it is no
/// declaration of that.
MoxName getDeclaredPrefix(const MoxValue& attribute, const UnicodeString& uri) {
    const UnicodeString& name = MoxNameTable::getSharedNameString(attribute.getKey());
    return name.startsWith(u"xmlns:") && attribute.toString() == uri
               ? MoxName(name.tempSubString(6))
               : MoxName();
}

} // namespace

MoxElement::MoxElement(MoxDocument* document) : MoxNode(MOXNODE_ELEMENT, document) {}

MoxElement::~MoxElement() {
    std::destroy_n(attributes, attributeCount);
    MoxNodeHeap::release(attributes, sizeOf(attributeCapacity));
}

std::uint32_t MoxElement::getTypeID() const { return typeId; }

bool MoxElement::isA(std::uint32_t id) const { return id == typeId || MoxNode::isA(id); }

const char* MoxElement::getTypeName() const { return "MoxElement"; }

MoxName MoxElement::getNodeName() const { return MoxXmlUtil::makeQName(prefix, local); }

MoxName MoxElement::getLocalName() const { return local; }

MoxName MoxElement::getPrefix() const { return prefix; }

MoxAttributeMap MoxElement::getAttributes() const { return {attributes, attributeCount}; }

const MoxValue& MoxElement::getAttribute(MoxName name) const {
    const MoxValue* found = find(name);
    return found ? *found : MoxValue::NULL_VALUE;
}

const MoxValue& MoxElement::getAttributeNS(MoxName namespaceUri, MoxName localName) const {
    if (!namespaceUri) {
        return getAttribute(localName);
    }
    const MoxDocument* document = getOwnerDocument();
    const MoxElement* root = document ? document->getDocumentElement() : nullptr;
    const UnicodeString& uriText = MoxNameTable::getSharedNameString(namespaceUri);
    for (const MoxValue& attribute : (root ? root : this)->getAttributes()) {
        const MoxName declared = getDeclaredPrefix(attribute, uriText);
        const MoxName name = declared ? MoxXmlUtil::makeQName(declared, localName) : MoxName();
        if (const MoxValue* found = name ? find(name) : nullptr) {
            return *found;
        }
    }
    return MoxValue::NULL_VALUE;
}

void MoxElement::setAttribute(MoxName name, const MoxValue& value) {
    setAttribute(name, MoxValue(value));
}

void MoxElement::setAttribute(MoxName name, MoxValue&& value) {
    if (!name || value.getType() == MOXVALUE_NULL) {
        return;
    }
    MoxValue* place = find(name);
    if (!place) {
        place = append();
    }
    *place = std::move(value);
    place->setKey(name);
}

void MoxElement::removeAttribute(MoxName name) {
    MoxValue* found = find(name);
    if (!found) {
        return;
    }
    std::move(found + 1, attributes + attributeCount, found);
    --attributeCount;
    std::destroy_at(attributes + attributeCount);
}

bool MoxElement::hasAttribute(MoxName name) const { return find(name) != nullptr; }

void MoxElement::reserveAttributes(int count) {
    if (!attributes && count > 0) {
        const std::uint32_t capacity = std::min(static_cast<std::uint32_t>(count), maxCapacity);
        attributes = static_cast<MoxValue*>(MoxNodeHeap::allocate(sizeOf(capacity)));
        attributeCapacity = static_cast<std::uint16_t>(capacity);
    }
}

void MoxElement::setName(MoxName newUri, MoxName newPrefix, MoxName newLocal) {
    uri = newUri;
    prefix = newPrefix;
    local = newLocal;
}

MoxPtr<MoxNode> MoxElement::cloneAlone() const {
    const MoxPtr<MoxElement> copy = makeLike();
    copy->setName(uri, prefix, local);
    for (const MoxValue& attribute : getAttributes()) {
        copy->setAttribute(attribute.getKey(), attribute);
    }
    return copy;
}

MoxPtr<MoxElement> MoxElement::makeLike() const {
    MoxPtr<MoxElement> element = makeBlank();
    element->shareOwner(*this);
    return element;
}

MoxPtr<MoxElement> MoxElement::makeBlank() const { return new MoxElement(nullptr); }

MoxValue* MoxElement::find(MoxName name) const {
    for (int i = 0; i < attributeCount; ++i) {
        if (attributes[i].getKey() == name) {
            return attributes + i;
        }
    }
    return nullptr;
}

/// Makes room for one attribute where the array stands, or for as many again elsewhere.
void MoxElement::grow() {
    if (attributeCapacity == maxCapacity) {
        throw std::bad_alloc();
    }
    const std::size_t size = sizeOf(attributeCapacity);
    if (MoxNodeHeap::growInPlace(attributes, size, size + sizeof(MoxValue))) {
        ++attributeCapacity;
        return;
    }
    const std::uint32_t capacity = std::clamp(2U * attributeCapacity, 1U, maxCapacity);
    void* memory = MoxNodeHeap::allocate(sizeOf(capacity));
    if (attributes) {
        // Values hold no pointers into themselves, so they may move as plain bytes.
        std::memcpy(memory, static_cast<void*>(attributes), size);
        MoxNodeHeap::release(attributes, size);
    }
    attributes = static_cast<MoxValue*>(memory);
    attributeCapacity = static_cast<std::uint16_t>(capacity);
}

MoxValue* MoxElement::append() {
    if (attributeCount == attributeCapacity) {
        grow();
    }
    MoxValue* place = new (attributes + attributeCount) MoxValue;
    ++attributeCount;
    return place;
}

} // namespace MoxCommonNS
