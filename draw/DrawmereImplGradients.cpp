// Gradients. While one is open the tree takes nothing but stops.
#include "SVGConfig.h"
#include "draw/DrawmereImpl.h"
#include "draw/ElementAttributes.h"
#include "foundation/common/MoxWord.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGroupManager.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::findWord;
using MoxCommonNS::MoxWord;

constexpr unsigned short gradientError = 16429;

// Padding is what SVG does anyway.
constexpr MoxWord<GRADSPERADMOD> spreadWords[] = {
    {GRADREFLECT, u"reflect"},
    {GRADREPEAT, u"repeat"},
};

bool isGradient(const SVGElement* element) {
    const SVGName name = SVGUtil::getSVGLocalName(element);
    return name == SVGName::linearGradient || name == SVGName::radialGradient;
}

} // namespace

UnicodeString DrawmereImpl::setGradientAttrs(SVGElement& gradient, const SVGMatrix& matrix,
                                             UNITSTYPE units, GRADSPERADMOD spread) {
    UnicodeString id = refIdManager->createReferenceID(SVGRefIDManager::REFGRADIENT);
    gradient.setSVGAttribute(SVGName::id, id);
    setUnits(gradient, gradientUnits, units);
    if (const char16_t* word = findWord(spreadWords, spread)) {
        gradient.setSVGAttribute(SVGName::spreadMethod, word);
    }
    setMatrix(gradient, SVGName::gradientTransform, matrix);
    return id;
}

void DrawmereImpl::openGradient(SVGElement* gradient) {
    openDefinition(gradient, ELEMENT_TYPE_GRADIENT);
    treeManager->setupStopLock();
}

UnicodeString DrawmereImpl::startLinearGradient(MoxLength x1, MoxLength y1, MoxLength x2,
                                                MoxLength y2, SVGMatrix matrix, UNITSTYPE units,
                                                GRADSPERADMOD spread) {
    const MoxPtr<SVGElement> gradient = createElement(SVGName::linearGradient);
    UnicodeString id = setGradientAttrs(*gradient, matrix, units, spread);
    setLength(*gradient, SVGName::x1, x1);
    setLength(*gradient, SVGName::y1, y1);
    setLength(*gradient, SVGName::x2, x2);
    setLength(*gradient, SVGName::y2, y2);
    openGradient(gradient.get());
    return id;
}

UnicodeString DrawmereImpl::startRadialGradient(MoxLength cx, MoxLength cy, MoxLength r,
                                                MoxLength fx, MoxLength fy, SVGMatrix matrix,
                                                UNITSTYPE units, GRADSPERADMOD spread) {
    // On purpose: a linear gradient gives no warning.
    warnUnderTiny(gradientError);
    const MoxPtr<SVGElement> gradient = createElement(SVGName::radialGradient);
    UnicodeString id = setGradientAttrs(*gradient, matrix, units, spread);
    setLength(*gradient, SVGName::cx, cx);
    setLength(*gradient, SVGName::cy, cy);
    setLength(*gradient, SVGName::r, r);
    setLength(*gradient, SVGName::fx, fx);
    setLength(*gradient, SVGName::fy, fy);
    openGradient(gradient.get());
    return id;
}

void DrawmereImpl::endGradiant() { popState(ELEMENT_TYPE_GRADIENT); }

void DrawmereImpl::setStopColor(const MoxColor& color, float offset, float opacity) {
    // Elsewhere a stop means nothing, and the lock behind it would keep out all that follows.
    if (!isGradient(treeManager->getCurrentNode())) {
        return;
    }
    const MoxPtr<SVGElement> stop = createElement(SVGName::stop);
    stop->setSVGAttribute(SVGName::stop_color, SVGUtil::getColorString(color, config->colorFlag));
    stop->setSVGAttribute(SVGName::offset, MoxValue(offset));
    stop->setSVGAttribute(SVGName::stop_opacity, MoxValue(opacity));
    // Under the lock still: a group that this closes must not come into the gradient.
    groupManager->setElemMode(PAINTMODE_NONE, ELEMENTTYPE_SHAPE);
    treeManager->defuseStopLock();
    addElement(stop.get(), /*direct=*/true, /*makeCurrent=*/false);
    treeManager->setupStopLock();
}

} // namespace DrawmereNS
