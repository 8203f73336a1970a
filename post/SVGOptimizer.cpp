#include "post/SVGOptimizer.h"

#include "tree/SVGUtil.h"

#include <unicode/locid.h>

namespace DrawmereNS {

using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNode;
using TalCommon::SVGName;

namespace {

constexpr char16_t smallDeviceProfile[] = u"wisp";

UnicodeString readBaseProfile(const MoxElement& root) {
    // The locale of the user must play no part: in Turkish an I would lose its dot.
    return root.getAttribute(SVGName(SVGName::baseProfile))
        .toString()
        .toLower(icu::Locale::getRoot());
}

bool isEmptyGroup(const MoxNode& node) {
    return node.kindLink() == MoxCommonNS::MOXNODE_ELEMENT && !node.firstLink() &&
           static_cast<const MoxElement&>(node).localLink() == MoxName(SVGName(SVGName::g));
}

/// On purpose: an empty group goes only when the walk gives the node behind it. So the last node of
/// a document stays, and so does a group that loses its last group, as it was tested before.
/// What is packed holds no empty group.
void removeEmptyGroups(MoxElement& root) {
    MoxNode* pending = nullptr;
    MoxNode* node = &root;
    while (node) {
        MoxNode* const next = node->followingLink(&root);
        if (pending) {
            pending->getParentNode()->removeChild(pending);
        }
        pending = isEmptyGroup(*node) ? node : nullptr;
        node = next;
    }
}

} // namespace

void SVGOptimizer::optimize(MoxElement* root) {
    if (!root) {
        return;
    }
    if (readBaseProfile(*root) == UnicodeString(smallDeviceProfile)) {
        optimizeDefsTiny(root);
    }
    removeEmptyGroups(*root);
}

void SVGOptimizer::optimizeDefsTiny(MoxElement* root) {
    MoxElement* defs = SVGUtil::findFirstChildLocalName(root, SVGName(SVGName::defs));
    if (defs && !SVGUtil::getFirstChildElement(defs)) {
        root->removeChild(defs);
    }
}

} // namespace DrawmereNS
