/// Names the set of further fonts that a caller may hand in with a font.
#pragma once

namespace MoxFontService_NS {

class FS_ExtraFonts;

} // namespace MoxFontService_NS
