/// Which characters may stand where in XML 1.0 (fifth edition).
#pragma once

#include <unicode/utypes.h>

namespace MoxCommonNS {

/// Returns: true when `codePoint` may stand in the text of a document (XML 1.0, production 2).
constexpr bool isXmlChar(UChar32 codePoint) {
    if (codePoint < 0x20) {
        return codePoint == 0x9 || codePoint == 0xA || codePoint == 0xD;
    }
    return codePoint <= 0xD7FF || (codePoint >= 0xE000 && codePoint <= 0xFFFD) ||
           (codePoint >= 0x10000 && codePoint <= 0x10FFFF);
}

/// Returns: true when a name may begin with `codePoint` (XML 1.0, production 4).
bool isXmlNameStart(UChar32 codePoint);

/// Returns: true when `codePoint` may stand in a name (XML 1.0, production 4a).
bool isXmlNameChar(UChar32 codePoint);

} // namespace MoxCommonNS
