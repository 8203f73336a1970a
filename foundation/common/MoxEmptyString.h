/// The shared empty text.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

namespace MoxCommonNS {

/// Keeps the one empty text that functions answer by reference.
class DRAWMERE_API MoxEmptyString {
    static const UnicodeString& getValue();

public:
    /// The empty text; it lives until the process ends.
    /// It may be used before main: the member is inline, so each source that includes this header
    /// sets it up ahead of the source's own static objects, and the text itself is made at that
    /// first use.
    static inline const UnicodeString& EMPTY_VALUE = getValue();
};

} // namespace MoxCommonNS
