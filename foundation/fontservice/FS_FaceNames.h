/// The names that a font file gives its face.
#pragma once

#include "foundation/common/MoxString.h"

#include <ft2build.h>
#include FT_FREETYPE_H

#include <vector>

namespace MoxFontService_NS {

/// Returns: the family name that a regular, an italic, a bold and a bold italic face at most
/// share; empty for a face without names.
UnicodeString readFamilyName(FT_Face face);

/// Returns: all that a face is asked for by: its family, full and PostScript names in all
/// languages, the one of `readFamilyName` first, each once.
std::vector<UnicodeString> readNames(FT_Face face);

} // namespace MoxFontService_NS
