/// Small operations on XML names.
#pragma once

#include "foundation/common/MoxName.h"

namespace MoxCommonNS {

/// Names in XML documents.
class DRAWMERE_API MoxXmlUtil {
public:
    /// Returns: `local` itself with a prefix of 0, otherwise the name "prefix:local".
    static MoxName makeQName(MoxName prefix, MoxName local);
};

} // namespace MoxCommonNS
