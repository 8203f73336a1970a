/// The registry of the fonts that a document carries.
#pragma once

#include "DrawmereExport.h"
#include "SVGFont.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/records/TLStringWithGlyphInfo.h"

namespace DrawmereNS {

class SVGEmbFont;
class SVGTreeManager;

using MoxFontService_NS::FS_ExtraFonts;
using TalFont::TLStringWithGlyphInfo;

/// Knows which font drawn text goes to, and writes the fonts of a document when it ends.
/// No font is carried so far: text refers to fonts by name alone.
class DRAWMERE_API SVGFontManager {
public:
    /// Borrows: `treeManager`, for its own life.
    explicit SVGFontManager(SVGTreeManager* treeManager);

    /// Selects the font of the text that follows. Ignores: a null font.
    /// Borrows: both, for the call; `extraFonts` may be null.
    void setCurrentFont(SVGFont* font, FS_ExtraFonts* extraFonts);

    /// Notes what a drawn text needs of the current font. Ignores: the call without one.
    /// Borrows: `glyphs`, for the call; it may be null for a font that goes by characters.
    void embedTextOrGlyph(const UnicodeString& text, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                          bool vertical);

    /// Writes the collected fonts into the tree.
    void doEmbedFonts();

    SVGTreeManager* treeManager;       // borrowed
    SVGEmbFont* currentFont = nullptr; // borrowed; null while the text's font is not carried
};

} // namespace DrawmereNS
