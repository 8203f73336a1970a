// The pass that puts images where they are drawn.
#include "foundation/common/MoxNameEnum.h"
#include "post/ElementWalk.h"
#include "post/QuilletExtention.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxValue;

const MoxName& getHrefName() {
    static const MoxName name(u"xlink:href");
    return name;
}

void copyAttribute(const MoxElement& from, MoxElement& to, MoxName name) {
    to.setAttribute(name, from.getAttribute(name));
}

/// The text of a name or a string, nothing of any other value.
UnicodeString readId(const MoxElement& element) {
    const MoxValue& id = element.getAttribute(SVGName(SVGName::id));
    const bool isText =
        id.getType() == MoxCommonNS::MOXVALUE_NAME || id.getType() == MoxCommonNS::MOXVALUE_STRING;
    return isText ? id.toString() : UnicodeString();
}

MoxElement* findDefs(const MoxElement& root) {
    MoxElement* child = findElement(root.firstLink());
    while (child && !hasName(*child, SVGName::defs)) {
        child = findElement(child->nextLink());
    }
    return child;
}

/// Finds the images of `defs` by their references and takes their ids away. Of two with one id the
/// first is found.
std::map<UnicodeString, MoxElement*> takeImages(const MoxElement& defs) {
    std::map<UnicodeString, MoxElement*> images;
    for (MoxElement* child = findElement(defs.firstLink()); child;
         child = findElement(child->nextLink())) {
        if (hasName(*child, SVGName::image)) {
            images.emplace(u"#" + readId(*child), child);
            child->removeAttribute(SVGName(SVGName::id));
        }
    }
    return images;
}

/// Puts a copy of `image` in the place of `frame`, and of its size.
void placeImage(MoxElement& frame, const MoxElement& image) {
    const MoxPtr<MoxElement> copy = makeElement(frame, SVGName::image);
    MoxNode* const parent = frame.getParentNode();
    if (!copy || !parent) {
        return;
    }
    for (const SVGName::Number name : {SVGName::width, SVGName::height, SVGName::x, SVGName::y}) {
        copyAttribute(frame, *copy, SVGName(name));
    }
    copyAttribute(image, *copy, SVGName(SVGName::preserveAspectRatio));
    copyAttribute(image, *copy, getHrefName());
    parent->replaceChild(copy.get(), &frame);
}

/// Returns: the image that the `use` in `frame` refers to, or null.
MoxElement* findUsedImage(const MoxElement& frame,
                          const std::map<UnicodeString, MoxElement*>& images) {
    static const MoxName href(u"href");
    const MoxElement* use = findElement(frame.firstLink());
    const auto found = images.find(
        use->getAttributeNS(MoxName(MoxCommonNS::MOXNAME_XLINK_NAMESPACE), href).toString());
    return found == images.end() ? nullptr : found->second;
}

} // namespace

void QuilletExtention::embedImageDirect(MoxElement* root) {
    MoxElement* defs = root ? findDefs(*root) : nullptr;
    std::map<UnicodeString, MoxElement*> images;
    if (defs) {
        images = takeImages(*defs);
    }
    if (images.empty()) {
        return;
    }
    execEmbedDirect(root, images);
    for (const auto& entry : images) {
        defs->removeChild(entry.second);
    }
    images.clear();
    if (!defs->firstLink()) {
        root->removeChild(defs);
    }
}

void QuilletExtention::execEmbedDirect(MoxElement* element,
                                       std::map<UnicodeString, MoxElement*>& images) {
    MoxElement* child = element;
    while (child) {
        const bool isFrame = isImageRefSvgElement(child);
        const bool below = !isFrame && !hasName(*child, SVGName::defs);
        MoxElement* const next = findNext(child, element, below);
        const MoxElement* image = isFrame ? findUsedImage(*child, images) : nullptr;
        if (image) {
            placeImage(*child, *image);
        }
        child = next;
    }
}

bool QuilletExtention::isImageRefSvgElement(MoxElement* element) {
    if (!element || !hasName(*element, SVGName::svg)) {
        return false;
    }
    MoxElement* const child = findElement(element->firstLink());
    return child && hasName(*child, SVGName::use) && !findElement(child->nextLink());
}

} // namespace DrawmereNS
