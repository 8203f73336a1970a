#include "foundation/common/MoxTreeIterator.h"

namespace MoxCommonNS {
namespace {

const MoxNode* findFollowing(const MoxNode* node, const MoxNode* root) {
    if (node->firstLink()) {
        return node->firstLink();
    }
    // A node that was taken out of the walked tree has no way up to the root.
    while (node && node != root && !node->nextLink()) {
        node = node->parentLink();
    }
    return !node || node == root ? nullptr : node->nextLink();
}

} // namespace

MoxTreeIterator::MoxTreeIterator(const MoxNode* walkRoot) : root(walkRoot), next(walkRoot) {}

MoxNode* MoxTreeIterator::nextNode() {
    const MoxNode* given = next;
    if (given) {
        next = findFollowing(given, root);
    }
    // The walk itself changes nothing; what the caller does with the node is the caller's right.
    return const_cast<MoxNode*>(given); // NOLINT(cppcoreguidelines-pro-type-const-cast)
}

} // namespace MoxCommonNS
