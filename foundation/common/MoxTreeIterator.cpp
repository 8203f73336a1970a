#include "foundation/common/MoxTreeIterator.h"

#include "foundation/common/MoxPackedNode.h"

namespace MoxCommonNS {
namespace {

/// The node behind `node`. What is packed becomes nodes as the walk gets there.
const MoxNode* findFollowing(const MoxNode* node, const MoxNode* root) {
    const MoxNode* next = node->followingLink(root);
    while (next && next->kindLink() == MOXNODE_PACKED) {
        // To whoever walks, the tree is the same.
        // NOLINTNEXTLINE(cppcoreguidelines-pro-type-const-cast)
        const_cast<MoxPackedNode*>(static_cast<const MoxPackedNode*>(next))->unpack();
        next = node->followingLink(root);
    }
    return next;
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
