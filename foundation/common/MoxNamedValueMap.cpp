#include "foundation/common/MoxNamedValueMap.h"

#include "foundation/common/MoxValue.h"

#include <algorithm>

namespace MoxCommonNS {

MoxNamedValueMap::MoxNamedValueMap() = default;
MoxNamedValueMap::MoxNamedValueMap(const MoxNamedValueMap&) = default;
MoxNamedValueMap& MoxNamedValueMap::operator=(const MoxNamedValueMap&) = default;
MoxNamedValueMap::~MoxNamedValueMap() = default;

const MoxValue& MoxNamedValueMap::getNamedItem(MoxName key) const {
    const auto found = std::find_if(items.begin(), items.end(),
                                    [key](const MoxValue& item) { return item.getKey() == key; });
    return found == items.end() ? MoxValue::NULL_VALUE : *found;
}

void MoxNamedValueMap::setNamedItem(MoxName key, const MoxValue& value) {
    if (!key) {
        return;
    }
    MoxValue item = value;
    item.setKey(key);
    const auto found = std::find_if(items.begin(), items.end(),
                                    [key](const MoxValue& known) { return known.getKey() == key; });
    if (found == items.end()) {
        items.push_back(std::move(item));
    } else {
        *found = std::move(item);
    }
}

int MoxNamedValueMap::getLength() const { return static_cast<int>(items.size()); }

bool MoxNamedValueMap::operator==(const MoxNamedValueMap& other) const {
    return items.size() == other.items.size() &&
           std::all_of(items.begin(), items.end(), [&other](const MoxValue& item) {
               const MoxValue& found = other.getNamedItem(item.getKey());
               return found.getKey() == item.getKey() && found == item;
           });
}

} // namespace MoxCommonNS
