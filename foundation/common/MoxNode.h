/// A node of the document tree.
#pragma once

#include "foundation/common/MoxAttributeMap.h"
#include "foundation/common/MoxNodeHeap.h"
#include "foundation/common/MoxNodeIterable.h"
#include "foundation/common/MoxPtr.h"

#include <span>

namespace MoxCommonNS {

class MoxDocument;
class MoxTreeIterator;

/// What a node is, by the numbers of the DOM.
enum MoxNodeType : std::uint8_t {
    MOXNODE_ELEMENT = 1,
    MOXNODE_TEXT = 3,
    MOXNODE_DOCUMENT = 9,
    MOXNODE_PACKED = 255, ///< no node of the DOM: a `MoxPackedNode`
};

/// A node: it holds a reference to each of its children, and its children know it without one.
/// A pointer to a node that an operation returns is borrowed; who keeps it longer than the tree
/// does holds it in a `MoxPtr`. No operation recurses by the depth of the tree.
/// Finished parts of a tree may be packed (`MoxPackedNode`); whoever asks for relatives or for a
/// walk gets nodes all the same. To make them changes the tree, so one thread at a time reads a
/// tree until `unpackAll`; saving changes nothing.
class DRAWMERE_API MoxNode : public MoxNodeIterable {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0xFF72074A;

    /// Lets go of all children.
    ~MoxNode() override;

    // Nodes stand in the memory of trees.
    /// Takes memory of trees.
    static void* operator new(std::size_t size) { return MoxNodeHeap::allocate(size); }

    /// Gives the memory back.
    static void operator delete(void* node, std::size_t size) { MoxNodeHeap::release(node, size); }

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;

    /// Returns: the qualified name: prefix, colon and local name, or the local name alone.
    virtual MoxName getNodeName() const;
    /// Returns: the name without its prefix.
    virtual MoxName getLocalName() const;
    /// Returns: the prefix, 0 when there is none.
    virtual MoxName getPrefix() const;
    /// Returns: the node's value, `NULL_VALUE` where a kind of node has none.
    virtual MoxValue getNodeValue() const;
    /// Returns: 1 element, 3 text, 9 document.
    virtual int getNodeType() const;
    /// Returns: the parent, borrowed, or null.
    virtual MoxNode* getParentNode() const;
    /// Returns: whether there are children.
    virtual bool hasChildNodes() const;
    /// Returns: the first child, borrowed, or null.
    virtual MoxNode* getFirstChild() const;
    /// Returns: the neighbour before this node, borrowed, or null.
    virtual MoxNode* getPreviousSibling() const;
    /// Returns: the neighbour behind this node, borrowed, or null.
    virtual MoxNode* getNextSibling() const;
    /// Returns: the document, borrowed; null when the node was made without one, and when the
    /// document is no more.
    virtual MoxDocument* getOwnerDocument() const;

    /// Inserts `child` before `ref`, or behind all children when `ref` is null.
    /// Owns: takes a reference to `child`; a child that has a parent moves.
    /// Returns: `child`, or null when it can't stand here: a null, a node that would become its own
    /// ancestor, a `ref` that is no child of this node, a document, a second element or a text in a
    /// document, anything in a text. The tree is then as it was.
    virtual MoxNode* insertBefore(MoxNode* child, MoxNode* ref);

    /// Puts `child` in the place of `old`, which loses the parent's reference.
    /// Ignores: what `insertBefore` refuses.
    virtual void replaceChild(MoxNode* child, MoxNode* old);

    /// Unlinks `child` and drops the parent's reference. Ignores: a node that is no child of this.
    virtual void removeChild(MoxNode* child);

    /// Appends `child` as `insertBefore` with a null `ref` does, and returns the same.
    virtual MoxNode* appendChild(MoxNode* child);

    /// Returns: the attributes, none for what is no element.
    virtual MoxAttributeMap getAttributes() const;

    /// Returns: a copy of the node, without a parent; of all below it too when `deep` is set.
    virtual MoxPtr<MoxNode> cloneNode(bool deep) const;
    /// Returns: true for an element.
    virtual bool isElementNode() const;
    /// Returns: true for a text.
    virtual bool isText() const;
    /// Returns: whether a text is saved with a tag of its own; no text of this library is.
    virtual bool saveTextTag() const;
    /// Returns: the text of a text node, empty for all others.
    virtual UnicodeString getText() const;
    /// Replaces the text of a text node. Ignores: every other node.
    virtual void setText(const UnicodeString& text);
    /// Appends a text node. Returns: the node, or null where none can stand.
    virtual MoxNode* appendChildText(const UnicodeString& text);

    /// Returns: a walk over this node and all below it, in document order.
    MoxTreeIterator getIterator() const;

    /// Makes nodes again of all that is packed below this node.
    /// Throws: std::bad_alloc; every part of the tree is packed or unpacked then.
    void unpackAll();

    // Plain readings of the links, for walks that can't afford a virtual call for each step. They
    // show what is packed as it is.
    /// Returns: the parent, borrowed, or null.
    MoxNode* parentLink() const { return parent; }

    /// Returns: the first child, borrowed, or null.
    MoxNode* firstLink() const { return firstChild; }

    /// Returns: the neighbour behind this node, borrowed, or null.
    MoxNode* nextLink() const { return nextSibling; }

    /// Returns: the neighbour before this node, borrowed, or null.
    MoxNode* previousLink() const { return previous && previous->nextSibling ? previous : nullptr; }

    /// Returns: the last child, borrowed, or null.
    MoxNode* lastLink() const { return firstChild ? firstChild->previous : nullptr; }

    /// Returns: the node behind this one in document order, in the subtree of `root`, or null.
    MoxNode* followingLink(const MoxNode* root) const;

    /// Returns: what the node is.
    MoxNodeType kindLink() const { return kind; }

protected:
    /// A node of `document`, which may be null.
    MoxNode(MoxNodeType nodeKind, MoxDocument* document);

    /// The copy of this node alone, for `cloneNode`.
    virtual MoxPtr<MoxNode> cloneAlone() const = 0;

    /// Makes `document`, whose base this is, the owner of itself and of all that it makes.
    void beginDocument(MoxDocument* document);

    /// Tells all nodes of the document, wherever they stand, that it is no more.
    void endDocument();

    /// Makes the document of `other` that of this node too.
    void shareOwner(const MoxNode& other);

private:
    friend class MoxPackedNode;

    struct DocumentLink;

    bool canTake(const MoxNode* child, const MoxNode* ref) const;
    bool isAtOrBelow(const MoxNode* other) const;
    bool hasRoomInDocument(const MoxNode* child) const;
    void link(MoxNode* child, MoxNode* ref);
    void unlink(MoxNode* child);
    void setOwnerOfSubtree(const MoxPtr<DocumentLink>& link);
    void releaseChildren();
    void replaceLink(MoxNode& old, std::span<const MoxPtr<MoxNode>> nodes);
    static MoxNode* unpacked(MoxNode* (*read)(const MoxNode& node), const MoxNode& node);

    MoxNodeType kind;
    MoxNode* parent = nullptr;      // borrowed
    MoxNode* previous = nullptr;    // borrowed; before the first child comes the last
    MoxNode* nextSibling = nullptr; // owned, by the parent's reference
    MoxPtr<DocumentLink> owner;     // shared by all nodes of a document
    MoxNode* firstChild = nullptr;  // owned, by reference
};

/// Narrows a node to a class by the type test. Returns: null for null and for a no.
template <typename T> T* narrow(MoxNode* node) {
    return node && node->isA(T::typeId) ? static_cast<T*>(node) : nullptr;
}

/// The same for a node that is not to be changed.
template <typename T> const T* narrow(const MoxNode* node) {
    return node && node->isA(T::typeId) ? static_cast<const T*>(node) : nullptr;
}

} // namespace MoxCommonNS
