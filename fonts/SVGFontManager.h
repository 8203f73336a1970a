/// The registry of the fonts that a document carries.
#pragma once

#include "DrawmereExport.h"
#include "SVGFont.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/records/TLStringWithGlyphInfo.h"

#include <map>

namespace DrawmereNS {

class SVGEmbFont;
class SVGTreeManager;

using MoxFontService_NS::FS_ExtraFonts;
using TalFont::TLStringWithGlyphInfo;

/// Knows which font drawn text goes to, collects what is drawn with each, and writes the fonts of a
/// document when it ends. A font is carried when it was set with `embedFont` and text was drawn
/// with it; two requests that come to one face share a font, under the name of the first.
///
/// What a viewer draws follows from the texts alone: at each place it takes the glyph with the
/// longest text that matches, and a text has one glyph, that of its first use. So a caller whose
/// glyphs have to come out exactly keeps these rules:
/// - A letter that looks different from place to place, as Arabic letters and Indic ones do, is
///   drawn with `wholeRun`, a word a call: the word then is one text with one outline. Its glyphs
///   are set one behind the other by their own advances, from left to right, so they are listed
///   in the order of the page; kerning and the shifts of marks within it get lost.
/// - Where letters are to stay apart that make a ligature elsewhere in the document, as "f" and
///   "i" do in "fi", each is drawn with a call of its own. Viewers take the ligature for any "fi"
///   in one text, even where each letter has a position.
/// - Letters that were shaped in two ways, small capitals beside lower case, go to two fonts: one
///   more name in `FS_ExtraFonts` for the same file makes a second font of it.
/// - A run with kerning is drawn in pieces, each at its own place. Pieces don't begin within an
///   Indic syllable, which viewers without the font would shape anew.
/// - The weight and slant that are asked for are those of a face that there is: the font is written
///   with those of the face that was found, and viewers pass over a font of another slant.
/// - A viewer of vertical text places a glyph by rules of its own, as the font says nothing of
///   where it starts; where the last tenth of an em counts, vertical forms are drawn one by one in
///   horizontal text.
/// Chromium, Firefox and librsvg draw no fonts of this kind at all; they take a face of the system
/// by the family name. WebKit draws no Arabic letter from one.
class DRAWMERE_API SVGFontManager {
public:
    /// Borrows: `treeManager`, for its own life.
    explicit SVGFontManager(SVGTreeManager* treeManager);
    SVGFontManager(const SVGFontManager&) = delete;
    SVGFontManager& operator=(const SVGFontManager&) = delete;
    ~SVGFontManager();

    /// Selects the font of the text that follows, none when `font` is not to be embedded. A font
    /// that is known by its key or its face goes on collecting, from now on in the way that `font`
    /// says: by glyphs or by characters. Ignores: a null font.
    /// Borrows: both, for the call; `extraFonts` may be null.
    void setCurrentFont(SVGFont* font, FS_ExtraFonts* extraFonts);

    /// Notes what a drawn text needs of the current font. Ignores: the call without one.
    /// Borrows: `glyphs`, for the call; it may be null for a font that goes by characters.
    void embedTextOrGlyph(const UnicodeString& text, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                          bool vertical);

    /// Writes the collected fonts into the tree, in the order of their keys. Nothing keeps a second
    /// call from writing them once more.
    void doEmbedFonts();

    SVGTreeManager* treeManager;       ///< borrowed
    SVGEmbFont* currentFont = nullptr; ///< borrowed; null while the text's font is not carried
    std::map<FONTATTRIBUTEKEY, SVGEmbFont*> embFonts; ///< owned, the fonts too

private:
    SVGEmbFont* findFont(const SVGFont& font, FS_ExtraFonts* extraFonts);
    SVGEmbFont* findSameFace(SVGEmbFont& wanted) const;
};

} // namespace DrawmereNS
