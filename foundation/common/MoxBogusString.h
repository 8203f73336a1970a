/// The shared text that stands for a text that was not set.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

namespace MoxCommonNS {

/// Keeps the one text in ICU's bogus state.
class DRAWMERE_API MoxBogusString {
    static const UnicodeString& getValue();

public:
    /// The text that was not set: `isBogus` answers true, and so does that of a copy until it is
    /// set. It lives until the process ends. It may be used before main: the member is inline, so
    /// each source that includes this header sets it up ahead of the source's own static objects,
    /// and the text itself is made at that first use.
    static inline const UnicodeString& BOGUS_VALUE = getValue();
};

} // namespace MoxCommonNS
