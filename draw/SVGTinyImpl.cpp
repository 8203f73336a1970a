#include "draw/SVGTinyImpl.h"

#include "SVGConfig.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

namespace DrawmereNS {
namespace {

/// An opaque colour; each channel is rounded down.
MoxColor findMiddle(const MoxColor& one, const MoxColor& other) {
    return {(one.getRed() + other.getRed()) >> 1, (one.getGreen() + other.getGreen()) >> 1,
            (one.getBlue() + other.getBlue()) >> 1};
}

MoxLength firstOf(const std::vector<MoxLength>& positions) {
    return positions.empty() ? MoxLength() : positions.front();
}

} // namespace

SVGTinyImpl::SVGTinyImpl(SVGConfig* options) : SVGBasicImpl(options) {
    getGContext()->setSVGType(SVGConfig::SVGTYPE_TINY);
}

SVGTinyImpl::~SVGTinyImpl() = default;

void SVGTinyImpl::setInternalView(UnicodeString /*id*/, float /*x*/, float /*y*/, float /*width*/,
                                  float /*height*/) {}

void SVGTinyImpl::doClip() {}

void SVGTinyImpl::drawImage(TLGraphicImage* image, const MoxLength& width, const MoxLength& height,
                            const MoxLength& x, const MoxLength& y) {
    if (!isInDefinition()) {
        DrawmereImpl::drawImage(image, width, height, x, y);
    }
}

UnicodeString SVGTinyImpl::startMask(MoxLength /*x*/, MoxLength /*y*/, MoxLength /*width*/,
                                     MoxLength /*height*/, UNITSTYPE /*maskUnits*/,
                                     UNITSTYPE /*contentUnits*/) {
    getGContext()->setType(ELEMENT_TYPE_MASK);
    return {};
}

void SVGTinyImpl::endMask() { getGContext()->setType(ELEMENT_TYPE_NONE); }

UnicodeString SVGTinyImpl::startLinearGradient(MoxLength /*x1*/, MoxLength /*y1*/, MoxLength /*x2*/,
                                               MoxLength /*y2*/, SVGMatrix /*matrix*/,
                                               UNITSTYPE /*units*/, GRADSPERADMOD /*spread*/) {
    return startGradient();
}

UnicodeString SVGTinyImpl::startRadialGradient(MoxLength /*cx*/, MoxLength /*cy*/, MoxLength /*r*/,
                                               MoxLength /*fx*/, MoxLength /*fy*/,
                                               SVGMatrix /*matrix*/, UNITSTYPE /*units*/,
                                               GRADSPERADMOD /*spread*/) {
    return startGradient();
}

void SVGTinyImpl::endGradiant() {
    // On purpose: the colours stay for the next gradient, so one without stops takes the colour of
    // the gradient before it.
    const MoxColor middle = findMiddle(lowStopColor, highStopColor);
    getGContext()->tinyFillColors.emplace(gradientId,
                                          SVGUtil::getColorString(middle, config->colorFlag));
    getGContext()->setType(ELEMENT_TYPE_NONE);
    noStopYet = true;
    lowStopOffset = 0.0F;
    highStopOffset = 0.0F;
    treeManager->defuseStopLock();
}

void SVGTinyImpl::setStopColor(const MoxColor& color, float offset, float /*opacity*/) {
    // Elsewhere a stop means nothing, and the lock behind it would keep out all that follows.
    if (treeManager->unlocked) {
        return;
    }
    if (noStopYet || offset >= highStopOffset) {
        highStopColor = color;
        highStopOffset = offset;
    }
    if (noStopYet || lowStopOffset >= offset) {
        lowStopColor = color;
        lowStopOffset = offset;
    }
    noStopYet = false;
}

UnicodeString SVGTinyImpl::startPattern(const MoxRectT<MoxLength>& /*area*/,
                                        const MoxRectT<MoxLength>& /*viewArea*/,
                                        SVGMatrix /*matrix*/, UNITSTYPE /*patternUnits*/,
                                        UNITSTYPE /*contentUnits*/) {
    getGContext()->setType(ELEMENT_TYPE_PATTERN);
    return {};
}

void SVGTinyImpl::endPattern() { getGContext()->setType(ELEMENT_TYPE_NONE); }

void SVGTinyImpl::drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y,
                           PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun) {
    if (!isInDefinition()) {
        DrawmereImpl::drawText(text, std::vector<MoxLength>{x}, std::vector<MoxLength>{y},
                               std::vector<float>(), mode, glyphs, wholeRun, /*leftToRight=*/true);
    }
}

void SVGTinyImpl::drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                           const std::vector<MoxLength>& y, const std::vector<float>& /*rotation*/,
                           PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun) {
    if (text.isEmpty() || isInDefinition()) {
        return;
    }
    const auto length = static_cast<std::size_t>(text.length());
    if (x.size() < length || y.size() < length) {
        drawText(text, firstOf(x), firstOf(y), mode, glyphs, wholeRun);
        return;
    }
    // On purpose: units, not characters. A surrogate pair becomes two texts, as the positions count
    // units too.
    for (std::size_t i = 0; i < length; ++i) {
        drawText(UnicodeString(text.charAt(static_cast<std::int32_t>(i))), x[i], y[i], mode, glyphs,
                 wholeRun);
    }
}

bool SVGTinyImpl::isInDefinition() const {
    const int type = getGContext()->getType();
    return type >= ELEMENT_TYPE_PATTERN && type <= ELEMENT_TYPE_CLIP;
}

UnicodeString SVGTinyImpl::startGradient() {
    if (!treeManager->unlocked) {
        return {};
    }
    gradientId = refIdManager->createReferenceID(SVGRefIDManager::REFGRADIENT);
    getGContext()->setType(ELEMENT_TYPE_GRADIENT);
    treeManager->setupStopLock();
    return gradientId;
}

} // namespace DrawmereNS
