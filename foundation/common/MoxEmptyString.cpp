#include "foundation/common/MoxEmptyString.h"

namespace MoxCommonNS {

const UnicodeString& MoxEmptyString::getValue() {
    // Never deleted: objects that die after main may still hold a reference to it.
    static const UnicodeString* const value = new UnicodeString();
    return *value;
}

} // namespace MoxCommonNS
