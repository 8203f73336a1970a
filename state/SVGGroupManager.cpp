#include "state/SVGGroupManager.h"

#include "foundation/common/MoxEmptyString.h"
#include "frontend/DrawmereError.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxEmptyString;
using MoxCommonNS::narrow;

constexpr unsigned short noTreeError = 16408;
constexpr int pageManagerType = 0;
constexpr float naturalScale = 1.0F;

bool isRoot(const MoxNode* node) {
    return SVGUtil::getSVGLocalName(narrow<MoxElement>(node)) == SVGName::svg;
}

} // namespace

SVGGroupManager::SVGGroupManager(SVGConfig* svgConfig)
    : context(new SVGGraphicContext(svgConfig)), config(svgConfig) {}

SVGGroupManager::~SVGGroupManager() { delete context; }

SVGGraphicContext* SVGGroupManager::getGContext() const { return context; }

int SVGGroupManager::getType() const { return pageManagerType; }

void SVGGroupManager::appendPathCommand(SVGDrawElement* /*command*/) {}

void SVGGroupManager::addPathSeg(const UnicodeString& /*text*/, bool /*absolute*/) {}

const UnicodeString& SVGGroupManager::getPathSeg() { return MoxEmptyString::EMPTY_VALUE; }

void SVGGroupManager::deletePathSeg() {}

void SVGGroupManager::addPathLock(bool /*lock*/) {}

void SVGGroupManager::addStopElem(MoxElement* /*stop*/) {}

void SVGGroupManager::setElemMode(PAINTMODE /*mode*/, ELEMENTTYPE /*kind*/) {}

void SVGGroupManager::push(ELEMENT_TYPE /*type*/) {}

void SVGGroupManager::pop(ELEMENT_TYPE /*type*/) {}

void SVGGroupManager::setScale(float /*scale*/) {}

float SVGGroupManager::getScale() const { return naturalScale; }

MoxValue SVGGroupManager::takePathData() { return {}; }

void SVGGroupManager::addElement(SVGElement* element) {
    if (pathLock || !element) {
        return;
    }
    if (!treeManager) {
        DrawmereError::throwError(noTreeError);
    }
    if (!groupElement) {
        openGroup();
    }
    groupElement->appendChild(element);
    context->AttrValueCompare(element, /*isGroup=*/false, elementMode);
}

void SVGGroupManager::openGroup() {
    context->copyCur2Group(/*multiply=*/false);
    groupElement = treeManager->document->createSVGElement(SVGName::g);
}

void SVGGroupManager::appendToTree() {
    if (groupElement) {
        closeGroup();
        return;
    }
    if (SVGGraphicContext::IsUnitMatrix(context->getCurrentGC()->transMatrix)) {
        return;
    }
    // A matrix set with nothing drawn is not lost: it moves one level out.
    const SVGElement* node = treeManager ? treeManager->getCurrentNode() : nullptr;
    if (node && !isRoot(node)) {
        context->copyCur2Group(/*multiply=*/true);
    } else {
        context->copyGroup2Root();
    }
}

void SVGGroupManager::closeGroup() {
    if (treeManager) {
        treeManager->addElement(groupElement.get(), /*makeCurrent=*/false);
    }
    // The attributes come first: they are those of the group's first element, and moving the state
    // brings later settings into the record.
    setGroupAttrs();
    if (isRoot(groupElement->getParentNode())) {
        context->copyGroup2Root();
    } else {
        context->copyCur2Group(/*multiply=*/true);
    }
    groupElement = nullptr;
    elementMode = ELEMENTTYPE_SHAPE;
    paintMode = PAINTMODE_NONE;
}

void SVGGroupManager::setGroupAttrs() { context->setGroupAttrs(groupElement.get(), elementMode); }

void SVGGroupManager::changeKind(ELEMENTTYPE kind) {
    if (kind != elementMode) {
        appendToTree();
        elementMode = kind;
    }
}

} // namespace DrawmereNS
