/// How a document is written.
#pragma once

#include "foundation/common/MoxString.h"

namespace MoxCommonNS {

/// The options of saving a document.
struct MoxXmlOptions {
    /// Means that reals keep all the digits they need.
    static constexpr int allDecimals = -1;

    bool indent = false;
    int decimals = allDecimals;

    /// Reads a comma-separated list of "indent" and "decimals=N"; blanks around an entry and
    /// unknown entries are passed over, and so is an N that is no whole number from 0 on.
    static MoxXmlOptions parse(const UnicodeString& list);
};

} // namespace MoxCommonNS
