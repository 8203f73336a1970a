#include "tree/SVGTreeManager.h"

#include "SVGConfig.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxPackedNode.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGUtil.h"

#include <algorithm>

namespace DrawmereNS {
namespace {

using MoxCommonNS::narrow;

enum class Destination : std::uint8_t { stay, defs, root };

/// What saving a state of one type does to the cursor.
struct CursorRule {
    ELEMENT_TYPE type;
    Destination destination;
};

// Types that are not listed save no cursor and take none back.
constexpr CursorRule cursorRules[] = {
    {ELEMENT_TYPE_PLAIN, Destination::stay},    {ELEMENT_TYPE_PATTERN, Destination::defs},
    {ELEMENT_TYPE_GRADIENT, Destination::defs}, {ELEMENT_TYPE_MASK, Destination::defs},
    {ELEMENT_TYPE_CLIP, Destination::defs},     {ELEMENT_TYPE_LINK, Destination::root},
};

const CursorRule* findRule(ELEMENT_TYPE type) {
    for (const CursorRule& rule : cursorRules) {
        if (rule.type == type) {
            return &rule;
        }
    }
    return nullptr;
}

struct RootProfile {
    std::int32_t svgType;
    const char16_t* baseProfile;
};

constexpr RootProfile rootProfiles[] = {
    {SVGConfig::SVGTYPE_BASIC, u"basic"},
    {SVGConfig::SVGTYPE_TINY, u"tiny"},
};

/// Links and what they may lead to are looked for when the document is finished, and so are empty
/// groups.
const MoxCommonNS::MoxPackRules& getPackRules() {
    static const MoxCommonNS::MoxPackRules rules = {
        .keptElement = SVGName(SVGName::a),
        .keptAttribute = SVGName(SVGName::id),
        .neverEmpty = SVGName(SVGName::g),
    };
    return rules;
}

} // namespace

SVGTreeManager::SVGTreeManager() : document(new SVGDocument) {}

SVGTreeManager::~SVGTreeManager() {
    defsElement = nullptr;
    fontStack.clear();
    nodeStack.clear();
    clipGroups.clear();
    currentNode = nullptr;
    document = nullptr;
}

void SVGTreeManager::setSVGDocProp(const UnicodeString& version, const SVGConfig* config) {
    if (!config) {
        return;
    }
    // A Plazmic player takes a root without a namespace.
    const MoxPtr<MoxElement> made =
        config->svgType == SVGConfig::SVGTYPE_PLAZMIC
            ? document->createElement(MoxCommonNS::MOXNAME_SVG)
            : document->createElementNS(MoxCommonNS::MOXNAME_SVG_NAMESPACE, MoxName(),
                                        MoxCommonNS::MOXNAME_SVG);
    const MoxPtr<SVGElement> root(narrow<SVGElement>(made.get()));
    setRootAttributes(*root, version, *config);
    if (document->appendChild(root.get())) {
        currentNode = root;
    }
}

void SVGTreeManager::setRootAttributes(SVGElement& root, const UnicodeString& version,
                                       const SVGConfig& config) const {
    root.setAttribute(MoxName(u"xmlns:xlink"), MoxName(MoxCommonNS::MOXNAME_XLINK_NAMESPACE));
    root.setAttribute(MoxName(u"xml:space"), MoxName(u"preserve"));
    root.setSVGAttribute(SVGName::version, version);
    for (const RootProfile& profile : rootProfiles) {
        if (profile.svgType == config.svgType) {
            root.setSVGAttribute(SVGName::baseProfile, profile.baseProfile);
        }
    }
    root.setSVGAttribute(SVGName::fill, SVGUtil::getColorString(MoxColor(), config.colorFlag));
    root.setSVGAttribute(SVGName::fill_rule, u"evenodd");
    root.setSVGAttribute(SVGName::font_style, u"normal");
    root.setSVGAttribute(SVGName::font_weight, u"normal");
    root.setSVGAttribute(SVGName::font_stretch, u"normal");
}

bool SVGTreeManager::canAdd() const { return unlocked && currentNode; }

void SVGTreeManager::addElement(SVGElement* element, bool makeCurrent) {
    if (makeCurrent) {
        packFinished(nullptr); // the group that a container has closed
    }
    if (!canAdd() || !element || !currentNode->appendChild(element)) {
        return;
    }
    if (context) {
        stampContext(element);
    }
    if (makeCurrent) {
        currentNode = element;
    }
}

void SVGTreeManager::stampContext(SVGElement* element) {
    const SVGName name = SVGUtil::getSVGLocalName(element);
    if (name == SVGName::a) {
        const auto* parent = narrow<MoxElement>(element->getParentNode());
        const bool underRoot = SVGUtil::getSVGLocalName(parent) == SVGName::svg;
        context->setTransformAttr(element, underRoot ? 1 : 2);
        if (underRoot) {
            context->setClipPathAttrVal(element, true);
        }
    }
    if (context->getType() == ELEMENT_TYPE_CLIP && name != SVGName::clipPath &&
        name != SVGName::g) {
        context->AttrValueCompare(element, /*isGroup=*/false, ELEMENTTYPE_TEXT);
    }
}

void SVGTreeManager::appendNewGroup(SVGElement* group, bool makeCurrent) {
    if (!group) {
        return;
    }
    clipGroups.emplace_back(group); // under the lock too: it may stand in an open group already
    if (!canAdd()) {
        return;
    }
    if (makeCurrent) {
        currentNode->appendChild(group);
    }
    if (context) {
        context->setTransformAttr(group, makeCurrent ? 5 : 4);
    }
    if (makeCurrent) {
        currentNode = group;
    }
    if (context) {
        context->setClipPathAttrVal(group, true);
    }
}

void SVGTreeManager::packFinished(SVGElement* group) {
    if (!packsFinished) {
        return;
    }
    packLast(group, keptInGroup);
    packLast(currentNode.get(), keptAtCursor);
}

void SVGTreeManager::packLast(MoxNode* parent, const MoxNode*& kept) const {
    if (parent && parent->lastLink() != kept &&
        !MoxCommonNS::MoxPackedNode::packLast(*parent, getPackRules())) {
        kept = parent->lastLink();
    }
}

void SVGTreeManager::stopPacking(SVGElement* group) {
    if (!packsFinished) {
        return; // nothing is packed, and a walk to find that out takes long
    }
    if (group) {
        group->unpackAll();
    }
    document->unpackAll();
    packsFinished = false;
}

bool SVGTreeManager::hasEmptyGroup() const {
    return std::any_of(clipGroups.begin(), clipGroups.end(),
                       [](const MoxPtr<SVGElement>& group) { return !group->hasChildNodes(); });
}

MoxElement* SVGTreeManager::findDefs(MoxElement* root) {
    if (!root) {
        return nullptr;
    }
    auto* first = narrow<MoxElement>(root->getFirstChild());
    if (first && first->getLocalName() == MoxName(SVGName(SVGName::defs))) {
        if (!defsElement) {
            defsElement = narrow<SVGElement>(first);
        }
        currentNode = defsElement;
        return first;
    }
    defsElement = document->createSVGElement(SVGName::defs);
    // A first child that is no element counts as none, so `defs` then goes behind what is there.
    root->insertBefore(defsElement.get(), first);
    currentNode = defsElement;
    return defsElement.get();
}

void SVGTreeManager::push(ELEMENT_TYPE type, SVGGraphicContext* newContext) {
    if (!newContext) {
        return;
    }
    if (const CursorRule* rule = findRule(type)) {
        nodeStack.emplace_back(currentNode);
        MoxElement* root = document->getDocumentElement();
        if (rule->destination == Destination::defs) {
            findDefs(root);
        } else if (rule->destination == Destination::root) {
            currentNode = narrow<SVGElement>(root);
        }
    }
    // On purpose: a type without a cursor saves its font all the same, which leaves the two stacks
    // out of step. Skipping it would change the font that the pop after the next one gives back.
    fontStack.push_back(*newContext->getFont());
    context = newContext;
}

void SVGTreeManager::pop(ELEMENT_TYPE type, SVGFont* font) {
    if (nodeStack.empty()) {
        return;
    }
    if (findRule(type)) {
        if (type == ELEMENT_TYPE_GRADIENT) {
            defuseStopLock();
        }
        currentNode = narrow<SVGElement>(nodeStack.back().get());
        nodeStack.pop_back();
    }
    if (fontStack.empty()) {
        return;
    }
    if (font) {
        assignFont(*font, fontStack.back());
    }
    fontStack.pop_back();
}

} // namespace DrawmereNS
