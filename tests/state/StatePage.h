/// A tree and a group manager to test the graphic state with.
#pragma once

#include "SVGConfig.h"
#include "foundation/common/MoxNameTable.h"
#include "state/SVGGManager.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

#include <string>
#include <vector>

namespace DrawmereNS {

inline MoxLength pt(float points) { return MoxLength::fromRaw(points); }

inline std::string utf8(const UnicodeString& text) {
    std::string bytes;
    return text.toUTF8String(bytes);
}

/// Returns: the attributes of `element` in their order, as "name=value name=value".
inline std::string attributesOf(const MoxElement* element) {
    std::string text;
    for (const MoxValue& value : element->getAttributes()) {
        text += text.empty() ? "" : " ";
        text += utf8(MoxCommonNS::MoxNameTable::getSharedNameString(value.getKey()));
        text += "=" + utf8(value.toString());
    }
    return text;
}

/// Returns: the child elements of `parent`.
inline std::vector<MoxElement*> childrenOf(const MoxElement* parent) {
    std::vector<MoxElement*> children;
    for (MoxNode* child = parent->getFirstChild(); child; child = child->getNextSibling()) {
        children.push_back(MoxCommonNS::narrow<MoxElement>(child));
    }
    return children;
}

/// A document with a root, and the manager that draws into it.
struct StatePage {
    explicit StatePage(SVGConfig::SVGTYPE dialect = SVGConfig::SVGTYPE_FULL) {
        manager.treeManager = &tree;
        tree.setSVGDocProp(u"1.1", &config);
        state().setSVGType(dialect);
    }

    SVGGraphicContext& state() { return *manager.getGContext(); }

    MoxPtr<SVGElement> make(SVGName name) {
        MoxPtr<SVGElement> element = tree.document->createSVGElement(name);
        if (name == SVGName::text) {
            element->appendChildText(u"abc");
        }
        return element;
    }

    /// Draws an element. Returns: the element, which the open group holds.
    SVGElement* draw(SVGName name, ELEMENTTYPE kind = ELEMENTTYPE_SHAPE) {
        manager.setElemMode(PAINTMODE_FILL, kind);
        const MoxPtr<SVGElement> element = make(name);
        manager.addElement(element.get());
        return element.get();
    }

    SVGElement* drawRect() { return draw(SVGName::rect); }

    SVGElement* drawImage() { return draw(SVGName::image, ELEMENTTYPE_IMAGE); }

    SVGElement* drawText() { return draw(SVGName::text, ELEMENTTYPE_TEXT); }

    /// Closes the open group. Returns: the group.
    SVGElement* close() {
        SVGElement* group = manager.getGroupRootNode();
        manager.appendToTree();
        return group;
    }

    /// Puts the cursor into a new `g` under the root, so that groups don't stand under the root.
    SVGElement* enterContainer() {
        const MoxPtr<SVGElement> container = make(SVGName::g);
        tree.addElement(container.get(), /*makeCurrent=*/true);
        return container.get();
    }

    SVGElement* root() const {
        return MoxCommonNS::narrow<SVGElement>(tree.document->getDocumentElement());
    }

    SVGConfig config;
    SVGTreeManager tree;
    SVGGManager manager{&config};
};

} // namespace DrawmereNS
