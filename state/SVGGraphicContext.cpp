#include "state/SVGGraphicContext.h"

#include "foundation/common/MoxColor.h"
#include "state/TextCopy.h"
#include "tree/SVGUtil.h"

#include <utility>

namespace DrawmereNS {
namespace {

constexpr float opaque = 1.0F;
constexpr float alphaOfOpaque = 255.0F;

UnicodeString makeReference(const UnicodeString& id) {
    UnicodeString text(u"url(#");
    text.append(id).append(u')');
    return text;
}

float getOpacityOf(const MoxColor& color) {
    return static_cast<float>(color.getAlpha()) / alphaOfOpaque;
}

struct OpacityMember {
    OPACITYDEST dest;
    float GraphicContext::*member;
};

constexpr OpacityMember opacityMembers[] = {
    {OPACITYDEST_STROKE, &GraphicContext::strokeOpacity},
    {OPACITYDEST_FILL, &GraphicContext::fillOpacity},
    {OPACITYDEST_ELEMENT, &GraphicContext::opacity},
};

} // namespace

SVGGraphicContext::SVGGraphicContext(SVGConfig* svgConfig) : config(svgConfig) {}

SVGGraphicContext::~SVGGraphicContext() = default;

UnicodeString SVGGraphicContext::getColorText(const MoxColor& color) const {
    MoxColor solid = color;
    solid.clearAlpha();
    return SVGUtil::getColorString(solid, !config || config->colorFlag);
}

void SVGGraphicContext::setStrokeColor(const MoxColor& color) {
    currentGC.strokeOpacity = color.hasAlpha() ? getOpacityOf(color) : opaque;
    currentGC.strokeColor = getColorText(color);
}

void SVGGraphicContext::setStrokeColorName(const UnicodeString& name) {
    currentGC.strokeColor = name;
}

void SVGGraphicContext::setStrokeColorId(const UnicodeString& id) {
    currentGC.strokeColor = makeReference(id);
}

void SVGGraphicContext::setFillColor(const MoxColor& color) {
    currentGC.fillOpacity = color.hasAlpha() ? getOpacityOf(color) : opaque;
    currentGC.fillColor = getColorText(color);
}

void SVGGraphicContext::setFillColorName(const UnicodeString& name) { currentGC.fillColor = name; }

void SVGGraphicContext::setFillColorId(const UnicodeString& id) {
    if (!isTiny()) {
        currentGC.fillColor = makeReference(id);
        return;
    }
    const auto found = tinyFillColors.find(id);
    setFillColorName(found != tinyFillColors.end() ? found->second : UnicodeString(u"none"));
}

void SVGGraphicContext::setOpacity(float value, OPACITYDEST dest) {
    for (const OpacityMember& row : opacityMembers) {
        if (row.dest == dest) {
            currentGC.*row.member = value;
        }
    }
}

void SVGGraphicContext::setFillRule(FILLRULE rule) {
    currentGC.fillRule = rule == FILLRULE_EVENODD ? u"evenodd" : u"nonzero";
    ++changeCount;
}

void SVGGraphicContext::setDashLine(const MoxLength* lengths, int count, MoxLength offset) {
    std::vector<MoxLength> pattern; // apart, as `lengths` may be the old pattern's own
    if (lengths && count > 0) {
        pattern.assign(lengths, lengths + count);
    }
    currentGC.dashArray = std::move(pattern);
    currentGC.dashOffset = offset;
}

void SVGGraphicContext::setMaskReference(const UnicodeString& id) {
    currentGC.maskReference = id == u"none" ? id : makeReference(id);
}

void SVGGraphicContext::setClipPathID(const UnicodeString& id) { clipPathId = makeReference(id); }

void SVGGraphicContext::copyCur2Group(bool multiply) {
    SVGMatrix kept = groupGC.transMatrix;
    groupGC = currentGC;
    groupGC.transMatrix = kept;
    if (multiply) {
        moveCurrentToGroup();
    }
}

void SVGGraphicContext::moveCurrentToGroup() {
    groupGC.transMatrix = groupGC.transMatrix.multiply(currentGC.transMatrix);
    currentGC.transMatrix = SVGMatrix();
}

void SVGGraphicContext::copyGroup2Root() {
    copyCur2Group(/*multiply=*/true);
    rootMatrix = rootMatrix.multiply(groupGC.transMatrix);
    groupGC.transMatrix = SVGMatrix();
}

void SVGGraphicContext::setDefaultGC() {
    currentGC = getDefaultGC();
    groupGC = getDefaultGC();
    rootMatrix = SVGMatrix();
}

void SVGGraphicContext::copyFrom(const SVGGraphicContext& other) {
    currentGC = other.currentGC;
    groupGC = other.groupGC;
    elementType = other.elementType;
    changeCount = other.changeCount;
    assignText(clipPathId, other.clipPathId);
    clipState = other.clipState;
    svgType = other.svgType;
    rootMatrix = other.rootMatrix;
    tinyFillColors = other.tinyFillColors;
}

} // namespace DrawmereNS
