/// Walks over the elements of a tree, for the passes that rewrite it.
#pragma once

#include "foundation/common/MoxDocument.h"
#include "foundation/names/SVGName.h"

namespace DrawmereNS {

using MoxCommonNS::MoxElement;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNode;
using MoxCommonNS::MoxPtr;
using TalCommon::SVGName;

/// Returns: the node as an element, null for null and for what is none.
inline MoxElement* toElement(MoxNode* node) {
    const bool isElement = node && node->kindLink() == MoxCommonNS::MOXNODE_ELEMENT;
    return isElement ? static_cast<MoxElement*>(node) : nullptr;
}

inline bool hasName(const MoxElement& element, SVGName name) {
    return element.localLink() == MoxName(name);
}

/// Returns: the first element among `node` and its next siblings, or null.
inline MoxElement* findElement(MoxNode* node) {
    while (node && !toElement(node)) {
        node = node->nextLink();
    }
    return toElement(node);
}

/// Returns: the element behind `node` in the walk over what is below `root`, in document order;
/// one `below` the node itself too when that is set. Null at the end.
inline MoxElement* findNext(MoxNode* node, const MoxNode* root, bool below) {
    MoxElement* next = below ? findElement(node->firstLink()) : nullptr;
    while (!next && node != root) {
        next = findElement(node->nextLink());
        node = node->parentLink();
    }
    return next;
}

/// Returns: an element of the document that `relative` belongs to, null when that is none.
inline MoxPtr<MoxElement> makeElement(const MoxElement& relative, SVGName name) {
    MoxCommonNS::MoxDocument* document = relative.getOwnerDocument();
    return document ? document->createElement(name) : MoxPtr<MoxElement>();
}

} // namespace DrawmereNS
