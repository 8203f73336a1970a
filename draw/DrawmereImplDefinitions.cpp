// Clip paths, masks and patterns: what is drawn between a start and its end stands in `defs`.
#include "SVGConfig.h"
#include "draw/DrawmereImpl.h"
#include "draw/ElementAttributes.h"
#include "foundation/common/MoxUtil.h"
#include "frontend/DrawmereError.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tree/SVGTreeManager.h"

#include <utility>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MOXUNIT_POINT;
using MoxCommonNS::MoxUtil;

constexpr unsigned short clipPathError = 16428;
constexpr unsigned short maskError = 16430;
constexpr unsigned short patternError = 16431;

/// What the code of a queued error is ahead of that of its text.
constexpr unsigned short queuedErrorShift = 512;

UnicodeString toText(float number) { return MoxUtil::toString(static_cast<double>(number)); }

/// On purpose: the corners are not put in order, so the size may be negative.
UnicodeString makeViewBox(const MoxRectT<MoxLength>& area) {
    const float x = area.x1.getRealValue(MOXUNIT_POINT);
    const float y = area.y1.getRealValue(MOXUNIT_POINT);
    UnicodeString box = toText(x);
    for (const float number :
         {y, area.x2.getRealValue(MOXUNIT_POINT) - x, area.y2.getRealValue(MOXUNIT_POINT) - y}) {
        box.append(u' ').append(toText(number));
    }
    return box;
}

void putInOrder(MoxLength& smaller, MoxLength& greater) {
    if (!(greater.getRawValue() > smaller.getRawValue())) {
        std::swap(smaller, greater);
    }
}

void setArea(SVGElement& element, MoxRectT<MoxLength> area) {
    putInOrder(area.x1, area.x2);
    putInOrder(area.y1, area.y2);
    setLength(element, SVGName::x, area.x1);
    setLength(element, SVGName::y, area.y1);
    setLength(element, SVGName::width,
              MoxLength::fromRaw(area.x2.getRawValue() - area.x1.getRawValue()));
    setLength(element, SVGName::height,
              MoxLength::fromRaw(area.y2.getRawValue() - area.y1.getRawValue()));
}

} // namespace

void DrawmereImpl::warnUnderTiny(unsigned short code) const {
    if (config->svgType == SVGConfig::SVGTYPE_TINY) {
        config->pushError(MoxError(static_cast<unsigned short>(code + queuedErrorShift),
                                   DrawmereError::getErrorMessage(code, UnicodeString()),
                                   UnicodeString(),
                                   /*lineNumber=*/-1, /*columnNumber=*/-1, UnicodeString()));
    }
}

void DrawmereImpl::openDefinition(SVGElement* element, ELEMENT_TYPE type) {
    pushState(type);
    addElement(element, /*direct=*/true, /*makeCurrent=*/true);
}

void DrawmereImpl::startClipDef(UNITSTYPE units) {
    warnUnderTiny(clipPathError);
    openClipPath(units);
}

void DrawmereImpl::startClipRect(UNITSTYPE units) { openClipPath(units); }

void DrawmereImpl::openClipPath(UNITSTYPE units) {
    const MoxPtr<SVGElement> clipPath = createElement(SVGName::clipPath);
    clipPathId = refIdManager->createReferenceID(SVGRefIDManager::REFCLIP);
    clipPath->setSVGAttribute(SVGName::id, clipPathId);
    setUnits(*clipPath, clipPathUnits, units);
    // Ahead of the push, so the end of the definition takes back a state that knows the id.
    getGContext()->setClipPathID(clipPathId);
    openDefinition(clipPath.get(), ELEMENT_TYPE_CLIP);
    inClipDef = true;
}

void DrawmereImpl::endClipDef() {
    popState(ELEMENT_TYPE_CLIP);
    inClipDef = false;
}

void DrawmereImpl::doClip() {
    if (getGContext()->getType() == ELEMENT_TYPE_CLIP) {
        return;
    }
    getGContext()->setClipState(true);
    const MoxPtr<SVGElement> group = createElement(SVGName::g);
    // On purpose: with a group open the clipping one stands in it and takes nothing in, so nothing
    // is clipped. Closing the open group first would clip what this call leaves alone.
    SVGElement* openGroup = groupManager->getGroupRootNode();
    if (openGroup) {
        openGroup->appendChild(group.get());
    }
    treeManager->appendNewGroup(group.get(), /*makeCurrent=*/!openGroup);
}

UnicodeString DrawmereImpl::startMask(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                                      UNITSTYPE units, UNITSTYPE contentUnits) {
    warnUnderTiny(maskError);
    const MoxPtr<SVGElement> mask = createElement(SVGName::mask);
    UnicodeString id = refIdManager->createReferenceID(SVGRefIDManager::REFIMAGE);
    mask->setSVGAttribute(SVGName::id, id);
    setUnits(*mask, maskUnits, units);
    setUnits(*mask, maskContentUnits, contentUnits);
    setLength(*mask, SVGName::x, x);
    setLength(*mask, SVGName::y, y);
    setLength(*mask, SVGName::width, width);
    setLength(*mask, SVGName::height, height);
    openDefinition(mask.get(), ELEMENT_TYPE_MASK);
    return id;
}

void DrawmereImpl::endMask() { popState(ELEMENT_TYPE_MASK); }

UnicodeString DrawmereImpl::startPattern(const MoxRectT<MoxLength>& area,
                                         const MoxRectT<MoxLength>& viewArea, SVGMatrix matrix,
                                         UNITSTYPE units, UNITSTYPE contentUnits) {
    warnUnderTiny(patternError);
    const MoxPtr<SVGElement> pattern = createElement(SVGName::pattern);
    UnicodeString id = refIdManager->createReferenceID(SVGRefIDManager::REFPATTERN);
    pattern->setSVGAttribute(SVGName::id, id);
    setUnits(*pattern, patternUnits, units);
    setUnits(*pattern, patternContentUnits, contentUnits);
    pattern->setSVGAttribute(SVGName::viewBox, makeViewBox(viewArea));
    setMatrix(*pattern, SVGName::patternTransform, matrix);
    setArea(*pattern, area);
    openDefinition(pattern.get(), ELEMENT_TYPE_PATTERN);
    return id;
}

void DrawmereImpl::endPattern() { popState(ELEMENT_TYPE_PATTERN); }

} // namespace DrawmereNS
