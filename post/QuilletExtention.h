/// The rewriting of a finished Tiny document for small devices.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxElement.h"

namespace DrawmereNS {

using MoxCommonNS::MoxElement;

/// Takes a finished tree through the passes of the small-device mode. There are none so far.
class QuilletExtention { // sic
public:
    /// Rewrites the tree at `root` in place.
    void optimizeQuillet(MoxElement* root);
};

} // namespace DrawmereNS
