#include "SVGFont.h"
#include "state/FontValues.h"

namespace DrawmereNS {

void SVGFontAttr2String::getFontAttrStr(const FONTATTRIBUTE& font, FONTATTRSTRING& out) {
    out.fontName = font.fontName;
    out.fontSize = makeFontSizeValue(font.fontSize).toString();
    out.fontWeight = makeFontWeightValue(font.fontWeight).toString();
    out.fontStyle = getFontStyleWord(font.fontStyle);
    out.fontFamily = font.fontFamily;
    out.fontAdjust = makeFontAdjustValue(font.fontAdjust).toString();
    out.fontVariant = getFontVariantWord(font.fontVariant);
    out.fontStretch = getFontStretchWord(font.fontStretch);
}

} // namespace DrawmereNS
