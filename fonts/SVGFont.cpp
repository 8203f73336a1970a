#include "SVGFont.h"

#include <utility>

namespace DrawmereNS {
namespace {

constexpr char16_t blank = u' ';
constexpr char16_t apostrophe = u'\'';

bool isSlanted(FSTYLE style) { return style != FSTYLE_NORMAL; }

UnicodeString quoted(const UnicodeString& name) {
    UnicodeString text(apostrophe);
    text.append(name).append(apostrophe);
    return text;
}

UnicodeString quotedWhereNeeded(const UnicodeString& name) {
    return name.indexOf(blank) >= 0 ? quoted(name) : name;
}

UnicodeString makeFamily(const UnicodeString& name, const UnicodeString& family, bool familyOnly) {
    if (familyOnly) {
        return quotedWhereNeeded(family);
    }
    if (family.isEmpty() || family == name) {
        return quotedWhereNeeded(name);
    }
    return quoted(name).append(u',').append(quoted(family));
}

} // namespace

bool FONTATTRIBUTEKEY::operator==(const FONTATTRIBUTEKEY& other) const {
    // On purpose: italic and oblique are one key. Faces are told apart as upright and slanted only;
    // two keys would load and embed one face twice.
    return fontName == other.fontName && fontWeight == other.fontWeight &&
           isSlanted(fontStyle) == isSlanted(other.fontStyle);
}

bool FONTATTRIBUTEKEY::operator<(const FONTATTRIBUTEKEY& other) const {
    const auto nameOrder = fontName.compare(other.fontName);
    if (nameOrder != 0) {
        return nameOrder < 0;
    }
    if (fontWeight != other.fontWeight) {
        return fontWeight < other.fontWeight;
    }
    return !isSlanted(fontStyle) && isSlanted(other.fontStyle);
}

void SVGFont::setFontAttribute(const UnicodeString& name, MoxLength size, FONTWEIGHT weight,
                               FSTYLE style, const UnicodeString& family, bool familyOnly) {
    // Made first: a caller may pass this font's own texts.
    UnicodeString newFamily = makeFamily(name, family, familyOnly);
    fontName = name;
    fontSize = size;
    fontWeight = weight;
    fontStyle = style;
    fontFamily = std::move(newFamily);
}

void SVGFont::setEmbedAttribute(bool embed, bool byGlyphIds) {
    embedFont = embed;
    embedGlyphIds = byGlyphIds;
}

} // namespace DrawmereNS
