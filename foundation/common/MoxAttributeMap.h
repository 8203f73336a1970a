/// The attributes of an element, seen in the order of first setting.
#pragma once

#include "foundation/common/MoxValue.h"

namespace MoxCommonNS {

/// One attribute, borrowed from its element.
class MoxAttribute {
public:
    /// Borrows: `attribute`.
    explicit MoxAttribute(const MoxValue& attribute) : value(&attribute) {}

    /// Returns: the qualified name of the attribute.
    MoxName getNodeName() const { return value->getKey(); }

    /// Returns: the value, valid until the element's attributes change.
    const MoxValue& getNodeValue() const { return *value; }

private:
    const MoxValue* value; // borrowed
};

/// All attributes of one element, borrowed; valid until they change.
class MoxAttributeMap {
public:
    MoxAttributeMap() = default;

    /// Borrows: `attributes`, `length` of them.
    MoxAttributeMap(const MoxValue* attributes, int length) : first(attributes), count(length) {}

    /// Returns: how many attributes there are.
    int getLength() const { return count; }

    /// Returns: the attribute at `index`, one without name and value beyond the last.
    MoxAttribute item(int index) const {
        return MoxAttribute(index >= 0 && index < count ? first[index] : MoxValue::NULL_VALUE);
    }

    /// Returns: the first value, for loops over all; each carries its name as its key.
    const MoxValue* begin() const { return first; }

    /// Returns: the place behind the last value.
    const MoxValue* end() const { return first + count; }

private:
    const MoxValue* first = nullptr; // borrowed
    int count = 0;
};

} // namespace MoxCommonNS
