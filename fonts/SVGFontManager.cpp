#include "fonts/SVGFontManager.h"

#include "fonts/SVGEmbFont.h"

#include <memory>

namespace DrawmereNS {

SVGFontManager::SVGFontManager(SVGTreeManager* tree) : treeManager(tree) {}

SVGFontManager::~SVGFontManager() {
    for (const auto& [key, font] : embFonts) {
        delete font;
    }
}

void SVGFontManager::setCurrentFont(SVGFont* font, FS_ExtraFonts* extraFonts) {
    if (!font) {
        return;
    }
    currentFont = font->embedFont ? findFont(*font, extraFonts) : nullptr;
    if (currentFont) {
        currentFont->fontAttribute.embedGlyphIds = font->embedGlyphIds;
        currentFont->fontAttribute.embedFont = font->embedFont;
    }
}

SVGEmbFont* SVGFontManager::findFont(const SVGFont& font, FS_ExtraFonts* extraFonts) {
    const auto known = embFonts.find(font);
    if (known != embFonts.end()) {
        return known->second;
    }
    auto wanted = std::make_unique<SVGEmbFont>(font, extraFonts);
    // On purpose: a face found under another key is entered no second time, so that it is known by
    // its first request alone. Asking once more for the other key looks for the face once more.
    if (SVGEmbFont* same = findSameFace(*wanted)) {
        return same;
    }
    SVGEmbFont*& entry = embFonts[font];
    entry = wanted.release();
    return entry;
}

/// On purpose: fonts without a face can't be told apart, so they are one, that of the first
/// request. Kept apart, each would put a `font` without glyphs into the document.
SVGEmbFont* SVGFontManager::findSameFace(SVGEmbFont& wanted) const {
    for (const auto& [key, font] : embFonts) {
        if (font->isSameFont(wanted)) {
            return font;
        }
    }
    return nullptr;
}

void SVGFontManager::embedTextOrGlyph(const UnicodeString& text, TLStringWithGlyphInfo* glyphs,
                                      bool wholeRun, bool vertical) {
    if (!currentFont || !currentFont->fontAttribute.embedFont) {
        return;
    }
    if (currentFont->fontAttribute.embedGlyphIds) {
        currentFont->embedGlyphId(text, glyphs, wholeRun, vertical);
    } else {
        currentFont->embedText(text, vertical);
    }
}

void SVGFontManager::doEmbedFonts() {
    for (const auto& [key, font] : embFonts) {
        font->doEmbedFont(treeManager);
    }
}

} // namespace DrawmereNS
