#include "fonts/SVGFontManager.h"

namespace DrawmereNS {

SVGFontManager::SVGFontManager(SVGTreeManager* tree) : treeManager(tree) {}

void SVGFontManager::setCurrentFont(SVGFont* /*font*/, FS_ExtraFonts* /*extraFonts*/) {}

void SVGFontManager::doEmbedFonts() {}

} // namespace DrawmereNS
