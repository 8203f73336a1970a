/// Cleans up the tree of a finished document.
#pragma once

#include "foundation/common/MoxElement.h"

namespace DrawmereNS {

using MoxCommonNS::MoxElement;

/// Removes what is left empty when a document is complete. It has no state.
class SVGOptimizer {
public:
    SVGOptimizer() = delete;

    /// Removes the groups without a child node at and below `root`, and for the base profile
    /// "wisp", in any case, an empty `defs` first. A group whose last group goes stays, and so does
    /// an empty group that is the last node of the document. Ignores: null.
    static void optimize(MoxElement* root);

    /// Removes the first `defs` among the children of `root` when no element is in it.
    /// Ignores: null.
    static void optimizeDefsTiny(MoxElement* root);
};

} // namespace DrawmereNS
