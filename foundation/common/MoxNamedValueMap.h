/// Values under names.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxName.h"

#include <vector>

namespace MoxCommonNS {

class MoxValue;

/// A small map from names to values, kept in the order of first setting.
class DRAWMERE_API MoxNamedValueMap {
public:
    MoxNamedValueMap();
    /// A copy.
    MoxNamedValueMap(const MoxNamedValueMap&);
    /// Copies everything.
    MoxNamedValueMap& operator=(const MoxNamedValueMap&);
    ~MoxNamedValueMap();

    /// Returns: the value stored at `key`, which carries `key`, or one with key 0 when there is
    /// none. It stays valid until the map changes.
    const MoxValue& getNamedItem(MoxName key) const;

    /// Stores a copy of `value` at `key`. Ignores: a key of 0.
    void setNamedItem(MoxName key, const MoxValue& value);

    /// Returns: the number of values.
    int getLength() const;

    /// True when both hold equal values under the same keys, in whatever order.
    bool operator==(const MoxNamedValueMap& other) const;

private:
    std::vector<MoxValue> items;
};

} // namespace MoxCommonNS
