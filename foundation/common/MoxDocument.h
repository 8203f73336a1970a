/// A document: the root of a tree and the maker of its elements.
#pragma once

#include "foundation/common/MoxElement.h"

#include <iosfwd>

namespace MoxCommonNS {

/// A document node. It has at most one child, the document element.
class DRAWMERE_API MoxDocument : public MoxNode {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0x2A780AB6;

    MoxDocument();
    /// Nodes that outlive the document belong to no document afterwards.
    ~MoxDocument() override;

    /// Takes memory of trees.
    static void* operator new(std::size_t size) { return MoxNodeHeap::allocate(size); }

    /// Gives the memory back.
    static void operator delete(void* document, std::size_t size) {
        MoxNodeHeap::release(document, size);
        MoxNodeHeap::startReuse();
    }

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    MoxName getNodeName() const override;
    /// Returns: "#document".
    MoxName getLocalName() const override;

    /// Returns: the root element or null.
    virtual MoxElement* getDocumentElement() const;

    /// Makes an element of this document that stands nowhere yet and has no namespace of its own.
    virtual MoxPtr<MoxElement> createElement(MoxName name);

    /// The same in the namespace `uri`; a `prefix` of 0 means none.
    virtual MoxPtr<MoxElement> createElementNS(MoxName uri, MoxName prefix, MoxName local);

    /// Writes the document as XML 1.0, or the subtree at `node` when that is not null.
    /// `encoding`: empty means UTF-8; otherwise a name that ICU knows, with character references
    /// for what it can't carry; an unknown name means UTF-8. `doctype`: what stands behind
    /// "<!DOCTYPE ", empty for none. `options`: a comma-separated list of "indent" and "decimals=N"
    /// (reals rounded to N decimals, though none that is not zero becomes 0). `reserved`: not used.
    /// Characters that XML forbids become U+FFFD. Failures stay in the state of `stream`.
    void save(const UnicodeString& encoding, const UnicodeString& doctype, std::ostream& stream,
              const MoxNode* node, const UnicodeString& options,
              const UnicodeString& reserved) const;

protected:
    MoxPtr<MoxNode> cloneAlone() const override;
};

} // namespace MoxCommonNS
