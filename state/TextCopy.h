/// Copying texts that are mostly the same already.
#pragma once

#include "foundation/common/MoxString.h"

#include <cstdint>
#include <cstring>

namespace DrawmereNS {

inline std::uint64_t loadUnits(const char16_t* units) {
    std::uint64_t result = 0;
    std::memcpy(&result, units, sizeof(result));
    return result;
}

/// Compares by eight bytes: most texts are that short, and ICU's comparison is two calls.
inline bool haveSameUnits(const char16_t* one, const char16_t* other, int count) {
    constexpr int unitsAtOnce = 4;
    if (count >= unitsAtOnce) {
        const int last = count - unitsAtOnce; // the last eight may overlap those before
        for (int i = 0; i < last; i += unitsAtOnce) {
            if (loadUnits(one + i) != loadUnits(other + i)) {
                return false;
            }
        }
        return loadUnits(one + last) == loadUnits(other + last);
    }
    for (; count > 0; --count) {
        if (*one++ != *other++) {
            return false;
        }
    }
    return true;
}

/// Makes `to` the text of `from`; a text that is the same already is left alone. States are saved,
/// restored and moved between levels far more often than their texts change.
inline void assignText(UnicodeString& to, const UnicodeString& from) {
    const std::int32_t length = to.length();
    const bool isSame = length == from.length() && to.isBogus() == from.isBogus() &&
                        haveSameUnits(to.getBuffer(), from.getBuffer(), length);
    if (!isSame) {
        to = from;
    }
}

} // namespace DrawmereNS
