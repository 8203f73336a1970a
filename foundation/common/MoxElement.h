/// An element of the document tree.
#pragma once

#include "foundation/common/MoxNode.h"

namespace MoxCommonNS {

/// An element: a name, attributes in the order of first setting, and children. It has room for
/// 65,535 attributes; one more throws std::bad_alloc and changes nothing.
class DRAWMERE_API MoxElement : public MoxNode {
public:
    /// What `isA` and `getTypeID` know this class by.
    static constexpr std::uint32_t typeId = 0x9B60777D;

    /// An element of `document` that has no name yet; `MoxDocument::createElement` gives it one.
    /// Borrows: `document`, which may be null.
    explicit MoxElement(MoxDocument* document);
    ~MoxElement() override;

    std::uint32_t getTypeID() const override;
    bool isA(std::uint32_t id) const override;
    const char* getTypeName() const override;
    MoxName getNodeName() const override;
    /// Returns: the local name.
    MoxName getLocalName() const override;
    MoxName getPrefix() const override;
    MoxAttributeMap getAttributes() const override;

    /// Returns: the value of the attribute with this qualified name, `NULL_VALUE` when absent;
    /// valid until the attributes change.
    virtual const MoxValue& getAttribute(MoxName name) const;

    /// Returns: the value of the attribute `local` of the namespace `uri`. An attribute that was
    /// set under a qualified name is found too when the root element declares its prefix for `uri`.
    virtual const MoxValue& getAttributeNS(MoxName uri, MoxName local) const;

    /// Sets or replaces an attribute. Ignores: a null value and the name 0.
    virtual void setAttribute(MoxName name, const MoxValue& value);
    /// Removes an attribute. Ignores: one that is not set.
    virtual void removeAttribute(MoxName name);
    /// Returns: whether the attribute is set.
    virtual bool hasAttribute(MoxName name) const;

    /// The same as the virtual form for a value that nobody needs any longer.
    void setAttribute(MoxName name, MoxValue&& value);

    /// Makes room for `count` attributes of an element that has none yet, so that they need not
    /// move as they come. Ignores: an element that has attributes.
    void reserveAttributes(int count);

    /// Names the element: a namespace and a prefix of 0 mean none.
    void setName(MoxName newUri, MoxName newPrefix, MoxName newLocal);

    /// Returns: a new element of the same class and document, without a name or attributes.
    MoxPtr<MoxElement> makeLike() const;

    /// Returns: the namespace that the element was made with, 0 for none of its own.
    MoxName getNamespaceURI() const { return uri; }

    // Plain readings for walks that can't afford a virtual call for each step.
    /// Returns: the local name.
    MoxName localLink() const { return local; }

    /// Returns: the prefix, 0 for none.
    MoxName prefixLink() const { return prefix; }

    /// Returns: the attributes.
    MoxAttributeMap attributeLinks() const { return {attributes, attributeCount}; }

protected:
    MoxPtr<MoxNode> cloneAlone() const override;

    /// An element of the same class for a copy, without a document, a name or attributes.
    virtual MoxPtr<MoxElement> makeBlank() const;

private:
    MoxValue* find(MoxName name) const;
    MoxValue* append();
    void grow();

    MoxName uri;
    MoxName prefix;
    MoxName local;
    std::uint16_t attributeCount = 0;
    std::uint16_t attributeCapacity = 0;
    MoxValue* attributes = nullptr; // owned
};

} // namespace MoxCommonNS
