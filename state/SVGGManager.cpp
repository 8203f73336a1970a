#include "state/SVGGManager.h"

#include "frontend/DrawmereError.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {
namespace {

constexpr unsigned short emptyStackError = 16406;
constexpr unsigned short otherTypeError = 16407;
constexpr float naturalScale = 1.0F;

bool isAllZero(const FONTATTRIBUTE& font) {
    return font.fontSize == MoxLength() && font.fontAdjust == MoxLength() &&
           font.fontVariant == 0 && font.fontStretch == 0;
}

// On purpose: the sizes are compared with 0, not with each other. With any real font each text thus
// starts its own group; otherwise texts of one size would share one.
bool shareGroup(const FONTATTRIBUTE& current, const FONTATTRIBUTE& group) {
    return current == group && isAllZero(current) && isAllZero(group);
}

} // namespace

SVGGManager::SVGGManager(SVGConfig* svgConfig) : SVGGroupManager(svgConfig) {
    saveContext();
    scaleStack.push_back(naturalScale);
}

SVGGManager::~SVGGManager() {
    for (const SVGGraphicContext* saved : contextStack) {
        delete saved;
    }
}

void SVGGManager::setElemMode(PAINTMODE mode, ELEMENTTYPE kind) {
    changeKind(kind);
    if (kind == ELEMENTTYPE_TEXT) {
        if (!shareGroup(context->getCurrentGC()->font, context->getGroupGC()->font)) {
            appendToTree();
            elementMode = ELEMENTTYPE_TEXT;
        }
        paintMode = paintMode | PAINTMODE_TEXT;
    }
    paintMode = paintMode | mode;
}

void SVGGManager::push(ELEMENT_TYPE type) {
    appendToTree();
    if (type == ELEMENT_TYPE_LINK) {
        return;
    }
    context->setType(type);
    saveContext();
    scaleStack.push_back(getScale());
    if (type != ELEMENT_TYPE_PLAIN) {
        context->setDefaultGC();
    }
}

void SVGGManager::saveContext() {
    if (spare) {
        spare->copyFrom(*context);
    } else {
        spare = std::make_unique<SVGGraphicContext>(*context);
    }
    contextStack.push_back(nullptr); // first, as it may fail
    contextStack.back() = spare.release();
}

void SVGGManager::pop(ELEMENT_TYPE type) {
    appendToTree();
    if (type == ELEMENT_TYPE_LINK) {
        return;
    }
    if (contextStack.empty()) {
        DrawmereError::throwError(emptyStackError);
    }
    if (type != contextStack.back()->getType()) {
        DrawmereError::throwError(otherTypeError);
    }
    takeSavedContext();
    if (!scaleStack.empty()) {
        scaleStack.pop_back();
    }
    // On purpose: nothing is being defined after any pop, even inside another definition. The saved
    // type serves the check above alone; restoring it would change what the rest of the outer one
    // writes.
    context->setType(ELEMENT_TYPE_NONE);
}

void SVGGManager::takeSavedContext() {
    spare.reset(contextStack.back());
    contextStack.pop_back();
    context->copyFrom(*spare);
}

void SVGGManager::setScale(float scale) {
    if (!scaleStack.empty()) {
        scaleStack.back() = scale;
    }
}

float SVGGManager::getScale() const {
    return scaleStack.empty() ? naturalScale : scaleStack.back();
}

} // namespace DrawmereNS
