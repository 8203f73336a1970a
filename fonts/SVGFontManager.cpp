#include "fonts/SVGFontManager.h"

namespace DrawmereNS {

SVGFontManager::SVGFontManager(SVGTreeManager* tree) : treeManager(tree) {}

void SVGFontManager::setCurrentFont(SVGFont* /*font*/, FS_ExtraFonts* /*extraFonts*/) {}

void SVGFontManager::embedTextOrGlyph(const UnicodeString& /*text*/,
                                      TLStringWithGlyphInfo* /*glyphs*/, bool /*wholeRun*/,
                                      bool /*vertical*/) {}

void SVGFontManager::doEmbedFonts() {}

} // namespace DrawmereNS
