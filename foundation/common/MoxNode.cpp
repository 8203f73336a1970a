#include "foundation/common/MoxNode.h"

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxPackedNode.h"
#include "foundation/common/MoxText.h"
#include "foundation/common/MoxTreeIterator.h"

namespace MoxCommonNS {

/// The way from nodes to their document, which may end before they do.
struct MoxNode::DocumentLink : MoxRCObject {
    MoxDocument* document = nullptr; // borrowed; null once it is no more
};

MoxNode::MoxNode(MoxNodeType nodeKind, MoxDocument* document)
    : kind(nodeKind), owner(document ? document->owner : nullptr) {}

MoxNode::~MoxNode() { releaseChildren(); }

std::uint32_t MoxNode::getTypeID() const { return typeId; }

bool MoxNode::isA(std::uint32_t id) const { return id == typeId || MoxNodeIterable::isA(id); }

const char* MoxNode::getTypeName() const { return "MoxNode"; }

MoxName MoxNode::getNodeName() const { return getLocalName(); }

MoxName MoxNode::getLocalName() const { return {}; }

MoxName MoxNode::getPrefix() const { return {}; }

MoxValue MoxNode::getNodeValue() const { return MoxValue::NULL_VALUE; }

int MoxNode::getNodeType() const { return kind; }

MoxNode* MoxNode::getParentNode() const { return parent; }

bool MoxNode::hasChildNodes() const { return firstChild != nullptr; }

MoxNode* MoxNode::getFirstChild() const {
    return unpacked([](const MoxNode& node) { return node.firstChild; }, *this);
}

MoxNode* MoxNode::getPreviousSibling() const {
    return unpacked([](const MoxNode& node) { return node.previousLink(); }, *this);
}

MoxNode* MoxNode::getNextSibling() const {
    return unpacked([](const MoxNode& node) { return node.nextSibling; }, *this);
}

/// Returns: the relative that `read` finds, a node of the DOM.
MoxNode* MoxNode::unpacked(MoxNode* (*read)(const MoxNode& node), const MoxNode& node) {
    MoxNode* const found = read(node);
    if (!found || found->kind != MOXNODE_PACKED) {
        return found;
    }
    static_cast<MoxPackedNode*>(found)->unpack();
    return read(node);
}

MoxDocument* MoxNode::getOwnerDocument() const { return owner ? owner->document : nullptr; }

MoxNode* MoxNode::insertBefore(MoxNode* child, MoxNode* ref) {
    if (!canTake(child, ref)) {
        return nullptr;
    }
    if (child == ref) {
        return child;
    }
    child->addRef();
    if (child->parent) {
        child->parent->removeChild(child);
    }
    link(child, ref);
    if (child->owner != owner) {
        child->setOwnerOfSubtree(owner);
    }
    return child;
}

void MoxNode::replaceChild(MoxNode* child, MoxNode* old) {
    if (!child || !old || old->parent != this || child == old) {
        return;
    }
    // The old child goes first, so that a document may exchange its one root.
    const MoxPtr<MoxNode> kept(old);
    MoxNode* next = old->nextSibling == child ? child->nextSibling : old->nextSibling;
    removeChild(old);
    if (!insertBefore(child, next)) {
        insertBefore(old, next);
    }
}

void MoxNode::removeChild(MoxNode* child) {
    if (!child || child->parent != this) {
        return;
    }
    unlink(child);
    child->release();
}

MoxNode* MoxNode::appendChild(MoxNode* child) { return insertBefore(child, nullptr); }

MoxAttributeMap MoxNode::getAttributes() const { return {}; }

MoxPtr<MoxNode> MoxNode::cloneNode(bool deep) const {
    MoxPtr<MoxNode> copy = cloneAlone();
    const MoxNode* from = this;
    MoxNode* to = copy.get();
    while (deep && from) {
        if (from->firstChild) {
            from = from->firstChild;
        } else {
            while (from != this && !from->nextSibling) {
                from = from->parent;
                to = to->parent;
            }
            if (from == this) {
                break;
            }
            from = from->nextSibling;
            to = to->parent;
        }
        to = to->appendChild(from->cloneAlone().get());
    }
    return copy;
}

bool MoxNode::isElementNode() const { return kind == MOXNODE_ELEMENT; }

bool MoxNode::isText() const { return kind == MOXNODE_TEXT; }

bool MoxNode::saveTextTag() const { return false; }

UnicodeString MoxNode::getText() const { return {}; }

void MoxNode::setText(const UnicodeString& /*text*/) {}

MoxNode* MoxNode::appendChildText(const UnicodeString& text) {
    const MoxPtr<MoxNode> node(new MoxText(getOwnerDocument(), text));
    return appendChild(node.get());
}

MoxTreeIterator MoxNode::getIterator() const { return MoxTreeIterator(this); }

MoxNode* MoxNode::followingLink(const MoxNode* root) const {
    if (firstChild) {
        return firstChild;
    }
    const MoxNode* node = this;
    // A node that was taken out of the walked tree has no way up to the root.
    while (node && node != root && !node->nextSibling) {
        node = node->parent;
    }
    return !node || node == root ? nullptr : node->nextSibling;
}

void MoxNode::unpackAll() {
    MoxNode* node = this;
    while (node) {
        MoxNode* const next = node->followingLink(this);
        if (node->kind == MOXNODE_PACKED) {
            static_cast<MoxPackedNode*>(node)->unpack();
        }
        node = next;
    }
}

bool MoxNode::canTake(const MoxNode* child, const MoxNode* ref) const {
    if (!child || child->kind == MOXNODE_DOCUMENT || kind == MOXNODE_TEXT ||
        (ref && ref->parent != this)) {
        return false;
    }
    return !isAtOrBelow(child) && (kind != MOXNODE_DOCUMENT || hasRoomInDocument(child));
}

/// Walks up from this node and down from `other` in turn, as the shorter way decides: a small tree
/// may go far down in a deep one.
bool MoxNode::isAtOrBelow(const MoxNode* other) const {
    const MoxNode* ancestor = this;
    const MoxNode* below = other;
    while (ancestor && below) {
        if (ancestor == other || below == this) {
            return true;
        }
        ancestor = ancestor->parent;
        below = below->followingLink(other);
    }
    return false;
}

bool MoxNode::hasRoomInDocument(const MoxNode* child) const {
    return child->kind == MOXNODE_ELEMENT && (!firstChild || firstChild == child);
}

void MoxNode::link(MoxNode* child, MoxNode* ref) {
    MoxNode* last = lastLink();
    child->parent = this;
    child->nextSibling = ref;
    if (ref && ref != firstChild) {
        ref->previous->nextSibling = child;
    } else if (!ref && last) {
        last->nextSibling = child;
    } else {
        firstChild = child;
    }
    MoxNode* behind = ref ? ref : firstChild;
    child->previous = last ? behind->previous : child;
    behind->previous = child;
}

void MoxNode::unlink(MoxNode* child) {
    MoxNode* behind = child->nextSibling;
    if (child == firstChild) {
        firstChild = behind;
    } else {
        child->previous->nextSibling = behind;
    }
    if (firstChild) {
        (behind ? behind : firstChild)->previous = child->previous;
    }
    child->parent = nullptr;
    child->previous = nullptr;
    child->nextSibling = nullptr;
}

/// Puts `nodes`, which stand nowhere, in the place of a child.
void MoxNode::replaceLink(MoxNode& old, std::span<const MoxPtr<MoxNode>> nodes) {
    for (const MoxPtr<MoxNode>& node : nodes) {
        node->addRef();
        link(node.get(), &old);
    }
    unlink(&old);
    old.release();
}

void MoxNode::setOwnerOfSubtree(const MoxPtr<DocumentLink>& link) {
    for (MoxNode* node = this; node; node = node->followingLink(this)) {
        node->owner = link;
    }
}

void MoxNode::beginDocument(MoxDocument* document) {
    owner = new DocumentLink;
    owner->document = document;
}

void MoxNode::endDocument() { owner->document = nullptr; }

void MoxNode::shareOwner(const MoxNode& other) { owner = other.owner; }

void MoxNode::releaseChildren() {
    // A dying child hands its children to this list, so the depth of the tree costs no stack.
    MoxNode* pending = firstChild;
    firstChild = nullptr;
    while (pending) {
        MoxNode* child = pending;
        pending = child->nextSibling;
        child->parent = nullptr;
        child->previous = nullptr;
        child->nextSibling = nullptr;
        if (!child->releaseWithoutDelete()) {
            continue;
        }
        if (child->firstChild) {
            child->lastLink()->nextSibling = pending;
            pending = child->firstChild;
            child->firstChild = nullptr;
        }
        delete child;
    }
}

} // namespace MoxCommonNS
