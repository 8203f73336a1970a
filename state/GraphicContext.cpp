#include "state/GraphicContext.h"

#include "state/TextCopy.h"

namespace DrawmereNS {

void assignFont(SVGFont& to, const SVGFont& from) {
    assignText(to.fontName, from.fontName);
    to.fontWeight = from.fontWeight;
    to.fontStyle = from.fontStyle;
    to.fontSize = from.fontSize;
    to.fontAdjust = from.fontAdjust;
    to.fontVariant = from.fontVariant;
    to.fontStretch = from.fontStretch;
    to.embedFont = from.embedFont;
    to.embedGlyphIds = from.embedGlyphIds;
    assignText(to.fontFamily, from.fontFamily);
}

GraphicContext& GraphicContext::operator=(const GraphicContext& other) {
    assignText(strokeColor, other.strokeColor);
    strokeWidth = other.strokeWidth;
    lineCap = other.lineCap;
    lineJoin = other.lineJoin;
    if (!dashArray.empty() || !other.dashArray.empty()) {
        dashArray = other.dashArray;
    }
    dashOffset = other.dashOffset;
    miterLimit = other.miterLimit;
    strokeOpacity = other.strokeOpacity;
    assignText(maskReference, other.maskReference);
    assignText(fillColor, other.fillColor);
    assignText(fillRule, other.fillRule);
    fillOpacity = other.fillOpacity;
    assignFont(font, other.font);
    letterSpacing = other.letterSpacing;
    wordSpacing = other.wordSpacing;
    writingMode = other.writingMode;
    textAnchor = other.textAnchor;
    textDecoration = other.textDecoration;
    clipRule = other.clipRule;
    opacity = other.opacity;
    transMatrix = other.transMatrix;
    return *this;
}

const GraphicContext& getDefaultGC() {
    // Never destroyed, so static objects may draw until the very end.
    static const auto* const record = new GraphicContext;
    return *record;
}

} // namespace DrawmereNS
