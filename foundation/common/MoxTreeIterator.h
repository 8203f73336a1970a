/// A walk over a subtree in document order.
#pragma once

#include "foundation/common/MoxNode.h"

namespace MoxCommonNS {

/// Walks depth first over a node and all below it. The node after the one just given is chosen when
/// that is given, so the caller may change or remove what it was given before, but not the node
/// that comes next.
class DRAWMERE_API MoxTreeIterator {
public:
    /// Borrows: `root`, which may be null for an empty walk.
    explicit MoxTreeIterator(const MoxNode* root);

    /// Returns: whether a node is left.
    bool hasNextNode() const { return next != nullptr; }

    /// Returns: the next node, or null at the end.
    MoxNode* nextNode();

private:
    const MoxNode* root; // borrowed
    const MoxNode* next; // borrowed
};

} // namespace MoxCommonNS
