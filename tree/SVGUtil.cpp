#include "tree/SVGUtil.h"

#include <algorithm>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxNode;
using MoxCommonNS::narrow;

MoxNode* findTextChild(const MoxElement* element) {
    MoxNode* child = element ? element->getFirstChild() : nullptr;
    while (child && !child->isText()) {
        child = child->getNextSibling();
    }
    return child;
}

} // namespace

SVGName SVGUtil::getSVGLocalName(const MoxElement* element) {
    return element ? SVGName(element->getLocalName()) : SVGName();
}

void SVGUtil::setTextValue(MoxElement* element, const UnicodeString& text) {
    if (MoxNode* child = findTextChild(element)) {
        child->setText(text);
    }
}

UnicodeString SVGUtil::getTextValue(const MoxElement* element) {
    const MoxNode* child = findTextChild(element);
    return child ? child->getText() : UnicodeString();
}

bool SVGUtil::hasEqualAttributes(const MoxElement* a, const MoxElement* b) {
    if (!a || !b || a->getLocalName() != b->getLocalName()) {
        return false;
    }
    const MoxCommonNS::MoxAttributeMap attributes = a->getAttributes();
    if (attributes.getLength() != b->getAttributes().getLength()) {
        return false;
    }
    return std::none_of(attributes.begin(), attributes.end(), [b](const MoxValue& attribute) {
        return attribute != b->getAttribute(attribute.getKey());
    });
}

MoxElement* SVGUtil::getFirstChildElement(const MoxElement* element) {
    MoxNode* child = element ? element->getFirstChild() : nullptr;
    while (child && !child->isElementNode()) {
        child = child->getNextSibling();
    }
    return narrow<MoxElement>(child);
}

MoxElement* SVGUtil::getNextSiblingElement(const MoxElement* element) {
    // On purpose: looks one sibling ahead, so a text node ends the walk. getFirstChildElement does
    // skip text; levelling the two would change what findFirstSiblingLocalName finds.
    return element ? narrow<MoxElement>(element->getNextSibling()) : nullptr;
}

MoxElement* SVGUtil::getPreviousSibligElement(const MoxElement* element) {
    return element ? narrow<MoxElement>(element->getPreviousSibling()) : nullptr;
}

MoxElement* SVGUtil::findFirstSiblingLocalName(MoxElement* element, const MoxName& name) {
    while (element && element->getLocalName() != name) {
        element = getNextSiblingElement(element);
    }
    return element;
}

MoxElement* SVGUtil::findFirstChildLocalName(const MoxElement* element, const MoxName& name) {
    return findFirstSiblingLocalName(getFirstChildElement(element), name);
}

MoxElement* SVGUtil::findNextSiblingLocalName(const MoxElement* element, const MoxName& name) {
    return findFirstSiblingLocalName(getNextSiblingElement(element), name);
}

UnicodeString SVGUtil::getColorString(const MoxColor& color, bool flag) {
    return color.toString(true, false, !flag);
}

} // namespace DrawmereNS
