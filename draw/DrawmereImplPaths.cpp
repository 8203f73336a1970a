// Path calls: while a path is open its manager stands in the place of the page's.
#include "SVGConfig.h"
#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxUtil.h"
#include "path/SVGPathManager.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MOXUNIT_MM;
using MoxCommonNS::MOXUNIT_POINT;
using MoxCommonNS::MoxUtil;

template <typename Segment>
void append(SVGGroupManager& manager, DrawmereDrawElementEnum name, Segment* newSegment) {
    const MoxPtr<Segment> segment(newSegment);
    segment->setDrawType(DRAWELEMENT_NONE);
    segment->setDrawName(name);
    manager.appendPathCommand(segment.get());
}

/// What is no farther from zero than a thousandth of a millimetre is zero.
float snapToZero(float value) {
    const float limit = MoxLength(0.001F, MOXUNIT_MM).getRawValue();
    return std::abs(MoxLength(value, MOXUNIT_POINT).getRawValue()) <= limit ? 0.0F : value;
}

/// Rounds to one decimal, halves away from zero; what a 32-bit number can't hold becomes its limit.
float roundToTenth(float value) {
    const double scaled = static_cast<double>(value) * 10.0;
    const double rounded = scaled < 0.0 ? scaled - 0.5 : scaled + 0.5;
    constexpr double lowest = std::numeric_limits<std::int32_t>::min();
    constexpr double highest = std::numeric_limits<std::int32_t>::max();
    if (std::isnan(rounded)) {
        return 0.0F;
    }
    const auto whole = static_cast<std::int32_t>(std::clamp(rounded, lowest, highest));
    return static_cast<float>(static_cast<double>(whole) / 10.0);
}

UnicodeString toArcText(float value) { return MoxUtil::toString(static_cast<double>(value)); }

UnicodeString toArcLength(float value, bool rounds) {
    const float snapped = snapToZero(value);
    return toArcText(rounds ? roundToTenth(snapped) : snapped);
}

} // namespace

void DrawmereImpl::startPathData() {
    if (savedGroupManager) {
        endPathData(lastPathPaintMode);
    }
    auto* pathManager = new SVGPathManager(config);
    pathManager->treeManager = treeManager;
    savedGroupManager = groupManager;
    groupManager = pathManager;
    // The next text hands its font over again.
    savedGroupManager->setFontAttribute(FONTATTRIBUTE());
    groupManager->addPathLock(true);
}

void DrawmereImpl::endPathData(PAINTMODE mode) {
    if (!savedGroupManager) {
        return;
    }
    MoxValue data = groupManager->takePathData();
    closePathManager();
    if (data.getType() == MoxCommonNS::MOXVALUE_NULL) {
        return;
    }
    const MoxPtr<SVGElement> path = createDrawing(SVGName::path, 1, mode);
    path->setSVGAttribute(SVGName::d, std::move(data));
    groupManager->setElemMode(mode, ELEMENTTYPE_SHAPE);
    setPaintAttr(path.get(), mode);
    addElement(path.get(), /*direct=*/false, /*makeCurrent=*/false);
    groupManager->appendToTree();
    lastPathPaintMode = mode;
}

void DrawmereImpl::closePathManager() {
    groupManager->addPathLock(false);
    groupManager->deletePathSeg();
    // A push while the path was open has left the tree with the state that goes now.
    if (treeManager->context == groupManager->getGContext()) {
        treeManager->context = savedGroupManager->getGContext();
    }
    delete groupManager;
    groupManager = savedGroupManager;
    savedGroupManager = nullptr;
}

void DrawmereImpl::setPathMoveTo(const MoxPointT<MoxLength>& point) {
    append(*groupManager, DRAWELEMENT_MOVE, new SVGDrawElementMoveTo(point));
}

void DrawmereImpl::setPathClosepath() {
    append(*groupManager, DRAWELEMENT_CLOSE, new SVGDrawElementClose);
}

void DrawmereImpl::setPathLineTo(const MoxPointT<MoxLength>& point) {
    append(*groupManager, DRAWELEMENT_LINE, new SVGDrawElementLineTo(point));
}

void DrawmereImpl::setPathCubicBezierCurveTo(const MoxPointT<MoxLength>& point1,
                                             const MoxPointT<MoxLength>& point2,
                                             const MoxPointT<MoxLength>& point3) {
    append(*groupManager, DRAWELEMENT_CUBIC,
           new SVGDrawElementCubicBezierCurveTo(point1, point2, point3));
}

void DrawmereImpl::setPathQuadraticBezierCurveTo(const MoxPointT<MoxLength>& point1,
                                                 const MoxPointT<MoxLength>& point2) {
    append(*groupManager, DRAWELEMENT_QUADRATIC,
           new SVGDrawElementQuadraticBezierCurveTo(point1, point2));
}

void DrawmereImpl::closePath(bool absolute) {
    groupManager->addPathSeg(absolute ? UnicodeString(u'Z') : UnicodeString(u'z'), absolute);
}

void DrawmereImpl::ellipticalArcTo(float rx, float ry, float angle, bool largeArc, bool sweep,
                                   float x, float y, bool absolute) {
    const bool rounds = config->wispMode;
    UnicodeString text(absolute ? u'A' : u'a');
    text.append(toArcLength(rx, rounds)).append(u' ').append(toArcLength(ry, rounds));
    text.append(u' ').append(toArcText(angle));
    text.append(largeArc ? u" 1" : u" 0").append(sweep ? u" 1 " : u" 0 ");
    text.append(toArcLength(x, rounds)).append(u' ').append(toArcLength(y, rounds));
    groupManager->addPathSeg(text, absolute);
}

} // namespace DrawmereNS
